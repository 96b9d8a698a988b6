#include "platform/ui/menu_keys.h"

#include "platform/ui/window_place.h"

#include <QHash>
#include <QMenu>

#include <memory>

namespace mirel {
namespace {

constexpr const char* kDone = "leavesOutKeys";

} // namespace

void LeaveOutKeysWhenSmall(QMenu& menu, const QWidget& part)
{
    if (menu.property(kDone).toBool())
        return; // a menu can be filled more than once
    menu.setProperty(kDone, true);
    const auto kept = std::make_shared<QHash<QAction*, QKeySequence>>();
    QObject::connect(&menu, &QMenu::aboutToShow, &menu, [&menu, &part, kept] {
        if (!IsHandheldSize(part.window()->size()))
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
