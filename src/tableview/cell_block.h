#pragma once

#include <QtGlobal>

#include <algorithm>

namespace mirel {

// A cell of the list: a record of the result and a column of the page, both from 0.
struct CellPlace {
    qint64 record = -1;
    int column = -1;

    friend bool operator==(const CellPlace&, const CellPlace&) = default;
};

// A rectangle of cells of the list, both ends within.
struct CellBlock {
    qint64 firstRecord = 0;
    qint64 lastRecord = -1;
    int firstColumn = 0;
    int lastColumn = -1;

    static CellBlock Between(CellPlace a, CellPlace b)
    {
        return {std::min(a.record, b.record), std::max(a.record, b.record), std::min(a.column, b.column),
                std::max(a.column, b.column)};
    }

    qint64 Records() const { return lastRecord - firstRecord + 1; }
    int Columns() const { return lastColumn - firstColumn + 1; }
    bool IsEmpty() const { return Records() <= 0 || Columns() <= 0; }
    bool IsOneCell() const { return Records() == 1 && Columns() == 1; }
    bool Contains(CellPlace cell) const
    {
        return cell.record >= firstRecord && cell.record <= lastRecord && cell.column >= firstColumn &&
               cell.column <= lastColumn;
    }

    friend bool operator==(const CellBlock&, const CellBlock&) = default;
};

} // namespace mirel
