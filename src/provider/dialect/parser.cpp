#include "provider/dialect/parser.h"

#include "provider/dialect/expression_parser.h"
#include "provider/dialect/structure_parser.h"
#include "provider/dialect/token_cursor.h"

namespace mirel::dialect {
namespace {

// The statements that read and change records.
class Parser {
public:
    explicit Parser(TokenCursor& cursor)
        : cursor_(cursor)
        , expressions_(cursor)
    {
    }

    bool Parse(Select& select);
    bool Parse(Insert& insert);
    bool Parse(Update& update);
    bool Parse(Delete& remove);
    bool Parse(WholeTable& whole) { return cursor_.ExpectName(whole.table); }

private:
    bool ParseColumns(Select& select);
    bool ParseColumn(SelectColumn& column);
    bool ParseAlias(QString& alias);
    bool ParseFrom(Select& select);
    bool ParseFromTable(FromTable& table);
    bool ParseJoin(FromTable& table, bool& more);
    bool ParseGroup(Select& select);
    bool ParseOrder(Select& select);
    bool ParseInsertColumns(Insert& insert);
    bool ParseColumnName(ColumnName& column);
    bool ParseWhere(std::optional<Expr>& where);
    bool ParseExpression(Expr& expression) { return expressions_.Parse(expression); }

