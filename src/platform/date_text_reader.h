#pragma once

#include <QLocale>
#include <QString>

#include <optional>

namespace mirel {

// Reads what people type for a date and a time: the reverse of UserLocale's texts, and more forgiving. Any of
// "/", "-", "." and a blank does between the parts of a date, ":" always does between those of a time; seconds
// may be missing; digits of every script count. `dateFormat` and `timeFormat` (in the letters of
// QLocale::toString) give the order of the parts and the locale's own separators.
//
// Empty when the text does not read as a whole, or names no day or time that exists.
std::optional<double> ReadDateText(const QLocale& locale, QStringView dateFormat, QStringView timeFormat,
                                   QStringView text);

} // namespace mirel
