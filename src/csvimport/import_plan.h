#pragma once

#include "csvimport/cell_reader.h"
#include "csvimport/csv_format.h"
#include "csvimport/import_column.h"
#include "platform/user_prompt.h"
#include "resources/string_table.h"

#include <QString>
#include <QStringList>

#include <vector>

namespace mirel {

// Everything that defines one import.
struct ImportPlan {
    CsvFormat format;
    QString table;         // its bare name
    ImportColumns columns; // of the file, in order; the last takes the rest of each line
    CellReader::LongTexts longTexts = CellReader::LongTexts::Cut;
    // Fields that name a record: a line whose key is there already changes that record, others are added. The
    // later of two lines with one key wins; a line that leaves a field of the key empty is added. Empty: all are
    // added.
    QStringList key{};
    // Where lines that fail are written as they are in the file, and the run goes on; empty: it ends at the first.
    QString skipTo{};
};

// How many records a keyed import adds and changes.
struct KeyCounts {
    qint64 added = 0;
    qint64 updated = 0;

    friend bool operator==(const KeyCounts&, const KeyCounts&) = default;
};

// The outcome. Everything that was left out is reported.
struct ImportReport {
    bool keyed = false;
    bool skips = false;
    qint64 records = 0;       // added to the table
    qint64 updated = 0;       // changed, by their keys
    qint64 skipped = 0;       // lines that failed
    qint64 cutTexts = 0;      // longer than CellReader::kMaxTextUnits
    qint64 cutNumbers = 0;    // texts that held more than a number
    bool stopped = false;     // the user stopped it
    bool otherCounts = false; // the table or the file is not what was counted: nothing was written

    // Whether the run did anything worth a message.
    bool DidSomething() const { return records > 0 || updated > 0 || skipped > 0; }
    // The messages: the number of records, and what was left out.
    UserMessage Count() const;
    std::vector<UserMessage> Warnings() const;
};

} // namespace mirel
