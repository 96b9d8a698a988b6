#pragma once

#include <QSyntaxHighlighter>

class QPlainTextEdit;

namespace mirel {

// Tells functions, texts and field names of an expression apart while it is written. The editor owns it.
class ExpressionHighlighter : public QSyntaxHighlighter {
public:
    explicit ExpressionHighlighter(QPlainTextEdit& editor);

protected:
    void highlightBlock(const QString& text) override;

private:
    QPlainTextEdit& editor_;
};

} // namespace mirel
