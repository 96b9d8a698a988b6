#pragma once

#include "forms/ui/control_widget.h"

namespace mirel {

// An edit box of any kind: of one line or of several, with a calendar's strip, with the strip of the longer text,
// or with none.
std::unique_ptr<ControlWidget> MakeEditBox(const ControlRun& control, QWidget& surface);

// Edited text with the line ends that the text before it had: editors know one kind only, and what the user did
// not change is to stay as it is.
QString WithLineEndsOf(const QString& before, QString edited);

} // namespace mirel
