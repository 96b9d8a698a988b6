#pragma once

#include "expr/date_format.h"
#include "platform/cell.h"
#include "platform/yes_no_words.h"
#include "provider/provider.h"
#include "tableview/date_texts.h"

#include <QByteArray>
#include <QStringEncoder>

#include <algorithm>
#include <span>
#include <string>
#include <vector>

class QIODevice;

namespace mirel {

// What an export writes. A document is made where there are fonts: in the window.
enum class ExportKind { Csv, Json, Html, Pdf };

// How an exported file is written. The defaults are those of the export dialog.
struct CsvExportOptions {
    ExportKind kind = ExportKind::Csv; // the others have no separators, marks and encodings to choose
    QChar separator = u',';
    bool header = false; // the field names in the first line
    QChar quote = u'"';  // around every text; null: none
    DateFormat dates = {DateOrder::Locale, 0, 0};
    bool doubledQuotes = false;    // a quotation mark inside a text is doubled; else it is written as it is, and
                                   // a reader of the file must cope with it
    QByteArray encoding = "UTF-8"; // what it lacks is written as "?"
    bool byteOrderMark = false;    // at the beginning; only Unicode's encodings have one
    YesNoWords words{};            // of a web page and a document
    QString title{};               // the same

    // Another order than the user's own brings "-" and ":" along where no separators were chosen yet.
    void SetDateOrder(DateOrder order);

    friend bool operator==(const CsvExportOptions&, const CsvExportOptions&) = default;
};

// Writes records as lines of a CSV file: a text in quotation marks, numbers bare, Yes/No as 1 and 0, NULL and
// what is no text (binary fields) as nothing, each line ended by CR LF.
//
// Collects what it writes and hands it to the device by the megabyte. A failing device makes the writer fail for
// good; Finish says so. Neither owns the device nor the fields, which must outlive it.
class CsvWriter {
public:
    CsvWriter(QIODevice& device, const CsvExportOptions& options, std::span<const ResultField> fields);

    static bool KnowsEncoding(const QByteArray& name);

    void WriteHeader();
    // The record's cells in the order of the fields. False once the device has failed.
    bool WriteRecord(std::span<const Cell> cells);
    // Writes what is still held back. False when anything could not be written.
    [[nodiscard]] bool Finish();

private:
    void Append(std::string_view bytes)
    {
        if (bytes.size() > pending_.size() - used_)
            pending_.resize(2 * pending_.size() + bytes.size());
        if (bytes.size() == 1) // separators and quotation marks, mostly
            pending_[used_] = bytes.front();
        else
            std::copy(bytes.begin(), bytes.end(), pending_.begin() + std::ptrdiff_t(used_));
        used_ += bytes.size();
    }
    void AppendText(std::string_view utf8);
    void AppendDate(std::string_view stored);
    void AppendCell(const Cell& cell, FieldType type);
    void EndLine();
    bool Flush();
    void WriteByteOrderMark();

    QIODevice& device_;
    CsvExportOptions options_;
    std::span<const ResultField> fields_;
    std::string separator_; // in UTF-8
    std::string quote_;     // in UTF-8; empty: none
    DateTexts dates_;
    bool plainUtf8_; // nothing to convert
    QStringEncoder encoder_;
    std::vector<char> pending_; // `used_` bytes wait for the device
    size_t used_ = 0;
    bool ok_ = true;
};

} // namespace mirel
