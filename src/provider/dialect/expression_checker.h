#pragma once

#include "provider/dialect/failure.h"
#include "provider/dialect/schema.h"
#include "provider/dialect/tree.h"

#include <vector>

namespace mirel::dialect {

// The tables that an expression can name.
struct Source {
    const Table* table;
    QString name; // in the statement: the alias, or the table's own name

    bool optional = false; // the right side of a LEFT JOIN
};

// Finds the columns of an expression, gives every node its type, and reads literals as the type of what they
// are compared with. Works on the tree in place; the sources must outlive the checker.
class ExpressionChecker {
public:
    enum class Aggregates : quint8 { Refused, Allowed };

    explicit ExpressionChecker(const std::vector<Source>& sources)
        : sources_(sources)
    {
    }

    [[nodiscard]] bool Check(Expr& expression, Aggregates aggregates);
    // The same for one that has to hold or not.
    [[nodiscard]] bool CheckCondition(Expr& expression, Aggregates aggregates);

    bool SawAggregate() const { return sawAggregate_; } // since it was made
    const Failure& Fault() const { return failure_; }

    enum class Lookup : quint8 { Found, Missing, Ambiguous };
    Lookup FindColumn(Expr& column) const;

private:
    bool CheckNode(Expr& expression, bool aggregatesAllowed);
    bool CheckOperation(Expr& expression);
    bool CheckColumn(Expr& expression);
    bool CheckCall(Expr& expression);
    bool CheckArgument(Expr& argument, ArgumentKind kind);
    bool CheckLike(Expr& expression);
    bool CheckSum(Expr& expression);
    bool CheckArithmetic(Expr& expression);
    bool CheckJoining(Expr& expression);
    bool CheckTruth(const Expr& operand);
    bool Compare(Expr& left, Expr& right);
    bool CompareWithFirst(Expr& expression);
    bool Keep(Hr hr);
    bool Fail(Hr code, QString context = {});

    const std::vector<Source>& sources_;
    Failure failure_;
    bool sawAggregate_ = false;
};

} // namespace mirel::dialect
