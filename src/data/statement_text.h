#pragma once

#include "provider/provider.h"

#include <QString>
#include <QStringList>

#include <span>

namespace mirel {

// Filters and sorts rewrite the text of a SELECT, which then runs again. These functions only see the text: if the
// clauses of a statement are unknown or in another order, the provider judges what they make of
// it.

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

// The columns between SELECT and FROM, one text each, without DISTINCT. Empty when either keyword is missing.
QStringList SelectList(QStringView statement);

// The statement with these columns as its select list, written unchanged. DISTINCT stays.
QString WithSelectList(const QString& statement, const QStringList& columns);

// Whether parentheses, square brackets and quotes are closed in order. A doubled quote ends one text and begins
// another.
bool IsBalanced(QStringView statement);

} // namespace mirel
