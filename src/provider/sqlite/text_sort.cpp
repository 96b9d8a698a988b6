#include "provider/sqlite/text_sort.h"

#include <QtEndian>

#include <algorithm>
#include <array>
#include <functional>

namespace mirel::sqlite {
namespace {

constexpr size_t kMostBytes = size_t(192) << 20;
constexpr size_t kMostEntries = size_t(4) << 20;
constexpr size_t kRecent = 1 << 15;

constexpr size_t kPieceBytes = 8;
constexpr int kMostPieces = 32; // then texts are compared as a whole
constexpr size_t kFewEntries = 6;

// Eight bytes as a number, zeros behind the key's end.
quint64 PieceOf(std::string_view key, int piece)
{
    const std::string_view bytes = key.substr(std::min(key.size(), size_t(piece) * kPieceBytes), kPieceBytes);
    std::array<char, kPieceBytes> padded{};
    std::ranges::copy(bytes, padded.begin());
    return qFromBigEndian<quint64>(padded.data());
}

} // namespace

bool TextSort::Store(std::string_view text, quint32& index)
{
    if (recent_.empty())
        recent_.resize(kRecent);
    const size_t hash = std::hash<std::string_view>()(text);
    Recent& recent = recent_[hash % kRecent];
    if (recent.index >= 0 && recent.hash == hash && TextOf(stored_[size_t(recent.index)]) == text) {
        index = quint32(recent.index);
        return true;
    }
    const std::span<const uint8_t> key = keys_.KeyOf(text);
    if (arena_.size() + key.size() + text.size() > kMostBytes)
        return false;
    index = quint32(stored_.size());
    stored_.push_back({quint32(arena_.size()), quint32(key.size()), quint32(text.size())});
    arena_.append(reinterpret_cast<const char*>(key.data()), key.size());
    arena_.append(text);
    recent = {hash, qint64(index)};
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
    entries_.push_back({0, rowId, index});
    return true;
}

int TextSort::Compare(const Entry& a, const Entry& b) const
{
    if (a.stored == b.stored)
        return 0;
    const Stored& left = stored_[a.stored];
    const Stored& right = stored_[b.stored];
    if (const int keys = KeyOf(left).compare(KeyOf(right)); keys != 0)
        return keys;
    return TextOf(left).compare(TextOf(right));
}

void TextSort::SortWhole(std::span<Entry> entries, bool descending) const
{
    std::ranges::sort(entries, [this, descending](const Entry& a, const Entry& b) {
        const int order = Compare(a, b);
        if (order != 0)
            return descending ? order > 0 : order < 0;
        return a.rowId < b.rowId;
    });
}

void TextSort::SortFrom(int piece, std::span<Entry> entries, bool descending)
{
    const auto isSameText = [first = entries.front().stored](const Entry& entry) { return entry.stored == first; };
    if (entries.size() <= kFewEntries || piece == kMostPieces || std::ranges::all_of(entries, isSameText))
        return SortWhole(entries, descending);
    size_t longest = 0;
    for (Entry& entry : entries) {
        const std::string_view key = KeyOf(stored_[entry.stored]);
        longest = std::max(longest, key.size());
        entry.piece = PieceOf(key, piece);
        if (descending)
            entry.piece = ~entry.piece;
    }
    std::ranges::sort(entries, {}, &Entry::piece);
    const bool isLast = longest <= size_t(piece + 1) * kPieceBytes;
    for (size_t from = 0, to = 0; from < entries.size(); from = to) {
        while (to < entries.size() && entries[to].piece == entries[from].piece)
            ++to;
        const std::span<Entry> same = entries.subspan(from, to - from);
        if (isLast)
            SortWhole(same, descending);
        else if (same.size() > 1)
            SortFrom(piece + 1, same, descending);
    }
}

std::vector<qint64> TextSort::Finish(bool descending)
{
    std::ranges::sort(nulls_);
    if (!entries_.empty())
        SortFrom(0, entries_, descending);
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
