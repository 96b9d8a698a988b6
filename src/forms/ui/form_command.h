#pragma once

namespace mirel {

// All that the view of a running form does on a key, a button or a menu entry. What each is called and does stands
// in the table in form_view_commands.cpp.
enum class FormCommand {
    First,
    Previous,
    Next,
    Last,
    AddRecord,
    DeleteRecord,
    Undo,
    Redo,
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
};

} // namespace mirel
