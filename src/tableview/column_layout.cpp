#include "tableview/column_layout.h"

#include <algorithm>
#include <cstdlib>

namespace mirel {

int ColumnLayout::LeftPx(int column) const
{
    int left = 0;
    for (int i = 0; i < column; ++i)
        left += columns_[size_t(i)].widthPx;
    return left;
}

int ColumnLayout::ColumnAt(int xPx) const
{
    int right = 0;
    for (int column = 0; column < Count(); ++column) {
        right += WidthPx(column);
        if (xPx < right)
            return column;
    }
    return -1;
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
    columns_[size_t(column)] = {std::max(widthPx, kNarrowestPx), true};
}

void ColumnLayout::Fit(int column, int widthPx)
{
    columns_[size_t(column)] = {std::max(widthPx, kNarrowestPx), false};
}

} // namespace mirel
