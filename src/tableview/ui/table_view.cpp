#include "tableview/ui/table_view.h"

#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"
#include "tableview/ui/cell_strip.h"
#include "tableview/ui/filter_chip.h"
#include "tableview/ui/go_to_dialog.h"
#include "tableview/ui/navigation_row.h"
#include "tableview/ui/options_dialog.h"
#include "tableview/ui/record_grid.h"

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QCloseEvent>
#include <QKeyEvent>
#include <QMenu>
#include <QMenuBar>
#include <QPlainTextEdit>
#include <QStackedWidget>
#include <QVBoxLayout>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using Command = TableCommand;

constexpr int kCountSliceMs = 8;
constexpr int kWriteErrorDelayMs = 1;

// What the browser does by itself.
struct BrowserCall {
    Command command;
    bool (*call)(RecordBrowser&);
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
    BrowserCall{Command::NextCell, [](RecordBrowser& b) { return b.MoveToNextCell(); }},
    BrowserCall{Command::PreviousCell, [](RecordBrowser& b) { return b.MoveToPreviousCell(); }},
    BrowserCall{Command::ClearCell, [](RecordBrowser& b) { return b.ClearCell(), true; }},
    BrowserCall{Command::RepeatAbove, [](RecordBrowser& b) { return b.RepeatAbove(), true; }},
    BrowserCall{Command::InsertDateTime, [](RecordBrowser& b) { return b.InsertCurrentDateTime(), true; }},
    BrowserCall{Command::NewRecord, [](RecordBrowser& b) { return b.AddRecord(); }},
    BrowserCall{Command::DeleteRecord, [](RecordBrowser& b) { return b.DeleteRecord(); }},
    BrowserCall{Command::ToggleDetail, [](RecordBrowser& b) { return b.TogglePresentation(); }},
    BrowserCall{Command::RunAgain, [](RecordBrowser& b) { return b.RunAgain(); }},
    BrowserCall{Command::FilterBySelection,
                [](RecordBrowser& b) { return b.FilterByCell(CellFilter::BySelection); }},
    BrowserCall{Command::FilterExcluding,
                [](RecordBrowser& b) { return b.FilterByCell(CellFilter::ExcludingSelection); }},
    BrowserCall{Command::RemoveFilter, [](RecordBrowser& b) { return b.RemoveFilter(); }},
    BrowserCall{Command::SortAscending,
                [](RecordBrowser& b) { return b.SortByColumn(b.SelectedField(), SortDirection::Ascending); }},
    BrowserCall{Command::SortDescending,
                [](RecordBrowser& b) { return b.SortByColumn(b.SelectedField(), SortDirection::Descending); }},
    BrowserCall{Command::HideColumn, [](RecordBrowser& b) { return b.HideColumn(); }},
    BrowserCall{Command::ShowAllColumns, [](RecordBrowser& b) { return b.ShowAllColumns(); }},
};

} // namespace

CTableView::CTableView(DbConnection& connection, const QString& database, UserPrompt& prompt,
                       const TableViewSettings& settings, QWidget* parent)
    : QMainWindow(parent)
    , browser_(connection, database, prompt, settings)
    , prompt_(prompt)
    , stack_(new QStackedWidget(this))
    , grid_(new RecordGrid(browser_, this))
    , zoomEdit_(new QPlainTextEdit(this))
    , strip_(new CellStrip(browser_, this))
{
    CreateActions();
    chip_ = new FilterChip(ActionOf(Command::RemoveFilter), this);
    navigation_ = new NavigationRow({.first = ActionOf(Command::First),
                                     .previous = ActionOf(Command::Previous),
                                     .goTo = ActionOf(Command::GoToRecord),
                                     .next = ActionOf(Command::Next),
                                     .last = ActionOf(Command::Last),
                                     .newRecord = ActionOf(Command::NewRecord),
                                     .deleteRecord = ActionOf(Command::DeleteRecord),
                                     .detail = ActionOf(Command::ToggleDetail)},
                                    this);
    CreateMenus();
    LayOut();
    ConnectParts();
    ShowState();
    grid_->setFocus();
}

