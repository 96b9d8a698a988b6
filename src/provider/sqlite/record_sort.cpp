#include "provider/sqlite/record_sort.h"

#include <QtEndian>

#include <algorithm>
#include <array>
#include <bit>
#include <numeric>

namespace mirel::sqlite {
namespace {

constexpr size_t kMostBytes = size_t(192) << 20;
constexpr size_t kMostRecords = size_t(12) << 20;
constexpr size_t kRecent = 1 << 15;

constexpr size_t kPieceBytes = 8;
constexpr size_t kMostKeyBytes = 256; // then keys are compared as a whole
constexpr size_t kFewEntries = 6;
constexpr size_t kManyEntries = 8192; // more are distributed among buckets first
constexpr int kBucketBits = 12;
constexpr size_t kSomeValues = 4096; // in one step
constexpr size_t kSomeRecords = 65'536;

// Eight bytes as a number, zeros behind the key's end.
quint64 PieceOf(std::string_view key, size_t at)
{
    const std::string_view bytes = key.substr(std::min(key.size(), at), kPieceBytes);
    std::array<char, kPieceBytes> padded{};
    std::ranges::copy(bytes, padded.begin());
    return qFromBigEndian<quint64>(padded.data());
}

} // namespace

bool RecordSort::Store(std::string_view bytes, quint32& index)
{
    if (recent_.empty())
        recent_.resize(kRecent);
    const size_t hash = std::hash<std::string_view>()(bytes);
    Recent& recent = recent_[hash % kRecent];
    if (recent.index >= 0 && recent.hash == hash && BytesOf(stored_[size_t(recent.index)]) == bytes) {
        index = quint32(recent.index);
        return true;
    }
    const std::string_view text = keys_.IsText() ? bytes : std::string_view();
    const std::string_view key = keys_.IsText() ? keys_.KeyOf(text) : bytes;
    bytes_ += key.size() + text.size();
    if (bytes_ > kMostBytes)
        return false;
    char* const place = static_cast<char*>(arena_.allocate(key.size() + text.size(), 1));
    std::ranges::copy(text, std::ranges::copy(key, place).out);
    index = quint32(stored_.size());
    stored_.push_back({place, quint32(key.size()), quint32(text.size())});
    entries_.push_back({PieceOf(key, 0), index});
    recent = {hash, qint64(index)};
    return true;
}

bool RecordSort::Add(qint64 rowId, sqlite3_stmt* row, int column)
{
    if (rowIds_.size() + nulls_.size() >= kMostRecords)
        return false;
    if (sqlite3_column_type(row, column) == SQLITE_NULL) {
        nulls_.push_back(rowId);
        return true;
    }
    const std::optional<std::string_view> bytes = keys_.BytesOf(row, column);
    quint32 index = 0;
    if (!bytes || !Store(*bytes, index))
        return false;
    rowIds_.push_back(rowId);
    values_.push_back(index);
    return true;
}

void RecordSort::SortWhole(std::span<Entry> entries) const
{
    std::ranges::sort(entries, [this](const Entry& a, const Entry& b) {
        const Stored& left = stored_[a.stored];
        const Stored& right = stored_[b.stored];
        const int keys = KeyOf(left).compare(KeyOf(right));
        return keys != 0 ? keys < 0 : TextOf(left) < TextOf(right);
    });
}

void RecordSort::SortNext()
{
    const Task task = tasks_.back();
    tasks_.pop_back();
    Sort(task);
}

void RecordSort::Sort(const Task& task)
{
    const std::span<Entry> entries = std::span(entries_).subspan(task.first, task.count);
    if (task.count <= kFewEntries || task.at >= kMostKeyBytes)
        return SortWhole(entries);
    quint64 least = ~quint64(0);
    quint64 greatest = 0;
    for (Entry& entry : entries) {
        if (task.at > 0)
            entry.piece = PieceOf(KeyOf(stored_[entry.stored]), task.at);
        least = std::min(least, entry.piece);
        greatest = std::max(greatest, entry.piece);
    }
    if (task.count > kManyEntries && least != greatest)
        return Distribute(task, least, greatest);
    if (least != greatest)
        std::ranges::sort(entries, {}, &Entry::piece);
    SortEqualPieces(task);
}

// By the first bits in which they differ, into buckets that are sorted later, each by itself.
void RecordSort::Distribute(const Task& task, quint64 least, quint64 greatest)
{
    const int shift = std::max(0, int(std::bit_width(least ^ greatest)) - kBucketBits);
    const auto bucketOf = [shift](const Entry& entry) {
        return size_t((entry.piece >> shift) & ((quint64(1) << kBucketBits) - 1));
    };
    const std::span<Entry> entries = std::span(entries_).subspan(task.first, task.count);
    std::vector<size_t> starts((size_t(1) << kBucketBits) + 1);
    for (const Entry& entry : entries)
        ++starts[bucketOf(entry) + 1];
    std::partial_sum(starts.begin(), starts.end(), starts.begin());
    for (size_t bucket = 0; bucket + 1 < starts.size(); ++bucket) {
        const size_t count = starts[bucket + 1] - starts[bucket];
        if (count > 1)
            tasks_.push_back({task.first + starts[bucket], count, task.at});
    }
    if (scratch_.size() < task.count)
        scratch_.resize(task.count);
    for (const Entry& entry : entries)
        scratch_[starts[bucketOf(entry)]++] = entry;
    if (task.count == entries_.size())
        entries_.swap(scratch_);
    else
        std::ranges::copy(std::span(scratch_).first(task.count), entries.begin());
}

void RecordSort::SortEqualPieces(const Task& task)
{
    const size_t next = task.at + kPieceBytes;
    const auto goesOn = [&](const Entry& entry) { return stored_[entry.stored].keySize > next; };
    const std::span<Entry> entries = std::span(entries_).subspan(task.first, task.count);
    for (size_t from = 0, to = 0; from < entries.size(); from = to) {
        while (to < entries.size() && entries[to].piece == entries[from].piece)
            ++to;
        const std::span<Entry> same = entries.subspan(from, to - from);
        if (same.size() > kFewEntries && std::ranges::any_of(same, goesOn))
            tasks_.push_back({task.first + from, same.size(), next});
        else if (same.size() > 1)
            SortWhole(same);
    }
}

void RecordSort::RankSome()
{
    const size_t end = std::min(ranked_ + kSomeValues, entries_.size());
    for (; ranked_ < end; ++ranked_) {
        const quint32 stored = entries_[ranked_].stored;
        if (ranked_ == 0 || BytesOf(stored_[stored]) != BytesOf(stored_[entries_[ranked_ - 1].stored]))
            ++different_;
        ranks_[stored] = quint32(different_ - 1);
    }
}

// From here on the values are not needed any more.
void RecordSort::CountRanks()
{
    arena_.release();
    starts_.resize(different_ + 1);
    for (const quint32 value : values_)
        ++starts_[ranks_[value] + 1];
    std::partial_sum(starts_.begin(), starts_.end(), starts_.begin());
    next_ = starts_;
    sorted_.resize(rowIds_.size());
}

void RecordSort::PlaceSome()
{
    const size_t end = std::min(placed_ + kSomeRecords, rowIds_.size());
    for (; placed_ < end; ++placed_)
        sorted_[next_[ranks_[values_[placed_]]]++] = rowIds_[placed_];
}

void RecordSort::HandSome(const std::function<void(qint64)>& take)
{
    const size_t total = different_ + 1;
    const size_t end = std::min(handed_ + kSomeValues, total);
    for (; handed_ < end; ++handed_) {
        const size_t place = descending_ ? total - 1 - handed_ : handed_; // NULL has the first one
        const std::span<qint64> rowIds =
            place == 0 ? std::span(nulls_)
                       : std::span(sorted_).subspan(starts_[place - 1], starts_[place] - starts_[place - 1]);
        if (!std::ranges::is_sorted(rowIds)) // an index led to them
            std::ranges::sort(rowIds);
        std::ranges::for_each(rowIds, take);
    }
}

// Each turn is a step; a stage begins with a step of its own.
bool RecordSort::HandOver(const QDeadlineTimer& until, const std::function<void(qint64)>& take)
{
    do {
        switch (stage_) {
        case Stage::Adding:
            ranks_.resize(stored_.size());
            tasks_.push_back({0, entries_.size(), 0});
            stage_ = Stage::Sorting;
            break;
        case Stage::Sorting:
            SortNext();
            if (tasks_.empty())
                stage_ = Stage::Ranking;
            break;
        case Stage::Ranking:
            RankSome();
            if (ranked_ == entries_.size())
                stage_ = Stage::Counting;
            break;
        case Stage::Counting:
            CountRanks();
            stage_ = Stage::Placing;
            break;
        case Stage::Placing:
            PlaceSome();
            if (placed_ == rowIds_.size())
                stage_ = Stage::Handing;
            break;
        case Stage::Handing:
            HandSome(take);
            if (handed_ > different_)
                return true;
            break;
        }
    } while (!until.hasExpired());
    return false;
}

} // namespace mirel::sqlite
