#include "tableview/aggregate.h"

#include <algorithm>
#include <cmath>

namespace mirel {
namespace {

double NumberOf(const Cell& cell)
{
    return cell.kind == Cell::Kind::Integer ? double(cell.integer) : cell.real;
}

bool IsTaken(const Cell& cell)
{
    return cell.kind == Cell::Kind::Integer || cell.kind == Cell::Kind::Real;
}

void TakeWhole(AggregateResult& taken, const Cell& cell, Aggregate kind)
{
    if (cell.kind != Cell::Kind::Integer || !taken.whole) {
        taken.whole.reset();
        return;
    }
    qint64& whole = *taken.whole;
    if (kind == Aggregate::Sum || kind == Aggregate::Avg) {
        if (__builtin_add_overflow(whole, cell.integer, &whole))
            taken.whole.reset();
    } else if (taken.values == 0) {
        whole = cell.integer;
    } else {
        whole = kind == Aggregate::Max ? std::max(whole, cell.integer) : std::min(whole, cell.integer);
    }
}

void Take(AggregateResult& taken, const Cell& cell, Aggregate kind)
{
    TakeWhole(taken, cell, kind);
    const double number = NumberOf(cell);
    if (kind == Aggregate::Sum || kind == Aggregate::Avg)
        taken.value += number;
    else if (taken.values == 0)
        taken.value = number;
    else
        taken.value = kind == Aggregate::Max ? std::max(taken.value, number) : std::min(taken.value, number);
    ++taken.values;
}

} // namespace

QString AggregateResult::Text(Aggregate kind) const
{
    if (values == 0 && (kind == Aggregate::Max || kind == Aggregate::Min))
        return {};
    if (whole && kind != Aggregate::Avg)
        return QString::number(*whole);
    if (value == std::trunc(value)) // the negative zero is a zero to people
        return QString::number(value == 0 ? 0.0 : value, 'f', 0);
    QString text = QString::number(value, 'f', 6);
    while (text.endsWith(u'0'))
        text.chop(1);
    if (text.endsWith(u'.'))
        text.chop(1);
    return text == u"-0" ? text.sliced(1) : text;
}

std::optional<AggregateResult> RunAggregate(DbRecordset& result, int field, Aggregate kind,
                                            const BulkProgress& progress)
{
    constexpr qint64 kRecordsPerStep = 1024; // between two looks at the progress display
    AggregateResult taken;
    qint64 records = 0;
    bool stopped = false;
    const auto take = [&](std::span<const Cell> cells) {
        if (IsTaken(cells.front()))
            Take(taken, cells.front(), kind);
        stopped = ++records % kRecordsPerStep == 0 && progress && !progress(records);
        return !stopped;
    };
    if (!result.Read({.fields = {field}, .order = ReadRange::Order::Any}, take) || stopped)
        return {};
    if (kind == Aggregate::Avg && taken.values > 0)
        taken.value /= double(taken.values);
    return taken;
}

} // namespace mirel
