#pragma once

#include <QMap>
#include <QString>

namespace mirel {

// The widths that the user gave columns by hand, in pixels by the column's title.
using ColumnWidths = QMap<QString, int>;

// Their form in the profile: "Name:120,Ship%20To:80". Reading leaves out what it does not understand.
QString ColumnWidthsText(const ColumnWidths& widths);
ColumnWidths ReadColumnWidths(const QString& text);

} // namespace mirel
