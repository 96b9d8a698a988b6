// What an open result writes, takes back and writes again, while others change the same table.
#include "result/open_result.h"

#include "support/printing.h"
#include "support/scripted_prompt.h"

#include <gtest/gtest.h>

#include <QTemporaryDir>

#include <sqlite3.h>

#include <utility>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;
using Written = OpenResult::Written;

// Something happens behind the first question.
class BusyPrompt : public ScriptedPrompt {
public:
    std::function<void()> meanwhile;

    bool AskYesNo(const UserMessage& question) override
    {
        if (const auto now = std::exchange(meanwhile, {}))
            now();
        return ScriptedPrompt::AskYesNo(question);
    }
};

struct NeverStops : Progress {
    bool Advance(qint64) override { return true; }
};

// A result of the table "T": "a1 b2 c3 d4", each record a name and a number.
class OpenResultTest : public ::testing::Test {
protected:
    enum Column { Name, N };
    const QString before = u"a1 b2 c3 d4"_s;

    OpenResultTest()
    {
        Do(u"CREATE DATABASE '%1'"_s.arg(path), {});
        Do(u"CREATE TABLE T (Name Varchar(20),N Integer)"_s);
        Outside("INSERT INTO T VALUES('a',1),('b',2),('c',3),('d',4)");
    }

    // What another view of this program does.
    void Do(const QString& statement, const QString& database)
    {
        DbRecordset rows(connection);
        EXPECT_TRUE(rows.Open(statement, database, CursorType::ForwardOnly, LockType::ReadOnly))
            << statement.toStdString() << ": " << rows.ErrorContext().toStdString();
    }
    void Do(const QString& statement) { Do(statement, path); }
    // What another program does.
    void Outside(const QByteArray& sql)
    {
        sqlite3* handle = nullptr;
        ASSERT_EQ(sqlite3_open(path.toUtf8().constData(), &handle), SQLITE_OK);
        EXPECT_EQ(sqlite3_exec(handle, sql.constData(), nullptr, nullptr, nullptr), SQLITE_OK)
            << sql.toStdString() << ": " << sqlite3_errmsg(handle);
        sqlite3_close(handle);
    }
    // The records, each as the texts of its fields.
    QString Stored(const QString& source = u"SELECT * FROM T ORDER BY N"_s)
    {
        DbRecordset rows(connection);
        EXPECT_TRUE(rows.Open(source, path, CursorType::ForwardOnly, LockType::ReadOnly));
        QStringList records;
        for (; !rows.IsEof(); (void)rows.MoveNext()) {
            records += QString();
            for (int field = 0; field < rows.FieldCount(); ++field)
                records.last() += rows.ValueText(field);
        }
        return records.join(u' ');
    }

    static FieldChange NameIs(const QString& name) { return {Name, Value::Text(name)}; }
    Written Rename(qint64 position, const QString& name)
    {
        EXPECT_TRUE(result.MoveTo(position));
        const FieldChange change = NameIs(name);
        return result.Update({&change, 1}, {});
    }
    Written Delete(qint64 position)
    {
        EXPECT_TRUE(result.MoveTo(position));
        return result.Delete(result.Seen(), {});
    }
    // A name for each of the records, and for new ones behind them.
    OpenResult::ManyWritten RenameMany(const std::vector<SeenRecord>& seen, const QStringList& names)
    {
        const auto values = [&](qint64 at) { return std::vector{NameIs(names[at])}; };
        return result.WriteMany(seen, names.size(), values, goOn);
    }

    QTemporaryDir folder;
    QString path = folder.filePath(u"t.cdb"_s);
    DbConnection connection;
    BusyPrompt prompt;
    NeverStops goOn;
    OpenResult result{connection, path, prompt};
};

