#include "platform/ui/wrapped_text.h"

#include <QAbstractButton>
#include <QCheckBox>
#include <QRadioButton>
#include <QStringList>
#include <QStyle>
#include <QTextLayout>

#include <algorithm>

namespace mirel {
namespace {

constexpr char kWhole[] = "wholeCaption";

QString WrappedLine(const QString& line, const QFont& font, int widthPx)
{
    QTextLayout layout(line, font);
    QTextOption option;
    option.setWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
    layout.setTextOption(option);
    QStringList lines;
    layout.beginLayout();
    for (QTextLine part = layout.createLine(); part.isValid(); part = layout.createLine()) {
        part.setLineWidth(widthPx);
        lines += line.mid(part.textStart(), part.textLength()).trimmed();
    }
    layout.endLayout();
    return lines.join(u'\n');
}

void WrapCaption(QAbstractButton& button, int widthPx)
{
    if (!button.property(kWhole).isValid())
        button.setProperty(kWhole, button.text());
    QStyle* style = button.style();
    const int mark = style->pixelMetric(QStyle::PM_IndicatorWidth, nullptr, &button) +
                     style->pixelMetric(QStyle::PM_CheckBoxLabelSpacing, nullptr, &button);
    button.setText(WrappedText(button.property(kWhole).toString(), button.font(), std::max(widthPx - mark, 1)));
}

} // namespace

QString WrappedText(const QString& text, const QFont& font, int widthPx)
{
    QStringList lines;
    for (const QString& line : text.split(u'\n'))
        lines += WrappedLine(line, font, widthPx);
    return lines.join(u'\n');
}

void WrapCaptions(QWidget& page, int widthPx)
{
    for (QAbstractButton* button : page.findChildren<QAbstractButton*>()) {
        if (qobject_cast<QCheckBox*>(button) || qobject_cast<QRadioButton*>(button))
            WrapCaption(*button, widthPx);
    }
}

} // namespace mirel
