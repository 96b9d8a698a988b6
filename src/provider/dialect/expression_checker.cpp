#include "provider/dialect/expression_checker.h"

#include "provider/dialect/literal.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel::dialect {
namespace {

const FunctionDef& DefinitionOf(Function function)
{
    return *std::ranges::find(Functions(), function, &FunctionDef::function);
}

bool IsTextLiteral(const Expr& expression)
{
    return expression.operation == Operation::Text;
}

FieldType SumType(FieldType left, FieldType right)
{
    return left == FieldType::Double || right == FieldType::Double || !IsInteger(left) || !IsInteger(right)
               ? FieldType::Double
               : FieldType::Integer;
}

// The first known type; whole and broken numbers together are broken ones.
template <typename Iterator>
FieldType CommonType(Iterator first, Iterator last)
{
    FieldType common = FieldType::None;
    for (; first != last; ++first) {
        if (common == FieldType::None || (IsInteger(common) && first->type == FieldType::Double))
            common = first->type;
    }
    return common;
}

FieldType ResultType(const FunctionDef& def, const Expr& call)
{
    const std::list<Expr>& arguments = call.arguments;
    switch (def.result) {
    case ResultKind::OfFirst:
        return CommonType(arguments.begin(), arguments.end());
    case ResultKind::OfLast:
        return CommonType(std::next(arguments.begin()), arguments.end());
    case ResultKind::LongText:
        return FieldType::Memo;
    case ResultKind::Whole:
        return FieldType::Integer;
    case ResultKind::Real:
        return FieldType::Double;
    case ResultKind::Moment:
        return FieldType::Date;
    case ResultKind::Total:
        return IsInteger(arguments.front().type) || arguments.front().type == FieldType::YesNo ? FieldType::Integer
                                                                                               : FieldType::Double;
    }
    return FieldType::None;
}

// Whether values of the two types can stand on the two sides of a comparison.
bool Comparable(FieldType left, FieldType right)
{
    if (IsBinary(left) || IsBinary(right))
        return false;
    const auto isDateWithNumber = [](FieldType a, FieldType b) {
        return a == FieldType::Date && (IsNumber(b) || b == FieldType::YesNo);
    };
    return !isDateWithNumber(left, right) && !isDateWithNumber(right, left);
}

} // namespace

bool ExpressionChecker::Check(Expr& expression, Aggregates aggregates)
{
    return CheckNode(expression, aggregates == Aggregates::Allowed);
}

bool ExpressionChecker::CheckCondition(Expr& expression, Aggregates aggregates)
{
    return Check(expression, aggregates) && CheckTruth(expression);
}

bool ExpressionChecker::CheckNode(Expr& expression, bool aggregatesAllowed)
{
    bool inside = aggregatesAllowed;
    if (expression.operation == Operation::Call && DefinitionOf(expression.function).isAggregate) {
        if (!aggregatesAllowed) {
            return Fail(Hr::SyntaxError,
                        StringText(Str::AggregateMisplaced, {QString::number(expression.place.begin + 1)}));
        }
        sawAggregate_ = true;
        inside = false;
    }
    for (Expr& argument : expression.arguments) {
        if (!CheckNode(argument, inside))
            return false;
    }
    return CheckOperation(expression);
}

