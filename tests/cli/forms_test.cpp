// The commands of forms as a script meets them.
#include "forms/form_file.h"
#include "forms/form_fixture.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>
#include <QTemporaryDir>

namespace {

using namespace mirel;
using namespace Qt::StringLiterals;

class FormsCommands : public ::testing::Test {
protected:
    struct Ended {
        int status;
        QString out;
        QString err;
    };

    FormsCommands()
    {
        Do({u"new"_s, u"a.cdb"_s});
        Sql(u"CREATE TABLE [My Birds] (ID Integer, Name Varchar(20), Wild Bit)"_s);
        for (const QString& values : {u"1,'Osprey',1"_s, u"2,'Gull',0"_s, u"3,'Tern',1"_s})
            Sql(u"INSERT INTO [My Birds] (ID,Name,Wild) VALUES(%1)"_s.arg(values));
        EXPECT_EQ(Do({u"forms"_s, u"default"_s, u"a.cdb"_s, u"My Birds"_s}), u"DefaultForm\n"_s);
    }

    Ended Run(const QStringList& words) const
    {
        QProcess process;
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        environment.insert(u"MIREL_HOME"_s, folder_.filePath(u"home"_s));
        environment.insert(u"LC_ALL"_s, u"C"_s);
        process.setProcessEnvironment(environment);
        process.setWorkingDirectory(folder_.path());
        process.start(QStringLiteral(MIREL_CLI), words);
        EXPECT_TRUE(process.waitForFinished());
        return {process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -1,
                QString::fromUtf8(process.readAllStandardOutput()),
                QString::fromUtf8(process.readAllStandardError())};
    }
    QString Do(const QStringList& words) const
    {
        const Ended ended = Run(words);
        EXPECT_EQ(ended.status, 0) << words.join(u' ').toStdString() << ": " << ended.err.toStdString();
        return ended.out;
    }
    QString Sql(const QString& statement) const
    {
        return Do({u"sql"_s, u"a.cdb"_s, statement, u"--format"_s, u"csv"_s});
    }
    Ended Show(const QStringList& options) const
    {
        return Run(QStringList{u"forms"_s, u"show"_s, u"a.cdb"_s, u"DefaultForm"_s, u"--format"_s, u"json"_s} +
                   options);
    }
    // "record/records", then what the controls show that hold a value.
    QString Shown(const QStringList& options) const
    {
        const Ended ended = Show(options);
        EXPECT_EQ(ended.status, 0) << ended.err.toStdString();
        const QJsonObject form = QJsonDocument::fromJson(ended.out.toUtf8()).object();
        QString shown = u"%1/%2"_s.arg(form[u"record"].toInt()).arg(form[u"records"].toInt());
        for (const QJsonValue& control : form[u"controls"].toArray()) {
            const int type = control[u"type"].toInt();
            if (type == 201 || type == 205)
                shown += u' ' + control[u"text"].toString();
        }
        return shown;
    }

