#include "csvimport/date_guess.h"

#include "platform/ole_date.h"
#include "platform/user_locale.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

enum Part { Day, Month, Year };

// By their numbers.
constexpr std::array<std::array<Part, 3>, 6> kOrders = {{{Month, Day, Year},
                                                         {Month, Year, Day},
                                                         {Year, Day, Month},
                                                         {Year, Month, Day},
                                                         {Day, Month, Year},
                                                         {Day, Year, Month}}};

struct Digits {
    int number = 0;
    size_t count = 0;
};

// Cuts a run of at most four digits off the front.
Digits CutDigits(std::string_view& text)
{
    constexpr size_t kMost = 4;
    Digits digits;
    while (digits.count < std::min(kMost, text.size()) && text[digits.count] >= '0' && text[digits.count] <= '9') {
        digits.number = digits.number * 10 + (text[digits.count] - '0');
        ++digits.count;
    }
    text.remove_prefix(digits.count);
    return digits;
}

// Cuts one of the characters off the front: 0 where none of them stands there, or another than `known`.
char CutOneOf(std::string_view characters, char known, std::string_view& text)
{
    if (text.empty() || characters.find(text[0]) == std::string_view::npos || (known != 0 && text[0] != known))
        return 0;
    const char cut = text[0];
    text.remove_prefix(1);
    return cut;
}

bool IsDate(const std::array<Digits, 3>& fields, const std::array<Part, 3>& order)
{
    DateParts parts;
    for (size_t i = 0; i < fields.size(); ++i) {
        const Digits& field = fields[i];
        if (order[i] == Year) {
            if (field.count != 2 && field.count != 4)
                return false;
            constexpr int kAnyCentury = 2000; // whose years of two digits have the same leap days
            parts.year = field.count == 2 ? kAnyCentury + field.number : field.number;
            if (field.count == 4 && field.number < 100)
                return false; // would be read as a short one
        } else if (field.count > 2) {
            return false;
        }
        if (order[i] == Month)
            parts.month = field.number;
        if (order[i] == Day)
            parts.day = field.number;
    }
    return OleDate(parts).has_value();
}

} // namespace

void DateGuess::Add(std::string_view text)
{
    if (text.empty() || orders_ == 0)
        return;
    any_ = true;
    std::string_view rest = text;
    const bool isDate = TakeDate(rest);
    const bool read = isDate ? rest.empty() || (rest[0] == ' ' && TakeTime(rest.substr(1))) : TakeTime(text);
    if (!read)
        orders_ = 0;
    hasDates_ = hasDates_ || isDate;
}

bool DateGuess::TakeDate(std::string_view& text)
{
    constexpr std::string_view kSeparators = "-/.";
    std::string_view rest = text;
    std::array<Digits, 3> fields;
    char separator = dateSeparator_;
    for (size_t i = 0; i < fields.size(); ++i) {
        if (i > 0 && (separator = CutOneOf(kSeparators, separator, rest)) == 0)
            return false;
        fields[i] = CutDigits(rest);
        if (fields[i].count == 0)
            return false;
    }
    unsigned fitting = 0;
    for (size_t order = 0; order < kOrders.size(); ++order)
        fitting |= IsDate(fields, kOrders[order]) ? 1U << order : 0;
    orders_ &= fitting;
    dateSeparator_ = separator;
    text = rest;
    return orders_ != 0;
}

bool DateGuess::TakeTime(std::string_view text)
{
    constexpr std::string_view kSeparators = ":.";
    constexpr std::array kLimits = {24, 60, 60};
    char separator = timeSeparator_;
    for (size_t i = 0; i < kLimits.size(); ++i) {
        if (i > 0 && (separator = CutOneOf(kSeparators, separator, text)) == 0)
            return false;
        const Digits part = CutDigits(text);
        if (part.count == 0 || part.count > 2 || part.number >= kLimits[i])
            return false;
    }
    timeSeparator_ = separator;
    return text.empty();
}

DateFormat DateGuess::Format(DateOrder order) const
{
    DateFormat format{.order = order};
    if (dateSeparator_ != 0)
        format.dateSeparator = char16_t(dateSeparator_);
    if (timeSeparator_ != 0)
        format.timeSeparator = char16_t(timeSeparator_);
    return format;
}

DateFormat DateGuess::Best(DateOrder wanted) const
{
    if (wanted != DateOrder::Locale && MayBe(wanted))
        return Format(wanted);
    constexpr std::array kByUse = {DateOrder::YearMonthDay, DateOrder::DayMonthYear, DateOrder::MonthDayYear,
                                   DateOrder::YearDayMonth, DateOrder::MonthYearDay, DateOrder::DayYearMonth};
    const auto best = std::ranges::find_if(kByUse, [this](DateOrder order) { return MayBe(order); });
    return best == kByUse.end() ? DateFormat() : Format(*best);
}

DateOrder DateOrderOfLocale()
{
    const QString& format = UserLocale::Current().DateFormat();
    const std::array at = {format.indexOf(u'd'), format.indexOf(u'M'), format.indexOf(u'y')};
    const auto follows = [&at](const std::array<Part, 3>& order) {
        return at[order[0]] < at[order[1]] && at[order[1]] < at[order[2]];
    };
    return DateOrder(std::ranges::find_if(kOrders, follows) - kOrders.begin());
}

} // namespace mirel
