#pragma once

#include "forms/form_records.h"
#include "resources/string_id.h"

#include <span>
#include <string_view>

namespace mirel {

// What a type of control is and does, beyond the widget that shows it.
enum ControlTrait : unsigned {
    HoldsValue = 1,   // expressions and UPDATE read it by its name
    ShowsText = 2,    // and what it holds is a text
    HasCaption = 4,   // its name is its caption
    HasItems = 8,     // offers texts to choose from
    HasRows = 16,     // shows the records of the result, a row each
    IsPressed = 32,   // runs a button function
    TakesGround = 64, // begins with the form's background color
    IsTicked = 128,   // what it holds is yes or no
};

// How its ControlSource is put together.
enum class SourceKind { None, Expression, Items, Columns, Function };

// A type of control: a row of the one table that the store, the running form, the form maker and the command line
// read. A new type is a row here and a widget in forms/ui/control_widget.cpp.
struct ControlTypeDef {
    ControlType type;
    Str title;                // "Edit Box"
    std::u16string_view stem; // of the names of new ones
    unsigned traits;
    SourceKind source;
    quint32 windowStyle; // of a new one
    int width;           // likewise, in the form's pixels
    int height;
};

std::span<const ControlTypeDef> ControlTypes();
// A number without a meaning is a control that shows its name and does nothing.
const ControlTypeDef& TypeOf(ControlType type);

inline bool Has(ControlType type, ControlTrait trait)
{
    return (TypeOf(type).traits & trait) != 0;
}
inline SourceKind SourceKindOf(ControlType type)
{
    return TypeOf(type).source;
}

} // namespace mirel
