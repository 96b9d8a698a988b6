#include "expr/decimal_rounding.h"

#include <QtGlobal>

#include <array>
#include <charconv>
#include <cmath>

namespace mirel {
namespace {

constexpr int kDecimals = 6;

// The number as "%f" writes it.
class FixedText {
public:
    explicit FixedText(double number)
    {
        end_ =
            std::to_chars(characters_.begin(), characters_.end(), number, std::chars_format::fixed, kDecimals).ptr;
    }

    char* Point() { return end_ - kDecimals - 1; }
    int WholeDigits() { return int(Point() - characters_.begin()) - (characters_[0] == '-' ? 1 : 0); }
    double Upto(const char* end) const
    {
        double number = 0;
        std::from_chars(characters_.begin(), end, number);
        return number;
    }

private:
    std::array<char, 330> characters_; // the largest double has 309 digits before the point
    char* end_;
};

} // namespace

double RoundDecimal(double number, int digits, Rounding rounding)
{
    if (digits >= kDecimals || !std::isfinite(number))
        return number;
    FixedText text(number);
    if (digits < 0 && -qint64(digits) > text.WholeDigits())
        return number;
    char* firstCut = digits >= 0 ? text.Point() + 1 + digits : text.Point() + digits;
    const bool up = rounding == Rounding::Up && *firstCut >= '5';
    const char* end = digits >= 0 ? firstCut : text.Point();
    for (char* cut = firstCut; cut < end; ++cut)
        *cut = '0';
    const double kept = text.Upto(end);
    return up ? kept + std::pow(10.0, -digits) : kept;
}

} // namespace mirel
