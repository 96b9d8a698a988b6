#include "cli/commands.h"
#include "cli/run.h"
#include "resources/string_table.h"

namespace mirel::cli {
namespace {

const SettingRow* FindSetting(Run& run)
{
    const SettingRow* row = Settings::Find(run.Argument(0), run.Argument(1));
    if (!row)
        run.Prompt().Show({Str::CliNoSuchSetting, {run.Argument(0), run.Argument(1)}});
    return row;
}

} // namespace

ExitStatus RunConfigGet(Run& run)
{
    const SettingRow* row = FindSetting(run);
    if (!row)
        return ExitStatus::Failed;
    run.Out().WriteLine(Settings(Profile(run.Folder().ProfileFile())).Text(row->id));
    return ExitStatus::Done;
}

ExitStatus RunConfigSet(Run& run)
{
    const SettingRow* row = FindSetting(run);
    if (!row)
        return ExitStatus::Failed;
    if (!Settings::Accepts(*row, run.Argument(2))) {
        run.Prompt().Show({Str::CliSettingWrong, {run.Argument(2), run.Argument(0), run.Argument(1)}});
        return ExitStatus::Failed;
    }
    const QString file = run.Folder().ProfileFile();
    if (Settings(Profile(file)).SetText(row->id, run.Argument(2)))
        return ExitStatus::Done;
    run.Prompt().Show({Str::CliCannotWriteFile, {file}});
    return ExitStatus::Failed;
}

} // namespace mirel::cli
