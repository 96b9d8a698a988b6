#include "querybuilder/query_clauses.h"

#include "data/statement_text.h"
#include "resources/string_table.h"
#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

struct SplitRow {
    const char* what;
    QString statement;
    QueryClauses clauses;
    QString joined; // empty: it is not looked at
};

void ExpectSplits(const std::vector<SplitRow>& rows)
{
    for (const SplitRow& row : rows) {
        const QueryClauses clauses = SplitStatement(row.statement);
        for (const ClauseDef& def : ClauseDefs()) {
            EXPECT_EQ(clauses.*def.text, row.clauses.*def.text)
                << row.what << ": " << def.keyword.toString().toStdString();
        }
        if (!row.joined.isEmpty())
            EXPECT_EQ(JoinClauses(clauses), row.joined) << row.what;
    }
}

TEST(SplitStatement, CutsAtTheKeywords)
{
    ExpectSplits({
        {"keywords in any case",
         u"select * from Orders where Qty > 5 order by Qty"_s,
         {u"*"_s, u"Orders"_s, {}, {}, u"Qty > 5"_s, u"Qty"_s},
         u"SELECT * FROM Orders WHERE Qty > 5 ORDER BY Qty"_s},
        {"a join",
         u"SELECT a FROM t1 INNER JOIN t2 ON t1.k = t2.k"_s,
         {u"a"_s, u"t1"_s, u"t2"_s, u"t1.k = t2.k"_s, {}, {}},
         u"SELECT a FROM t1 INNER JOIN t2 ON t1.k = t2.k"_s},
        {"keywords in quotes and brackets",
         u"SELECT [x FROM y] FROM t WHERE Name = 'ORDER BY' AND b = \" WHERE \""_s,
         {u"[x FROM y]"_s, u"t"_s, {}, {}, u"Name = 'ORDER BY' AND b = \" WHERE \""_s, {}},
         {}},
        {"tabs, line ends, many blanks",
         u" SELECT\n\ta ,\n b\r\nFROM\tt  \nWHERE\n(a)\nORDER\nBY b "_s,
         {u"a ,\n b"_s, u"t"_s, {}, {}, u"(a)"_s, u"b"_s},
         {}},
        {"keywords inside longer words",
         u"SELECT Fromage, Onset FROM Whereabouts ORDER BY Byte"_s,
         {u"Fromage, Onset"_s, u"Whereabouts"_s, {}, {}, {}, u"Byte"_s},
         {}},
        {"nothing", {}, {}, {}},
        {"no select clause", u"FROM t WHERE a"_s, {{}, u"t"_s, {}, {}, u"a"_s, {}}, u" FROM t WHERE a"_s},
    });
}

TEST(SplitStatement, TakesTheNextKeywordInItsFixedOrderNotInTheText)
{
    ExpectSplits({
        {"WHERE in front of FROM: the select clause ends at FROM",
         u"SELECT a WHERE b FROM c"_s,
         {u"a WHERE b"_s, {}, {}, {}, u"b FROM c"_s, {}},
         {}},
        {"JOIN without INNER is no join",
         u"SELECT a FROM t JOIN u ON x ORDER BY y"_s,
         {u"a"_s, u"t"_s, {}, u"x"_s, {}, u"y"_s},
         {}},
        {"INNER without JOIN", u"SELECT a FROM t INNER u ON x"_s, {u"a"_s, u"t"_s, {}, u"x"_s, {}, {}}, {}},
        {"ORDER without BY", u"SELECT a FROM t ORDER x"_s, {u"a"_s, u"t"_s, {}, {}, {}, {}}, {}},
        {"the BY behind ORDER counts",
         u"SELECT a FROM t WHERE BY ORDER BY c"_s,
         {u"a"_s, u"t"_s, {}, {}, u"BY"_s, u"c"_s},
         {}},
    });
}

TEST(JoinClauses, LeavesOutWhatIsEmptyAndBeginsWithThePrefix)
{
    EXPECT_EQ(JoinClauses({.from = u" t "_s, .where = u"  "_s, .order = u"a"_s}, u"SELECT *"_s),
              u"SELECT * FROM t ORDER BY a");
    EXPECT_EQ(JoinClauses({}), QString());
}

