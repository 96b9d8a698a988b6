#include "tableview/csv_writer.h"

#include "platform/number_text.h"
#include "platform/ole_date.h"

#include <QIODevice>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr size_t kFlushSizeBytes = size_t(1) << 20;

std::string Utf8Of(QChar character)
{
    return character.isNull() ? std::string() : QString(character).toStdString();
}

} // namespace

void CsvExportOptions::SetDateOrder(DateOrder order)
{
    const DateFormat usual;
    const bool chosen = dates.dateSeparator != 0 || dates.timeSeparator != 0;
    dates.order = order;
    if (order == DateOrder::Locale || chosen)
        return;
    dates.dateSeparator = usual.dateSeparator;
    dates.timeSeparator = usual.timeSeparator;
}

CsvWriter::CsvWriter(QIODevice& device, const CsvExportOptions& options, std::span<const ResultField> fields)
    : device_(device)
    , options_(options)
    , fields_(fields)
    , separator_(Utf8Of(options.separator))
    , quote_(Utf8Of(options.quote))
    , dates_(options.dates)
    , plainUtf8_(options.encoding.compare("UTF-8", Qt::CaseInsensitive) == 0)
    , encoder_(options.encoding.constData())
{
    pending_.resize(kFlushSizeBytes + (1 << 16));
    if (options.byteOrderMark)
        WriteByteOrderMark();
}

void CsvWriter::WriteByteOrderMark()
{
    const QStringView mark = u"\uFEFF";
    const QByteArray name = options_.encoding.toUpper();
    if (plainUtf8_)
        ok_ = device_.write(mark.toUtf8()) > 0;
    else if (name.startsWith("UTF-16") || name.startsWith("UTF-32"))
        ok_ = device_.write(QByteArray(encoder_.encode(mark))) > 0;
}

bool CsvWriter::KnowsEncoding(const QByteArray& name)
{
    return QStringEncoder(name.constData()).isValid();
}

void CsvWriter::WriteHeader()
{
    for (size_t i = 0; i < fields_.size(); ++i) {
        if (i > 0)
            Append(separator_);
        const QByteArray name = fields_[i].name.toUtf8();
        AppendText({name.constData(), size_t(name.size())});
    }
    EndLine();
}

bool CsvWriter::WriteRecord(std::span<const Cell> cells)
{
    Q_ASSERT(cells.size() == fields_.size());
    for (size_t i = 0; i < cells.size(); ++i) {
        if (i > 0)
            Append(separator_);
        AppendCell(cells[i], fields_[i].type);
    }
    EndLine();
    return ok_;
}

bool CsvWriter::Finish()
{
    return Flush();
}

void CsvWriter::AppendCell(const Cell& cell, FieldType type)
{
    switch (cell.kind) {
    case Cell::Kind::Null:
    case Cell::Kind::Binary:
        return;
    case Cell::Kind::Integer:
        if (type == FieldType::YesNo)
            Append(cell.integer == 0 ? "0" : "1");
        else
            Append(NumberBuffer(cell.integer).Text());
        return;
    case Cell::Kind::Real:
        Append(NumberBuffer(cell.real).Text());
        return;
    case Cell::Kind::Text:
        if (type == FieldType::Date)
            AppendDate(cell.bytes);
        else
            AppendText(cell.bytes);
        return;
    }
}

void CsvWriter::AppendText(std::string_view utf8)
{
    Append(quote_);
    if (options_.doubledQuotes && !quote_.empty()) {
        for (size_t at = utf8.find(quote_); at != std::string_view::npos; at = utf8.find(quote_)) {
            Append(utf8.substr(0, at + quote_.size()));
            Append(quote_);
            utf8.remove_prefix(at + quote_.size());
        }
    }
    Append(utf8);
    Append(quote_);
}

void CsvWriter::AppendDate(std::string_view stored)
{
    const std::string_view text = dates_.Of(stored);
    if (text.empty()) // what a file from elsewhere holds in a date column and nobody can read
        AppendText(stored);
    else
        Append(text);
}

void CsvWriter::EndLine()
{
    Append("\r\n");
    if (used_ >= kFlushSizeBytes)
        Flush();
}

bool CsvWriter::Flush()
{
    if (!ok_)
        return false;
    const QByteArray waiting = QByteArray::fromRawData(pending_.data(), qsizetype(used_));
    const QByteArray bytes = plainUtf8_ ? waiting : QByteArray(encoder_.encode(QString::fromUtf8(waiting)));
    ok_ = device_.write(bytes) == bytes.size();
    used_ = 0;
    return ok_;
}

} // namespace mirel