CTableView::~CTableView() = default;

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
    FillMenu(menuBar()->addMenu(StringText(Str::MenuTools)), ToolsMenu());
}

void CTableView::FillMenu(QMenu* menu, std::span<const MenuEntry> entries)
{
    menu->setToolTipsVisible(true);
    for (const MenuEntry entry : entries) {
        if (entry)
            menu->addAction(ActionOf(*entry));
        else
            menu->addSeparator();
    }
}

void CTableView::LayOut()
{
    auto* center = new QWidget(this);
    auto* column = new QVBoxLayout(center);
    column->setContentsMargins(0, 0, 0, 0);
    column->addWidget(stack_, 1);
    column->addWidget(chip_);
    column->addWidget(strip_);
    column->addWidget(navigation_);
    stack_->addWidget(grid_);
    stack_->addWidget(zoomEdit_);
    grid_->setFrameShape(QFrame::NoFrame);
    zoomEdit_->setTabChangesFocus(true);
    zoomEdit_->installEventFilter(this);
    grid_->setAccessibleName(StringText(Str::GridName));
    setCentralWidget(center);
    setContextMenuPolicy(Qt::NoContextMenu);
}

void CTableView::ConnectParts()
{
    connect(grid_, &RecordGrid::commandRequested, this, &CTableView::Do);
    connect(grid_, &RecordGrid::textTyped, this, [this](const QString& text) { Edit(&text); });
    connect(grid_, &RecordGrid::cellPressed, this,
            [this](int row, int cell) { Settle(browser_.SelectCell(row, cell)); });
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
    connect(strip_, &CellStrip::commandRequested, this, &CTableView::Do);
    connect(strip_, &CellStrip::textEdited, this, [this](const QString& text) {
        browser_.EditText(text);
        ShowState();
    });
    connect(strip_, &CellStrip::checkEdited, this, [this](bool checked) {
        browser_.EditChecked(checked);
        ShowState();
    });
    connect(zoomEdit_, &QPlainTextEdit::textChanged, this, [this] {
        if (showing_)
            return;
        browser_.EditText(zoomEdit_->toPlainText());
        ShowState();
    });
    connect(&countTimer_, &QTimer::timeout, this, [this] {
        if (browser_.CountOn(kCountSliceMs))
            ShowState();
    });
    // Other programs may have changed the records while the user was there.
    connect(qApp, &QGuiApplication::applicationStateChanged, this, [this](Qt::ApplicationState state) {
        if (state != Qt::ApplicationActive)
            return;
        browser_.TakeUpChanges();
        ShowState();
    });
}

bool CTableView::OpenTable(const QString& table)
{
    return OpenStatement(table, RecordBrowser::StatementOfTable(table));
}

bool CTableView::OpenStatement(const QString& title, const QString& statement)
{
    title_ = title;
    QApplication::setOverrideCursor(Qt::WaitCursor);
    const bool opened = browser_.Open(statement);
    QApplication::restoreOverrideCursor();
    return Settle(opened);
}

// --- showing ------------------------------------------------------------------------------------------------

bool CTableView::Settle(bool done)
{
    ShowState();
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
    showing_ = true;
    grid_->ShowState();
    strip_->ShowState(zoomed_);
    chip_->ShowConditions(browser_.Conditions());
    ShowZoom();
    ShowActions();
    navigation_->ShowCounter(browser_.CounterText());
    const Str title =
        !browser_.IsOpen() || browser_.CanUpdate() ? Str::TableViewTitle : Str::TableViewTitleReadOnly;
    setWindowTitle(StringText(title, {title_}));
    setWindowModified(browser_.HasPendingEdit());
    grid_->setAccessibleDescription(StringText(
        Str::CellDescription, {browser_.FieldLabel(), browser_.SelectedText(), browser_.CounterText()}));
    if (browser_.IsOpen() && !browser_.KnownCount())
        countTimer_.start(0);
    else
        countTimer_.stop();
    showing_ = false;
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
    if (zoomEdit_->toPlainText() != browser_.Edit().Text() && !browser_.HasPendingEdit())
        zoomEdit_->setPlainText(browser_.Edit().Text());
    if (moved)
        zoomEdit_->setFocus();
}

