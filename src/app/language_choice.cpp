#include "app/language_choice.h"

#include "resources/language.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QRegularExpression>

#include <map>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const QString kEnglish = u"en"_s;
const QString kEnding = u".ts"_s;

// "de-Latn-AT": de_Latn_AT, de_Latn, de. Nothing of what is no code: it is about to become the name of a file.
QStringList FromNearToFar(QString code)
{
    static const QRegularExpression form(u"^[A-Za-z]{2,3}(_[A-Za-z0-9]{1,8}){0,3}$"_s);
    code.replace(u'-', u'_');
    QStringList codes;
    while (form.match(code).hasMatch()) {
        codes += code;
        code.truncate(code.lastIndexOf(u'_'));
        if (codes.last() == code)
            break;
    }
    return codes;
}

std::optional<LanguageTexts> Read(const QString& path)
{
    QFile file(path);
    if (!QFileInfo(path).isFile() || !file.open(QIODevice::ReadOnly))
        return std::nullopt;
    return LanguageTexts::Read(file.read(LanguageTexts::kLargestFileBytes + 1));
}

} // namespace

QList<LanguageFile> LanguagesIn(const QStringList& folders)
{
    std::map<QString, QString> paths;
    for (const QString& folder : folders) {
        for (const QFileInfo& file : QDir(folder).entryInfoList({u'*' + kEnding}, QDir::Files)) {
            if (!FromNearToFar(file.completeBaseName()).isEmpty())
                paths.emplace(file.completeBaseName(), file.filePath());
        }
    }
    paths.erase(kEnglish);
    QList<LanguageFile> languages = {{kEnglish, {}}};
    for (const auto& [code, path] : paths)
        languages += {code, path};
    return languages;
}

QString SpeakFirstOf(const QStringList& wanted, const QStringList& folders, QStringList& faults)
{
    Speak(std::nullopt);
    for (const QString& each : wanted) {
        for (const QString& code : FromNearToFar(each)) {
            if (code == kEnglish)
                return kEnglish;
            for (const QString& folder : folders) {
                const QString path = folder + u'/' + code + kEnding;
                if (!QFileInfo::exists(path))
                    continue;
                if (std::optional<LanguageTexts> texts = Read(path)) {
                    Speak(std::move(texts));
                    return code;
                }
                faults += path;
            }
        }
    }
    return kEnglish;
}

} // namespace mirel
