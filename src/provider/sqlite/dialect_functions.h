#pragma once

#include "platform/hr.h"

#include <optional>
#include <string_view>

struct sqlite3;

namespace mirel::sqlite {

// The functions of ours that the dialect's own functions and assignments are written with; RegisterFunctions
// registers them with its own on every handle. Returns SQLite's result.
[[nodiscard]] int RegisterDialectFunctions(sqlite3* database);

// What a statement failed with when it was kStoreFunction that refused a value; empty for any other message.
std::optional<Hr> StoreFailure(std::string_view errorMessage);

} // namespace mirel::sqlite
