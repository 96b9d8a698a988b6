#include "csvimport/type_guess.h"

#include "csvimport/cell_reader.h"

#include <algorithm>
#include <array>
#include <charconv>

namespace mirel {
namespace {

bool IsDigit(char byte)
{
    return byte >= '0' && byte <= '9';
}

std::string_view Trimmed(std::string_view text)
{
    constexpr std::string_view kBlanks = " \t";
    const size_t first = text.find_first_not_of(kBlanks);
    return first == std::string_view::npos ? std::string_view()
                                           : text.substr(first, text.find_last_not_of(kBlanks) - first + 1);
}

// Cuts a run of digits off the front.
std::string_view CutDigits(std::string_view& text)
{
    size_t count = 0;
    while (count < text.size() && IsDigit(text[count]))
        ++count;
    const std::string_view digits = text.substr(0, count);
    text.remove_prefix(count);
    return digits;
}

enum class NumberShape { None, Integer, Decimal };

// A number that comes back as it was written, but for zeros at its end.
NumberShape ShapeOf(std::string_view text)
{
    constexpr size_t kDigitsOfDouble = 15;
    const bool negative = text.starts_with('-');
    if (negative)
        text.remove_prefix(1);
    const std::string_view whole = CutDigits(text);
    if (whole.empty() || (whole.size() > 1 && whole[0] == '0') || whole.size() > kDigitsOfDouble)
        return NumberShape::None;
    if (text.empty())
        return negative && whole == "0" ? NumberShape::None : NumberShape::Integer;
    if (text[0] != '.')
        return NumberShape::None; // "12E4" is a code as likely as a number
    text.remove_prefix(1);
    const std::string_view fraction = CutDigits(text);
    if (fraction.empty() || whole.size() + fraction.size() > kDigitsOfDouble + (whole == "0" ? 1 : 0))
        return NumberShape::None;
    if (text.starts_with('e') || text.starts_with('E')) {
        text.remove_prefix(1);
        if (text.starts_with('-') || text.starts_with('+'))
            text.remove_prefix(1);
        const std::string_view exponent = CutDigits(text);
        if (exponent.empty() || exponent.size() > 2)
            return NumberShape::None;
    }
    return text.empty() ? NumberShape::Decimal : NumberShape::None;
}

bool FitsInteger(std::string_view digits)
{
    qint32 number = 0;
    return std::from_chars(digits.data(), digits.data() + digits.size(), number).ec == std::errc();
}

// Nothing but digits and the format's own characters: reading alone would take "1-2-3 High Street".
bool IsWrittenAsDate(const DateFormat& format, std::string_view text)
{
    const auto belongs = [&format](char byte) {
        return IsDigit(byte) || char16_t(byte) == format.dateSeparator ||
               char16_t(byte) == format.timeSeparator || byte == ' ';
    };
    return format.order == DateOrder::Locale || std::ranges::all_of(text, belongs);
}

// Room for longer texts than the file has, in steps that people would choose.
int SizeFor(qsizetype longest)
{
    for (const int size : {50, 100}) {
        if (longest * 2 <= size)
            return size;
    }
    return kMaxTextSize;
}

} // namespace

void TypeGuess::Add(std::string_view text)
{
    if (text.empty())
        return;
    empty_ = false;
    if (text.size() > size_t(longest_))
        longest_ = std::max(longest_, Utf16Length(text));
    mayBeYesNo_ = mayBeYesNo_ && (text == "0" || text == "1");
    if (mayBeDouble_ || mayBeComma_)
        NarrowNumbers(Trimmed(text));
    if (mayBeDate_ || mayBeIsoDate_)
        NarrowDate(text);
}

void TypeGuess::NarrowNumbers(std::string_view text)
{
    const NumberShape shape = ShapeOf(text);
    if (mayBeComma_ && shape != NumberShape::Integer) // digits alone are a number either way
        NarrowComma(text);
    mayBeDouble_ = mayBeDouble_ && shape != NumberShape::None;
    mayBeInteger_ = mayBeInteger_ && shape == NumberShape::Integer && FitsInteger(text);
}

void TypeGuess::NarrowComma(std::string_view text)
{
    constexpr size_t kGroup = 3;
    std::array<char, kMaxCommaNumber> plain{};
    size_t length = 0;
    size_t end = 0;
    mayBeComma_ = !text.starts_with('+') && ReadCommaNumber(text, plain, length, end) && end == text.size() &&
                  ShapeOf({plain.data(), length}) != NumberShape::None;
    if (!mayBeComma_)
        return;
    const size_t comma = text.find(',');
    if (comma == std::string_view::npos)
        return;
    const size_t whole = comma - size_t(text.starts_with('-'));
    isSurelyComma_ = isSurelyComma_ || text.size() - comma - 1 != kGroup || whole > kGroup ||
                     (whole == 1 && text[comma - 1] == '0') || text.find('.') < comma;
}

void TypeGuess::NarrowDate(std::string_view text)
{
    mayBeIsoDate_ = mayBeIsoDate_ && IsIsoDate(text);
    // While all of them are ISO dates, the locale has nothing to add.
    if (mayBeDate_ && !(dates_.order == DateOrder::Locale && mayBeIsoDate_))
        mayBeDate_ = IsWrittenAsDate(dates_, text) && ParseDateFields(dates_, text).has_value();
}

ImportColumn TypeGuess::Column() const
{
    ImportColumn column;
    if (empty_)
        return column;
    const bool isDouble = decimal_ == u',' ? mayBeComma_ : mayBeDouble_;
    column.type = mayBeYesNo_                   ? FieldType::YesNo
                  : mayBeInteger_               ? FieldType::Integer
                  : isDouble                    ? FieldType::Double
                  : mayBeDate_ || mayBeIsoDate_ ? FieldType::Date
                  : longest_ > kMaxTextSize     ? FieldType::Memo
                                                : FieldType::Text;
    if (column.type == FieldType::Text)
        column.size = SizeFor(longest_);
    if (column.type == FieldType::Date && !mayBeDate_)
        column.dates = DateFormat{.order = DateOrder::Locale}; // which takes ISO dates
    return column;
}

} // namespace mirel
