// A process that is killed at any moment of a run leaves a whole file, with all of the run or with nothing of it.
#include "forms/form_store.h"
#include "support/printing.h"
#include "support/sqlite_file.h"

#include <gtest/gtest.h>

#include <QElapsedTimer>
#include <QFile>
#include <QProcess>
#include <QRandomGenerator>
#include <QTemporaryDir>
#include <QtEndian>

#include <csignal>
#include <sys/wait.h>
#include <unistd.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kRecords = 60000;
constexpr int kRounds = 17; // of each of the three kinds of run: some fifty kills

class Kill : public ::testing::Test {
protected:
    void SetUp() override
    {
        ASSERT_TRUE(folder_.isValid());
        QFile csv(Path(u"rows.csv"_s));
        ASSERT_TRUE(csv.open(QIODevice::WriteOnly));
        for (int i = 0; i < kRecords; ++i)
            csv.write("row " + QByteArray::number(i) + "," + QByteArray::number(i) + ",2001-07-04\n");
        csv.close();
        Run({u"new"_s, Path(u"empty.cdb"_s)});
        Run({u"sql"_s, Path(u"empty.cdb"_s), u"CREATE TABLE T (A Varchar(40), B Integer, C DateTime)"_s});
        QFile::copy(Path(u"empty.cdb"_s), Path(u"full.cdb"_s));
        Run(Import(u"full.cdb"_s));
        Run({u"sql"_s, Path(u"full.cdb"_s), u"CREATE INDEX T_A ON T (A ASC)"_s});
    }

    QString Path(const QString& name) const { return folder_.filePath(name); }
    QStringList Import(const QString& database) const
    {
        return {u"import"_s, Path(database), Path(u"rows.csv"_s), u"--table"_s, u"T"_s, u"--date-order"_s, u"3"_s};
    }

    void Run(const QStringList& arguments)
    {
        QProcess process;
        process.start(QStringLiteral(MIREL_CLI), arguments);
        ASSERT_TRUE(process.waitForFinished(60000));
        ASSERT_EQ(process.exitCode(), 0) << process.readAllStandardError().toStdString();
    }

    // Runs the command on a fresh copy of `original`, once to its end to know how long it takes, then kills it at
    // random moments; `check` sees the file after each kill.
    template <typename Check>
    void KillRounds(const QString& original, const QStringList& arguments, Check check)
    {
        const QString victim = Path(u"victim.cdb"_s);
        QElapsedTimer timer;
        int killed = 0;
        qint64 wholeRunMs = 0;
        for (int round = 0; round <= kRounds; ++round) {
            QFile::remove(victim);
            QFile::remove(victim + u"-journal"_s);
            ASSERT_TRUE(QFile::copy(Path(original), victim));
            QProcess process;
            timer.start();
            process.start(QStringLiteral(MIREL_CLI), arguments);
            ASSERT_TRUE(process.waitForStarted());
            if (round > 0 && !process.waitForFinished(int(QRandomGenerator::global()->bounded(wholeRunMs + 1)))) {
                ::kill(pid_t(process.processId()), SIGKILL);
                ++killed;
            }
            ASSERT_TRUE(process.state() == QProcess::NotRunning || process.waitForFinished(60000));
            if (round == 0)
                wholeRunMs = timer.elapsed();
            SqliteFile file(victim);
            ASSERT_EQ(file.Text("PRAGMA integrity_check"), u"ok"_s) << "round " << round;
            check(file);
        }
        EXPECT_GT(killed, 0);
    }

    QTemporaryDir folder_;
};

TEST_F(Kill, LeavesAllOfAnImportOrNothing)
{
    QStringList arguments = Import(u"victim.cdb"_s);
    KillRounds(u"empty.cdb"_s, arguments, [](SqliteFile& file) {
        const int records = file.Text("SELECT count(*) FROM T").toInt();
        EXPECT_TRUE(records == 0 || records == kRecords) << records;
    });
}

TEST_F(Kill, LeavesAllOfAnUpdateOrNothing)
{
    KillRounds(u"full.cdb"_s, {u"sql"_s, Path(u"victim.cdb"_s), u"UPDATE T SET A = 'changed', B = B + 1"_s},
               [](SqliteFile& file) {
                   const int changed = file.Text("SELECT count(*) FROM T WHERE A = 'changed'").toInt();
                   EXPECT_TRUE(changed == 0 || changed == kRecords) << changed;
                   EXPECT_EQ(file.Text("SELECT count(*) FROM T").toInt(), kRecords);
               });
}

