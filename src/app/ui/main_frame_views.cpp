#include "app/form_view_options.h"
#include "app/table_view_options.h"
#include "app/ui/display_look.h"
#include "app/ui/entry_panel.h"
#include "app/ui/main_frame.h"
#include "app/ui/view_tabs.h"
#include "app/ui/view_window.h"
#include "forms/ui/form_eng_view.h"
#include "forms/ui/form_mak_view.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "tableview/ui/table_view.h"

#include <QApplication>
#include <QFileInfo>
#include <QLabel>
#include <QPointer>
#include <QUrl>

#include <algorithm>

// The views of the main window: how they are made, kept, closed, and told of what others change.

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const QString kTablePlace = u"table"_s;
const QString kFormPlace = u"form"_s;
const QString kWidthsSection = u"Columns"_s;
const QString kViewsSection = u"Views"_s;
constexpr char kMaker[] = "maker"; // of a running form: the form maker that runs it
constexpr QSize kTableFirstSize(960, 620);

const QString& PlaceOf(const HostedView& view)
{
    return qobject_cast<const CTableView*>(&view) ? kTablePlace : kFormPlace;
}

} // namespace

// --- making -------------------------------------------------------------------------------------------------

HostedView* CMainFrame::MakeView(const ViewKey& key)
{
    if (key.kind == EntryKind::Form) {
        const std::optional<FormCall> call = commands_.CallOfForm(key.name);
        if (key.design)
            return call ? MakeMaker(call->form, FormMaker::Start::Stored) : nullptr;
        CFormEngView* form = call ? MakeForm(*call) : nullptr;
        if (form)
            (void)form->Open();
        return form;
    }
    const std::optional<TableRequest> request = commands_.RequestOf(key);
    return request ? MakeTable(*request) : nullptr;
}

HostedView* CMainFrame::OpenView(const ViewKey& key)
{
    if (key.kind == EntryKind::Form) {
        const std::optional<FormCall> call = commands_.CallOfForm(key.name);
        return call ? OpenForm(*call) : nullptr;
    }
    const std::optional<TableRequest> request = commands_.RequestOf(key);
    return request ? OpenTable(*request) : nullptr;
}

CTableView* CMainFrame::OpenTable(const TableRequest& request)
{
    const ViewKey key{request.kind, request.title};
    for (CViewWindow* window : Windows()) {
        if (window->Key() != key)
            continue;
        window->raise();
        window->activateWindow();
        return qobject_cast<CTableView*>(window->View());
    }
    if (tabs_->BringForward(key))
        return qobject_cast<CTableView*>(tabs_->Front());
    CTableView* table = MakeTable(request);
    if (table)
        tabs_->Add(table, key);
    return table;
}

CFormEngView* CMainFrame::OpenForm(const FormCall& call)
{
    CFormEngView* form = MakeForm(call);
    tabs_->Add(form, {EntryKind::Form, call.form.name.Text()});
    (void)form->Open(); // now that it shows: what it has to say stands over it
    return form;
}

CTableView* CMainFrame::MakeTable(const TableRequest& request)
{
    auto* table = new CTableView(session_.Connection(), session_.Location(), session_.Prompt(),
                                 ReadTableViewSettings(settings_), this);
    table->hide(); // until it has its place
    if (!table->OpenStatement(request.title, request.statement)) {
        delete table;
        return nullptr;
    }
    table->SetStore(session_.Store());
    table->SetQueryWriter(QueryWriter());
    table->SetWidthsByHand(ReadColumnWidths(profile_.ReadText(kWidthsSection, WidthsKey(request.statement), {})));
    table->SetLook(LookOf(DisplayChoice(settings_, DisplayView::Table)));
    connect(table, &CTableView::queriesChanged, this, [this] {
        commands_.Refill();
        ShowState();
    });
    connect(table, &CTableView::lookRequested, this, [this, table](LookItem item) {
        DisplayChoice choice(settings_, DisplayView::Table);
        if (ChooseLook(choice, item, *table))
            ShowLook();
    });
    connect(table, &CTableView::settingsChanged, this, [this](const TableViewSettings& options) {
        WriteTableViewSettings(settings_, options);
        SpreadOptions();
    });
    connect(table, &HostedView::closed, this, [this, table] { KeepWidths(*table); });
    ConnectView(*table);
    return table;
}