    QTemporaryDir folder_;
};

TEST_F(FormsCommands, ShowAFormOnARecordOfAQuery)
{
    EXPECT_EQ(Shown({}), u"1/3 1/3 1 Osprey 1"_s);
    EXPECT_EQ(Shown({u"--record"_s, u"2"_s}), u"2/3 2/3 2 Gull 0"_s);
    EXPECT_EQ(Shown({u"--query"_s, u"SELECT * WHERE Wild=1"_s, u"--record"_s, u"2"_s}), u"2/2 2/2 3 Tern 1"_s);
    EXPECT_EQ(Shown({u"--query"_s, u"SELECT * WHERE ID=9"_s}), u"0/0    0"_s);
    for (const QString& none : {u"0"_s, u"4"_s})
        EXPECT_EQ(Show({u"--record"_s, none}).status, 1) << none.toStdString();
    EXPECT_EQ(Show({u"--query"_s, u"SELECT * FROM Nowhere"_s}).status, 1);
}

TEST_F(FormsCommands, SetAndPressInTheirOrder)
{
    EXPECT_EQ(Shown({u"--set"_s, u"Name=A=B"_s, u"--set"_s, u"Wild=No"_s, u"--press"_s, u"SAVE"_s}),
              u"1/3 1/3 1 A=B 0"_s);
    EXPECT_EQ(Shown({u"--press"_s, u"SAVE"_s, u"--set"_s, u"Name=late"_s}), u"1/3 1/3 1 late 0"_s);
    EXPECT_EQ(Sql(u"SELECT Name FROM [My Birds] WHERE ID=1"_s), u"Name\nA=B\n"_s);
    const struct {
        QStringList options;
        int status;
        QString fault;
    } rows[] = {
        {{u"--set"_s, u"Nobody=1"_s}, 1, u"no control \"Nobody\""_s},
        {{u"--press"_s, u"NOPE"_s}, 1, u"no button \"NOPE\""_s},
        {{u"--press"_s, u"Name"_s}, 1, u"no button \"Name\""_s},
        {{u"--set"_s, u"Wild=maybe"_s}, 1, u"\"maybe\" is no value"_s},
        {{u"--set"_s, u"ID=x"_s, u"--press"_s, u"SAVE"_s}, 1, u"(80040E07)"_s},
        {{u"--set"_s, u"Name"_s}, 2, u"CONTROL=TEXT"_s},
        {{u"--format"_s, u"csv"_s}, 2, u"table|json"_s},
    };
    for (const auto& row : rows) {
        const Ended ended = Show(row.options);
        EXPECT_EQ(ended.status, row.status) << row.options.join(u' ').toStdString();
        EXPECT_EQ(ended.out, QString()) << row.options.join(u' ').toStdString();
        EXPECT_TRUE(ended.err.contains(row.fault)) << ended.err.toStdString();
    }
}

TEST_F(FormsCommands, ShowTheFormThatAButtonCalled)
{
    FormBuilder main(u"My Birds", u"Main");
    main.Edit(u"Name", u"[Name]").List(u"list", {{u"Bird"_s, u"[Name]"_s}}).DropDown(u"pick", u"a;b");
    main.Button(u"call", ButtonFunction::CallForm, u"DefaultForm").Last().option1 = 1;
    main.Button(u"swap", ButtonFunction::CallForm, u"DefaultForm").Last().option2 = 1;
    main.Button(u"find", ButtonFunction::Select, u"SELECT * WHERE Wild=1").Button(u"close", ButtonFunction::Close);
    QString error;
    ASSERT_TRUE(ExportForm(main.form, folder_.filePath(u"m.pfs"_s), error)) << error.toStdString();
    Do({u"forms"_s, u"import"_s, u"a.cdb"_s, u"m.pfs"_s});
    const auto show = [this](const QStringList& options) {
        const QString out =
            Do(QStringList{u"forms"_s, u"show"_s, u"a.cdb"_s, u"Main"_s, u"--format"_s, u"json"_s} + options);
        const QJsonObject form = QJsonDocument::fromJson(out.toUtf8()).object();
        return u"%1 %2/%3"_s.arg(form[u"form"].toString())
            .arg(form[u"record"].toInt())
            .arg(form[u"records"].toInt());
    };
    const QStringList call = {u"--press"_s, u"find"_s, u"--set"_s, u"list=2"_s, u"--press"_s, u"call"_s};
    EXPECT_EQ(show({}), u"Main 1/3"_s);
    EXPECT_EQ(show(call), u"DefaultForm 2/2"_s);
    EXPECT_EQ(show(QStringList{u"--press"_s, u"swap"_s}), u"DefaultForm 1/3"_s);
    EXPECT_EQ(show({u"--press"_s, u"close"_s}), u"Main 1/3"_s); // as it was when it closed
    for (const QStringList& pressed : {QStringList{u"--press"_s, u"close"_s, u"--press"_s, u"find"_s},
                                       {u"--press"_s, u"swap"_s, u"--press"_s, u"find"_s}})
        EXPECT_EQ(Run(QStringList{u"forms"_s, u"show"_s, u"a.cdb"_s, u"Main"_s} + pressed).status, 1);
}

TEST_F(FormsCommands, CarryFormsFromFileToFile)
{
    const QString first = Do({u"forms"_s, u"dump"_s, u"a.cdb"_s});
    Do({u"forms"_s, u"export"_s, u"a.cdb"_s, u"DefaultForm"_s, u"f.pfs"_s});
    EXPECT_EQ(Do({u"forms"_s, u"dump"_s, u"f.pfs"_s}), first);
    EXPECT_EQ(Run({u"forms"_s, u"export"_s, u"a.cdb"_s, u"DefaultForm"_s, u"f.pfs"_s}).status, 2);
    Do({u"forms"_s, u"export"_s, u"a.cdb"_s, u"DefaultForm"_s, u"f.pfs"_s, u"--yes"_s});
    EXPECT_EQ(Run({u"forms"_s, u"import"_s, u"a.cdb"_s, u"f.pfs"_s}).status, 1); // the name is taken
    Do({u"forms"_s, u"import"_s, u"a.cdb"_s, u"f.pfs"_s, u"--name"_s, u"Copy"_s});
    EXPECT_EQ(Do({u"forms"_s, u"default"_s, u"a.cdb"_s, u"My Birds"_s}), u"DefaultForm2\n"_s);
    const QStringList list = {u"forms"_s, u"list"_s, u"a.cdb"_s, u"--format"_s, u"csv"_s};
    EXPECT_EQ(Do(list), u"name,table,controls\nDefaultForm,My Birds,8\nCopy,My Birds,8\n"
                        "DefaultForm2,My Birds,8\n"_s);
    EXPECT_EQ(Run({u"forms"_s, u"delete"_s, u"a.cdb"_s, u"Copy"_s}).status, 2);
    Do({u"forms"_s, u"delete"_s, u"a.cdb"_s, u"Copy"_s, u"--yes"_s});
    EXPECT_FALSE(Do(list).contains(u"Copy"_s));
    for (const QStringList& words : {QStringList{u"export"_s, u"a.cdb"_s, u"Nobody"_s, u"n.pfs"_s},
                                     {u"export"_s, u"a.cdb"_s, u"DefaultForm"_s, u"a.cdb"_s, u"--yes"_s},
                                     {u"show"_s, u"a.cdb"_s, u"Nobody"_s},
                                     {u"delete"_s, u"a.cdb"_s, u"Nobody"_s, u"--yes"_s},
                                     {u"import"_s, u"a.cdb"_s, u"missing.pfs"_s},
                                     {u"import"_s, u"a.cdb"_s, u"a.cdb"_s, u"--name"_s, u"Not a form"_s},
                                     {u"import"_s, u"a.cdb"_s, u"f.pfs"_s, u"--name"_s, QString()},
                                     {u"default"_s, u"a.cdb"_s, u"Nowhere"_s},
                                     {u"dump"_s, u"missing.pfs"_s}}) {
        const Ended ended = Run(QStringList{u"forms"_s} + words);
        EXPECT_EQ(ended.status, 1) << words.join(u' ').toStdString();
        EXPECT_EQ(ended.out, QString()) << words.join(u' ').toStdString();
        EXPECT_FALSE(ended.err.isEmpty()) << words.join(u' ').toStdString();
    }
}

TEST_F(FormsCommands, DumpAllThatTheFileKeeps)
{
    const QJsonObject dump = QJsonDocument::fromJson(Do({u"forms"_s, u"dump"_s, u"a.cdb"_s}).toUtf8()).object();
    EXPECT_EQ(dump[u"queries"].toArray().size(), 0);
    const QJsonObject form = dump[u"forms"][0].toObject();
    EXPECT_EQ(form[u"form_name"].toString(), u"DefaultForm"_s);
    EXPECT_EQ(form[u"form_tag"].toInt(), -1);
    EXPECT_EQ(form[u"background_colour"].toInt(), -1);
    EXPECT_EQ(form[u"default_query"].toString(), u"SELECT * FROM [My Birds]"_s);
    EXPECT_EQ(form[u"control_count"].toInt(), 8);
    EXPECT_EQ(form[u"controls"].toArray().size(), 8);
    const QJsonObject box = form[u"controls"][6].toObject();
    EXPECT_EQ(box[u"name"].toString(), u"Wild"_s);
    EXPECT_EQ(box[u"control_type"].toInt(), 205);
    EXPECT_EQ(box[u"has_control_source"].toInt(), 1);
    EXPECT_EQ(box[u"control_source"].toString(), u"WHERE [My Birds].Wild=1"_s);
    EXPECT_EQ(box[u"control_source_length"].toInt(), 24);
    EXPECT_EQ(box[u"window_style"].toInteger(), 0x50010003);
    EXPECT_TRUE(form[u"controls"][1][u"control_source"].isNull()); // a label has none
}

// --- edit ---------------------------------------------------------------------------------------------------

class FormsEdit : public FormsCommands {
protected:
    QJsonObject Dumped() const
    {
        return QJsonDocument::fromJson(Do({u"forms"_s, u"dump"_s, u"a.cdb"_s}).toUtf8()).object();
    }
    Ended Edit(const QByteArray& json, const QString& name = u"DefaultForm"_s) const
    {
        QFile file(folder_.filePath(u"form.json"_s));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(json);
        file.close();
        return Run({u"forms"_s, u"edit"_s, u"a.cdb"_s, name, u"form.json"_s});
    }
};

TEST_F(FormsEdit, TakesWhatDumpWritesAndChangesWhatWasChanged)
{
    const QByteArray dumped = Do({u"forms"_s, u"dump"_s, u"a.cdb"_s}).toUtf8();
    EXPECT_EQ(Edit(dumped).status, 0);
    EXPECT_EQ(Do({u"forms"_s, u"dump"_s, u"a.cdb"_s}).toUtf8(), dumped);

    QByteArray changed = dumped;
    changed.replace("\"form_name\":\"DefaultForm\"", "\"form_name\":\"Birds\"");
    changed.replace("\"rec_counter\"", "\"count\"");
    EXPECT_EQ(Edit(changed).status, 0);
    EXPECT_EQ(Do({u"forms"_s, u"dump"_s, u"a.cdb"_s}).toUtf8(), changed);
    EXPECT_EQ(Edit(changed).status, 1) << "there is no DefaultForm now";
    Do({u"forms"_s, u"default"_s, u"a.cdb"_s, u"My Birds"_s});
    EXPECT_EQ(Edit(changed).status, 1) << "the name is another form's";
    EXPECT_EQ(
        Edit("{\"forms\":[{\"form_name\":\"Small\",\"controls\":[{\"name\":\"only\",\"control_type\":200}]}]}")
            .status,
        0)
        << "what is left out is as on a new record";
}

TEST_F(FormsEdit, RefusesWhatItDoesNotUnderstandByItsPath)
{
    const QByteArray before = Do({u"forms"_s, u"dump"_s, u"a.cdb"_s}).toUtf8();
    struct Case {
        QByteArray json;
        QString told;
    };
    const auto control = [](const QByteArray& members) {
        return "{\"forms\":[{\"form_name\":\"F\",\"controls\":[{},{" + members + "}]}]}";
    };
    for (const Case& each : {
             Case{"", u"The file is no JSON: "_s},
             Case{"[]", u"/: an object is wanted"_s},
             Case{"{}", u"forms: one form is wanted, and 0 are there"_s},
             Case{"{\"forms\":[{},{}]}", u"forms: one form is wanted, and 2 are there"_s},
             Case{"{\"forms\":[{\"form_name\":\"F\"}],\"queries\":[{}]}",
                  u"queries: queries cannot be replaced here"_s},
             Case{control("\"lefft\":1"), u"forms[0].controls[1].lefft: there is no such member"_s},
             Case{control("\"left\":\"1\""),
                  u"forms[0].controls[1].left: a whole number from -2147483648 to 2147483647 is wanted"_s},
             Case{control("\"left\":1.5"), u"forms[0].controls[1].left: a whole"_s},
             Case{control("\"left\":1e300"), u"forms[0].controls[1].left: a whole"_s},
             Case{control("\"option_1\":256"),
                  u"forms[0].controls[1].option_1: a whole number from 0 to 255 is wanted"_s},
             Case{control("\"text_style\":{\"face_name\":\"" + QByteArray(32, 'x') + "\"}"),
                  u"forms[0].controls[1].text_style.face_name: at most 31 characters fit"_s},
             Case{control("\"name\":\"a\\u0000b\""), u"forms[0].controls[1].name: a NUL cannot be kept"_s},
             Case{control("\"reserved\":[1,2]"), u"forms[0].controls[1].reserved: an array is wanted"_s},
             Case{control("\"reserved\":[1,2,3,4,5,6,7,\"8\"]"), u"forms[0].controls[1].reserved[7]: a whole"_s},
         }) {
        const Ended ended = Edit(each.json);
        EXPECT_EQ(ended.status, 1) << each.json.toStdString();
        EXPECT_TRUE(ended.err.startsWith(each.told)) << ended.err.toStdString();
    }
    EXPECT_EQ(Run({u"forms"_s, u"edit"_s, u"a.cdb"_s, u"DefaultForm"_s, u"no file"_s}).status, 1);
    EXPECT_EQ(Do({u"forms"_s, u"dump"_s, u"a.cdb"_s}).toUtf8(), before);
}

} // namespace
