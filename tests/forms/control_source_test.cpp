#include "forms/control_source.h"

#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TEST(ControlSource, KeepsAssignmentsThroughTheirText)
{
    const std::vector<SourceAssignment> both = {{u"T.A"_s, u"&A"_s}, {u"[My T].[B.C]"_s, u""_s}};
    EXPECT_EQ(JoinAssignments(both), u"\x05T.A\x05\x06&A\x06\x05[My T].[B.C]\x05\x06\x06"_s);
    EXPECT_EQ(SplitAssignments(JoinAssignments(both)), both);
}

TEST(ControlSource, TakesWholeAssignmentsAlone)
{
    const std::vector<SourceAssignment> one = {{u"T.A"_s, u"1"_s}};
    for (const QString& cut : {u"\x05T.A\x05\x06"
                               "1\x06\x05T.B"_s,
                               u"\x05T.A\x05\x06"
                               "1\x06\x05T.B\x05\x06"
                               "2"_s,
                               u"junk\x05T.A\x05 \x06"
                               "1\x06 junk"_s})
        EXPECT_EQ(SplitAssignments(cut), one);
    for (const QString& none : {u""_s, u"\x05"_s, u"\x06\x06"_s, u"UPDATE T"_s})
        EXPECT_TRUE(SplitAssignments(none).empty());
}

TEST(ControlSource, KeepsListColumnsThroughTheirText)
{
    const std::vector<SourceColumn> columns = {{u"Name"_s, u"T.A"_s}, {u""_s, u"[B]+1"_s}};
    EXPECT_EQ(JoinListColumns(columns), u"Name\x02T.A\x03\x02[B]+1\x03"_s);
    EXPECT_EQ(SplitListColumns(JoinListColumns(columns)), columns);
    EXPECT_EQ(SplitListColumns(u"Name\x02T.A\x03\x02[B]+1"_s), columns); // the last end is missing
    EXPECT_TRUE(SplitListColumns(u"just a text"_s).empty());
}

TEST(ControlSource, PartsADropDownsQueryFromItsItems)
{
    EXPECT_EQ(SplitDropDown(u"SELECT A FROM T\x08x;y\x08z"_s),
              (DropDownSource{u"SELECT A FROM T"_s, u"x;y\x08z"_s}));
    EXPECT_EQ(SplitDropDown(u"x;y"_s), (DropDownSource{u""_s, u"x;y"_s}));
    EXPECT_EQ(JoinDropDown({u"Q"_s, u"x"_s}), u"Q\x08x"_s);
    EXPECT_EQ(JoinDropDown({u""_s, u"x"_s}), u"x"_s);
    EXPECT_EQ(DropDownItems(u"a; b ;;\r\nc d\n e"), (QStringList{u"a"_s, u"b"_s, u"c d"_s, u"e"_s}));
}

TEST(ControlSource, ReadsTargetsInEveryWriting)
{
    EXPECT_EQ(SplitTarget(u"T.A"), (TargetName{u"T"_s, u"A"_s}));
    EXPECT_EQ(SplitTarget(u"[My T].[A.B]"), (TargetName{u"My T"_s, u"A.B"_s}));
    EXPECT_EQ(SplitTarget(u" [A.B] "), (TargetName{u""_s, u"A.B"_s}));
    EXPECT_EQ(SplitTarget(u""), (TargetName{}));
}

} // namespace
} // namespace mirel
