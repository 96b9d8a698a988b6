#pragma once

#include <QtGlobal>

#include <vector>

namespace mirel {

// Widths and places of the grid's columns, in pixels from the left edge of the first one. A width that the user
// set by hand stays until that column is asked to fit its content again.
class ColumnLayout {
public:
    static constexpr int kNarrowestPx = 16;

    void Reset(int columns) { columns_.assign(size_t(columns), Column()); }
    int Count() const { return int(columns_.size()); }

    int LeftPx(int column) const;
    int WidthPx(int column) const { return columns_[size_t(column)].widthPx; }
    int TotalPx() const { return LeftPx(Count()); }

    int ColumnAt(int xPx) const;              // -1: right of all columns
    int EdgeNear(int xPx, int reachPx) const; // the column whose right edge is that near; -1: none
    bool IsByHand(int column) const { return columns_[size_t(column)].byHand; }

    void SetByHand(int column, int widthPx);
    void Fit(int column, int widthPx); // gives up a width set by hand

private:
    struct Column {
        int widthPx = kNarrowestPx;
        bool byHand = false;
    };
    std::vector<Column> columns_;
};

} // namespace mirel
