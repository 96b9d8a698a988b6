#include "app/database_facts.h"

#include "app/file_state.h"
#include "data/statement_text.h"
#include "forms/design/quiet_prompt.h"
#include "platform/user_locale.h"
#include "resources/string_table.h"

#include <QDir>
#include <QElapsedTimer>
#include <QFileInfo>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

QString NumberText(qint64 number)
{
    return UserLocale::Current().Locale().toString(number);
}

} // namespace

DatabaseFacts::DatabaseFacts(DatabaseSession& session)
    : session_(session)
{
}

DatabaseFacts::~DatabaseFacts() = default;

void DatabaseFacts::Look()
{
    counted_.reset();
    tables_.clear();
    next_ = 0;
    records_ = 0;
    isUnread_ = false;
    QuietPrompt quiet;
    isListed_ = Catalog(session_.Connection(), quiet).ListTables(session_.Location(), tables_);
}

void DatabaseFacts::CountOn(int budgetMs)
{
    QElapsedTimer timer;
    timer.start();
    while (IsCounting() && timer.elapsed() < budgetMs) {
        if (!counted_) {
            counted_ = std::make_unique<DbRecordset>(session_.Connection());
            if (!counted_->Open(u"SELECT * FROM "_s + FieldReference(tables_[next_++]), session_.Location(),
                                CursorType::Static, LockType::ReadOnly)) {
                isUnread_ = true;
                counted_.reset();
                continue;
            }
        }
        if (!counted_->CountStep(int(std::max<qint64>(budgetMs - timer.elapsed(), 1))))
            return;
        records_ += std::max<qint64>(counted_->RecordCount(), 0);
        counted_.reset();
    }
}

void DatabaseFacts::StopCounting()
{
    counted_.reset();
    next_ = tables_.size();
}

QString DatabaseFacts::RecordsText() const
{
    if (IsCounting())
        return StringText(Str::InformationCounting, {NumberText(records_)});
    return isUnread_ ? StringText(Str::InformationUnread) : NumberText(records_);
}

std::vector<DatabaseFacts::Fact> DatabaseFacts::Facts() const
{
    const QLocale locale = UserLocale::Current().Locale();
    const QFileInfo file(session_.Location().FilePath());
    const FileState state = FileState::Of(file.filePath());
    const QString stamp = session_.Stamp().isEmpty() ? StringText(Str::AboutNoStamp) : session_.Stamp();
    const QString unread = StringText(Str::InformationUnread);
    return {
        {Str::InformationName, file.fileName()},
        {Str::InformationFolder, QDir::toNativeSeparators(file.path())},
        {Str::InformationStamp, stamp},
        {Str::InformationSize, state.exists ? locale.formattedDataSize(state.sizeBytes, 1) : unread},
        {Str::InformationChanged, state.exists ? locale.toString(state.changed, QLocale::ShortFormat) : unread},
        {Str::InformationTables, isListed_ ? NumberText(tables_.size()) : unread},
        {Str::InformationRecords, isListed_ ? RecordsText() : unread},
        {Str::InformationForms, NumberText(qint64(session_.Store().Forms().size()))},
        {Str::InformationQueries, NumberText(qint64(session_.Store().Queries().size()))}};
}

} // namespace mirel
