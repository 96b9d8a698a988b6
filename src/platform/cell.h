#pragma once

#include <QtGlobal>

#include <string_view>

namespace mirel {

// One value of a record as the store holds it, borrowed. Bulk work (import, export, page fills, sums) passes it
// along without turning it into a QString or a Value.
//
// A text is UTF-8. A date is a text in its stored form ("2001-07-04", "2001-07-04 09:05:00", with the fraction of
// the second if it has one), whatever form the file itself uses. A Yes/No is the integer 0 or 1.
//
// `bytes` belongs to the source of the cell and is valid until that call returns or the record is left.
struct Cell {
    enum class Kind : quint8 { Null, Integer, Real, Text, Binary };

    Kind kind = Kind::Null;
    qint64 integer = 0;
    double real = 0;
    std::string_view bytes;

    static Cell Of(qint64 number) { return {Kind::Integer, number, 0, {}}; }
    static Cell Of(double number) { return {Kind::Real, 0, number, {}}; }
    static Cell OfText(std::string_view utf8) { return {Kind::Text, 0, 0, utf8}; }
    static Cell OfBinary(std::string_view bytes) { return {Kind::Binary, 0, 0, bytes}; }
};

} // namespace mirel
