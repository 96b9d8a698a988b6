#pragma once

#include "expr/date_format.h"
#include "platform/cell.h"
#include "platform/field_type.h"
#include "platform/hr.h"
#include "platform/ole_date.h"

#include <array>
#include <string_view>

namespace mirel {

// Makes cells of one field's type from the texts of a file's column, without a QString or a Value on the way. An
// empty text is NULL.
//
// A number is what stands at a text's beginning; a text that does not begin with one is BadLiteral, a number
// beyond 64 bits Overflow. With a decimal comma a Double may be grouped by points ("1.234,50"). A text is a Yes
// when it begins with an integer other than 0. A text that is neither a date of the format nor a time alone is
// BadLiteral. All other types take the text, cut after kMaxTextUnits unless it is to stay whole.
class CellReader {
public:
    static constexpr int kMaxTextUnits = 8192; // of UTF-16

    enum class LongTexts { Cut, KeepWhole };

    CellReader(FieldType type, const DateFormat& dates, LongTexts longTexts, char16_t decimal = u'.')
        : type_(type)
        , dates_(dates)
        , longTexts_(longTexts)
        , decimal_(decimal)
    {
    }

    // The cell is good until the next call and as long as the text is.
    [[nodiscard]] Hr Read(std::string_view text, Cell& cell);

    FieldType Type() const { return type_; }
    // What was left out so far: the ends of long texts, and what stood behind numbers.
    qint64 CutTexts() const { return cutTexts_; }
    qint64 CutNumbers() const { return cutNumbers_; }

private:
    Hr ReadInteger(std::string_view text, Cell& cell);
    Hr ReadDouble(std::string_view text, Cell& cell);
    Hr ReadDate(std::string_view text, Cell& cell);
    bool ReadsStoredForm(std::string_view text) const;
    void CountRest(const char* numberEnd, std::string_view text);

    FieldType type_;
    DateFormat dates_;
    LongTexts longTexts_;
    char16_t decimal_;
    StoredDate date_;
    qint64 cutTexts_ = 0;
    qint64 cutNumbers_ = 0;
};

// "2001-07-04", with an optional time "09:05", "09:05:00" or "09:05:00.25" after a blank or "T": the form that
// needs no telling. A day or a time that does not exist is none.
bool IsIsoDate(std::string_view text);

// A number with a decimal comma as the C locale writes it: "1.234,50" becomes "1234.50". Only what is at the
// text's beginning; the rest follows unchanged. False where it does not begin with such a number, or one of more
// than kMaxCommaNumber bytes.
inline constexpr size_t kMaxCommaNumber = 64;
bool ReadCommaNumber(std::string_view text, std::array<char, kMaxCommaNumber>& digits, size_t& length,
                     size_t& numberEnd);

// How many UTF-16 units the text takes.
qsizetype Utf16Length(std::string_view utf8);

} // namespace mirel
