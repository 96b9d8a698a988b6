#include "app/ui/flat_style.h"

#include "platform/ui/look_roles.h"

#include <QPainter>
#include <QStyleOption>
#include <QWidget>

#include <algorithm>

namespace mirel {
namespace {

constexpr int kFocusPx = 2;
constexpr int kFrameEdgePx = 1;
constexpr float kHovered = 0.07F;
constexpr float kPressed = 0.16F;
constexpr float kTicked = 0.20F;

QColor Role(LookRole role, const QStyleOption& option)
{
    return ColorOfRole(role, option.palette);
}

// What cannot be operated keeps a fainter edge.
QColor EdgeOf(const QStyleOption& option, const QWidget* widget)
{
    if (widget && widget->property(kRefusedProperty).toBool())
        return Role(LookRole::Error, option);
    return Role(option.state & QStyle::State_Enabled ? LookRole::Edge : LookRole::Line, option);
}

void DrawBox(QPainter& painter, const QRect& place, const QColor& fill, const QColor& edge, int widthPx = 1,
             qreal corner = spacing::kCorner)
{
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setBrush(fill.isValid() ? QBrush(fill) : QBrush(Qt::NoBrush));
    painter.setPen(edge.isValid() ? QPen(edge, widthPx) : QPen(Qt::NoPen));
    const qreal inside = edge.isValid() ? widthPx / 2.0 : 0;
    painter.drawRoundedRect(QRectF(place).adjusted(inside, inside, -inside, -inside), corner, corner);
    painter.restore();
}

// A focused editor has the accent around it, a refused one the error's colour.
void DrawEditorFrame(QPainter& painter, const QStyleOption& option, const QWidget* widget, const QColor& fill)
{
    const bool refused = widget && widget->property(kRefusedProperty).toBool();
    const bool focused = option.state & QStyle::State_HasFocus;
    const QColor edge = refused || !focused ? EdgeOf(option, widget) : Role(LookRole::Accent, option);
    DrawBox(painter, option.rect, fill, edge, refused || focused ? kFocusPx : 1);
}

QColor ButtonGround(const QStyleOption& option)
{
    const QColor ground = option.palette.color(QPalette::Button);
    if (option.state & QStyle::State_Sunken)
        return Blend(Role(LookRole::Accent, option), ground, kPressed);
    if (option.state & QStyle::State_On)
        return Blend(Role(LookRole::Accent, option), ground, kTicked);
    if ((option.state & QStyle::State_MouseOver) && (option.state & QStyle::State_Enabled))
        return Blend(option.palette.color(QPalette::ButtonText), ground, kHovered);
    return ground;
}

void DrawPushButton(QPainter& painter, const QStyleOption& option)
{
    const auto* button = qstyleoption_cast<const QStyleOptionButton*>(&option);
    if (button && button->features.testFlag(QStyleOptionButton::Flat) &&
        !(option.state & (QStyle::State_Sunken | QStyle::State_On | QStyle::State_MouseOver)))
        return;
    const bool isDefault = button && button->features.testFlag(QStyleOptionButton::DefaultButton);
    DrawBox(painter, option.rect, ButtonGround(option),
            isDefault ? Role(LookRole::Accent, option) : EdgeOf(option, nullptr));
}

// Of a tab: quiet, with a ground where the mouse is.
void DrawCross(QPainter& painter, const QStyleOption& option)
{
    constexpr int kHalfPx = 4;
    const bool over = option.state & (QStyle::State_MouseOver | QStyle::State_Sunken);
    if (over)
        DrawBox(painter, option.rect, ButtonGround(option), {});
    const QPointF middle = QRectF(option.rect).center();
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(Role(over ? LookRole::Text : LookRole::Dim, option), 1.3));
    for (const qreal side : {-1.0, 1.0})
        painter.drawLine(middle + QPointF(-kHalfPx, -kHalfPx * side), middle + QPointF(kHalfPx, kHalfPx * side));
    painter.restore();
}

void DrawToolButton(QPainter& painter, const QStyleOption& option)
{
    if (!(option.state & QStyle::State_AutoRaise)) {
        DrawBox(painter, option.rect, ButtonGround(option), EdgeOf(option, nullptr));
        return;
    }
    const QStyle::State marked = QStyle::State_Sunken | QStyle::State_On | QStyle::State_MouseOver;
    if ((option.state & marked) && (option.state & QStyle::State_Enabled))
        DrawBox(painter, option.rect, ButtonGround(option), {});
}

void DrawTick(QPainter& painter, const QStyleOption& option)
{
    const int side = std::min(option.rect.width(), option.rect.height());
    QRect place(0, 0, side, side);
    place.moveCenter(option.rect.center());
    const bool enabled = option.state & QStyle::State_Enabled;
    const bool ticked = option.state & QStyle::State_On;
    const QColor mark = enabled ? Role(LookRole::Accent, option) : Role(LookRole::Edge, option);
    DrawBox(painter, place, ticked ? mark : option.palette.color(QPalette::Base),
            ticked ? mark : EdgeOf(option, nullptr), 1, 3);
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    const qreal unit = side / 12.0;
    const auto at = [&](qreal x, qreal y) { return QPointF(place.left() + x * unit, place.top() + y * unit); };
    if (ticked) {
        painter.setPen(QPen(Role(LookRole::AccentText, option), std::max(1.6 * unit, 1.5), Qt::SolidLine,
                            Qt::RoundCap, Qt::RoundJoin));
        painter.drawPolyline(QPolygonF({at(3, 6.2), at(5.2, 8.6), at(9.2, 3.8)}));
    } else if (option.state & QStyle::State_NoChange) {
        painter.setPen(QPen(Role(LookRole::Dim, option), std::max(1.4 * unit, 1.5)));
        painter.drawLine(at(3.5, 6), at(8.5, 6));
    }
    painter.restore();
}

void DrawRadio(QPainter& painter, const QStyleOption& option)
{
    const int side = std::min(option.rect.width(), option.rect.height());
    QRect place(0, 0, side, side);
    place.moveCenter(option.rect.center());
    const bool on = option.state & QStyle::State_On;
    const QColor accent =
        option.state & QStyle::State_Enabled ? Role(LookRole::Accent, option) : Role(LookRole::Edge, option);
    DrawBox(painter, place, option.palette.color(QPalette::Base), on ? accent : EdgeOf(option, nullptr), 1,
            side / 2.0);
    if (on) {
        const int in = std::max(side / 4, 3);
        DrawBox(painter, place.adjusted(in, in, -in, -in), accent, {}, 0, side / 2.0);
    }
}

void DrawLine(QPainter& painter, const QStyleOption& option, const QPoint& from, const QPoint& to)
{
    painter.setPen(Role(LookRole::Line, option));
    painter.drawLine(from, to);
}

void DrawHeaderSection(QPainter& painter, const QStyleOption& option, bool sunken)
{
    const QColor ground = Role(LookRole::Window, option);
    painter.save();
    painter.fillRect(option.rect, sunken ? Blend(Role(LookRole::Accent, option), ground, kPressed) : ground);
    DrawLine(painter, option, option.rect.bottomLeft(), option.rect.bottomRight());
    painter.restore();
}

void DrawTab(QPainter& painter, const QStyleOptionTab& tab)
{
    painter.save();
    if (tab.state & QStyle::State_Selected) {
        painter.fillRect(tab.rect, Role(LookRole::Base, tab));
        painter.fillRect(QRect(tab.rect.topLeft(), QSize(tab.rect.width(), kFocusPx)),
                         Role(LookRole::Accent, tab));
        DrawLine(painter, tab, tab.rect.topLeft(), tab.rect.bottomLeft());
        DrawLine(painter, tab, tab.rect.topRight(), tab.rect.bottomRight());
    } else {
        if (tab.state & QStyle::State_MouseOver)
            painter.fillRect(tab.rect, Blend(Role(LookRole::Text, tab), Role(LookRole::Window, tab), kHovered));
        DrawLine(painter, tab, tab.rect.bottomLeft(), tab.rect.bottomRight());
    }
    painter.restore();
}

} // namespace

