#include "platform/ui/memo_edit.h"
#include "platform/ui/view_command.h"
#include "platform/ui/wait_cursor.h"
#include "resources/string_table.h"
#include "tableview/ui/cell_strip.h"
#include "tableview/ui/find_line.h"
#include "tableview/ui/record_grid.h"
#include "tableview/ui/result_commands.h"
#include "tableview/ui/table_view.h"

#include <QMenu>
#include <QStackedWidget>

#include <array>

// The commands of the table view: one row each.

namespace mirel {
namespace {

using Command = TableCommand;
using Row = CommandRow<CTableView>;
using State = CommandState;

// Where keys work.
enum KeyPart : unsigned { InGrid = OnPart, InEditor = OnPart << 1, InBoth = InGrid | InEditor };

// Where commands show.
enum Menu : unsigned {
    FileMenu = 1,
    EditMenu = 2,
    ToolsMenu = 4,
    GridPopup = 8,
    DetailPopup = 16,
    EditAllMenu = 32,
    AggregateMenu = 64,
    LayoutMenu = 128,
};
constexpr unsigned kPopups = GridPopup | DetailPopup;

constexpr int Id(Command command)
{
    return int(command);
}

} // namespace

// What the rows call and ask.
struct CTableView::Commands {
    // --- done by the record browser ---------------------------------------------------------------------------

    template <auto Call>
    static bool Browse(RecordBrowser& browser)
    {
        return (browser.*Call)();
    }
    template <auto Call>
    static void Go(CTableView& view)
    {
        view.Walk(Browse<Call>);
    }
    // Runs a statement.
    template <auto Call>
    static void Rerun(CTableView& view)
    {
        const WaitCursor waiting;
        view.Walk(Browse<Call>);
    }
    template <auto Call>
    static void Extend(CTableView& view)
    {
        view.Walk([](RecordBrowser& browser) { return browser.Extend(Browse<Call>); });
    }
    // Never refused.
    template <auto Call>
    static void Select(CTableView& view)
    {
        view.Walk([](RecordBrowser& browser) { return (browser.*Call)(), true; });
    }
    // Changes what is typed; the editor keeps the focus.
    template <auto Call>
    static void Type(CTableView& view)
    {
        view.Run([](RecordBrowser& browser) { return (browser.*Call)(), true; });
    }
    template <int Count>
    static bool Rows(RecordBrowser& browser)
    {
        return browser.MoveRows(Count);
    }
    template <int Count>
    static bool Columns(RecordBrowser& browser)
    {
        return browser.MoveColumns(Count);
    }
    template <bool (*Call)(RecordBrowser&)>
    static void Move(CTableView& view)
    {
        view.Walk(Call);
    }
    template <bool (*Call)(RecordBrowser&)>
    static void ExtendBy(CTableView& view)
    {
        view.Walk([](RecordBrowser& browser) { return browser.Extend(Call); });
    }
    template <CellFilter Filter>
    static void FilterByCell(CTableView& view)
    {
        const WaitCursor waiting;
        view.Walk([](RecordBrowser& browser) { return browser.FilterByCell(Filter); });
    }
    template <SortDirection Direction>
    static void Sort(CTableView& view)
    {
        const WaitCursor waiting;
        view.Walk([](RecordBrowser& browser) { return browser.SortByColumn(browser.SelectedField(), Direction); });
    }

    // --- done by the view -------------------------------------------------------------------------------------

