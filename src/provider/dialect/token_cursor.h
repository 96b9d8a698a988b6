#pragma once

#include "provider/dialect/failure.h"
#include "provider/dialect/lexer.h"
#include "provider/dialect/place.h"

namespace mirel::dialect {

// The token that a parser looks at, and the fault that stopped it. What fails returns false; the first fault
// stays. Statements over the bounds fail like any other fault, so that no text costs more than its share.
class TokenCursor {
public:
    // `statement` must outlive the cursor.
    explicit TokenCursor(QStringView statement);

    const Token& Current() const { return current_; }
    // What stands from there to the end of the token before the current one.
    QString TextFrom(qsizetype begin) const
    {
        return lexer_.Statement().sliced(begin, previousEnd_ - begin).toString();
    }
    void Advance();

    bool At(Symbol symbol) const { return current_.symbol == symbol; }
    bool At(Keyword keyword) const { return current_.keyword == keyword; }
    // A word that is not reserved but means something in its place: ADD, TO, TABLE.
    bool AtWord(QStringView upperCase) const;
    bool AtName() const; // a bare or bracketed name

    // Each steps over the token when it is the wanted one.
    bool Take(Symbol symbol) { return At(symbol) && Step(); }
    bool Take(Keyword keyword) { return At(keyword) && Step(); }
    bool TakeWord(QStringView upperCase) { return AtWord(upperCase) && Step(); }
    // Steps over `opening`, "[(" for one, where the text goes on with just that.
    bool TakeText(QStringView opening);

    // The same, but anything else is a fault.
    [[nodiscard]] bool Expect(Symbol symbol) { return Take(symbol) || Fail(); }
    [[nodiscard]] bool Expect(Keyword keyword) { return Take(keyword) || Fail(); }
    [[nodiscard]] bool ExpectWord(QStringView upperCase) { return TakeWord(upperCase) || Fail(); }
    [[nodiscard]] bool ExpectName(QString& name);
    // A name that this statement makes: a bracket in it is a fault, because few programs could say it.
    [[nodiscard]] bool ExpectNewName(QString& name);
    [[nodiscard]] bool ExpectText(QString& text);

    // Each is always false. Without a code: a syntax error, at the current token or at `place`.
    bool Fail();
    bool Fail(Place place);
    bool Fail(Hr code);
    bool FailTooDeep(qsizetype at);
    bool Failed() const { return failed_; }
    const Failure& Fault() const { return failure_; }

private:
    bool Step()
    {
        Advance();
        return true;
    }
    bool Keep(Failure failure);

    Lexer lexer_;
    Token current_;
    qsizetype previousEnd_ = 0;
    int tokens_ = 0;
    bool failed_ = false;
    Failure failure_;
};

} // namespace mirel::dialect
