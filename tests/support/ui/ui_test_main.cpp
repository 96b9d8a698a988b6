// As test_main.cpp, with an application object for widgets on the offscreen platform.
#include "platform/user_locale.h"

#include <gtest/gtest.h>

#include <QApplication>
#include <QDir>
#include <QFile>
#include <QLocale>
#include <QTemporaryDir>

namespace {

// The platform's own screen is too small for a large window. Answers the path of the description.
QString DescribeScreen(const QString& folder)
{
    QFile file(QDir(folder).filePath(QStringLiteral("screen.json")));
    const bool written =
        file.open(QIODevice::WriteOnly) &&
        file.write(R"({"synchronousWindowSystemEvents": false, "windowFrameMargins": false, "screens": [{
            "name": "large", "x": 0, "y": 0, "width": 4000, "height": 3000,
            "logicalDpi": 96, "logicalBaseDpi": 96, "dpr": 1}]})") > 0;
    return written ? file.fileName() : QString();
}

} // namespace

int main(int argc, char** argv)
{
    ::testing::InitGoogleTest(&argc, argv);
    const QTemporaryDir home;
    qputenv("MIREL_HOME", home.path().toUtf8());
    // Also when the build asks for the list of tests, without the tests' environment.
    if (const QByteArray platform = qgetenv("QT_QPA_PLATFORM"); platform.isEmpty() || platform == "offscreen")
        qputenv("QT_QPA_PLATFORM", "offscreen:configfile=" + DescribeScreen(home.path()).toUtf8());
    const QApplication application(argc, argv);
    QApplication::setStyle(QStringLiteral("Fusion"));
    mirel::UserLocale::SetCurrent(QLocale(QLocale::English, QLocale::UnitedStates));
    return RUN_ALL_TESTS();
}
