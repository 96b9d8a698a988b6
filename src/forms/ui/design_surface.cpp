#include "forms/ui/design_surface.h"

#include "forms/ui/control_look.h"
#include "platform/ui/look_roles.h"
#include "resources/string_table.h"

#include <QApplication>
#include <QContextMenuEvent>
#include <QDragEnterEvent>
#include <QMimeData>
#include <QMouseEvent>
#include <QPainter>
#include <QPixmap>

#include <algorithm>
#include <array>
#include <cmath>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qint64 kLargestPicturePx = 200'000; // of a control that is kept
constexpr int kHandlePx = 7;                  // as drawn
constexpr int kHoldPx = 10;                   // as it is hit
constexpr int kDotsApart = 10;                // in the form's pixels
constexpr int kFarthest = 8000;
constexpr int kAroundPx = 8; // what handles and edges reach beyond a control

struct ZoneCursor {
    HitZone zone;
    Qt::CursorShape shape;
};
constexpr std::array kCursors = {
    ZoneCursor{HitZone::Move, Qt::SizeAllCursor},          ZoneCursor{HitZone::Left, Qt::SizeHorCursor},
    ZoneCursor{HitZone::Right, Qt::SizeHorCursor},         ZoneCursor{HitZone::Top, Qt::SizeVerCursor},
    ZoneCursor{HitZone::Bottom, Qt::SizeVerCursor},        ZoneCursor{HitZone::TopLeft, Qt::SizeFDiagCursor},
    ZoneCursor{HitZone::BottomRight, Qt::SizeFDiagCursor}, ZoneCursor{HitZone::TopRight, Qt::SizeBDiagCursor},
    ZoneCursor{HitZone::BottomLeft, Qt::SizeBDiagCursor},
};

} // namespace

DesignSurface::DesignSurface(FormDesign& design, QWidget* parent)
    : QWidget(parent)
    , design_(design)
{
    setFocusPolicy(Qt::StrongFocus);
    setMouseTracking(true);
    setAcceptDrops(true);
    setAccessibleName(StringText(Str::MakerSurfaceName));
    setObjectName(u"designSurface"_s);
    ShowState();
}

QSize DesignSurface::FormSize() const
{
    const FormDef& form = design_.Form();
    qint64 width = std::max(form.width, 20);
    qint64 height = std::max(form.height, 20);
    for (const ControlDef& control : form.controls) {
        const Edges place = Edges::Of(control);
        if (place.right < kFarthest)
            width = std::max(width, place.right);
        if (place.bottom < kFarthest)
            height = std::max(height, place.bottom);
    }
    return QSize(int(std::min<qint64>(width, kFarthest)), int(std::min<qint64>(height, kFarthest)));
}

void DesignSurface::ShowState()
{
    const QSize size = (QSizeF(FormSize()) * zoom_).toSize();
    if (size != this->size()) {
        setFixedSize(size);
        update();
    }
    // A step of a drag changes what it drags alone.
    if (design_.IsDragging()) {
        const QRect now = SelectionRect();
        update(now.united(shownSelection_));
        shownSelection_ = now;
    } else if (shown_ != design_.Revision()) {
        update();
        shownSelection_ = SelectionRect();
    }
    shown_ = design_.Revision();
}

void DesignSurface::SetZoom(qreal zoom)
{
    zoom_ = zoom;
    pictures_.clear();
    ShowState();
    update();
}

void DesignSurface::SetPlacing(std::optional<ControlType> type)
{
    placing_ = type;
    setCursor(type ? Qt::CrossCursor : Qt::ArrowCursor);
}

QPoint DesignSurface::ToForm(QPoint point) const
{
    return {int(std::floor(point.x() / zoom_)), int(std::floor(point.y() / zoom_))};
}

QRect DesignSurface::OnWidget(const Edges& place) const
{
    const auto scaled = [this](qint64 number) {
        return qRound(qreal(std::clamp<qint64>(number, -kFarthest, 2 * kFarthest)) * zoom_);
    };
    const QPoint from(scaled(place.left), scaled(place.top));
    return {from, QSize(scaled(place.right) - from.x(), scaled(place.bottom) - from.y())};
}

QRect DesignSurface::RectOf(int control) const
{
    return OnWidget(Edges::Of(design_.Control(control)));
}

