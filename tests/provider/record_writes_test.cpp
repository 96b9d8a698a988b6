// Changing records: one at a time, all at once, and appended in bulk.
#include "provider/database_fixture.h"
#include "support/small_disk.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class RecordWrites : public DatabaseFixture {
protected:
    RecordWrites()
    {
        Run(u"CREATE TABLE T (Name Varchar(5),Small Smallint,Whole Integer,Real Float,Day DateTime,Flag Bit,"_s
            u"Bytes Varbinary(3),Memo Text)"_s);
    }

    enum Fields { Name, Small, Whole, Real, Day, Flag, Bytes, Memo };

    void Add(ProviderRecordset& cursor, std::initializer_list<FieldChange> values)
    {
        EXPECT_EQ(cursor.AddNew(values, {}), Hr::Ok) << cursor.ErrorContext().toStdString();
    }
};

TEST_F(RecordWrites, ComeBackAsTheyWereWritten)
{
    const auto cursor = Open(u"T"_s);
    const Value written[] = {Value::Text(u"Äpfel"_s),
                             Value::SmallInt(-5),
                             Value::Integer(1 << 30),
                             Value::Double(0.1),
                             Value::Date(37076.25),
                             Value::Bool(true),
                             Value::Binary(QByteArray("\0\1", 2)),
                             Value::Text(QString::fromUtf16(u"a\0b", 3))};
    std::vector<FieldChange> values;
    for (int field = Name; field <= Memo; ++field)
        values.push_back({field, written[field]});
    ASSERT_EQ(cursor->AddNew(values, {}), Hr::Ok);
    for (int field = Name; field <= Memo; ++field)
        EXPECT_EQ(FieldOf(*cursor, field), written[field]) << field;
    EXPECT_EQ(Rows(u"SELECT Day,Flag FROM T"_s), QStringList{u"2001-07-04 06:00:00|1"_s})
        << "as the file holds it";

    Add(*cursor, {});
    for (int field = Name; field <= Memo; ++field)
        EXPECT_EQ(FieldOf(*cursor, field), Value::Null()) << field;
}

TEST_F(RecordWrites, AreRefusedWholeWhenAValueDoesNotFit)
{
    const auto cursor = Open(u"T"_s);
    Add(*cursor, {{Name, Value::Text(u"old"_s)}, {Whole, Value::Integer(1)}});
    const struct {
        const char* what;
        FieldChange change;
        Hr expected;
    } rows[] = {
        {"text too long", {Name, Value::Text(u"sixsix"_s)}, Hr::Overflow},
        {"two units a character", {Name, Value::Text(u"\U0001F600\U0001F600\U0001F600"_s)}, Hr::Overflow},
        {"no number", {Whole, Value::Text(u"abc"_s)}, Hr::BadLiteral},
        {"number too large", {Small, Value::Integer(40000)}, Hr::Overflow},
        {"no date", {Day, Value::Text(u"2001-02-30"_s)}, Hr::BadLiteral},
        {"bytes too many", {Bytes, Value::Binary(QByteArray("1234"))}, Hr::Overflow},
    };
    for (const auto& row : rows) {
        const FieldChange changes[] = {{Name, Value::Text(u"new"_s)}, row.change};
        EXPECT_EQ(cursor->Update(changes), row.expected) << row.what;
        EXPECT_EQ(cursor->AddNew(changes, {}), row.expected) << row.what;
    }
    EXPECT_EQ(Rows(u"SELECT Name,Whole FROM T"_s), QStringList{u"old|1"_s});
}

