#include "tableview/export_draft.h"

#include "support/file_size_limit.h"
#include "tableview/people_fixture.h"

#include <QDir>
#include <QFile>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class Export : public PeopleFixture {
protected:
    QString File(const QString& name) const { return folder.filePath(name); }
    QByteArray Read(const QString& name) const
    {
        QFile file(File(name));
        EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << name.toStdString();
        return file.readAll();
    }
    void Write(const QString& name, const QByteArray& bytes) const
    {
        QFile file(File(name));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(bytes);
    }
    void OpenLongSource()
    {
        Run(u"CREATE TABLE Digits (D Integer)"_s);
        for (int i = 0; i < 10; ++i)
            Run(u"INSERT INTO Digits (D) VALUES(%1)"_s.arg(i));
        ASSERT_TRUE(draft.SetSource(u"SELECT Name,a.D,b.D,c.D FROM People INNER JOIN Digits a ON a.D>=0 "
                                    "INNER JOIN Digits b ON b.D>=0 INNER JOIN Digits c ON c.D>=0"_s));
        ASSERT_EQ(draft.RecordCount(), 25000);
    }

    ExportDraft draft{connection, path, prompt};
};

TEST_F(Export, NeedsRecordsAndAFile)
{
    EXPECT_FALSE(draft.CanRun());
    EXPECT_FALSE(draft.SetSource(u"SELECT * FROM Gone"_s));
    EXPECT_EQ(prompt.shown.size(), 1);
    EXPECT_TRUE(draft.SetSource(u"SELECT * FROM People WHERE Age>1000"_s));
    EXPECT_TRUE(draft.ChoosePath(File(u"a"_s)));
    EXPECT_EQ(draft.Path(), File(u"a.csv"_s));
    EXPECT_FALSE(draft.CanRun());
    EXPECT_FALSE(draft.Run());
    EXPECT_FALSE(QFile::exists(draft.Path())) << "no records, no file";
    EXPECT_TRUE(draft.SetSource(u"SELECT * FROM People"_s));
    EXPECT_TRUE(draft.CanRun());
}

TEST_F(Export, ShowsTheFieldsWithTheirFirstData)
{
    ASSERT_TRUE(draft.SetSource(u"SELECT Name,Born,Member,Age FROM People WHERE Name='P5'"_s));
    QStringList lines;
    for (const ExportDraft::Field& field : draft.Fields())
        lines += field.name + u'|' + field.type + u'|' + field.firstData;
    EXPECT_EQ(lines, QStringList({u"Name|Text|P5"_s, u"Born|DateTime|7/4/2001"_s, u"Member|Yes/No|0"_s,
                                  u"Age|Integer|"_s}));
}

TEST_F(Export, WritesTheFileAndCountsItsRecords)
{
    ASSERT_TRUE(draft.SetSource(u"SELECT Name,Age,Member,Born FROM People WHERE Name='P4' OR Name='P5'"_s));
    draft.Options().header = true;
    draft.Options().separator = u';';
    draft.Options().SetDateOrder(DateOrder::YearMonthDay);
    EXPECT_TRUE(draft.ChoosePath(File(u"a.txt"_s)));
    EXPECT_TRUE(draft.Run());
    EXPECT_EQ(Read(u"a.txt"_s), "\"Name\";\"Age\";\"Member\";\"Born\"\r\n\"P4\";24;1;2001-07-04\r\n"
                                "\"P5\";;0;2001-07-04\r\n");
    EXPECT_EQ(prompt.shown, QStringList(u"2 record(s) exported."_s));
}

TEST_F(Export, PreviewsTenLinesAndSaysThatThereAreMore)
{
    ASSERT_TRUE(draft.SetSource(u"SELECT Name FROM People WHERE Age<=31"_s)); // every fifth has no age
    QStringList lines = draft.Preview();
    EXPECT_EQ(lines.size(), 9);
    EXPECT_EQ(lines.last(), u"\"P11\""_s);
    ASSERT_TRUE(draft.SetSource(u"SELECT Name FROM People"_s));
    draft.Options().header = true;
    lines = draft.Preview();
    EXPECT_EQ(lines.size(), 11);
    EXPECT_EQ(lines.first(), u"\"Name\""_s);
    EXPECT_EQ(lines[9], u"\"P9\""_s);
    EXPECT_EQ(lines.last(), u"....."_s);
}

TEST_F(Export, AsksBeforeItReplacesAFile)
{
    Write(u"old.csv"_s, "old");
    ASSERT_TRUE(draft.SetSource(u"SELECT Name FROM People WHERE Name='P1'"_s));
    EXPECT_TRUE(draft.ChoosePath(File(u"new.csv"_s)));
    EXPECT_FALSE(draft.ChoosePath(File(u"old"_s)));
    EXPECT_EQ(prompt.questions.size(), 1);
    EXPECT_EQ(draft.Path(), File(u"new.csv"_s));
    EXPECT_FALSE(draft.ChoosePath({}));
    prompt.answers = {true};
    EXPECT_TRUE(draft.ChoosePath(File(u"old.csv"_s)));
    EXPECT_EQ(Read(u"old.csv"_s), "old") << "only the run replaces it";
    EXPECT_TRUE(draft.Run());
    EXPECT_EQ(Read(u"old.csv"_s), "\"P1\"\r\n");
}

