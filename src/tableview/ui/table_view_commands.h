#pragma once

#include "platform/ui/view_command.h"
#include "platform/ui/wait_cursor.h"
#include "tableview/bulk_commands.h"
#include "tableview/ui/result_commands.h"
#include "tableview/ui/table_view.h"

#include <QStackedWidget>

// For the files that hold the table view's commands alone: one row each, the rows of a menu in a file of their
// own.

namespace mirel {

using TableRow = CommandRow<CTableView>;

// Where keys work. An editor keeps the keys that move within its text.
enum TableKeyPart : unsigned { InGrid = OnPart, InEditor = OnPart << 1, InBoth = InGrid | InEditor };

// Where commands show.
enum TableMenu : unsigned {
    TableFileMenu = 1,
    TableEditMenu = 2,
    TableToolsMenu = 4,
    TableGridPopup = 8,
    TableDetailPopup = 16,
    TableEditAllMenu = 32,
    TableAggregateMenu = 64,
    TableLayoutMenu = 128,
    TablePopups = TableGridPopup | TableDetailPopup,
};

constexpr int Id(TableCommand command)
{
    return int(command);
}

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
    static void InsertDateTime(CTableView& view);
    static void ToggleDetail(CTableView& view);
    static void EditCell(CTableView& view) { view.Edit(nullptr); }
    static void Copy(CTableView& view) { view.Copy(FieldNames::Without); }
    static void CopyWithNames(CTableView& view) { view.Copy(FieldNames::With); }
    static void FitColumn(CTableView& view);
    static void FitAllColumns(CTableView& view);
    static void Find(CTableView& view);
    static void FindNext(CTableView& view);
    static void FindPrevious(CTableView& view);
    static void OpenMenu(CTableView&) {} // the menu behind it does

    // --- when -------------------------------------------------------------------------------------------------

    template <auto Call>
    static CommandState If(const CTableView& view)
    {
        return {.enabled = (view.browser_.*Call)()};
    }
    template <auto Call>
    static CommandState IfResult(const CTableView& view)
    {
        return {.enabled = (view.resultCommands_->*Call)()};
    }
    static bool HasRecordIn(const CTableView& view) { return view.browser_.SelectedRecord() >= 0; }
    static CommandState HasRecord(const CTableView& view) { return {.enabled = HasRecordIn(view)}; }
    static CommandState InList(const CTableView& view)
    {
        return {.enabled = HasRecordIn(view) && view.browser_.CurrentPresentation() == Presentation::List};
    }
    static CommandState CanChangeRecords(const CTableView& view)
    {
        return {.enabled = HasRecordIn(view) && view.browser_.CanUpdate()};
    }
    static CommandState CanChangeValues(const CTableView& view)
    {
        return {.enabled = HasRecordIn(view) && view.browser_.CanEdit()};
    }
    static CommandState Zooming(const CTableView& view);
    static CommandState Detail(const CTableView& view);

    // The rows, in the order in which their menus show them.
    static std::span<const TableRow> Table();
    static std::span<const TableRow> FileRows();
    static std::span<const TableRow> RecordRows();
    static std::span<const TableRow> SubmenuRows();
    static std::span<const TableRow> EditRows();
    static std::span<const TableRow> KeyRows();
};

} // namespace mirel
