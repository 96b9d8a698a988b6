#include "forms/control_types.h"
#include "forms/ui/form_eng_view.h"
#include "forms/ui/form_options_dialog.h"
#include "forms/ui/form_surface.h"
#include "forms/ui/record_list.h"
#include "platform/ui/view_command.h"
#include "resources/string_table.h"

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QMenu>
#include <QScrollArea>
#include <QScrollBar>
#include <QStackedWidget>
#include <QToolBar>

#include <array>

// The commands of a running form's view: one row each; and what they open.

namespace mirel {
namespace {

using Command = FormCommand;
using Row = CommandRow<CFormEngView>;
using State = CommandState;

// Where commands show.
enum Menu : unsigned { FileMenu = 1, RecordMenu = 2, ViewMenu = 4, PopupMenu = 8, ToolBar = 16 };

constexpr int Id(Command command)
{
    return int(command);
}

} // namespace

// What the rows call and ask.
struct CFormEngView::Commands {
    using Outcome = RunningForm::Outcome;

    template <auto Call>
    static void Go(CFormEngView& view)
    {
        (void)(view.form_.*Call)();
        view.ShowState();
    }
    template <CellFilter Filter>
    static void FilterByControl(CFormEngView& view)
    {
        (void)view.form_.FilterByControl(view.CommandControl(), Filter);
        view.ShowState();
    }
    template <SortOrder Order>
    static void Sort(CFormEngView& view)
    {
        (void)view.form_.SortByControl(view.CommandControl(), Order);
        view.ShowState();
    }
    template <int Steps>
    static void ScrollBy(CFormEngView& view)
    {
        view.Scroll(Steps);
    }
    template <Page Shown>
    static void TogglePage(CFormEngView& view)
    {
        view.ShowPage(view.CurrentPage() == Shown ? Page::Form : Shown);
    }
    template <auto Call>
    static void View(CFormEngView& view)
    {
        (view.*Call)();
    }
    static void AddRecord(CFormEngView& view)
    {
        if (view.form_.AddRecord() == Outcome::Done)
            view.surface_->FocusFirstInput();
        view.ShowState();
    }
    static void Save(CFormEngView& view)
    {
        (void)view.form_.PressButton(view.form_.FirstUpdateButton());
        view.ShowState();
    }
    static void ToggleScrollBar(CFormEngView& view) { view.ShowScrollBar(!view.HasScrollBar()); }
    static void ToggleFit(CFormEngView& view)
    {
        FormViewSettings settings = view.form_.Settings();
        settings.fitToWindow = !settings.fitToWindow;
        view.ChangeSettings(settings);
        Q_EMIT view.settingsChanged(settings);
    }
    static void Zoom(CFormEngView& view) { view.surface_->OpenMoreOf(view.CommandControl()); }
    static void EditForm(CFormEngView& view) { Q_EMIT view.editRequested(); }

