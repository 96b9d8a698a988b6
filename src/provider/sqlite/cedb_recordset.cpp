#include "provider/sqlite/cedb_recordset.h"

#include "provider/sqlite/cedb_provider.h"
#include "provider/sqlite/database_file.h"
#include "provider/sqlite/forward_cursor.h"
#include "provider/sqlite/static_cursor.h"
#include "provider/sqlite/structure_change.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel::sqlite {

Hr CedbRecordset::Keep(Outcome outcome)
{
    context_ = outcome.Ok() ? QString() : std::move(outcome.context);
    return outcome.code;
}

bool CedbRecordset::HasCursor() const
{
    return cursor_ && file_->IsOpen();
}

bool CedbRecordset::IsField(int field) const
{
    return field >= 0 && size_t(field) < Fields().size();
}

bool CedbRecordset::AreFields(std::span<const FieldChange> values) const
{
    return std::ranges::all_of(values, [this](const FieldChange& change) { return IsField(change.field); });
}

template <typename Call>
Hr CedbRecordset::OnCursor(Call call)
{
    if (!HasCursor())
        return Keep({Hr::NotOpen, {}});
    const std::shared_ptr<DatabaseFile> kept = file_; // a sink may close the database
    return Keep(call(*cursor_));
}

template <typename Call>
Hr CedbRecordset::Change(Call call)
{
    if (HasCursor() && lock_ == LockType::ReadOnly)
        return Keep({Hr::ReadOnly, readOnlyReason_});
    return OnCursor(call);
}

Hr CedbRecordset::Open(const QString& source, const DatabaseLocation& database, CursorType cursor, LockType lock)
{
    Close();
    source_ = source;
    const Outcome outcome = database.IsEmpty() ? RunOnNoDatabase(source) : Run(source, database, cursor, lock);
    if (!outcome.Ok()) {
        cursor_.reset();
        file_.reset();
        lock_ = lock; // a failed join is told by the lock that was asked for
    }
    return Keep(outcome);
}

void CedbRecordset::Close()
{
    cursor_.reset();
    file_.reset();
    source_.clear();
    context_.clear();
    lock_ = LockType::ReadOnly;
}

Outcome CedbRecordset::RunOnNoDatabase(const QString& source)
{
    PlanResult result = PlanDatabaseStatement(source);
    if (auto* failure = std::get_if<PlanFailure>(&result))
        return {failure->code, failure->context};
    return RunDatabasePlan(std::get<Plan>(result));
}

Outcome CedbRecordset::RunDatabasePlan(const Plan& plan)
{
    if (const auto* create = std::get_if<CreateDatabase>(&plan))
        return DatabaseFile::Create(create->path);
    const QString& path = std::get<DropDatabase>(plan).path;
    provider_.CloseDatabase(path);
    return DatabaseFile::Remove(path);
}

Outcome CedbRecordset::Run(const QString& source, const DatabaseLocation& database, CursorType cursor,
                           LockType lock)
{
    Outcome outcome;
    file_ = provider_.FileOf(database, outcome);
    if (file_)
        outcome = file_->RefreshSchema();
    if (!outcome.Ok())
        return outcome;
    PlanResult result = PlanStatement(source, file_->Schema());
    if (auto* failure = std::get_if<PlanFailure>(&result))
        return {failure->code, failure->context};
    return RunPlan(std::move(std::get<Plan>(result)), cursor, lock);
}

Outcome CedbRecordset::RunPlan(Plan plan, CursorType cursor, LockType lock)
{
    if (auto* select = std::get_if<SelectPlan>(&plan))
        return OpenSelect(std::move(*select), cursor, lock);
    if (const auto* structure = std::get_if<StructurePlan>(&plan))
        return ChangeStructure(*file_, *structure);
    const auto* change = std::get_if<ChangePlan>(&plan);
    if (!change)
        return RunDatabasePlan(plan);
    Outcome outcome = file_->Execute(change->sql);
    if (outcome.Ok())
        file_->NoteChange(change->table);
    return outcome;
}

Outcome CedbRecordset::OpenSelect(SelectPlan plan, CursorType cursor, LockType lock)
{
    readOnlyReason_ = plan.readOnlyReason;
    if (file_->IsReadOnly())
        readOnlyReason_ = StringText(Str::DatabaseIsReadOnly, {file_->Path()});
    if (readOnlyReason_.isEmpty())
        readOnlyReason_ = StringText(Str::OpenedForReading);
    if (cursor == CursorType::Static)
        cursor_ = std::make_unique<StaticCursor>(file_, std::move(plan));
    else
        cursor_ = std::make_unique<ForwardCursor>(file_, std::move(plan));
    const bool updatable = cursor_->IsUpdatable() && !file_->IsReadOnly();
    lock_ = updatable ? lock : LockType::ReadOnly;
    return cursor_->Open();
}

std::span<const ResultField> CedbRecordset::Fields() const
{
    return cursor_ ? cursor_->Fields() : std::span<const ResultField>();
}

