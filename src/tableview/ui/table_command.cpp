#include "tableview/ui/table_command.h"

#include "resources/string_table.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

enum Places : unsigned { InGrid = 1, InEditor = 2, InWindow = 4 };

struct KeyRow {
    QKeyCombination keys;
    unsigned places;
    TableCommand command;
};

// The keys of the table view. Those of the window stand beside their menu entries; an editor keeps what moves
// within its text.
constexpr std::array kKeys = {
    KeyRow{Qt::Key_Up, InGrid | InEditor, TableCommand::RowUp},
    KeyRow{Qt::Key_Down, InGrid | InEditor, TableCommand::RowDown},
    KeyRow{Qt::Key_PageUp, InGrid | InEditor, TableCommand::PageUp},
    KeyRow{Qt::Key_PageDown, InGrid | InEditor, TableCommand::PageDown},
    KeyRow{Qt::Key_Left, InGrid, TableCommand::ColumnLeft},
    KeyRow{Qt::Key_Right, InGrid, TableCommand::ColumnRight},
    KeyRow{Qt::Key_Home, InGrid, TableCommand::FirstColumn},
    KeyRow{Qt::Key_End, InGrid, TableCommand::LastColumn},
    KeyRow{Qt::CTRL | Qt::Key_Home, InGrid, TableCommand::First},
    KeyRow{Qt::CTRL | Qt::Key_End, InGrid, TableCommand::Last},
    KeyRow{Qt::SHIFT | Qt::Key_Up, InGrid, TableCommand::ExtendUp},
    KeyRow{Qt::SHIFT | Qt::Key_Down, InGrid, TableCommand::ExtendDown},
    KeyRow{Qt::SHIFT | Qt::Key_PageUp, InGrid, TableCommand::ExtendPageUp},
    KeyRow{Qt::SHIFT | Qt::Key_PageDown, InGrid, TableCommand::ExtendPageDown},
    KeyRow{Qt::SHIFT | Qt::Key_Left, InGrid, TableCommand::ExtendLeft},
    KeyRow{Qt::SHIFT | Qt::Key_Right, InGrid, TableCommand::ExtendRight},
    KeyRow{Qt::SHIFT | Qt::Key_Home, InGrid, TableCommand::ExtendToFirstColumn},
    KeyRow{Qt::SHIFT | Qt::Key_End, InGrid, TableCommand::ExtendToLastColumn},
    KeyRow{Qt::CTRL | Qt::SHIFT | Qt::Key_Home, InGrid, TableCommand::ExtendToFirst},
    KeyRow{Qt::CTRL | Qt::SHIFT | Qt::Key_End, InGrid, TableCommand::ExtendToLast},
    KeyRow{Qt::SHIFT | Qt::Key_Space, InGrid, TableCommand::SelectRecords},
    KeyRow{Qt::CTRL | Qt::Key_Space, InGrid, TableCommand::SelectColumns},
    KeyRow{Qt::CTRL | Qt::Key_A, InWindow, TableCommand::SelectAll},
    KeyRow{Qt::CTRL | Qt::Key_PageUp, InGrid | InEditor, TableCommand::Previous},
    KeyRow{Qt::CTRL | Qt::Key_PageDown, InGrid | InEditor, TableCommand::Next},
    KeyRow{Qt::Key_Tab, InGrid | InEditor, TableCommand::NextCell},
    KeyRow{Qt::Key_Backtab, InGrid | InEditor, TableCommand::PreviousCell},
    KeyRow{Qt::SHIFT | Qt::Key_Backtab, InGrid | InEditor, TableCommand::PreviousCell},
    KeyRow{Qt::Key_Return, InGrid, TableCommand::EditCell},
    KeyRow{Qt::Key_Enter, InGrid, TableCommand::EditCell},
    KeyRow{Qt::Key_F2, InGrid, TableCommand::EditCell},
    KeyRow{Qt::Key_Return, InEditor, TableCommand::RowDown},
    KeyRow{Qt::Key_Enter, InEditor, TableCommand::RowDown},
    KeyRow{Qt::Key_Escape, InGrid | InEditor, TableCommand::RevertEdit},
    KeyRow{Qt::Key_Delete, InGrid, TableCommand::ClearCell},
    KeyRow{Qt::Key_Insert, InGrid, TableCommand::NewRecord},
    KeyRow{Qt::CTRL | Qt::Key_N, InWindow, TableCommand::NewRecord},
    KeyRow{Qt::CTRL | Qt::Key_Delete, InWindow, TableCommand::DeleteRecord},
    KeyRow{Qt::CTRL | Qt::Key_Apostrophe, InWindow, TableCommand::RepeatAbove},
    KeyRow{Qt::CTRL | Qt::Key_Semicolon, InWindow, TableCommand::InsertDateTime},
    KeyRow{Qt::SHIFT | Qt::Key_F2, InWindow, TableCommand::Zoom},
    KeyRow{Qt::CTRL | Qt::Key_G, InWindow, TableCommand::GoToRecord},
    KeyRow{Qt::CTRL | Qt::Key_D, InWindow, TableCommand::ToggleDetail},
    KeyRow{Qt::CTRL | Qt::SHIFT | Qt::Key_F, InWindow, TableCommand::FilterExpression},
    KeyRow{Qt::Key_F5, InWindow, TableCommand::RunAgain},
    KeyRow{Qt::Key_F6, InWindow, TableCommand::NextPane},
    KeyRow{Qt::CTRL | Qt::Key_Z, InWindow, TableCommand::Undo},
    KeyRow{Qt::CTRL | Qt::Key_C, InWindow, TableCommand::Copy},
    KeyRow{Qt::CTRL | Qt::SHIFT | Qt::Key_C, InWindow, TableCommand::CopyWithNames},
    KeyRow{Qt::CTRL | Qt::Key_V, InWindow, TableCommand::Paste},
    KeyRow{Qt::CTRL | Qt::Key_F, InWindow, TableCommand::Find},
    KeyRow{Qt::Key_F3, InWindow, TableCommand::FindNext},
    KeyRow{Qt::SHIFT | Qt::Key_F3, InWindow, TableCommand::FindPrevious},
    KeyRow{Qt::CTRL | Qt::Key_Slash, InWindow, TableCommand::Keys},
    KeyRow{Qt::CTRL | Qt::Key_W, InWindow, TableCommand::Close},
};

