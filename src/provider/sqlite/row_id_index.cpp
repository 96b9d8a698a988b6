#include "provider/sqlite/row_id_index.h"

#include <algorithm>

namespace mirel::sqlite {
namespace {

// Row ids can lie as far apart as numbers can.
bool HasNoGaps(qint64 first, qint64 last, qint64 count)
{
    return quint64(last) - quint64(first) == quint64(count) - 1;
}

} // namespace

void RowIdIndex::Begin(qint64 firstRowId)
{
    Clear();
    firsts_.push_back(firstRowId);
    starts_.push_back(0);
    count_ = 1;
}

void RowIdIndex::AddSample(qint64 rowId)
{
    starts_.push_back(starts_.back() + quint32(kStep));
    firsts_.push_back(rowId);
    count_ = qint64(starts_.back()) + 1;
}

void RowIdIndex::Finish(qint64 behindSample, qint64 rowId)
{
    isComplete_ = true;
    if (firsts_.empty()) {
        isDense_ = true;
        return;
    }
    count_ = qint64(starts_.back()) + behindSample;
    last_ = rowId;
    isDense_ = HasNoGaps(firsts_.front(), last_, count_);
    if (isDense_) {
        denseFirst_ = firsts_.front();
        std::vector<qint64>().swap(firsts_);
        std::vector<quint32>().swap(starts_);
    } else {
        firsts_.shrink_to_fit();
        starts_.shrink_to_fit();
    }
}

std::optional<qint64> RowIdIndex::LastSample() const
{
    return firsts_.empty() ? std::nullopt : std::optional(firsts_.back());
}

size_t RowIdIndex::SampleOf(qint64 position) const
{
    const auto behind = std::ranges::upper_bound(starts_, quint32(position));
    return size_t(behind - starts_.begin()) - 1;
}

qint64 RowIdIndex::CountOf(size_t sample) const
{
    const qint64 end = sample + 1 < starts_.size() ? qint64(starts_[sample + 1]) : count_;
    return end - qint64(starts_[sample]);
}

RowIdIndex::Place RowIdIndex::PlaceOf(qint64 position) const
{
    if (isDense_)
        return {denseFirst_ + position, 0, true};
    const size_t sample = SampleOf(position);
    const qint64 skip = position - qint64(starts_[sample]);
    const bool knowsEnd = isComplete_ || sample + 1 < firsts_.size();
    if (knowsEnd && HasNoGaps(firsts_[sample], LastOf(sample), CountOf(sample)))
        return {firsts_[sample] + skip, 0, true};
    return {firsts_[sample], skip, false};
}

std::optional<qint64> RowIdIndex::PositionOf(qint64 rowId) const
{
    if (isDense_ && rowId >= denseFirst_ && rowId <= last_)
        return rowId - denseFirst_;
    return {};
}

std::pair<qint64, qint64> RowIdIndex::SampleBefore(qint64 rowId) const
{
    const auto behind = std::ranges::upper_bound(firsts_, rowId);
    if (behind == firsts_.begin())
        return {rowId, 0};
    const auto sample = size_t(behind - firsts_.begin()) - 1;
    return {firsts_[sample], qint64(starts_[sample])};
}

void RowIdIndex::Spread()
{
    if (!isDense_)
        return;
    isDense_ = false;
    for (qint64 position = 0; position < count_; position += kStep) {
        firsts_.push_back(denseFirst_ + position);
        starts_.push_back(quint32(position));
    }
}

bool RowIdIndex::Append(qint64 rowId)
{
    if (count_ > 0 && rowId <= last_)
        return false;
    if (count_ == 0) {
        Clear();
        isComplete_ = true;
        isDense_ = true;
        denseFirst_ = rowId;
    } else if (isDense_ && rowId != last_ + 1) {
        Spread();
    }
    if (!isDense_ && CountOf(firsts_.size() - 1) >= kStep) {
        firsts_.push_back(rowId);
        starts_.push_back(quint32(count_));
    }
    last_ = rowId;
    ++count_;
    return true;
}

void RowIdIndex::Remove(qint64 position, qint64 rowId)
{
    if (isDense_ && rowId == last_) {
        --last_;
        --count_;
        return;
    }
    Spread();
    for (size_t sample = SampleOf(position) + 1; sample < starts_.size(); ++sample)
        --starts_[sample];
    --count_;
}

std::vector<RowIdIndex::Range> RowIdIndex::Ranges() const
{
    std::vector<Range> ranges;
    if (isDense_) {
        for (qint64 done = 0; done < count_; done += kStep)
            ranges.push_back({denseFirst_ + done, denseFirst_ + std::min(done + kStep, count_) - 1});
    }
    for (size_t sample = 0; sample < firsts_.size(); ++sample)
        ranges.push_back({firsts_[sample], LastOf(sample)});
    return ranges;
}

} // namespace mirel::sqlite
