#pragma once

#include "data/db_connection.h"
#include "forms/form_store.h"
#include "provider/database_location.h"

#include <QString>
#include <QStringList>

namespace mirel {

// Reads a database's file of forms and queries and says what is wrong with it, a line each. A file that is not
// there is an empty store: a database that was never opened here has none.
QStringList CheckStoreFile(const QString& path, FormStore& store);

// What of its forms and queries refers to tables, fields and forms that the database does not have, a line each.
// Runs their queries, and writes nothing.
QStringList CheckReferences(DbConnection& connection, const DatabaseLocation& database, const FormStore& store);

} // namespace mirel
