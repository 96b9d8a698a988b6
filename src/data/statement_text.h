#pragma once

#include <QString>
#include <QStringList>

namespace mirel {

// Filters and sorts rewrite the text of a SELECT, which then runs again. These functions only see the text: if the
// clauses of a statement are unknown or in another order, the provider judges what they make of
// it.

// The first position of `keyword` as a whole word, ignoring case: at the start or after a blank or tab, and before
// the end, "(", a blank or a tab. Skips quoted text and names in brackets. -1: not found.
qsizetype KeywordPosition(QStringView statement, QStringView keyword);

// The statement with one more condition: ANDed with an existing WHERE clause, before GROUP BY and ORDER BY. The
// rest of the text stays unchanged, blanks included.
QString WithCondition(const QString& statement, const QString& condition);

// The statement ordered by `terms` ("[Name] ASC") in place of its previous order.
QString WithOrder(const QString& statement, const QString& terms);

// The columns between SELECT and FROM, one text each, without DISTINCT. Empty when either keyword is missing.
QStringList SelectList(QStringView statement);

// The statement with these columns as its select list, written unchanged. DISTINCT stays.
QString WithSelectList(const QString& statement, const QStringList& columns);

// Whether parentheses, square brackets and quotes are closed in order. A doubled quote ends one text and begins
// another.
bool IsBalanced(QStringView statement);

} // namespace mirel
