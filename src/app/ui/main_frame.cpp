#include "app/ui/main_frame.h"

#include "app/ui/display_look.h"
#include "app/ui/empty_page.h"
#include "app/ui/entry_panel.h"
#include "app/ui/lumo_view.h"
#include "app/ui/open_views.h"
#include "app/ui/shell_actions.h"
#include "app/ui/side_bar.h"
#include "app/ui/view_tabs.h"
#include "app/ui/view_window.h"
#include "forms/ui/form_eng_view.h"
#include "platform/ui/keys_dialog.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"
#include "tableeditor/ui/table_dialog.h"
#include "tableview/ui/table_view.h"

#include <QApplication>
#include <QCloseEvent>
#include <QDir>
#include <QFileInfo>
#include <QFrame>
#include <QLabel>
#include <QMenuBar>
#include <QSplitter>
#include <QToolButton>
#include <QVBoxLayout>

#include <algorithm>

// The main window: its parts, its menus, and what it does with databases. What it does with views stands in
// main_frame_views.cpp, its commands in main_frame_commands.cpp.

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const QString kFramePlace = u"frame"_s;
const QString kWindowSection = u"Window"_s;
const QString kSideBarKey = u"sideBar"_s;
constexpr QSize kFrameFirstSize(1100, 700);
constexpr QSize kSmallestSize(160, 160);
constexpr int kSideBarFirstWidth = 212;
constexpr int kSideBarLeastWidth = 140;
constexpr int kLookAtFileMs = 1000;
// What the name in the corner takes of the window's width: a third of it at most, a fifth at least.
constexpr int kMostCornerShare = 3;
constexpr int kLeastCornerShare = 5;

// What the menus leave for the name in the corner.
int RoomForName(const QMenuBar& menus, int widthPx)
{
    int taken = spacing::kSection; // the arrow beside the name
    for (const QAction* menu : menus.actions())
        taken += menus.fontMetrics().size(Qt::TextShowMnemonic, menu->text()).width() + spacing::kWide;
    return std::clamp(widthPx - taken, widthPx / kLeastCornerShare, widthPx / kMostCornerShare);
}

// Between parts of the window.
QFrame* Line(QFrame::Shape shape, QWidget* parent)
{
    auto* line = new QFrame(parent);
    line->setFrameShape(shape);
    line->setFrameShadow(QFrame::Plain);
    line->setForegroundRole(QPalette::Mid);
    line->setLineWidth(1);
    return line;
}

} // namespace

CMainFrame::CMainFrame(DatabaseSession& session, MainViewState& state, MainViewCommands& commands,
                       Settings& settings, Profile& profile)
    : session_(session)
    , state_(state)
    , commands_(commands)
    , settings_(settings)
    , profile_(profile)
    , actions_(new ShellActions(*this))
    , openViews_(
          std::make_unique<OpenViews>(session, OpenViews::Lists{[this] { return ViewsOf<CTableView>(); },
                                                                [this] { return ViewsOf<CFormEngView>(); }}))
    , drafts_(session.Folder().DraftsFolder())
{
    MakeParts();
    MakeMenus();
    Connect();
    setAcceptDrops(true);
    setMinimumSize(kSmallestSize);
    setWindowIcon(QIcon(u":/icons/mirel.svg"_s));
    RestorePlace(*this, profile, kFramePlace, kFrameFirstSize);
    const int sideWidth =
        std::max(profile.ReadInt(kWindowSection, kSideBarKey, kSideBarFirstWidth), kSideBarLeastWidth);
    splitter_->setSizes({sideWidth, std::max(width() - sideWidth, 1)});
    wide_ = !IsWide(); // so that it is fitted
    FitWidth();
    ShowState();
    ShowLook();
    ShowLists();
    session_.AddListener(*this);
    commands_.SetViewHost(this);
    commands_.SetOpenViews(openViews_.get());
}

CMainFrame::~CMainFrame()
{
    commands_.SetViewHost(nullptr);
    commands_.SetOpenViews(nullptr);
    session_.RemoveListener(*this);
}

