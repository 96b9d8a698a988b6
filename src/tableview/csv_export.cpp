#include "tableview/csv_export.h"

#include "data/provider_error.h"
#include "platform/shared_file.h"
#include "resources/string_table.h"

#include <QBuffer>
#include <QDir>
#include <QFileInfo>
#include <QSaveFile>

#include <fcntl.h>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qint64 kRecordsPerStep = 1024; // between two looks at the progress display

// Has the disk write while the export goes on: otherwise all of the file is written when it is committed, and the
// export waits for that.
class EagerFile : public QSaveFile {
public:
    using QSaveFile::QSaveFile;

protected:
    qint64 writeData(const char* bytes, qint64 size) override
    {
        constexpr qint64 kPieceBytes = 8 << 20;
        const qint64 written = QSaveFile::writeData(bytes, size);
        waiting_ += std::max<qint64>(written, 0);
        if (waiting_ >= kPieceBytes) {
            (void)sync_file_range(handle(), begun_, waiting_, SYNC_FILE_RANGE_WRITE);
            begun_ += waiting_;
            waiting_ = 0;
        }
        return written;
    }

private:
    qint64 begun_ = 0;   // bytes that the disk was told to write
    qint64 waiting_ = 0; // behind them
};

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

std::optional<qint64> ExportCsvFile(DbRecordset& source, const CsvExportOptions& options, const CsvTarget& target,
                                    UserPrompt& prompt)
{
    using Ending = CsvExportResult::Ending;
    const QString path = QDir::toNativeSeparators(target.path);
    EagerFile file(target.path);
    if (IsSameFile(target.path, target.database) || !file.open(QIODevice::WriteOnly)) {
        prompt.Show({Str::FileCreationFail, {path}});
        return {};
    }
    CsvExportResult result;
    {
        constexpr int kAsk = -1;
        const qint64 total = source.CountStep(kAsk) ? source.RecordCount() : kUnknownTotal;
        const std::unique_ptr<Progress> progress = prompt.StartProgress({Str::ExportingRecords, {}}, total);
        result = ExportCsv(source, options, file, progress.get());
    } // the display goes before a message comes
    if (result.ending == Ending::ReadFailed) {
        ReportProviderError(prompt, &source, source.LastResult());
        return {};
    }
    if (result.ending == Ending::Stopped && target.onStop == OnStop::Discard)
        return {};
    if (result.ending == Ending::WriteFailed || !file.commit()) {
        prompt.Show({Str::FileWriteFail, {path, file.errorString()}});
        return {};
    }
    prompt.Show({Str::RecordsExported, {QString::number(result.records)}});
    return result.records;
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
