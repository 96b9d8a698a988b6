#include "provider/cell_value.h"

#include "platform/ole_date.h"

#include <limits>
#include <optional>

namespace mirel {
namespace {

Value ValueOfInteger(qint64 number, FieldType type)
{
    if (type == FieldType::YesNo)
        return Value::Bool(number != 0);
    if (type == FieldType::SmallInt && number == qint16(number))
        return Value::SmallInt(qint16(number));
    constexpr qint64 kExact = qint64(1) << 53; // up to here a double has a number of its own for each
    if (type == FieldType::Double && number >= -kExact && number <= kExact)
        return Value::Double(double(number));
    return Value::Whole(number);
}

} // namespace

Value ValueOfCell(const Cell& cell, FieldType type)
{
    switch (cell.kind) {
    case Cell::Kind::Null:
        break;
    case Cell::Kind::Integer:
        return ValueOfInteger(cell.integer, type);
    case Cell::Kind::Real:
        return Value::Double(cell.real);
    case Cell::Kind::Text:
        if (type == FieldType::Date) {
            if (const std::optional<double> days = OleDateFromStored(cell.bytes))
                return Value::Date(*days);
        }
        return Value::Text(QString::fromUtf8(cell.bytes.data(), qsizetype(cell.bytes.size())));
    case Cell::Kind::Binary:
        return Value::Binary(QByteArray(cell.bytes.data(), qsizetype(cell.bytes.size())));
    }
    return Value::Null();
}

} // namespace mirel
