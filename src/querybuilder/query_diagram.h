#pragma once

#include <QString>
#include <QStringList>

#include <optional>
#include <vector>

namespace mirel {

class FieldLists;

enum class Total { None, Group, Count, Sum, Average, Minimum, Maximum };
enum class ColumnOrder { None, Ascending, Descending };

struct DiagramTable {
    QString table;
    QString alias; // empty: none

    const QString& Source() const { return alias.isEmpty() ? table : alias; }
    friend bool operator==(const DiagramTable&, const DiagramTable&) = default;
};

// Two fields that are equal. Tables are named by their source names.
struct DiagramJoin {
    QString left;
    QString leftField;
    QString right;
    QString rightField;
    bool allOfLeft = false; // also the records of `left` without a match

    friend bool operator==(const DiagramJoin&, const DiagramJoin&) = default;
};

// A line of the grid: a field or an expression, with what is asked of it.
struct DiagramColumn {
    QString expression; // as a statement writes it
    QString alias{};    // empty: none
    Total total = Total::None;
    bool shown = true;
    ColumnOrder sort = ColumnOrder::None;
    int rank = 0;              // among the sorted ones
    bool sortsByAlias = false; // ORDER BY names it by its alias
    QString condition{};       // "> 5"; a bare value is compared with "="

    friend bool operator==(const DiagramColumn&, const DiagramColumn&) = default;
};

// A SELECT as a drawing: tables, the joins between them, and a grid of fields. It reads what it can write, and
// says so when a statement has more: nothing is ever left out silently. Positions count from 0.
class QueryDiagram {
public:
    // Empty: the statement does not parse, is no SELECT, or says what a drawing cannot.
    static std::optional<QueryDiagram> Read(const QString& statement);
    // Empty while there is no table.
    QString Statement() const;

    const std::vector<DiagramTable>& Tables() const { return tables_; }
    const std::vector<DiagramJoin>& Joins() const { return joins_; }
    const std::vector<DiagramColumn>& Columns() const { return columns_; }
    // The conditions that belong to no single field.
    const QString& OtherConditions() const { return other_; }
    void SetOtherConditions(const QString& conditions) { other_ = conditions; }

    // Adds a table and proposes its join with one that is there: by two fields of the same name and type. A table
    // that is there already comes a second time under an alias.
    void AddTable(const QString& table, FieldLists& lists);
    void RemoveTable(const QString& source); // with its joins and fields

    void AddJoin(const DiagramJoin& join); // replaces the one between the same fields
    void SetJoin(size_t join, bool allOfLeft);
    void TurnJoin(size_t join); // left and right change places
    void RemoveJoin(size_t join);

    // How the statement refers to a field of a table.
    static QString Reference(const QString& source, const QString& field);
    bool Shows(const QString& source, const QString& field) const;
    void Show(const QString& source, const QString& field, bool shown);

    void SetColumn(size_t column, const DiagramColumn& changed); // a sort that begins comes last
    void RemoveColumn(size_t column);
    void MoveColumn(size_t from, size_t to);

    friend bool operator==(const QueryDiagram&, const QueryDiagram&) = default;

private:
    friend class DiagramReader;

    QString FromClause() const;
    QStringList Conditions(bool ofTotals) const;
    bool HasTotals() const;
    bool IsGrouped(const DiagramColumn& column) const;
    const DiagramTable* Find(const QString& source) const;

    std::vector<DiagramTable> tables_;
    std::vector<DiagramJoin> joins_;
    std::vector<DiagramColumn> columns_;
    QString other_;
    bool distinct_ = false;
};

// The join that two tables suggest: two fields of the same name and type, of several the one that looks like a
// key. Empty: none.
std::optional<DiagramJoin> ProposedJoin(const DiagramTable& left, const DiagramTable& right, FieldLists& lists);

} // namespace mirel
