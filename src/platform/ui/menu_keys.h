#pragma once

class QMenu;
class QWidget;

namespace mirel {

// On a handheld a menu with its column of keys is wider than the screen: while the window of
// `part` is that small, the menu shows its entries without. `part` must outlive the menu.
void LeaveOutKeysWhenSmall(QMenu& menu, const QWidget& part);

} // namespace mirel
