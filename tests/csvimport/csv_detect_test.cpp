#include "csvimport/csv_detect.h"
#include "data/field_names.h"
#include "platform/user_locale.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"

#include <gtest/gtest.h>

#include <QBuffer>
#include <QStringEncoder>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// "separator quote flags encoding dates | Name:Type …"; flags are h (header), q (quoted lines), n (NULs are left
// out), "," (decimal comma), w (whole texts). A message where nothing was found.
std::string Found(const QByteArray& bytes, const CsvGiven& given = {})
{
    QBuffer file;
    file.setData(bytes);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly));
    ScriptedPrompt prompt;
    CsvFound found;
    if (!DetectCsv(file, given, found, prompt))
        return prompt.shown.join(u'\n').toStdString();
    const CsvFormat& format = found.format;
    QString text = format.separator == u'\t' ? u"tab"_s : QString(QChar(format.separator));
    text += u' ' + QString(QChar(format.quote)) + u' ';
    const auto flag = [&text](bool on, QChar letter) {
        if (on)
            text += letter;
    };
    flag(format.namesInFirstLine, u'h');
    flag(format.doubledQuotes, u'q');
    flag(format.dropNuls, u'n');
    flag(format.decimal == u',', u',');
    flag(found.longTexts == CellReader::LongTexts::KeepWhole, u'w');
    text += u' ' + format.encoding;
    if (format.dates.order != DateOrder::Locale)
        text += u' ' + QString::number(int(format.dates.order)) + QChar(format.dates.dateSeparator);
    text += u" |"_s;
    for (const ImportColumn& column : found.columns) {
        QString type;
        TypeNameOfField(column.type, type);
        text += u' ' + (column.ignored ? u"-"_s : column.field + u':' + type);
        if (column.dates)
            text += u'@' + QString::number(int(column.dates->order));
    }
    return text.toStdString();
}

QByteArray Encoded(const QString& text, QStringConverter::Encoding encoding, QStringConverter::Flag flag)
{
    return QStringEncoder(encoding, flag)(text);
}

struct Row {
    const char* what;
    QByteArray bytes;
    std::string found;
};

void ExpectFound(const std::vector<Row>& rows)
{
    for (const Row& row : rows)
        EXPECT_EQ(Found(row.bytes), row.found) << row.what;
}

TEST(Detect, FindsTheMarks)
{
    ExpectFound({
        {"commas", "name,n\nAnn,1\nBob,22\n", ", \" h UTF-8 | name:Text n:Integer"},
        {"semicolons, decimal commas", "Ort;Preis\r\nOslo;1,50\r\nCork;1.234,5\r\n",
         "; \" h, UTF-8 | Ort:Text Preis:Double"},
        {"tabs around commas", "a\tb\nx, y\t1\nz, w\t5\n", "tab \" h UTF-8 | a:Text b:Integer"},
        {"bars", "id|who\n7|Ann\n8|Bob\n", "| \" h UTF-8 | id:Integer who:Text"},
        {"texts with blanks alone", "Ann Lee\nBob Ray\nCid Moe\n", ", \" h UTF-8 | Ann Lee:Text"},
        {"numbers alone", "1.5\n2.5\n3\n", ", \"  UTF-8 | Field1:Double"},
        {"times are no columns", "at\n2001-07-04 09:05:00\n2001-07-05 10:00:00\n",
         ", \" h UTF-8 3- | at:DateTime"},
        {"single marks", "k,v\n1,'a, b'\n2,'c, d'\n", ", ' h UTF-8 | k:Integer v:Text"},
        {"doubled marks and lines inside", "k,v\n1,\"a \"\"b\"\",\nc\"\n2,\"d\"\n",
         ", \" hq UTF-8 | k:Integer v:Text"},
        {"inches are no marks", "size,n\n5\",1\n\"7,2\n9\",3\n", ", \" h UTF-8 | size:Text n:Integer"},
        {"only a carriage return", "a,b\r1,x\r2,y\r", ", \" h UTF-8 | a:Integer b:Text"},
    });
}

TEST(Detect, FindsTheEncoding)
{
    const QString text = u"städte,n\nKöln,1\nMünchen,2\n"_s;
    using Flag = QStringConverter::Flag;
    ExpectFound({
        {"UTF-8", text.toUtf8(), ", \" h UTF-8 | städte:Text n:Integer"},
        {"with its mark", "\xEF\xBB\xBF" + text.toUtf8(), ", \" h UTF-8 | städte:Text n:Integer"},
        {"UTF-16 by its mark", Encoded(text, QStringConverter::Utf16BE, Flag::WriteBom),
         ", \" h UTF-16BE | städte:Text n:Integer"},
        {"UTF-16 by its NULs", Encoded(text, QStringConverter::Utf16LE, Flag::Default),
         ", \" h UTF-16LE | städte:Text n:Integer"},
        {"Latin-1", text.toLatin1(), ", \" h ISO-8859-1 | städte:Text n:Integer"},
        {"Windows", "a,b\n\x80 5,1\nx\xE4,2\n", ", \" h windows-1252 | a:Text b:Integer"},
        {"one broken line in much UTF-8", "a,b\n" + QByteArray("ä,1\n").repeated(50) + "\xFF,2\n",
         ", \" h UTF-8 | a:Text b:Yes/No"},
        {"NULs", QByteArray("a,b\nx\0y,1\nz,2\n", 14), ", \" hn UTF-8 | a:Text b:Integer"},
    });
}

