#pragma once

#include <optional>

namespace mirel {

// Before 1899-12-30, OLE day numbers still count the time of day forward, so they cannot simply be added or
// subtracted. These functions handle that.
double PlusDays(double oleDays, double days);
double DaysBetween(double fromOleDays, double toOleDays);

int DaysInMonth(int year, int month); // month 1 to 12

// The date moved by `months`, at midnight, its day limited to the length of the new month. The language divides
// by 13 to count years, so twelve months after a December there is no date.
std::optional<double> AddMonths(double oleDays, int months);

} // namespace mirel
