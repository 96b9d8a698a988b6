#pragma once

#include "data/db_connection.h"
#include "platform/hr.h"
#include "platform/user_prompt.h"
#include "platform/value.h"

#include <QString>

#include <optional>

namespace mirel {

// What a change of its field means for a field's values.
struct ValuesAtStake {
    qint64 values = 0;  // that are not NULL
    qint64 altered = 0; // of these: would read differently if the change were taken back
    qint64 unfit = 0;   // of these: the new type or size does not take
    Hr fault = Hr::Ok;  // of the first unfit one
    QString firstUnfit; // its text
};

// What becomes of one value as the file stores it (a date as its stored text).
enum class ValueFate { Same, Altered, Unfit };
ValueFate FateOfValue(const Value& stored, FieldType from, FieldType to, int size, Hr& fault);

// Looks at all values of the field. Empty when they cannot be read, which was reported, or the user stopped it.
std::optional<ValuesAtStake> SurveyConversion(DbConnection& connection, const DatabaseLocation& database,
                                              const QString& table, const QString& field, FieldType to, int size,
                                              UserPrompt& prompt, Progress& progress);

// How many values the field holds, how many records the table; -1 when that cannot be read, which was reported.
qint64 CountValues(DbConnection& connection, const DatabaseLocation& database, const QString& table,
                   const QString& field, UserPrompt& prompt);
qint64 CountRecords(DbConnection& connection, const DatabaseLocation& database, const QString& table,
                    UserPrompt& prompt);

} // namespace mirel
