#include "tableview/ui/cell_strip.h"
#include "tableview/ui/go_to_dialog.h"
#include "tableview/ui/navigation_row.h"
#include "tableview/ui/options_dialog.h"
#include "tableview/ui/record_grid.h"
#include "tableview/ui/table_view.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QPlainTextEdit>
#include <QStackedWidget>

// What the table view does with the selected cell, and its dialogs.

namespace mirel {

using Command = TableCommand;

void CTableView::Edit(const QString* typed)
{
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
    browser_.RevertEdit();
    ShowState();
    if (stack_->currentWidget() == zoomEdit_)
        zoomEdit_->setPlainText(browser_.Edit().Text());
    else
        grid_->setFocus();
}

void CTableView::Copy()
{
    QGuiApplication::clipboard()->setText(browser_.SelectedText());
}

void CTableView::Paste()
{
    QString text = QGuiApplication::clipboard()->text();
    if (text.endsWith(u'\n')) // a cell copied elsewhere comes as a line
        text.chop(1);
    browser_.EditText(text);
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

void CTableView::ChooseOptions()
{
    if (!Settle(browser_.WriteEdit()))
        return;
    COptionsDialog dialog(browser_.Settings(), this);
    if (dialog.exec() != QDialog::Accepted)
        return;
    Settle(browser_.ChangeSettings(dialog.Chosen()));
    Q_EMIT settingsChanged(browser_.Settings());
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
