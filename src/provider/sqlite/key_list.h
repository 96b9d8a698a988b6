#pragma once

#include "platform/record_id.h"

#include <QVarLengthArray>
#include <QtGlobal>

#include <optional>
#include <span>
#include <vector>

namespace mirel::sqlite {

// The row ids of a record, one for each table of its result.
using RecordKey = QVarLengthArray<qint64, 4>;

// In place of a row id where an outer join found none.
inline constexpr qint64 kNoRow = std::numeric_limits<qint64>::min();

// A record's identity, outside of this folder, is its key.
RecordId IdOf(const RecordKey& key);
// None: it is not the key of a record of so many tables.
std::optional<RecordKey> KeyOf(const RecordId& id, size_t tables);

// The keys of a result in its order, four bytes a row id while all of them fit.
class KeyList {
public:
    explicit KeyList(qsizetype width)
        : width_(size_t(width))
    {
    }

    qint64 Size() const { return qint64((isWide_ ? wide_.size() : narrow_.size()) / width_); }
    // False when the list has become longer than memory should be asked for.
    [[nodiscard]] bool Append(std::span<const qint64> key);
    RecordKey At(qint64 position) const;
    qint64 RowIdAt(qint64 position, size_t source) const { return Slot(size_t(position) * width_ + source); }
    qint64 Find(const RecordKey& key) const; // -1: not there
    void Remove(qint64 position);
    void Clear();

private:
    // The last number that fits stands for kNoRow.
    static constexpr quint32 kNarrowNoRow = 0xFFFFFFFF;

    qint64 Slot(size_t at) const
    {
        if (isWide_)
            return wide_[at];
        return narrow_[at] == kNarrowNoRow ? kNoRow : qint64(narrow_[at]);
    }
    void Widen();

    size_t width_;
    std::vector<quint32> narrow_;
    std::vector<qint64> wide_;
    bool isWide_ = false;
};

} // namespace mirel::sqlite
