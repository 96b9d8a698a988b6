#include "tableview/csv_export.h"

#include <QBuffer>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qint64 kRecordsPerStep = 1024; // between two looks at the progress display

} // namespace

CsvExportResult ExportCsv(DbRecordset& source, const CsvExportOptions& options, QIODevice& device,
                          Progress* progress)
{
    using Ending = CsvExportResult::Ending;
    CsvWriter writer(device, options, source.Fields());
    if (options.header)
        writer.WriteHeader();

    CsvExportResult result;
    const bool read = source.Read({}, [&](std::span<const Cell> cells) {
        if (!writer.WriteRecord(cells)) {
            result.ending = Ending::WriteFailed;
            return false;
        }
        ++result.records;
        if (progress && result.records % kRecordsPerStep == 0 && !progress->Advance(result.records)) {
            result.ending = Ending::Stopped;
            return false;
        }
        return true;
    });
    if (!read)
        result.ending = Ending::ReadFailed;
    if (!writer.Finish())
        result.ending = Ending::WriteFailed;
    return result;
}

QStringList PreviewCsv(DbRecordset& source, const CsvExportOptions& options, int maxLines)
{
    CsvExportOptions shown = options;
    shown.encoding = "UTF-8";
    QBuffer device;
    device.open(QIODevice::WriteOnly);
    CsvWriter writer(device, shown, source.Fields());
    if (shown.header)
        writer.WriteHeader();

    const int room = maxLines - (shown.header ? 1 : 0);
    int records = 0;
    // One record more than is shown tells whether there are more.
    const bool read = source.Read({.count = room + 1}, [&](std::span<const Cell> cells) {
        return ++records > room || writer.WriteRecord(cells);
    });
    if (!read || !writer.Finish())
        return {};
    QStringList lines = QString::fromUtf8(device.data()).split(u"\r\n"_s);
    lines.removeLast(); // behind the last line's end
    if (records > room)
        lines += u"....."_s;
    return lines;
}

} // namespace mirel
