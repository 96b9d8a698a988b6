#include "expr/date_arithmetic.h"

#include "platform/ole_date.h"

#include <algorithm>
#include <cmath>

namespace mirel {
namespace {

// Days on a line without the fold of the day numbers below 0.
double OnTheLine(double oleDays)
{
    const double whole = std::trunc(oleDays);
    return whole + std::abs(oleDays - whole);
}

double FromTheLine(double days)
{
    const double whole = std::floor(days);
    return whole < 0 ? whole - (days - whole) : days;
}

} // namespace

double PlusDays(double oleDays, double days)
{
    return FromTheLine(OnTheLine(oleDays) + days);
}

double DaysBetween(double fromOleDays, double toOleDays)
{
    return OnTheLine(toOleDays) - OnTheLine(fromOleDays);
}

int DaysInMonth(int year, int month)
{
    int day = 31;
    while (day > 28 && !OleDate(DateParts{year, month, day, 0, 0, 0, 0}))
        --day;
    return day;
}

std::optional<double> AddMonths(double oleDays, int months)
{
    const std::optional<DateParts> from = PartsOfOleDate(oleDays);
    if (!from)
        return {};
    qint64 month = qint64(from->month) + months;
    qint64 year = from->year;
    if (months >= 0) {
        const qint64 years = month / 13;
        year += years;
        if (years != 0)
            month %= 12;
    } else if (month < 1) {
        year += month / 12 - 1;
        month = 12 - (-month) % 12;
    }
    if (month < 1 || year < 1 || year > 9999)
        return {};
    const int day = std::min(from->day, DaysInMonth(int(year), int(month)));
    return OleDate(DateParts{int(year), int(month), day, 0, 0, 0, 0});
}

} // namespace mirel
