// The program as a script meets it: its words, what it prints where, and how it ends.
#include "cli/program_fixture.h"
#include "support/sqlite_file.h"

#include <QDir>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>

#include <csignal>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TEST_F(Program, RefusesWrongWordsWithTwoLines)
{
    struct Row {
        QStringList words;
        const char* fault;
    };
    const std::vector<Row> rows = {
        {{}, "Which command?"},
        {{u"frob"_s}, "There is no command \"frob\"."},
        {{u"tables"_s}, "The command needs more arguments: DB."},
        {{u"tables"_s, u"a"_s, u"b"_s}, "The argument \"b\" is one too many."},
        {{u"tables"_s, u"a"_s, u"--frob"_s}, "There is no option --frob."},
        {{u"tables"_s, u"a"_s, u"--limit"_s, u"1"_s}, "This command does not take the option --limit."},
        {{u"sql"_s, u"a"_s, u"b"_s, u"--limit"_s}, "The option --limit needs a value: N."},
        {{u"sql"_s, u"a"_s, u"b"_s, u"--limit=-1"_s}, "\"-1\" is no value for --limit: N."},
        {{u"sql"_s, u"a"_s, u"b"_s, u"--timing=1"_s}, "The option --timing takes no value."},
        {{u"sql"_s, u"a"_s, u"b"_s, u"--format"_s, u"xml"_s},
         "\"xml\" is no value for --format: table|csv|tsv|json|jsonl."},
        {{u"drop"_s, u"a"_s}, "This command needs the option --yes."},
        {{u"import"_s, u"a"_s, u"b"_s}, "This command needs the option --table."},
        {{u"forms"_s}, "Which command of \"forms\"?"},
        {{u"forms"_s, u"frob"_s, u"a"_s}, "There is no command \"forms frob\"."},
        {{u"eval"_s, u"-[a]"_s}, "There is no option -[a]."},
    };
    for (const Row& row : rows) {
        const Ended ended = Run(row.words);
        EXPECT_EQ(ended.status, 2) << row.fault;
        EXPECT_EQ(ended.out, QString());
        EXPECT_EQ(ended.err.section(u'\n', 0, 0), QString::fromUtf8(row.fault));
        EXPECT_TRUE(ended.err.endsWith(u"--help\" shows how to use it.\n"_s)) << ended.err.toStdString();
    }
}

TEST_F(Program, HelpsOnItselfAndOnEveryCommand)
{
    const Ended help = Run({u"--help"_s});
    EXPECT_EQ(help.status, 0);
    for (const QString& command : {u"new"_s, u"sql"_s, u"import"_s, u"config get"_s}) {
        EXPECT_TRUE(help.out.contains(u"  "_s + command + u' ')) << command.toStdString();
        const Ended own = Run(command.split(u' ') + QStringList{u"--help"_s});
        EXPECT_EQ(own.status, 0);
        EXPECT_TRUE(own.out.startsWith(u"mirel-cli "_s + command)) << own.out.toStdString();
    }
    for (const QString& group : {u"forms"_s, u"queries"_s, u"config"_s}) {
        const Ended own = Run({group, u"--help"_s});
        EXPECT_EQ(own.status, 0) << own.err.toStdString();
        const QStringList lines = own.out.split(u'\n');
        EXPECT_GE(lines.filter(u"  "_s + group + u' ').size(), 2) << own.out.toStdString();
        EXPECT_TRUE(lines.filter(u"  import "_s).empty()) << "of this group alone";
        EXPECT_FALSE(lines.filter(u"  -- "_s).empty());
    }
    EXPECT_TRUE(Run({u"--version"_s}).out.startsWith(u"mirel-cli "_s));
}

TEST_F(Program, WritesNothingOfALibrarysWhateverTheLocale)
{
    NewDatabase();
    for (const QString& locale : {u"C"_s, u"POSIX"_s, u"de_DE"_s, u"nonsense"_s}) {
        locale_ = locale;
        EXPECT_EQ(Run({u"tables"_s, u"a.cdb"_s}), (Ended{0, {}, {}})) << locale.toStdString();
    }
}

