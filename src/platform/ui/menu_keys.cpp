#include "platform/ui/menu_keys.h"

#include "platform/ui/window_place.h"

#include <QHash>
#include <QMenu>

#include <memory>

namespace mirel {

void LeaveOutKeysWhenSmall(QMenu& menu, const QWidget& window)
{
    const auto kept = std::make_shared<QHash<QAction*, QKeySequence>>();
    QObject::connect(&menu, &QMenu::aboutToShow, &menu, [&menu, &window, kept] {
        if (!IsHandheldSize(window.size()))
            return;
        for (QAction* action : menu.actions()) {
            if (action->shortcut().isEmpty())
                continue;
            kept->insert(action, action->shortcut());
            action->setShortcut({});
        }
    });
    QObject::connect(&menu, &QMenu::aboutToHide, &menu, [kept] {
        for (auto each = kept->cbegin(); each != kept->cend(); ++each)
            each.key()->setShortcut(each.value());
        kept->clear();
    });
}

} // namespace mirel
