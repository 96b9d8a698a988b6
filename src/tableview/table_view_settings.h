#pragma once

#include "platform/yes_no_words.h"

namespace mirel {

// What the user chose for the record grid.
struct TableViewSettings {
    static constexpr int kNoColumnLimit = -1;

    int maxColumnChars = 50; // longest text in a cell of the grid; kNoColumnLimit: none
    bool confirmDelete = true;
    bool sortByHeader = false;
    int holdTimeMs = 400; // how long a hold takes to open the popup menu; 0 or less: it never does
    bool autoSizing = true;
    bool leadingNumber = false; // a typed number is what its text begins with, not the whole of it
    YesNoWords words;

    friend bool operator==(const TableViewSettings&, const TableViewSettings&) = default;
};

} // namespace mirel