TEST_F(OpenResultTest, EveryChangeIsTakenBackAndMadeAgain)
{
    const struct {
        const char* what;
        std::function<bool()> change;
        QString after;
    } rows[] = {
        {"a field", [this] { return Rename(1, u"x"_s) == Written::Done; }, u"a1 x2 c3 d4"_s},
        {"a new record",
         [this] {
             const FieldChange values[] = {NameIs(u"x"_s), {N, Value::Integer(9)}};
             return result.Add(values) == Written::Done;
         },
         u"a1 b2 c3 d4 x9"_s},
        {"a record goes", [this] { return Delete(1) == Written::Done; }, u"a1 c3 d4"_s},
        {"two records, and a new one",
         [this] {
             return RenameMany(result.SeenFrom(2, 2), {u"x"_s, u"y"_s, u"z"_s}).records == 3;
         },
         u"z a1 b2 x3 y4"_s},
        {"two records go", [this] { return result.DeleteMany(result.SeenFrom(1, 2), goOn).records == 2; },
         u"a1 d4"_s},
        {"a field of all", [this] { return result.UpdateAll(Name, Value::Text(u"x"_s), 4, {}); },
         u"x1 x2 x3 x4"_s},
        {"each its own",
         [this] {
             const auto values = [this] {
                 const QString twice = result.Records().ValueText(Name).repeated(2);
                 return std::optional(std::vector{NameIs(twice)});
             };
             return result.WriteAll(4, values, goOn).records == 4;
         },
         u"aa1 bb2 cc3 dd4"_s},
        {"all go", [this] { return result.DeleteAll(4, {}); }, QString()},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.what);
        ASSERT_TRUE(result.Open(u"T"_s));
        EXPECT_TRUE(row.change());
        EXPECT_EQ(Stored(), row.after);
        EXPECT_TRUE(result.Undo().done);
        EXPECT_EQ(Stored(), before);
        EXPECT_FALSE(result.CanUndo());
        EXPECT_TRUE(result.Redo().done);
        EXPECT_EQ(Stored(), row.after);
        EXPECT_TRUE(result.Undo().done);
        EXPECT_EQ(Stored(), before);
        EXPECT_TRUE(result.CanRedo());
        EXPECT_EQ(Rename(0, u"new"_s), Written::Done);
        EXPECT_FALSE(result.CanRedo()) << "it would be made in a table that is another by now";
        EXPECT_TRUE(result.Undo().done);
    }
    EXPECT_EQ(prompt.shown, QStringList());
}

TEST_F(OpenResultTest, ARecordIsFoundUnderItsNewIdentity)
{
    ASSERT_TRUE(result.Open(u"T"_s));
    ASSERT_EQ(Rename(3, u"x"_s), Written::Done);
    ASSERT_EQ(Delete(3), Written::Done);
    Do(u"INSERT INTO T (Name,N) VALUES ('new',9)"_s); // it has the row id of the one that went
    EXPECT_TRUE(result.Undo().done);
    EXPECT_EQ(Stored(), u"a1 b2 c3 x4 new9"_s);
    EXPECT_TRUE(result.Undo().done);
    EXPECT_EQ(Stored(), u"a1 b2 c3 d4 new9"_s);
    EXPECT_TRUE(result.Redo().done);
    EXPECT_TRUE(result.Redo().done);
    EXPECT_EQ(Stored(), u"a1 b2 c3 new9"_s);

    Outside("CREATE TABLE K (Id INTEGER PRIMARY KEY, Name TEXT); INSERT INTO K VALUES(1,'a'),(2,'b')");
    const QString keys = u"SELECT Id,Name FROM K ORDER BY Name"_s;
    ASSERT_TRUE(result.Open(u"K"_s));
    const FieldChange key{0, Value::Integer(7)};
    ASSERT_EQ(result.Update({&key, 1}, {}), Written::Done);
    EXPECT_EQ(Stored(keys), u"7a 2b"_s);
    EXPECT_TRUE(result.Undo().done);
    EXPECT_EQ(Stored(keys), u"1a 2b"_s);
    EXPECT_TRUE(result.Redo().done);
    EXPECT_EQ(Stored(keys), u"7a 2b"_s);
    EXPECT_EQ(prompt.shown, QStringList());
}

