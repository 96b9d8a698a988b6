#pragma once

#include "platform/hr.h"

#include <functional>

namespace mirel {

// What a read that was stopped ends with. Who stopped it knows: nobody has to be told.
inline constexpr Hr kStopped{0x80040E4E};

// Whether the user wants a long read to end: asked every few milliseconds while a single statement runs, such as
// the count of a view that has no end. True ends that statement, and its call ends with kStopped. Never asked
// while records are being written: bulk runs have their progress for that, and keep what is done. One for the
// process, as there is one thread; it must not use a connection. Empty, as at the start: nobody is asked.
void SetStopCheck(std::function<bool()> check);

// Asks it.
bool IsStopWanted();

} // namespace mirel
