#include "expr/explain.h"

#include "expr/expr_parser.h"
#include "expr/function_library.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel {
namespace {

// What can be known of a value before it is computed.
enum class Kind { Number, Text, Date, YesNo, Unknown };

bool IsTextual(Kind kind)
{
    return kind == Kind::Text || kind == Kind::Date || kind == Kind::YesNo;
}

bool IsComparison(const ExprNode& node)
{
    return node.kind == NodeKind::Condition && node.code != OpCode::And && node.code != OpCode::Or &&
           node.code != OpCode::Where;
}

// A minus in front of what it negates.
bool IsLeadingMinus(const ExprNode& node)
{
    return node.code == OpCode::Subtract && (!node.args[0] || node.args[0]->position > node.position);
}

// A leading minus that a higher operator followed, which left that operator without an operand.
bool MinusBrokeOperator(const ExprNode& node)
{
    const ExprNode* right = node.args[1].get();
    return IsArithmetic(node) && IsLeadingMinus(node) && right && IsArithmetic(*right) && !right->parenthesised;
}

class Explainer {
public:
    explicit Explainer(EvalContext& context)
        : context_(context)
    {
    }

    std::vector<ExprSlip> Explain(QStringView text, ExprMode mode)
    {
        std::vector<ParseLoss> losses;
        const ExprTree tree = ParseExpression(text, mode, &losses);
        for (const ParseLoss& loss : losses)
            AddLoss(loss);
        if (tree) {
            Check(*tree);
            EvaluateExpression(context_, *tree);
            if (tree->null)
                AddCauseOfNull(*tree);
        } else if (losses.empty()) {
            Add(0, Str::ExplainNothing);
        }
        std::ranges::stable_sort(slips_, {}, &ExprSlip::position);
        return std::move(slips_);
    }

private:
    void Add(qsizetype position, Str reason, const QStringList& arguments = {})
    {
        slips_.push_back({position + 1, reason, arguments});
    }
    void Add(const ExprNode& node, Str reason) { Add(node.position, reason, {node.text}); }

    void AddLoss(const ParseLoss& loss)
    {
        switch (loss.reason) {
        case ParseLoss::Reason::NoPlace:
            Add(loss.position, Str::ExplainNoPlace, {loss.text});
            return;
        case ParseLoss::Reason::Replaced:
            Add(loss.position, Str::ExplainReplaced, {loss.text});
            return;
        case ParseLoss::Reason::AfterTheEnd:
            Add(loss.position, Str::ExplainAfterTheEnd, {loss.text});
            return;
        case ParseLoss::Reason::LostNot:
            Add(loss.position, Str::ExplainLostNot);
            return;
        case ParseLoss::Reason::TooLong:
            Add(loss.position, Str::ExplainTooLong);
            return;
        }
    }

    // ---- What each side is

    Kind KindOfField(const ExprNode& node)
    {
        const int column = context_.FindColumn(node.text);
        switch (column < 0 ? FieldType::None : context_.TypeOfColumn(column)) {
        case FieldType::SmallInt:
        case FieldType::Integer:
        case FieldType::Double:
            return Kind::Number;
        case FieldType::Date:
            return Kind::Date;
        case FieldType::YesNo:
            return Kind::YesNo;
        case FieldType::Text:
        case FieldType::Memo:
            return Kind::Text;
        case FieldType::None:
        case FieldType::VarBinary:
        case FieldType::LongBinary:
            break;
        }
        return Kind::Unknown;
    }

    Kind KindOfOperator(const ExprNode& node)
    {
        const Kind left = KindOf(node.args[0].get());
        const Kind right = KindOf(node.args[1].get());
        const bool addsUp = node.code == OpCode::Add || node.code == OpCode::Subtract;
        if (addsUp && left == Kind::Date && right == Kind::Number)
            return Kind::Date;
        if (node.code != OpCode::Add)
            return addsUp && left == Kind::Date && right == Kind::Unknown ? Kind::Unknown : Kind::Number;
        if (left == Kind::Unknown || right == Kind::Unknown)
            return Kind::Unknown;
        return left == Kind::Number && right == Kind::Number ? Kind::Number : Kind::Text;
    }

    static Kind KindOfResult(const FunctionDef& function)
    {
        if (!function.evaluate)
            return Kind::Unknown;
        switch (function.result) {
        case ResultKind::Number:
            return Kind::Number;
        case ResultKind::Text:
            return Kind::Text;
        case ResultKind::Date:
            return Kind::Date;
        }
        return Kind::Unknown;
    }

    Kind KindOf(const ExprNode* node)
    {
        if (!node)
            return Kind::Unknown;
        if (node->function)
            return KindOfResult(*node->function);
        if (IsArithmetic(*node))
            return KindOfOperator(*node);
        if (node->code == OpCode::Where)
            return KindOf(node->args[0].get());
        if (node->kind == NodeKind::Condition || node->code == OpCode::Number)
            return Kind::Number;
        if (node->code == OpCode::Text)
            return Kind::Text;
        return node->code == OpCode::Field ? KindOfField(*node) : Kind::Unknown;
    }

    // ---- What is likely meant otherwise

    void Check(const ExprNode& node)
    {
        if (node.code == OpCode::Field && context_.FindColumn(node.text) < 0)
            Add(node, Str::ExplainUnknownName);
        if (node.function)
            CheckArguments(node);
        if (IsArithmetic(node) || IsComparison(node))
            CheckSwallowed(node);
        if (IsArithmetic(node))
            CheckOperands(node);
        if (node.kind == NodeKind::Condition)
            CheckCondition(node);
        const bool broken = MinusBrokeOperator(node);
        if (broken)
            Add(node.position, Str::ExplainLeadingMinus, {node.args[1]->text});
        for (const ExprTree& child : node.args) {
            if (child && !(broken && child == node.args[1]))
                Check(*child);
            else if (child)
                CheckChildren(*child);
        }
    }

