#include "app/ui/main_frame.h"

#include "app/form_view_options.h"
#include "app/table_view_options.h"
#include "app/ui/about_box.h"
#include "app/ui/display_look.h"
#include "app/ui/keys_dialog.h"
#include "app/ui/lumo_view.h"
#include "app/ui/open_views.h"
#include "app/ui/shell_actions.h"
#include "forms/ui/form_eng_view.h"
#include "platform/ui/file_choice.h"
#include "platform/ui/menu_keys.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "tableeditor/ui/table_dialog.h"
#include "tableview/ui/export_wizard.h"
#include "tableview/ui/table_view.h"

#include <QApplication>
#include <QDir>
#include <QDragEnterEvent>
#include <QFileInfo>
#include <QMenuBar>
#include <QMimeData>
#include <QUrl>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const QString kFramePlace = u"frame"_s;
const QString kTablePlace = u"table"_s;
const QString kWidthsSection = u"Columns"_s;
const QString kFormPlace = u"form"_s;
constexpr QSize kFrameFirstSize(760, 560);
constexpr QSize kTableFirstSize(960, 620);
constexpr QSize kSmallestSize(160, 160);

struct LookCommand {
    ShellCommand command;
    LookItem item;
};
constexpr std::array kLookItems = {
    LookCommand{ShellCommand::Font, LookItem::Font},
    LookCommand{ShellCommand::BackgroundColor, LookItem::LineBackground},
    LookCommand{ShellCommand::ListBackgroundColor, LookItem::ListBackground},
    LookCommand{ShellCommand::ButtonBackgroundColor, LookItem::ButtonBackground},
    LookCommand{ShellCommand::DatabaseTextColor, LookItem::LineText},
    LookCommand{ShellCommand::ListTextColor, LookItem::ListText},
    LookCommand{ShellCommand::ButtonTextColor, LookItem::ButtonText},
    LookCommand{ShellCommand::ResetLayout, LookItem::Reset},
};

// The one database file that is dragged; empty when it is anything else.
QString DraggedDatabase(const QMimeData* data)
{
    const QList<QUrl> urls = data->urls();
    if (urls.size() != 1 || !urls.first().isLocalFile())
        return {};
    const QString path = urls.first().toLocalFile();
    return path.endsWith(u".cdb"_s, Qt::CaseInsensitive) ? path : QString();
}

} // namespace

CMainFrame::CMainFrame(DatabaseSession& session, MainViewState& state, MainViewCommands& commands,
                       Settings& settings, Profile& profile)
    : session_(session)
    , state_(state)
    , commands_(commands)
    , settings_(settings)
    , profile_(profile)
    , actions_(new ShellActions(this))
    , view_(new CLumoView(state, *actions_, this))
    , openViews_(std::make_unique<OpenViews>(
          session, OpenViews::Lists{[this] { return Tables(); }, [this] { return Forms(); }}))
{
    commands.SetOpenViews(openViews_.get());
    MakeMenus();
    setCentralWidget(view_);
    setAcceptDrops(true);
    setMinimumSize(kSmallestSize);
    setWindowIcon(QIcon(u":/icons/mirel.svg"_s));
    connect(actions_, &ShellActions::Given, this, &CMainFrame::Run);
    connect(view_, &CLumoView::RecentChosen, this, &CMainFrame::OpenPath);
    RestorePlace(*this, profile, kFramePlace, kFrameFirstSize);
    ShowState();
    ShowLook();
    view_->setFocus();
}

CMainFrame::~CMainFrame()
{
    commands_.SetOpenViews(nullptr);
}

