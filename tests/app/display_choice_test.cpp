#include "app/display_choice.h"

#include "support/printing.h"

#include <gtest/gtest.h>

#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class Display : public ::testing::Test {
protected:
    QTemporaryDir folder;
    Profile profile{folder.filePath(u"Mirel.ini"_s)};
    Settings settings{profile};
    DisplayChoice choice{settings, DisplayView::Main};
};

TEST_F(Display, LeavesToTheDesktopWhatNobodyChose)
{
    EXPECT_FALSE(choice.HasFont());
    EXPECT_FALSE(choice.Color(ColorPart::Lists, ColorKind::Background));
    ASSERT_TRUE(choice.SetColor(ColorPart::Lists, ColorKind::Background, 0x0000FF));
    EXPECT_EQ(choice.Color(ColorPart::Lists, ColorKind::Background), 0x0000FFU);
    EXPECT_FALSE(choice.Color(ColorPart::Line, ColorKind::Background)) << "a neighbour in the same record";
    EXPECT_FALSE(choice.Color(ColorPart::Lists, ColorKind::Text));
    ASSERT_TRUE(choice.SetColor(ColorPart::Lists, ColorKind::Background, {}));
    EXPECT_FALSE(choice.Color(ColorPart::Lists, ColorKind::Background));
}

TEST_F(Display, TakesRecordsThatOthersWrote)
{
    ASSERT_TRUE(profile.WriteText(u"MainView"_s, u"TextColor"_s, u"(255),(0),(0),(0),(12632256)"_s));
    EXPECT_EQ(choice.Color(ColorPart::Line, ColorKind::Text), 255U);
    EXPECT_EQ(choice.Color(ColorPart::Lists, ColorKind::Text), 0U) << "black is a colour";
    EXPECT_EQ(choice.Color(ColorPart::Buttons, ColorKind::Text), 12632256U);
    ASSERT_TRUE(profile.WriteText(u"MainView"_s, u"TextColor"_s, u"(255),(0"_s));
    EXPECT_FALSE(choice.Color(ColorPart::Line, ColorKind::Text));
}

TEST_F(Display, KeepsEachViewsFontAndGivesAllBack)
{
    FontDesc font;
    font.faceName = u"DejaVu Sans"_s;
    font.bold = 1;
    font.size = 14;
    ASSERT_TRUE(choice.SetFont(font));
    ASSERT_TRUE(choice.SetColor(ColorPart::Lists, ColorKind::Text, 0x112233));
    font.color = 0x112233;
    EXPECT_EQ(choice.Font(), font);
    EXPECT_EQ(profile.ReadText(u"MainView"_s, u"Font"_s, {}), u"(0,1,0,0,14,\"DejaVu Sans\")"_s);
    EXPECT_FALSE(DisplayChoice(settings, DisplayView::Table).HasFont());
    ASSERT_TRUE(choice.Reset());
    EXPECT_FALSE(choice.HasFont());
    EXPECT_EQ(choice.Font(), FontDesc());
}

} // namespace
} // namespace mirel
