// Tables made and changed by a list of their fields.
#include "cli/program_fixture.h"

namespace mirel {
namespace {

class DesignProgram : public Program {
protected:
    Ended Design(const QByteArray& json, const QStringList& options = {}, const QString& table = u"T"_s)
    {
        WriteFile(u"fields.json"_s, json);
        return Run(QStringList{u"design"_s, u"a.cdb"_s, table, u"fields.json"_s} + options);
    }
    QString Fields() { return Run({u"fields"_s, u"a.cdb"_s, u"T"_s, u"--format"_s, u"csv"_s}).out; }
};

TEST_F(DesignProgram, MakesAndChangesATable)
{
    NewDatabase();
    EXPECT_EQ(Design(R"([{"name":"A","type":"Text","size":10,"index":"ASC"},{"name":"B","type":"Text"}])"),
              (Ended{0, {}, {}}));
    EXPECT_EQ(Fields(), u"name,type,size,indexed\nA,Text,10,ASC\nB,Text,255,NO\n"_s);
    Sql(u"INSERT INTO T (A,B) VALUES ('1','x')"_s);
    Sql(u"INSERT INTO T (A,B) VALUES ('22','y')"_s);

    // Names exchanged, a type changed, a field added in front.
    EXPECT_EQ(Design(R"([{"name":"New","type":"Memo"},{"name":"A","type":"Text","was":"B"},
                         {"name":"B","type":"Integer","was":"A","index":"DESC"}])"),
              (Ended{0, {}, {}}));
    EXPECT_EQ(Fields(), u"name,type,size,indexed\nNew,Memo,,NO\nA,Text,255,NO\nB,Integer,4,DESC\n"_s);
    EXPECT_EQ(Sql(u"SELECT * FROM T"_s), u"New,A,B\n,x,1\n,y,22\n"_s);

    const Ended missing = Design(R"([{"name":"B","type":"Integer"}])");
    EXPECT_EQ(missing.status, 2);
    EXPECT_EQ(missing.err.section(u'\n', 0, 0),
              u"These fields are not in the list and would go; --yes drops them: New, A"_s);
    const Ended unfit = Design(R"([{"name":"A","type":"Integer"}])", {u"--yes"_s});
    EXPECT_EQ(unfit.status, 1);
    EXPECT_TRUE(unfit.err.startsWith(u"2 of the 2 value(s) of \"A\" in \"T\" cannot become Integer"_s))
        << unfit.err.toStdString();
    EXPECT_EQ(Sql(u"SELECT * FROM T"_s), u"New,A,B\n,x,1\n,y,22\n"_s);
    EXPECT_EQ(Design(R"([{"name":"B","type":"Text","size":2}])", {u"--yes"_s}), (Ended{0, {}, {}}));
    EXPECT_EQ(Sql(u"SELECT * FROM T"_s), u"B\n1\n22\n"_s);
}

TEST_F(DesignProgram, MendsWhatRefersToARenamedField)
{
    NewDatabase();
    EXPECT_EQ(Design(R"([{"name":"A","type":"Text"},{"name":"B","type":"Text"}])").status, 0);
    Sql(u"INSERT INTO T (A,B) VALUES ('a','b')"_s);
    EXPECT_EQ(
        Run({u"queries"_s, u"save"_s, u"a.cdb"_s, u"Q"_s, u"SELECT A FROM T WHERE B='b'"_s, u"--table"_s, u"T"_s})
            .status,
        0);
    EXPECT_EQ(Design(R"([{"name":"B","type":"Text","was":"A"},{"name":"A","type":"Text","was":"B"}])"),
              (Ended{0, {}, {}}));
    EXPECT_TRUE(Run({u"queries"_s, u"list"_s, u"a.cdb"_s}).out.contains(u"SELECT B FROM T WHERE A='b'"_s));
    EXPECT_EQ(Run({u"queries"_s, u"run"_s, u"a.cdb"_s, u"Q"_s, u"--format"_s, u"csv"_s}).out, u"B\na\n"_s);
}

TEST_F(DesignProgram, RefusesWhatCannotBe)
{
    NewDatabase();
    struct Row {
        QByteArray json;
        QString table;
        const char* fault;
    };
    const std::vector<Row> rows = {
        {"[]", u"T"_s, "A table needs a field."},
        {"{", u"T"_s, "The list of fields cannot be read: "},
        {R"([{"name":"A","type":"Text","size":256}])", u"T"_s, "Text field can contain"},
        {R"([{"name":"A]","type":"Text"}])", u"T"_s, "\"A]\" cannot be a name"},
        {R"([{"name":"A","type":"Text"},{"name":"a","type":"Text"}])", u"T"_s, "There is a field \"a\" already."},
        {R"([{"name":"A","type":"Text"}])", u"a]b"_s, "\"a]b\" cannot be a name"},
        {R"([{"name":"A","type":"Text","was":"B"}])", u"T"_s, "The table is new: \"A\" cannot have been \"B\"."},
    };
    for (const Row& row : rows) {
        const Ended ended = Design(row.json, {}, row.table);
        EXPECT_EQ(ended.status, 1) << row.json.toStdString();
        EXPECT_TRUE(ended.err.startsWith(QString::fromUtf8(row.fault))) << ended.err.toStdString();
    }
    EXPECT_EQ(Run({u"design"_s, u"a.cdb"_s, u"T"_s, u"nowhere.json"_s}).status, 1);
    EXPECT_EQ(Run({u"tables"_s, u"a.cdb"_s}).out, QString());
}

} // namespace
} // namespace mirel
