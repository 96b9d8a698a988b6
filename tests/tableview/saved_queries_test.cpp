#include "tableview/saved_queries.h"

#include "resources/string_table.h"
#include "tableview/people_fixture.h"
#include "tableview/record_browser.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class Queries : public PeopleFixture {
protected:
    // As the file has it now.
    QString OnDisk(const QString& name)
    {
        FormStore fresh(store.Path());
        EXPECT_TRUE(fresh.Load());
        const QueryDef* query = fresh.FindQuery(name);
        return query ? query->tableName.Text() + u": "_s + query->text.Text() : QString();
    }

    FormStore store{folder.filePath(u"store.raf"_s)};
    SavedQueries queries{store, prompt};
};

TEST_F(Queries, AreWrittenAtOnceAndReplacedOnlyWhenTheUserSaysSo)
{
    EXPECT_TRUE(queries.Save(u"Old ones"_s, u"People"_s, u"SELECT 1"_s));
    EXPECT_EQ(OnDisk(u"Old ones"_s), u"People: SELECT 1"_s);
    EXPECT_FALSE(queries.Save(u"Old ones"_s, u"Other"_s, u"SELECT 2"_s));
    EXPECT_EQ(prompt.questions,
              QStringList(u"Query \"Old ones\" exists:\r\nDo you want to replace the existing query?"_s));
    EXPECT_EQ(OnDisk(u"Old ones"_s), u"People: SELECT 1"_s);
    prompt.answers = {true};
    EXPECT_TRUE(queries.Save(u"Old ones"_s, u"Other"_s, u"SELECT 2"_s));
    EXPECT_TRUE(queries.Save(u"Old ones"_s, u"Other"_s, u"SELECT 3"_s, SavedQueries::OnExisting::Replace));
    EXPECT_EQ(prompt.questions.size(), 2);
    EXPECT_EQ(OnDisk(u"Old ones"_s), u"Other: SELECT 3"_s);
    EXPECT_EQ(queries.Names(), QStringList(u"Old ones"_s));
}

TEST_F(Queries, AskAboutWhatAnotherProgramSavedMeanwhile)
{
    EXPECT_EQ(queries.Names(), QStringList());
    FormStore other(store.Path());
    EXPECT_TRUE(SavedQueries(other, prompt).Save(u"Q"_s, u"People"_s, u"SELECT 'other'"_s));
    EXPECT_FALSE(queries.Save(u"Q"_s, u"People"_s, u"SELECT 'own'"_s));
    EXPECT_EQ(prompt.questions.size(), 1);
    EXPECT_TRUE(queries.Save(u"R"_s, u"People"_s, u"SELECT 'own'"_s));
    EXPECT_EQ(OnDisk(u"Q"_s), u"People: SELECT 'other'"_s);
}

TEST_F(Queries, CutTheNamesThatAreTooLongAndKnowThemAgain)
{
    const QString name = u"0123456789"_s.repeated(5);
    EXPECT_TRUE(queries.Save(name, name, u"SELECT 1"_s));
    EXPECT_EQ(OnDisk(name.first(40)), name.first(31) + u": SELECT 1"_s);
    EXPECT_FALSE(queries.Save(name, name, u"SELECT 2"_s));
    EXPECT_EQ(prompt.questions.size(), 1) << "the cut name is taken";
    EXPECT_FALSE(queries.Save(u"  "_s, u"People"_s, u"SELECT 1"_s)) << "a name that nobody could see";
}

TEST_F(Queries, SayWhyNothingCouldBeSaved)
{
    FormStore none;
    EXPECT_FALSE(SavedQueries(none, prompt).CanSave());
    EXPECT_FALSE(SavedQueries(none, prompt).Save(u"Q"_s, u"T"_s, u"SELECT 1"_s));
    FormStore nowhere(folder.filePath(u"missing/store.raf"_s));
    EXPECT_FALSE(SavedQueries(nowhere, prompt).Save(u"Q"_s, u"T"_s, u"SELECT 1"_s));
    EXPECT_FALSE(queries.Remove(u"Q"_s));
    EXPECT_EQ(prompt.shown,
              QStringList({StringText(Str::StoreMissing), nowhere.LastError(), u"There is no query \"Q\"."_s}));
    EXPECT_EQ(prompt.questions, QStringList());
    EXPECT_TRUE(none.Queries().empty());
}

TEST_F(Queries, AskAboutAStatementThatIsNotClosed)
{
    EXPECT_TRUE(queries.AskIfUnbalanced(u"SELECT ')' FROM T"_s));
    EXPECT_FALSE(queries.AskIfUnbalanced(u"SELECT (1 FROM T"_s));
    prompt.answers = {true};
    EXPECT_TRUE(queries.AskIfUnbalanced(u"SELECT '1 FROM T"_s));
    ASSERT_EQ(prompt.questions.size(), 2);
    EXPECT_TRUE(prompt.questions[0].startsWith(u"Syntax Error:\r\nMake sure"_s));
    EXPECT_TRUE(prompt.questions[0].endsWith(u"mark.\r\nContinue ?"_s));
}

