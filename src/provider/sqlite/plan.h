#pragma once

#include "provider/dialect/schema.h"
#include "provider/provider.h"

#include <QByteArray>
#include <QString>

#include <optional>
#include <variant>
#include <vector>

namespace mirel::sqlite {

// A statement of the dialect, parsed, checked against the schema and written for SQLite: what the planner
// (planner.h) hands to the cursors and to the structure changes. All SQL here is UTF-8, names in brackets,
// literals quoted; where a text has a place for parameters it says so.

// One table of a FROM clause.
struct PlannedSource {
    QString table;    // its name in the schema
    QByteArray alias; // how the SQL below calls it, ready to use: "[T]", "[t0]"
    QByteArray rowId; // its row id, ready to use: "[t0].rowid"; empty when the table has none
};

struct PlannedOrder {
    QByteArray expression; // without the sort key function
    bool isText = false;   // by the user's language, case ignored, ties by exact text; else as SQLite compares
    bool descending = false;
};

// A SELECT in pieces, so that a cursor can ask for keys, for one record, for a range of row ids.
struct SelectPlan {
    std::vector<ResultField> fields;
    std::vector<QByteArray> columns; // an SQL expression a field
    std::vector<PlannedSource> sources;
    QByteArray from;  // behind FROM, joins included
    QByteArray where; // behind WHERE; empty: none
    QByteArray group; // "GROUP BY … HAVING …" or empty
    std::vector<PlannedOrder> order;
    bool distinct = false;
    bool keyed = true;        // false: DISTINCT, GROUP BY, aggregates, expressions only, a source without row ids
    int updatableSource = -1; // the one source that all columns come from and that can be written; -1: none
};

// INSERT, UPDATE … SET, DELETE FROM: complete SQL.
struct ChangePlan {
    QByteArray sql;
    QString table;
};

struct ColumnDefinition {
    QString name;
    FieldType type = FieldType::None;
    int size = 0; // Text and VarBinary
};

struct CreateDatabase {
    QString path;
};
struct DropDatabase {
    QString path;
};
struct CreateTable {
    QString table;
    std::vector<ColumnDefinition> columns;
};
struct DropTable {
    QString table;
};
struct RenameTable {
    QString table;
    QString newName;
};
struct AddColumn {
    QString table;
    ColumnDefinition column;
};
struct DropColumn {
    QString table;
    QString column;
};
struct RenameColumn {
    QString table;
    QString column;
    QString newName;
};
struct MoveColumn {
    QString table;
    QString column;
    QString before;
};
struct CreateIndex {
    QString table;
    QString index;
    std::vector<std::pair<QString, bool>> columns; // name, descending
    bool unique = false;
};
struct DropIndex {
    QString table;
    QString index;
};

using StructurePlan = std::variant<CreateTable, DropTable, RenameTable, AddColumn, DropColumn, RenameColumn,
                                   MoveColumn, CreateIndex, DropIndex>;
using Plan = std::variant<SelectPlan, ChangePlan, StructurePlan, CreateDatabase, DropDatabase>;

struct PlanFailure {
    Hr code = Hr::SyntaxError;
    QString context; // for people: the place and what stands there; empty where the code says all
};

using PlanResult = std::variant<Plan, PlanFailure>;

// Parses, checks and writes one statement, or the bare name of a table. Never longer than the text asks for:
// depth and size are bounded, and what is over the bounds is a SyntaxError.
PlanResult PlanStatement(QStringView statement, const dialect::Schema& schema);

// CREATE DATABASE and DROP DATABASE are the only statements that need no schema; anything else is a failure.
PlanResult PlanDatabaseStatement(QStringView statement);

// The order of `order` as an SQL clause, sort keys by the function kSortKeyFunction; empty without terms.
QByteArray OrderClause(const std::vector<PlannedOrder>& order);

// Functions of ours that written SQL uses; the engine registers them on every handle (functions.h).
inline constexpr const char* kSortKeyFunction = "mirel_sortkey"; // (text) -> blob; NULL stays NULL
inline constexpr const char* kDateFunction = "mirel_date";       // (any) -> our stored date text, or NULL
inline constexpr const char* kLikeFunction = "mirel_like";       // (text, pattern) -> 0, 1 or NULL: "%" alone
                                                                 // is a wildcard, case ignored

} // namespace mirel::sqlite
