#include "app/database_facts.h"
#include "app/database_upkeep.h"
#include "resources/string_table.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"
#include "support/sqlite_file.h"

#include <gtest/gtest.h>

#include <QFile>
#include <QFileInfo>
#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class DatabaseUpkeepTest : public ::testing::Test {
protected:
    DatabaseUpkeepTest()
    {
        EXPECT_TRUE(session_.Create(path_));
        EXPECT_TRUE(Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40))"_s));
        EXPECT_TRUE(Execute(u"INSERT INTO Birds (Name) VALUES ('Wren')"_s));
        FormDef form;
        form.SetName(u"Entry");
        form.SetTableName(u"Bees");
        session_.Store().AddForm(form);
        EXPECT_TRUE(session_.Store().Save());
    }
    bool Execute(const QString& statement)
    {
        return session_.GetCatalog().ExecuteStatement(session_.Location(), statement);
    }
    QString Fact(const DatabaseFacts& facts, Str label)
    {
        for (const DatabaseFacts::Fact& fact : facts.Facts()) {
            if (fact.label == label)
                return fact.value;
        }
        return {};
    }

    QTemporaryDir folder_;
    QString path_ = folder_.filePath(u"shop.cdb"_s);
    QString copy_ = folder_.filePath(u"copy.cdb"_s);
    ScriptedPrompt prompt_;
    DbConnection connection_;
    DatabaseSession session_{connection_, ProgramFolder{folder_.path()}, prompt_};
    DatabaseUpkeep upkeep_{session_};
};

