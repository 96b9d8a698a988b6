#pragma once

#include "platform/hr.h"

#include <QString>

#include <optional>
#include <vector>

namespace mirel {

class FieldLists;

// What the pieces of a statement are, for an editor that colours them.
enum class MarkKind { Keyword, Function, Text, Number, Fault };
struct StatementMark {
    MarkKind kind;
    qsizetype begin;
    qsizetype length;

    friend bool operator==(const StatementMark&, const StatementMark&) = default;
};

// The marks of one line of a statement. `open` is the sign that closes what an earlier line has left open, null
// for nothing; it becomes what this line leaves open.
std::vector<StatementMark> MarksOfLine(QStringView line, QChar& open);

// A piece of a statement, in characters from 0.
struct StatementPlace {
    qsizetype begin = 0;
    qsizetype length = 0;

    friend bool operator==(const StatementPlace&, const StatementPlace&) = default;
};

// Where a statement is at fault that the provider refused: the place of a syntax error, else the first name that
// the database does not know, else the name that `context` has between quotes. A place at the statement's end has
// no length. Empty: nobody knows a place.
std::optional<StatementPlace> FaultPlace(const QString& statement, const QString& context, FieldLists& lists);

} // namespace mirel
