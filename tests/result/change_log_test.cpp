// The way back of many changes, while others use the same file.
#include "result/open_result.h"
#include "support/scripted_prompt.h"
#include "support/sqlite_file.h"

#include <gtest/gtest.h>

#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const BulkProgress kGoOn = [](qint64) { return true; };

// A table of another program's, and a result over all of it. `State` is what the file holds.
class ManyChanges : public ::testing::Test {
protected:
    explicit ManyChanges(const QByteArray& columns = "K INTEGER PRIMARY KEY, N INTEGER, S TEXT COLLATE NOCASE, "
                                                     "D DATETIME, Most INTEGER, X, CHECK (N<=Most)")
    {
        other_.Run("PRAGMA synchronous=OFF; CREATE TABLE T (" + columns + ")");
    }
    void Fill(const QByteArray& records)
    {
        other_.Run("INSERT INTO T " + records);
        ASSERT_TRUE(result_.Open(u"SELECT * FROM T"_s));
    }
    QString State(const QByteArray& column)
    {
        return other_.Text("SELECT group_concat(rowid||':'||ifnull(" + column + ",'-'),' ') FROM T");
    }
    bool UpdateAll(int field, const Value& value)
    {
        return result_.UpdateAll(field, value, result_.Count(), kGoOn);
    }

    QTemporaryDir folder_;
    QString path_ = folder_.filePath(u"t.db"_s);
    SqliteFile other_{path_};
    DbConnection connection_;
    ScriptedPrompt prompt_;
    OpenResult result_{connection_, path_, prompt_};
};

