#pragma once

#include "expr/expr_node.h"
#include "expr/expr_token.h"

#include <vector>

namespace mirel {

// What a parse left out of the tree, in the order found.
struct ParseLoss {
    enum class Reason {
        NoPlace,     // the tree had no free place for it
        Replaced,    // something later took its place
        AfterTheEnd, // it follows a parenthesis that closes nothing
        LostNot,     // a NOT that no condition followed
        TooLong,     // the expression has too many tokens or parentheses: it parses to nothing
    };
    Reason reason;
    QString text;
    qsizetype position; // in the expression, from 0
};

// The tree of an expression; null if there is nothing in it. Never fails otherwise: each token joins the growing
// tree from left to right, and one that finds no place is dropped (see `losses`). docs/expressions.md
// describes the language.
//
// Accepts any text; one with more than 4000 tokens or 200 nested parentheses parses to nothing.
ExprTree ParseExpression(QStringView text, ExprMode mode, std::vector<ParseLoss>* losses = nullptr);

} // namespace mirel
