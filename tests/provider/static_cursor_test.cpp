// Results that know their positions: every kind must read the same at each of them, through own changes and
// those of others.
#include "provider/database_fixture.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qint64 kMany = 5000; // several samples of the position index

class StaticCursor : public DatabaseFixture {
protected:
    StaticCursor()
    {
        Run(u"CREATE TABLE T (N Integer,Name Varchar(20),Grp Integer)"_s);
        Run(u"CREATE TABLE G (Id Integer,Title Varchar(20))"_s);
        Run(u"INSERT INTO G (Id,Title) VALUES (0,'zero')"_s);
        Run(u"INSERT INTO G (Id,Title) VALUES (1,'one')"_s);
    }

    void Fill(qint64 count)
    {
        Outside("WITH RECURSIVE s(n) AS (SELECT 0 UNION ALL SELECT n+1 FROM s WHERE n<" +
                QByteArray::number(count - 1) + ") INSERT INTO T SELECT n,'name '||(n*7919%1000),n%3 FROM s");
    }

    // Positions, pages, moves and walks of one result agree with what a plain walk of it gives.
    void ExpectAgreement(const QString& source, const char* what)
    {
        const auto cursor = Open(source);
        const QStringList all = Read(*cursor);
        ASSERT_EQ(cursor->RecordCount(), all.size()) << what;
        EXPECT_EQ(Rows(source), all) << what << ": forward-only";
        for (const qint64 position : {0LL, 1LL, 1023LL, 1024LL, 1500LL, 2048LL, qint64(all.size()) - 1}) {
            if (position < 0 || position >= all.size())
                continue;
            EXPECT_EQ(Read(*cursor, {.first = position, .count = 3, .fields = {}}), all.mid(position, 3))
                << what << ": page at " << position;
            ASSERT_EQ(cursor->MoveTo(position), Hr::Ok);
            EXPECT_EQ(cursor->Position(), position) << what;
            EXPECT_EQ(QString::number(FieldOf(*cursor).ToInt()), all[position].section(u'|', 0, 0))
                << what << ": record " << position;
        }
    }
};

TEST_F(StaticCursor, StandsAnywhereInEveryKindOfResult)
{
    Fill(kMany);
    const std::initializer_list<std::pair<const char*, QString>> kinds = {
        {"whole table", u"SELECT * FROM T"_s},
        {"bare name", u"T"_s},
        {"filtered", u"SELECT * FROM T WHERE Grp=1"_s},
        {"sorted", u"SELECT N,Name FROM T ORDER BY Name DESC"_s},
        {"joined", u"SELECT T.N,G.Title FROM T INNER JOIN G ON T.Grp=G.Id ORDER BY T.N DESC"_s},
        {"outer join", u"SELECT T.N,G.Title FROM T LEFT JOIN G ON T.Grp=G.Id ORDER BY T.Name"_s},
        {"no keys", u"SELECT DISTINCT Grp FROM T"_s},
        {"no rows", u"SELECT * FROM T WHERE N<0"_s},
    };
    for (const auto& [what, source] : kinds)
        ExpectAgreement(source, what);
    Outside("DELETE FROM T WHERE N%7=3 OR N BETWEEN 1000 AND 1100");
    for (const auto& [what, source] : kinds)
        ExpectAgreement(source, what);
}

TEST_F(StaticCursor, MovesStopAtEitherEnd)
{
    const auto empty = Open(u"T"_s);
    EXPECT_TRUE(empty->AtEnd());
    EXPECT_EQ(empty->MoveLast(), Hr::Ok);
    EXPECT_TRUE(empty->AtEnd());
    Fill(3);
    const auto cursor = Open(u"T"_s);
    EXPECT_EQ(cursor->Position(), 0);
    EXPECT_EQ(cursor->MoveTo(7), Hr::Ok);
    EXPECT_TRUE(cursor->AtEnd());
    EXPECT_EQ(cursor->Position(), -1);
    EXPECT_EQ(cursor->MovePrevious(), Hr::Ok);
    EXPECT_EQ(cursor->Position(), 2);
    EXPECT_EQ(cursor->MoveTo(-5), Hr::Ok);
    EXPECT_TRUE(cursor->AtBegin());
    Value value;
    EXPECT_EQ(cursor->GetValue(0, value), Hr::NoCurrentRecord);
    EXPECT_EQ(cursor->MoveNext(), Hr::Ok);
    EXPECT_EQ(cursor->Position(), 0);
}