CFormEngView* CMainFrame::MakeForm(const FormCall& call)
{
    auto* form = new CFormEngView(call,
                                  {.connection = session_.Connection(),
                                   .database = session_.Location(),
                                   .store = session_.Store(),
                                   .prompt = session_.Prompt(),
                                   .settings = ReadFormViewSettings(settings_),
                                   .activeTable = state_.CurrentTable()},
                                  this);
    form->hide();
    connect(form, &CFormEngView::formCalled, this, &CMainFrame::OpenForm);
    connect(form, &CFormEngView::editRequested, this, [this, form] { EditRunning(*form); });
    connect(form, &CFormEngView::dataChanged, this, [this] {
        commands_.Refill();
        ShowState();
    });
    connect(form, &CFormEngView::settingsChanged, this, [this](const FormViewSettings& options) {
        WriteFormViewSettings(settings_, options);
        SpreadOptions();
    });
    ConnectView(*form);
    return form;
}

// --- designing forms ----------------------------------------------------------------------------------------

CFormMakView* CMainFrame::MakeMaker(const FormDef& form, FormMaker::Start start)
{
    const FormViewSettings options = ReadFormViewSettings(settings_);
    auto* maker = new CFormMakView(form, start,
                                   {.maker = {.connection = session_.Connection(),
                                              .database = session_.Location(),
                                              .store = session_.Store(),
                                              .prompt = session_.Prompt()},
                                    .dialogs = DialogsOfMaker(),
                                    .words = options.words,
                                    .holdTimeMs = options.holdTimeMs},
                                   this);
    maker->hide();
    connect(maker, &CFormMakView::runRequested, this,
            [this, maker](const FormCall& call) { RunFromMaker(*maker, call); });
    connect(maker, &CFormMakView::formSaved, this, [this, maker] { FollowMaker(*maker); });
    ConnectView(*maker);
    return maker;
}

CFormMakView* CMainFrame::DesignNewForm(const FormDef& form)
{
    CFormMakView* maker = MakeMaker(form, FormMaker::Start::New);
    tabs_->Add(maker, {EntryKind::Form, {}, true});
    return maker;
}

CFormMakView* CMainFrame::DesignForm(const QString& name)
{
    const ViewKey key{EntryKind::Form, name, true};
    for (CViewWindow* window : Windows()) {
        if (window->Key() != key)
            continue;
        window->raise();
        window->activateWindow();
        return qobject_cast<CFormMakView*>(window->View());
    }
    if (tabs_->BringForward(key))
        return qobject_cast<CFormMakView*>(tabs_->Front());
    const std::optional<FormCall> call = commands_.CallOfForm(name);
    if (!call) {
        session_.Prompt().Show({Str::MakerFormGone, {name}});
        return nullptr;
    }
    CFormMakView* maker = MakeMaker(call->form, FormMaker::Start::Stored);
    tabs_->Add(maker, key);
    return maker;
}

// A form that runs from its maker is one view, begun again with each Run; Edit Form leads back.
void CMainFrame::RunFromMaker(CFormMakView& maker, const FormCall& call)
{
    const QPointer<CFormMakView> from(&maker);
    for (CFormEngView* running : ViewsOf<CFormEngView>()) {
        if (running->property(kMaker).value<QObject*>() == &maker && !running->close())
            return;
    }
    if (!from)
        return;
    CFormEngView* running = OpenForm(call);
    running->setProperty(kMaker, QVariant::fromValue<QObject*>(from));
}

