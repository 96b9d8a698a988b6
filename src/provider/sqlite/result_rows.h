#pragma once

#include "provider/provider.h"
#include "provider/sqlite/key_list.h"
#include "provider/sqlite/outcome.h"
#include "provider/sqlite/row_id_index.h"

#include <QByteArray>
#include <QDeadlineTimer>

#include <span>
#include <vector>

namespace mirel::sqlite {

// Which records of a bulk run stand where: row ids in ascending pieces, and the condition that picks the
// records within them (empty: all).
struct BulkRanges {
    std::vector<RowIdIndex::Range> ranges;
    QByteArray condition;
    bool isWholeTable = false;
    qint64 count = 0; // of the records
};

// The records behind a static cursor: which stands at which position, and reading them. Positions count from 0;
// what is asked for by position must be known by then, see Extend. The caller holds the read transaction.
class ResultRows {
public:
    virtual ~ResultRows() = default;

    // Forgets everything and begins again.
    virtual void Restart() = 0;
    // Learns positions until `wanted` of them are known, or all, or the time is over; a few in any case.
    virtual Outcome Extend(qint64 wanted, const QDeadlineTimer& until) = 0;
    virtual qint64 Known() const = 0;
    virtual bool IsComplete() const = 0;
    // Complete, after a search or a sort among so many row ids that can be made again in short steps.
    virtual bool IsMadeInSteps(qint64 /*fromRowIds*/) const { return false; }

    virtual Outcome KeyAt(qint64 position, RecordKey& key) = 0;
    // The keys of the records from `first` to `end`, which is not among them.
    virtual Outcome KeysBetween(qint64 first, qint64 end, std::vector<RecordKey>& keys)
    {
        Outcome outcome;
        for (qint64 position = first; position < end && outcome.Ok(); ++position)
            outcome = KeyAt(position, keys.emplace_back());
        return outcome;
    }
    // -1: the record is not there any more. Positions must be complete.
    virtual Outcome PositionOf(const RecordKey& key, qint64& position) = 0;

    // Reading it all needs no positions, so a result that is only read through is never counted.
    virtual Outcome Read(const ReadRange& range, const CellSink& sink) = 0;
    // The sink is not called when the record is gone.
    virtual Outcome ReadRecord(const RecordKey& key, std::span<const int> fields, const CellSink& sink) = 0;

    // Own changes, once complete. False when the record has no place at the end.
    [[nodiscard]] virtual bool Append(const RecordKey& key) = 0;
    virtual void Remove(qint64 position, const RecordKey& key) = 0;

    virtual BulkRanges RangesFor(int source) const = 0;
};

// Everything at once, for callers that cannot do with less.
inline constexpr qint64 kAllRecords = std::numeric_limits<qint64>::max();
inline constexpr QDeadlineTimer kNoHurry(QDeadlineTimer::Forever);

} // namespace mirel::sqlite
