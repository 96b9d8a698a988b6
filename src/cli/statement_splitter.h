#pragma once

#include <QString>

#include <optional>

namespace mirel::cli {

// Assembles statements from the lines of a script: a ";" at the end of a line ends a statement unless it is inside
// quotes or brackets.
class StatementSplitter {
public:
    // The statement that this line ended, without its ";"; else empty.
    std::optional<QString> AddLine(const QString& line);
    // The text after the last ";": a statement, or nothing.
    QString Rest() const { return pending_.trimmed(); }

private:
    QString pending_;
    QChar closing_; // of the open quote or bracket; null: none
};

// A single statement without the ";" at its end.
QString WithoutSemicolon(const QString& statement);

} // namespace mirel::cli
