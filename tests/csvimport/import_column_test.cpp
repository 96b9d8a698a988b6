#include "csvimport/import_column.h"
#include "csvimport/type_guess.h"
#include "resources/string_table.h"
#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {

// "Name:type:size" with the type's number, "-" for an ignored column.
static std::string Shown(const ImportColumns& columns)
{
    std::string shown;
    for (const ImportColumn& column : columns) {
        shown += shown.empty() ? "" : " | ";
        shown += column.ignored ? "-"
                                : column.field.toStdString() + ':' + std::to_string(int(column.type)) +
                                      (column.type == FieldType::Text ? ':' + std::to_string(column.size) : "");
    }
    return shown;
}

namespace {

using namespace Qt::StringLiterals;

TEST(TypeGuess, LosesNothingOfAnyText)
{
    struct Row {
        const char* what;
        std::vector<std::string> texts;
        std::string column;
    };
    const std::vector<Row> rows = {
        {"integers", {"1", "-20", "", " 3 "}, ":3"},
        {"the largest", {"2147483647", "-2147483648"}, ":3"},
        {"one larger", {"2147483648", "1"}, ":5"},
        {"more digits than a double keeps", {"1234567890123456"}, ":202:50"},
        {"decimals", {"1", "1.50", "-0.123456789012345"}, ":5"},
        {"an exponent behind a decimal", {"1.5e-07"}, ":5"},
        {"an exponent behind an integer may be a code", {"12E4"}, ":202:50"},
        {"ZIP codes", {"00501", "10001"}, ":202:50"},
        {"a zero", {"0", "0.0"}, ":5"},
        {"0 and 1", {"0", "", "1"}, ":11"},
        {"0 and a blank 1", {"0", " 1"}, ":3"},
        {"a plus sign", {"+49"}, ":202:50"},
        {"a unit", {"5", "7 kg"}, ":202:50"},
        {"a point alone", {"1.", "."}, ":202:50"},
        {"dates of the format", {"1/2/2001", "12/31/99 9:05:00"}, ":7"},
        {"dates of ISO", {"2001-07-04", "2001-07-04T09:05"}, ":7"},
        {"of both", {"2001-07-04", "1/2/2001"}, ":202:50"},
        {"almost a date", {"1/2/2001", "1/2/3 High Street"}, ":202:50"},
        {"no date", {"13/13/2001"}, ":202:50"},
        {"nothing", {"", ""}, ":202:255"},
        {"26 characters", {std::string(26, 'x')}, ":202:100"},
        {"51 characters", {std::string(51, 'x')}, ":202:255"},
        {"255 of two bytes each", {std::string(QString(255, u'ä').toStdString())}, ":202:255"},
        {"256 characters", {"x", std::string(256, 'x')}, ":203"},
    };
    for (const Row& row : rows) {
        TypeGuess guess({DateOrder::MonthDayYear, u'/', u':'});
        for (const std::string& text : row.texts)
            guess.Add(text);
        EXPECT_EQ(Shown({guess.Column()}), row.column) << row.what;
    }
}

TEST(TypeGuess, KnowsWhoReadsItsDates)
{
    const DateFormat format{DateOrder::DayMonthYear, u'.', u':'};
    TypeGuess own(format);
    own.Add("24.12.2001");
    EXPECT_EQ(own.Column().dates, std::nullopt);
    TypeGuess iso(format);
    iso.Add("2001-12-24");
    EXPECT_EQ(iso.Column().dates->order, DateOrder::Locale);
    TypeGuess locale(DateFormat{});
    locale.Add("12/24/2001");
    EXPECT_EQ(Shown({locale.Column()}), ":7");
}

TEST(ColumnList, ReadsNamesTypesAndSizes)
{
    struct Row {
        QString list;
        std::string columns; // or the message that refuses it
    };
    const std::vector<Row> rows = {
        {u"Name:Text:40,Born:DateTime, Rare : yes/no ,-,Note"_s,
         "Name:202:40 | Born:7 | Rare:11 | - | Note:202:255"},
        {u"[a,b:c]:Integer,[d]"_s, "a,b:c:3 | d:202:255"},
        {u"Name:Number"_s,
         "\"Number\" is no field type. The types are Text, Integer, SmallInt, Double, Memo, DateTime, Yes/No."},
        {u"Name:Text:x"_s, StringText(Str::ImportTextSize).toStdString()},
        {u"Name:Text:256"_s, StringText(Str::ImportTextSize).toStdString()},
        {u"Name:Text:0"_s, StringText(Str::ImportTextSize).toStdString()},
        {u"A,b,a:Integer"_s, "The name \"a\" stands twice."},
        {u"A,,B"_s, "Column 2 has no name."},
        {u"-,-"_s, "There is no column to import."},
    };
    for (const Row& row : rows) {
        ImportColumns columns;
        UserMessage fault{};
        const bool ok = ParseColumnList(row.list, columns, fault) && CheckNewColumns(columns, fault);
        EXPECT_EQ(ok ? Shown(columns) : fault.Text().toStdString(), row.columns);
    }
}

TEST(ColumnsNamed, MakesNamesFitForFields)
{
    EXPECT_EQ(Shown(ColumnsNamed({u" Cost\nTotal $ "_s, u""_s, u"a[1]"_s, u"A"_s, u"a"_s, u"-"_s})),
              "Cost Total $:202:255 | Field2:202:255 | a(1):202:255 | A:202:255 | a 2:202:255 | Field6:202:255");
}

class ExistingTable : public ::testing::Test {
protected:
    std::string ByName(const QStringList& names)
    {
        ImportColumns columns;
        for (const QString& name : names)
            columns.push_back({name == u"-", name});
        UserMessage fault{};
        return MatchByName(u"Birds"_s, fields_, columns, fault) ? Shown(columns) : fault.Text().toStdString();
    }
    std::string InOrder(int count)
    {
        ImportColumns columns;
        UserMessage fault{};
        return MatchInOrder(u"Birds"_s, fields_, count, columns, fault) ? Shown(columns)
                                                                        : fault.Text().toStdString();
    }

private:
    const std::vector<ResultField> fields_ = {{u"Name"_s, FieldType::Memo, -1, {}, {}},
                                              {u"Count"_s, FieldType::Integer, 4, {}, {}}};
};

TEST_F(ExistingTable, TakesColumnsByNameOrInOrder)
{
    EXPECT_EQ(ByName({u"count"_s, u"-"_s, u"Name"_s}), "Count:3 | - | Name:203");
    EXPECT_EQ(ByName({u"Size"_s}), "The table \"Birds\" has no field \"Size\".");
    EXPECT_EQ(ByName({u"Name"_s, u"name"_s}), "Field \"Name\" is already assigned");
    EXPECT_EQ(ByName({u"-"_s}), "There is no column to import.");
    EXPECT_EQ(InOrder(1), "Name:203 | Count:3") << "later lines may have more";
    EXPECT_EQ(InOrder(3), "The file has 3 columns, the table \"Birds\" has 2 fields.");
}

} // namespace
} // namespace mirel