TEST_F(StaticCursor, CountsInSlices)
{
    Fill(4 * kMany);
    for (const QString& source : {u"T"_s, u"SELECT * FROM T WHERE Grp=1"_s}) {
        const auto cursor = Open(source);
        int steps = 1;
        while (!cursor->CountStep(0) && steps < 1000)
            ++steps;
        EXPECT_GT(steps, 1) << source.toStdString();
        EXPECT_LT(steps, 1000) << "each step learns something, however short";
    }
}

// The records of T by N, whatever order they stand in.
TEST_F(StaticCursor, OwnAdditionsGoToTheEndAndOwnDeletionsLeave)
{
    for (const bool gaps : {false, true}) {
        Run(u"DELETE FROM T"_s);
        Fill(2100);
        if (gaps)
            Outside("DELETE FROM T WHERE N%5=0");
        for (const QString& source :
             {u"SELECT N FROM T"_s, u"SELECT N FROM T WHERE N>=0"_s, u"SELECT N FROM T ORDER BY N"_s}) {
            SCOPED_TRACE(source.toStdString() + (gaps ? ", gaps" : ", dense"));
            const auto cursor = Open(source);
            QStringList expected = Read(*cursor);
            const quint64 generation = cursor->Generation();
            for (const qint64 position : {1024LL, 1024LL, 0LL}) {
                ASSERT_EQ(cursor->MoveTo(position), Hr::Ok);
                ASSERT_EQ(cursor->Delete(), Hr::Ok);
                expected.removeAt(position);
                EXPECT_EQ(cursor->Position(), position);
                EXPECT_EQ(QString::number(FieldOf(*cursor).ToInt()), expected[position]);
            }
            const FieldChange value{0, Value::Integer(-1)};
            ASSERT_EQ(cursor->AddNew({&value, 1}, {}), Hr::Ok);
            expected += u"-1"_s;
            EXPECT_EQ(cursor->Position(), expected.size() - 1);
            EXPECT_EQ(FieldOf(*cursor), Value::Integer(-1));
            EXPECT_EQ(cursor->RecordCount(), expected.size());
            EXPECT_EQ(Read(*cursor), expected);
            EXPECT_EQ(Read(*cursor, {.first = 1022, .count = 5, .fields = {}}), expected.mid(1022, 5));
            EXPECT_GT(cursor->Generation(), generation);
            ASSERT_EQ(cursor->MoveLast(), Hr::Ok);
            ASSERT_EQ(cursor->Delete(), Hr::Ok);
            EXPECT_TRUE(cursor->AtEnd());
        }
    }
}

// What an undo needs: a deleted record is again the one it was, if nobody has its number by now.
TEST_F(StaticCursor, ARecordComesBackUnderItsNumberWhileThatIsFree)
{
    Fill(2100);
    for (const bool gaps : {false, true}) {
        if (gaps)
            Outside("DELETE FROM T WHERE N%5=0");
        for (const qint64 position : {0LL, 1023LL, 1500LL}) {
            SCOPED_TRACE(QString::number(position).toStdString() + (gaps ? ", gaps" : ", dense"));
            const auto cursor = Open(u"SELECT N FROM T"_s);
            const QStringList before = Read(*cursor);
            ASSERT_EQ(cursor->MoveTo(position), Hr::Ok);
            const RecordId id = cursor->IdInTable();
            const FieldChange value{0, FieldOf(*cursor)};
            ASSERT_EQ(cursor->Delete(), Hr::Ok);
            ASSERT_EQ(cursor->AddNew({&value, 1}, id), Hr::Ok);
            EXPECT_EQ(cursor->IdInTable(), id);
            EXPECT_EQ(cursor->Position(), position);
            EXPECT_EQ(Read(*cursor), before);
            EXPECT_EQ(Read(*cursor, {.first = position, .count = 2, .fields = {}}), before.mid(position, 2));
            ASSERT_EQ(cursor->AddNew({&value, 1}, id), Hr::Ok);
            EXPECT_NE(cursor->IdInTable(), id) << "it is taken";
            ASSERT_EQ(cursor->Delete(), Hr::Ok);
            EXPECT_EQ(Read(*cursor), before);
        }
    }
}

