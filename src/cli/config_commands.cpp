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

Str FormOf(SettingKind kind)
{
    switch (kind) {
    case SettingKind::Integer:
        return Str::SettingTakesInteger;
    case SettingKind::Colors:
        return Str::SettingTakesColors;
    case SettingKind::Font:
        return Str::SettingTakesFont;
    case SettingKind::YesNo:
        return Str::SettingTakesWords;
    case SettingKind::Text:
        break;
    }
    return Str::SettingTakesText;
}

} // namespace

ExitStatus RunConfigGet(Run& run)
{
    const SettingRow* row = FindSetting(run);
    if (!row)
        return ExitStatus::Failed;
    run.Out().WriteLine(Settings(run.Folder().OpenProfile()).Text(row->id));
    return ExitStatus::Done;
}

ExitStatus RunConfigSet(Run& run)
{
    const SettingRow* row = FindSetting(run);
    if (!row)
        return ExitStatus::Failed;
    if (!Settings::Accepts(*row, run.Argument(2))) {
        run.Prompt().Show({Str::CliSettingWrong,
                           {run.Argument(2), run.Argument(0), run.Argument(1), StringText(FormOf(row->kind))}});
        return ExitStatus::Failed;
    }
    const QString file = run.Folder().ProfileFile();
    if (Settings(run.Folder().OpenProfile()).SetText(row->id, run.Argument(2)))
        return ExitStatus::Done;
    run.Prompt().Show({Str::CliCannotWriteFile, {file}});
    return ExitStatus::Failed;
}

} // namespace mirel::cli
