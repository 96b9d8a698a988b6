#pragma once

#include "resources/string_id.h"

#include <span>
#include <string_view>

namespace mirel {

// A row of the table of texts, in English.
struct StringRow {
    Str id;
    int counted;              // the argument, from 1, whose number decides on the form of the text; 0: none
    std::u16string_view one;  // the form for 1, where a number decides
    std::u16string_view text; // the form for all others
};

std::span<const StringRow> StringRows(); // by rising numbers
const StringRow* FindStringRow(Str id);  // null: no such row

} // namespace mirel
