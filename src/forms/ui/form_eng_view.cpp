#include "forms/ui/form_eng_view.h"

#include "forms/ui/form_surface.h"
#include "forms/ui/record_list.h"
#include "platform/ui/error_line.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "result/cell_text.h"
#include "tableview/ui/filter_bar.h"
#include "tableview/why_not_stored.h"

#include <QApplication>
#include <QCloseEvent>
#include <QHeaderView>
#include <QInputMethod>
#include <QScrollArea>
#include <QScrollBar>
#include <QScroller>
#include <QStackedWidget>
#include <QTimer>
#include <QToolBar>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace mirel {
namespace {

constexpr int kClockMs = 1000;
constexpr int kCatchUpSliceMs = 8;
constexpr int kCatchUpPauseMs = 2;     // others want to write meanwhile
constexpr qreal kPreferredScale = 1.4; // forms are laid out for a handheld's pixels

} // namespace

CFormEngView::CFormEngView(const FormCall& call, const FormSurroundings& surroundings, QWidget* parent)
    : HostedView(parent)
    , form_(call, {.connection = surroundings.connection,
                   .database = surroundings.database,
                   .store = surroundings.store,
                   .prompt = surroundings.prompt,
                   .host = *this,
                   .settings = surroundings.settings,
                   .activeTable = surroundings.activeTable})
    , stack_(new QStackedWidget(this))
    , scroller_(new QScrollArea(this))
    , surface_(new FormSurface(form_, nullptr))
    , detail_(new QTreeWidget(this))
    , list_(new RecordList({.rows = [this](qint64 first, int count) { return form_.RecordTexts(first, count); },
                            .maxColumnChars = [this] { return form_.Settings().maxColumnChars; },
                            .isNumber =
                                [this](int field) {
                                    return size_t(field) < form_.Fields().size() &&
                                           IsRightAligned(form_.Fields()[size_t(field)].type);
                                }},
                           this))
    , error_(new ErrorLine(this))
{
    CreateActions();
    filters_ = new FilterBar(FilterBar::Offers::SwitchAndRemove, this);
    CreateToolBar();
    LayOut();
    connect(filters_, &FilterBar::removed, this, [this](int filter) {
        (void)form_.TakeFilterOff(filter);
        ShowState();
    });
    connect(filters_, &FilterBar::switched, this, [this](int filter) {
        (void)form_.SwitchFilter(filter);
        ShowState();
    });
    connect(surface_, &FormSurface::acted, this, &CFormEngView::ShowState);
    connect(surface_, &FormSurface::popupRequested, this, &CFormEngView::ShowPopup);
    connect(surface_, &FormSurface::focusMoved, this, [this](QWidget* widget) {
        lastFocused_ = surface_->ControlOf(widget);
        ShowControl(*widget);
        ShowActions();
        ShowReason();
    });
    connect(error_, &ErrorLine::restoreRequested, this, [this] { (void)surface_->Revert(refusedControl_); });
    connect(list_, &RecordList::headerTapped, this, &CFormEngView::SortByHeader);
    connect(list_, &RecordList::rowChosen, this, [this](qint64 row) {
        (void)form_.GoToRecord(row);
        ShowState();
    });
    ShowScrollBar(form_.Form().formScrollBar != 0);
    ShowState();
}

CFormEngView::~CFormEngView() = default;

void CFormEngView::LayOut()
{
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
    column->addWidget(toolBar_);
    column->addWidget(stack_, 1);
    column->addWidget(filters_);
    column->addWidget(error_);
    stack_->addWidget(scroller_);
    stack_->addWidget(detail_);
    stack_->addWidget(list_);
    list_->setFrameShape(QFrame::NoFrame);
    list_->setAccessibleName(StringText(Str::GridName));
    scroller_->setWidget(surface_);
    scroller_->setFrameShape(QFrame::NoFrame);
    scroller_->setFocusPolicy(Qt::NoFocus);
    scroller_->setAlignment(Qt::AlignHCenter | Qt::AlignTop);
    QScroller::grabGesture(scroller_->viewport(), QScroller::TouchGesture);
    scroller_->viewport()->setPalette(surface_->palette());
    scroller_->viewport()->setAutoFillBackground(true);
    scroller_->viewport()->installEventFilter(this);
    detail_->setColumnCount(2);
    detail_->setHeaderLabels({StringText(Str::DetailFieldColumn), StringText(Str::DetailValueColumn)});
    detail_->setRootIsDecorated(false);
    detail_->setUniformRowHeights(true);
    detail_->setAlternatingRowColors(true);
    detail_->setFrameShape(QFrame::NoFrame);
    detail_->setAccessibleName(StringText(Str::GridName));
    setContextMenuPolicy(Qt::NoContextMenu);
}

