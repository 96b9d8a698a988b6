#include "provider/sqlite/table_rows.h"

#include "provider/sqlite/row_reader.h"
#include "provider/sqlite/select_sql.h"

namespace mirel::sqlite {

TableRows::TableRows(DatabaseFile& file, const SelectPlan& plan)
    : file_(file)
    , plan_(plan)
    , rowId_(plan.sources.front().rowId)
{
}

QByteArray TableRows::Select(const QByteArray& what, const QByteArray& rest) const
{
    return "SELECT " + what + " FROM " + plan_.from + QByteArray(rest).replace("@", rowId_);
}

Outcome TableRows::Extend(qint64 wanted, const QDeadlineTimer& until)
{
    Outcome outcome;
    if (!index_.LastSample() && !IsComplete())
        outcome = Begin();
    if (!outcome.Ok() || IsComplete() || Known() >= wanted)
        return outcome;
    Statement next = file_.Prepare(
        Select(rowId_, " WHERE @>=?1 ORDER BY @ LIMIT 1 OFFSET " + QByteArray::number(RowIdIndex::kStep)),
        outcome);
    while (outcome.Ok() && !IsComplete() && Known() < wanted) {
        outcome = AddSample(next);
        next.Reset();
        if (until.hasExpired())
            break;
    }
    return outcome;
}

Outcome TableRows::Begin()
{
    Outcome outcome;
    Statement first = file_.Prepare(Select(rowId_, " ORDER BY @ LIMIT 1"), outcome);
    if (!first)
        return outcome;
    const int result = first.Step();
    if (result == SQLITE_ROW)
        index_.Begin(first.Integer(0));
    else if (result == SQLITE_DONE)
        index_.Finish(0, -1);
    return file_.OutcomeOf(result);
}

Outcome TableRows::AddSample(Statement& next)
{
    next.Bind(1, *index_.LastSample());
    const int result = next.Step();
    if (result == SQLITE_DONE)
        return Finish();
    if (result != SQLITE_ROW)
        return file_.OutcomeOf(result);
    // In a damaged tree row ids can come again and again: there would be no end of samples.
    if (next.Integer(0) <= *index_.LastSample())
        return OutcomeOfSqlite(SQLITE_CORRUPT, file_.Path(), QLatin1String(sqlite3_errstr(SQLITE_CORRUPT)));
    index_.AddSample(next.Integer(0));
    return {};
}

Outcome TableRows::Finish()
{
    Outcome outcome;
    Statement rest = file_.Prepare(Select("count(*),max(" + rowId_ + ')', " WHERE @>=?1"), outcome);
    if (!rest)
        return outcome;
    rest.Bind(1, *index_.LastSample());
    const int result = rest.Step();
    if (result == SQLITE_ROW)
        index_.Finish(rest.Integer(0), rest.Integer(1));
    return file_.OutcomeOf(result);
}

Outcome TableRows::KeyAt(qint64 position, RecordKey& key)
{
    const RowIdIndex::Place place = index_.PlaceOf(position);
    if (place.isExact) {
        key = {place.rowId};
        return {};
    }
    Outcome outcome;
    Statement at = file_.Prepare(Select(rowId_, " WHERE @>=?1 ORDER BY @ LIMIT 1 OFFSET ?2"), outcome);
    if (!at)
        return outcome;
    at.Bind(1, place.rowId);
    at.Bind(2, place.skip);
    const int result = at.Step();
    if (result == SQLITE_ROW)
        key = {at.Integer(0)};
    return result == SQLITE_DONE ? Outcome{Hr::NoCurrentRecord, {}} : file_.OutcomeOf(result);
}

Outcome TableRows::KeysBetween(qint64 first, qint64 end, std::vector<RecordKey>& keys)
{
    const RowIdIndex::Place place = index_.PlaceOf(first);
    Outcome outcome;
    Statement walk = file_.Prepare(Select(rowId_, " WHERE @>=?1 ORDER BY @ LIMIT ?2 OFFSET ?3"), outcome);
    if (!walk)
        return outcome;
    walk.Bind(1, place.rowId);
    walk.Bind(2, end - first);
    walk.Bind(3, place.skip);
    int result = walk.Step();
    for (; result == SQLITE_ROW; result = walk.Step())
        keys.push_back({walk.Integer(0)});
    return file_.OutcomeOf(result);
}

Outcome TableRows::PositionOf(const RecordKey& key, qint64& position)
{
    if (const std::optional<qint64> known = index_.PositionOf(key[0])) {
        position = *known;
        return {};
    }
    const auto [sample, start] = index_.SampleBefore(key[0]);
    Outcome outcome;
    const QByteArray what = "sum(" + rowId_ + "<?2),sum(" + rowId_ + "=?2)";
    Statement count = file_.Prepare(Select(what, " WHERE @ BETWEEN ?1 AND ?2"), outcome);
    if (!count)
        return outcome;
    count.Bind(1, sample);
    count.Bind(2, key[0]);
    const int result = count.Step();
    if (result == SQLITE_ROW)
        position = count.Integer(1) == 1 ? start + count.Integer(0) : -1;
    return file_.OutcomeOf(result);
}

Outcome TableRows::Read(const ReadRange& range, const CellSink& sink)
{
    Outcome outcome = Extend(range.first + 1, kNoHurry);
    if (!outcome.Ok() || range.first >= Known())
        return outcome;
    const std::vector<int> fields = range.fields.empty() ? AllFields(plan_.fields) : range.fields;
    const RowIdIndex::Place place = index_.PlaceOf(range.first);
    const bool isBounded = range.count >= 0 || place.skip > 0; // counting would cost every record a little
    Statement page =
        file_.Prepare(Select(ColumnList(plan_, fields),
                             isBounded ? " WHERE @>=?1 ORDER BY @ LIMIT ?2 OFFSET ?3" : " WHERE @>=?1 ORDER BY @"),
                      outcome);
    if (!page)
        return outcome;
    page.Bind(1, place.rowId);
    if (isBounded) {
        page.Bind(2, range.count);
        page.Bind(3, place.skip);
    }
    RowReader reader(plan_.fields, fields, RowReader::Layout::Listed);
    int result = page.Step();
    for (; result == SQLITE_ROW; result = page.Step()) {
        if (!sink(reader.Read(page.Get())))
            return {};
    }
    return file_.OutcomeOf(result);
}

Outcome TableRows::ReadRecord(const RecordKey& key, std::span<const int> fields, const CellSink& sink)
{
    Outcome outcome;
    Statement record = file_.Prepare(Select(ColumnList(plan_, fields), " WHERE @=?1"), outcome);
    if (!record)
        return outcome;
    record.Bind(1, key[0]);
    const int result = record.Step();
    if (result == SQLITE_ROW)
        (void)sink(RowReader(plan_.fields, fields, RowReader::Layout::Listed).Read(record.Get()));
    return file_.OutcomeOf(result);
}

} // namespace mirel::sqlite
