#include "data/statement_text.h"

#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

struct KeywordRow {
    const char* what;
    QStringView statement;
    qsizetype position;
};

void ExpectWhere(std::initializer_list<KeywordRow> rows)
{
    for (const KeywordRow& row : rows)
        EXPECT_EQ(KeywordPosition(row.statement, u"WHERE"), row.position) << row.what;
}

TEST(KeywordPosition, StandsAsAWholeWord)
{
    ExpectWhere({{"between blanks", u"SELECT * FROM T WHERE A=1", 16},
                 {"at the start, any case", u"where A=1", 0},
                 {"at the end", u"FROM T WHERE", 7},
                 {"after a tab, before a bracket", u"FROM T\tWHERE(A=1)", 7},
                 {"inside longer names", u"FROM NOWHERE WHEREVER", -1},
                 {"between line ends", u"SELECT *\nFROM T\r\nWHERE\nA=1", 17},
                 {"behind a comma", u"A,WHERE B", -1}});
}

TEST(KeywordPosition, IsNotFoundInsideQuotesAndBrackets)
{
    ExpectWhere({{"single quotes", u"A='x WHERE y'", -1},
                 {"the other quote inside", u"A='\" WHERE' WHERE B=2", 12},
                 {"a doubled quote ends and reopens", u"A='it''s WHERE ' WHERE B", 17},
                 {"a name in brackets", u"SELECT [No WHERE here] FROM T WHERE A", 30},
                 {"a doubled bracket in a name", u"SELECT [a]] WHERE b] FROM T WHERE A", 28},
                 {"quote never closed", u"A='x WHERE y", -1},
                 {"bracket never closed", u"[x WHERE y", -1}});
}

TEST(WithCondition, KeepsWhatIsThere)
{
    struct Row {
        QString statement;
        QString expected;
    };
    const Row rows[] = {
        {u"SELECT * FROM T"_s, u"SELECT * FROM T WHERE b=2"_s},
        {u"SELECT * FROM T ORDER BY c"_s, u"SELECT * FROM T  WHERE b=2 ORDER BY c"_s},
        {u"SELECT * FROM T WHERE a=1"_s, u"SELECT * FROM T WHERE ( a=1) AND (b=2)"_s},
        {u"SELECT * FROM T WHERE a=1 ORDER BY c"_s, u"SELECT * FROM T WHERE ( a=1 ) AND (b=2) ORDER BY c"_s},
        {u"SELECT a FROM T GROUP BY a ORDER BY a"_s, u"SELECT a FROM T  WHERE b=2 GROUP BY a ORDER BY a"_s},
        {u"SELECT * FROM T WHERE a='ORDER BY %1'"_s, u"SELECT * FROM T WHERE ( a='ORDER BY %1') AND (b=2)"_s},
        {u"SELECT * FROM T ORDER BY c WHERE a=1"_s, u"SELECT * FROM T ORDER BY c WHERE a=1"_s},
    };
    for (const Row& row : rows)
        EXPECT_EQ(WithCondition(row.statement, u"b=2"_s), row.expected);
}

TEST(WithCondition, PutsWhatSpeaksOfGroupsIntoHaving)
{
    const QString total = u"sum (a) > 2"_s;
    EXPECT_EQ(WithCondition(u"SELECT b FROM T GROUP BY b"_s, total),
              u"SELECT b FROM T GROUP BY b HAVING sum (a) > 2"_s);
    EXPECT_EQ(WithCondition(u"SELECT b FROM T GROUP BY b HAVING c\nORDER BY b"_s, total),
              u"SELECT b FROM T GROUP BY b HAVING ( c\n) AND (sum (a) > 2) ORDER BY b"_s);
    EXPECT_EQ(WithCondition(u"SELECT COUNT(*) FROM T HAVING c"_s, u"a=1"_s),
              u"SELECT COUNT(*) FROM T  WHERE a=1 HAVING c"_s);
    for (const QString& other : {u"[Count(x)] = 1"_s, u"a = 'SUM(b)'"_s, u"summ(a) = 1"_s, u"Count = 1"_s})
        EXPECT_EQ(WithCondition(u"SELECT b FROM T"_s, other), u"SELECT b FROM T WHERE "_s + other);
}

TEST(WithOrder, ReplacesTheOrderBefore)
{
    EXPECT_EQ(WithOrder(u"SELECT * FROM T  "_s, u"a ASC"_s), u"SELECT * FROM T ORDER BY a ASC"_s);
    EXPECT_EQ(WithOrder(u"SELECT * FROM T ORDER BY a,b"_s, u"c DESC"_s), u"SELECT * FROM T  ORDER BY c DESC"_s);
    EXPECT_EQ(WithOrder(u"SELECT [ORDER BY] FROM T"_s, u"c"_s), u"SELECT [ORDER BY] FROM T ORDER BY c"_s);
}

TEST(WithSelectList, ReplacesTheColumnsAlone)
{
    const QStringList columns = {u"A"_s, u"[Unit Price] AS P"_s};
    EXPECT_EQ(WithSelectList(u"SELECT * FROM T WHERE a=1"_s, columns),
              u"SELECT A,[Unit Price] AS P FROM T WHERE a=1"_s);
    EXPECT_EQ(WithSelectList(u"select distinct A,B FROM T"_s, {u"A"_s}), u"SELECT DISTINCT A FROM T"_s);
    EXPECT_EQ(WithSelectList(u"SELECT 'x FROM y', b FROM T"_s, {u"b"_s}), u"SELECT b FROM T"_s);
    for (const QString& other : {u"SELECT 1"_s, u"FROM T SELECT a"_s, u"SELECTFROM T"_s, QString()})
        EXPECT_EQ(WithSelectList(other, columns), other);
}

TEST(SelectList, IsCutAtItsOwnCommas)
{
    const struct {
        QString statement;
        QStringList columns;
    } rows[] = {
        {u"SELECT * FROM T"_s, {u"*"_s}},
        {u"SELECT A, LEFT(B,2) AS [x,y] ,'a,b' FROM T"_s, {u"A"_s, u"LEFT(B,2) AS [x,y]"_s, u"'a,b'"_s}},
        {u"SELECT DISTINCT A,B FROM T"_s, {u"A"_s, u"B"_s}},
        {u"SELECT [DISTINCT],B FROM T"_s, {u"[DISTINCT]"_s, u"B"_s}},
        {u"SELECT A)),B,'x FROM T"_s, {}}, // a text that never ends
        {u"DELETE FROM T"_s, {}},
    };
    for (const auto& row : rows)
        EXPECT_EQ(SelectList(row.statement), row.columns) << row.statement.toStdString();
}

TEST(IsBalanced, LooksOutsideOfTexts)
{
    for (const QString& balanced :
         {u""_s, u"SELECT [x] FROM t WHERE b = ')'"_s, u"'it''s'"_s, u"([)]"_s, u"[a]]b]"_s})
        EXPECT_TRUE(IsBalanced(balanced)) << balanced.toStdString();
    for (const QString& unbalanced :
         {u"SELECT * FROM t WHERE (a = 1"_s, u"a)("_s, u"[a"_s, u"a]"_s, u"'a"_s, u"\"a'"_s})
        EXPECT_FALSE(IsBalanced(unbalanced)) << unbalanced.toStdString();
}

} // namespace
} // namespace mirel
