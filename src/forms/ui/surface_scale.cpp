#include "forms/ui/surface_scale.h"

#include <algorithm>

namespace mirel {
namespace {

// Below these, boxes of one line do not take a text of 9 points any more.
constexpr qreal kLeastX = 0.85;
constexpr qreal kLeastY = 0.93;
constexpr qreal kMost = 2.0;
constexpr qreal kMostStretch = 2.1; // of one direction against the other
constexpr qreal kMostText = 1.4;
constexpr qreal kFarthestPx = 1 << 22; // what a window system's widget may measure, and some to spare

int Pixels(qreal length)
{
    return qRound(std::clamp(length, -kFarthestPx, kFarthestPx));
}

// How much of the window's length the form's can take.
qreal Ratio(int form, int window)
{
    return form > 0 ? qreal(window) / form : 1.0;
}

} // namespace

SurfaceScale SurfaceScale::ToFit(QSize form, QSize window)
{
    const qreal wide = Ratio(form.width(), window.width());
    const qreal high = Ratio(form.height(), window.height());
    // What must be scrolled anyway need not be squeezed.
    qreal x = wide < kLeastX ? 1.0 : std::min(wide, kMost);
    qreal y = high < kLeastY ? std::clamp(x, 1.0, kMostText) : std::min(high, kMost);
    x = std::min(x, y * kMostStretch);
    y = std::min(y, x * kMostStretch);
    return {x, y};
}

QRect SurfaceScale::Of(const QRect& rect) const
{
    const int left = Pixels(rect.x() * x);
    const int top = Pixels(rect.y() * y);
    return {left, top, Pixels((qreal(rect.x()) + rect.width()) * x) - left,
            Pixels((qreal(rect.y()) + rect.height()) * y) - top};
}

QSize SurfaceScale::Of(QSize size) const
{
    return {Pixels(size.width() * x), Pixels(size.height() * y)};
}

qreal SurfaceScale::OfText() const
{
    return std::min({x, y, kMostText});
}

} // namespace mirel
