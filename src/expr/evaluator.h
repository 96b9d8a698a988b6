#pragma once

#include "expr/expr_node.h"
#include "expr/expr_number.h"
#include "platform/cell.h"
#include "platform/value.h"

#include <QDateTime>
#include <QString>

namespace mirel {

// What an expression reads: the current record of a result, and the controls of a form. Positions count
// from 0.
class EvalContext {
public:
    EvalContext() { ColumnsChanged(); }
    virtual ~EvalContext() = default;
    Q_DISABLE_COPY_MOVE(EvalContext)

    // Called before each evaluation, which ends the loans of earlier ones.
    virtual void BeginEvaluation() {}

    virtual qint64 Position() = 0;    // -1: no current record
    virtual qint64 RecordCount() = 0; // -1: no result, so every field name is unknown

    // The column of a field name, brackets as written; -1: none. Called once for each name of a tree until
    // ColumnsChanged.
    virtual int FindColumn(QStringView name) = 0;
    virtual FieldType TypeOfColumn(int column) = 0;
    // Null without a current record. Valid until BeginEvaluation.
    virtual const Value& FieldValue(int column) = 0;
    // The same value as the store lends it, for walks over many records. Null when the context only has Values.
    // Valid until BeginEvaluation.
    virtual const Cell* FieldCell(int /*column*/) { return nullptr; }

    virtual QStringView YesNoWord(bool truth) = 0;
    // The text that a form's control shows; empty for a missing control.
    virtual QString ControlText(QStringView name) = 0;
    virtual QDateTime Now() { return QDateTime::currentDateTime(); }

    quint64 ColumnsId() const { return columnsId_; }

protected:
    // For the derived class, when it has a new result: trees then look up their names again.
    void ColumnsChanged();

private:
    quint64 columnsId_ = 0; // unique to this set of columns, across all contexts
};

void WriteDateText(ExprNode& node); // for TextOf

// Evaluates the tree and leaves the value in `root`. True when root is a condition and holds; for WHERE, when its
// condition holds.
bool EvaluateExpression(EvalContext& context, ExprNode& root);

// The node's value as text; empty for a number. Valid until the next evaluation.
inline QStringView TextOf(ExprNode& node)
{
    if (!node.isText || node.null)
        return {};
    if (node.dateTextDue)
        WriteDateText(node);
    return node.valueText;
}

// The digits of a node whose value is a number.
ExprNumberChars NumberChars(const ExprNode& node);

// The value as a form shows it: empty for null and for a value whose WHERE did not hold; numbers as NumberChars
// writes them.
QString ShownText(ExprNode& node);

} // namespace mirel
