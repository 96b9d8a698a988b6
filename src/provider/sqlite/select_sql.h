#pragma once

#include "provider/sqlite/plan.h"

#include <QByteArray>

#include <span>

namespace mirel::sqlite {

// The statements that the cursors make of a SELECT plan.

// The expressions of those fields, by commas.
QByteArray ColumnList(const SelectPlan& plan, std::span<const int> fields);
// The row ids of all sources, by commas.
QByteArray RowIdList(const SelectPlan& plan);

// " WHERE …" of the plan's condition and `further`, either of which may be empty.
QByteArray WhereClause(const SelectPlan& plan, const QByteArray& further = {});

// " ORDER BY …": the plan's order, then the row ids, so that equal records stand the same way each time.
QByteArray KeyedOrder(const SelectPlan& plan);

// The whole SELECT as it was written.
QByteArray WholeSelect(const SelectPlan& plan);

} // namespace mirel::sqlite
