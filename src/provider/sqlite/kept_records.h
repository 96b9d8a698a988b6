#pragma once

#include "platform/cell.h"

#include <QtGlobal>

#include <span>
#include <string>
#include <vector>

namespace mirel::sqlite {

// Records as a walk hands them over, kept in one piece of memory in the order in which they came. Positions count
// from 0.
class KeptRecords {
public:
    void Append(std::span<const Cell> cells);
    void Clear();
    // Puts them in another order: places[i] is where the record stands now that is to be at i.
    void Arrange(std::span<const qint64> places);

    qint64 Size() const { return qint64(starts_.size()); }
    size_t Bytes() const { return bytes_.size(); }
    // Borrowed until the next call.
    std::span<const Cell> At(qint64 position) const;

private:
    std::string bytes_; // of each cell: its kind, then its number, or the size of its bytes and they
    std::vector<size_t> starts_;
    size_t width_ = 0; // cells of a record
    mutable std::vector<Cell> cells_;
};

} // namespace mirel::sqlite
