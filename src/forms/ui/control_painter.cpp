#include "forms/ui/control_painter.h"

#include "expr/expr_token.h"
#include "forms/control_binding.h"
#include "forms/control_run.h"
#include "forms/control_types.h"
#include "forms/ui/control_look.h"
#include "platform/ui/look_roles.h"

#include <QPainter>
#include <QPainterPath>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kInsetPx = 4;
constexpr int kArrowPx = 14;
constexpr qreal kLeastCaption = 0.85;
constexpr size_t kMostFonts = 32;
constexpr qsizetype kMostTexts = 5000;

QString ShownFieldName(const ControlDef& control)
{
    const ControlBinding binding = BindControl(control);
    const ExprNode* field = ShownField(binding, control.type);
    if (!field)
        return {};
    const QString text = field->text;
    const qsizetype point = text.lastIndexOf(u'.');
    return BareName(text.sliced(point + 1));
}

QString TextToShow(const ControlDef& control)
{
    const QString name = control.name.Text();
    switch (SourceKindOf(control.type)) {
    case SourceKind::Expression:
        if (control.hasSource != 0 || control.fieldBound != 0) {
            const QString field = ShownFieldName(control);
            return !field.isEmpty() ? field : control.hasSource != 0 ? control.source.Text() : name;
        }
        return name;
    case SourceKind::Columns: {
        QStringList columns;
        for (const SourceColumn& column : SplitListColumns(control.source.Text()))
            columns += column.name;
        return columns.isEmpty() ? name : columns.join(u"   |   "_s);
    }
    case SourceKind::Items:
    case SourceKind::Function:
    case SourceKind::None:
        break;
    }
    return name;
}

void DrawArrow(QPainter& painter, const QRect& box, const QColor& color)
{
    const QPointF middle = QRectF(box).center();
    QPainterPath arrow;
    arrow.moveTo(middle + QPointF(-3.5, -1.5));
    arrow.lineTo(middle + QPointF(0, 2));
    arrow.lineTo(middle + QPointF(3.5, -1.5));
    painter.setPen(QPen(color, 1.5));
    painter.setBrush(Qt::NoBrush);
    painter.drawPath(arrow);
}

} // namespace

const QFont& ControlPainter::FontFor(const TextStyle& style, qreal scale, int roomPx)
{
    const auto known = std::ranges::find_if(fonts_, [&](const FontKey& key) {
        return key.roomPx == roomPx && key.scale == scale && key.style == style;
    });
    if (known != fonts_.end())
        return known->font;
    if (fonts_.size() >= kMostFonts)
        fonts_.clear();
    fonts_.push_back({style, roomPx, scale, FontOf(style, scale, roomPx)});
    return fonts_.back().font;
}

const QString& ControlPainter::TextOf(const ControlDef& control)
{
    const QString key =
        u"%1 %2 %3 %4\n%5"_s.arg(QString::number(int(control.type)), QString::number(control.hasSource),
                                 QString::number(control.fieldBound), control.name.Text(), control.source.Text());
    const auto known = texts_.constFind(key);
    if (known != texts_.constEnd())
        return *known;
    if (texts_.size() > kMostTexts)
        texts_.clear();
    return *texts_.insert(key, TextToShow(control));
}

void ControlPainter::Paint(QPainter& painter, const ControlDef& control, const QRect& place, qreal scale,
                           const QPalette& palette)
{
    const ControlType type = control.type;
    const bool isLabel = type == ControlType::Label;
    const bool isButton = Has(type, IsPressed);
    const bool isBox = !isLabel && !isButton && type != ControlType::CheckBox;
    const QPalette::ColorRole groundRole = isButton  ? QPalette::Button
                                           : isLabel ? QPalette::Window
                                                     : QPalette::Base;
    const QPalette::ColorRole inkRole = isButton  ? QPalette::ButtonText
                                        : isLabel ? QPalette::WindowText
                                                  : QPalette::Text;
    const QPalette colors =
        PaletteOf(palette, control.backgroundColor, control.textStyle.color, groundRole, inkRole);
    const QColor edge = ColorOfRole(LookRole::Edge, palette);
    const QRectF outline = QRectF(place).adjusted(0.5, 0.5, -0.5, -0.5);
    const bool known =
        std::ranges::any_of(ControlTypes(), [type](const ControlTypeDef& row) { return row.type == type; });
    const bool framed = (control.windowStyle & style::kBorder) != 0 || isButton || !isLabel;
    const bool filled = isBox || isButton || control.backgroundColor != kDefaultColor;
    painter.setBrush(filled ? QBrush(colors.color(groundRole)) : QBrush(Qt::NoBrush));
    painter.setPen(framed && !(isLabel && (control.windowStyle & style::kBorder) == 0)
                       ? QPen(edge, 1, known ? Qt::SolidLine : Qt::DashLine)
                       : QPen(Qt::NoPen));
    const qreal corner = place.height() > 12 && !isLabel ? 3 : 0;
    painter.drawRoundedRect(outline, corner, corner);
    if (Has(type, IsTicked))
        return;

    QRect text = place.adjusted(isLabel ? 1 : kInsetPx, 0, isLabel ? -1 : -kInsetPx, 0);
    const bool hasArrow = Has(type, HasItems) || control.editKind == EditKind::DatePicker ||
                          control.editKind == EditKind::Extendable;
    if (hasArrow && text.width() > kArrowPx) {
        DrawArrow(
            painter,
            QRect(place.right() - kArrowPx, place.top(), kArrowPx, std::min(place.height(), int(24 * scale))),
            edge);
        text.setRight(text.right() - kArrowPx);
    }
    QFont font = FontFor(control.textStyle, scale, std::max(place.height() - (isLabel ? 0 : 4), 1));
    const QString& shown = TextOf(control);
    // A caption is narrowed before it is cut, as in the running form.
    if (Has(type, HasCaption)) {
        const int width = QFontMetrics(font).horizontalAdvance(shown);
        if (width > text.width() && place.height() < 2 * QFontMetrics(font).height())
            font.setPointSizeF(font.pointSizeF() * std::max(qreal(text.width()) / width, kLeastCaption));
    }
    painter.setFont(font);
    const QFontMetrics metrics(font);
    const bool single = place.height() < 2 * metrics.height() || isButton;
    QColor ink = colors.color(inkRole);
    if (isBox)
        ink = Blend(ink, colors.color(groundRole), 0.72F); // it stands for what will be there
    painter.setPen(ink);
    int flags = single ? Qt::AlignVCenter : Qt::AlignTop;
    // The low bits of a drop-down box's style are its kind.
    const quint32 alignBits = Has(type, HasItems) ? 0 : control.windowStyle;
    flags |= isButton ? Qt::AlignHCenter : int(AlignmentOf(alignBits));
    if (Has(type, HasRows)) {
        const int head = std::min(metrics.height() + 6, place.height());
        painter.drawText(text.adjusted(0, 0, 0, head - place.height()), Qt::AlignVCenter | Qt::AlignLeft,
                         metrics.elidedText(shown, Qt::ElideRight, text.width()));
        painter.setPen(ColorOfRole(LookRole::Line, palette));
        painter.drawLine(place.left() + 1, place.top() + head, place.right() - 1, place.top() + head);
        return;
    }
    if (single)
        painter.drawText(text, flags | Qt::TextSingleLine,
                         metrics.elidedText(shown, Qt::ElideRight, text.width()));
    else
        painter.drawText(text.adjusted(0, 2, 0, -2), flags | Qt::TextWordWrap, shown);
}

} // namespace mirel
