#include "forms/assignment.h"

#include "data/catalog.h"
#include "expr/evaluator.h"
#include "expr/expr_parser.h"
#include "platform/user_locale.h"
#include "provider/conversion.h"

#include <cmath>
#include <optional>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// What people type into a Yes/No field: the two words of the settings, and the usual ones.
std::optional<bool> TypedTruth(QStringView text, EvalContext& context)
{
    const auto is = [&](QStringView word) { return text.compare(word, Qt::CaseInsensitive) == 0; };
    if (is(context.YesNoWord(true)) || is(u"true") || is(u"1"))
        return true;
    if (is(context.YesNoWord(false)) || is(u"false") || is(u"0") || text.isEmpty())
        return false;
    return std::nullopt;
}

// The language's rule for what an expression comes to: the first character decides.
bool IsTrueText(QStringView text)
{
    return !text.isEmpty() && (text[0] == u'1' || text[0] == u'T' || text[0] == u't');
}

// What the expression comes to, before it is made to fit the field.
struct Result {
    QString text;
    const ExprNode* node = nullptr; // null: the text alone, as a control shows it

    bool IsNumber() const { return node && !node->null && !node->isText; }
    bool IsDate() const { return node && !node->null && node->isText && node->fieldType == FieldType::Date; }
    bool IsYesNoField() const { return node && !node->null && node->fieldType == FieldType::YesNo; }
};

Result Evaluated(FieldAssignment& assignment, EvalContext& context, const TextOfControl& controlText)
{
    if (!assignment.controlName.isEmpty())
        return {controlText(assignment.controlName), nullptr};
    if (!assignment.tree)
        return {};
    EvaluateExpression(context, *assignment.tree);
    return {ShownText(*assignment.tree), assignment.tree.get()};
}

// None: what was typed is neither true nor false.
std::optional<bool> TruthOf(const Result& result, EvalContext& context)
{
    if (result.IsYesNoField())
        return result.node->valueNumber != 0;
    const QString text = result.text.trimmed();
    const std::optional<bool> typed = TypedTruth(text, context);
    return typed || !result.node ? typed : IsTrueText(text);
}

// A computed number loses its fraction in an integer field; a typed one is refused with it.
QString WholeNumberText(const Result& result, const QString& text)
{
    const double number = result.node->valueNumber;
    return std::trunc(number) == number ? text : NumberText(std::trunc(number));
}

Value Unconverted(const Result& result, FieldType type, EvalContext& context)
{
    if (type == FieldType::YesNo) {
        const std::optional<bool> truth = TruthOf(result, context);
        return truth ? Value::Bool(*truth) : Value::Text(result.text);
    }
    if (IsText(type))
        return result.text.isEmpty() ? Value::Null() : Value::Text(result.text);
    const QString text = result.text.trimmed();
    if (text.isEmpty())
        return Value::Null();
    if (type == FieldType::Double && result.IsNumber())
        return Value::Double(result.node->valueNumber);
    if (type == FieldType::Date && result.IsDate())
        return Value::Date(result.node->valueNumber);
    if (IsInteger(type) && result.IsNumber())
        return Value::Text(WholeNumberText(result, text));
    return Value::Text(text);
}

// Whether the text may stand bare among the values of an INSERT: it can then say nothing but a number.
bool IsBareNumber(const QString& text)
{
    Value number;
    return !text.isEmpty() && !Failed(ConvertForColumn(Value::Text(text), FieldType::Double, -1, number));
}

} // namespace

FieldAssignment ParseAssignment(const SourceAssignment& source)
{
    FieldAssignment assignment;
    assignment.target = SplitTarget(source.target);
    assignment.tree = ParseExpression(source.value, ExprMode::Condition);
    if (assignment.tree && assignment.tree->code == OpCode::Control)
        assignment.controlName = assignment.tree->text;
    return assignment;
}

void CollectControlNames(const ExprNode& tree, QStringList& names)
{
    if (tree.code == OpCode::Control)
        names += tree.text;
    for (const ExprTree& argument : tree.args) {
        if (argument)
            CollectControlNames(*argument, names);
    }
}

Hr ValueToStore(FieldAssignment& assignment, EvalContext& context, const TextOfControl& controlText, Value& value)
{
    const Result result = Evaluated(assignment, context, controlText);
    return ConvertForColumn(Unconverted(result, assignment.type, context), assignment.type, assignment.size,
                            value);
}

QString LiteralToInsert(FieldAssignment& assignment, EvalContext& context, const TextOfControl& controlText)
{
    if (IsBinary(assignment.type) || assignment.type == FieldType::None)
        return {};
    const Result result = Evaluated(assignment, context, controlText);
    if (IsText(assignment.type))
        return QuoteText(result.text);
    const QString text = result.text.trimmed();
    if (text.isEmpty())
        return u"NULL"_s;
    if (assignment.type == FieldType::Date)
        return QuoteText(text);
    if (assignment.type == FieldType::YesNo) {
        const std::optional<bool> truth = TruthOf(result, context);
        return !truth ? QuoteText(text) : *truth ? u"1"_s : u"0"_s;
    }
    if (IsInteger(assignment.type) && result.IsNumber())
        return WholeNumberText(result, text);
    if (assignment.type == FieldType::Double && result.IsNumber())
        return NumberText(result.node->valueNumber);
    return IsBareNumber(text) ? text : QuoteText(text); // quoted, for the store to read or to refuse
}

} // namespace mirel
