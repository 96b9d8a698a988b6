#include "provider/dialect/structure_checker.h"

#include "resources/string_table.h"

#include <algorithm>

namespace mirel::dialect {
namespace {

// The engine keeps names that begin so for itself.
constexpr QStringView kReservedPrefix = u"sqlite_";

class StructureChecker {
public:
    explicit StructureChecker(const Schema& schema)
        : schema_(schema)
    {
    }

    bool Check(CreateTable& create);
    bool Check(DropTable& drop) { return FindTable(drop.table); }
    bool Check(RenameTable& rename);
    bool Check(AddColumn& add);
    bool Check(DropColumn& drop) { return FindTable(drop.table) && FindColumn(drop.column); }
    bool Check(RenameColumn& rename);
    bool Check(MoveColumn& move)
    {
        return FindTable(move.table) && FindColumn(move.column) && FindColumn(move.before);
    }
    bool Check(CreateIndex& create);
    bool Check(DropIndex& drop);

    const Failure& Fault() const { return failure_; }

private:
    bool FindTable(QString& name);
    bool FindColumn(QString& name);
    bool CheckNewTable(const QString& name);
    bool HasStampTable() const;
    bool Fail(Hr code, QString context = {})
    {
        failure_ = {code, std::move(context)};
        return false;
    }

    const Schema& schema_;
    const Table* table_ = nullptr;
    Failure failure_;
};

bool StructureChecker::FindTable(QString& name)
{
    table_ = schema_.FindTable(name);
    if (!table_)
        return Fail(Hr::NoSuchTable);
    name = table_->name;
    const std::optional<Failure> refused = RefuseChange(*table_);
    return !refused || Fail(refused->code, refused->context);
}

bool StructureChecker::FindColumn(QString& name)
{
    const Column* column = table_->FindColumn(name);
    if (!column)
        return Fail(Hr::NoSuchColumn);
    name = column->name;
    return true;
}

bool StructureChecker::CheckNewTable(const QString& name)
{
    if (const Table* other = schema_.FindTable(name); other && other != table_)
        return Fail(Hr::TableExists);
    if (name.startsWith(kReservedPrefix, Qt::CaseInsensitive))
        return Fail(Hr::SyntaxError, StringText(Str::ReservedTableName, {name}));
    return true;
}

bool StructureChecker::HasStampTable() const
{
    return std::ranges::any_of(schema_.tables,
                               [](const Table& table) { return !StampOfTable(table.name).isEmpty(); });
}

bool StructureChecker::Check(CreateTable& create)
{
    if (!CheckNewTable(create.table))
        return false;
    // A database gets its stamp once: a second one would cut it off from its forms and queries.
    if (!StampOfTable(create.table).isEmpty() && HasStampTable())
        return Fail(Hr::AccessDenied, StringText(Str::StampTableIsGuarded, {create.table}));
    if (create.columns.size() > kMaxColumns)
        return Fail(Hr::TooManyColumns);
    for (auto column = create.columns.begin(); column != create.columns.end(); ++column) {
        const bool twice = std::any_of(create.columns.begin(), column, [&](const ColumnDefinition& other) {
            return SameName(other.name, column->name);
        });
        if (twice)
            return Fail(Hr::DuplicateColumn);
    }
    return true;
}

bool StructureChecker::Check(RenameTable& rename)
{
    if (!FindTable(rename.table) || !CheckNewTable(rename.newName))
        return false;
    return StampOfTable(rename.newName).isEmpty() ||
           Fail(Hr::AccessDenied, StringText(Str::StampTableIsGuarded, {rename.newName}));
}

bool StructureChecker::Check(AddColumn& add)
{
    if (!FindTable(add.table))
        return false;
    if (table_->FindColumn(add.column.name))
        return Fail(Hr::DuplicateColumn);
    return table_->columns.size() < kMaxColumns || Fail(Hr::TooManyColumns);
}

bool StructureChecker::Check(RenameColumn& rename)
{
    if (!FindTable(rename.table) || !FindColumn(rename.column))
        return false;
    const Column* other = table_->FindColumn(rename.newName);
    return !other || other->name == rename.column || Fail(Hr::DuplicateColumn); // another spelling of itself
}

bool StructureChecker::Check(CreateIndex& create)
{
    if (!FindTable(create.table))
        return false;
    if (table_->FindIndex(create.index))
        return Fail(Hr::IndexExists);
    for (auto part = create.columns.begin(); part != create.columns.end(); ++part) {
        if (!FindColumn(part->first))
            return false;
        const bool twice = std::any_of(create.columns.begin(), part,
                                       [&](const auto& other) { return other.first == part->first; });
        if (twice)
            return Fail(Hr::DuplicateColumn);
    }
    return true;
}

bool StructureChecker::Check(DropIndex& drop)
{
    if (!FindTable(drop.table))
        return false;
    const Index* index = table_->FindIndex(drop.index);
    if (!index)
        return Fail(Hr::NoSuchIndex);
    drop.index = index->name;
    return true;
}

} // namespace

std::optional<Failure> CheckStructure(StructureChange& change, const Schema& schema)
{
    StructureChecker checker(schema);
    const bool fits = std::visit([&](auto& one) { return checker.Check(one); }, change);
    return fits ? std::nullopt : std::optional(checker.Fault());
}

std::optional<Failure> RefuseChange(const Table& table)
{
    if (table.writable)
        return {};
    const bool isGuarded = table.isSystem || !StampOfTable(table.name).isEmpty();
    return Failure{isGuarded ? Hr::AccessDenied : Hr::ReadOnly, ReadOnlyReason(table)};
}

QString ReadOnlyReason(const Table& table)
{
    if (table.writable)
        return {};
    const bool isStamp = !StampOfTable(table.name).isEmpty();
    const Str reason = table.isSystem ? Str::CatalogTableIsReadOnly
                       : isStamp      ? Str::StampTableIsGuarded
                       : table.isView ? Str::ViewIsReadOnly
                                      : Str::TableHasNoRowIds;
    return StringText(reason, {table.name});
}

} // namespace mirel::dialect
