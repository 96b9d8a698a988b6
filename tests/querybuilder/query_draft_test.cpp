#include "querybuilder/query_draft.h"

#include "forms/form_store.h"
#include "platform/profile.h"
#include "querybuilder/statement_history.h"
#include "resources/string_table.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"

#include <gtest/gtest.h>

#include <QFile>
#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class DraftTest : public ::testing::Test {
protected:
    void Store(const QString& name, const QString& statement)
    {
        ASSERT_TRUE(store.Apply([&](FormStore& now) {
            QueryDef query;
            query.SetName(name);
            query.SetTableName(u"T"_s);
            query.SetText(statement);
            now.RemoveQuery(name);
            now.AddQuery(query);
            return true;
        }));
    }
    QueryDraft Edit(const QString& name)
    {
        return QueryDraft({.name = name, .statement = Stored(name), .table = u"T"_s}, prompt);
    }
    QString Stored(const QString& name)
    {
        FormStore fresh(store.Path());
        EXPECT_TRUE(fresh.Load() || !QFile::exists(store.Path()));
        const QueryDef* query = fresh.FindQuery(name);
        return query ? query->tableName.Text() + u':' + query->text.Text() : u"none"_s;
    }

    QTemporaryDir folder;
    FormStore store{folder.filePath(u"q.raf"_s)};
    ScriptedPrompt prompt;
};
using QueryDraftSave = DraftTest;
using QueryDraftForms = DraftTest;

TEST_F(QueryDraftSave, NeedsANameAndCutsIt)
{
    QueryDraft draft({.statement = u"SELECT 1"_s, .table = QString(40, u't')}, prompt);
    draft.SetName(u"  "_s);
    EXPECT_EQ(draft.Save(store), QueryDraft::Saved::NameMissing);
    draft.SetName(QString(50, u'n'));
    EXPECT_TRUE(draft.IsChanged());
    EXPECT_EQ(draft.Save(store), QueryDraft::Saved::Yes);
    EXPECT_EQ(Stored(QString(40, u'n')), QString(31, u't') + u":SELECT 1"_s);
    EXPECT_FALSE(draft.IsChanged());
    EXPECT_TRUE(prompt.questions.isEmpty());
}

TEST_F(QueryDraftSave, AsksAboutBracketsThatAreNotClosed)
{
    QueryDraft draft({.name = {}, .statement = u"SELECT (a"_s}, prompt);
    draft.SetName(u"Q"_s);
    prompt.answers = {false, true};
    EXPECT_EQ(draft.Save(store), QueryDraft::Saved::No);
    EXPECT_EQ(Stored(u"Q"_s), u"none");
    EXPECT_EQ(draft.Save(store), QueryDraft::Saved::Yes);
    EXPECT_EQ(Stored(u"Q"_s), u":SELECT (a");
    ASSERT_EQ(prompt.questions.size(), 2);
    EXPECT_TRUE(prompt.questions[0].startsWith(u"Syntax Error:\r\n"_s));
    EXPECT_TRUE(prompt.questions[0].endsWith(u"\r\nContinue ?"_s));
}

TEST_F(QueryDraftSave, UpdatesTheEditedQueryWithoutAQuestion)
{
    Store(u"Q"_s, u"SELECT 1"_s);
    QueryDraft draft({.name = u"Q"_s, .statement = u"SELECT 1"_s, .table = u"U"_s}, prompt);
    draft.SetText(u"SELECT 2"_s);
    EXPECT_EQ(draft.Save(store), QueryDraft::Saved::Yes);
    draft.SetText(u"SELECT 3"_s);
    EXPECT_EQ(draft.Save(store), QueryDraft::Saved::Yes);
    EXPECT_EQ(Stored(u"Q"_s), u"U:SELECT 3");
    EXPECT_TRUE(prompt.questions.isEmpty());
}

TEST_F(QueryDraftSave, MakesANewQueryOfANewNameAndKeepsTheOld)
{
    Store(u"Q"_s, u"SELECT 1"_s);
    QueryDraft draft({.name = u"Q"_s, .statement = u"SELECT 1"_s, .table = u"T"_s}, prompt);
    draft.SetName(u"R"_s);
    draft.SetText(u"SELECT 2"_s);
    EXPECT_EQ(draft.Save(store), QueryDraft::Saved::Yes);
    EXPECT_EQ(Stored(u"Q"_s), u"T:SELECT 1");
    EXPECT_EQ(Stored(u"R"_s), u"T:SELECT 2");
}

TEST_F(QueryDraftSave, AsksBeforeItReplacesAnother)
{
    Store(u"Q"_s, u"SELECT 1"_s);
    Store(u"Other"_s, u"SELECT 9"_s);
    QueryDraft draft({.name = u"Q"_s, .statement = u"SELECT 1"_s, .table = u"T"_s}, prompt);
    draft.SetName(u"Other"_s);
    prompt.answers = {false, true};
    EXPECT_EQ(draft.Save(store), QueryDraft::Saved::No);
    EXPECT_EQ(Stored(u"Other"_s), u"T:SELECT 9");
    EXPECT_EQ(draft.Save(store), QueryDraft::Saved::Yes);
    EXPECT_EQ(Stored(u"Other"_s), u"T:SELECT 1");
    EXPECT_EQ(prompt.questions.last(), u"Query \"Other\" exists:\r\nDo you want to replace the existing query?");
}

