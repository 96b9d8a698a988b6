#pragma once

#include "provider/dialect/failure.h"
#include "provider/dialect/schema.h"
#include "provider/dialect/structure.h"

#include <optional>

namespace mirel::dialect {

inline constexpr size_t kMaxColumns = 2000; // of a table, and of a result

// Holds a structure change against a schema and gives the names that exist the schema's spelling. Empty: it
// can be made.
std::optional<Failure> CheckStructure(StructureChange& change, const Schema& schema);

// Why a table cannot be changed by any statement; empty when it can.
std::optional<Failure> RefuseChange(const Table& table);
// For people: why the table's records cannot be changed. Empty when they can.
QString ReadOnlyReason(const Table& table);

} // namespace mirel::dialect