QRect DesignSurface::SelectionRect() const
{
    QRect all;
    for (const int control : design_.Selection())
        all = all.united(RectOf(control));
    return all.isNull() ? all : all.adjusted(-kAroundPx, -kAroundPx, kAroundPx, kAroundPx);
}

int DesignSurface::HandleSize() const
{
    return std::max(int(std::ceil(kHoldPx / zoom_)), 1);
}

// --- painting -----------------------------------------------------------------------------------------------

void DesignSurface::PaintGrid(QPainter& painter, const QRect& area) const
{
    const qreal apart = kDotsApart * zoom_;
    const QColor dots = ColorOfRole(LookRole::Edge, palette());
    painter.setPen(Blend(dots, palette().color(QPalette::Window), 0.45F));
    QList<QPoint> points;
    for (qreal y = std::floor(area.top() / apart) * apart; y <= area.bottom(); y += apart) {
        for (qreal x = std::floor(area.left() / apart) * apart; x <= area.right(); x += apart)
            points += QPoint(qRound(x), qRound(y));
    }
    painter.drawPoints(points.constData(), int(points.size()));
}

// While controls are moved all of them look the same from one move to the next: they are drawn once and then
// copied.
void DesignSurface::PaintControl(QPainter& painter, int control, const QRect& place, const QPalette& colors)
{
    const ControlDef& def = design_.Control(control);
    if (!design_.IsMoving() || qint64(place.width()) * place.height() > kLargestPicturePx)
        return painter_.Paint(painter, def, place, zoom_, colors);
    QPixmap& picture = pictures_[control];
    if (picture.deviceIndependentSize().toSize() != place.size()) {
        const qreal ratio = devicePixelRatioF();
        picture = QPixmap(place.size() * ratio);
        picture.setDevicePixelRatio(ratio);
        picture.fill(Qt::transparent);
        QPainter own(&picture);
        own.setRenderHint(QPainter::Antialiasing);
        painter_.Paint(own, def, QRect(QPoint(), place.size()), zoom_, colors);
    }
    painter.drawPixmap(place.topLeft(), picture);
}

void DesignSurface::PaintSelection(QPainter& painter) const
{
    const QColor accent = ColorOfRole(LookRole::Accent, palette());
    const int only = design_.TheSelected();
    const int half = kHandlePx / 2;
    QList<QRect> frames;
    QList<QRect> handles;
    QList<QRect> filled; // of the first of several: what the others are aligned to
    for (const int control : design_.Selection()) {
        const QRect place = RectOf(control);
        frames += place.adjusted(-1, -1, 0, 0); // two thin ones: a thick pen takes ten times as long
        frames += place.adjusted(0, 0, -1, -1);
        const bool isReference = only < 0 && control == design_.Selection().front();
        for (const int x : {place.left(), place.center().x(), place.right()}) {
            for (const int y : {place.top(), place.center().y(), place.bottom()}) {
                const bool corner = x != place.center().x() && y != place.center().y();
                if ((x != place.center().x() || y != place.center().y()) && (only >= 0 || corner))
                    (isReference ? filled : handles) += QRect(x - half, y - half, kHandlePx - 1, kHandlePx - 1);
            }
        }
    }
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(accent, 1));
    painter.drawRects(frames);
    painter.setBrush(palette().color(QPalette::Base));
    painter.drawRects(handles);
    painter.setBrush(accent);
    painter.drawRects(filled);
}

void DesignSurface::paintEvent(QPaintEvent* event)
{
    QPainter painter(this);
    const FormDef& form = design_.Form();
    const QPalette colors =
        PaletteOf(palette(), form.backgroundColor, kDefaultColor, QPalette::Window, QPalette::WindowText);
    painter.fillRect(event->rect(), colors.color(QPalette::Window));
    PaintGrid(painter, event->rect());
    painter.setRenderHint(QPainter::Antialiasing);
    for (int control = 0; control < design_.Count(); ++control) {
        const QRect place = RectOf(control);
        if (place.isValid() && place.intersects(event->rect()))
            PaintControl(painter, control, place, colors);
    }
    if (!design_.IsMoving())
        pictures_.clear();
    painter.setRenderHint(QPainter::Antialiasing, false);
    PaintSelection(painter);
    painter.setBrush(Qt::NoBrush);
    if (band_) {
        painter.setPen(QPen(ColorOfRole(LookRole::Accent, palette()), 1, Qt::DashLine));
        painter.drawRect(OnWidget(
            {band_->left(), band_->top(), band_->left() + band_->width(), band_->top() + band_->height()}));
    }
    painter.setPen(ColorOfRole(LookRole::Edge, palette()));
    painter.drawRect(rect().adjusted(0, 0, -1, -1));
    if (design_.Count() == 0) {
        painter.setPen(ColorOfRole(LookRole::Dim, palette()));
        painter.drawText(rect().adjusted(8, 8, -8, -8), Qt::AlignCenter | Qt::TextWordWrap,
                         StringText(Str::MakerEmptyHint));
    }
}

