#pragma once

#include "platform/ui/keys_dialog.h"
#include "resources/string_id.h"

#include <QKeyCombination>
#include <QObject>

#include <array>
#include <map>
#include <optional>
#include <span>
#include <vector>

class QAction;
class QMenu;
class QToolBar;
class QWidget;

namespace mirel {

// Where a key works: in the whole view or window, beside its menu entry; or only where the view asks for it, on
// one of its parts (the bits from OnPart on are the view's own).
enum CommandKeyPlace : unsigned { Everywhere = 1, OnPart = 2 };

struct CommandKey {
    QKeyCombination keys = QKeyCombination::fromCombined(0);
    unsigned places = Everywhere;
};

// What a command is called, its keys, its icon, and where it shows.
struct CommandDef {
    int id;                         // of the view's own enum
    Str text;                       // with its mnemonic
    Str tip;                        // what it does; for what is not built yet, what it will do
    const char16_t* icon = nullptr; // a name for ThemeIcon
    std::array<CommandKey, 3> keys{};
    unsigned menus = 0;     // the view's bits: the menus that show it, in the order of the rows
    int group = 0;          // a line separates commands of different groups
    unsigned opens = 0;     // the menu behind the entry
    bool checkable = false; // shows a tick
    bool built = true;      // false: disabled for now
    bool asks = false;      // a dialog follows: its entry in a menu ends in "…"
};

// Whether a command can be given now, and how it shows. What is not said stays as in its row.
struct CommandState {
    bool enabled = true;
    bool checked = false;
    std::optional<Str> text{};
    std::optional<Str> tip{};
    const char16_t* icon = nullptr;

    friend bool operator==(const CommandState&, const CommandState&) = default;
};

// A command of a view: a row of its one table. A new command is a new row; actions, menus, keys, the list of keys
// and the dispatcher all read the table.
template <typename View>
struct CommandRow {
    CommandDef def;
    void (*run)(View&);
    CommandState (*state)(const View&) = nullptr; // null: it can always be given
};

// The actions of a table of commands, shared by menus, buttons and keys. Its parent must outlive it and owns it.
class CommandActions : public QObject {
    Q_OBJECT
public:
    template <typename View>
    CommandActions(std::span<const CommandRow<View>> rows, QWidget& owner)
        : CommandActions(owner)
    {
        for (const CommandRow<View>& row : rows)
            Add(row.def);
    }

    // Where the owner can be one of several views of a window, its keys work while it has the focus.
    void WorkWhereOwnerHasFocus();
    // Tips are the rows' texts alone; otherwise the keys stand behind them.
    void LeaveKeysOutOfTips();

    QAction* Of(int id) const;
    void Show(int id, const CommandState& state);
    void FillMenu(QMenu& menu, unsigned menuBit);
    void FillToolBar(QToolBar& bar, unsigned menuBit);
    QList<KeyHint> KeyHints() const; // what does the same in the same words is one line

Q_SIGNALS:
    void given(int id);

private:
    explicit CommandActions(QWidget& owner);
    void Add(const CommandDef& def);
    template <typename Bar>
    void Fill(Bar& bar, unsigned menuBit);

    struct Entry {
        const CommandDef* def;
        QAction* action;
        std::optional<CommandState> shown;
    };
    QWidget& owner_;
    bool keysInTips_ = true;
    std::vector<Entry> entries_;      // in the order of the rows
    std::map<int, size_t> positions_; // of an id
};

// Carries a command out on `view`.
template <typename View>
void RunCommand(std::span<const CommandRow<View>> rows, int id, View& view)
{
    for (const CommandRow<View>& row : rows) {
        if (row.def.id == id && row.def.built)
            return row.run(view);
    }
}

// Brings what the actions show up to date with the view.
template <typename View>
void ShowCommands(std::span<const CommandRow<View>> rows, CommandActions& actions, const View& view)
{
    for (const CommandRow<View>& row : rows) {
        CommandState state = row.state ? row.state(view) : CommandState{};
        state.enabled = state.enabled && row.def.built;
        actions.Show(row.def.id, state);
    }
}

// The command of a key on a part of the view; none: the key is the part's own.
template <typename View>
std::optional<int> CommandOfPartKey(std::span<const CommandRow<View>> rows, unsigned place, QKeyCombination keys)
{
    keys = QKeyCombination(keys.keyboardModifiers() & ~Qt::KeypadModifier, keys.key());
    for (const CommandRow<View>& row : rows) {
        for (const CommandKey& key : row.def.keys) {
            if (key.keys == keys && (key.places & place) != 0)
                return row.def.id;
        }
    }
    return std::nullopt;
}

} // namespace mirel
