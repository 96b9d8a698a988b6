#include "platform/profile.h"
#include "platform/profile_text.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TEST(ProfileText, KeepsEveryText)
{
    const QString texts[] = {u""_s,
                             u"/home/ada/my, database; [old].cdb"_s,
                             u"C:\\data\\new.cdb"_s,
                             u"(0,0,0,0,9,\"Tahoma\")"_s,
                             u"\"quoted\""_s,
                             u"\""_s,
                             u"  blanks around  "_s,
                             u"two\nlines\r\nand a\ttab"_s,
                             u"\\n is no line end"_s,
                             u"=[Config]="_s,
                             u"Größe ≥ 3 \U0001F600"_s,
                             u"nul\0inside"_s,
                             QString(QChar(0xD83D)) + u"half a pair"_s,
                             u"\u00A0no-break blank\u00A0"_s};
    for (const QString& text : texts) {
        ProfileText profile(QByteArray{});
        ASSERT_TRUE(profile.Set(u"Config"_s, u"ActiveDB"_s, text));
        EXPECT_EQ(ProfileText(profile.Bytes()).Find(u"Config"_s, u"ActiveDB"_s), text) << text.toStdString();
    }
}

TEST(ProfileText, ReadsWhatPeopleWrite)
{
    const ProfileText profile("\xEF\xBB\xBF; mine\r\n"
                              "[ config ]\r\n"
                              "ACTIVETABLE = Order Details \r\n"
                              "open=\"a\\tb\"  \r\n"
                              "open=second\r\n"
                              "# open2=no\r\n"
                              "[TableView]\n"
                              "yesnoString=Oui/Non");
    const struct {
        const char* what;
        QString section;
        QString key;
        std::optional<QString> value;
    } rows[] = {
        {"any case, blanks around", u"Config"_s, u"ActiveTable"_s, u"Order Details"_s},
        {"the first of two lines, with an escape", u"Config"_s, u"open"_s, u"a\tb"_s},
        {"no line end at the end", u"TableView"_s, u"yesnoString"_s, u"Oui/Non"_s},
        {"a comment is no key", u"Config"_s, u"open2"_s, std::nullopt},
        {"a key of another section", u"Config"_s, u"yesnoString"_s, std::nullopt},
    };
    for (const auto& row : rows)
        EXPECT_EQ(profile.Find(row.section, row.key), row.value) << row.what;
}

TEST(ProfileText, TakesNothingFromDamagedLines)
{
    const QByteArray lines[] = {"key",           "key=\"open",      "key=\"a\" b",  "key=\"\\x\"",
                                "key=\"\\u12\"", "key=\"\\u12g4\"", "key=\xFF\xFE", "key=\"\\"};
    for (const QByteArray& line : lines)
        EXPECT_EQ(ProfileText("[S]\n" + line).Find(u"S"_s, u"key"_s), std::nullopt) << line.toStdString();
}

TEST(ProfileText, ChangesOneLineAndNoOther)
{
    const QByteArray before = "; a comment\r\n\r\n[Other]\r\nkey=\xFF damaged\r\n[Config]\r\nopen=1\r\nbroken\r\n";
    const struct {
        const char* what;
        QString section;
        QString key;
        QByteArray after;
    } rows[] = {
        {"a key that is there", u"Config"_s, u"open"_s, QByteArray(before).replace("open=1", "open=2")},
        {"a new key of a section", u"Config"_s, u"new"_s, QByteArray(before).replace("open=1", "open=1\r\nnew=2")},
        {"a new section", u"MainView"_s, u"new"_s, before + "\r\n[MainView]\r\nnew=2\r\n"},
        {"a damaged line of the key", u"Other"_s, u"key"_s, QByteArray(before).replace("\xFF damaged", "2")},
    };
    for (const auto& row : rows) {
        ProfileText profile(before);
        ASSERT_TRUE(profile.Set(row.section, row.key, u"2"_s)) << row.what;
        EXPECT_EQ(profile.Bytes(), row.after) << row.what;
    }
}

TEST(ProfileText, RefusesNamesThatNoLineCouldHold)
{
    ProfileText profile("[S]\nkey=1\n");
    for (const QString& name : {u""_s, u" key"_s, u"a=b"_s, u"a\nb"_s, u"[x"_s, u";key"_s}) {
        EXPECT_FALSE(profile.Set(u"S"_s, name, u"2"_s)) << name.toStdString();
        EXPECT_FALSE(profile.Set(name, u"key"_s, u"2"_s)) << name.toStdString();
    }
    EXPECT_EQ(profile.Bytes(), "[S]\nkey=1\n");
}

TEST(Profile, IsReadByEveryCall)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(u"new folder/Mirel.ini"_s);
    Profile one(path);
    const Profile other(path);
    EXPECT_EQ(other.ReadInt(u"Config"_s, u"openByDoubleClick"_s, 1), 1);
    EXPECT_TRUE(one.WriteInt(u"Config"_s, u"openByDoubleClick"_s, 0));
    EXPECT_TRUE(one.WriteText(u"Config"_s, u"ActiveTable"_s, u"12 apples"_s));
    EXPECT_EQ(other.ReadInt(u"Config"_s, u"openByDoubleClick"_s, 1), 0);
    EXPECT_EQ(other.ReadInt(u"Config"_s, u"ActiveTable"_s, 7), 7) << "a text that is no number";
    EXPECT_EQ(QDir(folder.filePath(u"new folder"_s)).entryList(QDir::Files), QStringList{u"Mirel.ini"_s});
}

TEST(Profile, SaysWhenItCannotBeWritten)
{
    const QTemporaryDir folder;
    Profile profile(folder.path()); // a folder where the file should be
    EXPECT_FALSE(profile.WriteInt(u"Config"_s, u"openByDoubleClick"_s, 0));
}

} // namespace
} // namespace mirel
