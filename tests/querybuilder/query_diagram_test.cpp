#include "querybuilder/query_diagram.h"

#include "querybuilder/completion.h"
#include "querybuilder/first_records.h"
#include "querybuilder/statement_marks.h"
#include "tableview/field_lists.h"
#include "tableview/people_fixture.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class DiagramTest : public PeopleFixture {
protected:
    DiagramTest()
    {
        Run(u"CREATE TABLE Customers ([CustomerID] Integer,[Name] Varchar(20),[City] Varchar(20))"_s);
        Run(u"CREATE TABLE [My Orders] ([OrderNo] Integer,[Name] Varchar(20),[CustomerID] Integer,[Qty] Integer)"_s);
        Run(u"CREATE TABLE Other ([CustomerID] Varchar(5),[Photo] Long Varbinary)"_s);
        for (const QString& values : {u"1,'Ann','Oslo'"_s, u"2,'Bob','Cork'"_s})
            Run(u"INSERT INTO Customers VALUES(%1)"_s.arg(values));
        for (const QString& values : {u"1,'x',1,6"_s, u"2,'y',1,7"_s, u"3,'z',2,1"_s})
            Run(u"INSERT INTO [My Orders] VALUES(%1)"_s.arg(values));
    }
    FieldLists lists{connection, path, prompt};
};
using Diagram = DiagramTest;
using QueryTools = DiagramTest;

TEST_F(Diagram, WritesAJoinWithConditionOrderAndTotal)
{
    QueryDiagram diagram;
    EXPECT_EQ(diagram.Statement(), QString());
    diagram.AddTable(u"Customers"_s, lists);
    EXPECT_EQ(diagram.Statement(), u"SELECT * FROM Customers");
    diagram.AddTable(u"My Orders"_s, lists);
    diagram.Show(u"Customers"_s, u"City"_s, true);
    diagram.Show(u"My Orders"_s, u"Qty"_s, true);
    DiagramColumn city = diagram.Columns()[0];
    city.sort = ColumnOrder::Descending;
    diagram.SetColumn(0, city);
    DiagramColumn total = diagram.Columns()[1];
    total.total = Total::Sum;
    diagram.SetColumn(1, total);
    diagram.SetColumn(2, {.expression = u"[My Orders].Qty"_s, .shown = false, .condition = u"> 5"_s});
    const QString statement =
        u"SELECT Customers.City, SUM([My Orders].Qty) FROM Customers INNER JOIN [My Orders] ON "
        u"Customers.CustomerID = [My Orders].CustomerID WHERE [My Orders].Qty > 5 GROUP BY "
        u"Customers.City ORDER BY Customers.City DESC"_s;
    EXPECT_EQ(diagram.Statement(), statement);
    const FirstRecords first = ReadFirstRecords(connection, path, statement, 10, 5000);
    EXPECT_EQ(first.rows, (std::vector<QStringList>{{u"Oslo"_s, u"13"_s}})) << first.error.toStdString();

    diagram.Show(u"My Orders"_s, u"Qty"_s, false);
    EXPECT_FALSE(diagram.Shows(u"My Orders"_s, u"Qty"_s));
    diagram.RemoveTable(u"my orders"_s);
    EXPECT_EQ(diagram.Statement(), u"SELECT Customers.City FROM Customers ORDER BY Customers.City DESC");
}

TEST_F(Diagram, ProposesJoinsByNameAndType)
{
    const DiagramTable customers{u"Customers"_s, {}};
    const std::optional<DiagramJoin> join = ProposedJoin(customers, {u"My Orders"_s, u"o"_s}, lists);
    ASSERT_TRUE(join);
    EXPECT_EQ(*join, (DiagramJoin{u"Customers"_s, u"CustomerID"_s, u"o"_s, u"CustomerID"_s}));
    EXPECT_FALSE(ProposedJoin(customers, {u"Other"_s, {}}, lists)) << "of another type";
    QueryDiagram diagram;
    diagram.AddTable(u"Customers"_s, lists);
    diagram.AddTable(u"Other"_s, lists);
    diagram.AddTable(u"Customers"_s, lists);
    EXPECT_EQ(diagram.Statement(),
              u"SELECT * FROM Customers INNER JOIN Customers Customers2 ON Customers.CustomerID = "
              u"Customers2.CustomerID, Other");
}

