// Files that were made to do harm, or that no care was taken with: refused or shown, never followed.
#include "provider/database_fixture.h"
#include "provider/stop_check.h"

#include <QElapsedTimer>
#include <QFileInfo>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class HostileFile : public DatabaseFixture {
protected:
    QByteArray Bytes() const
    {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }
    // A file of another program in place of the fixture's own.
    void Make(const QByteArray& sql)
    {
        provider->CloseDatabase(path);
        QFile::remove(path);
        Outside(sql);
    }
    std::unique_ptr<ProviderRecordset> TryOpen(const QString& source, Hr& hr)
    {
        auto recordset = provider->CreateRecordset();
        hr = recordset->Open(source, path, CursorType::Static, LockType::Optimistic);
        context = recordset->ErrorContext();
        return recordset;
    }
    QStringList UserTables()
    {
        return Rows(u"SELECT TableName FROM MSysTables WHERE not TableName LIKE 'MSys%' ORDER BY TableName"_s);
    }
};

// Rights as a user has them: the superuser of a test machine may write everywhere.
class UsersRights {
public:
    UsersRights()
        : before_(geteuid())
    {
        if (before_ == 0) {
            EXPECT_EQ(seteuid(65534), 0);
        }
    }
    ~UsersRights()
    {
        if (before_ == 0) {
            EXPECT_EQ(seteuid(before_), 0);
        }
    }
    Q_DISABLE_COPY_MOVE(UsersRights)

private:
    uid_t before_;
};

TEST_F(HostileFile, IsNoFileAtAll)
{
    const auto make = [this](const QString& name, auto call) {
        EXPECT_EQ(call(QFile::encodeName(PathOf(name)).constData()), 0) << name.toStdString();
    };
    make(u"pipe.cdb"_s, [](const char* name) { return mkfifo(name, 0600); });
    make(u"to pipe.cdb"_s, [](const char* name) { return symlink("pipe.cdb", name); });
    make(u"device.cdb"_s, [](const char* name) { return symlink("/dev/zero", name); });
    make(u"loop.cdb"_s, [](const char* name) { return symlink("loop.cdb", name); });
    make(u"dangling.cdb"_s, [](const char* name) { return symlink("nothing.cdb", name); });
    const QString long_name = QString(300, u'n') + u".cdb"_s;
    for (const QString& name : {u"pipe.cdb"_s, u"to pipe.cdb"_s, u"device.cdb"_s, u"loop.cdb"_s, u"dangling.cdb"_s,
                                long_name, u"nul\0.cdb"_s}) {
        EXPECT_EQ(Try(u"SELECT * FROM T"_s, PathOf(name)), Hr::CannotOpen) << name.toStdString();
        EXPECT_FALSE(context.isEmpty()) << name.toStdString();
        EXPECT_TRUE(Failed(Try(u"CREATE DATABASE '%1'"_s.arg(PathOf(name)), {}))) << name.toStdString();
        EXPECT_TRUE(Failed(Try(u"DROP DATABASE '%1'"_s.arg(PathOf(name)), {}))) << name.toStdString();
    }
    EXPECT_TRUE(QFileInfo(PathOf(u"to pipe.cdb"_s)).isSymLink());
    EXPECT_FALSE(QFileInfo::exists(PathOf(u"nothing.cdb"_s)));
}

TEST_F(HostileFile, LiesInAFolderThatCannotBeWritten)
{
    Run(u"CREATE TABLE T (A Integer)"_s);
    Run(u"INSERT INTO T (A) VALUES (1)"_s);
    provider->CloseDatabase(path);
    chmod(QFile::encodeName(path).constData(), 0666);
    ASSERT_EQ(chmod(QFile::encodeName(folder.path()).constData(), 0555), 0);
    {
        const UsersRights user;
        EXPECT_EQ(Rows(u"T"_s), QStringList{u"1"_s});
        EXPECT_EQ(Try(u"DELETE FROM T"_s), Hr::AccessDenied) << context.toStdString();
        EXPECT_TRUE(context.contains(path)) << context.toStdString();
        EXPECT_EQ(Try(u"DROP DATABASE '%1'"_s.arg(path), {}), Hr::AccessDenied) << context.toStdString();
        EXPECT_EQ(Rows(u"T"_s), QStringList{u"1"_s});
    }
    provider->CloseDatabase(path);
    QFile::setPermissions(path, QFile::WriteOwner);
    {
        const UsersRights user;
        Hr hr{};
        TryOpen(u"T"_s, hr);
        EXPECT_TRUE(hr == Hr::CannotOpen || hr == Hr::AccessDenied) << "may not be read";
        EXPECT_TRUE(context.contains(path)) << context.toStdString();
    }
    chmod(QFile::encodeName(folder.path()).constData(), 0755);
}

