#include "tableview/csv_writer.h"

#include "platform/number_text.h"
#include "platform/ole_date.h"

#include <QIODevice>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qsizetype kFlushSizeBytes = 1 << 20;

void Append(QByteArray& out, std::string_view bytes)
{
    out.append(bytes.data(), qsizetype(bytes.size()));
}

QByteArray Utf8Of(QChar character)
{
    return character.isNull() ? QByteArray() : QString(character).toUtf8();
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
    , plainUtf8_(options.encoding.compare("UTF-8", Qt::CaseInsensitive) == 0)
    , encoder_(options.encoding.constData())
{
    pending_.reserve(kFlushSizeBytes + (1 << 16));
}

bool CsvWriter::KnowsEncoding(const QByteArray& name)
{
    return QStringEncoder(name.constData()).isValid();
}

void CsvWriter::WriteHeader()
{
    for (size_t i = 0; i < fields_.size(); ++i) {
        if (i > 0)
            pending_ += separator_;
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
            pending_ += separator_;
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
            pending_ += cell.integer == 0 ? '0' : '1';
        else
            Append(pending_, NumberBuffer(cell.integer).Text());
        return;
    case Cell::Kind::Real:
        Append(pending_, NumberBuffer(cell.real).Text());
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
    pending_ += quote_;
    if (options_.doubledQuotes && !quote_.isEmpty()) {
        const std::string_view quote(quote_.constData(), size_t(quote_.size()));
        for (size_t at = utf8.find(quote); at != std::string_view::npos; at = utf8.find(quote)) {
            Append(pending_, utf8.substr(0, at + quote.size()));
            pending_ += quote_;
            utf8.remove_prefix(at + quote.size());
        }
    }
    Append(pending_, utf8);
    pending_ += quote_;
}

void CsvWriter::AppendDate(std::string_view stored)
{
    const std::optional<double> date = OleDateFromStored(stored);
    if (!date) // what a file from elsewhere holds in a date column and nobody can read
        return AppendText(stored);
    if (options_.dates.order == DateOrder::Locale)
        pending_ += FormatDateText(options_.dates, *date).toUtf8();
    else
        Append(pending_, FormatDateFields(options_.dates, *date).Text());
}

void CsvWriter::EndLine()
{
    pending_ += "\r\n";
    if (pending_.size() >= kFlushSizeBytes)
        Flush();
}

bool CsvWriter::Flush()
{
    if (!ok_)
        return false;
    if (plainUtf8_) {
        ok_ = device_.write(pending_) == pending_.size();
    } else {
        QByteArray encoded = encoder_.encode(QString::fromUtf8(pending_));
        ok_ = device_.write(encoded) == encoded.size();
    }
    pending_.resize(0); // keeps the room
    return ok_;
}

} // namespace mirel