TEST_F(Kill, LeavesATableInItsOldShapeOrItsNew)
{
    KillRounds(u"full.cdb"_s, {u"sql"_s, Path(u"victim.cdb"_s), u"ALTER TABLE T MOVE C BEFORE A"_s},
               [](SqliteFile& file) {
                   const QString columns = file.Column("SELECT name FROM pragma_table_info('T')").join(u',');
                   EXPECT_TRUE(columns == u"A,B,C"_s || columns == u"C,A,B"_s) << columns.toStdString();
                   EXPECT_EQ(file.Column("SELECT name FROM sqlite_schema WHERE type='table' AND name NOT LIKE "
                                         "'MirelSys%' AND name NOT LIKE 'sqlite%'"),
                             QStringList(u"T"_s));
                   EXPECT_EQ(file.Text("SELECT count(*) FROM T").toInt(), kRecords);
                   EXPECT_EQ(file.Text("SELECT count(*) FROM sqlite_schema WHERE type='index'"), u"1"_s);
               });
}

// The file's own count of the transactions that were written to it.
quint32 Transactions(const QString& path)
{
    constexpr qint64 kChangeCounterAt = 24;
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly) && file.seek(kChangeCounterAt));
    return qFromBigEndian<quint32>(file.read(4).constData());
}

TEST_F(Kill, LeavesAMillionRecordsWhereAMoveOfTheirColumnWasUnderWay)
{
    const QString path = Path(u"million.cdb"_s);
    QFile::copy(Path(u"empty.cdb"_s), path);
    SqliteFile(path).Run("WITH RECURSIVE s(n) AS (SELECT 1 UNION ALL SELECT n+1 FROM s WHERE n<1000000) "
                         "INSERT INTO T(rowid,A,B) SELECT n*2,'name '||n,n FROM s");
    const QByteArray kSums = "SELECT count(*)||' '||sum(rowid*B)||' '||sum(length(A)) FROM T";
    const QString sums = SqliteFile(path).Text(kSums);
    const quint32 transactions = Transactions(path);
    const QStringList move = {u"sql"_s, path, u"ALTER TABLE T MOVE B BEFORE A"_s};

    QProcess process;
    process.start(QStringLiteral(MIREL_CLI), move);
    ASSERT_TRUE(process.waitForStarted());
    while (!QFile::exists(path + u"-journal"_s) && !process.waitForFinished(1)) {
    }
    ::usleep(100'000); // rows are being written now
    ::kill(pid_t(process.processId()), SIGKILL);
    ASSERT_TRUE(process.waitForFinished(60000));
    ASSERT_EQ(process.exitStatus(), QProcess::CrashExit) << "it was done before it was killed";
    {
        SqliteFile file(path);
        EXPECT_EQ(file.Column("SELECT name FROM pragma_table_info('T')").join(u','), u"A,B,C"_s);
        EXPECT_EQ(file.Text(kSums), sums);
        EXPECT_EQ(file.Text("PRAGMA quick_check"), u"ok"_s);
    }
    EXPECT_EQ(Transactions(path), transactions);

    Run(move);
    SqliteFile file(path);
    EXPECT_EQ(file.Column("SELECT name FROM pragma_table_info('T')").join(u','), u"B,A,C"_s);
    EXPECT_EQ(file.Text(kSums), sums);
    EXPECT_EQ(Transactions(path), transactions + 1);
}

FormStore StoreOf(const QString& path, int queries)
{
    FormStore store(path);
    for (int i = 0; i < queries; ++i) {
        QueryDef query;
        query.SetName(u"Query %1 of %2"_s.arg(QString::number(i), QString::number(queries)));
        query.SetText(QString(2000, u'x'));
        store.AddQuery(query);
    }
    return store;
}

// The child does nothing but save, one store after the other, so that the kill meets a save.
TEST_F(Kill, LeavesTheOldStoreOrTheNew)
{
    const QString path = Path(u"Mirel_20260101000000.RAF"_s);
    for (int round = 0; round < kRounds; ++round) {
        const pid_t child = ::fork();
        ASSERT_GE(child, 0);
        if (child == 0) {
            for (int queries = 1;; queries = queries % 50 + 1) {
                if (!StoreOf(path, queries).Save())
                    ::_exit(1);
            }
        }
        ::usleep(20000 + QRandomGenerator::global()->bounded(30000));
        ::kill(child, SIGKILL);
        int status = 0;
        ASSERT_EQ(::waitpid(child, &status, 0), child);
        ASSERT_TRUE(WIFSIGNALED(status));
        FormStore store(path);
        ASSERT_TRUE(store.Load());
        const size_t queries = store.Queries().size();
        ASSERT_GT(queries, 0U);
        for (const QueryDef& query : store.Queries())
            EXPECT_TRUE(query.name.Text().endsWith(u" of %1"_s.arg(queries)));
    }
}

} // namespace
} // namespace mirel
