#pragma once

#include <QKeyCombination>

#include <optional>

namespace mirel {

// All that the table view does on a key, a button or a menu entry.
enum class TableCommand {
    First,
    Previous,
    Next,
    Last,
    RowUp,
    RowDown,
    PageUp,
    PageDown,
    ColumnLeft,
    ColumnRight,
    FirstColumn,
    LastColumn,
    NextCell,
    PreviousCell,
    EditCell,
    RevertEdit,
    ClearCell,
    RepeatAbove,
    InsertDateTime,
    Zoom,
    NewRecord,
    DeleteRecord,
    GoToRecord,
    ToggleDetail,
    RunAgain,
    Copy,
    Paste,
    FitColumn,
    FitAllColumns,
    HideColumn,
    ShowAllColumns,
    NextPane,
    Options,
    Close,
};

enum class KeyPlace { Grid, Editor };

// The command of a key where the grid, or the editor of a cell, has the focus; none: the key is theirs.
std::optional<TableCommand> CommandOfKey(KeyPlace place, QKeyCombination keys);

// The key that stands beside the command's menu entry; a key of 0: it has none.
QKeyCombination ShortcutOf(TableCommand command);

} // namespace mirel
