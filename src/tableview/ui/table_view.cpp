#include "tableview/ui/table_view.h"

#include "platform/ui/error_line.h"
#include "platform/ui/hold_popup.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/memo_edit.h"
#include "platform/ui/wait_cursor.h"
#include "resources/string_table.h"
#include "tableview/ui/cell_strip.h"
#include "tableview/ui/filter_bar.h"
#include "tableview/ui/find_line.h"
#include "tableview/ui/navigation_row.h"
#include "tableview/ui/record_grid.h"
#include "tableview/ui/result_commands.h"
#include "tableview/why_not_stored.h"

#include <QApplication>
#include <QKeyEvent>
#include <QStackedWidget>
#include <QVBoxLayout>

#include <algorithm>

namespace mirel {
namespace {

constexpr int kSettleSliceMs = 8;
constexpr int kSettlePauseMs = 2; // others want to write meanwhile
constexpr int kWriteErrorDelayMs = 1;

} // namespace

using Command = TableCommand;

CTableView::CTableView(DbConnection& connection, const DatabaseLocation& database, UserPrompt& prompt,
                       const TableViewSettings& settings, QWidget* parent)
    : HostedView(parent)
    , browser_(connection, database, prompt, settings)
    , prompt_(prompt)
    , blocks_(browser_, prompt)
    , resultCommands_(new ResultCommands(browser_, connection, prompt, *this))
    , stack_(new QStackedWidget(this))
    , grid_(new RecordGrid(browser_, this))
    , zoomEdit_(new MemoEdit(this))
    , strip_(new CellStrip(browser_, this))
    , error_(new ErrorLine(this))
{
    CreateActions();
    filters_ = new FilterBar(FilterBar::Offers::All, this);
    findLine_ = new FindLine(
        browser_, {.next = ActionOf(Command::FindNext), .previous = ActionOf(Command::FindPrevious)}, this);
    navigation_ = new NavigationRow({.first = ActionOf(Command::First),
                                     .previous = ActionOf(Command::Previous),
                                     .goTo = ActionOf(Command::GoToRecord),
                                     .next = ActionOf(Command::Next),
                                     .last = ActionOf(Command::Last),
                                     .newRecord = ActionOf(Command::NewRecord),
                                     .deleteRecord = ActionOf(Command::DeleteRecord),
                                     .detail = ActionOf(Command::ToggleDetail)},
                                    this);
    LayOut();
    ConnectParts();
    ShowState();
    setFocusProxy(grid_); // who focuses the view without having been in it means the records
}

CTableView::~CTableView() = default;

void CTableView::LayOut()
{
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(spacing::kTight);
    column->addWidget(filters_);
    column->addWidget(stack_, 1);
    column->addWidget(findLine_);
    column->addWidget(error_);
    column->addWidget(strip_);
    column->addWidget(navigation_);
    stack_->addWidget(grid_);
    stack_->addWidget(zoomEdit_);
    grid_->setFrameShape(QFrame::NoFrame);
    zoomEdit_->setFrameShape(QFrame::NoFrame);
    zoomEdit_->installEventFilter(this);
    new HoldPopup(zoomEdit_->viewport(), [this] { return browser_.Settings().holdTimeMs; });
    grid_->setAccessibleName(StringText(Str::GridName));
    setContextMenuPolicy(Qt::NoContextMenu);
}

void CTableView::ConnectParts()
{
    connect(grid_, &RecordGrid::commandRequested, this, &CTableView::Do);
    connect(grid_, &RecordGrid::textTyped, this, [this](const QString& text) { Edit(&text); });
    connect(grid_, &RecordGrid::cellPressed, this,
            [this](int row, int cell) { Settle(browser_.SelectCell(row, cell)); });
    connect(grid_, &RecordGrid::cellReached, this,
            [this](int row, int cell) { Settle(browser_.ExtendToCell(row, cell)); });
    connect(grid_, &RecordGrid::selectedCellTapped, this, [this] {
        if (browser_.Edit().Kind() != EditorKind::Check || browser_.ShowsResult())
            return;
        browser_.EditChecked(!browser_.Edit().IsChecked());
        ShowState();
    });
    connect(grid_, &RecordGrid::cellDoubleTapped, this, [this] { Edit(nullptr); });
    connect(grid_, &RecordGrid::popupRequested, this, &CTableView::ShowPopup);
    connect(grid_, &RecordGrid::headerTapped, this, [this](int column) { Settle(browser_.TapHeader(column)); });
    connect(grid_, &RecordGrid::scrollRequested, this,
            [this](qint64 position) { Settle(browser_.ScrollTo(position)); });
    connect(grid_, &RecordGrid::thumbDragged, this,
            [this](qint64 position) { navigation_->ShowCounter(browser_.CounterTextAt(position)); });
    connect(grid_, &RecordGrid::rowsPerPageChanged, this, [this](int rows) {
        browser_.SetRowsPerPage(rows);
        ShowState();
    });
    connect(resultCommands_, &ResultCommands::queryOpened, this, &CTableView::SetTitle);
    connect(resultCommands_, &ResultCommands::queriesChanged, this, &CTableView::queriesChanged);
    connect(strip_, &CellStrip::commandRequested, this, &CTableView::Do);
    connect(strip_, &CellStrip::textEdited, this, [this](const QString& text) {
        browser_.EditText(text);
        ShowState();
    });
    connect(strip_, &CellStrip::checkEdited, this, [this](bool checked) {
        browser_.EditChecked(checked);
        ShowState();
    });
    connect(filters_, &FilterBar::removed, this, [this](int filter) {
        ChangeFilters([filter](RecordBrowser& browser) { return browser.TakeFilterOff(filter); });
    });
    connect(filters_, &FilterBar::switched, this, [this](int filter) {
        ChangeFilters([filter](RecordBrowser& browser) { return browser.SwitchFilter(filter); });
    });
    connect(filters_, &FilterBar::changeRequested, this, [this](int filter) {
        Settle(resultCommands_->ChangeFilter(filter));
        stack_->currentWidget()->setFocus();
    });
    connect(filters_, &FilterBar::addRequested, this, [this] { Do(Command::FilterExpression); });
    connect(findLine_, &FindLine::moved, this, [this] { Settle(!browser_.WriteFailed()); });
    connect(findLine_, &FindLine::closed, stack_, [this] { stack_->currentWidget()->setFocus(); });
    connect(zoomEdit_, &MemoEdit::edited, this, [this](const QString& text) {
        browser_.EditText(text);
        ShowState();
    });
    connect(strip_, &CellStrip::reasonRequested, this, [this] {
        refused_ = true;
        ShowState();
    });
    connect(strip_, &CellStrip::typedOverResult, this, [this](const QString& text) { Edit(&text); });
    connect(error_, &ErrorLine::restoreRequested, this, [this] { Do(Command::RevertEdit); });
    connect(&settleTimer_, &QTimer::timeout, this, [this] {
        if (browser_.SettleOn(kSettleSliceMs))
            ShowState();
    });
    // Other programs may have changed the records while the user was there.
    connect(qApp, &QGuiApplication::applicationStateChanged, this, [this](Qt::ApplicationState state) {
        if (state == Qt::ApplicationActive && isVisible())
            TakeUpChanges();
    });
}

void CTableView::ChangeFilters(const std::function<bool(RecordBrowser&)>& change)
{
    const WaitCursor waiting;
    Settle(change(browser_));
    stack_->currentWidget()->setFocus();
}

void CTableView::TakeUpChanges()
{
    if (givenUp_)
        return;
    browser_.TakeUpChanges();
    ShowState();
}

std::optional<RecordDraft> CTableView::Draft()
{
    return givenUp_ ? std::nullopt : browser_.Draft();
}

bool CTableView::PutBack(const RecordDraft& draft)
{
    const bool done = browser_.PutBack(draft);
    ShowState();
    if (done)
        Edit(nullptr);
    return done;
}

void CTableView::SetStore(FormStore& store)
{
    resultCommands_->SetStore(&store);
    ShowState();
}

void CTableView::SetQueryWriter(WriteQuery write)
{
    resultCommands_->SetQueryWriter(std::move(write));
    ShowState();
}

void CTableView::SetTitle(const QString& title)
{
    title_ = title;
    resultCommands_->SetTitle(title);
}

bool CTableView::OpenTable(const QString& table)
{
    return OpenStatement(table, RecordBrowser::StatementOfTable(table));
}

bool CTableView::OpenStatement(const QString& title, const QString& statement)
{
    SetTitle(title);
    const WaitCursor waiting;
    return Settle(browser_.Open(statement));
}

bool CTableView::Shows(const QString& table) const
{
    return std::ranges::any_of(browser_.Fields(), [&table](const ResultField& field) {
        return field.table.compare(table, Qt::CaseInsensitive) == 0;
    });
}

bool CTableView::RunAgain()
{
    const WaitCursor waiting;
    return Settle(browser_.RunAgain());
}

bool CTableView::RunRenamed(const QString& title, const std::function<QString(const QString&)>& renamed)
{
    const WaitCursor waiting;
    SetTitle(title);
    return Settle(browser_.OpenRenamed(renamed));
}

void CTableView::SetLook(const ViewLook& look)
{
    for (QWidget* part : {static_cast<QWidget*>(grid_), static_cast<QWidget*>(zoomEdit_),
                          static_cast<QWidget*>(strip_), static_cast<QWidget*>(findLine_)})
        part->setFont(look.font.value_or(QFont()));
    DrawAsList(*grid_, look.lists);
    DrawAsList(*zoomEdit_, look.lists);
    DrawAsLine(*strip_, look.line);
    DrawAsButtons(*navigation_, look.buttons);
    navigation_->setAutoFillBackground(look.buttons.background.has_value()); // its buttons have no ground
    ShowState();
}

ColumnWidths CTableView::WidthsByHand() const
{
    return grid_->WidthsByHand();
}

void CTableView::SetWidthsByHand(const ColumnWidths& widths)
{
    grid_->SetWidthsByHand(widths);
}

// --- showing ------------------------------------------------------------------------------------------------

void CTableView::Walk(bool (*call)(RecordBrowser&))
{
    const bool fromEditor = strip_->HasEditorFocus();
    if (Run(call) && fromEditor)
        grid_->setFocus();
}

bool CTableView::Settle(bool done)
{
    if (!done && browser_.WriteFailed()) {
        refused_ = true;
        refusal_ = {browser_.Edit().Text(), browser_.WriteError()};
    }
    ShowState();
    if (browser_.IsOpen() && browser_.Recordset().Generation() != generation_) {
        generation_ = browser_.Recordset().Generation();
        Q_EMIT recordsChanged();
    }
    if (!done && browser_.WriteFailed()) {
        QTimer::singleShot(kWriteErrorDelayMs, this, [this] {
            browser_.ShowWriteError();
            Edit(nullptr);
        });
    }
    return done;
}

void CTableView::ShowState()
{
    const bool wasRefused = refused_;
    refused_ = refused_ && browser_.HasPendingEdit();
    grid_->ShowState();
    strip_->ShowState(zoomed_);
    strip_->MarkRefused(refused_);
    if (refused_)
        ShowReason();
    else if (wasRefused || notedAt_ != CellPlace{browser_.SelectedRecord(), browser_.SelectedField()})
        error_->Clear();
    filters_->Show(browser_.Filters());
    ShowZoom();
    ShowActions();
    navigation_->ShowCounter(browser_.CounterText());
    const Str title =
        !browser_.IsOpen() || browser_.CanUpdate() ? Str::TableViewTitle : Str::TableViewTitleReadOnly;
    setWindowTitle(StringText(title, {title_}));
    setWindowModified(browser_.HasPendingEdit());
    if (std::exchange(hadEdit_, browser_.HasPendingEdit()) || hadEdit_)
        Q_EMIT typed();
    grid_->setAccessibleDescription(StringText(
        Str::CellDescription, {browser_.FieldLabel(), browser_.SelectedText(), browser_.CounterText()}));
    if (browser_.IsSettled())
        settleTimer_.stop();
    else
        settleTimer_.start(kSettlePauseMs);
}

// The words of what was typed; else, where the store has refused it, those of the store.
void CTableView::ShowReason()
{
    const QString why = browser_.WhyNotStored();
    const bool isRefusedText = browser_.Edit().Text() == refusal_.text;
    const QString what = !why.isEmpty() ? why : isRefusedText ? refusal_.why : QString();
    notedAt_ = {browser_.SelectedRecord(), browser_.SelectedField()};
    if (what.isEmpty())
        return error_->Clear();
    const QString before = Quoted(browser_.Edit().LoadedText()).replace(u'&', QStringLiteral("&&"));
    error_->ShowError(what, before.isEmpty() ? StringText(Str::ErrorRestoreEmpty)
                                             : StringText(Str::ErrorRestore, {before}));
}

void CTableView::Note(const QString& text)
{
    notedAt_ = {browser_.SelectedRecord(), browser_.SelectedField()};
    error_->ShowNote(text);
}

// Dates and ticks keep their ordinary editors while the view is zoomed.
void CTableView::ShowZoom()
{
    const bool shown = zoomed_ && browser_.Edit().Kind() == EditorKind::Text;
    const bool moved = shown != (stack_->currentWidget() == zoomEdit_);
    if (moved)
        stack_->setCurrentWidget(shown ? static_cast<QWidget*>(zoomEdit_) : grid_);
    if (!shown)
        return;
    zoomEdit_->setReadOnly(!browser_.CanEdit());
    zoomEdit_->setAccessibleName(browser_.FieldLabel());
    zoomEdit_->SetText(browser_.Edit().Text());
    if (moved)
        zoomEdit_->setFocus();
}

// The zoomed editor keeps its keys but for those that leave it.
bool CTableView::eventFilter(QObject* watched, QEvent* event)
{
    if (watched != zoomEdit_ || event->type() != QEvent::KeyPress)
        return HostedView::eventFilter(watched, event);
    switch (static_cast<QKeyEvent*>(event)->key()) {
    case Qt::Key_Escape:
        Do(Command::RevertEdit);
        return true;
    case Qt::Key_Tab:
        Do(Command::NextCell);
        return true;
    case Qt::Key_Backtab:
        Do(Command::PreviousCell);
        return true;
    default:
        return HostedView::eventFilter(watched, event);
    }
}

} // namespace mirel
