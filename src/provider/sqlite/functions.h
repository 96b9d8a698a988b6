#pragma once

#include <sqlite3.h>

namespace mirel::sqlite {

// Registers the functions that written SQL uses (kSortKeyFunction, kDateFunction, kLikeFunction). They can be
// called by statements alone: no view, index or trigger of a file can name them. Returns SQLite's result code.
int RegisterFunctions(sqlite3* handle);

} // namespace mirel::sqlite
