#pragma once

#include <QString>
#include <QTime>

#include <array>
#include <optional>
#include <string_view>

namespace mirel {

// The order of the three date fields in a text. Settings and scripts hold these numbers.
enum class DateOrder : int {
    MonthDayYear = 0,
    MonthYearDay = 1,
    YearDayMonth = 2,
    YearMonthDay = 3,
    DayMonthYear = 4,
    DayYearMonth = 5,
    Locale = 6, // the user's own form, read and written by UserLocale; separators play no part
};

// How CSV files write dates. A separator of 0 means none: it is not written, and texts that need one cannot be
// read.
struct DateFormat {
    DateOrder order = DateOrder::Locale;
    char16_t dateSeparator = u'-';
    char16_t timeSeparator = u':';

    friend bool operator==(const DateFormat&, const DateFormat&) = default;
};

// Reads a date with an optional time after a blank: the day number, or empty if the text is not a date. Each field
// counts by its leading number; years 0 to 29 are 2000 to 2029, other years below 100 are of the
// 20th century. A time needs both of its separators; an hour without a separator after it is ignored.
//
// Suits bulk work: in the orders 0 to 5 it makes no QString.
std::optional<double> ParseDateFields(const DateFormat& format, std::string_view utf8);

// Reads a time that stands alone, as FormatDateFields writes one on the base date: hour, minute and second, digits
// only. Empty for anything else, and for DateOrder::Locale, whose own reader takes times.
std::optional<double> ParseTimeFields(const DateFormat& format, std::string_view utf8);

// ParseDateFields for one text: `out` becomes the date as the user's locale writes it. On false `out` is as it
// was.
[[nodiscard]] bool ParseDateText(DateOrder order, QChar dateSeparator, QChar timeSeparator, QStringView text,
                                 QString& out);

// A date in one of the orders 0 to 5, as UTF-8 in its own small buffer.
struct DateFieldsText {
    std::array<char, 40> characters{};
    size_t length = 0;

    std::string_view Text() const { return {characters.data(), length}; }
};

// Omits midnight; writes a time on the base date 1899-12-30 without the date. Empty for a value that is not a
// date. Not for DateOrder::Locale, which has no fields of its own.
DateFieldsText FormatDateFields(const DateFormat& format, double oleDays);

// The same for every order.
QString FormatDateText(const DateFormat& format, double oleDays);

// Fills a pattern of pieces in parentheses, "(DD).(MM).(YYYY)"; docs/expressions.md lists the pieces. Copies the
// rest, and an unclosed "(". Empty for a value that is not a date.
QString FormatDatePattern(double oleDays, QStringView pattern);

QString CurrentTimeText(QTime now = QTime::currentTime()); // "09:05:00"
QString DateText(double oleDays);                          // "2001-07-04"; empty if not a date
QString CompactDateText(QStringView text);                 // "20010704", from a text in the user's locale

} // namespace mirel
