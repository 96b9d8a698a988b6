#include "app/store_check.h"
#include "cli/commands.h"
#include "cli/run.h"
#include "data/provider_error.h"
#include "platform/shared_file.h"
#include "provider/stop_check.h"
#include "resources/string_table.h"

#include <QFileInfo>

#include <algorithm>
#include <utility>

namespace mirel::cli {
namespace {

ExitStatus StatusOf(Run& run, Hr hr, const QString& context)
{
    if (Failed(hr) && hr != kStopped)
        run.Prompt().ShowError(ProviderErrorText(nullptr, hr, context));
    return Failed(hr) ? ExitStatus::Failed : ExitStatus::Done;
}

} // namespace

// Not through the session, which gives a database its stamp when it opens it: a check writes nothing.
ExitStatus RunCheck(Run& run)
{
    const DatabaseLocation database(run.PathArgument(0));
    QStringList damage;
    QString context;
    const Hr hr = run.Connection().Provider()->Care().Check(
        database, [] { return !IsStopWanted(); }, damage, context);
    if (Failed(hr))
        return StatusOf(run, hr, context);
    QString stamp;
    if (!Catalog(run.Connection(), run.Prompt()).FindDatabaseStamp(database, stamp))
        return ExitStatus::Failed;
    FormStore store;
    std::vector<CheckFinding> findings;
    if (!stamp.isEmpty())
        findings = CheckStoreFile(SideFilePath(run.Folder().FormsFolder(), stamp), store);
    for (const QString& line : std::as_const(damage))
        run.Out().WriteLine(line);
    std::ranges::copy(CheckReferences(run.Connection(), database, store), std::back_inserter(findings));
    for (const CheckFinding& finding : findings)
        run.Out().WriteLine(finding.text);
    return damage.isEmpty() && findings.empty() ? ExitStatus::Done : ExitStatus::Failed;
}

ExitStatus RunBackup(Run& run)
{
    if (!run.OpenDatabase())
        return ExitStatus::Failed;
    const QString file = run.PathArgument(1);
    const DatabaseLocation& database = run.Session().Location();
    if (IsSameFile(file, database.FilePath()) || IsSameFile(file, run.Session().Store().Path())) {
        run.Prompt().Show({Str::CopyOntoItself, {file}});
        return ExitStatus::Failed;
    }
    if (QFileInfo::exists(file) && !run.Args().Has(Opt::Yes)) {
        run.Prompt().Show({Str::CliFileExists, {file}});
        return ExitStatus::BadArguments;
    }
    constexpr int kThousandths = 1000;
    const std::unique_ptr<Progress> progress = run.Prompt().StartProgress({Str::BackingUp, {}}, kThousandths);
    QString context;
    const Hr hr = run.Connection().Provider()->Care().BackUp(
        database, file, run.Session().Store().ToBytes(),
        [&](int done) { return progress->Advance(done) && !IsStopWanted(); }, context);
    return StatusOf(run, hr, context);
}

ExitStatus RunCompact(Run& run)
{
    QString context;
    const Hr hr = run.Connection().Provider()->Care().Compact(
        DatabaseLocation(run.PathArgument(0)), [] { return !IsStopWanted(); }, context);
    return StatusOf(run, hr, context);
}

} // namespace mirel::cli