constexpr std::array kActions = {
    ActionRow{TableCommand::First, Str::ActionFirst, Str::ActionFirst, u"go-first"},
    ActionRow{TableCommand::Previous, Str::ActionPrevious, Str::ActionPrevious, u"go-previous"},
    ActionRow{TableCommand::Next, Str::ActionNext, Str::ActionNext, u"go-next"},
    ActionRow{TableCommand::Last, Str::ActionLast, Str::ActionLast, u"go-last"},
    ActionRow{TableCommand::NewRecord, Str::ActionNewRecord, Str::ActionNewRecordTip, u"list-add"},
    ActionRow{TableCommand::DeleteRecord, Str::ActionDeleteRecord, Str::ActionDeleteRecordTip, u"list-remove"},
    ActionRow{TableCommand::ToggleDetail, Str::ActionDetail, Str::ActionDetailTip, u"view-list-details"},
    ActionRow{TableCommand::GoToRecord, Str::ActionGoToRecord, Str::ActionGoToRecordTip, u"go-jump"},
    ActionRow{TableCommand::InsertDateTime, Str::ActionInsertDateTime, Str::ActionInsertDateTimeTip, nullptr},
    ActionRow{TableCommand::RepeatAbove, Str::ActionRepeatAbove, Str::ActionRepeatAboveTip, nullptr},
    ActionRow{TableCommand::Zoom, Str::ZoomIn, Str::ZoomTip, u"zoom-in"},
    ActionRow{TableCommand::RunAgain, Str::ActionRunAgain, Str::ActionRunAgainTip, u"view-refresh"},
    ActionRow{TableCommand::FitAllColumns, Str::ActionFitAll, Str::ActionFitAllTip, nullptr},
    ActionRow{TableCommand::FitColumn, Str::ActionFitColumn, Str::ActionFitColumnTip, nullptr},
    ActionRow{TableCommand::HideColumn, Str::ActionHideColumn, Str::ActionHideColumnTip, nullptr},
    ActionRow{TableCommand::ShowAllColumns, Str::ActionShowAll, Str::ActionShowAllTip, nullptr},
    ActionRow{TableCommand::FilterBySelection, Str::ActionFilterBy, Str::ActionFilterByTip, u"view-filter"},
    ActionRow{TableCommand::FilterExcluding, Str::ActionFilterExcluding, Str::ActionFilterExcludingTip, nullptr},
    ActionRow{TableCommand::RemoveFilter, Str::ActionRemoveFilter, Str::ActionRemoveFilterTip, u"edit-clear"},
    ActionRow{TableCommand::SortAscending, Str::ActionSortAscending, Str::ActionSortAscendingTip,
              u"view-sort-ascending"},
    ActionRow{TableCommand::SortDescending, Str::ActionSortDescending, Str::ActionSortDescendingTip,
              u"view-sort-descending"},
    ActionRow{TableCommand::FilterExpression, Str::ActionFilterExpression, Str::ActionFilterExpressionTip,
              nullptr},
    ActionRow{TableCommand::SortExpression, Str::ActionSortExpression, Str::ActionSortExpressionTip, nullptr},
    ActionRow{TableCommand::EditAll, Str::ActionEditAll, Str::ActionEditAllTip, nullptr},
    ActionRow{TableCommand::DeleteAll, Str::ActionDeleteAll, Str::ActionDeleteAllTip, nullptr},
    ActionRow{TableCommand::UpdateAll, Str::ActionUpdateAll, Str::ActionUpdateAllTip, nullptr},
    ActionRow{TableCommand::Aggregate, Str::ActionAggregate, Str::ActionAggregateTip, nullptr},
    ActionRow{TableCommand::Sum, Str::ActionSum, Str::ActionSumTip, nullptr},
    ActionRow{TableCommand::Max, Str::ActionMax, Str::ActionMaxTip, nullptr},
    ActionRow{TableCommand::Min, Str::ActionMin, Str::ActionMinTip, nullptr},
    ActionRow{TableCommand::Avg, Str::ActionAvg, Str::ActionAvgTip, nullptr},
    ActionRow{TableCommand::NewQuery, Str::ActionNewQuery, Str::ActionNewQueryTip, nullptr},
    ActionRow{TableCommand::OpenQuery, Str::ActionOpenQuery, Str::ActionOpenQueryTip, nullptr},
    ActionRow{TableCommand::SaveQuery, Str::ActionSaveQuery, Str::ActionSaveQueryTip, nullptr},
    ActionRow{TableCommand::ExportCsv, Str::ActionExportCsv, Str::ActionExportCsvTip, nullptr},
    ActionRow{TableCommand::Layout, Str::ActionLayout, Str::ActionLayoutTip, nullptr},
    ActionRow{TableCommand::Help, Str::ActionHelp, Str::ActionHelpTip, nullptr},
    ActionRow{TableCommand::Find, Str::ActionFind, Str::ActionFindTip, u"edit-find"},
    ActionRow{TableCommand::FindNext, Str::ActionFindNext, Str::ActionFindNextTip, u"go-down"},
    ActionRow{TableCommand::FindPrevious, Str::ActionFindPrevious, Str::ActionFindPreviousTip, u"go-up"},
    ActionRow{TableCommand::Statement, Str::ActionStatement, Str::ActionStatementTip, nullptr},
    ActionRow{TableCommand::Keys, Str::CommandKeys, Str::TipKeys, nullptr},
    ActionRow{TableCommand::FitAllNow, Str::ActionFitAllNow, Str::ActionFitAllTip, nullptr},
    ActionRow{TableCommand::LayoutFont, Str::CommandFont, Str::TipFont, u"preferences-desktop-font"},
    ActionRow{TableCommand::LayoutBackground, Str::CommandBackgroundColor, Str::TipColor, nullptr},
    ActionRow{TableCommand::LayoutListBackground, Str::CommandListBackgroundColor, Str::TipColor, nullptr},
    ActionRow{TableCommand::LayoutButtonBackground, Str::CommandButtonBackgroundColor, Str::TipColor, nullptr},
    ActionRow{TableCommand::LayoutText, Str::LayoutTextColor, Str::TipColor, nullptr},
    ActionRow{TableCommand::LayoutListText, Str::CommandListTextColor, Str::TipColor, nullptr},
    ActionRow{TableCommand::LayoutButtonText, Str::CommandButtonTextColor, Str::TipColor, nullptr},
    ActionRow{TableCommand::LayoutReset, Str::LayoutReset, Str::LayoutResetTip, nullptr},
    ActionRow{TableCommand::Undo, Str::ActionUndo, Str::ActionUndoTip, u"edit-undo"},
    ActionRow{TableCommand::CopyWithNames, Str::ActionCopyWithNames, Str::ActionCopyWithNamesTip, nullptr},
    ActionRow{TableCommand::SelectAll, Str::ActionSelectAll, Str::ActionSelectAllTip, nullptr},
    ActionRow{TableCommand::SelectRecords, Str::ActionSelectRecords, Str::ActionSelectRecordsTip, nullptr},
    ActionRow{TableCommand::SelectColumns, Str::ActionSelectColumns, Str::ActionSelectColumnsTip, nullptr},
    ActionRow{TableCommand::Copy, Str::ActionCopy, Str::ActionCopyTip, u"edit-copy"},
    ActionRow{TableCommand::Paste, Str::ActionPaste, Str::ActionPasteTip, u"edit-paste"},
    ActionRow{TableCommand::Options, Str::ActionOptions, Str::ActionOptionsTip, u"configure"},
    ActionRow{TableCommand::NextPane, Str::ActionNextPane, Str::ActionNextPane, nullptr},
    ActionRow{TableCommand::Close, Str::ActionClose, Str::ActionCloseTip, nullptr},
};

