#include "app/ui/compact_tab_bar.h"

#include <QResizeEvent>

namespace mirel {

QSize CompactTabBar::minimumSizeHint() const
{
    int width = 0;
    for (int i = 0; i < count(); ++i)
        width += minimumTabSizeHint(i).width();
    return {width, QTabBar::minimumSizeHint().height()};
}

QSize CompactTabBar::tabSizeHint(int index) const
{
    const QSize roomy = QTabBar::tabSizeHint(index);
    int all = 0;
    int least = 0;
    for (int i = 0; i < count(); ++i) {
        all += QTabBar::tabSizeHint(i).width();
        least += minimumTabSizeHint(i).width();
    }
    const int window = parentWidget() ? parentWidget()->contentsRect().width() : all;
    const int room = std::min(window, width() > least ? width() : window);
    if (all <= room)
        return roomy;
    const int spare = std::max(0, room - least) / std::max(1, count());
    return {std::min(roomy.width(), minimumTabSizeHint(index).width() + spare), roomy.height()};
}

QSize CompactTabBar::minimumTabSizeHint(int index) const
{
    const int text = fontMetrics().size(Qt::TextShowMnemonic, tabText(index)).width();
    return {text + fontMetrics().averageCharWidth(), QTabBar::minimumTabSizeHint(index).height()};
}

void CompactTabBar::resizeEvent(QResizeEvent* event)
{
    // The bar lays its tabs out anew only when it believes that they changed.
    if (event->size().width() != event->oldSize().width() && count() > 0)
        setTabText(0, tabText(0));
    QTabBar::resizeEvent(event);
}

} // namespace mirel
