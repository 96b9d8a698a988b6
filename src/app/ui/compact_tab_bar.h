#pragma once

#include <QTabBar>

namespace mirel {

// A tab bar that shows all its tabs whole in a narrow window: where the style's spacing does not fit, the tabs
// come closer together instead of hiding behind arrows. TouchTargetStyle asks it how close.
class CompactTabBar : public QTabBar {
    Q_OBJECT
public:
    using QTabBar::QTabBar;

    // The space within a tab beside its text, both sides together, where the style would have `roomyPx`.
    int SpaceInTabPx(int roomyPx) const;

    QSize minimumSizeHint() const override;

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    int TextsWidth() const;
};

} // namespace mirel
