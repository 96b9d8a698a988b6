#include "provider/sqlite/static_cursor.h"

#include "provider/sqlite/bulk_change.h"
#include "provider/sqlite/keyed_rows.h"
#include "provider/sqlite/row_reader.h"
#include "provider/sqlite/table_rows.h"
#include "provider/sqlite/transaction.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel::sqlite {
namespace {

const QDeadlineTimer kNoHurry(QDeadlineTimer::Forever);

const Outcome& Gone()
{
    static const Outcome kGone{Hr::NoCurrentRecord, StringText(Str::RecordIsGone)};
    return kGone;
}

} // namespace

StaticCursor::StaticCursor(std::shared_ptr<DatabaseFile> file, SelectPlan plan)
    : file_(std::move(file))
    , plan_(std::move(plan))
{
    if (plan_.updatableSource < 0)
        return;
    const QString& name = plan_.sources[size_t(plan_.updatableSource)].table;
    if (const dialect::Table* table = file_->Schema().FindTable(name))
        writer_.emplace(*file_, *table, plan_.fields);
}

template <typename Work>
Outcome StaticCursor::InRead(Work work)
{
    ReadTransaction transaction(*file_);
    Outcome outcome = transaction.Begin();
    if (outcome.Ok())
        outcome = work();
    const Outcome ended = transaction.End();
    return outcome.Ok() ? ended : outcome;
}

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

Outcome StaticCursor::Open()
{
    return InRead([this]() -> Outcome {
        if (!plan_.keyed) {
            kept_.emplace(*file_);
            if (Outcome outcome = kept_->Fill(plan_); !outcome.Ok())
                return outcome;
            plan_ = kept_->Plan(plan_);
        } else if (!HasTables()) {
            return {Hr::NoSuchTable, {}};
        }
        if (plan_.sources.size() == 1 && plan_.where.isEmpty() && plan_.order.empty())
            rows_ = std::make_unique<TableRows>(*file_, plan_);
        else
            rows_ = std::make_unique<KeyedRows>(*file_, plan_);
        if (Outcome outcome = ReadVersion(version_); !outcome.Ok())
            return outcome;
        return Settle(0);
    });
}

// A plan can be older than the file's structure: a forward-only cursor comes here when its first block ends.
bool StaticCursor::HasTables() const
{
    return std::ranges::all_of(plan_.sources, [this](const PlannedSource& source) {
        return file_->Schema().FindTable(source.table) != nullptr;
    });
}

quint64 StaticCursor::OwnVersion() const
{
    quint64 version = 0;
    for (const PlannedSource& source : plan_.sources)
        version += file_->TableVersion(source.table);
    return version;
}

Outcome StaticCursor::ReadVersion(Version& version)
{
    version = {};
    if (kept_) // rows of their own, which nobody changes
        return {};
    version.own = OwnVersion();
    version.values = file_->ValuesVersion();
    Outcome outcome;
    Statement statement = file_->Prepare("PRAGMA data_version", outcome);
    if (!statement)
        return outcome;
    const int result = statement.Step();
    if (result == SQLITE_ROW)
        version.data = statement.Integer(0);
    return file_->OutcomeOf(result);
}

Outcome StaticCursor::TakeUpChanges()
{
    Version now;
    Outcome outcome = ReadVersion(now);
    if (!outcome.Ok() || now == version_)
        return outcome;
    valuesAged_ = !values_.empty();
    const bool haveRecordsMoved = now.data != version_.data || now.own != version_.own;
    if (haveRecordsMoved)
        return Restart();
    version_ = now;
    ++generation_;
    return {};
}

Outcome StaticCursor::TakeUpChanges(ProviderRecordset::Values values)
{
    const Outcome outcome = InRead([this] { return TakeUpChanges(); });
    if (values == ProviderRecordset::Values::ReadAgain && valuesAged_) {
        values_.clear();
        valuesAged_ = false;
        ++generation_;
    }
    return outcome;
}

// Positions are made again, and the current record is looked for among them. Its values stay what they were when
// they were asked for: a write compares them.
Outcome StaticCursor::Restart()
{
    rows_->Restart();
    ++generation_;
    Outcome outcome = ReadVersion(version_);
    return outcome.Ok() && (place_ == Place::On || place_ == Place::Gone) ? FindCurrent() : outcome;
}

// Row ids are given again when a file is compacted: where the structure is another, a record with the same one but
// other values is not the record that was current.
bool StaticCursor::IsAnotherRecord()
{
    if (values_.empty() || structureOfValues_ == file_->SchemaVersion())
        return false;
    std::vector<Value> now;
    return !ReadCurrent(AllFields(plan_.fields), now).Ok() || now != values_;
}

// A record that is gone keeps the place where it was, and may come back there: by an undo elsewhere.
Outcome StaticCursor::FindCurrent()
{
    qint64 position = -1;
    Outcome outcome = CountAll();
    if (outcome.Ok())
        outcome = rows_->PositionOf(key_, position);
    if (!outcome.Ok())
        return outcome;
    if (position >= 0 && IsAnotherRecord())
        position = -1;
    place_ = position >= 0 ? Place::On : Place::Gone;
    position_ = position >= 0 ? position : std::min(position_, rows_->Known());
    return {};
}

