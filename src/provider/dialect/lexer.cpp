#include "provider/dialect/lexer.h"

#include <array>

namespace mirel::dialect {
namespace {

bool IsBlank(QChar unit)
{
    return unit == u' ' || (unit >= u'\t' && unit <= u'\r') || unit.isSpace();
}

bool IsDigit(QChar unit)
{
    return unit >= u'0' && unit <= u'9';
}

// Letters of any language; a surrogate can only be half of a letter here, or the name is simply not found.
bool BeginsName(QChar unit)
{
    return unit.isLetter() || unit == u'_' || unit.isSurrogate();
}

bool ContinuesName(QChar unit)
{
    return unit.isLetterOrNumber() || unit == u'_' || unit == u'$' || unit.isSurrogate() || unit.isMark();
}

struct SymbolRow {
    QStringView spelling; // longer ones first
    Symbol symbol;
};

constexpr std::array kSymbols = {
    SymbolRow{u"<>", Symbol::NotEqual},  SymbolRow{u"!=", Symbol::NotEqual},
    SymbolRow{u"<=", Symbol::LessEqual}, SymbolRow{u">=", Symbol::GreaterEqual},
    SymbolRow{u"||", Symbol::Bars},      SymbolRow{u"(", Symbol::Open},
    SymbolRow{u")", Symbol::Close},      SymbolRow{u",", Symbol::Comma},
    SymbolRow{u".", Symbol::Point},      SymbolRow{u"=", Symbol::Equal},
    SymbolRow{u"<", Symbol::Less},       SymbolRow{u">", Symbol::Greater},
    SymbolRow{u"*", Symbol::Star},       SymbolRow{u"+", Symbol::Plus},
    SymbolRow{u"-", Symbol::Minus},      SymbolRow{u"/", Symbol::Slash},
    SymbolRow{u"%", Symbol::Percent},    SymbolRow{u"&", Symbol::Ampersand},
    SymbolRow{u";", Symbol::Semicolon},
};

} // namespace

QString Token::Text() const
{
    QString value = text.toString();
    if (!quote.isNull() && text.contains(quote))
        value.replace(QString(2, quote), QString(quote));
    return value;
}

Token Lexer::Finish(Token token, TokenKind kind, qsizetype end)
{
    token.kind = kind;
    token.end = end;
    if (token.text.isNull())
        token.text = statement_.sliced(token.begin, end - token.begin);
    position_ = end;
    return token;
}

Token Lexer::Next()
{
    while (position_ < statement_.size() && IsBlank(statement_[position_]))
        ++position_;
    Token token;
    token.begin = token.end = position_;
    if (position_ == statement_.size())
        return token;
    const QChar first = statement_[position_];
    if (BeginsName(first))
        return Bare(token);
    if (first == u'[')
        return Bracketed(token);
    if (first == u'\'' || first == u'"')
        return Quoted(token);
    if (IsDigit(first) || (first == u'.' && IsDigit(At(position_ + 1))))
        return Number(token);
    return SymbolToken(token);
}

Token Lexer::Bare(Token token)
{
    qsizetype end = position_;
    while (end < statement_.size() && ContinuesName(statement_[end]))
        ++end;
    token = Finish(token, TokenKind::Name, end);
    token.keyword = FindKeyword(token.text);
    return token;
}

Token Lexer::Bracketed(Token token)
{
    token.quote = u']';
    const qsizetype close = ClosingQuote(token.quote);
    const QStringView name = close < 0 ? QStringView() : statement_.sliced(position_ + 1, close - position_ - 1);
    if (name.isEmpty() || name.contains(QChar(u'\0')))
        return Finish(token, TokenKind::Fault, statement_.size());
    token.text = name;
    return Finish(token, TokenKind::BracketedName, close + 1);
}

// Behind the current position, where a doubled one is part of the text. -1: it is never closed.
qsizetype Lexer::ClosingQuote(QChar quote) const
{
    for (qsizetype at = position_ + 1;; at += 2) {
        at = statement_.indexOf(quote, at);
        if (at < 0 || At(at + 1) != quote)
            return at;
    }
}

Token Lexer::Quoted(Token token)
{
    token.quote = statement_[position_];
    const qsizetype close = ClosingQuote(token.quote);
    if (close < 0)
        return Finish(token, TokenKind::Fault, statement_.size());
    token.text = statement_.sliced(position_ + 1, close - position_ - 1);
    return Finish(token, TokenKind::Text, close + 1);
}

Token Lexer::Number(Token token)
{
    qsizetype end = position_;
    const auto skipDigits = [&] {
        while (IsDigit(At(end)))
            ++end;
    };
    skipDigits();
    if (At(end) == u'.') {
        ++end;
        skipDigits();
    }
    if (At(end) == u'e' || At(end) == u'E') {
        const QChar sign = At(end + 1);
        const qsizetype digits = end + (sign == u'+' || sign == u'-' ? 2 : 1);
        if (IsDigit(At(digits))) {
            end = digits;
            skipDigits();
        }
    }
    // "12abc" is neither a number nor a name.
    return Finish(token, BeginsName(At(end)) ? TokenKind::Fault : TokenKind::Number, end);
}

Token Lexer::SymbolToken(Token token)
{
    const QStringView rest = statement_.sliced(position_);
    if (rest.startsWith(u"--") || rest.startsWith(u"/*")) // comments: refused, and never taken for two signs
        return Finish(token, TokenKind::Fault, position_ + 2);
    for (const SymbolRow& row : kSymbols) {
        if (rest.startsWith(row.spelling)) {
            token.symbol = row.symbol;
            return Finish(token, TokenKind::Symbol, position_ + row.spelling.size());
        }
    }
    return Finish(token, TokenKind::Fault, position_ + 1);
}

} // namespace mirel::dialect
