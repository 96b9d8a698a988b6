#pragma once

#include <QtGlobal>

#include <string_view>

namespace mirel {

// One value of a record as the store holds it, borrowed: what bulk work (import, export, page fills, sums)
// passes along without making a QString or a Value of it.
//
// A text is UTF-8. A date is the text of its stored form ("2001-07-04", "2001-07-04 09:05:00", with a fraction
// of a second where there is one), whatever form the file itself uses. A Yes/No is the integer 0 or 1.
//
// `bytes` points into what handed the cell over, and is good until that call returns or the record is left.
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
