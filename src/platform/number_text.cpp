#include "platform/number_text.h"

#include <algorithm>
#include <charconv>

namespace mirel {

NumberBuffer::NumberBuffer(qint64 number)
{
    length_ = size_t(std::to_chars(characters_.begin(), characters_.end(), number).ptr - characters_.begin());
}

NumberBuffer::NumberBuffer(double number)
{
    constexpr int kDigits = 15;
    if (number == 0)
        number = 0; // the negative zero is a zero to people
    const auto end =
        std::to_chars(characters_.begin(), characters_.end(), number, std::chars_format::general, kDigits).ptr;
    std::replace(characters_.begin(), end, 'e', 'E');
    length_ = size_t(end - characters_.begin());
}

} // namespace mirel
