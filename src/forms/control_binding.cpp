#include "forms/control_binding.h"

#include "expr/evaluation.h"
#include "expr/expr_parser.h"
#include "platform/user_locale.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

bool IsAggregate(const ExprNode& node)
{
    return node.code == OpCode::Sum || node.code == OpCode::Avg || node.code == OpCode::Min ||
           node.code == OpCode::Max;
}

// An aggregate is null until a pass over the result gives it its value.
void CollectAggregates(ExprNode& node, std::vector<ControlBinding::Aggregate>& aggregates, bool outermost = true)
{
    const bool isAggregate = IsAggregate(node);
    if (isAggregate) {
        SetNull(node);
        if (outermost)
            aggregates.push_back({&node});
    }
    for (const ExprTree& argument : node.args) {
        if (argument)
            CollectAggregates(*argument, aggregates, outermost && !isAggregate);
    }
}

// The text that is parsed for what the control shows; empty: it shows what is put into it.
QString ShownSource(const ControlDef& control, const ControlBinding& binding)
{
    const bool isDropDown = control.type == ControlType::DropDownBox;
    if (control.type != ControlType::EditBox && control.type != ControlType::CheckBox && !isDropDown)
        return {};
    if (control.hasSource != 0) {
        const QString source = isDropDown ? binding.dropDown.data : control.source.Text();
        const bool isItems = isDropDown && DropDownItems(source).size() != 1;
        if (!source.isEmpty() && !isItems)
            return source;
    }
    return control.fieldBound != 0 ? u'[' + control.name.Text() + u']' : QString();
}

std::vector<ControlBinding::Column> BindColumns(const ControlDef& control)
{
    std::vector<ControlBinding::Column> columns;
    for (const SourceColumn& column : SplitListColumns(control.source.Text())) {
        columns.push_back({column.name, ParseExpression(column.expression, ExprMode::Value)});
        std::vector<ControlBinding::Aggregate> unused; // a row is one record: an aggregate is null in it
        if (columns.back().tree)
            CollectAggregates(*columns.back().tree, unused);
    }
    return columns;
}

} // namespace

ControlBinding BindControl(const ControlDef& control)
{
    ControlBinding binding;
    if (control.type == ControlType::List)
        binding.columns = BindColumns(control);
    if (control.type == ControlType::DropDownBox)
        binding.dropDown = SplitDropDown(control.source.Text());
    binding.tree = ParseExpression(ShownSource(control, binding), ExprMode::Condition);
    if (!binding.tree)
        return binding;
    if (control.type == ControlType::CheckBox)
        CompareYesNoAsNumber(*binding.tree);
    binding.isMaybeItem = control.type == ControlType::DropDownBox && control.hasSource != 0 &&
                          !binding.dropDown.data.isEmpty() && binding.tree->kind == NodeKind::Operand;
    binding.wholeResult = control.sourceScope == SourceScope::WholeResult;
    CollectAggregates(*binding.tree, binding.aggregates);
    return binding;
}

int ColumnOf(const ExprNode* tree, EvalContext& context)
{
    return tree && tree->code == OpCode::Field ? context.FindColumn(tree->text) : -1;
}

const ExprNode* ShownField(const ControlBinding& binding, ControlType type)
{
    const ExprNode* tree = binding.wholeResult ? nullptr : binding.tree.get();
    if (tree && type == ControlType::CheckBox) {
        if (tree->code == OpCode::Where)
            tree = tree->args[1] ? tree->args[1].get() : tree->args[0].get();
        if (tree && tree->kind == NodeKind::Condition)
            tree = tree->args[0].get();
    }
    return tree && tree->code == OpCode::Field ? tree : nullptr;
}

int ShownColumn(const ControlBinding& binding, ControlType type, FormContext& context)
{
    const int column = ColumnOf(ShownField(binding, type), context);
    return column < context.FieldCount() ? column : column - context.FieldCount();
}

QString TextOnRecord(ExprNode& tree, EvalContext& context)
{
    EvaluateExpression(context, tree);
    if (tree.code == OpCode::Field && !tree.null && !tree.isText && tree.column >= 0)
        return VariantText(context.FieldValue(tree.column));
    return ShownText(tree);
}

bool HoldsOnRecord(ExprNode& tree, EvalContext& context)
{
    const bool holds = EvaluateExpression(context, tree);
    if (tree.kind == NodeKind::Condition || tree.null || tree.suppressed)
        return holds;
    return tree.isText ? TextOf(tree) == context.YesNoWord(true) : tree.valueNumber != 0;
}

} // namespace mirel
