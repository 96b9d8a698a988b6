#include "tableview/scroll_scale.h"
#include "tableview/ui/grid_header.h"
#include "tableview/ui/record_grid.h"

#include <QApplication>
#include <QHelpEvent>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QScrollBar>
#include <QScrollPrepareEvent>
#include <QToolTip>

#include <algorithm>
#include <utility>

// What the user does to the grid: keys, the mouse, a pen, fingers, scroll bars.

namespace mirel {
namespace {

bool IsTyped(const QKeyEvent& event)
{
    const bool command = event.modifiers() & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier);
    // AltGr comes as both modifiers, and types.
    const bool altGr = (event.modifiers() & Qt::ControlModifier) && (event.modifiers() & Qt::AltModifier);
    return (!command || altGr) && !event.text().isEmpty() && event.text().front().isPrint();
}

} // namespace

void RecordGrid::keyPressEvent(QKeyEvent* event)
{
    if (const std::optional<TableCommand> command = CommandOfKey(KeyPlace::Grid, event->keyCombination()))
        Q_EMIT commandRequested(*command);
    else if (event->key() == Qt::Key_F10 && event->modifiers() == Qt::ShiftModifier)
        Q_EMIT popupRequested(PopupPlace());
    else if (IsTyped(*event))
        Q_EMIT textTyped(event->text());
    else
        event->ignore();
}

std::optional<QPoint> RecordGrid::CellAt(const QPoint& position) const
{
    const int row = RowAt(position.y());
    const int column = layout_.ColumnAt(position.x() + horizontalScrollBar()->value());
    if (row < 0 || row >= browser_.Page().RowCount() || column < 0)
        return {};
    return QPoint(column, row);
}

bool RecordGrid::PressCell(const QPoint& position)
{
    const std::optional<QPoint> cell = CellAt(position);
    if (cell)
        Q_EMIT cellPressed(cell->y(), cell->x());
    return cell.has_value();
}

void RecordGrid::mousePressEvent(QMouseEvent* event)
{
    const QPoint at = event->position().toPoint();
    const std::optional<QPoint> cell = CellAt(at);
    if (!cell)
        return;
    const bool isLeft = event->button() == Qt::LeftButton;
    const CellPlace place{browser_.ScrollPosition() + cell->y(), cell->x()};
    const bool inBlock = browser_.HasBlock() && browser_.Block().Contains(place);
    if (!isLeft && inBlock)
        return; // its menu is the block's
    pressedInBlock_.reset();
    pressedSelected_ = isLeft && event->modifiers() == Qt::NoModifier && !browser_.HasBlock() &&
                       *cell == QPoint(browser_.SelectedColumn(), browser_.SelectedRow());
    if (isLeft && event->modifiers() == Qt::ShiftModifier)
        Q_EMIT cellReached(cell->y(), cell->x());
    else if (inBlock)
        pressedInBlock_ = cell;
    else
        Q_EMIT cellPressed(cell->y(), cell->x());
    if (!isLeft)
        return;
    pressedAt_ = at;
    // A finger's drag scrolls; only a mouse selects with it.
    dragging_ = event->source() == Qt::MouseEventNotSynthesized;
    if (browser_.Settings().holdTimeMs > 0)
        hold_.start(browser_.Settings().holdTimeMs, this);
}

void RecordGrid::mouseMoveEvent(QMouseEvent* event)
{
    const QPoint at = event->position().toPoint();
    if (hold_.isActive()) {
        if ((at - pressedAt_).manhattanLength() < QApplication::startDragDistance())
            return;
        hold_.stop();
    }
    if (!dragging_ || !(event->buttons() & Qt::LeftButton))
        return;
    pressedSelected_ = false;
    EndBlockPressed();
    DragTo(at);
}

void RecordGrid::EndBlockPressed()
{
    if (!pressedInBlock_)
        return;
    const QPoint cell = *std::exchange(pressedInBlock_, std::nullopt);
    Q_EMIT cellPressed(cell.y(), cell.x());
}

void RecordGrid::DragTo(const QPoint& position)
{
    constexpr int kDragOnMs = 60;
    dragAt_ = position;
    const QRect cells(0, 0, viewport()->width(), browser_.RowsPerPage() * rowHeightPx_);
    if (!cells.contains(position) && !dragOn_.isActive())
        dragOn_.start(kDragOnMs, this);
    const QPoint inside(std::clamp(position.x(), 0, viewport()->width() - 1),
                        std::clamp(position.y(), 0, cells.bottom()));
    if (const std::optional<QPoint> cell = CellAt(inside))
        Q_EMIT cellReached(cell->y(), cell->x());
}

