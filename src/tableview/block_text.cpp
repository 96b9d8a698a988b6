#include "tableview/block_text.h"

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr QChar kQuote = u'"';

bool IsLineEnd(QChar letter)
{
    return letter == u'\n' || letter == u'\r';
}

QString Quoted(const QString& text)
{
    const bool needed = text.startsWith(kQuote) || std::ranges::any_of(text, [](QChar letter) {
                            return letter == u'\t' || IsLineEnd(letter);
                        });
    if (!needed)
        return text;
    QString doubled = text;
    doubled.replace(kQuote, u"\"\""_s);
    return kQuote + doubled + kQuote;
}

// The end of the quoted text that begins at `from`: behind its closing mark, which a tab, a line end or the end
// follows. -1: it is never closed so, and the mark is plain text.
qsizetype EndOfQuoted(QStringView text, qsizetype from)
{
    for (qsizetype at = from + 1; at < text.size(); ++at) {
        if (text[at] != kQuote)
            continue;
        const bool atEnd = at + 1 == text.size();
        if (atEnd || text[at + 1] == u'\t' || IsLineEnd(text[at + 1]))
            return at + 1;
        if (text[at + 1] != kQuote)
            return -1;
        ++at;
    }
    return -1;
}

// Takes one cell off `text` at `at`, which then stands on what follows it.
QString TakeCell(QStringView text, qsizetype& at)
{
    const qsizetype start = at;
    if (at < text.size() && text[at] == kQuote) {
        const qsizetype end = EndOfQuoted(text, at);
        if (end >= 0) {
            at = end;
            QString inner = text.sliced(start + 1, end - start - 2).toString();
            return inner.replace(u"\"\""_s, u"\""_s);
        }
    }
    while (at < text.size() && text[at] != u'\t' && !IsLineEnd(text[at]))
        ++at;
    return text.sliced(start, at - start).toString();
}

} // namespace

QString TextOfRows(const TextRows& rows)
{
    QStringList lines;
    for (const QStringList& row : rows) {
        QStringList cells;
        for (const QString& cell : row)
            cells += Quoted(cell);
        lines += cells.join(u'\t');
    }
    // An empty cell at the end would be taken for the line end behind the row before it.
    const bool endsEmpty = lines.size() > 1 && lines.back().isEmpty();
    return lines.join(u'\n') + (endsEmpty ? u"\n"_s : QString());
}

TextRows RowsOfText(QStringView text)
{
    TextRows rows{{}};
    qsizetype at = 0;
    while (true) {
        rows.back() += TakeCell(text, at);
        if (at >= text.size())
            return rows;
        const bool isTab = text[at] == u'\t';
        at += text.sliced(at).startsWith(u"\r\n") ? 2 : 1;
        if (isTab)
            continue;
        if (at >= text.size())
            return rows;
        rows.emplace_back();
    }
}

QString HtmlOfRows(const TextRows& rows)
{
    QString html = u"<meta charset=\"utf-8\"><table>"_s;
    for (const QStringList& row : rows) {
        html += u"<tr>"_s;
        for (const QString& cell : row) {
            QString text = cell.toHtmlEscaped();
            text.replace(u"\r\n"_s, u"<br>"_s).replace(u'\n', u"<br>"_s);
            // A text of digits stays one where it begins with 0 or is longer than a number keeps.
            constexpr qsizetype kExactDigits = 15;
            const bool isCode = (cell.startsWith(u'0') && cell.size() > 1 && cell[1].isDigit()) ||
                                (cell.size() > kExactDigits && cell.front().isDigit());
            html += isCode ? u"<td style='mso-number-format:\"\\@\";white-space:pre-wrap'>"_s
                           : u"<td style='white-space:pre-wrap'>"_s;
            html += text + u"</td>"_s;
        }
        html += u"</tr>"_s;
    }
    return html + u"</table>"_s;
}

} // namespace mirel
