#pragma once

#include <QString>
#include <QStringView>

#include <optional>

namespace mirel {

// In value mode "!", "<", "=" and ">" are part of the adjacent name; in condition mode they are operators, and the
// words of conditions are recognised.
enum class ExprMode { Value, Condition };

struct ExprToken {
    QString text;           // as written; an operator of two characters is one token
    qsizetype position = 0; // where it begins
};

// Reads the next token of `text` at `position`, and moves `position` past it. Tabs, spaces and commas between
// tokens are skipped. Empty at the end of the text.
std::optional<ExprToken> NextExpressionToken(QStringView text, qsizetype& position, ExprMode mode);

// The position of the first character at or after `position` that is no tab, space or comma.
qsizetype SkipExpressionBlanks(QStringView text, qsizetype position);

// A name without its brackets. Between brackets "]]" stands for "]", and a "[" is part of the name.
QString BareName(QStringView written);

// Both start after an opening parenthesis and skip inner parentheses and quoted text; a quote of either kind ends
// a text that a quote of either kind began. -1: not found.
qsizetype FindClosingParenthesis(QStringView text, qsizetype from);
qsizetype FindArgumentEnd(QStringView text, qsizetype from); // the closing parenthesis, or a comma before it

} // namespace mirel
