#pragma once

#include <QString>
#include <QStringView>

#include <array>

namespace mirel {

// A number as expressions write it: a whole number in decimal, any other with six decimals, without trailing
// zeros. The point stays: 1.0000001 is "1.".
class ExprNumberChars {
public:
    explicit ExprNumberChars(double number);
    explicit ExprNumberChars(qint64 number);

    QLatin1StringView Text() const { return {characters_.data(), length_}; }

private:
    void Write(qint64 number);

    std::array<char, 320> characters_; // the largest double has 309 digits before the point
    qsizetype length_;
};

// The decimal number at the start of a text, after white space; 0 when there is none. Infinite when it is too
// large.
double LeadingDecimal(QStringView text);

// Rounds toward zero. Out of range gives the nearest limit, NaN gives 0.
qint32 ToInt32(double number);

} // namespace mirel
