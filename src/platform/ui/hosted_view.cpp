#include "platform/ui/hosted_view.h"

#include <QCloseEvent>

namespace mirel {

void HostedView::closeEvent(QCloseEvent* event)
{
    if (!MayClose()) {
        event->ignore();
        return;
    }
    event->accept();
    Q_EMIT closed();
}

} // namespace mirel
