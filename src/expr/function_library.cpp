#include "expr/function_library.h"

#include "expr/date_arithmetic.h"
#include "expr/decimal_rounding.h"
#include "expr/expr_number.h"
#include "expr/operators.h"
#include "expr/text_search.h"
#include "platform/ole_date.h"
#include "platform/user_locale.h"
#include "resources/string_table.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace mirel {
namespace {

// Arguments count from 0. Those that a function requires are there and not null when it is called.

ExprNode* Argument(ExprNode& node, int index)
{
    return node.args[size_t(node.kind == NodeKind::OneArgument ? 1 : index)].get();
}

QStringView TextArgument(ExprNode& node, int index)
{
    return TextOf(*Argument(node, index));
}

double NumberArgument(ExprNode& node, int index)
{
    return Argument(node, index)->valueNumber;
}

qint32 IntegerArgument(ExprNode& node, int index, qint32 otherwise = 0)
{
    const ExprNode* argument = Argument(node, index);
    return argument ? ToInt32(argument->valueNumber) : otherwise;
}

std::optional<double> DateArgument(ExprNode& node, int index)
{
    ExprNode& argument = *Argument(node, index);
    if (argument.isText && argument.fieldType == FieldType::Date)
        return argument.valueNumber;
    return UserLocale::Current().ParseDateTime(TextOf(argument));
}

void SetParts(ExprNode& node, int DateParts::*part)
{
    const std::optional<double> date = DateArgument(node, 0);
    const std::optional<DateParts> parts = date ? PartsOfOleDate(*date) : std::nullopt;
    if (parts)
        SetNumber(node, *parts.*part);
    else
        SetNull(node);
}

// ---- Text

// The units of `from` written to `to` through `convert`, which gets code points. A letter whose other form has
// another length stays as it is. Both may be the same.
template <typename Convert>
void ConvertUnits(QStringView from, char16_t* to, Convert& convert)
{
    for (qsizetype i = 0; i < from.size(); ++i) {
        const char16_t unit = from[i].unicode();
        if (unit < 0x80) {
            to[i] = char16_t(convert(unit));
            continue;
        }
        const bool pair = QChar::isHighSurrogate(unit) && i + 1 < from.size() && from[i + 1].isLowSurrogate();
        const char32_t before = pair ? QChar::surrogateToUcs4(unit, from[i + 1].unicode()) : unit;
        const char32_t after = convert(before);
        const char32_t kept = QChar::requiresSurrogates(after) == pair ? after : before;
        to[i] = pair ? QChar::highSurrogate(kept) : char16_t(kept);
        if (pair)
            to[++i] = QChar::lowSurrogate(kept);
    }
}

template <typename Convert>
void ConvertText(ExprNode& node, Evaluation& evaluation, Convert convert)
{
    const QStringView text = TextArgument(node, 0);
    if (!TakeBuffer(node, *Argument(node, 0)) && !evaluation.Afford(text.size())) {
        SetNull(node);
        return;
    }
    ConvertUnits(text, node.buffer.Resize(text.size()), convert);
    KeepBuffer(node);
}

char32_t UpperOf(char32_t c)
{
    if (c < 0x80)
        return c >= 'a' && c <= 'z' ? c - 0x20 : c;
    return QChar::toUpper(c);
}

char32_t LowerOf(char32_t c)
{
    if (c < 0x80)
        return c >= 'A' && c <= 'Z' ? c + 0x20 : c;
    return QChar::toLower(c);
}

void FnUpper(ExprNode& node, Evaluation& evaluation)
{
    ConvertText(node, evaluation, [](char32_t c) { return UpperOf(c); });
}

void FnLower(ExprNode& node, Evaluation& evaluation)
{
    ConvertText(node, evaluation, [](char32_t c) { return LowerOf(c); });
}

void FnInitCap(ExprNode& node, Evaluation& evaluation)
{
    ConvertText(node, evaluation, [atStart = true](char32_t c) mutable {
        const char32_t converted = atStart ? UpperOf(c) : c;
        atStart = c == ' ' || c == '\t';
        return converted;
    });
}

void FnRTrim(ExprNode& node, Evaluation&)
{
    QStringView text = TextArgument(node, 0);
    while (text.endsWith(u' '))
        text = text.chopped(1);
    SetText(node, text);
}

void FnLTrim(ExprNode& node, Evaluation&)
{
    QStringView text = TextArgument(node, 0);
    while (text.startsWith(u' '))
        text = text.sliced(1);
    SetText(node, text);
}

void FnLength(ExprNode& node, Evaluation&)
{
    SetNumber(node, double(TextArgument(node, 0).size()));
}

void FnLeft(ExprNode& node, Evaluation&)
{
    const QStringView text = TextArgument(node, 0);
    SetText(node, text.first(std::clamp<qsizetype>(IntegerArgument(node, 1), 0, text.size())));
}

void FnRight(ExprNode& node, Evaluation&)
{
    const QStringView text = TextArgument(node, 0);
    SetText(node, text.last(std::clamp<qsizetype>(IntegerArgument(node, 1), 0, text.size())));
}

void FnSubstr(ExprNode& node, Evaluation&)
{
    const QStringView text = TextArgument(node, 0);
    const qsizetype start = IntegerArgument(node, 1);
    const qsizetype first = start < 0 ? text.size() + start : std::max<qsizetype>(start - 1, 0);
    if (first < 0 || first >= text.size()) {
        SetText(node, {});
        return;
    }
    const QStringView rest = text.sliced(first);
    const bool counted = Argument(node, 2) != nullptr;
    const qsizetype count = counted ? IntegerArgument(node, 2) : rest.size();
    SetText(node, rest.first(std::clamp<qsizetype>(count, 0, rest.size())));
}

void FnInstr(ExprNode& node, Evaluation&)
{
    SetNumber(node, double(PositionOfMatch(TextArgument(node, 0), TextArgument(node, 1),
                                           IntegerArgument(node, 2, 1), IntegerArgument(node, 3, 1))));
}

void FnReplace(ExprNode& node, Evaluation& evaluation)
{
    QStringView rest = TextArgument(node, 0);
    const QStringView from = TextArgument(node, 1);
    const QStringView to = TextArgument(node, 2);
    qsizetype at = from.isEmpty() ? -1 : FindText(rest, from, 0);
    if (at < 0) {
        SetText(node, rest);
        return;
    }
    node.buffer.Resize(0);
    for (; at >= 0; at = FindText(rest, from, 0)) {
        if (!evaluation.Afford(at + to.size())) {
            SetNull(node);
            return;
        }
        node.buffer.Append(rest.first(at));
        node.buffer.Append(to);
        rest = rest.sliced(at + from.size());
    }
    node.buffer.Append(rest);
    KeepBuffer(node);
}

void FnToChar(ExprNode& node, Evaluation&)
{
    ExprNode& argument = *Argument(node, 0);
    if (argument.isText || argument.null) {
        SetText(node, TextOf(argument));
        return;
    }
    node.buffer.Resize(0);
    node.buffer.Append(NumberChars(argument).Text());
    KeepBuffer(node);
}

void FnToNumber(ExprNode& node, Evaluation&)
{
    SetNumber(node, LeadingDecimal(TextArgument(node, 0)));
}

// ---- Dates and times

double WholeSeconds(const QDateTime& now)
{
    return OleDate(QDateTime(now.date(), QTime(now.time().hour(), now.time().minute(), now.time().second())))
        .value_or(0);
}

void FnSysTime(ExprNode& node, Evaluation& evaluation)
{
    const double now = WholeSeconds(evaluation.context.Now());
    node.buffer.Assign(UserLocale::Current().TimeText(now));
    KeepBuffer(node);
}

void FnSysDate(ExprNode& node, Evaluation& evaluation)
{
    SetDate(node, OleDate(QDateTime(evaluation.context.Now().date(), QTime(0, 0))));
}

void FnSysDateTime(ExprNode& node, Evaluation& evaluation)
{
    SetDate(node, WholeSeconds(evaluation.context.Now()));
}

void FnToDate(ExprNode& node, Evaluation&)
{
    SetDate(node, DateArgument(node, 0));
}

void FnDay(ExprNode& node, Evaluation&)
{
    SetParts(node, &DateParts::day);
}

void FnMonth(ExprNode& node, Evaluation&)
{
    SetParts(node, &DateParts::month);
}

void FnYear(ExprNode& node, Evaluation&)
{
    SetParts(node, &DateParts::year);
}

// The number of the last day, not the day itself; of the current month where the text is no date.
void FnLastDay(ExprNode& node, Evaluation& evaluation)
{
    const std::optional<double> date = Argument(node, 0) ? DateArgument(node, 0) : std::nullopt;
    const std::optional<DateParts> parts = PartsOfOleDate(date ? *date : WholeSeconds(evaluation.context.Now()));
    if (parts)
        SetNumber(node, DaysInMonth(parts->year, parts->month));
    else
        SetNull(node);
}

void FnAddMonth(ExprNode& node, Evaluation&)
{
    const std::optional<double> date = DateArgument(node, 0);
    SetDate(node, date ? AddMonths(*date, IntegerArgument(node, 1)) : std::nullopt);
}

void FnDiffTime(ExprNode& node, Evaluation&)
{
    constexpr double kSecondsPerDay = 86400;
    constexpr double kAgainstRounding = 0.000005787037037037037;
    const std::optional<double> to = DateArgument(node, 0);
    const std::optional<double> from = DateArgument(node, 1);
    if (to && from)
        SetNumber(node, std::trunc(DaysBetween(*from, *to) * kSecondsPerDay + kAgainstRounding));
    else
        SetNull(node);
}

void FnToTimeStr(ExprNode& node, Evaluation&)
{
    const qint64 seconds = IntegerArgument(node, 0);
    const qint64 size = std::abs(seconds);
    node.buffer.Assign(QString::asprintf("%s%02lld:%02lld:%02lld", seconds < 0 ? "-" : "", size / 3600,
                                         size / 60 % 60, size % 60));
    KeepBuffer(node);
}

// ---- Numbers

template <double (*function)(double)>
void FnMath(ExprNode& node, Evaluation&)
{
    SetNumber(node, function(NumberArgument(node, 0)));
}

void FnAbs(ExprNode& node, Evaluation&)
{
    SetNumber(node, std::abs(double(IntegerArgument(node, 0))));
}

void FnLog(ExprNode& node, Evaluation&)
{
    SetNumber(node, std::log(NumberArgument(node, 1)) / std::log(NumberArgument(node, 0)));
}

void FnPower(ExprNode& node, Evaluation&)
{
    SetNumber(node, std::pow(NumberArgument(node, 0), NumberArgument(node, 1)));
}

template <Rounding rounding>
void FnRound(ExprNode& node, Evaluation&)
{
    SetNumber(node, RoundDecimal(NumberArgument(node, 0), IntegerArgument(node, 1), rounding));
}

// ---- The result

void FnRecNo(ExprNode& node, Evaluation& evaluation)
{
    const qint64 position = evaluation.context.Position();
    if (position < 0)
        SetNull(node);
    else
        SetNumber(node, double(position + 1));
}

void FnRecCount(ExprNode& node, Evaluation& evaluation)
{
    const qint64 count = evaluation.context.RecordCount();
    if (count < 0)
        SetNull(node);
    else
        SetNumber(node, double(count));
}

// The whole library. The names of the types are short for the table's sake.
constexpr auto kOne = NodeKind::OneArgument;
constexpr auto kTwo = NodeKind::TwoArguments;
constexpr auto kThree = NodeKind::ThreeArguments;
constexpr auto kFour = NodeKind::FourArguments;
constexpr auto kNumber = ResultKind::Number;
constexpr auto kText = ResultKind::Text;
constexpr auto kDate = ResultKind::Date;

// clang-format off
constexpr std::array kFunctions = {
    FunctionDef{u"SUM", kOne, 109, nullptr, "a", kNumber, Str::FunctionHelpSum},
    FunctionDef{u"AVG", kOne, 110, nullptr, "a", kNumber, Str::FunctionHelpAvg},
    FunctionDef{u"MAX", kOne, 111, nullptr, "a", kNumber, Str::FunctionHelpMax},
    FunctionDef{u"MIN", kOne, 112, nullptr, "a", kNumber, Str::FunctionHelpMin},
    FunctionDef{u"SYSTIME", kOne, 118, FnSysTime, "", kText, Str::FunctionHelpSystime},
    FunctionDef{u"SYSDATE", kOne, 128, FnSysDate, "", kDate, Str::FunctionHelpSysdate},
    FunctionDef{u"SYSDATETIME", kOne, 139, FnSysDateTime, "", kDate, Str::FunctionHelpSysdatetime},
    FunctionDef{u"UPPER", kOne, 119, FnUpper, "t", kText, Str::FunctionHelpUpper},
    FunctionDef{u"LOWER", kOne, 137, FnLower, "t", kText, Str::FunctionHelpLower},
    FunctionDef{u"RTRIM", kOne, 122, FnRTrim, "t", kText, Str::FunctionHelpRtrim},
    FunctionDef{u"LTRIM", kOne, 123, FnLTrim, "t", kText, Str::FunctionHelpLtrim},
    FunctionDef{u"TO_CHAR", kOne, 116, FnToChar, "a", kText, Str::FunctionHelpToChar},
    FunctionDef{u"TO_NUMBER", kOne, 135, FnToNumber, "t", kNumber, Str::FunctionHelpToNumber},
    FunctionDef{u"YEAR", kOne, 131, FnYear, "d", kNumber, Str::FunctionHelpYear},
    FunctionDef{u"MONTH", kOne, 130, FnMonth, "d", kNumber, Str::FunctionHelpMonth},
    FunctionDef{u"DAY", kOne, 129, FnDay, "d", kNumber, Str::FunctionHelpDay},
    FunctionDef{u"RECNO", kOne, 134, FnRecNo, "", kNumber, Str::FunctionHelpRecno},
    FunctionDef{u"RECCOUNT", kOne, 133, FnRecCount, "", kNumber, Str::FunctionHelpReccount},
    FunctionDef{u"COUNT", kOne, 140, FnRecCount, "", kNumber, Str::FunctionHelpCount},
    FunctionDef{u"SEEKTOTAL", kOne, 114, FnRecCount, "", kNumber, Str::FunctionHelpSeektotal},
    FunctionDef{u"SIN", kOne, 141, FnMath<std::sin>, "n", kNumber, Str::FunctionHelpSin},
    FunctionDef{u"COS", kOne, 142, FnMath<std::cos>, "n", kNumber, Str::FunctionHelpCos},
    FunctionDef{u"TAN", kOne, 143, FnMath<std::tan>, "n", kNumber, Str::FunctionHelpTan},
    FunctionDef{u"ASIN", kOne, 165, FnMath<std::asin>, "n", kNumber, Str::FunctionHelpAsin},
    FunctionDef{u"ACOS", kOne, 164, FnMath<std::acos>, "n", kNumber, Str::FunctionHelpAcos},
    FunctionDef{u"ATAN", kOne, 166, FnMath<std::atan>, "n", kNumber, Str::FunctionHelpAtan},
    FunctionDef{u"SINH", kOne, 144, FnMath<std::sinh>, "n", kNumber, Str::FunctionHelpSinh},
    FunctionDef{u"COSH", kOne, 145, FnMath<std::cosh>, "n", kNumber, Str::FunctionHelpCosh},
    FunctionDef{u"TANH", kOne, 146, FnMath<std::tanh>, "n", kNumber, Str::FunctionHelpTanh},
    FunctionDef{u"EXP", kOne, 147, FnMath<std::exp>, "n", kNumber, Str::FunctionHelpExp},
    FunctionDef{u"SQRT", kOne, 149, FnMath<std::sqrt>, "n", kNumber, Str::FunctionHelpSqrt},
    FunctionDef{u"FLOOR", kOne, 151, FnMath<std::floor>, "n", kNumber, Str::FunctionHelpFloor},
    FunctionDef{u"CEIL", kOne, 152, FnMath<std::ceil>, "n", kNumber, Str::FunctionHelpCeil},
    FunctionDef{u"TO_NUMBER", kOne, 153, FnToNumber, "t", kNumber, Str::FunctionHelpToNumber},
    FunctionDef{u"TO_TIMESTR", kOne, 169, FnToTimeStr, "i", kText, Str::FunctionHelpToTimestr},
    FunctionDef{u"LN", kOne, 156, FnMath<std::log>, "n", kNumber, Str::FunctionHelpLn},
    FunctionDef{u"INITCAP", kOne, 157, FnInitCap, "t", kText, Str::FunctionHelpInitcap},
    FunctionDef{u"LENGTH", kOne, 158, FnLength, "t", kNumber, Str::FunctionHelpLength},
    FunctionDef{u"LAST_DAY", kOne, 161, FnLastDay, "|d", kNumber, Str::FunctionHelpLastDay},
    FunctionDef{u"TO_DATE", kOne, 162, FnToDate, "d", kDate, Str::FunctionHelpToDate},
    FunctionDef{u"ABS", kOne, 163, FnAbs, "i", kNumber, Str::FunctionHelpAbs},
    FunctionDef{u"LEFT", kTwo, 124, FnLeft, "ti", kText, Str::FunctionHelpLeft},
    FunctionDef{u"RIGHT", kTwo, 138, FnRight, "ti", kText, Str::FunctionHelpRight},
    FunctionDef{u"LOG", kTwo, 148, FnLog, "nn", kNumber, Str::FunctionHelpLog},
    FunctionDef{u"POWER", kTwo, 150, FnPower, "nn", kNumber, Str::FunctionHelpPower},
    FunctionDef{u"ROUND", kTwo, 154, FnRound<Rounding::Up>, "n|i", kNumber, Str::FunctionHelpRound},
    FunctionDef{u"TRUNC", kTwo, 155, FnRound<Rounding::Truncate>, "n|i", kNumber, Str::FunctionHelpTrunc},
    FunctionDef{u"ADD_MONTH", kTwo, 160, FnAddMonth, "di", kDate, Str::FunctionHelpAddMonth},
    FunctionDef{u"DIFF_TIME", kTwo, 168, FnDiffTime, "dd", kNumber, Str::FunctionHelpDiffTime},
    FunctionDef{u"SUBSTR", kThree, 117, FnSubstr, "ti|i", kText, Str::FunctionHelpSubstr},
    FunctionDef{u"REPLACE", kThree, 167, FnReplace, "ttt", kText, Str::FunctionHelpReplace},
    FunctionDef{u"INSTR", kFour, 159, FnInstr, "tt|ii", kNumber, Str::FunctionHelpInstr},
};
// clang-format on

constexpr bool CodesAreDistinct()
{
    for (auto row = kFunctions.begin(); row != kFunctions.end(); ++row) {
        if (std::any_of(row + 1, kFunctions.end(),
                        [&](const FunctionDef& other) { return other.code == row->code; }))
            return false;
    }
    return true;
}
static_assert(CodesAreDistinct());

} // namespace

std::span<const FunctionDef> Functions()
{
    return kFunctions;
}

const FunctionDef* FindFunction(QStringView name)
{
    const auto row =
        std::ranges::find_if(kFunctions, [&](const FunctionDef& def) { return IsWord(name, def.name); });
    return row == kFunctions.end() ? nullptr : &*row;
}

void EvaluateFunction(ExprNode& node, Evaluation& evaluation)
{
    const FunctionDef& function = *node.function;
    for (int i = 0; i < function.allowed; ++i) {
        ExprNode* argument = Argument(node, i);
        if (argument)
            Evaluate(*argument, evaluation);
        const bool missing = !argument && i < function.required;
        const bool isNull = argument && argument->null && function.Parameter(i) != 'a';
        if (missing || isNull) {
            SetNull(node);
            return;
        }
    }
    function.evaluate(node, evaluation);
}

bool AsksForRecordCount(const ExprNode& tree)
{
    const bool asks = tree.function && tree.function->evaluate == FnRecCount;
    return asks || std::ranges::any_of(tree.args, [](const ExprTree& argument) {
               return argument && AsksForRecordCount(*argument);
           });
}

} // namespace mirel
