#include "provider/sqlite/transaction.h"

#include "resources/string_table.h"

namespace mirel::sqlite {

Outcome ReadTransaction::Begin()
{
    if (file_.InTransaction())
        return {};
    Outcome outcome = file_.Execute("BEGIN");
    own_ = outcome.Ok();
    return outcome;
}

Outcome ReadTransaction::End()
{
    if (!own_)
        return {};
    own_ = false;
    if (!file_.InTransaction())
        return {};
    Outcome outcome = file_.Execute("COMMIT");
    if (!outcome.Ok())
        (void)file_.Execute("ROLLBACK");
    return outcome;
}

Outcome WriteTransaction::Begin()
{
    const bool nested = file_.InTransaction();
    Outcome outcome = file_.Execute(nested ? "SAVEPOINT mirel" : "BEGIN IMMEDIATE");
    if (outcome.Ok())
        state_ = nested ? State::Nested : State::Outermost;
    return outcome;
}

Outcome WriteTransaction::Commit()
{
    if (!file_.InTransaction()) { // a full disk or a failing device took everything back
        state_ = State::Idle;
        return {Hr::Unexpected, StringText(Str::BulkRunUndone, {file_.Path()})};
    }
    Outcome outcome = file_.Execute(state_ == State::Nested ? "RELEASE mirel" : "COMMIT");
    if (outcome.Ok())
        state_ = State::Idle;
    return outcome;
}

void WriteTransaction::Undo()
{
    if (state_ == State::Idle || !file_.InTransaction())
        return;
    if (state_ == State::Outermost) {
        (void)file_.Execute("ROLLBACK");
    } else {
        (void)file_.Execute("ROLLBACK TO mirel");
        (void)file_.Execute("RELEASE mirel");
    }
    state_ = State::Idle;
}

} // namespace mirel::sqlite