TEST_F(Diagram, TakesWhatAPersonTypesAsACondition)
{
    for (const auto& [typed, written] : std::initializer_list<std::pair<QString, QString>>{
             {u"> 5"_s, u"A > 5"_s},
             {u"5"_s, u"A = 5"_s},
             {u"-5"_s, u"A = -5"_s},
             {u"'x'"_s, u"A = 'x'"_s},
             {u"Oslo"_s, u"A = 'Oslo'"_s},
             {u"7/4/2001"_s, u"A = '7/4/2001'"_s},
             {u"New York"_s, u"A = 'New York'"_s},
             {u"null"_s, u"A IS NULL"_s},
             {u"true"_s, u"A = true"_s},
             {u"is not null"_s, u"A is not null"_s},
             {u"BETWEEN 1 AND 5"_s, u"A BETWEEN 1 AND 5"_s},
             {u">1 AND <5"_s, u"A >1 AND A <5"_s},
             {u"1 OR 2"_s, u"(A = 1 OR A = 2)"_s},
             {u"T.B"_s, u"A = T.B"_s},
             {u"[B]"_s, u"A = [B]"_s},
         }) {
        QueryDiagram diagram;
        diagram.AddTable(u"T"_s, lists);
        diagram.SetColumn(0, {.expression = u"A"_s, .shown = false, .condition = typed});
        EXPECT_EQ(diagram.Statement(), u"SELECT * FROM T WHERE "_s + written);
    }
}

TEST(DiagramRead, GivesBackWhatItWrote)
{
    for (
        const QString& statement : {
            u"SELECT * FROM T"_s,
            u"SELECT *, T.A FROM T"_s,
            u"SELECT T.* FROM T"_s,
            u"SELECT DISTINCT T.A FROM T ORDER BY T.B, T.A DESC"_s,
            u"SELECT A AS First, UPPER(B), COUNT(*) AS N FROM T WHERE C = 'x,y' GROUP BY A, UPPER(B) HAVING COUNT(*) > 2 ORDER BY COUNT(*)"_s,
            u"SELECT a.X FROM T a INNER JOIN U b ON a.K = b.K AND a.L = b.L, V WHERE a.X BETWEEN 1 AND 2 AND a.X < 9"_s,
            u"SELECT a.X FROM T a LEFT JOIN U b ON a.K = b.K LEFT JOIN V ON b.M = V.M"_s,
            u"SELECT A FROM T WHERE A IS NOT NULL AND (B = 1 OR C = 2)"_s,
            u"SELECT A FROM T WHERE B = 1 OR C = 2"_s,
            u"SELECT A FROM T GROUP BY A, B"_s,
            u"SELECT A, SUM(B) AS S FROM T GROUP BY A ORDER BY S DESC"_s,
        }) {
        const std::optional<QueryDiagram> diagram = QueryDiagram::Read(statement);
        ASSERT_TRUE(diagram) << statement.toStdString();
        EXPECT_EQ(diagram->Statement(), statement);
        EXPECT_EQ(QueryDiagram::Read(diagram->Statement()), diagram) << statement.toStdString();
    }
}

TEST(DiagramRead, RefusesWhatItCannotDraw)
{
    for (const QString& statement : {
             u""_s, u"T"_s, u"UPDATE T SET A = 1"_s, u"SELECT 1"_s, u"SELECT A FROM T WHERE"_s,
             u"SELECT A FROM T INNER JOIN U ON T.K > U.K"_s, u"SELECT A FROM T INNER JOIN U ON T.K = 5"_s,
             u"SELECT A FROM T INNER JOIN U ON K = L"_s,
             u"SELECT A, SUM(B) FROM T GROUP BY A HAVING SUM(B) > 1 OR SUM(B) < 0"_s,
             u"SELECT A FROM T, U INNER JOIN V ON T.K = V.K"_s, // would come out in another order
         })
        EXPECT_FALSE(QueryDiagram::Read(statement)) << statement.toStdString();
}

TEST_F(QueryTools, MarkWordsAcrossLines)
{
    QChar open;
    EXPECT_EQ(MarksOfLine(u"SELECT SUM(a), 'x"_s, open),
              (std::vector<StatementMark>{
                  {MarkKind::Keyword, 0, 6}, {MarkKind::Function, 7, 3}, {MarkKind::Text, 15, 2}}));
    EXPECT_EQ(open, QChar(u'\''));
    EXPECT_EQ(MarksOfLine(u"it''s FROM"_s, open), (std::vector<StatementMark>{{MarkKind::Text, 0, 10}}));
    EXPECT_EQ(
        MarksOfLine(u"y' FROM 12"_s, open),
        (std::vector<StatementMark>{{MarkKind::Text, 0, 2}, {MarkKind::Keyword, 3, 4}, {MarkKind::Number, 8, 2}}));
    EXPECT_TRUE(open.isNull());
}

