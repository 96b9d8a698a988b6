#include "expr/expr_node.h"

namespace mirel {
namespace {

// Which of the four children are a function's arguments. A single argument hangs on the right.
template <typename Slots>
auto Arguments(Slots& slots, const ExprNode& node)
{
    const std::span all(slots);
    switch (node.kind) {
    case NodeKind::OneArgument:
        return all.subspan(1, 1);
    case NodeKind::TwoArguments:
        return all.first(IsArithmetic(node) ? 0 : 2);
    case NodeKind::ThreeArguments:
        return all.first(3);
    case NodeKind::FourArguments:
        return all.first(4);
    case NodeKind::OpenParenthesis:
    case NodeKind::CloseParenthesis:
    case NodeKind::Operand:
    case NodeKind::Condition:
        break;
    }
    return all.first(0);
}

} // namespace

std::span<ExprTree> ArgumentSlots(ExprNode& node)
{
    return Arguments(node.args, node);
}

std::span<const ExprTree> ArgumentSlots(const ExprNode& node)
{
    return Arguments(node.args, node);
}

void DumpExpression(const ExprNode* root, QString& out)
{
    if (!root)
        return;
    out += QStringLiteral("{ ");
    DumpExpression(root->args[0].get(), out);
    out += root->text;
    for (size_t i = 1; i < root->args.size(); ++i)
        DumpExpression(root->args[i].get(), out);
    out += QStringLiteral(" }");
}

} // namespace mirel
