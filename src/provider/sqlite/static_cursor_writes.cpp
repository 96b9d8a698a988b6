#include "provider/sqlite/bulk_change.h"
#include "provider/sqlite/row_reader.h"
#include "provider/sqlite/static_cursor.h"
#include "resources/string_table.h"

// What a static cursor writes. Each write compares the record with what was shown.

namespace mirel::sqlite {

// What is compared within cannot change before it is written. Inside a transaction of the caller's, that one
// serves.
template <typename Work>
Outcome StaticCursor::InWrite(Work work)
{
    if (file_->IsTransactionLost())
        return {Hr::Unexpected, StringText(Str::BulkRunUndone, {file_->Path()})};
    Outcome outcome = file_->BeginTransaction();
    if (!outcome.Ok())
        return outcome;
    outcome = work();
    if (!outcome.Ok() && file_->IsOutermostTransaction()) {
        file_->RollBackTransaction();
        return outcome;
    }
    const Outcome committed = file_->CommitTransaction();
    return outcome.Ok() ? committed : outcome;
}

// Inside a write transaction: the current record is there, and `fields` of it hold what GetValue gave. Once the
// file's structure is another, row ids may be others too: then all fields are compared.
Outcome StaticCursor::CheckCurrent(std::span<const int> fields)
{
    if (place_ != Place::On)
        return GoneOutcome();
    if (values_.empty())
        return {};
    const std::vector<int> all = AllFields(plan_.fields);
    if (structureOfValues_ != file_->SchemaVersion())
        fields = all;
    std::vector<Value> now;
    if (Outcome outcome = ReadCurrent(fields, now); !outcome.Ok())
        return outcome;
    for (size_t i = 0; i < fields.size(); ++i) {
        if (now[i] != values_[size_t(fields[i])])
            return {Hr::RecordChanged, StringText(Str::RecordIsChanged)};
    }
    return {};
}

void StaticCursor::AdoptOwnChange()
{
    positions_->AdoptOwnChange();
    ++generation_;
    values_.clear();
}

Outcome StaticCursor::AddNew(std::span<const FieldChange> values, const RecordId& preferred)
{
    const std::optional<RecordKey> wanted = KeyOf(preferred, 1);
    RecordKey key(plan_.sources.size(), kNoRow);
    Outcome outcome = Recount(); // before the lock is taken: it can take its time
    if (outcome.Ok()) {
        outcome = InWrite([&] {
            Outcome taken = TakeUpForOneRecord();
            if (taken.Ok())
                taken = CountAll();
            const std::optional<qint64> rowId = wanted ? std::optional((*wanted)[0]) : std::nullopt;
            return taken.Ok() ? writer_->Add(values, rowId, key[plan_.updatableSource]) : taken;
        });
    }
    if (!outcome.Ok())
        return outcome;
    place_ = Place::On;
    key_ = key;
    values_.clear();
    if (!Rows().Append(key))
        return InRead([this] { return TakeUpEverything(); });
    position_ = Rows().Known() - 1;
    AdoptOwnChange();
    return {};
}

Outcome StaticCursor::Update(std::span<const FieldChange> values)
{
    if (place_ != Place::On && place_ != Place::Gone)
        return {Hr::NoCurrentRecord, {}};
    qint64 rowId = RowIdOfCurrent();
    std::vector<int> fields;
    for (const FieldChange& change : values)
        fields.push_back(change.field);
    const Outcome outcome = InWrite([&] {
        Outcome checked = TakeUpForOneRecord();
        if (checked.Ok())
            checked = CheckCurrent(fields);
        return checked.Ok() ? writer_->Update(values, rowId) : checked;
    });
    if (!outcome.Ok())
        return outcome;
    values_.clear();
    ++generation_;
    positions_->AdoptOwnValues();
    if (rowId == RowIdOfCurrent())
        return {};
    RowIdOfCurrent() = rowId;
    return InRead([this] { return TakeUpEverything(); });
}

Outcome StaticCursor::Delete()
{
    if (place_ != Place::On && place_ != Place::Gone)
        return {Hr::NoCurrentRecord, {}};
    Outcome outcome = Recount();
    if (!outcome.Ok())
        return outcome;
    outcome = InWrite([&] {
        Outcome checked = TakeUpForOneRecord();
        if (checked.Ok())
            checked = CountAll();
        if (checked.Ok())
            checked = CheckCurrent(AllFields(plan_.fields));
        return checked.Ok() ? writer_->Delete(RowIdOfCurrent()) : checked;
    });
    if (!outcome.Ok())
        return outcome;
    Rows().Remove(position_, key_);
    AdoptOwnChange();
    return InRead([this] { return Settle(position_); });
}

// Inside the transaction that is to change them: no more records than were asked about.
Outcome StaticCursor::CheckCount(qint64 confirmed)
{
    Outcome outcome = TakeUpChanges();
    if (outcome.Ok())
        outcome = CountAll();
    if (outcome.Ok() && confirmed >= 0 && Rows().Known() > confirmed)
        return {Hr::RecordChanged, StringText(Str::ResultHasGrown)};
    return outcome;
}

// A refused record leaves those before it written: the change keeps them itself, and says so by its outcome.
Outcome StaticCursor::UpdateAll(int field, const Value& value, qint64 confirmed, const BulkProgress& progress)
{
    Outcome changed;
    const Outcome outcome = InWrite([&] {
        Outcome checked = CheckCount(confirmed);
        if (!checked.Ok())
            return checked;
        const BulkRanges ranges = Rows().RangesFor(plan_.updatableSource);
        BulkChange change(*file_, *writer_, plan_.sources[size_t(plan_.updatableSource)].alias);
        changed = change.Update(ranges, {field, value}, progress);
        return Outcome();
    });
    if (!outcome.Ok())
        return changed.Ok() ? outcome : changed;
    AdoptOwnChange();
    if (writer_->MovesRecords(field)) {
        file_->NoteChange(writer_->TableName());
        const Outcome restarted = InRead([this] { return TakeUpEverything(); });
        if (changed.Ok())
            return restarted;
    }
    return changed;
}

Outcome StaticCursor::DeleteAll(qint64 confirmed, const BulkProgress& progress)
{
    Outcome changed;
    const PlannedSource& source = plan_.sources[size_t(plan_.updatableSource)];
    const Outcome outcome = InWrite([&] {
        Outcome checked = CheckCount(confirmed);
        if (!checked.Ok())
            return checked;
        BulkChange change(*file_, *writer_, source.alias);
        changed = change.Delete(Rows().RangesFor(plan_.updatableSource), progress);
        return Outcome();
    });
    if (!outcome.Ok())
        return changed.Ok() ? outcome : changed;
    file_->NoteChange(source.table);
    place_ = Place::Before;
    values_.clear();
    const Outcome restarted = InRead([this] {
        Outcome begun = TakeUpEverything();
        return begun.Ok() ? Settle(0) : begun;
    });
    return changed.Ok() ? restarted : changed;
}

} // namespace mirel::sqlite
