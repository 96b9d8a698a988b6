#include "app/ui/keys_dialog.h"

#include "platform/ui/keys_dialog.h"

#include <QAction>
#include <QWidget>

namespace mirel {

void ShowKeys(QWidget& window)
{
    QList<KeyHint> rows;
    for (const QAction* action : window.findChildren<QAction*>()) {
        if (!action->shortcut().isEmpty())
            rows.push_back({action->shortcut().toString(QKeySequence::NativeText), action->text()});
    }
    ShowKeyHints(window, rows);
}

} // namespace mirel
