#include "provider/sqlite/forward_cursor.h"

#include "provider/sqlite/row_reader.h"
#include "provider/sqlite/select_sql.h"
#include "provider/sqlite/static_cursor.h"
#include "provider/sqlite/transaction.h"

#include <QElapsedTimer>

namespace mirel::sqlite {
namespace {

constexpr size_t kBlockSize = 256;
constexpr int kFirstBlockMs = 2;

} // namespace

ForwardCursor::ForwardCursor(std::shared_ptr<DatabaseFile> file, SelectPlan plan)
    : file_(std::move(file))
    , plan_(std::move(plan))
{
}

void ForwardCursor::Keep(std::span<const Cell> cells)
{
    std::vector<Value>& row = block_.emplace_back();
    row.reserve(cells.size());
    for (size_t i = 0; i < cells.size(); ++i)
        row.push_back(ValueOfCell(cells[i], plan_.fields[i].type));
}

Outcome ForwardCursor::FetchBlock()
{
    block_.clear();
    blockStart_ = position_;
    QElapsedTimer timer;
    timer.start();
    blockIsLast_ = true;
    const CellSink keep = [&](std::span<const Cell> cells) {
        Keep(cells);
        // A search that finds little is not run to the block's end: reading on starts it again.
        blockIsLast_ = block_.size() < kBlockSize && (position_ > 0 || !timer.hasExpired(kFirstBlockMs));
        return blockIsLast_;
    };
    return position_ == 0 ? Walk(AllFields(plan_.fields), keep) : FetchFurther(keep);
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
    return rest_->Read({.first = position_, .count = qint64(kBlockSize) + 1, .fields = {}}, keep);
}

// Hands over the records from the current one on, running the SELECT anew: nothing was left running.
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
    value = block_[size_t(position_ - blockStart_)][size_t(field)];
    return {};
}

Outcome ForwardCursor::Read(const ReadRange& range, const CellSink& sink)
{
    if (AtEnd() || range.count == 0)
        return {};
    ReadTransaction transaction(*file_);
    Outcome outcome = transaction.Begin();
    if (!outcome.Ok())
        return outcome;
    qint64 done = 0;
    bool isStopped = false;
    const std::vector<int> fields = range.fields.empty() ? AllFields(plan_.fields) : range.fields;
    outcome = Walk(fields, [&](std::span<const Cell> cells) {
        ++done;
        isStopped = !sink(cells) || done == range.count;
        return !isStopped;
    });
    position_ += done;
    if (outcome.Ok() && !isStopped) {
        block_.clear();
        blockStart_ = position_;
        blockIsLast_ = true;
    } else if (outcome.Ok() && AtEnd() && !blockIsLast_) {
        outcome = FetchBlock();
    }
    if (outcome.Ok())
        outcome = transaction.End();
    return outcome;
}

} // namespace mirel::sqlite
