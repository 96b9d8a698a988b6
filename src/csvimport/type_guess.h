#pragma once

#include "csvimport/import_column.h"
#include "expr/date_format.h"

#include <string_view>

namespace mirel {

// Finds the type that can hold every text of a file's column without loss: Yes/No (nothing but 0 and 1), Integer,
// Double, DateTime, Text or Memo. Numbers written with leading zeros or a plus sign are codes, and so texts; so is
// a number with more digits than a Double keeps. Dates are those of the file's format, or all of them ISO dates.
class TypeGuess {
public:
    explicit TypeGuess(const DateFormat& dates, char16_t decimal = u'.')
        : dates_(dates)
        , decimal_(decimal)
    {
    }

    void Add(std::string_view text);
    // Type, size and date format of a field for the texts so far; a Text of 255 when all were empty. The name is
    // left to the caller.
    ImportColumn Column() const;

    // Whether the texts are numbers with a decimal comma, and could not be read with a point: "1,5", and not only
    // "1,234", which others write for 1234.
    bool HasDecimalComma() const { return mayBeComma_ && isSurelyComma_; }
    // Whether they are numbers that have a decimal point.
    bool HasDecimalPoint() const { return mayBeDouble_ && !mayBeInteger_; }
    // The column once the file is known to use the decimal comma.
    void TakeDecimalComma() { decimal_ = u','; }
    bool IsEmpty() const { return empty_; }
    qsizetype LongestText() const { return longest_; } // in UTF-16 units

private:
    void NarrowComma(std::string_view text);
    void NarrowNumbers(std::string_view text);
    void NarrowDate(std::string_view text);

    DateFormat dates_;
    char16_t decimal_;
    bool empty_ = true; // no text yet
    bool mayBeYesNo_ = true;
    bool mayBeInteger_ = true;
    bool mayBeDouble_ = true;
    bool mayBeComma_ = true;
    bool isSurelyComma_ = false;
    bool mayBeDate_ = true; // in the file's format
    bool mayBeIsoDate_ = true;
    qsizetype longest_ = 0; // in UTF-16 units
};

} // namespace mirel