TEST_F(ManyChanges, AreTakenBackButForWhatOthersDidSince)
{
    enum Field { K, N, S, D, Most, X };
    enum class Then { NothingLeft, SomeAreToCome };
    const Value day = Value::Date(37'000); // 2001-04-19
    const struct {
        const char* what;
        Field field;
        Value value; // what all records get
        QByteArray column;
        QByteArray others; // what somebody does before the undo
        QString state;     // after it
        Then then = Then::NothingLeft;
        int told = 0;
    } cases[] = {
        {"nobody", N, Value::Integer(0), "N", "", u"1:10 2:20 3:30"_s},
        {"another value", N, Value::Integer(0), "N", "UPDATE T SET N=5 WHERE K=2", u"1:10 2:5 3:30"_s,
         Then::NothingLeft, 1},
        {"no value", N, Value::Integer(0), "N", "UPDATE T SET N=NULL WHERE K=2", u"1:10 2:- 3:30"_s,
         Then::NothingLeft, 1},
        {"a record less", N, Value::Null(), "N", "DELETE FROM T WHERE K=2", u"1:10 3:30"_s, Then::NothingLeft, 1},
        {"a value of another field", N, Value::Integer(0), "N", "UPDATE T SET S='x'", u"1:10 2:20 3:30"_s},
        {"the case of a letter, where the column has no regard to it", S, Value::Text(u"x"_s), "S",
         "UPDATE T SET S='X' WHERE K=2", u"1:a 2:X 3:c"_s, Then::NothingLeft, 1},
        {"the same date, written in another way", D, day, "D", "UPDATE T SET D='2001-04-19T00:00Z' WHERE K=2",
         u"1:2000-01-01 2:2000-01-02 3:-"_s},
        {"the same date, as a number", D, day, "D", "UPDATE T SET D=2452018.5 WHERE K=2",
         u"1:2000-01-01 2:2000-01-02 3:-"_s},
        {"a text that is no date", D, day, "D", "UPDATE T SET D='2001-04-19 or so' WHERE K=2",
         u"1:2000-01-01 2:2001-04-19 or so 3:-"_s, Then::NothingLeft, 1},
        {"the same number of another kind, where the column takes any", X, Value::Integer(7), "X",
         "UPDATE T SET X=7.0 WHERE K=2", u"1:1 2:7.0 3:3"_s, Then::NothingLeft, 1},
        {"a rule that holds no more", N, Value::Integer(0), "N", "UPDATE T SET Most=5 WHERE K=2",
         u"1:0 2:0 3:30"_s, Then::SomeAreToCome, 1},
        {"a trigger that refuses", N, Value::Integer(0), "N",
         "CREATE TRIGGER R BEFORE UPDATE ON T WHEN OLD.K=2 BEGIN SELECT RAISE(ABORT,'not now'); END",
         u"1:0 2:0 3:30"_s, Then::SomeAreToCome, 1},
        {"a trigger that ignores the record", N, Value::Integer(0), "N",
         "CREATE TRIGGER R BEFORE UPDATE ON T WHEN OLD.K=2 BEGIN SELECT RAISE(IGNORE); END", u"1:0 2:0 3:30"_s,
         Then::SomeAreToCome, 1},
        {"another name of the column", N, Value::Integer(0), "M", "ALTER TABLE T RENAME N TO M", u"1:0 2:0 3:0"_s,
         Then::NothingLeft, 1},
    };
    for (const auto& row : cases) {
        SCOPED_TRACE(row.what);
        other_.Run("DELETE FROM T");
        Fill("VALUES (1,10,'a','2000-01-01',99,1), (2,20,'b','2000-01-02',99,2), (3,30,'c',NULL,99,3)");
        ASSERT_TRUE(UpdateAll(row.field, row.value));
        prompt_.shown.clear();
        other_.Run(row.others);
        const ChangeLog::Outcome outcome = result_.Undo();
        EXPECT_EQ(State(row.column), row.state);
        EXPECT_EQ(prompt_.shown.size(), row.told) << prompt_.shown.join(u'\n').toStdString();
        EXPECT_EQ(outcome.done, row.then == Then::NothingLeft);
        EXPECT_EQ(result_.CanUndo(), row.then == Then::SomeAreToCome);
        other_.Run("DROP TRIGGER IF EXISTS R");
        if (row.then == Then::SomeAreToCome) { // once nothing stands in the way
            other_.Run("UPDATE T SET Most=99");
            EXPECT_TRUE(result_.Undo().done);
            EXPECT_EQ(State(row.column), u"1:10 2:20 3:30"_s);
        }
    }
}

TEST_F(ManyChanges, GoBackAndForthAsFarAsTheUserLetsThem)
{
    Fill("WITH RECURSIVE C(I) AS (SELECT 1 UNION ALL SELECT I+1 FROM C WHERE I<200) SELECT I,I,'s',NULL,999,0 FROM "
         "C");
    OpenResult shown(connection_, path_, prompt_);
    ASSERT_TRUE(shown.Open(u"SELECT N FROM T"_s) && shown.MoveTo(199));
    const auto lastShown = [&shown] {
        EXPECT_TRUE(shown.TakeUpChanges());
        return shown.Records().FieldValue(0);
    };
    ASSERT_TRUE(UpdateAll(1, Value::Integer(7)));
    EXPECT_EQ(lastShown(), Value::Integer(7));
    prompt_.stopAt = 64;
    (void)result_.Undo();
    EXPECT_EQ(other_.Text("SELECT count(*)||' '||min(K) FROM T WHERE N=K AND K<>7"), u"64 137"_s)
        << "the last ones first";
    EXPECT_TRUE(result_.CanUndo() && result_.CanRedo());
    EXPECT_EQ(lastShown(), Value::Integer(200)) << "another result knows";
    prompt_.stopAt = -1;
    EXPECT_TRUE(result_.Undo().done);
    EXPECT_EQ(other_.Text("SELECT count(*) FROM T WHERE N=K"), u"200"_s);
    EXPECT_FALSE(result_.CanUndo());
    EXPECT_TRUE(result_.Redo().done && result_.Redo().done);
    EXPECT_EQ(other_.Text("SELECT count(*) FROM T WHERE N=7"), u"200"_s);
    EXPECT_TRUE(result_.Undo().done && result_.Undo().done);
    EXPECT_EQ(other_.Text("SELECT count(*) FROM T WHERE N=K"), u"200"_s);
    EXPECT_EQ(prompt_.shown, QStringList());
}

TEST_F(ManyChanges, OfKeysLeadBackToThem)
{
    Fill("VALUES (1,10,'a',NULL,99,0), (2,20,'b',NULL,99,0)");
    const YesNoWords words;
    ASSERT_TRUE(result_.MoveTo(1));
    ASSERT_EQ(
        result_.Update(std::array{FieldChange{0, Value::Integer(8)}, FieldChange{1, Value::Integer(9)}}, words),
        OpenResult::Written::Done);
    EXPECT_EQ(State("N"), u"1:10 8:9"_s);
    EXPECT_TRUE(result_.Undo().done);
    EXPECT_EQ(State("N"), u"1:10 2:20"_s);
    EXPECT_EQ(result_.Records().FieldValue(0), Value::Integer(2)) << "it is current";
    EXPECT_TRUE(result_.Redo().done);
    EXPECT_EQ(State("N"), u"1:10 8:9"_s);
    other_.Run("INSERT INTO T VALUES (2,0,'new',NULL,99,0)");
    EXPECT_FALSE(result_.Undo().done) << "its key is taken";
    EXPECT_EQ(State("N"), u"1:10 2:0 8:9"_s);
}

// Whose row ids are no column of theirs.
class ManyDeletions : public ManyChanges {
protected:
    ManyDeletions()
        : ManyChanges("N INT, S TEXT NOT NULL")
    {
        Fill("VALUES (10,'a'), (20,'b'), (30,'c')");
    }
};

TEST_F(ManyDeletions, BringTheSameRecordsBack)
{
    OpenResult shown(connection_, path_, prompt_);
    ASSERT_TRUE(shown.Open(u"SELECT * FROM T"_s));
    ASSERT_TRUE(result_.DeleteAll(3, kGoOn));
    EXPECT_TRUE(result_.Undo().done);
    EXPECT_EQ(State("N"), u"1:10 2:20 3:30"_s);
    ASSERT_TRUE(shown.TakeUpChanges());
    EXPECT_EQ(shown.Count(), 3);
    other_.Run("UPDATE T SET S='theirs' WHERE N=20");
    EXPECT_TRUE(result_.Redo().done);
    EXPECT_EQ(State("N"), u"2:20"_s) << "what somebody changed stays";
    EXPECT_EQ(prompt_.shown.size(), 1);
    EXPECT_TRUE(result_.Undo().done);
    EXPECT_EQ(State("N"), u"1:10 2:20 3:30"_s);
}

TEST_F(ManyDeletions, FindARowIdTakenAndAreKnownByTheNewOne)
{
    ASSERT_TRUE(UpdateAll(0, Value::Integer(7)));
    ASSERT_TRUE(result_.DeleteAll(3, kGoOn));
    other_.Run("INSERT INTO T(rowid,N,S) VALUES (2,0,'new')");
    EXPECT_TRUE(result_.Undo().done);
    EXPECT_EQ(State("S"), u"1:a 2:new 3:c 4:b"_s);
    EXPECT_TRUE(result_.Undo().done);
    EXPECT_EQ(State("N"), u"1:10 2:0 3:30 4:20"_s);
    EXPECT_TRUE(result_.Redo().done && result_.Redo().done);
    EXPECT_EQ(State("S"), u"2:new"_s);
    EXPECT_EQ(prompt_.shown, QStringList());
}

TEST_F(ManyDeletions, WaitForATableThatCanTakeThem)
{
    ASSERT_TRUE(result_.DeleteAll(3, kGoOn));
    other_.Run("ALTER TABLE T RENAME TO U; CREATE VIEW T AS SELECT * FROM U");
    EXPECT_FALSE(result_.Undo().done);
    other_.Run(
        "DROP VIEW T; ALTER TABLE U RENAME TO T; CREATE UNIQUE INDEX I ON T(S); INSERT INTO T VALUES (0,'b')");
    EXPECT_FALSE(result_.Undo().done) << "there is a b";
    EXPECT_EQ(prompt_.shown.size(), 2);
    EXPECT_EQ(other_.Text("SELECT group_concat(S) FROM T ORDER BY S"), u"b,c"_s);
    other_.Run("DELETE FROM T WHERE S='b'");
    EXPECT_TRUE(result_.Undo().done);
    EXPECT_EQ(State("N"), u"1:10 2:20 3:30"_s);
    EXPECT_FALSE(result_.CanUndo());
}

} // namespace
} // namespace mirel
