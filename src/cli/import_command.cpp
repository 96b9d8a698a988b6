#include "cli/commands.h"
#include "cli/import_found.h"
#include "cli/run.h"
#include "csvimport/csv_detect.h"
#include "csvimport/csv_import.h"
#include "csvimport/import_lines.h"
#include "csvimport/utf8_source.h"
#include "data/provider_error.h"
#include "platform/shared_file.h"
#include "platform/system_reason.h"
#include "resources/string_table.h"

#include <QFile>
#include <QFileInfo>

#include <algorithm>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

// One import, from the options to the report.
class ImportCommand {
public:
    explicit ImportCommand(Run& run)
        : run_(run)
        , path_(run.PathArgument(1))
        , database_(run.Session().Location())
    {
        plan_.format = FormatOf(run.Args());
        plan_.table = TableName(run.Args().Text(Opt::Table));
        if (run.Args().Has(Opt::WholeTexts))
            plan_.longTexts = CellReader::LongTexts::KeepWhole;
        plan_.skipTo = run.FilePath(run.Args().Text(Opt::SkipTo));
        for (const QString& field : run.Args().Text(Opt::Key).split(u',', Qt::SkipEmptyParts))
            plan_.key += field.trimmed();
    }

    bool Execute()
    {
        if (!Utf8Source::IsKnownEncoding(plan_.format.encoding))
            return Tell({Str::ImportUnknownEncoding, {plan_.format.encoding}});
        if (IsSameFile(plan_.skipTo, path_) || IsSameFile(plan_.skipTo, database_.FilePath()))
            return Tell({Str::ImportSkipIsSource, {run_.Args().Text(Opt::SkipTo)}});
        if (run_.Args().Has(Opt::Detect) && !Detect())
            return false;
        const bool isPlanned = run_.Args().Has(Opt::Create) ? PlanNewTable() : PlanExistingTable();
        if (!isPlanned || !CheckKey())
            return false;
        if (run_.Args().Has(Opt::Create) && !run_.Session().GetCatalog().ExecuteStatement(
                                                database_, CreateTableStatement(plan_.table, plan_.columns)))
            return false;
        return Import();
    }

private:
    static CsvFormat FormatOf(const Arguments& arguments)
    {
        CsvFormat format;
        format.separator = arguments.Character(Opt::Separator, format.separator);
        format.quote = arguments.Character(Opt::Quote, format.quote);
        format.doubledQuotes = arguments.Has(Opt::DoubledQuotes) || arguments.Has(Opt::QuotedLines);
        format.namesInFirstLine = arguments.Has(Opt::Header) && !arguments.Has(Opt::NoHeader);
        format.decimal = arguments.Character(Opt::Decimal, format.decimal);
        format.dates.order = DateOrder(arguments.Count(Opt::DateOrder, int(DateOrder::Locale)));
        format.dates.dateSeparator = arguments.Character(Opt::DateSeparator, format.dates.dateSeparator);
        format.dates.timeSeparator = arguments.Character(Opt::TimeSeparator, format.dates.timeSeparator);
        format.encoding = arguments.Text(Opt::Encoding, format.encoding);
        return format;
    }

    CsvGiven Given() const
    {
        const Arguments& arguments = run_.Args();
        const CsvFormat& format = plan_.format;
        const auto ifAny = [&arguments](std::initializer_list<Opt> options, auto value) {
            const bool any = std::ranges::any_of(options, [&](Opt option) { return arguments.Has(option); });
            return any ? std::optional(value) : std::nullopt;
        };
        return {.separator = ifAny({Opt::Separator}, format.separator),
                .quote = ifAny({Opt::Quote}, format.quote),
                .doubledQuotes = ifAny({Opt::DoubledQuotes, Opt::QuotedLines}, format.doubledQuotes),
                .namesInFirstLine = ifAny({Opt::Header, Opt::NoHeader}, format.namesInFirstLine),
                .encoding = ifAny({Opt::Encoding}, format.encoding),
                .dates = ifAny({Opt::DateOrder, Opt::DateSeparator, Opt::TimeSeparator}, format.dates),
                .decimal = ifAny({Opt::Decimal}, format.decimal)};
    }

    bool Detect()
    {
        QFile file;
        CsvFound found;
        if (!OpenFile(file) || !DetectCsv(file, Given(), found, run_.Prompt()))
            return false;
        plan_.format = found.format;
        if (found.longTexts == CellReader::LongTexts::KeepWhole)
            plan_.longTexts = found.longTexts;
        run_.Prompt().Show({Str::ImportFound, {FoundText(found)}});
        found_ = std::move(found);
        return true;
    }

    bool CheckKey()
    {
        const QStringList filled = FieldsToFill(plan_.columns);
        const auto missing = std::ranges::find_if(
            plan_.key, [&filled](const QString& field) { return !filled.contains(field, Qt::CaseInsensitive); });
        return missing == plan_.key.end() || Tell({Str::ImportKeyNotFilled, {*missing}});
    }

