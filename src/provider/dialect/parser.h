#pragma once

#include "provider/dialect/failure.h"
#include "provider/dialect/tree.h"

#include <QStringView>

#include <variant>

namespace mirel::dialect {

using ParseResult = std::variant<Statement, Failure>;

// Reads one statement, or the bare name of a table; a ";" may end it. Time and memory stay in proportion to
// the text, and texts over a megabyte are refused.
ParseResult ParseStatement(QStringView text);

// True for a text that begins as a statement does, and so is not the bare name of a table.
bool BeginsAsStatement(QStringView text);

} // namespace mirel::dialect
