#include "platform/memo_text.h"

#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TEST(MemoText, KeepsEachCharacterThatWasNotEdited)
{
    const struct {
        const char* what;
        QString before;
        QString edited;
        QString after;
    } rows[] = {
        {"nothing edited", u"a\r\nb\nc\rd\u2028e\u2029f\u00A0g"_s,
         u"a\u2029b\u2029c\u2029d\u2028e\u2029f\u00A0g"_s, u"a\r\nb\nc\rd\u2028e\u2029f\u00A0g"_s},
        {"a letter between mixed ends", u"a\r\nb\nc"_s, u"a\u2029bX\u2029c"_s, u"a\r\nbX\nc"_s},
        {"a new line where they are pairs", u"a\r\nb"_s, u"a\u2029b\u2029c"_s, u"a\r\nb\r\nc"_s},
        {"a new line where there was none", u"ab"_s, u"a\u2029b"_s, u"a\nb"_s},
        {"a line end taken away", u"a\r\nb\r\nc"_s, u"ab\u2029c"_s, u"ab\r\nc"_s},
        {"one of two equal lines", u"a\r\n\r\nb"_s, u"a\u2029b"_s, u"a\r\nb"_s},
        {"all of it", u"a\r\nb"_s, u""_s, u""_s},
        {"typed into nothing", u""_s, u"x\u2029"_s, u"x\n"_s},
        {"a pair whose end repeats", u"\r\n"_s, u"\u2029\u2029"_s, u"\r\n\r\n"_s},
    };
    for (const auto& row : rows)
        EXPECT_EQ(WithEdit(row.before, row.edited), row.after) << row.what;
}

} // namespace
} // namespace mirel
