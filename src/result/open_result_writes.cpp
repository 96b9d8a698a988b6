#include "data/catalog.h"
#include "data/provider_error.h"
#include "provider/cell_value.h"
#include "provider/conversion.h"
#include "resources/string_table.h"
#include "result/cell_text.h"
#include "result/open_result.h"

#include <algorithm>

// What an open result writes: one record, many, all; and the way back.

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qint64 kTellEvery = 64;
constexpr qsizetype kMostShown = 80; // characters of a value in a question

QString Shown(const Value& value, FieldType type, const YesNoWords& words)
{
    return CutForGrid(DisplayText(value, type, words), kMostShown);
}

} // namespace

OpenResult::Written OpenResult::Fail()
{
    result_ = records_.LastResult();
    failure_ = ProviderErrorText(&records_, result_, records_.ErrorContext());
    return Written::Refused;
}

OpenResult::Written OpenResult::Fail(const DbTransaction& transaction)
{
    result_ = transaction.LastResult();
    failure_ = ProviderErrorText(nullptr, result_, transaction.ErrorContext());
    return Written::Refused;
}

OpenResult::Written OpenResult::FailAsGone()
{
    result_ = Hr::NoCurrentRecord;
    failure_ = StringText(Str::RecordDeletedMeanwhile);
    return Written::Gone;
}

// No transaction is open: others may go on while the user thinks.
bool OpenResult::Ask(const UserMessage& question)
{
    isAsking_ = true;
    const bool answer = prompt_.AskYesNo(question);
    isAsking_ = false;
    return answer;
}

// --- one record
// ---------------------------------------------------------------------------------------------------

// Of the fields that are to be written: what they hold by now, and what they would.
QString OpenResult::MineAndTheirs(std::span<const FieldChange> mine, const YesNoWords& words) const
{
    QString lines;
    for (const FieldChange& change : mine) {
        const FieldType type = records_.TypeOfField(change.field);
        const Value theirs = records_.FieldValue(change.field);
        if (theirs != change.value) {
            lines += StringText(Str::KeepMineField, {records_.FieldName(change.field), Shown(theirs, type, words),
                                                     Shown(change.value, type, words)});
        }
    }
    return lines;
}

QString OpenResult::BeforeAndNow(const SeenRecord& before, const SeenRecord& now, const YesNoWords& words) const
{
    QString lines;
    for (size_t field = 0; field < now.values.size() && field < before.values.size(); ++field) {
        const FieldType type = records_.TypeOfField(int(field));
        if (now.values[field] != before.values[field]) {
            lines += StringText(Str::ChangedField,
                                {records_.FieldName(int(field)), Shown(now.values[field], type, words),
                                 Shown(before.values[field], type, words)});
        }
    }
    return lines;
}

OpenResult::Written OpenResult::Update(std::span<const FieldChange> values, const YesNoWords& words)
{
    const RecordId id = records_.Id();
    for (;;) {
        ChangeLog::Step step;
        if (UpdateCurrent(values, &step)) {
            log_.Add(std::move(step));
            StandWhereRecordsAre();
            return Written::Done;
        }
        if (records_.LastResult() == Hr::NoCurrentRecord)
            return FailAsGone();
        if (records_.LastResult() != Hr::RecordChanged)
            return Fail();
        if (!records_.TakeUpChanges())
            return Fail();
        if (records_.IsGone())
            return FailAsGone();
        const bool keepsMine = Ask({Str::KeepMineQuestion, {MineAndTheirs(values, words)}});
        if (records_.Id() != id && !records_.MoveToRecord(id))
            return FailAsGone();
        if (!keepsMine) {
            StandWhereRecordsAre();
            return Written::GaveWay;
        }
    }
}

OpenResult::Written OpenResult::Delete(const SeenRecord& asked, const YesNoWords& words)
{
    SeenRecord expected = asked;
    DbRecordset table(connection_);
    for (;;) {
        if ((records_.Id() != asked.id || records_.IsGone()) && !records_.MoveToRecord(asked.id))
            return FailAsGone();
        if (!records_.TakeUpChanges())
            return Fail();
        if (records_.IsGone())
            return FailAsGone();
        const SeenRecord now = Seen();
        if (now.values != expected.values) {
            if (!Ask({Str::DeleteChangedQuestion, {BeforeAndNow(expected, now, words)}})) {
                StandWhereRecordsAre();
                return Written::GaveWay;
            }
            expected = now;
            continue;
        }
        DbTransaction transaction(connection_, database_);
        if (!transaction.Begin())
            return Fail(transaction);
        ChangeLog::Step step;
        if (DeleteCurrent(table, &step)) {
            if (!transaction.Commit())
                return Fail(transaction);
            log_.Add(std::move(step));
            break;
        }
        if (records_.LastResult() != Hr::RecordChanged && records_.LastResult() != Hr::NoCurrentRecord)
            return Fail();
    }
    if (records_.IsEof() && !records_.MoveLast())
        Report();
    StandWhereRecordsAre();
    return Written::Done;
}

