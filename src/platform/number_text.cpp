#include "platform/number_text.h"

#include <algorithm>
#include <charconv>
#include <cmath>

namespace mirel {
namespace {

// A number that a person or another program wrote with up to two or six decimals is found to be that decimal by
// one division, which rounds as reading the text would: for most of a file's numbers the digits need not be
// searched for. Null for any other number.
char* WriteShortDecimal(double number, char* to)
{
    constexpr double kSmallestPlain = 1e-4; // below it the form has an exponent
    constexpr double kFifteenDigits = 1e15;
    const double size = std::abs(number);
    if (!(size >= kSmallestPlain && size < kFifteenDigits))
        return nullptr;
    for (const auto& [scale, decimals] : {std::pair(1e2, 2), std::pair(1e6, 6)}) {
        const double scaled = std::nearbyint(size * scale);
        if (scaled >= kFifteenDigits || scaled / scale != size)
            continue;
        const auto whole = qint64(scaled) / qint64(scale);
        auto rest = qint64(scaled) % qint64(scale);
        if (number < 0)
            *to++ = '-';
        constexpr size_t kMostDigits = 16;
        to = std::to_chars(to, to + kMostDigits, whole).ptr;
        if (rest == 0)
            return to;
        *to++ = '.';
        char* const end = to + decimals;
        for (char* digit = end; digit != to; rest /= 10)
            *--digit = char('0' + rest % 10);
        to = end;
        while (to[-1] == '0')
            --to;
        return to;
    }
    return nullptr;
}

} // namespace

NumberBuffer::NumberBuffer(qint64 number)
{
    length_ = size_t(std::to_chars(characters_.begin(), characters_.end(), number).ptr - characters_.begin());
}

NumberBuffer::NumberBuffer(double number)
{
    if (const char* end = WriteShortDecimal(number, characters_.data())) {
        length_ = size_t(end - characters_.data());
        return;
    }
    constexpr int kDigits = 15;
    if (number == 0)
        number = 0; // the negative zero is a zero to people
    const auto end =
        std::to_chars(characters_.begin(), characters_.end(), number, std::chars_format::general, kDigits).ptr;
    std::replace(characters_.begin(), end, 'e', 'E');
    length_ = size_t(end - characters_.begin());
}

} // namespace mirel
