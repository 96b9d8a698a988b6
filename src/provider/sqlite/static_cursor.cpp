#include "provider/sqlite/static_cursor.h"

#include "provider/sqlite/row_reader.h"
#include "resources/string_table.h"

#include <algorithm>

// Positions and reading; what is written is in static_cursor_writes.cpp.

namespace mirel::sqlite {
namespace {

// In an old order: so many records are looked up one by one, and so many that are gone leave it one by one.
constexpr qint64 kMostOnPage = 1024;
constexpr int kMostDropped = 256;

} // namespace

const Outcome& StaticCursor::GoneOutcome()
{
    static const Outcome kGone{Hr::NoCurrentRecord, StringText(Str::RecordIsGone)};
    return kGone;
}

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
        positions_.emplace(*file_, plan_);
        if (Outcome outcome = positions_->Begin(!kept_); !outcome.Ok())
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

// Positions are made again, and the current record is looked for among them. Its values stay what they were when
// they were asked for: a write compares them.
Outcome StaticCursor::TakeUpChanges()
{
    using Change = RecordPositions::Change;
    Change change = Change::None;
    Outcome outcome = positions_->Look(change);
    if (!outcome.Ok() || change == Change::None)
        return outcome;
    ++generation_;
    valuesAged_ = !values_.empty();
    if (change == Change::Values)
        return {};
    outcome = positions_->IsBehind() ? KeepPlace() : FindCurrent();
    if (!outcome.Ok())
        positions_->GiveUp();
    return outcome;
}

// An old order will do for what is compared by its key, as long as keys are what they were.
Outcome StaticCursor::TakeUpForOneRecord()
{
    return positions_->IsBehind() && positions_->AreKeysTheSame() ? Outcome() : TakeUpChanges();
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

Outcome StaticCursor::TakeUpEverything()
{
    ++generation_;
    Outcome outcome = positions_->Renew();
    return outcome.Ok() ? FindCurrent() : outcome;
}

bool StaticCursor::CatchUp(int budgetMs)
{
    if (!positions_->IsBehind())
        return true;
    const Outcome outcome = InRead([this, budgetMs] {
        bool isNew = false;
        Outcome step = TakeUpChanges();
        if (step.Ok() && positions_->IsBehind())
            step = positions_->CatchUp(QDeadlineTimer(budgetMs), isNew);
        if (!step.Ok() || !isNew)
            return step;
        ++generation_;
        return FindCurrent();
    });
    if (!outcome.Ok())
        positions_->GiveUp();
    return !positions_->IsBehind();
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
    if (place_ != Place::On && place_ != Place::Gone)
        return {};
    qint64 position = -1;
    Outcome outcome = CountAll();
    if (outcome.Ok())
        outcome = Rows().PositionOf(key_, position);
    if (!outcome.Ok())
        return outcome;
    if (position >= 0 && IsAnotherRecord())
        position = -1;
    place_ = position >= 0 ? Place::On : Place::Gone;
    position_ = position >= 0 ? position : std::min(position_, Rows().Known());
    return {};
}

// In an old order the current record has its place, as long as it is there.
Outcome StaticCursor::KeepPlace()
{
    if (place_ != Place::On)
        return {};
    bool isThere = false;
    Outcome outcome = positions_->Holds(key_, isThere);
    if (!outcome.Ok() || isThere)
        return outcome;
    Rows().Remove(position_, key_);
    place_ = Place::Gone;
    return {};
}

// In an old order: what is at these positions afterwards is there.
Outcome StaticCursor::DropDeleted(qint64 first, qint64 count)
{
    int dropped = 0;
    for (qint64 position = first; position < std::min(first + count, Rows().Known());) {
        RecordKey key;
        bool isThere = false;
        Outcome outcome = Rows().KeyAt(position, key);
        if (outcome.Ok())
            outcome = positions_->Holds(key, isThere);
        if (!outcome.Ok())
            return outcome;
        if (isThere) {
            ++position;
            continue;
        }
        if (++dropped > kMostDropped)
            return TakeUpEverything();
        ++generation_;
        Rows().Remove(position, key);
        if (position == position_ && place_ == Place::On)
            place_ = Place::Gone;
        else if (position < position_)
            --position_;
    }
    return {};
}

Outcome StaticCursor::CountAll()
{
    return Rows().Extend(kAllRecords, kNoHurry);
}

Outcome StaticCursor::Recount()
{
    return InRead([this] {
        Outcome outcome = TakeUpChanges();
        return outcome.Ok() ? CountAll() : outcome;
    });
}

// To the same record once more is no move: its values stay those that were shown, unless others changed it.
Outcome StaticCursor::Settle(qint64 position)
{
    Outcome outcome = Rows().Extend(position + 1, kNoHurry);
    if (outcome.Ok() && position >= 0 && positions_->IsBehind())
        outcome = DropDeleted(position, 1);
    const bool isOnRecord = position >= 0 && position < Rows().Known();
    RecordKey key;
    if (outcome.Ok() && isOnRecord)
        outcome = Rows().KeyAt(position, key);
    if (!outcome.Ok())
        return outcome;
    if (!isOnRecord || place_ != Place::On || key != key_ || valuesAged_) {
        values_.clear();
        valuesAged_ = false;
    }
    if (!isOnRecord) {
        place_ = position < 0 ? Place::Before : Place::Behind;
        return {};
    }
    place_ = Place::On;
    position_ = position;
    key_ = std::move(key);
    return {};
}

qint64 StaticCursor::RecordCount()
{
    (void)Recount();
    return Rows().Known();
}

bool StaticCursor::CountStep(int budgetMs)
{
    if (budgetMs < 0)
        return Rows().IsComplete();
    const Outcome outcome = InRead([this, budgetMs] {
        Outcome taken = TakeUpChanges();
        return taken.Ok() ? Rows().Extend(kAllRecords, QDeadlineTimer(budgetMs)) : taken;
    });
    return !outcome.Ok() || Rows().IsComplete(); // a file that fails is not asked for ever
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
        return Settle(Rows().Known() > 0 ? Rows().Known() - 1 : 0);
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
        return Settle((place_ == Place::Behind ? Rows().Known() : position_) - 1);
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
        Outcome outcome = Rows().Extend(first + count, kNoHurry);
        std::vector<RecordKey> keys;
        if (outcome.Ok() && first < Rows().Known())
            outcome = Rows().KeysBetween(first, std::min(first + count, Rows().Known()), keys);
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
                return GoneOutcome();
            outcome = Rows().ReadRecord(*key, fields, [&](std::span<const Cell> cells) {
                sink(i, cells);
                return false;
            });
        }
        return outcome;
    });
}

