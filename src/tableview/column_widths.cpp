#include "tableview/column_widths.h"

#include "tableview/column_layout.h"

#include <QStringList>
#include <QUrl>

namespace mirel {
namespace {

constexpr int kWidestPx = 20'000;

} // namespace

QString ColumnWidthsText(const ColumnWidths& widths)
{
    QStringList parts;
    for (auto at = widths.begin(); at != widths.end(); ++at) {
        parts += QString::fromLatin1(QUrl::toPercentEncoding(at.key())) + u':' + QString::number(at.value());
    }
    return parts.join(u',');
}

ColumnWidths ReadColumnWidths(const QString& text)
{
    ColumnWidths widths;
    for (const QString& part : text.split(u',', Qt::SkipEmptyParts)) {
        const qsizetype colon = part.lastIndexOf(u':');
        bool ok = false;
        const int width = part.mid(colon + 1).toInt(&ok);
        if (colon >= 0 && ok && width >= ColumnLayout::kNarrowestPx && width <= kWidestPx)
            widths.insert(QUrl::fromPercentEncoding(part.left(colon).toUtf8()), width);
    }
    return widths;
}

} // namespace mirel
