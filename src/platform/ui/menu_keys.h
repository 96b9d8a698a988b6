#pragma once

class QMenu;
class QWidget;

namespace mirel {

// On a handheld a menu with its column of keys is wider than the screen: while `window` is that small, the menu
// shows its entries without. `window` must outlive the menu.
void LeaveOutKeysWhenSmall(QMenu& menu, const QWidget& window);

} // namespace mirel
