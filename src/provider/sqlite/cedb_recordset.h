#pragma once

#include "provider/provider.h"
#include "provider/sqlite/plan.h"
#include "provider/sqlite/result_cursor.h"

#include <memory>

namespace mirel::sqlite {

class CedbProvider;
class DatabaseFile;

// A recordset of the provider "cedb": runs one statement, and hands every call on to the cursor over its rows.
class CedbRecordset : public ProviderRecordset {
public:
    explicit CedbRecordset(CedbProvider& provider)
        : provider_(provider)
    {
    }

    Hr Open(const QString& source, const DatabaseLocation& database, CursorType cursor, LockType lock) override;
    void Close() override;

    QString Source() const override { return source_; }
    LockType Lock() const override { return lock_; }
    QString ErrorContext() const override { return context_; }
    std::span<const ResultField> Fields() const override;

    qint64 RecordCount() override;
    bool CountStep(int budgetMs) override;
    quint64 Generation() const override;

    bool AtBegin() const override;
    bool AtEnd() const override;
    qint64 Position() const override;

    bool IsGone() const override;
    Hr TakeUpChanges(Values values) override;
    void AllowOldOrder(qint64 fromRecords) override;
    bool IsBehind() const override;
    bool CatchUp(int budgetMs) override;
    Hr MoveFirst() override;
    Hr MoveLast() override;
    Hr MoveNext() override;
    Hr MovePrevious() override;
    Hr MoveTo(qint64 position) override;

    RecordId Id() const override;
    RecordId IdInTable() const override;
    Hr Ids(qint64 first, qint64 count, std::vector<RecordId>& ids) override;
    Hr ReadRecords(std::span<const RecordId> ids, const RecordSink& sink) override;
    Hr MoveToRecord(const RecordId& id) override;

    Hr GetValue(int field, Value& value) override;
    Hr Read(const ReadRange& range, const CellSink& sink) override;

    Hr AddNew(std::span<const FieldChange> values, const RecordId& preferred) override;
    Hr Update(std::span<const FieldChange> values) override;
    Hr Delete() override;
    Hr UpdateAll(int field, const Value& value, qint64 confirmed, const BulkProgress& progress) override;
    Hr DeleteAll(qint64 confirmed, const BulkProgress& progress) override;

private:
    Outcome Run(const QString& source, const DatabaseLocation& database, CursorType cursor, LockType lock);
    Outcome RunPlan(Plan plan, CursorType cursor, LockType lock);
    Outcome RunOnNoDatabase(const QString& source);
    Outcome RunDatabasePlan(const Plan& plan);
    Outcome OpenSelect(SelectPlan plan, CursorType cursor, LockType lock);

    bool HasCursor() const;
    bool IsField(int field) const;
    bool AreFields(std::span<const FieldChange> values) const;
    Hr Keep(Outcome outcome);
    template <typename Call>
    Hr OnCursor(Call call);
    template <typename Call>
    Hr Change(Call call);

    CedbProvider& provider_;
    std::shared_ptr<DatabaseFile> file_;
    std::unique_ptr<ResultCursor> cursor_; // none: not open, or a statement without rows
    QString source_;
    QString context_;
    QString readOnlyReason_; // of an open result that refuses changes
    LockType lock_ = LockType::ReadOnly;
};

} // namespace mirel::sqlite
