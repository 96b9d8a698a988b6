#include "app/settings.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QFile>
#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class SettingsTest : public ::testing::Test {
protected:
    void WriteFile(const QByteArray& bytes)
    {
        QFile file(Path());
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(bytes);
    }
    QByteArray ReadFile() const
    {
        QFile file(Path());
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        return file.readAll();
    }
    QString Path() const { return folder_.filePath(u"Mirel.ini"_s); }

    QTemporaryDir folder_;
    Settings settings_{Profile(Path())};
};

TEST_F(SettingsTest, HaveDefaultsThatReadAsTheirKind)
{
    for (const SettingRow& row : Settings::Rows()) {
        const QString text = settings_.Text(row.id);
        EXPECT_TRUE(Settings::Accepts(row, text)) << QStringView(row.key).toString().toStdString();
        EXPECT_EQ(Settings::Find(QStringView(row.section), QStringView(row.key)), &row);
    }
    EXPECT_EQ(settings_.Int(Setting::TableViewHoldingTime), 400);
    EXPECT_EQ(settings_.Font(Setting::MainViewFont), FontDesc());
    EXPECT_FALSE(settings_.Colors(Setting::MainViewBkColor)) << "the desktop's palette gives them";
    EXPECT_FALSE(QFile::exists(Path())) << "reading writes nothing";
    EXPECT_EQ(Settings::Find(u"Config", u"nScroll"), nullptr) << "the key of another section";
}

TEST_F(SettingsTest, TakeTheDefaultForDamagedValues)
{
    WriteFile("[TableView]\nmaxColumnChars=wide\nyesnoString=Ja\nFont=(1,2,\nTextColor=(1),(2)\n"
              "tabnholdingTime=99999999999\n");
    EXPECT_EQ(settings_.Int(Setting::TableViewMaxColumnChars), 50);
    EXPECT_EQ(settings_.Int(Setting::TableViewHoldingTime), 400);
    EXPECT_EQ(settings_.Words(), YesNoWords());
    EXPECT_EQ(settings_.Font(Setting::TableViewFont), FontDesc());
    EXPECT_FALSE(settings_.Colors(Setting::TableViewTextColor));
}

TEST_F(SettingsTest, RefuseWhatDoesNotReadBack)
{
    EXPECT_TRUE(settings_.SetInt(Setting::TableViewMaxColumnChars, 20));
    const QByteArray before = ReadFile();
    EXPECT_FALSE(settings_.SetText(Setting::TableViewMaxColumnChars, u"wide"_s));
    EXPECT_FALSE(settings_.SetText(Setting::MainViewTextColor, u"(1),(2),(3),(4)"_s));
    EXPECT_FALSE(settings_.SetText(Setting::MainViewFont, u"Tahoma"_s));
    EXPECT_FALSE(settings_.SetText(Setting::FormViewYesNo, u"Yes"_s));
    EXPECT_EQ(ReadFile(), before);
}

TEST_F(SettingsTest, HaveOnePairOfWordsForYesAndNo)
{
    ASSERT_TRUE(settings_.SetText(Setting::FormViewYesNo, u"Oui/Non/Peut-être"_s));
    EXPECT_EQ(settings_.Words(), (YesNoWords{u"Oui"_s, u"Non/Peut-être"_s}));
    EXPECT_EQ(settings_.Text(Setting::TableViewYesNo), u"Oui/Non/Peut-être"_s);
    WriteFile("[TableView]\nyesnoString=Ja/Nein\n[FormView]\nyesnoString=Si/No\n");
    EXPECT_EQ(settings_.Text(Setting::FormViewYesNo), u"Ja/Nein"_s) << "the table view's counts";
}

TEST_F(SettingsTest, RememberTheLatestDatabases)
{
    for (const QString& path : {u"/a, b.cdb"_s, u"/c.cdb"_s, u"/a, b.cdb"_s})
        ASSERT_TRUE(settings_.AddRecentDatabase(path));
    EXPECT_EQ(settings_.RecentDatabases(), (QStringList{u"/a, b.cdb"_s, u"/c.cdb"_s}));
    ASSERT_TRUE(settings_.ForgetDatabase(u"/a, b.cdb"_s));
    EXPECT_EQ(settings_.RecentDatabases(), QStringList{u"/c.cdb"_s});
}

TEST(DisplayRecords, ReadWhatTheyWrite)
{
    const ColorRecord colors{{0, 255, 16777215, 4294967295U, 12632256}};
    EXPECT_EQ(ColorRecordText(colors), u"(0),(255),(16777215),(4294967295),(12632256)"_s);
    EXPECT_EQ(ReadColorRecord(ColorRecordText(colors)), colors);
    const FontDesc font{u"Courier New"_s, 1, 0, 1, 0, 14, 0};
    EXPECT_EQ(FontRecordText(font), u"(1,0,1,0,14,\"Courier New\")"_s);
    EXPECT_EQ(ReadFontRecord(FontRecordText(font)), font);
    const FontDesc quoted{u"a\"b %1"_s, 0, 0, 0, 0, 9, 0};
    EXPECT_EQ(ReadFontRecord(FontRecordText(quoted))->faceName, u"ab %1"_s);
}

TEST(DisplayRecords, RefuseWhatIsNone)
{
    for (const QString& text :
         {u""_s, u"(1),(2),(3),(4),(5"_s, u"(1),(2),(3),(4),(99999999999)"_s, u"1,2,3,4,5"_s})
        EXPECT_FALSE(ReadColorRecord(text)) << text.toStdString();
    for (const QString& text : {u""_s, u"(0,0,0,0,9,Tahoma)"_s, u"(0,0,0,0,9,\"Tahoma)"_s, u"(0,0,0,0,\"T\")"_s,
                                u"(0,0,0,0,-5,\"Tahoma\")"_s, u"(0,0,0,0,99999999999,\"Tahoma\")"_s})
        EXPECT_FALSE(ReadFontRecord(text)) << text.toStdString();
}

} // namespace
} // namespace mirel
