#pragma once

#include "expr/evaluator.h"
#include "expr/expr_token.h"
#include "resources/string_id.h"

#include <QStringList>

#include <vector>

namespace mirel {

// A part of an expression that does not do what it seems to.
struct ExprSlip {
    qsizetype position; // in the text, from 1
    Str reason;
    QStringList arguments; // of the reason, after the position

    QString Text() const { return StringText(reason, QStringList{QString::number(position)} + arguments); }
};

// The language silently drops what it cannot place, and gives NULL for what it cannot compute. This reports what
// was dropped, what was probably meant differently and, if the value is null, what made it null. In the order of
// the text; empty for a sound expression. Evaluates the expression without changing any value.
std::vector<ExprSlip> ExplainExpression(QStringView text, ExprMode mode, EvalContext& context);

} // namespace mirel
