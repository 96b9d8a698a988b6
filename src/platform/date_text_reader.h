#pragma once

#include <QLocale>
#include <QString>

#include <optional>

namespace mirel {

// Reads dates and times as people type them: the reverse of UserLocale's texts, but more forgiving. The parts of a
// date may be separated by "/", "-", "." or a blank, those of a time always by ":"; seconds may be missing; digits
// of any script are accepted. `dateFormat` and `timeFormat` (in the letters of
// QLocale::toString) give the order of the parts and the locale's own separators.
//
// Empty when part of the text cannot be read, or when there is no such day or time.
std::optional<double> ReadDateText(const QLocale& locale, QStringView dateFormat, QStringView timeFormat,
                                   QStringView text);

} // namespace mirel
