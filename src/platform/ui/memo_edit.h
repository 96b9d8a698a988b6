#pragma once

#include <QPlainTextEdit>

namespace mirel {

// An editor of several lines that gives back every character of its text which the user has not edited: each
// kind of line end, no-break spaces, separators.
class MemoEdit : public QPlainTextEdit {
    Q_OBJECT
public:
    explicit MemoEdit(QWidget* parent = nullptr);

    const QString& Text() const { return text_; }
    void SetText(const QString& text); // tells nobody; the caret stays where the text is the same

Q_SIGNALS:
    void edited(const QString& text);

private:
    QString text_;
    bool setting_ = false;
};

} // namespace mirel