OpenResult::Written OpenResult::Add(std::span<const FieldChange> values)
{
    ChangeLog::Step step;
    if (!AddOne(values, &step))
        return Fail();
    log_.Add(std::move(step));
    count_.reset();
    (void)Count();
    position_ = records_.Position();
    return Written::Done;
}

// --- many records
// -------------------------------------------------------------------------------------------------

// To a record that was seen at `hint`, or somewhere else by now.
bool OpenResult::FindSeen(const SeenRecord& record, qint64 hint)
{
    return (hint >= 0 && records_.MoveTo(hint) && records_.Id() == record.id) || records_.MoveToRecord(record.id);
}

// The fields that are to be changed, all of them when none is named, hold what was seen. Values that were not
// looked at hold.
bool OpenResult::HoldsAsSeen(const SeenRecord& record, std::span<const FieldChange> changes) const
{
    const auto holds = [&](int field) { return records_.FieldValue(field) == record.values[size_t(field)]; };
    if (record.values.empty())
        return true;
    if (!changes.empty())
        return std::ranges::all_of(changes, [&](const FieldChange& change) { return holds(change.field); });
    for (int field = 0; field < int(record.values.size()); ++field) {
        if (!holds(field))
            return false;
    }
    return true;
}

// One transaction and one step to undo. Once the step is too large, nothing from before can be taken back any
// more.
OpenResult::ManyWritten OpenResult::InOneStep(const std::function<void(ManyWritten&, StepInProgress&)>& work)
{
    DbTransaction transaction(connection_, database_);
    if (!transaction.Begin()) {
        Fail(transaction);
        return {.failure = failure_};
    }
    ManyWritten written;
    StepInProgress progress;
    result_ = Hr::Ok;
    work(written, progress);
    if (!transaction.Commit()) {
        Fail(transaction);
        written = {.leftAlone = written.leftAlone, .failure = failure_};
    } else if (progress.IsKept()) {
        log_.Add(std::move(progress.step));
    } else if (written.records > 0) {
        log_.Clear();
    }
    StandWhereRecordsAre();
    return written;
}

void OpenResult::NoteRefusal(ManyWritten& written, std::span<const FieldChange> wanted)
{
    Fail();
    written.failure = failure_;
    const auto refused = std::ranges::find_if(wanted, [this](const FieldChange& change) {
        Value converted;
        return Failed(ConvertForColumn(change.value, records_.TypeOfField(change.field),
                                       records_.FieldSize(change.field), converted));
    });
    if (refused != wanted.end())
        written.refusedField = refused->field;
}

OpenResult::ManyWritten OpenResult::DeleteMany(const std::vector<SeenRecord>& asked, Progress& progress)
{
    return InOneStep([&](ManyWritten& written, StepInProgress& noted) {
        DbRecordset table(connection_);
        const qint64 first = !asked.empty() && records_.MoveToRecord(asked.front().id) ? records_.Position() : -1;
        // From the last to the first, so that those still to go keep their places.
        for (qint64 done = 0; done < qint64(asked.size()) && written.failure.isEmpty(); ++done) {
            if (done % kTellEvery == 0 && !progress.Advance(done))
                break;
            const size_t at = asked.size() - 1 - size_t(done);
            if (!FindSeen(asked[at], first < 0 ? -1 : first + qint64(at)) || !HoldsAsSeen(asked[at], {}))
                ++written.leftAlone;
            else if (DeleteCurrent(table, noted.ForCells(FieldCount())))
                ++written.records;
            else
                NoteRefusal(written, {});
        }
    });
}

OpenResult::ManyWritten OpenResult::WriteMany(const std::vector<SeenRecord>& asked, qint64 count,
                                              const std::function<std::vector<FieldChange>(qint64)>& values,
                                              Progress& progress)
{
    return InOneStep([&](ManyWritten& written, StepInProgress& noted) {
        const qint64 first = !asked.empty() && records_.MoveToRecord(asked.front().id) ? records_.Position() : -1;
        for (qint64 done = 0; done < count && written.failure.isEmpty(); ++done) {
            if (done % kTellEvery == 0 && !progress.Advance(done))
                break;
            const bool isNew = done >= qint64(asked.size());
            if (!isNew && !FindSeen(asked[size_t(done)], first < 0 ? -1 : first + done)) {
                ++written.leftAlone;
                continue;
            }
            const std::vector<FieldChange> wanted = values(done);
            if (!isNew && !HoldsAsSeen(asked[size_t(done)], wanted)) {
                ++written.leftAlone;
                continue;
            }
            ChangeLog::Step* const step = noted.ForCells(qint64(wanted.size()));
            if (isNew ? AddOne(wanted, step) : UpdateCurrent(wanted, step))
                ++written.records;
            else
                NoteRefusal(written, wanted);
        }
    });
}

