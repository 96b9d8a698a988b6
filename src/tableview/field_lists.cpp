#include "tableview/field_lists.h"

#include "data/catalog.h"
#include "data/db_recordset.h"
#include "data/provider_error.h"

#include <algorithm>

namespace mirel {

FieldLists::FieldLists(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt)
    : connection_(connection)
    , database_(std::move(database))
    , prompt_(prompt)
{
}

const QStringList& FieldLists::Tables()
{
    if (!tablesRead_)
        tablesRead_ = Catalog(connection_, prompt_).ListTables(database_, tables_);
    return tables_;
}

const std::vector<FieldLists::Field>& FieldLists::FieldsOf(const QString& table)
{
    const auto known = fields_.constFind(table);
    if (known != fields_.constEnd())
        return *known;
    std::vector<Field> fields;
    DbRecordset records(connection_);
    const QString source = table.startsWith(u'[') ? table : u'[' + table + u']';
    if (records.Open(source, database_, CursorType::ForwardOnly, LockType::ReadOnly)) {
        for (const ResultField& field : records.Fields())
            fields.push_back({field.name, field.type});
    } else {
        ReportProviderError(prompt_, &records, records.LastResult());
    }
    return *fields_.insert(table, std::move(fields));
}

FieldType FieldLists::TypeOf(const QString& table, const QString& field)
{
    const std::vector<Field>& fields = FieldsOf(table);
    const auto found = std::ranges::find(fields, field, &Field::name);
    return found == fields.end() ? FieldType::None : found->type;
}

} // namespace mirel
