#pragma once

#include "provider/dialect/expression_checker.h"

namespace mirel::dialect {

// Holds statements against a schema and completes them in place: "*" becomes the columns it stands for, terms
// of GROUP BY and ORDER BY that name a result column become its expression, the values of INSERT and SET
// become what their columns store, names take the schema's spelling.
//
// The schema must outlive the checker, and what it hands out.
class StatementChecker {
public:
    explicit StatementChecker(const Schema& schema)
        : schema_(schema)
    {
    }

    [[nodiscard]] bool Check(Select& select);
    [[nodiscard]] bool Check(Insert& insert); // afterwards it has as many columns as values
    [[nodiscard]] bool Check(Update& update);
    [[nodiscard]] bool Check(Delete& remove);

    // Of the statement checked last: its tables in the order of FROM, or the one that it changes.
    const std::vector<Source>& Sources() const { return sources_; }
    bool IsAggregated() const { return aggregated_; } // a SELECT with GROUP BY or aggregates
    const Failure& Fault() const { return failure_; }

private:
    enum class NameOrder : quint8 { ColumnsFirst, ResultsFirst };

    bool AddSource(const QString& name, const QString& alias, bool optional);
    bool AddTarget(const QString& name);
    bool CheckFrom(Select& select);
    bool ExpandColumns(Select& select);
    bool ExpandAll(const Expr& star, std::vector<SelectColumn>& columns);
    bool CheckGroup(Select& select);
    bool CheckOrder(Select& select);
    bool CheckGrouping(const Select& select);
    bool IsGrouped(const Expr& expression, const std::vector<Expr>& group);
    bool NameResultColumn(Expr& term, const Select& select, NameOrder order, bool& named);
    bool CheckTargetColumn(ColumnName& name, const Column*& column);
    bool CheckValue(const Column& column, Expr& value, const std::vector<Source>& sources);
    bool CheckDistinctNames(std::vector<QString> names);
    bool CheckExpression(Expr& expression, ExpressionChecker::Aggregates aggregates);
    bool CheckWhere(std::optional<Expr>& where);
    bool Fail(Hr code, QString context = {});

    const Schema& schema_;
    std::vector<Source> sources_;
    bool aggregated_ = false;
    size_t copied_ = 0; // nodes that stand-ins for names have cost
    Failure failure_;
};

} // namespace mirel::dialect
