#pragma once

#include "platform/field_type.h"
#include "platform/hr.h"
#include "platform/value.h"

namespace mirel {

// Types direct the values: makes of `value` what a column of that type and size stores. A text is read as a
// date (the user's form, or ISO), a number or one of TRUE and FALSE where the column asks for it; a number that
// has no fraction becomes an integer. NULL stays NULL. What does not read is BadLiteral; what does not fit
// (too long a text, too large a number, a year outside 1 to 9999) is Overflow; nothing is cut or wrapped.
// `size` is the column's, -1 for none. On failure `converted` is left alone.
[[nodiscard]] Hr ConvertForColumn(const Value& value, FieldType type, int size, Value& converted);

} // namespace mirel
