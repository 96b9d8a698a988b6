#include "csvimport/key_index.h"

#include <cmath>

namespace mirel {
namespace {

// Equal values give equal texts, whether a number is stored as an integer or not.
void AppendPart(const Cell& cell, std::string& key)
{
    std::string part;
    constexpr double kWholeBelow = 9e15; // up to here a double holds each integer
    switch (cell.kind) {
    case Cell::Kind::Null:
        return;
    case Cell::Kind::Integer:
        part = 'n' + std::to_string(cell.integer);
        break;
    case Cell::Kind::Real:
        if (std::abs(cell.real) < kWholeBelow && cell.real == std::trunc(cell.real))
            part = 'n' + std::to_string(qint64(cell.real));
        else
            part = 'r' + std::string(reinterpret_cast<const char*>(&cell.real), sizeof(cell.real));
        break;
    case Cell::Kind::Text:
    case Cell::Kind::Binary:
        part = 't' + std::string(cell.bytes);
        break;
    }
    key += std::to_string(part.size());
    key += ':';
    key += part;
}

} // namespace

std::optional<std::string> KeyIndex::KeyOf(std::span<const Cell> cells, std::span<const int> at)
{
    std::string key;
    for (const int index : at) {
        if (cells[size_t(index)].kind == Cell::Kind::Null)
            return {};
        AppendPart(cells[size_t(index)], key);
    }
    return key;
}

bool KeyIndex::Build(DbRecordset& table, std::span<const int> fields)
{
    constexpr qint64 kBlock = 4096;
    std::vector<int> all(fields.size());
    for (size_t i = 0; i < all.size(); ++i)
        all[i] = int(i);
    const qint64 count = table.RecordCount();
    std::vector<RecordId> ids;
    for (qint64 first = 0; first < count; first += qint64(ids.size())) {
        ids.clear();
        if (!table.Ids(first, kBlock, ids) || ids.empty())
            return false;
        size_t at = 0;
        const ReadRange range{
            .first = first, .count = qint64(ids.size()), .fields = {fields.begin(), fields.end()}};
        const bool read = table.Read(range, [&](std::span<const Cell> cells) {
            const std::optional<std::string> key = KeyOf(cells, all);
            if (key && at < ids.size()) {
                const auto [entry, isNew] = entries_.try_emplace(*key, Entry{.record = ids[at]});
                entry->second.several = !isNew;
            }
            ++at;
            return true;
        });
        if (!read || at != ids.size())
            return false;
    }
    return true;
}

bool KeyIndex::AddLine(const std::optional<std::string>& key, qint64 line)
{
    if (!key) {
        ++counts_.added;
        return true;
    }
    Entry& entry = entries_[*key];
    if (entry.several)
        return false;
    if (entry.lastLine == 0)
        ++(entry.record.IsNull() ? counts_.added : counts_.updated);
    entry.lastLine = line;
    return true;
}

const KeyIndex::Entry* KeyIndex::Find(const std::string& key) const
{
    const auto entry = entries_.find(key);
    return entry == entries_.end() ? nullptr : &entry->second;
}

} // namespace mirel