void CMainFrame::MakeParts()
{
    auto* whole = new QWidget(this);
    notice_ = new QLabel(whole);
    notice_->setWordWrap(true);
    notice_->setMargin(8);
    notice_->setTextFormat(Qt::PlainText);
    notice_->hide();
    splitter_ = new QSplitter(whole);
    splitter_->setChildrenCollapsible(false);
    splitter_->setHandleWidth(1);
    sidePane_ = new QWidget(splitter_);
    sidePane_->setMinimumWidth(kSideBarLeastWidth);
    sideBar_ = new SideBar(state_, *actions_, sidePane_);
    panel_ = new EntryPanel(session_, sidePane_);
    auto* lines = new QVBoxLayout;
    lines->setSpacing(0);
    lines->addWidget(sideBar_, 1);
    lines->addWidget(Line(QFrame::HLine, sidePane_));
    lines->addWidget(panel_);
    auto* side = new QHBoxLayout(sidePane_);
    side->setContentsMargins({});
    side->setSpacing(0);
    side->addLayout(lines, 1);
    side->addWidget(Line(QFrame::VLine, sidePane_));
    tabs_ = new ViewTabs([this](const ViewKey& key) { return MakeView(key); }, splitter_);
    tabs_->SetHomes({.withBar = [this] { return &Home(); }, .withoutBar = [this] { return &Lists(); }});
    splitter_->addWidget(sidePane_);
    splitter_->addWidget(tabs_);
    splitter_->setStretchFactor(0, 0);
    splitter_->setStretchFactor(1, 1);
    auto* column = new QVBoxLayout(whole);
    column->setContentsMargins({});
    column->setSpacing(0);
    column->addWidget(notice_);
    column->addWidget(splitter_, 1);
    setCentralWidget(whole);
}

CLumoView& CMainFrame::Lists()
{
    if (!lists_) {
        lists_ = new CLumoView(state_, *actions_, tabs_);
        tabs_->AddHome(lists_);
        lists_->SetLook(LookOf(DisplayChoice(settings_, DisplayView::Main)));
        lists_->ShowRecent(settings_.RecentDatabases());
        connect(lists_, &CLumoView::RecentChosen, this, &CMainFrame::OpenPath);
    }
    return *lists_;
}

EmptyPage& CMainFrame::Home()
{
    if (!emptyPage_) {
        emptyPage_ = new EmptyPage(*actions_, tabs_);
        tabs_->AddHome(emptyPage_);
        emptyPage_->Show(state_, settings_.RecentDatabases());
        connect(emptyPage_, &EmptyPage::RecentChosen, this, &CMainFrame::OpenPath);
    }
    return *emptyPage_;
}

void CMainFrame::MakeMenus()
{
    menuBar()->setNativeMenuBar(false); // its place in a small window is the window
    fileMenu_ = new QMenu(StringText(Str::MenuFile), this);
    databaseMenu_ = new QMenu(StringText(Str::MenuDatabase), this);
    windowMenu_ = new QMenu(StringText(Str::MenuWindow), this);
    helpMenu_ = new QMenu(StringText(Str::MenuHelp), this);
    recentMenu_ = new QMenu(StringText(Str::MenuRecent), databaseMenu_);
    recentMenu_->setToolTipsVisible(true); // the paths
    actions_->FillMenu(*databaseMenu_, ShellDatabaseMenu);
    databaseMenu_->addMenu(recentMenu_);
    actions_->FillMenu(*helpMenu_, ShellHelpMenu);
    windowMenu_->setToolTipsVisible(true);
    actions_->FillMenu(*windowMenu_,
                       ShellWindowMenu); // before it is filled each time: it learns which keys to leave out
    corner_ = new QToolButton(menuBar());
    corner_->setAutoRaise(true);
    corner_->setPopupMode(QToolButton::InstantPopup);
    corner_->setMenu(windowMenu_);
    corner_->setFocusPolicy(Qt::NoFocus); // the same stands in menus
    corner_->setAccessibleName(StringText(Str::MenuOfViews));
    menuBar()->setCornerWidget(corner_);
}