// What the keys do that no menu shows.
struct KeyText {
    TableCommand command;
    Str what;
};
constexpr std::array kKeyTexts = {
    KeyText{TableCommand::RowUp, Str::KeyRowUp},
    KeyText{TableCommand::RowDown, Str::KeyRowDown},
    KeyText{TableCommand::PageUp, Str::KeyPageUp},
    KeyText{TableCommand::PageDown, Str::KeyPageDown},
    KeyText{TableCommand::ColumnLeft, Str::KeyColumnLeft},
    KeyText{TableCommand::ColumnRight, Str::KeyColumnRight},
    KeyText{TableCommand::FirstColumn, Str::KeyFirstColumn},
    KeyText{TableCommand::LastColumn, Str::KeyLastColumn},
    KeyText{TableCommand::ExtendUp, Str::KeyExtend},
    KeyText{TableCommand::ExtendDown, Str::KeyExtend},
    KeyText{TableCommand::ExtendPageUp, Str::KeyExtend},
    KeyText{TableCommand::ExtendPageDown, Str::KeyExtend},
    KeyText{TableCommand::ExtendLeft, Str::KeyExtend},
    KeyText{TableCommand::ExtendRight, Str::KeyExtend},
    KeyText{TableCommand::ExtendToFirstColumn, Str::KeyExtend},
    KeyText{TableCommand::ExtendToLastColumn, Str::KeyExtend},
    KeyText{TableCommand::ExtendToFirst, Str::KeyExtend},
    KeyText{TableCommand::ExtendToLast, Str::KeyExtend},
    KeyText{TableCommand::NextCell, Str::KeyNextCell},
    KeyText{TableCommand::PreviousCell, Str::KeyPreviousCell},
    KeyText{TableCommand::EditCell, Str::KeyEditCell},
    KeyText{TableCommand::RevertEdit, Str::KeyRevertEdit},
    KeyText{TableCommand::ClearCell, Str::KeyClearCell},
};

