#include "provider/sqlite/table_text.h"

namespace mirel::sqlite {
namespace {

// Where the quoted name, text or comment that begins at `at` ends; `at` itself when none begins there.
qsizetype EndOfQuoted(const QByteArray& sql, qsizetype at)
{
    const auto behind = [&](const char* end, qsizetype length, qsizetype from) {
        const qsizetype found = sql.indexOf(end, from);
        return found < 0 ? sql.size() : found + length;
    };
    switch (sql[at]) {
    case '\'':
        return behind("'", 1, at + 1); // a doubled quote ends one text and begins the next
    case '"':
        return behind("\"", 1, at + 1);
    case '`':
        return behind("`", 1, at + 1);
    case '[':
        return behind("]", 1, at + 1);
    case '-':
        return sql.mid(at, 2) == "--" ? behind("\n", 1, at) : at;
    case '/':
        return sql.mid(at, 2) == "/*" ? behind("*/", 2, at + 2) : at;
    default:
        return at;
    }
}

} // namespace

std::optional<TableText> CutTableText(const QByteArray& sql)
{
    TableText text;
    int depth = 0;
    qsizetype start = 0;
    for (qsizetype at = 0; at < sql.size();) {
        if (const qsizetype end = EndOfQuoted(sql, at); end > at) {
            at = end;
            continue;
        }
        const char unit = sql[at];
        if (unit == '(' && depth++ == 0)
            start = at + 1;
        if (unit == ',' && depth == 1) {
            text.parts.push_back(sql.mid(start, at - start));
            start = at + 1;
        }
        if (unit == ')' && --depth == 0) {
            text.parts.push_back(sql.mid(start, at - start));
            text.tail = sql.mid(at + 1);
            return text;
        }
        ++at;
    }
    return {};
}

QByteArray TableText::Statement(const QByteArray& quotedName) const
{
    QByteArray sql = "CREATE TABLE " + quotedName + '(';
    for (size_t i = 0; i < parts.size(); ++i)
        sql += (i > 0 ? "," : "") + parts[i];
    return sql + ')' + tail;
}

} // namespace mirel::sqlite