TEST_F(DatabaseUpkeepTest, ACopyIsWholeAndReplacesAFileOnlyAfterAQuestion)
{
    EXPECT_TRUE(upkeep_.BackUp(copy_).contains(u"copy.cdb"_s));
    EXPECT_EQ(SqliteFile(copy_).Text("SELECT Name FROM Birds"), u"Wren"_s);
    ASSERT_TRUE(Execute(u"INSERT INTO Birds (Name) VALUES ('Owl')"_s));
    prompt_.answers = {false, true};
    EXPECT_TRUE(upkeep_.BackUp(copy_).isEmpty());
    EXPECT_EQ(SqliteFile(copy_).Text("SELECT count(*) FROM Birds"), u"1"_s) << "No leaves it";
    EXPECT_FALSE(upkeep_.BackUp(copy_).isEmpty());
    EXPECT_EQ(SqliteFile(copy_).Text("SELECT count(*) FROM Birds"), u"2"_s);

    EXPECT_TRUE(upkeep_.BackUp(path_).isEmpty()) << "onto itself";
    EXPECT_TRUE(upkeep_.BackUp(session_.SideFile()).isEmpty());
    EXPECT_TRUE(upkeep_.BackUp(folder_.filePath(u"no/such/folder.cdb"_s)).isEmpty());
    EXPECT_EQ(prompt_.shown.size(), 3);
    ASSERT_TRUE(Execute(u"CREATE TABLE [Big] ([Note] Text)"_s)); // more than is copied at once
    for (int i = 0; i < 12; ++i)
        ASSERT_TRUE(Execute(u"INSERT INTO Big (Note) VALUES ('%1')"_s.arg(QString(900'000, u'x'))));
    prompt_.stopAt = 0;
    EXPECT_EQ(upkeep_.BackUp(folder_.filePath(u"stopped.cdb"_s)), StringText(Str::BackUpStopped));
    EXPECT_FALSE(QFileInfo::exists(folder_.filePath(u"stopped.cdb"_s)));
}

// Neither a file that only looks like one of ours, nor what a database left behind that was killed there.
TEST_F(DatabaseUpkeepTest, ACopyTakesNothingFromItsNeighborsAndNothingOver)
{
    const QString neighbor = copy_ + u".part"_s;
    const QString journal = copy_ + u"-journal"_s;
    for (const QString& path : {neighbor, journal}) {
        QFile file(path);
        ASSERT_TRUE(file.open(QIODevice::WriteOnly) && file.write("mine") == 4);
    }
    EXPECT_FALSE(upkeep_.BackUp(copy_).isEmpty());
    EXPECT_FALSE(QFileInfo::exists(journal)) << "it would be played back into the copy";
    QFile kept(neighbor);
    ASSERT_TRUE(kept.open(QIODevice::ReadOnly));
    EXPECT_EQ(kept.readAll(), "mine");
    EXPECT_FALSE(QFileInfo::exists(neighbor + u'2'));
    EXPECT_EQ(SqliteFile(copy_).Text("SELECT Name FROM Birds"), u"Wren"_s);
}

TEST_F(DatabaseUpkeepTest, TheNameOfACopyIsFree)
{
    const QString first = upkeep_.NameForCopy();
    EXPECT_TRUE(first.startsWith(u"shop"_s) && first.endsWith(u".cdb"_s));
    QFile taken(folder_.filePath(first));
    ASSERT_TRUE(taken.open(QIODevice::WriteOnly));
    EXPECT_NE(upkeep_.NameForCopy(), first);
}

TEST_F(DatabaseUpkeepTest, CompactingGivesRoomBackAndAnotherProgramsLockIsNamed)
{
    ASSERT_TRUE(Execute(u"CREATE TABLE [Big] ([Note] Text)"_s));
    ASSERT_TRUE(Execute(u"INSERT INTO Big (Note) VALUES ('%1')"_s.arg(QString(300'000, u'x'))));
    ASSERT_TRUE(Execute(u"DROP TABLE Big"_s));
    const qint64 before = QFileInfo(path_).size();
    EXPECT_FALSE(upkeep_.Compact().isEmpty()) << prompt_.shown.join(u'\n').toStdString();
    EXPECT_LT(QFileInfo(path_).size(), before);
    EXPECT_TRUE(Execute(u"INSERT INTO Birds (Name) VALUES ('Owl')"_s)) << "it goes on";

    SqliteFile other(path_);
    other.Run("BEGIN IMMEDIATE");
    EXPECT_TRUE(upkeep_.Compact().isEmpty());
    EXPECT_EQ(prompt_.reasons, QStringList(StringText(Str::CompactInUse)));
    other.Run("COMMIT");
    EXPECT_FALSE(upkeep_.Compact().isEmpty());
}

TEST_F(DatabaseUpkeepTest, TheCheckSaysWhatIsWrongAndWhatToDo)
{
    std::vector<CheckFinding> findings;
    EXPECT_EQ(upkeep_.Check(findings), StringText(Str::CheckOneFinding));
    ASSERT_EQ(findings.size(), 1U);
    EXPECT_EQ(findings[0].text, u"form \"Entry\": there is no table \"Bees\""_s);
    EXPECT_EQ(findings[0].remedy, Str::RemedyForm);

    ASSERT_TRUE(Execute(u"CREATE TABLE [Bees] ([Name] Varchar(40))"_s));
    EXPECT_EQ(upkeep_.Check(findings), StringText(Str::CheckClean));
    EXPECT_TRUE(findings.empty());

    QFile sideFile(session_.SideFile());
    ASSERT_TRUE(sideFile.resize(sideFile.size() - 7));
    (void)upkeep_.Check(findings);
    ASSERT_FALSE(findings.empty());
    EXPECT_EQ(findings[0].remedy, Str::RemedyStore);
}

TEST_F(DatabaseUpkeepTest, TheCheckFindsDamage)
{
    ASSERT_TRUE(Execute(u"CREATE TABLE [Bees] ([Name] Varchar(40))"_s));
    for (int i = 0; i < 400; ++i)
        ASSERT_TRUE(Execute(u"INSERT INTO Bees (Name) VALUES ('%1')"_s.arg(QString(40, u'b'))));
    ASSERT_TRUE(Execute(u"CREATE INDEX Bees_Name ON Bees (Name ASC)"_s));
    session_.Close();
    {
        SqliteFile other(path_);
        other.Run(
            "PRAGMA writable_schema=ON; UPDATE sqlite_schema SET rootpage=(SELECT rootpage FROM sqlite_schema "
            "WHERE name='Bees') WHERE name='Birds'");
    }
    ASSERT_TRUE(session_.Open(path_));
    std::vector<CheckFinding> findings;
    EXPECT_FALSE(upkeep_.Check(findings).isEmpty());
    ASSERT_FALSE(findings.empty());
    EXPECT_EQ(findings[0].remedy, Str::RemedyDamage);
}

TEST_F(DatabaseUpkeepTest, TheFactsCountEveryTable)
{
    ASSERT_TRUE(Execute(u"CREATE TABLE [Bees] ([Name] Varchar(40))"_s));
    for (int i = 0; i < 3; ++i)
        ASSERT_TRUE(Execute(u"INSERT INTO Bees (Name) VALUES ('b')"_s));
    DatabaseFacts facts(session_);
    facts.Look();
    for (int i = 0; i < 1000 && facts.IsCounting(); ++i)
        facts.CountOn(5);
    EXPECT_EQ(Fact(facts, Str::InformationTables), u"2"_s);
    EXPECT_EQ(Fact(facts, Str::InformationRecords), u"4"_s);
    EXPECT_EQ(Fact(facts, Str::InformationForms), u"1"_s);
    EXPECT_EQ(Fact(facts, Str::InformationStamp), session_.Stamp());
    EXPECT_EQ(Fact(facts, Str::InformationName), u"shop.cdb"_s);
}

} // namespace
} // namespace mirel
