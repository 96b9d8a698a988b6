#include "cli/record_writer.h"
#include "cli/table_writer.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QFile>
#include <QTemporaryFile>

#include <limits>
#include <vector>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

const std::vector<ResultField> kFields = {{u"Name"_s, FieldType::Text, 40, u"Birds"_s, u"Name"_s},
                                          {u"Count"_s, FieldType::Integer, 4, u"Birds"_s, u"Count"_s},
                                          {u"Weight"_s, FieldType::Double, 8, u"Birds"_s, u"Weight"_s},
                                          {u"Seen"_s, FieldType::Date, 8, u"Birds"_s, u"Seen"_s},
                                          {u"Rare"_s, FieldType::YesNo, 1, u"Birds"_s, u"Rare"_s},
                                          {u"Photo"_s, FieldType::LongBinary, -1, u"Birds"_s, u"Photo"_s}};

using Records = std::vector<std::vector<Cell>>;

const Records kRecords = {
    {Cell::OfText("Ann"), Cell::Of(qint64(30)), Cell::Of(0.1), Cell::OfText("2001-07-04"), Cell::Of(qint64(1)),
     Cell::OfBinary("\x01\x02\xFF")},
    {Cell::OfText("a,\"b\"\tc\nd\\"), Cell::Of(qint64(-1)), Cell::Of(1e300), Cell::OfText("2001-07-04 09:05:00"),
     Cell::Of(qint64(0)), Cell()},
    {Cell(), Cell(), Cell(), Cell(), Cell(), Cell()},
};

QString Written(OutputFormat format, std::span<const ResultField> fields, const Records& records)
{
    QTemporaryFile file;
    EXPECT_TRUE(file.open());
    Output output(file.handle());
    const std::unique_ptr<RecordWriter> writer = MakeRecordWriter(format, output, YesNoWords{u"Ja"_s, u"Nein"_s});
    writer->Begin(fields);
    for (const std::vector<Cell>& record : records)
        EXPECT_TRUE(writer->Record(record));
    writer->End();
    EXPECT_TRUE(output.Flush());
    QFile written(file.fileName());
    EXPECT_TRUE(written.open(QIODevice::ReadOnly));
    return QString::fromUtf8(written.readAll());
}

// Whatever the text's length, and wherever in it the mark stands.
TEST(RecordWriter, QuotesATextWithAMarkAnywhere)
{
    for (const size_t size : {1, 2, 7, 15, 16, 17, 31, 32, 33, 47}) {
        const std::string plain(size, 'x');
        EXPECT_EQ(Written(OutputFormat::Csv, std::span(kFields).first(1), {{Cell::OfText(plain)}}),
                  u"Name\n%1\n"_s.arg(QString::fromStdString(plain)));
        for (size_t at = 0; at < size; ++at) {
            std::string marked = plain;
            marked[at] = ',';
            EXPECT_EQ(Written(OutputFormat::Csv, std::span(kFields).first(1), {{Cell::OfText(marked)}}),
                      u"Name\n\"%1\"\n"_s.arg(QString::fromStdString(marked)));
        }
    }
}

TEST(RecordWriter, WritesEachTypeAsItsFormatHasIt)
{
    EXPECT_EQ(Written(OutputFormat::Csv, kFields, kRecords),
              u"Name,Count,Weight,Seen,Rare,Photo\n"
              "Ann,30,0.1,2001-07-04,Ja,AQL/\n"
              "\"a,\"\"b\"\"\tc\nd\\\",-1,1E+300,2001-07-04 09:05:00,Nein,\n"
              ",,,,,\n"_s);
    EXPECT_EQ(Written(OutputFormat::Tsv, kFields, {kRecords[1]}),
              u"Name\tCount\tWeight\tSeen\tRare\tPhoto\n"
              "a,\"b\"\\tc\\nd\\\\\t-1\t1E+300\t2001-07-04 09:05:00\tNein\t\n"_s);
    EXPECT_EQ(Written(OutputFormat::JsonLines, kFields, kRecords),
              u"{\"Name\":\"Ann\",\"Count\":30,\"Weight\":0.1,\"Seen\":\"2001-07-04T00:00:00\",\"Rare\":true,"
              "\"Photo\":\"AQL/\"}\n"
              "{\"Name\":\"a,\\\"b\\\"\\tc\\nd\\\\\",\"Count\":-1,\"Weight\":1e+300,"
              "\"Seen\":\"2001-07-04T09:05:00\",\"Rare\":false,\"Photo\":null}\n"
              "{\"Name\":null,\"Count\":null,\"Weight\":null,\"Seen\":null,\"Rare\":null,\"Photo\":null}\n"_s);
    EXPECT_EQ(Written(OutputFormat::Table, kFields, {kRecords[0], kRecords[2]}),
              u"Name  Count  Weight  Seen        Rare  Photo\n"
              "----  -----  ------  ----------  ----  -----\n"
              "Ann      30     0.1  2001-07-04  Ja    AQL/\n"_s +
                  QString(39, u' ') + u'\n');
}

