#include "querybuilder/statement_marks.h"

#include "provider/dialect/functions.h"
#include "provider/dialect/lexer.h"
#include "provider/dialect/parser.h"
#include "provider/dialect/schema.h"
#include "tableview/field_lists.h"

#include <QRegularExpression>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;
using dialect::Keyword;
using dialect::Token;
using dialect::TokenKind;

std::optional<MarkKind> KindOf(const Token& token)
{
    switch (token.kind) {
    case TokenKind::Name:
        if (token.keyword != Keyword::None)
            return MarkKind::Keyword;
        return dialect::FindFunction(token.text) ? std::optional(MarkKind::Function) : std::nullopt;
    case TokenKind::Text:
        return MarkKind::Text;
    case TokenKind::Number:
        return MarkKind::Number;
    case TokenKind::Fault:
        return MarkKind::Fault;
    case TokenKind::End:
    case TokenKind::BracketedName:
    case TokenKind::Symbol:
        break;
    }
    return std::nullopt;
}

// Behind the sign that closes what an earlier line left open; -1: it stays open.
qsizetype EndOfOpen(QStringView line, QChar closing)
{
    for (qsizetype at = line.indexOf(closing); at >= 0; at = line.indexOf(closing, at + 2)) {
        if (at + 1 == line.size() || line[at + 1] != closing)
            return at + 1;
    }
    return -1;
}

MarkKind KindOfOpen(QChar closing)
{
    return closing == u']' ? MarkKind::Fault : MarkKind::Text;
}

std::optional<StatementPlace> PlaceOfName(QStringView statement, QStringView name)
{
    dialect::Lexer lexer(statement);
    for (Token token = lexer.Next(); token.kind != TokenKind::End; token = lexer.Next()) {
        const bool isName = token.kind == TokenKind::Name || token.kind == TokenKind::BracketedName;
        if (isName && dialect::SameName(token.Text(), name))
            return StatementPlace{token.begin, token.end - token.begin};
    }
    return std::nullopt;
}

// Looks for names in a SELECT that the database does not have.
class NameSearch {
public:
    NameSearch(QStringView statement, const dialect::Select& select, FieldLists& lists)
        : statement_(statement)
        , select_(select)
        , lists_(lists)
    {
    }

    std::optional<StatementPlace> FirstUnknown()
    {
        for (const dialect::FromTable& from : select_.from) {
            if (!lists_.Tables().contains(from.table, Qt::CaseInsensitive))
                return PlaceOfName(statement_, from.table);
        }
        for (const dialect::SelectColumn& column : select_.columns)
            Visit(column.expression);
        for (const dialect::FromTable& from : select_.from) {
            if (from.on)
                Visit(*from.on);
        }
        for (const std::optional<dialect::Expr>* condition : {&select_.where, &select_.having}) {
            if (*condition)
                Visit(**condition);
        }
        for (const dialect::Expr& group : select_.group)
            Visit(group);
        for (const dialect::OrderTerm& term : select_.order)
            Visit(term.expression);
        return found_;
    }

private:
    void Visit(const dialect::Expr& expression) // no deeper than kMaxDepth
    {
        if (!found_ && expression.operation == dialect::Operation::Column && !IsKnown(expression))
            found_ = PlaceOfColumn(expression);
        for (const dialect::Expr& argument : expression.arguments)
            Visit(argument);
    }

    bool IsKnown(const dialect::Expr& column)
    {
        const bool isAlias = column.table.isEmpty() &&
                             std::ranges::any_of(select_.columns, [&column](const dialect::SelectColumn& one) {
                                 return dialect::SameName(one.alias, column.text);
                             });
        return isAlias || std::ranges::any_of(select_.from, [&](const dialect::FromTable& from) {
                   const QString& source = from.alias.isEmpty() ? from.table : from.alias;
                   const bool isMeant = column.table.isEmpty() || dialect::SameName(source, column.table);
                   return isMeant && HasField(from.table, column.text);
               });
    }

    bool HasField(const QString& table, const QString& name)
    {
        const qsizetype known = lists_.Tables().indexOf(
            QRegularExpression(QRegularExpression::anchoredPattern(QRegularExpression::escape(table)),
                               QRegularExpression::CaseInsensitiveOption));
        const std::vector<FieldLists::Field>& fields = lists_.FieldsOf(lists_.Tables()[known]);
        return std::ranges::any_of(
            fields, [&name](const FieldLists::Field& field) { return dialect::SameName(field.name, name); });
    }

    // The column's name, behind that of its table.
    StatementPlace PlaceOfColumn(const dialect::Expr& column) const
    {
        const QStringView whole = statement_.sliced(column.place.begin, column.place.end - column.place.begin);
        dialect::Lexer lexer(whole);
        Token last;
        for (Token token = lexer.Next(); token.kind != TokenKind::End; token = lexer.Next())
            last = token;
        return {column.place.begin + last.begin, last.end - last.begin};
    }

    QStringView statement_;
    const dialect::Select& select_;
    FieldLists& lists_;
    std::optional<StatementPlace> found_;
};

} // namespace

std::vector<StatementMark> MarksOfLine(QStringView line, QChar& open)
{
    std::vector<StatementMark> marks;
    dialect::Lexer lexer(line);
    if (!open.isNull()) {
        const qsizetype end = EndOfOpen(line, open);
        marks.push_back({KindOfOpen(open), 0, end < 0 ? line.size() : end});
        if (end < 0)
            return marks;
        lexer.GoTo(end);
        open = QChar();
    }
    for (Token token = lexer.Next(); token.kind != TokenKind::End; token = lexer.Next()) {
        std::optional<MarkKind> kind = KindOf(token);
        if (token.kind == TokenKind::Fault && !token.quote.isNull()) {
            open = token.quote;
            kind = KindOfOpen(open);
        }
        if (kind)
            marks.push_back({*kind, token.begin, token.end - token.begin});
    }
    return marks;
}

std::optional<StatementPlace> FaultPlace(const QString& statement, const QString& context, FieldLists& lists)
{
    const dialect::ParseResult parsed = dialect::ParseStatement(statement);
    if (const auto* failure = std::get_if<dialect::Failure>(&parsed)) {
        if (failure->at < 0)
            return std::nullopt;
        dialect::Lexer lexer(statement);
        lexer.GoTo(std::min(failure->at, statement.size()));
        const Token token = lexer.Next();
        return StatementPlace{token.begin, token.end - token.begin};
    }
    const auto* select = std::get_if<dialect::Select>(&std::get<dialect::Statement>(parsed));
    if (select) {
        if (const std::optional<StatementPlace> unknown = NameSearch(statement, *select, lists).FirstUnknown())
            return unknown;
    }
    static const QRegularExpression quoted(u"\"([^\"]+)\""_s);
    const QRegularExpressionMatch match = quoted.match(context);
    return match.hasMatch() ? PlaceOfName(statement, match.captured(1)) : std::nullopt;
}

} // namespace mirel
