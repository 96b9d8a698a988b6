#pragma once

#include "app/main_view_state.h"
#include "app/ui/shell_actions.h"

#include <QStackedWidget>

class QLabel;
class QToolButton;

namespace mirel {

class WelcomePage;

// What stands beside the side bar while no view is open: the ways to a database, or what the open one offers.
class EmptyPage : public QStackedWidget {
    Q_OBJECT
public:
    EmptyPage(const ShellActions& actions, QWidget* parent = nullptr);

    void Show(const MainViewState& state, const QStringList& recent);

Q_SIGNALS:
    void RecentChosen(const QString& path);

private:
    WelcomePage& Welcome();

    const ShellActions& actions_;
    WelcomePage* welcome_ = nullptr; // until no database is open
    QWidget* offers_;
    QLabel* hint_;
    std::vector<QToolButton*> buttons_;
};

} // namespace mirel