void DesignSurface::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::FontChange || event->type() == QEvent::PaletteChange) {
        painter_.Forget();
        pictures_.clear();
        update();
    }
}

// --- stylus and mouse ---------------------------------------------------------------------------------------

void DesignSurface::mousePressEvent(QMouseEvent* event)
{
    const QPoint at = ToForm(event->position().toPoint());
    if (event->button() != Qt::LeftButton)
        return QWidget::mousePressEvent(event);
    pressedAt_ = at;
    moved_ = false;
    if (placing_) {
        design_.AddControl(*placing_, at);
        SetPlacing({});
        Q_EMIT placed();
        Q_EMIT acted();
        return;
    }
    if (holdTimeMs_ > 0)
        hold_.start(holdTimeMs_, this);
    if (event->modifiers() & (Qt::ShiftModifier | Qt::ControlModifier)) {
        if (const int control = design_.ControlAt(at); control >= 0)
            design_.Toggle(control);
        Q_EMIT acted();
        return;
    }
    const HitZone zone = design_.ZoneAt(at, HandleSize());
    if (zone != HitZone::None) {
        design_.BeginDrag(zone, at);
    } else if (const int control = design_.ControlAt(at); control >= 0) {
        design_.SelectOnly(control);
        design_.BeginDrag(HitZone::Move, at);
    } else {
        design_.SelectNone();
        band_ = QRect(at, QSize(0, 0));
    }
    Q_EMIT acted();
}

void DesignSurface::mouseMoveEvent(QMouseEvent* event)
{
    const QPoint at = ToForm(event->position().toPoint());
    if (!(event->buttons() & Qt::LeftButton))
        return ShowCursor(at);
    if (!moved_ && ((at - pressedAt_) * zoom_).manhattanLength() < QApplication::startDragDistance())
        return;
    moved_ = true;
    hold_.stop();
    if (design_.IsDragging()) {
        design_.DragTo(at);
        Q_EMIT acted();
    } else if (band_) {
        const auto outline = [this] {
            return OnWidget({band_->left(), band_->top(), band_->left() + band_->width(),
                             band_->top() + band_->height()})
                .adjusted(-2, -2, 2, 2);
        };
        update(outline());
        band_ = QRect(QPoint(std::min(at.x(), pressedAt_.x()), std::min(at.y(), pressedAt_.y())),
                      QSize(std::abs(at.x() - pressedAt_.x()), std::abs(at.y() - pressedAt_.y())));
        update(outline());
    }
}

void DesignSurface::mouseReleaseEvent(QMouseEvent* event)
{
    hold_.stop();
    const QPoint at = ToForm(event->position().toPoint());
    if (event->button() != Qt::LeftButton)
        return QWidget::mouseReleaseEvent(event);
    if (design_.IsDragging()) {
        design_.EndDrag();
        if (!moved_)
            SelectUnder(at);
    } else if (band_) {
        const QRect area = *std::exchange(band_, std::nullopt);
        if (moved_)
            design_.SelectWithin(area);
        update();
    }
    Q_EMIT acted();
}

// A tap on what is selected takes what lies on top of it there.
void DesignSurface::SelectUnder(QPoint at)
{
    const int top = design_.ControlAt(at);
    if (top >= 0 && design_.TheSelected() != top)
        design_.SelectOnly(top);
}

void DesignSurface::mouseDoubleClickEvent(QMouseEvent* event)
{
    hold_.stop();
    design_.CancelDrag();
    band_.reset();
    if (event->button() == Qt::LeftButton && !placing_)
        Q_EMIT propertiesRequested();
}

