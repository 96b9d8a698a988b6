#pragma once

#include <optional>

namespace mirel {

// OLE day numbers count the time of day forward even before 1899-12-30, so they cannot simply be added and
// subtracted there; these can.
double PlusDays(double oleDays, double days);
double DaysBetween(double fromOleDays, double toOleDays);

int DaysInMonth(int year, int month); // month 1 to 12

// The date moved by `months`, at midnight, its day clamped to the length of the new month. Years are counted
// with the divisor 13, as the language has it: from December on by 12 months there is no such date.
std::optional<double> AddMonths(double oleDays, int months);

} // namespace mirel
