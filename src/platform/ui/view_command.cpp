#include "platform/ui/view_command.h"

#include "platform/ui/menu_keys.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QAction>
#include <QMenu>
#include <QToolBar>

#include <algorithm>

namespace mirel {
namespace {

bool IsKey(const CommandKey& key)
{
    return key.keys.toCombined() != 0;
}

// Shift and Tab come as a key of their own.
QString TextOf(QKeyCombination keys)
{
    const bool isBackTab = keys.key() == Qt::Key_Backtab;
    return QKeySequence(isBackTab ? QKeyCombination(Qt::SHIFT | Qt::Key_Tab) : keys)
        .toString(QKeySequence::NativeText);
}

} // namespace

CommandActions::CommandActions(QWidget& owner)
    : QObject(&owner)
    , owner_(owner)
{
}

void CommandActions::Add(const CommandDef& def)
{
    auto* action = new QAction(this);
    action->setCheckable(def.checkable);
    action->setMenuRole(QAction::NoRole);
    QList<QKeySequence> shortcuts;
    for (const CommandKey& key : def.keys) {
        if (IsKey(key) && (key.places & Everywhere) != 0)
            shortcuts += QKeySequence(key.keys);
    }
    action->setShortcuts(shortcuts);
    connect(action, &QAction::triggered, this, [this, id = def.id] { Q_EMIT given(id); });
    owner_.addAction(action); // its key works although no menu may show it
    positions_.emplace(def.id, entries_.size());
    entries_.push_back({&def, action, std::nullopt});
    Show(def.id, {.enabled = def.built});
}

void CommandActions::WorkWhereOwnerHasFocus()
{
    for (const Entry& entry : entries_)
        entry.action->setShortcutContext(Qt::WidgetWithChildrenShortcut);
}

void CommandActions::LeaveKeysOutOfTips()
{
    keysInTips_ = false;
    for (Entry& entry : entries_) {
        const CommandState state = entry.shown.value_or(CommandState{});
        entry.shown.reset();
        Show(entry.def->id, state);
    }
}

QAction* CommandActions::Of(int id) const
{
    return entries_[positions_.at(id)].action;
}

void CommandActions::Show(int id, const CommandState& state)
{
    Entry& entry = entries_[positions_.at(id)];
    QAction* action = entry.action;
    const bool tickFits = !entry.def->checkable || action->isChecked() == state.checked; // a tap ticks by itself
    if (entry.shown == state && tickFits)
        return; // most of them, with every step through the records
    const QString tip = StringText(state.tip.value_or(entry.def->tip));
    const QString keys = action->shortcut().toString(QKeySequence::NativeText);
    action->setEnabled(state.enabled);
    const QString text = StringText(state.text.value_or(entry.def->text));
    action->setText(entry.def->asks ? StringText(Str::CommandThatAsks, {text}) : text);
    action->setIconText(QString(text).remove(u'&').remove(QStringLiteral("...")).trimmed());
    action->setToolTip(keys.isEmpty() || !keysInTips_ ? tip : StringText(Str::TipWithKeys, {tip, keys}));
    action->setStatusTip(tip);
    if (entry.def->checkable)
        action->setChecked(state.checked);
    if (const char16_t* icon = state.icon ? state.icon : entry.def->icon)
        action->setIcon(ThemeIcon(icon));
    entry.shown = state;
}

template <typename Bar>
void CommandActions::Fill(Bar& bar, unsigned menuBit)
{
    std::optional<int> group;
    for (const Entry& entry : entries_) {
        if ((entry.def->menus & menuBit) == 0)
            continue;
        if (group && *group != entry.def->group)
            bar.addSeparator();
        group = entry.def->group;
        bar.addAction(entry.action);
        if (entry.def->opens != 0 && !entry.action->menu()) {
            auto* behind = new QMenu(&owner_);
            entry.action->setMenu(behind);
            FillMenu(*behind, entry.def->opens);
        }
    }
}

void CommandActions::FillMenu(QMenu& menu, unsigned menuBit)
{
    menu.setToolTipsVisible(true); // they say why an entry cannot be chosen
    LeaveOutKeysWhenSmall(menu, owner_);
    Fill(menu, menuBit);
}

void CommandActions::FillToolBar(QToolBar& bar, unsigned menuBit)
{
    Fill(bar, menuBit);
}

QList<KeyHint> CommandActions::KeyHints() const
{
    QList<KeyHint> hints;
    QList<QStringList> keysOfHints;
    for (const Entry& entry : entries_) {
        QStringList keys;
        for (const CommandKey& key : entry.def->keys) {
            // The key pad has a second Return.
            if (IsKey(key) && key.keys.key() != Qt::Key_Enter && !keys.contains(TextOf(key.keys)))
                keys += TextOf(key.keys);
        }
        if (keys.isEmpty())
            continue;
        const QString what = StringText(entry.def->text);
        const auto same = std::ranges::find(hints, what, &KeyHint::what);
        if (same == hints.end()) {
            hints.push_back({{}, what});
            keysOfHints.push_back(keys);
        } else {
            keysOfHints[same - hints.begin()] += keys;
        }
    }
    for (qsizetype i = 0; i < hints.size(); ++i)
        hints[i].keys = keysOfHints[i].join(QStringLiteral(", "));
    return hints;
}

} // namespace mirel