    template <auto Call>
    static void Result(CTableView& view)
    {
        view.Settle((view.resultCommands_->*Call)());
        view.stack_->currentWidget()->setFocus();
    }
    template <Aggregate Function>
    static void Compute(CTableView& view)
    {
        view.Settle(view.resultCommands_->Compute(Function));
        view.stack_->currentWidget()->setFocus();
    }
    template <auto Call>
    static void View(CTableView& view)
    {
        (view.*Call)();
    }
    template <LookItem Item>
    static void Look(CTableView& view)
    {
        if (view.Settle(view.browser_.WriteEdit()))
            Q_EMIT view.lookRequested(Item);
    }
    static void InsertDateTime(CTableView& view)
    {
        if (view.stack_->currentWidget() == view.zoomEdit_ && !view.zoomEdit_->isReadOnly())
            view.zoomEdit_->insertPlainText(RecordBrowser::CurrentDateTimeText()); // a memo is not replaced by it
        else
            Type<&RecordBrowser::InsertCurrentDateTime>(view);
    }
    static void ToggleDetail(CTableView& view)
    {
        const qint64 before = view.browser_.SelectedRecord();
        Go<&RecordBrowser::TogglePresentation>(view);
        const bool list = view.browser_.CurrentPresentation() == Presentation::List;
        if (list && view.browser_.SelectedRecord() != before)
            view.Note(StringText(Str::DetailLeft, {QString::number(view.browser_.SelectedRecord() + 1)}));
    }
    static void EditCell(CTableView& view) { view.Edit(nullptr); }
    static void Copy(CTableView& view) { view.Copy(FieldNames::Without); }
    static void CopyWithNames(CTableView& view) { view.Copy(FieldNames::With); }
    static void FitColumn(CTableView& view) { view.grid_->FitColumn(view.browser_.SelectedColumn()); }
    static void FitAllColumns(CTableView& view) { view.grid_->FitAllColumns(); }
    static void Find(CTableView& view) { view.findLine_->Open(); }
    static void FindNext(CTableView& view) { view.findLine_->FindAgain(QuickFind::Direction::Forward); }
    static void FindPrevious(CTableView& view) { view.findLine_->FindAgain(QuickFind::Direction::Backward); }
    static void OpenMenu(CTableView&) {} // the menu behind it does

    // --- when -------------------------------------------------------------------------------------------------

    template <auto Call>
    static State If(const CTableView& view)
    {
        return {.enabled = (view.browser_.*Call)()};
    }
    template <auto Call>
    static State IfResult(const CTableView& view)
    {
        return {.enabled = (view.resultCommands_->*Call)()};
    }
    static bool HasRecordIn(const CTableView& view) { return view.browser_.SelectedRecord() >= 0; }
    static State HasRecord(const CTableView& view) { return {.enabled = HasRecordIn(view)}; }
    static State InList(const CTableView& view)
    {
        return {.enabled = HasRecordIn(view) && view.browser_.CurrentPresentation() == Presentation::List};
    }
    static State CanChangeRecords(const CTableView& view)
    {
        return {.enabled = HasRecordIn(view) && view.browser_.CanUpdate()};
    }
    static State CanChangeValues(const CTableView& view)
    {
        return {.enabled = HasRecordIn(view) && view.browser_.CanEdit()};
    }
    static State Zooming(const CTableView& view)
    {
        const bool zoomed = view.zoomed_;
        return {.enabled = zoomed || view.browser_.Edit().Kind() == EditorKind::Text,
                .text = zoomed ? Str::ZoomBack : Str::ZoomIn};
    }
    static State Detail(const CTableView& view)
    {
        const bool list = view.browser_.CurrentPresentation() == Presentation::List;
        return {.enabled = view.browser_.IsOpen(),
                .text = list ? Str::ActionDetail : Str::ActionList,
                .icon = list ? u"view-list-details" : u"view-list-text"};
    }