void CMainFrame::EditRunning(CFormEngView& form)
{
    const auto* maker = qobject_cast<CFormMakView*>(form.property(kMaker).value<QObject*>());
    const QList<CFormMakView*> open = ViewsOf<CFormMakView>();
    const auto found = std::ranges::find(open, maker);
    if (!maker || found == open.end()) {
        DesignForm(form.Form().Title());
        return;
    }
    for (int tab = 0; tab < tabs_->Count(); ++tab) {
        if (tabs_->ViewAt(tab) == maker)
            tabs_->BringForward(tab);
    }
    if (QWidget* window = (*found)->window(); window != this)
        window->activateWindow();
}

// A form that was saved, under whatever name, is that form from now on.
void CMainFrame::FollowMaker(CFormMakView& maker)
{
    const QString& name = maker.Maker().StoredName();
    for (int tab = 0; tab < tabs_->Count(); ++tab) {
        if (tabs_->ViewAt(tab) == &maker)
            tabs_->SetNameAt(tab, name);
    }
    for (CViewWindow* window : Windows()) {
        if (window->View() == &maker)
            window->SetName(name);
    }
    commands_.Refill();
    if (state_.Tab() == MainTab::Form)
        state_.Select({EntryKind::Form, name, {}, false});
    ShowState();
}

void CMainFrame::ConnectView(HostedView& view)
{
    view.setAttribute(Qt::WA_DeleteOnClose);
    FollowTyping(view);
    connect(&view, &HostedView::recordsChanged, this, [this] {
        if (!telling_)
            tellTimer_.start(0);
    });
}

// The options of one view are those of all, and the words for Yes and No those of both kinds.
void CMainFrame::SpreadOptions()
{
    for (CTableView* open : ViewsOf<CTableView>())
        open->ChangeSettings(ReadTableViewSettings(settings_));
    for (CFormEngView* open : ViewsOf<CFormEngView>())
        open->ChangeSettings(ReadFormViewSettings(settings_));
}

// A table that was renamed keeps its tab.
void CMainFrame::FollowNames()
{
    const std::vector<MainEntry>& tables = state_.Entries(MainTab::Table);
    const auto newName = [&tables](const ViewKey& key, HostedView* view) -> QString {
        const auto* table = qobject_cast<const CTableView*>(view);
        if (!table || key.kind != EntryKind::Table || table->Title() == key.name ||
            std::ranges::find(tables, key.name, &MainEntry::name) != tables.end() ||
            std::ranges::find(tables, table->Title(), &MainEntry::name) == tables.end())
            return {};
        return table->Title();
    };
    for (int tab = 0; tab < tabs_->Count(); ++tab) {
        if (const QString name = newName(tabs_->KeyAt(tab), tabs_->ViewAt(tab)); !name.isEmpty())
            tabs_->SetNameAt(tab, name);
    }
    for (CViewWindow* window : Windows()) {
        if (const QString name = newName(window->Key(), window->View()); !name.isEmpty())
            window->SetName(name);
    }
}

void CMainFrame::BeAlone(const ViewKey& view)
{
    alone_ = true;
    aloneWith_ = view;
    wide_ = !IsWide();
    FitWidth();
}

// --- windows of their own -----------------------------------------------------------------------------------

void CMainFrame::MoveToWindow()
{
    const int tab = tabs_->Current();
    if (!tabs_->Front())
        return;
    const ViewKey key = tabs_->KeyAt(tab);
    HostedView* view = tabs_->Take(tab);
    auto* window = new CViewWindow(*view, key, state_.DatabaseName(), this);
    const QSize first = view->PreferredSize();
    RestorePlace(*window, profile_, PlaceOf(*view), first.isEmpty() ? kTableFirstSize : first);
    connect(window, &CViewWindow::aboutToClose, this, [this, window] {
        if (window->View() && !IsHandheldSize(window->size()))
            KeepPlace(*window, profile_, PlaceOf(*window->View()));
    });
    connect(window, &CViewWindow::showAsTabRequested, this, [this, window] {
        const ViewKey back = window->Key();
        HostedView* taken = window->Take();
        taken->setParent(this);
        tabs_->Add(taken, back);
        activateWindow();
    });
    window->show();
    FocusView(*view);
}

