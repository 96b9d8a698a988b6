#include "forms/form_query.h"

#include "data/catalog.h"
#include "provider/dialect/lexer.h"
#include "provider/dialect/parser.h"

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;
using dialect::Keyword;
using dialect::Token;
using dialect::TokenKind;

bool IsNameUnit(QChar c)
{
    return c.isLetterOrNumber() || c == u'_';
}

// A reference in a statement, from its "&" on.
struct Reference {
    QStringView name;
    qsizetype length = 0; // 0: there is none
};

Reference ReferenceAt(QStringView text, bool inQuotes)
{
    if (text.size() < 2)
        return {};
    if (text[1] == u'[') {
        const qsizetype end = text.indexOf(u']');
        return end < 0 ? Reference() : Reference{text.sliced(2, end - 2).trimmed(), end + 1};
    }
    // "R&D" in a literal is no reference.
    const auto end = std::find_if_not(text.begin() + 1, text.end(), IsNameUnit);
    const qsizetype length = end - text.begin();
    return inQuotes || length < 2 ? Reference() : Reference{text.sliced(1, length - 1), length};
}

QString Doubled(const QString& text, QChar quote)
{
    return QString(text).replace(quote, QString(2, quote));
}

QString WithControlTexts(QStringView query, const ControlTextOf& controlText)
{
    QString out;
    QChar closing; // of the quote or bracket that the position is in; null outside
    for (qsizetype i = 0; i < query.size(); ++i) {
        const QChar c = query[i];
        if (c == u'&' && closing != u']') {
            const Reference reference = ReferenceAt(query.sliced(i), !closing.isNull());
            const std::optional<QString> text = reference.length > 0 ? controlText(reference.name) : std::nullopt;
            if (text) {
                if (!closing.isNull())
                    out += Doubled(*text, closing);
                else
                    out += text->isEmpty() ? u"NULL"_s : QuoteText(*text);
                i += reference.length - 1;
                continue;
            }
        }
        if (c == closing)
            closing = QChar();
        else if (closing.isNull() && (c == u'\'' || c == u'"'))
            closing = c;
        else if (closing.isNull() && c == u'[')
            closing = u']';
        // Filters and sorts, which are put onto the statement later, look for words between blanks.
        out += closing.isNull() && c.isSpace() ? QChar(u' ') : c;
    }
    return out;
}

// The first of the keywords that stands in no parentheses; the end, or the fault that ends the text, without
// one. LEFT counts only in front of JOIN: it is a function as well.
Token FindToken(const QString& statement, std::initializer_list<Keyword> keywords)
{
    dialect::Lexer lexer(statement);
    int depth = 0;
    Token previous;
    for (Token token = lexer.Next();; previous = token, token = lexer.Next()) {
        if (token.kind == TokenKind::End || token.kind == TokenKind::Fault)
            return token;
        if (token.symbol == dialect::Symbol::Open)
            ++depth;
        else if (token.symbol == dialect::Symbol::Close)
            --depth;
        else if (depth == 0 && std::ranges::count(keywords, token.keyword) > 0)
            return token.keyword == Keyword::Join && previous.keyword == Keyword::Left ? previous : token;
    }
}

bool IsWithoutFrom(const QString& statement)
{
    return dialect::BeginsAsStatement(statement) && FindToken(statement, {Keyword::From}).kind == TokenKind::End;
}

QString Trimmed(const QString& statement)
{
    QString trimmed = statement.trimmed();
    while (trimmed.endsWith(u';'))
        trimmed = trimmed.chopped(1).trimmed();
    return trimmed;
}

} // namespace

QString CompleteQuery(const QString& query, const QString& table, const ControlTextOf& controlText)
{
    QString statement = Trimmed(WithControlTexts(query, controlText));
    if (table.isEmpty() || !IsWithoutFrom(statement))
        return statement;
    const Token clause = FindToken(statement, {Keyword::Inner, Keyword::Join, Keyword::Where, Keyword::Group,
                                               Keyword::Having, Keyword::Order});
    const bool atEnd = clause.kind != TokenKind::Name;
    const QString head = atEnd ? statement : statement.first(clause.begin).trimmed();
    const QString tail = atEnd ? QString() : u' ' + statement.sliced(clause.begin);
    return u"%1 FROM %2%3"_s.arg(head, FieldReference(table), tail);
}

} // namespace mirel
