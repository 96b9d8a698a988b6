#include "provider/sqlite/database_file.h"

#include "platform/system_reason.h"
#include "provider/sqlite/functions.h"
#include "provider/sqlite/schema_reader.h"
#include "provider/sqlite/system_tables.h"
#include "provider/stop_check.h"
#include "resources/string_table.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <array>

namespace mirel::sqlite {

using namespace Qt::StringLiterals;

namespace {

constexpr int kBusyTimeoutMs = 3000;

// Once a process, before its first handle: one thread uses a handle, nobody reads memory statistics, and a
// path is a path, never a URI.
void ConfigureLibrary()
{
    static const bool configured = [] {
        sqlite3_config(SQLITE_CONFIG_MEMSTATUS, 0);
        sqlite3_config(SQLITE_CONFIG_URI, 0);
        return sqlite3_initialize() == SQLITE_OK;
    }();
    Q_UNUSED(configured)
}

struct Limit {
    int what;
    int value;
};
// Above what any database of this system needs, below what takes the machine down.
constexpr std::array kLimits = {
    Limit{SQLITE_LIMIT_LENGTH, 512 << 20},    Limit{SQLITE_LIMIT_SQL_LENGTH, 192 << 20},
    Limit{SQLITE_LIMIT_COMPOUND_SELECT, 100}, Limit{SQLITE_LIMIT_TRIGGER_DEPTH, 32},
    Limit{SQLITE_LIMIT_ATTACHED, 1}, // compacting attaches its new file
};

struct Option {
    int what;
    int value;
};
constexpr std::array kOptions = {
    Option{SQLITE_DBCONFIG_DEFENSIVE, 1},
    Option{SQLITE_DBCONFIG_TRUSTED_SCHEMA, 0},
    Option{SQLITE_DBCONFIG_DQS_DML, 0},
    Option{SQLITE_DBCONFIG_DQS_DDL, 0},
    Option{SQLITE_DBCONFIG_ENABLE_LOAD_EXTENSION, 0},
};

// Results that are kept as rows lie in temporary tables; a view without an end must not fill the disk.
constexpr const char* kSettings = "PRAGMA cell_size_check=ON;"
                                  "PRAGMA temp.max_page_count=1048576;";
// The page size holds from the first page that is written.
const QByteArray kNewDatabase =
    "PRAGMA page_size=16384; PRAGMA application_id=" + QByteArray::number(kApplicationId);

// The engine takes a few milliseconds for so many operations.
constexpr int kOperationsPerLook = 200'000;

// A statement that writes is left alone: ending it would take back the whole run that it is part of.
int EndLongRead(void* handle)
{
    return sqlite3_txn_state(static_cast<sqlite3*>(handle), "main") != SQLITE_TXN_WRITE && IsStopWanted() ? 1 : 0;
}

// What the engine keeps beside a database.
constexpr std::array kCompanions = {"-journal", "-wal", "-shm"};

QString CompanionOf(const QString& path, const char* suffix)
{
    return path + QLatin1String(suffix);
}

Outcome CheckName(const QString& path)
{
    if (path.isEmpty())
        return {Hr::CannotOpen, StringText(Str::NoDatabaseNamed)};
    if (path.contains(QChar::Null)) // the system would take the part before it for the name
        return {Hr::CannotOpen, StringText(Str::DatabaseIsNoFile, {path})};
    return {};
}

// The engine opens what bears these names, and a pipe would keep it waiting for ever.
Outcome CheckCompanions(const QString& path)
{
    for (const char* suffix : kCompanions) {
        const QFileInfo companion(CompanionOf(path, suffix));
        if (companion.exists() && !companion.isFile())
            return {Hr::CannotOpen, StringText(Str::DatabaseIsNoFile, {companion.filePath()})};
    }
    return {};
}

Outcome CheckFile(const QString& path)
{
    if (Outcome outcome = CheckName(path); !outcome.Ok())
        return outcome;
    const QFileInfo info(path);
    if (!info.exists())
        return {Hr::CannotOpen, StringText(Str::DatabaseNotFound, {path})};
    if (!info.isFile()) // a folder, or a device that would never end
        return {Hr::CannotOpen, StringText(Str::DatabaseIsNoFile, {path})};
    if (info.size() == 0) // the engine would make a database of it
        return {Hr::NotADatabase, StringText(Str::FileIsNoDatabase, {path})};
    return CheckCompanions(IdentityOfPath(path));
}

bool MayBeWritten(const QString& path)
{
    constexpr auto kWrite = QFile::WriteOwner | QFile::WriteGroup | QFile::WriteOther;
    const QFileInfo info(path);
    return (info.permissions() & kWrite) && info.isWritable();
}

} // namespace

QString IdentityOfPath(const QString& path)
{
    const QFileInfo info(path);
    const QString canonical = info.canonicalFilePath();
    return canonical.isEmpty() ? QDir::cleanPath(info.absoluteFilePath()) : canonical;
}

std::shared_ptr<DatabaseFile> DatabaseFile::Open(const QString& path, Outcome& outcome)
{
    outcome = CheckFile(path);
    if (!outcome.Ok())
        return {};
    std::shared_ptr<DatabaseFile> file(new DatabaseFile(IdentityOfPath(path)));
    outcome = file->OpenHandle(!MayBeWritten(path));
    if (outcome.Ok())
        outcome = file->RefreshSchema();
    return outcome.Ok() ? file : nullptr;
}

Outcome DatabaseFile::OpenHandle(bool readOnly)
{
    ConfigureLibrary();
    const int flags = (readOnly ? SQLITE_OPEN_READONLY : SQLITE_OPEN_READWRITE) | SQLITE_OPEN_NOMUTEX;
    sqlite3* raw = nullptr;
    int result = sqlite3_open_v2(QFile::encodeName(path_).constData(), &raw, flags, nullptr);
    handle_.reset(raw);
    if (result != SQLITE_OK)
        return OutcomeOf(result);
    sqlite3_extended_result_codes(raw, 1);
    sqlite3_busy_timeout(raw, kBusyTimeoutMs);
    for (const Limit& limit : kLimits)
        sqlite3_limit(raw, limit.what, limit.value);
    for (const Option& option : kOptions)
        sqlite3_db_config(raw, option.what, option.value, nullptr);
    sqlite3_progress_handler(raw, kOperationsPerLook, EndLongRead, raw);
    result = RegisterFunctions(raw);
    if (result == SQLITE_OK)
        result = RegisterSystemTables(raw, schema_);
    if (result == SQLITE_OK)
        result = sqlite3_exec(raw, kSettings, nullptr, nullptr, nullptr);
    return OutcomeOf(result);
}

Outcome DatabaseFile::Create(const QString& path)
{
    if (Outcome outcome = CheckName(path); !outcome.Ok())
        return outcome;
    QFile place(path);
    if (!place.open(QIODevice::WriteOnly | QIODevice::NewOnly)) {
        if (QFileInfo::exists(path))
            return {Hr::CannotOpen, StringText(Str::DatabaseExists, {path})};
        return {Hr::CannotOpen, StringText(Str::DatabaseFailure, {path, SystemReason(place)})};
    }
    place.close();
    DatabaseFile file(IdentityOfPath(path));
    Outcome outcome = file.OpenHandle(false);
    if (outcome.Ok())
        outcome = file.OutcomeOf(sqlite3_exec(file.Handle(), kNewDatabase.constData(), nullptr, nullptr, nullptr));
    file.Close();
    if (!outcome.Ok())
        QFile::remove(path);
    return outcome;
}

Outcome DatabaseFile::Remove(const QString& path)
{
    Outcome outcome;
    const std::shared_ptr<DatabaseFile> file = Open(path, outcome);
    if (!file)
        return outcome;
    if (file->IsReadOnly())
        return {Hr::AccessDenied, StringText(Str::DatabaseIsReadOnly, {path})};
    outcome = file->Execute("BEGIN EXCLUSIVE"); // busy while another program reads or writes
    file->Close();
    if (!outcome.Ok())
        return outcome;
    QFile whole(file->Path());
    if (!whole.remove())
        return {Hr::AccessDenied, StringText(Str::DatabaseFailure, {path, SystemReason(whole)})};
    for (const char* suffix : kCompanions)
        QFile::remove(CompanionOf(file->Path(), suffix));
    return {};
}

DatabaseFile::~DatabaseFile()
{
    Close();
}

void DatabaseFile::Close()
{
    cache_->Clear();
    cache_ = std::make_shared<StatementCache>(); // loans that are still out find theirs gone
    handle_.reset();
    depth_ = 0;
}

bool DatabaseFile::IsReadOnly() const
{
    return !handle_ || sqlite3_db_readonly(handle_.get(), "main") != 0;
}

Outcome DatabaseFile::OutcomeOf(int resultCode) const
{
    if (resultCode == SQLITE_OK || resultCode == SQLITE_ROW || resultCode == SQLITE_DONE)
        return {};
    const QString reason = handle_ ? QString::fromUtf8(sqlite3_errmsg(handle_.get())) : QString();
    return OutcomeOfSqlite(resultCode, path_, reason);
}

Statement DatabaseFile::Prepare(const QByteArray& sql, Outcome& outcome)
{
    Statement statement = cache_->Lend(handle_.get(), sql);
    outcome = statement ? Outcome() : OutcomeOf(sqlite3_extended_errcode(handle_.get()));
    return statement;
}

Outcome DatabaseFile::Execute(const QByteArray& sql)
{
    Outcome outcome;
    Statement statement = Prepare(sql, outcome);
    if (!statement)
        return outcome;
    int result = SQLITE_ROW;
    while (result == SQLITE_ROW)
        result = statement.Step();
    return OutcomeOf(result);
}

qint64 DatabaseFile::Number(const QByteArray& sql)
{
    Outcome outcome;
    Statement statement = Prepare(sql, outcome);
    return statement && statement.Step() == SQLITE_ROW ? statement.Integer(0) : 0;
}

Outcome DatabaseFile::RefreshSchema()
{
    Outcome outcome;
    qint64 version = 0;
    {
        Statement statement = Prepare("PRAGMA schema_version", outcome);
        if (!statement)
            return outcome;
        const int result = statement.Step();
        if (result != SQLITE_ROW)
            return OutcomeOf(result);
        version = statement.Integer(0);
    }
    if (version == schemaVersion_)
        return {};
    dialect::Schema fresh;
    outcome = ReadSchema(*this, fresh);
    if (outcome.Ok()) {
        schema_ = std::move(fresh);
        schemaVersion_ = version;
    }
    return outcome;
}

Outcome DatabaseFile::BeginTransaction()
{
    if (depth_ == 0) {
        isDoomed_ = false;
        isJoined_ = InTransaction(); // a walk of ours writes on its way
        if (const Outcome outcome = Execute(isJoined_ ? "SAVEPOINT changes" : "BEGIN IMMEDIATE"); !outcome.Ok())
            return outcome;
    }
    ++depth_;
    return {};
}

Outcome DatabaseFile::CommitTransaction()
{
    if (depth_ == 0)
        return {Hr::Unexpected, {}};
    if (depth_ > 1) {
        --depth_;
        return {};
    }
    Outcome outcome;
    if (isDoomed_ || !InTransaction()) // taken back within, or by a full disk or a failing device
        outcome = {Hr::Unexpected, StringText(Str::BulkRunUndone, {path_})};
    else
        outcome = Execute(isJoined_ ? "RELEASE changes" : "COMMIT");
    if (outcome.Ok())
        --depth_;
    else
        RollBackTransaction();
    return outcome;
}

void DatabaseFile::RollBackTransaction()
{
    if (depth_ == 0)
        return;
    isDoomed_ = true;
    if (--depth_ > 0)
        return;
    ++rollbacks_;
    schemaVersion_ = -1; // the next change of the structure may get the number of one that is taken back
    if (!InTransaction())
        return;
    (void)Execute(isJoined_ ? "ROLLBACK TO changes" : "ROLLBACK");
    if (isJoined_)
        (void)Execute("RELEASE changes");
}

} // namespace mirel::sqlite
