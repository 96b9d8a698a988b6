#pragma once

#include "app/database_session.h"
#include "app/main_view_state.h"
#include "app/renaming.h"
#include "app/sample_database.h"
#include "app/settings.h"
#include "app/view_list.h"
#include "forms/form_host.h"

#include <optional>

namespace mirel {

// A result to be shown in the table view.
struct TableRequest {
    QString title;     // the table's or the query's name
    QString statement; // a SELECT
    QString table;     // what it shows the records of; for a query the table it was built on
    EntryKind kind = EntryKind::Table;

    friend bool operator==(const TableRequest&, const TableRequest&) = default;
};

// The views that are open on the database, where there is a window.
class ViewHost {
public:
    virtual ~ViewHost() = default;

    // Writes or asks about what was typed in any of them, before one is closed. False: the user stays.
    virtual bool MayCloseViews() = 0;
    // Closes all without a question. They can be opened again as they were.
    virtual ViewList CloseViews() = 0;
    virtual void OpenAgain(const ViewList& views) = 0;
    // What it shows is gone.
    virtual void CloseViewOf(const ViewKey& view) = 0;
};

// Carries out what the user asks of the main view: opens, makes and deletes databases, keeps the favorites,
// deletes entries, remembers all that from one run to the next. Each call that changes something brings the state
// up to date. Questions and failures go through the session's prompt. All must outlive this.
class MainViewCommands {
public:
    MainViewCommands(DatabaseSession& session, MainViewState& state, Settings& settings, SampleDatabase sample)
        : session_(session)
        , state_(state)
        , settings_(settings)
        , sample_(std::move(sample))
    {
    }

    // Must outlive this, or be taken back with null.
    void SetViewHost(ViewHost* host) { host_ = host; }

    // What the last run left behind: its selections, its tab, its database. A database that no longer opens is
    // reported, and none is open then. `database` is opened instead when it is not empty.
    void RestoreLastRun(const QString& database);
    bool KeepForNextRun(); // false: the profile cannot be written

    // The views that are open, for what changes tables under them; must outlive this. Null: there are none.
    void SetOpenViews(DesignHost* views) { views_ = views ? views : &noViews_; }
    DesignHost& Views() { return *views_; }

    // Reads the lists of the open database again.
    void Refill();
    // The same where another program may have changed them; true: it has.
    bool RefillIfChanged();

    // Another database is open before the views of the current one are closed: when it does not open, or the user
    // stays in a view, all is as it was. A database that is open already stays with its views.
    bool OpenDatabase(const QString& path);
    bool NewDatabase(const QString& path); // a name without an ending gets ".cdb"
    // Asks twice; No leaves everything as it is, and nothing is asked about a file that is no database.
    bool DeleteDatabase(const QString& path);

    // Brings the form of a form file into the open database, and selects it; asks before it replaces one.
    bool ImportFormFile(const QString& path);
    bool OpenSample(); // makes it first where it is not there

    // These act on the entry selected on the tab in front, and do nothing when there is none.
    bool AddFavorite();
    bool RemoveFavorite();
    bool DeleteSelected(); // asks; does nothing on the favorites
    bool RenameSelected(); // asks for the name, and offers to mend what refers to the old one

    // On the tab in front: asks, and gives the default form of the selected table, which is not in the store yet;
    // or says what must be chosen first.
    std::optional<FormDef> New();

    // What the table view is to show for the selected entry; empty for a form, or when there is nothing to show.
    std::optional<TableRequest> RequestOfSelected() const;
    // The same, once the user has agreed to run a query that does more than show records.
    std::optional<TableRequest> RequestToOpen();
    std::optional<TableRequest> RequestOf(const ViewKey& view) const;
    // The selected form, to be run from its start; empty for anything else.
    std::optional<FormCall> CallOfSelected() const;
    std::optional<FormCall> CallOfForm(const QString& name) const;

private:
    bool ReadContents(UserPrompt& prompt, DatabaseContents& contents);
    bool TakeOver(OpenedDatabase opened);
    bool RemoveFavorite(const MainEntry& entry);
    bool DropTable(const QString& name);
    bool RenameTable(const QString& name, const QString& newName);
    bool DeleteFromStore(const MainEntry& entry);
    std::optional<FormDef> NewForm(const QString& table);

    DatabaseSession& session_;
    MainViewState& state_;
    Settings& settings_;
    SampleDatabase sample_;
    MendingHost noViews_{session_};
    DesignHost* views_ = &noViews_;
    ViewHost* host_ = nullptr;
};

} // namespace mirel
