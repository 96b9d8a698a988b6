#include "app/main_view_commands.h"

#include "app/shell_commands.h"
#include "forms/default_form.h"
#include "forms/form_file.h"
#include "resources/string_table.h"
#include "tableview/saved_queries.h"

#include <QFileInfo>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

template <typename Record>
std::vector<MainEntry> EntriesOf(const std::vector<Record>& records, EntryKind kind)
{
    std::vector<MainEntry> entries;
    entries.reserve(records.size());
    for (const Record& record : records)
        entries.push_back({kind, record.name.Text(), record.tableName.Text(), false});
    return entries;
}

// For what nobody asked for: when it fails, nothing is told.
class SilentPrompt : public UserPrompt {
public:
    bool AskYesNo(const UserMessage&) override { return false; }
    void Show(const UserMessage&) override {}
    void ShowError(const QString&) override {}
    std::optional<QString> AskText(const UserMessage&, const UserMessage&, const QString&) override { return {}; }
    std::unique_ptr<Progress> StartProgress(const UserMessage&, qint64) override { return {}; }
};

// Where the selection of each tab stands in the profile, and the tab's name there.
struct TabMemory {
    MainTab tab;
    Setting selection;
    QStringView name;
};
const std::array kTabMemories = {
    TabMemory{MainTab::Favorites, Setting::ActiveFavorites, u"Favorites"},
    TabMemory{MainTab::Table, Setting::ActiveTable, u"Table"},
    TabMemory{MainTab::Form, Setting::ActiveForm, u"Form"},
    TabMemory{MainTab::Query, Setting::ActiveQuery, u"Query"},
};

} // namespace

void MainViewCommands::RestoreLastRun(const QString& database)
{
    const QString tabName = settings_.Text(Setting::ActiveView);
    for (const TabMemory& memory : kTabMemories) {
        state_.Remember(memory.tab, settings_.Text(memory.selection));
        if (memory.name == tabName)
            state_.SetTab(memory.tab);
    }
    state_.SetOpensByDoubleTap(settings_.Flag(Setting::OpenByDoubleClick));
    const QString path = database.isEmpty() ? settings_.Text(Setting::ActiveDb) : database;
    if (!path.isEmpty())
        OpenDatabase(path);
}

bool MainViewCommands::KeepForNextRun()
{
    bool kept = true;
    for (const TabMemory& memory : kTabMemories) {
        kept = settings_.SetText(memory.selection, state_.Remembered(memory.tab)) && kept;
        if (memory.tab == state_.Tab())
            kept = settings_.SetText(Setting::ActiveView, memory.name.toString()) && kept;
    }
    kept = settings_.SetInt(Setting::OpenByDoubleClick, state_.OpensByDoubleTap() ? 1 : 0) && kept;
    kept = settings_.SetText(Setting::ActiveDb, session_.Location().Text()) && kept;
    // As they are in force: a damaged line is written as the default that stood in for it.
    for (const Setting look : {Setting::MainViewBkColor, Setting::MainViewTextColor, Setting::MainViewFont})
        kept = settings_.SetText(look, settings_.Text(look)) && kept;
    return kept;
}

bool MainViewCommands::ReadContents(UserPrompt& prompt, DatabaseContents& contents)
{
    contents.path = session_.Location().Text();
    if (!session_.IsOpen())
        return true;
    QStringList tables;
    if (!Catalog(session_.Connection(), prompt).ListTables(session_.Location(), tables))
        return false;
    for (const QString& table : std::as_const(tables))
        contents.tables.push_back({EntryKind::Table, table, {}, false});
    contents.forms = EntriesOf(session_.Store().Forms(), EntryKind::Form);
    contents.queries = EntriesOf(session_.Store().Queries(), EntryKind::Query);
    for (const QString& text : session_.Favorites()) {
        if (const std::optional<MainEntry> favorite = FavoriteOfText(text))
            contents.favorites.push_back(*favorite);
    }
    return true;
}

void MainViewCommands::Refill()
{
    // Also now, not at the end alone: a program that is killed comes back to its database.
    if (settings_.Text(Setting::ActiveDb) != session_.Location().Text())
        settings_.SetText(Setting::ActiveDb, session_.Location().Text());
    DatabaseContents contents;
    (void)ReadContents(session_.Prompt(), contents);
    state_.Show(std::move(contents));
}

bool MainViewCommands::RefillIfChanged()
{
    SilentPrompt silent;
    DatabaseContents contents;
    return ReadContents(silent, contents) && state_.ShowIfChanged(std::move(contents));
}