void CTableView::ShowActions()
{
    const bool hasRecord = browser_.SelectedRecord() >= 0;
    for (const TableCommand command :
         {Command::First, Command::Previous, Command::Next, Command::Last, Command::GoToRecord, Command::Copy,
          Command::FitColumn, Command::FitAllColumns, Command::FilterBySelection, Command::FilterExcluding,
          Command::SortAscending, Command::SortDescending})
        ActionOf(command)->setEnabled(hasRecord);
    ActionOf(Command::RemoveFilter)->setEnabled(browser_.IsFiltered());
    for (const TableCommand command : {Command::InsertDateTime, Command::RepeatAbove, Command::Paste})
        ActionOf(command)->setEnabled(browser_.CanEdit());
    ActionOf(Command::NewRecord)->setEnabled(browser_.CanUpdate());
    ActionOf(Command::DeleteRecord)->setEnabled(hasRecord && browser_.CanUpdate());
    ActionOf(Command::HideColumn)->setEnabled(browser_.CanHideColumn());
    ActionOf(Command::ShowAllColumns)->setEnabled(browser_.CanShowAllColumns());
    ActionOf(Command::Zoom)->setEnabled(zoomed_ || browser_.Edit().Kind() == EditorKind::Text);
    ActionOf(Command::Zoom)->setText(StringText(zoomed_ ? Str::ZoomBack : Str::ZoomIn));

    const bool list = browser_.CurrentPresentation() == Presentation::List;
    QAction* detail = ActionOf(Command::ToggleDetail);
    detail->setEnabled(browser_.IsOpen());
    detail->setText(StringText(list ? Str::ActionDetail : Str::ActionList));
    detail->setIcon(ThemeIcon(list ? u"view-list-details" : u"view-list-text"));
}

// --- commands -----------------------------------------------------------------------------------------------

void CTableView::Do(TableCommand command)
{
    const auto row = std::ranges::find(kBrowserCalls, command, &BrowserCall::command);
    if (row != kBrowserCalls.end()) {
        const bool fromEditor = strip_->HasEditorFocus();
        const bool isEdit = command == Command::RepeatAbove || command == Command::InsertDateTime;
        if (Run(row->call) && fromEditor && !isEdit)
            grid_->setFocus();
        return;
    }
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
        return Copy();
    case Command::Paste:
        return Paste();
    case Command::FitColumn:
        return grid_->FitColumn(browser_.SelectedColumn());
    case Command::FitAllColumns:
        return grid_->FitAllColumns();
    case Command::NextPane:
        return FocusNextPane();
    case Command::Options:
        return ChooseOptions();
    case Command::Close:
        close();
        return;
    default: // the rest is the browser's, above
        return;
    }
}

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

void CTableView::ShowPopup(const QPoint& globalPosition)
{
    if (!Settle(browser_.WriteEdit()))
        return;
    QMenu popup(this);
    FillMenu(&popup, PopupMenu());
    popup.exec(globalPosition);
}

void CTableView::closeEvent(QCloseEvent* event)
{
    if (!Settle(browser_.WriteEdit())) {
        event->ignore();
        return;
    }
    event->accept();
}

// The zoomed editor keeps its keys but for those that leave it.
bool CTableView::eventFilter(QObject* watched, QEvent* event)
{
    if (watched != zoomEdit_ || event->type() != QEvent::KeyPress)
        return QMainWindow::eventFilter(watched, event);
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
        return QMainWindow::eventFilter(watched, event);
    }
}

} // namespace mirel
