// The commands on whole results: export, sums, changes of all records, saved queries.
#include "cli/program_fixture.h"

#include <QDir>

#include <csignal>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class ResultProgram : public Program {
protected:
    void SetUp() override
    {
        Program::SetUp();
        NewDatabase();
        Import("Name,Age,Price,Member,Born\r\nAnn,30,2.50,1,2001-07-04\r\nO'Brien,,1.25,0,\r\n\"5\"\" "
               "pipe\",7,,0,\r\n",
               {u"--create"_s, u"--header"_s, u"--doubled-quotes"_s, u"--columns"_s,
                u"Name:Text:20,Age:Integer,Price:Double,Member:Yes/No,Born:DateTime"_s});
    }

    Ended OnTable(const QString& command, const QStringList& words)
    {
        return Run(QStringList{command, u"a.cdb"_s, u"T"_s} + words);
    }
    QByteArray Read(const QString& name) const
    {
        QFile file(Path(name));
        EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << name.toStdString();
        return file.readAll();
    }
    QStringList FilesOf(const QString& pattern) const
    {
        return QDir(Path(u"."_s)).entryList({pattern}, QDir::Files);
    }
};

TEST_F(ResultProgram, ExportsATableAStatementAndASavedQuery)
{
    const Ended done{0, {}, u"3 record(s) exported.\n"_s};
    EXPECT_EQ(OnTable(u"export"_s, {u"x.csv"_s, u"--header"_s}), done);
    EXPECT_EQ(Read(u"x.csv"_s), "\"Name\",\"Age\",\"Price\",\"Member\",\"Born\"\r\n\"Ann\",30,2.5,1,7/4/2001\r\n"
                                "\"O'Brien\",,1.25,0,\r\n\"5\" pipe\",7,,0,\r\n");
    EXPECT_EQ(Run({u"export"_s, u"a.cdb"_s, u"SELECT Born,Name FROM T WHERE Age=30"_s, u"-"_s, u"--separator"_s,
                   u"tab"_s, u"--quote"_s, u"none"_s, u"--date-order"_s, u"4"_s, u"--date-separator"_s, u"."_s}),
              (Ended{0, u"04.07.2001\tAnn\r\n"_s, u"1 record(s) exported.\n"_s}));
    Run({u"queries"_s, u"save"_s, u"a.cdb"_s, u"Pipes"_s, u"SELECT Name FROM T WHERE Age=7"_s, u"--table"_s,
         u"T"_s});
    EXPECT_EQ(Run({u"export"_s, u"a.cdb"_s, u"-"_s, u"--query"_s, u"Pipes"_s, u"--doubled-quotes"_s}),
              (Ended{0, u"\"5\"\" pipe\"\r\n"_s, u"1 record(s) exported.\n"_s}));
    EXPECT_EQ(Run({u"export"_s, u"a.cdb"_s, u"-"_s, u"--query"_s, u"pipes"_s}),
              (Ended{1, {}, u"There is no query \"pipes\".\n"_s}));
}

TEST_F(ResultProgram, ReplacesAFileOnlyWhenToldAndOnlyByAWholeOne)
{
    WriteFile(u"x.csv"_s, "old");
    const Ended refused = OnTable(u"export"_s, {u"x.csv"_s});
    EXPECT_EQ(refused.status, 2);
    EXPECT_TRUE(refused.err.endsWith(u"x.csv\" exists; --yes replaces it.\n"_s)) << refused.err.toStdString();
    EXPECT_EQ(Run({u"export"_s, u"a.cdb"_s, u"Nowhere"_s, u"x.csv"_s, u"--yes"_s}).status, 1);
    EXPECT_EQ(OnTable(u"export"_s, {u"x.csv"_s, u"--yes"_s, u"--encoding"_s, u"no such"_s}).status, 1);
    EXPECT_EQ(Read(u"x.csv"_s), "old");
    EXPECT_EQ(OnTable(u"export"_s, {u"x.csv"_s, u"--yes"_s}).status, 0);
    EXPECT_EQ(Read(u"x.csv"_s).count("\r\n"), 3);
    EXPECT_EQ(OnTable(u"export"_s, {u"no/where/y.csv"_s}).err.section(u'\n', 0, 0), u"File creation fail."_s);
    EXPECT_EQ(FilesOf(u"*.csv*"_s), QStringList({u"a.csv"_s, u"x.csv"_s}));
}

