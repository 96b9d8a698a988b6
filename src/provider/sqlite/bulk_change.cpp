#include "provider/sqlite/bulk_change.h"

#include "provider/sqlite/sql_writer.h"
#include "provider/sqlite/transaction.h"

namespace mirel::sqlite {
namespace {

// Pages that a deletion frees are not overwritten with zeros while it runs: that would double the work.
class FreedPagesStay {
public:
    explicit FreedPagesStay(DatabaseFile& file)
        : file_(file)
        , was_(Ask("PRAGMA secure_delete"))
    {
        Ask("PRAGMA secure_delete=0");
    }
    ~FreedPagesStay() { Ask("PRAGMA secure_delete=" + QByteArray::number(was_)); }
    Q_DISABLE_COPY_MOVE(FreedPagesStay)

private:
    // The engine obeys, and takes the answer, when it prepares the statement: one that was kept would do nothing.
    int Ask(const QByteArray& pragma) const
    {
        sqlite3_stmt* raw = nullptr;
        sqlite3_prepare_v2(file_.Handle(), pragma.constData(), int(pragma.size()), &raw, nullptr);
        const StatementPtr statement(raw);
        return sqlite3_step(raw) == SQLITE_ROW ? sqlite3_column_int(raw, 0) : 0;
    }

    DatabaseFile& file_;
    int was_;
};

// What a record or its value may be refused for, as opposed to a file that cannot be written.
bool IsRefusal(const Outcome& outcome)
{
    return outcome.code == Hr::IntegrityViolation || outcome.code == Hr::BadLiteral ||
           outcome.code == Hr::Overflow;
}

} // namespace

QByteArray BulkChange::Within(const QByteArray& condition) const
{
    const QByteArray range = alias_ + '.' + writer_.RowId() + " BETWEEN ?1 AND ?2";
    return " WHERE " + (condition.isEmpty() ? range : range + " AND (" + condition + ')');
}

Outcome BulkChange::Update(const BulkRanges& ranges, const FieldChange& change, const BulkProgress& progress)
{
    Value value;
    if (Outcome outcome = writer_.Convert(change, value); !outcome.Ok())
        return outcome;
    file_.NoteValues();
    // FAIL keeps the records of a piece that were changed before the refused one.
    return Run("UPDATE OR FAIL " + Target() + " SET " + writer_.ColumnOf(change.field) + "=?3" +
                   Within(ranges.condition),
               ranges, progress, &value);
}

Outcome BulkChange::Delete(const BulkRanges& ranges, const BulkProgress& progress)
{
    const FreedPagesStay faster(file_);
    if (ranges.isWholeTable && !HasTriggers())
        return DeleteWhole(ranges, progress);
    return Run("DELETE FROM " + Target() + Within(ranges.condition), ranges, progress, nullptr);
}

bool BulkChange::HasTriggers() const
{
    return file_.Number("SELECT count(*) FROM sqlite_schema WHERE type='trigger' AND lower(tbl_name)=lower(" +
                        QuoteText(writer_.TableName()) + ')') > 0;
}

// The engine drops all pages of the table at once, in a twentieth of the time that its records would take; there
// is nothing to be stopped on the way.
Outcome BulkChange::DeleteWhole(const BulkRanges& ranges, const BulkProgress& progress)
{
    if (progress && !progress(0))
        return {};
    Outcome outcome = file_.Execute("DELETE FROM " + writer_.Table());
    if (outcome.Ok() && progress)
        (void)progress(ranges.count);
    return outcome;
}

Outcome BulkChange::Run(const QByteArray& sql, const BulkRanges& ranges, const BulkProgress& progress,
                        const Value* value)
{
    WriteTransaction transaction(file_);
    if (Outcome outcome = transaction.Begin(); !outcome.Ok())
        return outcome;
    const Outcome outcome = RunRanges(sql, ranges, progress, value);
    if (!outcome.Ok() && !IsRefusal(outcome))
        return outcome;
    const Outcome committed = transaction.Commit();
    return committed.Ok() ? outcome : committed;
}

Outcome BulkChange::RunRanges(const QByteArray& sql, const BulkRanges& ranges, const BulkProgress& progress,
                              const Value* value)
{
    Outcome outcome;
    Statement statement = file_.Prepare(sql, outcome);
    if (!statement)
        return outcome;
    if (value)
        statement.Bind(3, *value);
    qint64 done = 0;
    qint64 told = 0;
    for (const RowIdIndex::Range& range : ranges.ranges) {
        statement.Bind(1, range.first);
        statement.Bind(2, range.last);
        const int result = statement.Step();
        if (result != SQLITE_DONE)
            return file_.OutcomeOf(result);
        statement.Reset();
        done += sqlite3_changes64(file_.Handle());
        if (done - told >= RowIdIndex::kStep || &range == &ranges.ranges.back()) {
            told = done;
            if (progress && !progress(done))
                break;
        }
    }
    return {};
}

} // namespace mirel::sqlite