Outcome StaticCursor::CountAll()
{
    return rows_->Extend(kAllRecords, kNoHurry);
}

Outcome StaticCursor::Recount()
{
    return InRead([this] {
        Outcome outcome = TakeUpChanges();
        return outcome.Ok() ? CountAll() : outcome;
    });
}

Outcome StaticCursor::Settle(qint64 position)
{
    values_.clear();
    if (position < 0) {
        place_ = Place::Before;
        return {};
    }
    Outcome outcome = rows_->Extend(position + 1, kNoHurry);
    if (!outcome.Ok())
        return outcome;
    if (position >= rows_->Known()) {
        place_ = Place::Behind;
        return {};
    }
    RecordKey key;
    outcome = rows_->KeyAt(position, key);
    if (!outcome.Ok())
        return outcome;
    place_ = Place::On;
    position_ = position;
    key_ = std::move(key);
    return {};
}

qint64 StaticCursor::RecordCount()
{
    (void)Recount();
    return rows_->Known();
}

bool StaticCursor::CountStep(int budgetMs)
{
    if (budgetMs < 0)
        return rows_->IsComplete();
    const Outcome outcome = InRead([this, budgetMs] {
        Outcome taken = TakeUpChanges();
        return taken.Ok() ? rows_->Extend(kAllRecords, QDeadlineTimer(budgetMs)) : taken;
    });
    return !outcome.Ok() || rows_->IsComplete(); // a file that fails is not asked for ever
}

Outcome StaticCursor::MoveTo(qint64 position)
{
    return InRead([this, position] {
        Outcome outcome = TakeUpChanges();
        return outcome.Ok() ? Settle(position) : outcome;
    });
}

Outcome StaticCursor::MoveLast()
{
    return InRead([this] {
        Outcome outcome = TakeUpChanges();
        if (outcome.Ok())
            outcome = CountAll();
        if (!outcome.Ok())
            return outcome;
        return Settle(rows_->Known() > 0 ? rows_->Known() - 1 : 0);
    });
}

Outcome StaticCursor::MoveNext()
{
    return InRead([this] {
        Outcome outcome = TakeUpChanges();
        if (!outcome.Ok() || place_ == Place::Behind)
            return outcome;
        if (place_ == Place::Gone) // the record behind it has its place now
            return Settle(position_);
        return Settle(place_ == Place::Before ? 0 : position_ + 1);
    });
}

Outcome StaticCursor::MovePrevious()
{
    return InRead([this] {
        Outcome outcome = TakeUpChanges();
        if (outcome.Ok() && place_ == Place::Behind)
            outcome = CountAll();
        if (!outcome.Ok() || place_ == Place::Before)
            return outcome;
        return Settle((place_ == Place::Behind ? rows_->Known() : position_) - 1);
    });
}

RecordId StaticCursor::Id() const
{
    const bool stands = place_ == Place::On || place_ == Place::Gone;
    return stands && !kept_ ? IdOf(key_) : RecordId();
}

RecordId StaticCursor::IdInTable() const
{
    if (place_ != Place::On || !writer_ || key_[plan_.updatableSource] == kNoRow)
        return {};
    return IdOf({key_[plan_.updatableSource]});
}

Outcome StaticCursor::Ids(qint64 first, qint64 count, std::vector<RecordId>& ids)
{
    if (kept_)
        return {Hr::NotImplemented, {}};
    return InRead([&] {
        Outcome outcome = rows_->Extend(first + count, kNoHurry);
        std::vector<RecordKey> keys;
        if (outcome.Ok() && first < rows_->Known())
            outcome = rows_->KeysBetween(first, std::min(first + count, rows_->Known()), keys);
        std::ranges::transform(keys, std::back_inserter(ids), IdOf);
        return outcome;
    });
}

Outcome StaticCursor::ReadRecords(std::span<const RecordId> ids, const RecordSink& sink)
{
    const std::vector<int> fields = AllFields(plan_.fields);
    return InRead([&] {
        Outcome outcome;
        for (size_t i = 0; i < ids.size() && outcome.Ok(); ++i) {
            const std::optional<RecordKey> key = kept_ ? std::nullopt : KeyOf(ids[i], plan_.sources.size());
            if (!key)
                return Gone();
            outcome = rows_->ReadRecord(*key, fields, [&](std::span<const Cell> cells) {
                sink(i, cells);
                return false;
            });
        }
        return outcome;
    });
}

Outcome StaticCursor::MoveToRecord(const RecordId& id)
{
    const std::optional<RecordKey> key = KeyOf(id, plan_.sources.size());
    if (kept_ || !key)
        return Gone();
    return InRead([this, &key] {
        qint64 position = -1;
        Outcome outcome = TakeUpChanges();
        if (outcome.Ok())
            outcome = CountAll();
        if (outcome.Ok())
            outcome = rows_->PositionOf(*key, position);
        if (!outcome.Ok() || position < 0)
            return outcome.Ok() ? Gone() : outcome;
        return Settle(position);
    });
}

