#include "platform/ui/scrolled_page.h"

#include "platform/ui/look_roles.h"
#include "platform/ui/wrapped_text.h"

#include <QScrollArea>
#include <QScrollBar>

namespace mirel {
namespace {

class PageScroller : public QScrollArea {
public:
    using QScrollArea::QScrollArea;

    QSize sizeHint() const override { return widget()->sizeHint() + QSize(BarWidth(), 0); }
    // Captions wrap, so that the page can be as narrow as what it cannot wrap.
    QSize minimumSizeHint() const override
    {
        return {kFewestChars * fontMetrics().averageCharWidth() + BarWidth(),
                QScrollArea::minimumSizeHint().height()};
    }

protected:
    void resizeEvent(QResizeEvent* event) override
    {
        QScrollArea::resizeEvent(event);
        WrapCaptions(*widget(), viewport()->width() - 2 * kAroundCaptionPx);
        widget()->setMaximumWidth(viewport()->width());
    }

private:
    static constexpr int kFewestChars = 16;
    static constexpr int kAroundCaptionPx = spacing::kWide; // margins of the page and of a group in it

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