TEST_F(Program, RunsStatements)
{
    NewDatabase();
    Sql(u"CREATE TABLE [Bird s] ([Name] Varchar(40), [N] Integer, [Rare] Bit, [Seen] DateTime);"_s);
    Sql(u"INSERT INTO [Bird s] ([Name],[N],[Rare],[Seen]) VALUES ('a;b', 3, TRUE, '2001-07-04 09:05:00')"_s);
    EXPECT_EQ(Run({u"tables"_s, u"a.cdb"_s}).out, u"Bird s\n"_s);
    EXPECT_EQ(Sql(u"SELECT * FROM [Bird s]"_s), u"Name,N,Rare,Seen\na;b,3,Yes,2001-07-04 09:05:00\n"_s);
    EXPECT_EQ(Run({u"config"_s, u"set"_s, u"TableView"_s, u"yesnoString"_s, u"Ja/Nein"_s}), (Ended{0, {}, {}}));
    EXPECT_EQ(Sql(u"SELECT Rare FROM [Bird s]"_s), u"Rare\nJa\n"_s);
    EXPECT_EQ(Sql(u"SELECT * FROM [Bird s]"_s, u"json"_s),
              u"[{\"Name\":\"a;b\",\"N\":3,\"Rare\":true,\"Seen\":\"2001-07-04T09:05:00\"}]\n"_s);
    EXPECT_EQ(
        Run({u"fields"_s, u"a.cdb"_s, u"Bird s"_s, u"--format"_s, u"csv"_s}).out,
        u"name,type,size,indexed\nName,Text,40,NO\nN,Integer,4,NO\nRare,Yes/No,2,NO\nSeen,DateTime,8,NO\n"_s);
}

TEST_F(Program, ReadsStatementsFromItsInputUpToTheFirstFailure)
{
    NewDatabase();
    const Ended ended =
        Run({u"sql"_s, u"a.cdb"_s, u"-"_s, u"--format"_s, u"csv"_s}, "CREATE TABLE T (A Varchar(9));\r\n"
                                                                     "INSERT INTO T (A)\n VALUES (';');\n"
                                                                     "SELECT A FROM T;\n"
                                                                     "SELECT A FROM Nowhere;\n"
                                                                     "DELETE FROM T");
    EXPECT_EQ(ended, (Ended{1, u"A\n;\n"_s, u"Error: (80040E37)\nThe specified table does not exist\n"_s}));
    EXPECT_EQ(Sql(u"SELECT A FROM T"_s), u"A\n;\n"_s);
}

TEST_F(Program, RefusesBytesThatAreNotUtf8)
{
    NewDatabase();
    const Ended ended = Run({u"sql"_s, u"a.cdb"_s, u"-"_s}, "CREATE TABLE T (A Varchar(9));\n"
                                                            "INSERT INTO T (A)\nVALUES ('caf\xE9');\n");
    EXPECT_EQ(ended, (Ended{1, {}, u"Line 3 is not UTF-8: the script ends before it.\n"_s}));
    EXPECT_EQ(Sql(u"SELECT A FROM T"_s), u"A\n"_s);
    QProcess shell; // a shell alone can hand over such an argument
    StartProgram(shell, u"/bin/sh"_s,
                 {u"-c"_s, u"\"$0\" sql a.cdb \"INSERT INTO T (A) VALUES ('$(printf '\\351')')\""_s,
                  QStringLiteral(MIREL_CLI)});
    ASSERT_TRUE(shell.waitForFinished());
    EXPECT_EQ(shell.exitCode(), 2);
    EXPECT_EQ(shell.readAllStandardError(), "Argument 3 is not UTF-8.\n");
    EXPECT_EQ(Sql(u"SELECT A FROM T"_s), u"A\n"_s);
}

TEST_F(Program, SaysWhatASettingTakes)
{
    const auto set = [this](const QStringList& words) {
        return Run(QStringList{u"config"_s, u"set"_s, u"TableView"_s} + words);
    };
    EXPECT_EQ(set({u"font"_s, u"Serif 12"_s}),
              (Ended{1,
                     {},
                     u"\"Serif 12\" is no value for the setting TableView font: it takes a font: (italic,bold,"
                     "strikeout,underline,size,\"face\"), such as (0,1,0,0,9,\"Tahoma\").\n"_s}));
    EXPECT_EQ(set({u"Font"_s, u"(0,1,0,0,9,\"Tahoma\")"_s}), (Ended{0, {}, {}})); // the example itself is one
    EXPECT_EQ(set({u"BkColor"_s, u"(0),(16777215),(0),(0),(12632256)"_s}), (Ended{0, {}, {}}));
    EXPECT_EQ(set({u"confirmDelete"_s, u"maybe"_s}).status, 1);
}

