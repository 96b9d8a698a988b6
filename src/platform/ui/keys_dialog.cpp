#include "platform/ui/keys_dialog.h"

#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QDialog>
#include <QDialogButtonBox>
#include <QTextBrowser>
#include <QVBoxLayout>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

QString TableOf(const QList<KeyHint>& rows)
{
    QString html = u"<table width=\"100%\" cellpadding=\"3\">"_s;
    for (const KeyHint& row : rows) {
        QString what = row.what;
        what.remove(u'&').remove(u" ..."_s);
        QString keys = row.keys.toHtmlEscaped();
        keys.replace(u", "_s, u"<br>"_s);
        html +=
            u"<tr><td style=\"white-space:pre\"><b>%1</b></td><td>%2</td></tr>"_s.arg(keys, what.toHtmlEscaped());
    }
    return html + u"</table>"_s;
}

} // namespace

void ShowKeyHints(QWidget& window, const QList<KeyHint>& rows)
{
    QDialog dialog(&window);
    dialog.setWindowTitle(StringText(Str::KeysTitle));
    auto* keys = new QTextBrowser(&dialog);
    keys->setHtml(TableOf(rows));
    keys->setAccessibleName(dialog.windowTitle());
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Close, &dialog);
    QObject::connect(buttons, &QDialogButtonBox::rejected, &dialog, &QDialog::reject);
    auto* lines = new QVBoxLayout(&dialog);
    lines->addWidget(keys);
    lines->addWidget(buttons);
    const int line = dialog.fontMetrics().height();
    dialog.resize(line * 34, line * 30);
    FillSmallWindow(dialog, window);
    dialog.exec();
}

} // namespace mirel
