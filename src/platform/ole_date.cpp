#include "platform/ole_date.h"

#include <cmath>
#include <cstring>

namespace mirel {
namespace {

constexpr qint64 kMillisecondsPerDay = 86400000;
constexpr qint64 kOleEpoch = 693593; // 1899-12-30 counted from 0001-01-01
constexpr qint64 kLastDay = 3652058; // 9999-12-31 counted so

constexpr std::string_view kStoredForm = "0000-00-00 00:00:00.000"; // 0 stands for any digit
constexpr size_t kStoredDay = 10;                                   // as far as the day
constexpr size_t kStoredSecond = 19;

constexpr bool IsLeap(int year)
{
    return year % 4 == 0 && (year % 100 != 0 || year % 400 == 0);
}

constexpr int DaysInMonth(int year, int month)
{
    constexpr std::array kDays = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
    return month == 2 && IsLeap(year) ? 29 : kDays[size_t(month - 1)];
}

// Days from 0001-01-01 by Howard Hinnant's civil-date arithmetic: the year begins in March, so that the leap
// day is its last.
constexpr qint64 DayNumber(int year, int month, int day)
{
    const int shifted = month > 2 ? year : year - 1;
    const qint64 era = shifted / 400;
    const qint64 yearOfEra = shifted - era * 400;
    const qint64 dayOfYear = (153 * (month > 2 ? month - 3 : month + 9) + 2) / 5 + day - 1;
    const qint64 dayOfEra = yearOfEra * 365 + yearOfEra / 4 - yearOfEra / 100 + dayOfYear;
    return era * 146097 + dayOfEra - 306;
}
static_assert(DayNumber(1, 1, 1) == 0 && DayNumber(1899, 12, 30) == kOleEpoch &&
              DayNumber(9999, 12, 31) == kLastDay);

void SetDay(DateParts& parts, qint64 dayNumber)
{
    const qint64 fromMarch = dayNumber + 306;
    const qint64 era = fromMarch / 146097;
    const qint64 dayOfEra = fromMarch - era * 146097;
    const qint64 yearOfEra = (dayOfEra - dayOfEra / 1460 + dayOfEra / 36524 - dayOfEra / 146096) / 365;
    const qint64 dayOfYear = dayOfEra - (365 * yearOfEra + yearOfEra / 4 - yearOfEra / 100);
    const qint64 shiftedMonth = (5 * dayOfYear + 2) / 153;
    parts.day = int(dayOfYear - (153 * shiftedMonth + 2) / 5 + 1);
    parts.month = int(shiftedMonth < 10 ? shiftedMonth + 3 : shiftedMonth - 9);
    parts.year = int(yearOfEra + era * 400 + (parts.month <= 2 ? 1 : 0));
}

bool Exists(const DateParts& parts)
{
    return parts.year >= 1 && parts.year <= 9999 && parts.month >= 1 && parts.month <= 12 && parts.day >= 1 &&
           parts.day <= DaysInMonth(parts.year, parts.month) && parts.hour >= 0 && parts.hour <= 23 &&
           parts.minute >= 0 && parts.minute <= 59 && parts.second >= 0 && parts.second <= 59 &&
           parts.millisecond >= 0 && parts.millisecond <= 999;
}

double OleDays(qint64 dayNumber, qint64 millisecondOfDay)
{
    const auto days = double(dayNumber - kOleEpoch);
    const double fraction = double(millisecondOfDay) / double(kMillisecondsPerDay);
    return days < 0 ? days - fraction : days + fraction;
}

// Reads digits off the front of a text.
class DigitReader {
public:
    explicit DigitReader(std::string_view text)
        : rest_(text)
    {
    }

