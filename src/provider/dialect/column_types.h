#pragma once

#include "provider/dialect/structure.h"
#include "provider/dialect/token_cursor.h"

namespace mirel::dialect {

// Reads a type clause, "Varchar(40)", "Long Varbinary", in any case, into type and size of `column`.
[[nodiscard]] bool ParseColumnType(TokenCursor& cursor, ColumnDefinition& column);

// The clause that ParseColumnType reads back as the same type.
QString ColumnTypeText(const ColumnDefinition& column);

} // namespace mirel::dialect