TEST_F(ResultProgram, ExportsNoRecordsAsAFileWithoutThem)
{
    EXPECT_EQ(Run({u"export"_s, u"a.cdb"_s, u"SELECT Name FROM T WHERE Age=0"_s, u"x.csv"_s, u"--header"_s}),
              (Ended{0, {}, u"0 record(s) exported.\n"_s}));
    EXPECT_EQ(Read(u"x.csv"_s), "\"Name\"\r\n");
}

TEST_F(ResultProgram, LeavesNothingHalfWrittenWhenItIsInterrupted)
{
    Sql(u"CREATE TABLE D (N Integer)"_s);
    Sql(u"INSERT INTO D (N) VALUES (1)"_s);
    QByteArray numbers;
    for (int i = 0; i < 1000; ++i)
        numbers += QByteArray::number(i) + '\n';
    WriteFile(u"n.csv"_s, numbers);
    Run({u"import"_s, u"a.cdb"_s, u"n.csv"_s, u"--table"_s, u"D"_s});
    QProcess process; // a million records: long enough to be met on the way
    Start(process, {u"export"_s, u"a.cdb"_s, u"SELECT a.N,b.N FROM D a INNER JOIN D b ON b.N>=0"_s, u"x.csv"_s});
    ASSERT_TRUE(process.waitForStarted());
    ASSERT_FALSE(process.waitForFinished(200));
    kill(pid_t(process.processId()), SIGINT);
    ASSERT_TRUE(process.waitForFinished());
    EXPECT_EQ(process.exitCode(), 1);
    EXPECT_EQ(process.readAllStandardError(), QByteArray());
    EXPECT_EQ(FilesOf(u"x.csv*"_s), QStringList());
}

TEST_F(ResultProgram, SumsUpAField)
{
    const struct {
        QString field;
        QString kind;
        QString value;
    } rows[] = {
        {u"Price"_s, u"sum"_s, u"3.75"_s},
        {u"age"_s, u"avg"_s, u"18.5"_s},
        {u"Age"_s, u"max"_s, u"30"_s},
        {u"Price"_s, u"min"_s, u"1.25"_s},
    };
    for (const auto& row : rows)
        EXPECT_EQ(OnTable(u"aggregate"_s, {row.field, row.kind}), (Ended{0, row.value + u'\n', {}}));
    EXPECT_EQ(Run({u"aggregate"_s, u"a.cdb"_s, u"SELECT * FROM T WHERE Age=0"_s, u"Age"_s, u"max"_s}),
              (Ended{0, u"\n"_s, {}}));
    EXPECT_EQ(OnTable(u"aggregate"_s, {u"Name"_s, u"sum"_s}),
              (Ended{1, {}, u"The aggregate functions are not supported on the 'Text' field.\n"_s}));
    EXPECT_EQ(OnTable(u"aggregate"_s, {u"Nome"_s, u"sum"_s}),
              (Ended{1, {}, u"The result has no field \"Nome\".\n"_s}));
    EXPECT_EQ(OnTable(u"aggregate"_s, {u"Age"_s, u"median"_s}).status, 2);
}

