#include "csvimport/csv_reader.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QBuffer>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

CsvFormat Doubled(char16_t quote = u'"')
{
    CsvFormat format;
    format.quote = quote;
    format.doubledQuotes = true;
    return format;
}

// Every record as its texts joined by "|", with the fault's number behind "!" where one ended the file.
QStringList Read(QByteArray bytes, const CsvFormat& format = {}, int maxTexts = 100)
{
    QBuffer device(&bytes);
    EXPECT_TRUE(device.open(QIODevice::ReadOnly));
    CsvReader reader(device, format);
    QStringList records;
    CsvReader::Result result;
    while ((result = reader.Next(maxTexts)) == CsvReader::Result::Record) {
        QStringList texts;
        for (const std::string_view text : reader.Texts())
            texts += QString::fromUtf8(text.data(), qsizetype(text.size()));
        records += texts.join(u'|');
    }
    if (result == CsvReader::Result::Fault)
        records +=
            u"!%1 line %2 text %3"_s.arg(QString::number(int(reader.LastFault())), QString::number(reader.Line()),
                                         QString::number(reader.FaultText()));
    return records;
}

struct Row {
    const char* what;
    QByteArray bytes;
    QStringList records;
};

void ExpectRecords(const std::vector<Row>& rows, const CsvFormat& format = {}, int maxTexts = 100)
{
    for (const Row& row : rows)
        EXPECT_EQ(Read(row.bytes, format, maxTexts), row.records) << row.what;
}

TEST(CsvReader, EndsLinesAtEachKindOfLineEnd)
{
    ExpectRecords({{"LF", "a,b\nc\n", {u"a|b"_s, u"c"_s}},
                   {"CR LF", "a,b\r\nc\r\n", {u"a|b"_s, u"c"_s}},
                   {"CR alone", "a,b\rc\r", {u"a|b"_s, u"c"_s}},
                   {"mixed, none at the end", "a\rb\r\nc\nd", {u"a"_s, u"b"_s, u"c"_s, u"d"_s}},
                   {"empty lines", "a\n\n\r\n\rb", {u"a"_s, u""_s, u""_s, u""_s, u"b"_s}},
                   {"no line", "", {}},
                   {"separator at both ends", ",a,\n", {u"|a|"_s}}});
}

TEST(CsvReader, CutsNowhereInsideAnEnclosedText)
{
    ExpectRecords({{"double marks", "a,\"b,c\",d", {u"a|b,c|d"_s}},
                   {"single marks are not the format's: they stay", "a,'b,c',d", {u"a|'b,c'|d"_s}},
                   {"the other mark inside", "\"b',c\",d", {u"b',c|d"_s}},
                   {"marks inside a text", "O'Brien,5\",x", {u"O'Brien|5\"|x"_s}},
                   {"a mark inside an enclosed text", "\"5\" nail, big\",x", {u"5\" nail, big|x"_s}},
                   {"never closed", "'tis,\"a,b", {u"'tis|\"a|b"_s}},
                   {"one mark alone", "\",x", {u"\"|x"_s}},
                   {"nothing enclosed", "\"\",x", {u"|x"_s}},
                   {"an enclosed text ends with its line", "\"a\nb\"", {u"\"a"_s, u"b\""_s}}});
}

TEST(CsvReader, CutsAtAnySeparatorAndTakesOffAnyMark)
{
    CsvFormat format;
    format.separator = u'§';
    format.quote = u'„';
    ExpectRecords({{"two bytes and three", "a§„b§c„§d", {u"a|b§c|d"_s}},
                   {"the usual mark still encloses, and stays", "\"b§c\"§d", {u"\"b§c\"|d"_s}}},
                  format);
    format = {};
    format.quote = 0;
    ExpectRecords({{"no mark", "\"a,b\",\"c\"", {u"\"a,b\"|\"c\""_s}}}, format);
}

TEST(CsvReader, GivesTheLastTextTheRestOfTheLine)
{
    ExpectRecords({{"more texts", "a,b,c,d\ne", {u"a|b,c,d"_s, u"e"_s}},
                   {"enclosed", "a,\"b,c\"", {u"a|b,c"_s}},
                   {"enclosed only in part", "a,\"b\",c", {u"a|\"b\",c"_s}}},
                  {}, 2);
    ExpectRecords({{"over lines", "a,\"b\nc\",d\ne,f", {u"a|\"b\nc\",d"_s, u"e|f"_s}}}, Doubled(), 2);
}

TEST(CsvReader, UndoesDoubledMarks)
{
    ExpectRecords({{"pairs", "\"a \"\"b\"\", c\",d", {u"a \"b\", c|d"_s}},
                   {"a pair and the closing mark", "\"a\"\"\",\"\"\"\",\"\"", {u"a\"|\"|"_s}},
                   {"not in a bare text", "a\"\"b,c", {u"a\"\"b|c"_s}},
                   {"single marks enclose nothing", "'a,b'", {u"'a|b'"_s}},
                   {"line ends inside", "x,\"a\r\nb\n\nc\",y\nz", {u"x|a\r\nb\n\nc|y"_s, u"z"_s}},
                   {"never closed", "x,\"a\nb", {u"!4 line 1 text 1"_s}}},
                  Doubled());
    // Undoubled, such a text is two.
    ExpectRecords({{"without the option", "\"a \"\"b\"\", c\",d", {u"a \"\"b\"| c\"|d"_s}}});
}