TEST(Detect, TellsNamesFromRecords)
{
    ExpectFound({
        {"numbers below a word", "1,2\n3,4\n", ", \"  UTF-8 | Field1:Integer Field2:Integer"},
        {"a first text that comes again", "Ann,Oslo\nBob,Oslo\nCid,Cork\n",
         ", \"  UTF-8 | Field1:Text Field2:Text"},
        {"texts that come once", "Name,City\nBob,Oslo\nCid,Cork\n", ", \" h UTF-8 | Name:Text City:Text"},
        {"one line", "Ann,5\n", ", \"  UTF-8 | Field1:Text Field2:Integer"},
        {"names to mend", "a,a,,x[1]\n1,2,3,4\n5,6,7,8\n",
         ", \" h UTF-8 | a:Integer a 2:Integer Field3:Integer x(1):Integer"},
        {"a separator at each end", "a,b,\n1,x,\n2,y,\n", ", \" h UTF-8 | a:Integer b:Text -"},
        {"ragged lines", "a,b\n1,x\n2\n3,y,z\n", ", \" h UTF-8 | a:Integer b:Text Field3:Text"},
        {"nothing but blanks", " \r\n\t\r\n", "The file holds no text."},
        {"nothing", "", "The file holds no text."},
    });
}

TEST(Detect, FindsTypes)
{
    ExpectFound({
        {"codes are no numbers", "zip,big,id\n00501,3000000000,1\n10001,5,2\n",
         ", \" h UTF-8 | zip:Text big:Double id:Integer"},
        {"0 and 1, and other words", "a,b\n0,yes\n1,no\n", ", \" h UTF-8 | a:Yes/No b:Text"},
        {"days first", "d\n24.12.2001\n01.02.2002\n", ", \" h UTF-8 4. | d:DateTime"},
        {"one certain column decides", "d;e\n1/2/2001;31/1/2001\n3/4/2002;5/5/2005\n",
         "; \" h UTF-8 4/ | d:DateTime e:DateTime"},
        {"uncertain: the user's order", "d;n\n1/2/2001;5\n3/4/2002;7\n", "; \" h UTF-8 0/ | d:DateTime n:Integer"},
        {"years first, with a time", "d\n2001-07-04\n2001-07-05 10:00:00\n", ", \" h UTF-8 3- | d:DateTime"},
        {"two forms", "d;e\n24.12.2001;12/24/2001\n25.12.2001;12/25/2001\n",
         "; \" h UTF-8 4. | d:DateTime e:DateTime@0"},
        {"no such day", "d\n31.02.2001\n24.12.2001\n", ", \" h UTF-8 | d:Text"},
        {"hours beyond a day", "t\n36:00:00\n01:00:00\n", ", \" h UTF-8 | t:Text"},
        {"long texts", "a\n" + QByteArray(9000, 'x') + "\nb\n", ", \" hw UTF-8 | a:Memo"},
        {"grouped thousands are no decimals", "a;b\n1,234;x\n5,678;y\n", "; \" h UTF-8 | a:Text b:Text"},
    });
}

TEST(Detect, LeavesWhatIsGiven)
{
    EXPECT_EQ(Found("a;b\n1,5;2\n", {.separator = u',', .namesInFirstLine = false}),
              ", \"  UTF-8 | Field1:Text Field2:Text");
    EXPECT_EQ(Found("d\n1/2/2001\n",
                    {.namesInFirstLine = true, .dates = DateFormat{DateOrder::DayMonthYear, u'/', u':'}}),
              ", \" h UTF-8 4/ | d:DateTime");
}

TEST(Detect, TakesWideAndLongFiles)
{
    QByteArray wide;
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 200; ++column)
            wide += (column > 0 ? "\t" : "") +
                    (row == 0 ? "c" + QByteArray::number(column) : QByteArray::number(row * 7));
        wide += '\n';
    }
    EXPECT_TRUE(QString::fromStdString(Found(wide)).endsWith(u"c198:Integer c199:Integer"_s));
    const QByteArray longLine = "a,b\n1," + QByteArray(10 << 20, 'x') + "\n2,y\n";
    EXPECT_EQ(Found(longLine), ", \" hw UTF-8 | a:Integer b:Memo");
}

} // namespace
} // namespace mirel
