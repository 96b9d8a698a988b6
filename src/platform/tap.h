#pragma once

namespace mirel {

// How many times the stylus or the mouse touched the same place.
enum class Tap { Single, Double };

} // namespace mirel