    // A name in brackets is the name inside.
    static QString TableName(const QString& given)
    {
        return given.startsWith(u'[') && given.endsWith(u']') ? given.mid(1, given.size() - 2) : given;
    }

    bool Tell(const UserMessage& message)
    {
        run_.Prompt().Show(message);
        return false;
    }

    // Each pass over the file opens it again.
    bool OpenFile(QFile& file)
    {
        file.setFileName(path_);
        if (file.open(QIODevice::ReadOnly | QIODevice::Unbuffered))
            return true;
        return Tell({Str::ImportCannotOpen, {run_.Argument(1), SystemReason(file)}});
    }

    bool FirstLine(QStringList& texts)
    {
        QFile file;
        return OpenFile(file) && ReadFirstLine(file, plan_.format, texts, run_.Prompt());
    }

    bool PlanNewTable()
    {
        const QString list = run_.Args().Text(Opt::Columns);
        UserMessage fault;
        if (found_ && (list == u"auto" || !run_.Args().Has(Opt::Columns))) {
            plan_.columns = found_->columns;
        } else if (list == u"auto") {
            QFile file;
            if (!OpenFile(file) || !GuessColumns(file, plan_.format, plan_.columns, run_.Prompt()))
                return false;
        } else if (run_.Args().Has(Opt::Columns)) {
            if (!ParseColumnList(list, plan_.columns, fault))
                return Tell(fault);
        } else {
            QStringList first;
            if (!FirstLine(first))
                return false;
            plan_.columns =
                plan_.format.namesInFirstLine ? ColumnsNamed(first) : NumberedColumns(int(first.size()));
        }
        return CheckNewColumns(plan_.columns, fault) || Tell(fault);
    }

    bool PlanExistingTable()
    {
        DbRecordset table(run_.Connection());
        if (!table.Open(u'[' + plan_.table + u']', database_, CursorType::ForwardOnly, LockType::ReadOnly)) {
            ReportProviderError(run_.Prompt(), &table, table.LastResult());
            return false;
        }
        const std::span<const ResultField> fields = table.Fields();
        const QString list = run_.Args().Text(Opt::Columns, u"auto"_s);
        UserMessage fault;
        if (list != u"auto") {
            return (ParseColumnList(list, plan_.columns, fault) &&
                    MatchByName(plan_.table, fields, plan_.columns, fault)) ||
                   Tell(fault);
        }
        if (found_)
            return MatchFound(fields, fault) || Tell(fault);
        QStringList first;
        if (!FirstLine(first))
            return false;
        if (!plan_.format.namesInFirstLine)
            return MatchInOrder(plan_.table, fields, int(first.size()), plan_.columns, fault) || Tell(fault);
        for (const QString& name : first) {
            ImportColumn column;
            column.field = name;
            plan_.columns.push_back(column);
        }
        return MatchByName(plan_.table, fields, plan_.columns, fault) || Tell(fault);
    }

    bool MatchFound(std::span<const ResultField> fields, UserMessage& fault)
    {
        if (plan_.format.namesInFirstLine) {
            plan_.columns = found_->columns;
            return MatchByName(plan_.table, fields, plan_.columns, fault);
        }
        if (!MatchInOrder(plan_.table, fields, int(found_->columns.size()), plan_.columns, fault))
            return false;
        for (size_t i = 0; i < found_->columns.size(); ++i)
            plan_.columns[i].dates = found_->columns[i].dates;
        return true;
    }

    bool Import()
    {
        QFile file;
        ImportReport report;
        if (!OpenFile(file))
            return false;
        const bool complete = ImportCsv(run_.Connection(), database_, file, plan_, run_.Prompt(), report);
        run_.Times().rows = report.records;
        for (const UserMessage& warning : report.Warnings())
            run_.Prompt().Show(warning);
        if (report.stopped)
            run_.Prompt().Show(report.Count());
        else if (complete && report.DidSomething())
            run_.Out().WriteLine(report.Count().Text());
        // No line failed this time: what an earlier run left there would say otherwise.
        if (complete && report.skipped == 0 && !plan_.skipTo.isEmpty() && run_.Args().Has(Opt::Yes))
            QFile::remove(plan_.skipTo);
        return complete && !report.stopped;
    }

    Run& run_;
    QString path_;
    DatabaseLocation database_;
    ImportPlan plan_;
    std::optional<CsvFound> found_;
};

} // namespace

ExitStatus RunImport(Run& run)
{
    const QString skipTo = run.Args().Text(Opt::SkipTo);
    if (!skipTo.isEmpty() && QFileInfo::exists(run.FilePath(skipTo)) && !run.Args().Has(Opt::Yes) &&
        !IsSameFile(run.FilePath(skipTo), run.PathArgument(0)) &&
        !IsSameFile(run.FilePath(skipTo), run.PathArgument(1))) {
        run.Prompt().Show({Str::CliFileExists, {skipTo}});
        return ExitStatus::BadArguments;
    }
    return run.OpenDatabase() && ImportCommand(run).Execute() ? ExitStatus::Done : ExitStatus::Failed;
}

} // namespace mirel::cli