TEST_F(OpenResultTest, UndoGoesOnWhereARefusalStoppedIt)
{
    Outside("CREATE UNIQUE INDEX u ON T(Name)");
    ASSERT_TRUE(result.Open(u"T"_s));
    ASSERT_EQ(RenameMany(result.SeenFrom(0, 3), {u"x"_s, u"y"_s, u"z"_s}).records, 3);
    Do(u"INSERT INTO T (Name,N) VALUES ('b',9)"_s);
    EXPECT_FALSE(result.Undo().done);
    EXPECT_EQ(prompt.shown.size(), 1);
    EXPECT_EQ(Stored(), u"x1 y2 c3 d4 b9"_s) << "from the last to the first, as far as it goes";
    Do(u"DELETE FROM T WHERE N=9"_s);
    EXPECT_TRUE(result.Undo().done);
    EXPECT_EQ(Stored(), before);
    EXPECT_TRUE(result.Redo().done);
    EXPECT_TRUE(result.Redo().done);
    EXPECT_EQ(Stored(), u"x1 y2 z3 d4"_s);
}

TEST_F(OpenResultTest, UndoLeavesAloneWhatOthersChangedSince)
{
    ASSERT_TRUE(result.Open(u"T"_s));
    ASSERT_EQ(RenameMany(result.SeenFrom(0, 3), {u"x"_s, u"y"_s, u"z"_s}).records, 3);
    Do(u"UPDATE T SET Name='theirs' WHERE N=1"_s);
    Do(u"UPDATE T SET N=20 WHERE N=2"_s);
    Do(u"DELETE FROM T WHERE N=3"_s);
    EXPECT_TRUE(result.Undo().done);
    EXPECT_EQ(Stored(), u"theirs1 d4 b20"_s) << "the name alone was changed here";
    EXPECT_EQ(prompt.shown.size(), 1);
    EXPECT_FALSE(result.CanUndo());
}

TEST_F(OpenResultTest, UndoBringsBackNoRecordThatIsStillThere)
{
    Outside("WITH RECURSIVE s(n) AS (SELECT 5 UNION ALL SELECT n+1 FROM s WHERE n<3000) "
            "INSERT INTO T SELECT 'n',n FROM s");
    ASSERT_TRUE(result.Open(u"SELECT * FROM T WHERE N>0"_s));
    EXPECT_TRUE(result.DeleteAll(3000, [](qint64 done) { return done < 1000; }));
    EXPECT_TRUE(result.TakeUpChanges());
    EXPECT_LT(result.Count(), 3000);
    EXPECT_GT(result.Count(), 0);
    EXPECT_TRUE(result.Undo().done);
    EXPECT_EQ(Stored(u"SELECT COUNT(*),MIN(N),MAX(N),SUM(N) FROM T"_s), u"3000130004501500"_s);
}

// A change of too many cells is not kept. What came before it must not be taken back past it.
TEST_F(OpenResultTest, AChangeThatIsNotKeptEndsTheWayBack)
{
    constexpr qint64 kRecords = ChangeLog::kMostCells + 1;
    Outside("WITH RECURSIVE s(n) AS (SELECT 5 UNION ALL SELECT n+1 FROM s WHERE n<" +
            QByteArray::number(kRecords) + ") INSERT INTO T SELECT 'n',n FROM s");
    const struct {
        const char* what;
        std::function<bool()> change;
    } rows[] = {
        {"all updated", [this] { return result.UpdateAll(Name, Value::Text(u"x"_s), kRecords, {}); }},
        {"all deleted", [this] { return result.DeleteAll(kRecords, {}); }},
    };
    for (const auto& row : rows) {
        ASSERT_TRUE(result.Open(u"T"_s));
        ASSERT_EQ(Rename(0, u"before"_s), Written::Done);
        EXPECT_TRUE(row.change()) << row.what;
        EXPECT_FALSE(result.CanUndo()) << row.what;
    }
}

