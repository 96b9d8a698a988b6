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
    if (type != FieldType::Double && number == qint32(number))
        return Value::Integer(qint32(number));
    return Value::Double(double(number));
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