FlatStyle::FlatStyle()
    : TouchTargetStyle(QStringLiteral("Fusion"))
{
}

void FlatStyle::drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                              const QWidget* widget) const
{
    switch (element) {
    case PE_PanelLineEdit: {
        const auto* panel = qstyleoption_cast<const QStyleOptionFrame*>(option);
        if (panel && panel->lineWidth <= 0)
            painter->fillRect(option->rect, option->palette.color(QPalette::Base));
        else
            DrawEditorFrame(*painter, *option, widget, option->palette.color(QPalette::Base));
        return;
    }
    case PE_FrameLineEdit:
        return DrawEditorFrame(*painter, *option, widget, {});
    case PE_Frame: {
        const bool focused = option->state & State_HasFocus;
        painter->save();
        painter->setPen(focused ? Role(LookRole::Accent, *option) : EdgeOf(*option, widget));
        painter->drawRect(option->rect.adjusted(0, 0, -1, -1));
        painter->restore();
        return;
    }
    case PE_IndicatorHeaderArrow: // Qt says "down" of an ascending order; here the arrow points to where it grows
        if (const auto* header = qstyleoption_cast<const QStyleOptionHeader*>(option)) {
            const bool ascending = header->sortIndicator == QStyleOptionHeader::SortDown;
            return DrawArrow(ascending ? PE_IndicatorArrowUp : PE_IndicatorArrowDown, *option, option->rect,
                             *painter, widget);
        }
        break;
    case PE_FrameGroupBox:
    case PE_FrameTabWidget:
        return DrawBox(*painter, option->rect, {}, Role(LookRole::Line, *option));
    case PE_FrameTabBarBase:
        painter->save();
        DrawLine(*painter, *option, option->rect.bottomLeft(), option->rect.bottomRight());
        painter->restore();
        return;
    case PE_PanelButtonCommand:
        return DrawPushButton(*painter, *option);
    case PE_PanelButtonTool:
        return DrawToolButton(*painter, *option);
    case PE_FrameFocusRect:
        if (option->state & State_KeyboardFocusChange)
            DrawBox(*painter, option->rect, {}, Role(LookRole::Accent, *option), kFocusPx);
        return;
    case PE_IndicatorCheckBox:
    case PE_IndicatorItemViewItemCheck:
        return DrawTick(*painter, *option);
    case PE_IndicatorRadioButton:
        return DrawRadio(*painter, *option);
    case PE_IndicatorTabClose:
        return DrawCross(*painter, *option);
    default:
        TouchTargetStyle::drawPrimitive(element, option, painter, widget);
    }
}

