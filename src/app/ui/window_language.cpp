#include "app/ui/window_language.h"

#include "app/language_choice.h"
#include "app/settings.h"
#include "platform/program_folder.h"
#include "platform/ui/dialog_buttons.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QCoreApplication>
#include <QDialog>
#include <QDialogButtonBox>
#include <QDir>
#include <QLabel>
#include <QLibraryInfo>
#include <QListWidget>
#include <QLocale>
#include <QTranslator>
#include <QVBoxLayout>

#include <cstdio>
#include <memory>

// A resource in a static library is linked only when it is asked for; the macro wants the global namespace.
static void LinkTexts()
{
    Q_INIT_RESOURCE(languages);
}

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const QString kBuiltIn = u":/languages"_s;

QStringList FoldersOf(const ProgramFolder& folder)
{
    LinkTexts();
    return {QDir(folder.path).filePath(u"Languages"_s), kBuiltIn};
}

// The texts of Qt's own parts: Cancel, the calendar, the file dialog. They come with Qt; without them these stay
// English.
void UseQtTextsOf(const QString& code)
{
    auto translator = std::make_unique<QTranslator>(QCoreApplication::instance());
    if (translator->load(QLocale(code), u"qtbase"_s, u"_"_s, QLibraryInfo::path(QLibraryInfo::TranslationsPath)))
        QCoreApplication::installTranslator(translator.release());
}

QString NameOf(const QString& code)
{
    if (code == u"en")
        return u"English"_s; // without a country
    const QString name = QLocale(code).nativeLanguageName();
    if (name.isEmpty())
        return code;
    const QString country = code.contains(u'_') ? u" (%1)"_s.arg(QLocale(code).nativeCountryName()) : QString();
    return name.left(1).toUpper() + name.mid(1) + country;
}

} // namespace

void UseLanguage(const QString& fromCommandLine, const ProgramFolder& folder, const Settings& settings)
{
    QStringList wanted = {fromCommandLine.isEmpty() ? settings.Text(Setting::MainViewLanguage) : fromCommandLine};
    if (wanted.first().isEmpty())
        wanted = QLocale::system().uiLanguages();
    QStringList faults;
    const QString code = SpeakFirstOf(wanted, FoldersOf(folder), faults);
    for (const QString& path : faults)
        std::fputs(u"mirel: cannot read the language file %1\n"_s.arg(path).toUtf8().constData(), stderr);
    if (code != u"en")
        UseQtTextsOf(code);
}

void ChooseLanguage(const ProgramFolder& folder, Settings& settings, QWidget& window)
{
    QDialog dialog(&window);
    dialog.setObjectName(u"language"_s);
    dialog.setWindowTitle(StringText(Str::LanguageTitle));
    auto* prompt = new QLabel(StringText(Str::LanguagePrompt), &dialog);
    prompt->setWordWrap(true);
    auto* list = new QListWidget(&dialog);
    prompt->setBuddy(list);
    list->setAccessibleName(dialog.windowTitle());
    new QListWidgetItem(StringText(Str::LanguageOfSystem), list);
    list->setCurrentRow(0);
    for (const LanguageFile& language : LanguagesIn(FoldersOf(folder))) {
        auto* item = new QListWidgetItem(NameOf(language.code), list);
        item->setData(Qt::UserRole, language.code);
        if (language.code == settings.Text(Setting::MainViewLanguage))
            list->setCurrentItem(item);
    }
    auto* note = new QLabel(StringText(Str::LanguageNextStart), &dialog);
    note->setWordWrap(true);
    QDialogButtonBox* buttons = OkAndCancel(dialog);
    QObject::connect(list, &QListWidget::itemDoubleClicked, &dialog, &QDialog::accept);
    auto* lines = new QVBoxLayout(&dialog);
    for (QWidget* part : {static_cast<QWidget*>(prompt), static_cast<QWidget*>(list), static_cast<QWidget*>(note),
                          static_cast<QWidget*>(buttons)})
        lines->addWidget(part);
    list->setFocus();
    FillSmallWindow(dialog, window);
    if (dialog.exec() == QDialog::Accepted)
        settings.SetText(Setting::MainViewLanguage, list->currentItem()->data(Qt::UserRole).toString());
}

} // namespace mirel
