#pragma once

#include "platform/cell.h"
#include "platform/field_type.h"
#include "platform/value.h"

namespace mirel {

Value ValueOfCell(const Cell& cell, FieldType type);

} // namespace mirel