Str TextOfCommand(TableCommand command)
{
    const auto action = std::ranges::find(kActions, command, &ActionRow::command);
    return action != kActions.end() ? action->text
                                    : std::ranges::find(kKeyTexts, command, &KeyText::command)->what;
}

constexpr bool EveryKeySaysWhatItDoes()
{
    return std::ranges::all_of(kKeys, [](const KeyRow& key) {
        return std::ranges::any_of(kActions, [&](const ActionRow& row) { return row.command == key.command; }) ||
               std::ranges::any_of(kKeyTexts, [&](const KeyText& row) { return row.command == key.command; });
    });
}
static_assert(EveryKeySaysWhatItDoes());

constexpr MenuEntry kLine = std::nullopt;

// No menu is longer than a screen of 320 pixels: Qt would make two columns of it.
constexpr std::array<MenuEntry, 16> kFileMenu = {TableCommand::InsertDateTime,
                                                 kLine,
                                                 TableCommand::NewQuery,
                                                 TableCommand::OpenQuery,
                                                 TableCommand::SaveQuery,
                                                 TableCommand::ExportCsv,
                                                 kLine,
                                                 TableCommand::RunAgain,
                                                 TableCommand::Statement,
                                                 TableCommand::FitAllColumns,
                                                 TableCommand::Options,
                                                 TableCommand::Layout,
                                                 TableCommand::Help,
                                                 TableCommand::Keys,
                                                 kLine,
                                                 TableCommand::Close};
