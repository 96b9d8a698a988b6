#pragma once

namespace mirel {

enum class Rounding { Up, Truncate };

// Rounds the number, written with six decimals, to `digits` places; negative digits count to the left of the
// point. Up adds a whole unit of the last place whenever the first digit cut off is 5 or more, for negative
// numbers too: -2.5 rounded to 0 digits is -1. A number with too few digits to cut stays unchanged.
double RoundDecimal(double number, int digits, Rounding rounding);

} // namespace mirel
