#pragma once

#include "app/shell_commands.h"
#include "platform/ui/view_command.h"

#include <QAction>

class QAbstractScrollArea;

namespace mirel {

// Where the commands of the main window show.
enum ShellMenu : unsigned {
    ShellFileMenu = 1,
    ShellViewFileMenu = 2, // behind the entries of the view in front
    ShellSideBarMenu = 4,
    ShellLayoutMenu = 8,
    ShellDatabaseMenu = 16,
    ShellHelpMenu = 32,
    ShellWindowMenu = 64,
    ShellTabMenu = 128,
    ShellEntryPopup = 256,
    ShellFavoritePopup = 512,
};

// The commands of the main window as actions: menus, lists, buttons and keys share them, so that all agree on what
// can be done now and why not. The keys of the selected entry's commands work in the lists that add these actions.
class ShellActions : public CommandActions {
    Q_OBJECT
public:
    explicit ShellActions(QWidget& window);

    QAction* Of(ShellCommand id) const { return CommandActions::Of(int(id)); }
    std::vector<QAction*> OfEntries() const;
    // As the lists and their selection decide.
    void Follow(const MainViewState& state);
    // The popup menu of the selected entry, by the right mouse button, a hold or a key. The state must outlive the
    // list.
    void OfferEntryMenu(QAbstractScrollArea& list, const MainViewState& state);

Q_SIGNALS:
    void followed();
};

} // namespace mirel
