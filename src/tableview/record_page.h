#pragma once

#include <QString>

#include <vector>

namespace mirel {

// One column of what the grid shows. In the list a field of the result; of a single record "Field" and "Value".
struct PageColumn {
    QString title;
    bool rightAligned = false;
    int field = -1; // index in the result; -1: the column of field names

    friend bool operator==(const PageColumn&, const PageColumn&) = default;
};

struct PageCell {
    QString text; // cut for the grid
    bool isNull = false;

    friend bool operator==(const PageCell&, const PageCell&) = default;
};

// The texts that the grid shows now, a page of the result at a time. Rows and columns count from 0.
struct RecordPage {
    std::vector<PageColumn> columns;
    std::vector<std::vector<PageCell>> rows; // at most one more than fits wholly

    const PageCell& At(int row, int column) const { return rows[size_t(row)][size_t(column)]; }
    int RowCount() const { return int(rows.size()); }
    int ColumnCount() const { return int(columns.size()); }
    int ColumnOfField(int field) const; // -1: not shown
};

} // namespace mirel
