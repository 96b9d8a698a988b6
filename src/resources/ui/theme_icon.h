#pragma once

#include <QIcon>

namespace mirel {

// The icon of that standard name ("document-open", "go-first") from the desktop's icon theme; where the theme
// has none, our own drawing of that name in the colour of the palette's text, light on dark and dark on light,
// dimmed when disabled. Names that begin with "mirel-" are always our own. An unknown name gives a null icon.
QIcon ThemeIcon(QStringView name);

// From here on only our own drawings are given: for a palette that is not the desktop's, which the desktop's
// icons may not suit.
void UseOwnIconsOnly();

} // namespace mirel
