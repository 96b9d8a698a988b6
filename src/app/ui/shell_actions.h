#pragma once

#include "app/shell_commands.h"

#include <QAction>

#include <map>

namespace mirel {

// The commands of the main view as actions: menus, buttons and keys share them, so that all agree on what can be
// done now and why not.
class ShellActions : public QObject {
    Q_OBJECT
public:
    explicit ShellActions(QObject* parent = nullptr);

    QAction* Of(ShellCommand id) const { return actions_.at(id); }
    void Follow(const MainViewState& state);

Q_SIGNALS:
    void Given(mirel::ShellCommand id);

private:
    std::map<ShellCommand, QAction*> actions_;
};

} // namespace mirel