TEST_F(RecordWrites, NeedAResultThatCanBeUpdated)
{
    Run(u"INSERT INTO T (Name,Whole) VALUES ('a',1)"_s);
    Run(u"CREATE TABLE U (Whole Integer)"_s);
    Run(u"INSERT INTO U (Whole) VALUES (1)"_s);
    const struct {
        QString source;
        LockType asked;
        LockType given;
    } rows[] = {
        {u"T"_s, LockType::Optimistic, LockType::Optimistic},
        {u"T"_s, LockType::ReadOnly, LockType::ReadOnly},
        {u"SELECT T.Name FROM T INNER JOIN U ON T.Whole=U.Whole"_s, LockType::Optimistic, LockType::Optimistic},
        {u"SELECT T.Name,U.Whole FROM T INNER JOIN U ON T.Whole=U.Whole"_s, LockType::Optimistic,
         LockType::ReadOnly},
        {u"SELECT DISTINCT Name FROM T"_s, LockType::Optimistic, LockType::ReadOnly},
        {u"MSysTables"_s, LockType::Optimistic, LockType::ReadOnly},
    };
    for (const auto& row : rows) {
        const auto cursor = Open(row.source, CursorType::Static, row.asked);
        EXPECT_EQ(cursor->Lock(), row.given) << row.source.toStdString();
        const FieldChange change{0, Value::Text(u"b"_s)};
        EXPECT_EQ(cursor->Update({&change, 1}), row.given == LockType::ReadOnly ? Hr::ReadOnly : Hr::Ok)
            << row.source.toStdString();
    }
    const FieldChange computed{0, Value::Integer(1)};
    EXPECT_EQ(Open(u"SELECT Whole+1,Name FROM T"_s)->Update({&computed, 1}), Hr::ReadOnly) << "an expression";
}