TEST(CsvReader, ReadsOtherEncodings)
{
    const QString text = u"ä,€\n日本,\U0001F600"_s;
    const QStringList records = {u"ä|€"_s, u"日本|\U0001F600"_s};
    const auto encoded = [&text](QStringConverter::Encoding encoding) -> QByteArray {
        return QStringEncoder(encoding, QStringConverter::Flag::WriteBom)(text);
    };
    ExpectRecords({{"UTF-8", text.toUtf8(), records},
                   {"UTF-8 with its mark", "\xEF\xBB\xBF" + text.toUtf8(), records},
                   {"UTF-16 by its mark", encoded(QStringConverter::Utf16BE), records},
                   {"UTF-32 by its mark", encoded(QStringConverter::Utf32LE), records},
                   {"a mark alone", "\xEF\xBB\xBF", {}},
                   {"not UTF-8", "a\nb,\xE4\n", {u"a"_s, u"!2 line 2 text 1"_s}},
                   {"NUL", QByteArray("a,b\0c", 5), {u"!2 line 1 text 1"_s}}});
    CsvFormat format;
    format.encoding = u"windows-1252"_s;
    ExpectRecords({{"one byte a character", "\xE4,\x80", {u"ä|€"_s}}}, format);
}

// The seams of the buffer: every line end and mark once on each side of it.
TEST(CsvReader, ReadsAcrossItsBuffer)
{
    for (const qsizetype length : {262141, 262142, 262143, 262144, 262145, 600000}) {
        const QString longText(length, u'x');
        const QByteArray bytes = longText.toUtf8();
        EXPECT_EQ(Read(bytes + "\r\nb\r\n"), (QStringList{longText, u"b"_s})) << length;
        EXPECT_EQ(Read('"' + bytes + "\"\"\n\",b\n" + bytes + ",c", Doubled()),
                  (QStringList{longText + u"\"\n|b"_s, longText + u"|c"_s}))
            << length;
    }
}

// Texts of good records, and the bytes of the failing ones in braces.
QStringList ReadOn(QByteArray bytes, const CsvFormat& format)
{
    QBuffer device(&bytes);
    EXPECT_TRUE(device.open(QIODevice::ReadOnly));
    CsvReader reader(device, format);
    QStringList records;
    for (CsvReader::Result result = reader.Next(); result != CsvReader::Result::End; result = reader.Next()) {
        if (result == CsvReader::Result::Record) {
            records += QString::fromUtf8(reader.Texts().empty() ? ""
                                                                : QByteArray(reader.Texts()[0].data(),
                                                                             qsizetype(reader.Texts()[0].size())));
            continue;
        }
        if (!reader.StepOverFault())
            break;
        const std::string_view raw = reader.RawRecord();
        records += u'{' + QString::fromLatin1(raw.data(), qsizetype(raw.size())) + u'}';
    }
    return records;
}

TEST(CsvReader, GoesOnBehindAFault)
{
    EXPECT_EQ(ReadOn("a\r\nb\xE4\r\nc\n\xFF", {}),
              (QStringList{u"a"_s, u"{b\u00E4\r\n}"_s, u"c"_s, u"{\u00FF}"_s}));
    EXPECT_EQ(ReadOn("a\n\"b\nc\n\"d\n\"e\"\n\"f", Doubled()),
              (QStringList{u"a"_s, u"b\nc\n\"d\n\"e"_s, u"{\"f}"_s}));
    EXPECT_EQ(ReadOn("\"b\r\nc\r\n\"d\r\n", Doubled()), (QStringList{u"{\"b\r\n}"_s, u"c"_s, u"{\"d\r\n}"_s}));
    EXPECT_EQ(ReadOn("\"x\"\"y\nz\xE4\"\nb\n", Doubled()), (QStringList{u"{\"x\"\"y\nz\u00E4\"\n}"_s, u"b"_s}));
    CsvFormat drop;
    drop.dropNuls = true;
    EXPECT_EQ(ReadOn(QByteArray("a\0b\n\0\n", 6), drop), (QStringList{u"ab"_s, u""_s}));
}

TEST(CsvReader, RefusesARecordWithoutEnd)
{
    EXPECT_EQ(Read("a\n" + QByteArray(CsvReader::kMaxRecordBytes + 1, 'x')),
              (QStringList{u"a"_s, u"!3 line 2 text 0"_s}));
}

TEST(CsvReader, TakesLinearTimeForMarksThatNothingCloses)
{
    const QByteArray open = QByteArray("\"a,'b,").repeated(1'000'000);
    EXPECT_EQ(Read(open, {}, CsvReader::kMaxTexts).size(), 1);
    EXPECT_EQ(Read("\"" + QByteArray("\n").repeated(1'000'000), Doubled()).last(), u"!4 line 1 text 0"_s);
    EXPECT_EQ(Read(QByteArray("\r").repeated(1'000'000)).size(), 1'000'000);
}

} // namespace
} // namespace mirel
