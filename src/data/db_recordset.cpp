#include "data/db_recordset.h"

#include "platform/user_locale.h"
#include "provider/dialect/parser.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel {

bool OnlyReads(const QString& statement)
{
    const dialect::ParseResult parsed = dialect::ParseStatement(statement);
    const auto* tree = std::get_if<dialect::Statement>(&parsed);
    return !tree || std::holds_alternative<dialect::Select>(*tree) ||
           std::holds_alternative<dialect::WholeTable>(*tree);
}

DbRecordset::DbRecordset(DbConnection& connection)
    : cursor_(connection.Provider() ? connection.Provider()->CreateRecordset() : nullptr)
{
}

DbRecordset::~DbRecordset()
{
    Close();
}

bool DbRecordset::Keep(Hr result) const
{
    lastResult_ = result;
    return !Failed(result);
}

bool DbRecordset::Open(const QString& source, const DatabaseLocation& database, CursorType cursor, LockType lock)
{
    Close();
    if (!cursor_)
        return Keep(Hr::NotOpen);
    open_ = Keep(cursor_->Open(source, database, cursor, lock));
    return open_;
}

bool DbRecordset::OpenSource(const QString& source, const DatabaseLocation& database, CursorType cursor,
                             LockType lock)
{
    if (OnlyReads(source))
        return Open(source, database, cursor, lock);
    Close();
    isNoSource_ = true;
    return Keep(Hr::SyntaxError);
}

void DbRecordset::Close()
{
    if (open_)
        cursor_->Close();
    open_ = false;
    isNoSource_ = false;
}

QString DbRecordset::ErrorContext() const
{
    if (isNoSource_)
        return StringText(Str::OnlySelectIsRead);
    return cursor_ ? cursor_->ErrorContext() : QString();
}

QString DbRecordset::Source() const
{
    return cursor_ ? cursor_->Source() : QString();
}

LockType DbRecordset::Lock() const
{
    return cursor_ ? cursor_->Lock() : LockType::ReadOnly;
}

std::span<const ResultField> DbRecordset::Fields() const
{
    return open_ ? cursor_->Fields() : std::span<const ResultField>();
}

int DbRecordset::FieldCount() const
{
    return int(Fields().size());
}

QString DbRecordset::FieldName(int index) const
{
    return index >= 0 && index < FieldCount() ? Fields()[size_t(index)].name : QString();
}

int DbRecordset::FieldIndex(QStringView name) const
{
    const std::span<const ResultField> fields = Fields();
    const auto at = std::ranges::find_if(fields, [name](const ResultField& field) { return field.name == name; });
    return at == fields.end() ? -1 : int(at - fields.begin());
}

FieldType DbRecordset::TypeOfField(int index) const
{
    return index >= 0 && index < FieldCount() ? Fields()[size_t(index)].type : FieldType::None;
}

int DbRecordset::FieldSize(int index) const
{
    return index >= 0 && index < FieldCount() ? Fields()[size_t(index)].size : -1;
}

bool DbRecordset::MoveFirst()
{
    return Keep(open_ ? cursor_->MoveFirst() : Hr::NotOpen);
}

bool DbRecordset::MoveLast()
{
    return Keep(open_ ? cursor_->MoveLast() : Hr::NotOpen);
}

bool DbRecordset::MoveNext()
{
    return Keep(open_ ? cursor_->MoveNext() : Hr::NotOpen);
}

bool DbRecordset::MovePrevious()
{
    return Keep(open_ ? cursor_->MovePrevious() : Hr::NotOpen);
}

bool DbRecordset::MoveTo(qint64 position)
{
    return Keep(open_ ? cursor_->MoveTo(position) : Hr::NotOpen);
}

bool DbRecordset::IsEof() const
{
    return !open_ || cursor_->AtEnd();
}

bool DbRecordset::IsBof() const
{
    return !open_ || cursor_->AtBegin();
}

qint64 DbRecordset::Position() const
{
    return open_ ? cursor_->Position() : -1;
}

bool DbRecordset::IsGone() const
{
    return open_ && cursor_->IsGone();
}

bool DbRecordset::TakeUpChanges(ProviderRecordset::Values values)
{
    return Keep(open_ ? cursor_->TakeUpChanges(values) : Hr::NotOpen);
}

RecordId DbRecordset::Id() const
{
    return open_ ? cursor_->Id() : RecordId();
}

RecordId DbRecordset::IdInTable() const
{
    return open_ ? cursor_->IdInTable() : RecordId();
}

bool DbRecordset::Ids(qint64 first, qint64 count, std::vector<RecordId>& ids)
{
    return Keep(open_ ? cursor_->Ids(first, count, ids) : Hr::NotOpen);
}

bool DbRecordset::ReadRecords(std::span<const RecordId> ids, const RecordSink& sink)
{
    return Keep(open_ ? cursor_->ReadRecords(ids, sink) : Hr::NotOpen);
}

bool DbRecordset::MoveToRecord(const RecordId& id)
{
    return Keep(open_ ? cursor_->MoveToRecord(id) : Hr::NotOpen);
}

qint64 DbRecordset::RecordCount()
{
    return open_ ? cursor_->RecordCount() : -1;
}

bool DbRecordset::CountStep(int budgetMs)
{
    return !open_ || cursor_->CountStep(budgetMs);
}

void DbRecordset::AllowOldOrder(qint64 fromRecords)
{
    if (open_)
        cursor_->AllowOldOrder(fromRecords);
}

bool DbRecordset::IsBehind() const
{
    return open_ && cursor_->IsBehind();
}

bool DbRecordset::CatchUp(int budgetMs)
{
    return !open_ || cursor_->CatchUp(budgetMs);
}

quint64 DbRecordset::Generation() const
{
    return open_ ? cursor_->Generation() : 0;
}

Value DbRecordset::FieldValue(int index) const
{
    if (index < 0 || index >= FieldCount())
        return Value::Integer(0);
    Value value = Value::Null();
    return Keep(cursor_->GetValue(index, value)) ? value : Value::Null();
}

Value DbRecordset::FieldValue(QStringView name) const
{
    return FieldValue(FieldIndex(name));
}

QString DbRecordset::ValueText(int index) const
{
    return VariantText(FieldValue(index));
}

bool DbRecordset::Read(const ReadRange& range, const CellSink& sink)
{
    return Keep(open_ ? cursor_->Read(range, sink) : Hr::NotOpen);
}

bool DbRecordset::AddNew(std::span<const FieldChange> values, const RecordId& preferred)
{
    return Keep(open_ ? cursor_->AddNew(values, preferred) : Hr::NotOpen);
}

bool DbRecordset::Update(std::span<const FieldChange> values)
{
    return Keep(open_ ? cursor_->Update(values) : Hr::NotOpen);
}

bool DbRecordset::Update(int index, const Value& value)
{
    const FieldChange change{index, value};
    return Update(std::span(&change, 1));
}

bool DbRecordset::Delete()
{
    return Keep(open_ ? cursor_->Delete() : Hr::NotOpen);
}

bool DbRecordset::UpdateAll(int field, const Value& value, qint64 confirmed, const BulkProgress& progress)
{
    return Keep(open_ ? cursor_->UpdateAll(field, value, confirmed, progress) : Hr::NotOpen);
}

bool DbRecordset::DeleteAll(qint64 confirmed, const BulkProgress& progress)
{
    return Keep(open_ ? cursor_->DeleteAll(confirmed, progress) : Hr::NotOpen);
}

} // namespace mirel
