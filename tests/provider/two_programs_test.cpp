// Another program commits while a result of this one stands.
#include "provider/database_fixture.h"

#include <QElapsedTimer>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// The other program, with its connection open for as long as the test runs.
class OtherProgram {
public:
    explicit OtherProgram(const QString& path)
    {
        EXPECT_EQ(sqlite3_open(QFile::encodeName(path).constData(), &handle_), SQLITE_OK);
    }
    ~OtherProgram() { sqlite3_close(handle_); }
    Q_DISABLE_COPY_MOVE(OtherProgram)

    void Run(const QByteArray& sql)
    {
        EXPECT_EQ(sqlite3_exec(handle_, sql.constData(), nullptr, nullptr, nullptr), SQLITE_OK)
            << sql.toStdString() << ": " << sqlite3_errmsg(handle_);
    }

private:
    sqlite3* handle_ = nullptr;
};

class TwoPrograms : public DatabaseFixture {
protected:
    TwoPrograms()
    {
        Run(u"CREATE TABLE T (N Integer,Name Varchar(20))"_s);
        Outside("WITH RECURSIVE s(n) AS (SELECT 1 UNION ALL SELECT n+1 FROM s WHERE n<3000) "
                "INSERT INTO T SELECT n,'name '||n FROM s");
    }

    OtherProgram other{path};
};

// What is compared is what was shown; a field that the other left alone is no reason to refuse.
TEST_F(TwoPrograms, AWriteIsHeldAgainstTheValuesThatWereShown)
{
    using Values = ProviderRecordset::Values;
    const FieldChange name{1, Value::Text(u"mine"_s)};
    const struct {
        const char* what;
        const char* sql;
        Hr update;
        Hr remove;
    } rows[] = {
        {"the field itself", "UPDATE T SET Name='theirs' WHERE N=1", Hr::RecordChanged, Hr::RecordChanged},
        {"another field", "UPDATE T SET N=-1 WHERE rowid=1", Hr::Ok, Hr::RecordChanged},
        {"another record", "UPDATE T SET Name='theirs' WHERE N=2", Hr::Ok, Hr::Ok},
        {"the file's structure, and another field: it may be another record by now",
         "UPDATE T SET N=-1 WHERE rowid=1; CREATE TABLE U(a)", Hr::NoCurrentRecord, Hr::NoCurrentRecord},
        {"the file's structure alone", "CREATE TABLE U(a)", Hr::Ok, Hr::Ok},
        {"its key has gone to another record",
         "DELETE FROM T WHERE N=1; INSERT INTO T(rowid,N,Name) VALUES(1,7,'n')", Hr::RecordChanged,
         Hr::RecordChanged},
    };
    for (const auto& row : rows) {
        for (const bool removes : {false, true}) {
            SCOPED_TRACE(row.what);
            other.Run("DELETE FROM T WHERE rowid<3; DROP TABLE IF EXISTS U;"
                      "INSERT INTO T(rowid,N,Name) VALUES(1,1,'name 1'),(2,2,'name 2')");
            const auto cursor = Open(u"T"_s);
            ASSERT_EQ(FieldOf(*cursor, 1), Value::Text(u"name 1"_s));
            other.Run(row.sql);
            EXPECT_EQ(removes ? cursor->Delete() : cursor->Update({&name, 1}), removes ? row.remove : row.update);
            if ((removes ? row.remove : row.update) != Hr::RecordChanged)
                continue;
            ASSERT_EQ(cursor->TakeUpChanges(Values::ReadAgain), Hr::Ok);
            EXPECT_EQ(removes ? cursor->Delete() : cursor->Update({&name, 1}), Hr::Ok)
                << "now they have been seen";
        }
    }
}

TEST_F(TwoPrograms, AResultTakesUpWhatTheOtherCommitted)
{
    const struct {
        const char* what;
        const char* sql;
        qint64 count;
        qint64 position; // of the record that was current, 2000 before
        int value;       // of the current record
    } rows[] = {
        {"behind it", "INSERT INTO T VALUES (9001,'new'),(9002,'new')", 3002, 2000, 2001},
        {"in front of it", "DELETE FROM T WHERE N<=1500", 1500, 500, 2001},
        {"between", "DELETE FROM T WHERE N>100 AND N<200", 2901, 1901, 2001},
        {"an insertion in front", "INSERT INTO T(rowid,N,Name) VALUES (-5,0,'first')", 3001, 2001, 2001},
        {"the record itself: no neighbor takes its place", "DELETE FROM T WHERE N=2001", 2999, -1, 2002},
        {"its value", "UPDATE T SET N=N+1 WHERE N=2001", 3000, 2000, 2002},
        {"everything", "DELETE FROM T", 0, -1, 0},
    };
    for (const auto& row : rows) {
        for (const QString& source : {u"T"_s, u"SELECT * FROM T WHERE Name>'a'"_s}) {
            SCOPED_TRACE(row.what + (": " + source.toStdString()));
            const auto cursor = Open(source);
            ASSERT_EQ(cursor->MoveTo(2000), Hr::Ok);
            const quint64 generation = cursor->Generation();
            other.Run("SAVEPOINT whole");
            other.Run(row.sql);
            EXPECT_EQ(cursor->RecordCount(), 3000) << "not committed yet";
            EXPECT_EQ(cursor->Generation(), generation);
            other.Run("RELEASE whole");
            EXPECT_EQ(Read(*cursor, {.first = 0, .count = 1, .fields = {}}).size(), row.count > 0 ? 1 : 0);
            EXPECT_GT(cursor->Generation(), generation);
            EXPECT_EQ(cursor->RecordCount(), row.count);
            EXPECT_EQ(cursor->Position(), row.position);
            EXPECT_EQ(cursor->IsGone(), row.position < 0);
            if (row.position < 0) {
                EXPECT_EQ(cursor->Delete(), Hr::NoCurrentRecord);
                EXPECT_EQ(cursor->MoveNext(), Hr::Ok) << "to the one that was behind it";
            }
            if (row.value > 0) {
                EXPECT_EQ(FieldOf(*cursor), Value::Integer(row.value));
            }
            other.Run("DELETE FROM T; WITH RECURSIVE s(n) AS (SELECT 1 UNION ALL SELECT n+1 FROM s WHERE n<3000) "
                      "INSERT INTO T(rowid,N,Name) SELECT n,n,'name '||n FROM s");
        }
    }
}