TEST_F(Export, SaysWhyAFileCannotBeMadeAndCanGoElsewhere)
{
    ASSERT_TRUE(draft.SetSource(u"SELECT Name FROM People"_s));
    EXPECT_TRUE(draft.ChoosePath(File(u"missing/a.csv"_s)));
    EXPECT_FALSE(draft.Run());
    EXPECT_EQ(prompt.shown, QStringList(u"File creation fail.\r\n"_s + File(u"missing/a.csv"_s)));
    EXPECT_TRUE(draft.ChoosePath(File(u"a.csv"_s)));
    EXPECT_TRUE(draft.Run());
}

TEST_F(Export, NeverReplacesTheDatabaseItself)
{
    ASSERT_TRUE(draft.SetSource(u"SELECT Name FROM People"_s));
    ASSERT_TRUE(QFile::link(path, File(u"link.csv"_s)));
    for (const QString& database :
         {path, File(u"link.csv"_s), File(u"../"_s) + QDir(folder.path()).dirName() + u"/people.cdb"_s}) {
        prompt.answers = {true};
        EXPECT_TRUE(draft.ChoosePath(database));
        EXPECT_FALSE(draft.Run());
        EXPECT_TRUE(prompt.shown.takeLast().startsWith(u"File creation fail."_s));
    }
    EXPECT_EQ(Stored(u"SELECT COUNT(*) FROM People"_s), u"25"_s);
}

TEST_F(Export, LeavesTheOldFileWhenTheDiskIsFull)
{
    OpenLongSource();
    Write(u"old.csv"_s, "old");
    prompt.answers = {true};
    EXPECT_TRUE(draft.ChoosePath(File(u"old.csv"_s)));
    {
        const FileSizeLimit full(100000);
        EXPECT_FALSE(draft.Run());
    }
    EXPECT_EQ(prompt.shown.size(), 1);
    EXPECT_TRUE(prompt.shown[0].contains(File(u"old.csv"_s)));
    EXPECT_EQ(Read(u"old.csv"_s), "old");
    EXPECT_EQ(QDir(folder.path()).entryList({u"old*"_s}, QDir::Files), QStringList(u"old.csv"_s)) << "no remains";
}

TEST_F(Export, LeavesNothingOfANewFileWhenTheDiskIsFull)
{
    OpenLongSource();
    EXPECT_TRUE(draft.ChoosePath(File(u"new.csv"_s)));
    {
        const FileSizeLimit full(100000);
        EXPECT_FALSE(draft.Run());
    }
    EXPECT_EQ(QDir(folder.path()).entryList({u"new*"_s}, QDir::Files), QStringList());
}

TEST_F(Export, TakesTheEndingOfWhatIsWritten)
{
    OpenLongSource();
    EXPECT_TRUE(draft.ChoosePath(File(u"a"_s)));
    EXPECT_TRUE(draft.SetKind(ExportKind::Html));
    EXPECT_EQ(draft.Path(), File(u"a.html"_s));
    EXPECT_TRUE(draft.Preview().first().startsWith(u"<!DOCTYPE html>"_s));
    Write(u"a.json"_s, "theirs");
    EXPECT_FALSE(draft.SetKind(ExportKind::Json)) << "the file that is there stays";
    EXPECT_TRUE(draft.Path().isEmpty());
}

TEST_F(Export, KeepsWhatWasWrittenWhenTheUserStops)
{
    OpenLongSource();
    EXPECT_TRUE(draft.ChoosePath(File(u"a.csv"_s)));
    prompt.stopAt = 5000;
    EXPECT_TRUE(draft.Run());
    const int records = int(Read(u"a.csv"_s).count("\r\n"));
    EXPECT_GE(records, 5000);
    EXPECT_LT(records, 8000);
    EXPECT_EQ(prompt.shown, QStringList(u"%1 record(s) exported."_s.arg(records)));
}

TEST(CsvExportOptions, BringTheUsualSeparatorsAlongWithAnotherDateOrder)
{
    CsvExportOptions options;
    options.SetDateOrder(DateOrder::DayMonthYear);
    EXPECT_EQ(options.dates, (DateFormat{DateOrder::DayMonthYear, u'-', u':'}));
    options.dates.dateSeparator = u'.';
    options.SetDateOrder(DateOrder::YearMonthDay);
    EXPECT_EQ(options.dates.dateSeparator, u'.') << "what the user chose stays";
}

} // namespace
} // namespace mirel
