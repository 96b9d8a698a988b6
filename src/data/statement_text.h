#pragma once

#include <QString>
#include <QStringList>

namespace mirel {

// Filters and sorts are rewrites of a SELECT's text, run again afterwards. These work on the text alone: what
// they make of a statement that has clauses in another order, or none that they know, is for the provider to
// judge.

// Where `keyword` first stands as a whole word, case ignored: at the start or after a blank or tab, and followed
// by the end, "(", a blank or a tab. Quoted text and names in brackets are skipped. -1: nowhere.
qsizetype KeywordPosition(QStringView statement, QStringView keyword);

// The statement with one more condition: ANDed with the WHERE clause that is there, in front of GROUP BY and
// ORDER BY. The text around the pieces stays as it is, blanks included.
QString WithCondition(const QString& statement, const QString& condition);

// The statement ordered by `terms` ("[Name] ASC"), whatever its order was before.
QString WithOrder(const QString& statement, const QString& terms);

// The statement from its FROM on, with the select list replaced by these names, each written by the
// field-reference rule.
QString WithFields(const QString& statement, const QStringList& fields);

} // namespace mirel