TEST_F(ResultProgram, ChangesAllRecordsOfASource)
{
    const auto members = u"SELECT * FROM T WHERE Member=1"_s;
    EXPECT_EQ(OnTable(u"update-all"_s, {u"Age"_s, u"12.7"_s, u"--yes"_s}).status, 1) << "never cut";
    EXPECT_EQ(OnTable(u"update-all"_s, {u"Age"_s, u"12"_s, u"--yes"_s}), (Ended{0, u"3\n"_s, {}}));
    EXPECT_EQ(Run({u"update-all"_s, u"a.cdb"_s, members, u"Name"_s, QString(), u"--yes"_s}),
              (Ended{0, u"1\n"_s, {}}));
    EXPECT_EQ(OnTable(u"update-all"_s, {u"Born"_s, u"2001-07-05"_s, u"--yes"_s}).status, 0);
    EXPECT_EQ(OnTable(u"update-all"_s, {u"Member"_s, u"yes"_s, u"--yes"_s}).out, u"3\n"_s);
    EXPECT_EQ(Sql(u"SELECT * FROM T"_s),
              u"Name,Age,Price,Member,Born\n,12,2.5,Yes,2001-07-05\nO'Brien,12,1.25,Yes,2001-07-05\n"
              "\"5\"\" pipe\",12,,Yes,2001-07-05\n"_s);
    EXPECT_EQ(OnTable(u"update-all"_s, {u"Member"_s, u"maybe"_s, u"--yes"_s}),
              (Ended{1, {}, u"\"maybe\" is no value for a Yes/No field: Yes, No, 1 or 0.\n"_s}));
    EXPECT_EQ(OnTable(u"update-all"_s, {u"Born"_s, u"soon"_s, u"--yes"_s}).status, 1);
    EXPECT_EQ(OnTable(u"update-all"_s, {u"Age"_s, u"1"_s}).status, 2);
    EXPECT_EQ(OnTable(u"delete-all"_s, {}).status, 2);
    EXPECT_EQ(Run({u"delete-all"_s, u"a.cdb"_s, u"SELECT * FROM T WHERE Price IS NULL"_s, u"--yes"_s}).out,
              u"1\n"_s);
    EXPECT_EQ(OnTable(u"delete-all"_s, {u"--yes"_s}), (Ended{0, u"2\n"_s, {}}));
    EXPECT_EQ(OnTable(u"delete-all"_s, {u"--yes"_s}), (Ended{0, u"0\n"_s, {}}));
    EXPECT_EQ(Run({u"delete-all"_s, u"a.cdb"_s, u"SELECT COUNT(*) AS N FROM T"_s, u"--yes"_s}).status, 1);
}

TEST_F(ResultProgram, KeepsSavedQueries)
{
    const auto queries = [this](const QStringList& words) { return Run(QStringList{u"queries"_s} + words); };
    const auto save = [&](const QString& statement, const QStringList& options) {
        return queries(QStringList{u"save"_s, u"a.cdb"_s, u"Q"_s, statement, u"--table"_s, u"T"_s} + options);
    };
    EXPECT_EQ(save(u"SELECT Name FROM T ORDER BY Age"_s, {}), (Ended{0, {}, {}}));
    EXPECT_EQ(queries({u"save"_s, u"a.cdb"_s, u" "_s, u"SELECT 1"_s, u"--table"_s, u"T"_s}),
              (Ended{1, {}, u"A query needs a name.\n"_s}));
    EXPECT_EQ(save(u"SELECT 1"_s, {u"--yes"_s}),
              (Ended{1, {}, u"The query \"Q\" exists; --replace replaces it.\n"_s}));
    const Ended unbalanced = save(u"SELECT (Name FROM T"_s, {u"--replace"_s});
    EXPECT_EQ(unbalanced.status, 1);
    EXPECT_TRUE(unbalanced.err.startsWith(u"Syntax Error:\n"_s)) << unbalanced.err.toStdString();
    EXPECT_EQ(queries({u"list"_s, u"a.cdb"_s, u"--format"_s, u"csv"_s}).out,
              u"name,table,statement\nQ,T,SELECT Name FROM T ORDER BY Age\n"_s);
    EXPECT_EQ(queries({u"run"_s, u"a.cdb"_s, u"Q"_s, u"--format"_s, u"csv"_s}),
              (Ended{0, u"Name\nO'Brien\n\"5\"\" pipe\"\nAnn\n"_s, {}}));
    EXPECT_EQ(save(u"SELECT (Name FROM T"_s, {u"--replace"_s, u"--yes"_s}).status, 0);
    EXPECT_EQ(queries({u"run"_s, u"a.cdb"_s, u"Q"_s}).status, 1);
    EXPECT_EQ(queries({u"delete"_s, u"a.cdb"_s, u"Q"_s}).status, 2);
    EXPECT_EQ(queries({u"delete"_s, u"a.cdb"_s, u"Q"_s, u"--yes"_s}), (Ended{0, {}, {}}));
    EXPECT_EQ(queries({u"delete"_s, u"a.cdb"_s, u"Q"_s, u"--yes"_s}),
              (Ended{1, {}, u"There is no query \"Q\".\n"_s}));
    EXPECT_EQ(queries({u"list"_s, u"a.cdb"_s, u"--format"_s, u"jsonl"_s}), (Ended{0, {}, {}}));
}

