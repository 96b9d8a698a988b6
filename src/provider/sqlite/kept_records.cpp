#include "provider/sqlite/kept_records.h"

#include <cstring>

namespace mirel::sqlite {
namespace {

template <typename Plain>
void Write(std::string& bytes, Plain plain)
{
    bytes.append(reinterpret_cast<const char*>(&plain), sizeof plain);
}

template <typename Plain>
Plain Take(const char*& at)
{
    Plain plain;
    std::memcpy(&plain, at, sizeof plain);
    at += sizeof plain;
    return plain;
}

Cell TakeCell(const char*& at)
{
    Cell cell;
    cell.kind = Take<Cell::Kind>(at);
    switch (cell.kind) {
    case Cell::Kind::Null:
        break;
    case Cell::Kind::Integer:
        cell.integer = Take<qint64>(at);
        break;
    case Cell::Kind::Real:
        cell.real = Take<double>(at);
        break;
    case Cell::Kind::Text:
    case Cell::Kind::Binary: {
        const auto size = Take<quint32>(at); // no value of the engine is longer
        cell.bytes = {at, size};
        at += size;
        break;
    }
    }
    return cell;
}

} // namespace

void KeptRecords::Append(std::span<const Cell> cells)
{
    width_ = cells.size();
    starts_.push_back(bytes_.size());
    for (const Cell& cell : cells) {
        Write(bytes_, cell.kind);
        switch (cell.kind) {
        case Cell::Kind::Null:
            break;
        case Cell::Kind::Integer:
            Write(bytes_, cell.integer);
            break;
        case Cell::Kind::Real:
            Write(bytes_, cell.real);
            break;
        case Cell::Kind::Text:
        case Cell::Kind::Binary:
            Write(bytes_, quint32(cell.bytes.size()));
            bytes_.append(cell.bytes);
            break;
        }
    }
}

void KeptRecords::Clear()
{
    bytes_.clear();
    starts_.clear();
}

void KeptRecords::Arrange(std::span<const qint64> places)
{
    std::vector<size_t> arranged;
    arranged.reserve(places.size());
    for (const qint64 place : places)
        arranged.push_back(starts_[size_t(place)]);
    starts_ = std::move(arranged);
}

std::span<const Cell> KeptRecords::At(qint64 position) const
{
    cells_.resize(width_);
    const char* at = bytes_.data() + starts_[size_t(position)];
    for (Cell& cell : cells_)
        cell = TakeCell(at);
    return cells_;
}

} // namespace mirel::sqlite