// Each is opened and every table read and changed; what the schema wants to run beside that is not run.
TEST_F(HostileFile, HasASchemaThatRunsThings)
{
    const struct {
        const char* what;
        QByteArray sql;
        QString table;
        Hr opens;
        Hr writes;
    } rows[] = {
        {"trigger",
         "CREATE TABLE t(a); CREATE TABLE log(n); INSERT INTO t VALUES(1);"
         "CREATE TRIGGER x AFTER UPDATE ON t BEGIN INSERT INTO log VALUES(new.a); END",
         u"t"_s, Hr::Ok, Hr::Ok},
        {"trigger that refuses",
         "CREATE TABLE t(a); INSERT INTO t VALUES(1);"
         "CREATE TRIGGER x BEFORE UPDATE ON t BEGIN SELECT RAISE(ABORT,'not here'); END",
         u"t"_s, Hr::Ok, Hr::IntegrityViolation},
        {"trigger without end",
         "CREATE TABLE t(a); INSERT INTO t VALUES(1); PRAGMA recursive_triggers=1;"
         "CREATE TRIGGER x AFTER UPDATE ON t BEGIN UPDATE t SET a=a+1; END",
         u"t"_s, Hr::Ok, Hr::Ok},
        {"trigger into another file",
         "CREATE TABLE t(a); INSERT INTO t VALUES(1);"
         "CREATE TRIGGER x AFTER UPDATE ON t BEGIN INSERT INTO nowhere VALUES(1); END",
         u"t"_s, Hr::Ok, Hr::SyntaxError},
        {"trigger that loads",
         "CREATE TABLE t(a); INSERT INTO t VALUES(1);"
         "CREATE TRIGGER x AFTER UPDATE ON t BEGIN SELECT load_extension('evil'); END",
         u"t"_s, Hr::Ok, Hr::SyntaxError},
        {"trigger on the schema's own memory",
         "CREATE TABLE t(a); INSERT INTO t VALUES(1);"
         "CREATE TRIGGER x AFTER UPDATE ON t BEGIN SELECT fts3_tokenizer('simple',x'00'); END",
         u"t"_s, Hr::Ok, Hr::SyntaxError},
        {"check", "CREATE TABLE t(a CHECK(a=1)); INSERT INTO t VALUES(1)", u"t"_s, Hr::Ok, Hr::IntegrityViolation},
        {"generated column", "CREATE TABLE t(a AS (b*2), b); INSERT INTO t VALUES(1)", u"t"_s, Hr::Ok,
         Hr::SyntaxError},
        {"unknown collation",
         "PRAGMA writable_schema=1; CREATE TABLE t(a); INSERT INTO t VALUES(1);"
         "UPDATE sqlite_schema SET sql='CREATE TABLE t(a COLLATE nowhere)'",
         u"t"_s, Hr::Ok, Hr::Ok},
        {"recursive view",
         "CREATE VIEW t AS WITH RECURSIVE s(n) AS (SELECT 1 UNION ALL SELECT n+1 FROM s "
         "WHERE n<1000) SELECT n FROM s",
         u"t"_s, Hr::Ok, Hr::ReadOnly},
        {"view of itself",
         "CREATE VIEW t AS SELECT 1 AS a; PRAGMA writable_schema=1;"
         "UPDATE sqlite_schema SET sql='CREATE VIEW t AS SELECT * FROM t'",
         u"t"_s, Hr::NoSuchTable, Hr::NotOpen},
        {"view of the engine's settings", "CREATE VIEW t AS SELECT * FROM pragma_database_list", u"t"_s,
         Hr::NoSuchTable, Hr::NotOpen},
        {"view that loads", "CREATE VIEW t AS SELECT load_extension('evil') AS a", u"t"_s, Hr::NoSuchTable,
         Hr::NotOpen},
        {"virtual table", "CREATE VIRTUAL TABLE t USING fts4(a); INSERT INTO t VALUES('words')", u"t"_s, Hr::Ok,
         Hr::ReadOnly},
        {"virtual table of an unknown kind",
         "PRAGMA writable_schema=1; INSERT INTO sqlite_schema VALUES('table','t','t',0,"
         "'CREATE VIRTUAL TABLE t USING nowhere(a)')",
         u"t"_s, Hr::NoSuchTable, Hr::NotOpen},
        {"name of the engine's own",
         "CREATE TABLE a(x); PRAGMA writable_schema=1;"
         "UPDATE sqlite_schema SET name='sqlite_x',tbl_name='sqlite_x',"
         "sql='CREATE TABLE sqlite_x(x)'",
         u"sqlite_x"_s, Hr::NoSuchTable, Hr::NotOpen},
        {"schema that is no SQL",
         "CREATE TABLE t(a); PRAGMA writable_schema=1;"
         "UPDATE sqlite_schema SET sql='CREATE TABLE nonsense'",
         u"t"_s, Hr::NotADatabase, Hr::NotOpen},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.what);
        Make(row.sql);
        const QByteArray before = Bytes();
        Hr hr{};
        const auto cursor = TryOpen(row.table, hr);
        EXPECT_EQ(hr, row.opens) << context.toStdString();
        (void)cursor->Read({}, [](std::span<const Cell>) { return true; });
        EXPECT_EQ(Bytes(), before) << "reading rewrites nothing";
        const FieldChange change{0, Value::Integer(2)};
        EXPECT_EQ(cursor->Update({&change, 1}), row.writes) << cursor->ErrorContext().toStdString();
        if (row.writes == Hr::IntegrityViolation || row.writes == Hr::SyntaxError) {
            EXPECT_FALSE(cursor->ErrorContext().isEmpty());
            EXPECT_EQ(Bytes(), before);
        }
    }
}

