#pragma once

#include <QRect>
#include <QSize>
#include <QtGlobal>

namespace mirel {

// How the form's pixels become the window's: a form is laid out once and runs on any screen.
//
// The two directions stretch by themselves, because a window is rarely of the form's shape; neither so far that
// the form loses its own. Texts grow with the lesser of them.
struct SurfaceScale {
    qreal x = 1;
    qreal y = 1;

    // Fills the window where the form is smaller. A form that is larger keeps a size that can be read and hit,
    // and is scrolled; what little it exceeds the window's width is squeezed.
    static SurfaceScale ToFit(QSize form, QSize window);

    // Edges are scaled, not sizes: controls that touch in the form touch in the window.
    QRect Of(const QRect& rect) const;
    QSize Of(QSize size) const;
    qreal OfText() const;

    friend bool operator==(const SurfaceScale&, const SurfaceScale&) = default;
};

} // namespace mirel
