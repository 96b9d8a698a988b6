#pragma once

#include "provider/dialect/keywords.h"

#include <QString>

namespace mirel::dialect {

enum class TokenKind : quint8 {
    End,
    Name,          // a bare word; `keyword` says whether it is a reserved one
    BracketedName, // [Ship To], a "]" of the name doubled
    Text,          // 'O''Brien' or "so"
    Number,
    Symbol,
    Fault, // a quote or bracket never closed, a comment, a character that begins nothing
};

enum class Symbol : quint8 {
    None,
    Open,
    Close,
    Comma,
    Point,
    Semicolon,
    Star,
    Plus,
    Minus,
    Slash,
    Percent,
    Ampersand,
    Bars,
    Equal,
    NotEqual,
    Less,
    LessEqual,
    Greater,
    GreaterEqual,
};

struct Token {
    TokenKind kind = TokenKind::End;
    Keyword keyword = Keyword::None;
    Symbol symbol = Symbol::None;
    QStringView text;     // of names and texts without brackets and quotes; what is doubled inside still is
    qsizetype begin = 0;  // in the statement, from 0
    qsizetype end = 0;    // just behind it
    QChar quote;          // that closes a text or a bracketed name
    QString Text() const; // the text or name itself
};

// Cuts a statement into tokens, one at a time. Keeps views into the statement, which must outlive the tokens.
class Lexer {
public:
    explicit Lexer(QStringView statement)
        : statement_(statement)
    {
    }

    Token Next();
    // Goes to `position`, where the next token begins.
    void GoTo(qsizetype position) { position_ = position; }
    QStringView Statement() const { return statement_; }

private:
    Token Bare(Token token);
    Token Bracketed(Token token);
    Token Quoted(Token token);
    Token Number(Token token);
    Token SymbolToken(Token token);
    qsizetype ClosingQuote(QChar quote) const;
    Token Finish(Token token, TokenKind kind, qsizetype end);
    QChar At(qsizetype position) const { return position < statement_.size() ? statement_[position] : QChar(); }

    QStringView statement_;
    qsizetype position_ = 0;
};

} // namespace mirel::dialect
