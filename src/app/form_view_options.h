#pragma once

#include "app/settings.h"
#include "forms/form_view_settings.h"

namespace mirel {

// The form view's section of the configuration, as running forms take it.
FormViewSettings ReadFormViewSettings(const Settings& settings);
void WriteFormViewSettings(Settings& settings, const FormViewSettings& options);

} // namespace mirel
