#include "provider/sqlite/keyed_rows.h"

#include "provider/sqlite/row_reader.h"
#include "provider/sqlite/select_sql.h"
#include "provider/sqlite/sql_writer.h"

#include <QElapsedTimer>

#include <algorithm>

namespace mirel::sqlite {
namespace {

constexpr quint64 kFirstSliceWidth = 4096; // row ids; then as many as take about kSliceMs
constexpr int kSliceMs = 4;
constexpr qint64 kBulkStep = RowIdIndex::kStep;

} // namespace

KeyedRows::KeyedRows(DatabaseFile& file, const SelectPlan& plan)
    : file_(file)
    , plan_(plan)
    , keys_(qsizetype(plan.sources.size()))
{
    for (const PlannedSource& source : plan.sources)
        storedTables_.push_back(QuoteName(file.Schema().FindTable(source.table)->storedName));
}

void KeyedRows::Restart()
{
    keys_.Clear();
    isComplete_ = false;
    gathering_ = Gathering::Unknown;
    sort_.reset();
    isInSlices_ = false;
}

bool KeyedRows::IsMadeInSteps(qint64 fromRowIds) const
{
    return isComplete_ && isInSlices_ && quint64(lastRowId_) - quint64(firstRowId_) >= quint64(fromRowIds);
}

Outcome KeyedRows::Extend(qint64 wanted, const QDeadlineTimer& until)
{
    Outcome outcome;
    if (gathering_ == Gathering::Unknown) {
        changesBefore_ = sqlite3_total_changes64(file_.Handle());
        outcome = ChooseGathering();
    }
    while (outcome.Ok() && !isComplete_ && Known() < wanted) {
        if (gathering_ == Gathering::Sorting)
            outcome = HandOverSorted(until);
        else
            outcome = gathering_ == Gathering::Whole ? GatherAll() : GatherSlice();
        if (until.hasExpired())
            break;
    }
    if (!outcome.Ok()) // a slice may have been taken in part
        Restart();
    return outcome;
}

// Slices pay where the condition is held against every record. Where an index leads to the records, each slice
// would begin that search again.
Outcome KeyedRows::ChooseGathering()
{
    gathering_ = Gathering::Whole;
    if (CanSort())
        sort_ = std::make_unique<RecordSort>(plan_.order.front());
    else if (plan_.sources.size() != 1 || !plan_.order.empty())
        return {};
    const QByteArray& rowId = plan_.sources.front().rowId;
    Outcome outcome;
    bool isScan = false;
    {
        Statement explain = file_.Prepare(
            "EXPLAIN QUERY PLAN SELECT " + rowId + " FROM " + plan_.from + WhereClause(plan_), outcome);
        constexpr int kDetail = 3;
        if (!explain || explain.Step() != SQLITE_ROW)
            return outcome;
        const QString detail = explain.Text(kDetail);
        isScan = detail.startsWith(QStringLiteral("SCAN")) && (sort_ || !detail.contains(QStringLiteral("INDEX")));
    }
    if (!isScan)
        return {};
    gathering_ = Gathering::Slices;
    const QByteArray from = " FROM " + plan_.from;
    Statement bounds = file_.Prepare(
        "SELECT (SELECT min(" + rowId + ')' + from + "),(SELECT max(" + rowId + ')' + from + ')', outcome);
    if (!bounds)
        return outcome;
    const int result = bounds.Step();
    if (result != SQLITE_ROW)
        return file_.OutcomeOf(result);
    isComplete_ = sqlite3_column_type(bounds.Get(), 0) == SQLITE_NULL;
    firstRowId_ = nextRowId_ = bounds.Integer(0);
    lastRowId_ = bounds.Integer(1);
    sliceWidth_ = kFirstSliceWidth;
    return {};
}

// The columns of a statement that gathers: the row ids, and what is sorted by.
QByteArray KeyedRows::GatheredColumns() const
{
    return RowIdList(plan_) + (sort_ ? ',' + plan_.order.front().expression : QByteArray());
}

Outcome KeyedRows::GatherAll()
{
    Outcome outcome;
    Statement statement = file_.Prepare("SELECT " + GatheredColumns() + " FROM " + plan_.from +
                                            WhereClause(plan_) + (sort_ ? QByteArray() : KeyedOrder(plan_)),
                                        outcome);
    if (!statement)
        return outcome;
    if (!sort_) {
        outcome = Gather(statement);
        isComplete_ = outcome.Ok();
        return outcome;
    }
    outcome = GatherToSort(statement);
    if (sort_)
        gathering_ = Gathering::Sorting;
    return outcome;
}

Outcome KeyedRows::GatherSlice()
{
    const QByteArray& rowId = plan_.sources.front().rowId;
    Outcome outcome;
    Statement slice = file_.Prepare("SELECT " + GatheredColumns() + " FROM " + plan_.from +
                                        WhereClause(plan_, rowId + " BETWEEN ?1 AND ?2") + " ORDER BY " + rowId,
                                    outcome);
    if (!slice)
        return outcome;
    // In a damaged tree the least row id may be behind the greatest.
    const bool isLast = lastRowId_ < nextRowId_ || quint64(lastRowId_) - quint64(nextRowId_) < sliceWidth_;
    const qint64 end = isLast ? lastRowId_ : nextRowId_ + qint64(sliceWidth_) - 1;
    slice.Bind(1, nextRowId_);
    slice.Bind(2, end);
    QElapsedTimer timer;
    timer.start();
    outcome = sort_ ? GatherToSort(slice) : Gather(slice);
    if (!outcome.Ok() || gathering_ == Gathering::Whole)
        return outcome;
    isInSlices_ = true;
    if (isLast && sort_)
        gathering_ = Gathering::Sorting;
    else
        isComplete_ = isLast;
    nextRowId_ = isLast ? end : end + 1;
    if (timer.elapsed() < kSliceMs) // wide gaps between row ids are crossed soon
        sliceWidth_ = std::min(sliceWidth_ * 2, quint64(1) << 62);
    else if (timer.elapsed() > 2 * kSliceMs)
        sliceWidth_ = std::max(sliceWidth_ / 2, kFirstSliceWidth);
    return {};
}

// What cannot be sorted here is left to the engine, all of it at once.
Outcome KeyedRows::GatherToSort(Statement& statement)
{
    int result = statement.Step();
    for (; result == SQLITE_ROW; result = statement.Step()) {
        if (!sort_->Add(statement.Integer(0), statement.Get(), 1)) {
            sort_.reset();
            gathering_ = Gathering::Whole;
            isInSlices_ = false;
            return {};
        }
    }
    return file_.OutcomeOf(result);
}

Outcome KeyedRows::HandOverSorted(const QDeadlineTimer& until)
{
    bool fit = true;
    isComplete_ = sort_->HandOver(until, [&](qint64 rowId) { fit = fit && keys_.Append({&rowId, 1}); });
    if (isComplete_)
        sort_.reset();
    return fit ? Outcome() : Outcome{Hr::OutOfMemory, {}};
}

Outcome KeyedRows::Gather(Statement& statement)
{
    RecordKey key(qsizetype(plan_.sources.size()));
    int result = statement.Step();
    for (; result == SQLITE_ROW; result = statement.Step()) {
        for (int source = 0; source < int(key.size()); ++source) {
            const bool isNull = sqlite3_column_type(statement.Get(), source) == SQLITE_NULL;
            key[source] = isNull ? kNoRow : statement.Integer(source);
        }
        if (!keys_.Append(std::span(key.constData(), size_t(key.size()))))
            return {Hr::OutOfMemory, {}};
    }
    return file_.OutcomeOf(result);
}

Outcome KeyedRows::KeyAt(qint64 position, RecordKey& key)
{
    key = keys_.At(position);
    return {};
}

Outcome KeyedRows::PositionOf(const RecordKey& key, qint64& position)
{
    position = keys_.Find(key);
    return {};
}

Outcome KeyedRows::Read(const ReadRange& range, const CellSink& sink)
{
    const std::vector<int> fields = range.fields.empty() ? AllFields(plan_.fields) : range.fields;
    bool goOn = true;
    const CellSink stopping = [&](std::span<const Cell> cells) { return goOn = sink(cells); };
    if (!ShouldRunAgain(range)) {
        const qint64 end = range.count < 0 ? kAllRecords : range.first + range.count;
        Outcome outcome = Extend(end, kNoHurry);
        return outcome.Ok() ? ReadByKeys(range.first, std::min(end, Known()), fields, stopping) : outcome;
    }
    // What slices have found so far is not searched for again.
    const qint64 known = IsPartial() ? Known() : 0;
    Outcome outcome = ReadByKeys(0, known, fields, stopping);
    return outcome.Ok() && goOn ? ReadRest(range, fields, sink) : outcome;
}

// Reading it all is fastest by the SELECT itself, which visits the records in row id order; but few records of
// a big table by their keys. A join without an order stands in the order of its keys alone.
bool KeyedRows::ShouldRunAgain(const ReadRange& range) const
{
    constexpr quint64 kFew = 8; // one in so many row ids
    if (range.first != 0 || range.count >= 0 || !IsFresh())
        return false;
    if (range.order == ReadRange::Order::Any || !plan_.order.empty())
        return true;
    if (plan_.sources.size() > 1)
        return false;
    return !isComplete_ || gathering_ == Gathering::Whole ||
           quint64(Known()) > (quint64(lastRowId_) - quint64(firstRowId_)) / kFew;
}

Outcome KeyedRows::ReadRest(const ReadRange& range, std::span<const int> fields, const CellSink& sink)
{
    const bool inSlices = IsPartial();
    const QByteArray& rowId = plan_.sources.front().rowId;
    QByteArray sql = "SELECT " + ColumnList(plan_, fields) + " FROM " + plan_.from +
                     WhereClause(plan_, inSlices ? rowId + ">=?1" : QByteArray());
    if (range.order == ReadRange::Order::Result)
        sql += KeyedOrder(plan_);
    Outcome outcome;
    Statement statement = file_.Prepare(sql, outcome);
    if (!statement)
        return outcome;
    if (inSlices)
        statement.Bind(1, nextRowId_);
    RowReader reader(plan_.fields, fields, RowReader::Layout::Listed);
    int result = statement.Step();
    for (; result == SQLITE_ROW; result = statement.Step()) {
        if (!sink(reader.Read(statement.Get())))
            return {};
    }
    return file_.OutcomeOf(result);
}

Outcome KeyedRows::ReadByKeys(qint64 first, qint64 end, std::span<const int> fields, const CellSink& sink)
{
    if (first >= end)
        return {};
    Outcome outcome;
    Statement record = file_.Prepare(RecordSelect(fields), outcome);
    if (!record)
        return outcome;
    RowReader reader(plan_.fields, fields, RowReader::Layout::Listed);
    for (qint64 position = first; position < end; ++position) {
        for (size_t source = 0; source < plan_.sources.size(); ++source)
            record.Bind(int(source) + 1, keys_.RowIdAt(position, source));
        const int result = record.Step();
        if (result == SQLITE_ROW) {
            if (!sink(reader.Read(record.Get())))
                return {};
        } else if (result != SQLITE_DONE) {
            return file_.OutcomeOf(result);
        }
        record.Reset();
    }
    return {};
}

// One record by its key. In a join each table is looked up by itself: whether the records still belong together
// is not asked again, and a missing one gives NULL. No record has the row id that kNoRow is.
QByteArray KeyedRows::RecordSelect(std::span<const int> fields) const
{
    const QByteArray select = "SELECT " + ColumnList(plan_, fields) + " FROM ";
    if (plan_.sources.size() == 1)
        return select + plan_.from + " WHERE " + plan_.sources.front().rowId + "=?1";
    QByteArray sql = select + "(SELECT 1)";
    for (size_t source = 0; source < plan_.sources.size(); ++source) {
        const PlannedSource& planned = plan_.sources[source];
        sql += " LEFT JOIN " + storedTables_[source] + " AS " + planned.alias + " ON " + planned.rowId + "=?" +
               QByteArray::number(qulonglong(source) + 1);
    }
    return sql;
}

Outcome KeyedRows::ReadRecord(const RecordKey& key, std::span<const int> fields, const CellSink& sink)
{
    Outcome outcome;
    Statement record = file_.Prepare(RecordSelect(fields), outcome);
    if (!record)
        return outcome;
    for (qsizetype source = 0; source < key.size(); ++source)
        record.Bind(int(source) + 1, key[source]);
    const int result = record.Step();
    if (result == SQLITE_ROW)
        (void)sink(RowReader(plan_.fields, fields, RowReader::Layout::Listed).Read(record.Get()));
    return file_.OutcomeOf(result);
}

// While the condition still picks the same records it can do so within a range of row ids; otherwise each
// record is a range of its own.
BulkRanges KeyedRows::RangesFor(int source) const
{
    std::vector<qint64> rowIds;
    rowIds.reserve(size_t(Known()));
    for (qint64 position = 0; position < Known(); ++position)
        rowIds.push_back(keys_.RowIdAt(position, size_t(source)));
    std::ranges::sort(rowIds);
    rowIds.erase(std::unique(rowIds.begin(), rowIds.end()), rowIds.end());
    std::erase(rowIds, kNoRow);

    const bool byCondition = IsFresh() && plan_.sources.size() == 1;
    const size_t step = byCondition ? size_t(kBulkStep) : 1;
    BulkRanges bulk;
    bulk.count = qint64(rowIds.size());
    for (size_t at = 0; at < rowIds.size(); at += step)
        bulk.ranges.push_back({rowIds[at], rowIds[std::min(at + step, rowIds.size()) - 1]});
    if (byCondition)
        bulk.condition = plan_.where;
    return bulk;
}

} // namespace mirel::sqlite
