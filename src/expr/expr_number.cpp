#include "expr/expr_number.h"

#include <QVarLengthArray>

#include <charconv>
#include <cmath>
#include <cstdlib>
#include <limits>

#include <locale.h>

namespace mirel {
namespace {

bool IsDigit(QChar c)
{
    return c >= u'0' && c <= u'9';
}

// Collects the characters of a decimal number off the front of a text.
class DecimalCollector {
public:
    explicit DecimalCollector(QStringView text)
        : rest_(text)
    {
    }

    // Sign, digits with at most one point, exponent; false when there is no digit.
    bool Collect()
    {
        while (!rest_.isEmpty() && rest_.front().isSpace())
            rest_ = rest_.sliced(1);
        if (!Take(u'-') && rest_.startsWith(u'+'))
            rest_ = rest_.sliced(1);
        qsizetype digits = Digits();
        if (Take(u'.'))
            digits += Digits();
        if (digits > 0)
            Exponent();
        return digits > 0;
    }

    const char* Begin() const { return characters_.constData(); }
    const char* End() const { return characters_.constData() + characters_.size(); }
    const char* Terminated()
    {
        characters_.append('\0');
        return Begin();
    }

private:
    bool Take(QChar wanted)
    {
        if (!rest_.startsWith(wanted))
            return false;
        characters_.append(wanted.toLatin1());
        rest_ = rest_.sliced(1);
        return true;
    }
    qsizetype Digits()
    {
        const qsizetype before = characters_.size();
        while (!rest_.isEmpty() && IsDigit(rest_.front()))
            Take(rest_.front());
        return characters_.size() - before;
    }
    // An "e" that no number follows is not part of the number.
    void Exponent()
    {
        const qsizetype before = characters_.size();
        if (!Take(u'e') && !Take(u'E'))
            return;
        if (!Take(u'-') && rest_.startsWith(u'+'))
            rest_ = rest_.sliced(1);
        if (Digits() == 0)
            characters_.resize(before);
    }

    QStringView rest_;
    QVarLengthArray<char, 64> characters_;
};

} // namespace

ExprNumberChars::ExprNumberChars(qint64 number)
{
    Write(number);
}

void ExprNumberChars::Write(qint64 number)
{
    length_ = std::to_chars(characters_.begin(), characters_.end(), number).ptr - characters_.data();
}

ExprNumberChars::ExprNumberChars(double number)
{
    constexpr double kBeyondIntegers = 9.2e18;
    const bool whole = number == std::trunc(number);
    if (whole && std::abs(number) < kBeyondIntegers) { // most are, and integers are quick to write
        Write(qint64(number));
        return;
    }
    const auto written = std::to_chars(characters_.begin(), characters_.end(), number + 0.0,
                                       std::chars_format::fixed, whole ? 0 : 6);
    const char* end = written.ptr;
    while (!whole && end[-1] == '0')
        --end;
    length_ = end - characters_.data();
}

double LeadingDecimal(QStringView text)
{
    DecimalCollector decimal(text);
    if (!decimal.Collect())
        return 0;
    double number = 0;
    if (std::from_chars(decimal.Begin(), decimal.End(), number).ec == std::errc())
        return number;
    // Out of range; from_chars does not say on which side.
    static const locale_t kPointAsPoint = newlocale(LC_NUMERIC_MASK, "C", nullptr);
    return strtod_l(decimal.Terminated(), nullptr, kPointAsPoint);
}

qint32 ToInt32(double number)
{
    using Limits = std::numeric_limits<qint32>;
    if (std::isnan(number))
        return 0;
    if (number <= Limits::min())
        return Limits::min();
    return number >= Limits::max() ? Limits::max() : qint32(number);
}

} // namespace mirel
