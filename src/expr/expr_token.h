#pragma once

#include <QString>
#include <QStringView>

#include <optional>

namespace mirel {

// In value mode "!", "<", "=" and ">" belong to the name beside them; in condition mode they are operators, and
// the words of conditions are recognised.
enum class ExprMode { Value, Condition };

struct ExprToken {
    QString text;           // as written; the two characters of an operator stand together
    qsizetype position = 0; // where it begins
};

// Takes the next token off `text` at `position`, and moves `position` behind it. Tabs, spaces and commas between
// tokens are skipped. Empty at the end of the text.
std::optional<ExprToken> NextExpressionToken(QStringView text, qsizetype& position, ExprMode mode);

// The position of the first character at or after `position` that is no tab, space or comma.
qsizetype SkipExpressionBlanks(QStringView text, qsizetype position);

// Both look from behind an opening parenthesis and pass over inner parentheses and over what stands between
// quotes, where a quote of either kind ends what one of either kind began. -1: there is none.
qsizetype FindClosingParenthesis(QStringView text, qsizetype from);
qsizetype FindArgumentEnd(QStringView text, qsizetype from); // the closing parenthesis, or a comma before it

} // namespace mirel
