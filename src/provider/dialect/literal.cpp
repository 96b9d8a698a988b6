#include "provider/dialect/literal.h"

#include "platform/ole_date.h"
#include "platform/user_locale.h"
#include "provider/dialect/column_value.h"

#include <QLocale>

namespace mirel::dialect {
namespace {

Value ValueOf(const Expr& literal)
{
    switch (literal.operation) {
    case Operation::True:
    case Operation::False:
        return Value::Bool(literal.operation == Operation::True);
    case Operation::Number:
        // As text, which is read to the last digit where the number is needed, and stored as it was written
        // by a text column.
    case Operation::Text:
        return Value::Text(literal.text);
    default:
        return Value::Null();
    }
}

void Become(Expr& literal, Operation operation, FieldType type, QString text = {})
{
    literal.operation = operation;
    literal.type = type;
    literal.text = std::move(text);
}

QString StoredText(double oleDays)
{
    const std::optional<StoredDate> stored = StoredDateOf(oleDays);
    return stored ? QString::fromLatin1(stored->Text().data(), stored->length) : QString();
}

QString NumberText(const Value& value)
{
    const std::optional<qint64> whole = value.WholeNumber();
    return whole ? QString::number(*whole) : QString::number(value.Number(), 'g', QLocale::FloatingPointShortest);
}

void BecomeValue(Expr& literal, FieldType type, const Value& value)
{
    switch (value.Tag()) {
    case ValueTag::SmallInt:
    case ValueTag::Integer:
    case ValueTag::Double:
        if (literal.operation != Operation::Number) // else it stays as it was written
            Become(literal, Operation::Number, type, NumberText(value));
        break;
    case ValueTag::Date:
        Become(literal, Operation::Date, type, StoredText(value.Number()));
        break;
    case ValueTag::Text:
        Become(literal, Operation::Text, type, value.ToText());
        break;
    case ValueTag::Bool:
        Become(literal, value.ToBool() ? Operation::True : Operation::False, type);
        break;
    case ValueTag::Empty:
    case ValueTag::Null:
    case ValueTag::Binary:
        break;
    }
    literal.type = type;
}

// A number as a date is its day number.
Value DateSource(const Expr& literal)
{
    double days = 0;
    if (literal.operation != Operation::Number || Failed(ReadNumber(literal.text, days)))
        return ValueOf(literal);
    return Value::Double(days);
}

Hr Convert(Expr& literal, FieldType type, int size)
{
    Value converted;
    const Value value = type == FieldType::Date ? DateSource(literal) : ValueOf(literal);
    const Hr hr = ConvertValue(value, type, size, converted);
    if (!Failed(hr))
        BecomeValue(literal, type, converted);
    return hr;
}

} // namespace

Hr FitLiteral(Expr& expression, FieldType type)
{
    if (!IsLiteral(expression.operation) || expression.operation == Operation::Null)
        return Hr::Ok;
    const bool isDate = expression.operation == Operation::Date; // read before, as something else asked for it
    if (IsBinary(type) || (IsText(type) && TypeOfLiteral(expression) == FieldType::YesNo) ||
        (isDate && (IsNumber(type) || type == FieldType::YesNo))) {
        return Hr::BadComparison;
    }
    if (type == FieldType::None || isDate)
        return Hr::Ok;
    // A comparison has no range: 3.5 and 99999 are fair things to compare a small integer with.
    if (IsInteger(type))
        type = FieldType::Double;
    if (expression.operation == Operation::Number && (type == FieldType::Double || type == FieldType::YesNo)) {
        if (type == FieldType::YesNo && expression.text == u"-1") // true, as many databases count
            Become(expression, Operation::True, FieldType::YesNo);
        return Hr::Ok;
    }
    return Convert(expression, type, -1);
}

Hr StoreLiteral(Expr& expression, FieldType type, int size)
{
    if (!IsLiteral(expression.operation) || expression.operation == Operation::Null)
        return Hr::Ok;
    return Convert(expression, type, size);
}

FieldType TypeOfLiteral(const Expr& expression)
{
    switch (expression.operation) {
    case Operation::True:
    case Operation::False:
        return FieldType::YesNo;
    case Operation::Number: {
        bool isInteger = false;
        (void)expression.text.toInt(&isInteger);
        return isInteger ? FieldType::Integer : FieldType::Double;
    }
    case Operation::Text:
        return FieldType::Memo;
    case Operation::Date:
        return FieldType::Date;
    default:
        return FieldType::None;
    }
}

} // namespace mirel::dialect
