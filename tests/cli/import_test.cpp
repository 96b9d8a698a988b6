// What an import finds out by itself, passes over and changes.
#include "cli/program_fixture.h"

#include <QStringEncoder>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const QString kDetect = u"--detect"_s;
const QString kCreate = u"--create"_s;
const QString kSkip = u"--skip-to"_s;
const QString kKey = u"--key"_s;

class Import : public Program {
protected:
    QByteArray FileBytes(const QString& name) const
    {
        QFile file(Path(name));
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("(no file)");
    }
    QString Fields() const { return Run({u"fields"_s, u"a.cdb"_s, u"T"_s, u"--format"_s, u"csv"_s}).out; }
};

TEST_F(Import, FillsInWhatIsNotGiven)
{
    NewDatabase();
    const Ended ended = Program::Import(
        u"Ort;Preis;Am\nK\u00F6ln;1,50;24.12.2001\n\"a;\"\"b\"\"\nc\";;\n"_s.toLatin1(), {kDetect, kCreate});
    EXPECT_EQ(ended.out, u"2 record(s) imported.\n"_s);
    EXPECT_EQ(
        ended.err,
        u"Found: --separator semicolon --quote '\"' --quoted-lines --header --encoding ISO-8859-1 --date-order 4 "
        u"--date-separator '.' --time-separator ':' --decimal comma --columns "
        u"'Ort:Text:50,Preis:Double,Am:DateTime' (line ends LF, 2 record(s))\n"_s);
    EXPECT_EQ(Sql(u"SELECT * FROM T"_s), u"Ort,Preis,Am\nK\u00F6ln,1.5,2001-12-24\n\"a;\"\"b\"\"\nc\",,\n"_s);
    EXPECT_EQ(Program::Import("", {kDetect, kCreate}).err, u"The file holds no text.\n"_s);
    // Into a table that is there: by the names, with what is given left alone.
    EXPECT_EQ(Program::Import("am;ort\n24.12.2002;x\n", {kDetect}).out, u"1 record(s) imported.\n"_s);
    EXPECT_EQ(Program::Import("y;7;\n", {kDetect, u"--no-header"_s}).out, u"1 record(s) imported.\n"_s);
    EXPECT_EQ(Sql(u"SELECT Ort, Am FROM T WHERE Ort = 'x'"_s), u"Ort,Am\nx,2002-12-24\n"_s);
}

TEST_F(Import, WritesFailingLinesAsTheyStand)
{
    NewDatabase();
    const QByteArray file = "n,\"t\"\r\n1,a\r\nx,\"b \"\"c\r\n2,\xFF\r\n3,d";
    const QStringList options = {kCreate, u"--header"_s, u"--columns"_s, u"N:Integer,T"_s, kSkip, u"bad.csv"_s};
    const Ended ended = Program::Import(file, options);
    EXPECT_EQ(ended, (Ended{0, u"2 record(s) imported, 2 line(s) skipped.\n"_s, {}}));
    EXPECT_EQ(FileBytes(u"bad.csv"_s), QByteArray("x,\"b \"\"c\r\n2,\xFF\r\n"));
    const QStringList again = {kSkip, u"bad.csv"_s};
    EXPECT_EQ(Program::Import("5,x\n", again).status, 2) << "what is there is kept";
    EXPECT_EQ(Program::Import("5,x\n", again + QStringList{u"--yes"_s}).out,
              u"1 record(s) imported, 0 line(s) skipped.\n"_s);
    EXPECT_EQ(FileBytes(u"bad.csv"_s), QByteArray("(no file)"));
    for (const QString& own : {u"a.csv"_s, u"a.cdb"_s})
        EXPECT_EQ(Program::Import("x,y\n", {kSkip, own, u"--yes"_s}).status, 1) << own.toStdString();
    EXPECT_EQ(Sql(u"SELECT COUNT(*) FROM T"_s).section(u'\n', 1, 1), u"3"_s);
    // A text that never ends costs its own line; one of several lines counts once; other encodings come back.
    EXPECT_EQ(Program::Import("x,\"p\nq\"\n6,\"r\n7,s\n", {u"--quoted-lines"_s, kSkip, u"lines.csv"_s}).out,
              u"1 record(s) imported, 2 line(s) skipped.\n"_s);
    EXPECT_EQ(FileBytes(u"lines.csv"_s), QByteArray("x,\"p\nq\"\n6,\"r\n"));
    const QByteArray wide =
        QStringEncoder(QStringConverter::Utf16LE, QStringConverter::Flag::WriteBom)(u"x,\u00E4\r\n"_s);
    EXPECT_EQ(Program::Import(wide, {kSkip, u"wide.csv"_s}).status, 0);
    EXPECT_EQ(FileBytes(u"wide.csv"_s), wide);
}

