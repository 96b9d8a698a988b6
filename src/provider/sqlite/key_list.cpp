#include "provider/sqlite/key_list.h"

#include <algorithm>
#include <cstring>

namespace mirel::sqlite {
namespace {

constexpr size_t kMostSlots = size_t(1) << 28; // 1 GB; a join without a condition has no bound of its own

} // namespace

RecordId IdOf(const RecordKey& key)
{
    return RecordId(
        QByteArray(reinterpret_cast<const char*>(key.constData()), key.size() * qsizetype(sizeof(qint64))));
}

std::optional<RecordKey> KeyOf(const RecordId& id, size_t tables)
{
    const QByteArray& bytes = id.Key();
    if (bytes.isEmpty() || size_t(bytes.size()) != tables * sizeof(qint64))
        return {};
    RecordKey key(qsizetype(tables), kNoRow);
    memcpy(key.data(), bytes.constData(), size_t(bytes.size()));
    return key;
}

bool KeyList::Append(std::span<const qint64> key)
{
    const auto fits = [](qint64 rowId) { return rowId == kNoRow || (rowId >= 0 && rowId < kNarrowNoRow); };
    if (!isWide_ && !std::ranges::all_of(key, fits))
        Widen();
    if (isWide_) {
        wide_.insert(wide_.end(), key.begin(), key.end());
        return wide_.size() < kMostSlots / 2;
    }
    for (const qint64 rowId : key)
        narrow_.push_back(rowId == kNoRow ? kNarrowNoRow : quint32(rowId));
    return narrow_.size() < kMostSlots;
}

void KeyList::Widen()
{
    wide_.reserve(narrow_.size() + width_);
    for (size_t at = 0; at < narrow_.size(); ++at)
        wide_.push_back(Slot(at));
    std::vector<quint32>().swap(narrow_);
    isWide_ = true;
}

RecordKey KeyList::At(qint64 position) const
{
    RecordKey key;
    for (size_t source = 0; source < width_; ++source)
        key.append(RowIdAt(position, source));
    return key;
}

qint64 KeyList::Find(const RecordKey& key) const
{
    for (qint64 position = 0; position < Size(); ++position) {
        size_t source = 0;
        while (source < width_ && RowIdAt(position, source) == key[qsizetype(source)])
            ++source;
        if (source == width_)
            return position;
    }
    return -1;
}

void KeyList::Remove(qint64 position)
{
    const auto erase = [&](auto& slots) {
        const auto first = slots.begin() + position * qint64(width_);
        slots.erase(first, first + qint64(width_));
    };
    if (isWide_)
        erase(wide_);
    else
        erase(narrow_);
}

void KeyList::Clear()
{
    *this = KeyList(qsizetype(width_));
}

} // namespace mirel::sqlite
