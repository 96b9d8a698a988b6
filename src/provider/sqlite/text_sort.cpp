#include "provider/sqlite/text_sort.h"

#include <QtEndian>

#include <algorithm>
#include <array>
#include <functional>
#include <numeric>

namespace mirel::sqlite {
namespace {

constexpr size_t kMostBytes = size_t(192) << 20;
constexpr size_t kMostRecords = size_t(12) << 20;
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
    if (rowIds_.size() + nulls_.size() >= kMostRecords)
        return false;
    if (!text) {
        nulls_.push_back(rowId);
        return true;
    }
    quint32 index = 0;
    if (!Store(*text, index))
        return false;
    rowIds_.push_back(rowId);
    texts_.push_back(index);
    return true;
}

void TextSort::SortWhole(std::span<Entry> entries) const
{
    std::ranges::sort(entries, [this](const Entry& a, const Entry& b) {
        const Stored& left = stored_[a.stored];
        const Stored& right = stored_[b.stored];
        const int keys = KeyOf(left).compare(KeyOf(right));
        return keys != 0 ? keys < 0 : TextOf(left) < TextOf(right);
    });
}

void TextSort::SortFrom(int piece, std::span<Entry> entries)
{
    if (entries.size() <= kFewEntries || piece == kMostPieces)
        return SortWhole(entries);
    size_t longest = 0;
    for (Entry& entry : entries) {
        const std::string_view key = KeyOf(stored_[entry.stored]);
        longest = std::max(longest, key.size());
        entry.piece = PieceOf(key, piece);
    }
    std::ranges::sort(entries, {}, &Entry::piece);
    const bool isLast = longest <= size_t(piece + 1) * kPieceBytes;
    for (size_t from = 0, to = 0; from < entries.size(); from = to) {
        while (to < entries.size() && entries[to].piece == entries[from].piece)
            ++to;
        const std::span<Entry> same = entries.subspan(from, to - from);
        if (isLast)
            SortWhole(same);
        else if (same.size() > 1)
            SortFrom(piece + 1, same);
    }
}

quint32 TextSort::Rank(std::vector<quint32>& ranks)
{
    std::vector<Entry> entries(stored_.size());
    for (size_t i = 0; i < entries.size(); ++i)
        entries[i].stored = quint32(i);
    SortFrom(0, entries);
    ranks.resize(stored_.size());
    quint32 rank = 0;
    for (size_t i = 0; i < entries.size(); ++i) {
        if (i > 0 && TextOf(stored_[entries[i].stored]) != TextOf(stored_[entries[i - 1].stored]))
            ++rank;
        ranks[entries[i].stored] = rank;
    }
    return entries.empty() ? 0 : rank + 1;
}

void TextSort::Finish(bool descending, const std::function<void(qint64)>& take)
{
    std::vector<quint32> ranks;
    const size_t different = Rank(ranks);
    // Where each text's records begin, then where the next one of them goes.
    std::vector<quint32> starts(different + 1);
    for (const quint32 text : texts_)
        ++starts[ranks[text] + 1];
    std::partial_sum(starts.begin(), starts.end(), starts.begin());
    std::vector<quint32> next = starts;
    std::vector<qint64> sorted(rowIds_.size());
    for (size_t i = 0; i < rowIds_.size(); ++i)
        sorted[next[ranks[texts_[i]]]++] = rowIds_[i];

    const auto takeAll = [&take](std::span<qint64> rowIds) {
        if (!std::ranges::is_sorted(rowIds)) // an index led to them
            std::ranges::sort(rowIds);
        std::ranges::for_each(rowIds, take);
    };
    if (!descending)
        takeAll(nulls_);
    for (size_t i = 0; i < different; ++i) {
        const size_t rank = descending ? different - 1 - i : i;
        takeAll(std::span(sorted).subspan(starts[rank], starts[rank + 1] - starts[rank]));
    }
    if (descending)
        takeAll(nulls_);
}

} // namespace mirel::sqlite
