// Which file of a language is taken: the user's own before the program's, the nearer one before the farther.
#include "app/language_choice.h"
#include "resources/language.h"
#include "resources/string_table.h"
#include "support/printing.h"
#include "support/spoken_language.h"

#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class LanguageChoice : public ::testing::Test {
protected:
    void TearDown() override { Speak(std::nullopt); }

    void Write(const QString& name, const QByteArray& word)
    {
        QFile file(own_.filePath(name));
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write("<TS version=\"2.1\" language=\"de\"><context><message id=\"57710\"><translation>" + word +
                   "</translation></message></context></TS>");
    }
    QString SpokenOf(const QStringList& wanted)
    {
        faults_.clear();
        const QString code = SpeakFirstOf(wanted, {own_.path(), LanguageFolder()}, faults_);
        return code + u": "_s + StringText(Str::SaveChangesQuestion);
    }

    QTemporaryDir own_;
    QStringList faults_;
};

TEST_F(LanguageChoice, TakesTheFirstThatThereIs)
{
    const struct {
        QStringList wanted;
        QString spoken;
    } rows[] = {
        {{u"de"_s}, u"de: Änderungen speichern?"_s},
        {{u"de-AT"_s, u"de"_s}, u"de: Änderungen speichern?"_s},
        {{u"de_Latn_CH"_s}, u"de: Änderungen speichern?"_s},
        {{u"xx"_s, u"de"_s}, u"de: Änderungen speichern?"_s},
        {{u"en-GB"_s, u"de"_s}, u"en: Save changes?"_s},
        {{u"C"_s}, u"en: Save changes?"_s},
        {{}, u"en: Save changes?"_s},
        {{u""_s, u"../de"_s, u"/de"_s, u"d"_s, u"de_"_s}, u"en: Save changes?"_s},
    };
    for (const auto& row : rows)
        EXPECT_EQ(SpokenOf(row.wanted), row.spoken) << row.wanted.join(u' ').toStdString();
}

TEST_F(LanguageChoice, LooksIntoTheUsersFolderFirst)
{
    Write(u"de.ts"_s, "Sichern?");
    Write(u"de_AT.ts"_s, "Behalten?");
    Write(u"nl.ts"_s, "Bewaren?");
    EXPECT_EQ(SpokenOf({u"de-DE"_s}), u"de: Sichern?"_s);
    EXPECT_EQ(SpokenOf({u"de-AT"_s}), u"de_AT: Behalten?"_s);
    EXPECT_EQ(SpokenOf({u"nl"_s}), u"nl: Bewaren?"_s);
    QStringList codes;
    for (const LanguageFile& language : LanguagesIn({own_.path(), LanguageFolder()}))
        codes += language.code;
    EXPECT_EQ(codes, QStringList({u"en"_s, u"de"_s, u"de_AT"_s, u"nl"_s}));
}

TEST_F(LanguageChoice, GoesOnToTheNextFolderWhenAFileDoesNotRead)
{
    QFile broken(own_.filePath(u"de.ts"_s));
    ASSERT_TRUE(broken.open(QIODevice::WriteOnly));
    broken.write("<TS><message id=\"57710\"><translation>Halb");
    broken.close();
    EXPECT_EQ(SpokenOf({u"de"_s}), u"de: Änderungen speichern?"_s);
    EXPECT_EQ(faults_, QStringList{broken.fileName()});
    ASSERT_TRUE(QDir(own_.path()).mkdir(u"fr.ts"_s)); // a folder of that name
    EXPECT_EQ(SpokenOf({u"fr"_s}), u"en: Save changes?"_s);
    EXPECT_EQ(SpeakFirstOf({u"de"_s}, {broken.fileName()}, faults_), u"en"_s) << "the folder is a file";
}

} // namespace
} // namespace mirel
