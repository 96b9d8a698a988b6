#include "provider/dialect/parser.h"
#include "support/printing.h"
#include "support/tree_text.h"

#include <gtest/gtest.h>

#include <QFile>

namespace mirel::dialect {
namespace {

using namespace Qt::StringLiterals;

const Statement* StatementOf(const ParseResult& result)
{
    return std::get_if<Statement>(&result);
}

TEST(Statements, SurviveBeingWrittenAndReadAgain)
{
    QFile file(QStringLiteral(MIREL_SOURCE_DIR "/tests/dialect/statements.txt"));
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    int count = 0;
    for (const QString& line : QString::fromUtf8(file.readAll()).split(u'\n')) {
        if (line.isEmpty() || line.startsWith(u'#'))
            continue;
        const ParseResult first = ParseStatement(line);
        ASSERT_TRUE(StatementOf(first))
            << qPrintable(line) << ": " << qPrintable(std::get<Failure>(first).context);
        const QString written = StatementText(*StatementOf(first));
        const ParseResult second = ParseStatement(written);
        EXPECT_TRUE(StatementOf(second) && *StatementOf(second) == *StatementOf(first))
            << qPrintable(line) << " became " << qPrintable(written);
        ++count;
    }
    EXPECT_GT(count, 30);
}

struct Reading {
    const char* what;
    QString expression;
    QString same; // with parentheses where the reading would put them
};

TEST(Expressions, BindAsPeopleReadThem)
{
    const std::vector<Reading> rows = {
        {"AND before OR", u"a OR b AND c"_s, u"a OR (b AND c)"_s},
        {"NOT before AND", u"NOT a AND b"_s, u"(NOT a) AND b"_s},
        {"comparison before NOT", u"NOT a = b"_s, u"NOT (a = b)"_s},
        {"sum before comparison", u"a + 1 = b - 2"_s, u"(a + 1) = (b - 2)"_s},
        {"product before sum", u"a + b * c"_s, u"a + (b * c)"_s},
        {"from the left", u"a - b - c"_s, u"(a - b) - c"_s},
        {"sign before product", u"-a * b"_s, u"(-a) * b"_s},
        {"sum before joining", u"'n' & a + 1"_s, u"'n' & (a + 1)"_s},
        {"the AND of BETWEEN", u"a BETWEEN 1 AND 2 AND b"_s, u"(a BETWEEN 1 AND 2) AND b"_s},
        {"IS after comparison", u"a = b IS NULL"_s, u"(a = b) IS NULL"_s},
        {"not =", u"a not = 5"_s, u"a <> 5"_s},
        {"chains are one", u"a AND (b AND (c AND d))"_s, u"((a AND b) AND c) AND d"_s},
        {"sign of a number", u"a - - 5"_s, u"a - (-5)"_s},
    };
    for (const Reading& row : rows) {
        const ParseResult plain = ParseStatement(u"SELECT "_s + row.expression + u" AS x FROM t"_s);
        const ParseResult same = ParseStatement(u"SELECT "_s + row.same + u" AS x FROM t"_s);
        ASSERT_TRUE(StatementOf(plain) && StatementOf(same)) << row.what;
        EXPECT_TRUE(*StatementOf(plain) == *StatementOf(same)) << row.what;
    }
    const ParseResult other = ParseStatement(u"SELECT a - (b - c) AS x FROM t"_s);
    const ParseResult plain = ParseStatement(u"SELECT a - b - c AS x FROM t"_s);
    EXPECT_FALSE(*StatementOf(plain) == *StatementOf(other));
}

TEST(Faults, NameThePlace)
{
    const std::vector<std::pair<QString, QString>> rows = {
        {u"SELECT * FORM T"_s, u"at character 10, near \"FORM\""_s},
        {u"SELECT * FROM"_s, u"at the end of the statement"_s},
        {u"SELECT a FROM t WHERE"_s, u"at the end of the statement"_s},
        {u"SELECT a FROM t WHERE (a = 1"_s, u"at the end of the statement"_s},
        {u"SELECT a FROM t WHERE a = 1)"_s, u"at character 28, near \")\""_s},
        {u"SELECT a FROM t WHERE a BETWEEN 1 OR 2"_s, u"at the end of the statement"_s},
        {u"SELECT a FROM t WHERE b = 'x"_s, u"at character 27, near \"'x\""_s},
        {u"SELECT [a FROM t"_s, u"at character 8, near \"[a FROM t\""_s},
        {u"SELECT [] FROM t"_s, u"at character 8, near \"[] FROM t\""_s},
        {u"SELECT a FROM select"_s, u"at character 15, near \"select\""_s},
        {u"SELECT 12abc FROM t"_s, u"at character 8, near \"12\""_s},
        {u"SELECT a -- b\nFROM t"_s, u"at character 10, near \"--\""_s},
        {u"SELECT a FROM t; DROP TABLE t"_s, u"at character 18, near \"DROP\""_s},
        {u"SELECT SUBSTR(a) FROM t"_s, u"at character 8, near \"SUBSTR\""_s},
        {u"SELECT NOSUCH(a) FROM t"_s, u"at character 14, near \"(\""_s},
        {u"CREATE TABLE [a]b] (x Integer)"_s, u"at character 17, near \"b\""_s},
        {u"CREATE TABLE t (x Integer NOT NULL)"_s, u"at character 27, near \"NOT\""_s},
        {u"DROP INDEX i"_s, u"at the end of the statement"_s},
        {u""_s, u"at the end of the statement"_s},
        {u"SELECT * FROM t ORDER a"_s, u"at character 23, near \"a\""_s},
    };
    for (const auto& [statement, place] : rows) {
        const ParseResult result = ParseStatement(statement);
        ASSERT_TRUE(std::holds_alternative<Failure>(result)) << qPrintable(statement);
        EXPECT_EQ(std::get<Failure>(result).code, Hr::SyntaxError) << qPrintable(statement);
        EXPECT_EQ(std::get<Failure>(result).context, place) << qPrintable(statement);
    }
}

TEST(Bounds, AddedUpFiltersAreNothingSpecial)
{
    // As filters add up: each wraps what was there before.
    QString statement = u"a = 0"_s;
    for (int i = 1; i <= 3000; ++i)
        statement = u" ("_s + statement + u") AND (a <> "_s + QString::number(i) + u')';
    const ParseResult parsed = ParseStatement(u"SELECT * FROM t WHERE"_s + statement);
    ASSERT_TRUE(StatementOf(parsed));
    EXPECT_EQ(std::get<Select>(*StatementOf(parsed)).where->arguments.size(), 3001U);
}

TEST(Bounds, RefuseWhatIsTooDeepOrTooLong)
{
    const auto times = [](const QString& piece, int count) { return piece.repeated(count); };
    const std::vector<std::pair<const char*, QString>> rows = {
        {"nested calls", u"SELECT "_s + times(u"UPPER("_s, 5000) + u"a"_s + times(u")"_s, 5000) + u" FROM t"_s},
        {"AND and OR in turn",
         u"SELECT * FROM t WHERE "_s + times(u"(a AND (b OR "_s, 5000) + u"c"_s + times(u"))"_s, 5000)},
        {"signs", u"SELECT "_s + times(u"- "_s, 5000) + u"a FROM t"_s},
        {"a sum of thousands", u"SELECT a"_s + times(u"+a"_s, 5000) + u" FROM t"_s},
        {"a megabyte of parentheses", u"SELECT "_s + times(u"("_s, 1000000)},
        {"a megabyte of names", u"SELECT a"_s + times(u",a"_s, 500000) + u" FROM t"_s},
        {"over the length", u"SELECT '"_s + times(u"x"_s, 60000000) + u"' FROM t"_s},
    };
    for (const auto& [what, statement] : rows) {
        const ParseResult result = ParseStatement(statement);
        ASSERT_TRUE(std::holds_alternative<Failure>(result)) << what;
        EXPECT_EQ(std::get<Failure>(result).code, Hr::SyntaxError) << what;
    }
}

TEST(Bounds, LeaveRoomForLongTexts)
{
    EXPECT_TRUE(StatementOf(ParseStatement(u"INSERT INTO t VALUES('"_s + u"x"_s.repeated(500000) + u"')"_s)));
}

} // namespace
} // namespace mirel::dialect
