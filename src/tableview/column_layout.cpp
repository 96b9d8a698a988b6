#include "tableview/column_layout.h"

#include <algorithm>
#include <cstdlib>

namespace mirel {

void ColumnLayout::Reset(int columns)
{
    columns_.assign(size_t(columns), Column());
    leftPx_.clear();
}

// A result may have two thousand columns, and each of its cells asks.
void ColumnLayout::Place() const
{
    if (!leftPx_.empty())
        return;
    leftPx_.reserve(columns_.size() + 1);
    leftPx_.push_back(0);
    for (const Column& column : columns_)
        leftPx_.push_back(leftPx_.back() + column.widthPx);
}

int ColumnLayout::LeftPx(int column) const
{
    Place();
    return leftPx_[size_t(std::clamp(column, 0, Count()))];
}

int ColumnLayout::ColumnAt(int xPx) const
{
    Place();
    const auto right = std::upper_bound(leftPx_.begin() + 1, leftPx_.end(), xPx);
    return right == leftPx_.end() ? -1 : int(right - leftPx_.begin()) - 1;
}

int ColumnLayout::EdgeNear(int xPx, int reachPx) const
{
    int right = 0;
    int nearest = -1;
    int distance = reachPx + 1;
    for (int column = 0; column < Count(); ++column) {
        right += WidthPx(column);
        if (std::abs(xPx - right) < distance) {
            distance = std::abs(xPx - right);
            nearest = column;
        }
    }
    return nearest;
}

void ColumnLayout::SetByHand(int column, int widthPx)
{
    SetWidth(column, widthPx);
    columns_[size_t(column)].byHand = true;
}

void ColumnLayout::SetWidth(int column, int widthPx)
{
    columns_[size_t(column)].widthPx = std::max(widthPx, kNarrowestPx);
    leftPx_.clear();
}

void ColumnLayout::FitToPage(int column)
{
    columns_[size_t(column)].byHand = false;
    columns_[size_t(column)].content = {};
}

void ColumnLayout::Grow(int column, const Content& content)
{
    Content& held = columns_[size_t(column)].content;
    held.wholePx = std::max(held.wholePx, content.wholePx);
    held.fractionPx = std::max(held.fractionPx, content.fractionPx);
}

void ColumnLayout::TakeContentWidths(int marginPx, int mostPx)
{
    for (int column = 0; column < Count(); ++column) {
        const Content& content = columns_[size_t(column)].content;
        if (!IsByHand(column))
            SetWidth(column, std::min(content.wholePx + content.fractionPx + 2 * marginPx + 1, mostPx));
    }
}

} // namespace mirel
