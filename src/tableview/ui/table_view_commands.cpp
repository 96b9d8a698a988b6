#include "tableview/ui/table_view_commands.h"

#include "platform/ui/memo_edit.h"
#include "resources/string_table.h"
#include "tableview/ui/find_line.h"
#include "tableview/ui/record_grid.h"

#include <QMenu>

#include <vector>

// The dispatcher of the table view's commands, its menus and keys.

namespace mirel {

std::span<const TableRow> CTableView::Commands::Table()
{
    static const std::vector<TableRow> kRows = [] {
        std::vector<TableRow> rows;
        for (const std::span<const TableRow> part :
             {FileRows(), RecordRows(), SubmenuRows(), EditRows(), KeyRows()})
            rows.insert(rows.end(), part.begin(), part.end());
        return rows;
    }();
    return kRows;
}

void CTableView::Commands::InsertDateTime(CTableView& view)
{
    if (view.stack_->currentWidget() == view.zoomEdit_ && !view.zoomEdit_->isReadOnly())
        view.zoomEdit_->insertPlainText(RecordBrowser::CurrentDateTimeText()); // a memo is not replaced by it
    else
        Type<&RecordBrowser::InsertCurrentDateTime>(view);
}

void CTableView::Commands::ToggleDetail(CTableView& view)
{
    const qint64 before = view.browser_.SelectedRecord();
    Go<&RecordBrowser::TogglePresentation>(view);
    const bool list = view.browser_.CurrentPresentation() == Presentation::List;
    if (list && view.browser_.SelectedRecord() != before)
        view.Note(StringText(Str::DetailLeft, {QString::number(view.browser_.SelectedRecord() + 1)}));
}

void CTableView::Commands::FitColumn(CTableView& view)
{
    view.grid_->FitColumn(view.browser_.SelectedColumn());
}

void CTableView::Commands::FitAllColumns(CTableView& view)
{
    view.grid_->FitAllColumns();
}

void CTableView::Commands::Find(CTableView& view)
{
    view.findLine_->Open();
}

void CTableView::Commands::FindNext(CTableView& view)
{
    view.findLine_->FindAgain(QuickFind::Direction::Forward);
}

void CTableView::Commands::FindPrevious(CTableView& view)
{
    view.findLine_->FindAgain(QuickFind::Direction::Backward);
}

CommandState CTableView::Commands::Zooming(const CTableView& view)
{
    const bool zoomed = view.zoomed_;
    return {.enabled = zoomed || view.browser_.Edit().Kind() == EditorKind::Text,
            .text = zoomed ? Str::ZoomBack : Str::ZoomIn};
}

CommandState CTableView::Commands::Detail(const CTableView& view)
{
    const bool list = view.browser_.CurrentPresentation() == Presentation::List;
    return {.enabled = view.browser_.IsOpen(),
            .text = list ? Str::ActionDetail : Str::ActionList,
            .icon = list ? u"view-list-details" : u"view-list-text"};
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
    for (const auto& [bit, title] :
         {std::pair(TableFileMenu, Str::MenuFile), std::pair(TableEditMenu, Str::MenuEdit),
          std::pair(TableToolsMenu, Str::MenuTools)}) {
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
    actions_->FillMenu(popup, list ? TableGridPopup : TableDetailPopup);
    popup.exec(globalPosition);
}

} // namespace mirel
