#pragma once

#include "resources/string_id.h"

#include <QString>
#include <QStringList>

#include <optional>
#include <span>

namespace mirel {

// The clauses of a SELECT as the query builder shows them: one text each, without its keyword and without blanks
// at its ends.
struct QueryClauses {
    QString select;
    QString from;
    QString join; // the table of an INNER JOIN
    QString on;
    QString where;
    QString order;

    friend bool operator==(const QueryClauses&, const QueryClauses&) = default;
};

struct ClauseDef {
    QString QueryClauses::*text;
    QStringView keyword; // as the joined statement has it
};
// All clauses, in the order of a statement.
std::span<const ClauseDef> ClauseDefs();

// Cuts a statement at its keywords. Each piece ends at the first keyword of FROM, INNER, JOIN, ON, WHERE, ORDER,
// BY that follows in this order and is in the statement at all, wherever it is; the join needs both of its
// keywords, and so does the order. What a piece would have of negative length is empty.
QueryClauses SplitStatement(QStringView statement);

// The clauses that are not empty, each behind its keyword, appended to `prefix`.
QString JoinClauses(const QueryClauses& clauses, const QString& prefix = {});

// Whether two statements consist of the same words; keywords in any case, and blanks do not count.
bool SayTheSame(QStringView a, QStringView b);

// Why the clauses cannot stand for the statement: it has clauses without a box, is no SELECT, or would lose a part
// of itself when it is split and joined again. Empty: they can.
struct SplitObstacle {
    Str reason;
    QStringList arguments;
};
std::optional<SplitObstacle> ObstacleToSplitting(const QString& statement);

// What stands behind the select clause of a statement, which keeps its own: the text from FROM, INNER, WHERE or
// ORDER on. Of a text without a select clause all of it.
QString WithoutSelectClause(const QString& statement, const QString& selectClause);
// The two put together again.
QString WithSelectClause(const QString& selectClause, const QString& rest);

} // namespace mirel
