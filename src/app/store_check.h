#pragma once

#include "data/db_connection.h"
#include "forms/form_store.h"
#include "provider/database_location.h"
#include "resources/string_id.h"

#include <QString>

#include <vector>

namespace mirel {

// What is wrong, on one line, and what can be done about it.
struct CheckFinding {
    QString text;
    Str remedy;
};

// Reads a database's file of forms and queries and says what is wrong with it. A file that is not there is an
// empty store: a database that was never opened here has none.
std::vector<CheckFinding> CheckStoreFile(const QString& path, FormStore& store);

// What of its forms and queries refers to tables, fields and forms that the database does not have. Runs their
// queries, and writes nothing.
std::vector<CheckFinding> CheckReferences(DbConnection& connection, const DatabaseLocation& database,
                                          const FormStore& store);

} // namespace mirel
