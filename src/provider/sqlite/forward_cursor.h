#pragma once

#include "provider/sqlite/database_file.h"
#include "provider/sqlite/kept_records.h"
#include "provider/sqlite/plan.h"
#include "provider/sqlite/result_cursor.h"

#include <memory>
#include <vector>

namespace mirel::sqlite {

// Walks a result once, from its first record to its end. Holds a block of records at a time, so that no
// statement is left running between two calls; of a result that has to be worked out before it yields its first
// record (sorted, grouped) it holds all that memory allows, so that the work is done once.
class ForwardCursor : public ResultCursor {
public:
    ForwardCursor(std::shared_ptr<DatabaseFile> file, SelectPlan plan);

    Outcome Open() override { return FetchBlock(); }
    std::span<const ResultField> Fields() const override { return plan_.fields; }

    bool AtBegin() const override { return false; }
    bool AtEnd() const override { return position_ >= blockStart_ + block_.Size(); }
    qint64 Position() const override { return AtEnd() ? -1 : position_; }
    Outcome MoveFirst() override;
    Outcome MoveLast() override;
    Outcome MoveNext() override;
    Outcome MovePrevious() override;
    Outcome MoveTo(qint64 position) override;

    Outcome GetValue(int field, Value& value) override;
    Outcome Read(const ReadRange& range, const CellSink& sink) override;

private:
    Outcome FetchBlock();
    Outcome FetchFirst();
    // In the order of one term, by an own sort. `sorted` stays false when it is too much for memory.
    Outcome FetchSorted(bool& sorted);
    Outcome FetchFurther(const CellSink& keep);
    Outcome Walk(const std::vector<int>& fields, const CellSink& sink);
    Outcome ReadOn(const ReadRange& range, const std::vector<int>& fields, const CellSink& sink);
    void ReadBlock(const ReadRange& range, const std::vector<int>& fields, const CellSink& sink);

    std::shared_ptr<DatabaseFile> file_;
    SelectPlan plan_;
    KeptRecords block_;
    qint64 blockStart_ = 0;
    bool blockIsLast_ = false;
    qint64 position_ = 0;
    std::unique_ptr<ResultCursor> rest_; // once a record behind the first block is asked for
};

} // namespace mirel::sqlite
