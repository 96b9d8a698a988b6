// As test_main.cpp, with an application object for widgets on the offscreen platform.
#include "platform/user_locale.h"

#include <gtest/gtest.h>

#include <QApplication>
#include <QLocale>
#include <QTemporaryDir>

int main(int argc, char** argv)
{
    ::testing::InitGoogleTest(&argc, argv);
    // Also when the build asks for the list of tests, without the tests' environment.
    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    const QTemporaryDir home;
    qputenv("MIREL_HOME", home.path().toUtf8());
    const QApplication application(argc, argv);
    QApplication::setStyle(QStringLiteral("Fusion"));
    mirel::UserLocale::SetCurrent(QLocale(QLocale::English, QLocale::UnitedStates));
    return RUN_ALL_TESTS();
}