void FlatStyle::drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                            const QWidget* widget) const
{
    switch (element) {
    case CE_HeaderSection:
        DrawHeaderSection(*painter, *option, option->state & State_Sunken);
        painter->save();
        DrawLine(*painter, *option, option->rect.topRight(), option->rect.bottomRight());
        painter->restore();
        return;
    case CE_HeaderEmptyArea:
        return DrawHeaderSection(*painter, *option, false);
    case CE_TabBarTabShape:
        if (const auto* tab = qstyleoption_cast<const QStyleOptionTab*>(option))
            return DrawTab(*painter, *tab);
        break;
    case CE_MenuBarItem:
        if (const auto* item = qstyleoption_cast<const QStyleOptionMenuItem*>(option))
            return DrawMenuBarItem(*item, *painter, widget);
        break;
    case CE_ComboBoxLabel:
        if (const auto* box = qstyleoption_cast<const QStyleOptionComboBox*>(option))
            return DrawComboBoxText(*box, *painter, widget);
        break;
    case CE_ToolBar:
    case CE_MenuBarEmptyArea:
        painter->fillRect(option->rect, option->palette.color(QPalette::Window));
        return;
    default:
        break;
    }
    TouchTargetStyle::drawControl(element, option, painter, widget);
}

QRect FlatStyle::subElementRect(SubElement element, const QStyleOption* option, const QWidget* widget) const
{
    if (element == SE_ItemViewItemFocusRect) // the entry's, its icon included
        return option->rect.adjusted(1, 1, -1, -1);
    return TouchTargetStyle::subElementRect(element, option, widget);
}

void FlatStyle::DrawMenuBarItem(QStyleOptionMenuItem item, QPainter& painter, const QWidget* widget) const
{
    // The keys go to the bar until Escape is pressed once more: that must be seen.
    if ((item.state & State_Selected) && widget && widget->hasFocus())
        item.state |= State_Sunken;
    TouchTargetStyle::drawControl(CE_MenuBarItem, &item, &painter, widget);
    if (!(item.state & State_Selected)) // Fusion's line beneath it
        painter.fillRect(QRect(item.rect.bottomLeft(), QSize(item.rect.width(), 1)),
                         item.palette.color(QPalette::Window));
}

void FlatStyle::drawComplexControl(ComplexControl control, const QStyleOptionComplex* option, QPainter* painter,
                                   const QWidget* widget) const
{
    if (const auto* combo = qstyleoption_cast<const QStyleOptionComboBox*>(option))
        return DrawComboBox(*combo, *painter, widget);
    if (const auto* spin = qstyleoption_cast<const QStyleOptionSpinBox*>(option))
        return DrawSpinBox(*spin, *painter, widget);
    const auto* slider = qstyleoption_cast<const QStyleOptionSlider*>(option);
    if (control == CC_ScrollBar && slider)
        return DrawScrollBar(*slider, *painter, widget);
    TouchTargetStyle::drawComplexControl(control, option, painter, widget);
}

void FlatStyle::DrawArrow(PrimitiveElement arrow, const QStyleOption& option, const QRect& place,
                          QPainter& painter, const QWidget* widget) const
{
    constexpr int kArrowPx = 12;
    QStyleOption sign = option;
    const int side = std::min({kArrowPx, place.width(), place.height()});
    sign.rect = QRect(0, 0, side, side);
    sign.rect.moveCenter(place.center());
    sign.state &= ~(State_Sunken | State_HasFocus);
    proxy()->drawPrimitive(arrow, &sign, &painter, widget);
}

