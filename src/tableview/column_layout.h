#pragma once

#include <QtGlobal>

#include <vector>

namespace mirel {

// Widths and places of the grid's columns, in pixels from the left edge of the first one.
//
// A column fits what it has shown: it grows with wider content and never shrinks, until it is asked to fit again.
// A width that the user set by hand stays until then.
class ColumnLayout {
public:
    static constexpr int kNarrowestPx = 16;

    void Reset(int columns);
    int Count() const { return int(columns_.size()); }

    int LeftPx(int column) const;
    int WidthPx(int column) const { return columns_[size_t(column)].widthPx; }
    int TotalPx() const { return LeftPx(Count()); }

    int ColumnAt(int xPx) const;              // -1: right of all columns
    int EdgeNear(int xPx, int reachPx) const; // the column whose right edge is that near; -1: none
    bool IsByHand(int column) const { return columns_[size_t(column)].byHand; }

    void SetByHand(int column, int widthPx);

    // What a column holds: a caption, or texts, or numbers that stand under one another by their points. A text
    // without a fraction is whole.
    struct Content {
        int wholePx = 0;    // up to the point
        int fractionPx = 0; // from the point on
    };
    // Forgets what the columns have held, and the widths set by hand.
    void FitToPage(int column);
    void Grow(int column, const Content& content);
    int FractionPx(int column) const { return columns_[size_t(column)].content.fractionPx; }
    // Gives the columns that are not set by hand the width of their content, `marginPx` on either side, but no
    // more than `mostPx`.
    void TakeContentWidths(int marginPx, int mostPx);
    void SetWidth(int column, int widthPx);

private:
    struct Column {
        int widthPx = kNarrowestPx;
        bool byHand = false;
        Content content;
    };
    void Place() const;

    std::vector<Column> columns_;
    mutable std::vector<int> leftPx_; // of each column and of the end; empty: to be placed again
};

} // namespace mirel
