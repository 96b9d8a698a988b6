#pragma once

#include <QProxyStyle>
#include <QStringView>

namespace mirel {

// Puts the program into one of its own palettes ("light", "dark", or "own": the one that goes with the desktop's)
// on the flat style, with our own icons. False, and nothing changed, for any other name.
bool UsePalette(QStringView name);

// The user's style, with what a finger or a stylus is to hit made large enough for it: 24 pixels, 32 where there
// is a touch screen.
class TouchTargetStyle : public QProxyStyle {
    Q_OBJECT
public:
    // Takes the style of that name; empty: the platform's.
    explicit TouchTargetStyle(const QString& baseStyle);

    QSize sizeFromContents(ContentsType type, const QStyleOption* option, const QSize& contentsSize,
                           const QWidget* widget) const override;
    int pixelMetric(PixelMetric metric, const QStyleOption* option, const QWidget* widget) const override;
    int styleHint(StyleHint hint, const QStyleOption* option, const QWidget* widget,
                  QStyleHintReturn* returnData) const override;
    QIcon standardIcon(StandardPixmap which, const QStyleOption* option, const QWidget* widget) const override;

private:
    int target_;
    bool own_; // a style of our choice, not the desktop's
};

} // namespace mirel