TEST_F(HostileFile, HasNamesOfEveryKind)
{
    const QString longName = QString(400, u'w');
    const QByteArray many = longName.toUtf8();
    Make("CREATE TABLE \"a]b\" (a TEXT); CREATE TABLE odd (\"c]d\" TEXT, \"e\"\"f\" TEXT, \"\" TEXT, \"\x01\n\" "
         "TEXT);"
         "INSERT INTO odd VALUES ('1','2','3','4');"
         "CREATE TABLE \"\" (a TEXT); INSERT INTO \"\" VALUES ('unnamed');"
         "CREATE TABLE \"" +
         many + "\" (\"" + many + "x\" TEXT); INSERT INTO \"" + many +
         "\" VALUES ('long');"
         "CREATE TABLE cases (\"\xC3\xA4\" TEXT, \"\xC3\x84\" TEXT); INSERT INTO cases VALUES ('small','large');"
         "CREATE TABLE \"quote'd\" (a TEXT); INSERT INTO \"quote'd\" VALUES ('x');"
         "CREATE TABLE \"SELECT\" (\"FROM\" TEXT); INSERT INTO \"SELECT\" VALUES ('word');"
         "CREATE TABLE bytes (\"\xFF\xFE\" TEXT, b TEXT); INSERT INTO bytes VALUES ('1','2');");
    const struct {
        QString source;
        QStringList records;
    } rows[] = {
        {u"odd"_s, {u"1|2|3|4"_s}},
        {u"SELECT [e\"f] FROM odd WHERE [e\"f]='2'"_s, {u"2"_s}},
        {u"["_s + longName + u']', {u"long"_s}},
        {u"SELECT [%1x] FROM [%1] WHERE [%1x] LIKE 'L%'"_s.arg(longName), {u"long"_s}},
        {u"cases"_s, {u"small|large"_s}},
        {u"SELECT [\u00C4],[\u00E4] FROM cases"_s, {u"large|small"_s}},
        {u"[quote'd]"_s, {u"x"_s}},
        {u"SELECT [FROM] FROM [SELECT]"_s, {u"word"_s}},
    };
    for (const auto& row : rows) {
        EXPECT_EQ(Rows(row.source), row.records) << row.source.toStdString();
        EXPECT_EQ(Rows(row.source, CursorType::Static), row.records) << row.source.toStdString();
    }
    EXPECT_EQ(UserTables().size(), 8) << UserTables().join(u'\n').toStdString();
    Hr hr{};
    const auto cursor = TryOpen(u"SELECT * FROM odd"_s, hr);
    ASSERT_EQ(hr, Hr::Ok) << context.toStdString();
    for (int field = 0; field < 4; ++field) {
        const FieldChange change{field, Value::Text(u"new"_s)};
        const Hr expected = cursor->Fields()[size_t(field)].name.isEmpty() ? Hr::ReadOnly : Hr::Ok;
        EXPECT_EQ(cursor->Update({&change, 1}), expected) << field << cursor->ErrorContext().toStdString();
    }
    EXPECT_EQ(Rows(u"odd"_s), QStringList{u"new|new|3|new"_s});
    EXPECT_EQ(Try(u"SELECT * FROM [a]b]"_s), Hr::SyntaxError) << "a name that no statement can say";
    EXPECT_TRUE(context.contains(u"character"_s)) << context.toStdString();
    TryOpen(u"bytes"_s, hr); // a name that is no text cannot be written in a statement
    EXPECT_EQ(Rows(u"SELECT b FROM bytes"_s), QStringList{u"2"_s});
}