TEST_F(StaticCursor, KnowsRowIdsOfAnySize)
{
    for (const QStringList& all :
         {QStringList{u"1"_s, u"4294967294"_s, u"4294967295"_s}, QStringList{u"0"_s, u"4294967296"_s},
          QStringList{u"-9223372036854775808"_s, u"-1"_s, u"0"_s, u"9223372036854775807"_s}}) {
        Outside("DELETE FROM T");
        for (const QString& rowId : all)
            Outside("INSERT INTO T(rowid,N,Name) VALUES(" + rowId.toLatin1() + ",1,'" + rowId.toLatin1() + "')");
        for (const QString& source :
             {u"SELECT Name FROM T"_s, u"SELECT Name FROM T WHERE N=1"_s, u"SELECT Name FROM T ORDER BY N"_s}) {
            SCOPED_TRACE(source.toStdString() + ": " + all.join(u' ').toStdString());
            const auto cursor = Open(source);
            for (int position = 0; position < all.size(); ++position) {
                ASSERT_EQ(cursor->MoveTo(position), Hr::Ok);
                EXPECT_EQ(FieldOf(*cursor), Value::Text(all[position]));
                EXPECT_EQ(Read(*cursor, {.first = position, .count = 1, .fields = {}}), all.mid(position, 1));
            }
        }
    }
}

TEST_F(StaticCursor, TakesUpWhatOthersChanged)
{
    Fill(2000);
    const auto other = Open(u"T"_s);
    for (const QString& source : {u"SELECT N FROM T"_s, u"SELECT N FROM T WHERE N>=0"_s}) {
        SCOPED_TRACE(source.toStdString());
        const auto cursor = Open(source);
        ASSERT_EQ(cursor->MoveTo(1500), Hr::Ok);
        const Value current = FieldOf(*cursor);
        Outside("DELETE FROM T WHERE rowid=(SELECT rowid FROM T WHERE N>=0 LIMIT 1 OFFSET 10)");
        EXPECT_EQ(Read(*cursor).size(), cursor->RecordCount());
        EXPECT_EQ(cursor->Position(), 1499) << "found again by its row id";
        EXPECT_EQ(FieldOf(*cursor), current);
        const qint64 count = cursor->RecordCount();
        ASSERT_EQ(other->MoveTo(5), Hr::Ok);
        ASSERT_EQ(other->Delete(), Hr::Ok) << "another result of this program";
        EXPECT_EQ(cursor->RecordCount(), count - 1);
        Run(u"INSERT INTO T (N) VALUES (77777)"_s);
        EXPECT_EQ(cursor->RecordCount(), count);
        EXPECT_EQ(Read(*cursor).last(), u"77777"_s);
    }
}

TEST_F(StaticCursor, SeesChangedValuesAndVanishedRecords)
{
    Fill(3);
    const auto cursor = Open(u"SELECT N,Name FROM T ORDER BY N"_s);
    const auto other = Open(u"T"_s);
    EXPECT_EQ(FieldOf(*cursor), Value::Integer(0));
    const FieldChange change{0, Value::Integer(50)};
    ASSERT_EQ(other->Update({&change, 1}), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor), Value::Integer(0)) << "as it was shown";
    ASSERT_EQ(cursor->TakeUpChanges(ProviderRecordset::Values::ReadAgain), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor), Value::Integer(50));
    EXPECT_EQ(Read(*cursor).first().section(u'|', 0, 0), u"50"_s) << "it keeps its place in the order";
    Outside("DELETE FROM T WHERE N=50");
    EXPECT_EQ(cursor->Update({&change, 1}), Hr::NoCurrentRecord);
    EXPECT_FALSE(cursor->ErrorContext().isEmpty());
    EXPECT_EQ(cursor->MoveFirst(), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor), Value::Integer(1));
}

