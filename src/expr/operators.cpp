#include "expr/operators.h"

#include "expr/date_arithmetic.h"
#include "expr/expr_number.h"
#include "expr/text_search.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <compare>
#include <functional>

namespace mirel {
namespace {

// Evaluates both operands; false, and the node null, unless both are there and have a value.
inline bool BothOperands(ExprNode& node, Evaluation& evaluation)
{
    for (const ExprTree* side : {&node.args[0], &node.args[1]}) {
        if (!*side) {
            SetNull(node);
            return false;
        }
        Evaluate(**side, evaluation);
        if ((*side)->null) {
            SetNull(node);
            return false;
        }
    }
    return true;
}

// A number computed from literals alone is not computed again.
inline void SetResult(ExprNode& node, const ExprNode& left, const ExprNode& right, double number)
{
    SetNumber(node, number);
    node.constant = left.constant && right.constant;
    if (node.constant)
        node.evaluate = nullptr;
}

// The operators that know numbers alone; a text operand gives null.
template <typename Operation>
void EvaluateNumbers(ExprNode& node, Evaluation& evaluation)
{
    if (!BothOperands(node, evaluation))
        return;
    const ExprNode& left = *node.args[0];
    const ExprNode& right = *node.args[1];
    if (left.isText || right.isText)
        SetNull(node);
    else
        SetResult(node, left, right, Operation{}(left.valueNumber, right.valueNumber));
}

struct QuotientOf {
    double operator()(double left, double right) const { return right == 0 ? NAN : left / right; }
};

struct PowerOf {
    double operator()(double left, double right) const { return std::pow(left, right); }
};

struct RemainderOf {
    double operator()(double left, double right) const
    {
        const qint64 divisor = ToInt32(right);
        return divisor == 0 ? 0 : double(ToInt32(left) % divisor);
    }
};

// The node's value as text behind what the buffer holds.
void AppendValue(TextBuffer& buffer, ExprNode& node)
{
    if (node.isText)
        buffer.Append(TextOf(node));
    else
        buffer.Append(NumberChars(node).Text());
}

void Concatenate(ExprNode& node, ExprNode& left, ExprNode& right, Evaluation& evaluation)
{
    qsizetype moved = 0;
    if (left.isText && TakeBuffer(node, left)) {
        moved = node.buffer.View().size();
    } else {
        node.buffer.Resize(0);
        AppendValue(node.buffer, left);
    }
    AppendValue(node.buffer, right);
    KeepBuffer(node);
    if (!evaluation.Afford(node.buffer.View().size() - moved))
        SetNull(node);
}

void EvaluateAdd(ExprNode& node, Evaluation& evaluation)
{
    if (!BothOperands(node, evaluation))
        return;
    ExprNode& left = *node.args[0];
    ExprNode& right = *node.args[1];
    if (!left.isText && !right.isText)
        SetResult(node, left, right, left.valueNumber + right.valueNumber);
    else if (left.fieldType == FieldType::Date && !right.isText)
        SetDate(node, PlusDays(left.valueNumber, right.valueNumber));
    else
        Concatenate(node, left, right, evaluation);
}

// A minus with one operand, which hangs on either side: the first operand after a leading minus fills arg1, a
// group or a function arg2.
void EvaluateNegation(ExprNode& node, Evaluation& evaluation)
{
    ExprNode* operand = node.args[0] ? node.args[0].get() : node.args[1].get();
    if (operand)
        Evaluate(*operand, evaluation);
    if (!operand || operand->null || operand->isText)
        SetNull(node);
    else
        SetNumber(node, -operand->valueNumber);
}

void EvaluateSubtract(ExprNode& node, Evaluation& evaluation)
{
    if (!node.args[0] || !node.args[1]) {
        EvaluateNegation(node, evaluation);
        return;
    }
    if (!BothOperands(node, evaluation))
        return;
    const ExprNode& left = *node.args[0];
    const ExprNode& right = *node.args[1];
    const bool leftIsDate = left.isText && left.fieldType == FieldType::Date;
    if (!left.isText && !right.isText)
        SetResult(node, left, right, left.valueNumber - right.valueNumber);
    else if (leftIsDate && right.isText && right.fieldType == FieldType::Date)
        SetNumber(node, std::trunc(DaysBetween(right.valueNumber, left.valueNumber)));
    else if (leftIsDate && !right.isText)
        SetDate(node, PlusDays(left.valueNumber, -right.valueNumber));
    else
        SetNull(node);
}

void SetCondition(ExprNode& node, bool holds)
{
    SetNumber(node, holds != node.negated ? 1 : 0);
}

// Whether a comparison of that code holds, from the order of its sides.
template <OpCode code>
bool HoldsFor(std::partial_ordering order)
{
    switch (code) {
    case OpCode::Equal:
        return order == 0;
    case OpCode::NotEqual:
        return order != 0;
    case OpCode::Less:
        return order < 0;
    case OpCode::LessOrEqual:
        return order <= 0;
    case OpCode::Greater:
        return order > 0;
    default:
        return order >= 0;
    }
}

// Text and number never compare: that fails whatever the operator.
template <OpCode code>
bool Compare(ExprNode& left, ExprNode& right)
{
    if (left.isText != right.isText)
        return false;
    if (!left.isText)
        return HoldsFor<code>(left.valueNumber <=> right.valueNumber);
    if constexpr (code == OpCode::Equal)
        return TextOf(left) == TextOf(right);
    return HoldsFor<code>(TextOf(left).compare(TextOf(right)) <=> 0);
}

template <OpCode code>
void EvaluateComparison(ExprNode& node, Evaluation& evaluation)
{
    ExprNode* left = node.args[0].get();
    const ExprNode* right = node.args[1].get();
    if (left && right && right->code == OpCode::Null) {
        Evaluate(*left, evaluation);
        SetCondition(node, left->null); // whatever the operator: «[x] <> NULL» tests for null too
        return;
    }
    if (BothOperands(node, evaluation))
        SetCondition(node, Compare<code>(*left, *node.args[1]));
}

// "%" counts at the ends of the pattern alone; without one there nothing fits.
bool Fits(QStringView text, QStringView pattern)
{
    const bool openStart = pattern.startsWith(u'%');
    if (openStart)
        pattern = pattern.sliced(1);
    const bool openEnd = pattern.endsWith(u'%');
    if (openEnd)
        pattern = pattern.chopped(1);
    if (openStart && openEnd)
        return pattern.isEmpty() || FindText(text, pattern, 0) >= 0;
    if (openEnd)
        return text.startsWith(pattern);
    return openStart && text.endsWith(pattern);
}

void EvaluateLike(ExprNode& node, Evaluation& evaluation)
{
    if (!BothOperands(node, evaluation))
        return;
    ExprNode& text = *node.args[0];
    ExprNode& pattern = *node.args[1];
    SetCondition(node, text.isText && pattern.isText && Fits(TextOf(text), TextOf(pattern)));
}

bool EvaluatesToTrue(ExprNode& node, Evaluation& evaluation)
{
    Evaluate(node, evaluation);
    return Holds(node);
}

// AND with `decisive` false, OR with true: the left side's answer that needs no right side.
template <bool decisive>
void EvaluateJunction(ExprNode& node, Evaluation& evaluation)
{
    if (!node.args[0] || !node.args[1]) {
        SetNull(node);
        return;
    }
    const bool left = EvaluatesToTrue(*node.args[0], evaluation);
    SetCondition(node, left == decisive ? left : EvaluatesToTrue(*node.args[1], evaluation));
}

// The value of the left side where the right side holds; elsewhere 0 with an empty text, and suppressed.
void EvaluateWhere(ExprNode& node, Evaluation& evaluation)
{
    ExprNode* value = node.args[0].get();
    ExprNode* condition = node.args[1].get();
    const bool holds = condition && EvaluatesToTrue(*condition, evaluation) != node.negated;
    node.suppressed = !holds;
    if (!value || !condition) {
        SetNull(node);
        return;
    }
    value->suppressed = !holds;
    if (!holds) {
        SetNumber(node, 0);
        return;
    }
    Evaluate(*value, evaluation);
    SetText(node, TextOf(*value));
    node.null = value->null;
    node.isText = value->isText;
    node.fieldType = value->fieldType;
    node.valueNumber = value->valueNumber;
    node.wholeNumber = value->wholeNumber;
}

constexpr auto kOperator = NodeKind::TwoArguments;
constexpr std::array kArithmeticOperators = {
    OperatorDef{u"+", kOperator, OpCode::Add, EvaluateAdd},
    OperatorDef{u"-", kOperator, OpCode::Subtract, EvaluateSubtract},
    OperatorDef{u"*", kOperator, OpCode::Multiply, EvaluateNumbers<std::multiplies<>>},
    OperatorDef{u"/", kOperator, OpCode::Divide, EvaluateNumbers<QuotientOf>},
    OperatorDef{u"^", kOperator, OpCode::Power, EvaluateNumbers<PowerOf>},
    OperatorDef{u"%", kOperator, OpCode::Remainder, EvaluateNumbers<RemainderOf>},
    OperatorDef{u"(", NodeKind::OpenParenthesis, OpCode::OpenParenthesis, nullptr},
    OperatorDef{u")", NodeKind::CloseParenthesis, OpCode::CloseParenthesis, nullptr},
};

constexpr auto kCondition = NodeKind::Condition;
constexpr std::array kConditionWords = {
    OperatorDef{u"WHERE", kCondition, OpCode::Where, EvaluateWhere},
    OperatorDef{u"AND", kCondition, OpCode::And, EvaluateJunction<false>},
    OperatorDef{u"OR", kCondition, OpCode::Or, EvaluateJunction<true>},
    OperatorDef{u"=", kCondition, OpCode::Equal, EvaluateComparison<OpCode::Equal>},
    OperatorDef{u"IS", kCondition, OpCode::Equal, EvaluateComparison<OpCode::Equal>},
    OperatorDef{u"!=", kCondition, OpCode::NotEqual, EvaluateComparison<OpCode::NotEqual>},
    OperatorDef{u"<>", kCondition, OpCode::NotEqual, EvaluateComparison<OpCode::NotEqual>},
    OperatorDef{u"LIKE", kCondition, OpCode::Like, EvaluateLike},
    OperatorDef{u">=", kCondition, OpCode::GreaterOrEqual, EvaluateComparison<OpCode::GreaterOrEqual>},
    OperatorDef{u"=>", kCondition, OpCode::GreaterOrEqual, EvaluateComparison<OpCode::GreaterOrEqual>},
    OperatorDef{u"<=", kCondition, OpCode::LessOrEqual, EvaluateComparison<OpCode::LessOrEqual>},
    OperatorDef{u"=<", kCondition, OpCode::LessOrEqual, EvaluateComparison<OpCode::LessOrEqual>},
    OperatorDef{u">", kCondition, OpCode::Greater, EvaluateComparison<OpCode::Greater>},
    OperatorDef{u"<", kCondition, OpCode::Less, EvaluateComparison<OpCode::Less>},
    OperatorDef{u"NOT", kCondition, OpCode::Not, nullptr},
    OperatorDef{u"NULL", NodeKind::Operand, OpCode::Null, nullptr},
};

const OperatorDef* FindIn(std::span<const OperatorDef> table, QStringView token)
{
    const auto row = std::ranges::find_if(table, [&](const OperatorDef& def) { return IsWord(token, def.text); });
    return row == table.end() ? nullptr : &*row;
}

} // namespace

std::span<const OperatorDef> ArithmeticOperators()
{
    return kArithmeticOperators;
}

std::span<const OperatorDef> ConditionWords()
{
    return kConditionWords;
}

const OperatorDef* FindArithmeticOperator(QStringView token)
{
    return FindIn(kArithmeticOperators, token);
}

const OperatorDef* FindConditionWord(QStringView token)
{
    return FindIn(kConditionWords, token);
}

bool IsWord(QStringView token, std::u16string_view word)
{
    const auto upper = [](char16_t c) { return c >= u'a' && c <= u'z' ? char16_t(c - u'a' + u'A') : c; };
    return std::ranges::equal(std::u16string_view(token.utf16(), size_t(token.size())), word, {}, upper);
}

QStringView TrimmedSpaces(QStringView text)
{
    while (text.startsWith(u' '))
        text = text.sliced(1);
    while (text.endsWith(u' '))
        text = text.chopped(1);
    return text;
}

} // namespace mirel
