#pragma once

#include "tableview/column_layout.h"
#include "tableview/column_widths.h"
#include "tableview/record_browser.h"
#include "tableview/ui/line_painter.h"
#include "tableview/ui/table_command.h"

#include <QAbstractScrollArea>
#include <QBasicTimer>

#include <optional>

namespace mirel {

class EmptyNote;
class GridHeader;

// Draws the browser's page with its selection, and turns keys, taps, the wheel and its scroll bars into
// requests. It changes nothing by itself: the receiver of the requests calls ShowState afterwards.
//
// The vertical scroll bar counts the whole result, in rows. The browser must outlive the grid.
class RecordGrid : public QAbstractScrollArea {
    Q_OBJECT

public:
    RecordGrid(const RecordBrowser& browser, QWidget* parent);
    ~RecordGrid() override;

    // Takes up page, columns and selection as they are now.
    void ShowState();
    void FitAllColumns();
    void FitColumn(int column);
    // Widths set by hand outlive other filters, orders and hidden columns.
    const ColumnWidths& WidthsByHand() const { return widthsByHand_; }
    void SetWidthsByHand(const ColumnWidths& widths);
    QRect CellRect(int row, int column) const; // in the viewport

    QSize minimumSizeHint() const override;
    QSize sizeHint() const override;

Q_SIGNALS:
    void commandRequested(TableCommand command);
    void textTyped(const QString& text);
    void cellPressed(int row, int column);
    void cellReached(int row, int column); // by a drag of the mouse, or pressed with Shift
    void selectedCellTapped();             // that was selected before
    void cellDoubleTapped();
    void popupRequested(const QPoint& globalPosition);
    void headerTapped(int column);
    void scrollRequested(qint64 position);
    void thumbDragged(qint64 position);
    void rowsPerPageChanged(int wholeRows);

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void changeEvent(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void timerEvent(QTimerEvent* event) override;
    void scrollContentsBy(int dx, int dy) override;
    bool viewportEvent(QEvent* event) override;
    bool focusNextPrevChild(bool) override { return false; } // Tab walks through the cells

private:
    void TakeUpFont();
    void PlaceHeader();
    // Grows the columns with the page; Whole: fits them to it alone.
    enum class Fit { Grow, Whole };
    void FitToContent(Fit fit);
    void TakeUpContent(int column);
    void TakeContentWidths();
    void FitDetail();
    void ShowEmptyNote();
    void KeepWidth(int column);
    void TakeUpWidths();
    void UpdateScrollBars();
    void ScrollToSelectedColumn();
    int RowAt(int y) const { return rowHeightPx_ > 0 ? y / rowHeightPx_ : -1; }
    // The cell there, in rows and columns of the page; empty: there is none.
    std::optional<QPoint> CellAt(const QPoint& position) const;
    bool PressCell(const QPoint& position); // false: there is none
    void EndBlockPressed();
    QPoint PopupPlace() const;
    void DragTo(const QPoint& position);
    void DragOnward();

    void PaintRow(QPainter& painter, int row, const QRect& dirty);
    void PaintBlock(QPainter& painter, int row, const QRect& band) const;
    void PaintCell(QPainter& painter, int row, int column, const QRect& rect);
    void PaintNumber(QPainter& painter, int column, const QRect& inner, const QString& number);
    QString ShownText(int row, int column) const;
    bool ShowToolTip(const QPoint& position, const QPoint& globalPosition);
    bool IsDetailName(int column) const;
    void PaintGridLines(QPainter& painter, const QRect& dirty) const;
    void PaintSelection(QPainter& painter) const;

    const RecordBrowser& browser_;
    ColumnLayout layout_;
    ColumnWidths widthsByHand_;
    GridHeader* header_;
    std::optional<LinePainter> text_; // for the widget's font
    int rowHeightPx_ = 0;
    int marginPx_ = 0;
    EmptyNote* empty_;
    bool handheld_ = false;
    quint64 shownPage_ = 0;
    quint64 shownColumns_ = 0;
    int shownField_ = -1;   // scrolled to when it was selected
    int detailNamesPx_ = 0; // set by hand; 0: as they need
    bool syncing_ = false;
    QBasicTimer hold_;
    QPoint pressedAt_;
    std::optional<QPoint> pressedInBlock_; // the cell: a hold opens the block's menu, all else ends the block
    bool pressedSelected_ = false;         // the selected cell: neither dragged nor held since
    bool dragging_ = false;
    QBasicTimer dragOn_; // while the mouse is dragged beyond the cells
    QPoint dragAt_;
};

} // namespace mirel