bool CFormEngView::Open()
{
    QApplication::setOverrideCursor(Qt::WaitCursor);
    const bool opened = form_.Open();
    QApplication::restoreOverrideCursor();
    ShowState();
    BeginAtTop();
    // Once the window has its size; by then the user may be elsewhere.
    QTimer::singleShot(0, this, [this, first = surface_->focusWidget()] {
        if (surface_->focusWidget() == first)
            BeginAtTop();
    });
    if (form_.HasClock())
        clock_.start(kClockMs, this);
    if (form_.Form().raiseInputPanel != 0)
        QTimer::singleShot(0, this, [] { QGuiApplication::inputMethod()->show(); });
    return opened;
}

void CFormEngView::RunAgain()
{
    if (form_.HasResult())
        (void)form_.RunAgain();
    ShowState();
}

QSize CFormEngView::PreferredSize() const
{
    const QSize form = (QSizeF(surface_->FormSize()) * kPreferredScale).toSize();
    const int bar = scroller_->verticalScrollBar()->sizeHint().width();
    return form + QSize(bar, toolBar_->sizeHint().height() + bar);
}

// --- the form's requests ------------------------------------------------------------------------------------

void CFormEngView::CallForm(const FormCall& call)
{
    Q_EMIT formCalled(call);
}

void CFormEngView::CloseForm()
{
    closing_ = true;
    QTimer::singleShot(0, this, &QWidget::close); // the form is in the middle of a call
}

void CFormEngView::DataChanged()
{
    Q_EMIT dataChanged();
}

void CFormEngView::closeEvent(QCloseEvent* event)
{
    if (!closing_ && form_.Close() != RunningForm::Outcome::Done) {
        event->ignore();
        ShowState();
        return;
    }
    closing_ = true;
    event->accept();
    Q_EMIT closed();
}

bool CFormEngView::MayClose()
{
    const bool may = closing_ || form_.LeaveRecordCheck();
    ShowState();
    return may;
}

void CFormEngView::GiveUpEdits()
{
    closing_ = true;
}

void CFormEngView::TakeUpChanges()
{
    form_.TakeUpChanges();
    ShowState();
}

std::optional<RecordDraft> CFormEngView::Draft()
{
    return closing_ ? std::nullopt : form_.Draft();
}

bool CFormEngView::PutBack(const RecordDraft& draft)
{
    const bool done = form_.PutBack(draft);
    ShowState();
    if (done)
        surface_->FocusControl(draft.texts.front().place);
    return done;
}

// --- showing ------------------------------------------------------------------------------------------------

void CFormEngView::ShowState()
{
    surface_->ShowState();
    const bool readOnly = form_.HasResult() && !form_.CanUpdate();
    setWindowTitle(StringText(readOnly ? Str::TableViewTitleReadOnly : Str::TableViewTitle, {form_.Title()}));
    setWindowModified(form_.IsDirty());
    filters_->Show(form_.Filters());
    if (std::exchange(wasDirty_, form_.IsDirty()) || wasDirty_)
        Q_EMIT typed();
    if (!form_.IsDirty())
        Q_EMIT recordsChanged(); // perhaps nothing was written: the listeners look
    if (CurrentPage() == Page::Detail)
        ShowDetail();
    if (CurrentPage() == Page::List)
        ShowList();
    ShowActions();
    ShowReason();
    if (!form_.IsBehind())
        catchUp_.stop();
    else if (!catchUp_.isActive())
        catchUp_.start(kCatchUpPauseMs, this);
}

void CFormEngView::ShowReason()
{
    refusedControl_ = -1;
    QString why;
    const std::span<const ControlRun> controls = form_.Controls();
    for (int i = 0; i < int(controls.size()) && why.isEmpty(); ++i) {
        const int field = controls[size_t(i)].edited ? form_.FieldOfControl(i) : -1;
        if (field < 0 || i == surface_->FocusedControl())
            continue;
        const ResultField& shown = form_.Fields()[size_t(field)];
        const bool isTyped = IsText(shown.type) || IsNumber(shown.type) || shown.type == FieldType::Date;
        why = isTyped ? WhyNotStored(controls[size_t(i)].text, shown.type, shown.size) : QString();
        if (why.isEmpty())
            continue;
        refusedControl_ = i;
        why = StringText(Str::WhyOfField, {shown.name, why});
    }
    surface_->MarkRefused(refusedControl_);
    if (refusedControl_ < 0)
        return error_->Clear();
    const QString before = Quoted(surface_->TextBefore(refusedControl_)).replace(u'&', QStringLiteral("&&"));
    error_->ShowError(why, before.isEmpty() ? StringText(Str::ErrorRestoreEmpty)
                                            : StringText(Str::ErrorRestore, {before}));
}

