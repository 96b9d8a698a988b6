#include "csvimport/import_lines.h"

#include "csvimport/reader_fault.h"
#include "data/provider_error.h"
#include "resources/string_table.h"

#include <QStringEncoder>

namespace mirel {
namespace {

QString ReadingError(FieldType type, Hr read)
{
    return type == FieldType::Date ? StringText(Str::InvalidDateTime) : ProviderErrorText(nullptr, read, {});
}

} // namespace

ImportLines::ImportLines(QIODevice& file, const ImportPlan& plan, std::span<const ResultField> fields)
    : file_(file)
    , plan_(plan)
    , reader_(file, plan.format)
    , cells_(fields.size())
{
    for (size_t i = 0; i < plan.columns.size(); ++i) {
        const ImportColumn& column = plan.columns[i];
        if (column.ignored || targets_.size() == fields.size())
            continue;
        targets_.push_back({i, CellReader(fields[targets_.size()].type, column.dates.value_or(plan.format.dates),
                                          plan.longTexts, plan.format.decimal)});
    }
}

ImportLines::Result ImportLines::Next()
{
    const int columns = int(plan_.columns.size());
    for (;;) {
        const CsvReader::Result result = reader_.Next(columns);
        const bool isHeader = !started_ && plan_.format.namesInFirstLine;
        started_ = true;
        if (result == CsvReader::Result::End)
            return Result::End;
        if (result == CsvReader::Result::Fault) {
            failure_ = {MessageOfFault(reader_, file_).Text(), reader_.Line(), reader_.FaultText()};
            return Result::Failed;
        }
        // An empty line is a record only where a record may be an empty line.
        if (!isHeader && !(reader_.Texts().empty() && columns > 1))
            return ReadCells();
    }
}

ImportLines::Result ImportLines::ReadCells()
{
    const std::span<const std::string_view> texts = reader_.Texts();
    for (size_t i = 0; i < targets_.size(); ++i) {
        Target& target = targets_[i];
        cells_[i] = Cell();
        if (target.column >= texts.size())
            continue;
        const Hr read = target.reader.Read(texts[target.column], cells_[i]);
        if (!Failed(read))
            continue;
        failure_ = {ReadingError(target.reader.Type(), read), reader_.Line(), int(target.column)};
        return Result::Failed;
    }
    return Result::Record;
}

void ImportLines::Refuse(const QString& why, int field)
{
    const bool isKnown = field >= 0 && size_t(field) < targets_.size();
    failure_ = {why, reader_.Line(), isKnown ? int(targets_[size_t(field)].column) : -1};
}

bool ImportLines::StepOver()
{
    return reader_.LastFault() == CsvReader::Fault::None || reader_.StepOverFault();
}

QByteArray ImportLines::RawLine()
{
    const std::string_view utf8 = reader_.RawRecord();
    const QByteArray bytes(utf8.data(), qsizetype(utf8.size()));
    if (reader_.Encoding().startsWith(QLatin1StringView("UTF-8"), Qt::CaseInsensitive))
        return bytes;
    QStringEncoder encoder(reader_.Encoding().toLatin1().constData());
    return encoder.isValid() ? QByteArray(encoder.encode(QString::fromUtf8(bytes))) : bytes;
}

QByteArray ImportLines::ByteOrderMark() const
{
    const bool isWide = reader_.Encoding().startsWith(QLatin1StringView("UTF-16"), Qt::CaseInsensitive) ||
                        reader_.Encoding().startsWith(QLatin1StringView("UTF-32"), Qt::CaseInsensitive);
    if (!isWide || !reader_.HasByteOrderMark())
        return {};
    QStringEncoder encoder(reader_.Encoding().toLatin1().constData());
    return encoder.encode(QStringView(u"\uFEFF"));
}

void ImportLines::CountWhatWasCut(ImportReport& report) const
{
    for (const Target& target : targets_) {
        report.cutTexts += target.reader.CutTexts();
        report.cutNumbers += target.reader.CutNumbers();
    }
}

QStringList FieldsToFill(const ImportColumns& columns)
{
    QStringList fields;
    for (const ImportColumn& column : columns) {
        if (!column.ignored)
            fields += column.field;
    }
    return fields;
}

} // namespace mirel
