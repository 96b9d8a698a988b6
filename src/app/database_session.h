#pragma once

#include "data/catalog.h"
#include "data/db_connection.h"
#include "forms/form_store.h"
#include "platform/program_folder.h"
#include "platform/user_prompt.h"

#include <QString>
#include <QStringList>

#include <memory>

namespace mirel {

// The one database that is open in the program, with what belongs to it: its stamp, the side file with its
// forms and saved queries, its favourites. The window and the command line open databases through this class.
//
// Owns the form store. Connection and prompt must outlive the session.
class DatabaseSession {
public:
    DatabaseSession(DbConnection& connection, ProgramFolder folder, UserPrompt& prompt);
    ~DatabaseSession();
    Q_DISABLE_COPY_MOVE(DatabaseSession)

    // Closes the current database and opens `path`; an empty path only closes. A database that has no stamp
    // gets one with its first opening; one that cannot be written is opened without stamp and store. False,
    // with nothing open and the reason reported, when the file is no database.
    bool Open(const QString& path);
    void Close();
    // CREATE DATABASE, then Open.
    bool Create(const QString& path);
    // Removes the database, its side file (unless another known database bears the same stamp) and its
    // favourites; asks nothing.
    bool Drop(const QString& path);

    bool IsOpen() const { return !path_.isEmpty(); }
    QString Path() const { return path_; }
    QString Stamp() const { return stamp_; }       // empty: the database could not be written
    QString SideFile() const { return sideFile_; } // empty likewise
    FormStore& Store() { return *store_; }
    QStringList Favorites() const { return favorites_; } // "table:Birds", "form:…", "query:…"
    // Written to the favorites file at once. False, and nothing changed, when that fails or the database has no
    // stamp.
    bool SetFavorites(const QStringList& favorites);

    bool ListTables(QStringList& tables) { return catalog_.ListTables(path_, tables); }
    Catalog& GetCatalog() { return catalog_; }
    DbConnection& Connection() { return connection_; }
    UserPrompt& Prompt() { return prompt_; }

private:
    DbConnection& connection_;
    ProgramFolder folder_;
    UserPrompt& prompt_;
    Catalog catalog_;
    QString path_;
    QString stamp_;
    QString sideFile_;
    QStringList favorites_;
    std::unique_ptr<FormStore> store_;
};

} // namespace mirel
