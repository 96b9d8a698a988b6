#pragma once

#include "expr/evaluator.h"
#include "expr/expr_token.h"
#include "resources/string_id.h"

#include <QStringList>

#include <vector>

namespace mirel {

// Something in an expression that does not do what it seems to.
struct ExprSlip {
    qsizetype position; // in the text, from 1
    Str reason;
    QStringList arguments; // of the reason, behind the position

    QString Text() const { return StringText(reason, QStringList{QString::number(position)} + arguments); }
};

// The language leaves out in silence what it cannot place, and answers with NULL what it cannot compute. This
// tells what was left out, what is likely meant otherwise, and, for a value that is null, what made it so. In the
// order of the text; empty for an expression without fault. Evaluates it, and changes no value by that.
std::vector<ExprSlip> ExplainExpression(QStringView text, ExprMode mode, EvalContext& context);

} // namespace mirel
