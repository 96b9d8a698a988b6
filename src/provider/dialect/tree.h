#pragma once

#include "platform/field_type.h"
#include "provider/dialect/functions.h"
#include "provider/dialect/place.h"
#include "provider/dialect/structure.h"

#include <QString>

#include <list>
#include <optional>
#include <variant>
#include <vector>

namespace mirel::dialect {

// A statement as a tree: what the parser makes, the checker completes and a writer per engine writes out.
// Plain records with a defaulted ==.

enum class Operation : quint8 {
    Null,
    True,
    False,
    Number, // `text` as written, with a leading "-" where there is one
    Text,
    Date,       // a text or number that the checker has read as a date: `text` in the stored form
    Column,     // `table` (may be empty) and `text`
    AllColumns, // "*" or "T.*" of a column list, "*" of COUNT(*)
    Or,         // two or more arguments: chains are one node
    And,        // so here
    Not,
    Equal,
    NotEqual,
    Less,
    LessEqual,
    Greater,
    GreaterEqual,
    Like,
    NotLike,
    In, // the first argument in the others
    NotIn,
    Between, // the first argument between the second and the third
    NotBetween,
    IsNull,
    IsNotNull,
    IsTrue,
    IsNotTrue,
    IsFalse,
    IsNotFalse,
    Join,   // "&": NULL counts as the empty text
    Concat, // "||"
    Add,
    Subtract,
    Multiply,
    Divide,
    Remainder,
    Negate,
    Call,
};

// How tightly an operation binds; operands that bind less stand in parentheses. In rising order.
enum class Binding : quint8 { None, Or, And, Not, Comparison, Text, Sum, Product, Sign, Operand };
Binding BindingOf(Operation operation);

// Both sides of the comparisons from Equal to GreaterEqual, and of LIKE.
constexpr bool IsComparison(Operation operation)
{
    return operation >= Operation::Equal && operation <= Operation::NotLike;
}
constexpr bool IsLiteral(Operation operation)
{
    return operation <= Operation::Date;
}

// Expressions nest at most this deep (chains of AND and of OR count once): work on them may recurse.
inline constexpr int kMaxDepth = 100;

struct Expr {
    Operation operation = Operation::Null;
    Function function = Function::Count; // of a Call
    bool distinct = false;               // of an aggregate
    int depth = 1;                       // of the tree below, this node included
    Place place;
    QString text;
    QString table;
    std::list<Expr> arguments; // a list, because chains of AND are joined without copying either part

    // What the checker finds out.
    FieldType type = FieldType::None;
    int source = -1; // of a Column: which table of FROM, and which of its columns
    int column = -1;

    friend bool operator==(const Expr&, const Expr&) = default;
};

// The words of the statement itself: they name a column without an alias, and are no part of what it says.
struct SourceText {
    QString text;

    friend bool operator==(const SourceText&, const SourceText&) { return true; }
};

struct ColumnName {
    QString table; // may be empty
    QString name;
    friend bool operator==(const ColumnName&, const ColumnName&) = default;
};

struct SelectColumn {
    Expr expression;
    QString alias;
    SourceText name; // of an expression: as it was written
    friend bool operator==(const SelectColumn&, const SelectColumn&) = default;
};

enum class JoinKind : quint8 { None, Cross, Inner, Left };

struct FromTable {
    QString table;
    QString alias;
    JoinKind join = JoinKind::None; // with the tables before it; None for the first
    std::optional<Expr> on;
    friend bool operator==(const FromTable&, const FromTable&) = default;
};

struct OrderTerm {
    Expr expression;
    bool descending = false;
    friend bool operator==(const OrderTerm&, const OrderTerm&) = default;
};

struct Select {
    bool distinct = false;
    std::vector<SelectColumn> columns;
    std::vector<FromTable> from;
    std::optional<Expr> where;
    std::vector<Expr> group;
    std::optional<Expr> having;
    std::vector<OrderTerm> order;
    friend bool operator==(const Select&, const Select&) = default;
};

struct Insert {
    QString table;
    std::vector<ColumnName> columns; // empty: all, in the table's order
    std::vector<Expr> values;
    friend bool operator==(const Insert&, const Insert&) = default;
};

struct Assignment {
    ColumnName column;
    Expr value;
    friend bool operator==(const Assignment&, const Assignment&) = default;
};

struct Update {
    QString table;
    std::vector<Assignment> assignments;
    std::optional<Expr> where;
    friend bool operator==(const Update&, const Update&) = default;
};

struct Delete {
    QString table;
    std::optional<Expr> where;
    friend bool operator==(const Delete&, const Delete&) = default;
};

// A bare name: all of that table.
struct WholeTable {
    QString table;
    friend bool operator==(const WholeTable&, const WholeTable&) = default;
};

using Statement =
    std::variant<WholeTable, Select, Insert, Update, Delete, StructureChange, CreateDatabase, DropDatabase>;

} // namespace mirel::dialect