TEST_F(OpenResultTest, AsksAgainWhenARecordChangesDuringTheQuestion)
{
    for (const bool deletes : {false, true}) {
        for (const bool agrees : {false, true}) {
            SCOPED_TRACE(deletes ? "a deletion" : "an update");
            Outside("DELETE FROM T WHERE N=1; INSERT INTO T(rowid,Name,N) VALUES(1,'a',1)");
            ASSERT_TRUE(result.Open(u"T"_s));
            const SeenRecord seen = result.Seen();
            const FieldChange mine = NameIs(u"mine"_s);
            prompt.questions.clear();
            prompt.answers = {true, agrees};
            prompt.meanwhile = [this] {
                Do(u"UPDATE T SET Name='theirs, later' WHERE N=1"_s);
                EXPECT_FALSE(result.TakeUpChanges()) << "the window looks for changes behind the question";
            };
            Do(u"UPDATE T SET Name='theirs' WHERE N=1"_s);
            EXPECT_EQ(deletes ? result.Delete(seen, {}) : result.Update({&mine, 1}, {}),
                      agrees ? Written::Done : Written::GaveWay);
            ASSERT_EQ(prompt.questions.size(), 2);
            EXPECT_TRUE(prompt.questions[1].contains(u"theirs, later"_s)) << prompt.questions[1].toStdString();
            EXPECT_EQ(Stored(), !agrees   ? u"theirs, later1 b2 c3 d4"_s
                                : deletes ? u"b2 c3 d4"_s
                                          : u"mine1 b2 c3 d4"_s);
        }
    }
}

TEST_F(OpenResultTest, ChangesOfManyLeaveAloneWhatIsNotAsItWasSeen)
{
    const struct {
        const char* what;
        std::function<OpenResult::ManyWritten(const std::vector<SeenRecord>&)> change;
        qint64 records;
        QString after;
    } rows[] = {
        {"deleted: each field counts", [this](const auto& seen) { return result.DeleteMany(seen, goOn); }, 1,
         u"theirs1 b20"_s},
        {"renamed: the name alone counts",
         [this](const auto& seen) {
             return RenameMany(seen, {u"x"_s, u"x"_s, u"x"_s, u"x"_s});
         },
         2, u"theirs1 x4 x20"_s},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.what);
        Outside("DELETE FROM T; INSERT INTO T VALUES('a',1),('b',2),('c',3),('d',4)");
        ASSERT_TRUE(result.Open(u"T"_s));
        const std::vector<SeenRecord> seen = result.SeenFrom(0, 4);
        Do(u"UPDATE T SET Name='theirs' WHERE N=1"_s);
        Do(u"UPDATE T SET N=20 WHERE N=2"_s);
        Do(u"DELETE FROM T WHERE N=3"_s);
        const OpenResult::ManyWritten written = row.change(seen);
        EXPECT_EQ(Stored(), row.after);
        EXPECT_EQ(written.records, row.records);
        EXPECT_EQ(written.leftAlone, 4 - row.records);
    }
    ASSERT_TRUE(result.Open(u"T"_s));
    const auto values = [] { return std::optional(std::vector{NameIs(u"y"_s)}); };
    EXPECT_EQ(result.WriteAll(2, values, goOn).records, 0) << "more records than were asked about";
    EXPECT_EQ(result.LastResult(), Hr::RecordChanged);
    EXPECT_EQ(Stored(), u"theirs1 x4 x20"_s);
}

TEST_F(OpenResultTest, ARefusedStatementLeavesTheOneBeforeWithItsFilters)
{
    ASSERT_TRUE(result.Open(u"SELECT * FROM T"_s));
    ASSERT_TRUE(result.AddCondition(u"N>1"_s));
    ASSERT_TRUE(result.OrderBy(u"N DESC"_s));
    EXPECT_FALSE(result.OpenInstead(u"SELECT * FROM Nowhere"_s));
    EXPECT_EQ(result.Count(), 3);
    EXPECT_EQ(result.Records().ValueText(Name), u"d"_s);
    EXPECT_EQ(result.Conditions(), QStringList{u"N>1"_s});
    EXPECT_TRUE(result.RemoveConditions());
    EXPECT_EQ(result.Count(), 4);
}

} // namespace
} // namespace mirel
