#pragma once

#include "csvimport/csv_detect.h"
#include "csvimport/import_check.h"
#include "csvimport/import_plan.h"
#include "csvimport/import_source.h"
#include "data/db_connection.h"
#include "platform/user_prompt.h"

#include <QString>
#include <QStringList>

#include <memory>
#include <optional>
#include <vector>

namespace mirel {

// An import as the user puts it together: which file, how it is written, into which table, what goes where.
// Connection and prompt must outlive it.
class ImportDraft {
public:
    ImportDraft(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt);

    // Takes the source, lets Detect look at it, and names the new table after it. False when it cannot be read or
    // holds no text, which was told, or when the user stopped it: the source before stays.
    [[nodiscard]] bool Choose(const ImportSource& source);
    const ImportSource& Source() const { return source_; }
    const CsvFound& Found() const { return found_; }
    // Looks at the file once more, without regard to what was chosen. False when it cannot be done, which was
    // told.
    [[nodiscard]] bool Detect();

    const CsvFormat& Format() const { return format_; }
    void SetFormat(const CsvFormat& format) { format_ = format; }

    // The file's first records under the format, a header among them; `fault` says why one cannot be read.
    struct PreviewRow {
        QStringList texts;
        QString fault;
    };
    std::vector<PreviewRow> Preview(int mostRows = 10) const;

    enum class Destination { NewTable, ExistingTable };
    void SetDestination(Destination destination) { destination_ = destination; }
    Destination DestinationKind() const { return destination_; }
    void SetNewTable(const QString& name) { newTable_ = name; }
    const QString& NewTable() const { return newTable_; }
    void SetExistingTable(const QString& name) { existingTable_ = name; }
    const QString& ExistingTable() const { return existingTable_; }
    QStringList Tables() const; // those that are there

    // What goes where, one of each column of the file. MakeColumns sets them up for format and destination, unless
    // they are already; false when it cannot, which was told.
    [[nodiscard]] bool MakeColumns();
    ImportColumns& Columns() { return columns_; }
    const ImportColumns& Columns() const { return columns_; }
    // Of the existing table, which the columns may fill.
    const std::vector<ResultField>& TableFields() const { return tableFields_; }
    // A column of the existing table's, by its position; -1: it is ignored.
    void FillField(size_t column, int field);
    void SetKey(size_t column, bool isKey);
    bool IsKey(size_t column) const;

    void SetSkipsFailing(bool skips) { skipsFailing_ = skips; }
    bool SkipsFailing() const { return skipsFailing_; }
    // Where lines that fail are written: beside the file, under a name that is free.
    QString SkipPath() const;

    // What is wrong with a page; empty: nothing.
    std::optional<UserMessage> FaultOfFormat() const;
    std::optional<UserMessage> FaultOfDestination() const;
    std::optional<UserMessage> FaultOfColumns() const;

    // Reads the file as the import would: which lines will fail. It works on copies of what was chosen. Null when
    // the file cannot be opened.
    class Rehearsal {
    public:
        Rehearsal(std::unique_ptr<QIODevice> device, ImportPlan plan, std::span<const ResultField> fields);
        const ImportCheck& Check() const { return check_; }
        [[nodiscard]] bool Step(qint64 lines) { return check_.Step(lines); }

    private:
        std::unique_ptr<QIODevice> device_;
        ImportPlan plan_;
        ImportCheck check_;
    };
    std::unique_ptr<Rehearsal> Rehearse() const;

    // Makes the table where it is new, imports, and tells how many records that were. With a key both counts are
    // asked about first.
    enum class Outcome {
        Done,
        Failed,  // and was told; records before the failure stay
        Nothing, // was written: a failure that was told, or the user said no
    };
    Outcome Run();
    const QString& Table() const { return table_; } // that Run has filled

private:
    bool ReadTableFields();
    ImportPlan Plan() const;
    std::vector<ResultField> FieldsToBe() const;
    bool CreateTable();
    std::optional<KeyCounts> ConfirmKeys(const ImportPlan& plan, bool& told);
    bool Tell(const UserMessage& message) const;
    std::unique_ptr<QIODevice> OpenSource() const;

    DbConnection& connection_;
    DatabaseLocation database_;
    UserPrompt& prompt_;
    ImportSource source_;
    CsvFound found_;
    CsvFormat format_;
    Destination destination_ = Destination::NewTable;
    QString newTable_;
    QString existingTable_;
    ImportColumns columns_;
    std::vector<ResultField> tableFields_;
    QStringList key_;
    bool skipsFailing_ = false;
    std::optional<CsvFormat> columnsFormat_; // that the columns were made for
    QString columnsTable_;                   // the same; empty: a new one
    QString table_;
};

} // namespace mirel
