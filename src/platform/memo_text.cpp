#include "platform/memo_text.h"

#include <algorithm>

namespace mirel {
namespace {

constexpr QChar kParagraph = QChar::ParagraphSeparator;

// What editors take for the end of a line; the last two begin and end a frame in their documents.
bool EndsLine(QChar letter)
{
    return letter == u'\n' || letter == u'\r' || letter == kParagraph || letter == QChar(0xFDD0) ||
           letter == QChar(0xFDD1);
}

bool IsPair(const QString& text, qsizetype at)
{
    return at >= 0 && at + 1 < text.size() && text[at] == u'\r' && text[at + 1] == u'\n';
}

QChar InEditor(QChar letter)
{
    return EndsLine(letter) ? kParagraph : letter;
}

QString LineEndOf(const QString& text)
{
    const auto end = std::ranges::find_if(text, EndsLine);
    if (end == text.end())
        return QStringLiteral("\n");
    return IsPair(text, end - text.begin()) ? QStringLiteral("\r\n") : QString(*end);
}

} // namespace

QString WithEdit(const QString& before, const QString& edited)
{
    qsizetype kept = 0; // of `before` from its beginning
    qsizetype same = 0; // of `edited`
    while (kept < before.size() && same < edited.size() && InEditor(before[kept]) == edited[same]) {
        kept += IsPair(before, kept) ? 2 : 1;
        ++same;
    }
    qsizetype rest = before.size(); // what is kept at its end begins there
    qsizetype sameRest = edited.size();
    while (rest > kept && sameRest > same && InEditor(before[rest - 1]) == edited[sameRest - 1]) {
        rest -= IsPair(before, rest - 2) && rest - 2 >= kept ? 2 : 1;
        --sameRest;
    }
    QString changed = edited.mid(same, sameRest - same);
    changed.replace(kParagraph, LineEndOf(before));
    return before.left(kept) + changed + before.mid(rest);
}

} // namespace mirel
