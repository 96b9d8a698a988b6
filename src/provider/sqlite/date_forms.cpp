#include "provider/sqlite/date_forms.h"

#include <cmath>
#include <string>

namespace mirel::sqlite {
namespace {

constexpr double kJulianOfBaseDate = 2415018.5; // 1899-12-30, midnight
constexpr double kFirstJulian = 1721425.5;      // 0001-01-01
constexpr double kEndOfJulian = 5373484.5;      // the day after 9999-12-31
constexpr double kUnixOfBaseDate = -2209161600;
constexpr double kLastUnixSecond = 253402300799;
constexpr double kSecondsPerDay = 86400;

// In a day number the fraction counts forward also before the base date.
double OleDaysOf(double daysSinceBaseDate)
{
    const double whole = std::floor(daysSinceBaseDate);
    const double fraction = daysSinceBaseDate - whole;
    return whole < 0 ? whole - fraction : whole + fraction;
}

} // namespace

std::optional<StoredDate> StoredDateOfText(std::string_view text)
{
    constexpr size_t kLongest = 64;
    if (text.size() > kLongest)
        return {};
    std::optional<double> days = OleDateFromStored(text);
    if (!days && text.find('-') == std::string_view::npos)
        days = OleDateFromStored("1899-12-30 " + std::string(text));
    return days ? StoredDateOf(*days) : std::nullopt;
}

std::optional<StoredDate> StoredDateOfNumber(double number)
{
    if (number >= kFirstJulian && number < kEndOfJulian)
        return StoredDateOf(OleDaysOf(number - kJulianOfBaseDate));
    if (std::abs(number) > kLastUnixSecond)
        number /= 1000;
    if (!(std::abs(number) <= kLastUnixSecond))
        return {};
    return StoredDateOf(OleDaysOf((number - kUnixOfBaseDate) / kSecondsPerDay));
}

} // namespace mirel::sqlite