    bool Number(size_t minDigits, size_t maxDigits, int& number)
    {
        size_t count = 0;
        number = 0;
        while (count < maxDigits && count < rest_.size() && rest_[count] >= '0' && rest_[count] <= '9')
            number = number * 10 + (rest_[count++] - '0');
        rest_.remove_prefix(count);
        return count >= minDigits;
    }
    bool Take(char wanted)
    {
        if (rest_.empty() || rest_.front() != wanted)
            return false;
        rest_.remove_prefix(1);
        return true;
    }
    bool AtEnd() const { return rest_.empty(); }

    // The digits after a point as milliseconds; further digits are dropped.
    bool Milliseconds(int& milliseconds)
    {
        int scale = 100;
        size_t count = 0;
        for (milliseconds = 0; count < rest_.size() && rest_[count] >= '0' && rest_[count] <= '9'; ++count) {
            milliseconds += (rest_[count] - '0') * scale;
            scale /= 10;
        }
        rest_.remove_prefix(count);
        return count > 0;
    }

private:
    std::string_view rest_;
};

bool ReadTime(DigitReader& reader, DateParts& parts)
{
    if (!reader.Number(1, 2, parts.hour) || !reader.Take(':') || !reader.Number(2, 2, parts.minute))
        return false;
    if (!reader.Take(':'))
        return true;
    if (!reader.Number(2, 2, parts.second))
        return false;
    return !reader.Take('.') || reader.Milliseconds(parts.millisecond);
}

bool ReadZone(DigitReader& reader, int& minutesEast)
{
    if (reader.Take('Z') || reader.AtEnd())
        return true;
    const int sign = reader.Take('-') ? -1 : 1;
    if (sign == 1 && !reader.Take('+'))
        return false;
    int hours = 0;
    int minutes = 0;
    if (!reader.Number(2, 2, hours))
        return false;
    reader.Take(':');
    if (!reader.AtEnd() && !reader.Number(2, 2, minutes))
        return false;
    minutesEast = sign * (hours * 60 + minutes);
    return hours <= 23 && minutes <= 59;
}

} // namespace

std::optional<double> OleDate(const DateParts& parts)
{
    if (!Exists(parts))
        return {};
    const qint64 milliseconds =
        ((parts.hour * 60LL + parts.minute) * 60 + parts.second) * 1000 + parts.millisecond;
    return OleDays(DayNumber(parts.year, parts.month, parts.day), milliseconds);
}

std::optional<DateParts> PartsOfOleDate(double oleDays)
{
    if (!(std::abs(oleDays) < 4e6)) // no number, or far outside the calendar
        return {};
    double wholeDays = std::trunc(oleDays);
    const double fraction = std::abs(oleDays - wholeDays);
    auto milliseconds = qint64(std::llround(fraction * double(kMillisecondsPerDay)));
    if (milliseconds == kMillisecondsPerDay) { // a fraction that rounds up to the next day
        milliseconds = 0;
        wholeDays += 1;
    }
    const qint64 dayNumber = qint64(wholeDays) + kOleEpoch;
    if (dayNumber < 0 || dayNumber > kLastDay)
        return {};
    DateParts parts;
    SetDay(parts, dayNumber);
    parts.millisecond = int(milliseconds % 1000);
    parts.second = int(milliseconds / 1000 % 60);
    parts.minute = int(milliseconds / 60000 % 60);
    parts.hour = int(milliseconds / 3600000);
    return parts;
}

std::optional<double> OleDate(const QDateTime& local)
{
    const QDate date = local.date();
    const QTime time = local.time();
    return OleDate(
        DateParts{date.year(), date.month(), date.day(), time.hour(), time.minute(), time.second(), time.msec()});
}

std::optional<StoredDate> StoredDateOf(double oleDays)
{
    const std::optional<DateParts> parts = PartsOfOleDate(oleDays);
    if (!parts)
        return {};
    StoredDate stored;
    const auto write = [&stored](int number, int digits) {
        for (int at = stored.length + digits - 1; at >= stored.length; --at, number /= 10)
            stored.characters[size_t(at)] = char('0' + number % 10);
        stored.length += digits;
    };
    const auto writeAfter = [&](char sign, int number, int digits) {
        stored.characters[size_t(stored.length++)] = sign;
        write(number, digits);
    };
    write(parts->year, 4);
    writeAfter('-', parts->month, 2);
    writeAfter('-', parts->day, 2);
    if (parts->hour == 0 && parts->minute == 0 && parts->second == 0 && parts->millisecond == 0)
        return stored;
    writeAfter(' ', parts->hour, 2);
    writeAfter(':', parts->minute, 2);
    writeAfter(':', parts->second, 2);
    if (parts->millisecond != 0)
        writeAfter('.', parts->millisecond, 3);
    return stored;
}

bool HasStoredDateForm(std::string_view text)
{
    if (text.size() != kStoredDay && text.size() != kStoredSecond && text.size() != kStoredForm.size())
        return false;
    // Eight characters at a time. Against the form a digit becomes 0 to 9 and a sign 0; what is added carries
    // everything else into the upper half of its byte.
    constexpr std::string_view kAddends = "\6\6\6\6\17\6\6\17\6\6\17\6\6\17\6\6\17\6\6\17\6\6\6";
    static_assert(kAddends.size() == kStoredForm.size());
    const auto eightAt = [](std::string_view characters, size_t at) {
        quint64 eight = 0;
        std::memcpy(&eight, characters.data() + at, sizeof eight);
        return eight;
    };
    const auto fits = [&](size_t at) {
        constexpr quint64 kUpperHalves = 0xF0F0F0F0F0F0F0F0;
        const quint64 difference = eightAt(text, at) ^ eightAt(kStoredForm, at);
        return ((difference | (difference + eightAt(kAddends, at))) & kUpperHalves) == 0;
    };
    for (size_t at = 0; at + 8 < text.size(); at += 8) {
        if (!fits(at))
            return false;
    }
    return fits(text.size() - 8);
}

bool IsStoredDate(std::string_view text)
{
    if (!HasStoredDateForm(text))
        return false;
    const auto number = [text](size_t at, size_t digits) {
        int value = 0;
        for (; digits > 0 && at < text.size(); ++at, --digits)
            value = value * 10 + (text[at] - '0');
        return value;
    };
    const DateParts day{.year = number(0, 4), .month = number(5, 2), .day = number(8, 2), .hour = 0};
    if (text.size() == kStoredDay)
        return Exists(day);
    const DateParts parts{day.year,      day.month,     day.day,      number(11, 2),
                          number(14, 2), number(17, 2), number(20, 3)};
    if (!Exists(parts))
        return false;
    if (text.size() == kStoredForm.size())
        return parts.millisecond != 0;
    return parts.hour != 0 || parts.minute != 0 || parts.second != 0;
}

std::optional<double> OleDateFromStored(std::string_view text)
{
    DigitReader reader(text);
    DateParts parts;
    if (!reader.Number(4, 4, parts.year) || !reader.Take('-') || !reader.Number(1, 2, parts.month) ||
        !reader.Take('-') || !reader.Number(1, 2, parts.day)) {
        return {};
    }
    int minutesEast = 0;
    if (!reader.AtEnd()) {
        if ((!reader.Take(' ') && !reader.Take('T')) || !ReadTime(reader, parts))
            return {};
        reader.Take(' ');
        if (!ReadZone(reader, minutesEast))
            return {};
    }
    if (!reader.AtEnd() || !Exists(parts))
        return {};
    const qint64 milliseconds =
        ((parts.hour * 60LL + parts.minute) * 60 + parts.second) * 1000 + parts.millisecond;
    const qint64 all =
        DayNumber(parts.year, parts.month, parts.day) * kMillisecondsPerDay + milliseconds - minutesEast * 60000LL;
    if (all < 0 || all >= (kLastDay + 1) * kMillisecondsPerDay)
        return {};
    return OleDays(all / kMillisecondsPerDay, all % kMillisecondsPerDay);
}

} // namespace mirel
