#include "tableview/block_text.h"

#include "support/printing.h"

#include <gtest/gtest.h>

#include <QRandomGenerator>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TEST(BlockText, IsWhatSpreadsheetsWriteAndRead)
{
    const struct {
        const char* what;
        TextRows rows;
        QString text;
    } cases[] = {
        {"one cell", {{u"Ann"_s}}, u"Ann"_s},
        {"nothing", {{u""_s}}, u""_s},
        {"a row", {{u"Ann"_s, u""_s, u"3"_s}}, u"Ann\t\t3"_s},
        {"two rows", {{u"a"_s, u"b"_s}, {u"c"_s, u"d"_s}}, u"a\tb\nc\td"_s},
        {"empty cells at the ends", {{u""_s, u"b"_s}, {u"c"_s, u""_s}}, u"\tb\nc\t"_s},
        {"an empty cell at the very end", {{u"a"_s}, {u""_s}}, u"a\n\n"_s},
        {"nothing but empty cells", {{u""_s}, {u""_s}}, u"\n\n"_s},
        {"a tab inside", {{u"a\tb"_s, u"c"_s}}, u"\"a\tb\"\tc"_s},
        {"a line end inside", {{u"a\r\nb"_s}, {u"c"_s}}, u"\"a\r\nb\"\nc"_s},
        {"both and quotation marks", {{u"say \"hi\"\nnow"_s}}, u"\"say \"\"hi\"\"\nnow\""_s},
        {"a mark inside alone", {{u"5\" pipe"_s, u"x"_s}}, u"5\" pipe\tx"_s},
        {"a mark in front", {{u"\"quoted\" once"_s}}, u"\"\"\"quoted\"\" once\""_s},
    };
    for (const auto& row : cases) {
        EXPECT_EQ(TextOfRows(row.rows), row.text) << row.what;
        EXPECT_EQ(RowsOfText(row.text), row.rows) << row.what;
    }
}

TEST(BlockText, IsReadAsOthersWriteIt)
{
    const struct {
        const char* what;
        QString text;
        TextRows rows;
    } cases[] = {
        {"a line end behind the last row", u"a\tb\r\nc\td\r\n"_s, {{u"a"_s, u"b"_s}, {u"c"_s, u"d"_s}}},
        {"an empty row between", u"a\n\nb"_s, {{u"a"_s}, {u""_s}, {u"b"_s}}},
        {"old line ends", u"a\rb"_s, {{u"a"_s}, {u"b"_s}}},
        {"a mark never closed", u"\"a\tb"_s, {{u"\"a"_s, u"b"_s}}},
        {"closed, but the text goes on", u"\"a\" b\tc"_s, {{u"\"a\" b"_s, u"c"_s}}},
        {"rows of several lengths", u"a\nb\tc"_s, {{u"a"_s}, {u"b"_s, u"c"_s}}},
    };
    for (const auto& row : cases)
        EXPECT_EQ(RowsOfText(row.text), row.rows) << row.what;
}

TEST(BlockText, ComesBackAsItWasWhateverItHolds)
{
    constexpr int kTexts = 5000;
    const QString letters = u"a\t\n\r\"\" "_s;
    QRandomGenerator random(1);
    for (int i = 0; i < kTexts; ++i) {
        QString text;
        for (int length = random.bounded(12); length > 0; --length)
            text += letters[random.bounded(int(letters.size()))];
        const TextRows rows = RowsOfText(text);
        ASSERT_EQ(RowsOfText(TextOfRows(rows)), rows) << text.toStdString();
    }
}

TEST(BlockText, IsEscapedAsHtml)
{
    const QString html = HtmlOfRows({{u"<b> & co"_s, u"one\ntwo"_s}, {u"007"_s, u"0.5"_s}});
    EXPECT_TRUE(html.contains(u">&lt;b&gt; &amp; co</td>"_s));
    EXPECT_TRUE(html.contains(u"one<br>two"_s));
    EXPECT_EQ(html.count(u"mso-number-format"_s), 1) << "007 stays a text, 0.5 is a number";
    EXPECT_EQ(html.count(u"<tr>"_s), 2);
}

} // namespace
} // namespace mirel
