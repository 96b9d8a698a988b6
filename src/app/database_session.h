#pragma once

#include "app/settings.h"
#include "data/catalog.h"
#include "data/db_connection.h"
#include "forms/form_store.h"
#include "platform/program_folder.h"
#include "platform/user_prompt.h"

#include <QString>
#include <QStringList>

#include <memory>
#include <optional>
#include <vector>

namespace mirel {

// A database that was opened and is not yet the session's.
struct OpenedDatabase {
    DatabaseLocation location;
    QString stamp;
    QString sideFile;
    QStringList favorites;
    std::unique_ptr<FormStore> store;
};

// Hears at once what changes in the session's database.
class SessionListener {
public:
    virtual ~SessionListener() = default;
    virtual void RecordsChanged() = 0;
};

// The one database that is open in the program, with what belongs to it: its stamp, the side file with its
// forms and saved queries, its favourites. The window and the command line open databases through this class.
//
// Owns the form store. Connection and prompt must outlive the session.
class DatabaseSession {
public:
    DatabaseSession(DbConnection& connection, ProgramFolder folder, UserPrompt& prompt);
    ~DatabaseSession();
    Q_DISABLE_COPY_MOVE(DatabaseSession)

    // Opens `location` and closes the database before it; an empty one only closes. A database that has no stamp
    // gets one with its first opening; one that cannot be written is opened without stamp and store. When the file
    // is no database: false, the reason is reported, and the current one stays open.
    bool Open(const DatabaseLocation& location);
    // The two halves of Open, for callers that close something between them. What is neither adopted nor
    // dismissed keeps its file open.
    std::optional<OpenedDatabase> Prepare(const DatabaseLocation& location);
    void Adopt(OpenedDatabase opened);
    void Dismiss(const OpenedDatabase& opened);
    // Whether `location` names the file that is open.
    bool IsCurrent(const DatabaseLocation& location) const;
    // Results that are open on the database end with it.
    void Close();
    // CREATE DATABASE, then Open. On failure the current database stays open.
    bool Create(const DatabaseLocation& location);
    // Removes the database and with it its side file and its favourites, unless one of the recent databases is a
    // copy and bears the same stamp; asks nothing. On failure all is as it was.
    bool Drop(const DatabaseLocation& location);

    bool IsOpen() const { return !location_.IsEmpty(); }
    const DatabaseLocation& Location() const { return location_; }
    QString Stamp() const { return stamp_; }       // empty: the database could not be written
    QString SideFile() const { return sideFile_; } // empty likewise
    // Forms and queries. Without a path, so that nothing can be saved in it, when there is no side file or it
    // cannot be read.
    FormStore& Store() { return *store_; }
    QStringList Favorites() const { return favorites_; } // "table:Birds", "form:…", "query:…"
    // Written to the favorites file at once. False, and nothing changed, when that fails or the database has no
    // stamp.
    bool SetFavorites(const QStringList& favorites);

    bool ListTables(QStringList& tables) { return catalog_.ListTables(location_, tables); }
    Catalog& GetCatalog() { return catalog_; }
    const ProgramFolder& Folder() const { return folder_; }
    DbConnection& Connection() { return connection_; }
    UserPrompt& Prompt() { return prompt_; }

    // Each must be removed before it goes.
    void AddListener(SessionListener& listener) { listeners_.push_back(&listener); }
    void RemoveListener(SessionListener& listener) { std::erase(listeners_, &listener); }
    // Call it after writing records.
    void TellRecordsChanged();

private:
    bool FindOrMakeStamp(const DatabaseLocation& location, QString& stamp);
    void LoadStore(OpenedDatabase& opened);
    bool HasKnownCopy(const DatabaseLocation& location, const QString& stamp);

    DbConnection& connection_;
    ProgramFolder folder_;
    Settings settings_;
    UserPrompt& prompt_;
    Catalog catalog_;
    DatabaseLocation location_;
    QString stamp_;
    QString sideFile_;
    QStringList favorites_;
    std::unique_ptr<FormStore> store_;
    std::vector<SessionListener*> listeners_;
};

} // namespace mirel
