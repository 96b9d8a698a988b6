#include "app/ui/main_frame.h"
#include "resources/string_table.h"

#include <QApplication>

// The second start with a database that this window has open.

namespace mirel {
namespace {

constexpr int kAskAgainMs = 300; // while a dialog is open

} // namespace

void CMainFrame::AnswerOtherStarts(Instance& instance)
{
    instance_ = &instance;
    instance.SetListener([this](const InstanceRequest& request) {
        if (!request.activation.isEmpty())
            qputenv("XDG_ACTIVATION_TOKEN", request.activation);
        ComeForward();
        if (request.view)
            OpenWhenFree(*request.view);
    });
    FollowInstance();
    instance.Listen();
}

// The window's name among those of other starts is that of the database it has open.
void CMainFrame::FollowInstance()
{
    if (!instance_)
        return;
    const QString path = state_.DatabasePath();
    (void)instance_->Take(path.isEmpty() ? QByteArray() : InstanceName(session_.Folder().path, path, aloneWith_));
}

void CMainFrame::ComeForward()
{
    setWindowState(windowState() & ~Qt::WindowMinimized);
    show();
    QWidget* front = QApplication::activeModalWidget() ? QApplication::activeModalWidget() : this;
    raise();
    front->raise();
    front->activateWindow();
}

void CMainFrame::OpenWhenFree(const ViewKey& view)
{
    if (QApplication::activeModalWidget() || QApplication::activePopupWidget()) {
        QTimer::singleShot(kAskAgainMs, this, [this, view] { OpenWhenFree(view); });
        return;
    }
    if (!OpenView(view) && view.kind != EntryKind::Table) // a table that does not open was told of
        session_.Prompt().Show({Str::ViewNotThere, {view.name}});
}

} // namespace mirel