TEST_F(Import, ChangesRecordsByTheirKey)
{
    NewDatabase();
    ASSERT_EQ(
        Program::Import("1,Ann,a\n2,Bob,b\n3,Cid,c\n3,Dan,d\n", {kCreate, u"--columns"_s, u"K:Integer,N,X"_s})
            .status,
        0);
    const QStringList key = {u"--columns"_s, u"K,N"_s, kKey, u"K"_s};
    EXPECT_EQ(Program::Import("2,Eve\n9,Fay\n2,Gus\n9,Hal\n,Ida\n", key),
              (Ended{0, u"2 record(s) imported, 1 updated.\n"_s, {}}));
    const QString after = u"K,N,X\n,Ida,\n1,Ann,a\n2,Gus,b\n3,Cid,c\n3,Dan,d\n9,Hal,\n"_s;
    EXPECT_EQ(Sql(u"SELECT * FROM T ORDER BY K, N"_s), after);
    const Ended several = Program::Import("1,X\n3,Y\n", key);
    EXPECT_EQ(several, (Ended{1, {}, u"The key on line 2 names several records. Nothing was imported.\n"_s}));
    EXPECT_EQ(Program::Import("1,X\n", {kKey, u"Q"_s}).status, 1);
    EXPECT_EQ(Sql(u"SELECT * FROM T ORDER BY K, N"_s), after);
    // Of two lines with one key, the good one is taken when the later one fails.
    EXPECT_EQ(Program::Import("1,Jon,j\nx,Kim,k\n5,Lea,l\n", {kKey, u"K"_s, kSkip, u"bad.csv"_s}).out,
              u"1 record(s) imported, 1 updated, 1 line(s) skipped.\n"_s);
    const Ended failing = Program::Import("1,Max,m\nx,Kim,k\n1,Ned,n\n", {kKey, u"K"_s});
    EXPECT_EQ(failing.status, 1);
    EXPECT_EQ(Sql(u"SELECT N FROM T WHERE K = 1"_s), u"N\nMax\n"_s) << "what precedes the failing line stays";
    // More records than are read at a time.
    QByteArray many;
    for (int i = 0; i < 5000; ++i)
        many += QByteArray::number(i + 10) + ",n,x\n";
    EXPECT_EQ(Program::Import(many, {}).status, 0);
    EXPECT_EQ(Program::Import("5009,last,y\n", {kKey, u"K"_s}).out, u"0 record(s) imported, 1 updated.\n"_s);
    EXPECT_EQ(Sql(u"SELECT N FROM T WHERE K = 5009"_s), u"N\nlast\n"_s);
    // Two fields, one of them a number that is stored as a double.
    EXPECT_EQ(Sql(u"CREATE TABLE P (A FLOAT, B Varchar(9), C Integer)"_s), QString());
    const auto intoP = [this](const QByteArray& bytes) {
        WriteFile(u"p.csv"_s, bytes);
        return Run({u"import"_s, u"a.cdb"_s, u"p.csv"_s, u"--table"_s, u"P"_s, kKey, u"a, B"_s}).out;
    };
    EXPECT_EQ(intoP("1,x,5\n1,y,6\n"), u"2 record(s) imported, 0 updated.\n"_s);
    EXPECT_EQ(intoP("1.0,y,7\n1.5,y,8\n"), u"1 record(s) imported, 1 updated.\n"_s);
}

TEST_F(Import, ExportsInOtherFormats)
{
    NewDatabase();
    Sql(u"CREATE TABLE T (N Integer, X Varchar(20), D DateTime, F Bit)"_s);
    Sql(u"INSERT INTO T VALUES (1, 'a<b & \"c\"', '2001-07-04 09:05:00', TRUE)"_s);
    Sql(u"INSERT INTO T (N) VALUES (2)"_s);
    const auto exported = [this](const QStringList& options) {
        EXPECT_EQ(Run(QStringList{u"export"_s, u"a.cdb"_s, u"T"_s, u"o.txt"_s, u"--yes"_s} + options).err,
                  u"2 record(s) exported.\n"_s);
        return FileBytes(u"o.txt"_s);
    };
    EXPECT_EQ(exported({u"--format"_s, u"json"_s}),
              QByteArray("[{\"N\":1,\"X\":\"a<b & \\\"c\\\"\",\"D\":\"2001-07-04T09:05:00\",\"F\":true},\n"
                         "{\"N\":2,\"X\":null,\"D\":null,\"F\":null}]\n"));
    const QByteArray page = exported({u"--format"_s, u"html"_s});
    EXPECT_TRUE(page.contains("<td class=\"n\">1</td><td>a&lt;b &amp; \"c\"</td>")) << page.toStdString();
    EXPECT_TRUE(page.endsWith("</table>\n</body>\n</html>\n"));
    EXPECT_TRUE(exported({u"--bom"_s})
                    .startsWith("\xEF\xBB\xBF"
                                "1,\"a<b"));
    EXPECT_TRUE(exported({u"--bom"_s, u"--encoding"_s, u"UTF-16LE"_s})
                    .startsWith(QByteArray("\xFF\xFE"
                                           "1\0,\0",
                                           6)));
    EXPECT_TRUE(exported({u"--bom"_s, u"--encoding"_s, u"ISO-8859-1"_s}).startsWith("1,")) << "Latin-1 has no byte order mark";
    EXPECT_EQ(Run({u"export"_s, u"a.cdb"_s, u"T"_s, u"p.txt"_s, u"--format"_s, u"pdf"_s}).status, 2);
}