constexpr std::array<MenuEntry, 16> kEditMenu = {TableCommand::Undo,
                                                 kLine,
                                                 TableCommand::Copy,
                                                 TableCommand::CopyWithNames,
                                                 TableCommand::Paste,
                                                 TableCommand::RepeatAbove,
                                                 kLine,
                                                 TableCommand::SelectAll,
                                                 TableCommand::SelectRecords,
                                                 TableCommand::SelectColumns,
                                                 kLine,
                                                 TableCommand::Find,
                                                 TableCommand::FindNext,
                                                 TableCommand::FindPrevious,
                                                 kLine,
                                                 TableCommand::Zoom};
constexpr std::array<MenuEntry, 17> kToolsMenu = {TableCommand::NewRecord,
                                                  TableCommand::DeleteRecord,
                                                  TableCommand::ToggleDetail,
                                                  kLine,
                                                  TableCommand::FilterBySelection,
                                                  TableCommand::FilterExcluding,
                                                  TableCommand::FilterExpression,
                                                  TableCommand::RemoveFilter,
                                                  kLine,
                                                  TableCommand::SortAscending,
                                                  TableCommand::SortDescending,
                                                  TableCommand::SortExpression,
                                                  kLine,
                                                  TableCommand::EditAll,
                                                  TableCommand::Aggregate,
                                                  kLine,
                                                  TableCommand::GoToRecord};
constexpr std::array<MenuEntry, 16> kGridPopup = {TableCommand::FilterBySelection,
                                                  TableCommand::FilterExcluding,
                                                  TableCommand::FilterExpression,
                                                  TableCommand::RemoveFilter,
                                                  kLine,
                                                  TableCommand::SortAscending,
                                                  TableCommand::SortDescending,
                                                  TableCommand::SortExpression,
                                                  kLine,
                                                  TableCommand::HideColumn,
                                                  TableCommand::ShowAllColumns,
                                                  TableCommand::FitColumn,
                                                  TableCommand::FitAllNow,
                                                  kLine,
                                                  TableCommand::Copy,
                                                  TableCommand::Paste};
