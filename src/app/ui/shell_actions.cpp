#include "app/ui/shell_actions.h"

#include "app/ui/main_frame.h"

namespace mirel {

ShellActions::ShellActions(QWidget& window)
    : CommandActions(CMainFrame::CommandTable(), window)
{
    for (const CommandRow<CMainFrame>& row : CMainFrame::CommandTable()) {
        QAction* action = CommandActions::Of(row.def.id);
        action->setIconText(action->text()); // buttons keep the mnemonic
    }
    for (QAction* action : OfEntries()) {
        window.removeAction(action);
        action->setShortcutContext(Qt::WidgetWithChildrenShortcut);
    }
}

std::vector<QAction*> ShellActions::OfEntries() const
{
    return {Of(ShellCommand::Open),   Of(ShellCommand::New),    Of(ShellCommand::Edit),
            Of(ShellCommand::Rename), Of(ShellCommand::Delete), Of(ShellCommand::RemoveFavorites)};
}

void ShellActions::Follow(const MainViewState& state)
{
    for (const CommandRow<CMainFrame>& row : CMainFrame::CommandTable()) {
        if (row.state)
            continue; // the window decides on it
        const Availability now = AvailabilityOf(ShellCommand(row.def.id), state);
        Show(row.def.id, {.enabled = now.enabled && row.def.built,
                          .checked = ShellCommand(row.def.id) == ShellCommand::OpenByDoubleClicking &&
                                     state.OpensByDoubleTap(),
                          .tip = now.tip});
    }
    Q_EMIT followed();
}

} // namespace mirel
