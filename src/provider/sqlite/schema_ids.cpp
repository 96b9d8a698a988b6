#include "provider/sqlite/schema_ids.h"

namespace mirel::sqlite {

int SchemaIds::IdOf(const QString& key)
{
    int& id = ids_[key];
    if (id == 0)
        id = ++last_;
    return id;
}

void SchemaIds::Move(const QString& key, const QString& newKey)
{
    if (const int id = ids_.take(key); id != 0)
        ids_[newKey] = id;
}

void SchemaIds::RenameTable(const QString& table, const QString& newName)
{
    const QString fieldsOf = KeyOf(table, {});
    for (const QString& key : ids_.keys()) {
        if (key.startsWith(fieldsOf))
            Move(key, KeyOf(newName, key.mid(fieldsOf.size())));
    }
    Move(table, newName);
}

} // namespace mirel::sqlite
