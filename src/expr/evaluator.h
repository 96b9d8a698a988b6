#pragma once

#include "expr/expr_node.h"
#include "platform/value.h"

#include <QDateTime>
#include <QString>

namespace mirel {

// What an expression is evaluated against: the current record of a result, and the controls of a form. Positions
// count from 0.
class EvalContext {
public:
    EvalContext() { ColumnsChanged(); }
    virtual ~EvalContext() = default;
    Q_DISABLE_COPY_MOVE(EvalContext)

    // Comes before each evaluation: what was lent to earlier ones may now be given up.
    virtual void BeginEvaluation() {}

    virtual qint64 Position() = 0;    // -1: there is no current record
    virtual qint64 RecordCount() = 0; // -1: there is no result at all, and field names are unknown names

    // The column that a field name means, brackets as written; -1: none. Asked once for each name of a tree, until
    // ColumnsChanged.
    virtual int FindColumn(QStringView name) = 0;
    virtual FieldType TypeOfColumn(int column) = 0;
    // Null without a current record. Good until BeginEvaluation.
    virtual const Value& FieldValue(int column) = 0;

    virtual QStringView YesNoWord(bool truth) = 0;
    // The text that a form's control shows; empty text for a control that is not there.
    virtual QString ControlText(QStringView name) = 0;
    virtual QDateTime Now() { return QDateTime::currentDateTime(); }

    quint64 ColumnsId() const { return columnsId_; }

protected:
    // For the deriving class, once the result is another: trees then look their names up again.
    void ColumnsChanged();

private:
    quint64 columnsId_ = 0; // never that of another set of columns, of this context or any other
};

void WriteDateText(ExprNode& node); // for TextOf

// Evaluates the tree and leaves the value in `root`. True when root is a condition and holds; for WHERE, when its
// condition holds.
bool EvaluateExpression(EvalContext& context, ExprNode& root);

// The node's value as text; empty for a number. Good until the next evaluation.
inline QStringView TextOf(ExprNode& node)
{
    if (!node.isText || node.null)
        return {};
    if (node.dateTextDue)
        WriteDateText(node);
    return node.valueText;
}

// The value as a form shows it: nothing for null and for a value whose WHERE did not hold, a number by
// ExprNumberText.
QString ShownText(ExprNode& node);

} // namespace mirel
