#include "cli/statement_splitter.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QStringList>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

QStringList Split(const QString& script)
{
    StatementSplitter splitter;
    QStringList statements;
    for (const QString& line : script.split(u'\n')) {
        if (const std::optional<QString> statement = splitter.AddLine(line))
            statements += *statement;
    }
    if (!splitter.Rest().isEmpty())
        statements += u"rest: "_s + splitter.Rest();
    return statements;
}

TEST(StatementSplitter, EndsStatementsAtASemicolonBeforeALineEnd)
{
    struct Row {
        const char* what;
        QString script;
        QStringList statements;
    };
    const Row rows[] = {
        {"one a line", u"A 1;\nB 2;  \n"_s, {u"A 1"_s, u"B 2"_s}},
        {"over lines, the last without one", u"A\n1;\nB"_s, {u"A\n1"_s, u"rest: B"_s}},
        {"inside a line", u"A; B;\n"_s, {u"A; B"_s}},
        {"in quotes over lines", u"A 'x;\ny';\nB"_s, {u"A 'x;\ny'"_s, u"rest: B"_s}},
        {"the other quote inside", u"A \"it's;\n\";"_s, {u"A \"it's;\n\""_s}},
        {"a doubled quote", u"A 'it''s';"_s, {u"A 'it''s'"_s}},
        {"in brackets", u"A [o'clock;\n];"_s, {u"A [o'clock;\n]"_s}},
        {"quote never closed", u"A 'x;\n"_s, {u"rest: A 'x;"_s}},
        {"nothing", u"\n;\n"_s, {u""_s}},
    };
    for (const Row& row : rows)
        EXPECT_EQ(Split(row.script), row.statements) << row.what;
}

TEST(StatementSplitter, TakesTheSemicolonOffASingleStatement)
{
    EXPECT_EQ(WithoutSemicolon(u" A ; "_s), u"A"_s);
    EXPECT_EQ(WithoutSemicolon(u"A ';'"_s), u"A ';'"_s);
    EXPECT_EQ(WithoutSemicolon(u"A ';"_s), u"A ';"_s);
}

} // namespace
} // namespace mirel::cli
