#include "provider/sqlite/record_positions.h"

#include "provider/sqlite/keyed_rows.h"
#include "provider/sqlite/table_rows.h"

namespace mirel::sqlite {

RecordPositions::RecordPositions(DatabaseFile& file, const SelectPlan& plan)
    : file_(file)
    , plan_(plan)
{
}

std::unique_ptr<ResultRows> RecordPositions::MakeRows() const
{
    if (plan_.sources.size() == 1 && plan_.where.isEmpty() && plan_.order.empty())
        return std::make_unique<TableRows>(file_, plan_);
    return std::make_unique<KeyedRows>(file_, plan_);
}

Outcome RecordPositions::Begin(bool isShared)
{
    isShared_ = isShared;
    rows_ = MakeRows();
    structure_ = file_.SchemaVersion();
    return ReadVersion(version_);
}

quint64 RecordPositions::OwnVersion() const
{
    quint64 version = 0;
    for (const PlannedSource& source : plan_.sources)
        version += file_.TableVersion(source.table);
    return version;
}

Outcome RecordPositions::ReadVersion(Version& version) const
{
    version = {};
    if (!isShared_)
        return {};
    version.own = OwnVersion();
    version.values = file_.ValuesVersion();
    Outcome outcome;
    Statement statement = file_.Prepare("PRAGMA data_version", outcome);
    if (!statement)
        return outcome;
    const int result = statement.Step();
    if (result == SQLITE_ROW)
        version.data = statement.Integer(0);
    return file_.OutcomeOf(result);
}

bool RecordPositions::MayStayOld() const
{
    return rows_->IsMadeInSteps(oldFrom_) && !file_.IsWriting() && AreKeysTheSame();
}

Outcome RecordPositions::Look(Change& change)
{
    Version now;
    Outcome outcome = ReadVersion(now);
    if (!outcome.Ok())
        return outcome;
    if (now != version_)
        change = now.HasSameRecords(version_) ? Change::Values : Change::Records;
    version_ = now;
    if (IsBehind() ? MayStayOld() : change != Change::Records)
        return {};
    change = Change::Records;
    if (IsBehind() || !MayStayOld())
        return Renew();
    BeginComing();
    return {};
}

Outcome RecordPositions::Renew()
{
    coming_.reset();
    rows_->Restart();
    structure_ = file_.SchemaVersion();
    return ReadVersion(version_);
}

void RecordPositions::AdoptOwnChange()
{
    version_.own = OwnVersion();
    AdoptOwnValues();
    if (IsBehind())
        BeginComing();
}

void RecordPositions::AdoptOwnValues()
{
    version_.values = file_.ValuesVersion();
}

void RecordPositions::BeginComing()
{
    coming_ = MakeRows();
    comingVersion_ = version_;
}

// A change in the meantime does not begin it again: under a steady writer it would never come to an end.
Outcome RecordPositions::CatchUp(const QDeadlineTimer& until, bool& isNew)
{
    Outcome outcome = coming_->Extend(kAllRecords, until);
    if (!outcome.Ok() || !coming_->IsComplete())
        return outcome;
    rows_ = std::move(coming_);
    isNew = true;
    if (!comingVersion_.HasSameRecords(version_))
        BeginComing();
    return {};
}

void RecordPositions::GiveUp()
{
    coming_.reset();
    version_.data = -1;
}

Outcome RecordPositions::Holds(const RecordKey& key, bool& holds) const
{
    holds = false;
    constexpr int kAnyField = 0;
    return rows_->ReadRecord(key, std::span(&kAnyField, 1), [&holds](std::span<const Cell>) {
        holds = true;
        return false;
    });
}

} // namespace mirel::sqlite
