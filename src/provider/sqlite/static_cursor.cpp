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
// How old a value may be: asking what others have written costs as much as reading a record, and a form reads
// fifty values of one.
constexpr qint64 kFreshMs = 50;

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

Outcome StaticCursor::ReadVersion(Version& version)
{
    version = {};
    if (kept_) // rows of their own, which nobody changes
        return {};
    for (const PlannedSource& source : plan_.sources)
        version.own += file_->TableVersion(source.table);
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
    return !outcome.Ok() || now == version_ ? outcome : Restart();
}

// Positions are made anew, and the current record is looked for among them.
Outcome StaticCursor::Restart()
{
    rows_->Restart();
    ++generation_;
    values_.clear();
    Outcome outcome = ReadVersion(version_);
    return outcome.Ok() && place_ == Place::On ? FindCurrent(key_) : outcome;
}

// Where a record is gone, the one that took its position becomes current.
Outcome StaticCursor::FindCurrent(const RecordKey& key)
{
    qint64 position = -1;
    Outcome outcome = CountAll();
    if (outcome.Ok())
        outcome = rows_->PositionOf(key, position);
    if (!outcome.Ok())
        return outcome;
    return Settle(position >= 0 ? position : position_);
}

Outcome StaticCursor::CountAll()
{
    return rows_->Extend(kAllRecords, kNoHurry);
}

Outcome StaticCursor::CountAnew()
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
    (void)CountAnew();
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

std::optional<qint64> StaticCursor::RecordId() const
{
    if (place_ != Place::On || !writer_ || key_[plan_.updatableSource] == kNoRow)
        return {};
    return key_[plan_.updatableSource];
}

Outcome StaticCursor::MoveToRecord(qint64 id)
{
    if (!writer_ || plan_.sources.size() != 1)
        return {Hr::NoCurrentRecord, {}};
    return InRead([this, id] {
        qint64 position = -1;
        Outcome outcome = TakeUpChanges();
        if (outcome.Ok())
            outcome = CountAll();
        if (outcome.Ok())
            outcome = rows_->PositionOf(RecordKey(1, id), position);
        if (!outcome.Ok() || position < 0)
            return outcome.Ok() ? Outcome{Hr::NoCurrentRecord, StringText(Str::RecordIsGone)} : outcome;
        return Settle(position);
    });
}

Outcome StaticCursor::LoadRecord()
{
    const std::vector<int> fields = AllFields(plan_.fields);
    values_.clear();
    Outcome outcome = InRead([&] {
        Outcome read = ReadVersion(valuesVersion_);
        if (!read.Ok())
            return read;
        return rows_->ReadRecord(key_, fields, [this](std::span<const Cell> cells) {
            for (size_t i = 0; i < cells.size(); ++i)
                values_.push_back(ValueOfCell(cells[i], plan_.fields[i].type));
            return false;
        });
    });
    sinceLook_.start();
    valuesAsOf_ = sqlite3_total_changes64(file_->Handle());
    if (outcome.Ok() && values_.empty())
        return {Hr::NoCurrentRecord, StringText(Str::RecordIsGone)};
    return outcome;
}

// Whether others may have changed the record since its values were read.
bool StaticCursor::HaveValuesAged()
{
    if (valuesAsOf_ != sqlite3_total_changes64(file_->Handle()))
        return true;
    if (!sinceLook_.hasExpired(kFreshMs))
        return false;
    sinceLook_.start();
    Version now;
    return ReadVersion(now).Ok() && now != valuesVersion_;
}

Outcome StaticCursor::GetValue(int field, Value& value)
{
    if (place_ != Place::On)
        return {Hr::NoCurrentRecord, {}};
    if (values_.empty() || HaveValuesAged()) {
        if (Outcome outcome = LoadRecord(); !outcome.Ok())
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

// After a change of ours that the rows already know of.
void StaticCursor::AdoptOwnChange()
{
    (void)ReadVersion(version_);
    ++generation_;
    values_.clear();
}

Outcome StaticCursor::AddNew(std::span<const FieldChange> values)
{
    Outcome outcome = CountAnew();
    RecordKey key(plan_.sources.size(), kNoRow);
    if (outcome.Ok())
        outcome = writer_->Add(values, key[plan_.updatableSource]);
    if (!outcome.Ok())
        return outcome;
    place_ = Place::On;
    key_ = key;
    if (!rows_->Append(key))
        return InRead([this] { return Restart(); });
    position_ = rows_->Known() - 1;
    AdoptOwnChange();
    return {};
}

Outcome StaticCursor::Update(std::span<const FieldChange> values)
{
    if (place_ != Place::On)
        return {Hr::NoCurrentRecord, {}};
    const qint64 old = RowIdOfCurrent();
    const Outcome outcome = writer_->Update(values, RowIdOfCurrent());
    if (!outcome.Ok())
        return outcome;
    values_.clear();
    ++generation_;
    return RowIdOfCurrent() == old ? Outcome() : InRead([this] { return Restart(); });
}

Outcome StaticCursor::Delete()
{
    if (place_ != Place::On)
        return {Hr::NoCurrentRecord, {}};
    Outcome outcome = CountAnew();
    if (!outcome.Ok())
        return outcome;
    outcome = writer_->Delete(RowIdOfCurrent());
    if (!outcome.Ok())
        return outcome;
    rows_->Remove(position_, key_);
    AdoptOwnChange();
    return InRead([this] { return Settle(position_); });
}

Outcome StaticCursor::UpdateAll(int field, const Value& value, const BulkProgress& progress)
{
    Outcome outcome = CountAnew();
    if (!outcome.Ok())
        return outcome;
    const BulkRanges ranges = rows_->RangesFor(plan_.updatableSource);
    BulkChange change(*file_, *writer_, plan_.sources[size_t(plan_.updatableSource)].alias);
    const bool movesRecords = writer_->MovesRecords(field);
    outcome = change.Update(ranges, {field, value}, progress);
    AdoptOwnChange();
    if (!movesRecords)
        return outcome;
    file_->NoteChange(writer_->TableName());
    const Outcome restarted = InRead([this] { return Restart(); });
    return outcome.Ok() ? restarted : outcome;
}

Outcome StaticCursor::DeleteAll(const BulkProgress& progress)
{
    Outcome outcome = CountAnew();
    if (!outcome.Ok())
        return outcome;
    const PlannedSource& source = plan_.sources[size_t(plan_.updatableSource)];
    outcome = BulkChange(*file_, *writer_, source.alias).Delete(rows_->RangesFor(plan_.updatableSource), progress);
    file_->NoteChange(source.table);
    place_ = Place::Before;
    const Outcome restarted = InRead([this] {
        Outcome begun = Restart();
        return begun.Ok() ? Settle(0) : begun;
    });
    return outcome.Ok() ? restarted : outcome;
}

} // namespace mirel::sqlite
