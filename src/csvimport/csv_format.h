#pragma once

#include "expr/date_format.h"

#include <QString>

namespace mirel {

// How a delimited text file is written: the user's settings for an import. Characters are single UTF-16
// units of the basic plane, 0 is none.
struct CsvFormat {
    char16_t separator = u',';
    char16_t quote = u'"'; // a text that starts and ends with it loses both
    // A quotation mark inside a quoted text is doubled, and a quoted text may hold line ends: as most other
    // programs write. Without it a quoted text ends at the first mark before a separator or the line's end, and
    // marks inside are kept.
    bool doubledQuotes = false;
    bool namesInFirstLine = false;
    bool dropNuls = false;   // NUL characters are left out; without it they fail their line
    char16_t decimal = u'.'; // of Doubles; with "," numbers may be grouped by "."
    DateFormat dates;
    QString encoding = QStringLiteral("UTF-8"); // a byte-order mark of UTF-16 or UTF-32 overrules UTF-8

    friend bool operator==(const CsvFormat&, const CsvFormat&) = default;
};

} // namespace mirel
