#pragma once

#include <QSize>

#include <array>

namespace mirel {

// The sizes at which windows are looked at, in logical pixels.
inline constexpr QSize kHandheld(240, 320);
inline constexpr QSize kFlat(320, 240); // the same, turned
inline constexpr QSize kDesktop(1100, 700);
inline constexpr std::array kWindowSizes = {kHandheld, kFlat, kDesktop};

} // namespace mirel
