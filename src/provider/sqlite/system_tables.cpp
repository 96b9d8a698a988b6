#include "provider/sqlite/system_tables.h"

#include <QByteArray>

#include <array>
#include <variant>
#include <vector>

namespace mirel::sqlite {
namespace {

using SystemValue = std::variant<int, QByteArray>;
using SystemRow = std::vector<SystemValue>;
using SystemRows = std::vector<SystemRow>;

SystemRows RowsOfTables(const dialect::Schema& schema)
{
    SystemRows rows;
    for (const dialect::Table& table : schema.tables)
        rows.push_back({table.name.toUtf8(), table.id});
    return rows;
}

SystemRows RowsOfFields(const dialect::Schema& schema)
{
    SystemRows rows;
    for (const dialect::Table& table : schema.tables) {
        for (const dialect::Column& column : table.columns)
            rows.push_back({table.id, column.id, column.name.toUtf8()});
    }
    return rows;
}

SystemRows RowsOfIndexes(const dialect::Schema& schema)
{
    constexpr int kDescending = 1;
    constexpr int kUnique = 2;
    SystemRows rows;
    for (const dialect::Table& table : schema.tables) {
        for (const dialect::Index& index : table.indexes) {
            for (const dialect::Index::Part& part : index.parts) {
                const int flags = (part.descending ? kDescending : 0) | (index.unique ? kUnique : 0);
                const int fieldId = table.columns[size_t(part.column)].id;
                rows.push_back({table.id, fieldId, index.name.toUtf8(), flags});
            }
        }
    }
    return rows;
}

// There are no stored procedures; the table is there for those who ask.
SystemRows NoRows(const dialect::Schema&)
{
    return {};
}

struct SystemColumn {
    QStringView name; // empty: no further column
    FieldType type;
};
struct SystemTable {
    QStringView name;
    const char* module;      // the virtual table's name, which no statement of the dialect can reach
    const char* declaration; // the same columns for the engine
    std::array<SystemColumn, 4> columns;
    SystemRows (*rows)(const dialect::Schema&);
};

constexpr std::array kSystemTables = {
    SystemTable{u"MSysFields",
                "mirel_catalog_fields",
                "CREATE TABLE x(TableID INTEGER,FieldID INTEGER,FieldName TEXT)",
                {SystemColumn{u"TableID", FieldType::Integer}, SystemColumn{u"FieldID", FieldType::Integer},
                 SystemColumn{u"FieldName", FieldType::Text}},
                RowsOfFields},
    SystemTable{u"MSysIndexes",
                "mirel_catalog_indexes",
                "CREATE TABLE x(TableID INTEGER,FieldID INTEGER,IndexName TEXT,IndexFlags INTEGER)",
                {SystemColumn{u"TableID", FieldType::Integer}, SystemColumn{u"FieldID", FieldType::Integer},
                 SystemColumn{u"IndexName", FieldType::Text}, SystemColumn{u"IndexFlags", FieldType::Integer}},
                RowsOfIndexes},
    SystemTable{u"MSysProcs",
                "mirel_catalog_procs",
                "CREATE TABLE x(ProcName TEXT)",
                {SystemColumn{u"ProcName", FieldType::Text}},
                NoRows},
    SystemTable{u"MSysTables",
                "mirel_catalog_tables",
                "CREATE TABLE x(TableName TEXT,TableID INTEGER)",
                {SystemColumn{u"TableName", FieldType::Text}, SystemColumn{u"TableID", FieldType::Integer}},
                RowsOfTables},
};

// What a module is registered with.
struct ModuleContext {
    const SystemTable& table;
    const dialect::Schema& schema;
};

struct CatalogTable : sqlite3_vtab {
    explicit CatalogTable(const ModuleContext& of)
        : sqlite3_vtab{}
        , context(of)
    {
    }
    const ModuleContext& context;
};

struct CatalogCursor : sqlite3_vtab_cursor {
    CatalogCursor()
        : sqlite3_vtab_cursor{}
    {
    }
    SystemRows rows;
    size_t at = 0;
};

CatalogCursor& CursorOf(sqlite3_vtab_cursor* base)
{
    return *static_cast<CatalogCursor*>(base);
}

int Connect(sqlite3* handle, void* context, int, const char* const*, sqlite3_vtab** table, char**)
{
    const auto& of = *static_cast<ModuleContext*>(context);
    sqlite3_vtab_config(handle, SQLITE_VTAB_DIRECTONLY);
    const int result = sqlite3_declare_vtab(handle, of.table.declaration);
    if (result == SQLITE_OK)
        *table = new CatalogTable(of);
    return result;
}

int Disconnect(sqlite3_vtab* table)
{
    delete static_cast<CatalogTable*>(table);
    return SQLITE_OK;
}

// Always all rows: a catalog is small.
int BestIndex(sqlite3_vtab*, sqlite3_index_info*)
{
    return SQLITE_OK;
}

int OpenCursor(sqlite3_vtab*, sqlite3_vtab_cursor** cursor)
{
    *cursor = new CatalogCursor;
    return SQLITE_OK;
}

int CloseCursor(sqlite3_vtab_cursor* cursor)
{
    delete &CursorOf(cursor);
    return SQLITE_OK;
}

int Filter(sqlite3_vtab_cursor* base, int, const char*, int, sqlite3_value**)
{
    CatalogCursor& cursor = CursorOf(base);
    const ModuleContext& context = static_cast<CatalogTable*>(base->pVtab)->context;
    cursor.rows = context.table.rows(context.schema);
    cursor.at = 0;
    return SQLITE_OK;
}

int Next(sqlite3_vtab_cursor* base)
{
    ++CursorOf(base).at;
    return SQLITE_OK;
}

int IsAtEnd(sqlite3_vtab_cursor* base)
{
    return CursorOf(base).at >= CursorOf(base).rows.size();
}

int ColumnOf(sqlite3_vtab_cursor* base, sqlite3_context* result, int column)
{
    const SystemValue& value = CursorOf(base).rows[CursorOf(base).at][size_t(column)];
    if (const auto* text = std::get_if<QByteArray>(&value))
        sqlite3_result_text(result, text->constData(), int(text->size()), SQLITE_TRANSIENT);
    else
        sqlite3_result_int(result, std::get<int>(value));
    return SQLITE_OK;
}

int RowIdOf(sqlite3_vtab_cursor* base, sqlite3_int64* rowId)
{
    *rowId = sqlite3_int64(CursorOf(base).at) + 1;
    return SQLITE_OK;
}

// No xCreate: such a table is there under its module's name without having been created, and none can be.
constexpr sqlite3_module kModule = [] {
    sqlite3_module module{};
    module.xConnect = Connect;
    module.xBestIndex = BestIndex;
    module.xDisconnect = Disconnect;
    module.xDestroy = Disconnect;
    module.xOpen = OpenCursor;
    module.xClose = CloseCursor;
    module.xFilter = Filter;
    module.xNext = Next;
    module.xEof = IsAtEnd;
    module.xColumn = ColumnOf;
    module.xRowid = RowIdOf;
    return module;
}();

} // namespace

int RegisterSystemTables(sqlite3* handle, const dialect::Schema& schema)
{
    for (const SystemTable& table : kSystemTables) {
        auto* context = new ModuleContext{table, schema};
        const int result = sqlite3_create_module_v2(handle, table.module, &kModule, context,
                                                    [](void* kept) { delete static_cast<ModuleContext*>(kept); });
        if (result != SQLITE_OK)
            return result;
    }
    return SQLITE_OK;
}

void AddSystemTables(dialect::Schema& schema, SchemaIds& ids)
{
    for (const SystemTable& system : kSystemTables) {
        const QString name = system.name.toString();
        dialect::Table table{name, QString::fromLatin1(system.module), ids.OfTable(name), {}, {}, {}, false, true};
        for (const SystemColumn& column : system.columns) {
            if (column.name.isEmpty())
                continue;
            const QString columnName = column.name.toString();
            const int size = column.type == FieldType::Text ? kMaxTextSize : -1;
            table.columns.push_back({columnName, column.type, size, ids.OfField(name, columnName), false});
        }
        schema.tables.push_back(std::move(table));
    }
}

} // namespace mirel::sqlite
