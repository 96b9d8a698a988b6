#include "forms/record_context.h"

#include "expr/expr_parser.h"
#include "forms/form_context.h"
#include "support/sqlite_file.h"
#include "support/test_database.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class RecordContextTest : public TestDatabase {
protected:
    RecordContextTest()
    {
        Run(u"CREATE TABLE [Birds] ([ID] INTEGER, [Bird Name] VARCHAR(40), [Seen] BIT)"_s);
        Run(u"CREATE TABLE [Places] ([ID] INTEGER, [Bird] INTEGER, [name] VARCHAR(40))"_s);
        Run(u"INSERT INTO [Birds] ([ID], [Bird Name], [Seen]) VALUES (1, 'Osprey', 1)"_s);
        Run(u"INSERT INTO [Birds] ([ID], [Bird Name], [Seen]) VALUES (2, 'Gull', 0)"_s);
        Run(u"INSERT INTO [Places] ([ID], [Bird], [name]) VALUES (7, 1, 'Loch')"_s);
    }

    QString Shown(QStringView text)
    {
        const ExprTree tree = ParseExpression(text, ExprMode::Value);
        EvaluateExpression(context, *tree);
        return ShownText(*tree);
    }

    DbRecordset records{connection_};
    RecordContext context{records, {u"ja"_s, u"nein"_s}, {}};
};

TEST_F(RecordContextTest, FindsColumnsByEveryWayToWriteThem)
{
    ASSERT_TRUE(Open(records, u"SELECT Birds.ID, Birds.[Bird Name], Places.ID, Places.[name] FROM [Birds] "
                              "INNER JOIN [Places] ON Birds.ID = Places.Bird"_s));
    context.ResultChanged();
    const struct {
        const char16_t* name;
        const char16_t* shown;
    } rows[] = {{u"[Bird Name]", u"Osprey"}, {u"Birds.[Bird Name]", u"Osprey"},
                {u"BirdName", u"Osprey"},    {u"[birds].[bird name]", u"Osprey"},
                {u"name", u"Loch"},          {u"[NAME]", u"Loch"},
                {u"Places.ID", u"7"},        {u"[Places].[ID]", u"7"},
                {u"Birds.ID", u"1"},         {u"Other.Name", u"Loch"},
                {u"[Nobody]", u""},          {u"[]", u""}};
    for (const auto& row : rows)
        EXPECT_EQ(Shown(row.name), QString::fromUtf16(row.shown)) << QString::fromUtf16(row.name).toStdString();
}

TEST_F(RecordContextTest, FindsNamesThatHoldBrackets)
{
    SqliteFile(path_).Run("CREATE TABLE Odd (\"a]b\" INTEGER, \"[c\" INTEGER, \"d].[e\" INTEGER);"
                          "INSERT INTO Odd VALUES (1, 2, 3)");
    ASSERT_TRUE(Open(records, u"SELECT * FROM Odd"_s));
    context.ResultChanged();
    EXPECT_EQ(Shown(u"[a]]b]"), u"1"_s);
    EXPECT_EQ(Shown(u"Odd.[a]]b]+[[c]"), u"3"_s);
    EXPECT_EQ(Shown(u"[d]].[e]"), u"3"_s);
}

TEST_F(RecordContextTest, FollowsTheCurrentRecord)
{
    ASSERT_TRUE(Open(records, u"SELECT * FROM [Birds]"_s));
    context.ResultChanged();
    const ExprTree tree =
        ParseExpression(u"RECNO()+'/'+RECCOUNT()+' '+[Bird Name]+[Bird Name]+' '+[Seen]", ExprMode::Value);
    const auto shown = [&] {
        EvaluateExpression(context, *tree);
        return ShownText(*tree);
    };
    EXPECT_EQ(shown(), u"1/2 OspreyOsprey ja"_s);
    ASSERT_TRUE(records.MoveNext());
    EXPECT_EQ(shown(), u"2/2 GullGull nein"_s);
    ASSERT_TRUE(records.Update(1, Value::Text(u"Tern"_s)));
    EXPECT_EQ(shown(), u"2/2 TernTern nein"_s);
    ASSERT_TRUE(records.MoveNext());
    EXPECT_EQ(shown(), QString()); // behind the last record
    ASSERT_TRUE(Open(records, u"SELECT [Seen], [Bird Name] FROM [Birds]"_s));
    context.ResultChanged();
    EXPECT_EQ(shown(), u"1/2 OspreyOsprey ja"_s);
}

TEST_F(RecordContextTest, KnowsNoNameWhileClosed)
{
    EXPECT_EQ(Shown(u"'<'+[Bird Name]+'>'"), u"<>"_s);
    EXPECT_EQ(Shown(u"RECCOUNT()"), QString());
}

// A walk lends cells where the current record has values: expressions must not see a difference.
TEST_F(RecordContextTest, GivesAWalkTheValuesOfTheCurrentRecord)
{
    Run(u"CREATE TABLE [All] ([I] INTEGER, [D] FLOAT, [T] VARCHAR(40), [M] TEXT, [Y] BIT, [S] DATETIME, "
        "[B] VARBINARY)"_s);
    Run(u"INSERT INTO [All] ([I],[D],[T],[M],[Y],[S]) VALUES (7, 2.5, 'Gull', 'é€😀', 1, "
        "'2001-07-04 09:05:00')"_s);
    Run(u"INSERT INTO [All] ([I]) VALUES (NULL)"_s);
    // As another program fills columns, whatever their types.
    SqliteFile(path_).Run("INSERT INTO [All] VALUES (3000000000, 3, x'41FF', 12, 'perhaps', 'next Tuesday', "
                          "x'00'), ('seven', 'x', 5, '', 0, 37076.5, 4)");

    FormContext current(records, {u"ja"_s, u"nein"_s}, {}, [] { return QDateTime(); });
    for (const QString& statement : {u"SELECT * FROM [All]"_s, u"SELECT I+1 AS I, D*2 AS D, UPPER(T) AS T, M, Y, "
                                                               "S, B FROM [All]"_s}) {
        ASSERT_TRUE(Open(records, statement));
        current.ResultChanged();
        for (const QString& text : {u"[I]"_s, u"[D]/2"_s, u"[T]"_s, u"UPPER([T])+'/'+[M]"_s, u"[Y]"_s, u"[S]"_s,
                                    u"[S]+1"_s, u"[B]"_s, u"RECNO()+[T]+[Nobody]"_s, u"TO_CHAR([I])"_s}) {
            const ExprTree tree = ParseExpression(text, ExprMode::Value);
            QStringList walked;
            RowContext rows(current, 0);
            rows.Collect(*tree);
            ASSERT_TRUE(records.Read({.fields = rows.Columns().empty() ? std::vector{0} : rows.Columns()},
                                     [&](std::span<const Cell> cells) {
                                         rows.Lend(walked.size(), cells);
                                         EvaluateExpression(rows, *tree);
                                         walked += (tree->null ? u"null "_s : u""_s) + ShownText(*tree);
                                         return true;
                                     }));
            QStringList moved;
            for (bool more = records.MoveFirst(); more && !records.IsEof(); more = records.MoveNext()) {
                EvaluateExpression(current, *tree);
                moved += (tree->null ? u"null "_s : u""_s) + ShownText(*tree);
            }
            EXPECT_EQ(moved.size(), 4);
            EXPECT_EQ(walked, moved) << text.toStdString();
        }
    }
}

} // namespace
} // namespace mirel
