#pragma once

#include <QtGlobal>

#include <limits>

namespace mirel {

// Fits a result of any length onto a scroll bar, whose values are ints: one to one as long as they fit, evenly
// spread beyond. Both ends always meet.
class ScrollScale {
public:
    static constexpr int kHighestValue = std::numeric_limits<int>::max() / 2; // bars add a page to their maximum

    explicit ScrollScale(qint64 highestPosition)
        : highest_(highestPosition)
    {
    }

    int HighestValue() const { return IsOneToOne() ? int(highest_) : kHighestValue; }
    int ValueOf(qint64 position) const
    {
        return IsOneToOne() ? int(position) : int(double(position) / double(highest_) * kHighestValue);
    }
    qint64 PositionOf(int value) const
    {
        if (IsOneToOne())
            return value;
        return value == kHighestValue ? highest_ : qint64(double(value) / kHighestValue * double(highest_));
    }

private:
    bool IsOneToOne() const { return highest_ <= kHighestValue; }

    qint64 highest_;
};

} // namespace mirel
