#pragma once

#include "csvimport/cell_reader.h"
#include "csvimport/csv_format.h"
#include "csvimport/import_column.h"
#include "platform/user_prompt.h"

#include <QIODevice>

#include <optional>

namespace mirel {

// What is known of a file already; Detect finds the rest.
struct CsvGiven {
    std::optional<char16_t> separator;
    std::optional<char16_t> quote;
    std::optional<bool> doubledQuotes;
    std::optional<bool> namesInFirstLine;
    std::optional<QString> encoding;
    std::optional<DateFormat> dates;
    std::optional<char16_t> decimal;
};

enum class LineEnds { None, Lf, CrLf, Cr, Mixed };

// How a file is written and what is in it.
struct CsvFound {
    CsvFormat format;
    ImportColumns columns; // of a new table that keeps every text of the file
    CellReader::LongTexts longTexts = CellReader::LongTexts::Cut;
    LineEnds lineEnds = LineEnds::None;
    qint64 records = 0;      // the header left out
    qint64 failingLines = 0; // that are no text in the encoding

    friend bool operator==(const CsvFound&, const CsvFound&) = default;
};

// Finds out how a file is written: the separator, quotation mark and header from its beginning, the encoding,
// types and sizes from the whole of it. Dates that several orders read are taken in the order of the file's other
// dates, else in the user's own.
//
// The device is open for reading and can be read from its beginning as often as needed. False when it cannot be
// read, holds no text, or the user stopped it; all but the last was told. `found` is then unchanged.
[[nodiscard]] bool DetectCsv(QIODevice& file, const CsvGiven& given, CsvFound& found, UserPrompt& prompt);

} // namespace mirel
