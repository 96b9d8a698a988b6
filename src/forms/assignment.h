#pragma once

#include "expr/evaluator.h"
#include "expr/expr_node.h"
#include "forms/control_source.h"
#include "provider/provider.h"

#include <QString>

#include <functional>
#include <vector>

namespace mirel {

// One assignment of a button, made ready for a result: the expression whose value goes into a field of it.
struct FieldAssignment {
    int field = -1; // of the result; -1: the result has no such field
    FieldType type = FieldType::None;
    int size = -1;
    TargetName target;
    ExprTree tree;       // null: no value expression
    QString controlName; // not empty: the value is this control's text and nothing else
};

// The assignment as far as it can be told without a result.
FieldAssignment ParseAssignment(const SourceAssignment& source);

// Adds the names of all controls that the tree refers to.
void CollectControlNames(const ExprNode& tree, QStringList& names);

using TextOfControl = std::function<QString(QStringView name)>;

// What the assignment stores in its field, on the context's record; empty text is NULL, in a Yes/No field false.
// `value` is left alone when the result does not read as the field's type, or does not fit.
[[nodiscard]] Hr ValueToStore(FieldAssignment& assignment, EvalContext& context, const TextOfControl& controlText,
                              Value& value);
// The same as it stands in the values of an INSERT; nothing at all for a binary field.
QString LiteralToInsert(FieldAssignment& assignment, EvalContext& context, const TextOfControl& controlText);

} // namespace mirel
