#pragma once

#include "provider/dialect/schema.h"
#include "provider/sqlite/schema_ids.h"

#include <sqlite3.h>

namespace mirel::sqlite {

// The catalog as tables of the dialect: MSysTables, MSysFields, MSysIndexes, MSysProcs. They stand in no file;
// the handle shows the schema through virtual tables under names of its own.

// `schema` must outlive the handle; rows are what it holds when a statement reads them. Returns SQLite's
// result code.
int RegisterSystemTables(sqlite3* handle, const dialect::Schema& schema);

void AddSystemTables(dialect::Schema& schema, SchemaIds& ids);

} // namespace mirel::sqlite
