#pragma once

namespace mirel {

// All that the form maker's view does on a key, a button or a menu entry. What each is called and does stands in
// the table in form_mak_commands.cpp.
enum class FormMakCommand {
    Save,
    SaveAs,
    Import,
    Export,
    Run,
    ScrollBar,
    DeleteAll,
    Help,
    FormProperties,
    FormColor,
    FormFont,
    DefaultForm,
    LayOutAll,
    Select,
    NewLabel,
    NewEditBox,
    NewCheckBox,
    NewDropDown,
    NewList,
    NewButton,
    InsertCounter,
    Fields,
    ControlProperties,
    ControlColor,
    ControlFont,
    Color,
    Font,
    AlignLeft,
    AlignRight,
    AlignTop,
    AlignBottom,
    SameSize,
    SameHeight,
    SameWidth,
    Copy,
    Paste,
    Delete,
    Earlier,
    Later,
    SelectAll,
    Undo,
    Redo,
    ZoomIn,
    ZoomOut,
};

} // namespace mirel
