// The main program of every test of core: an application object without windows, the US English locale (what
// tests write is what they read anywhere) and no folder of the user's.
#include "platform/user_locale.h"

#include <gtest/gtest.h>

#include <QCoreApplication>
#include <QLocale>
#include <QTemporaryDir>

int main(int argc, char** argv)
{
    ::testing::InitGoogleTest(&argc, argv);
    const QTemporaryDir home;
    qputenv("MIREL_HOME", home.path().toUtf8());
    const QCoreApplication application(argc, argv);
    mirel::UserLocale::SetCurrent(QLocale(QLocale::English, QLocale::UnitedStates));
    return RUN_ALL_TESTS();
}
