#pragma once

#include <QtGlobal>

namespace mirel::dialect {

// Where a piece stands in the statement, from 0. It is for messages and no part of what a statement says: two
// trees that differ in it alone are equal.
struct Place {
    qsizetype begin = 0;
    qsizetype end = 0; // just behind it

    friend bool operator==(const Place&, const Place&) { return true; }
};

} // namespace mirel::dialect
