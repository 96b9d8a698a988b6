#pragma once

#include "provider/sqlite/database_file.h"
#include "provider/sqlite/kept_result.h"
#include "provider/sqlite/plan.h"
#include "provider/sqlite/record_positions.h"
#include "provider/sqlite/record_writer.h"
#include "provider/sqlite/result_cursor.h"
#include "provider/sqlite/transaction.h"

#include <memory>
#include <optional>

namespace mirel::sqlite {

// A result that knows its records by their keys, so that every position can be reached. Notices what others
// changed, in this program or another, before it uses positions again or writes.
class StaticCursor : public ResultCursor {
public:
    StaticCursor(std::shared_ptr<DatabaseFile> file, SelectPlan plan);

    Outcome Open() override;
    std::span<const ResultField> Fields() const override { return plan_.fields; }
    bool IsUpdatable() const override { return writer_.has_value(); }

    qint64 RecordCount() override;
    bool CountStep(int budgetMs) override;
    quint64 Generation() const override { return generation_; }

    bool AtBegin() const override { return place_ == Place::Before; }
    bool AtEnd() const override { return place_ == Place::Behind; }
    bool IsGone() const override { return place_ == Place::Gone; }
    qint64 Position() const override { return place_ == Place::On ? position_ : -1; }
    Outcome TakeUpChanges(ProviderRecordset::Values values) override;
    void AllowOldOrder(qint64 fromRecords) override { positions_->AllowOldOrder(fromRecords); }
    bool IsBehind() const override { return positions_->IsBehind(); }
    bool CatchUp(int budgetMs) override;
    Outcome MoveFirst() override { return MoveTo(0); }
    Outcome MoveLast() override;
    Outcome MoveNext() override;
    Outcome MovePrevious() override;
    Outcome MoveTo(qint64 position) override;

    RecordId Id() const override;
    RecordId IdInTable() const override;
    Outcome Ids(qint64 first, qint64 count, std::vector<RecordId>& ids) override;
    Outcome ReadRecords(std::span<const RecordId> ids, const RecordSink& sink) override;
    Outcome MoveToRecord(const RecordId& id) override;

    Outcome GetValue(int field, Value& value) override;
    Outcome Read(const ReadRange& range, const CellSink& sink) override;

    Outcome AddNew(std::span<const FieldChange> values, const RecordId& preferred) override;
    Outcome Update(std::span<const FieldChange> values) override;
    Outcome Delete() override;
    Outcome UpdateAll(int field, const Value& value, qint64 confirmed, const BulkProgress& progress) override;
    Outcome DeleteAll(qint64 confirmed, const BulkProgress& progress) override;

private:
    enum class Place { Before, On, Gone, Behind };

    static const Outcome& GoneOutcome();
    template <typename Work>
    Outcome InRead(Work work)
    {
        ReadTransaction transaction(*file_);
        Outcome outcome = transaction.Begin();
        if (outcome.Ok())
            outcome = work();
        const Outcome ended = transaction.End();
        return outcome.Ok() ? ended : outcome;
    }
    template <typename Work>
    Outcome InWrite(Work work);
    bool HasTables() const;
    ResultRows& Rows() const { return positions_->Rows(); }
    Outcome TakeUpChanges();
    Outcome TakeUpForOneRecord();
    Outcome TakeUpEverything();
    bool IsAnotherRecord();
    Outcome FindCurrent();
    Outcome KeepPlace();
    Outcome DropDeleted(qint64 first, qint64 count);
    Outcome FindInOldOrder(const RecordKey& key, qint64& position);
    Outcome Settle(qint64 position);
    Outcome CountAll();
    Outcome Recount(); // all, as they are now
    Outcome ReadCurrent(std::span<const int> fields, std::vector<Value>& values);
    Outcome LoadRecord();
    Outcome CheckCurrent(std::span<const int> fields);
    Outcome CheckCount(qint64 confirmed);
    qint64& RowIdOfCurrent() { return key_[plan_.updatableSource]; }
    void AdoptOwnChange();

    std::shared_ptr<DatabaseFile> file_;
    SelectPlan plan_;
    std::optional<KeptResult> kept_;
    std::optional<RecordPositions> positions_;
    std::optional<RecordWriter> writer_;
    quint64 generation_ = 0;

    Place place_ = Place::Before;
    qint64 position_ = -1;
    RecordKey key_;                 // of the current record
    std::vector<Value> values_;     // of the current record, once one was asked for
    bool valuesAged_ = false;       // others may have changed it since
    qint64 structureOfValues_ = -1; // the version of the file's structure when they were read
};

} // namespace mirel::sqlite