qint64 CedbRecordset::RecordCount()
{
    return HasCursor() ? cursor_->RecordCount() : -1;
}

bool CedbRecordset::CountStep(int budgetMs)
{
    return !HasCursor() || cursor_->CountStep(budgetMs);
}

quint64 CedbRecordset::Generation() const
{
    return HasCursor() ? cursor_->Generation() : 0;
}

bool CedbRecordset::AtBegin() const
{
    return HasCursor() && cursor_->AtBegin();
}

bool CedbRecordset::AtEnd() const
{
    return !HasCursor() || cursor_->AtEnd();
}

bool CedbRecordset::IsGone() const
{
    return HasCursor() && cursor_->IsGone();
}

Hr CedbRecordset::TakeUpChanges(Values values)
{
    return OnCursor([values](ResultCursor& cursor) { return cursor.TakeUpChanges(values); });
}

void CedbRecordset::AllowOldOrder(qint64 fromRecords)
{
    if (HasCursor())
        cursor_->AllowOldOrder(fromRecords);
}

bool CedbRecordset::IsBehind() const
{
    return HasCursor() && cursor_->IsBehind();
}

bool CedbRecordset::CatchUp(int budgetMs)
{
    return !HasCursor() || cursor_->CatchUp(budgetMs);
}

qint64 CedbRecordset::Position() const
{
    return HasCursor() ? cursor_->Position() : -1;
}

Hr CedbRecordset::MoveFirst()
{
    return OnCursor([](ResultCursor& cursor) { return cursor.MoveFirst(); });
}

Hr CedbRecordset::MoveLast()
{
    return OnCursor([](ResultCursor& cursor) { return cursor.MoveLast(); });
}

Hr CedbRecordset::MoveNext()
{
    return OnCursor([](ResultCursor& cursor) { return cursor.MoveNext(); });
}

Hr CedbRecordset::MovePrevious()
{
    return OnCursor([](ResultCursor& cursor) { return cursor.MovePrevious(); });
}

Hr CedbRecordset::MoveTo(qint64 position)
{
    return OnCursor([position](ResultCursor& cursor) { return cursor.MoveTo(position); });
}

RecordId CedbRecordset::Id() const
{
    return HasCursor() ? cursor_->Id() : RecordId();
}

RecordId CedbRecordset::IdInTable() const
{
    return HasCursor() ? cursor_->IdInTable() : RecordId();
}

Hr CedbRecordset::Ids(qint64 first, qint64 count, std::vector<RecordId>& ids)
{
    return OnCursor([&](ResultCursor& cursor) { return cursor.Ids(first, count, ids); });
}

Hr CedbRecordset::ReadRecords(std::span<const RecordId> ids, const RecordSink& sink)
{
    return OnCursor([&](ResultCursor& cursor) { return cursor.ReadRecords(ids, sink); });
}

Hr CedbRecordset::MoveToRecord(const RecordId& id)
{
    return OnCursor([&id](ResultCursor& cursor) { return cursor.MoveToRecord(id); });
}

Hr CedbRecordset::GetValue(int field, Value& value)
{
    if (HasCursor() && !IsField(field))
        return Keep({Hr::NoSuchColumn, {}});
    return OnCursor([&](ResultCursor& cursor) { return cursor.GetValue(field, value); });
}

Hr CedbRecordset::Read(const ReadRange& range, const CellSink& sink)
{
    if (HasCursor() && !std::ranges::all_of(range.fields, [this](int field) { return IsField(field); }))
        return Keep({Hr::NoSuchColumn, {}});
    return OnCursor([&](ResultCursor& cursor) { return cursor.Read(range, sink); });
}

Hr CedbRecordset::AddNew(std::span<const FieldChange> values, const RecordId& preferred)
{
    if (HasCursor() && !AreFields(values))
        return Keep({Hr::NoSuchColumn, {}});
    return Change([&](ResultCursor& cursor) { return cursor.AddNew(values, preferred); });
}

Hr CedbRecordset::Update(std::span<const FieldChange> values)
{
    if (HasCursor() && !AreFields(values))
        return Keep({Hr::NoSuchColumn, {}});
    return Change([&](ResultCursor& cursor) { return cursor.Update(values); });
}

Hr CedbRecordset::Delete()
{
    return Change([](ResultCursor& cursor) { return cursor.Delete(); });
}

Hr CedbRecordset::UpdateAll(int field, const Value& value, qint64 confirmed, const BulkProgress& progress)
{
    if (HasCursor() && !IsField(field))
        return Keep({Hr::NoSuchColumn, {}});
    return Change([&](ResultCursor& cursor) { return cursor.UpdateAll(field, value, confirmed, progress); });
}

Hr CedbRecordset::DeleteAll(qint64 confirmed, const BulkProgress& progress)
{
    return Change([&](ResultCursor& cursor) { return cursor.DeleteAll(confirmed, progress); });
}

} // namespace mirel::sqlite
