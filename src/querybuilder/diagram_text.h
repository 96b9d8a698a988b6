#pragma once

#include "querybuilder/query_diagram.h"

#include "provider/dialect/lexer.h"

#include <span>
#include <vector>

namespace mirel {

// Statements by their words, for the diagram: it takes conditions and expressions over as they are written.
using Tokens = std::vector<dialect::Token>;
using TokenRun = std::span<const dialect::Token>;

Tokens TokensOf(QStringView text);
QString TextOf(QStringView text, TokenRun run); // as written, from the first to the last of them

// Cuts at a separator outside of parentheses. BETWEEN keeps its AND.
std::vector<TokenRun> CutAt(TokenRun run, dialect::Symbol symbol);
std::vector<TokenRun> CutAt(TokenRun run, dialect::Keyword keyword);
bool HasOutside(TokenRun run, dialect::Keyword keyword); // of parentheses
TokenRun WithoutParentheses(TokenRun run);               // that enclose all of it

// Whether the words are the same; keywords and names in any case.
bool SameWords(TokenRun a, TokenRun b);
bool SameWords(const QString& a, const QString& b);

// How many tokens at the beginning are a column: a name, or a table's, a point and a name. 0: they are none.
size_t ColumnLength(TokenRun run);
// Whether a comparison begins there: "=", LIKE, IS, "not =" and so on.
bool BeginsComparison(TokenRun run);

struct TotalDef {
    Total total;
    QStringView function;
};
QStringView FunctionOf(Total total); // empty for None and Group
// The total that the run computes over an expression, which it becomes; None: it is no total.
Total TakeTotal(TokenRun& run);

// A condition of the grid on an expression: its operator may be missing, and it may name several by AND and OR.
QString ConditionText(const QString& expression, const QString& condition);

} // namespace mirel
