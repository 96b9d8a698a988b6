#pragma once

class QWidget;

namespace mirel {

// Puts a page that stands in a dialog into a frame that scrolls it up and down where the screen is too small for
// it, never sideways: captions of check boxes and radio buttons wrap. Takes the page over.
QWidget* Scrolled(QWidget* page);

} // namespace mirel
