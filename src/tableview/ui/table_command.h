#pragma once

#include "resources/string_id.h"

#include <QKeyCombination>
#include <QList>

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
    // Not built yet: their menu entries are there, disabled, and say what they will do.
    NewQuery,
    Help,
    FitColumn,
    FitAllColumns,
    HideColumn,
    ShowAllColumns,
    FitAllNow, // as FitAllColumns, under the name that the popup menu has for it
    Statement,
    Keys,
    NextPane,
    Options,
    Close,
};

enum class KeyPlace { Grid, Editor };

// The command of a key where the grid, or the editor of a cell, has the focus; none: the key is theirs.
std::optional<TableCommand> CommandOfKey(KeyPlace place, QKeyCombination keys);

// Every key with what it does, for the list of keys; keys that do the same stand together.
struct KeyLine {
    QList<QKeyCombination> keys;
    Str what;
};
QList<KeyLine> KeyList();

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
std::span<const MenuEntry> GridPopup();
std::span<const MenuEntry> DetailPopup(); // on the fields of a single record
// The menu behind an entry; empty for one that is a command itself.
std::span<const MenuEntry> SubmenuOf(TableCommand command);

} // namespace mirel
