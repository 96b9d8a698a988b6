#pragma once

#include "data/db_connection.h"
#include "data/table_statements.h"
#include "platform/user_prompt.h"

#include <QString>
#include <QStringList>

#include <vector>

namespace mirel {

// Reads a database's own catalog and gives each database its lasting identity: a hidden table named "MirelSys"
// and a stamp of 14 digits, the moment at which the system first opened the database.
//
// Every call runs on the file `database`; failures are reported through the prompt and return false with an
// empty result.
class Catalog {
public:
    // Both must outlive the catalog.
    Catalog(DbConnection& connection, UserPrompt& prompt)
        : connection_(connection)
        , prompt_(prompt)
    {
    }

    // The user's tables by name; the catalog's own tables and the stamp table are left out.
    bool ListTables(const DatabaseLocation& database, QStringList& tables);
    // The stamp, empty when the database has none. False when the statement failed.
    bool FindDatabaseStamp(const DatabaseLocation& database, QString& stamp);
    // Whether that database has the stamp. Reports nothing: a database that cannot be read has none.
    bool BearsStamp(const DatabaseLocation& database, const QString& stamp);
    // Gives the database a stamp that no file in `folderOfSideFiles` has yet. Reports no failure: a database that
    // cannot be written is opened without a stamp.
    bool EnsureSystemTable(const DatabaseLocation& database, const QString& folderOfSideFiles, QString& stamp);
    bool ListFields(const QString& table, const DatabaseLocation& database, QStringList& fields);
    // The index on a field: its name and flags (bit 0 descending, bit 1 unique). Without an
    // index the call succeeds too, with an empty name and flags 0.
    bool FindFieldIndex(const QString& table, const QString& field, const DatabaseLocation& database,
                        QString& index, int& flags);
    // All indexes of a table, each with its fields in their order.
    bool ListIndexes(const QString& table, const DatabaseLocation& database,
                     std::vector<IndexDefinition>& indexes);
    // Runs a statement that yields no rows.
    bool ExecuteStatement(const DatabaseLocation& database, const QString& statement);

private:
    DbConnection& connection_;
    UserPrompt& prompt_;
};

// The side file of a database, which holds its forms and saved queries: "<folder>/Mirel_<stamp>.RAF".
QString SideFilePath(const QString& folder, const QString& stamp);

// A name in brackets, whatever it holds: "]" is written doubled.
QString BracketedName(QStringView name);
// A name as it stands in a statement: as it is when it is empty, "*" or in brackets already; bare when it is made
// of A to Z, digits and "_", begins with a letter and is no reserved word of the dialect; in brackets otherwise.
QString FieldReference(QStringView name);
// A text as a literal: in single quotes, inner ones doubled.
QString QuoteText(QStringView text);

} // namespace mirel