TEST_F(Program, TakesAPartOfTheRecordsAndTellsTheTime)
{
    NewDatabase();
    Import("1\n2\n3\n4\n5\n", {u"--create"_s});
    const Ended ended = Run({u"sql"_s, u"a.cdb"_s, u"SELECT * FROM T"_s, u"--offset"_s, u"1"_s, u"--limit"_s,
                             u"2"_s, u"--format"_s, u"csv"_s, u"--timing"_s});
    EXPECT_EQ(ended.out, u"Field1\n2\n3\n"_s);
    const QJsonObject timing = QJsonDocument::fromJson(ended.err.toUtf8()).object();
    EXPECT_EQ(timing[u"rows"].toInt(), 2) << ended.err.toStdString();
    for (const QString& key : {u"open_ms"_s, u"run_ms"_s, u"jump_us"_s})
        EXPECT_TRUE(timing.contains(key)) << key.toStdString();
}

TEST_F(Program, ImportsIntoANewTableWithTypesFromTheData)
{
    NewDatabase();
    EXPECT_EQ(Import("ZIP,Cost,Weight,Seen,Note\r\n00501,7,1.5,2001-07-04,\"a, b\"\r\n10001,,2,,x\r\n",
                     {u"--create"_s, u"--header"_s, u"--columns"_s, u"auto"_s}),
              (Ended{0, u"2 record(s) imported.\n"_s, {}}));
    EXPECT_EQ(Run({u"fields"_s, u"a.cdb"_s, u"T"_s, u"--format"_s, u"csv"_s}).out,
              u"name,type,size,indexed\nZIP,Text,50,NO\nCost,Integer,4,NO\nWeight,Double,8,NO\n"
              "Seen,DateTime,8,NO\nNote,Text,50,NO\n"_s);
    EXPECT_EQ(Sql(u"SELECT * FROM T"_s),
              u"ZIP,Cost,Weight,Seen,Note\n00501,7,1.5,2001-07-04,\"a, b\"\n10001,,2,,x\n"_s);
}

TEST_F(Program, ImportsIntoAnExistingTable)
{
    NewDatabase();
    Sql(u"CREATE TABLE T (A Varchar(9), B Integer)"_s);
    EXPECT_EQ(Import("B,a\n1,x\n", {u"--header"_s}).out, u"1 record(s) imported.\n"_s);
    EXPECT_EQ(Import("z\n\ny,2\n", {}).out, u"2 record(s) imported.\n"_s) << "the first line is short";
    EXPECT_EQ(Import("3;-;w,v\n", {u"--columns"_s, u"B,-,A"_s, u"--separator"_s, u"semicolon"_s}).status, 0);
    EXPECT_EQ(Sql(u"SELECT * FROM T"_s), u"A,B\nx,1\nz,\ny,2\n\"w,v\",3\n"_s);
}

TEST_F(Program, ImportsNothingForNamesThatAreNotThere)
{
    NewDatabase();
    Sql(u"CREATE TABLE T (A Varchar(9))"_s);
    EXPECT_EQ(Import("A,B\nx,y\n", {u"--header"_s}), (Ended{1, {}, u"The table \"T\" has no field \"B\".\n"_s}));
    EXPECT_EQ(Import("x\n", {u"--columns"_s, u"B"_s}), (Ended{1, {}, u"The table \"T\" has no field \"B\".\n"_s}));
    EXPECT_EQ(Sql(u"SELECT * FROM T"_s), u"A\n"_s);
    EXPECT_EQ(Import("A\n", {u"--header"_s}), (Ended{0, {}, {}})); // the header alone: no count either
}

