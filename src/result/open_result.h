#pragma once

#include "data/db_recordset.h"
#include "data/db_transaction.h"
#include "platform/user_prompt.h"
#include "platform/yes_no_words.h"
#include "result/change_log.h"

#include <QDateTime>
#include <QString>
#include <QStringList>

#include <functional>
#include <optional>
#include <span>
#include <vector>

namespace mirel {

// A record as somebody saw it: which one, and what it held. What a question is asked about, and what a write is
// compared with.
struct SeenRecord {
    RecordId id;
    std::vector<Value> values; // of all fields of the result; empty: not looked at

    friend bool operator==(const SeenRecord&, const SeenRecord&) = default;
};

// One open result under a table view or a running form: its statement with the conditions and the order put onto
// it, its records, and the current one among them.
//
// The current record is known by its identity, never by its position alone: others add, delete and change records
// while it is open. Whatever depends on a position first calls TakeUpChanges, which finds the record where it is
// now. A record that was deleted is gone, and stays current as such until the next move, so that nothing meant for
// it ever reaches a neighbor. Every write compares the record with what was shown, in its own transaction; what
// was deleted or changed meanwhile is told, and asked about, outside of it.
//
// Records and fields count from 0. Failures are reported through the prompt unless a call says otherwise.
// Connection and prompt must outlive the result.
class OpenResult {
public:
    // A condition that a filter has put onto the base statement. Switched off, it stays in the list alone.
    struct Filter {
        QString condition;
        bool on = true;

        friend bool operator==(const Filter&, const Filter&) = default;
    };

    OpenResult(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt);
    Q_DISABLE_COPY_MOVE(OpenResult)

    // --- the statement --------------------------------------------------------------------------------------

    // Runs `statement`, which becomes the base and the current one, and stands on the first record. False, with
    // nothing open, when the provider refuses it.
    bool Open(const QString& statement);
    // The same; but when it is refused, what was open before is opened again, with its conditions and its order.
    bool OpenInstead(const QString& statement);
    // Runs `statement`, a condition or order put onto the current one. When it is refused, the one before is run
    // again, and the record that was current is current again.
    bool Rewrite(const QString& statement);
    // The current statement. The current record stays current where it still is in the result.
    bool RunAgain();
    void Close();
    bool IsOpen() const { return records_.IsOpen(); }
    quint64 Runs() const { return runs_; } // of statements; grows when the result may have other fields
    bool CanUpdate() const { return IsOpen() && records_.Lock() != LockType::ReadOnly; }
    const QString& Statement() const { return statement_; }
    const QString& BaseStatement() const { return baseStatement_; }
    const DatabaseLocation& Database() const { return database_; }
    DbConnection& Connection() const { return connection_; }

    bool AddCondition(const QString& condition);
    bool OrderBy(const QString& terms);
    bool RemoveConditions(); // back to the base statement, its order included
    // These conditions instead of those there are; the order stays, and the current record where it is still in
    // the result. Where they are refused, all is as before.
    bool Refilter(const std::vector<Filter>& filters);
    const std::vector<Filter>& Filters() const { return filters_; }
    QStringList Conditions() const; // those in force
    // Opens the same with other names in its statements: `renamed` makes one say the new ones.
    bool OpenRenamed(const std::function<QString(const QString&)>& renamed);

    // --- fields -----------------------------------------------------------------------------------------------

    std::span<const ResultField> Fields() const { return records_.Fields(); }
    int FieldCount() const { return records_.FieldCount(); }
    bool IsWritable(int field) const;
    // The field as a statement names it: with its source where the result draws on more than one.
    QString ReferenceOf(int field) const;
    // The table that the field comes from; for an expression the result's first one.
    QString TableOf(int field) const;
    // What a new record holds before anybody types: today in the date fields, No in the Yes/No fields. All else is
    // left to the store, which fills in its own keys and defaults.
    std::vector<FieldChange> NewRecordValues(const QDateTime& now) const;
    // Asks for what the table requires of a new record and `values` does not hold yet. False: the user gave up.
    [[nodiscard]] bool AskForRequired(std::vector<FieldChange>& values);

