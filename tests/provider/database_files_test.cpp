// Opening, making and removing database files, whatever stands at their path.
#include "provider/database_fixture.h"

#include <QFileInfo>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class DatabaseFiles : public DatabaseFixture {
protected:
    static QByteArray BytesOf(const QString& file)
    {
        QFile bytes(file);
        return bytes.open(QIODevice::ReadOnly) ? bytes.readAll() : QByteArray("(none)");
    }
};

TEST_F(DatabaseFiles, ThatAreNoDatabasesFailAndStayAsTheyAre)
{
    Write(u"text.cdb"_s, QByteArray("No database at all. ").repeated(100));
    Write(u"empty.cdb"_s, {});
    QDir(folder.path()).mkdir(u"folder.cdb"_s);
    const struct {
        QString name;
        Hr expected;
    } rows[] = {
        {u"text.cdb"_s, Hr::NotADatabase},         {u"empty.cdb"_s, Hr::NotADatabase},
        {u"folder.cdb"_s, Hr::CannotOpen},         {u"missing.cdb"_s, Hr::CannotOpen},
        {u"no/such/folder.cdb"_s, Hr::CannotOpen},
    };
    for (const auto& row : rows) {
        const QByteArray before = BytesOf(PathOf(row.name));
        EXPECT_EQ(Try(u"SELECT * FROM MSysTables"_s, PathOf(row.name)), row.expected) << row.name.toStdString();
        EXPECT_TRUE(context.contains(PathOf(row.name))) << context.toStdString();
        EXPECT_TRUE(Failed(Try(u"DROP DATABASE '%1'"_s.arg(PathOf(row.name)), {}))) << row.name.toStdString();
        EXPECT_EQ(BytesOf(PathOf(row.name)), before) << row.name.toStdString();
    }
    EXPECT_FALSE(QFileInfo::exists(PathOf(u"missing.cdb"_s))) << "opening makes no file";
    EXPECT_EQ(Try(u"SELECT * FROM T"_s, {}), Hr::SyntaxError) << "no database is named";
}

TEST_F(DatabaseFiles, AreMadeAndRemovedByStatementsAlone)
{
    EXPECT_EQ(Try(u"CREATE DATABASE '%1'"_s.arg(path), {}), Hr::CannotOpen) << "never over another file";
    EXPECT_EQ(Try(u"CREATE DATABASE '%1'"_s.arg(PathOf(u"no/folder.cdb"_s)), {}), Hr::CannotOpen);
    Run(u"CREATE TABLE T (A Integer)"_s);
    const auto cursor = Open(u"T"_s);
    Run(u"DROP DATABASE '%1'"_s.arg(path), {});
    EXPECT_FALSE(QFileInfo::exists(path));
    EXPECT_EQ(cursor->MoveFirst(), Hr::NotOpen);
    EXPECT_EQ(Try(u"SELECT * FROM T"_s), Hr::CannotOpen);
}

TEST_F(DatabaseFiles, WithoutWritePermissionAreOpenedReadOnly)
{
    Run(u"CREATE TABLE T (A Integer)"_s);
    Run(u"INSERT INTO T (A) VALUES (1)"_s);
    provider->CloseDatabase(path);
    ASSERT_TRUE(QFile::setPermissions(path, QFile::ReadOwner));
    const auto cursor = Open(u"T"_s);
    EXPECT_EQ(cursor->Lock(), LockType::ReadOnly);
    EXPECT_EQ(FieldOf(*cursor), Value::Integer(1));
    EXPECT_EQ(cursor->Delete(), Hr::ReadOnly);
    EXPECT_EQ(Try(u"DELETE FROM T"_s), Hr::AccessDenied);
    EXPECT_EQ(Try(u"CREATE TABLE U (A Integer)"_s), Hr::AccessDenied);
    EXPECT_FALSE(context.isEmpty());
    EXPECT_EQ(Rows(u"SELECT DISTINCT A FROM T"_s, CursorType::Static), QStringList{u"1"_s});
}

TEST_F(DatabaseFiles, InUseByAnotherProgramAreWaitedForAndThenRefused)
{
    Run(u"CREATE TABLE T (A Integer)"_s);
    sqlite3* other = nullptr;
    ASSERT_EQ(sqlite3_open(QFile::encodeName(path).constData(), &other), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(other, "BEGIN EXCLUSIVE", nullptr, nullptr, nullptr), SQLITE_OK);
    EXPECT_EQ(Try(u"INSERT INTO T (A) VALUES (1)"_s), Hr::AccessDenied);
    EXPECT_TRUE(context.contains(path));
    sqlite3_close(other);
    EXPECT_EQ(Try(u"INSERT INTO T (A) VALUES (1)"_s), Hr::Ok);
}

// Wherever a file is cut off or damaged, it is read as far as it goes or refused.
TEST_F(DatabaseFiles, SurviveDamage)
{
    Run(u"CREATE TABLE T (A Integer,B Varchar(50))"_s);
    Run(u"CREATE INDEX i ON T (B)"_s);
    Outside("WITH RECURSIVE s(n) AS (SELECT 1 UNION ALL SELECT n+1 FROM s WHERE n<3000) "
            "INSERT INTO T SELECT n,'some text '||n FROM s");
    provider->CloseDatabase(path);
    const QByteArray whole = BytesOf(path);
    const QString damaged = PathOf(u"damaged.cdb"_s);
    const auto readAll = [&] {
        for (const QString& source :
             {u"T"_s, u"SELECT A FROM T WHERE B='some text 7'"_s, u"SELECT A FROM T ORDER BY B"_s}) {
            auto cursor = provider->CreateRecordset();
            if (Failed(cursor->Open(source, damaged, CursorType::Static, LockType::Optimistic)))
                continue;
            (void)cursor->RecordCount();
            (void)cursor->Read({}, [](std::span<const Cell>) { return true; });
            (void)cursor->MoveLast();
            (void)cursor->Delete();
        }
        provider->CloseDatabase(damaged);
    };
    for (qsizetype length = 1; length < whole.size(); length = length * 5 / 3 + 7) {
        Write(u"damaged.cdb"_s, whole.left(length));
        readAll();
    }
    quint32 random = 1;
    for (int round = 0; round < 40; ++round) {
        QByteArray bytes = whole;
        for (int hit = 0; hit < 30; ++hit) {
            random = random * 1664525 + 1013904223;
            bytes[qsizetype(random % quint32(hit % 2 ? bytes.size() : 400))] = char(random >> 24);
        }
        Write(u"damaged.cdb"_s, bytes);
        readAll();
    }
}

