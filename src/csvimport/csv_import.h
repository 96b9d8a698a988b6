#pragma once

#include "csvimport/cell_reader.h"
#include "csvimport/csv_format.h"
#include "csvimport/csv_reader.h"
#include "csvimport/import_column.h"
#include "data/db_connection.h"
#include "platform/user_prompt.h"
#include "resources/string_table.h"

#include <QIODevice>
#include <QString>
#include <QStringList>

namespace mirel {

// Everything that defines one import.
struct ImportPlan {
    CsvFormat format;
    QString table;         // its bare name
    ImportColumns columns; // of the file, in order; the last takes the rest of each line
    CellReader::LongTexts longTexts = CellReader::LongTexts::Cut;
};

// The outcome. Everything that was left out is reported.
struct ImportReport {
    qint64 records = 0;    // added to the table
    qint64 cutTexts = 0;   // longer than CellReader::kMaxTextUnits
    qint64 cutNumbers = 0; // texts that held more than a number
    bool stopped = false;  // the user stopped it

    // The messages: the number of records, and what was left out.
    UserMessage Count() const { return {Str::RecordsImported, {QString::number(records)}}; }
    std::vector<UserMessage> Warnings() const;
};

// The texts of the file's first line.
[[nodiscard]] bool ReadFirstLine(QIODevice& file, const CsvFormat& format, QStringList& texts, UserPrompt& prompt);

// Reads the whole file and gives each column the type that takes all of its texts; the names are those of the
// first line, or Field1, Field2, … False when the file cannot be read or the user stopped it.
[[nodiscard]] bool GuessColumns(QIODevice& file, const CsvFormat& format, ImportColumns& columns,
                                UserPrompt& prompt);

// Appends one record per line of the file to the plan's table, as one transaction. It ends at the
// first line that fails: the failure is reported with line and column, and the records before that line stay. It
// ends the same way, without a message, when the user stops it. False when a line failed or nothing was written.
[[nodiscard]] bool ImportCsv(DbConnection& connection, const DatabaseLocation& database, QIODevice& file,
                             const ImportPlan& plan, UserPrompt& prompt, ImportReport& report);

} // namespace mirel