bool ExpressionChecker::CheckOperation(Expr& expression)
{
    switch (expression.operation) {
    case Operation::Column:
        return CheckColumn(expression);
    case Operation::AllColumns:
        return true;
    case Operation::Or:
    case Operation::And:
    case Operation::Not:
    case Operation::IsTrue:
    case Operation::IsNotTrue:
    case Operation::IsFalse:
    case Operation::IsNotFalse:
        expression.type = FieldType::YesNo;
        return std::ranges::all_of(expression.arguments, [this](const Expr& part) { return CheckTruth(part); });
    case Operation::Equal:
    case Operation::NotEqual:
    case Operation::Less:
    case Operation::LessEqual:
    case Operation::Greater:
    case Operation::GreaterEqual:
    case Operation::In:
    case Operation::NotIn:
    case Operation::Between:
    case Operation::NotBetween:
        return CompareWithFirst(expression);
    case Operation::Like:
    case Operation::NotLike:
        return CheckLike(expression);
    case Operation::IsNull:
    case Operation::IsNotNull:
        expression.type = FieldType::YesNo;
        return true;
    case Operation::Join:
    case Operation::Concat:
        return CheckJoining(expression);
    case Operation::Add:
    case Operation::Subtract:
        return CheckSum(expression);
    case Operation::Multiply:
    case Operation::Divide:
    case Operation::Remainder:
    case Operation::Negate:
        return CheckArithmetic(expression);
    case Operation::Call:
        return CheckCall(expression);
    case Operation::Null:
    case Operation::True:
    case Operation::False:
    case Operation::Number:
    case Operation::Text:
    case Operation::Date:
        expression.type = TypeOfLiteral(expression);
        return true;
    }
    return false;
}

ExpressionChecker::Lookup ExpressionChecker::FindColumn(Expr& column) const
{
    // A table that was given an alias still answers to its own name where nothing else does: filters and sorts
    // name the table that a column comes from.
    for (const bool byTable : {false, true}) {
        for (size_t i = 0; i < sources_.size(); ++i) {
            const Source& source = sources_[i];
            if (!column.table.isEmpty() && !SameName(byTable ? source.table->name : source.name, column.table))
                continue;
            const Column* found = source.table->FindColumn(column.text);
            if (!found)
                continue;
            if (column.source >= 0)
                return Lookup::Ambiguous;
            column.source = int(i);
            column.column = int(found - source.table->columns.data());
            column.type = found->type;
        }
        if (column.source >= 0)
            return Lookup::Found;
    }
    return Lookup::Missing;
}

bool ExpressionChecker::CheckColumn(Expr& expression)
{
    if (expression.source >= 0) // put in by us and found before
        return true;
    switch (FindColumn(expression)) {
    case Lookup::Found: // however it was written, it is the same column from here on
        expression.table.clear();
        expression.text = sources_[size_t(expression.source)].table->columns[size_t(expression.column)].name;
        return true;
    case Lookup::Missing:
        return Fail(Hr::NoSuchColumn);
    case Lookup::Ambiguous:
        break;
    }
    return Fail(Hr::SyntaxError,
                StringText(Str::AmbiguousColumn, {QString::number(expression.place.begin + 1), expression.text}));
}

bool ExpressionChecker::CheckTruth(const Expr& operand)
{
    const bool fits =
        operand.type == FieldType::YesNo || operand.type == FieldType::None || IsNumber(operand.type);
    return fits || Fail(Hr::BadComparison);
}

bool ExpressionChecker::Compare(Expr& left, Expr& right)
{
    if (left.operation == Operation::Null || right.operation == Operation::Null)
        return true;
    const bool leftFixed = !IsLiteral(left.operation);
    if (!leftFixed && IsLiteral(right.operation)) // of two literals a text follows the other
        return Keep(IsTextLiteral(right) ? FitLiteral(right, left.type) : FitLiteral(left, right.type));
    if (!Keep(leftFixed ? FitLiteral(right, left.type) : FitLiteral(left, right.type)))
        return false;
    return Comparable(left.type, right.type) || Fail(Hr::BadComparison);
}

bool ExpressionChecker::CompareWithFirst(Expr& expression)
{
    expression.type = FieldType::YesNo;
    Expr& first = expression.arguments.front();
    for (auto other = std::next(expression.arguments.begin()); other != expression.arguments.end(); ++other) {
        if (!Compare(first, *other))
            return false;
    }
    return true;
}

bool ExpressionChecker::CheckLike(Expr& expression)
{
    expression.type = FieldType::YesNo;
    for (Expr& part : expression.arguments) {
        if (IsBinary(part.type))
            return Fail(Hr::BadComparison);
    }
    Expr& pattern = expression.arguments.back();
    return pattern.operation != Operation::Number || Keep(FitLiteral(pattern, FieldType::Memo));
}

