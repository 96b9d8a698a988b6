#pragma once

#include "app/view_list.h"
#include "platform/ui/hosted_view.h"
#include "platform/ui/view_command.h"

#include <QMainWindow>

namespace mirel {

// A window with one view in it, and the view's menus. It closes with its view, and its view with it.
class CViewWindow : public QMainWindow {
    Q_OBJECT
public:
    CViewWindow(HostedView& view, ViewKey key, const QString& database, QWidget* parent);

    HostedView* View() const { return view_; } // null once it was taken
    const ViewKey& Key() const { return key_; }
    void SetName(const QString& name) { key_.name = name; }
    // The view leaves without being closed, and the window closes.
    HostedView* Take();

    static std::span<const CommandRow<CViewWindow>> CommandTable();

Q_SIGNALS:
    void showAsTabRequested();
    void aboutToClose();

protected:
    void closeEvent(QCloseEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void ShowTitle();

    HostedView* view_;
    ViewKey key_;
    QString database_;
    CommandActions* actions_;
};

} // namespace mirel
