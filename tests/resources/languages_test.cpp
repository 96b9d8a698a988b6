// Every language file holds what the table of texts holds, and nothing that a person wrote into one can do harm.
#include "resources/language.h"
#include "resources/string_rows.h"
#include "resources/string_table.h"
#include "support/printing.h"
#include "support/spoken_language.h"

#include <QRegularExpression>
#include <QXmlStreamReader>

#include <map>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

struct Message {
    QString id;
    QString source;
    QStringList forms;
    bool finished = true;
};

QList<Message> MessagesOf(const QString& code)
{
    QList<Message> messages;
    const QByteArray bytes = LanguageBytes(code);
    QXmlStreamReader xml(bytes);
    while (!xml.atEnd()) {
        if (xml.readNext() != QXmlStreamReader::StartElement)
            continue;
        if (xml.name() == u"message")
            messages += {xml.attributes().value(u"id"_s).toString(), {}, {}, true};
        else if (xml.name() == u"source")
            messages.last().source = xml.readElementText();
        else if (xml.name() == u"translation")
            messages.last().finished = !xml.attributes().hasAttribute(u"type"_s);
        if (xml.name() == u"numerusform")
            messages.last().forms += xml.readElementText();
        else if (xml.name() == u"translation" && xml.readNext() == QXmlStreamReader::Characters &&
                 !xml.text().trimmed().isEmpty())
            messages.last().forms += xml.text().toString();
    }
    EXPECT_FALSE(xml.hasError()) << xml.errorString().toStdString();
    return messages;
}

QString English(const StringRow& row)
{
    return QStringView(row.text).toString().replace(u"\r\n"_s, u"\n"_s);
}

QStringList PlaceholdersOf(const QString& text)
{
    static const QRegularExpression placeholder(u"%[1-9]"_s);
    QStringList found;
    auto matches = placeholder.globalMatch(text);
    while (matches.hasNext())
        found += matches.next().captured();
    found.sort();
    found.removeDuplicates();
    return found;
}

// What the end of a text says: more follows, a value follows.
QString EndOf(QString text)
{
    text.replace(u"..."_s, u"…"_s);
    static const QRegularExpression end(u"[…:?]+\\s*$"_s);
    return end.match(text).captured().trimmed() + (text.endsWith(u' ') ? u" "_s : QString());
}

QString AllOf(const QStringList& lines)
{
    return u'\n' + lines.join(u'\n');
}

class Languages : public ::testing::TestWithParam<QString> {};

QStringList CodesOfFiles()
{
    QStringList codes;
    for (const QString& name : QDir(LanguageFolder()).entryList({u"*.ts"_s}))
        codes += name.chopped(3);
    return codes;
}

INSTANTIATE_TEST_SUITE_P(Files, Languages, ::testing::ValuesIn(CodesOfFiles()),
                         [](const auto& each) { return each.param.toStdString(); });

TEST_P(Languages, TranslateEveryTextOnce)
{
    std::map<QString, int> times;
    QStringList unfinished;
    for (const Message& message : MessagesOf(GetParam())) {
        ++times[message.id];
        const StringRow* row = FindStringRow(Str(message.id.toInt()));
        const bool isEmpty = row && row->text.empty();
        const bool translated = isEmpty || (!message.forms.isEmpty() && !message.forms.contains(QString()));
        if (!message.finished || !translated)
            unfinished += message.id + u' ' + message.source;
        if (row) {
            EXPECT_EQ(message.source, English(*row)) << "the English text has changed: run scripts/languages";
        }
    }
    QStringList missing;
    QStringList superfluous;
    QStringList doubled;
    for (const StringRow& row : StringRows()) {
        if (!times.contains(QString::number(int(row.id))))
            missing += u"%1 %2"_s.arg(QString::number(int(row.id)), English(row));
    }
    for (const auto& [id, count] : times) {
        if (!FindStringRow(Str(id.toInt())))
            superfluous += id;
        if (count > 1)
            doubled += id;
    }
    EXPECT_TRUE(missing.isEmpty()) << "missing, run scripts/languages and translate:"
                                   << AllOf(missing).toStdString();
    EXPECT_TRUE(unfinished.isEmpty()) << "not translated:" << AllOf(unfinished).toStdString();
    EXPECT_TRUE(superfluous.isEmpty()) << "no longer in the table:" << AllOf(superfluous).toStdString();
    EXPECT_TRUE(doubled.isEmpty()) << "more than once:" << AllOf(doubled).toStdString();
}

TEST_P(Languages, ArePartsOfTheProgram)
{
    QFile list(QStringLiteral(MIREL_SOURCE_DIR "/src/resources/languages.qrc"));
    ASSERT_TRUE(list.open(QIODevice::ReadOnly));
    EXPECT_TRUE(list.readAll().contains("<file>languages/" + GetParam().toUtf8() + ".ts</file>"));
    EXPECT_EQ(LanguageTexts::Read(LanguageBytes(GetParam()))->Code(), GetParam());
}