// Nasty files go in by Detect alone, go out, and come in again as the same table.
TEST_F(Import, BringsNastyFilesThroughUnchanged)
{
    const QByteArray wideNames = [] {
        QByteArray line;
        for (int i = 0; i < 200; ++i)
            line += (i > 0 ? ";c" : "c") + QByteArray::number(i);
        return line + "\n" + QByteArray("5;").repeated(199) + "5\n" + QByteArray("7;").repeated(199) + "x\n";
    }();
    using Flag = QStringConverter::Flag;
    const std::vector<std::pair<const char*, QByteArray>> files = {
        {"semicolons, decimal commas, Latin-1, CR LF",
         u"Name;Preis\r\nM\u00FCller;1,5\r\n\u00C4rger;-0,25\r\n"_s.toLatin1()},
        {"tabs, UTF-16, CR",
         QStringEncoder(QStringConverter::Utf16BE, Flag::WriteBom)(u"k\tv\r1\t\u65E5\u672C\r22\t\U0001F600\r"_s)},
        {"marks and lines inside", "id,memo\n1,\"say \"\"hi\"\",\nthen go\"\n2,\"\"\"\"\n3,\"it's, O'Brien\"\n"},
        {"200 columns", wideNames},
        {"a line of ten megabytes", "a|b\n1|" + QByteArray(10 << 20, 'y') + "\n2|z\n"},
        {"NULs", QByteArray("a,b\nx\0,1\ny,2\n", 13)},
        {"ragged lines", "a,b,c\n1,x\n2,y,z,w\n3\n"},
        {"postcodes, dates, Yes/No", "zip;on;born\n00501;1;31.01.1999\n90210;0;24.12.2001\n"},
        {"bars and single marks", "k|v\n1|'a|b'\n2|'c'\n"},
    };
    NewDatabase();
    int number = 0;
    for (const auto& [what, bytes] : files) {
        const QString first = u"F%1"_s.arg(++number);
        const QString second = first + u"b"_s;
        const auto import = [&](const QString& file, const QString& table) {
            return Run({u"import"_s, u"a.cdb"_s, file, u"--table"_s, table, kCreate, kDetect});
        };
        WriteFile(u"in.csv"_s, bytes);
        const Ended in = import(u"in.csv"_s, first);
        ASSERT_EQ(in.status, 0) << what << ": " << in.err.toStdString();
        ASSERT_EQ(
            Run({u"export"_s, u"a.cdb"_s, first, u"out.csv"_s, u"--header"_s, u"--doubled-quotes"_s, u"--yes"_s})
                .status,
            0)
            << what;
        const Ended again = import(u"out.csv"_s, second);
        EXPECT_EQ(again.out, in.out) << what << ": " << again.err.toStdString();
        EXPECT_EQ(Run({u"fields"_s, u"a.cdb"_s, second}).out, Run({u"fields"_s, u"a.cdb"_s, first}).out) << what;
        EXPECT_TRUE(Sql(u"SELECT * FROM "_s + second) == Sql(u"SELECT * FROM "_s + first)) << what;
    }
    EXPECT_EQ(Sql(u"SELECT zip, [on], born FROM F8"_s),
              u"zip,on,born\n00501,Yes,1999-01-31\n90210,No,2001-12-24\n"_s);
    EXPECT_EQ(Sql(u"SELECT v FROM F9"_s), u"v\na|b\nc\n"_s);
    EXPECT_EQ(Sql(u"SELECT a, b FROM F6"_s), u"a,b\nx,1\ny,2\n"_s);
}

} // namespace
} // namespace mirel
