#pragma once

#include <QString>

#include <optional>

namespace mirel::cli {

// Puts statements together from the lines of a script: a ";" at a line's end ends one, unless it stands inside
// quotes or brackets.
class StatementSplitter {
public:
    // The statement that this line ended, without its ";"; else empty.
    std::optional<QString> AddLine(const QString& line);
    // What stands behind the last ";": a statement, or nothing but blanks.
    QString Rest() const { return pending_.trimmed(); }

private:
    QString pending_;
    QChar closing_; // of the quote or bracket that is open; null: none
};

// A single statement as it was given, without the ";" at its end.
QString WithoutSemicolon(const QString& statement);

} // namespace mirel::cli
