#include "provider/sqlite/cedb_care.h"

#include "provider/sqlite/cedb_provider.h"
#include "provider/sqlite/database_file.h"
#include "provider/stop_check.h"
#include "resources/string_table.h"

#include <QFile>
#include <QFileInfo>
#include <QThread>

#include <atomic>
#include <chrono>
#include <cstdio>
#include <future>
#include <sqlite3.h>

namespace mirel::sqlite {
namespace {

using namespace Qt::StringLiterals;

constexpr int kPagesAtOnce = 256; // others wait no longer than that takes
constexpr int kThousandths = 1000;
constexpr unsigned long kBusyPauseMs = 20;
constexpr int kOperationsPerLook = 10'000;
constexpr std::chrono::milliseconds kLookPause(15);

// What the engine keeps beside a file until its changes are whole.
void RemoveJournals(const QString& path)
{
    for (const auto& ending : {u"-journal"_s, u"-wal"_s, u"-shm"_s})
        QFile::remove(path + ending);
}

// A file beside `target`, under a name that was free, which is gone again unless it was moved there.
class NewFile {
public:
    explicit NewFile(const QString& target)
        : path_(target + u".part"_s)
    {
        for (int number = 2; QFileInfo::exists(path_); ++number)
            path_ = target + u".part"_s + QString::number(number);
    }
    ~NewFile()
    {
        QFile::remove(path_);
        RemoveJournals(path_);
    }
    Q_DISABLE_COPY_MOVE(NewFile)

