#pragma once

#include "provider/dialect/schema.h"
#include "provider/sqlite/outcome.h"
#include "provider/sqlite/schema_ids.h"
#include "provider/sqlite/statement.h"

#include <QHash>
#include <QString>

#include <memory>

namespace mirel::sqlite {

// In the header of every file that this system makes: "Mirl".
inline constexpr qint32 kApplicationId = 0x4D69726C;

struct HandleCloser {
    void operator()(sqlite3* handle) const { sqlite3_close_v2(handle); }
};
using HandlePtr = std::unique_ptr<sqlite3, HandleCloser>;

// One database file that is open, the only handle on it in this process: another one that is opened and closed
// would drop the locks of this one. Files come from anywhere, so the handle trusts nothing that they say.
//
// Results and appenders share it; Close() takes it from all of them, and their calls find IsOpen() false.
class DatabaseFile {
public:
    // Never creates a file. A file without write permission is opened read-only.
    static std::shared_ptr<DatabaseFile> Open(const QString& path, Outcome& outcome);
    // A new, empty database. Fails when anything of that name exists, and leaves nothing behind then.
    static Outcome Create(const QString& path);
    // Deletes a database that nobody uses; what is no database stays.
    static Outcome Remove(const QString& path);

    ~DatabaseFile();
    Q_DISABLE_COPY_MOVE(DatabaseFile)

    bool IsOpen() const { return handle_ != nullptr; }
    void Close();
    const QString& Path() const { return path_; }
    bool IsReadOnly() const;
    sqlite3* Handle() const { return handle_.get(); }

    Outcome OutcomeOf(int resultCode) const;
    // An empty loan, and why, when it does not prepare.
    Statement Prepare(const QByteArray& sql, Outcome& outcome);
    Outcome Execute(const QByteArray& sql);
    // The number in the first row of `sql`; 0 when it fails.
    qint64 Number(const QByteArray& sql);

    // Takes up what the file's structure is now. What Schema() gave out before is gone then.
    Outcome RefreshSchema();
    const dialect::Schema& Schema() const { return schema_; }
    SchemaIds& Ids() { return ids_; }

    // Grows whenever records may have come to or gone from a table by this process. (What other programs do
    // shows in PRAGMA data_version, what this process does never.)
    quint64 TableVersion(const QString& table) const { return tableVersions_.value(table.toLower()) + rollbacks_; }
    void NoteChange(const QString& table) { ++tableVersions_[table.toLower()]; }
    // The same for values of records that stay where they are, of any table.
    quint64 ValuesVersion() const { return valuesVersion_; }
    void NoteValues() { ++valuesVersion_; }

    // What ProviderTransaction promises; each Begin that succeeds is ended once, by either of the others.
    Outcome BeginTransaction();
    Outcome CommitTransaction();
    void RollBackTransaction();
    bool IsOutermostTransaction() const { return depth_ == 1; }
    bool IsWriting() const { return depth_ > 0; }
    // A full disk or a failing device has taken it back already: what is written now would be on its own.
    bool IsTransactionLost() const { return depth_ > 0 && !InTransaction(); }
    // Grows with every change of the file's structure, by anybody.
    qint64 SchemaVersion() { return Number("PRAGMA schema_version"); }
    bool InTransaction() const { return handle_ && sqlite3_get_autocommit(handle_.get()) == 0; }

private:
    explicit DatabaseFile(QString path)
        : path_(std::move(path))
    {
    }
    Outcome OpenHandle(bool readOnly);

    QString path_;
    std::shared_ptr<StatementCache> cache_ = std::make_shared<StatementCache>();
    HandlePtr handle_;
    dialect::Schema schema_;
    SchemaIds ids_;
    qint64 schemaVersion_ = -1;
    QHash<QString, quint64> tableVersions_;
    quint64 valuesVersion_ = 0;
    quint64 rollbacks_ = 0; // each may have changed any table back
    int depth_ = 0;         // of transactions
    bool isJoined_ = false; // the outermost one is within a transaction that was there
    bool isDoomed_ = false; // an inner one was taken back: so is the whole
};

// The path under which a file is known whatever name it was reached by.
QString IdentityOfPath(const QString& path);

} // namespace mirel::sqlite
