#pragma once

#include "provider/sqlite/database_file.h"
#include "provider/sqlite/plan.h"
#include "provider/sqlite/result_rows.h"

namespace mirel::sqlite {

// All records of one table in the order of their row ids. Pages are read as ranges of row ids, so that the last
// one costs what the first does.
class TableRows : public ResultRows {
public:
    // Both must outlive it.
    TableRows(DatabaseFile& file, const SelectPlan& plan);

    void Restart() override { index_.Clear(); }
    Outcome Extend(qint64 wanted, const QDeadlineTimer& until) override;
    qint64 Known() const override { return index_.Count(); }
    bool IsComplete() const override { return index_.IsComplete(); }

    Outcome KeyAt(qint64 position, RecordKey& key) override;
    Outcome KeysBetween(qint64 first, qint64 end, std::vector<RecordKey>& keys) override;
    Outcome PositionOf(const RecordKey& key, qint64& position) override;
    Outcome Read(const ReadRange& range, const CellSink& sink) override;
    Outcome ReadRecord(const RecordKey& key, std::span<const int> fields, const CellSink& sink) override;

    bool Append(const RecordKey& key) override { return index_.Append(key[0]); }
    void Remove(qint64 position, const RecordKey& key) override { index_.Remove(position, key[0]); }
    BulkRanges RangesFor(int) const override { return {index_.Ranges(), {}, true, Known()}; }

private:
    Outcome Begin();
    Outcome AddSample(Statement& next); // a statement that finds the one behind
    Outcome Finish();
    // "SELECT what FROM the table " + rest, with "@" in `rest` standing for the row id.
    QByteArray Select(const QByteArray& what, const QByteArray& rest) const;

    DatabaseFile& file_;
    const SelectPlan& plan_;
    QByteArray rowId_;
    RowIdIndex index_;
};

} // namespace mirel::sqlite