TEST_F(DatabaseFiles, OfOtherProgramsShowWhatTheyHold)
{
    const QString foreign = PathOf(u"foreign.db"_s);
    Outside(foreign, R"(
        CREATE TABLE Kinds (id INTEGER PRIMARY KEY, big BIGINT, price DECIMAL(10,2), title NVARCHAR(100),
                            long_title VARCHAR(2000), born DATE, seen TIMESTAMP, ok BOOLEAN, blob BLOB, any);
        INSERT INTO Kinds VALUES (1, 9000000000, 1.5, 'x', 'y', '2001-07-04', '2001-07-04T09:05:00Z', 'true', x'00', 'z');
        INSERT INTO Kinds VALUES (2, 7, 2, 3, 4, 2452094.5, 994237500, 0, 'text', x'FF');
        CREATE TABLE Fixed (a TEXT PRIMARY KEY, b) WITHOUT ROWID;
        INSERT INTO Fixed VALUES ('k', 1);
        CREATE TABLE Hidden (rowid TEXT, _rowid_ TEXT, oid TEXT);
        CREATE TABLE Alias (rowid TEXT, b TEXT);
        INSERT INTO Alias VALUES ('mine', 'b');
        CREATE VIEW Seen AS SELECT id, title FROM Kinds;
        CREATE VIEW Broken AS SELECT absent FROM nowhere;
        CREATE TABLE [MSysTables] (x);
    )");
    const auto rows = [&](const QString& source, LockType* lock = nullptr) {
        auto cursor = provider->CreateRecordset();
        EXPECT_EQ(cursor->Open(source, foreign, CursorType::Static, LockType::Optimistic), Hr::Ok)
            << source.toStdString() << cursor->ErrorContext().toStdString();
        if (lock)
            *lock = cursor->Lock();
        return Read(*cursor);
    };
    EXPECT_EQ(rows(u"Kinds"_s), (QStringList{u"1|9000000000|1.5|x|y|2001-07-04|2001-07-04 09:05:00|1|00|z"_s,
                                             u"2|7|2|3|4|2001-07-04|2001-07-04 09:05:00|0|text|ff"_s}));
    auto cursor = provider->CreateRecordset();
    ASSERT_EQ(cursor->Open(u"Kinds"_s, foreign, CursorType::Static, LockType::Optimistic), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor, 1), Value::Whole(9000000000));
    EXPECT_EQ(FieldOf(*cursor, 5), Value::Date(37076));
    EXPECT_EQ(cursor->Fields()[3].type, FieldType::Text);
    EXPECT_EQ(cursor->Fields()[4].type, FieldType::Memo);

    const struct {
        QString table;
        QString row;
        LockType lock;
    } tables[] = {
        {u"Fixed"_s, u"k|1"_s, LockType::ReadOnly},
        {u"Hidden"_s, {}, LockType::ReadOnly},
        {u"Seen"_s, u"1|x"_s, LockType::ReadOnly},
        {u"Alias"_s, u"mine|b"_s, LockType::Optimistic},
    };
    for (const auto& row : tables) {
        LockType lock{};
        EXPECT_EQ(rows(row.table, &lock).value(0), row.row) << row.table.toStdString();
        EXPECT_EQ(lock, row.lock) << row.table.toStdString();
    }
    EXPECT_EQ(rows(u"SELECT TableName FROM MSysTables WHERE not TableName LIKE 'MSys%' ORDER BY TableName"_s),
              (QStringList{u"Alias"_s, u"Fixed"_s, u"Hidden"_s, u"Kinds"_s, u"Seen"_s}));

    // The key is the row id: a record whose key changes is still the current one.
    const FieldChange key{0, Value::Integer(77)};
    ASSERT_EQ(cursor->Update({&key, 1}), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor), Value::Integer(77));
    EXPECT_EQ(cursor->Position(), 1);
    const FieldChange between{0, Value::Integer(5)};
    ASSERT_EQ(cursor->AddNew({&between, 1}, {}), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor), Value::Integer(5));
    EXPECT_EQ(cursor->RecordCount(), 3);
    EXPECT_EQ(Read(*cursor, {.fields = {0}}), (QStringList{u"2"_s, u"5"_s, u"77"_s}));
}

TEST_F(DatabaseFiles, StayOpenableForOthers)
{
    Run(u"CREATE TABLE [Order Details] (Name Varchar(5),Day DateTime)"_s);
    Run(u"CREATE INDEX i ON [Order Details] (Name DESC)"_s);
    provider->CloseDatabase(path);
    Outside("INSERT INTO \"Order Details\" VALUES ('a','2001-07-04'); REINDEX; PRAGMA integrity_check;");
    EXPECT_EQ(Rows(u"[Order Details]"_s), QStringList{u"a|2001-07-04"_s});
}

} // namespace
} // namespace mirel