TEST_F(QueryTools, FindThePlaceOfAFault)
{
    struct Row {
        QString statement;
        StatementPlace place;
    };
    for (const Row& row : {Row{u"SELECT Name FRM People"_s, {16, 6}}, Row{u"SELECT Name FROM"_s, {16, 0}},
                           Row{u"SELECT Nme FROM People"_s, {7, 3}}, Row{u"SELECT Name FROM [Peple]"_s, {17, 7}},
                           Row{u"SELECT P.Nme FROM People P"_s, {9, 3}}}) {
        DbRecordset records(connection);
        EXPECT_FALSE(records.OpenSource(row.statement, path, CursorType::ForwardOnly, LockType::ReadOnly));
        const std::optional<StatementPlace> place = FaultPlace(row.statement, records.ErrorContext(), lists);
        ASSERT_TRUE(place) << row.statement.toStdString() << ": " << records.ErrorContext().toStdString();
        EXPECT_EQ(place->begin, row.place.begin) << row.statement.toStdString();
        EXPECT_EQ(place->length, row.place.length) << row.statement.toStdString();
    }
}

TEST_F(QueryTools, CompleteNamesWhereTheyCanStand)
{
    struct Row {
        const char* what;
        QString before; // the caret
        QString behind;
        QStringList first; // of the words
        qsizetype begin;
    };
    for (const Row& row : {
             Row{"fields of the statement's tables first",
                 u"SELECT C"_s,
                 u" FROM Customers"_s,
                 {u"CustomerID"_s, u"City"_s, u"Customers"_s},
                 7},
             Row{"behind a point only fields",
                 u"SELECT o."_s,
                 u" FROM [My Orders] o"_s,
                 {u"OrderNo"_s, u"Name"_s, u"CustomerID"_s, u"Qty"_s},
                 9},
             Row{"a bracket begins names", u"SELECT * FROM [my"_s, u""_s, {u"[My Orders]"_s}, 14},
             Row{"functions", u"SELECT av"_s, u""_s, {u"AVG("_s}, 7},
             Row{"not inside a text", u"SELECT * FROM Customers WHERE Name = 'C"_s, u""_s, {}, 0},
             Row{"not where nothing was typed", u"SELECT "_s, u" FROM Customers"_s, {}, 0},
             Row{"not what is typed whole", u"SELECT City"_s, u" FROM Customers"_s, {}, 7},
         }) {
        const Completion found = CompletionAt(row.before, row.before + row.behind, lists);
        EXPECT_EQ(found.words.first(std::min(found.words.size(), row.first.size())), row.first) << row.what;
        EXPECT_EQ(found.words.isEmpty(), row.first.isEmpty()) << row.what;
        if (!row.first.isEmpty())
            EXPECT_EQ(found.begin, row.begin) << row.what;
    }
}

TEST_F(QueryTools, TakeWordsIntoClauses)
{
    struct Row {
        ClauseKind kind;
        QString before;
        QString inserted;
    };
    for (const Row& row : {
             Row{ClauseKind::List, u""_s, u"w"_s},
             Row{ClauseKind::List, u"a"_s, u", w"_s},
             Row{ClauseKind::List, u"a, "_s, u"w"_s},
             Row{ClauseKind::List, u"SUM("_s, u"w"_s},
             Row{ClauseKind::List, u"a DESC"_s, u", w"_s},
             Row{ClauseKind::Condition, u"a = 5"_s, u" AND w"_s},
             Row{ClauseKind::Condition, u"a = 5 "_s, u"AND w"_s},
             Row{ClauseKind::Condition, u"a = 5 OR"_s, u" w"_s},
             Row{ClauseKind::Condition, u"a ="_s, u" w"_s},
             Row{ClauseKind::Plain, u"SELECT"_s, u" w"_s},
             Row{ClauseKind::Plain, u"T."_s, u"w"_s},
         })
        EXPECT_EQ(ClauseInsertion(row.kind, row.before, u"w"_s), row.inserted) << row.before.toStdString();
}

TEST_F(QueryTools, ReadTheFirstRecordsOrSayWhyNot)
{
    const FirstRecords few = ReadFirstRecords(connection, path, u"SELECT Name, Age FROM People"_s, 3, 5000);
    EXPECT_EQ(few.rows.size(), 3U);
    EXPECT_TRUE(few.columns[1].rightAligned);
    EXPECT_FALSE(ReadFirstRecords(connection, path, u"DELETE FROM People"_s, 3, 5000).error.isEmpty());
    EXPECT_EQ(Stored(u"SELECT COUNT(*) FROM People"_s), u"25");
    const FirstRecords slow = ReadFirstRecords(
        connection, path, u"SELECT COUNT(*) FROM People a, People b, People c, People d, People e, People f"_s, 3,
        100);
    EXPECT_TRUE(slow.stopped);
}

} // namespace
} // namespace mirel