// Beyond an edge the selection goes on growing, and the page follows it.
void RecordGrid::DragOnward()
{
    const int bottom = browser_.RowsPerPage() * rowHeightPx_;
    if (dragAt_.y() < 0)
        Q_EMIT commandRequested(TableCommand::ExtendUp);
    else if (dragAt_.y() >= bottom)
        Q_EMIT commandRequested(TableCommand::ExtendDown);
    if (dragAt_.x() < 0)
        Q_EMIT commandRequested(TableCommand::ExtendLeft);
    else if (dragAt_.x() >= viewport()->width())
        Q_EMIT commandRequested(TableCommand::ExtendRight);
    if (QRect(0, 0, viewport()->width(), bottom).contains(dragAt_))
        dragOn_.stop();
}

void RecordGrid::mouseReleaseEvent(QMouseEvent*)
{
    hold_.stop();
    dragOn_.stop();
    dragging_ = false;
    EndBlockPressed();
    if (std::exchange(pressedSelected_, false))
        Q_EMIT selectedCellTapped();
}

void RecordGrid::mouseDoubleClickEvent(QMouseEvent* event)
{
    hold_.stop();
    const QPoint at = event->position().toPoint();
    if (event->button() == Qt::LeftButton && PressCell(at))
        Q_EMIT cellDoubleTapped();
}

void RecordGrid::contextMenuEvent(QContextMenuEvent* event)
{
    Q_EMIT popupRequested(event->reason() == QContextMenuEvent::Keyboard ? PopupPlace() : event->globalPos());
}

// Of the menu that a key opens.
QPoint RecordGrid::PopupPlace() const
{
    const int row = std::max(browser_.SelectedRow(), 0);
    const QRect cell = browser_.SelectedColumn() < 0 ? QRect() : CellRect(row, browser_.SelectedColumn());
    return viewport()->mapToGlobal(cell.intersected(viewport()->rect()).bottomLeft());
}

bool RecordGrid::ShowToolTip(const QPoint& position, const QPoint& globalPosition)
{
    const std::optional<QPoint> cell = CellAt(position);
    if (cell) {
        const QString text = ShownText(cell->y(), cell->x());
        const QRect place = CellRect(cell->y(), cell->x());
        if (text_->WidthOf(text) > place.width() - 2 * marginPx_ - 1) {
            QToolTip::showText(globalPosition, text.toHtmlEscaped(), viewport(), place);
            return true;
        }
    }
    QToolTip::hideText();
    return true;
}

void RecordGrid::timerEvent(QTimerEvent* event)
{
    if (event->timerId() == dragOn_.timerId()) {
        DragOnward();
    } else if (event->timerId() == hold_.timerId()) {
        hold_.stop();
        dragging_ = false;
        pressedSelected_ = false;
        pressedInBlock_.reset();
        Q_EMIT popupRequested(viewport()->mapToGlobal(pressedAt_));
    } else {
        QAbstractScrollArea::timerEvent(event);
    }
}

void RecordGrid::scrollContentsBy(int dx, int)
{
    if (syncing_)
        return;
    if (dx != 0) {
        header_->SetOffset(horizontalScrollBar()->value());
        viewport()->update();
    }
    const qint64 position = ScrollScale(browser_.HighestScrollPosition()).PositionOf(verticalScrollBar()->value());
    if (position != browser_.ScrollPosition())
        Q_EMIT scrollRequested(position);
}

// A finger moves the rows with it: its pixels are rows of the result, not steps of the bar.
bool RecordGrid::viewportEvent(QEvent* event)
{
    if (event->type() == QEvent::ScrollPrepare) {
        auto* prepare = static_cast<QScrollPrepareEvent*>(event);
        prepare->setViewportSize(viewport()->size());
        prepare->setContentPosRange(QRectF(0, 0, horizontalScrollBar()->maximum(),
                                           double(browser_.HighestScrollPosition()) * rowHeightPx_));
        prepare->setContentPos(
            QPointF(horizontalScrollBar()->value(), double(browser_.ScrollPosition()) * rowHeightPx_));
        prepare->accept();
        return true;
    }
    if (event->type() == QEvent::Scroll) {
        hold_.stop();
        dragging_ = false;
        pressedSelected_ = false;
        const auto* scroll = static_cast<QScrollEvent*>(event);
        horizontalScrollBar()->setValue(int(scroll->contentPos().x()));
        Q_EMIT scrollRequested(qint64(scroll->contentPos().y() / rowHeightPx_));
        return true;
    }
    if (event->type() == QEvent::ToolTip) {
        const auto* help = static_cast<QHelpEvent*>(event);
        return ShowToolTip(help->pos(), help->globalPos());
    }
    return QAbstractScrollArea::viewportEvent(event);
}

} // namespace mirel
