#pragma once

#include "csvimport/import_column.h"
#include "expr/date_format.h"

#include <string_view>

namespace mirel {

// Finds the type that can hold every text of a file's column without loss: Integer, Double, DateTime, Text or
// Memo. Numbers written with leading zeros or a plus sign are codes, and so texts; so is a number with
// more digits than a Double keeps. Dates are those of the file's format, or all of them ISO dates.
class TypeGuess {
public:
    explicit TypeGuess(const DateFormat& dates)
        : dates_(dates)
    {
    }

    void Add(std::string_view text);
    // Type, size and date format of a field for the texts so far; a Text of 255 when all were empty. The name is
    // left to the caller.
    ImportColumn Column() const;

private:
    void NarrowNumber(std::string_view text);
    void NarrowDate(std::string_view text);

    DateFormat dates_;
    bool empty_ = true; // no text yet
    bool mayBeInteger_ = true;
    bool mayBeDouble_ = true;
    bool mayBeDate_ = true; // in the file's format
    bool mayBeIsoDate_ = true;
    qsizetype longest_ = 0; // in UTF-16 units
};

} // namespace mirel