// A record that is gone still has its position there, and one that is new has none.
Outcome StaticCursor::FindInOldOrder(const RecordKey& key, qint64& position)
{
    bool isThere = false;
    Outcome outcome = positions_->Holds(key, isThere);
    if (outcome.Ok() && isThere && position < 0) {
        outcome = TakeUpEverything();
        if (outcome.Ok())
            outcome = CountAll();
        if (outcome.Ok())
            outcome = Rows().PositionOf(key, position);
    }
    if (!isThere)
        position = -1;
    return outcome;
}

Outcome StaticCursor::MoveToRecord(const RecordId& id)
{
    const std::optional<RecordKey> key = KeyOf(id, plan_.sources.size());
    if (kept_ || !key)
        return GoneOutcome();
    return InRead([this, &key] {
        qint64 position = -1;
        Outcome outcome = TakeUpChanges();
        if (outcome.Ok())
            outcome = CountAll();
        if (outcome.Ok())
            outcome = Rows().PositionOf(*key, position);
        if (outcome.Ok() && positions_->IsBehind())
            outcome = FindInOldOrder(*key, position);
        if (!outcome.Ok() || position < 0)
            return outcome.Ok() ? GoneOutcome() : outcome;
        return Settle(position);
    });
}

Outcome StaticCursor::ReadCurrent(std::span<const int> fields, std::vector<Value>& values)
{
    Outcome outcome = Rows().ReadRecord(key_, fields, [&](std::span<const Cell> cells) {
        for (size_t i = 0; i < cells.size(); ++i)
            values.push_back(ValueOfCell(cells[i], plan_.fields[size_t(fields[i])].type));
        return false;
    });
    return outcome.Ok() && values.empty() ? GoneOutcome() : outcome;
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

Outcome StaticCursor::GetValue(int field, Value& value)
{
    if (place_ != Place::On && place_ != Place::Gone)
        return {Hr::NoCurrentRecord, {}};
    if (values_.empty()) {
        if (Outcome outcome = place_ == Place::On ? LoadRecord() : GoneOutcome(); !outcome.Ok())
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
        if (outcome.Ok() && positions_->IsBehind()) {
            const bool isPage = range.count >= 0 && range.count <= kMostOnPage;
            outcome = isPage ? DropDeleted(range.first, range.count) : TakeUpEverything();
        }
        return outcome.Ok() ? Rows().Read(range, sink) : outcome;
    });
}

} // namespace mirel::sqlite
