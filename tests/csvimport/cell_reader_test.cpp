#include "csvimport/cell_reader.h"
#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using LongTexts = CellReader::LongTexts;

struct Row {
    FieldType type;
    std::string_view text;
    std::string expected; // the cell, or the result that refuses the text
};

std::string Shown(const Cell& cell)
{
    switch (cell.kind) {
    case Cell::Kind::Null:
        return "null";
    case Cell::Kind::Integer:
        return "integer " + std::to_string(cell.integer);
    case Cell::Kind::Real:
        return "real " + std::to_string(cell.real);
    case Cell::Kind::Text:
    case Cell::Kind::Binary:
        return std::string(cell.bytes);
    }
    return {};
}

std::string Read(CellReader& reader, std::string_view text)
{
    Cell cell;
    switch (reader.Read(text, cell)) {
    case Hr::Ok:
        return Shown(cell);
    case Hr::BadLiteral:
        return "bad literal";
    case Hr::Overflow:
        return "overflow";
    default:
        return "?";
    }
}

void ExpectCells(const std::vector<Row>& rows, const DateFormat& dates = {})
{
    for (const Row& row : rows) {
        CellReader reader(row.type, dates, LongTexts::Cut);
        EXPECT_EQ(Read(reader, row.text), row.expected) << row.text;
    }
}

TEST(CellReader, ReadsTheNumberAtATextsBeginning)
{
    constexpr auto kInteger = FieldType::Integer;
    constexpr auto kDouble = FieldType::Double;
    ExpectCells({{kInteger, "42", "integer 42"},
                 {kInteger, " \t-7 ", "integer -7"},
                 {kInteger, "+5", "integer 5"},
                 {kInteger, "+-5", "bad literal"},
                 {kInteger, "12.7", "integer 12"},
                 {kInteger, "abc", "bad literal"},
                 {kInteger, " ", "bad literal"},
                 {kInteger, "", "null"},
                 {kInteger, "3000000000", "integer 3000000000"}, // the column's own range is the provider's matter
                 {kInteger, "99999999999999999999", "overflow"},
                 {kDouble, "1.5e2", "real 150.000000"},
                 {kDouble, "-.5", "real -0.500000"},
                 {kDouble, "7 kg", "real 7.000000"},
                 {kDouble, "nan", "bad literal"},
                 {kDouble, "-inf", "bad literal"},
                 {kDouble, "-", "bad literal"},
                 {kDouble, ".", "bad literal"},
                 {kDouble, "1e999", "overflow"}});
}

TEST(CellReader, ReadsDecimalCommasOnRequest)
{
    const std::vector<Row> rows = {
        {FieldType::Double, "1,5", "real 1.500000"},
        {FieldType::Double, "-1.234.567,25", "real -1234567.250000"},
        {FieldType::Double, "1.234", "real 1234.000000"},
        {FieldType::Double, "1.2345", "real 1.000000"}, // no group: what follows is left out
        {FieldType::Double, ",5", "real 0.500000"},
        {FieldType::Double, ".5", "bad literal"},
        {FieldType::Double, ",", "bad literal"},
        {FieldType::Double, "7 kg", "real 7.000000"}};
    for (const Row& row : rows) {
        CellReader reader(row.type, {}, LongTexts::Cut, u',');
        EXPECT_EQ(Read(reader, row.text), row.expected) << row.text;
    }
}

TEST(CellReader, TakesAYesForANonZeroIntegerAlone)
{
    constexpr auto kYesNo = FieldType::YesNo;
    ExpectCells({{kYesNo, "0", "integer 0"},
                 {kYesNo, "5", "integer 1"},
                 {kYesNo, "-1", "integer 1"},
                 {kYesNo, "0.5", "integer 0"},
                 {kYesNo, "yes", "integer 0"},
                 {kYesNo, "99999999999999999999", "integer 1"},
                 {kYesNo, "", "null"}});
}

TEST(CellReader, ReadsDatesOfTheFormat)
{
    constexpr auto kDate = FieldType::Date;
    ExpectCells({{kDate, "2001-7-4 9:05:00", "2001-07-04 09:05:00"},
                 {kDate, "2001-07-04 09:05:00", "2001-07-04 09:05:00"},
                 {kDate, "2001-07-04 00:00:00", "2001-07-04"},
                 {kDate, "0045-07-04", "1945-07-04"},
                 {kDate, "45-7-4", "1945-07-04"},
                 {kDate, "2001-13-4", "bad literal"},
                 {kDate, "09:05:07", "1899-12-30 09:05:07"},
                 {kDate, "24:00:00", "bad literal"},
                 {kDate, "9:05", "bad literal"},
                 {kDate, "9:05:7h", "bad literal"},
                 {kDate, "", "null"}},
                {DateOrder::YearMonthDay, u'-', u':'});
    // The tests' locale is US English.
    ExpectCells({{kDate, "9:05:07 PM", "1899-12-30 21:05:07"},
                 {kDate, "7/4/2001 9:05:00 PM", "2001-07-04 21:05:00"},
                 {kDate, "2001-07-04T09:05:00.25", "2001-07-04 09:05:00.250"},
                 {kDate, "2001-02-30", "bad literal"},
                 {kDate, "0045-07-04", "0045-07-04"},
                 {kDate, "soon", "bad literal"}});
}

TEST(CellReader, CountsWhatItLeavesOut)
{
    CellReader numbers(FieldType::Integer, {}, LongTexts::Cut);
    for (const std::string_view text : {"1", " 2 ", "3,5", "4 kg", "x"})
        Read(numbers, text);
    EXPECT_EQ(numbers.CutNumbers(), 2);

    // 8190 units and a character of two; one unit more leaves that character out.
    const std::string fits = std::string(8190, 'x') + "\U0001F600";
    CellReader texts(FieldType::Memo, {}, LongTexts::Cut);
    EXPECT_EQ(Read(texts, fits), fits);
    EXPECT_EQ(texts.CutTexts(), 0);
    EXPECT_EQ(Read(texts, "x" + fits), "x" + std::string(8190, 'x'));
    EXPECT_EQ(texts.CutTexts(), 1);
    EXPECT_EQ(Read(texts, std::string(8193, 'x')), std::string(8192, 'x'));
    EXPECT_EQ(texts.CutTexts(), 2);

    CellReader whole(FieldType::Memo, {}, LongTexts::KeepWhole);
    EXPECT_EQ(Read(whole, "x" + fits), "x" + fits);
    EXPECT_EQ(whole.CutTexts(), 0);
}

TEST(IsIsoDate, WantsEveryDigit)
{
    for (const std::string_view date : {"2001-07-04", "2001-07-04 09:05", "2001-07-04T09:05:00.5"})
        EXPECT_TRUE(IsIsoDate(date)) << date;
    for (const std::string_view text : {"2001-7-4", "2001-07-04 ", "2001-07-04x", "2001-02-29", "2001-07-04T09",
                                        "2001-07-04 24:00", "2001-07-04 09:05:00.", "2001-07-04T09:05:00Z", ""})
        EXPECT_FALSE(IsIsoDate(text)) << text;
}

} // namespace
} // namespace mirel
