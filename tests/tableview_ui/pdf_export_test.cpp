// A table as a document, read back by another program.
#include "support/test_database.h"
#include "tableview/ui/pdf_export.h"

#include <QBuffer>
#include <QDir>
#include <QFile>
#include <QProcess>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class PdfExport : public TestDatabase {
protected:
    CsvExportResult Export(const QString& statement, Progress* progress = nullptr)
    {
        DbRecordset source(connection_);
        EXPECT_TRUE(Open(source, statement, LockType::ReadOnly));
        const QString folder = qEnvironmentVariable("MIREL_PICTURES", folder_.path());
        file_ = QDir(folder).filePath(
            QString::fromLatin1(::testing::UnitTest::GetInstance()->current_test_info()->name()) + u".pdf"_s);
        QFile file(file_);
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        CsvExportOptions options;
        options.kind = ExportKind::Pdf;
        options.dates = {DateOrder::YearMonthDay, u'-', u':'};
        options.title = u"Vögel, all of them"_s;
        return ExportPdf(source, options, file, progress);
    }

    // The pages as a reader of documents sees them.
    QStringList Pages()
    {
        QProcess reader;
        reader.start(u"pdftotext"_s, {u"-raw"_s, file_, u"-"_s});
        EXPECT_TRUE(reader.waitForFinished()) << "pdftotext is missing";
        EXPECT_EQ(reader.exitCode(), 0) << reader.readAllStandardError().toStdString();
        QStringList pages = QString::fromUtf8(reader.readAllStandardOutput()).split(u'\f');
        pages.removeLast();
        for (QString& page : pages)
            page = page.simplified();
        return pages;
    }

    QString file_;
};

TEST_F(PdfExport, SetsEveryRecordUnderTheNamesOfItsFields)
{
    Run(u"CREATE TABLE Birds (Number Integer, Name Varchar(40), Weight Float, Seen Datetime, Rare Bit)"_s);
    for (int i = 1; i <= 120; ++i)
        Run(u"INSERT INTO Birds VALUES(%1,'Vogel %1',%1.5,'2001-02-03',%2)"_s.arg(i).arg(i % 2));
    Run(u"INSERT INTO Birds (Number) VALUES(121)"_s);
    const CsvExportResult result = Export(u"SELECT * FROM Birds"_s);
    EXPECT_EQ(result.ending, CsvExportResult::Ending::Complete);
    EXPECT_EQ(result.records, 121);

    const QStringList pages = Pages();
    ASSERT_GT(pages.size(), 1);
    for (qsizetype i = 0; i < pages.size(); ++i) {
        EXPECT_TRUE(pages[i].startsWith(u"Number Name Weight Seen Rare "_s)) << pages[i].left(80).toStdString();
        EXPECT_TRUE(pages[i].endsWith(u"Page %1 Vögel, all of them"_s.arg(i + 1)))
            << pages[i].right(80).toStdString();
    }
    const QString all = pages.join(u' ');
    qsizetype from = 0;
    for (int i = 1; i <= 120; ++i) {
        const QString record =
            u" %1 Vogel %1 %1.5 2001-02-03 %2 "_s.arg(QString::number(i), i % 2 ? u"Yes"_s : u"No"_s);
        const qsizetype at = all.indexOf(record, from);
        EXPECT_GE(at, from) << record.toStdString();
        from = std::max(from, at);
    }
}

TEST_F(PdfExport, FitsManyColumnsAndLongTextsOnThePage)
{
    QStringList columns;
    QStringList values;
    for (int i = 0; i < 9; ++i) {
        columns += u"[Column number %1] Varchar(40)"_s.arg(i);
        values += u"'the words of column %1'"_s.arg(i);
    }
    Run(u"CREATE TABLE Wide ("_s + columns.join(u',') + u", Story Memo)"_s);
    Run(u"INSERT INTO Wide VALUES("_s + values.join(u',') + u",'begin "_s + u"bird "_s.repeated(80) + u"end')"_s);
    EXPECT_EQ(Export(u"SELECT * FROM Wide"_s).ending, CsvExportResult::Ending::Complete);
    const QString text = Pages().join(u' ');
    EXPECT_TRUE(text.contains(u"begin "_s + u"bird "_s.repeated(80) + u"end"_s)) << text.toStdString();
    for (const QString& value : values)
        EXPECT_TRUE(text.contains(QString(value).remove(u'\''))) << value.toStdString();
}

TEST_F(PdfExport, StopsWhenItIsTold)
{
    struct Impatient : Progress {
        bool Advance(qint64) override { return false; }
    } progress;
    Run(u"CREATE TABLE T (N Integer)"_s);
    for (int i = 0; i < 200; ++i)
        Run(u"INSERT INTO T VALUES(%1)"_s.arg(i));
    const CsvExportResult result = Export(u"SELECT * FROM T"_s, &progress);
    EXPECT_EQ(result.ending, CsvExportResult::Ending::Stopped);
    EXPECT_LT(result.records, 200);
    EXPECT_TRUE(Pages().last().contains(u" %1 "_s.arg(result.records - 1)));

    EXPECT_EQ(Export(u"SELECT * FROM T WHERE N<0"_s).records, 0);
    EXPECT_TRUE(Pages().value(0).startsWith(u"N "_s)) << "an empty table has its page";
}

} // namespace
} // namespace mirel
