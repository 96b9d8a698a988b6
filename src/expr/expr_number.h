#pragma once

#include <QString>
#include <QStringView>

namespace mirel {

// A number as expressions write it: a whole number in decimal, any other with six decimals less the zeros at
// its end. The point stays: 1.0000001 is "1.".
void AppendExprNumber(QString& out, double number);
QString ExprNumberText(double number);

// The decimal number that a text begins with, after white space; 0 when there is none. Infinite when it is too
// large.
double LeadingDecimal(QStringView text);

// Toward zero; what does not fit is the nearest number that does, and no number is 0.
qint32 ToInt32(double number);

} // namespace mirel
