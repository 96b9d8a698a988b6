#include "platform/ui/memo_edit.h"
#include "platform/ui/menu_keys.h"
#include "platform/ui/wait_cursor.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"
#include "tableview/ui/cell_strip.h"
#include "tableview/ui/find_line.h"
#include "tableview/ui/record_grid.h"
#include "tableview/ui/result_commands.h"
#include "tableview/ui/table_view.h"

#include <QAction>
#include <QMenu>
#include <QMenuBar>
#include <QStackedWidget>

#include <algorithm>
#include <array>
#include <memory>

// The commands of the table view: their actions and menus, when each can be given, and what carries it out.

namespace mirel {
namespace {

using Command = TableCommand;

template <int Count>
bool Rows(RecordBrowser& browser)
{
    return browser.MoveRows(Count);
}

template <int Count>
bool Columns(RecordBrowser& browser)
{
    return browser.MoveColumns(Count);
}

constexpr bool kTakesTime = true;

// What the browser does by itself.
struct BrowserCall {
    Command command;
    bool (*call)(RecordBrowser&);
    bool takesTime = false; // runs a statement
};
constexpr std::array kBrowserCalls = {
    BrowserCall{Command::First, [](RecordBrowser& b) { return b.GoToFirst(); }},
    BrowserCall{Command::Previous, [](RecordBrowser& b) { return b.GoToPrevious(); }},
    BrowserCall{Command::Next, [](RecordBrowser& b) { return b.GoToNext(); }},
    BrowserCall{Command::Last, [](RecordBrowser& b) { return b.GoToLast(); }},
    BrowserCall{Command::RowUp, [](RecordBrowser& b) { return b.MoveRows(-1); }},
    BrowserCall{Command::RowDown, [](RecordBrowser& b) { return b.MoveRows(1); }},
    BrowserCall{Command::PageUp, [](RecordBrowser& b) { return b.PageUp(); }},
    BrowserCall{Command::PageDown, [](RecordBrowser& b) { return b.PageDown(); }},
    BrowserCall{Command::ColumnLeft, [](RecordBrowser& b) { return b.MoveColumns(-1); }},
    BrowserCall{Command::ColumnRight, [](RecordBrowser& b) { return b.MoveColumns(1); }},
    BrowserCall{Command::FirstColumn, [](RecordBrowser& b) { return b.MoveToFirstColumn(); }},
    BrowserCall{Command::LastColumn, [](RecordBrowser& b) { return b.MoveToLastColumn(); }},
    BrowserCall{Command::ExtendUp, [](RecordBrowser& b) { return b.Extend(Rows<-1>); }},
    BrowserCall{Command::ExtendDown, [](RecordBrowser& b) { return b.Extend(Rows<1>); }},
    BrowserCall{Command::ExtendPageUp, [](RecordBrowser& b) { return b.Extend(&RecordBrowser::PageUp); }},
    BrowserCall{Command::ExtendPageDown, [](RecordBrowser& b) { return b.Extend(&RecordBrowser::PageDown); }},
    BrowserCall{Command::ExtendLeft, [](RecordBrowser& b) { return b.Extend(Columns<-1>); }},
    BrowserCall{Command::ExtendRight, [](RecordBrowser& b) { return b.Extend(Columns<1>); }},
    BrowserCall{Command::ExtendToFirstColumn,
                [](RecordBrowser& b) { return b.Extend(&RecordBrowser::MoveToFirstColumn); }},
    BrowserCall{Command::ExtendToLastColumn,
                [](RecordBrowser& b) { return b.Extend(&RecordBrowser::MoveToLastColumn); }},
    BrowserCall{Command::ExtendToFirst, [](RecordBrowser& b) { return b.Extend(&RecordBrowser::GoToFirst); }},
    BrowserCall{Command::ExtendToLast, [](RecordBrowser& b) { return b.Extend(&RecordBrowser::GoToLast); }},
    BrowserCall{Command::SelectAll, [](RecordBrowser& b) { return b.SelectAllCells(), true; }},
    BrowserCall{Command::SelectRecords, [](RecordBrowser& b) { return b.SelectWholeRecords(), true; }},
    BrowserCall{Command::SelectColumns, [](RecordBrowser& b) { return b.SelectWholeColumns(), true; }},
    BrowserCall{Command::Undo, [](RecordBrowser& b) { return b.Undo(); }},
    BrowserCall{Command::NextCell, [](RecordBrowser& b) { return b.MoveToNextCell(); }},
    BrowserCall{Command::PreviousCell, [](RecordBrowser& b) { return b.MoveToPreviousCell(); }},
    BrowserCall{Command::RepeatAbove, [](RecordBrowser& b) { return b.RepeatAbove(), true; }},
    BrowserCall{Command::InsertDateTime, [](RecordBrowser& b) { return b.InsertCurrentDateTime(), true; }},
    BrowserCall{Command::NewRecord, [](RecordBrowser& b) { return b.AddRecord(); }},
    BrowserCall{Command::DeleteRecord, [](RecordBrowser& b) { return b.DeleteRecord(); }},
    BrowserCall{Command::ToggleDetail, [](RecordBrowser& b) { return b.TogglePresentation(); }},
    BrowserCall{Command::RunAgain, [](RecordBrowser& b) { return b.RunAgain(); }, kTakesTime},
    BrowserCall{Command::FilterBySelection,
                [](RecordBrowser& b) { return b.FilterByCell(CellFilter::BySelection); }, kTakesTime},
    BrowserCall{Command::FilterExcluding,
                [](RecordBrowser& b) { return b.FilterByCell(CellFilter::ExcludingSelection); }, kTakesTime},
    BrowserCall{Command::RemoveFilter, [](RecordBrowser& b) { return b.RemoveFilter(); }, kTakesTime},
    BrowserCall{Command::SortAscending,
                [](RecordBrowser& b) { return b.SortByColumn(b.SelectedField(), SortDirection::Ascending); },
                kTakesTime},
    BrowserCall{Command::SortDescending,
                [](RecordBrowser& b) { return b.SortByColumn(b.SelectedField(), SortDirection::Descending); },
                kTakesTime},
    BrowserCall{Command::HideColumn, [](RecordBrowser& b) { return b.HideColumn(); }},
    BrowserCall{Command::ShowAllColumns, [](RecordBrowser& b) { return b.ShowAllColumns(); }},
};

struct LookCommand {
    Command command;
    LookItem item;
};
constexpr std::array kLookItems = {
    LookCommand{Command::LayoutFont, LookItem::Font},
    LookCommand{Command::LayoutBackground, LookItem::LineBackground},
    LookCommand{Command::LayoutListBackground, LookItem::ListBackground},
    LookCommand{Command::LayoutButtonBackground, LookItem::ButtonBackground},
    LookCommand{Command::LayoutText, LookItem::LineText},
    LookCommand{Command::LayoutListText, LookItem::ListText},
    LookCommand{Command::LayoutButtonText, LookItem::ButtonText},
    LookCommand{Command::LayoutReset, LookItem::Reset},
};

} // namespace

void CTableView::CreateActions()
{
    for (const ActionRow& row : ActionRows()) {
        auto* action = new QAction(StringText(row.text), this);
        action->setToolTip(StringText(row.tip));
        if (row.icon)
            action->setIcon(ThemeIcon(row.icon));
        if (const QKeyCombination keys = ShortcutOf(row.command); keys.toCombined() != 0) {
            action->setShortcut(keys);
            const QString keyText = action->shortcut().toString(QKeySequence::NativeText);
            action->setToolTip(StringText(Str::TipWithKeys, {action->toolTip(), keyText}));
        }
        action->setEnabled(!IsToCome(row.command));
        connect(action, &QAction::triggered, this, [this, command = row.command] { Do(command); });
        addAction(action); // its key works although no menu may show it
        actions_.insert(row.command, action);
    }
}

void CTableView::CreateMenus()
{
    FillMenu(menuBar()->addMenu(StringText(Str::MenuFile)), FileMenu());
    FillMenu(menuBar()->addMenu(StringText(Str::MenuEdit)), EditMenu());
    FillMenu(menuBar()->addMenu(StringText(Str::MenuTools)), ToolsMenu());
}

void CTableView::FillMenu(QMenu* menu, std::span<const MenuEntry> entries)
{
    menu->setToolTipsVisible(true);
    LeaveOutKeysWhenSmall(*menu, *this);
    for (const MenuEntry entry : entries) {
        if (!entry) {
            menu->addSeparator();
            continue;
        }
        QAction* action = ActionOf(*entry);
        menu->addAction(action);
        if (const std::span<const MenuEntry> behind = SubmenuOf(*entry); !behind.empty() && !action->menu()) {
            action->setMenu(new QMenu(this));
            FillMenu(action->menu(), behind);
        }
    }
}

void CTableView::ShowPopup(const QPoint& globalPosition)
{
    if (!Settle(browser_.WriteEdit()))
        return;
    QMenu popup(this);
    const bool list = browser_.CurrentPresentation() == Presentation::List;
    FillMenu(&popup, list ? GridPopup() : DetailPopup());
    popup.exec(globalPosition);
}

void CTableView::ShowActions()
{
    const bool hasRecord = browser_.SelectedRecord() >= 0;
    for (const TableCommand command :
         {Command::First, Command::Previous, Command::Next, Command::Last, Command::GoToRecord, Command::Copy,
          Command::CopyWithNames, Command::Find, Command::FindNext, Command::FindPrevious, Command::FitColumn,
          Command::FitAllColumns, Command::FitAllNow, Command::FilterBySelection, Command::FilterExcluding,
          Command::SortAscending, Command::SortDescending})
        ActionOf(command)->setEnabled(hasRecord);
    for (const TableCommand command :
         {Command::FilterExpression, Command::SortExpression, Command::EditAll, Command::DeleteAll,
          Command::UpdateAll, Command::Aggregate, Command::Sum, Command::Max, Command::Min, Command::Avg,
          Command::OpenQuery, Command::SaveQuery, Command::ExportCsv})
        ActionOf(command)->setEnabled(resultCommands_->CanDo(command));
    ActionOf(Command::RemoveFilter)->setEnabled(browser_.IsFiltered());
    ActionOf(Command::Statement)->setEnabled(browser_.IsOpen());
    for (const TableCommand command : {Command::InsertDateTime, Command::RepeatAbove})
        ActionOf(command)->setEnabled(browser_.CanEdit());
    ActionOf(Command::Paste)->setEnabled(browser_.CanUpdate());
    ActionOf(Command::Undo)->setEnabled(browser_.CanUndo());
    ActionOf(Command::NewRecord)->setEnabled(browser_.CanUpdate());
    ActionOf(Command::DeleteRecord)->setEnabled(hasRecord && browser_.CanUpdate());
    ActionOf(Command::HideColumn)->setEnabled(browser_.CanHideColumn());
    ActionOf(Command::ShowAllColumns)->setEnabled(browser_.CanShowAllColumns());
    ActionOf(Command::Zoom)->setEnabled(zoomed_ || browser_.Edit().Kind() == EditorKind::Text);
    ActionOf(Command::Zoom)->setText(StringText(zoomed_ ? Str::ZoomBack : Str::ZoomIn));

    const bool list = browser_.CurrentPresentation() == Presentation::List;
    for (const TableCommand command : {Command::SelectAll, Command::SelectRecords, Command::SelectColumns})
        ActionOf(command)->setEnabled(hasRecord && list);
    QAction* detail = ActionOf(Command::ToggleDetail);
    detail->setEnabled(browser_.IsOpen());
    detail->setText(StringText(list ? Str::ActionDetail : Str::ActionList));
    detail->setIcon(ThemeIcon(list ? u"view-list-details" : u"view-list-text"));
}

void CTableView::Do(TableCommand command)
{
    if (command == Command::InsertDateTime && stack_->currentWidget() == zoomEdit_ && !zoomEdit_->isReadOnly())
        return zoomEdit_->insertPlainText(RecordBrowser::CurrentDateTimeText()); // a memo is not replaced by it
    const auto row = std::ranges::find(kBrowserCalls, command, &BrowserCall::command);
    if (row != kBrowserCalls.end()) {
        const bool fromEditor = strip_->HasEditorFocus();
        const bool isEdit = command == Command::RepeatAbove || command == Command::InsertDateTime;
        const auto waiting = row->takesTime ? std::make_unique<WaitCursor>() : nullptr;
        const qint64 before = browser_.SelectedRecord();
        if (Run(row->call) && fromEditor && !isEdit)
            grid_->setFocus();
        const bool listAgain =
            command == Command::ToggleDetail && browser_.CurrentPresentation() == Presentation::List;
        if (listAgain && browser_.SelectedRecord() != before)
            Note(StringText(Str::DetailLeft, {QString::number(browser_.SelectedRecord() + 1)}));
        return;
    }
    const auto look = std::ranges::find(kLookItems, command, &LookCommand::command);
    if (look != kLookItems.end()) {
        if (Settle(browser_.WriteEdit()))
            Q_EMIT lookRequested(look->item);
        return;
    }
    if (const std::optional<bool> done = resultCommands_->Do(command)) {
        Settle(*done);
        stack_->currentWidget()->setFocus();
        return;
    }
    DoHere(command);
}

void CTableView::DoHere(TableCommand command)
{
    switch (command) {
    case Command::EditCell:
        return Edit(nullptr);
    case Command::RevertEdit:
        return Revert();
    case Command::Zoom:
        return ToggleZoom();
    case Command::GoToRecord:
        return GoTo();
    case Command::Copy:
        return Copy(FieldNames::Without);
    case Command::CopyWithNames:
        return Copy(FieldNames::With);
    case Command::ClearCell:
        return Clear();
    case Command::Paste:
        return Paste();
    case Command::FitColumn:
        return grid_->FitColumn(browser_.SelectedColumn());
    case Command::Find:
        return findLine_->Open();
    case Command::FindNext:
        return findLine_->FindAgain(QuickFind::Direction::Forward);
    case Command::FindPrevious:
        return findLine_->FindAgain(QuickFind::Direction::Backward);
    case Command::Statement:
        return ShowStatement();
    case Command::Keys:
        return ShowKeys();
    case Command::FitAllNow:
    case Command::FitAllColumns:
        return grid_->FitAllColumns();
    case Command::NextPane:
        return FocusNextPane();
    case Command::Options:
        return ChooseOptions();
    case Command::Close:
        close();
        return;
    default: // the rest was done above
        return;
    }
}

} // namespace mirel
