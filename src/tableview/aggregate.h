#pragma once

#include "data/db_recordset.h"

#include <QString>

#include <optional>

namespace mirel {

// The numbers are those of the menu's entries.
enum class Aggregate : int { Sum = 1, Max = 2, Min = 3, Avg = 4 };

// Whether the values of such a field can be summed up.
constexpr bool CanAggregate(FieldType type)
{
    return IsNumber(type);
}

struct AggregateResult {
    double value = 0;
    qint64 values = 0;               // how many were taken; NULL is left out
    std::optional<qint64> whole = 0; // the value to the last digit, while all that was taken is whole and fits

    // As people read it: whole numbers without a point, others with up to six decimals and no trailing zeros. A
    // sum or average of no value is 0, a greatest or smallest one the empty text.
    QString Text(Aggregate kind) const;
};

// Walks all records of the result; the current one stays where it is. Empty when the walk failed, the recordset's
// last result then says why; and when `progress` ended it, which is no failure.
std::optional<AggregateResult> RunAggregate(DbRecordset& result, int field, Aggregate kind,
                                            const BulkProgress& progress = {});

} // namespace mirel
