#pragma once

#include "platform/field_type.h"
#include "platform/hr.h"
#include "platform/value.h"

#include <QStringView>

#include <optional>

namespace mirel::dialect {

// How texts read as values of the other types, and what a column of a type takes. Every failure is BadLiteral
// (does not read) or Overflow (reads, but does not fit); what was to be set is then left alone.

// A decimal number with an optional sign, point and exponent; blanks around it do not count.
[[nodiscard]] Hr ReadNumber(QStringView text, double& number);
// The stored form, or the user's own; as an OLE day number.
[[nodiscard]] Hr ReadDate(QStringView text, double& oleDays);
// TRUE, FALSE, YES, NO in any case, or a number.
[[nodiscard]] Hr ReadTruth(QStringView text, bool& truth);

// `value` as a column of that type and size stores it; NULL stays NULL.
[[nodiscard]] Hr ConvertValue(const Value& value, FieldType type, int size, Value& converted);

} // namespace mirel::dialect
