#pragma once

#include "provider/dialect/failure.h"
#include "provider/dialect/schema.h"
#include "provider/dialect/structure.h"
#include "provider/provider.h"

#include <QByteArray>
#include <QString>

#include <optional>
#include <variant>
#include <vector>

namespace mirel::sqlite {

// A statement of the dialect, parsed, checked against the schema and written for SQLite: what the planner
// hands to the cursors and to the structure changes. All SQL here is UTF-8, names in brackets,
// literals quoted; where a text has a place for parameters it says so.

// One table of a FROM clause.
struct PlannedSource {
    QString table;         // its name in the schema
    QByteArray alias;      // how the SQL below calls it, ready to use: "[T]", "[t0]"
    QByteArray rowId;      // its row id, ready to use: "[t0].rowid"; empty when the table has none
    bool optional = false; // the right side of a LEFT JOIN: without a matching row all of it is NULL, row id too
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
    bool isAggregated = false; // groups, or a total
    bool keyed = true;         // false: DISTINCT, GROUP BY, aggregates, expressions only, a source without row ids
    // The one source that all columns come from and that can be written; -1: none. Fields without a `column`
    // (expressions over that source) cannot be written even so.
    int updatableSource = -1;
    QString readOnlyReason; // for people: why no source can be written; empty when one can
};

// INSERT, UPDATE … SET, DELETE FROM: complete SQL.
struct ChangePlan {
    QByteArray sql;
    QString table;
};

// Checked: names that exist are spelled as the schema spells them, new names are free and writable.
using dialect::AddColumn;
using dialect::ColumnDefinition;
using dialect::CreateDatabase;
using dialect::CreateIndex;
using dialect::CreateTable;
using dialect::DropColumn;
using dialect::DropDatabase;
using dialect::DropIndex;
using dialect::DropTable;
using dialect::MoveColumn;
using dialect::RenameColumn;
using dialect::RenameTable;
using StructurePlan = dialect::StructureChange;

using Plan = std::variant<SelectPlan, ChangePlan, StructurePlan, CreateDatabase, DropDatabase>;
using PlanFailure = dialect::Failure;
using PlanResult = std::variant<Plan, PlanFailure>;

// Parses, checks and writes one statement, or the bare name of a table. Never longer than the text asks for:
// depth and size are bounded, and what is over the bounds is a SyntaxError.
PlanResult PlanStatement(QStringView statement, const dialect::Schema& schema);

// CREATE DATABASE and DROP DATABASE are the only statements that need no schema; anything else is a failure.
PlanResult PlanDatabaseStatement(QStringView statement);

// The order of `order` as an SQL clause, sort keys by the function kSortKeyFunction; empty without terms.
QByteArray OrderClause(const std::vector<PlannedOrder>& order);

// How a column appears in a result.
ResultField ResultFieldOf(const dialect::Table& table, const dialect::Column& column);

// Functions of ours that written SQL uses, registered on every handle: the first three by functions.h, the
// others by dialect_functions.h.
inline constexpr const char* kSortKeyFunction = "mirel_sortkey"; // (text) -> blob; NULL stays NULL
inline constexpr const char* kDateFunction = "mirel_date";       // (any) -> our stored date text, or NULL
inline constexpr const char* kLikeFunction = "mirel_like";       // (text, pattern) -> 0, 1 or NULL: "%" alone
                                                                 // is a wildcard, case ignored

inline constexpr const char* kUpperFunction = "mirel_upper"; // (text) -> text, letters of every language
inline constexpr const char* kLowerFunction = "mirel_lower";
inline constexpr const char* kTextFunction = "mirel_text";   // (any, type) -> the value as people read it
inline constexpr const char* kStoreFunction = "mirel_store"; // (any, type, size) -> what such a column stores,
                                                             // or the statement fails: see StoreFailure

// How deep the expressions of written SQL can be at most, for sqlite3_limit.
inline constexpr int kMaxExpressionDepth = 500;

} // namespace mirel::sqlite
