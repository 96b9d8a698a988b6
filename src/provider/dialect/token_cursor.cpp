#include "provider/dialect/token_cursor.h"

#include "resources/string_table.h"

namespace mirel::dialect {
namespace {

// Room for filters that have added up to thousands of conditions, and for long texts in an INSERT.
constexpr qsizetype kMaxUnits = 48 << 20;
constexpr int kMaxTokens = 200000;

} // namespace

TokenCursor::TokenCursor(QStringView statement)
    : lexer_(statement.size() <= kMaxUnits ? statement : QStringView())
{
    if (statement.size() > kMaxUnits)
        Keep({Hr::SyntaxError, StringText(Str::StatementTooLong)});
    else
        Advance();
}

void TokenCursor::Advance()
{
    if (failed_)
        return;
    previousEnd_ = current_.end;
    current_ = lexer_.Next();
    if (++tokens_ > kMaxTokens) {
        Keep({Hr::SyntaxError, StringText(Str::StatementTooLong)});
        current_ = Token();
    }
}

bool TokenCursor::AtWord(QStringView upperCase) const
{
    return current_.kind == TokenKind::Name && current_.text.compare(upperCase, Qt::CaseInsensitive) == 0;
}

bool TokenCursor::AtName() const
{
    return current_.kind == TokenKind::BracketedName ||
           (current_.kind == TokenKind::Name && current_.keyword == Keyword::None);
}

bool TokenCursor::TakeText(QStringView opening)
{
    if (!lexer_.Statement().sliced(current_.begin).startsWith(opening))
        return false;
    lexer_.GoTo(current_.begin + opening.size());
    return Step();
}

bool TokenCursor::ExpectName(QString& name)
{
    if (!AtName())
        return Fail();
    name = current_.Text();
    return Step();
}

bool TokenCursor::ExpectNewName(QString& name)
{
    if (!AtName())
        return Fail();
    name = current_.Text();
    return name.startsWith(u'[') || name.contains(u']') ? Fail() : Step();
}

bool TokenCursor::ExpectText(QString& text)
{
    if (current_.kind != TokenKind::Text)
        return Fail();
    text = current_.Text();
    return Step();
}

bool TokenCursor::Fail()
{
    return Fail({current_.begin, current_.end});
}

bool TokenCursor::Fail(Place place)
{
    if (place.begin == place.end)
        return Keep({Hr::SyntaxError, StringText(Str::SyntaxErrorAtEnd), place.begin});
    constexpr qsizetype kShown = 30;
    const QStringView there = lexer_.Statement().sliced(place.begin, place.end - place.begin);
    return Keep(
        {Hr::SyntaxError,
         StringText(Str::SyntaxErrorNear, {QString::number(place.begin + 1), there.left(kShown).toString()}),
         place.begin});
}

bool TokenCursor::Fail(Hr code)
{
    return Keep({code, {}});
}

bool TokenCursor::FailTooDeep(qsizetype at)
{
    return Keep({Hr::SyntaxError, StringText(Str::SyntaxTooDeep, {QString::number(at + 1)}), at});
}

bool TokenCursor::Keep(Failure failure)
{
    if (!failed_)
        failure_ = std::move(failure);
    failed_ = true;
    return false;
}

} // namespace mirel::dialect
