#pragma once

#include "provider/provider.h"
#include "provider/sqlite/outcome.h"

#include <span>
#include <vector>

namespace mirel::sqlite {

// The rows of one SELECT and a position in them, as the recordset of the provider sees them: see
// ProviderRecordset for what the calls mean. The file is open whenever one is made.
class ResultCursor {
public:
    virtual ~ResultCursor() = default;

    // Runs the SELECT and stands on its first record.
    virtual Outcome Open() = 0;
    virtual std::span<const ResultField> Fields() const = 0;
    virtual bool IsUpdatable() const { return false; }

    virtual qint64 RecordCount() { return -1; }
    virtual bool CountStep(int /*budgetMs*/) { return true; }
    virtual quint64 Generation() const { return 0; }

    virtual bool AtBegin() const = 0;
    virtual bool AtEnd() const = 0;
    virtual bool IsGone() const { return false; }
    virtual qint64 Position() const = 0;
    virtual Outcome TakeUpChanges(ProviderRecordset::Values) { return {}; }
    virtual void AllowOldOrder(qint64 /*fromRecords*/) {}
    virtual bool IsBehind() const { return false; }
    virtual bool CatchUp(int /*budgetMs*/) { return true; }
    virtual Outcome MoveFirst() = 0;
    virtual Outcome MoveLast() = 0;
    virtual Outcome MoveNext() = 0;
    virtual Outcome MovePrevious() = 0;
    virtual Outcome MoveTo(qint64 position) = 0;

    virtual RecordId Id() const { return {}; }
    virtual RecordId IdInTable() const { return {}; }
    virtual Outcome Ids(qint64, qint64, std::vector<RecordId>&) { return {Hr::NotImplemented, {}}; }
    virtual Outcome ReadRecords(std::span<const RecordId>, const RecordSink&) { return {Hr::NotImplemented, {}}; }
    virtual Outcome MoveToRecord(const RecordId&) { return {Hr::NoCurrentRecord, {}}; }

    virtual Outcome GetValue(int field, Value& value) = 0;
    virtual Outcome Read(const ReadRange& range, const CellSink& sink) = 0;

    virtual Outcome AddNew(std::span<const FieldChange>, const RecordId&) { return {Hr::ReadOnly, {}}; }
    virtual Outcome Update(std::span<const FieldChange>) { return {Hr::ReadOnly, {}}; }
    virtual Outcome Delete() { return {Hr::ReadOnly, {}}; }
    virtual Outcome UpdateAll(int, const Value&, qint64, const BulkProgress&) { return {Hr::ReadOnly, {}}; }
    virtual Outcome DeleteAll(qint64, const BulkProgress&) { return {Hr::ReadOnly, {}}; }
};

} // namespace mirel::sqlite
