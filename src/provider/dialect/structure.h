#pragma once

#include "platform/field_type.h"

#include <QString>

#include <variant>
#include <vector>

namespace mirel::dialect {

// The statements that change a database's structure, as plain records. Names stand without brackets; the
// check against a schema puts in its own spelling of the names that exist.

struct ColumnDefinition {
    QString name;
    FieldType type = FieldType::None;
    int size = 0; // Text and VarBinary; 0 for the others

    friend bool operator==(const ColumnDefinition&, const ColumnDefinition&) = default;
};

struct CreateDatabase {
    QString path;
    friend bool operator==(const CreateDatabase&, const CreateDatabase&) = default;
};
struct DropDatabase {
    QString path;
    friend bool operator==(const DropDatabase&, const DropDatabase&) = default;
};
struct CreateTable {
    QString table;
    std::vector<ColumnDefinition> columns;
    friend bool operator==(const CreateTable&, const CreateTable&) = default;
};
struct DropTable {
    QString table;
    friend bool operator==(const DropTable&, const DropTable&) = default;
};
struct RenameTable {
    QString table;
    QString newName;
    friend bool operator==(const RenameTable&, const RenameTable&) = default;
};
struct AddColumn {
    QString table;
    ColumnDefinition column;
    friend bool operator==(const AddColumn&, const AddColumn&) = default;
};
struct DropColumn {
    QString table;
    QString column;
    friend bool operator==(const DropColumn&, const DropColumn&) = default;
};
struct RenameColumn {
    QString table;
    QString column;
    QString newName;
    friend bool operator==(const RenameColumn&, const RenameColumn&) = default;
};
struct MoveColumn {
    QString table;
    QString column;
    QString before;
    friend bool operator==(const MoveColumn&, const MoveColumn&) = default;
};
struct CreateIndex {
    QString table;
    QString index;
    std::vector<std::pair<QString, bool>> columns; // name, descending
    bool unique = false;
    friend bool operator==(const CreateIndex&, const CreateIndex&) = default;
};
struct DropIndex {
    QString table;
    QString index;
    friend bool operator==(const DropIndex&, const DropIndex&) = default;
};

using StructureChange = std::variant<CreateTable, DropTable, RenameTable, AddColumn, DropColumn, RenameColumn,
                                     MoveColumn, CreateIndex, DropIndex>;

} // namespace mirel::dialect