QList<CViewWindow*> CMainFrame::Windows() const
{
    QList<CViewWindow*> windows = findChildren<CViewWindow*>(Qt::FindDirectChildrenOnly);
    windows.removeIf([](const CViewWindow* window) { return !window->View(); });
    return windows;
}

QList<HostedView*> CMainFrame::Views() const
{
    QList<HostedView*> views = tabs_->Views();
    for (const CViewWindow* window : Windows())
        views += window->View();
    return views;
}

bool CMainFrame::IsSettled() const
{
    const QList<HostedView*> views = Views();
    return panel_->IsSettled() && std::ranges::all_of(views, &HostedView::IsSettled);
}

// --- kept for the next run ----------------------------------------------------------------------------------

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

QString CMainFrame::ViewsKey() const
{
    return QString::fromLatin1(QUrl::toPercentEncoding(state_.DatabasePath()));
}

void CMainFrame::KeepViews()
{
    if (!state_.HasDatabase() || alone_)
        return;
    ViewList open = tabs_->Open();
    for (const CViewWindow* window : Windows())
        open.views.push_back(window->Key());
    const QString text = ViewListText(open);
    if (profile_.ReadText(kViewsSection, ViewsKey(), {}) != text)
        profile_.WriteText(kViewsSection, ViewsKey(), text);
}

void CMainFrame::RestoreViews()
{
    if (state_.HasDatabase())
        OpenAgain(ReadViewList(profile_.ReadText(kViewsSection, ViewsKey(), {})));
}

// --- closing ------------------------------------------------------------------------------------------------

bool CMainFrame::MayCloseViews()
{
    return std::ranges::all_of(Views(), [](HostedView* view) { return view->MayClose(); });
}

ViewList CMainFrame::CloseViews()
{
    KeepViews();
    ViewList open = tabs_->Open();
    for (CViewWindow* window : Windows()) {
        open.views.push_back(window->Key()); // a tab when it is opened again
        window->close();
    }
    const bool alone = std::exchange(alone_, false); // the window does not close with its last view now
    tabs_->CloseAll();
    alone_ = alone;
    return open;
}

void CMainFrame::OpenAgain(const ViewList& views)
{
    tabs_->AddWaiting(StillThere(views, state_));
}

void CMainFrame::CloseViewOf(const ViewKey& key)
{
    for (CViewWindow* window : Windows()) {
        if (window->Key() == key) {
            window->View()->GiveUpEdits();
            window->close();
        }
    }
    for (int tab = tabs_->Count() - 1; tab >= 0; --tab) {
        if (tabs_->KeyAt(tab) != key)
            continue;
        if (HostedView* view = tabs_->ViewAt(tab))
            view->GiveUpEdits();
        (void)tabs_->Close(tab);
    }
}

// --- what others change -------------------------------------------------------------------------------------

void CMainFrame::RecordsChanged()
{
    TakeUpChanges(nullptr);
}

void CMainFrame::TakeUpChanges(const HostedView* butNot)
{
    telling_ = true;
    for (HostedView* view : Views()) {
        if (view != butNot && view->isVisible())
            view->TakeUpChanges();
    }
    telling_ = false;
}

// Another program may have written to the file, or taken it away.
void CMainFrame::LookAtFile()
{
    if (!state_.HasDatabase() || !isVisible() || QApplication::activeModalWidget())
        return;
    const FileState now = FileState::Of(state_.DatabasePath());
    if (now == file_)
        return;
    file_ = now;
    if (!now.exists) {
        notice_->setText(StringText(Str::FileGone, {QFileInfo(state_.DatabasePath()).fileName()}));
        notice_->show();
        return;
    }
    notice_->hide();
    if (commands_.RefillIfChanged()) {
        FollowNames();
        const ViewList open = tabs_->Open();
        const ViewList left = StillThere(open, state_);
        for (const ViewKey& view : open.views) {
            const bool gone = std::ranges::find(left.views, view) == left.views.end();
            if (gone && view.kind == EntryKind::Table)
                CloseViewOf(view);
        }
        ShowState();
    } else {
        panel_->LookAt(state_.Selected());
    }
    TakeUpChanges(nullptr);
}

} // namespace mirel
