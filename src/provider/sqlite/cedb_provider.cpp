#include "provider/sqlite/cedb_provider.h"

#include "provider/sqlite/cedb_recordset.h"
#include "provider/sqlite/database_file.h"
#include "provider/sqlite/table_appender.h"
#include "provider/sqlite/table_editor.h"
#include "resources/string_table.h"

namespace mirel::sqlite {
namespace {

class FileTransaction : public ProviderTransaction {
public:
    explicit FileTransaction(std::shared_ptr<DatabaseFile> file)
        : file_(std::move(file))
    {
    }
    ~FileTransaction() override
    {
        if (!isEnded_ && file_->IsOpen())
            file_->RollBackTransaction();
    }
    Q_DISABLE_COPY_MOVE(FileTransaction)

    Hr Commit() override
    {
        if (isEnded_ || !file_->IsOpen())
            return Hr::NotOpen;
        isEnded_ = true;
        Outcome outcome = file_->CommitTransaction();
        context_ = std::move(outcome.context);
        return outcome.code;
    }
    QString ErrorContext() const override { return context_; }

private:
    std::shared_ptr<DatabaseFile> file_;
    QString context_;
    bool isEnded_ = false;
};

} // namespace

CedbProvider::~CedbProvider()
{
    for (const std::shared_ptr<DatabaseFile>& file : std::as_const(files_))
        file->Close();
}

std::shared_ptr<DatabaseFile> CedbProvider::FileOf(const DatabaseLocation& database, Outcome& outcome)
{
    outcome = {};
    if (database.IsAddress()) {
        outcome = {Hr::CannotOpen, StringText(Str::DatabaseIsNoFile, {database.Text()})};
        return nullptr;
    }
    const QString identity = IdentityOfPath(database.FilePath());
    if (const auto open = files_.constFind(identity); open != files_.constEnd())
        return *open;
    std::shared_ptr<DatabaseFile> file = DatabaseFile::Open(database.FilePath(), outcome);
    if (file)
        files_.insert(identity, file);
    return file;
}

std::unique_ptr<ProviderRecordset> CedbProvider::CreateRecordset()
{
    return std::make_unique<CedbRecordset>(*this);
}

std::unique_ptr<RecordAppender> CedbProvider::CreateAppender(const DatabaseLocation& database,
                                                             const QString& table, const QStringList& columns,
                                                             Hr& result, QString& context)
{
    Outcome outcome;
    std::unique_ptr<RecordAppender> appender;
    if (const std::shared_ptr<DatabaseFile> file = FileOf(database, outcome))
        appender = OpenAppender(file, table, columns, outcome);
    result = outcome.code;
    context = outcome.context;
    return appender;
}

std::unique_ptr<RecordEditor> CedbProvider::CreateEditor(const DatabaseLocation& database, const QString& table,
                                                         Hr& result, QString& context)
{
    Outcome outcome;
    std::unique_ptr<RecordEditor> editor;
    if (const std::shared_ptr<DatabaseFile> file = FileOf(database, outcome))
        editor = OpenEditor(file, table, outcome);
    result = outcome.code;
    context = outcome.context;
    return editor;
}

std::unique_ptr<ProviderTransaction> CedbProvider::BeginTransaction(const DatabaseLocation& database, Hr& result,
                                                                    QString& context)
{
    Outcome outcome;
    const std::shared_ptr<DatabaseFile> file = FileOf(database, outcome);
    if (file)
        outcome = file->BeginTransaction();
    result = outcome.code;
    context = outcome.context;
    return outcome.Ok() ? std::make_unique<FileTransaction>(file) : nullptr;
}

void CedbProvider::CloseDatabase(const DatabaseLocation& database)
{
    if (const std::shared_ptr<DatabaseFile> file = files_.take(IdentityOfPath(database.FilePath())))
        file->Close();
}

} // namespace mirel::sqlite