TEST_F(Program, EndsAnImportAtTheLineThatFails)
{
    struct Row {
        const char* what;
        QByteArray file;
        QStringList options;
        QString message;
    };
    const QStringList toNumber = {u"--columns"_s, u"N,D,A"_s};
    const std::vector<Row> rows = {
        {"no number", "1,,\n2,,\nx,,\n4,,\n", toNumber,
         u"Error: (80040E07)\nA literal value in the command could not be converted to the correct type due to a "
         "reason other than data overflow\nLine 3, column 1 (N). 2 record(s) imported.\n"_s},
        {"too large", "1,,\n2,,\n3000000000,,\n", toNumber,
         u"Error: (80040E57)\nA literal value in the command overflowed the range of the type of the associated "
         "column\nLine 3, column 1 (N). 2 record(s) imported.\n"_s},
        {"too long", "1,,\n2,,\n3,,0123456789\n", toNumber,
         u"Error: (80040E57)\nA literal value in the command overflowed the range of the type of the associated "
         "column\nLine 3, column 3 (A). 2 record(s) imported.\n"_s},
        {"no date", "1,,\n2,30.1.2001,\n3,30.2.2001,\n",
         toNumber + QStringList{u"--date-order"_s, u"4"_s, u"--date-separator"_s, u"."_s},
         u"Invalid datetime format.\nLine 3, column 2 (D). 2 record(s) imported.\n"_s},
        {"not UTF-8", "1,,\n2,,\n3,,\xFF\n", toNumber,
         u"This is no text in the encoding UTF-8.\nLine 3, column 3 (A). 2 record(s) imported.\n"_s},
    };
    NewDatabase();
    for (const Row& row : rows) {
        Sql(u"CREATE TABLE T (N Integer, D DateTime, A Varchar(9))"_s);
        EXPECT_EQ(Import(row.file, row.options), (Ended{1, {}, row.message})) << row.what;
        EXPECT_EQ(Sql(u"SELECT N FROM T"_s), u"N\n1\n2\n"_s) << row.what;
        Sql(u"DROP TABLE T"_s);
    }
}

TEST_F(Program, TellsWhatAnImportLeftOut)
{
    NewDatabase();
    const QByteArray file = "12.7," + QByteArray(9000, 'x') + "\n";
    const QStringList columns = {u"--create"_s, u"--columns"_s, u"N:Integer,T:Memo"_s};
    EXPECT_EQ(Import(file, columns),
              (Ended{0, u"1 record(s) imported.\n"_s,
                     u"1 text of more than 8192 characters was cut.\n"
                     "1 text held more than the number at its beginning; the rest was left out.\n"_s}));
    EXPECT_EQ(Sql(u"SELECT * FROM T"_s), u"N,T\n12,"_s + QString(8192, u'x') + u'\n');
    Sql(u"DROP TABLE T"_s);
    Import(file, columns + QStringList{u"--whole-texts"_s});
    EXPECT_EQ(Sql(u"SELECT T FROM T"_s), u"T\n"_s + QString(9000, u'x') + u'\n');
}

