#pragma once

#include "provider/sqlite/plan.h"

#include <gtest/gtest.h>

namespace mirel::dialect {

// Items and Orders are plain tables; Old has dates in foreign forms, Odd names that need care, Seen is a view.
inline Column MakeColumn(const QString& name, FieldType type, int size = 0, bool foreignDates = false)
{
    return {name, type, size, 0, foreignDates};
}

inline Table MakeTable(const QString& name, std::vector<Column> columns)
{
    Table table;
    table.name = table.storedName = name;
    table.columns = std::move(columns);
    table.rowId = "rowid";
    return table;
}

inline Schema TestSchema()
{
    using namespace Qt::StringLiterals;
    Schema schema;
    schema.tables.push_back(MakeTable(
        u"Items"_s,
        {MakeColumn(u"Name"_s, FieldType::Text, 10), MakeColumn(u"Qty"_s, FieldType::Integer),
         MakeColumn(u"Small"_s, FieldType::SmallInt), MakeColumn(u"Price"_s, FieldType::Double),
         MakeColumn(u"Made"_s, FieldType::Date), MakeColumn(u"Sold"_s, FieldType::YesNo),
         MakeColumn(u"Note"_s, FieldType::Memo, -1), MakeColumn(u"Photo"_s, FieldType::LongBinary, -1)}));
    schema.tables.back().indexes.push_back({u"ByQty"_s, u"Items.ByQty"_s, {{1, false}}, false});
    schema.tables.push_back(MakeTable(u"Orders"_s, {MakeColumn(u"Item"_s, FieldType::Text, 10),
                                                    MakeColumn(u"Qty"_s, FieldType::Integer),
                                                    MakeColumn(u"Ship To"_s, FieldType::Text, 40)}));
    schema.tables.push_back(MakeTable(
        u"Old"_s, {MakeColumn(u"Day"_s, FieldType::Date, 0, true), MakeColumn(u"Name"_s, FieldType::Text, 20)}));
    schema.tables.push_back(MakeTable(u"Order Details"_s, {MakeColumn(u"a]b"_s, FieldType::Integer)}));
    Table catalog = MakeTable(u"MSysTables"_s, {MakeColumn(u"TableName"_s, FieldType::Text, 255),
                                                MakeColumn(u"TableID"_s, FieldType::Integer)});
    catalog.storedName = u"catalog_tables"_s;
    catalog.rowId.clear();
    catalog.writable = false;
    catalog.isSystem = true;
    schema.tables.push_back(catalog);
    Table view = MakeTable(u"Seen"_s, {MakeColumn(u"Name"_s, FieldType::Text, 10)});
    view.rowId.clear();
    view.writable = false;
    schema.tables.push_back(view);
    return schema;
}

} // namespace mirel::dialect