void DesignSurface::ShowCursor(QPoint at)
{
    if (placing_)
        return;
    const HitZone zone = design_.ZoneAt(at, HandleSize());
    const auto row = std::ranges::find(kCursors, zone, &ZoneCursor::zone);
    setCursor(row == kCursors.end() ? Qt::ArrowCursor : row->shape);
}

void DesignSurface::Popup(QPoint at, const QPoint& globalPosition)
{
    const int control = design_.ControlAt(at);
    if (control < 0)
        design_.SelectNone();
    else if (!design_.IsSelected(control))
        design_.SelectOnly(control);
    Q_EMIT acted();
    Q_EMIT popupRequested(globalPosition);
}

void DesignSurface::contextMenuEvent(QContextMenuEvent* event)
{
    if (event->reason() == QContextMenuEvent::Keyboard) {
        const QRect selected = SelectionRect();
        Q_EMIT popupRequested(mapToGlobal(selected.isNull() ? QPoint(8, 8) : selected.center()));
        return;
    }
    Popup(ToForm(event->pos()), event->globalPos());
}

void DesignSurface::timerEvent(QTimerEvent* event)
{
    if (event->timerId() != hold_.timerId())
        return QWidget::timerEvent(event);
    hold_.stop();
    design_.CancelDrag();
    band_.reset();
    const QPoint at = (QPointF(pressedAt_) * zoom_).toPoint();
    Popup(pressedAt_, mapToGlobal(at));
}

// --- keys ---------------------------------------------------------------------------------------------------

void DesignSurface::Step(QPoint direction, Qt::KeyboardModifiers modifiers)
{
    const int far = modifiers & Qt::ControlModifier ? kDotsApart : 1;
    const QPoint by = direction * far;
    if (modifiers & Qt::ShiftModifier)
        design_.ResizeBy(by.x(), by.y());
    else
        design_.MoveBy(by.x(), by.y());
    Q_EMIT acted();
}

void DesignSurface::keyPressEvent(QKeyEvent* event)
{
    struct Arrow {
        int key;
        QPoint by;
    };
    static const std::array kArrows = {Arrow{Qt::Key_Left, {-1, 0}}, Arrow{Qt::Key_Right, {1, 0}},
                                       Arrow{Qt::Key_Up, {0, -1}}, Arrow{Qt::Key_Down, {0, 1}}};
    const auto arrow = std::ranges::find(kArrows, event->key(), &Arrow::key);
    if (arrow != kArrows.end())
        return Step(arrow->by, event->modifiers());
    switch (event->key()) {
    case Qt::Key_Escape:
        if (placing_)
            Q_EMIT placed();
        else if (design_.IsDragging())
            design_.CancelDrag();
        else
            design_.SelectNone();
        SetPlacing({});
        Q_EMIT acted();
        return;
    case Qt::Key_Return:
    case Qt::Key_Enter:
        if (placing_) { // the keyboard's place for it is the middle of what is seen
            design_.AddControl(*placing_, ToForm(visibleRegion().boundingRect().center()));
            SetPlacing({});
            Q_EMIT placed();
            Q_EMIT acted();
        } else {
            Q_EMIT propertiesRequested();
        }
        return;
    default:
        QWidget::keyPressEvent(event);
    }
}

// Tab goes through the controls, and on from the last one.
bool DesignSurface::focusNextPrevChild(bool next)
{
    const int last = next ? design_.Count() - 1 : 0;
    const bool atEnd = design_.TheSelected() == last || design_.Count() == 0;
    if (atEnd)
        design_.SelectNone();
    else
        design_.SelectNext(next ? 1 : -1);
    Q_EMIT acted();
    return !atEnd || QWidget::focusNextPrevChild(next);
}

// --- fields from the list -----------------------------------------------------------------------------------

void DesignSurface::dragEnterEvent(QDragEnterEvent* event)
{
    if (event->mimeData()->hasFormat(QLatin1StringView(kFieldMime)))
        event->acceptProposedAction();
}

void DesignSurface::dropEvent(QDropEvent* event)
{
    const QByteArray name = event->mimeData()->data(QLatin1StringView(kFieldMime));
    event->acceptProposedAction();
    Q_EMIT fieldDropped(QString::fromUtf8(name), ToForm(event->position().toPoint()));
}

} // namespace mirel