CFormEngView::Page CFormEngView::CurrentPage() const
{
    return Page(stack_->currentIndex()); // they were added in that order
}

void CFormEngView::ShowPage(Page page)
{
    stack_->setCurrentIndex(int(page));
    ShowState();
    if (page == Page::Form)
        BeginAtTop();
    else
        stack_->currentWidget()->setFocus();
}

void CFormEngView::ShowList()
{
    QStringList names;
    for (const ResultField& field : form_.Fields())
        names += field.name;
    if (names != list_->Columns())
        list_->SetColumns(names);
    list_->SetSortMark(sortedField_, sortedDescending_ ? Qt::DescendingOrder : Qt::AscendingOrder);
    list_->SetRows(form_.RecordCount(), form_.CurrentRecord());
}

void CFormEngView::SortByHeader(int field)
{
    if (!form_.Settings().sortByHeader)
        return;
    const bool descending = sortedField_ == field && !sortedDescending_;
    if (form_.SortByField(field, descending ? SortOrder::Descending : SortOrder::Ascending) ==
        RunningForm::Outcome::Done) {
        sortedField_ = field;
        sortedDescending_ = descending;
    }
    ShowState();
}

void CFormEngView::ShowDetail()
{
    const std::span<const ResultField> fields = form_.Fields();
    while (detail_->topLevelItemCount() > int(fields.size()))
        delete detail_->takeTopLevelItem(detail_->topLevelItemCount() - 1);
    while (detail_->topLevelItemCount() < int(fields.size()))
        new QTreeWidgetItem(detail_);
    for (int field = 0; field < int(fields.size()); ++field) {
        QTreeWidgetItem* row = detail_->topLevelItem(field);
        row->setText(0, fields[size_t(field)].name);
        row->setText(1, form_.FieldText(field));
        row->setToolTip(1, row->text(1).toHtmlEscaped());
    }
    detail_->resizeColumnToContents(0);
}

void CFormEngView::FitSurface()
{
    const QSize room = scroller_->viewport()->size();
    const SurfaceScale scale =
        form_.Settings().fitToWindow ? SurfaceScale::ToFit(surface_->FormSize(), room) : SurfaceScale{};
    if (scale != surface_->Scale())
        surface_->SetScale(scale);
    ShowActions();
}

// A form is shown from its top, and the focus is where that can be seen.
void CFormEngView::BeginAtTop()
{
    scroller_->verticalScrollBar()->setValue(0);
    surface_->FocusFirstInput(scroller_->viewport()->height());
    if (QWidget* control = surface_->focusWidget())
        ShowControl(*control);
}

void CFormEngView::ShowControl(QWidget& control)
{
    scroller_->ensureWidgetVisible(&control, 0, control.height() / 2);
}

void CFormEngView::ShowScrollBar(bool shown)
{
    scroller_->setVerticalScrollBarPolicy(shown ? Qt::ScrollBarAsNeeded : Qt::ScrollBarAlwaysOff);
    ShowActions();
}

bool CFormEngView::HasScrollBar() const
{
    return scroller_->verticalScrollBarPolicy() != Qt::ScrollBarAlwaysOff;
}

void CFormEngView::Scroll(int steps)
{
    QScrollBar* bar = scroller_->verticalScrollBar();
    bar->setValue(bar->value() + steps * form_.Settings().scrollPixels);
    ShowActions();
}

bool CFormEngView::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == scroller_->viewport()) {
        if (event->type() == QEvent::Resize)
            FitSurface();
        if (event->type() == QEvent::ContextMenu) {
            ShowPopup(-1, static_cast<QContextMenuEvent*>(event)->globalPos());
            return true;
        }
    }
    return HostedView::eventFilter(watched, event);
}

void CFormEngView::resizeEvent(QResizeEvent* event)
{
    HostedView::resizeEvent(event);
    // On a handheld every pixel of the bar is a button's.
    for (QAction* action : toolBar_->actions()) {
        if (action->isSeparator())
            action->setVisible(!IsHandheldSize(window()->size()));
    }
}

void CFormEngView::changeEvent(QEvent* event)
{
    HostedView::changeEvent(event);
    if (event->type() == QEvent::ApplicationFontChange)
        surface_->SetScale(surface_->Scale());
}

void CFormEngView::timerEvent(QTimerEvent* event)
{
    if (event->timerId() == clock_.timerId()) {
        form_.Tick();
        surface_->ShowState();
    } else if (event->timerId() == catchUp_.timerId()) {
        if (form_.CatchUp(kCatchUpSliceMs))
            ShowState();
    } else {
        HostedView::timerEvent(event);
    }
}

} // namespace mirel
