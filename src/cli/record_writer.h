#pragma once

#include "cli/output.h"
#include "platform/cell.h"
#include "platform/yes_no_words.h"
#include "provider/provider.h"

#include <QStringView>

#include <memory>
#include <optional>
#include <span>

namespace mirel::cli {

enum class OutputFormat { Table, Csv, Tsv, Json, JsonLines };
std::optional<OutputFormat> FormatOfName(QStringView name);

// Writes records one by one in one of the program's formats. Memory does not grow with their number: the first
// records determine the widths of a table's columns.
//
// Call Begin, then Record any number of times, then End; the fields must live until then.
class RecordWriter {
public:
    virtual ~RecordWriter() = default;

    virtual void Begin(std::span<const ResultField> fields) = 0;
    // False once the output accepts no more.
    virtual bool Record(std::span<const Cell> cells) = 0;
    virtual void End() = 0;
};

std::unique_ptr<RecordWriter> MakeRecordWriter(OutputFormat format, Output& output, const YesNoWords& words);

} // namespace mirel::cli