TEST_F(Program, EndsQuietlyWhenNobodyReadsOrItIsInterrupted)
{
    NewDatabase();
    Import(QByteArray("0123456789012345678901234567890123456789\n").repeated(200'000), {u"--create"_s});
    QProcess shell;
    StartProgram(shell, u"/bin/sh"_s,
                 {u"-c"_s, u"{ \"$0\" sql a.cdb 'SELECT * FROM T' --format csv; echo $? >&2; } | head -n 2"_s,
                  QStringLiteral(MIREL_CLI)});
    ASSERT_TRUE(shell.waitForFinished());
    EXPECT_EQ(shell.readAllStandardError(), QByteArray("1\n"));
    EXPECT_EQ(shell.readAllStandardOutput().count('\n'), 2);

    // Its own input keeps it waiting, so that the interrupt finds it between two statements.
    QProcess script;
    Start(script, {u"sql"_s, u"a.cdb"_s, u"-"_s});
    script.write("CREATE TABLE U (A Integer);\nSELECT * FROM U;\n");
    ASSERT_TRUE(script.waitForReadyRead());
    kill(pid_t(script.processId()), SIGINT);
    script.write("INSERT INTO U (A) VALUES (1);\nINSERT INTO U (A) VALUES (2);\n");
    script.closeWriteChannel();
    ASSERT_TRUE(script.waitForFinished());
    EXPECT_EQ(script.exitStatus(), QProcess::NormalExit);
    EXPECT_EQ(script.exitCode(), 1);
    EXPECT_EQ(Sql(u"SELECT COUNT(*) AS N FROM U"_s), u"N\n0\n"_s);
}

TEST_F(Program, DropsADatabaseWithItsSideFile)
{
    NewDatabase();
    const QDir forms(Path(u"home/Forms"_s));
    EXPECT_EQ(forms.entryList(QDir::Files).size(), 1);
    EXPECT_EQ(Run({u"drop"_s, u"a.cdb"_s, u"--yes"_s}), (Ended{0, {}, {}}));
    EXPECT_FALSE(QFile::exists(Path(u"a.cdb"_s)));
    EXPECT_EQ(forms.entryList(QDir::Files).size(), 0);
    EXPECT_EQ(Run({u"tables"_s, u"a.cdb"_s}).status, 1);
}

TEST_F(Program, EvaluatesExpressions)
{
    NewDatabase();
    Import("Name,Price\nGull,2.5\nTern,\n",
           {u"--create"_s, u"--columns"_s, u"Name:Text:20,Price:Double"_s, u"--header"_s});
    const auto eval = [this](const QStringList& words) { return Run(QStringList{u"eval"_s} + words); };
    const QStringList onTable = {u"--db"_s, u"a.cdb"_s, u"--source"_s, u"T"_s};
    const QString counter = u"RECNO()+'/'+RECCOUNT()"_s;
    EXPECT_EQ(eval({u"--"_s, u"-5+3"_s}), (Ended{0, u"-2\n"_s, {}}));
    EXPECT_EQ(eval({u"&a*2"_s, u"--control"_s, u"a=5"_s}), (Ended{0, u"10\n"_s, {}}));
    EXPECT_EQ(eval({u"2+3*4"_s, u"--tree"_s}), (Ended{0, u"{ { 2 }+{ { 3 }*{ 4 } } }\n"_s, {}}));
    EXPECT_EQ(eval(QStringList{counter, u"--record"_s, u"2"_s} + onTable), (Ended{0, u"2/2\n"_s, {}}));
    EXPECT_EQ(eval(QStringList{counter, u"--all"_s} + onTable), (Ended{0, u"1/2\n2/2\n"_s, {}}));
    EXPECT_EQ(eval(QStringList{u""_s, u"--all"_s} + onTable), (Ended{0, u"\n\n"_s, {}}));
    EXPECT_EQ(eval(QStringList{u"[Name]+[Price]"_s, u"--all"_s} + onTable), (Ended{0, u"Gull2.5\n\n"_s, {}}));
    EXPECT_EQ(eval(QStringList{counter, u"--record"_s, u"3"_s} + onTable),
              (Ended{1, {}, u"There is no record 3.\n"_s}));
    EXPECT_EQ(eval({u"1"_s, u"--all"_s}).status, 2);
    EXPECT_EQ(eval({u"1"_s, u"--control"_s, u"a"_s}).status, 2);
    EXPECT_EQ(eval({u"1"_s, u"--format"_s, u"csv"_s}).status, 2);
}

TEST_F(Program, ShowsEveryDigitOfAWholeNumber)
{
    NewDatabase();
    Sql(u"CREATE TABLE T (A Integer)"_s);
    SqliteFile(Path(u"a.cdb"_s)).Run("INSERT INTO T VALUES (9007199254740993), (-9223372036854775807)");
    EXPECT_EQ(
        Run({u"eval"_s, u"[A]+'/'+TO_CHAR([A])"_s, u"--all"_s, u"--db"_s, u"a.cdb"_s, u"--source"_s, u"T"_s}),
        (Ended{0, u"9007199254740993/9007199254740993\n-9223372036854775807/-9223372036854775807\n"_s, {}}));
}

TEST_F(Program, TellsOfExpressionsAsJson)
{
    const auto object = [this](const QStringList& words) {
        const Ended ended = Run(QStringList{u"eval"_s, u"--format"_s, u"json"_s} + words);
        return QJsonDocument::fromJson(ended.out.toUtf8()).object();
    };
    EXPECT_EQ(object({u"'a\"'+1"_s}), (QJsonObject{{u"null"_s, false},
                                                   {u"isText"_s, true},
                                                   {u"text"_s, u"a\"1"_s},
                                                   {u"number"_s, 0},
                                                   {u"fieldType"_s, 0}}));
    EXPECT_EQ(object({u"1 < 2"_s, u"--condition"_s})[u"holds"_s], QJsonValue(1));
    EXPECT_EQ(object({u"NULL < 2"_s, u"--condition"_s})[u"holds"_s], QJsonValue(0));
    const QJsonObject explained = object({u"1/0 2"_s, u"--explain"_s});
    EXPECT_TRUE(explained[u"null"_s].toBool());
    EXPECT_EQ(explained[u"explanation"_s].toArray().size(), 2);
}

} // namespace
} // namespace mirel
