#pragma once

#include "csvimport/csv_reader.h"
#include "csvimport/import_plan.h"
#include "provider/provider.h"

#include <QIODevice>

#include <span>
#include <vector>

namespace mirel {

// Why a line cannot become a record.
struct LineFailure {
    QString why;
    qint64 line = 0; // from 1
    int column = -1; // of the file, from 0; -1: the line as a whole

    friend bool operator==(const LineFailure&, const LineFailure&) = default;
};

// The lines of a file as the cells of a plan's fields, one by one. The header is left out.
class ImportLines {
public:
    // `fields`: those that the plan fills, in the order of its columns. File and plan outlive the lines.
    ImportLines(QIODevice& file, const ImportPlan& plan, std::span<const ResultField> fields);

    enum class Result { Record, Failed, End };
    // Nothing more is to be read after End, nor after Failed unless StepOver succeeds.
    [[nodiscard]] Result Next();

    std::span<const Cell> Cells() const { return cells_; } // good until the next call
    std::span<const std::string_view> Texts() const { return reader_.Texts(); }
    qint64 Line() const { return reader_.Line(); }
    qint64 BytesConsumed() const { return reader_.BytesConsumed(); }
    const LineFailure& Failure() const { return failure_; }

    // Says of the current record that the table refused it, in a field of the plan (-1: no single one).
    void Refuse(const QString& why, int field);
    // Gives the failing line up. False where nothing more can be read.
    [[nodiscard]] bool StepOver();
    // The failing line with its line end, in the file's encoding; after StepOver.
    QByteArray RawLine();
    // The byte-order mark that a file of such lines needs.
    QByteArray ByteOrderMark() const;

    void CountWhatWasCut(ImportReport& report) const;

private:
    struct Target {
        size_t column; // of the file
        CellReader reader;
    };
    Result ReadCells();

    QIODevice& file_;
    const ImportPlan& plan_;
    CsvReader reader_;
    std::vector<Target> targets_; // in the order of the fields
    std::vector<Cell> cells_;
    LineFailure failure_;
    bool started_ = false;
};

// The names of the fields that a plan fills, in order.
QStringList FieldsToFill(const ImportColumns& columns);

} // namespace mirel
