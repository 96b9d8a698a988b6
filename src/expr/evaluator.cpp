#include "expr/evaluator.h"

#include "expr/evaluation.h"
#include "expr/expr_number.h"
#include "expr/operators.h"
#include "platform/ole_date.h"
#include "platform/user_locale.h"

#include <atomic>

namespace mirel {
namespace {

void ResolveColumn(ExprNode& node, EvalContext& context)
{
    node.column = context.FindColumn(node.text);
    node.columnType = node.column < 0 ? FieldType::None : context.TypeOfColumn(node.column);
    node.columnsId = context.ColumnsId();
}

// A column of no type takes the type of what it holds. A text in a column of another type does not
// convert to that type, so it stays a text.
FieldType TypeToRead(FieldType columnType, const Value& value)
{
    if (columnType != FieldType::None && value.Tag() != ValueTag::Text)
        return columnType;
    switch (value.Tag()) {
    case ValueTag::SmallInt:
    case ValueTag::Integer:
        return FieldType::Integer;
    case ValueTag::Double:
        return FieldType::Double;
    case ValueTag::Date:
        return FieldType::Date;
    case ValueTag::Bool:
        return FieldType::YesNo;
    case ValueTag::Text:
        return FieldType::Text;
    case ValueTag::Binary:
    case ValueTag::Empty:
    case ValueTag::Null:
        break;
    }
    return FieldType::None;
}

void ReadValue(ExprNode& node, const Value& value, EvalContext& context)
{
    if (value.IsNull()) {
        SetNull(node);
        return;
    }
    switch (TypeToRead(node.columnType, value)) {
    case FieldType::SmallInt:
    case FieldType::Integer:
    case FieldType::Double:
        if (const std::optional<qint64> whole = value.WholeNumber())
            SetWholeNumber(node, *whole);
        else
            SetNumber(node, value.Number());
        return;
    case FieldType::Date:
        SetDate(node, value.Number());
        return;
    case FieldType::YesNo: {
        const bool truth = value.Number() != 0;
        SetText(node, context.YesNoWord(truth));
        node.valueNumber = truth ? 1 : 0;
        return;
    }
    case FieldType::Text:
    case FieldType::Memo:
        SetText(node, value.TextView());
        return;
    case FieldType::None:
    case FieldType::VarBinary:
    case FieldType::LongBinary:
        node.buffer.Assign(VariantText(value));
        KeepBuffer(node);
        return;
    }
}

bool IsNumeric(FieldType type)
{
    return type == FieldType::SmallInt || type == FieldType::Integer || type == FieldType::Double;
}

// Numbers and texts, which walks mostly meet, are read off the cell; a Value tells the rest.
void ReadCell(ExprNode& node, const Cell& cell, EvalContext& context)
{
    const bool takesNumber = IsNumeric(node.columnType) || node.columnType == FieldType::None;
    if (cell.kind == Cell::Kind::Null) {
        SetNull(node);
    } else if (cell.kind == Cell::Kind::Integer && takesNumber) {
        SetWholeNumber(node, cell.integer);
    } else if (cell.kind == Cell::Kind::Real && takesNumber) {
        SetNumber(node, cell.real);
    } else if (cell.kind == Cell::Kind::Text && node.columnType != FieldType::Date) {
        node.buffer.AssignUtf8(cell.bytes);
        KeepBuffer(node);
    } else if (cell.kind == Cell::Kind::Binary) {
        SetText(node, {});
    } else {
        ReadValue(node, context.FieldValue(node.column), context);
    }
}

// A control's text counts as a number when it is made of digits with at most one point and a leading minus.
bool LooksLikeNumber(QStringView text)
{
    if (text.startsWith(u'-'))
        text = text.sliced(1);
    int digits = 0;
    int points = 0;
    for (const QChar c : text) {
        if (c >= u'0' && c <= u'9')
            ++digits;
        else if (c != u'.' || ++points > 1)
            return false;
    }
    return digits > 0;
}

QStringView WithoutQuotes(QStringView text)
{
    const bool quoted = text.size() >= 2 && (text.front() == u'\'' || text.front() == u'"');
    return quoted && text.back() == text.front() ? text.sliced(1, text.size() - 2) : text;
}

} // namespace

void EvalContext::ColumnsChanged()
{
    static std::atomic<quint64> last = 0;
    columnsId_ = ++last;
}

void EvaluateField(ExprNode& node, Evaluation& evaluation)
{
    EvalContext& context = evaluation.context;
    if (node.columnsId != context.ColumnsId())
        ResolveColumn(node, context);
    if (node.column < 0) {
        SetText(node, {}); // an unknown name is an empty text, but with no record there is no value at all
        node.null = context.Position() < 0 && context.RecordCount() == 0;
        return;
    }
    if (const Cell* cell = context.FieldCell(node.column))
        ReadCell(node, *cell, context);
    else
        ReadValue(node, context.FieldValue(node.column), context);
    // Only what reads as a date is one.
    if (node.columnType != FieldType::Date || node.null)
        node.fieldType = node.columnType;
}

void EvaluateControl(ExprNode& node, Evaluation& evaluation)
{
    node.buffer.Assign(evaluation.context.ControlText(node.text));
    const QStringView text = TrimmedSpaces(node.buffer.View());
    if (LooksLikeNumber(text))
        SetNumber(node, LeadingDecimal(text));
    else
        SetText(node, WithoutQuotes(text));
}

bool EvaluateExpression(EvalContext& context, ExprNode& root)
{
    context.BeginEvaluation();
    Evaluation evaluation{context};
    Evaluate(root, evaluation);
    TextOf(root);
    if (root.kind != NodeKind::Condition)
        return false;
    return root.code == OpCode::Where ? !root.suppressed : Holds(root);
}

void WriteDateText(ExprNode& node)
{
    node.buffer.Assign(UserLocale::Current().DateTimeText(node.valueNumber));
    node.valueText = node.buffer.View();
    node.dateTextDue = false;
}

ExprNumberChars NumberChars(const ExprNode& node)
{
    return node.wholeNumber != 0 ? ExprNumberChars(node.wholeNumber) : ExprNumberChars(node.valueNumber);
}

QString ShownText(ExprNode& node)
{
    if (node.null || node.suppressed)
        return {};
    return node.isText ? TextOf(node).toString() : QString(NumberChars(node).Text());
}

void SetDate(ExprNode& node, std::optional<double> oleDays)
{
    if (!oleDays || !PartsOfOleDate(*oleDays)) {
        SetNull(node);
        return;
    }
    SetText(node, {});
    node.valueNumber = *oleDays;
    node.fieldType = FieldType::Date;
    node.dateTextDue = true; // most dates are only compared or counted: their text is slow to make
}

} // namespace mirel
