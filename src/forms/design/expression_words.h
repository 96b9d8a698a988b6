#pragma once

#include "expr/expr_node.h"

#include <QStringList>

namespace mirel {

// What an expression says, in words: one line for each node of its tree, its operands indented below it.
QStringList ExpressionInWords(const ExprNode& tree);

} // namespace mirel
