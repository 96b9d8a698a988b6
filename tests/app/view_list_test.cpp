#include "app/view_list.h"

#include "app/entry_summary.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TEST(ViewListText, ComesBackAsItWas)
{
    const QString longName(255, u'ä');
    const ViewList rows[] = {
        {},
        {{{EntryKind::Table, u"Order Details"_s}}, 0},
        {{{EntryKind::Form, u"a:b 100%"_s}, {EntryKind::Query, longName}, {EntryKind::Table, u"two\nlines"_s}}, 2},
        {{{EntryKind::Table, u"T"_s}, {EntryKind::Form, u"T"_s}}, -1},
    };
    for (const ViewList& row : rows) {
        const QString text = ViewListText(row);
        EXPECT_FALSE(text.contains(u'\n')) << "it is one line of the profile";
        EXPECT_TRUE(ReadViewList(text) == row) << text.toStdString();
    }
}

TEST(ViewListText, LeavesOutWhatDoesNotRead)
{
    struct Row {
        QString text;
        size_t views;
        int front;
    };
    const Row rows[] = {
        {u""_s, 0, -1},
        {u"x table%3AT"_s, 0, -1},
        {u"0"_s, 0, -1},
        {u"7 table%3AT"_s, 1, -1},
        {u"1 chair%3AT table%3AT"_s, 1, 0},
        {u"0 table%3A table%3AT table%3AT"_s, 1, -1},
    };
    for (const Row& row : rows) {
        const ViewList views = ReadViewList(row.text);
        EXPECT_EQ(views.views.size(), row.views) << row.text.toStdString();
        EXPECT_EQ(views.front, row.front) << row.text.toStdString();
    }
    QString many = u"3"_s;
    for (int i = 0; i < 100'000; ++i)
        many += u" table%3AT"_s + QString::number(i);
    EXPECT_LT(ReadViewList(many).views.size(), 1000U);
}

TEST(ViewList, AreHarmlessWhenTheirTableIsGone)
{
    MainViewState state;
    state.Show({.path = u"/a.cdb"_s,
                .tables = {{EntryKind::Table, u"T"_s, {}, false}, {EntryKind::Table, u"U"_s, {}, false}},
                .forms = {},
                .queries = {},
                .favorites = {}});
    const ViewList before{{{EntryKind::Table, u"Gone"_s}, {EntryKind::Form, u"T"_s}, {EntryKind::Table, u"U"_s}},
                          2};
    const ViewList left{{{EntryKind::Table, u"U"_s}}, 0};
    EXPECT_TRUE(StillThere(before, state) == left);
    EXPECT_EQ(StillThere({before.views, 0}, state).front, -1);
}

class EntrySummaryTest : public ::testing::Test {
protected:
    EntrySummaryTest()
    {
        EXPECT_TRUE(session.Create(QDir(folder.path()).filePath(u"a.cdb"_s)));
        Run(u"CREATE TABLE T (A SmallInt,B Varchar(9))"_s);
        for (int i = 0; i < 3; ++i)
            Run(u"INSERT INTO T (A) VALUES (1)"_s);
    }
    void Run(const QString& statement)
    {
        EXPECT_TRUE(session.GetCatalog().ExecuteStatement(session.Location(), statement));
    }
    QString CountedLine(const QString& table)
    {
        summary.LookAt(MainEntry{EntryKind::Table, table, {}, false});
        for (int i = 0; summary.IsCounting() && i < 10'000; ++i)
            summary.CountOn(1);
        EXPECT_FALSE(summary.IsCounting());
        return summary.Lines().value(0);
    }

    QTemporaryDir folder;
    ScriptedPrompt prompt;
    DbConnection connection;
    DatabaseSession session{connection, ProgramFolder{folder.path()}, prompt};
    EntrySummary summary{session};
};

TEST_F(EntrySummaryTest, TellsFieldsAndRecordsOfATable)
{
    EXPECT_EQ(CountedLine(u"T"_s), u"2 fields · 3 records"_s);
    Run(u"DELETE FROM T"_s);
    Run(u"INSERT INTO T (A) VALUES (1)"_s);
    EXPECT_EQ(CountedLine(u"T"_s), u"2 fields · 1 record"_s);
    EXPECT_EQ(summary.Lines().size(), 3) << "the file's size, and when it changed";
    EXPECT_TRUE(summary.Lines()[1].startsWith(u"a.cdb"_s));
}

TEST_F(EntrySummaryTest, SaysNothingOfATableThatIsGoneAndLetsATableGo)
{
    EXPECT_EQ(CountedLine(u"Gone"_s), QString());
    summary.LookAt(MainEntry{EntryKind::Table, u"T"_s, {}, false});
    summary.StopCounting();
    Run(u"DROP TABLE T"_s);
    EXPECT_EQ(CountedLine(u"T"_s), QString());
    EXPECT_EQ(prompt.shown, QStringList());
}

} // namespace
} // namespace mirel
