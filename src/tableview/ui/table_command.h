#pragma once

#include "resources/string_id.h"

#include <QKeyCombination>

#include <optional>
#include <span>

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
    ExtendUp,
    ExtendDown,
    ExtendPageUp,
    ExtendPageDown,
    ExtendLeft,
    ExtendRight,
    ExtendToFirstColumn,
    ExtendToLastColumn,
    ExtendToFirst,
    ExtendToLast,
    SelectAll,
    SelectRecords,
    SelectColumns,
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
    Undo,
    Copy,
    CopyWithNames,
    Paste,
    FilterBySelection,
    FilterExcluding,
    RemoveFilter,
    SortAscending,
    SortDescending,
    FilterExpression,
    SortExpression,
    EditAll, // opens a menu of its own, as Aggregate does
    DeleteAll,
    UpdateAll,
    Aggregate,
    Sum,
    Max,
    Min,
    Avg,
    OpenQuery,
    SaveQuery,
    ExportCsv,
    // Not built yet: their menu entries are there, disabled, and say what they will do.
    NewQuery,
    Layout,
    Help,
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

// Each command that has a menu entry or a button: its words, and its icon where it has one.
struct ActionRow {
    TableCommand command;
    Str text;
    Str tip;
    const char16_t* icon;
};
std::span<const ActionRow> ActionRows();
// The commands that are not built yet.
bool IsToCome(TableCommand command);

// The menus, in groups: an empty entry is a line between two.
using MenuEntry = std::optional<TableCommand>;
std::span<const MenuEntry> FileMenu();
std::span<const MenuEntry> EditMenu();
std::span<const MenuEntry> ToolsMenu();
std::span<const MenuEntry> PopupMenu(); // on the grid
// The menu behind an entry; empty for one that is a command itself.
std::span<const MenuEntry> SubmenuOf(TableCommand command);

} // namespace mirel
