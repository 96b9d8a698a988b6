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

// Writes records one after the other in one of the formats of the program. Memory does not grow with their
// number: columns of a table are as wide as its first records need them.
//
// Begin, any number of Records, End; the fields must live until then.
class RecordWriter {
public:
    virtual ~RecordWriter() = default;

    virtual void Begin(std::span<const ResultField> fields) = 0;
    // False once the output takes no more.
    virtual bool Record(std::span<const Cell> cells) = 0;
    virtual void End() = 0;
};

std::unique_ptr<RecordWriter> MakeRecordWriter(OutputFormat format, Output& output, const YesNoWords& words);

} // namespace mirel::cli
