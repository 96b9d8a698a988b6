#pragma once

#include "provider/dialect/parser.h"
#include "provider/dialect/token_cursor.h"

namespace mirel::dialect {

// The statements that begin with CREATE, DROP or ALTER, up to the statement's end.
ParseResult ParseStructureStatement(TokenCursor& cursor);

} // namespace mirel::dialect
