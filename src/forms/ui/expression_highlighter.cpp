#include "forms/ui/expression_highlighter.h"

#include "expr/expr_token.h"
#include "expr/function_library.h"
#include "platform/ui/look_roles.h"

#include <QPlainTextEdit>

namespace mirel {

ExpressionHighlighter::ExpressionHighlighter(QPlainTextEdit& editor)
    : QSyntaxHighlighter(editor.document())
    , editor_(editor)
{
}

void ExpressionHighlighter::highlightBlock(const QString& text)
{
    const QColor function = ColorOfRole(LookRole::Accent, editor_.palette());
    const QColor literal = ColorOfRole(LookRole::Warning, editor_.palette());
    qsizetype position = 0;
    while (const std::optional<ExprToken> token = NextExpressionToken(text, position, ExprMode::Condition)) {
        const QChar first = token->text.isEmpty() ? QChar() : token->text.front();
        if (first == u'\'' || first == u'"')
            setFormat(int(token->position), int(token->text.size()), literal);
        else if (FindFunction(token->text))
            setFormat(int(token->position), int(token->text.size()), function);
        if (position >= text.size())
            break;
    }
}

} // namespace mirel
