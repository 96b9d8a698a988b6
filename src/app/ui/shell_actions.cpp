#include "app/ui/shell_actions.h"

#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

namespace mirel {
namespace {

QString TextOf(std::u16string_view text)
{
    return QString::fromUtf16(text.data(), qsizetype(text.size()));
}

} // namespace

ShellActions::ShellActions(QObject* parent)
    : QObject(parent)
{
    for (const ShellCommandDef& definition : ShellCommands()) {
        const ShellCommand id = definition.id;
        auto* action = new QAction(ThemeIcon(TextOf(definition.icon)), StringText(definition.text), this);
        action->setIconText(action->text()); // buttons keep the mnemonic
        action->setCheckable(id == ShellCommand::OpenByDoubleClicking);
        action->setMenuRole(QAction::NoRole);
        connect(action, &QAction::triggered, this, [this, id] { Q_EMIT Given(id); });
        action->setShortcut(QKeySequence(TextOf(definition.keys), QKeySequence::PortableText));
        actions_.emplace(id, action);
    }
}

void ShellActions::Follow(const MainViewState& state)
{
    for (const auto& [id, action] : actions_) {
        const Availability now = AvailabilityOf(id, state);
        const QString tip = StringText(now.tip);
        const QString keys = action->shortcut().toString(QKeySequence::NativeText);
        action->setEnabled(now.enabled);
        action->setToolTip(keys.isEmpty() ? tip : StringText(Str::TipWithKeys, {tip, keys}));
        action->setStatusTip(tip);
    }
    actions_.at(ShellCommand::OpenByDoubleClicking)->setChecked(state.OpensByDoubleTap());
}

} // namespace mirel
