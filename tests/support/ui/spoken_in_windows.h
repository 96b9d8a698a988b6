#pragma once

#include "support/spoken_language.h"

#include <QCoreApplication>
#include <QLibraryInfo>
#include <QTranslator>

namespace mirel {

// As SpokenIn, with the texts of Qt's own parts, where they are installed.
class SpokenInWindows {
public:
    explicit SpokenInWindows(const QString& code)
        : texts_(code)
    {
        if (qt_.load(QLocale(code), QStringLiteral("qtbase"), QStringLiteral("_"),
                     QLibraryInfo::path(QLibraryInfo::TranslationsPath)))
            QCoreApplication::installTranslator(&qt_);
    }
    ~SpokenInWindows() { QCoreApplication::removeTranslator(&qt_); }
    Q_DISABLE_COPY_MOVE(SpokenInWindows)

private:
    SpokenIn texts_;
    QTranslator qt_;
};

} // namespace mirel