void CMainFrame::MakeMenus()
{
    menuBar()->setNativeMenuBar(false); // its place in a small window is the window
    QMenu* file = menuBar()->addMenu(StringText(Str::MenuFile));
    auto* layout = new QMenu(StringText(Str::MenuLayout), file);
    QMenu* database = menuBar()->addMenu(StringText(Str::MenuDatabase));
    QMenu* help = menuBar()->addMenu(StringText(Str::MenuHelp));
    recentMenu_ = new QMenu(StringText(Str::MenuRecent), database);
    recentMenu_->setToolTipsVisible(true); // the paths
    const std::map<ShellMenu, QMenu*> menus = {{ShellMenu::File, file},
                                               {ShellMenu::Layout, layout},
                                               {ShellMenu::Database, database},
                                               {ShellMenu::Help, help}};
    for (const auto& [id, menu] : menus) {
        menu->setToolTipsVisible(true); // they say why an entry cannot be chosen
        LeaveOutKeysWhenSmall(*menu, *this);
    }
    for (const ShellCommandDef& definition : ShellCommands()) {
        const auto menu = menus.find(definition.menu);
        if (menu == menus.end())
            continue;
        if (definition.id == ShellCommand::ImportCsv)
            file->addMenu(layout);
        if (definition.separated)
            menu->second->addSeparator();
        menu->second->addAction(actions_->Of(definition.id));
    }
    database->addMenu(recentMenu_);
    connect(recentMenu_, &QMenu::aboutToShow, this, &CMainFrame::FillRecentMenu);
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

void CMainFrame::ShowState()
{
    const QStringList recent = settings_.RecentDatabases();
    recentMenu_->setEnabled(!recent.isEmpty());
    view_->ShowRecent(recent);
    view_->ShowState();
    const QString application = QApplication::applicationDisplayName();
    setWindowTitle(state_.HasDatabase() ? StringText(Str::WindowTitle, {state_.DatabaseName()}) : application);
}

void CMainFrame::Run(ShellCommand id)
{
    switch (id) {
    case ShellCommand::AddFavorites:
        commands_.AddFavorite();
        break;
    case ShellCommand::RemoveFavorites:
        commands_.RemoveFavorite();
        break;
    case ShellCommand::OpenByDoubleClicking:
        state_.SetOpensByDoubleTap(!state_.OpensByDoubleTap());
        break;
    case ShellCommand::Exit:
        close();
        return;
    case ShellCommand::OpenDatabase:
        ChooseAndOpenDatabase();
        break;
    case ShellCommand::NewDatabase:
        ChooseAndCreateDatabase();
        break;
    case ShellCommand::DeleteDatabase:
        ChooseAndDeleteDatabase();
        break;
    case ShellCommand::OpenSample:
        commands_.OpenSample();
        break;
    case ShellCommand::Keys:
        ShowKeys(*this);
        return;
    case ShellCommand::About:
        ShowAbout(session_, *this);
        return;
    case ShellCommand::Open:
        if (const std::optional<TableRequest> request = commands_.RequestToOpen())
            OpenTable(*request);
        else if (const std::optional<FormCall> call = commands_.CallOfSelected())
            OpenForm(*call);
        return;
    case ShellCommand::ExportCsv:
        if (const std::optional<TableRequest> request = commands_.RequestOfSelected()) {
            RunExport(session_.Connection(), session_.Path(), session_.Prompt(),
                      {.name = request->title, .statement = request->statement}, *this);
        }
        return;
    case ShellCommand::New:
        if (OutcomeOfNew(state_).make == EntryKind::Table)
            DesignTable({});
        else
            commands_.New();
        break;
    case ShellCommand::Edit:
        if (const std::optional<MainEntry> entry = state_.Selected(); entry && entry->kind == EntryKind::Table)
            DesignTable(entry->name);
        break;
    case ShellCommand::Rename:
        commands_.RenameSelected();
        break;
    case ShellCommand::Delete:
        commands_.DeleteSelected();
        break;
    case ShellCommand::Font:
    case ShellCommand::BackgroundColor:
    case ShellCommand::ListBackgroundColor:
    case ShellCommand::ButtonBackgroundColor:
    case ShellCommand::DatabaseTextColor:
    case ShellCommand::ListTextColor:
    case ShellCommand::ButtonTextColor:
    case ShellCommand::ResetLayout:
        ChooseLayout(id);
        return;
    case ShellCommand::ImportCsv:
    case ShellCommand::Help:
        return; // disabled: not built yet
    }
    ShowState();
}

void CMainFrame::DesignTable(const QString& table)
{
    TableDesigner designer(session_.Connection(), session_.Path(), session_.Prompt(), *openViews_);
    if (table.isEmpty() || designer.Open(table))
        CTableDialog(designer, this).exec();
    commands_.Refill();
    if (!designer.IsNew() && state_.Tab() == MainTab::Table)
        state_.Select({EntryKind::Table, designer.Table(), {}, false});
}

void CMainFrame::ChooseLayout(ShellCommand id)
{
    const auto row = std::ranges::find(kLookItems, id, &LookCommand::command);
    DisplayChoice choice(settings_, DisplayView::Main);
    if (ChooseLook(choice, row->item, *view_))
        ShowLook();
}

void CMainFrame::ShowLook()
{
    view_->SetLook(LookOf(DisplayChoice(settings_, DisplayView::Main)));
    for (CTableView* table : Tables())
        table->SetLook(LookOf(DisplayChoice(settings_, DisplayView::Table)));
}

QWidget* CMainFrame::OpenTable(const TableRequest& request)
{
    for (CTableView* open : Tables()) {
        if (open->Browser().BaseStatement() != request.statement)
            continue;
        open->show();
        open->raise();
        open->activateWindow();
        return open;
    }
    auto* table = new CTableView(session_.Connection(), session_.Path(), session_.Prompt(),
                                 ReadTableViewSettings(settings_), this);
    table->setAttribute(Qt::WA_DeleteOnClose);
    if (!table->OpenStatement(request.title, request.statement)) {
        delete table;
        return nullptr;
    }
    table->SetStore(session_.Store());
    connect(table, &CTableView::queriesChanged, this, [this] {
        commands_.Refill();
        ShowState();
    });
    table->SetWidthsByHand(ReadColumnWidths(profile_.ReadText(kWidthsSection, WidthsKey(request.statement), {})));
    table->SetLook(LookOf(DisplayChoice(settings_, DisplayView::Table)));
    connect(table, &CTableView::lookRequested, this, [this, table](LookItem item) {
        DisplayChoice choice(settings_, DisplayView::Table);
        if (ChooseLook(choice, item, *table))
            ShowLook();
    });
    connect(table, &CTableView::settingsChanged, this, [this](const TableViewSettings& options) {
        WriteTableViewSettings(settings_, options);
        SpreadOptions();
    });
    Place(*table, kTablePlace, kTableFirstSize);
    table->installEventFilter(this);
    table->show();
    return table;
}

CFormEngView* CMainFrame::OpenForm(const FormCall& call)
{
    auto* form = new CFormEngView(call,
                                  {.connection = session_.Connection(),
                                   .database = session_.Path(),
                                   .store = session_.Store(),
                                   .prompt = session_.Prompt(),
                                   .settings = ReadFormViewSettings(settings_),
                                   .activeTable = state_.CurrentTable()},
                                  this);
    form->setAttribute(Qt::WA_DeleteOnClose);
    connect(form, &CFormEngView::formCalled, this, &CMainFrame::OpenForm);
    connect(form, &CFormEngView::dataChanged, this, [this] {
        commands_.Refill();
        ShowState();
    });
    connect(form, &CFormEngView::keysRequested, form, [form] { ShowKeys(*form); });
    connect(form, &CFormEngView::settingsChanged, this, [this](const FormViewSettings& options) {
        WriteFormViewSettings(settings_, options);
        SpreadOptions();
    });
    Place(*form, kFormPlace, form->PreferredSize());
    form->installEventFilter(this);
    form->show();
    (void)form->Open(); // after show: what it has to say stands over its window
    return form;
}

// The options of one view are those of all, and the words for Yes and No those of both kinds.
void CMainFrame::SpreadOptions()
{
    for (CTableView* open : Tables())
        open->ChangeSettings(ReadTableViewSettings(settings_));
    for (CFormEngView* open : Forms())
        open->ChangeSettings(ReadFormViewSettings(settings_));
}

// On a handheld the window takes the frame's place.
void CMainFrame::Place(QWidget& window, const QString& key, QSize firstSize)
{
    if (IsHandheldSize(size())) {
        window.setGeometry(geometry());
        window.setWindowState(windowState());
    } else {
        RestorePlace(window, profile_, key, firstSize);
    }
}

void CMainFrame::KeepPlaceOf(QWidget& window)
{
    const auto* table = qobject_cast<CTableView*>(&window);
    if (table)
        KeepWidths(*table);
    if (IsHandheldSize(window.size()))
        return;
    if (table)
        KeepPlace(window, profile_, kTablePlace);
    else if (qobject_cast<CFormEngView*>(&window))
        KeepPlace(window, profile_, kFormPlace);
}

bool CMainFrame::eventFilter(QObject* watched, QEvent* event)
{
    if (event->type() == QEvent::Close && watched->isWidgetType())
        KeepPlaceOf(*static_cast<QWidget*>(watched));
    return QMainWindow::eventFilter(watched, event);
}

// By the file's name and what was opened of it: a copy of a database looks as the first one does.
QString CMainFrame::WidthsKey(const QString& statement) const
{
    const QString place = state_.DatabaseName() + u':' + statement;
    return QString::fromLatin1(QUrl::toPercentEncoding(place));
}

void CMainFrame::KeepWidths(const CTableView& table)
{
    const QString key = WidthsKey(table.Browser().BaseStatement());
    const QString text = ColumnWidthsText(table.WidthsByHand());
    if (profile_.ReadText(kWidthsSection, key, {}) != text)
        profile_.WriteText(kWidthsSection, key, text);
}

QString CMainFrame::ChooseDatabase(Str title, Str accept, FileUse use)
{
    return ChooseFile(*this, {.title = title,
                              .accept = accept,
                              .use = use,
                              .kind = FileKind::Database(),
                              .near = state_.DatabasePath(),
                              .name = {}});
}

void CMainFrame::ChooseAndOpenDatabase()
{
    const QString path = ChooseDatabase(Str::CommandOpenDatabase, Str::CommandOpen, FileUse::Open);
    if (!path.isEmpty() && CloseWindows())
        commands_.OpenDatabase(path);
}

void CMainFrame::ChooseAndCreateDatabase()
{
    const QString path = ChooseDatabase(Str::CommandNewDatabase, Str::CommandNew, FileUse::Create);
    if (!path.isEmpty() && CloseWindows())
        commands_.NewDatabase(path);
}

void CMainFrame::ChooseAndDeleteDatabase()
{
    const QString path = ChooseDatabase(Str::CommandDeleteDatabase, Str::CommandDelete, FileUse::Delete);
    if (!path.isEmpty() && CloseWindows())
        commands_.DeleteDatabase(path);
}

void CMainFrame::OpenPath(const QString& path)
{
    if (!CloseWindows())
        return;
    commands_.OpenDatabase(path);
    ShowState();
}

bool CMainFrame::CloseWindows()
{
    const auto close = [](QWidget* window) { return window->close(); };
    return std::ranges::all_of(Forms(), close) && std::ranges::all_of(Tables(), close);
}

QList<CTableView*> CMainFrame::Tables() const
{
    return findChildren<CTableView*>(Qt::FindDirectChildrenOnly);
}

QList<CFormEngView*> CMainFrame::Forms() const
{
    return findChildren<CFormEngView*>(Qt::FindDirectChildrenOnly);
}

void CMainFrame::closeEvent(QCloseEvent* event)
{
    if (!CloseWindows()) {
        event->ignore();
        return;
    }
    KeepPlace(*this, profile_, kFramePlace);
    QMainWindow::closeEvent(event);
}

void CMainFrame::dragEnterEvent(QDragEnterEvent* event)
{
    if (!DraggedDatabase(event->mimeData()).isEmpty())
        event->acceptProposedAction();
}

void CMainFrame::dropEvent(QDropEvent* event)
{
    const QString path = DraggedDatabase(event->mimeData());
    if (path.isEmpty())
        return;
    // A move would have the file manager delete what was only opened.
    event->setDropAction(Qt::CopyAction);
    event->accept();
    OpenPath(path);
}

} // namespace mirel