constexpr std::array<MenuEntry, 14> kDetailPopup = {TableCommand::FilterBySelection,
                                                    TableCommand::FilterExcluding,
                                                    TableCommand::FilterExpression,
                                                    TableCommand::RemoveFilter,
                                                    kLine,
                                                    TableCommand::SortAscending,
                                                    TableCommand::SortDescending,
                                                    TableCommand::SortExpression,
                                                    kLine,
                                                    TableCommand::Aggregate,
                                                    kLine,
                                                    TableCommand::Undo,
                                                    TableCommand::Copy,
                                                    TableCommand::Paste};
constexpr std::array<MenuEntry, 9> kLayoutMenu = {
    TableCommand::LayoutFont,           TableCommand::LayoutBackground,
    TableCommand::LayoutListBackground, TableCommand::LayoutButtonBackground,
    TableCommand::LayoutText,           TableCommand::LayoutListText,
    TableCommand::LayoutButtonText,     kLine,
    TableCommand::LayoutReset};
constexpr std::array<MenuEntry, 2> kEditAllMenu = {TableCommand::DeleteAll, TableCommand::UpdateAll};
constexpr std::array<MenuEntry, 4> kAggregateMenu = {TableCommand::Sum, TableCommand::Max, TableCommand::Min,
                                                     TableCommand::Avg};

} // namespace

std::optional<TableCommand> CommandOfKey(KeyPlace place, QKeyCombination keys)
{
    const unsigned bit = place == KeyPlace::Grid ? InGrid : InEditor;
    keys = QKeyCombination(keys.keyboardModifiers() & ~Qt::KeypadModifier, keys.key());
    const auto row = std::ranges::find_if(
        kKeys, [&](const KeyRow& candidate) { return candidate.keys == keys && (candidate.places & bit) != 0; });
    return row == kKeys.end() ? std::nullopt : std::optional(row->command);
}

QList<KeyLine> KeyList()
{
    QList<KeyLine> lines;
    for (const KeyRow& row : kKeys) {
        const Str what = TextOfCommand(row.command);
        auto line = std::ranges::find(lines, what, &KeyLine::what);
        if (line == lines.end())
            line = lines.insert(lines.end(), {{}, what});
        // Shift and Tab come as a key of their own, and the key pad has a second Return.
        const bool isBackTab = row.keys.key() == Qt::Key_Backtab;
        const QKeyCombination keys = isBackTab ? Qt::SHIFT | Qt::Key_Tab : row.keys;
        if (keys.key() != Qt::Key_Enter && !line->keys.contains(keys))
            line->keys += keys;
    }
    return lines;
}

QKeyCombination ShortcutOf(TableCommand command)
{
    const auto row = std::ranges::find_if(kKeys, [command](const KeyRow& candidate) {
        return candidate.command == command && (candidate.places & InWindow) != 0;
    });
    return row == kKeys.end() ? QKeyCombination::fromCombined(0) : row->keys;
}

std::span<const ActionRow> ActionRows()
{
    return kActions;
}

bool IsToCome(TableCommand command)
{
    return command >= TableCommand::NewQuery && command <= TableCommand::Help;
}

std::span<const MenuEntry> FileMenu()
{
    return kFileMenu;
}

std::span<const MenuEntry> EditMenu()
{
    return kEditMenu;
}

std::span<const MenuEntry> ToolsMenu()
{
    return kToolsMenu;
}

std::span<const MenuEntry> GridPopup()
{
    return kGridPopup;
}

std::span<const MenuEntry> DetailPopup()
{
    return kDetailPopup;
}

std::span<const MenuEntry> SubmenuOf(TableCommand command)
{
    if (command == TableCommand::EditAll)
        return kEditAllMenu;
    if (command == TableCommand::Aggregate)
        return kAggregateMenu;
    if (command == TableCommand::Layout)
        return kLayoutMenu;
    return {};
}

} // namespace mirel
