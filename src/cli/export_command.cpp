#include "cli/commands.h"
#include "cli/output_device.h"
#include "cli/run.h"
#include "data/provider_error.h"
#include "resources/string_table.h"
#include "tableview/csv_export.h"
#include "tableview/saved_queries.h"

#include <QFileInfo>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

CsvExportOptions OptionsOf(const Arguments& arguments)
{
    CsvExportOptions options;
    options.separator = arguments.Character(Opt::Separator, options.separator.unicode());
    options.quote = arguments.Character(Opt::Quote, options.quote.unicode());
    options.header = arguments.Has(Opt::Header);
    options.doubledQuotes = arguments.Has(Opt::DoubledQuotes);
    options.SetDateOrder(DateOrder(arguments.Count(Opt::DateOrder, int(DateOrder::Locale))));
    options.dates.dateSeparator = arguments.Character(Opt::DateSeparator, options.dates.dateSeparator);
    options.dates.timeSeparator = arguments.Character(Opt::TimeSeparator, options.dates.timeSeparator);
    options.encoding = arguments.Text(Opt::Encoding, QString::fromLatin1(options.encoding)).toUtf8();
    options.byteOrderMark = arguments.Has(Opt::Bom);
    const QString format = arguments.Text(Opt::Format);
    options.kind = format == u"json" ? ExportKind::Json : format == u"html" ? ExportKind::Html : ExportKind::Csv;
    return options;
}

// The statement to export: the argument, or the saved query of the option.
std::optional<QString> SourceOf(Run& run)
{
    if (!run.Args().Has(Opt::Query))
        return run.SourceOf(run.Argument(1));
    const QString name = run.Args().Text(Opt::Query);
    std::optional<QString> statement = SavedQueries(run.Session().Store(), run.Prompt()).StatementOf(name);
    if (!statement)
        run.Prompt().Show({Str::NoSuchQuery, {name}});
    return statement;
}

bool ExportToOutput(Run& run, DbRecordset& records, const CsvExportOptions& options)
{
    using Ending = CsvExportResult::Ending;
    OutputDevice device(run.Out());
    const std::unique_ptr<Progress> progress = run.Prompt().StartProgress({Str::ExportingRecords, {}}, 0);
    const CsvExportResult result = ExportCsv(records, options, device, progress.get());
    if (result.ending == Ending::ReadFailed)
        ReportProviderError(run.Prompt(), &records, records.LastResult());
    if (result.ending != Ending::Complete || !run.Out().Flush())
        return false;
    run.Times().rows = result.records;
    run.Prompt().Show({Str::RecordsExported, {QString::number(result.records)}});
    return true;
}

bool ExportToFile(Run& run, DbRecordset& records, const CsvExportOptions& options, const QString& path)
{
    const CsvTarget target{
        .path = path, .database = run.Session().Location().FilePath(), .onStop = OnStop::Discard};
    const std::optional<qint64> written = ExportCsvFile(records, options, target, run.Prompt());
    run.Times().rows = written.value_or(0);
    return written.has_value();
}

// What is wrong with the number of arguments; empty when nothing is.
QString FaultOf(const Run& run)
{
    const bool isQuery = run.Args().Has(Opt::Query);
    const qsizetype given = run.Args().positional.size();
    if (isQuery && given > 2)
        return StringText(Str::CliArgumentTooMany, {run.Argument(2)});
    if (!isQuery && given < 3)
        return StringText(Str::CliArgumentsMissing, {u"DB SOURCE FILE"_s});
    return {};
}

} // namespace

ExitStatus RunExport(Run& run)
{
    if (const QString fault = FaultOf(run); !fault.isEmpty())
        return run.Refuse(fault);
    CsvExportOptions options = OptionsOf(run.Args());
    options.words = run.Words();
    options.title = run.Args().Has(Opt::Query) ? run.Args().Text(Opt::Query) : run.Argument(1);
    if (!CsvWriter::KnowsEncoding(options.encoding)) {
        run.Prompt().Show({Str::ImportUnknownEncoding, {QString::fromUtf8(options.encoding)}});
        return ExitStatus::Failed;
    }
    const int fileArgument = run.Args().Has(Opt::Query) ? 1 : 2;
    const bool toOutput = run.Argument(fileArgument) == u"-";
    const QString path = run.PathArgument(fileArgument);
    if (!toOutput && QFileInfo::exists(path) && !run.Args().Has(Opt::Yes)) {
        run.Prompt().Show({Str::CliFileExists, {path}});
        return ExitStatus::BadArguments;
    }
    if (!run.OpenDatabase())
        return ExitStatus::Failed;
    const std::optional<QString> source = SourceOf(run);
    if (!source)
        return ExitStatus::Failed;
    DbRecordset records(run.Connection());
    if (!records.OpenSource(*source, run.Session().Location(), CursorType::Static, LockType::ReadOnly)) {
        ReportProviderError(run.Prompt(), &records, records.LastResult());
        return ExitStatus::Failed;
    }
    const bool done = toOutput ? ExportToOutput(run, records, options) : ExportToFile(run, records, options, path);
    return done ? ExitStatus::Done : ExitStatus::Failed;
}

} // namespace mirel::cli