TEST_P(Languages, KeepPlaceholdersLinesEndsAndLetters)
{
    for (const Message& message : MessagesOf(GetParam())) {
        const StringRow* row = FindStringRow(Str(message.id.toInt()));
        if (!row)
            continue;
        const QString english = English(*row);
        const QStringList wanted = PlaceholdersOf(english);
        for (qsizetype form = 0; form < message.forms.size(); ++form) {
            const QString& text = message.forms[form];
            const std::string where = (message.id + u": "_s + text).toStdString();
            QStringList found = PlaceholdersOf(text);
            // "The record" may stand for "%1 record".
            if (row->counted > 0 && form == 0 && message.forms.size() > 1 && found.size() < wanted.size()) {
                found += u"%%1"_s.arg(row->counted);
                found.sort();
            }
            EXPECT_EQ(found, wanted) << where;
            EXPECT_EQ(text.count(u'\n'), english.count(u'\n')) << where;
            EXPECT_EQ(EndOf(text), EndOf(english)) << where;
            EXPECT_EQ(text.count(u'&') > 0, english.count(u'&') > 0) << where;
            EXPECT_FALSE(text.contains(u'"') && english.contains(u'"') && !english.contains(u"(0,1,"_s))
                << where << ": quotation marks of another language";
        }
        EXPECT_TRUE(row->counted == 0 || message.forms.size() == PluralRuleOf(GetParam()).forms)
            << message.id.toStdString();
        EXPECT_TRUE(row->counted > 0 || message.forms.size() <= 1) << message.id.toStdString();
    }
}

TEST(Plurals, TakeTheFormOfTheirNumber)
{
    struct Row {
        const char* language;
        std::vector<quint64> numbers;
        std::vector<int> forms;
    };
    for (const Row& row :
         {Row{"de", {0, 1, 2, 101}, {1, 0, 1, 1}}, Row{"fr", {0, 1, 2}, {0, 0, 1}},
          Row{"fr_CA", {0, 1, 2}, {0, 0, 1}}, Row{"pt", {0, 1, 2}, {1, 0, 1}}, Row{"pt_BR", {0, 1, 2}, {0, 0, 1}},
          Row{"ja", {0, 1, 2}, {0, 0, 0}},
          Row{"ru", {1, 2, 5, 11, 12, 21, 22, 111, 112}, {0, 1, 2, 2, 2, 0, 1, 2, 2}},
          Row{"pl", {1, 2, 5, 12, 21, 22, 112}, {0, 1, 2, 2, 2, 1, 2}},
          Row{"cs", {1, 2, 4, 5, 22}, {0, 1, 1, 2, 2}}, Row{"sl", {1, 2, 3, 5, 101, 102}, {0, 1, 2, 3, 0, 1}},
          Row{"ar", {0, 1, 2, 3, 10, 11, 99, 100, 103}, {0, 1, 2, 3, 3, 4, 4, 5, 3}},
          Row{"unknown", {0, 1, 2}, {1, 0, 1}}}) {
        const PluralRule& rule = PluralRuleOf(QString::fromLatin1(row.language));
        for (size_t i = 0; i < row.numbers.size(); ++i) {
            EXPECT_EQ(rule.formOf(row.numbers[i]), row.forms[i]) << row.language << " " << row.numbers[i];
            EXPECT_LT(rule.formOf(row.numbers[i]), rule.forms) << row.language;
        }
    }
}

TEST(Plurals, AreChosenByTheArgumentThatCounts)
{
    EXPECT_EQ(StringText(Str::SummaryRecords, {u"1"_s}), u"1 record"_s);
    EXPECT_EQ(StringText(Str::SummaryRecords, {u"1,001"_s}), u"1,001 records"_s);
    EXPECT_EQ(StringText(Str::DesignDropTable, {u"1"_s, u"2"_s}).section(u'\n', 1),
              u"It holds 2 records, which go with it."_s);
    const SpokenIn german(u"de"_s);
    EXPECT_EQ(StringText(Str::SummaryRecords, {u"1"_s}), u"1 Datensatz"_s);
    EXPECT_EQ(StringText(Str::SummaryRecords, {u"1.001"_s}), u"1.001 Datensätze"_s);
    EXPECT_EQ(StringText(Str::RecordsImported, {u"1"_s}), u"1 Datensatz importiert."_s);
    EXPECT_EQ(StringText(Str::DesignDropField, {u"1"_s, u"1"_s}).section(u"\r\n"_s, 1),
              u"Es enthält 1 Wert, der mit ihm verloren geht."_s);
}

// --- files that somebody has made -----------------------------------------------------------------------------

QByteArray File(const QByteArray& inside, const QByteArray& language = "de")
{
    return "<?xml version=\"1.0\"?>\n<!DOCTYPE TS>\n<TS version=\"2.1\" language=\"" + language +
           "\"><context><name></name>" + inside + "</context></TS>";
}

