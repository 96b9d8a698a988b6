#include "app/database_upkeep.h"

#include "app/file_state.h"
#include "data/provider_error.h"
#include "platform/shared_file.h"
#include "platform/user_locale.h"
#include "provider/stop_check.h"
#include "resources/string_table.h"

#include <QDate>
#include <QDir>
#include <QFileInfo>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

QString SizeText(const QString& path)
{
    return UserLocale::Current().Locale().formattedDataSize(FileState::Of(path).sizeBytes, 1);
}

// How long it takes nobody knows: the display moves, and can be cancelled.
std::function<bool()> Counting(Progress& progress)
{
    return [&progress, looks = qint64(0)]() mutable { return progress.Advance(++looks); };
}

} // namespace

bool DatabaseUpkeep::Report(Hr hr, const QString& context, const QString& reason)
{
    if (Failed(hr) && hr != kStopped)
        session_.Prompt().ShowErrorWithReason(ProviderErrorText(nullptr, hr, context), reason);
    return !Failed(hr);
}

QString DatabaseUpkeep::BackUp(const QString& file)
{
    const DatabaseLocation& database = session_.Location();
    UserPrompt& prompt = session_.Prompt();
    if (IsSameFile(file, database.FilePath()) || IsSameFile(file, session_.Store().Path())) {
        prompt.Show({Str::CopyOntoItself, {QDir::toNativeSeparators(file)}});
        return {};
    }
    if (QFileInfo::exists(file) && !prompt.AskYesNo({Str::BackUpReplace, {QDir::toNativeSeparators(file)}}))
        return {};
    constexpr int kThousandths = 1000;
    QString context;
    Hr hr = Hr::Ok;
    {
        const std::unique_ptr<Progress> progress = prompt.StartProgress({Str::BackingUp, {}}, kThousandths);
        hr = session_.Connection().Provider()->Care().BackUp(
            database, file, session_.Store().ToBytes(), [&](int done) { return progress->Advance(done); },
            context);
    }
    if (hr == kStopped)
        return StringText(Str::BackUpStopped);
    return Report(hr, context) ? StringText(Str::BackUpDone, {QFileInfo(file).fileName(), SizeText(file)})
                               : QString();
}

QString DatabaseUpkeep::Compact()
{
    const DatabaseLocation database = session_.Location();
    const QString before = SizeText(database.FilePath());
    QString context;
    Hr hr = Hr::Ok;
    {
        const std::unique_ptr<Progress> progress =
            session_.Prompt().StartProgress({Str::Compacting, {}}, kUnknownTotal);
        hr = session_.Connection().Provider()->Care().Compact(database, Counting(*progress), context);
    }
    if (hr == kStopped)
        return StringText(Str::CompactStopped);
    const QString reason = hr == Hr::AccessDenied ? StringText(Str::CompactInUse) : QString();
    if (!Report(hr, context, reason))
        return {};
    return StringText(Str::CompactDone, {before, SizeText(database.FilePath())});
}

QString DatabaseUpkeep::Check(std::vector<CheckFinding>& findings)
{
    findings.clear();
    QStringList damage;
    QString context;
    Hr hr = Hr::Ok;
    {
        const std::unique_ptr<Progress> progress =
            session_.Prompt().StartProgress({Str::Checking, {}}, kUnknownTotal);
        hr = session_.Connection().Provider()->Care().Check(session_.Location(), Counting(*progress), damage,
                                                            context);
    }
    for (const QString& line : std::as_const(damage))
        findings.push_back({line, Str::RemedyDamage});
    if (hr == kStopped)
        return StringText(Str::CheckStopped);
    if (!Report(hr, context))
        return {};
    FormStore store;
    if (!session_.SideFile().isEmpty())
        std::ranges::copy(CheckStoreFile(session_.SideFile(), store), std::back_inserter(findings));
    std::ranges::copy(CheckReferences(session_.Connection(), session_.Location(), store),
                      std::back_inserter(findings));
    if (findings.empty())
        return StringText(Str::CheckClean);
    return findings.size() == 1 ? StringText(Str::CheckOneFinding)
                                : StringText(Str::CheckFindings, {QString::number(findings.size())});
}

QString DatabaseUpkeep::NameForCopy() const
{
    const QFileInfo database(session_.Location().FilePath());
    const QString day = QDate::currentDate().toString(Qt::ISODate);
    QString name = StringText(Str::BackUpName, {database.completeBaseName(), day});
    constexpr int kMostTries = 1000;
    for (int number = 2; database.dir().exists(name) && number < kMostTries; ++number)
        name = StringText(Str::BackUpName, {database.completeBaseName(), u"%1 %2"_s.arg(day).arg(number)});
    return name;
}

} // namespace mirel
