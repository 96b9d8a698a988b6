// Another program commits while a result of this one stands.
#include "provider/database_fixture.h"

#include <QElapsedTimer>

#include <functional>

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

// The other compacts the file, and the key of the record that is shown goes to its neighbor.
TEST_F(TwoPrograms, AMoveToTheSameRecordKeepsWhatWasShown)
{
    const auto cursor = Open(u"T"_s);
    other.Run("DELETE FROM T WHERE N<3");
    ASSERT_EQ(cursor->MoveTo(1), Hr::Ok);
    ASSERT_EQ(FieldOf(*cursor, 0).ToInt(), 4);
    ASSERT_EQ(cursor->MoveTo(1), Hr::Ok);
    other.Run("VACUUM");
    EXPECT_EQ(FieldOf(*cursor, 0).ToInt(), 4);
    EXPECT_EQ(cursor->Delete(), Hr::NoCurrentRecord);
}

// A result in a long order, which is let stand while the new one is made.
class OldOrder : public TwoPrograms {
protected:
    using Values = ProviderRecordset::Values;

    OldOrder() { cursor->AllowOldOrder(1000); }

    void TakeUp(bool isBehind)
    {
        ASSERT_EQ(cursor->TakeUpChanges(Values::ReadAgain), Hr::Ok);
        ASSERT_EQ(cursor->IsBehind(), isBehind);
    }
    QStringList Page(qint64 first, qint64 count)
    {
        return Read(*cursor, {.first = first, .count = count, .fields = {1}});
    }
    // The result is what a new one would be, and the current record has its place in it.
    void ExpectTheNewOrder()
    {
        EXPECT_FALSE(cursor->IsBehind());
        const QStringList names = Rows(u"SELECT Name FROM T ORDER BY Name"_s);
        EXPECT_EQ(cursor->RecordCount(), names.size());
        EXPECT_EQ(Page(0, names.size()), names);
        if (cursor->Position() >= 0) {
            EXPECT_EQ(names[cursor->Position()], FieldOf(*cursor, 1).ToText());
        }
    }

    std::unique_ptr<ProviderRecordset> cursor = Open(u"SELECT N,Name FROM T ORDER BY Name"_s);
};

TEST_F(OldOrder, StandsUntilTheNewOneIsMade)
{
    const QStringList before = Page(0, 3000);
    ASSERT_EQ(cursor->MoveTo(10), Hr::Ok);
    const RecordId current = cursor->Id();
    other.Run("INSERT INTO T VALUES(0,'a new first');"
              "UPDATE T SET Name='zz' WHERE Name='" +
              before[5].toUtf8() +
              "';"
              "DELETE FROM T WHERE Name IN('" +
              before[3].toUtf8() + "','" + before[11].toUtf8() + "')");
    TakeUp(true);
    QStringList page = before.first(13);
    page[5] = u"zz"_s; // its value is that of now, its place the old one
    page.remove(11);
    page.remove(3);
    EXPECT_EQ(Page(0, 11), page);
    EXPECT_EQ(cursor->Position(), 9);
    EXPECT_EQ(cursor->Id(), current);
    ASSERT_EQ(cursor->MoveNext(), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor, 1).ToText(), before[12]);
    const quint64 generation = cursor->Generation();
    while (!cursor->CatchUp(1)) {
    }
    EXPECT_GT(cursor->Generation(), generation);
    ExpectTheNewOrder();
    EXPECT_EQ(FieldOf(*cursor, 1).ToText(), before[12]);
}

