#pragma once

#include "querybuilder/completion.h"
#include "querybuilder/statement_marks.h"

#include <QPlainTextEdit>

#include <functional>

class QCompleter;
class QStringListModel;

namespace mirel {

// An editor of a statement or of one of its clauses: colours its words, completes names, marks a fault.
class StatementEdit : public QPlainTextEdit {
    Q_OBJECT
public:
    // What can stand behind that text.
    using Complete = std::function<Completion(const QString& before)>;

    StatementEdit(Complete complete, QWidget* parent);

    void SetText(const QString& text); // keeps the caret's line where the text is the same
    // As if it were typed at the caret, which stays behind it; the editor takes the focus.
    void Insert(ClauseKind kind, const QString& word);
    QString TextBeforeCaret() const;

    // Until the text is edited.
    void MarkFault(const StatementPlace& place);
    bool HasFault() const { return !extraSelections().isEmpty(); }

    // From `least` to `most` lines high; 0: as high as there is room.
    void SetLines(int least, int most);

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    int HeightOf(int lines) const;
    void OfferWords(bool asked);
    void TakeWord(const QString& word);

    Complete complete_;
    Completion completion_;
    QCompleter* completer_;
    QStringListModel* words_;
    int leastLines_ = 3;
    bool singleLine_ = false; // Enter breaks no line
};

} // namespace mirel
