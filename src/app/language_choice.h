#pragma once

#include <QString>
#include <QStringList>

namespace mirel {

// The files of languages: <code>.ts in the folders given, of which an earlier one comes first. English is the
// table of texts itself and has no file.
struct LanguageFile {
    QString code; // "de", "pt_BR"; "en" has no path
    QString path;
};

// English, then each language once, by code.
QList<LanguageFile> LanguagesIn(const QStringList& folders);

// The first of `wanted` ("de-AT", "fr") that is English or has a file that reads; "de_AT" is looked for before
// "de". From then on the texts speak it. Gives its code, "en" when it is English. What does not read is added to
// `faults`.
QString SpeakFirstOf(const QStringList& wanted, const QStringList& folders, QStringList& faults);

} // namespace mirel
