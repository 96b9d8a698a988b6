#include "platform/ui/memo_edit.h"
#include "resources/string_table.h"
#include "tableview/ui/cell_strip.h"
#include "tableview/ui/find_line.h"
#include "tableview/ui/go_to_dialog.h"
#include "tableview/ui/navigation_row.h"
#include "tableview/ui/options_dialog.h"
#include "tableview/ui/record_grid.h"
#include "tableview/ui/result_commands.h"
#include "tableview/ui/statement_dialog.h"
#include "tableview/ui/table_view.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QMimeData>
#include <QStackedWidget>

// What the table view does with the selected cell, and its dialogs.

namespace mirel {

using Command = TableCommand;

namespace {

const QString kCellsFormat = QStringLiteral("application/x-mirel-cells");

} // namespace

void CTableView::Edit(const QString* typed)
{
    if (browser_.ShowsResult()) {
        browser_.EndResult();
        ShowState();
    }
    if (const QString why = browser_.WhyNotEditable(); typed && !why.isEmpty())
        return Note(why);
    if (stack_->currentWidget() == zoomEdit_) {
        zoomEdit_->setFocus();
        return;
    }
    const bool isCheck = browser_.Edit().Kind() == EditorKind::Check;
    if (!typed) {
        strip_->BeginEdit();
    } else if (isCheck && *typed == u" ") {
        browser_.EditChecked(!browser_.Edit().IsChecked());
        ShowState();
    } else if (!isCheck && browser_.CanEdit()) {
        strip_->BeginTyping(*typed);
    }
}

void CTableView::Revert()
{
    const bool givesBack = browser_.HasPendingEdit() || browser_.ShowsResult();
    if (!givesBack && zoomed_)
        return ToggleZoom();
    if (!givesBack && !browser_.HasBlock())
        findLine_->hide();
    if (!givesBack)
        browser_.SelectBlock({});
    browser_.RevertEdit();
    ShowState();
    if (stack_->currentWidget() != zoomEdit_)
        grid_->setFocus();
}

// Beside the words that any program takes, the cells as we read them back: a text of several lines is one cell.
void CTableView::Copy(FieldNames names)
{
    constexpr qsizetype kMostHtmlCells = 200'000;
    if (browser_.HasBlock() && !Settle(browser_.WriteEdit()))
        return;
    const std::optional<TextRows> rows = blocks_.Copy(names);
    if (!rows)
        return;
    const QString text = TextOfRows(*rows);
    const bool isOne = rows->size() == 1 && rows->front().size() == 1;
    auto* copied = new QMimeData;
    copied->setText(isOne ? rows->front().front() : text);
    copied->setData(kCellsFormat, text.toUtf8());
    if (!isOne && qsizetype(rows->size()) * rows->front().size() <= kMostHtmlCells)
        copied->setHtml(HtmlOfRows(*rows));
    QGuiApplication::clipboard()->setMimeData(copied);
}

void CTableView::Paste()
{
    const QMimeData* copied = QGuiApplication::clipboard()->mimeData();
    const bool isOwn = copied->hasFormat(kCellsFormat);
    if (!isOwn && !copied->hasText())
        return;
    if (stack_->currentWidget() == zoomEdit_)
        return zoomEdit_->paste(); // at its caret
    if (const QString why = browser_.WhyNotEditable(); !why.isEmpty() && !browser_.HasBlock())
        return Note(why);
    const TextRows rows = RowsOfText(isOwn ? QString::fromUtf8(copied->data(kCellsFormat)) : copied->text());
    const bool isOne = rows.size() == 1 && rows.front().size() == 1;
    if (isOne && !browser_.HasBlock() && browser_.CanEdit() && browser_.Edit().Kind() != EditorKind::Check)
        browser_.EditText(rows.front().front()); // pending: Escape gives the old value back
    else
        Settle(blocks_.Paste(rows));
    ShowState();
}

void CTableView::Clear()
{
    if (browser_.HasBlock())
        Settle(blocks_.Clear());
    else
        browser_.ClearCell();
    ShowState();
}

void CTableView::GoTo()
{
    if (!Settle(browser_.WriteEdit()))
        return;
    CGoToDialog dialog(browser_.SelectedRecord() + 1, this);
    if (dialog.exec() != QDialog::Accepted)
        return;
    switch (dialog.Chosen()) {
    case CGoToDialog::Choice::Record:
        Settle(browser_.GoToRecord(dialog.Number()));
        return;
    case CGoToDialog::Choice::First:
        return Do(Command::First);
    case CGoToDialog::Choice::Last:
        return Do(Command::Last);
    case CGoToDialog::Choice::Previous:
        return Do(Command::Previous);
    case CGoToDialog::Choice::Next:
        return Do(Command::Next);
    }
}

void CTableView::ChangeSettings(const TableViewSettings& settings)
{
    browser_.ChangeSettings(settings);
    ShowState();
}

void CTableView::ChooseOptions()
{
    if (!Settle(browser_.WriteEdit()))
        return;
    COptionsDialog dialog(browser_.Settings(), this);
    if (dialog.exec() != QDialog::Accepted)
        return;
    ChangeSettings(dialog.Chosen());
    Q_EMIT settingsChanged(browser_.Settings());
}

void CTableView::ShowStatement()
{
    const bool mayEdit = resultCommands_->CanWriteQuery();
    CStatementDialog dialog(browser_.Statement(),
                            mayEdit ? CStatementDialog::Edit::Offered : CStatementDialog::Edit::NotOffered, this);
    if (dialog.exec() == QDialog::Accepted)
        Settle(resultCommands_->EditStatement());
}

void CTableView::FocusNextPane()
{
    if (grid_->hasFocus())
        strip_->BeginEdit();
    else if (strip_->HasEditorFocus())
        navigation_->focusWidget() ? navigation_->focusWidget()->setFocus() : navigation_->setFocus();
    else
        stack_->currentWidget()->setFocus();
}

void CTableView::ToggleZoom()
{
    zoomed_ = !zoomed_;
    ShowState();
    stack_->currentWidget()->setFocus();
}

} // namespace mirel