TEST_F(StaticCursor, ReadsOnlyTheFieldsAskedForAndStopsWhenTold)
{
    Fill(10);
    for (const CursorType type : {CursorType::Static, CursorType::ForwardOnly}) {
        const auto cursor = Open(u"SELECT N,Name,Grp FROM T"_s, type);
        EXPECT_EQ(Read(*cursor, {.count = 2, .fields = {2, 0}}), (QStringList{u"0|0"_s, u"1|1"_s}));
        int seen = 0;
        EXPECT_EQ(cursor->Read({.fields = {}}, [&seen](std::span<const Cell>) { return ++seen < 3; }), Hr::Ok);
        EXPECT_EQ(seen, 3);
        EXPECT_EQ(cursor->Read({.fields = {3}}, [](std::span<const Cell>) { return true; }), Hr::NoSuchColumn);
    }
}

TEST_F(StaticCursor, ForwardOnlyWalksBeyondItsFirstBlock)
{
    Fill(kMany);
    const auto cursor = Open(u"SELECT N FROM T WHERE N<1000"_s, CursorType::ForwardOnly);
    int expected = 0;
    for (; !cursor->AtEnd(); ++expected) {
        ASSERT_EQ(FieldOf(*cursor), Value::Integer(expected));
        ASSERT_EQ(cursor->MoveNext(), Hr::Ok);
    }
    EXPECT_EQ(expected, 1000);
    const auto read = Open(u"SELECT N FROM T WHERE N<1000"_s, CursorType::ForwardOnly);
    EXPECT_EQ(Read(*read, {.count = 300, .fields = {}}).last(), u"299"_s);
    EXPECT_EQ(FieldOf(*read), Value::Integer(300)) << "what was read is used up";
    EXPECT_EQ(Read(*read).size(), 700);
    EXPECT_TRUE(read->AtEnd());
    EXPECT_EQ(cursor->RecordCount(), -1);
    EXPECT_TRUE(Failed(cursor->MovePrevious()));
}

TEST_F(StaticCursor, LeavesNothingLockedBetweenCalls)
{
    Fill(2000);
    const auto forward = Open(u"T"_s, CursorType::ForwardOnly);
    const auto cursor = Open(u"SELECT N FROM T ORDER BY Name"_s);
    const auto kept = Open(u"SELECT DISTINCT Grp FROM T"_s);
    ASSERT_EQ(cursor->MoveNext(), Hr::Ok);
    Outside("UPDATE T SET Grp=9");
    Run(u"ALTER TABLE T MOVE Grp BEFORE N"_s);
    Run(u"ALTER TABLE T DROP Name"_s);
    EXPECT_EQ(Read(*kept).size(), 3) << "kept as it was";
    Run(u"DROP TABLE T"_s);
    EXPECT_TRUE(Failed(cursor->MoveNext()));
}

TEST_F(StaticCursor, EndsWithItsDatabase)
{
    Fill(3);
    const auto cursor = Open(u"T"_s);
    provider->CloseDatabase(path);
    EXPECT_EQ(cursor->MoveNext(), Hr::NotOpen);
    EXPECT_EQ(cursor->Read({}, [](std::span<const Cell>) { return true; }), Hr::NotOpen);
    EXPECT_TRUE(cursor->AtEnd());
    EXPECT_EQ(Rows(u"SELECT N FROM T"_s).size(), 3) << "opened again";
}

