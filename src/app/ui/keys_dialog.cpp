#include "app/ui/keys_dialog.h"

#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QAction>
#include <QDialog>
#include <QDialogButtonBox>
#include <QHeaderView>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace mirel {

void ShowKeys(QWidget& window)
{
    QDialog dialog(&window);
    dialog.setWindowTitle(StringText(Str::KeysTitle));
    auto* keys = new QTreeWidget(&dialog);
    keys->setColumnCount(2);
    keys->setHeaderHidden(true);
    keys->setRootIsDecorated(false);
    keys->setAlternatingRowColors(true);
    keys->setAccessibleName(StringText(Str::KeysTitle));
    for (const QAction* action : window.findChildren<QAction*>()) {
        if (action->shortcut().isEmpty())
            continue;
        auto* row = new QTreeWidgetItem(
            keys, {action->shortcut().toString(QKeySequence::NativeText), action->text().remove(u'&')});
        row->setToolTip(1, action->statusTip());
    }
    keys->resizeColumnToContents(0);
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Close, &dialog);
    QObject::connect(buttons, &QDialogButtonBox::rejected, &dialog, &QDialog::reject);
    auto* lines = new QVBoxLayout(&dialog);
    lines->addWidget(keys);
    lines->addWidget(buttons);
    dialog.resize(IsHandheldSize(window.size()) ? window.size() : keys->sizeHint() * 3 / 2);
    dialog.exec();
}

} // namespace mirel
