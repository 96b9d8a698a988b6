#pragma once

#include "provider/provider.h"
#include "provider/sqlite/cedb_care.h"
#include "provider/sqlite/outcome.h"

#include <QHash>

#include <memory>

namespace mirel::sqlite {

class DatabaseFile;

// The provider "cedb": databases in SQLite files, one handle a file.
class CedbProvider : public ProviderConnection {
public:
    CedbProvider() = default;
    ~CedbProvider() override;
    Q_DISABLE_COPY_MOVE(CedbProvider)

    std::unique_ptr<ProviderRecordset> CreateRecordset() override;
    std::unique_ptr<RecordAppender> CreateAppender(const DatabaseLocation& database, const QString& table,
                                                   const QStringList& columns, Hr& result,
                                                   QString& context) override;
    std::unique_ptr<RecordEditor> CreateEditor(const DatabaseLocation& database, const QString& table, Hr& result,
                                               QString& context) override;
    std::unique_ptr<ProviderTransaction> BeginTransaction(const DatabaseLocation& database, Hr& result,
                                                          QString& context) override;
    void CloseDatabase(const DatabaseLocation& database) override;
    DatabaseCare& Care() override { return care_; }

    // The file of that path, opened when it is not yet; null, and why, when it cannot be.
    std::shared_ptr<DatabaseFile> FileOf(const DatabaseLocation& database, Outcome& outcome);

private:
    CedbCare care_{*this};
    QHash<QString, std::shared_ptr<DatabaseFile>> files_; // by IdentityOfPath
};

} // namespace mirel::sqlite