TEST_F(StaticCursor, FindsARecordByItsNumberInEveryOrder)
{
    Fill(kMany);
    const auto table = Open(u"SELECT * FROM T"_s);
    ASSERT_EQ(table->MoveTo(1234), Hr::Ok);
    const RecordId id = table->IdInTable();
    ASSERT_FALSE(id.IsNull());
    ASSERT_EQ(table->MoveNext(), Hr::Ok);
    const RecordId next = table->IdInTable();
    ASSERT_EQ(table->MoveTo(kMany - 1), Hr::Ok);
    const auto sorted = Open(u"SELECT N FROM T WHERE Grp=1 ORDER BY N DESC"_s);
    ASSERT_EQ(sorted->MoveToRecord(id), Hr::Ok);
    EXPECT_EQ(FieldOf(*sorted).ToInt(), 1234);
    EXPECT_EQ(sorted->IdInTable(), id);

    const auto others = Open(u"SELECT N FROM T WHERE Grp=2"_s);
    ASSERT_EQ(others->MoveTo(7), Hr::Ok);
    EXPECT_EQ(others->MoveToRecord(id), Hr::NoCurrentRecord);
    EXPECT_EQ(others->Position(), 7) << "nothing moved";
    Outside("DELETE FROM T WHERE N=1234");
    for (const RecordId& gone : {id, RecordId(), RecordId("no key of ours"), RecordId(QByteArray(8, '\x7f'))})
        EXPECT_EQ(table->MoveToRecord(gone), Hr::NoCurrentRecord) << gone.Key().toStdString();
    EXPECT_EQ(table->MoveToRecord(next), Hr::Ok);
    EXPECT_EQ(table->Position(), 1234);

    const auto fixed = Open(u"SELECT DISTINCT Grp FROM T"_s);
    EXPECT_TRUE(fixed->Id().IsNull());
    EXPECT_EQ(fixed->MoveToRecord(id), Hr::NoCurrentRecord);
}

// Numbers of both kinds, dates and nothing, in every file that may come: what we sort stands as the engine would
// put it, ties by the row id.
TEST_F(StaticCursor, OrdersNumbersAndDatesAsTheEngineDoes)
{
    const char* const values[] = {
        // more than are sorted in one piece, and many that differ late
        "WITH RECURSIVE s(n) AS (SELECT 1 UNION ALL SELECT n+1 FROM s WHERE n<20000) "
        "INSERT INTO X SELECT CASE n%4 WHEN 0 THEN n*7919%10007 WHEN 1 THEN n*0.37 "
        "WHEN 2 THEN 4611686018427387904+n*7919%10007 ELSE date('1999-01-01','+'||(n*31%9000)||' days') END FROM "
        "s",
        "INSERT INTO X VALUES(9007199254740993),(9007199254740992.0),(9007199254740994.0),(-0.0),(0),(NULL),"
        "(9223372036854775807),(9223372036854775807.0),(-9223372036854775807),(-9223372036854775807.0),(1e308),"
        "(-1e308),(9e999),(-9e999),(1e-300),(-1e-300),(0.1),(NULL),('1899-12-30 "
        "10:00:00'),('1899-12-30'),(-1),(1)",
        "INSERT INTO X VALUES('next Tuesday'),(x'00ff')", // the engine sorts all of it
    };
    Outside("CREATE TABLE X(V DATETIME)");
    for (const char* sql : values) {
        Outside(sql);
        for (const bool descending : {false, true}) {
            SCOPED_TRACE(testing::Message() << sql << descending);
            const QByteArray order = descending ? " DESC" : "";
            Outside("DROP TABLE IF EXISTS Right; CREATE TABLE Right AS SELECT rowid AS R FROM X ORDER BY V" +
                    order + ",rowid");
            const QStringList right = Rows(u"Right"_s);
            const auto cursor = Open(u"SELECT V FROM X ORDER BY V"_s + QString::fromLatin1(order));
            std::vector<RecordId> ids;
            ASSERT_EQ(cursor->Ids(0, right.size(), ids), Hr::Ok);
            ASSERT_EQ(qsizetype(ids.size()), right.size());
            for (qsizetype at = 0; at < right.size(); ++at) {
                qint64 rowId = 0;
                memcpy(&rowId, ids[size_t(at)].Key().constData(), sizeof rowId);
                ASSERT_EQ(QString::number(rowId), right[at]) << "at " << at;
            }
        }
    }
}

} // namespace
} // namespace mirel