TEST_F(QueryDraftSave, AsksWhenAnotherProgramHasChangedTheEditedQuery)
{
    Store(u"Q"_s, u"SELECT 1"_s);
    QueryDraft draft({.name = u"Q"_s, .statement = u"SELECT 1"_s, .table = u"T"_s}, prompt);
    FormStore elsewhere(store.Path());
    ASSERT_TRUE(elsewhere.Apply([](FormStore& now) {
        now.FindQuery(u"Q"_s)->SetText(u"SELECT 7"_s);
        return true;
    }));
    draft.SetText(u"SELECT 2"_s);
    EXPECT_EQ(draft.Save(store), QueryDraft::Saved::No);
    EXPECT_EQ(Stored(u"Q"_s), u"T:SELECT 7");
    EXPECT_EQ(prompt.questions.size(), 1);
}

TEST_F(QueryDraftSave, TellsOfAStoreThatCannotBeWritten)
{
    FormStore nowhere;
    QueryDraft draft({.name = u"Q"_s, .statement = u"SELECT 1"_s}, prompt);
    EXPECT_EQ(draft.Save(nowhere), QueryDraft::Saved::No);
    FormStore gone(folder.filePath(u"no/such/folder/q.raf"_s));
    EXPECT_EQ(draft.Save(gone), QueryDraft::Saved::No);
    EXPECT_EQ(prompt.shown.size(), 2);
    EXPECT_EQ(draft.Statement(), u"SELECT 1");
}

TEST_F(QueryDraftForms, ConvertWhenTheOtherComesToTheFront)
{
    QueryDraft draft({.statement = u"select * from T where a"_s}, prompt);
    EXPECT_FALSE(draft.IsChanged());
    EXPECT_FALSE(draft.ShowClauses());
    EXPECT_EQ(draft.Clauses().from, u"T");
    EXPECT_FALSE(draft.IsChanged()); // the same words; keywords in capitals are no change
    QueryClauses clauses = draft.Clauses();
    clauses.order = u"b"_s;
    draft.SetClauses(clauses);
    EXPECT_EQ(draft.Statement(), u"SELECT * FROM T WHERE a ORDER BY b");
    EXPECT_TRUE(draft.IsChanged());
    draft.ShowText();
    EXPECT_EQ(draft.Text(), u"SELECT * FROM T WHERE a ORDER BY b");
}

TEST_F(QueryDraftForms, KeepTheStatementThatCannotBeSplit)
{
    const QString statement = u"SELECT a FROM T\nGROUP BY a"_s;
    QueryDraft draft({.statement = statement}, prompt);
    EXPECT_TRUE(draft.ShowClauses());
    EXPECT_EQ(draft.Statement(), statement);
    draft.ShowText();
    EXPECT_EQ(draft.Text(), statement);
}

TEST_F(QueryDraftForms, NeitherShowNorLoseAFixedSelectClause)
{
    QueryDraft draft({.nameUse = QueryRequest::Name::None,
                      .statement = u"SELECT * WHERE a=1"_s,
                      .selectClause = u"SELECT * "_s},
                     prompt);
    EXPECT_EQ(draft.Text(), u"WHERE a=1");
    EXPECT_FALSE(draft.ShowClauses());
    EXPECT_EQ(draft.Clauses(), (QueryClauses{.where = u"a=1"_s}));
    draft.SetClauses({.where = u"a=2"_s, .order = u"b"_s});
    EXPECT_EQ(draft.Statement(), u"SELECT * WHERE a=2 ORDER BY b");
    draft.ShowText();
    EXPECT_EQ(draft.Text(), u"WHERE a=2 ORDER BY b");
    draft.SetText({});
    EXPECT_EQ(draft.Statement(), u"SELECT *");
}

TEST(StatementHistory, KeepsTheLatestFirstAndEachOnce)
{
    const QTemporaryDir folder;
    Profile profile(folder.filePath(u"p.ini"_s));
    StatementHistory history(profile, u"db"_s);
    history.Add(u"SELECT\t'ä%',\n2"_s);
    history.Add(u"SELECT 1"_s);
    history.Add(u"SELECT\t'ä%',\n2"_s);
    history.Add(u" "_s);
    history.Add(QString(5000, u'x'));
    EXPECT_EQ(StatementHistory(profile, u"db"_s).Statements(),
              (QStringList{u"SELECT\t'ä%',\n2"_s, u"SELECT 1"_s}));
    EXPECT_TRUE(StatementHistory(profile, u"other"_s).Statements().isEmpty());
    for (int i = 0; i < 30; ++i)
        history.Add(QString::number(i));
    EXPECT_EQ(history.Statements().size(), StatementHistory::kMost);
    EXPECT_EQ(history.Statements().first(), u"29");
}

} // namespace
} // namespace mirel
