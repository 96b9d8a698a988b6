#include "forms/control_binding.h"

#include "expr/evaluation.h"
#include "expr/expr_parser.h"
#include "forms/control_types.h"
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

ExprTree OwnField(const ControlDef& control)
{
    return control.fieldBound != 0 ? ParseExpression(u'[' + control.name.Text() + u']', ExprMode::Condition)
                                   : nullptr;
}

// The expression of a drop-down box's data: more than one item is none. A single name may be an item all the same,
// where no field bears it; then the box shows its own field.
void BindDropDown(const ControlDef& control, ControlBinding& binding)
{
    binding.dropDown = SplitDropDown(control.source.Text());
    const bool isOne = control.hasSource != 0 && DropDownItems(binding.dropDown.data).size() == 1;
    binding.tree = isOne ? ParseExpression(binding.dropDown.data, ExprMode::Condition) : nullptr;
    if (!binding.tree) {
        binding.tree = OwnField(control);
    } else if (binding.tree->kind == NodeKind::Operand) {
        binding.isMaybeItem = true;
        binding.ownField = OwnField(control);
    }
}

void BindSource(const ControlDef& control, ControlBinding& binding)
{
    binding.tree = control.hasSource != 0 ? ParseExpression(control.source.Text(), ExprMode::Condition) : nullptr;
    if (!binding.tree)
        binding.tree = OwnField(control);
    if (binding.tree && control.type == ControlType::CheckBox)
        CompareYesNoAsNumber(*binding.tree);
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
    switch (SourceKindOf(control.type)) {
    case SourceKind::Columns:
        binding.columns = BindColumns(control);
        break;
    case SourceKind::Items:
        BindDropDown(control, binding);
        break;
    case SourceKind::Expression:
        BindSource(control, binding);
        break;
    case SourceKind::Function:
    case SourceKind::None:
        break;
    }
    if (binding.tree) {
        binding.wholeResult = control.sourceScope == SourceScope::WholeResult;
        CollectAggregates(*binding.tree, binding.aggregates);
    }
    return binding;
}

bool IsItem(const ControlBinding& binding, EvalContext& context)
{
    return binding.isMaybeItem && ColumnOf(binding.tree.get(), context) < 0;
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
    const ExprNode* shown = IsItem(binding, context) ? binding.ownField.get() : ShownField(binding, type);
    const int column = ColumnOf(shown, context);
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
