#pragma once

#include "platform/yes_no_words.h"

namespace mirel {

// What the user chose for running forms.
struct FormViewSettings {
    static constexpr int kNoColumnLimit = -1;

    bool confirmDelete = true;
    bool confirmSave = true;        // ask before changes are left behind
    bool saveAsThirdAnswer = false; // and offer to save them there
    bool updateAggregate = false;   // recompute aggregates after each saved change
    int scrollPixels = 10;          // of Scroll Up and Scroll Down
    int maxColumnChars = 50;        // longest text in a list's cell; kNoColumnLimit: none
    int holdTimeMs = 400;           // how long a hold takes to open the popup menu; 0 or less: it never does
    bool sortByHeader = false;      // a tap on a header of the view's list of records sorts it, too
    bool fitToWindow = true;        // scale the form to its window; otherwise its pixels are the window's
    YesNoWords words;

    friend bool operator==(const FormViewSettings&, const FormViewSettings&) = default;
};

} // namespace mirel
