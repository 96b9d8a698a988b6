#include "querybuilder/completion.h"

#include "data/catalog.h"
#include "provider/dialect/functions.h"
#include "provider/dialect/lexer.h"
#include "tableview/field_lists.h"

#include <vector>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;
using dialect::Keyword;
using dialect::Symbol;
using dialect::Token;
using dialect::TokenKind;

const QStringList kKeywords = {u"SELECT"_s,   u"DISTINCT"_s, u"FROM"_s,     u"INNER JOIN"_s, u"LEFT JOIN"_s,
                               u"ON"_s,       u"WHERE"_s,    u"AND"_s,      u"OR"_s,         u"NOT"_s,
                               u"LIKE"_s,     u"IN"_s,       u"BETWEEN"_s,  u"IS NULL"_s,    u"IS NOT NULL"_s,
                               u"GROUP BY"_s, u"HAVING"_s,   u"ORDER BY"_s, u"ASC"_s,        u"DESC"_s,
                               u"AS"_s,       u"TRUE"_s,     u"FALSE"_s};

bool IsName(const Token& token)
{
    return (token.kind == TokenKind::Name && token.keyword == Keyword::None) ||
           token.kind == TokenKind::BracketedName;
}

// A table of the statement, and how its columns are referred to.
struct Source {
    QString table;
    QString alias;
};

std::vector<Token> TokensOf(QStringView text)
{
    std::vector<Token> tokens;
    dialect::Lexer lexer(text);
    for (Token token = lexer.Next(); token.kind != TokenKind::End; token = lexer.Next())
        tokens.push_back(token);
    return tokens;
}

// Read from the words alone: the statement is not finished.
std::vector<Source> SourcesOf(const QString& statement)
{
    std::vector<Source> sources;
    const std::vector<Token> tokens = TokensOf(statement);
    bool inFrom = false;
    for (size_t i = 0; i < tokens.size(); ++i) {
        const Token& token = tokens[i];
        const bool begins = token.keyword == Keyword::From || token.keyword == Keyword::Join ||
                            (inFrom && token.symbol == Symbol::Comma);
        if (!begins) {
            inFrom = inFrom && token.keyword == Keyword::None;
            continue;
        }
        inFrom = true;
        if (i + 1 == tokens.size() || !IsName(tokens[i + 1]))
            continue;
        Source source{tokens[++i].Text(), {}};
        if (i + 1 < tokens.size() && tokens[i + 1].keyword == Keyword::As)
            ++i;
        if (i + 1 < tokens.size() && IsName(tokens[i + 1]))
            source.alias = tokens[++i].Text();
        sources.push_back(source);
    }
    return sources;
}

// What is being typed in front of the caret.
struct TypedWord {
    qsizetype begin = 0;
    QString text;
    QString table; // in front of its point
    bool bracketed = false;
    bool inText = false;
};
TypedWord WordBefore(QStringView before)
{
    const std::vector<Token> tokens = TokensOf(before);
    TypedWord word{before.size(), {}, {}, false, false};
    size_t count = tokens.size();
    if (count > 0) {
        const Token& last = tokens[count - 1];
        const bool touches = last.end == before.size();
        if (last.kind == TokenKind::Fault && last.quote == u']') {
            word.begin = last.begin;
            word.text = before.sliced(last.begin + 1).toString();
            word.bracketed = true;
            --count;
        } else if (last.kind == TokenKind::Fault || (touches && last.kind == TokenKind::Text)) {
            word.inText = true;
        } else if (touches && last.kind == TokenKind::Name) {
            word.begin = last.begin;
            word.text = last.text.toString();
            --count;
        }
    }
    if (count >= 2 && tokens[count - 1].symbol == Symbol::Point && IsName(tokens[count - 2]))
        word.table = tokens[count - 2].Text();
    return word;
}

void AddFields(const QString& table, FieldLists& lists, QStringList& words)
{
    for (const FieldLists::Field& field : lists.FieldsOf(table))
        words += FieldReference(field.name);
}

QString KnownTable(const QString& name, FieldLists& lists)
{
    for (const QString& table : lists.Tables()) {
        if (table.compare(name, Qt::CaseInsensitive) == 0)
            return table;
    }
    return {};
}

} // namespace

Completion CompletionAt(QStringView before, const QString& statement, FieldLists& lists)
{
    const TypedWord word = WordBefore(before);
    Completion completion{word.begin, word.text, {}};
    if (word.inText || (word.text.isEmpty() && word.table.isEmpty() && !word.bracketed))
        return completion;
    QStringList words;
    const std::vector<Source> sources = SourcesOf(statement);
    if (!word.table.isEmpty()) {
        QString table = word.table;
        for (const Source& source : sources) {
            if (source.alias.compare(word.table, Qt::CaseInsensitive) == 0)
                table = source.table;
        }
        if (const QString known = KnownTable(table, lists); !known.isEmpty())
            AddFields(known, lists, words);
    } else {
        for (const Source& source : sources) {
            if (const QString known = KnownTable(source.table, lists); !known.isEmpty())
                AddFields(known, lists, words);
        }
        for (const QString& table : lists.Tables())
            words += FieldReference(table);
        if (!word.bracketed) {
            for (const dialect::FunctionDef& function : dialect::Functions())
                words += function.name.toString() + u'(';
            words += kKeywords;
        }
    }
    for (const QString& one : words) {
        const QStringView name = one.startsWith(u'[') ? QStringView(one).sliced(1) : QStringView(one);
        const bool isTyped = name.size() == word.text.size() + (one.startsWith(u'[') ? 1 : 0) && !word.bracketed;
        if (name.startsWith(word.text, Qt::CaseInsensitive) && !isTyped && !completion.words.contains(one))
            completion.words += one;
    }
    return completion;
}

QString ClauseInsertion(ClauseKind kind, QStringView before, const QString& word)
{
    const std::vector<Token> tokens = TokensOf(before);
    const bool ends = before.isEmpty() || before.back().isSpace();
    if (tokens.empty())
        return word;
    const Token& last = tokens.back();
    if (last.symbol == Symbol::Point || last.symbol == Symbol::Open)
        return word;
    const bool completes = IsName(last) || last.kind == TokenKind::Number || last.kind == TokenKind::Text ||
                           last.symbol == Symbol::Close || last.symbol == Symbol::Star ||
                           last.keyword == Keyword::Asc || last.keyword == Keyword::Desc ||
                           last.keyword == Keyword::Null || last.keyword == Keyword::True ||
                           last.keyword == Keyword::False;
    if (completes && kind == ClauseKind::List)
        return u", "_s + word;
    const QString apart = ends ? QString() : u" "_s;
    return completes && kind == ClauseKind::Condition ? apart + u"AND "_s + word : apart + word;
}

} // namespace mirel
