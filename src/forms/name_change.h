#pragma once

#include <QString>

namespace mirel {

// A name of a database that becomes another.
struct NameChange {
    enum class What { Table, Field, Query, Form };

    What what = What::Table;
    QString table; // of a field
    QString from;
    QString to;

    friend bool operator==(const NameChange&, const NameChange&) = default;
};

} // namespace mirel
