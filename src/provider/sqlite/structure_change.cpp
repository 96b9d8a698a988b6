#include "provider/sqlite/structure_change.h"

#include "provider/dialect/column_types.h"
#include "provider/sqlite/schema_reader.h"
#include "provider/sqlite/sql_writer.h"
#include "provider/sqlite/table_rebuild.h"
#include "provider/sqlite/transaction.h"

#include <algorithm>

namespace mirel::sqlite {
namespace {

using dialect::Index;
using dialect::Table;

QByteArray ColumnClause(const ColumnDefinition& column)
{
    return QuoteName(column.name) + ' ' + dialect::ColumnTypeText(column).toUtf8();
}

// Runs the statements of each change; the transaction around them is the caller's.
class StructureChanger {
public:
    explicit StructureChanger(DatabaseFile& file)
        : file_(file)
    {
    }

    Outcome operator()(const CreateTable& create);
    Outcome operator()(const DropTable& drop) { return file_.Execute("DROP TABLE " + QuoteName(drop.table)); }
    Outcome operator()(const RenameTable& rename);
    Outcome operator()(const AddColumn& add);
    Outcome operator()(const DropColumn& drop);
    Outcome operator()(const RenameColumn& rename);
    Outcome operator()(const MoveColumn& move);
    Outcome operator()(const CreateIndex& create);
    Outcome operator()(const DropIndex& drop);

private:
    const Table* FindTable(const QString& name) const { return file_.Schema().FindTable(name); }
    Outcome Rename(const QString& table, const QString& newName);
    Outcome RenameIndexes(const std::vector<Index>& indexes, const RenameTable& rename);
    Outcome Drop(const Index& index) { return file_.Execute("DROP INDEX " + QuoteName(index.storedName)); }

    DatabaseFile& file_;
};

Outcome StructureChanger::operator()(const CreateTable& create)
{
    QByteArray columns;
    for (const ColumnDefinition& column : create.columns)
        columns += (columns.isEmpty() ? "" : ",") + ColumnClause(column);
    return file_.Execute("CREATE TABLE " + QuoteName(create.table) + " (" + columns + ')');
}

Outcome StructureChanger::Rename(const QString& table, const QString& newName)
{
    return file_.Execute("ALTER TABLE " + QuoteName(table) + " RENAME TO " + QuoteName(newName));
}

Outcome StructureChanger::operator()(const RenameTable& rename)
{
    const std::vector<Index> indexes = FindTable(rename.table)->indexes;
    Outcome outcome;
    QString from = rename.table;
    if (dialect::SameName(rename.table, rename.newName)) { // the engine takes another spelling for a second table
        from = rename.newName + QStringLiteral(" (renamed)");
        outcome = Rename(rename.table, from);
    }
    if (outcome.Ok())
        outcome = Rename(from, rename.newName);
    return outcome.Ok() ? RenameIndexes(indexes, rename) : outcome;
}

// An index bears its table's name in front of its own. It cannot be renamed, only made again.
Outcome StructureChanger::RenameIndexes(const std::vector<Index>& indexes, const RenameTable& rename)
{
    const std::vector<dialect::Column> columns = FindTable(rename.table)->columns;
    for (const Index& index : indexes) {
        if (index.storedName == index.name) // named by others
            continue;
        if (Outcome outcome = Drop(index); !outcome.Ok())
            return outcome;
        CreateIndex again{rename.newName, index.name, {}, index.unique};
        for (const Index::Part& part : index.parts)
            again.columns.emplace_back(columns[size_t(part.column)].name, part.descending);
        if (Outcome outcome = (*this)(again); !outcome.Ok())
            return outcome;
    }
    return {};
}

Outcome StructureChanger::operator()(const AddColumn& add)
{
    return file_.Execute("ALTER TABLE " + QuoteName(add.table) + " ADD COLUMN " + ColumnClause(add.column));
}

Outcome StructureChanger::operator()(const DropColumn& drop)
{
    const Table& table = *FindTable(drop.table);
    const auto position = int(table.FindColumn(drop.column) - table.columns.data());
    for (const Index& index : table.indexes) {
        if (!std::ranges::count(index.parts, position, &Index::Part::column))
            continue;
        if (Outcome outcome = Drop(index); !outcome.Ok())
            return outcome;
    }
    return file_.Execute("ALTER TABLE " + QuoteName(drop.table) + " DROP COLUMN " + QuoteName(drop.column));
}

Outcome StructureChanger::operator()(const RenameColumn& rename)
{
    return file_.Execute("ALTER TABLE " + QuoteName(rename.table) + " RENAME COLUMN " + QuoteName(rename.column) +
                         " TO " + QuoteName(rename.newName));
}

Outcome StructureChanger::operator()(const MoveColumn& move)
{
    const Table& table = *FindTable(move.table);
    const auto from = size_t(table.FindColumn(move.column) - table.columns.data());
    const auto before = size_t(table.FindColumn(move.before) - table.columns.data());
    return from == before ? Outcome() : MoveColumnByRebuild(file_, table, from, before);
}

Outcome StructureChanger::operator()(const CreateIndex& create)
{
    QByteArray parts;
    for (const auto& [column, descending] : create.columns)
        parts += (parts.isEmpty() ? "" : ",") + QuoteName(column) + (descending ? " DESC" : "");
    return file_.Execute((create.unique ? "CREATE UNIQUE INDEX " : "CREATE INDEX ") +
                         QuoteName(StoredIndexName(create.table, create.index)) + " ON " +
                         QuoteName(create.table) + " (" + parts + ')');
}

Outcome StructureChanger::operator()(const DropIndex& drop)
{
    return Drop(*FindTable(drop.table)->FindIndex(drop.index));
}

void KeepIds(SchemaIds& ids, const StructurePlan& plan)
{
    if (const auto* table = std::get_if<RenameTable>(&plan))
        ids.RenameTable(table->table, table->newName);
    if (const auto* column = std::get_if<RenameColumn>(&plan))
        ids.RenameField(column->table, column->column, column->newName);
}

} // namespace

Outcome ChangeStructure(DatabaseFile& file, const StructurePlan& plan)
{
    WriteTransaction transaction(file);
    Outcome outcome = transaction.Begin();
    if (outcome.Ok())
        outcome = std::visit(StructureChanger(file), plan);
    if (outcome.Ok())
        outcome = transaction.Commit();
    if (!outcome.Ok())
        return outcome;
    KeepIds(file.Ids(), plan);
    std::visit([&file](const auto& change) { file.NoteChange(change.table); }, plan);
    return {};
}

} // namespace mirel::sqlite
