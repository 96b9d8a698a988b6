#include "cli/sql_command.h"
#include "cli/commands.h"
#include "cli/run.h"
#include "cli/statement_splitter.h"
#include "data/provider_error.h"
#include "resources/string_table.h"

#include <QFile>

#include <cstdio>

namespace mirel::cli {
namespace {

// Hands the records over that --offset and --limit leave. False when the provider failed.
bool WriteRecords(Run& run, DbRecordset& records)
{
    const std::unique_ptr<RecordWriter> writer = run.MakeWriter();
    ReadRange range;
    range.first = run.Args().Count(Opt::Offset, 0);
    range.count = run.Args().Count(Opt::Limit, -1);
    writer->Begin(records.Fields());
    Timing& timing = run.Times();
    const bool measureJump = run.Args().Has(Opt::Offset) && run.Args().Has(Opt::Timing);
    if (measureJump)
        records.RecordCount(); // finding the positions is no part of the jump
    QElapsedTimer sinceJump;
    sinceJump.start();
    const bool read = records.Read(range, [&](std::span<const Cell> cells) {
        if (measureJump && !timing.jumpUs)
            timing.jumpUs = sinceJump.nsecsElapsed() / 1000;
        ++timing.rows;
        return writer->Record(cells) && !WasInterrupted();
    });
    if (read)
        writer->End();
    return read;
}

bool RunScript(Run& run, QIODevice& script)
{
    StatementSplitter splitter;
    for (qint64 number = 1; !script.atEnd(); ++number) {
        QByteArray line = script.readLine();
        while (line.endsWith('\n') || line.endsWith('\r'))
            line.chop(1);
        if (WasInterrupted())
            return false;
        if (!line.isValidUtf8()) { // stored as U+FFFD it could never be told from what was meant
            run.Prompt().Show({Str::CliNotUtf8Line, {QString::number(number)}});
            return false;
        }
        const std::optional<QString> statement = splitter.AddLine(QString::fromUtf8(line));
        if (statement && !statement->isEmpty() && !RunStatement(run, *statement))
            return false;
    }
    const QString last = splitter.Rest();
    return last.isEmpty() || RunStatement(run, last);
}

} // namespace

bool RunStatement(Run& run, const QString& statement)
{
    // Only a static cursor can begin anywhere; the other one gives its first records sooner.
    const CursorType cursor = run.Args().Has(Opt::Offset) ? CursorType::Static : CursorType::ForwardOnly;
    DbRecordset records(run.Connection());
    const bool done = records.Open(statement, run.Session().Location(), cursor, LockType::ReadOnly) &&
                      (records.Fields().empty() || WriteRecords(run, records));
    if (!done)
        ReportProviderError(run.Prompt(), &records, records.LastResult());
    // The program that feeds a script may wait for the records before it goes on.
    return done && run.Out().Flush() && !WasInterrupted();
}

ExitStatus RunSql(Run& run)
{
    if (!run.OpenDatabase())
        return ExitStatus::Failed;
    const QString statement = run.Argument(1);
    if (statement != u"-")
        return RunStatement(run, WithoutSemicolon(statement)) ? ExitStatus::Done : ExitStatus::Failed;
    QFile input;
    if (!input.open(stdin, QIODevice::ReadOnly))
        return ExitStatus::Failed;
    return RunScript(run, input) ? ExitStatus::Done : ExitStatus::Failed;
}

} // namespace mirel::cli
