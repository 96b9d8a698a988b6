#include "app/ui/compact_tab_bar.h"

#include <QResizeEvent>

#include <algorithm>

namespace mirel {
namespace {

constexpr int kLeastSpacePx = 6;

} // namespace

int CompactTabBar::TextsWidth() const
{
    int width = 0;
    for (int i = 0; i < count(); ++i)
        width += fontMetrics().size(Qt::TextShowMnemonic, tabText(i)).width();
    return width;
}

int CompactTabBar::SpaceInTabPx(int roomyPx) const
{
    if (count() == 0)
        return roomyPx;
    return std::clamp((width() - TextsWidth()) / count(), std::min(kLeastSpacePx, roomyPx), roomyPx);
}

QSize CompactTabBar::minimumSizeHint() const
{
    return {TextsWidth() + kLeastSpacePx * count(), QTabBar::minimumSizeHint().height()};
}

void CompactTabBar::resizeEvent(QResizeEvent* event)
{
    // The bar lays its tabs out again only when it believes that they changed.
    if (event->size().width() != event->oldSize().width() && count() > 0)
        setTabText(0, tabText(0));
    QTabBar::resizeEvent(event);
}

} // namespace mirel
