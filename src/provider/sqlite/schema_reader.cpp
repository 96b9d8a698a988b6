#include "provider/sqlite/schema_reader.h"

#include "provider/sqlite/cedb_care.h"
#include "provider/sqlite/database_file.h"
#include "provider/sqlite/declared_type.h"
#include "provider/sqlite/sql_writer.h"
#include "provider/sqlite/system_tables.h"

#include <algorithm>
#include <functional>

namespace mirel::sqlite {

using namespace Qt::StringLiterals;

namespace {

class SchemaReader {
public:
    SchemaReader(DatabaseFile& file, dialect::Schema& schema)
        : file_(file)
        , schema_(schema)
    {
    }

    Outcome Read();

private:
    Outcome ForEachRow(const QByteArray& sql, const std::function<void(const Statement&)>& row);
    Outcome ReadColumns(dialect::Table& table);
    Outcome ReadIndexes(dialect::Table& table);
    Outcome ReadParts(dialect::Index& index);
    void ChooseRowId(dialect::Table& table) const;
    // Exactly so: a file may have a table of its own whose name differs in the case of a letter.
    bool IsCatalogName(const QString& name) const
    {
        return name == QLatin1StringView(kBelongingsTable) ||
               std::ranges::find(schema_.tables, name, &dialect::Table::name) != schema_.tables.end();
    }

    DatabaseFile& file_;
    dialect::Schema& schema_;
    bool isOurs_ = false; // written by this system: its dates are in our form
};

// Whether the name comes back as the bytes it was read from.
bool IsText(const Statement& row, int column)
{
    const auto* bytes = reinterpret_cast<const char*>(sqlite3_column_text(row.Get(), column));
    return bytes && row.Text(column).toUtf8() == QByteArrayView(bytes);
}

Outcome SchemaReader::ForEachRow(const QByteArray& sql, const std::function<void(const Statement&)>& row)
{
    Outcome outcome;
    Statement statement = file_.Prepare(sql, outcome);
    if (!statement)
        return outcome;
    int result = statement.Step();
    for (; result == SQLITE_ROW; result = statement.Step())
        row(statement);
    return file_.OutcomeOf(result);
}

Outcome SchemaReader::Read()
{
    isOurs_ = file_.Number("PRAGMA application_id") == kApplicationId;
    AddSystemTables(schema_, file_.Ids());
    std::vector<dialect::Table> tables;
    const Outcome outcome = ForEachRow("PRAGMA main.table_list", [&](const Statement& row) {
        enum { Schema, Name, Type, ColumnCount, WithoutRowId };
        const QString name = row.Text(Name);
        if (row.Text(Schema) != u"main" || !IsText(row, Name) || IsCatalogName(name) ||
            name.startsWith(u"sqlite_", Qt::CaseInsensitive)) {
            return;
        }
        dialect::Table table{name, name, file_.Ids().OfTable(name), {}, {}, {}, false, false};
        const bool isPlain = row.Text(Type) == u"table";
        table.writable = isPlain && row.Integer(WithoutRowId) == 0 && dialect::StampOfTable(name).isEmpty();
        table.isView = row.Text(Type) == u"view";
        tables.push_back(std::move(table));
    });
    if (!outcome.Ok())
        return outcome;
    std::ranges::sort(tables, {}, &dialect::Table::name);
    for (dialect::Table& table : tables) {
        // A view over what is gone has no columns; the other tables can be used all the same.
        if (!ReadColumns(table).Ok() || table.columns.empty())
            continue;
        if (table.writable)
            ChooseRowId(table);
        if (const Outcome indexes = ReadIndexes(table); !indexes.Ok())
            return indexes;
        schema_.tables.push_back(std::move(table));
    }
    return {};
}

Outcome SchemaReader::ReadColumns(dialect::Table& table)
{
    return ForEachRow("PRAGMA main.table_xinfo(" + QuoteName(table.storedName) + ')', [&](const Statement& row) {
        enum { Id, Name, Type, NotNull, Default, Key, Hidden };
        constexpr int kHiddenColumn = 1; // of a virtual table
        if (row.Integer(Hidden) == kHiddenColumn)
            return;
        const QString name = row.Text(Name);
        const DeclaredType declared = ReadDeclaredType(row.Text(Type));
        const bool foreignDates = declared.type == FieldType::Date && !(isOurs_ && declared.own);
        const bool isWide = declared.type == FieldType::Integer && !(isOurs_ && declared.own);
        const int size = isWide ? kWideIntegerSize : declared.size;
        // The engine gives an integer key its value by itself.
        const bool isKey = row.Integer(Key) != 0 && row.Text(Type).compare(u"INTEGER", Qt::CaseInsensitive) == 0;
        const bool isRequired =
            row.Integer(NotNull) != 0 && sqlite3_column_type(row.Get(), Default) == SQLITE_NULL && !isKey;
        table.columns.push_back(
            {name, declared.type, size, file_.Ids().OfField(table.name, name), foreignDates, isRequired});
    });
}

void SchemaReader::ChooseRowId(dialect::Table& table) const
{
    for (const auto* alias : {"rowid", "_rowid_", "oid"}) {
        if (!table.FindColumn(QString::fromLatin1(alias))) {
            table.rowId = alias;
            return;
        }
    }
    table.writable = false;
}

Outcome SchemaReader::ReadIndexes(dialect::Table& table)
{
    const QString prefix = StoredIndexName(table.name, {});
    Outcome outcome =
        ForEachRow("PRAGMA main.index_list(" + QuoteName(table.storedName) + ')', [&](const Statement& row) {
            enum { Sequence, Name, Unique, Origin };
            if (row.Text(Origin) != u"c" || !IsText(row, Name)) // made by a constraint: no index of its own
                return;
            const QString stored = row.Text(Name);
            const bool isOurs = stored.startsWith(prefix, Qt::CaseInsensitive) && stored.size() > prefix.size();
            table.indexes.push_back(
                {isOurs ? stored.mid(prefix.size()) : stored, stored, {}, row.Integer(Unique) != 0});
        });
    for (dialect::Index& index : table.indexes) {
        if (outcome.Ok())
            outcome = ReadParts(index);
    }
    std::ranges::sort(table.indexes, {}, &dialect::Index::name);
    return outcome;
}

Outcome SchemaReader::ReadParts(dialect::Index& index)
{
    return ForEachRow("PRAGMA main.index_xinfo(" + QuoteName(index.storedName) + ')', [&](const Statement& row) {
        enum { Sequence, Column, Name, Descending, Collation, IsKey };
        if (row.Integer(IsKey) != 0 && row.Integer(Column) >= 0) // an expression is no column
            index.parts.push_back({int(row.Integer(Column)), row.Integer(Descending) != 0});
    });
}

} // namespace

Outcome ReadSchema(DatabaseFile& file, dialect::Schema& schema)
{
    return SchemaReader(file, schema).Read();
}

QString StoredIndexName(const QString& table, const QString& index)
{
    return table + u'.' + index;
}

} // namespace mirel::sqlite
