#pragma once

#include "resources/language.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>

namespace mirel {

// The languages that the program comes with.
inline QString LanguageFolder()
{
    return QStringLiteral(MIREL_SOURCE_DIR "/src/resources/languages");
}

inline QByteArray LanguageBytes(const QString& code)
{
    QFile file(QDir(LanguageFolder()).filePath(code + QStringLiteral(".ts")));
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << file.fileName().toStdString();
    return file.readAll();
}

// All texts are in that language as long as it lives.
class SpokenIn {
public:
    explicit SpokenIn(const QString& code)
    {
        std::optional<LanguageTexts> texts = LanguageTexts::Read(LanguageBytes(code));
        EXPECT_TRUE(texts);
        Speak(std::move(texts));
    }
    ~SpokenIn() { Speak(std::nullopt); }
    Q_DISABLE_COPY_MOVE(SpokenIn)
};

} // namespace mirel