    const QString& Path() const { return path_; }
    // In one step, over what bears that name. The journal of a database that stood there and was not closed well
    // would be played back into the new one.
    Outcome MoveTo(const QString& target) const
    {
        if (std::rename(QFile::encodeName(path_).constData(), QFile::encodeName(target).constData()) == 0) {
            RemoveJournals(target);
            return {};
        }
        return {Hr::CannotOpen, StringText(Str::DatabaseFailure, {target, qt_error_string()})};
    }

private:
    QString path_;
};

Outcome CopyPages(DatabaseFile& from, const QString& path, const std::function<bool(int)>& progress)
{
    sqlite3* raw = nullptr;
    const int opened = sqlite3_open_v2(QFile::encodeName(path).constData(), &raw,
                                       SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE | SQLITE_OPEN_NOMUTEX, nullptr);
    const HandlePtr copy(raw);
    if (opened != SQLITE_OK)
        return OutcomeOfSqlite(opened, path, QString::fromUtf8(sqlite3_errmsg(raw)));
    sqlite3_backup* backup = sqlite3_backup_init(raw, "main", from.Handle(), "main");
    if (!backup)
        return OutcomeOfSqlite(sqlite3_errcode(raw), path, QString::fromUtf8(sqlite3_errmsg(raw)));
    int step = SQLITE_OK;
    bool goesOn = true;
    while (goesOn && (step == SQLITE_OK || step == SQLITE_BUSY || step == SQLITE_LOCKED)) {
        step = sqlite3_backup_step(backup, kPagesAtOnce);
        if (step == SQLITE_BUSY || step == SQLITE_LOCKED)
            QThread::msleep(kBusyPauseMs); // another program writes: until the user has enough of it
        const int pages = std::max(sqlite3_backup_pagecount(backup), 1);
        goesOn = progress(int(qint64(pages - sqlite3_backup_remaining(backup)) * kThousandths / pages));
    }
    const int finished = sqlite3_backup_finish(backup);
    if (step != SQLITE_DONE && !goesOn)
        return {kStopped, {}};
    const int result = step == SQLITE_DONE ? finished : step;
    return OutcomeOfSqlite(result, path, QString::fromUtf8(sqlite3_errmsg(raw)));
}

Outcome PutBelongings(const QString& path, const QByteArray& belongings)
{
    Outcome outcome;
    const std::shared_ptr<DatabaseFile> copy = DatabaseFile::Open(path, outcome);
    if (!copy)
        return outcome;
    const QByteArray table = kBelongingsTable;
    outcome = copy->Execute("DROP TABLE IF EXISTS " + table);
    if (outcome.Ok() && !belongings.isEmpty()) {
        outcome = copy->Execute("CREATE TABLE " + table + " (Content BLOB)");
        if (outcome.Ok()) {
            Statement insert = copy->Prepare("INSERT INTO " + table + " VALUES(?)", outcome);
            if (insert) {
                insert.Bind(1, Value::Binary(belongings));
                outcome = copy->OutcomeOf(insert.Step());
            }
        }
    }
    copy->Close();
    return outcome;
}

int IsStopped(void* stop)
{
    return static_cast<const std::atomic<bool>*>(stop)->load() ? 1 : 0;
}

// One statement that may take minutes, on a thread and a handle of its own: the engine cannot be left in the
// middle of a statement, and the window wants to live on. The engine shares the locks of this process among its
// handles.
Outcome RunAside(const QString& path, const std::function<bool()>& goesOn,
                 const std::function<Outcome(DatabaseFile&)>& work)
{
    std::atomic<bool> stop = false;
    std::future<Outcome> result = std::async(std::launch::async, [&] {
        Outcome outcome;
        const std::shared_ptr<DatabaseFile> file = DatabaseFile::Open(path, outcome);
        if (!file)
            return outcome;
        sqlite3_progress_handler(file->Handle(), kOperationsPerLook, IsStopped, &stop);
        outcome = work(*file);
        file->Close();
        return outcome;
    });
    while (result.wait_for(kLookPause) != std::future_status::ready) {
        if (!stop && !goesOn())
            stop = true;
    }
    const Outcome outcome = result.get();
    return stop && !outcome.Ok() ? Outcome{kStopped, {}} : outcome;
}

} // namespace

template <typename Work>
Hr CedbCare::OnFile(const DatabaseLocation& database, QString& context, Work work)
{
    Outcome outcome;
    if (const std::shared_ptr<DatabaseFile> file = provider_.FileOf(database, outcome))
        outcome = work(*file);
    context = outcome.context;
    return outcome.code;
}

Hr CedbCare::BackUp(const DatabaseLocation& database, const QString& target, const QByteArray& belongings,
                    const std::function<bool(int)>& progress, QString& context)
{
    return OnFile(database, context, [&](DatabaseFile& file) -> Outcome {
        if (IdentityOfPath(target) == file.Path())
            return {Hr::CannotOpen, StringText(Str::CopyOntoItself, {target})};
        const NewFile copy(target);
        Outcome outcome = CopyPages(file, copy.Path(), progress);
        if (outcome.Ok())
            outcome = PutBelongings(copy.Path(), belongings);
        return outcome.Ok() ? copy.MoveTo(target) : outcome;
    });
}

QByteArray CedbCare::Belongings(const DatabaseLocation& database)
{
    QByteArray content;
    QString context;
    (void)OnFile(database, context, [&](DatabaseFile& file) -> Outcome {
        const QByteArray table = kBelongingsTable;
        if (file.Number("SELECT count(*) FROM sqlite_schema WHERE type='table' AND name='" + table + "'") == 0)
            return {};
        Outcome outcome;
        Statement row = file.Prepare("SELECT Content FROM " + table + " LIMIT 1", outcome);
        if (row && row.Step() == SQLITE_ROW)
            content = QByteArray(static_cast<const char*>(sqlite3_column_blob(row.Get(), 0)),
                                 sqlite3_column_bytes(row.Get(), 0));
        return outcome;
    });
    return content;
}

Hr CedbCare::Compact(const DatabaseLocation& database, const std::function<bool()>& goesOn, QString& context)
{
    QString path;
    const Hr found = OnFile(database, context, [&path](DatabaseFile& file) -> Outcome {
        path = file.Path();
        if (file.IsReadOnly())
            return {Hr::AccessDenied, StringText(Str::DatabaseIsReadOnly, {path})};
        return {};
    });
    if (Failed(found))
        return found;
    provider_.CloseDatabase(database); // results that read on would be in its way
    const Outcome outcome = RunAside(path, goesOn, [](DatabaseFile& file) { return file.Execute("VACUUM"); });
    context = outcome.context;
    return outcome.code;
}

Hr CedbCare::Check(const DatabaseLocation& database, const std::function<bool()>& goesOn, QStringList& findings,
                   QString& context)
{
    QString path;
    const Hr found = OnFile(database, context, [&path](DatabaseFile& file) -> Outcome {
        path = file.Path();
        return {};
    });
    if (Failed(found))
        return found;
    QStringList lines;
    const Outcome outcome = RunAside(path, goesOn, [&lines](DatabaseFile& file) {
        Outcome step;
        Statement row = file.Prepare("PRAGMA integrity_check", step);
        if (!row)
            return step;
        int result = row.Step();
        for (; result == SQLITE_ROW; result = row.Step()) {
            if (const QString finding = row.Text(0); finding != u"ok")
                lines += finding.split(u'\n');
        }
        return file.OutcomeOf(result);
    });
    findings += lines;
    context = outcome.context;
    return outcome.code;
}

} // namespace mirel::sqlite
