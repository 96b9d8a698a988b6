#include "forms/design/hit_zone.h"

#include <algorithm>
#include <limits>

namespace mirel {
namespace {

constexpr qint64 kLeastSide = 3;

bool Fits(qint64 number)
{
    return number >= std::numeric_limits<qint32>::min() && number <= std::numeric_limits<qint32>::max();
}

// Which edges a zone moves.
struct ZoneEdges {
    bool left, top, right, bottom;
};
constexpr std::array kZoneEdges = {
    ZoneEdges{false, false, false, false}, // None
    ZoneEdges{true, true, true, true},     // Move
    ZoneEdges{true, false, false, false},  ZoneEdges{false, false, true, false},
    ZoneEdges{false, true, false, false},  ZoneEdges{false, false, false, true},
    ZoneEdges{true, true, false, false},   ZoneEdges{false, true, true, false},
    ZoneEdges{true, false, false, true},   ZoneEdges{false, false, true, true},
};

} // namespace

Edges Edges::Of(const ControlDef& control)
{
    return {control.left, control.top, qint64(control.left) + control.width, qint64(control.top) + control.height};
}

bool Edges::PutInto(ControlDef& control) const
{
    if (!Fits(left) || !Fits(top) || !Fits(Width()) || !Fits(Height()))
        return false;
    control.left = qint32(left);
    control.top = qint32(top);
    control.width = qint32(Width());
    control.height = qint32(Height());
    return true;
}

bool Edges::Contains(QPoint point) const
{
    return point.x() >= left && point.x() < right && point.y() >= top && point.y() < bottom;
}

bool Edges::Meets(const QRect& area) const
{
    return left < qint64(area.x()) + area.width() && right > area.x() && top < qint64(area.y()) + area.height() &&
           bottom > area.y();
}

std::array<Handle, 8> HandlesOf(const Edges& control, int handleSize)
{
    const qint64 w = std::clamp<qint64>(control.Width() / 4, 1, handleSize);
    const qint64 h = std::clamp<qint64>(control.Height() / 4, 1, handleSize);
    const qint64 midX = control.left + (control.Width() - w) / 2;
    const qint64 midY = control.top + (control.Height() - h) / 2;
    const qint64 right = control.right - w;
    const qint64 bottom = control.bottom - h;
    const auto at = [w, h](HitZone zone, qint64 x, qint64 y) { return Handle{zone, {x, y, x + w, y + h}}; };
    return {at(HitZone::TopLeft, control.left, control.top),
            at(HitZone::Top, midX, control.top),
            at(HitZone::TopRight, right, control.top),
            at(HitZone::Left, control.left, midY),
            at(HitZone::Right, right, midY),
            at(HitZone::BottomLeft, control.left, bottom),
            at(HitZone::Bottom, midX, bottom),
            at(HitZone::BottomRight, right, bottom)};
}

HitZone ZoneAt(const Edges& control, int handleSize, QPoint point)
{
    if (!control.Contains(point))
        return HitZone::None;
    for (const Handle& handle : HandlesOf(control, handleSize)) {
        if (handle.place.Contains(point))
            return handle.zone;
    }
    return HitZone::Move;
}

Edges Dragged(const Edges& control, HitZone zone, int dx, int dy)
{
    const ZoneEdges moved = kZoneEdges[size_t(zone)];
    Edges after = control;
    after.left += moved.left ? dx : 0;
    after.right += moved.right ? dx : 0;
    after.top += moved.top ? dy : 0;
    after.bottom += moved.bottom ? dy : 0;
    return after.Width() >= kLeastSide && after.Height() >= kLeastSide ? after : control;
}

} // namespace mirel
