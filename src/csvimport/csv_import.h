#pragma once

#include "csvimport/csv_format.h"
#include "csvimport/import_plan.h"
#include "data/db_connection.h"
#include "platform/user_prompt.h"

#include <QIODevice>
#include <QString>
#include <QStringList>

#include <optional>

namespace mirel {

// The texts of the file's first line.
[[nodiscard]] bool ReadFirstLine(QIODevice& file, const CsvFormat& format, QStringList& texts, UserPrompt& prompt);

// Reads the whole file and gives each column the type that takes all of its texts; the names are those of the
// first line, or Field1, Field2, … False when the file cannot be read or the user stopped it.
[[nodiscard]] bool GuessColumns(QIODevice& file, const CsvFormat& format, ImportColumns& columns,
                                UserPrompt& prompt);

// Makes a record of each line of the file, in the plan's table, as one transaction. It ends at the first line that
// fails, unless the plan skips such lines: the failure is reported with line and column, and the records before
// that line stay. It ends the same way, without a message, when the user stops it. False when a line ended it or
// nothing was written.
//
// With a key the file is read twice, so it must be one that can be; a key that names several records is reported
// and nothing is written. `confirmed` are the counts that the user has agreed to: with others nothing is written,
// and the report says so.
[[nodiscard]] bool ImportCsv(DbConnection& connection, const DatabaseLocation& database, QIODevice& file,
                             const ImportPlan& plan, UserPrompt& prompt, ImportReport& report,
                             const std::optional<KeyCounts>& confirmed = {});

} // namespace mirel
