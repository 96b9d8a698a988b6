#pragma once

#include "forms/ui/control_widget.h"

namespace mirel {

// An edit box of any kind: of one line or of several, with a calendar's strip, with the strip of the longer text,
// or with none.
std::unique_ptr<ControlWidget> MakeEditBox(const ControlRun& control, QWidget& surface);

} // namespace mirel
