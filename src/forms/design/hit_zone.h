#pragma once

#include "forms/form_records.h"

#include <QPoint>
#include <QRect>

#include <array>

namespace mirel {

// Where the stylus holds a selected control. The numbers are the zones of the drag rules.
enum class HitZone {
    None = 0,
    Move = 1,
    Left = 2,
    Right = 3,
    Top = 4,
    Bottom = 5,
    TopLeft = 6,
    TopRight = 7,
    BottomLeft = 8,
    BottomRight = 9,
};

// A control's rectangle by its edges, in the form's pixels. Files hold any numbers, so sums are 64 bits wide.
struct Edges {
    qint64 left = 0;
    qint64 top = 0;
    qint64 right = 0; // left + width
    qint64 bottom = 0;

    static Edges Of(const ControlDef& control);
    // False, and the control as it was, when a number does not fit its record.
    bool PutInto(ControlDef& control) const;
    bool Contains(QPoint point) const;
    bool Meets(const QRect& area) const;
    qint64 Width() const { return right - left; }
    qint64 Height() const { return bottom - top; }

    friend bool operator==(const Edges&, const Edges&) = default;
};

struct Handle {
    HitZone zone;
    Edges place;
};

// The eight handles in the order in which they are tested, each within the rectangle. In a small control they
// shrink, so that some of it is left to move it by.
std::array<Handle, 8> HandlesOf(const Edges& control, int handleSize);

// The zone of a point. Outside the rectangle it is None, also where a drawn handle straddles the edge.
HitZone ZoneAt(const Edges& control, int handleSize, QPoint point);

// The rectangle after one step of a drag. A step that would leave it less than 3 by 3 pixels leaves it as it is.
Edges Dragged(const Edges& control, HitZone zone, int dx, int dy);

} // namespace mirel
