#pragma once

#include "tableview/column_layout.h"
#include "tableview/record_page.h"

#include <QWidget>

class QStyleOptionHeader;

namespace mirel {

// The captions over the grid's columns, drawn by the user's style; drags of their edges change the widths.
// Layout and page belong to the grid and outlive it.
class GridHeader : public QWidget {
    Q_OBJECT

public:
    enum class Arrow { None, Ascending, Descending };

    GridHeader(ColumnLayout& layout, const RecordPage& page, QWidget* parent);

    void SetOffset(int xPx);
    void SetMargin(int px); // left and right of a caption, as in the cells
    void SetArrow(int field, Arrow arrow);
    int WidthFor(const QString& title) const; // room for a sort arrow included

    QSize sizeHint() const override;

Q_SIGNALS:
    void columnTapped(int column);
    void edgeDoubleTapped(int column);
    void widthChanged(int column);

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    bool event(QEvent* event) override; // tool tips of titles that are cut

private:
    QRect SectionRect(int column) const;
    void PaintSection(QPainter& painter, int column, QStyleOptionHeader& option);

    ColumnLayout& layout_;
    const RecordPage& page_;
    int offsetPx_ = 0;
    int marginPx_ = 4;
    int arrowField_ = -1;
    Arrow arrow_ = Arrow::None;
    int pressedColumn_ = -1;
    int draggedEdge_ = -1;
    int dragFromPx_ = 0;
    int dragWidthPx_ = 0;
};

} // namespace mirel
