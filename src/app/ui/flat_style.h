#pragma once

#include "app/ui/look.h"

namespace mirel {

// The look of the program's own palettes on the Fusion style: flat, with one edge around what can be operated,
// one accent for selection and focus, no gradients. Sizes are those of TouchTargetStyle.
//
// An editor whose property kRefusedProperty is true has its edge in the error's colour.
class FlatStyle : public TouchTargetStyle {
    Q_OBJECT
public:
    FlatStyle();

    void drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                       const QWidget* widget) const override;
    QRect subElementRect(SubElement element, const QStyleOption* option, const QWidget* widget) const override;
    void drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                     const QWidget* widget) const override;
    void drawComplexControl(ComplexControl control, const QStyleOptionComplex* option, QPainter* painter,
                            const QWidget* widget) const override;
    int pixelMetric(PixelMetric metric, const QStyleOption* option, const QWidget* widget) const override;
    int styleHint(StyleHint hint, const QStyleOption* option, const QWidget* widget,
                  QStyleHintReturn* returnData) const override;

private:
    void DrawComboBox(const QStyleOptionComboBox& option, QPainter& painter, const QWidget* widget) const;
    void DrawComboBoxText(QStyleOptionComboBox box, QPainter& painter, const QWidget* widget) const;
    void DrawSpinBox(const QStyleOptionSpinBox& option, QPainter& painter, const QWidget* widget) const;
    void DrawScrollBar(const QStyleOptionSlider& option, QPainter& painter, const QWidget* widget) const;
    void DrawMenuBarItem(QStyleOptionMenuItem item, QPainter& painter, const QWidget* widget) const;
    void DrawArrow(PrimitiveElement arrow, const QStyleOption& option, const QRect& place, QPainter& painter,
                   const QWidget* widget) const;
};

} // namespace mirel
