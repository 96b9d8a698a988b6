#include "tableview/csv_writer.h"

#include "support/printing.h"

#include <gtest/gtest.h>

#include <QBuffer>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

std::vector<ResultField> FieldsOf(std::initializer_list<std::pair<QString, FieldType>> list)
{
    std::vector<ResultField> fields;
    for (const auto& [name, type] : list)
        fields.push_back({.name = name, .type = type, .size = -1, .table = {}, .column = {}});
    return fields;
}

QByteArray Written(const CsvExportOptions& options, const std::vector<ResultField>& fields,
                   std::initializer_list<std::vector<Cell>> records)
{
    QBuffer device;
    EXPECT_TRUE(device.open(QIODevice::WriteOnly));
    CsvWriter writer(device, options, fields);
    if (options.header)
        writer.WriteHeader();
    for (const std::vector<Cell>& record : records)
        EXPECT_TRUE(writer.WriteRecord(record));
    EXPECT_TRUE(writer.Finish());
    return device.data();
}

const std::vector<ResultField> kPeople = FieldsOf({{u"Name"_s, FieldType::Text}, {u"Age"_s, FieldType::Integer}});

TEST(CsvWriter, QuotesTextsAndLeavesNullOut)
{
    EXPECT_EQ(Written({}, kPeople, {{Cell::OfText("Ann"), Cell::Of(qint64(30))}, {{}, {}}}),
              "\"Ann\",30\r\n,\r\n");
}

TEST(CsvWriter, WritesTheNamesInTheFirstLine)
{
    EXPECT_EQ(Written({.header = true}, kPeople, {}), "\"Name\",\"Age\"\r\n");
    EXPECT_EQ(Written({.separator = u'\t', .header = true, .quote = {}}, kPeople, {}), "Name\tAge\r\n");
}

TEST(CsvWriter, DoublesQuotationMarksOnlyWhenAsked)
{
    const auto field = FieldsOf({{u"a"_s, FieldType::Memo}});
    EXPECT_EQ(Written({}, field, {{Cell::OfText("5\" pipe")}}), "\"5\" pipe\"\r\n");
    EXPECT_EQ(Written({.doubledQuotes = true}, field, {{Cell::OfText("\"5\"\"")}}), "\"\"\"5\"\"\"\"\"\r\n");
    // A mark of two bytes is doubled whole, and no other character that ends in the same byte.
    EXPECT_EQ(Written({.quote = u'\u00AB', .doubledQuotes = true}, field, {{Cell::OfText("\u00EB\u00AB")}}),
              "\u00AB\u00EB\u00AB\u00AB\u00AB\r\n");
}

TEST(CsvWriter, WritesEachTypeInItsForm)
{
    const auto fields = FieldsOf({{u"d"_s, FieldType::Double},
                                  {u"y"_s, FieldType::YesNo},
                                  {u"n"_s, FieldType::YesNo},
                                  {u"b"_s, FieldType::LongBinary},
                                  {u"t"_s, FieldType::Date},
                                  {u"w"_s, FieldType::Date}});
    const std::vector<Cell> record = {
        Cell::Of(2.50),
        Cell::Of(qint64(1)),
        Cell::Of(qint64(0)),
        Cell::OfBinary("xyz"),
        Cell::OfText("2001-07-04 09:05:00"),
        Cell::OfText("1899-12-30 18:30:00"),
    };
    EXPECT_EQ(Written({}, fields, {record}), "2.5,1,0,,7/4/2001 9:05:00 AM,6:30:00 PM\r\n");
    EXPECT_EQ(Written({.dates = {DateOrder::DayMonthYear, u'.', u':'}}, fields, {record}),
              "2.5,1,0,,04.07.2001 09:05:00,18:30:00\r\n");
}

TEST(CsvWriter, WritesAQuestionMarkForWhatTheEncodingLacks)
{
    const auto field = FieldsOf({{u"a"_s, FieldType::Text}});
    EXPECT_EQ(Written({.encoding = "ISO-8859-1"}, field, {{Cell::OfText("\u00E9\u4E2D")}}), "\"\xE9?\"\r\n");
    EXPECT_FALSE(CsvWriter::KnowsEncoding("no such encoding"));
}

// Takes a number of bytes and then fails, as a full disk does.
class FullDevice : public QIODevice {
public:
    explicit FullDevice(qint64 roomBytes)
        : room_(roomBytes)
    {
        open(QIODevice::WriteOnly | QIODevice::Unbuffered);
    }

protected:
    qint64 readData(char*, qint64) override { return -1; }
    qint64 writeData(const char*, qint64 size) override
    {
        if (size > room_)
            return -1;
        room_ -= size;
        return size;
    }

private:
    qint64 room_;
};

TEST(CsvWriter, FailsForGoodOnAFullDisk)
{
    FullDevice device(3000000);
    CsvWriter writer(device, {}, kPeople);
    const std::string text(1000, 'x');
    int written = 0;
    while (written < 10000 && writer.WriteRecord(std::vector{Cell::OfText(text), Cell::Of(qint64(1))}))
        ++written;
    EXPECT_LT(written, 4000);
    EXPECT_FALSE(writer.Finish());
}

} // namespace
} // namespace mirel
