#pragma once

#include "forms/design/form_design.h"
#include "forms/ui/control_painter.h"

#include <QBasicTimer>
#include <QHash>
#include <QPixmap>
#include <QWidget>

#include <optional>

namespace mirel {

// The design surface: draws the form with its grid of dots, its controls and the handles of what is selected, and
// hands stylus, mouse and arrow keys to the design. The form's pixels are drawn larger by the zoom.
//
// The design must outlive the surface.
class DesignSurface : public QWidget {
    Q_OBJECT

public:
    static constexpr char kFieldMime[] = "application/x-mirel-field"; // a field's name, dragged onto the form

    DesignSurface(FormDesign& design, QWidget* parent);

    // Brings what is drawn up to date with the design.
    void ShowState();
    void SetZoom(qreal zoom);
    qreal Zoom() const { return zoom_; }
    QSize FormSize() const; // in the form's pixels; all that a hand can have put there

    // The next tap is the place of a new control; none: taps select.
    void SetPlacing(std::optional<ControlType> type);
    std::optional<ControlType> Placing() const { return placing_; }

    QRect RectOf(int control) const; // on the widget
    QPoint ToForm(QPoint point) const;
    void SetHoldTime(int ms) { holdTimeMs_ = ms; }

Q_SIGNALS:
    void acted();
    void placed(); // the control that was to be placed is there
    void propertiesRequested();
    void popupRequested(const QPoint& globalPosition);
    void fieldDropped(const QString& field, const QPoint& at); // in the form's pixels

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    bool focusNextPrevChild(bool next) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dropEvent(QDropEvent* event) override;
    void changeEvent(QEvent* event) override;
    void timerEvent(QTimerEvent* event) override;

private:
    int HandleSize() const; // in the form's pixels
    QRect OnWidget(const Edges& place) const;
    QRect SelectionRect() const;
    void PaintGrid(QPainter& painter, const QRect& area) const;
    void PaintControl(QPainter& painter, int control, const QRect& place, const QPalette& colors);
    void PaintSelection(QPainter& painter) const;
    void ShowCursor(QPoint at);
    void SelectUnder(QPoint at);
    void Popup(QPoint at, const QPoint& globalPosition);
    void Step(QPoint direction, Qt::KeyboardModifiers modifiers);

    FormDesign& design_;
    ControlPainter painter_;
    QHash<int, QPixmap> pictures_; // of the controls, while some are moved
    qreal zoom_ = 1;
    std::optional<ControlType> placing_;
    quint64 shown_ = 0; // the design's revision
    QRect shownSelection_;
    QPoint pressedAt_; // in the form's pixels
    bool moved_ = false;
    std::optional<QRect> band_; // in the form's pixels
    QBasicTimer hold_;
    int holdTimeMs_ = 0;
};

} // namespace mirel