    static std::span<const Row> Table();
};

std::span<const CommandRow<CTableView>> CTableView::Commands::Table()
{
    using B = RecordBrowser;
    using R = ResultCommands;
    using V = CTableView;
    // An editor keeps the keys that move within its text.
    static constexpr std::array kRows = {
        Row{{.id = Id(Command::InsertDateTime),
             .text = Str::ActionInsertDateTime,
             .tip = Str::ActionInsertDateTimeTip,
             .keys = {{{Qt::CTRL | Qt::Key_Semicolon}}},
             .menus = FileMenu,
             .group = 0},
            InsertDateTime,
            If<&B::CanEdit>},
        Row{{.id = Id(Command::NewQuery),
             .text = Str::ActionNewQuery,
             .tip = Str::ActionNewQueryTip,
             .menus = FileMenu,
             .group = 1},
            Result<&R::NewQuery>,
            IfResult<&R::CanWriteQuery>},
        Row{{.id = Id(Command::OpenQuery),
             .text = Str::ActionOpenQuery,
             .tip = Str::ActionOpenQueryTip,
             .menus = FileMenu,
             .group = 1},
            Result<&R::OpenQuery>,
            IfResult<&R::CanOpenQuery>},
        Row{{.id = Id(Command::SaveQuery),
             .text = Str::ActionSaveQuery,
             .tip = Str::ActionSaveQueryTip,
             .menus = FileMenu,
             .group = 1},
            Result<&R::SaveQuery>,
            IfResult<&R::CanSaveQuery>},
        Row{{.id = Id(Command::ExportCsv),
             .text = Str::ActionExportCsv,
             .tip = Str::ActionExportCsvTip,
             .menus = FileMenu,
             .group = 1},
            Result<&R::Export>,
            HasRecord},
        Row{{.id = Id(Command::RunAgain),
             .text = Str::ActionRunAgain,
             .tip = Str::ActionRunAgainTip,
             .icon = u"view-refresh",
             .keys = {{{Qt::Key_F5}}},
             .menus = FileMenu,
             .group = 2},
            Rerun<&B::RunAgain>},
        Row{{.id = Id(Command::Statement),
             .text = Str::ActionStatement,
             .tip = Str::ActionStatementTip,
             .menus = FileMenu,
             .group = 2},
            View<&V::ShowStatement>,
            If<&B::IsOpen>},
        Row{{.id = Id(Command::FitAllColumns),
             .text = Str::ActionFitAll,
             .tip = Str::ActionFitAllTip,
             .menus = FileMenu,
             .group = 2},
            FitAllColumns,
            HasRecord},
        Row{{.id = Id(Command::Options),
             .text = Str::ActionOptions,
             .tip = Str::ActionOptionsTip,
             .icon = u"configure",
             .menus = FileMenu,
             .group = 2},
            View<&V::ChooseOptions>},
        Row{{.id = Id(Command::Layout),
             .text = Str::ActionLayout,
             .tip = Str::ActionLayoutTip,
             .menus = FileMenu,
             .group = 2,
             .opens = LayoutMenu},
            OpenMenu},

        Row{{.id = Id(Command::NewRecord),
             .text = Str::ActionNewRecord,
             .tip = Str::ActionNewRecordTip,
             .icon = u"list-add",
             .keys = {{{Qt::CTRL | Qt::Key_N}, {Qt::Key_Insert, InGrid}}},
             .menus = ToolsMenu,
             .group = 3},
            Go<&B::AddRecord>,
            If<&B::CanUpdate>},
        Row{{.id = Id(Command::DeleteRecord),
             .text = Str::ActionDeleteRecord,
             .tip = Str::ActionDeleteRecordTip,
             .icon = u"list-remove",
             .keys = {{{Qt::CTRL | Qt::Key_Delete}}},
             .menus = ToolsMenu,
             .group = 3},
            Go<&B::DeleteRecord>,
            CanChangeRecords},
        Row{{.id = Id(Command::ToggleDetail),
             .text = Str::ActionDetail,
             .tip = Str::ActionDetailTip,
             .icon = u"view-list-details",
             .keys = {{{Qt::CTRL | Qt::Key_D}}},
             .menus = ToolsMenu,
             .group = 3},
            ToggleDetail,
            Detail},
        Row{{.id = Id(Command::FilterBySelection),
             .text = Str::ActionFilterBy,
             .tip = Str::ActionFilterByTip,
             .icon = u"view-filter",
             .menus = ToolsMenu | kPopups,
             .group = 4},
            FilterByCell<CellFilter::BySelection>,
            HasRecord},
        Row{{.id = Id(Command::FilterExcluding),
             .text = Str::ActionFilterExcluding,
             .tip = Str::ActionFilterExcludingTip,
             .menus = ToolsMenu | kPopups,
             .group = 4},
            FilterByCell<CellFilter::ExcludingSelection>,
            HasRecord},
        Row{{.id = Id(Command::FilterExpression),
             .text = Str::ActionFilterExpression,
             .tip = Str::ActionFilterExpressionTip,
             .keys = {{{Qt::CTRL | Qt::SHIFT | Qt::Key_F}}},
             .menus = ToolsMenu | kPopups,
             .group = 4},
            Result<&R::FilterByExpression>,
            HasRecord},
        Row{{.id = Id(Command::RemoveFilter),
             .text = Str::ActionRemoveFilter,
             .tip = Str::ActionRemoveFilterTip,
             .icon = u"edit-clear",
             .menus = ToolsMenu | kPopups,
             .group = 4},
            Rerun<&B::RemoveFilter>,
            If<&B::IsFiltered>},
        Row{{.id = Id(Command::SortAscending),
             .text = Str::ActionSortAscending,
             .tip = Str::ActionSortAscendingTip,
             .icon = u"view-sort-ascending",
             .menus = ToolsMenu | kPopups,
             .group = 5},
            Sort<SortDirection::Ascending>,
            HasRecord},
        Row{{.id = Id(Command::SortDescending),
             .text = Str::ActionSortDescending,
             .tip = Str::ActionSortDescendingTip,
             .icon = u"view-sort-descending",
             .menus = ToolsMenu | kPopups,
             .group = 5},
            Sort<SortDirection::Descending>,
            HasRecord},
        Row{{.id = Id(Command::SortExpression),
             .text = Str::ActionSortExpression,
             .tip = Str::ActionSortExpressionTip,
             .menus = ToolsMenu | kPopups,
             .group = 5},
            Result<&R::SortByExpression>,
            HasRecord},
        Row{{.id = Id(Command::EditAll),
             .text = Str::ActionEditAll,
             .tip = Str::ActionEditAllTip,
             .menus = ToolsMenu,
             .group = 6,
             .opens = EditAllMenu},
            OpenMenu,
            CanChangeRecords},
        Row{{.id = Id(Command::Aggregate),
             .text = Str::ActionAggregate,
             .tip = Str::ActionAggregateTip,
             .menus = ToolsMenu | DetailPopup,
             .group = 6,
             .opens = AggregateMenu},
            OpenMenu,
            HasRecord},
        Row{{.id = Id(Command::GoToRecord),
             .text = Str::ActionGoToRecord,
             .tip = Str::ActionGoToRecordTip,
             .icon = u"go-jump",
             .keys = {{{Qt::CTRL | Qt::Key_G}}},
             .menus = ToolsMenu,
             .group = 7},
            View<&V::GoTo>,
            HasRecord},
        Row{{.id = Id(Command::HideColumn),
             .text = Str::ActionHideColumn,
             .tip = Str::ActionHideColumnTip,
             .menus = GridPopup,
             .group = 8},
            Go<&B::HideColumn>,
            If<&B::CanHideColumn>},
        Row{{.id = Id(Command::ShowAllColumns),
             .text = Str::ActionShowAll,
             .tip = Str::ActionShowAllTip,
             .menus = GridPopup,
             .group = 8},
            Go<&B::ShowAllColumns>,
            If<&B::CanShowAllColumns>},
        Row{{.id = Id(Command::FitColumn),
             .text = Str::ActionFitColumn,
             .tip = Str::ActionFitColumnTip,
             .menus = GridPopup,
             .group = 8},
            FitColumn,
            HasRecord},
        Row{{.id = Id(Command::FitAllNow),
             .text = Str::ActionFitAllNow,
             .tip = Str::ActionFitAllTip,
             .menus = GridPopup,
             .group = 8},
            FitAllColumns,
            HasRecord},
        Row{{.id = Id(Command::DeleteAll),
             .text = Str::ActionDeleteAll,
             .tip = Str::ActionDeleteAllTip,
             .menus = EditAllMenu},
            Result<&R::DeleteAll>,
            CanChangeRecords},
        Row{{.id = Id(Command::UpdateAll),
             .text = Str::ActionUpdateAll,
             .tip = Str::ActionUpdateAllTip,
             .menus = EditAllMenu},
            Result<&R::UpdateAll>,
            CanChangeValues},
        Row{{.id = Id(Command::Sum), .text = Str::ActionSum, .tip = Str::ActionSumTip, .menus = AggregateMenu},
            Compute<Aggregate::Sum>,
            HasRecord},
        Row{{.id = Id(Command::Max), .text = Str::ActionMax, .tip = Str::ActionMaxTip, .menus = AggregateMenu},
            Compute<Aggregate::Max>,
            HasRecord},
        Row{{.id = Id(Command::Min), .text = Str::ActionMin, .tip = Str::ActionMinTip, .menus = AggregateMenu},
            Compute<Aggregate::Min>,
            HasRecord},
        Row{{.id = Id(Command::Avg), .text = Str::ActionAvg, .tip = Str::ActionAvgTip, .menus = AggregateMenu},
            Compute<Aggregate::Avg>,
            HasRecord},
        Row{{.id = Id(Command::LayoutFont),
             .text = Str::CommandFont,
             .tip = Str::TipFont,
             .icon = u"preferences-desktop-font",
             .menus = LayoutMenu},
            Look<LookItem::Font>},
        Row{{.id = Id(Command::LayoutBackground),
             .text = Str::CommandBackgroundColor,
             .tip = Str::TipColor,
             .menus = LayoutMenu},
            Look<LookItem::LineBackground>},
        Row{{.id = Id(Command::LayoutListBackground),
             .text = Str::CommandListBackgroundColor,
             .tip = Str::TipColor,
             .menus = LayoutMenu},
            Look<LookItem::ListBackground>},
        Row{{.id = Id(Command::LayoutButtonBackground),
             .text = Str::CommandButtonBackgroundColor,
             .tip = Str::TipColor,
             .menus = LayoutMenu},
            Look<LookItem::ButtonBackground>},
        Row{{.id = Id(Command::LayoutText),
             .text = Str::LayoutTextColor,
             .tip = Str::TipColor,
             .menus = LayoutMenu},
            Look<LookItem::LineText>},
        Row{{.id = Id(Command::LayoutListText),
             .text = Str::CommandListTextColor,
             .tip = Str::TipColor,
             .menus = LayoutMenu},
            Look<LookItem::ListText>},
        Row{{.id = Id(Command::LayoutButtonText),
             .text = Str::CommandButtonTextColor,
             .tip = Str::TipColor,
             .menus = LayoutMenu},
            Look<LookItem::ButtonText>},
        Row{{.id = Id(Command::LayoutReset),
             .text = Str::LayoutReset,
             .tip = Str::LayoutResetTip,
             .menus = LayoutMenu,
             .group = 1},
            Look<LookItem::Reset>},

        Row{{.id = Id(Command::Undo),
             .text = Str::ActionUndo,
             .tip = Str::ActionUndoTip,
             .icon = u"edit-undo",
             .keys = {{{Qt::CTRL | Qt::Key_Z}}},
             .menus = EditMenu | DetailPopup,
             .group = 9},
            Go<&B::Undo>,
            If<&B::CanUndo>},
        Row{{.id = Id(Command::Redo),
             .text = Str::ActionRedo,
             .tip = Str::ActionRedoTip,
             .icon = u"edit-redo",
             .keys = {{{Qt::CTRL | Qt::SHIFT | Qt::Key_Z}}},
             .menus = EditMenu,
             .group = 9},
            Go<&B::Redo>,
            If<&B::CanRedo>},
        Row{{.id = Id(Command::Copy),
             .text = Str::ActionCopy,
             .tip = Str::ActionCopyTip,
             .icon = u"edit-copy",
             .keys = {{{Qt::CTRL | Qt::Key_C}}},
             .menus = EditMenu | kPopups,
             .group = 10},
            Copy,
            HasRecord},
        Row{{.id = Id(Command::CopyWithNames),
             .text = Str::ActionCopyWithNames,
             .tip = Str::ActionCopyWithNamesTip,
             .keys = {{{Qt::CTRL | Qt::SHIFT | Qt::Key_C}}},
             .menus = EditMenu,
             .group = 10},
            CopyWithNames,
            HasRecord},
        Row{{.id = Id(Command::Paste),
             .text = Str::ActionPaste,
             .tip = Str::ActionPasteTip,
             .icon = u"edit-paste",
             .keys = {{{Qt::CTRL | Qt::Key_V}}},
             .menus = EditMenu | kPopups,
             .group = 10},
            View<&V::Paste>,
            If<&B::CanUpdate>},
        Row{{.id = Id(Command::RepeatAbove),
             .text = Str::ActionRepeatAbove,
             .tip = Str::ActionRepeatAboveTip,
             .keys = {{{Qt::CTRL | Qt::Key_Apostrophe}}},
             .menus = EditMenu,
             .group = 10},
            Type<&B::RepeatAbove>,
            If<&B::CanEdit>},
        Row{{.id = Id(Command::SelectAll),
             .text = Str::ActionSelectAll,
             .tip = Str::ActionSelectAllTip,
             .keys = {{{Qt::CTRL | Qt::Key_A}}},
             .menus = EditMenu,
             .group = 11},
            Select<&B::SelectAllCells>,
            InList},
        Row{{.id = Id(Command::SelectRecords),
             .text = Str::ActionSelectRecords,
             .tip = Str::ActionSelectRecordsTip,
             .keys = {{{Qt::SHIFT | Qt::Key_Space, InGrid}}},
             .menus = EditMenu,
             .group = 11},
            Select<&B::SelectWholeRecords>,
            InList},
        Row{{.id = Id(Command::SelectColumns),
             .text = Str::ActionSelectColumns,
             .tip = Str::ActionSelectColumnsTip,
             .keys = {{{Qt::CTRL | Qt::Key_Space, InGrid}}},
             .menus = EditMenu,
             .group = 11},
            Select<&B::SelectWholeColumns>,
            InList},
        Row{{.id = Id(Command::Find),
             .text = Str::ActionFind,
             .tip = Str::ActionFindTip,
             .icon = u"edit-find",
             .keys = {{{Qt::CTRL | Qt::Key_F}}},
             .menus = EditMenu,
             .group = 12},
            Find,
            HasRecord},
        Row{{.id = Id(Command::FindNext),
             .text = Str::ActionFindNext,
             .tip = Str::ActionFindNextTip,
             .icon = u"go-down",
             .keys = {{{Qt::Key_F3}}},
             .menus = EditMenu,
             .group = 12},
            FindNext,
            HasRecord},
        Row{{.id = Id(Command::FindPrevious),
             .text = Str::ActionFindPrevious,
             .tip = Str::ActionFindPreviousTip,
             .icon = u"go-up",
             .keys = {{{Qt::SHIFT | Qt::Key_F3}}},
             .menus = EditMenu,
             .group = 12},
            FindPrevious,
            HasRecord},
        Row{{.id = Id(Command::Zoom),
             .text = Str::ZoomIn,
             .tip = Str::ZoomTip,
             .icon = u"zoom-in",
             .keys = {{{Qt::SHIFT | Qt::Key_F2}}},
             .menus = EditMenu,
             .group = 13},
            View<&V::ToggleZoom>,
            Zooming},

        Row{{.id = Id(Command::First),
             .text = Str::ActionFirst,
             .tip = Str::ActionFirst,
             .icon = u"go-first",
             .keys = {{{Qt::CTRL | Qt::Key_Home, InGrid}}}},
            Go<&B::GoToFirst>,
            HasRecord},
        Row{{.id = Id(Command::Previous),
             .text = Str::ActionPrevious,
             .tip = Str::ActionPrevious,
             .icon = u"go-previous",
             .keys = {{{Qt::CTRL | Qt::Key_PageUp, InBoth}}}},
            Go<&B::GoToPrevious>,
            HasRecord},
        Row{{.id = Id(Command::Next),
             .text = Str::ActionNext,
             .tip = Str::ActionNext,
             .icon = u"go-next",
             .keys = {{{Qt::CTRL | Qt::Key_PageDown, InBoth}}}},
            Go<&B::GoToNext>,
            HasRecord},
        Row{{.id = Id(Command::Last),
             .text = Str::ActionLast,
             .tip = Str::ActionLast,
             .icon = u"go-last",
             .keys = {{{Qt::CTRL | Qt::Key_End, InGrid}}}},
            Go<&B::GoToLast>,
            HasRecord},
        Row{{.id = Id(Command::NextPane),
             .text = Str::ActionNextPane,
             .tip = Str::ActionNextPane,
             .keys = {{{Qt::Key_F6}}}},
            View<&V::FocusNextPane>},

        // Keys that no menu shows.
        Row{{.id = Id(Command::RowUp),
             .text = Str::KeyRowUp,
             .tip = Str::KeyRowUp,
             .keys = {{{Qt::Key_Up, InBoth}}}},
            Move<Rows<-1>>},
        Row{{.id = Id(Command::RowDown),
             .text = Str::KeyRowDown,
             .tip = Str::KeyRowDown,
             .keys = {{{Qt::Key_Down, InBoth}, {Qt::Key_Return, InEditor}, {Qt::Key_Enter, InEditor}}}},
            Move<Rows<1>>},
        Row{{.id = Id(Command::PageUp),
             .text = Str::KeyPageUp,
             .tip = Str::KeyPageUp,
             .keys = {{{Qt::Key_PageUp, InBoth}}}},
            Go<&B::PageUp>},
        Row{{.id = Id(Command::PageDown),
             .text = Str::KeyPageDown,
             .tip = Str::KeyPageDown,
             .keys = {{{Qt::Key_PageDown, InBoth}}}},
            Go<&B::PageDown>},
        Row{{.id = Id(Command::ColumnLeft),
             .text = Str::KeyColumnLeft,
             .tip = Str::KeyColumnLeft,
             .keys = {{{Qt::Key_Left, InGrid}}}},
            Move<Columns<-1>>},
        Row{{.id = Id(Command::ColumnRight),
             .text = Str::KeyColumnRight,
             .tip = Str::KeyColumnRight,
             .keys = {{{Qt::Key_Right, InGrid}}}},
            Move<Columns<1>>},
        Row{{.id = Id(Command::FirstColumn),
             .text = Str::KeyFirstColumn,
             .tip = Str::KeyFirstColumn,
             .keys = {{{Qt::Key_Home, InGrid}}}},
            Go<&B::MoveToFirstColumn>},
        Row{{.id = Id(Command::LastColumn),
             .text = Str::KeyLastColumn,
             .tip = Str::KeyLastColumn,
             .keys = {{{Qt::Key_End, InGrid}}}},
            Go<&B::MoveToLastColumn>},
        Row{{.id = Id(Command::ExtendUp),
             .text = Str::KeyExtend,
             .tip = Str::KeyExtend,
             .keys = {{{Qt::SHIFT | Qt::Key_Up, InGrid}}}},
            ExtendBy<Rows<-1>>},
        Row{{.id = Id(Command::ExtendDown),
             .text = Str::KeyExtend,
             .tip = Str::KeyExtend,
             .keys = {{{Qt::SHIFT | Qt::Key_Down, InGrid}}}},
            ExtendBy<Rows<1>>},
        Row{{.id = Id(Command::ExtendPageUp),
             .text = Str::KeyExtend,
             .tip = Str::KeyExtend,
             .keys = {{{Qt::SHIFT | Qt::Key_PageUp, InGrid}}}},
            Extend<&B::PageUp>},
        Row{{.id = Id(Command::ExtendPageDown),
             .text = Str::KeyExtend,
             .tip = Str::KeyExtend,
             .keys = {{{Qt::SHIFT | Qt::Key_PageDown, InGrid}}}},
            Extend<&B::PageDown>},
        Row{{.id = Id(Command::ExtendLeft),
             .text = Str::KeyExtend,
             .tip = Str::KeyExtend,
             .keys = {{{Qt::SHIFT | Qt::Key_Left, InGrid}}}},
            ExtendBy<Columns<-1>>},
        Row{{.id = Id(Command::ExtendRight),
             .text = Str::KeyExtend,
             .tip = Str::KeyExtend,
             .keys = {{{Qt::SHIFT | Qt::Key_Right, InGrid}}}},
            ExtendBy<Columns<1>>},
        Row{{.id = Id(Command::ExtendToFirstColumn),
             .text = Str::KeyExtend,
             .tip = Str::KeyExtend,
             .keys = {{{Qt::SHIFT | Qt::Key_Home, InGrid}}}},
            Extend<&B::MoveToFirstColumn>},
        Row{{.id = Id(Command::ExtendToLastColumn),
             .text = Str::KeyExtend,
             .tip = Str::KeyExtend,
             .keys = {{{Qt::SHIFT | Qt::Key_End, InGrid}}}},
            Extend<&B::MoveToLastColumn>},
        Row{{.id = Id(Command::ExtendToFirst),
             .text = Str::KeyExtend,
             .tip = Str::KeyExtend,
             .keys = {{{Qt::CTRL | Qt::SHIFT | Qt::Key_Home, InGrid}}}},
            Extend<&B::GoToFirst>},
        Row{{.id = Id(Command::ExtendToLast),
             .text = Str::KeyExtend,
             .tip = Str::KeyExtend,
             .keys = {{{Qt::CTRL | Qt::SHIFT | Qt::Key_End, InGrid}}}},
            Extend<&B::GoToLast>},
        Row{{.id = Id(Command::NextCell),
             .text = Str::KeyNextCell,
             .tip = Str::KeyNextCell,
             .keys = {{{Qt::Key_Tab, InBoth}}}},
            Go<&B::MoveToNextCell>},
        Row{{.id = Id(Command::PreviousCell),
             .text = Str::KeyPreviousCell,
             .tip = Str::KeyPreviousCell,
             .keys = {{{Qt::Key_Backtab, InBoth}, {Qt::SHIFT | Qt::Key_Backtab, InBoth}}}},
            Go<&B::MoveToPreviousCell>},
        Row{{.id = Id(Command::EditCell),
             .text = Str::KeyEditCell,
             .tip = Str::KeyEditCell,
             .keys = {{{Qt::Key_Return, InGrid}, {Qt::Key_Enter, InGrid}, {Qt::Key_F2, InGrid}}}},
            EditCell},
        Row{{.id = Id(Command::RevertEdit),
             .text = Str::KeyRevertEdit,
             .tip = Str::KeyRevertEdit,
             .keys = {{{Qt::Key_Escape, InBoth}}}},
            View<&V::Revert>},
        Row{{.id = Id(Command::ClearCell),
             .text = Str::KeyClearCell,
             .tip = Str::KeyClearCell,
             .keys = {{{Qt::Key_Delete, InGrid}}}},
            View<&V::Clear>},
    };
    return kRows;
}

std::optional<TableCommand> CommandOfKey(KeyPlace place, QKeyCombination keys)
{
    return CTableView::CommandOfKey(place, keys);
}

std::optional<TableCommand> CTableView::CommandOfKey(KeyPlace place, QKeyCombination keys)
{
    const unsigned part = place == KeyPlace::Grid ? InGrid : InEditor;
    const std::optional<int> id = CommandOfPartKey(Commands::Table(), part, keys);
    return id ? std::optional(TableCommand(*id)) : std::nullopt;
}

void CTableView::CreateActions()
{
    actions_ = new CommandActions(Commands::Table(), *this);
    actions_->WorkWhereOwnerHasFocus();
    connect(actions_, &CommandActions::given, this, [this](int id) { Do(TableCommand(id)); });
    for (const auto& [bit, title] : {std::pair(FileMenu, Str::MenuFile), std::pair(EditMenu, Str::MenuEdit),
                                     std::pair(ToolsMenu, Str::MenuTools)}) {
        menus_ += new QMenu(StringText(title), this);
        actions_->FillMenu(*menus_.back(), bit);
    }
}

QList<KeyHint> CTableView::Keys() const
{
    return actions_->KeyHints();
}

QAction* CTableView::ActionOf(TableCommand command) const
{
    return actions_->Of(Id(command));
}

void CTableView::ShowActions()
{
    ShowCommands(Commands::Table(), *actions_, *this);
}

void CTableView::Do(TableCommand command)
{
    RunCommand(Commands::Table(), Id(command), *this);
}

void CTableView::ShowPopup(const QPoint& globalPosition)
{
    if (!Settle(browser_.WriteEdit()))
        return;
    QMenu popup(this);
    const bool list = browser_.CurrentPresentation() == Presentation::List;
    actions_->FillMenu(popup, list ? GridPopup : DetailPopup);
    popup.exec(globalPosition);
}

} // namespace mirel