TEST_F(OldOrder, IsLeftWhereItWouldNotDo)
{
    const struct {
        const char* what;
        const char* sql;
        std::function<void()> step;
    } rows[] = {
        {"all of it is read", "DELETE FROM T WHERE N%3=0",
         [this] { EXPECT_EQ(Read(*cursor, {.fields = {1}}), Rows(u"SELECT Name FROM T ORDER BY Name"_s)); }},
        {"a record that is new is gone to", "INSERT INTO T(rowid,N,Name) VALUES(5000,-1,'name 17b')",
         [this] {
             const auto added = Open(u"SELECT N,Name FROM T WHERE N=-1"_s);
             ASSERT_EQ(cursor->MoveToRecord(added->Id()), Hr::Ok);
             EXPECT_EQ(FieldOf(*cursor, 1).ToText(), u"name 17b");
         }},
        {"many are to be written", "INSERT INTO T VALUES(-2,'name 17c')",
         [this] {
             Hr hr = Hr::Ok;
             const auto transaction = provider->BeginTransaction(path, hr, context);
             ASSERT_EQ(cursor->TakeUpChanges(Values::Keep), Hr::Ok);
             std::vector<RecordId> ids;
             EXPECT_EQ(cursor->Ids(0, 5000, ids), Hr::Ok);
             EXPECT_EQ(qint64(ids.size()), cursor->RecordCount());
         }},
        {"a page of it has been deleted", "DELETE FROM T WHERE Name<'name 2'", [this] { Page(0, 20); }},
        {"a record is written that has another row id now", "DELETE FROM T WHERE rowid<5; VACUUM",
         [this] {
             const FieldChange mine{1, Value::Text(u"mine"_s)};
             EXPECT_EQ(cursor->Update({&mine, 1}), Hr::NoCurrentRecord);
         }},
        {"row ids are others", "INSERT INTO T VALUES(-3,'b'); VACUUM",
         [this] { EXPECT_EQ(cursor->TakeUpChanges(Values::ReadAgain), Hr::Ok); }},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.what);
        ASSERT_EQ(cursor->MoveTo(7), Hr::Ok);
        (void)FieldOf(*cursor);
        other.Run("INSERT INTO T VALUES(9,'another')");
        TakeUp(true);
        other.Run(row.sql);
        row.step();
        ExpectTheNewOrder();
    }
}

// Writes compare by the record's key, and need no new order.
TEST_F(OldOrder, TakesOwnChanges)
{
    const FieldChange mine{1, Value::Text(u"mine"_s)};
    const QStringList before = Page(0, 30);
    other.Run("INSERT INTO T VALUES(0,'a new first'); DELETE FROM T WHERE Name='" + before[25].toUtf8() + '\'');
    TakeUp(true);
    ASSERT_EQ(cursor->MoveTo(4), Hr::Ok);
    EXPECT_EQ(cursor->Update({&mine, 1}), Hr::Ok);
    ASSERT_EQ(cursor->MoveTo(20), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor, 1).ToText(), before[20]);
    EXPECT_EQ(cursor->Delete(), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor, 1).ToText(), before[21]);
    ASSERT_EQ(cursor->MoveTo(24), Hr::Ok) << "the one that is gone is passed over";
    EXPECT_EQ(FieldOf(*cursor, 1).ToText(), before[26]);
    other.Run("UPDATE T SET Name='theirs' WHERE Name='" + before[26].toUtf8() + '\'');
    EXPECT_EQ(cursor->Update({&mine, 1}), Hr::RecordChanged);
    EXPECT_EQ(cursor->AddNew({&mine, 1}, {}), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor, 1).ToText(), u"mine");
    EXPECT_TRUE(cursor->IsBehind());
    const RecordId added = cursor->Id();
    while (!cursor->CatchUp(1)) {
    }
    EXPECT_EQ(cursor->Id(), added);
    ExpectTheNewOrder();
}

TEST_F(OldOrder, OfASearchStandsAsWell)
{
    cursor = Open(u"SELECT N,Name FROM T WHERE Name LIKE '%1%'"_s);
    cursor->AllowOldOrder(1000);
    const qint64 before = cursor->RecordCount();
    other.Run(
        "DELETE FROM T WHERE N=10; INSERT INTO T(rowid,N,Name) VALUES(-5,0,'a 1'); DELETE FROM T WHERE N=13");
    TakeUp(true);
    EXPECT_EQ(Page(0, 4), (QStringList{u"name 1"_s, u"name 11"_s, u"name 12"_s, u"name 14"_s}));
    while (!cursor->CatchUp(1)) {
    }
    EXPECT_EQ(Page(0, 2), (QStringList{u"a 1"_s, u"name 1"_s}));
    EXPECT_EQ(cursor->RecordCount(), before - 1);
}

TEST_F(OldOrder, ComesOnUnderASteadyWriter)
{
    for (int i = 0; i < 400 && Page(0, 2).back() != u"a 1"; ++i) {
        other.Run("INSERT INTO T VALUES(0,'a " + QByteArray::number(i) + "')");
        TakeUp(true);
        (void)cursor->CatchUp(1);
    }
    EXPECT_EQ(Page(0, 2), (QStringList{u"a 0"_s, u"a 1"_s}));
    while (!cursor->CatchUp(1)) {
    }
    ExpectTheNewOrder();
}

} // namespace
} // namespace mirel
