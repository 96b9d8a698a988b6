#pragma once

#include "app/main_view_state.h"
#include "resources/string_id.h"

#include <span>

namespace mirel {

// What the user can do in the main view: the entries of its menus, and the buttons under its lists.
enum class ShellCommand {
    AddFavorites,
    RemoveFavorites,
    OpenByDoubleClicking,
    Font,
    BackgroundColor,
    ListBackgroundColor,
    ButtonBackgroundColor,
    DatabaseTextColor,
    ListTextColor,
    ButtonTextColor,
    ResetLayout,
    ImportCsv,
    ExportCsv,
    Exit,
    OpenDatabase,
    NewDatabase,
    DeleteDatabase,
    OpenSample,
    Help,
    Keys,
    About,
    Open,
    New,
    Edit,
    Rename,
    Delete,
};

// Where a command has its place. Entry commands are the buttons under the list and its popup menu.
enum class ShellMenu { File, Layout, Database, Help, Entry };

struct ShellCommandDef {
    ShellCommand id;
    ShellMenu menu;
    Str text;                 // with its mnemonic
    Str tip;                  // what it does; for what is not built yet, what it will do
    std::u16string_view icon; // name for ThemeIcon; empty: none
    std::u16string_view keys; // in QKeySequence's portable form; empty: none
    bool built = true;        // false: always disabled
    bool separated = false;   // a line stands above it in its menu
};

// Every command once, in the order of the menus.
std::span<const ShellCommandDef> ShellCommands();
const ShellCommandDef& DefinitionOf(ShellCommand id);

struct Availability {
    bool enabled = false;
    Str tip{};
};
// Whether the command can be given now, and what its tool tip says.
Availability AvailabilityOf(ShellCommand id, const MainViewState& state);

// What New does on a tab: a message that something must be chosen first, or the designer of that tab.
struct NewOutcome {
    std::optional<Str> message;
    std::optional<EntryKind> make; // a new thing of that kind; neither on the favorites
};
NewOutcome OutcomeOfNew(const MainViewState& state);

// What stands in place of an empty list.
Str EmptyListText(MainTab tab);
Str TabText(MainTab tab);

} // namespace mirel