bool MainViewCommands::OpenDatabase(const QString& path)
{
    if (session_.IsCurrent(path) && QFileInfo::exists(path)) {
        Refill();
        return true;
    }
    std::optional<OpenedDatabase> opened = session_.Prepare(path);
    if (!opened && !QFileInfo::exists(path))
        settings_.ForgetDatabase(path);
    return opened && TakeOver(std::move(*opened));
}

bool MainViewCommands::TakeOver(OpenedDatabase opened)
{
    if (host_ && !host_->MayCloseViews()) {
        session_.Dismiss(opened);
        return false;
    }
    if (host_)
        host_->CloseViews();
    session_.Adopt(std::move(opened));
    Refill();
    return true;
}

bool MainViewCommands::NewDatabase(const QString& path)
{
    const QString file = QFileInfo(path).suffix().isEmpty() ? path + u".cdb"_s : path;
    if (!session_.GetCatalog().ExecuteStatement({}, u"CREATE DATABASE "_s + QuoteText(file)))
        return false;
    std::optional<OpenedDatabase> opened = session_.Prepare(file);
    if (opened && TakeOver(std::move(*opened)))
        return true;
    (void)session_.Drop(file); // the user stays where he is
    return false;
}

bool MainViewCommands::DeleteDatabase(const QString& path)
{
    if (!QFileInfo(path).isFile())
        return false; // nothing was chosen
    UserPrompt& prompt = session_.Prompt();
    QString stamp;
    if (!session_.GetCatalog().FindDatabaseStamp(path, stamp) || !prompt.AskYesNo({Str::DeleteDatabase, {path}}) ||
        !prompt.AskYesNo({Str::DeleteDatabaseReally, {path}}))
        return false;
    const bool closes = host_ && session_.IsCurrent(path);
    if (closes && !host_->MayCloseViews())
        return false;
    const ViewList before = closes ? host_->CloseViews() : ViewList{};
    const bool dropped = session_.Drop(path);
    Refill();
    if (!dropped && closes)
        host_->OpenAgain(before);
    return dropped;
}

bool MainViewCommands::ImportFormFile(const QString& path)
{
    UserPrompt& prompt = session_.Prompt();
    QString error;
    std::optional<FormDef> form = ImportForm(path, error);
    if (!form) {
        prompt.ShowError(error);
        return false;
    }
    if (session_.Store().Path().isEmpty()) {
        prompt.Show({Str::MakerStoreMissing, {}});
        return false;
    }
    // The question is asked while the store is not locked; then all is looked at again.
    const QString name = form->name.Text();
    bool mayReplace = false;
    bool exists = false;
    const auto put = [&](FormStore& store) {
        FormDef* there = store.FindForm(name);
        exists = there && !mayReplace;
        if (exists)
            return false;
        if (there)
            there->CopyFrom(*form);
        else
            store.AddForm(*form);
        return true;
    };
    while (!session_.Store().Apply(put)) {
        if (!exists) {
            prompt.ShowError(session_.Store().LastError());
            return false;
        }
        if (!prompt.AskYesNo({Str::FormExists, {name}}))
            return false;
        mayReplace = true;
    }
    Refill();
    state_.SetTab(MainTab::Form);
    state_.Select({EntryKind::Form, name, form->tableName.Text(), false});
    return true;
}

bool MainViewCommands::OpenSample()
{
    if (session_.IsCurrent(sample_.Path()))
        return true;
    const bool isNew = !QFileInfo::exists(sample_.Path());
    if (!sample_.Provide(session_) || !OpenDatabase(sample_.Path()))
        return false;
    if (isNew) {
        sample_.Furnish(session_);
        Refill();
    }
    return true;
}

bool MainViewCommands::AddFavorite()
{
    const std::optional<MainEntry> entry = state_.Selected();
    if (!entry || state_.IsFavorite(*entry))
        return false;
    if (!session_.SetFavorites(session_.Favorites() << FavoriteText(*entry))) {
        session_.Prompt().Show({Str::FavoritesReadOnly, {}});
        return false;
    }
    Refill();
    return true;
}

bool MainViewCommands::RemoveFavorite()
{
    const std::optional<MainEntry> entry = state_.Selected();
    return entry && RemoveFavorite(*entry);
}

bool MainViewCommands::RemoveFavorite(const MainEntry& entry)
{
    QStringList favorites = session_.Favorites();
    if (favorites.removeAll(FavoriteText(entry)) == 0)
        return false;
    if (!session_.SetFavorites(favorites)) {
        session_.Prompt().Show({Str::FavoritesReadOnly, {}});
        return false;
    }
    Refill();
    return true;
}