    void CheckChildren(const ExprNode& node)
    {
        for (const ExprTree& child : node.args) {
            if (child)
                Check(*child);
        }
    }

    void CheckArguments(const ExprNode& node)
    {
        const FunctionDef& function = *node.function;
        const std::span<const ExprTree> arguments = ArgumentSlots(node);
        if (!function.evaluate)
            Add(node, Str::ExplainAggregate);
        for (int i = 0; i < function.allowed; ++i) {
            const ExprNode* argument = arguments[size_t(i)].get();
            const char parameter = function.Parameter(i);
            const Kind kind = KindOf(argument);
            if (!argument && i < function.required)
                Add(node.position, Str::ExplainMissingArgument, {node.text, QString::number(i + 1)});
            else if (kind == Kind::Number && (parameter == 't' || parameter == 'd'))
                Add(argument->position, Str::ExplainNumberForText, {node.text});
            else if (kind == Kind::Text && (parameter == 'n' || parameter == 'i'))
                Add(argument->position, Str::ExplainTextForNumber, {node.text});
        }
    }

    void CheckSwallowed(const ExprNode& node)
    {
        const ExprNode* left = node.args[0].get();
        if (left && left->kind == NodeKind::Condition && !left->parenthesised)
            Add(node, Str::ExplainSwallowed);
    }

    void CheckOperands(const ExprNode& node)
    {
        const bool complete = node.args[0] && node.args[1];
        const bool negates = IsLeadingMinus(node) && (node.args[0] || node.args[1]);
        if (!complete && !negates)
            Add(node, Str::ExplainMissingOperand);
    }

    void CheckCondition(const ExprNode& node)
    {
        const ExprNode* left = node.args[0].get();
        const ExprNode* right = node.args[1].get();
        const bool guardsNothing = node.code == OpCode::Where && !left; // the condition of a check box
        if ((!left && !guardsNothing) || !right)
            Add(node, Str::ExplainMissingOperand);
        else if (node.code == OpCode::Where)
            CheckTruth(*right);
        else if (!IsComparison(node)) {
            CheckTruth(*left);
            CheckTruth(*right);
        } else
            CheckComparison(node, *left, *right);
    }

    void CheckTruth(const ExprNode& node)
    {
        if (node.kind != NodeKind::Condition && IsTextual(KindOf(&node)))
            Add(node, Str::ExplainTextAsCondition);
    }

    void CheckComparison(const ExprNode& node, const ExprNode& left, const ExprNode& right)
    {
        const Kind leftKind = KindOf(&left);
        const Kind rightKind = KindOf(&right);
        const bool like = node.code == OpCode::Like;
        const bool yesNo = leftKind == Kind::YesNo || rightKind == Kind::YesNo;
        const bool number = leftKind == Kind::Number || rightKind == Kind::Number;
        const bool text = IsTextual(leftKind) || IsTextual(rightKind);
        if (yesNo && number)
            Add(node.position, Str::ExplainYesNoAndNumber,
                {node.text, context_.YesNoWord(true).toString(), context_.YesNoWord(false).toString()});
        else if (number && (text || like))
            Add(node, Str::ExplainTextAndNumber);
        if (like && right.code == OpCode::Text && !right.text.startsWith(u'%') && !right.text.endsWith(u'%'))
            Add(right, Str::ExplainNoPercent);
    }

    // ---- What made the value null

    // Goes down to the first operand that is null of itself.
    void AddCauseOfNull(const ExprNode& node)
    {
        for (const ExprTree& child : node.args) {
            if (child && child->null) {
                AddCauseOfNull(*child);
                return;
            }
        }
        if (IsArithmetic(node)) {
            AddArithmeticCause(node);
        } else if (node.code == OpCode::Field) {
            Add(node, context_.Position() < 0 ? Str::ExplainNoRecord : Str::ExplainFieldIsNull);
        } else if (node.code == OpCode::Null) {
            Add(node, Str::ExplainNullWord);
        } else if (node.function && node.function->evaluate && HasRequired(node)) {
            Add(node, Str::ExplainNoValue);
        }
    }

    // What lacks an operand was told before.
    void AddArithmeticCause(const ExprNode& node)
    {
        const ExprNode* left = node.args[0].get();
        const ExprNode* right = node.args[1].get();
        if ((left && left->isText) || (right && right->isText)) {
            const bool dates = left && left->fieldType == FieldType::Date;
            Add(node, dates ? Str::ExplainNoValue : Str::ExplainTextInArithmetic);
        } else if (left && right) {
            const bool byZero = node.code == OpCode::Divide && right->valueNumber == 0;
            Add(node, byZero ? Str::ExplainDivisionByZero : Str::ExplainNoValue);
        }
    }

    static bool HasRequired(const ExprNode& node)
    {
        const std::span<const ExprTree> arguments = ArgumentSlots(node).first(size_t(node.function->required));
        return std::ranges::all_of(arguments, [](const ExprTree& argument) { return argument != nullptr; });
    }

    EvalContext& context_;
    std::vector<ExprSlip> slips_;
};

} // namespace

std::vector<ExprSlip> ExplainExpression(QStringView text, ExprMode mode, EvalContext& context)
{
    return Explainer(context).Explain(text, mode);
}

} // namespace mirel
