#pragma once

class QWidget;

namespace mirel {

// Lists the keys of a window: those of its actions, and those of its actions' menus.
void ShowKeys(QWidget& window);

} // namespace mirel