bool MainViewCommands::DeleteSelected()
{
    const std::optional<MainEntry> entry = state_.Selected();
    if (!entry || state_.Tab() == MainTab::Favorites)
        return false;
    const bool deleted = entry->kind == EntryKind::Table ? DropTable(entry->name) : DeleteFromStore(*entry);
    if (deleted) {
        if (state_.IsFavorite(*entry))
            RemoveFavorite(*entry);
        Refill();
        if (host_ && entry->kind == EntryKind::Table)
            host_->CloseViewOf({entry->kind, entry->name});
    }
    return deleted;
}

bool MainViewCommands::DropTable(const QString& name)
{
    if (!views_->WritePending(name))
        return false;
    DesignRun run(session_.Connection(), session_.Location(), session_.Prompt());
    if (run.DropTable(name) != DesignRun::Outcome::Done)
        return false;
    views_->TableDropped(name);
    return true;
}

bool MainViewCommands::RenameSelected()
{
    const std::optional<MainEntry> entry = state_.Selected();
    if (!entry || entry->missing)
        return false;
    const std::optional<QString> name =
        session_.Prompt().AskText({Str::RenameTitle, {}}, {Str::RenameLabel, {entry->name}}, entry->name);
    if (!name)
        return false;
    const bool renamed = entry->kind == EntryKind::Table
                             ? RenameTable(entry->name, *name)
                             : Renaming(session_).RenameInStore(entry->kind, entry->name, *name);
    Refill();
    if (renamed)
        state_.Select({entry->kind, name->trimmed(), entry->table, false});
    return renamed;
}

bool MainViewCommands::RenameTable(const QString& name, const QString& newName)
{
    TableDesigner designer(session_.Connection(), session_.Location(), session_.Prompt(), *views_);
    return designer.Open(name) && designer.RenameTable(newName);
}

bool MainViewCommands::DeleteFromStore(const MainEntry& entry)
{
    const bool form = entry.kind == EntryKind::Form;
    if (!session_.Prompt().AskYesNo({form ? Str::DeleteFormQuestion : Str::DeleteQueryQuestion, {entry.name}}))
        return false;
    const bool deleted = session_.Store().Apply(
        [&](FormStore& store) { return form ? store.RemoveForm(entry.name) : store.RemoveQuery(entry.name); });
    if (!deleted && !session_.Store().LastError().isEmpty())
        session_.Prompt().ShowError(session_.Store().LastError());
    return deleted;
}

std::optional<FormDef> MainViewCommands::New()
{
    const NewOutcome outcome = OutcomeOfNew(state_);
    if (outcome.message)
        session_.Prompt().Show({*outcome.message, {}});
    return outcome.make == EntryKind::Form ? NewForm(state_.CurrentTable()) : std::nullopt;
}

std::optional<FormDef> MainViewCommands::NewForm(const QString& table)
{
    UserPrompt& prompt = session_.Prompt();
    if (!prompt.AskYesNo({Str::CreateFormForTable, {table}}))
        return std::nullopt;
    return DefaultFormOf(session_.Connection(), session_.Location(), table, prompt);
}

std::optional<TableRequest> MainViewCommands::RequestOfSelected() const
{
    const std::optional<MainEntry> entry = state_.Selected();
    return entry && !entry->missing ? RequestOf({entry->kind, entry->name}) : std::nullopt;
}

std::optional<TableRequest> MainViewCommands::RequestOf(const ViewKey& view) const
{
    switch (view.kind) {
    // Never the bare name: a filter appends its WHERE to the statement.
    case EntryKind::Table:
        return TableRequest{view.name, u"SELECT * FROM "_s + FieldReference(view.name), view.name};
    case EntryKind::Query:
        if (const QueryDef* query = session_.Store().FindQuery(view.name))
            return TableRequest{view.name, query->text.Text(), query->tableName.Text(), EntryKind::Query};
        break;
    case EntryKind::Form:
        break;
    }
    return std::nullopt;
}

std::optional<TableRequest> MainViewCommands::RequestToOpen()
{
    std::optional<TableRequest> request = RequestOfSelected();
    SavedQueries queries(session_.Store(), session_.Prompt());
    return request && queries.AskIfItChanges(request->title, request->statement) ? request : std::nullopt;
}

std::optional<FormCall> MainViewCommands::CallOfSelected() const
{
    const std::optional<MainEntry> entry = state_.Selected();
    if (!entry || entry->missing || entry->kind != EntryKind::Form)
        return std::nullopt;
    return CallOfForm(entry->name);
}

std::optional<FormCall> MainViewCommands::CallOfForm(const QString& name) const
{
    const FormDef* form = session_.Store().FindForm(name);
    if (!form)
        return std::nullopt;
    FormCall call;
    call.form.CopyFrom(*form); // the store may be loaded again while the form runs
    return call;
}

} // namespace mirel
