#pragma once

#include "forms/ui/control_widget.h"

#include <QAbstractScrollArea>
#include <QBasicTimer>

class QHeaderView;
class QStandardItemModel;

namespace mirel {

// Rows of texts under a header, read as they come into sight: a list of any length costs what its visible rows
// do. Draws what it is given; a tap or a key asks for another row, and the answer is a call of SetRows.
//
// Rows count from 0.
class RecordList : public QAbstractScrollArea {
    Q_OBJECT

public:
    RecordList(ControlWidget::ListSource source, QWidget* parent);

    void SetColumns(const QStringList& names);
    const QStringList& Columns() const { return columns_; }
    // Reads the rows in sight again.
    void SetRows(qint64 rows, qint64 selected);
    void SetSortMark(int column, Qt::SortOrder order); // -1: none

    QRect RowRect(qint64 row) const; // in the viewport
    QHeaderView* Header() const { return header_; }

Q_SIGNALS:
    void rowChosen(qint64 row);
    void headerTapped(int column);

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void changeEvent(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void scrollContentsBy(int dx, int dy) override;
    void focusInEvent(QFocusEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;

private:
    int RowHeightPx() const;
    int WholeRows() const;
    qint64 HighestTop() const;
    void PlaceHeader();
    void UpdateScrollBars();
    void ReadRows();
    void MeasureNumbers();
    void DrawCell(QPainter& painter, QRect cell, int column, const QString& text) const;
    void FitColumns();
    void NarrowWidestColumn();
    void BringIntoSight(qint64 row);
    QString Shown(const QString& text) const;

    ControlWidget::ListSource source_;
    QStringList columns_;
    QStandardItemModel* names_;
    QHeaderView* header_;
    qint64 rows_ = 0;
    qint64 selected_ = -1;
    qint64 top_ = 0;                 // the first row in sight
    std::vector<QStringList> texts_; // from `top_` on
    std::vector<int> fractionPx_;    // of each column: the widest; -1: it holds no numbers
    bool sizedByHand_ = false;       // the columns: they are not fitted any more
    bool fitting_ = false;
    bool syncing_ = false;
};

class ListWidget : public ControlWidget {
    Q_OBJECT
public:
    ListWidget(const ControlRun& control, const ListSource& source, QWidget& surface);
    void Show(const ControlRun& control) override;

protected:
    int TextRoomPx(int) const override { return 0; }

private:
    RecordList* list_;
};

} // namespace mirel
