#include "tableview/csv_export.h"

#include "data/provider_error.h"
#include "platform/shared_file.h"
#include "platform/system_reason.h"
#include "resources/string_table.h"
#include "tableview/html_records.h"
#include "tableview/json_records.h"

#include <QBuffer>
#include <QCoreApplication>
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

// The file that an export writes, under its name once it is whole. One that replaces another is on disk before it
// does; for a new one nobody has to wait for the disk.
class ExportFile {
public:
    explicit ExportFile(const QString& path)
        : path_(path)
        , replaces_(QFileInfo::exists(path))
        , replacement_(path)
        , fresh_(path + u".%1.part"_s.arg(QCoreApplication::applicationPid()))
    {
    }
    ~ExportFile()
    {
        if (unfinished_)
            fresh_.remove();
    }
    Q_DISABLE_COPY_MOVE(ExportFile)

    bool Open()
    {
        if (replaces_)
            return replacement_.open(QIODevice::WriteOnly);
        unfinished_ = fresh_.open(QIODevice::WriteOnly | QIODevice::NewOnly | QIODevice::Unbuffered);
        return unfinished_;
    }
    QIODevice& Device() { return replaces_ ? static_cast<QIODevice&>(replacement_) : fresh_; }

    bool Commit()
    {
        if (replaces_)
            return replacement_.commit();
        // Never over a file that came there meanwhile.
        unfinished_ = fresh_.error() != QFileDevice::NoError || !fresh_.rename(path_);
        return !unfinished_;
    }

private:
    QString path_;
    bool replaces_;
    EagerFile replacement_;
    QFile fresh_;
    bool unfinished_ = false; // the new file is there, under a name for the time being
};

// Walks the records. `take` is false when the device takes no more; `finish` says whether all of it was written.
template <typename Take, typename Finish>
CsvExportResult Walk(DbRecordset& source, Progress* progress, Take take, Finish finish)
{
    using Ending = CsvExportResult::Ending;
    CsvExportResult result;
    const bool read = source.Read({}, [&](std::span<const Cell> cells) {
        if (!take(cells)) {
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
    if (!finish())
        result.ending = Ending::WriteFailed;
    return result;
}

// The records of a writer that appends to a text.
template <typename Records>
CsvExportResult WriteRecords(Records& records, DbRecordset& source, std::string start, QIODevice& device,
                             Progress* progress)
{
    constexpr size_t kPieceBytes = size_t(1) << 20;
    std::string pending = std::move(start);
    const auto flush = [&] {
        const bool written = device.write(pending.data(), qint64(pending.size())) == qint64(pending.size());
        pending.clear();
        return written;
    };
    return Walk(
        source, progress,
        [&](std::span<const Cell> cells) {
            records.Record(cells, pending);
            return pending.size() < kPieceBytes || flush();
        },
        [&] {
            records.End(pending);
            return flush();
        });
}

} // namespace

CsvExportResult ExportCsv(DbRecordset& source, const CsvExportOptions& options, QIODevice& device,
                          Progress* progress)
{
    std::string start;
    if (options.kind == ExportKind::Json) {
        JsonRecords records(JsonRecords::Shape::Array, source.Fields());
        records.Begin(start);
        return WriteRecords(records, source, std::move(start), device, progress);
    }
    if (options.kind == ExportKind::Html) {
        HtmlRecords records(options.dates, options.words, source.Fields());
        records.Begin(options.title, start);
        return WriteRecords(records, source, std::move(start), device, progress);
    }
    CsvWriter writer(device, options, source.Fields());
    if (options.header)
        writer.WriteHeader();
    return Walk(
        source, progress, [&](std::span<const Cell> cells) { return writer.WriteRecord(cells); },
        [&] { return writer.Finish(); });
}

std::optional<qint64> ExportCsvFile(DbRecordset& source, const CsvExportOptions& options, const CsvTarget& target,
                                    UserPrompt& prompt)
{
    using Ending = CsvExportResult::Ending;
    const QString path = QDir::toNativeSeparators(target.path);
    ExportFile file(target.path);
    if (IsSameFile(target.path, target.database) || !file.Open()) {
        prompt.Show({Str::FileCreationFail, {path}});
        return {};
    }
    CsvExportResult result;
    {
        constexpr int kAsk = -1;
        const qint64 total = source.CountStep(kAsk) ? source.RecordCount() : kUnknownTotal;
        const std::unique_ptr<Progress> progress = prompt.StartProgress({Str::ExportingRecords, {}}, total);
        result = target.write(source, options, file.Device(), progress.get());
    } // the display goes before a message comes
    if (result.ending == Ending::ReadFailed) {
        ReportProviderError(prompt, &source, source.LastResult());
        return {};
    }
    if (result.ending == Ending::Stopped && target.onStop == OnStop::Discard)
        return {};
    if (result.ending == Ending::WriteFailed || !file.Commit()) {
        prompt.Show({Str::FileWriteFail, {path, SystemReason(file.Device())}});
        return {};
    }
    prompt.Show({Str::RecordsExported, {QString::number(result.records)}});
    return result.records;
}

// The first lines of a text that is no CSV; a document has none.
static QStringList PreviewText(DbRecordset& source, const CsvExportOptions& options, int maxLines)
{
    std::string text;
    JsonRecords json(JsonRecords::Shape::Array, source.Fields());
    HtmlRecords html(options.dates, options.words, source.Fields());
    if (options.kind == ExportKind::Pdf)
        return {};
    options.kind == ExportKind::Json ? json.Begin(text) : html.Begin(options.title, text);
    const bool read = source.Read({.count = maxLines}, [&](std::span<const Cell> cells) {
        options.kind == ExportKind::Json ? json.Record(cells, text) : html.Record(cells, text);
        return true;
    });
    const QStringList lines = QString::fromStdString(text).split(u'\n');
    return read ? lines.first(std::min(lines.size(), qsizetype(maxLines))) + QStringList{u"....."_s}
                : QStringList();
}

QStringList PreviewCsv(DbRecordset& source, const CsvExportOptions& options, int maxLines)
{
    CsvExportOptions shown = options;
    shown.encoding = "UTF-8";
    shown.byteOrderMark = false;
    if (options.kind != ExportKind::Csv)
        return PreviewText(source, options, maxLines);
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
