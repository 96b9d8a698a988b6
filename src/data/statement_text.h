#pragma once

#include "provider/provider.h"

#include <QString>
#include <QStringList>

#include <span>

namespace mirel {

// Filters and sorts are rewrites of a SELECT's text, run again afterwards. These work on the text alone: what
// they make of a statement that has clauses in another order, or none that they know, is for the provider to
// judge.

// Where `keyword` first stands as a whole word, case ignored: at the start or after a blank, and followed by the
// end, "(" or a blank; tabs and line ends are blanks. Quoted text and names in brackets are skipped. -1: nowhere.
qsizetype KeywordPosition(QStringView statement, QStringView keyword);

// The statement with one more condition: ANDed with the WHERE clause that is there, in front of GROUP BY and
// ORDER BY; one that speaks of COUNT, SUM and the like goes to HAVING instead. The text around the pieces stays as
// it is, blanks included.
QString WithCondition(const QString& statement, const QString& condition);

// How a column of a result is referred to in a condition or an order of the statement that made it: by its name,
// with the source's alias where there are several or the name alone would mean another column; a computed one by
// its expression.
QString FieldReferenceIn(std::span<const ResultField> result, int field);

// The statement ordered by `terms` ("[Name] ASC"), whatever its order was before.
QString WithOrder(const QString& statement, const QString& terms);

// What stands between SELECT and FROM, a text a column, without DISTINCT. Empty when one of the two is missing.
QStringList SelectList(QStringView statement);

// The statement from its FROM on, with these columns as its select list, written as they are. DISTINCT stays.
QString WithSelectList(const QString& statement, const QStringList& columns);

// Whether parentheses, square brackets and quotes are closed in order. A doubled quote ends a text and begins one.
bool IsBalanced(QStringView statement);

} // namespace mirel
