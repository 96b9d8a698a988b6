#include "provider/conversion.h"

#include "provider/dialect/column_value.h"

namespace mirel {

Hr ConvertForColumn(const Value& value, FieldType type, int size, Value& converted)
{
    return dialect::ConvertValue(value, type, size, converted);
}

} // namespace mirel
