#include "provider/sqlite/forward_cursor.h"

#include "provider/sqlite/record_sort.h"
#include "provider/sqlite/result_rows.h"
#include "provider/sqlite/row_reader.h"
#include "provider/sqlite/select_sql.h"
#include "provider/sqlite/static_cursor.h"
#include "provider/sqlite/transaction.h"

#include <QElapsedTimer>

#include <algorithm>

namespace mirel::sqlite {
namespace {

constexpr qint64 kBlockSize = 256;
constexpr int kFirstBlockMs = 2;
constexpr size_t kMostKeptBytes = size_t(192) << 20;

} // namespace

ForwardCursor::ForwardCursor(std::shared_ptr<DatabaseFile> file, SelectPlan plan)
    : file_(std::move(file))
    , plan_(std::move(plan))
{
}

Outcome ForwardCursor::FetchBlock()
{
    block_.Clear();
    blockStart_ = position_;
    blockIsLast_ = true;
    if (position_ == 0)
        return FetchFirst();
    return FetchFurther([this](std::span<const Cell> cells) {
        block_.Append(cells);
        return blockIsLast_ = block_.Size() < kBlockSize;
    });
}

Outcome ForwardCursor::FetchFirst()
{
    if (plan_.keyed && plan_.order.size() == 1) {
        bool sorted = false;
        Outcome outcome = FetchSorted(sorted);
        if (sorted || !outcome.Ok())
            return outcome;
        block_.Clear();
    }
    Outcome outcome;
    Statement statement = file_->Prepare(WholeSelect(plan_), outcome);
    if (!statement)
        return outcome;
    QElapsedTimer timer;
    timer.start();
    RowReader reader(plan_.fields, AllFields(plan_.fields), RowReader::Layout::Whole);
    bool isWorkedOut = plan_.isAggregated;
    int result = statement.Step();
    for (; result == SQLITE_ROW && blockIsLast_; result = blockIsLast_ ? statement.Step() : result) {
        block_.Append(reader.Read(statement.Get()));
        isWorkedOut = isWorkedOut || sqlite3_stmt_status(statement.Get(), SQLITE_STMTSTATUS_SORT, 0) > 0;
        // A search that finds little is not run to the block's end: reading on starts it again.
        blockIsLast_ = isWorkedOut ? block_.Bytes() < kMostKeptBytes
                                   : block_.Size() < kBlockSize && !timer.hasExpired(kFirstBlockMs);
    }
    return file_->OutcomeOf(result);
}

Outcome ForwardCursor::FetchSorted(bool& sorted)
{
    const PlannedOrder& order = plan_.order.front();
    SelectPlan unsorted = plan_;
    unsorted.order.clear();
    unsorted.fields.emplace_back();
    unsorted.columns.push_back(order.expression);
    Outcome outcome;
    Statement statement = file_->Prepare(WholeSelect(unsorted), outcome);
    if (!statement)
        return outcome;
    const int orderColumn = int(plan_.fields.size());
    RowReader reader(plan_.fields, AllFields(plan_.fields), RowReader::Layout::Whole);
    RecordSort sort(order);
    int result = statement.Step();
    for (; result == SQLITE_ROW; result = statement.Step()) {
        if (!sort.Add(block_.Size(), statement.Get(), orderColumn) || block_.Bytes() > kMostKeptBytes)
            return {};
        block_.Append(reader.Read(statement.Get()));
    }
    if (result != SQLITE_DONE)
        return file_->OutcomeOf(result);
    std::vector<qint64> places;
    places.reserve(size_t(block_.Size()));
    sort.HandOver(kNoHurry, [&places](qint64 place) { places.push_back(place); });
    block_.Arrange(places);
    sorted = true;
    return {};
}

// Most results end within the first block; a longer one that is walked record by record gets positions.
Outcome ForwardCursor::FetchFurther(const CellSink& keep)
{
    if (!rest_) {
        auto rest = std::make_unique<StaticCursor>(file_, plan_);
        if (Outcome outcome = rest->Open(); !outcome.Ok())
            return outcome;
        rest_ = std::move(rest);
    }
    return rest_->Read({.first = position_, .count = kBlockSize + 1, .fields = {}}, keep);
}

// Hands over the records from the current one on, running the SELECT again: nothing was left running.
Outcome ForwardCursor::Walk(const std::vector<int>& fields, const CellSink& sink)
{
    Outcome outcome;
    Statement statement = file_->Prepare(WholeSelect(plan_), outcome);
    if (!statement)
        return outcome;
    RowReader reader(plan_.fields, fields, RowReader::Layout::Whole);
    qint64 toSkip = position_;
    int result = statement.Step();
    for (; result == SQLITE_ROW; result = statement.Step()) {
        if (toSkip-- <= 0 && !sink(reader.Read(statement.Get())))
            return {};
    }
    return file_->OutcomeOf(result);
}

Outcome ForwardCursor::MoveFirst()
{
    return position_ == 0 ? Outcome() : Outcome{Hr::NotImplemented, {}};
}

Outcome ForwardCursor::MoveLast()
{
    return {Hr::NotImplemented, {}};
}

Outcome ForwardCursor::MovePrevious()
{
    return {Hr::NotImplemented, {}};
}

Outcome ForwardCursor::MoveNext()
{
    if (AtEnd())
        return {};
    ++position_;
    return AtEnd() && !blockIsLast_ ? FetchBlock() : Outcome();
}

Outcome ForwardCursor::MoveTo(qint64 position)
{
    if (position < position_)
        return {Hr::NotImplemented, {}};
    Outcome outcome;
    while (outcome.Ok() && !AtEnd() && position_ < position)
        outcome = MoveNext();
    return outcome;
}

Outcome ForwardCursor::GetValue(int field, Value& value)
{
    if (AtEnd())
        return {Hr::NoCurrentRecord, {}};
    value = ValueOfCell(block_.At(position_ - blockStart_)[size_t(field)], plan_.fields[size_t(field)].type);
    return {};
}

Outcome ForwardCursor::Read(const ReadRange& range, const CellSink& sink)
{
    if (AtEnd() || range.count == 0)
        return {};
    const std::vector<int> fields = range.fields.empty() ? AllFields(plan_.fields) : range.fields;
    if (blockIsLast_) {
        ReadBlock(range, fields, sink);
        return {};
    }
    ReadTransaction transaction(*file_);
    Outcome outcome = transaction.Begin();
    if (outcome.Ok())
        outcome = ReadOn(range, fields, sink);
    if (outcome.Ok())
        outcome = transaction.End();
    return outcome;
}

// All that is left of the result is in the block.
void ForwardCursor::ReadBlock(const ReadRange& range, const std::vector<int>& fields, const CellSink& sink)
{
    const qint64 end = blockStart_ + block_.Size();
    const qint64 stop = range.count < 0 ? end : std::min(end, position_ + range.count);
    std::vector<Cell> wanted(fields.size());
    bool goOn = true;
    while (goOn && position_ < stop) {
        const std::span<const Cell> cells = block_.At(position_ - blockStart_);
        for (size_t i = 0; i < fields.size(); ++i)
            wanted[i] = cells[size_t(fields[i])];
        ++position_;
        goOn = sink(wanted);
    }
}

Outcome ForwardCursor::ReadOn(const ReadRange& range, const std::vector<int>& fields, const CellSink& sink)
{
    qint64 done = 0;
    bool isStopped = false;
    Outcome outcome = Walk(fields, [&](std::span<const Cell> cells) {
        ++done;
        isStopped = !sink(cells) || done == range.count;
        return !isStopped;
    });
    position_ += done;
    if (outcome.Ok() && !isStopped) {
        block_.Clear();
        blockStart_ = position_;
        blockIsLast_ = true;
    } else if (outcome.Ok() && AtEnd()) {
        outcome = FetchBlock();
    }
    return outcome;
}

} // namespace mirel::sqlite
