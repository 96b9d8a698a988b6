#pragma once

#include <QtGlobal>

#include <algorithm>

namespace mirel {

// The list shows a page of records, a row each; the detail shows one record, a row for each of its fields.
enum class Presentation { List, Detail };

// Which rows a presentation shows of all that there are: a window of so many whole rows that starts at Top() and
// scrolls no further than it has to. Counts from 0. What the rows are (records, or fields) is the presentation's.
class RowWindow {
public:
    qint64 Top() const { return top_; }
    int WholeRows() const { return wholeRows_; }
    void SetWholeRows(int rows) { wholeRows_ = std::max(rows, 1); }

    qint64 HighestTop(qint64 count) const { return std::max<qint64>(count - wholeRows_, 0); }
    // Out of range positions stop at the end.
    void ScrollTo(qint64 top, qint64 highestTop)
    {
        top_ = std::clamp<qint64>(top, 0, std::max<qint64>(highestTop, 0));
    }
    // As far as it takes to show the row.
    void Show(qint64 row)
    {
        top_ = std::clamp(top_, std::max<qint64>(row - wholeRows_ + 1, 0), std::max<qint64>(row, 0));
    }

private:
    qint64 top_ = 0;
    int wholeRows_ = 1;
};

// The list: records of the result. Until their count is known, the end is where the page has shown that they go
// on.
class ListPresentation : public RowWindow {
public:
    // The row of a record within the page; -1 for none.
    int RowOf(qint64 record) const { return record < 0 ? -1 : int(record - Top()); }
};

// The detail: the fields of the current record.
class DetailPresentation : public RowWindow {
public:
    int TopField() const { return int(Top()); }
    int RowOf(int field) const { return field - TopField(); }
};

} // namespace mirel