    // --- records ----------------------------------------------------------------------------------------------

    DbRecordset& Records() { return records_; }
    const DbRecordset& Records() const { return records_; }

    qint64 Count();                                             // finishes counting; 0 when not open
    std::optional<qint64> KnownCount() const { return count_; } // empty: not counted yet
    bool CountOn(int budgetMs);                                 // true once the count is known

    // Where the current record is, or was when it is gone; -1: none.
    qint64 Position() const { return position_; }
    bool IsGone() const { return records_.IsGone(); }
    // To a position, stopping at either end. False when the store fails.
    bool MoveTo(qint64 position);
    // False, and nothing reported, where the result does not hold it any more.
    bool MoveToRecord(const RecordId& id);

    // What others changed, in this program or another, since the last look: the count, where the current record
    // is, and its values unless they are kept for an edit that has begun. True when anything may look different.
    bool TakeUpChanges(ProviderRecordset::Values values = ProviderRecordset::Values::ReadAgain);

    // After a change of a long order it is the old one for a while: values are those of now, and records that are
    // gone leave as soon as they are looked at. CatchUp works on the new order for about `budgetMs`; true once it
    // is there, to be taken up like others' changes.
    bool IsBehind() const { return records_.IsBehind(); }
    bool CatchUp(int budgetMs) { return !isAsking_ && records_.CatchUp(budgetMs); }
    // How many records make an order long, for results that are opened from now on.
    static void SetLongOrder(qint64 records) { longOrder_ = records; }
    static constexpr qint64 kLongOrder = 20'000; // they are sorted in some 50 ms

    // Reads the current record's values, so that later writes and questions are about those.
    void Hold();
    // The current record as it is shown now.
    SeenRecord Seen();
    QByteArray Fingerprint(); // of that; empty without a record
    // The records from a position on, as positions were at the last look; fewer at the end. SeenFrom reads their
    // values as well, when they are few enough to be undone.
    std::vector<RecordId> IdsFrom(qint64 first, qint64 count);
    std::vector<SeenRecord> SeenFrom(qint64 first, qint64 count);

    // --- writing one record -----------------------------------------------------------------------------------

    enum class Written {
        Done,
        Refused, // LastFailure() has the words; nothing was reported
        Gone,    // deleted meanwhile; LastFailure() says so
        GaveWay, // somebody else's values are kept: the user wanted it so
    };
    // The current record. Where its values are others by now, both are shown, and the user chooses.
    Written Update(std::span<const FieldChange> values, const YesNoWords& words);
    // The record that was asked about; the one behind it becomes current, or the last one.
    Written Delete(const SeenRecord& asked, const YesNoWords& words);
    Written Add(std::span<const FieldChange> values); // the new record becomes current
    Hr LastResult() const { return result_; }
    const QString& LastFailure() const { return failure_; }

    // --- writing many records ---------------------------------------------------------------------------------

    // What a change of many records came to. Where it stopped early, the records before are written.
    struct ManyWritten {
        qint64 records = 0;    // written
        qint64 leftAlone = 0;  // others had changed or deleted them
        QString failure;       // why it stopped; empty: it did not, or the user asked for it
        int refusedField = -1; // whose value was refused; -1: it was no single one
    };
    // Each is one transaction and one step to undo. `asked` are records as SeenFrom gave them.
    ManyWritten DeleteMany(const std::vector<SeenRecord>& asked, Progress& progress);
    // `count` records: those in `asked`, then new ones. `values` is asked for each, counting from 0, when it is
    // current. Values are refused rather than cut.
    ManyWritten WriteMany(const std::vector<SeenRecord>& asked, qint64 count,
                          const std::function<std::vector<FieldChange>(qint64)>& values, Progress& progress);
    // All records, each with values of its own, at most `confirmed` of them: LastResult() is RecordChanged, and
    // nothing written, when there are more. `values` is asked for each when it is current; none stops it there.
    ManyWritten WriteAll(qint64 confirmed, const std::function<std::optional<std::vector<FieldChange>>()>& values,
                         Progress& progress);
    // One value, or none at all. They fail with RecordChanged when there are more than `confirmed`: ask again
    // then. A failure is not reported: LastResult() and LastFailure() tell it.
    bool UpdateAll(int field, const Value& value, qint64 confirmed, const BulkProgress& progress);
    bool DeleteAll(qint64 confirmed, const BulkProgress& progress);
    // Whether a change of so many fields of so many records can be taken back: they are few enough, and all of one
    // table.
    bool CanUndoAll(qint64 records, int fields) const;

