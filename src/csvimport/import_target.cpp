#include "csvimport/import_target.h"

#include "csvimport/import_check.h"
#include "csvimport/import_lines.h"
#include "data/provider_error.h"
#include "provider/cell_value.h"

#include <algorithm>

namespace mirel {
namespace {

QString FaultOf(const DbRecordset& table)
{
    return ProviderErrorText(&table, table.LastResult(), table.ErrorContext());
}

std::vector<int> PlacesIn(const DbRecordset& table, const QStringList& names)
{
    return PlacesOfKey(names, table.Fields());
}

} // namespace

std::unique_ptr<AppendTarget> AppendTarget::Open(DbConnection& connection, const DatabaseLocation& database,
                                                 const ImportPlan& plan, QString& fault)
{
    Hr result = Hr::Unexpected;
    QString context;
    std::unique_ptr<RecordAppender> appender =
        connection.Provider() ? connection.Provider()->CreateAppender(database, plan.table,
                                                                      FieldsToFill(plan.columns), result, context)
                              : nullptr;
    if (!appender) {
        fault = ProviderErrorText(nullptr, result, context);
        return {};
    }
    return std::unique_ptr<AppendTarget>(new AppendTarget(std::move(appender)));
}

ImportTarget::Taken AppendTarget::Put(std::span<const Cell> cells, qint64)
{
    const Hr appended = appender_->Append(cells);
    if (!Failed(appended))
        return Taken::Added;
    return Refuse(ProviderErrorText(nullptr, appended, appender_->ErrorContext()), appender_->RefusedField());
}

Hr AppendTarget::Commit()
{
    const Hr committed = appender_->Commit();
    if (Failed(committed))
        errorText_ = ProviderErrorText(nullptr, committed, appender_->ErrorContext());
    return committed;
}

std::unique_ptr<KeyedTarget> KeyedTarget::Open(DbConnection& connection, const DatabaseLocation& database,
                                               const ImportPlan& plan, QString& fault)
{
    std::unique_ptr<KeyedTarget> target(new KeyedTarget(connection, database));
    return target->Begin(connection, database, plan, fault) ? std::move(target) : nullptr;
}

bool KeyedTarget::Begin(DbConnection& connection, const DatabaseLocation& database, const ImportPlan& plan,
                        QString& fault)
{
    if (!transaction_.Begin()) {
        fault = ProviderErrorText(nullptr, transaction_.LastResult(), transaction_.ErrorContext());
        return false;
    }
    if (!ReadKeys(table_, database, plan, keys_, fault))
        return false;
    append_ = AppendTarget::Open(connection, database, plan, fault);
    if (!append_)
        return false;
    fieldAt_ = PlacesIn(table_, FieldsToFill(plan.columns));
    keyAt_ = PlacesOfKey(plan.key, append_->Fields());
    return true;
}

ImportTarget::Taken KeyedTarget::Put(std::span<const Cell> cells, qint64 line)
{
    const std::optional<std::string> key = KeyIndex::KeyOf(cells, keyAt_);
    const KeyIndex::Entry* entry = key ? keys_.Find(*key) : nullptr;
    if (entry && entry->lastLine != line)
        return Taken::Superseded;
    if (entry && !entry->record.IsNull())
        return Update(entry->record, cells);
    const Taken taken = append_->Put(cells, line);
    return taken == Taken::Refused ? Refuse(append_->ErrorText(), append_->RefusedField()) : taken;
}

ImportTarget::Taken KeyedTarget::Update(const RecordId& record, std::span<const Cell> cells)
{
    std::vector<FieldChange> changes;
    for (size_t i = 0; i < cells.size(); ++i) {
        if (std::ranges::find(keyAt_, int(i)) == keyAt_.end())
            changes.push_back({fieldAt_[i], ValueOfCell(cells[i], table_.TypeOfField(fieldAt_[i]))});
    }
    if (changes.empty())
        return Taken::Updated;
    if (!table_.MoveToRecord(record) || !table_.Update(changes))
        return Refuse(FaultOf(table_), -1);
    return Taken::Updated;
}

Hr KeyedTarget::Commit()
{
    if (const Hr hr = append_->Commit(); Failed(hr)) {
        errorText_ = append_->ErrorText();
        return hr;
    }
    if (transaction_.Commit())
        return Hr::Ok;
    errorText_ = ProviderErrorText(nullptr, transaction_.LastResult(), transaction_.ErrorContext());
    return transaction_.LastResult();
}

bool ReadKeys(DbRecordset& table, const DatabaseLocation& database, const ImportPlan& plan, KeyIndex& keys,
              QString& fault)
{
    if (table.Open(u'[' + QString(plan.table).replace(u']', QStringLiteral("]]")) + u']', database,
                   CursorType::Static, LockType::Optimistic) &&
        keys.Build(table, PlacesIn(table, plan.key)))
        return true;
    fault = FaultOf(table);
    return false;
}

} // namespace mirel
