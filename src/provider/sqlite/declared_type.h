#pragma once

#include "platform/field_type.h"

#include <QString>

namespace mirel::sqlite {

struct DeclaredType {
    FieldType type = FieldType::Memo;
    int size = -1;    // characters of a Text, bytes of a VarBinary
    bool own = false; // one of the clauses that this system writes

    friend bool operator==(const DeclaredType&, const DeclaredType&) = default;
};

// What a column's declared type is to this system: our own clauses exactly, others as the nearest. A column
// without a type may hold anything and is a Memo.
DeclaredType ReadDeclaredType(QStringView declared);

} // namespace mirel::sqlite