bool ExpressionChecker::CheckJoining(Expr& expression)
{
    expression.type = FieldType::Memo;
    const bool binary = std::ranges::any_of(expression.arguments, &IsBinary, &Expr::type);
    return !binary || Fail(Hr::BadComparison);
}

// "+" joins texts, moves dates by days and adds numbers; "-" has no meaning for texts.
bool ExpressionChecker::CheckSum(Expr& expression)
{
    Expr& left = expression.arguments.front();
    Expr& right = expression.arguments.back();
    const bool adds = expression.operation == Operation::Add;
    if (adds && IsText(left.type) && IsText(right.type)) {
        expression.operation = Operation::Concat;
        expression.type = FieldType::Memo;
        return true;
    }
    const bool dateLeft = left.type == FieldType::Date;
    const bool dateRight = right.type == FieldType::Date;
    if (!dateLeft && !dateRight)
        return CheckArithmetic(expression);
    if (dateLeft && dateRight && !adds) {
        expression.type = FieldType::Double;
        return true;
    }
    Expr& days = dateLeft ? right : left;
    if ((dateLeft && dateRight) || (dateRight && !adds) || !CheckArgument(days, ArgumentKind::Number))
        return Fail(Hr::BadComparison);
    expression.type = FieldType::Date;
    return true;
}

bool ExpressionChecker::CheckArithmetic(Expr& expression)
{
    for (Expr& operand : expression.arguments) {
        if (!CheckArgument(operand, ArgumentKind::Number))
            return false;
    }
    if (expression.operation == Operation::Divide)
        expression.type = FieldType::Double;
    else if (expression.operation == Operation::Remainder)
        expression.type = FieldType::Integer;
    else
        expression.type = SumType(expression.arguments.front().type, expression.arguments.back().type);
    return true;
}

bool ExpressionChecker::CheckArgument(Expr& argument, ArgumentKind kind)
{
    if (kind == ArgumentKind::Any)
        return true;
    if (IsBinary(argument.type))
        return Fail(Hr::BadComparison);
    switch (kind) {
    case ArgumentKind::Number:
        if (IsTextLiteral(argument))
            return Keep(FitLiteral(argument, FieldType::Double));
        return argument.type != FieldType::Date || Fail(Hr::BadComparison);
    case ArgumentKind::Date:
        if (IsLiteral(argument.operation))
            return Keep(FitLiteral(argument, FieldType::Date));
        return Comparable(FieldType::Date, argument.type) || Fail(Hr::BadComparison);
    case ArgumentKind::Condition:
        return CheckTruth(argument);
    case ArgumentKind::Text:
    case ArgumentKind::Any:
        break;
    }
    return true;
}

bool ExpressionChecker::CheckCall(Expr& expression)
{
    const FunctionDef& def = DefinitionOf(expression.function);
    ArgumentKind kind = def.first;
    for (Expr& argument : expression.arguments) {
        if (!CheckArgument(argument, kind))
            return false;
        kind = def.rest;
    }
    const bool adds = def.function == Function::Sum || def.function == Function::Average;
    const bool ranks = def.function == Function::Minimum || def.function == Function::Maximum;
    if ((adds && IsText(expression.arguments.front().type)) ||
        (ranks && IsBinary(expression.arguments.front().type)))
        return Fail(Hr::BadComparison);
    if (def.function == Function::Coalesce && expression.arguments.front().type == FieldType::Date &&
        !CompareWithFirst(expression)) { // its literals are dates too
        return false;
    }
    expression.type = ResultType(def, expression);
    if (def.function == Function::Absolute && !IsInteger(expression.type))
        expression.type = FieldType::Double;
    return true;
}

bool ExpressionChecker::Keep(Hr hr)
{
    return !Failed(hr) || Fail(hr);
}

bool ExpressionChecker::Fail(Hr code, QString context)
{
    failure_ = {code, std::move(context)};
    return false;
}

} // namespace mirel::dialect
