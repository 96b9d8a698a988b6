#pragma once

#include <QtGlobal>

#include <optional>
#include <vector>

namespace mirel::sqlite {

// Which record of a whole table, in row id order, stands at which position: known by every 1024th row id, or,
// while the row ids have no gaps, by the first one alone. Ten million records take an eighth of a megabyte.
//
// Built from the front: Begin, then AddSample for each further sample, then Finish. Positions count from 0.
class RowIdIndex {
public:
    static constexpr qint64 kStep = 1024;

    // The record is the one `skip` places behind the first whose row id is at least `rowId`.
    struct Place {
        qint64 rowId;
        qint64 skip;
        bool isExact; // it has that very row id
    };
    struct Range {
        qint64 first; // row ids, both within
        qint64 last;
    };

    void Clear() { *this = {}; }
    void Begin(qint64 firstRowId);
    void AddSample(qint64 rowId);                   // kStep records behind the last sample
    void Finish(qint64 behindSample, qint64 rowId); // so many records from the last sample on, ending with that
    bool IsComplete() const { return isComplete_; }
    qint64 Count() const { return count_; } // as far as it is known
    std::optional<qint64> LastSample() const;

    Place PlaceOf(qint64 position) const;
    // The position of a record with that row id, while no gaps make it plain.
    std::optional<qint64> PositionOf(qint64 rowId) const;
    // A row id at or below the given one, and how many records stand in front of it.
    std::pair<qint64, qint64> SampleBefore(qint64 rowId) const;

    // Both once complete. False when the row id lies among the others, where no place can be made for it.
    [[nodiscard]] bool Append(qint64 rowId);
    void Remove(qint64 position, qint64 rowId);
    // The whole table in pieces of about kStep records.
    std::vector<Range> Ranges() const;

private:
    void Spread(); // ends "dense": writes the samples that dense ids do without
    size_t SampleOf(qint64 position) const;
    qint64 LastOf(size_t sample) const { return sample + 1 < firsts_.size() ? firsts_[sample + 1] - 1 : last_; }
    qint64 CountOf(size_t sample) const;

    // Of each sample: its row id (or one below the first that is left), and the position there. Two vectors, so
    // that a sample takes twelve bytes.
    std::vector<qint64> firsts_;
    std::vector<quint32> starts_;
    qint64 count_ = 0;
    qint64 denseFirst_ = 0;
    qint64 last_ = -1;
    bool isDense_ = false;
    bool isComplete_ = false;
};

} // namespace mirel::sqlite