// A full disk takes back all that the transaction wrote. What is written behind that must not stay alone.
TEST_F(RecordWrites, EndWhereTheirTransactionWasTakenBack)
{
    provider->CloseDatabase(path);
    const SmallDisk disk(16);
    const auto cursor = Open(u"T"_s);
    Hr result = Hr::Ok;
    auto whole = provider->BeginTransaction(path, result, context);
    ASSERT_TRUE(whole);
    const FieldChange large{Memo, Value::Text(QString(20'000, u'x'))};
    Hr written = Hr::Ok;
    for (int i = 0; i < 20 && written == Hr::Ok; ++i)
        written = cursor->AddNew({&large, 1}, {});
    ASSERT_EQ(written, Hr::DiskFull);
    EXPECT_TRUE(Failed(cursor->AddNew({}, {})));
    EXPECT_TRUE(Failed(whole->Commit()));
    EXPECT_TRUE(Rows(u"SELECT Name FROM T"_s).isEmpty());
    Add(*cursor, {});
    EXPECT_EQ(Rows(u"SELECT Name FROM T"_s).size(), 1) << "the next one is another matter";
}

class BulkWrites : public RecordWrites {
protected:
    static constexpr int kCount = 3000;

    BulkWrites()
    {
        Outside("WITH RECURSIVE s(n) AS (SELECT 1 UNION ALL SELECT n+1 FROM s WHERE n<3000) "
                "INSERT INTO T (Name,Whole,Small) SELECT 'x'||(n%10),n,0 FROM s");
    }
    QString Count(const QString& where) { return Rows(u"SELECT COUNT(*) FROM T WHERE "_s + where).value(0); }
};

TEST_F(BulkWrites, ChangeExactlyTheRecordsOfTheResult)
{
    const struct {
        QString source;
        int field; // Small in that result
        int records;
    } rows[] = {
        {u"T"_s, Small, kCount},
        {u"SELECT Small FROM T WHERE Name='x3'"_s, 0, 300},
        {u"SELECT Small FROM T WHERE Small=0 AND Whole>100"_s, 0, kCount - 100},
        {u"SELECT Small,Name FROM T WHERE Name='x1' ORDER BY Name DESC,Whole"_s, 0, 300},
    };
    for (const auto& row : rows) {
        Run(u"UPDATE T SET Small=0"_s);
        const auto cursor = Open(row.source);
        qint64 told = 0;
        EXPECT_EQ(cursor->UpdateAll(row.field, Value::Text(u"7"_s), -1,
                                    [&told](qint64 done) { return (told = done) >= 0; }),
                  Hr::Ok);
        EXPECT_EQ(told, row.records) << row.source.toStdString();
        EXPECT_EQ(Count(u"Small=7"_s).toInt(), row.records) << row.source.toStdString();
        EXPECT_EQ(cursor->RecordCount(), row.records) << "the result keeps its records";
    }
    const auto cursor = Open(u"SELECT * FROM T WHERE Name='x3'"_s);
    EXPECT_EQ(cursor->DeleteAll(-1, {}), Hr::Ok);
    EXPECT_TRUE(cursor->AtEnd());
    EXPECT_EQ(cursor->RecordCount(), 0);
    EXPECT_EQ(Count(u"Whole>0"_s).toInt(), kCount - 300);
}

// The records are those that were asked about, whatever meets the condition by now.
TEST_F(BulkWrites, TouchNothingThatTheResultDoesNotHold)
{
    for (const bool deletes : {false, true}) {
        Run(u"UPDATE T SET Small=0"_s);
        Run(u"UPDATE T SET Small=1 WHERE Whole<=10"_s);
        const auto change = [&](ProviderRecordset& cursor, qint64 confirmed) {
            return deletes ? cursor.DeleteAll(confirmed, {})
                           : cursor.UpdateAll(0, Value::Text(u"all"_s), confirmed, {});
        };
        const QString source = u"SELECT Name FROM T WHERE Small=1"_s;
        EXPECT_EQ(change(*Open(source), 9), Hr::RecordChanged) << "more than were asked about";
        EXPECT_EQ(Count(u"Name='all'"_s), u"0"_s);
        EXPECT_EQ(Count(u"Whole>0"_s).toInt(), kCount);

        const auto cursor = Open(source);
        ASSERT_EQ(cursor->RecordCount(), 10);
        const auto other = Open(u"T"_s);
        for (const auto& [position, small] : {std::pair(0, 0), std::pair(100, 1)}) {
            ASSERT_EQ(other->MoveTo(position), Hr::Ok);
            const FieldChange value{Small, Value::SmallInt(qint16(small))};
            ASSERT_EQ(other->Update({&value, 1}), Hr::Ok);
        }
        EXPECT_EQ(change(*cursor, 10), Hr::Ok);
        EXPECT_EQ(Count(u"Whole=101 AND Name='x1'"_s), u"1"_s) << "it came to meet the condition since";
        EXPECT_EQ(Count(deletes ? u"Whole<=10"_s : u"Whole<=10 AND Name<>'all'"_s), u"0"_s);
        Run(u"UPDATE T SET Name='x' WHERE Name='all'"_s);
    }
}

TEST_F(BulkWrites, KeepWhatCameBeforeAStopOrARefusal)
{
    const auto cursor = Open(u"T"_s);
    EXPECT_EQ(cursor->UpdateAll(Small, Value::SmallInt(1), -1, [](qint64 done) { return done < 2000; }), Hr::Ok);
    EXPECT_EQ(Count(u"Small=1"_s), u"2048"_s);
    EXPECT_EQ(cursor->UpdateAll(Small, Value::Text(u"x"_s), -1, {}), Hr::BadLiteral);

    const QString foreign = PathOf(u"foreign.db"_s);
    Outside(foreign, "CREATE TABLE F (n INTEGER, v INTEGER CHECK (n<1500 OR v<5));"
                     "WITH RECURSIVE s(n) AS (SELECT 1 UNION ALL SELECT n+1 FROM s WHERE n<3000) "
                     "INSERT INTO F SELECT n,0 FROM s");
    auto checked = provider->CreateRecordset();
    ASSERT_EQ(checked->Open(u"F"_s, foreign, CursorType::Static, LockType::Optimistic), Hr::Ok);
    EXPECT_EQ(checked->UpdateAll(1, Value::Integer(9), -1, {}), Hr::IntegrityViolation);
    EXPECT_FALSE(checked->ErrorContext().isEmpty());
    ASSERT_EQ(
        checked->Open(u"SELECT COUNT(*) FROM F WHERE v=9"_s, foreign, CursorType::Static, LockType::ReadOnly),
        Hr::Ok);
    EXPECT_EQ(FieldOf(*checked), Value::Integer(1499));

    const auto filtered = Open(u"SELECT * FROM T WHERE Whole>0"_s);
    EXPECT_EQ(filtered->DeleteAll(-1, [](qint64 done) { return done < 1000; }), Hr::Ok);
    EXPECT_EQ(filtered->RecordCount(), kCount - 1024);
    EXPECT_EQ(filtered->Position(), 0);
    EXPECT_EQ(cursor->DeleteAll(-1, [](qint64) { return false; }), Hr::Ok);
    EXPECT_EQ(cursor->RecordCount(), kCount - 1024) << "a whole table goes at once or not at all";
    EXPECT_EQ(cursor->DeleteAll(-1, {}), Hr::Ok);
    EXPECT_EQ(cursor->RecordCount(), 0);
    EXPECT_TRUE(cursor->AtEnd());
}

TEST_F(BulkWrites, AreOneTransactionBetweenBeginAndEnd)
{
    const auto cursor = Open(u"T"_s);
    const auto outsideCount = [this] {
        sqlite3* handle = nullptr;
        sqlite3_stmt* statement = nullptr;
        sqlite3_open(QFile::encodeName(path).constData(), &handle);
        sqlite3_prepare_v2(handle, "SELECT count(*) FROM T", -1, &statement, nullptr);
        sqlite3_step(statement);
        const int count = sqlite3_column_int(statement, 0);
        sqlite3_finalize(statement);
        sqlite3_close(handle);
        return count;
    };
    Hr result = Hr::Ok;
    auto outer = provider->BeginTransaction(path, result, context);
    auto inner = provider->BeginTransaction(path, result, context);
    ASSERT_TRUE(outer && inner);
    Add(*cursor, {});
    ASSERT_EQ(inner->Commit(), Hr::Ok);
    Run(u"INSERT INTO T (Name) VALUES ('b')"_s);
    EXPECT_EQ(outsideCount(), kCount);
    ASSERT_EQ(outer->Commit(), Hr::Ok);
    EXPECT_EQ(outsideCount(), kCount + 2);
    EXPECT_TRUE(Failed(outer->Commit())) << "it has ended";

    // What is not committed is taken back, and so is the whole around it.
    outer = provider->BeginTransaction(path, result, context);
    inner = provider->BeginTransaction(path, result, context);
    Add(*cursor, {});
    EXPECT_EQ(cursor->RecordCount(), kCount + 3);
    inner.reset();
    EXPECT_TRUE(Failed(outer->Commit()));
    EXPECT_EQ(outsideCount(), kCount + 2);
    EXPECT_EQ(cursor->RecordCount(), kCount + 2) << "the cursor knows";
}

// In files from elsewhere a column can be the row id itself.
TEST_F(BulkWrites, OfAKeyLeaveTheCursorOnRecordsThatAreThere)
{
    Outside("CREATE TABLE K (Id INTEGER PRIMARY KEY, Name TEXT); INSERT INTO K VALUES (1,'a'),(2,'b')");
    const auto cursor = Open(u"K"_s);
    ASSERT_EQ(cursor->RecordCount(), 2);
    EXPECT_EQ(cursor->UpdateAll(0, Value::Integer(7), -1, {}), Hr::IntegrityViolation) << "only one can be 7";
    EXPECT_EQ(Read(*cursor), (QStringList{u"2|b"_s, u"7|a"_s}));
    EXPECT_EQ(Read(*cursor, {.first = 1, .count = 1}), QStringList{u"7|a"_s});
    EXPECT_TRUE(cursor->IsGone()) << "its key is another, and no neighbor stands in for it";
    ASSERT_EQ(cursor->MoveNext(), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor, 1), Value::Text(u"b"_s)) << "at the position of the record that went";
    ASSERT_EQ(cursor->MoveNext(), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor, 0), Value::Integer(7));
}

// What the way back of many changes is made of; tests/result/change_log_test.cpp has the rest.
TEST_F(BulkWrites, ByIdentityNeedATransactionAndTheValuesExpected)
{
    Outside("CREATE TABLE K (Id INTEGER PRIMARY KEY, Name VARCHAR(3)); INSERT INTO K VALUES (1,'a'),(2,'b')");
    Hr result = Hr::Unexpected;
    QString reason;
    EXPECT_EQ(provider->CreateEditor(path, u"Nowhere"_s, result, reason), nullptr);
    EXPECT_EQ(result, Hr::NoSuchTable);
    const auto editor = provider->CreateEditor(path, u"K"_s, result, reason);
    ASSERT_TRUE(editor) << reason.toStdString();
    const auto cursor = Open(u"K"_s);
    RecordId id = cursor->IdInTable();
    const auto name = [](const char16_t* text) {
        return std::array{FieldChange{1, Value::Text(QString::fromUtf16(text))}};
    };
    EXPECT_EQ(editor->Update(id, name(u"a"), name(u"x")), Hr::Unexpected) << "no transaction";
    EXPECT_EQ(editor->Add(id, name(u"x")), Hr::Unexpected);
    const auto transaction = provider->BeginTransaction(path, result, reason);
    ASSERT_TRUE(transaction);
    EXPECT_EQ(editor->Update(id, name(u"b"), name(u"x")), Hr::RecordChanged);
    EXPECT_EQ(editor->Update(id, name(u"a"), name(u"long")), Hr::Overflow);
    EXPECT_EQ(editor->Update(id, name(u"a"), name(u"x")), Hr::Ok);
    EXPECT_EQ(editor->Delete(id, name(u"a")), Hr::RecordChanged);
    EXPECT_EQ(editor->Delete(id, name(u"x")), Hr::Ok);
    EXPECT_EQ(editor->Delete(id, {}), Hr::NoCurrentRecord);
    for (RecordId strange : {RecordId(), RecordId("1"), RecordId(QByteArray(16, '\1'))})
        EXPECT_EQ(editor->Update(strange, {}, name(u"y")), Hr::NoCurrentRecord);
    EXPECT_EQ(editor->Add(id, name(u"c")), Hr::Ok);
    EXPECT_EQ(transaction->Commit(), Hr::Ok);
    EXPECT_EQ(Read(*Open(u"K"_s)), (QStringList{u"1|c"_s, u"2|b"_s}));
    provider->CloseDatabase(path);
    EXPECT_EQ(editor->Delete(id, {}), Hr::NotOpen);
}

class Appending : public RecordWrites {
protected:
    std::unique_ptr<RecordAppender> Appender(const QStringList& columns, Hr expected = Hr::Ok)
    {
        Hr result = Hr::Unexpected;
        QString reason;
        auto appender = provider->CreateAppender(path, u"T"_s, columns, result, reason);
        EXPECT_EQ(result, expected) << reason.toStdString();
        return appender;
    }
};

TEST_F(Appending, ChecksEachCellAndGoesOnAfterARefusedRecord)
{
    const auto appender = Appender({u"name"_s, u"Small"_s, u"Real"_s, u"Day"_s, u"Flag"_s});
    ASSERT_TRUE(appender);
    const struct {
        const char* what;
        std::vector<Cell> cells;
        int refused;
    } rows[] = {
        {"texts",
         {Cell::OfText("Äpfel"), Cell::OfText("12"), Cell::OfText("1.5"), Cell::OfText("2001-07-04T09:05"),
          Cell::OfText("yes")},
         -1},
        {"numbers", {Cell(), Cell::Of(qint64(-3)), Cell::Of(2.5), Cell(), Cell::Of(qint64(5))}, -1},
        {"text too long", {Cell::OfText("sechs!"), Cell(), Cell(), Cell(), Cell()}, 0},
        {"out of range", {Cell(), Cell::OfText("32768"), Cell(), Cell(), Cell()}, 1},
        {"no number", {Cell(), Cell(), Cell::OfText("1,5"), Cell(), Cell()}, 2},
        {"no date", {Cell(), Cell(), Cell(), Cell::OfText("2001-13-04"), Cell()}, 3},
        {"too few cells", {Cell()}, -1},
    };
    for (const auto& row : rows) {
        const bool fits = row.refused < 0 && row.cells.size() == 5;
        EXPECT_EQ(!Failed(appender->Append(row.cells)), fits) << row.what;
        EXPECT_EQ(appender->RefusedField(), row.refused) << row.what;
    }
    ASSERT_EQ(appender->Commit(), Hr::Ok);
    EXPECT_EQ(Rows(u"SELECT Name,Small,Real,Day,Flag FROM T"_s),
              (QStringList{u"Äpfel|12|1.5|2001-07-04 09:05:00|1"_s, u"~|-3|2.5|~|1"_s}));
}

// Records wait for one another on their way into the table; none may be lost or change its place over that.
TEST_F(Appending, KeepsTheOrderOfManyRecords)
{
    constexpr int kRecords = 1000;
    const auto appender = Appender({u"Memo"_s, u"Whole"_s});
    const std::string long40K(40'000, 'x');
    for (int i = 0; i < kRecords; ++i) {
        const Cell cells[] = {Cell::OfText(i % 10 == 3 ? std::string_view(long40K) : "short"),
                              Cell::Of(qint64(i))};
        const Cell tooBig[] = {Cell::OfText("half a record"), Cell::Of(qint64(1) << 40)};
        ASSERT_EQ(appender->Append(cells), Hr::Ok);
        if (i % 7 == 0) {
            ASSERT_EQ(appender->Append(tooBig), Hr::Overflow);
        }
    }
    ASSERT_EQ(appender->Commit(), Hr::Ok);
    const QStringList numbers = Rows(u"SELECT Whole FROM T"_s);
    ASSERT_EQ(numbers.size(), kRecords);
    for (int i = 0; i < kRecords; ++i)
        ASSERT_EQ(numbers[i], QString::number(i));
    EXPECT_EQ(Rows(u"SELECT COUNT(*) FROM T WHERE LEN(Memo)=40000"_s), QStringList{u"100"_s});
}

TEST_F(Appending, TellsOfTheVeryRecordThatTheFileRefuses)
{
    const qint64 numbers[] = {4, 5, 4, 6};
    const struct {
        const char* what;
        QByteArray table;
        size_t refused; // index among the numbers
    } rows[] = {
        {"a unique index", "CREATE TABLE T (Whole INTEGER); CREATE UNIQUE INDEX u ON T (Whole)", 2},
        {"a unique column", "CREATE TABLE T (Whole INTEGER UNIQUE)", 2},
        {"a key", "CREATE TABLE T (Whole INTEGER PRIMARY KEY)", 2},
        {"a check", "CREATE TABLE T ([no check] TEXT, Whole INTEGER, check/**/(Whole<>5))", 1},
        {"an index over an expression",
         "CREATE TABLE T (Whole INTEGER); CREATE INDEX e ON T (abs(CASE Whole WHEN 5 THEN -9223372036854775807-1 "
         "END))",
         1},
        {"a trigger",
         "CREATE TABLE T (Whole INTEGER); CREATE TRIGGER no BEFORE INSERT ON T WHEN new.Whole=5 "
         "BEGIN SELECT RAISE(ABORT,'five'); END",
         1},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.what);
        Outside("DROP TABLE T; " + row.table);
        const auto appender = Appender({u"Whole"_s});
        ASSERT_TRUE(appender);
        QStringList expected;
        for (size_t i = 0; i < std::size(numbers); ++i) {
            const Cell cells[] = {Cell::Of(numbers[i])};
            EXPECT_EQ(Failed(appender->Append(cells)), i == row.refused) << i;
            if (i != row.refused)
                expected += QString::number(numbers[i]);
        }
        EXPECT_EQ(appender->Commit(), Hr::Ok);
        QStringList kept = Rows(u"SELECT Whole FROM T"_s);
        expected.sort();
        kept.sort();
        EXPECT_EQ(kept, expected);
    }
}

TEST_F(Appending, LeavesNothingWhereTheDiskIsFull)
{
    provider->CloseDatabase(path);
    const SmallDisk disk(10);
    const auto appender = Appender({u"Memo"_s});
    ASSERT_TRUE(appender);
    const std::string text(10'000, 'x');
    const Cell cells[] = {Cell::OfText(text)};
    int taken = 0;
    while (taken < 1000 && !Failed(appender->Append(cells)))
        ++taken;
    EXPECT_LT(taken, 1000);
    EXPECT_EQ(appender->Append(cells), Hr::DiskFull) << "no record goes in behind the ones that were lost";
    EXPECT_EQ(appender->Commit(), Hr::DiskFull);
    EXPECT_TRUE(Rows(u"SELECT Memo FROM T"_s).isEmpty());
}

TEST_F(Appending, LeavesNothingWithoutCommit)
{
    const Cell cells[] = {Cell::OfText("a")};
    {
        const auto appender = Appender({u"Name"_s});
        ASSERT_EQ(appender->Append(cells), Hr::Ok);
    }
    EXPECT_TRUE(Rows(u"SELECT Name FROM T"_s).isEmpty());
    {
        Hr result = Hr::Ok;
        const auto whole = provider->BeginTransaction(path, result, context);
        {
            const auto appender = Appender({u"Name"_s});
            for (int i = 0; i < 200; ++i)
                ASSERT_EQ(appender->Append(cells), Hr::Ok);
        }
        Run(u"INSERT INTO T (Name) VALUES ('b')"_s);
        ASSERT_EQ(whole->Commit(), Hr::Ok);
    }
    EXPECT_EQ(Rows(u"SELECT Name FROM T"_s), QStringList{u"b"_s}) << "nor within another change";
    Appender({u"Nobody"_s}, Hr::NoSuchColumn);
    Appender({u"Name"_s, u"NAME"_s}, Hr::DuplicateColumn);
    EXPECT_EQ(Appender({})->Fields().size(), 8U);
}

} // namespace
} // namespace mirel