TEST_F(Queries, HoldTheVisibleColumnsAlone)
{
    Run(u"CREATE TABLE Towns ([Name] Varchar(10),[Unit Price] Float)"_s);
    Run(u"INSERT INTO Towns (Name,[Unit Price]) VALUES('P1',2)"_s);
    const struct {
        QString statement;
        QList<int> hidden;
        QString saved;
    } rows[] = {
        {u"SELECT * FROM Towns"_s, {}, u"SELECT * FROM Towns"_s},
        {u"SELECT * FROM Towns WHERE Name='FROM' ORDER BY Name"_s,
         {0},
         u"SELECT [Unit Price] FROM Towns WHERE Name='FROM' ORDER BY Name"_s},
        {u"SELECT Name,Age,Born FROM People"_s, {1}, u"SELECT Name,Born FROM People"_s},
        {u"SELECT Name AS Who, Age, LEFT(Name,1) AS First FROM People ORDER BY Who"_s,
         {1},
         u"SELECT Name AS Who,LEFT(Name,1) AS First FROM People ORDER BY Who"_s},
        {u"SELECT Member, COUNT(*) AS N, MAX(Age) FROM People GROUP BY Member"_s,
         {0},
         u"SELECT COUNT(*) AS N,MAX(Age) FROM People GROUP BY Member"_s},
        {u"SELECT DISTINCT Member,Age FROM People"_s, {1}, u"SELECT DISTINCT Member FROM People"_s},
        {u"SELECT *, Age+1 AS Next FROM People"_s, {0}, u"SELECT *, Age+1 AS Next FROM People"_s},
        {u"SELECT People.Name,Towns.Name,[Unit Price] FROM People INNER JOIN Towns ON People.Name=Towns.Name"_s,
         {0},
         u"SELECT Towns.Name,Towns.[Unit Price] FROM People INNER JOIN Towns ON People.Name=Towns.Name"_s},
    };
    for (const auto& row : rows) {
        RecordBrowser browser(connection, path, prompt, {});
        browser.SetRowsPerPage(5);
        ASSERT_TRUE(browser.Open(row.statement)) << prompt.shown.join(u'\n').toStdString();
        for (const int field : row.hidden) {
            if (browser.IsEmpty())
                break;
            EXPECT_TRUE(browser.SelectCell(0, browser.Page().ColumnOfField(field)));
            EXPECT_TRUE(browser.HideColumn());
        }
        if (browser.IsEmpty())
            continue;
        EXPECT_EQ(ShownStatement(browser), row.saved);
        RecordBrowser again(connection, path, prompt, {});
        EXPECT_TRUE(again.Open(ShownStatement(browser))) << prompt.shown.join(u'\n').toStdString();
    }
}

TEST_F(Queries, ThatFailLeaveTheViewAsItWas)
{
    RecordBrowser browser(connection, path, prompt, {});
    EXPECT_TRUE(browser.Open(u"SELECT * FROM People"_s));
    EXPECT_TRUE(browser.AddCondition(u"Age>30"_s));
    const QString before = browser.CounterText();
    EXPECT_FALSE(browser.OpenInstead(u"SELECT * FROM Gone"_s));
    EXPECT_EQ(browser.CounterText(), before);
    EXPECT_EQ(browser.Conditions(), QStringList(u"Age>30"_s));
    EXPECT_TRUE(browser.OpenInstead(u"SELECT Name FROM People"_s));
    EXPECT_FALSE(browser.IsFiltered());
    EXPECT_TRUE(browser.RemoveFilter());
    EXPECT_EQ(browser.FieldCount(), 1) << "the new one is the base now";
}

TEST_F(Queries, AreShownBeforeTheyChangeAnything)
{
    EXPECT_TRUE(queries.AskIfItChanges(u"Old ones"_s, u"SELECT * FROM People"_s));
    EXPECT_EQ(prompt.questions, QStringList());
    const QString wipe = u"DELETE FROM People WHERE Name='"_s + QString(1000, u'x') + u'\'';
    EXPECT_FALSE(queries.AskIfItChanges(u"Wipe"_s, wipe));
    ASSERT_EQ(prompt.questions.size(), 1);
    EXPECT_TRUE(prompt.questions[0].contains(u"\"Wipe\""_s));
    EXPECT_TRUE(prompt.questions[0].contains(wipe.first(300)));
    EXPECT_LT(prompt.questions[0].size(), 600) << "it has to fit a small window";
    prompt.answers = {true};
    EXPECT_TRUE(queries.AskIfItChanges(u"Wipe"_s, wipe));
}

} // namespace
} // namespace mirel