TEST_F(TwoPrograms, ARecordDeletedUnderneathIsNotWritten)
{
    for (const QString& source : {u"T"_s, u"SELECT * FROM T ORDER BY N DESC"_s}) {
        const auto cursor = Open(source);
        const QByteArray current = QByteArray::number(FieldOf(*cursor).ToInt());
        other.Run("DELETE FROM T WHERE N=" + current);
        const FieldChange change{1, Value::Text(u"changed"_s)};
        EXPECT_EQ(cursor->Update({&change, 1}), Hr::NoCurrentRecord) << source.toStdString();
        EXPECT_FALSE(cursor->ErrorContext().isEmpty());
    }
    EXPECT_EQ(Rows(u"SELECT COUNT(*) FROM T WHERE Name='changed'"_s), QStringList{u"0"_s});
}

// A lock is waited for, then refused; what stood before the call stands after it.
TEST_F(TwoPrograms, AWriteThatMeetsALockLeavesAllAsItWas)
{
    const QString keyed = PathOf(u"keyed.db"_s);
    Outside(keyed, "CREATE TABLE K (id INTEGER PRIMARY KEY, v TEXT); INSERT INTO K VALUES (1,'a'),(2,'b')");
    const auto cursor = provider->CreateRecordset();
    ASSERT_EQ(cursor->Open(u"K"_s, keyed, CursorType::Static, LockType::Optimistic), Hr::Ok);
    OtherProgram reader(keyed);
    reader.Run("BEGIN; SELECT * FROM K"); // a reader lets others prepare a change, but not commit it
    const FieldChange key{0, Value::Integer(77)};
    QElapsedTimer timer;
    timer.start();
    EXPECT_EQ(cursor->Update({&key, 1}), Hr::AccessDenied);
    EXPECT_GE(timer.elapsed(), 2500) << "it waits, the other may be done soon";
    EXPECT_TRUE(cursor->ErrorContext().contains(keyed)) << cursor->ErrorContext().toStdString();
    EXPECT_EQ(FieldOf(*cursor), Value::Integer(1));
    EXPECT_EQ(cursor->Position(), 0);
    reader.Run("COMMIT");
    EXPECT_EQ(cursor->Update({&key, 1}), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor), Value::Integer(77));
}

TEST_F(TwoPrograms, AResultOutlivesItsTableAndColumns)
{
    const auto whole = Open(u"T"_s);
    const auto named = Open(u"SELECT N FROM T WHERE N>5"_s);
    const auto forward = Open(u"T"_s, CursorType::ForwardOnly);
    const auto kept = Open(u"SELECT DISTINCT Name FROM T"_s);
    const auto failsWithWords = [](ProviderRecordset& cursor) {
        EXPECT_TRUE(Failed(cursor.Read({}, [](std::span<const Cell>) { return true; })));
        EXPECT_FALSE(cursor.ErrorContext().isEmpty());
    };
    other.Run("ALTER TABLE T DROP COLUMN Name");
    failsWithWords(*whole);
    EXPECT_EQ(Read(*named).size(), 2995) << "its columns are there";
    EXPECT_EQ(Read(*Open(u"T"_s)).value(0), u"1"_s) << "opened again";
    other.Run("DROP TABLE T");
    EXPECT_EQ(Try(u"SELECT * FROM T"_s), Hr::NoSuchTable);
    failsWithWords(*named);
    EXPECT_TRUE(Failed(named->Delete()));
    EXPECT_EQ(Read(*kept).size(), 3000) << "rows of its own";
    Hr hr = Hr::Ok;
    for (int i = 0; i < 3000 && !Failed(hr); ++i)
        hr = forward->MoveNext();
    EXPECT_EQ(hr, Hr::NoSuchTable) << "where its first block ends";
}

} // namespace
} // namespace mirel
