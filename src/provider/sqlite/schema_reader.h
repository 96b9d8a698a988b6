#pragma once

#include "provider/dialect/schema.h"
#include "provider/sqlite/outcome.h"

namespace mirel::sqlite {

class DatabaseFile;

// Reads the file's tables, columns and indexes, and puts the catalog's own tables in front of them. Tables
// that no statement could name (bytes that are no text) and the engine's own are left out.
Outcome ReadSchema(DatabaseFile& file, dialect::Schema& schema);

// The name of an index in the file, where the names of all indexes and tables share one space.
QString StoredIndexName(const QString& table, const QString& index);

} // namespace mirel::sqlite
