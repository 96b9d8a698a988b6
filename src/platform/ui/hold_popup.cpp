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
    const auto* mouse = static_cast<const QMouseEvent*>(event);
    switch (event->type()) {
    case QEvent::MouseButtonPress:
        at_ = mouse->position().toPoint();
        if (mouse->button() == Qt::LeftButton && holdMs_() > 0)
            timer_.start(holdMs_(), this);
        break;
    case QEvent::MouseMove:
        if ((mouse->position().toPoint() - at_).manhattanLength() >= QApplication::startDragDistance())
            timer_.stop();
        break;
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

void HoldPopup::timerEvent(QTimerEvent*)
{
    timer_.stop();
    QContextMenuEvent popup(QContextMenuEvent::Mouse, at_, widget_->mapToGlobal(at_));
    QApplication::sendEvent(widget_, &popup);
}

} // namespace mirel