TEST_F(HostileFile, HasAsManyColumnsAsThereCanBe)
{
    QByteArray columns;
    for (int i = 0; i < 2000; ++i)
        columns += (i > 0 ? ",c" : "c") + QByteArray::number(i) + " INT";
    Make("CREATE TABLE wide (" + columns +
         "); INSERT INTO wide (c0,c1999) VALUES (1,2);"
         "CREATE TABLE other (" +
         columns + "); INSERT INTO other (c0) VALUES (1)");
    for (const QString& source : {u"wide"_s, u"SELECT * FROM wide WHERE c0=1"_s, u"SELECT DISTINCT * FROM wide"_s,
                                  u"SELECT wide.* FROM wide INNER JOIN other ON wide.c0=other.c0"_s}) {
        Hr hr{};
        const auto cursor = TryOpen(source, hr);
        ASSERT_EQ(hr, Hr::Ok) << source.toStdString() << context.toStdString();
        ASSERT_EQ(cursor->Fields().size(), 2000U);
        EXPECT_EQ(FieldOf(*cursor, 1999), Value::Integer(2)) << source.toStdString();
        const FieldChange change{1998, Value::Integer(3)};
        if (cursor->Lock() == LockType::Optimistic) {
            EXPECT_EQ(cursor->Update({&change, 1}), Hr::Ok) << cursor->ErrorContext().toStdString();
        }
        EXPECT_EQ(Read(*cursor).size(), 1);
    }
    EXPECT_EQ(Try(u"ALTER TABLE wide ADD more Integer"_s), Hr::TooManyColumns) << context.toStdString();
    EXPECT_EQ(Try(u"ALTER TABLE wide MOVE c1999 BEFORE c0"_s), Hr::TooManyColumns) << context.toStdString();
    EXPECT_EQ(Try(u"SELECT * FROM wide INNER JOIN other ON wide.c0=other.c0"_s), Hr::TooManyColumns)
        << context.toStdString();
}

// What lies beside a database is as foreign as the database.
TEST_F(HostileFile, HasStrangeCompanions)
{
    Run(u"CREATE TABLE T (A Integer)"_s);
    Run(u"INSERT INTO T (A) VALUES (1)"_s);
    provider->CloseDatabase(path);
    for (const QString& suffix : {u"-journal"_s, u"-wal"_s, u"-shm"_s}) {
        for (const char* kind : {"noise", "pipe", "folder"}) {
            SCOPED_TRACE(suffix.toStdString() + kind);
            const QString companion = path + suffix;
            if (kind == std::string_view("noise"))
                Write(QFileInfo(companion).fileName(), QByteArray("noise ").repeated(1000));
            else if (kind == std::string_view("pipe"))
                ASSERT_EQ(mkfifo(QFile::encodeName(companion).constData(), 0600), 0);
            else
                ASSERT_TRUE(QDir().mkdir(companion));
            Hr hr{};
            TryOpen(u"T"_s, hr);
            const Hr written = Try(u"UPDATE T SET A=1"_s);
            provider->CloseDatabase(path);
            if (Failed(hr) || Failed(written)) {
                EXPECT_FALSE(context.isEmpty());
            }
            QFile::remove(companion);
            QDir().rmdir(companion);
            EXPECT_EQ(Rows(u"T"_s), QStringList{u"1"_s});
            provider->CloseDatabase(path);
        }
    }
}

TEST_F(HostileFile, AViewWithoutAnEndCanBeStopped)
{
    Run(u"CREATE TABLE T (A Integer)"_s);
    Outside("WITH RECURSIVE s(n) AS (SELECT 1 UNION ALL SELECT n+1 FROM s WHERE n<100000) INSERT INTO T SELECT n "
            "FROM s; CREATE VIEW endless AS WITH RECURSIVE s(n) AS (SELECT 1 UNION ALL SELECT n+1 FROM s) SELECT "
            "n FROM s");
    int asked = 0;
    SetStopCheck([&asked] { return ++asked > 2; });
    auto cursor = provider->CreateRecordset();
    EXPECT_EQ(cursor->Open(u"endless"_s, path, CursorType::Static, LockType::ReadOnly), kStopped);
    EXPECT_EQ(Try(u"SELECT COUNT(*) FROM endless"_s), kStopped);
    EXPECT_GT(asked, 3);
    SetStopCheck([] { return true; });
    Run(u"UPDATE T SET A=7"_s); // what writes is not asked about
    SetStopCheck({});
    EXPECT_EQ(Rows(u"SELECT COUNT(*) FROM T WHERE A=7"_s), QStringList{u"100000"_s});
}

} // namespace
} // namespace mirel
