#pragma once

#include <QString>
#include <QStringList>

namespace mirel {

class FieldLists;

// The words that can stand where the caret is: what is replaced, and by what.
struct Completion {
    qsizetype begin = 0; // of the piece that is replaced: from here to the caret
    QString typed;       // that piece, without an opening bracket
    QStringList words;   // as the statement writes them

    bool IsEmpty() const { return words.isEmpty(); }
};

// `before`: the editor's text up to the caret; `statement`: what it is a part of. Fields of the tables in the
// statement come first, then tables, functions and keywords; behind a table's name and a point only its fields.
// Nothing is offered inside a text, and where nothing was typed yet only behind a point.
Completion CompletionAt(QStringView before, const QString& statement, FieldLists& lists);

// How a word is taken into a clause at the caret: with the comma of a list, the AND of a condition, or the blank
// that keeps it apart from what is in front of it.
enum class ClauseKind { List, Condition, Plain };
QString ClauseInsertion(ClauseKind kind, QStringView before, const QString& word);

} // namespace mirel
