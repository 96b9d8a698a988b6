#include "provider/sqlite/order_keys.h"

#include "platform/ole_date.h"

#include <QtEndian>

#include <bit>
#include <cmath>

namespace mirel::sqlite {
namespace {

constexpr char kNumberMark = 1; // before all texts
constexpr quint64 kSign = quint64(1) << 63;
constexpr double kBeyondInteger = 9223372036854775808.0; // 2^63

// The bits of a number so that they compare, as an unsigned number, like it. Both zeros are the same.
quint64 OrderedBits(double number)
{
    const auto bits = std::bit_cast<quint64>(number == 0 ? 0.0 : number);
    return (bits & kSign) != 0 ? ~bits : bits | kSign;
}

// The greatest number of 53 bits that is not above it: a whole number of 64 bits may lie between two of them.
double RoundedDown(qint64 number)
{
    const auto nearest = double(number);
    const bool isAbove = nearest >= kBeyondInteger || qint64(nearest) > number;
    return isAbove ? std::nextafter(nearest, -HUGE_VAL) : nearest;
}

std::string_view TextOf(sqlite3_stmt* row, int column)
{
    const auto* text = reinterpret_cast<const char*>(sqlite3_column_text(row, column));
    return {text ? text : "", size_t(sqlite3_column_bytes(row, column))};
}

} // namespace

std::string_view OrderKeys::NumberKey(double rounded, quint16 rest)
{
    number_[0] = kNumberMark;
    qToBigEndian(OrderedBits(rounded), &number_[1]);
    qToBigEndian(rest, &number_[1 + sizeof(quint64)]);
    return {number_.data(), number_.size()};
}

std::optional<std::string_view> OrderKeys::BytesOf(sqlite3_stmt* row, int column)
{
    if (isText_)
        return TextOf(row, column);
    const int type = sqlite3_column_type(row, column);
    if (type == SQLITE_INTEGER) {
        const qint64 number = sqlite3_column_int64(row, column);
        const double rounded = RoundedDown(number);
        return NumberKey(rounded, quint16(number - qint64(rounded)));
    }
    if (type == SQLITE_FLOAT)
        return NumberKey(sqlite3_column_double(row, column), 0);
    // Digits and marks, which every collation orders by their bytes; all of them are behind kNumberMark.
    if (type == SQLITE_TEXT && HasStoredDateForm(TextOf(row, column)))
        return TextOf(row, column);
    return {};
}

std::string_view OrderKeys::KeyOf(std::string_view text)
{
    const std::span<const uint8_t> key = texts_.KeyOf(text);
    return {reinterpret_cast<const char*>(key.data()), key.size()};
}

} // namespace mirel::sqlite