void CMainFrame::Connect()
{
    connect(actions_, &CommandActions::given, this, [this](int id) { RunCommand(CommandTable(), id, *this); });
    connect(sideBar_, &SideBar::selectionChanged, this, [this] { panel_->LookAt(state_.Selected()); });
    connect(tabs_, &ViewTabs::frontChanged, this, &CMainFrame::ShowFront);
    connect(tabs_, &ViewTabs::titleChanged, this, &CMainFrame::ShowTitle);
    connect(tabs_, &ViewTabs::lastClosed, this, [this] {
        if (alone_)
            close();
        else
            ShowLists();
    });
    connect(tabs_, &ViewTabs::menuRequested, this, [this](const QPoint& globalPosition) {
        QMenu menu(this);
        actions_->FillMenu(menu, ShellTabMenu);
        menu.exec(globalPosition);
    });
    connect(recentMenu_, &QMenu::aboutToShow, this, &CMainFrame::FillRecentMenu);
    connect(windowMenu_, &QMenu::aboutToShow, this, &CMainFrame::FillWindowMenu);
    connect(&watchTimer_, &QTimer::timeout, this, [this] {
        LookAtFile();
        if (instance_ && instance_->Name().isEmpty())
            FollowInstance(); // the window that had the name may be gone
        TellWhereNothingIsKept();
    });
    tellTimer_.setSingleShot(true);
    connect(&tellTimer_, &QTimer::timeout, this, [this] { session_.TellRecordsChanged(); });
    watchTimer_.start(kLookAtFileMs);
    draftTimer_.setSingleShot(true);
    connect(&draftTimer_, &QTimer::timeout, this, &CMainFrame::KeepDrafts);
}

// --- showing ------------------------------------------------------------------------------------------------

void CMainFrame::ShowState()
{
    FollowNames();
    const QStringList recent = settings_.RecentDatabases();
    recentMenu_->setEnabled(!recent.isEmpty());
    if (lists_) {
        lists_->ShowRecent(recent);
        lists_->ShowState();
    }
    sideBar_->ShowState();
    if (emptyPage_)
        emptyPage_->Show(state_, recent);
    panel_->LookAt(state_.Selected());
    panel_->setVisible(state_.HasDatabase());
    FollowTabs();
    ShowTitle();
    if (watchedPath_ == state_.DatabasePath())
        return;
    watchedPath_ = state_.DatabasePath();
    file_ = FileState::Of(watchedPath_);
    notice_->hide();
    FollowInstance();
    QMetaObject::invokeMethod(this, &CMainFrame::OfferDrafts, Qt::QueuedConnection); // once its views are there
}

void CMainFrame::ShowTitle()
{
    const HostedView* front = tabs_->Front();
    const QString application = QApplication::applicationDisplayName();
    const QString database = state_.DatabaseName();
    if (front)
        setWindowTitle(StringText(Str::TitleOfView, {front->windowTitle(), database}));
    else
        setWindowTitle(state_.HasDatabase() ? StringText(Str::WindowTitle, {database}) : application);
    setWindowModified(front && front->isWindowModified());
    const QString name = front && !wide_ ? tabs_->TitleAt(tabs_->Current())
                         : wide_         ? database
                                         : StringText(Str::OpenViews);
    const QString shown = corner_->fontMetrics()
                              .elidedText(name, Qt::ElideMiddle, RoomForName(*menuBar(), width()))
                              .replace(u'&', u"&&"_s);
    if (shown != corner_->text())
        corner_->hide(); // the bar measures a corner only when it comes to show
    corner_->setText(shown);
    corner_->setToolTip(wide_ ? QDir::toNativeSeparators(state_.DatabasePath()).toHtmlEscaped()
                              : name.toHtmlEscaped());
    corner_->setVisible(state_.HasDatabase() && (wide_ || tabs_->Count() > 0) && !alone_);
}

void CMainFrame::resizeEvent(QResizeEvent* event)
{
    QMainWindow::resizeEvent(event);
    FitWidth();
}

void CMainFrame::FitWidth()
{
    if (wide_ == IsWide())
        return;
    wide_ = IsWide();
    const bool focusInLists =
        (lists_ && lists_->isAncestorOf(focusWidget())) || sideBar_->isAncestorOf(focusWidget());
    sidePane_->setVisible(wide_ && !alone_);
    FitBar();
    ShowState();
    shownFront_ = nullptr;
    ShowMenus();
    ShowTitle();
    if (focusInLists && !tabs_->Front())
        ShowLists();
}

