// Runs the program as users and scripts do.
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFileInfo>
#include <QImage>
#include <QProcess>
#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class ProgramTest : public ::testing::Test {
protected:
    int Run(const QStringList& arguments)
    {
        QProcess program;
        program.start(QStringLiteral(MIREL_WINDOW), QStringList{u"--home"_s, folder_.path()} + arguments);
        EXPECT_TRUE(program.waitForFinished(60'000));
        output_ = QString::fromUtf8(program.readAllStandardOutput());
        messages_ = QString::fromUtf8(program.readAllStandardError());
        return program.exitStatus() == QProcess::NormalExit ? program.exitCode() : -1;
    }
    QString PathOf(const QString& name) const { return QDir(folder_.path()).filePath(name); }

    QTemporaryDir folder_;
    QString output_;
    QString messages_;
};

TEST_F(ProgramTest, SaysWhereTheSampleIsAndMakesIt)
{
    EXPECT_EQ(Run({u"--print-sample-path"_s}), 0) << messages_.toStdString();
    EXPECT_EQ(output_, PathOf(u"Sample.cdb"_s) + u'\n');
    EXPECT_TRUE(QFileInfo::exists(PathOf(u"Sample.cdb"_s)));
}

TEST_F(ProgramTest, TakesPicturesWithoutADisplay)
{
    const QStringList size{u"--size"_s, u"480x400"_s, u"--palette"_s, u"dark"_s};
    EXPECT_EQ(Run(QStringList{u"--picture"_s, PathOf(u"empty.png"_s)} + size), 0) << messages_.toStdString();
    EXPECT_EQ(Run(QStringList{u"--picture"_s, PathOf(u"main.png"_s), u"--sample"_s} + size), 0);
    EXPECT_EQ(
        Run(QStringList{u"--picture"_s, PathOf(u"table.png"_s), u"--sample"_s, u"--table"_s, u"Bird Strikes"_s} +
            size),
        0);
    QList<QImage> pictures;
    for (const QString& name : {u"empty.png"_s, u"main.png"_s, u"table.png"_s}) {
        const QImage picture(PathOf(name));
        EXPECT_EQ(picture.size(), QSize(480, 400)) << name.toStdString();
        EXPECT_FALSE(pictures.contains(picture)) << name.toStdString();
        pictures += picture;
    }
    EXPECT_LT(pictures[0].pixelColor(470, 200).lightness(), 100) << "it is to be dark";
    EXPECT_FALSE(QFileInfo::exists(PathOf(u"Mirel.ini"_s))) << "the user's next window opens what it had open";
}

TEST_F(ProgramTest, FailsWithAWordAndAStatus)
{
    struct Row {
        QStringList arguments;
        int status;
        QString said;
    };
    const Row rows[] = {
        {{u"--pallette"_s}, 2, u"pallette"_s},
        {{u"--language"_s, u"../de"_s}, 2, u"--language"_s},
        {{u"--picture"_s, PathOf(u"p.png"_s), u"--sample"_s, u"--table"_s, u"Bees"_s}, 1, u"table"_s},
        {{u"--picture"_s, PathOf(u"no/such/folder/p.png"_s)}, 1, u"p.png"_s},
        {{u"--picture"_s, PathOf(u"p.png"_s), PathOf(u"gone.cdb"_s)}, 1, u"gone.cdb"_s},
    };
    for (const Row& row : rows) {
        EXPECT_EQ(Run(row.arguments), row.status) << row.arguments.join(u' ').toStdString();
        EXPECT_TRUE(messages_.contains(row.said)) << messages_.toStdString();
    }
    EXPECT_FALSE(QFileInfo::exists(PathOf(u"p.png"_s)));
}

TEST_F(ProgramTest, SpeaksTheLanguageThatItIsToldAndOtherwiseEnglish)
{
    const auto picture = [this](const QString& language) {
        const QString path = PathOf(language + u".png"_s);
        EXPECT_EQ(Run({u"--picture"_s, path, u"--size"_s, u"480x400"_s, u"--language"_s, language}), 0)
            << messages_.toStdString();
        return QImage(path);
    };
    const QImage english = picture(u"en"_s);
    EXPECT_NE(picture(u"de"_s), english);
    EXPECT_EQ(picture(u"xx"_s), english);
    // The user's own file comes first, and does no harm: here the bytes of a picture.
    ASSERT_TRUE(QDir(folder_.path()).mkdir(u"Languages"_s));
    ASSERT_TRUE(QFile::copy(PathOf(u"en.png"_s), PathOf(u"Languages/xx.ts"_s)));
    EXPECT_EQ(picture(u"xx"_s), english);
    EXPECT_TRUE(messages_.contains(u"cannot read the language file"_s)) << messages_.toStdString();
    QFile own(PathOf(u"Languages/de.ts"_s));
    ASSERT_TRUE(own.open(QIODevice::WriteOnly));
    own.write("<TS language=\"de\"></TS>"); // translates nothing
    own.close();
    EXPECT_EQ(picture(u"de"_s), english);
}

} // namespace
} // namespace mirel
