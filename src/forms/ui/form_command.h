#pragma once

#include "resources/string_id.h"

#include <optional>
#include <span>
#include <string_view>

namespace mirel {

// All that the window of a running form does on a key, a button or a menu entry.
enum class FormCommand {
    First,
    Previous,
    Next,
    Last,
    AddRecord,
    DeleteRecord,
    ScrollUp,
    ScrollDown,
    ScrollBar,
    FitToWindow,
    Detail,
    List,
    Save,
    Recalculate,
    Zoom,
    Copy,
    Paste,
    FilterBy,
    FilterExcluding,
    RemoveFilter,
    SortAscending,
    SortDescending,
    Options,
    EditForm,
    Keys,
    Help,
    Close,
};

struct FormCommandDef {
    FormCommand id;
    Str text; // with its mnemonic
    Str tip;
    std::u16string_view icon; // name for ThemeIcon; empty: none
    std::u16string_view keys; // in QKeySequence's portable form; empty: none
    bool checkable = false;
    bool built = true; // false: always disabled
};
std::span<const FormCommandDef> FormCommands();

// The tool bar and the menus, in groups: an empty entry is a line between two.
using FormMenuEntry = std::optional<FormCommand>;
std::span<const FormMenuEntry> FormToolBar();
std::span<const FormMenuEntry> FormFileMenu();
std::span<const FormMenuEntry> FormRecordMenu();
std::span<const FormMenuEntry> FormViewMenu();
std::span<const FormMenuEntry> FormPopupMenu(); // on a control

} // namespace mirel