    TokenCursor& cursor_;
    ExpressionParser expressions_;
};

bool Parser::Parse(Select& select)
{
    cursor_.Advance();
    select.distinct = cursor_.Take(Keyword::Distinct);
    return ParseColumns(select) && ParseFrom(select) && ParseWhere(select.where) && ParseGroup(select) &&
           ParseOrder(select);
}

bool Parser::ParseColumns(Select& select)
{
    do {
        if (!ParseColumn(select.columns.emplace_back()))
            return false;
    } while (cursor_.Take(Symbol::Comma));
    return true;
}

bool Parser::ParseColumn(SelectColumn& column)
{
    const qsizetype begin = cursor_.Current().begin;
    if (cursor_.Take(Symbol::Star)) {
        column.expression.operation = Operation::AllColumns;
        return true;
    }
    const TokenCursor mark = cursor_;
    QString table;
    if (cursor_.AtName() && cursor_.ExpectName(table) && cursor_.Take(Symbol::Point) &&
        cursor_.Take(Symbol::Star)) {
        column.expression.operation = Operation::AllColumns;
        column.expression.table = table;
        return true;
    }
    cursor_ = mark;
    if (!ParseExpression(column.expression))
        return false;
    column.name.text = cursor_.TextFrom(begin);
    return ParseAlias(column.alias);
}

bool Parser::ParseAlias(QString& alias)
{
    if (cursor_.Take(Keyword::As) || cursor_.AtName())
        return cursor_.ExpectName(alias);
    return true;
}

bool Parser::ParseFrom(Select& select)
{
    if (!cursor_.Take(Keyword::From))
        return true;
    // Joins may be put in parentheses from the left; they mean the same without.
    int open = 0;
    while (cursor_.Take(Symbol::Open))
        ++open;
    if (!ParseFromTable(select.from.emplace_back()))
        return false;
    for (bool more = true; more;) {
        if (open > 0 && cursor_.Take(Symbol::Close)) {
            --open;
            continue;
        }
        FromTable table;
        if (!ParseJoin(table, more))
            return false;
        if (more)
            select.from.push_back(std::move(table));
    }
    return open == 0 || cursor_.Fail();
}

bool Parser::ParseFromTable(FromTable& table)
{
    return cursor_.ExpectName(table.table) && ParseAlias(table.alias);
}

bool Parser::ParseJoin(FromTable& table, bool& more)
{
    more = true;
    if (cursor_.Take(Symbol::Comma)) {
        table.join = JoinKind::Cross;
        return ParseFromTable(table);
    }
    if (cursor_.Take(Keyword::Inner) || cursor_.At(Keyword::Join)) {
        table.join = JoinKind::Inner;
    } else if (cursor_.Take(Keyword::Left)) {
        table.join = JoinKind::Left;
        cursor_.TakeWord(u"OUTER");
    } else {
        more = false;
        return true;
    }
    return cursor_.Expect(Keyword::Join) && ParseFromTable(table) && cursor_.Expect(Keyword::On) &&
           ParseExpression(table.on.emplace());
}

bool Parser::ParseWhere(std::optional<Expr>& where)
{
    return !cursor_.Take(Keyword::Where) || ParseExpression(where.emplace());
}

bool Parser::ParseGroup(Select& select)
{
    if (cursor_.Take(Keyword::Group)) {
        if (!cursor_.Expect(Keyword::By))
            return false;
        do {
            if (!ParseExpression(select.group.emplace_back()))
                return false;
        } while (cursor_.Take(Symbol::Comma));
    }
    return !cursor_.Take(Keyword::Having) || ParseExpression(select.having.emplace());
}

bool Parser::ParseOrder(Select& select)
{
    if (!cursor_.Take(Keyword::Order))
        return true;
    if (!cursor_.Expect(Keyword::By))
        return false;
    do {
        OrderTerm& term = select.order.emplace_back();
        if (!ParseExpression(term.expression))
            return false;
        term.descending = cursor_.Take(Keyword::Desc);
        if (!term.descending)
            cursor_.Take(Keyword::Asc);
    } while (cursor_.Take(Symbol::Comma));
    return true;
}

bool Parser::ParseColumnName(ColumnName& column)
{
    if (!cursor_.ExpectName(column.name))
        return false;
    if (!cursor_.Take(Symbol::Point))
        return true;
    column.table = std::exchange(column.name, {});
    return cursor_.ExpectName(column.name);
}

// "(a,b)", and "[(a,b)]": a form's insert button puts its list into brackets as if it were a name.
bool Parser::ParseInsertColumns(Insert& insert)
{
    const bool bracketed = cursor_.TakeText(u"[(");
    if (!bracketed && !cursor_.Take(Symbol::Open))
        return true;
    do {
        if (!ParseColumnName(insert.columns.emplace_back()))
            return false;
    } while (cursor_.Take(Symbol::Comma));
    return bracketed && cursor_.TakeText(u")]") ? true : cursor_.Expect(Symbol::Close);
}

bool Parser::Parse(Insert& insert)
{
    cursor_.Advance();
    if (!cursor_.Expect(Keyword::Into) || !cursor_.ExpectName(insert.table) || !ParseInsertColumns(insert) ||
        !cursor_.Expect(Keyword::Values) || !cursor_.Expect(Symbol::Open)) {
        return false;
    }
    do {
        if (!ParseExpression(insert.values.emplace_back()))
            return false;
    } while (cursor_.Take(Symbol::Comma));
    return cursor_.Expect(Symbol::Close);
}

bool Parser::Parse(Update& update)
{
    cursor_.Advance();
    if (!cursor_.ExpectName(update.table) || !cursor_.Expect(Keyword::Set))
        return false;
    do {
        Assignment& assignment = update.assignments.emplace_back();
        if (!ParseColumnName(assignment.column) || !cursor_.Expect(Symbol::Equal) ||
            !ParseExpression(assignment.value)) {
            return false;
        }
    } while (cursor_.Take(Symbol::Comma));
    return ParseWhere(update.where);
}

bool Parser::Parse(Delete& remove)
{
    cursor_.Advance();
    cursor_.Take(Symbol::Star);
    return cursor_.Expect(Keyword::From) && cursor_.ExpectName(remove.table) && ParseWhere(remove.where);
}

template <typename Kind>
ParseResult ParseAs(TokenCursor& cursor)
{
    Kind kind;
    Parser parser(cursor);
    const bool parsed = parser.Parse(kind);
    cursor.Take(Symbol::Semicolon);
    if (parsed && cursor.Current().kind == TokenKind::End && !cursor.Failed())
        return Statement(std::move(kind));
    cursor.Fail();
    return cursor.Fault();
}

} // namespace

ParseResult ParseStatement(QStringView text)
{
    TokenCursor cursor(text);
    switch (cursor.Current().keyword) {
    case Keyword::Select:
        return ParseAs<Select>(cursor);
    case Keyword::Insert:
        return ParseAs<Insert>(cursor);
    case Keyword::Update:
        return ParseAs<Update>(cursor);
    case Keyword::Delete:
        return ParseAs<Delete>(cursor);
    case Keyword::Create:
    case Keyword::Drop:
    case Keyword::Alter:
        return ParseStructureStatement(cursor);
    default:
        return ParseAs<WholeTable>(cursor);
    }
}

bool BeginsAsStatement(QStringView text)
{
    switch (Lexer(text).Next().keyword) {
    case Keyword::Select:
    case Keyword::Insert:
    case Keyword::Update:
    case Keyword::Delete:
    case Keyword::Create:
    case Keyword::Drop:
    case Keyword::Alter:
        return true;
    default:
        return false;
    }
}

} // namespace mirel::dialect