TEST(RecordWriter, MakesOneArrayOfJson)
{
    const std::span<const ResultField> name(kFields.data(), 1);
    EXPECT_EQ(Written(OutputFormat::Json, name, {}), u"[]\n"_s);
    EXPECT_EQ(Written(OutputFormat::Json, name, {{Cell::OfText("a")}, {Cell::OfText("\x01\x7F\xFF")}}),
              u"[{\"Name\":\"a\"},\n{\"Name\":\"\\u0001\\u007f\uFFFD\"}]\n"_s);
}

TEST(RecordWriter, MakesJsonOfDatesThatAreNone)
{
    const std::span<const ResultField> seen(&kFields[3], 1);
    EXPECT_EQ(Written(OutputFormat::JsonLines, seen,
                      {{Cell::OfText("next Tuesday")},
                       {Cell::OfText("\"July\"\n2001")},
                       {Cell::OfText("4")},
                       {Cell::OfText("2001-07-04 09:05:00.250")}}),
              u"{\"Seen\":\"next Tuesday\"}\n{\"Seen\":\"\\\"July\\\"\\n2001\"}\n{\"Seen\":\"4\"}\n"
              "{\"Seen\":\"2001-07-04T09:05:00.250\"}\n"_s);
}

TEST(RecordWriter, GivesEveryColumnItsOwnKey)
{
    const std::vector<ResultField> fields = {{u"Name"_s, FieldType::Text, 9, u"A"_s, u"Name"_s},
                                             {u"Name"_s, FieldType::Text, 9, u"B"_s, u"Name"_s},
                                             {u"Name"_s, FieldType::Text, 9, u"B"_s, u"Name"_s}};
    EXPECT_EQ(Written(OutputFormat::JsonLines, fields, {{Cell(), Cell(), Cell()}}),
              u"{\"Name\":null,\"B.Name\":null,\"Name 2\":null}\n"_s);
}

TEST(RecordWriter, WritesNumbersThatReadBackAsTheyWere)
{
    const std::vector<ResultField> fields = {{u"N"_s, FieldType::Double, 8, {}, {}}};
    const Records records = {{Cell::Of(0.1 + 0.2)},
                             {Cell::Of(std::numeric_limits<double>::infinity())},
                             {Cell::Of(std::numeric_limits<qint64>::min())}};
    EXPECT_EQ(Written(OutputFormat::JsonLines, fields, records),
              u"{\"N\":0.30000000000000004}\n{\"N\":1e999}\n{\"N\":-9223372036854775808}\n"_s);
}

TEST(TableWriter, KeepsColumnsStraightAndTheTerminalUntouched)
{
    const std::vector<ResultField> fields = {{u"Naïve"_s, FieldType::Text, 9, {}, {}},
                                             {u"N"_s, FieldType::Integer, 4, {}, {}}};
    EXPECT_EQ(Written(OutputFormat::Table, fields,
                      {{Cell::OfText("日本"), Cell::Of(qint64(1))},
                       {Cell::OfText("e\u0301\x1B[2J\n\u009B"), Cell::Of(qint64(22))}}),
              u"Naïve     N\n"
              "-------  --\n"
              "日本      1\n"
              "e\u0301 [2J    22\n"_s);
}

TEST(TableWriter, KeepsItsWidthsBeyondTheMeasuredRecords)
{
    const std::vector<ResultField> fields = {{u"A"_s, FieldType::Text, 9, {}, {}},
                                             {u"B"_s, FieldType::Text, 9, {}, {}}};
    Records records(TableWriter::kMeasuredRecords + 1, {Cell::OfText("ab"), Cell::OfText("c")});
    records.push_back({Cell::OfText("longer"), Cell::OfText("d")});
    const QStringList lines = Written(OutputFormat::Table, fields, records).split(u'\n');
    ASSERT_EQ(lines.size(), qsizetype(records.size()) + 3);
    EXPECT_EQ(lines[2], u"ab  c"_s);
    EXPECT_EQ(lines[lines.size() - 2], u"longer  d"_s);
}

TEST(Output, SaysThatNothingMoreIsTaken)
{
    Output output(-1);
    output.Write(std::string(1'000'000, 'x'));
    EXPECT_TRUE(output.HasFailed());
    EXPECT_FALSE(output.IsBrokenPipe());
    EXPECT_FALSE(output.Reason().isEmpty());
}

} // namespace
} // namespace mirel::cli