    static State HasRecords(const CFormEngView& view) { return {.enabled = view.form_.RecordCount() > 0}; }
    static State HasPrevious(const CFormEngView& view) { return {.enabled = view.form_.CurrentRecord() > 0}; }
    static State HasNext(const CFormEngView& view)
    {
        const qint64 record = view.form_.CurrentRecord();
        return {.enabled = record >= 0 && record + 1 < view.form_.RecordCount()};
    }
    static State CanUpdate(const CFormEngView& view) { return {.enabled = view.form_.CanUpdate()}; }
    static State CanDelete(const CFormEngView& view)
    {
        return {.enabled = view.form_.CanUpdate() && view.form_.CurrentRecord() >= 0};
    }
    static State CanUndo(const CFormEngView& view) { return {.enabled = view.form_.CanUndo()}; }
    static State CanRedo(const CFormEngView& view) { return {.enabled = view.form_.CanRedo()}; }
    static State HasResult(const CFormEngView& view) { return {.enabled = view.form_.HasResult()}; }
    static State IsFiltered(const CFormEngView& view) { return {.enabled = view.form_.IsFiltered()}; }
    static State Saves(const CFormEngView& view)
    {
        const bool saves = view.form_.FirstUpdateButton() >= 0;
        return {.enabled = saves, .tip = saves ? Str::FormSaveTip : Str::FormSaveNone};
    }
    static State HasField(const CFormEngView& view)
    {
        return {.enabled =
                    view.form_.CurrentRecord() >= 0 && view.form_.FieldOfControl(view.CommandControl()) >= 0};
    }
    static State HasText(const CFormEngView& view)
    {
        const int control = view.CommandControl();
        const ControlType type = control >= 0 ? view.form_.Controls()[size_t(control)].type : ControlType::None;
        return {.enabled = Has(type, ShowsText)};
    }
    static State CanScrollUp(const CFormEngView& view)
    {
        const QScrollBar* bar = view.scroller_->verticalScrollBar();
        return {.enabled = bar->value() > bar->minimum()};
    }
    static State CanScrollDown(const CFormEngView& view)
    {
        const QScrollBar* bar = view.scroller_->verticalScrollBar();
        return {.enabled = bar->value() < bar->maximum()};
    }
    static State ScrollBarShown(const CFormEngView& view) { return {.checked = view.HasScrollBar()}; }
    static State Fits(const CFormEngView& view) { return {.checked = view.form_.Settings().fitToWindow}; }
    template <Page Shown>
    static State IsOn(const CFormEngView& view)
    {
        return {.checked = view.CurrentPage() == Shown};
    }

