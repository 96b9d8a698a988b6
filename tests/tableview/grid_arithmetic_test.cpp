#include "tableview/column_layout.h"
#include "tableview/column_widths.h"
#include "tableview/scroll_scale.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace mirel {
namespace {

TEST(ScrollScale, MeetsBothEndsAtEveryLength)
{
    for (const qint64 highest : {qint64(0), qint64(9), qint64(10'000'000), qint64(ScrollScale::kHighestValue),
                                 qint64(ScrollScale::kHighestValue) + 1, qint64(3'000'000'000'000)}) {
        const ScrollScale scale(highest);
        EXPECT_EQ(scale.ValueOf(0), 0) << highest;
        EXPECT_EQ(scale.ValueOf(highest), scale.HighestValue()) << highest;
        EXPECT_EQ(scale.PositionOf(scale.HighestValue()), highest) << highest;
        EXPECT_EQ(scale.PositionOf(0), 0) << highest;
        EXPECT_LT(scale.HighestValue(), std::numeric_limits<int>::max() - 10'000) << highest;
    }
}

TEST(ScrollScale, StaysNearEachPositionOfALongResult)
{
    const qint64 highest = 3'000'000'000'000;
    const ScrollScale scale(highest);
    for (const qint64 position : {qint64(1), highest / 3, highest / 2, highest - 1})
        EXPECT_NEAR(double(scale.PositionOf(scale.ValueOf(position))), double(position), 3000) << position;
}

class Columns : public ::testing::Test {
protected:
    Columns()
    {
        layout_.Reset(3);
        for (const int column : {0, 1, 2})
            layout_.SetWidth(column, 100 * (column + 1));
    }
    ColumnLayout layout_; // edges at 100, 300 and 600
};

TEST_F(Columns, AreFoundByPlace)
{
    EXPECT_EQ(layout_.TotalPx(), 600);
    EXPECT_EQ(layout_.LeftPx(2), 300);
    EXPECT_EQ(layout_.ColumnAt(99), 0);
    EXPECT_EQ(layout_.ColumnAt(100), 1);
    EXPECT_EQ(layout_.ColumnAt(599), 2);
    EXPECT_EQ(layout_.ColumnAt(600), -1);
}

TEST_F(Columns, AreResizedByTheNearestEdgeWithinReach)
{
    EXPECT_EQ(layout_.EdgeNear(97, 5), 0);
    EXPECT_EQ(layout_.EdgeNear(305, 5), 1);
    EXPECT_EQ(layout_.EdgeNear(306, 5), -1);
    layout_.SetByHand(0, -50);
    EXPECT_EQ(layout_.WidthPx(0), ColumnLayout::kNarrowestPx);
    EXPECT_TRUE(layout_.IsByHand(0));
    layout_.FitToPage(0);
    EXPECT_FALSE(layout_.IsByHand(0));
}

TEST_F(Columns, GrowWithTheirContentAndNeverShrinkByThemselves)
{
    constexpr int kMarginPx = 5;
    constexpr int kViewPx = 200;
    layout_.SetByHand(2, 50);
    const struct {
        const char* what;
        ColumnLayout::Content content;
        int widthPx;
    } pages[] = {
        {"12.5", {20, 15}, 46},
        {"narrower", {10, 5}, 46},
        {"100 and .125 of other rows", {30, 25}, 66},
        {"wider than the view", {900, 0}, kViewPx},
    };
    for (const auto& page : pages) {
        layout_.Grow(1, page.content);
        layout_.TakeContentWidths(kMarginPx, kViewPx);
        EXPECT_EQ(layout_.WidthPx(1), page.widthPx) << page.what;
    }
    EXPECT_EQ(layout_.WidthPx(2), 50) << "set by hand";
    layout_.FitToPage(1);
    layout_.Grow(1, {10, 5});
    layout_.TakeContentWidths(kMarginPx, kViewPx);
    EXPECT_EQ(layout_.WidthPx(1), 26) << "when it was asked to";
}

TEST(ColumnWidths, ComeBackFromTheProfile)
{
    const ColumnWidths widths = {{QStringLiteral("Name"), 120}, {QStringLiteral("a:b,c%"), 80}};
    EXPECT_EQ(ReadColumnWidths(ColumnWidthsText(widths)), widths);
    EXPECT_EQ(ReadColumnWidths(QStringLiteral("Name:120,x,:,Age:wide,B:-5,C:99999999999")),
              (ColumnWidths{{QStringLiteral("Name"), 120}}));
}

} // namespace
} // namespace mirel
