#include "app/ui/about_box.h"

#include "app/database_session.h"
#include "resources/string_table.h"

#include <QDir>
#include <QIcon>
#include <QMessageBox>

namespace mirel {

void ShowAbout(const DatabaseSession& session, QWidget& parent)
{
    QStringList lines{StringText(Str::AboutWhat)};
    if (session.IsOpen()) {
        const QString stamp = session.Stamp().isEmpty() ? StringText(Str::AboutNoStamp) : session.Stamp();
        lines << QString() << StringText(Str::AboutDatabase, {QDir::toNativeSeparators(session.Location().Text())})
              << StringText(Str::AboutStamp, {stamp});
    }
    QMessageBox box(&parent);
    box.setWindowTitle(StringText(Str::AboutTitle));
    box.setIconPixmap(QIcon(QStringLiteral(":/icons/mirel.svg")).pixmap(48));
    box.setTextFormat(Qt::PlainText);
    box.setText(StringText(Str::AboutVersion, {QStringLiteral(MIREL_VERSION)}));
    box.setInformativeText(lines.join(u'\n'));
    box.setStandardButtons(QMessageBox::Ok);
    box.exec();
}

} // namespace mirel