OpenResult::ManyWritten
OpenResult::WriteAll(qint64 confirmed, const std::function<std::optional<std::vector<FieldChange>>()>& values,
                     Progress& progress)
{
    return InOneStep([&](ManyWritten& written, StepInProgress& noted) {
        bool more = records_.TakeUpChanges() && records_.RecordCount() <= confirmed && records_.MoveFirst();
        if (!more) {
            Fail();
            if (records_.RecordCount() > confirmed)
                result_ = Hr::RecordChanged;
            return;
        }
        for (qint64 done = 0; more && !records_.IsEof(); ++done, more = records_.MoveNext()) {
            if (done % kTellEvery == 0 && !progress.Advance(done))
                return;
            const std::optional<std::vector<FieldChange>> wanted = values();
            if (!wanted)
                return;
            if (!wanted->empty() && !UpdateCurrent(*wanted, noted.ForCells(qint64(wanted->size())))) {
                NoteRefusal(written, *wanted);
                return;
            }
            written.records += wanted->empty() ? 0 : 1;
        }
        if (!more)
            NoteRefusal(written, {});
    });
}

// --- all records ------------------------------------------------------------------------------------------------

bool OpenResult::CanUndoAll(qint64 records, int fields) const
{
    return records >= 0 && records * fields <= ChangeLog::kMostCells && records_.IdInTable() == records_.Id();
}

// Runs `change`, which fills the step; without one, nothing from before can be taken back any more.
bool OpenResult::ChangeAll(bool isNoted, const std::function<bool(ChangeLog::Step&)>& change)
{
    DbTransaction transaction(connection_, database_);
    if (!transaction.Begin()) {
        Fail(transaction);
        return false;
    }
    ChangeLog::Step step;
    const bool done = change(step); // a refused record ends it, and those before stay
    if (!transaction.Commit()) {
        if (done)
            Fail(transaction);
        return false;
    }
    if (isNoted)
        log_.Add(std::move(step));
    else
        log_.Clear();
    return done;
}

bool OpenResult::UpdateAll(int field, const Value& value, qint64 confirmed, const BulkProgress& progress)
{
    const bool isNoted = CanUndoAll(confirmed, 1);
    return ChangeAll(isNoted, [&](ChangeLog::Step& step) {
        if (isNoted)
            return UpdateAllNoted(field, value, confirmed, progress, step);
        const bool done = records_.UpdateAll(field, value, confirmed, progress);
        if (!done)
            Fail();
        return done;
    });
}

// What the field holds before and after, on the same transaction: a run that a record ends early has not changed
// all of them.
bool OpenResult::UpdateAllNoted(int field, const Value& value, qint64 confirmed, const BulkProgress& progress,
                                ChangeLog::Step& step)
{
    std::vector<RecordId> ids;
    const auto readInto = [&](Value RecordChange::Field::*place) {
        size_t at = 0;
        return records_.Read({.fields = {field}}, [&](std::span<const Cell> cells) {
            step[at].fields.front().*place = ValueOfCell(cells.front(), records_.TypeOfField(field));
            return ++at < step.size();
        });
    };
    const QString column = Fields()[size_t(field)].column;
    const QString table = Fields()[size_t(field)].table;
    if (!records_.TakeUpChanges(ProviderRecordset::Values::Keep) || !records_.Ids(0, confirmed, ids)) {
        Fail();
        return false;
    }
    for (RecordId& id : ids) {
        step.push_back({.kind = RecordChange::Kind::Changed, .table = table, .id = std::move(id), .fields = {}});
        step.back().fields.push_back({column, {}, {}});
    }
    if (!step.empty() && !readInto(&RecordChange::Field::before)) {
        Fail();
        return false;
    }
    const bool done = records_.UpdateAll(field, value, confirmed, progress);
    if (!done)
        Fail();
    if (!step.empty() && !readInto(&RecordChange::Field::after))
        step.clear();
    std::erase_if(step, [](const RecordChange& change) {
        return change.fields.front().before == change.fields.front().after;
    });
    return done;
}

bool OpenResult::DeleteAll(qint64 confirmed, const BulkProgress& progress)
{
    const bool isNoted = CanUndoAll(confirmed, FieldCount());
    return ChangeAll(isNoted, [&](ChangeLog::Step& step) {
        DbRecordset table(connection_);
        bool more = isNoted && records_.MoveFirst();
        for (; more && !records_.IsEof() && qint64(step.size()) <= confirmed; more = records_.MoveNext())
            NoteDeleted(table, step);
        qint64 deleted = 0;
        const bool done = records_.DeleteAll(confirmed, [&](qint64 records) {
            deleted = records;
            return !progress || progress(records);
        });
        if (!done)
            Fail();
        if (!done || deleted < qint64(step.size())) // those that are still there were not deleted
            std::erase_if(step, [&](const RecordChange& change) { return records_.MoveToRecord(change.id); });
        return done;
    });
}