    // --- the way back -----------------------------------------------------------------------------------------

    bool CanUndo() const { return log_.CanUndo(); }
    bool CanRedo() const { return log_.CanRedo(); }
    // The record that was written last becomes current, where the result holds it.
    ChangeLog::Outcome Undo();
    ChangeLog::Outcome Redo();

    void Report(); // the recordset's last failure, to the user

private:
    std::optional<Value> AskForValue(int field);
    using TurnOfLog = ChangeLog::Outcome (ChangeLog::*)(DbConnection&, const DatabaseLocation&, UserPrompt&);

    // A step that becomes too large to be kept is given up.
    class StepInProgress {
    public:
        ChangeLog::Step* ForCells(qint64 cells)
        {
            cells_ += cells;
            return IsKept() ? &step : nullptr;
        }
        bool IsKept() const { return cells_ <= ChangeLog::kMostCells; }

        ChangeLog::Step step;

    private:
        qint64 cells_ = 0;
    };

    bool Execute(const QString& statement);
    void ReturnTo(const RecordId& id, qint64 position);
    void Recount();
    void StandWhereRecordsAre();
    bool Ask(const UserMessage& question);
    Written Fail();
    Written Fail(const DbTransaction& transaction);
    Written FailAsGone();

    bool FindSeen(const SeenRecord& record, qint64 hint);
    bool HoldsAsSeen(const SeenRecord& record, std::span<const FieldChange> changes) const;
    QString MineAndTheirs(std::span<const FieldChange> mine, const YesNoWords& words) const;
    QString BeforeAndNow(const SeenRecord& before, const SeenRecord& now, const YesNoWords& words) const;

    bool UpdateCurrent(std::span<const FieldChange> values, ChangeLog::Step* step);
    bool DeleteCurrent(DbRecordset& table, ChangeLog::Step* step);
    bool AddOne(std::span<const FieldChange> values, ChangeLog::Step* step);
    ManyWritten InOneStep(const std::function<void(ManyWritten&, StepInProgress&)>& work);
    void NoteRefusal(ManyWritten& written, std::span<const FieldChange> wanted);
    std::optional<RecordChange> NewChange(RecordChange::Kind kind) const;
    void NoteDeleted(DbRecordset& table, ChangeLog::Step& step) const;
    bool ChangeAll(bool isNoted, const std::function<bool(ChangeLog::Step&)>& change);
    bool UpdateAllNoted(int field, const Value& value, qint64 confirmed, const BulkProgress& progress,
                        ChangeLog::Step& step);
    ChangeLog::Outcome Turn(TurnOfLog turn);

    static inline qint64 longOrder_ = kLongOrder;

    DbConnection& connection_;
    DbRecordset records_;
    UserPrompt& prompt_;
    DatabaseLocation database_;
    QString baseStatement_;
    QString statement_;
    std::vector<Filter> filters_;
    QString order_; // put onto the base statement; empty: its own
    quint64 runs_ = 0;
    std::optional<qint64> count_;
    quint64 generation_ = 0; // of the records, when position_ was taken
    qint64 position_ = -1;
    ChangeLog log_;
    bool isAsking_ = false; // the window lives on meanwhile, and looks for changes
    Hr result_ = Hr::Ok;
    QString failure_;
    QString lookFailure_; // why the last look for changes failed, so that it is told once
};

} // namespace mirel
