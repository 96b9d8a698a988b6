#pragma once

#include "expr/expr_node.h"
#include "expr/expr_token.h"

#include <vector>

namespace mirel {

// What a parse left out of the tree, in the order in which it was found.
struct ParseLoss {
    enum class Reason {
        NoPlace,     // the tree had no free place for it
        Replaced,    // something later took its place
        AfterTheEnd, // it stands behind a parenthesis that closes nothing
        LostNot,     // a NOT that no condition followed
        TooLong,     // the expression has too many tokens or parentheses: it parses to nothing
    };
    Reason reason;
    QString text;
    qsizetype position; // in the expression, from 0
};

// The tree of an expression, null for one that holds nothing. Never fails otherwise: tokens are hung into the
// growing tree from left to right, and what finds no place is left out (`losses` tells). docs/expressions.md
// describes the language.
//
// Any text will do: beyond 4000 tokens or 200 nested parentheses it parses to nothing.
ExprTree ParseExpression(QStringView text, ExprMode mode, std::vector<ParseLoss>* losses = nullptr);

} // namespace mirel