QString Spoken(const QByteArray& file, Str id, const QStringList& arguments = {})
{
    Speak(LanguageTexts::Read(file));
    const QString text = StringText(id, arguments);
    Speak(std::nullopt);
    return text;
}

TEST(LanguageFile, ReplacesWhatItTranslatesAlone)
{
    const QByteArray file =
        File("<message id=\"57710\"><source>x</source><translation>Sichern?</translation></message>"
             "<message id=\"57672\"><translation>Weg: %1\nWirklich?</translation></message>");
    EXPECT_EQ(Spoken(file, Str::SaveChangesQuestion), u"Sichern?"_s);
    EXPECT_EQ(Spoken(file, Str::DeleteDatabaseReally, {u"a.cdb"_s}), u"Weg: a.cdb\r\nWirklich?"_s);
    EXPECT_EQ(Spoken(file, Str::ContinueQuestion), u"Continue ?"_s);
}

TEST(LanguageFile, LeavesOddMessagesEnglish)
{
    const struct {
        const char* what;
        QByteArray message;
    } rows[] = {
        {"empty", R"(<message id="57710"><translation></translation></message>)"},
        {"an empty form",
         R"(<message id="57710"><translation><numerusform>a</numerusform><numerusform></numerusform></translation></message>)"},
        {"gone from the table", R"(<message id="57710"><translation type="vanished">x</translation></message>)"},
        {"no number", R"(<message id="five"><translation>x</translation></message>)"},
        {"no such number", R"(<message id="1"><translation>x</translation></message>)"},
        {"larger than a number", R"(<message id="99999999999999999999"><translation>x</translation></message>)"},
        {"no id", R"(<message><translation>x</translation></message>)"},
        {"nothing in it", R"(<message id="57710"/>)"},
        {"another translation inside", R"(<message id="57710"><a><translation>x</translation></a></message>)"},
    };
    for (const auto& row : rows) {
        EXPECT_EQ(Spoken(File(row.message), Str::SaveChangesQuestion), u"Save changes?"_s) << row.what;
    }
    // More placeholders than arguments, fewer forms than plurals: the texts stand as they are.
    EXPECT_EQ(Spoken(File(R"(<message id="61107"><translation>%9 %1 %</translation></message>)"),
                     Str::RecordsExported, {u"3"_s}),
              u"%9 3 %"_s);
}

TEST(LanguageFile, IsRefusedWhenItIsNone)
{
    const QByteArray whole = LanguageBytes(u"de"_s);
    ASSERT_TRUE(LanguageTexts::Read(whole));
    const QByteArray bomb =
        "<?xml version=\"1.0\"?><!DOCTYPE TS [<!ENTITY a \"aaaaaaaaaa\"><!ENTITY b "
        "\"&a;&a;&a;&a;&a;&a;&a;&a;&a;&a;\"><!ENTITY c \"&b;&b;&b;&b;&b;&b;&b;&b;&b;&b;\"><!ENTITY "
        "d \"&c;&c;&c;&c;&c;&c;&c;&c;&c;&c;\">]><TS language=\"de\"><message "
        "id=\"57710\"><translation>&d;</translation></message></TS>";
    const struct {
        const char* what;
        QByteArray bytes;
    } rows[] = {
        {"nothing", {}},
        {"no XML", "Guten Tag"},
        {"another XML", "<html><TS/></html>"},
        {"bytes of a program", QByteArray("\x7f"
                                          "ELF\0\1\2\3",
                                          8)},
        {"NULs", QByteArray(1000, '\0')},
        {"a quarter of it", whole.left(whole.size() / 4)},
        {"all but its end", whole.chopped(4)},
        {"one letter gone", QByteArray(whole).replace("</context>", "</contex>")},
        {"too large", File(QByteArray(LanguageTexts::kLargestFileBytes, ' '))},
        {"an entity of entities", bomb},
        {"nested without an end", "<TS>" + QByteArray("<a>").repeated(50'000)},
    };
    for (const auto& row : rows) {
        EXPECT_FALSE(LanguageTexts::Read(row.bytes)) << row.what;
        EXPECT_EQ(Spoken(row.bytes, Str::SaveChangesQuestion), u"Save changes?"_s) << row.what;
    }
}

TEST(LanguageFile, BearsBeingCutAnywhere)
{
    const QByteArray file =
        File("<message id=\"61107\" numerus=\"yes\"><source>a &amp; b</source><translation><numerusform>%1 x"
             "</numerusform><numerusform>%1 \xc3\xa4</numerusform></translation></message>");
    EXPECT_EQ(Spoken(file, Str::RecordsExported, {u"2"_s}), u"2 ä"_s);
    for (qsizetype length = 0; length < file.size(); ++length)
        EXPECT_FALSE(LanguageTexts::Read(file.left(length))) << length;
}

} // namespace
} // namespace mirel