    static std::span<const Row> Table();
};

std::span<const CommandRow<CFormEngView>> CFormEngView::Commands::Table()
{
    using F = RunningForm;
    using V = CFormEngView;
    constexpr bool kCheckable = true;
    // The tips of the tool bar are the commands' names. An editor keeps the keys that move within its text.
    static constexpr std::array kRows = {
        Row{{.id = Id(Command::Save),
             .text = Str::FormSave,
             .tip = Str::FormSaveTip,
             .icon = u"document-save",
             .keys = {{{Qt::CTRL | Qt::Key_S}}},
             .menus = FileMenu,
             .group = 0},
            Save,
            Saves},
        Row{{.id = Id(Command::Recalculate),
             .text = Str::FormRecalculate,
             .tip = Str::FormRecalculateTip,
             .icon = u"view-refresh",
             .keys = {{{Qt::Key_F5}}},
             .menus = FileMenu,
             .group = 0},
            Go<&F::RunAgain>,
            HasResult},
        Row{{.id = Id(Command::Options),
             .text = Str::ActionOptions,
             .tip = Str::FormOptionsTip,
             .icon = u"configure",
             .menus = FileMenu,
             .group = 1},
            View<&V::ChooseOptions>},
        Row{{.id = Id(Command::EditForm),
             .text = Str::FormEdit,
             .tip = Str::FormEditTip,
             .icon = u"document-edit",
             .menus = FileMenu,
             .group = 1},
            EditForm},
        Row{{.id = Id(Command::First),
             .text = Str::FormFirst,
             .tip = Str::FormFirstTip,
             .icon = u"go-first",
             .keys = {{{Qt::CTRL | Qt::Key_Home}}},
             .menus = RecordMenu | ToolBar,
             .group = 2},
            Go<&F::GoToFirst>,
            HasRecords},
        Row{{.id = Id(Command::Previous),
             .text = Str::FormPrevious,
             .tip = Str::FormPreviousTip,
             .icon = u"go-previous",
             .keys = {{{Qt::CTRL | Qt::Key_PageUp}}},
             .menus = RecordMenu | ToolBar,
             .group = 2},
            Go<&F::GoToPrevious>,
            HasPrevious},
        Row{{.id = Id(Command::Next),
             .text = Str::FormNext,
             .tip = Str::FormNextTip,
             .icon = u"go-next",
             .keys = {{{Qt::CTRL | Qt::Key_PageDown}}},
             .menus = RecordMenu | ToolBar,
             .group = 2},
            Go<&F::GoToNext>,
            HasNext},
        Row{{.id = Id(Command::Last),
             .text = Str::FormLast,
             .tip = Str::FormLastTip,
             .icon = u"go-last",
             .keys = {{{Qt::CTRL | Qt::Key_End}}},
             .menus = RecordMenu | ToolBar,
             .group = 2},
            Go<&F::GoToLast>,
            HasRecords},
        Row{{.id = Id(Command::AddRecord),
             .text = Str::FormAdd,
             .tip = Str::FormAddTip,
             .icon = u"list-add",
             .keys = {{{Qt::CTRL | Qt::Key_N}}},
             .menus = RecordMenu | ToolBar,
             .group = 3},
            AddRecord,
            CanUpdate},
        Row{{.id = Id(Command::DeleteRecord),
             .text = Str::FormDelete,
             .tip = Str::FormDeleteTip,
             .icon = u"list-remove",
             .keys = {{{Qt::CTRL | Qt::Key_Delete}}},
             .menus = RecordMenu | ToolBar,
             .group = 3},
            Go<&F::DeleteRecord>,
            CanDelete},
        Row{{.id = Id(Command::Undo),
             .text = Str::FormUndo,
             .tip = Str::FormUndoTip,
             .keys = {{{Qt::CTRL | Qt::Key_Z}}},
             .menus = RecordMenu,
             .group = 4},
            Go<&F::Undo>,
            CanUndo},
        Row{{.id = Id(Command::Redo),
             .text = Str::ActionRedo,
             .tip = Str::ActionRedoTip,
             .keys = {{{Qt::CTRL | Qt::SHIFT | Qt::Key_Z}}},
             .menus = RecordMenu,
             .group = 4},
            Go<&F::Redo>,
            CanRedo},
        Row{{.id = Id(Command::FilterBy),
             .text = Str::FormFilterBy,
             .tip = Str::FormFilterByTip,
             .icon = u"view-filter",
             .menus = RecordMenu | PopupMenu,
             .group = 4},
            FilterByControl<CellFilter::BySelection>,
            HasField},
        Row{{.id = Id(Command::FilterExcluding),
             .text = Str::FormFilterExcluding,
             .tip = Str::FormFilterExcludingTip,
             .menus = RecordMenu | PopupMenu,
             .group = 4},
            FilterByControl<CellFilter::ExcludingSelection>,
            HasField},
        Row{{.id = Id(Command::RemoveFilter),
             .text = Str::ActionRemoveFilter,
             .tip = Str::ActionRemoveFilterTip,
             .icon = u"edit-clear",
             .menus = RecordMenu | PopupMenu,
             .group = 4},
            Go<&F::RemoveFilter>,
            IsFiltered},
        Row{{.id = Id(Command::SortAscending),
             .text = Str::FormSortAscending,
             .tip = Str::FormSortAscendingTip,
             .icon = u"view-sort-ascending",
             .menus = RecordMenu | PopupMenu,
             .group = 5},
            Sort<SortOrder::Ascending>,
            HasField},
        Row{{.id = Id(Command::SortDescending),
             .text = Str::FormSortDescending,
             .tip = Str::FormSortDescendingTip,
             .icon = u"view-sort-descending",
             .menus = RecordMenu | PopupMenu,
             .group = 5},
            Sort<SortOrder::Descending>,
            HasField},
        Row{{.id = Id(Command::Copy),
             .text = Str::ActionCopy,
             .tip = Str::FormCopyTip,
             .icon = u"edit-copy",
             .menus = PopupMenu,
             .group = 6},
            View<&V::Copy>,
            HasText},
        Row{{.id = Id(Command::Paste),
             .text = Str::ActionPaste,
             .tip = Str::FormPasteTip,
             .icon = u"edit-paste",
             .menus = PopupMenu,
             .group = 6},
            View<&V::Paste>,
            HasText},
        Row{{.id = Id(Command::Zoom),
             .text = Str::FormZoom,
             .tip = Str::ZoomTip,
             .icon = u"zoom-in",
             .keys = {{{Qt::SHIFT | Qt::Key_F2}}},
             .menus = FileMenu | PopupMenu,
             .group = 6},
            Zoom,
            HasText},
        Row{{.id = Id(Command::ScrollUp),
             .text = Str::FormScrollUp,
             .tip = Str::FormScrollUpTip,
             .icon = u"go-up",
             .keys = {{{Qt::ALT | Qt::Key_PageUp}}},
             .menus = ViewMenu | ToolBar,
             .group = 7},
            ScrollBy<-1>,
            CanScrollUp},
        Row{{.id = Id(Command::ScrollDown),
             .text = Str::FormScrollDown,
             .tip = Str::FormScrollDownTip,
             .icon = u"go-down",
             .keys = {{{Qt::ALT | Qt::Key_PageDown}}},
             .menus = ViewMenu | ToolBar,
             .group = 7},
            ScrollBy<1>,
            CanScrollDown},
        Row{{.id = Id(Command::ScrollBar),
             .text = Str::FormScrollBar,
             .tip = Str::FormScrollBarTip,
             .icon = u"mirel-scrollbar",
             .menus = ViewMenu | ToolBar,
             .group = 7,
             .checkable = kCheckable},
            ToggleScrollBar,
            ScrollBarShown},
        Row{{.id = Id(Command::FitToWindow),
             .text = Str::FormFit,
             .tip = Str::FormFitTip,
             .menus = ViewMenu,
             .group = 8,
             .checkable = kCheckable},
            ToggleFit,
            Fits},
        Row{{.id = Id(Command::Detail),
             .text = Str::FormDetail,
             .tip = Str::FormDetailTip,
             .icon = u"view-list-details",
             .keys = {{{Qt::CTRL | Qt::Key_D}}},
             .menus = ViewMenu,
             .group = 8,
             .checkable = kCheckable},
            TogglePage<Page::Detail>,
            IsOn<Page::Detail>},
        Row{{.id = Id(Command::List),
             .text = Str::FormList,
             .tip = Str::FormListTip,
             .icon = u"view-list-text",
             .keys = {{{Qt::CTRL | Qt::Key_L}}},
             .menus = ViewMenu,
             .group = 8,
             .checkable = kCheckable},
            TogglePage<Page::List>,
            IsOn<Page::List>},
    };
    return kRows;
}

void CFormEngView::CreateActions()
{
    actions_ = new CommandActions(Commands::Table(), *this);
    actions_->WorkWhereOwnerHasFocus();
    actions_->LeaveKeysOutOfTips();
    connect(actions_, &CommandActions::given, this, [this](int id) { RunCommand(Commands::Table(), id, *this); });
    for (const auto& [bit, title] :
         {std::pair(FileMenu, Str::MenuFile), std::pair(RecordMenu, Str::FormMenuRecord),
          std::pair(ViewMenu, Str::FormMenuView)}) {
        menus_ += new QMenu(StringText(title), this);
        actions_->FillMenu(*menus_.back(), bit);
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
    actions_->FillToolBar(*toolBar_, ToolBar);
}

QAction* CFormEngView::ActionOf(FormCommand id) const
{
    return actions_->Of(Id(id));
}

QList<KeyHint> CFormEngView::Keys() const
{
    return actions_->KeyHints();
}

void CFormEngView::ShowActions()
{
    ShowCommands(Commands::Table(), *actions_, *this);
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
    actions_->FillMenu(popup, PopupMenu);
    popup.exec(globalPosition);
    popupControl_ = -1;
    ShowActions();
}

} // namespace mirel