void CMainFrame::FitBar()
{
    tabs_->SetBarShown(alone_ ? tabs_->Count() > 1 : wide_);
}

void CMainFrame::ShowFront()
{
    FitBar();
    FollowTabs();
    ShowMenus();
    ShowTitle();
    HostedView* front = tabs_->Front();
    const bool isOther = front != std::exchange(shownFront_, front);
    if (front && isOther && front->isVisible())
        front->TakeUpChanges(); // it could not see them while it was hidden
}

void CMainFrame::FollowTabs()
{
    for (const CommandRow<CMainFrame>& row : CommandTable()) {
        if (row.state)
            actions_->Show(row.def.id, row.state(*this));
    }
}

void CMainFrame::ShowMenus()
{
    const HostedView* front = tabs_->Front();
    if (front == shownFront_ && !menuBar()->actions().isEmpty() && shownFront_)
        return;
    const QList<QMenu*> menus = front ? front->Menus() : QList<QMenu*>();
    menuBar()->clear();
    fileMenu_->clear();
    menuBar()->addMenu(fileMenu_);
    if (!menus.isEmpty()) {
        fileMenu_->addActions(menus.first()->actions());
        fileMenu_->addSeparator();
    }
    if (front && !wide_ && !alone_) { // on a narrow window the view's own menus have the bar
        for (QMenu* menu : {databaseMenu_, helpMenu_})
            fileMenu_->addMenu(menu);
        fileMenu_->addSeparator();
    }
    actions_->FillMenu(*fileMenu_, front ? ShellViewFileMenu : ShellFileMenu);
    for (qsizetype i = 1; i < menus.size(); ++i)
        menuBar()->addMenu(menus[i]);
    if (alone_) {
        menuBar()->addMenu(helpMenu_);
    } else if (wide_ || !front) {
        menuBar()->addMenu(databaseMenu_);
        if (wide_)
            menuBar()->addMenu(windowMenu_);
        menuBar()->addMenu(helpMenu_);
    }
}

void CMainFrame::FillRecentMenu()
{
    recentMenu_->clear();
    int number = 0;
    for (const QString& path : settings_.RecentDatabases()) {
        const QString name = QFileInfo(path).fileName().replace(u'&', u"&&"_s);
        QAction* action = recentMenu_->addAction(StringText(Str::RecentEntry, {QString::number(++number), name}));
        action->setToolTip(QDir::toNativeSeparators(path));
        connect(action, &QAction::triggered, this, [this, path] { OpenPath(path); });
    }
}

void CMainFrame::FillWindowMenu()
{
    windowMenu_->clear();
    actions_->FillMenu(*windowMenu_, ShellWindowMenu);
    windowMenu_->addSeparator();
    for (int tab = 0; tab < tabs_->Count(); ++tab) {
        const QString title =
            fontMetrics().elidedText(tabs_->TitleAt(tab), Qt::ElideMiddle, width() / 2).replace(u'&', u"&&"_s);
        QAction* action = windowMenu_->addAction(StringText(Str::ViewEntry, {QString::number(tab + 1), title}));
        action->setCheckable(true);
        action->setChecked(tabs_->Front() && tab == tabs_->Current());
        action->setToolTip(tabs_->TitleAt(tab).toHtmlEscaped());
        connect(action, &QAction::triggered, this, [this, tab] { tabs_->BringForward(tab); });
    }
}

void CMainFrame::ShowLook()
{
    const ViewLook look = LookOf(DisplayChoice(settings_, DisplayView::Main));
    if (lists_)
        lists_->SetLook(look);
    sideBar_->SetLook(look);
    for (HostedView* view : Views()) {
        if (auto* table = qobject_cast<CTableView*>(view))
            table->SetLook(LookOf(DisplayChoice(settings_, DisplayView::Table)));
    }
}

// --- commands -----------------------------------------------------------------------------------------------

void CMainFrame::ChooseMainLook(LookItem item)
{
    DisplayChoice choice(settings_, DisplayView::Main);
    if (ChooseLook(choice, item, *this))
        ShowLook();
}

void CMainFrame::OpenSelected()
{
    const std::optional<MainEntry> entry = state_.Selected();
    if (!entry || entry->missing)
        return;
    if (const std::optional<FormCall> call = commands_.CallOfSelected())
        OpenForm(*call);
    else if (const std::optional<TableRequest> request = commands_.RequestToOpen())
        (void)OpenTable(*request);
}