TEST(ObstacleToSplitting, KeepsStatementsOnTheSqlTab)
{
    struct Row {
        const char* what;
        QString statement;
        std::optional<Str> reason;
    };
    for (const Row& row : {
             Row{"a plain one", u"SELECT a FROM t INNER JOIN u ON t.k=u.k WHERE LEFT(a,1)='x' ORDER BY a"_s, {}},
             Row{"nothing", u" \n "_s, {}},
             Row{"not finished", u"SELECT a FROM"_s, {}},
             Row{"a second join stays in the ON box",
                 u"SELECT a FROM t INNER JOIN u ON b INNER JOIN v ON c"_s,
                 {}},
             Row{"counts each once", u"SELECT COUNT(DISTINCT a) FROM t"_s, {}},
             Row{"groups", u"SELECT a FROM t GROUP BY a"_s, Str::BuilderHasNoBox},
             Row{"groups chosen", u"SELECT a FROM t HAVING COUNT(*)>1"_s, Str::BuilderHasNoBox},
             Row{"each once", u"SELECT DISTINCT a FROM t"_s, Str::BuilderHasNoBox},
             Row{"all of the left table", u"SELECT a FROM t LEFT JOIN u ON b"_s, Str::BuilderHasNoBox},
             Row{"a word of a text is no clause", u"SELECT a FROM t WHERE b='GROUP BY'"_s, {}},
             Row{"a bare JOIN would be lost", u"SELECT a FROM t JOIN u ON b"_s, Str::BuilderWouldLose},
             Row{"clauses out of order", u"SELECT a WHERE b FROM c"_s, Str::BuilderWouldLose},
             Row{"a FROM that is not found", u"SELECT a,(b)FROM t"_s, {}},
             Row{"a change", u"UPDATE t SET a=1"_s, Str::BuilderOnlySelect},
             Row{"a table's name", u"Orders"_s, Str::BuilderOnlySelect},
         }) {
        const std::optional<SplitObstacle> obstacle = ObstacleToSplitting(row.statement);
        EXPECT_EQ(obstacle ? std::optional(obstacle->reason) : std::nullopt, row.reason) << row.what;
    }
}

TEST(ObstacleToSplitting, BearsAStatementOfAMegabyte)
{
    const QString statement =
        u"SELECT a FROM t WHERE a IN (%1) ORDER BY a"_s.arg(u"'FROM',"_s.repeated(150'000) + u"1"_s);
    EXPECT_FALSE(ObstacleToSplitting(statement));
    EXPECT_EQ(JoinClauses(SplitStatement(statement)), statement);
}

TEST(IsBalanced, CountsOutsideOfQuotes)
{
    for (const auto& [statement, balanced] : std::initializer_list<std::pair<QString, bool>>{
             {{}, true},
             {u"SELECT * FROM t WHERE (a = 1"_s, false},
             {u"SELECT [x] FROM t WHERE b = ')'"_s, true},
             {u"a)("_s, false},
             {u"[a"_s, false},
             {u"'it''s'"_s, true},
             {u"'a\"b"_s, false},
             {u"[(])"_s, true},
         })
        EXPECT_EQ(IsBalanced(statement), balanced) << statement.toStdString();
}

TEST(SelectClause, IsTakenOffAndPutBack)
{
    const QString fixed = u"SELECT *"_s;
    for (const auto& [statement, rest, whole] : std::initializer_list<std::array<QString, 3>>{
             {u"SELECT * "_s, u""_s, u"SELECT *"_s},
             {u"select *\nWHERE a"_s, u"WHERE a"_s, u"SELECT * WHERE a"_s},
             {u"SELECT a, b FROM t WHERE c"_s, u"FROM t WHERE c"_s, u"SELECT * FROM t WHERE c"_s},
             {u"ORDER BY a"_s, u"ORDER BY a"_s, u"SELECT * ORDER BY a"_s},
             {u"SELECT *x FROM t"_s, u"FROM t"_s, u"SELECT * FROM t"_s},
         }) {
        EXPECT_EQ(WithoutSelectClause(statement, fixed), rest) << statement.toStdString();
        EXPECT_EQ(WithSelectClause(fixed, rest), whole) << statement.toStdString();
    }
}

} // namespace
} // namespace mirel
