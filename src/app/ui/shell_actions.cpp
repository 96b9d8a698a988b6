#include "app/ui/shell_actions.h"

#include "app/ui/main_frame.h"
#include "platform/ui/hold_popup.h"

#include <QAbstractScrollArea>
#include <QMenu>

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

void ShellActions::OfferEntryMenu(QAbstractScrollArea& list, const MainViewState& state)
{
    constexpr int kHoldMs = 700;
    list.setContextMenuPolicy(Qt::CustomContextMenu);
    new HoldPopup(list.viewport(), [] { return kHoldMs; });
    connect(&list, &QWidget::customContextMenuRequested, this, [this, &list, &state](const QPoint& position) {
        QMenu menu(&list);
        FillMenu(menu, state.Tab() == MainTab::Favorites ? ShellFavoritePopup : ShellEntryPopup);
        menu.exec(list.viewport()->mapToGlobal(position));
    });
}

} // namespace mirel
