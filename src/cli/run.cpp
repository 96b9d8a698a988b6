#include "cli/run.h"

#include "provider/dialect/parser.h"
#include "resources/string_table.h"
#include "tableview/record_browser.h"

#include <QDir>
#include <QFileInfo>
#include <QJsonDocument>
#include <QJsonObject>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

ExitStatus RefuseArguments(const ArgumentFault& fault)
{
    const QString words = fault.helpOn.isEmpty() ? QString() : u' ' + fault.helpOn;
    WriteMessage(fault.text + u'\n' + StringText(Str::CliSeeHelp, {words}));
    return ExitStatus::BadArguments;
}

ExitStatus RunCommand(Run& run)
{
    const ExitStatus status = run.Args().command->run(run);
    if (run.Args().Has(Opt::Timing))
        run.WriteTiming();
    return WasInterrupted() && status == ExitStatus::Done ? ExitStatus::Failed : status;
}

QString FullPath(const QString& file)
{
    return QDir::cleanPath(QFileInfo(file).absoluteFilePath());
}

// A command whose output was lost has failed; if the reader is gone, it needs no message.
ExitStatus EndOutput(Output& output, ExitStatus status)
{
    if (output.Flush())
        return status;
    if (!output.IsBrokenPipe())
        WriteMessage(StringText(Str::CliCannotWrite, {output.Reason()}));
    return ExitStatus::Failed;
}

} // namespace

Run::Run(Arguments arguments, Output& output)
    : arguments_(std::move(arguments))
    , output_(output)
    , folder_(ProgramFolder::Find(arguments_.Text(Opt::Home)))
    , prompt_(arguments_.Has(Opt::Yes))
    , session_(connection_, folder_, prompt_)
{
    sinceStart_.start();
}

QString Run::PathArgument(int index) const
{
    return FullPath(Argument(index));
}

QString Run::FilePath(const QString& given) const
{
    return given.isEmpty() ? QString() : FullPath(given);
}

bool Run::OpenDatabase(const QString& file)
{
    const bool open = session_.Open(FullPath(file));
    timing_.openMs = sinceStart_.elapsed();
    return open;
}

std::unique_ptr<RecordWriter> Run::MakeWriter()
{
    const OutputFormat format = FormatOfName(arguments_.Text(Opt::Format)).value_or(OutputFormat::Table);
    return MakeRecordWriter(format, output_, Words());
}

void Run::WriteTiming() const
{
    QJsonObject line{{u"open_ms"_s, timing_.openMs},
                     {u"run_ms"_s, sinceStart_.elapsed() - timing_.openMs},
                     {u"rows"_s, timing_.rows}};
    if (timing_.jumpUs)
        line[u"jump_us"_s] = *timing_.jumpUs;
    if (timing_.nsPerEval)
        line[u"ns_per_eval"_s] = *timing_.nsPerEval;
    WriteMessage(QString::fromUtf8(QJsonDocument(line).toJson(QJsonDocument::Compact)));
}

ExitStatus Run::Refuse(const QString& fault) const
{
    return RefuseArguments({fault, QString::fromLatin1(arguments_.command->name)});
}

bool Run::IsTable(const QString& name)
{
    QStringList tables;
    session_.ListTables(tables);
    return tables.contains(name, Qt::CaseInsensitive);
}

QString Run::SourceOf(const QString& given)
{
    if (IsTable(given))
        return RecordBrowser::StatementOfTable(given);
    const QueryDef* query = dialect::BeginsAsStatement(given) ? nullptr : session_.Store().FindQuery(given);
    return query ? query->text.Text() : given;
}

ExitStatus RunProgram(const QStringList& words, Output& output)
{
    ArgumentFault fault;
    std::optional<Arguments> arguments = ParseArguments(words, fault);
    if (!arguments)
        return RefuseArguments(fault);
    if (arguments->Has(Opt::Help)) {
        output.WriteText(HelpFor(*arguments));
        return EndOutput(output, ExitStatus::Done);
    }
    if (arguments->Has(Opt::Version)) {
        output.WriteLine(u"mirel-cli " MIREL_VERSION ""_s);
        return EndOutput(output, ExitStatus::Done);
    }
    Run run(std::move(*arguments), output);
    return EndOutput(output, RunCommand(run));
}

} // namespace mirel::cli
