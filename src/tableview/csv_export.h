#pragma once

#include "data/db_recordset.h"
#include "platform/user_prompt.h"
#include "tableview/csv_writer.h"

#include <QStringList>

#include <optional>

class QIODevice;

namespace mirel {

struct CsvExportResult {
    enum class Ending {
        Complete,
        Stopped,     // by the user: the records before that are written
        ReadFailed,  // the recordset's last result says why
        WriteFailed, // the device's error says why
    };

    Ending ending = Ending::Complete;
    qint64 records = 0; // written, the header line not counted
};

// Writes all records of an open result, in its order, to an open device, as the options' kind says (a document as
// CSV). The current record stays where it is. `progress` may be null; it counts records.
CsvExportResult ExportCsv(DbRecordset& source, const CsvExportOptions& options, QIODevice& device,
                          Progress* progress);

// What writes the records of a result: ExportCsv, or what the window has for documents.
using ExportFunction = CsvExportResult (*)(DbRecordset& source, const CsvExportOptions& options, QIODevice& device,
                                           Progress* progress);

enum class OnStop { KeepWritten, Discard };

struct CsvTarget {
    QString path;
    QString database; // whose records these are: the one file that an export never replaces
    OnStop onStop = OnStop::KeepWritten;
    ExportFunction write = ExportCsv;
};

// The same into a file, with progress and the messages of its end. An existing file is replaced in one step once
// the new one is whole, or, when the user stops it and the target says so, holds what was written up to there.
// Gives the number of records; empty: nothing was written, why was told, and the file is as it was before.
std::optional<qint64> ExportCsvFile(DbRecordset& source, const CsvExportOptions& options, const CsvTarget& target,
                                    UserPrompt& prompt);

// The first lines of the file that ExportCsv would write, at most `maxLines`, and a line "....." when there are
// more records than that.
QStringList PreviewCsv(DbRecordset& source, const CsvExportOptions& options, int maxLines = 10);

} // namespace mirel