TEST_F(ResultProgram, NeedsTheRightNumberOfArgumentsToExport)
{
    EXPECT_EQ(Run({u"export"_s, u"a.cdb"_s, u"T"_s}).status, 2);
    EXPECT_EQ(Run({u"export"_s, u"a.cdb"_s, u"T"_s, u"x.csv"_s, u"--query"_s, u"Q"_s}).status, 2);
    EXPECT_EQ(FilesOf(u"x.csv"_s), QStringList());
}

TEST_F(ResultProgram, ReadsSourcesAndRunsNothingElse)
{
    const QString refused = u"Error: (80040E14) only a SELECT can be read here\n"
                            "The command contained one or more errors\n"_s;
    const auto save = [this](const QString& name, const QString& statement) {
        Run({u"queries"_s, u"save"_s, u"a.cdb"_s, name, statement, u"--table"_s, u"T"_s});
    };
    save(u"Wipe"_s, u"DELETE FROM T"_s);
    const QString before = Sql(u"SELECT * FROM T"_s);
    for (const QString& source : {u"DELETE FROM T"_s, u"DROP TABLE T"_s, u"UPDATE T SET Age=1"_s, u"Wipe"_s}) {
        const std::vector<QStringList> rows = {
            {u"export"_s, u"a.cdb"_s, source, u"x.csv"_s},
            {u"eval"_s, u"1"_s, u"--db"_s, u"a.cdb"_s, u"--source"_s, source},
            {u"eval"_s, u"1"_s, u"--db"_s, u"a.cdb"_s, u"--source"_s, source, u"--all"_s},
            {u"aggregate"_s, u"a.cdb"_s, source, u"Age"_s, u"sum"_s},
            {u"update-all"_s, u"a.cdb"_s, source, u"Age"_s, u"1"_s, u"--yes"_s},
            {u"delete-all"_s, u"a.cdb"_s, source, u"--yes"_s},
        };
        for (const QStringList& words : rows)
            EXPECT_EQ(Run(words), (Ended{1, {}, refused})) << words.join(u' ').toStdString();
    }
    EXPECT_EQ(Run({u"export"_s, u"a.cdb"_s, u"x.csv"_s, u"--query"_s, u"Wipe"_s}), (Ended{1, {}, refused}));
    EXPECT_EQ(Run({u"queries"_s, u"run"_s, u"a.cdb"_s, u"Wipe"_s}),
              (Ended{2, {}, u"The query \"Wipe\" is not a SELECT; --yes runs it.\n"_s}));
    EXPECT_EQ(FilesOf(u"x.csv*"_s), QStringList());
    EXPECT_EQ(Sql(u"SELECT * FROM T"_s), before);

    save(u"Old ones"_s, u"SELECT * FROM T WHERE Age > 8"_s);
    EXPECT_EQ(Run({u"aggregate"_s, u"a.cdb"_s, u"Old ones"_s, u"Age"_s, u"sum"_s}), (Ended{0, u"30\n"_s, {}}));
    EXPECT_EQ(Run({u"queries"_s, u"run"_s, u"a.cdb"_s, u"Wipe"_s, u"--yes"_s}), (Ended{0, {}, {}}));
    EXPECT_EQ(OnTable(u"export"_s, {u"-"_s}).err, u"0 record(s) exported.\n"_s);
}

TEST_F(ResultProgram, TakesANegativeNumberForAValue)
{
    EXPECT_EQ(OnTable(u"update-all"_s, {u"Age"_s, u"-7"_s, u"--yes"_s}), (Ended{0, u"3\n"_s, {}}));
    EXPECT_EQ(OnTable(u"update-all"_s, {u"Price"_s, u"-.5"_s, u"--yes"_s}), (Ended{0, u"3\n"_s, {}}));
    EXPECT_EQ(Sql(u"SELECT DISTINCT Age,Price FROM T"_s), u"Age,Price\n-7,-0.5\n"_s);
    EXPECT_EQ(Run({u"eval"_s, u"-5+3"_s}), (Ended{0, u"-2\n"_s, {}}));
    EXPECT_EQ(Run({u"eval"_s, u"--"_s, u"-ROUND(2.5,0)"_s}), (Ended{0, u"-3\n"_s, {}}));
}

} // namespace
} // namespace mirel
