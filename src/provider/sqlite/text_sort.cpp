#include "provider/sqlite/text_sort.h"

#include <algorithm>
#include <functional>

namespace mirel::sqlite {
namespace {

constexpr size_t kMostBytes = size_t(192) << 20;
constexpr size_t kMostEntries = size_t(4) << 20;
constexpr size_t kRecent = 1 << 15;

quint64 PrefixOf(std::string_view key)
{
    quint64 prefix = 0;
    for (size_t i = 0; i < 8; ++i)
        prefix = prefix << 8 | (i < key.size() ? quint8(key[i]) : 0);
    return prefix;
}

} // namespace

bool TextSort::Store(std::string_view text, quint32& index)
{
    if (recent_.empty())
        recent_.resize(kRecent);
    quint32& recent = recent_[std::hash<std::string_view>()(text) % kRecent];
    if (recent > 0 && TextOf(stored_[recent - 1]) == text) {
        index = recent - 1;
        return true;
    }
    const std::span<const uint8_t> key = keys_.KeyOf(text);
    if (arena_.size() + key.size() + text.size() > kMostBytes)
        return false;
    index = quint32(stored_.size());
    stored_.push_back({quint32(arena_.size()), quint32(key.size()), quint32(text.size())});
    arena_.append(reinterpret_cast<const char*>(key.data()), key.size());
    arena_.append(text);
    recent = index + 1;
    return true;
}

bool TextSort::Add(qint64 rowId, std::optional<std::string_view> text)
{
    if (!text) {
        nulls_.push_back(rowId);
        return true;
    }
    quint32 index = 0;
    if (entries_.size() >= kMostEntries || !Store(*text, index))
        return false;
    const Stored& stored = stored_[index];
    entries_.push_back({PrefixOf(std::string_view(arena_).substr(stored.at, stored.keySize)), rowId, index});
    return true;
}

std::string_view TextSort::KeyBehindPrefix(const Stored& stored) const
{
    const std::string_view key = std::string_view(arena_).substr(stored.at, stored.keySize);
    return key.size() > 8 ? key.substr(8) : std::string_view();
}

int TextSort::Compare(const Entry& a, const Entry& b) const
{
    if (a.prefix != b.prefix)
        return a.prefix < b.prefix ? -1 : 1;
    if (a.stored == b.stored)
        return 0;
    const Stored& left = stored_[a.stored];
    const Stored& right = stored_[b.stored];
    if (const int keys = KeyBehindPrefix(left).compare(KeyBehindPrefix(right)); keys != 0)
        return keys;
    return TextOf(left).compare(TextOf(right));
}

std::vector<qint64> TextSort::Finish(bool descending)
{
    std::ranges::sort(nulls_);
    std::ranges::sort(entries_, [this, descending](const Entry& a, const Entry& b) {
        const int order = Compare(a, b);
        if (order != 0)
            return descending ? order > 0 : order < 0;
        return a.rowId < b.rowId;
    });
    std::vector<qint64> rowIds;
    rowIds.reserve(entries_.size() + nulls_.size());
    if (!descending)
        rowIds = std::move(nulls_);
    for (const Entry& entry : entries_)
        rowIds.push_back(entry.rowId);
    if (descending)
        rowIds.insert(rowIds.end(), nulls_.begin(), nulls_.end());
    return rowIds;
}

} // namespace mirel::sqlite
