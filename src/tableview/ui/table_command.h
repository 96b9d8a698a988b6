#pragma once

#include <QKeyCombination>

#include <optional>

namespace mirel {

// All that the table view does on a key, a button or a menu entry. What each is called and does stands in the
// table in tableview/ui/table_*_rows.cpp.
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
    Redo,
    Copy,
    CopyWithNames,
    Paste,
    Find,
    FindNext,
    FindPrevious,
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
    Layout, // a menu of its own, too
    LayoutFont,
    LayoutBackground,
    LayoutListBackground,
    LayoutButtonBackground,
    LayoutText,
    LayoutListText,
    LayoutButtonText,
    LayoutReset,
    NewQuery,
    FitColumn,
    FitAllColumns,
    HideColumn,
    ShowAllColumns,
    FitAllNow, // as FitAllColumns, under the name that the popup menu has for it
    Statement,
    NextPane,
    Options,
};

enum class KeyPlace { Grid, Editor };

// The command of a key where the grid, or the editor of a cell, has the focus; none: the key is theirs.
std::optional<TableCommand> CommandOfKey(KeyPlace place, QKeyCombination keys);

} // namespace mirel
