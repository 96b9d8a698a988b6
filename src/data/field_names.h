#pragma once

#include "platform/field_type.h"

#include <QString>
#include <QStringList>

namespace mirel {

// The names that people see for the storage types ("Text", "Memo", "Yes/No", …). False, with `name` unchanged,
// for a type without a name.
bool TypeNameOfField(FieldType type, QString& name);

// The type of that name, in any case; "Boolean" is taken beside "Yes/No". None: no type has it.
FieldType FieldTypeOfName(QStringView name);
// The names of all types, in the order of their numbers.
QStringList FieldTypeNames();

// The type clause of CREATE TABLE for such a name: exact, case counts; "Boolean" is accepted for "Yes/No"; any
// other name gives "Text", the long text. `size` matters only for "Text", which becomes Varchar(size).
QString DdlTypeOfName(QStringView name, int size);

} // namespace mirel
