#pragma once

#include <QDateTime>

#include <array>
#include <optional>
#include <string_view>

namespace mirel {

// Dates in memory are OLE day numbers: whole days since 1899-12-30, and the time of day as the fraction. Before
// that day the fraction still counts forward: -1.25 is 1899-12-29 at 06:00. The calendar is the proleptic
// Gregorian one, years 1 to 9999; a time is kept to the millisecond. There is no time zone.
struct DateParts {
    int year = 1899;
    int month = 12;
    int day = 30;
    int hour = 0;
    int minute = 0;
    int second = 0;
    int millisecond = 0;

    friend bool operator==(const DateParts&, const DateParts&) = default;
};

// Empty when no such day or time exists.
std::optional<double> OleDate(const DateParts& parts);
// Empty when the day number is not a number or lies outside the years 1 to 9999.
std::optional<DateParts> PartsOfOleDate(double oleDays);

std::optional<double> OleDate(const QDateTime& local);

// The form of a date in the file: "2001-07-04", "2001-07-04 09:05:00", "2001-07-04 09:05:00.250". Sorts and
// compares as text.
struct StoredDate {
    std::array<char, 24> characters{};
    int length = 0;

    std::string_view Text() const { return {characters.data(), size_t(length)}; }
};
std::optional<StoredDate> StoredDateOf(double oleDays);
// Whether a text has that form, even if no such day or time exists.
bool HasStoredDateForm(std::string_view text);
// Whether a text has exactly that form and its day and time exist: bulk work stores it unchanged.
bool IsStoredDate(std::string_view text);

// Reads the stored form and the variants of other programs: a "T" between date and time, a missing second, a
// fraction of any length; a time zone ("Z", "+02:00") moves the value to UTC. Empty for anything else.
std::optional<double> OleDateFromStored(std::string_view text);

} // namespace mirel