// --- what is noted
// ------------------------------------------------------------------------------------------------

// Of the current record, without its fields. None: it cannot be undone.
std::optional<RecordChange> OpenResult::NewChange(RecordChange::Kind kind) const
{
    RecordId id = records_.IdInTable();
    const auto from =
        std::ranges::find_if(Fields(), [](const ResultField& field) { return !field.column.isEmpty(); });
    if (id.IsNull() || from == Fields().end())
        return {};
    return RecordChange{.kind = kind, .table = from->table, .id = std::move(id), .fields = {}};
}

bool OpenResult::UpdateCurrent(std::span<const FieldChange> values, ChangeLog::Step* step)
{
    std::optional<RecordChange> change;
    if (step)
        change = NewChange(RecordChange::Kind::Changed);
    std::vector<Value> before;
    for (const FieldChange& value : values)
        before.push_back(change ? records_.FieldValue(value.field) : Value());
    if (!records_.Update(values))
        return false;
    if (!change)
        return true;
    change->id = records_.IdInTable(); // a field that was changed may be the key
    for (size_t i = 0; i < values.size(); ++i) {
        const Value after = records_.FieldValue(values[i].field);
        if (after != before[i])
            change->fields.push_back({Fields()[size_t(values[i].field)].column, before[i], after});
    }
    if (!change->fields.empty())
        step->push_back(std::move(*change));
    return true;
}

bool OpenResult::AddOne(std::span<const FieldChange> values, ChangeLog::Step* step)
{
    if (!records_.AddNew(values))
        return false;
    std::optional<RecordChange> change;
    if (step)
        change = NewChange(RecordChange::Kind::Added);
    if (!change)
        return true;
    for (int field = 0; field < FieldCount(); ++field) {
        const QString& column = Fields()[size_t(field)].column;
        if (!column.isEmpty())
            change->fields.push_back({column, {}, records_.FieldValue(field)});
    }
    step->push_back(std::move(*change));
    return true;
}

bool OpenResult::DeleteCurrent(DbRecordset& table, ChangeLog::Step* step)
{
    const size_t before = step ? step->size() : 0;
    if (step)
        NoteDeleted(table, *step);
    if (records_.Delete())
        return true;
    if (step)
        step->resize(before);
    return false;
}

// The whole record, also what of it the result does not show: `table` is opened for that where it is not yet.
void OpenResult::NoteDeleted(DbRecordset& table, ChangeLog::Step& step) const
{
    std::optional<RecordChange> change = NewChange(RecordChange::Kind::Deleted);
    if (!change)
        return;
    if (!table.IsOpen() && !table.Open(u"SELECT * FROM "_s + FieldReference(change->table), database_,
                                       CursorType::Static, LockType::Optimistic))
        return;
    std::vector<int> shown; // where the result has each of the table's columns
    for (const ResultField& column : table.Fields()) {
        const auto at = std::ranges::find(Fields(), column.column, &ResultField::column);
        shown.push_back(at == Fields().end() ? -1 : int(at - Fields().begin()));
    }
    const bool isWhole = std::ranges::find(shown, -1) == shown.end();
    if (!isWhole && !table.MoveToRecord(change->id))
        return;
    for (int column = 0; column < table.FieldCount(); ++column) {
        const Value value = isWhole ? records_.FieldValue(shown[size_t(column)]) : table.FieldValue(column);
        change->fields.push_back({table.Fields()[size_t(column)].column, value, {}});
    }
    step.push_back(std::move(*change));
}

// --- the way back
// -------------------------------------------------------------------------------------------------

ChangeLog::Outcome OpenResult::Turn(TurnOfLog turn)
{
    const ChangeLog::Outcome outcome = (log_.*turn)(connection_, database_, prompt_);
    if (!records_.TakeUpChanges())
        Report();
    if (!outcome.record.IsNull())
        (void)records_.MoveToRecord(outcome.record);
    StandWhereRecordsAre();
    if (records_.IsGone() || (position_ < 0 && Count() > 0))
        (void)MoveTo(std::max<qint64>(position_, 0));
    return outcome;
}

ChangeLog::Outcome OpenResult::Undo()
{
    return Turn(&ChangeLog::Undo);
}

ChangeLog::Outcome OpenResult::Redo()
{
    return Turn(&ChangeLog::Redo);
}

} // namespace mirel