Outcome StaticCursor::ReadCurrent(std::span<const int> fields, std::vector<Value>& values)
{
    Outcome outcome = rows_->ReadRecord(key_, fields, [&](std::span<const Cell> cells) {
        for (size_t i = 0; i < cells.size(); ++i)
            values.push_back(ValueOfCell(cells[i], plan_.fields[size_t(fields[i])].type));
        return false;
    });
    return outcome.Ok() && values.empty() ? Gone() : outcome;
}

Outcome StaticCursor::LoadRecord()
{
    values_.clear();
    valuesAged_ = false;
    return InRead([this] {
        structureOfValues_ = writer_ ? file_->SchemaVersion() : -1;
        return ReadCurrent(AllFields(plan_.fields), values_);
    });
}

// Inside a write transaction: the current record is there, and `fields` of it hold what GetValue gave. Once the
// file's structure is another, row ids may be others too: then all fields are compared.
Outcome StaticCursor::CheckCurrent(std::span<const int> fields)
{
    if (place_ != Place::On)
        return Gone();
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

Outcome StaticCursor::GetValue(int field, Value& value)
{
    if (place_ != Place::On && place_ != Place::Gone)
        return {Hr::NoCurrentRecord, {}};
    if (values_.empty()) {
        if (Outcome outcome = place_ == Place::On ? LoadRecord() : Gone(); !outcome.Ok())
            return outcome;
    }
    value = values_[size_t(field)];
    return {};
}

Outcome StaticCursor::Read(const ReadRange& range, const CellSink& sink)
{
    if (range.first < 0 || range.count == 0)
        return {};
    return InRead([&] {
        Outcome outcome = TakeUpChanges();
        return outcome.Ok() ? rows_->Read(range, sink) : outcome;
    });
}

// After a change of ours that the rows already know of. What another program has committed since is still to come.
void StaticCursor::AdoptOwnChange()
{
    version_.own = OwnVersion();
    version_.values = file_->ValuesVersion();
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
            Outcome taken = TakeUpChanges();
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
    if (!rows_->Append(key))
        return InRead([this] { return Restart(); });
    position_ = rows_->Known() - 1;
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
        Outcome checked = TakeUpChanges();
        if (checked.Ok())
            checked = CheckCurrent(fields);
        return checked.Ok() ? writer_->Update(values, rowId) : checked;
    });
    if (!outcome.Ok())
        return outcome;
    values_.clear();
    ++generation_;
    version_.values = file_->ValuesVersion();
    if (rowId == RowIdOfCurrent())
        return {};
    RowIdOfCurrent() = rowId;
    return InRead([this] { return Restart(); });
}

Outcome StaticCursor::Delete()
{
    if (place_ != Place::On && place_ != Place::Gone)
        return {Hr::NoCurrentRecord, {}};
    Outcome outcome = Recount();
    if (!outcome.Ok())
        return outcome;
    outcome = InWrite([&] {
        Outcome checked = TakeUpChanges();
        if (checked.Ok())
            checked = CountAll();
        if (checked.Ok())
            checked = CheckCurrent(AllFields(plan_.fields));
        return checked.Ok() ? writer_->Delete(RowIdOfCurrent()) : checked;
    });
    if (!outcome.Ok())
        return outcome;
    rows_->Remove(position_, key_);
    AdoptOwnChange();
    return InRead([this] { return Settle(position_); });
}

// Inside the transaction that is to change them: no more records than were asked about.
Outcome StaticCursor::CheckCount(qint64 confirmed)
{
    Outcome outcome = TakeUpChanges();
    if (outcome.Ok())
        outcome = CountAll();
    if (outcome.Ok() && confirmed >= 0 && rows_->Known() > confirmed)
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
        const BulkRanges ranges = rows_->RangesFor(plan_.updatableSource);
        BulkChange change(*file_, *writer_, plan_.sources[size_t(plan_.updatableSource)].alias);
        changed = change.Update(ranges, {field, value}, progress);
        return Outcome();
    });
    if (!outcome.Ok())
        return changed.Ok() ? outcome : changed;
    AdoptOwnChange();
    if (writer_->MovesRecords(field)) {
        file_->NoteChange(writer_->TableName());
        const Outcome restarted = InRead([this] { return Restart(); });
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
        changed = change.Delete(rows_->RangesFor(plan_.updatableSource), progress);
        return Outcome();
    });
    if (!outcome.Ok())
        return changed.Ok() ? outcome : changed;
    file_->NoteChange(source.table);
    place_ = Place::Before;
    values_.clear();
    const Outcome restarted = InRead([this] {
        Outcome begun = Restart();
        return begun.Ok() ? Settle(0) : begun;
    });
    return changed.Ok() ? restarted : changed;
}

} // namespace mirel::sqlite
