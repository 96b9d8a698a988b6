#include "forms/ui/control_look.h"

#include <QApplication>
#include <QFontMetricsF>
#include <QWidget>

#include <algorithm>
#include <cmath>

namespace mirel {
namespace {

constexpr qreal kLeastPoints = 5.5;
constexpr int kMostPoints = 400;
constexpr double kPixelsPerPoint = 96.0 / 72.0; // of the form's pixels
constexpr int kUsualPoints = 9;
constexpr double kReadableContrast = 2.5;

double Linear(double channel)
{
    return channel <= 0.03928 ? channel / 12.92 : std::pow((channel + 0.055) / 1.055, 2.4);
}

double Luminance(const QColor& color)
{
    return 0.2126 * Linear(color.redF()) + 0.7152 * Linear(color.greenF()) + 0.0722 * Linear(color.blueF());
}

double Contrast(const QColor& one, const QColor& other)
{
    const double a = Luminance(one) + 0.05;
    const double b = Luminance(other) + 0.05;
    return std::max(a, b) / std::min(a, b);
}

QColor ReadableOn(const QColor& background, const QColor& wanted)
{
    if (Contrast(background, wanted) >= kReadableContrast)
        return wanted;
    return Luminance(background) > 0.18 ? QColor(Qt::black) : QColor(Qt::white);
}

} // namespace

QFont FontOf(const TextStyle& style, qreal scale, int roomPx)
{
    QFont font = QApplication::font();
    if (!style.faceName.IsEmpty())
        font.setFamily(style.faceName.Text());
    const qreal points = style.pointSize > 0 ? std::min(style.pointSize, kMostPoints) : font.pointSizeF();
    font.setPointSizeF(std::max(points * scale, kLeastPoints));
    font.setBold(style.bold != 0);
    font.setItalic(style.italic != 0);
    font.setStrikeOut(style.strikeout != 0);
    font.setUnderline(style.underline != 0);
    const qreal height = roomPx > 0 ? QFontMetricsF(font).height() : 0;
    if (height > roomPx)
        font.setPointSizeF(std::max(font.pointSizeF() * roomPx / height, kLeastPoints));
    return font;
}

void NarrowToFit(QWidget& widget, const QString& text, int roomPx, qreal least)
{
    const int width = widget.fontMetrics().size(Qt::TextShowMnemonic, text).width();
    if (width <= roomPx)
        return;
    QFont font = widget.font();
    font.setPointSizeF(font.pointSizeF() * std::max(qreal(roomPx) / width, least));
    widget.setFont(font);
}

int LineHeightOf(const TextStyle& style)
{
    const int points = style.pointSize > 0 ? std::min(style.pointSize, kMostPoints) : kUsualPoints;
    return qRound(points * kPixelsPerPoint);
}

std::optional<QColor> ColorOf(quint32 stored)
{
    if (stored == kDefaultColor)
        return std::nullopt;
    return QColor(int(stored & 0xFF), int(stored >> 8 & 0xFF), int(stored >> 16 & 0xFF));
}

QPalette PaletteOf(const QPalette& base, quint32 background, quint32 text, QPalette::ColorRole backgroundRole,
                   QPalette::ColorRole textRole)
{
    QPalette palette = base;
    const std::optional<QColor> ground = ColorOf(background);
    const std::optional<QColor> ink = ColorOf(text);
    if (ground)
        palette.setColor(backgroundRole, *ground);
    if (ground || ink) {
        const QColor under = palette.color(QPalette::Active, backgroundRole);
        const QColor own = palette.color(QPalette::Active, textRole);
        const QColor wanted = ink.value_or(own);
        palette.setColor(textRole, ground && ink ? wanted : ReadableOn(under, wanted));
    }
    return palette;
}

Qt::Alignment AlignmentOf(quint32 windowStyle)
{
    switch (windowStyle & style::kAlignMask) {
    case style::kCentre:
        return Qt::AlignHCenter;
    case style::kRight:
        return Qt::AlignRight;
    default:
        return Qt::AlignLeft;
    }
}

} // namespace mirel
