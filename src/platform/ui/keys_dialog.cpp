#include "platform/ui/keys_dialog.h"

#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QDialog>
#include <QDialogButtonBox>
#include <QHeaderView>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace mirel {

void ShowKeyHints(QWidget& window, const QList<KeyHint>& rows)
{
    QDialog dialog(&window);
    dialog.setWindowTitle(StringText(Str::KeysTitle));
    auto* keys = new QTreeWidget(&dialog);
    keys->setColumnCount(2);
    keys->setHeaderHidden(true);
    keys->setRootIsDecorated(false);
    keys->setAlternatingRowColors(true);
    keys->setWordWrap(true);
    keys->setTextElideMode(Qt::ElideRight);
    keys->setAccessibleName(dialog.windowTitle());
    for (const KeyHint& row : rows) {
        QString what = row.what;
        auto* item = new QTreeWidgetItem(keys, {row.keys, what.remove(u'&').remove(QStringLiteral(" ..."))});
        item->setToolTip(0, row.keys);
        item->setToolTip(1, what);
    }
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Close, &dialog);
    QObject::connect(buttons, &QDialogButtonBox::rejected, &dialog, &QDialog::reject);
    auto* lines = new QVBoxLayout(&dialog);
    lines->addWidget(keys);
    lines->addWidget(buttons);
    const int line = dialog.fontMetrics().height();
    dialog.resize(line * 34, line * 28);
    FillSmallWindow(dialog, window);
    keys->header()->resizeSection(0, dialog.width() * 2 / 5);
    dialog.exec();
}

} // namespace mirel
