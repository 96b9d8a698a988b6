#pragma once

#include "provider/sqlite/database_file.h"

namespace mirel::sqlite {

// Puts column `from` in front of column `before` by writing the table again, rows under their row ids; indexes,
// triggers and everything else that its statement says come along. The transaction around it is the caller's.
Outcome MoveColumnByRebuild(DatabaseFile& file, const dialect::Table& table, size_t from, size_t before);

} // namespace mirel::sqlite
