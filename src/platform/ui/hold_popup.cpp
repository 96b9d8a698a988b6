#include "platform/ui/hold_popup.h"

#include <QApplication>
#include <QContextMenuEvent>
#include <QMouseEvent>
#include <QWidget>

namespace mirel {

HoldPopup::HoldPopup(QWidget* widget, std::function<int()> holdMs)
    : QObject(widget)
    , widget_(widget)
    , holdMs_(std::move(holdMs))
{
    widget->installEventFilter(this);
}

bool HoldPopup::eventFilter(QObject* watched, QEvent* event)
{
    switch (event->type()) {
    case QEvent::MouseButtonPress:
        Press(*static_cast<const QMouseEvent*>(event));
        break;
    case QEvent::MouseMove: {
        const QPoint way = static_cast<const QMouseEvent*>(event)->position().toPoint() - at_;
        if (way.manhattanLength() >= QApplication::startDragDistance())
            timer_.stop();
        break;
    }
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
    case QEvent::Hide:
        timer_.stop();
        break;
    default:
        break;
    }
    return QObject::eventFilter(watched, event);
}

void HoldPopup::Press(const QMouseEvent& press)
{
    at_ = press.position().toPoint();
    if (press.button() == Qt::LeftButton && holdMs_() > 0)
        timer_.start(holdMs_(), this);
}

void HoldPopup::timerEvent(QTimerEvent*)
{
    timer_.stop();
    QContextMenuEvent popup(QContextMenuEvent::Mouse, at_, widget_->mapToGlobal(at_));
    QApplication::sendEvent(widget_, &popup);
}

} // namespace mirel
