#include "provider/dialect/functions.h"

#include <algorithm>
#include <array>

namespace mirel::dialect {
namespace {

using enum ArgumentKind;

constexpr int kMany = 100;

// Several rows of one function are its other names; the first is the one that is written.
constexpr std::array kFunctions = {
    FunctionDef{u"COUNT", Function::Count, true, 1, 1, Any, Any, ResultKind::Whole},
    FunctionDef{u"SUM", Function::Sum, true, 1, 1, Number, Any, ResultKind::Total},
    FunctionDef{u"AVG", Function::Average, true, 1, 1, Number, Any, ResultKind::Real},
    FunctionDef{u"MIN", Function::Minimum, true, 1, 1, Any, Any, ResultKind::OfFirst},
    FunctionDef{u"MAX", Function::Maximum, true, 1, 1, Any, Any, ResultKind::OfFirst},

    FunctionDef{u"UPPER", Function::Upper, false, 1, 1, Text, Any, ResultKind::LongText},
    FunctionDef{u"UCASE", Function::Upper, false, 1, 1, Text, Any, ResultKind::LongText},
    FunctionDef{u"LOWER", Function::Lower, false, 1, 1, Text, Any, ResultKind::LongText},
    FunctionDef{u"LCASE", Function::Lower, false, 1, 1, Text, Any, ResultKind::LongText},
    FunctionDef{u"LENGTH", Function::Length, false, 1, 1, Text, Any, ResultKind::Whole},
    FunctionDef{u"LEN", Function::Length, false, 1, 1, Text, Any, ResultKind::Whole},
    FunctionDef{u"SUBSTR", Function::Substring, false, 2, 3, Text, Number, ResultKind::LongText},
    FunctionDef{u"SUBSTRING", Function::Substring, false, 2, 3, Text, Number, ResultKind::LongText},
    FunctionDef{u"MID", Function::Substring, false, 2, 3, Text, Number, ResultKind::LongText},
    FunctionDef{u"LEFT", Function::Left, false, 2, 2, Text, Number, ResultKind::LongText},
    FunctionDef{u"RIGHT", Function::Right, false, 2, 2, Text, Number, ResultKind::LongText},
    FunctionDef{u"TRIM", Function::Trim, false, 1, 1, Text, Any, ResultKind::LongText},
    FunctionDef{u"LTRIM", Function::TrimLeft, false, 1, 1, Text, Any, ResultKind::LongText},
    FunctionDef{u"RTRIM", Function::TrimRight, false, 1, 1, Text, Any, ResultKind::LongText},
    FunctionDef{u"REPLACE", Function::Replace, false, 3, 3, Text, Text, ResultKind::LongText},
    FunctionDef{u"INSTR", Function::Find, false, 2, 2, Text, Text, ResultKind::Whole},

    FunctionDef{u"ROUND", Function::Round, false, 1, 2, Number, Number, ResultKind::Real},
    FunctionDef{u"ABS", Function::Absolute, false, 1, 1, Number, Any, ResultKind::OfFirst},
    FunctionDef{u"INT", Function::Whole, false, 1, 1, Number, Any, ResultKind::Whole},

    FunctionDef{u"COALESCE", Function::Coalesce, false, 2, kMany, Any, Any, ResultKind::OfFirst},
    FunctionDef{u"NZ", Function::Coalesce, false, 2, 2, Any, Any, ResultKind::OfFirst},
    FunctionDef{u"IFNULL", Function::Coalesce, false, 2, 2, Any, Any, ResultKind::OfFirst},
    FunctionDef{u"IIF", Function::Choose, false, 3, 3, Condition, Any, ResultKind::OfLast},

    FunctionDef{u"YEAR", Function::Year, false, 1, 1, Date, Any, ResultKind::Whole},
    FunctionDef{u"MONTH", Function::Month, false, 1, 1, Date, Any, ResultKind::Whole},
    FunctionDef{u"DAY", Function::Day, false, 1, 1, Date, Any, ResultKind::Whole},
    FunctionDef{u"HOUR", Function::Hour, false, 1, 1, Date, Any, ResultKind::Whole},
    FunctionDef{u"MINUTE", Function::Minute, false, 1, 1, Date, Any, ResultKind::Whole},
    FunctionDef{u"SECOND", Function::Second, false, 1, 1, Date, Any, ResultKind::Whole},
    FunctionDef{u"NOW", Function::Now, false, 0, 0, Any, Any, ResultKind::Moment},
    FunctionDef{u"SYSDATETIME", Function::Now, false, 0, 0, Any, Any, ResultKind::Moment},
    FunctionDef{u"DATE", Function::Today, false, 0, 0, Any, Any, ResultKind::Moment},
    FunctionDef{u"SYSDATE", Function::Today, false, 0, 0, Any, Any, ResultKind::Moment},
};

} // namespace

std::span<const FunctionDef> Functions()
{
    return kFunctions;
}

const FunctionDef* FindFunction(QStringView name)
{
    const auto row = std::ranges::find_if(kFunctions, [name](const FunctionDef& def) {
        return def.name.size() == name.size() && def.name.compare(name, Qt::CaseInsensitive) == 0;
    });
    return row == kFunctions.end() ? nullptr : &*row;
}

} // namespace mirel::dialect
