#pragma once

#include "platform/hr.h"
#include "provider/dialect/tree.h"

namespace mirel::dialect {

// Types direct the literals. Each changes the literal `expression` into one of the wanted type, or fails with
// BadLiteral, Overflow or BadComparison and leaves it. What is no literal, and NULL, stays as it is.

// For a comparison with something of that type.
[[nodiscard]] Hr FitLiteral(Expr& expression, FieldType type);
// For being stored in a column of that type and size.
[[nodiscard]] Hr StoreLiteral(Expr& expression, FieldType type, int size);

// The type that a literal has by itself.
FieldType TypeOfLiteral(const Expr& expression);

} // namespace mirel::dialect
