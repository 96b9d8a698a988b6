#pragma once

#include <QBasicTimer>
#include <QObject>
#include <QPoint>

#include <functional>

class QMouseEvent;
class QWidget;

namespace mirel {

// Opens a widget's popup menu where the pen, a finger or the left mouse button is held still on it. The widget
// gets the same event as from the right mouse button. Lives as long as the widget.
class HoldPopup : public QObject {
    Q_OBJECT

public:
    // `holdMs` is asked at each press; 0 or less: a hold opens nothing.
    HoldPopup(QWidget* widget, std::function<int()> holdMs);

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void timerEvent(QTimerEvent* event) override;

private:
    void Press(const QMouseEvent& press);

    QWidget* widget_;
    std::function<int()> holdMs_;
    QBasicTimer timer_;
    QPoint at_;
};

} // namespace mirel
