#pragma once

#include "app/display_choice.h"
#include "forms/ui/property_editors.h"
#include "platform/ui/view_look.h"

namespace mirel {

// How a view is to be drawn with what the user chose for it.
ViewLook LookOf(const DisplayChoice& choice);

// Lets the user choose one item of a view's look over `view`, and keeps it. False: nothing was changed.
bool ChooseLook(DisplayChoice& choice, LookItem item, QWidget& view);

// Fonts and colors of a form, chosen in the same dialogs.
MakerDialogs MakerDialogsOf();

} // namespace mirel
