#pragma once

#include "data/db_recordset.h"
#include "platform/user_prompt.h"
#include "tableview/csv_export.h"

#include <QString>
#include <QStringList>

#include <vector>

namespace mirel {

// An export as the user puts it together: which records, into which file, written how. Opens the records as a
// result of its own. Connection and prompt must outlive it.
class ExportDraft {
public:
    struct Field {
        QString name;
        QString type;      // its display name
        QString firstData; // what the first record holds
    };

    ExportDraft(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt);

    // False, with no source, when the provider refuses the statement, which is told.
    bool SetSource(const QString& statement);
    const QString& Source() const { return statement_; }
    qint64 RecordCount() { return records_.IsOpen() ? records_.RecordCount() : 0; }
    std::vector<Field> Fields() const;

    // A name without an ending gets its kind's. Asks when the file exists; false: the path before stays.
    bool ChoosePath(const QString& path);
    const QString& Path() const { return path_; }

    CsvExportOptions& Options() { return options_; }
    const CsvExportOptions& Options() const { return options_; }
    QStringList Preview() { return records_.IsOpen() ? PreviewCsv(records_, options_) : QStringList(); }

    // What is written, and with it the ending of a path that was chosen for another kind.
    bool SetKind(ExportKind kind); // false: a file of that name is to stay, and the path is forgotten
    static QString EndingOf(ExportKind kind);

    // There is something to write, and a file for it.
    bool CanRun() { return RecordCount() > 0 && !path_.isEmpty(); }
    // Writes the file and tells how many records it holds. False: it was not written, and why was told.
    bool Run(ExportFunction write = ExportCsv);

private:
    DbRecordset records_;
    DatabaseLocation database_;
    UserPrompt& prompt_;
    QString statement_;
    QString path_;
    CsvExportOptions options_;
};

} // namespace mirel
