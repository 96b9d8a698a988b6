#include "csvimport/cell_reader.h"

#include <algorithm>
#include <charconv>

namespace mirel {
namespace {

bool IsDigit(char byte)
{
    return byte >= '0' && byte <= '9';
}

bool IsBlank(char byte)
{
    return byte == ' ' || byte == '\t';
}

// Where a number may begin: behind blanks and a plus sign, which std::from_chars does not take.
const char* NumberStart(std::string_view text)
{
    const char* at = text.data();
    const char* const end = at + text.size();
    while (at != end && IsBlank(*at))
        ++at;
    if (end - at > 1 && *at == '+' && at[1] != '-')
        ++at;
    return at;
}

int UnitsOf(char leadByte)
{
    const auto byte = static_cast<unsigned char>(leadByte);
    if (byte >= 0xF0)
        return 2; // beyond the basic plane: a surrogate pair
    return byte < 0x80 || byte >= 0xC0 ? 1 : 0;
}

// The longest beginning of at most that many units, never half a character.
std::string_view FirstUnits(std::string_view utf8, int units)
{
    for (size_t at = 0; at < utf8.size(); ++at) {
        units -= UnitsOf(utf8[at]);
        if (units < 0)
            return utf8.substr(0, at);
    }
    return utf8;
}

} // namespace

bool ReadCommaNumber(std::string_view text, std::array<char, kMaxCommaNumber>& digits, size_t& length,
                     size_t& numberEnd)
{
    constexpr size_t kGroup = 3;
    length = 0;
    size_t at = size_t(NumberStart(text) - text.data());
    const auto put = [&](char byte) {
        if (length == digits.size())
            return false;
        digits[length++] = byte;
        return true;
    };
    const auto putDigits = [&](size_t most) {
        const size_t from = at;
        while (at < text.size() && at - from < most && IsDigit(text[at]) && put(text[at]))
            ++at;
        return at - from;
    };
    if (at < text.size() && text[at] == '-' && put(text[at]))
        ++at;
    const size_t first = putDigits(digits.size());
    // A point is a group's only where three digits follow it, and no fourth.
    const auto isGroup = [&] {
        const std::string_view rest = text.substr(std::min(at, text.size()));
        return rest.size() > kGroup && rest[0] == '.' &&
               std::all_of(rest.begin() + 1, rest.begin() + 1 + kGroup, IsDigit) &&
               (rest.size() == kGroup + 1 || !IsDigit(rest[kGroup + 1]));
    };
    while (first > 0 && first <= kGroup && isGroup()) {
        ++at;
        putDigits(kGroup);
    }
    if (at < text.size() && text[at] == ',' && put('.')) {
        ++at;
        if (putDigits(digits.size()) == 0 && first == 0)
            return false;
    } else if (first == 0) {
        return false;
    }
    numberEnd = at;
    return at == text.size() || !IsDigit(text[at]);
}

qsizetype Utf16Length(std::string_view utf8)
{
    qsizetype units = 0;
    for (const char byte : utf8)
        units += UnitsOf(byte);
    return units;
}

bool IsIsoDate(std::string_view text)
{
    constexpr std::string_view kDate = "dddd-dd-dd";
    constexpr std::string_view kTime = "dd:dd:dd";
    constexpr size_t kShortTime = 5;
    const auto matches = [](std::string_view part, std::string_view pattern) {
        return std::ranges::equal(
            part, pattern, [](char byte, char wanted) { return wanted == 'd' ? IsDigit(byte) : byte == wanted; });
    };
    if (IsStoredDate(text))
        return true; // most are
    if (!matches(text.substr(0, kDate.size()), kDate))
        return false;
    if (text.size() > kDate.size()) {
        const char between = text[kDate.size()];
        const std::string_view time = text.substr(kDate.size() + 1);
        const std::string_view fraction = time.substr(std::min(kTime.size(), time.size()));
        const std::string_view whole = time.substr(0, time.size() - fraction.size());
        const bool fractionIsOne = fraction.empty() || (fraction.size() > 1 && fraction[0] == '.' &&
                                                        std::ranges::all_of(fraction.substr(1), IsDigit));
        if ((between != ' ' && between != 'T') || !fractionIsOne ||
            !(matches(whole, kTime) || matches(whole, kTime.substr(0, kShortTime))))
            return false;
    }
    return OleDateFromStored(text).has_value();
}

Hr CellReader::Read(std::string_view text, Cell& cell)
{
    if (text.empty()) {
        cell = Cell();
        return Hr::Ok;
    }
    switch (type_) {
    case FieldType::SmallInt:
    case FieldType::Integer:
        return ReadInteger(text, cell);
    case FieldType::Double:
        return ReadDouble(text, cell);
    case FieldType::Date:
        return ReadDate(text, cell);
    case FieldType::YesNo: {
        qint64 number = 0;
        const auto read = std::from_chars(NumberStart(text), text.data() + text.size(), number);
        cell = Cell::Of(qint64(number != 0 || read.ec == std::errc::result_out_of_range));
        return Hr::Ok;
    }
    case FieldType::None:
    case FieldType::Text:
    case FieldType::Memo:
    case FieldType::VarBinary:
    case FieldType::LongBinary:
        break;
    }
    // A text of fewer bytes is short enough without counting.
    if (longTexts_ == LongTexts::Cut && text.size() > size_t(kMaxTextUnits)) {
        const std::string_view shortened = FirstUnits(text, kMaxTextUnits);
        cutTexts_ += shortened.size() < text.size();
        text = shortened;
    }
    cell = Cell::OfText(text);
    return Hr::Ok;
}

void CellReader::CountRest(const char* numberEnd, std::string_view text)
{
    const char* const end = text.data() + text.size();
    while (numberEnd != end && IsBlank(*numberEnd))
        ++numberEnd;
    cutNumbers_ += numberEnd != end;
}

Hr CellReader::ReadInteger(std::string_view text, Cell& cell)
{
    qint64 number = 0;
    const auto read = std::from_chars(NumberStart(text), text.data() + text.size(), number);
    if (read.ec != std::errc())
        return read.ec == std::errc::result_out_of_range ? Hr::Overflow : Hr::BadLiteral;
    CountRest(read.ptr, text);
    cell = Cell::Of(number);
    return Hr::Ok;
}

Hr CellReader::ReadDouble(std::string_view text, Cell& cell)
{
    const char* const end = text.data() + text.size();
    const char* const start = NumberStart(text);
    const char* const digits = start != end && *start == '-' ? start + 1 : start;
    // std::from_chars reads the words "inf" and "nan" as numbers, but no file means them.
    if (digits == end || !(IsDigit(*digits) || char16_t(*digits) == decimal_))
        return Hr::BadLiteral;
    double number = 0;
    if (decimal_ == u',') {
        std::array<char, kMaxCommaNumber> plain{};
        size_t length = 0;
        size_t numberEnd = 0;
        if (!ReadCommaNumber(text, plain, length, numberEnd) ||
            std::from_chars(plain.data(), plain.data() + length, number).ec != std::errc())
            return Hr::BadLiteral;
        CountRest(text.data() + numberEnd, text);
        cell = Cell::Of(number);
        return Hr::Ok;
    }
    const auto read = std::from_chars(start, end, number);
    if (read.ec != std::errc())
        return read.ec == std::errc::result_out_of_range ? Hr::Overflow : Hr::BadLiteral;
    CountRest(read.ptr, text);
    cell = Cell::Of(number);
    return Hr::Ok;
}

// Whether the format reads a text in the stored form as the day that it says. A year below 100 is a short one
// to the orders 0 to 5.
bool CellReader::ReadsStoredForm(std::string_view text) const
{
    if (dates_.order == DateOrder::Locale)
        return true;
    return dates_ == DateFormat{DateOrder::YearMonthDay, u'-', u':'} && !text.starts_with("00");
}

Hr CellReader::ReadDate(std::string_view text, Cell& cell)
{
    if (IsStoredDate(text) && ReadsStoredForm(text)) {
        cell = Cell::OfText(text);
        return Hr::Ok;
    }
    // Every locale takes ISO; most files have it, and the locale's own reader is slow.
    std::optional<double> date = dates_.order == DateOrder::Locale && IsIsoDate(text)
                                     ? OleDateFromStored(text)
                                     : ParseDateFields(dates_, text);
    if (!date)
        date = ParseTimeFields(dates_, text); // an export writes no date for a time on the base date
    const std::optional<StoredDate> stored = date ? StoredDateOf(*date) : std::nullopt;
    if (!stored)
        return Hr::BadLiteral;
    date_ = *stored;
    cell = Cell::OfText(date_.Text());
    return Hr::Ok;
}

} // namespace mirel
