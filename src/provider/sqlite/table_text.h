#pragma once

#include <QByteArray>

#include <optional>
#include <vector>

namespace mirel::sqlite {

// A CREATE TABLE statement as it stands in a file, cut at its commas: so that its columns can be put into
// another order and everything else that others have written there (constraints, defaults, comments) stays.
struct TableText {
    std::vector<QByteArray> parts; // between the parentheses: the columns in their order, then constraints
    QByteArray tail;               // behind the closing parenthesis

    // The same table under another name, given as it stands in SQL.
    QByteArray Statement(const QByteArray& quotedName) const;
};

// Empty when the text has no list of columns.
std::optional<TableText> CutTableText(const QByteArray& sql);

} // namespace mirel::sqlite