void CMainFrame::MakeNew()
{
    const std::optional<EntryKind> make = OutcomeOfNew(state_).make;
    if (make == EntryKind::Table)
        return DesignTable({});
    if (make == EntryKind::Query)
        return WriteSavedQuery({});
    if (const std::optional<FormDef> form = commands_.New())
        DesignNewForm(*form);
    ShowState();
}

void CMainFrame::EditSelected()
{
    const std::optional<MainEntry> entry = state_.Selected();
    if (entry && entry->kind == EntryKind::Table)
        DesignTable(entry->name);
    else if (entry && entry->kind == EntryKind::Form)
        DesignForm(entry->name);
    else if (entry && entry->kind == EntryKind::Query)
        WriteSavedQuery(entry->name);
}

void CMainFrame::DesignTable(const QString& table)
{
    panel_->StopCounting();
    TableDesigner designer(session_.Connection(), session_.Location(), session_.Prompt(), *openViews_);
    if (table.isEmpty() || designer.Open(table))
        CTableDialog(designer, this).exec();
    commands_.Refill();
    if (!designer.IsNew() && state_.Tab() == MainTab::Table)
        state_.Select({EntryKind::Table, designer.Table(), {}, false});
    ShowState();
}

void CMainFrame::DeleteSelected()
{
    panel_->StopCounting(); // a table that is read cannot be dropped
    commands_.DeleteSelected();
    ShowState();
}

void CMainFrame::ShowLists()
{
    if (alone_)
        return;
    if (wide_) {
        sideBar_->setFocus();
    } else {
        tabs_->ShowHome();
        Lists().setFocus();
    }
    if (!state_.HasDatabase() && wide_)
        Home().setFocus();
}

void CMainFrame::ShowKeyList()
{
    QList<KeyHint> keys = actions_->KeyHints();
    if (const HostedView* front = tabs_->Front())
        keys = front->Keys() + keys;
    ShowKeyHints(*this, keys);
}

QString CMainFrame::ChooseDatabase(Str title, Str accept, FileUse use)
{
    FileRequest request{.title = title,
                        .accept = accept,
                        .use = use,
                        .kind = FileKind::Database(),
                        .near = state_.DatabasePath(),
                        .name = {}};
    if (use == FileUse::Create) { // a name to begin with: without a keyboard it is the only one
        request.kind.others.clear();
        request.name = StringText(Str::MenuDatabase).remove(u'&') + request.kind.endings.first();
    }
    return ChooseFile(*this, request);
}

void CMainFrame::ChooseAndOpenDatabase()
{
    const QString path = ChooseDatabase(Str::CommandOpenDatabase, Str::CommandOpen, FileUse::Open);
    if (!path.isEmpty())
        OpenPath(path);
}

void CMainFrame::ChooseAndCreateDatabase()
{
    const QString path = ChooseDatabase(Str::CommandNewDatabase, Str::CommandNew, FileUse::Create);
    if (path.isEmpty())
        return;
    commands_.NewDatabase(path);
    ShowState();
}

void CMainFrame::ChooseAndDeleteDatabase()
{
    const QString path = ChooseDatabase(Str::CommandDeleteDatabase, Str::CommandDelete, FileUse::Delete);
    if (path.isEmpty())
        return;
    panel_->StopCounting();
    commands_.DeleteDatabase(path);
    ShowState();
}

void CMainFrame::OpenPath(const QString& path)
{
    commands_.OpenDatabase(path);
    ShowState();
}

// --- closing ------------------------------------------------------------------------------------------------

void CMainFrame::closeEvent(QCloseEvent* event)
{
    if (!MayCloseViews()) {
        event->ignore();
        return;
    }
    CloseViews();
    KeepDrafts();
    if (instance_)
        instance_->Release(); // from here on another start is a window of its own
    if (sidePane_->isVisible())
        profile_.WriteInt(kWindowSection, kSideBarKey, sidePane_->width());
    KeepPlace(*this, profile_, kFramePlace);
    QMainWindow::closeEvent(event);
}

} // namespace mirel
