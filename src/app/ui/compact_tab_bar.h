#pragma once

#include <QTabBar>

namespace mirel {

// A tab bar that shows all its tabs whole in a narrow window: where the style's spacing does not fit, the tabs
// come closer together instead of hiding behind arrows.
class CompactTabBar : public QTabBar {
    Q_OBJECT
public:
    using QTabBar::QTabBar;

    QSize minimumSizeHint() const override;

protected:
    QSize tabSizeHint(int index) const override;
    QSize minimumTabSizeHint(int index) const override;
    void resizeEvent(QResizeEvent* event) override;
};

} // namespace mirel
