#include "platform/system_reason.h"

#include "support/printing.h"
#include "support/spoken_language.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TEST(SystemReason, IsToldInTheLanguageOfTheProgram)
{
    const QTemporaryDir folder;
    const QString file = folder.filePath(u"file"_s);
    ASSERT_TRUE(QFile(file).open(QIODevice::WriteOnly));
    const struct {
        const char* what;
        QString path;
        QString english;
        QString german;
    } rows[] = {
        {"missing", folder.filePath(u"none/file"_s), u"No such file or directory"_s,
         u"Datei oder Ordner nicht gefunden"_s},
        {"a file as a folder", file + u"/file"_s, u"Not a directory"_s, u"Ein Teil des Pfads ist kein Ordner"_s},
        {"a long name", folder.filePath(QString(300, u'x')), u"File name too long"_s,
         u"Der Dateiname ist zu lang"_s},
    };
    for (const auto& row : rows) {
        QFile device(row.path);
        ASSERT_FALSE(device.open(QIODevice::ReadWrite)) << row.what;
        EXPECT_EQ(SystemReason(device), row.english) << row.what;
        const SpokenIn german(u"de"_s);
        EXPECT_EQ(SystemReason(device), row.german) << row.what;
    }
}

TEST(SystemReason, KnowsAFullDiskAndLeavesOtherWordsAlone)
{
    const SpokenIn german(u"de"_s);
    QFile full(u"/dev/full"_s);
    ASSERT_TRUE(full.open(QIODevice::WriteOnly | QIODevice::Unbuffered));
    ASSERT_EQ(full.write("x"), -1);
    EXPECT_EQ(SystemReason(full), u"Auf dem Datenträger ist kein Platz mehr"_s);
    class Device : public QFile {
    public:
        Device() { setErrorString(u"paper jam"_s); }
    };
    EXPECT_EQ(SystemReason(Device()), u"paper jam"_s);
}

} // namespace
} // namespace mirel
