#include "forms/ui/form_eng_view.h"
#include "forms/ui/form_options_dialog.h"
#include "forms/ui/form_surface.h"
#include "forms/ui/record_list.h"
#include "platform/ui/menu_keys.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QMenu>
#include <QMenuBar>
#include <QScrollArea>
#include <QScrollBar>
#include <QStackedWidget>
#include <QToolBar>
#include <QTreeWidget>

// The commands of a running form's window: their actions and menus, when each can be given, and what carries it
// out.

namespace mirel {

using Command = FormCommand;

namespace {

QString TextOf(std::u16string_view text)
{
    return QString::fromUtf16(text.data(), qsizetype(text.size()));
}

} // namespace

void CFormEngView::CreateActions()
{
    for (const FormCommandDef& definition : FormCommands()) {
        auto* action = new QAction(ThemeIcon(TextOf(definition.icon)), StringText(definition.text), this);
        action->setToolTip(StringText(definition.tip));
        action->setShortcut(QKeySequence(TextOf(definition.keys), QKeySequence::PortableText));
        action->setCheckable(definition.checkable);
        action->setEnabled(definition.built);
        action->setMenuRole(QAction::NoRole);
        connect(action, &QAction::triggered, this, [this, id = definition.id] { Do(id); });
        addAction(action); // its key works although no menu may show it
        actions_.insert(definition.id, action);
    }
    ActionOf(Command::FitToWindow)->setChecked(form_.Settings().fitToWindow);
}

void CFormEngView::CreateMenus()
{
    menuBar()->setNativeMenuBar(false); // its place in a small window is the window
    FillMenu(menuBar()->addMenu(StringText(Str::MenuFile)), FormFileMenu());
    FillMenu(menuBar()->addMenu(StringText(Str::FormMenuRecord)), FormRecordMenu());
    FillMenu(menuBar()->addMenu(StringText(Str::FormMenuView)), FormViewMenu());
}

void CFormEngView::FillMenu(QMenu* menu, std::span<const FormMenuEntry> entries)
{
    menu->setToolTipsVisible(true);
    LeaveOutKeysWhenSmall(*menu, *this);
    for (const FormMenuEntry entry : entries) {
        if (entry)
            menu->addAction(ActionOf(*entry));
        else
            menu->addSeparator();
    }
}

void CFormEngView::CreateToolBar()
{
    toolBar_ = new QToolBar(StringText(Str::FormMenuRecord).remove(u'&'), this);
    toolBar_->setObjectName(QStringLiteral("records"));
    toolBar_->setMovable(false);
    toolBar_->setFloatable(false);
    const int side = style()->pixelMetric(QStyle::PM_SmallIconSize, nullptr, this);
    toolBar_->setIconSize(QSize(side, side)); // all of them fit on a handheld
    for (const FormMenuEntry entry : FormToolBar()) {
        if (entry)
            toolBar_->addAction(ActionOf(*entry));
        else
            toolBar_->addSeparator();
    }
    addToolBar(toolBar_);
}

void CFormEngView::ShowActions()
{
    const qint64 record = form_.CurrentRecord();
    const qint64 count = form_.RecordCount();
    ActionOf(Command::First)->setEnabled(count > 0);
    ActionOf(Command::Last)->setEnabled(count > 0);
    ActionOf(Command::Previous)->setEnabled(record > 0);
    ActionOf(Command::Next)->setEnabled(record >= 0 && record + 1 < count);
    ActionOf(Command::AddRecord)->setEnabled(form_.CanUpdate());
    ActionOf(Command::DeleteRecord)->setEnabled(form_.CanUpdate() && record >= 0);
    ActionOf(Command::Recalculate)->setEnabled(form_.HasResult());
    ActionOf(Command::Detail)->setChecked(CurrentPage() == Page::Detail);
    ActionOf(Command::List)->setChecked(CurrentPage() == Page::List);
    const bool saves = form_.FirstUpdateButton() >= 0;
    ActionOf(Command::Save)->setEnabled(saves);
    ActionOf(Command::Save)->setToolTip(StringText(saves ? Str::FormSaveTip : Str::FormSaveNone));

    const int control = CommandControl();
    const bool hasField = record >= 0 && form_.FieldOfControl(control) >= 0;
    for (const Command id :
         {Command::FilterBy, Command::FilterExcluding, Command::SortAscending, Command::SortDescending})
        ActionOf(id)->setEnabled(hasField);
    ActionOf(Command::RemoveFilter)->setEnabled(form_.IsFiltered());
    const ControlType type = control >= 0 ? form_.Controls()[size_t(control)].type : ControlType::None;
    const bool hasText = type == ControlType::EditBox || type == ControlType::DropDownBox;
    ActionOf(Command::Copy)->setEnabled(hasText);
    ActionOf(Command::Paste)->setEnabled(hasText);
    ActionOf(Command::Zoom)->setEnabled(hasText);

    const QScrollBar* bar = scroller_->verticalScrollBar();
    ActionOf(Command::ScrollUp)->setEnabled(bar->value() > bar->minimum());
    ActionOf(Command::ScrollDown)->setEnabled(bar->value() < bar->maximum());
}

bool CFormEngView::RunInForm(Command id)
{
    switch (id) {
    case Command::First:
        (void)form_.GoToFirst();
        return true;
    case Command::Previous:
        (void)form_.GoToPrevious();
        return true;
    case Command::Next:
        (void)form_.GoToNext();
        return true;
    case Command::Last:
        (void)form_.GoToLast();
        return true;
    case Command::AddRecord:
        if (form_.AddRecord() == RunningForm::Outcome::Done)
            surface_->FocusFirstInput();
        return true;
    case Command::DeleteRecord:
        (void)form_.DeleteRecord();
        return true;
    case Command::Save:
        (void)form_.PressButton(form_.FirstUpdateButton());
        return true;
    case Command::Recalculate:
        (void)form_.RunAgain();
        return true;
    case Command::FilterBy:
        (void)form_.FilterByControl(CommandControl(), CellFilter::BySelection);
        return true;
    case Command::FilterExcluding:
        (void)form_.FilterByControl(CommandControl(), CellFilter::ExcludingSelection);
        return true;
    case Command::RemoveFilter:
        (void)form_.RemoveFilter();
        return true;
    case Command::SortAscending:
        (void)form_.SortByControl(CommandControl(), SortOrder::Ascending);
        return true;
    case Command::SortDescending:
        (void)form_.SortByControl(CommandControl(), SortOrder::Descending);
        return true;
    default:
        return false;
    }
}

void CFormEngView::Do(Command id)
{
    if (RunInForm(id)) {
        ShowState();
        return;
    }
    switch (id) {
    case Command::ScrollUp:
        return Scroll(-1);
    case Command::ScrollDown:
        return Scroll(1);
    case Command::ScrollBar:
        return ShowScrollBar(ActionOf(id)->isChecked());
    case Command::FitToWindow: {
        FormViewSettings settings = form_.Settings();
        settings.fitToWindow = ActionOf(id)->isChecked();
        ChangeSettings(settings);
        Q_EMIT settingsChanged(settings);
        return;
    }
    case Command::Detail:
        return ShowPage(ActionOf(id)->isChecked() ? Page::Detail : Page::Form);
    case Command::List:
        return ShowPage(ActionOf(id)->isChecked() ? Page::List : Page::Form);
    case Command::Zoom:
        surface_->OpenMoreOf(CommandControl());
        return;
    case Command::Copy:
        return Copy();
    case Command::Paste:
        return Paste();
    case Command::Options:
        return ChooseOptions();
    case Command::Keys:
        Q_EMIT keysRequested();
        return;
    case Command::Close:
        close();
        return;
    default: // the rest is the form's, above, or disabled
        return;
    }
}

void CFormEngView::Copy()
{
    if (const int control = CommandControl(); control >= 0)
        QGuiApplication::clipboard()->setText(form_.Controls()[size_t(control)].text);
}

void CFormEngView::Paste()
{
    const int control = CommandControl();
    const QString text = QGuiApplication::clipboard()->text();
    if (control < 0 || text.isEmpty())
        return;
    (void)surface_->PasteInto(control, text);
}

void CFormEngView::ChangeSettings(const FormViewSettings& settings)
{
    form_.ChangeSettings(settings);
    ActionOf(Command::FitToWindow)->setChecked(settings.fitToWindow);
    FitSurface();
    ShowState();
    for (RecordList* list : findChildren<RecordList*>())
        list->viewport()->update();
}

void CFormEngView::ChooseOptions()
{
    CFormOptionsDialog dialog(form_.Settings(), this);
    if (dialog.exec() != QDialog::Accepted || dialog.Chosen() == form_.Settings())
        return;
    ChangeSettings(dialog.Chosen());
    Q_EMIT settingsChanged(form_.Settings());
}

void CFormEngView::ShowPopup(int control, const QPoint& globalPosition)
{
    if (control >= 0 && surface_->WidgetOf(control)->focusPolicy() != Qt::NoFocus)
        surface_->WidgetOf(control)->setFocus(Qt::PopupFocusReason);
    popupControl_ = control;
    ShowActions();
    QMenu popup(this);
    FillMenu(&popup, FormPopupMenu());
    popup.exec(globalPosition);
    popupControl_ = -1;
    ShowActions();
}

} // namespace mirel
