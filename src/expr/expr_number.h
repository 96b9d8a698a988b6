#pragma once

#include <QString>
#include <QStringView>

#include <array>

namespace mirel {

// A number as expressions write it: a whole number in decimal, any other with six decimals less the zeros at
// its end. The point stays: 1.0000001 is "1.".
class ExprNumberChars {
public:
    explicit ExprNumberChars(double number);

    QLatin1StringView Text() const { return {characters_.data(), length_}; }

private:
    std::array<char, 320> characters_; // the largest double has 309 digits before the point
    qsizetype length_;
};
QString ExprNumberText(double number);

// The decimal number that a text begins with, after white space; 0 when there is none. Infinite when it is too
// large.
double LeadingDecimal(QStringView text);

// Toward zero; what does not fit is the nearest number that does, and no number is 0.
qint32 ToInt32(double number);

} // namespace mirel
