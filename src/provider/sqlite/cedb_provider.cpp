#include "provider/sqlite/cedb_provider.h"

#include "provider/sqlite/cedb_recordset.h"
#include "provider/sqlite/database_file.h"
#include "provider/sqlite/table_appender.h"

namespace mirel::sqlite {

CedbProvider::~CedbProvider()
{
    for (const std::shared_ptr<DatabaseFile>& file : std::as_const(files_))
        file->Close();
}

std::shared_ptr<DatabaseFile> CedbProvider::FileOf(const QString& database, Outcome& outcome)
{
    outcome = {};
    const QString identity = IdentityOfPath(database);
    if (const auto open = files_.constFind(identity); open != files_.constEnd())
        return *open;
    std::shared_ptr<DatabaseFile> file = DatabaseFile::Open(database, outcome);
    if (file)
        files_.insert(identity, file);
    return file;
}

std::unique_ptr<ProviderRecordset> CedbProvider::CreateRecordset()
{
    return std::make_unique<CedbRecordset>(*this);
}

std::unique_ptr<RecordAppender> CedbProvider::CreateAppender(const QString& database, const QString& table,
                                                             const QStringList& columns, Hr& result,
                                                             QString& context)
{
    Outcome outcome;
    std::unique_ptr<RecordAppender> appender;
    if (const std::shared_ptr<DatabaseFile> file = FileOf(database, outcome))
        appender = OpenAppender(file, table, columns, outcome);
    result = outcome.code;
    context = outcome.context;
    return appender;
}

Hr CedbProvider::BeginBulk(const QString& database)
{
    Outcome outcome;
    const std::shared_ptr<DatabaseFile> file = FileOf(database, outcome);
    return file ? file->BeginBulk().code : outcome.code;
}

Hr CedbProvider::EndBulk(const QString& database)
{
    Outcome outcome;
    const std::shared_ptr<DatabaseFile> file = FileOf(database, outcome);
    return file ? file->EndBulk().code : outcome.code;
}

void CedbProvider::CloseDatabase(const QString& database)
{
    if (const std::shared_ptr<DatabaseFile> file = files_.take(IdentityOfPath(database)))
        file->Close();
}

} // namespace mirel::sqlite
