#pragma once

#include "provider/sqlite/database_file.h"
#include "provider/sqlite/plan.h"
#include "provider/sqlite/record_sort.h"
#include "provider/sqlite/result_rows.h"

namespace mirel::sqlite {

// The records of a filtered, sorted or joined result: the row ids of all of them, in the result's order. The
// result stays what it was when they were gathered, while the values are those of now.
class KeyedRows : public ResultRows {
public:
    // Both must outlive it.
    KeyedRows(DatabaseFile& file, const SelectPlan& plan);

    void Restart() override;
    Outcome Extend(qint64 wanted, const QDeadlineTimer& until) override;
    qint64 Known() const override { return keys_.Size(); }
    bool IsComplete() const override { return isComplete_; }
    bool IsMadeInSteps(qint64 fromRowIds) const override;

    Outcome KeyAt(qint64 position, RecordKey& key) override;
    Outcome PositionOf(const RecordKey& key, qint64& position) override;
    Outcome Read(const ReadRange& range, const CellSink& sink) override;
    Outcome ReadRecord(const RecordKey& key, std::span<const int> fields, const CellSink& sink) override;

    bool Append(const RecordKey& key) override
    {
        return keys_.Append(std::span(key.constData(), size_t(key.size())));
    }
    void Remove(qint64 position, const RecordKey&) override { keys_.Remove(position); }
    BulkRanges RangesFor(int source) const override;

private:
    // One table in no order or that of one term, read by row ids from the first to the last: keys can be gathered
    // in slices.
    Outcome ChooseGathering();
    bool CanSort() const { return plan_.sources.size() == 1 && plan_.order.size() == 1; }
    Outcome GatherAll();
    Outcome GatherSlice();
    Outcome Gather(Statement& statement);
    Outcome GatherToSort(Statement& statement);
    Outcome HandOverSorted(const QDeadlineTimer& until);
    bool ShouldRunAgain(const ReadRange& range) const;
    Outcome ReadRest(const ReadRange& range, std::span<const int> fields, const CellSink& sink);
    Outcome ReadByKeys(qint64 first, qint64 end, std::span<const int> fields, const CellSink& sink);
    // Nothing has changed since: the SELECT would give these very records in this order.
    bool IsFresh() const { return sqlite3_total_changes64(file_.Handle()) == changesBefore_; }
    // The first records are known, in the order of their row ids, and the others are not.
    bool IsPartial() const { return gathering_ == Gathering::Slices && !sort_ && !isComplete_; }
    QByteArray GatheredColumns() const;
    QByteArray RecordSelect(std::span<const int> fields) const;

    DatabaseFile& file_;
    const SelectPlan& plan_;
    std::vector<QByteArray> storedTables_; // of each source, as SQL
    KeyList keys_;
    bool isComplete_ = false;
    qint64 changesBefore_ = 0; // the handle's count of changes when gathering began

    enum class Gathering { Unknown, Whole, Slices, Sorting };
    Gathering gathering_ = Gathering::Unknown;
    std::unique_ptr<RecordSort> sort_; // while an order is made here; the engine makes the others
    bool isInSlices_ = false;          // the table was read
    qint64 firstRowId_ = 0;            // of a table that is gathered in slices
    qint64 nextRowId_ = 0;
    qint64 lastRowId_ = 0;
    quint64 sliceWidth_ = 0;
};

} // namespace mirel::sqlite
