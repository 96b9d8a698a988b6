#include "platform/ui/scrolled_page.h"

#include <QScrollArea>
#include <QScrollBar>

namespace mirel {
namespace {

class PageScroller : public QScrollArea {
public:
    using QScrollArea::QScrollArea;

    QSize sizeHint() const override { return widget()->sizeHint() + QSize(BarWidth(), 0); }
    QSize minimumSizeHint() const override
    {
        return {widget()->minimumSizeHint().width() + BarWidth(), QScrollArea::minimumSizeHint().height()};
    }

private:
    int BarWidth() const { return verticalScrollBar()->sizeHint().width(); }
};

} // namespace

QWidget* Scrolled(QWidget* page)
{
    auto* scroller = new PageScroller(page->parentWidget());
    scroller->setFrameShape(QFrame::NoFrame);
    scroller->setWidgetResizable(true);
    scroller->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    scroller->setWidget(page);
    // As in the tab or the dialog around it, not as in a list.
    scroller->viewport()->setAutoFillBackground(false);
    page->setAutoFillBackground(false);
    return scroller;
}

} // namespace mirel
