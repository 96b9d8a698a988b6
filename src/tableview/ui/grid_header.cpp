#include "tableview/ui/grid_header.h"

#include <QHelpEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QStyleOptionHeader>
#include <QToolTip>

#include <algorithm>

namespace mirel {
namespace {

constexpr int kEdgeReachPx = 5;

} // namespace

GridHeader::GridHeader(ColumnLayout& layout, const RecordPage& page, QWidget* parent)
    : QWidget(parent)
    , layout_(layout)
    , page_(page)
{
    setMouseTracking(true);
}

void GridHeader::SetOffset(int xPx)
{
    offsetPx_ = xPx;
    update();
}

void GridHeader::SetArrow(int field, Arrow arrow)
{
    arrowField_ = field;
    arrow_ = arrow;
    update();
}

void GridHeader::SetMargin(int px)
{
    marginPx_ = px;
    update();
}

int GridHeader::WidthFor(const QString& title) const
{
    return fontMetrics().horizontalAdvance(title) + 3 * marginPx_ + 1 +
           style()->pixelMetric(QStyle::PM_HeaderMarkSize, nullptr, this);
}

QSize GridHeader::sizeHint() const
{
    QStyleOptionHeader option;
    option.initFrom(this);
    option.text = QStringLiteral("X");
    option.orientation = Qt::Horizontal;
    return style()->sizeFromContents(QStyle::CT_HeaderSection, &option, QSize(), this);
}

QRect GridHeader::SectionRect(int column) const
{
    return {layout_.LeftPx(column) - offsetPx_, 0, layout_.WidthPx(column), height()};
}

void GridHeader::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    QStyleOptionHeader rest;
    rest.initFrom(this);
    rest.orientation = Qt::Horizontal;
    rest.rect = QRect(layout_.TotalPx() - offsetPx_, 0, width(), height());
    style()->drawControl(QStyle::CE_HeaderEmptyArea, &rest, &painter, this);
    QStyleOptionHeader option;
    option.initFrom(this);
    option.orientation = Qt::Horizontal;
    for (int column = 0; column < layout_.Count(); ++column) {
        option.rect = SectionRect(column);
        if (option.rect.intersects(rect()))
            PaintSection(painter, column, option);
    }
}

// The style draws the section and the arrow; the caption stands exactly over the texts of its column.
void GridHeader::PaintSection(QPainter& painter, int column, QStyleOptionHeader& option)
{
    const PageColumn& shown = page_.columns[size_t(column)];
    option.section = column;
    option.state.setFlag(QStyle::State_Sunken, column == pressedColumn_);
    option.state.setFlag(QStyle::State_Raised, column != pressedColumn_);
    option.position = column == 0 ? QStyleOptionHeader::Beginning : QStyleOptionHeader::Middle;
    const bool hasArrow = shown.field >= 0 && shown.field == arrowField_ && arrow_ != Arrow::None;
    option.sortIndicator = !hasArrow                    ? QStyleOptionHeader::None
                           : arrow_ == Arrow::Ascending ? QStyleOptionHeader::SortDown
                                                        : QStyleOptionHeader::SortUp;
    style()->drawControl(QStyle::CE_HeaderSection, &option, &painter, this);

    const QRect section = option.rect;
    QRect caption = section.adjusted(marginPx_, 0, -marginPx_ - 1, 0);
    if (hasArrow) {
        const int mark = style()->pixelMetric(QStyle::PM_HeaderMarkSize, nullptr, this);
        option.rect = QRect(caption.right() - mark + 1, (height() - mark) / 2, mark, mark);
        style()->drawPrimitive(QStyle::PE_IndicatorHeaderArrow, &option, &painter, this);
        caption.setRight(option.rect.left() - marginPx_);
        option.rect = section;
    }
    const int side = shown.rightAligned ? Qt::AlignRight : Qt::AlignLeft;
    painter.setPen(palette().color(QPalette::ButtonText));
    painter.drawText(caption, side | Qt::AlignVCenter | Qt::TextSingleLine,
                     fontMetrics().elidedText(shown.title, Qt::ElideRight, caption.width()));
}

void GridHeader::mousePressEvent(QMouseEvent* event)
{
    if (event->button() != Qt::LeftButton)
        return;
    const int x = event->position().toPoint().x() + offsetPx_;
    draggedEdge_ = layout_.EdgeNear(x, kEdgeReachPx);
    dragFromPx_ = x;
    dragWidthPx_ = draggedEdge_ < 0 ? 0 : layout_.WidthPx(draggedEdge_);
    pressedColumn_ = draggedEdge_ < 0 ? layout_.ColumnAt(x) : -1;
    update();
}

void GridHeader::mouseMoveEvent(QMouseEvent* event)
{
    const int x = event->position().toPoint().x() + offsetPx_;
    if (draggedEdge_ >= 0) {
        layout_.SetByHand(draggedEdge_, dragWidthPx_ + x - dragFromPx_);
        Q_EMIT widthChanged(draggedEdge_);
        return;
    }
    setCursor(layout_.EdgeNear(x, kEdgeReachPx) >= 0 ? Qt::SplitHCursor : Qt::ArrowCursor);
}

void GridHeader::mouseReleaseEvent(QMouseEvent* event)
{
    const int column = layout_.ColumnAt(event->position().toPoint().x() + offsetPx_);
    const bool tapped = pressedColumn_ >= 0 && pressedColumn_ == column;
    pressedColumn_ = -1;
    draggedEdge_ = -1;
    update();
    if (tapped)
        Q_EMIT columnTapped(column);
}

void GridHeader::mouseDoubleClickEvent(QMouseEvent* event)
{
    const int edge = layout_.EdgeNear(event->position().toPoint().x() + offsetPx_, kEdgeReachPx);
    if (edge >= 0)
        Q_EMIT edgeDoubleTapped(edge);
}

bool GridHeader::event(QEvent* event)
{
    if (event->type() != QEvent::ToolTip)
        return QWidget::event(event);
    const auto* help = static_cast<QHelpEvent*>(event);
    const int column = layout_.ColumnAt(help->pos().x() + offsetPx_);
    if (column >= 0)
        QToolTip::showText(help->globalPos(), page_.columns[size_t(column)].title, this, SectionRect(column));
    else
        QToolTip::hideText();
    return true;
}

} // namespace mirel
