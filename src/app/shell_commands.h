#pragma once

#include "app/main_view_state.h"
#include "resources/string_id.h"

#include <optional>

namespace mirel {

// What the user can do in the main window: the entries of its menus, and the buttons under its lists. What each is
// called and does stands in the table in main_frame_commands.cpp.
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
    PasteTable,
    ExportCsv,
    Exit,
    OpenDatabase,
    NewDatabase,
    DeleteDatabase,
    OpenSample,
    Information,
    BackUp,
    Compact,
    Check,
    Help,
    WhatsThis,
    Tour,
    Language,
    Keys,
    About,
    Open,
    New,
    Edit,
    Rename,
    Delete,
    SideBar, // these open menus
    Layout,
    NextView,
    PreviousView,
    CloseView,
    CloseOtherViews,
    OpenInWindow,
    ShowLists,
};

struct Availability {
    bool enabled = false;
    std::optional<Str> tip{}; // empty: the command's own
};
// Whether the command can be given now, as far as the lists decide on it, and what its tool tip says.
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
Str SectionText(MainTab tab); // the same in the side bar

} // namespace mirel