void FlatStyle::DrawComboBox(const QStyleOptionComboBox& option, QPainter& painter, const QWidget* widget) const
{
    if (option.frame)
        DrawEditorFrame(painter, option, widget,
                        option.editable ? option.palette.color(QPalette::Base) : ButtonGround(option));
    else
        painter.fillRect(option.rect, option.palette.color(QPalette::Base));
    DrawArrow(PE_IndicatorArrowDown, option,
              proxy()->subControlRect(CC_ComboBox, &option, SC_ComboBoxArrow, widget), painter, widget);
}

// The base style cuts a long text off without a sign.
void FlatStyle::DrawComboBoxText(QStyleOptionComboBox box, QPainter& painter, const QWidget* widget) const
{
    constexpr int kBesideIconPx = 4;
    constexpr int kAroundTextPx = 2;
    int room =
        proxy()->subControlRect(CC_ComboBox, &box, SC_ComboBoxEditField, widget).width() - 2 * kAroundTextPx;
    if (!box.currentIcon.isNull())
        room -= box.iconSize.width() + kBesideIconPx;
    box.currentText = box.fontMetrics.elidedText(box.currentText, Qt::ElideMiddle, room);
    TouchTargetStyle::drawControl(CE_ComboBoxLabel, &box, &painter, widget);
}

void FlatStyle::DrawSpinBox(const QStyleOptionSpinBox& option, QPainter& painter, const QWidget* widget) const
{
    DrawEditorFrame(painter, option, widget, option.palette.color(QPalette::Base));
    if (option.buttonSymbols == QAbstractSpinBox::NoButtons)
        return;
    const auto arrow = [&](SubControl part, PrimitiveElement sign, QAbstractSpinBox::StepEnabledFlag step) {
        QStyleOptionSpinBox button = option;
        button.state.setFlag(State_Enabled, option.state.testFlag(State_Enabled) && (option.stepEnabled & step));
        DrawArrow(sign, button, proxy()->subControlRect(CC_SpinBox, &option, part, widget), painter, widget);
    };
    arrow(SC_SpinBoxUp, PE_IndicatorArrowUp, QAbstractSpinBox::StepUpEnabled);
    arrow(SC_SpinBoxDown, PE_IndicatorArrowDown, QAbstractSpinBox::StepDownEnabled);
}

void FlatStyle::DrawScrollBar(const QStyleOptionSlider& option, QPainter& painter, const QWidget* widget) const
{
    const bool upright = option.orientation == Qt::Vertical;
    const auto place = [&](SubControl part) {
        return proxy()->subControlRect(CC_ScrollBar, &option, part, widget);
    };
    painter.fillRect(option.rect, Role(LookRole::Window, option));
    if (!(option.state & State_Enabled) || option.maximum <= option.minimum)
        return;
    constexpr int kSidePx = 4;
    const QRect slider = upright ? place(SC_ScrollBarSlider).adjusted(kSidePx, 1, -kSidePx, -1)
                                 : place(SC_ScrollBarSlider).adjusted(1, kSidePx, -1, -kSidePx);
    const bool held = (option.activeSubControls & SC_ScrollBarSlider) && (option.state & State_Sunken);
    DrawBox(painter, slider, Role(held ? LookRole::Accent : LookRole::Edge, option), {}, 0,
            std::min(slider.width(), slider.height()) / 2.0);
    DrawArrow(upright ? PE_IndicatorArrowUp : PE_IndicatorArrowLeft, option, place(SC_ScrollBarSubLine), painter,
              widget);
    DrawArrow(upright ? PE_IndicatorArrowDown : PE_IndicatorArrowRight, option, place(SC_ScrollBarAddLine),
              painter, widget);
}

int FlatStyle::pixelMetric(PixelMetric metric, const QStyleOption* option, const QWidget* widget) const
{
    switch (metric) {
    case PM_LayoutLeftMargin:
    case PM_LayoutTopMargin:
    case PM_LayoutRightMargin:
    case PM_LayoutBottomMargin:
    case PM_LayoutHorizontalSpacing:
    case PM_LayoutVerticalSpacing:
        return spacing::kGap;
    case PM_DefaultFrameWidth:
        return widget && widget->inherits("QLineEdit") ? kFocusPx : kFrameEdgePx;
    default:
        return TouchTargetStyle::pixelMetric(metric, option, widget);
    }
}

int FlatStyle::styleHint(StyleHint hint, const QStyleOption* option, const QWidget* widget,
                         QStyleHintReturn* returnData) const
{
    if (hint == SH_Table_GridLineColor && option)
        return int(Role(LookRole::Line, *option).rgb());
    return TouchTargetStyle::styleHint(hint, option, widget, returnData);
}

} // namespace mirel
