#include "result/cell_text.h"

#include "platform/ole_date.h"
#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const YesNoWords kWords{u"Oui"_s, u"Non"_s};

TEST(GridText, ShowsEachKindOfCellAsTheUserReadsIt)
{
    const struct {
        const char* what;
        Cell cell;
        FieldType type;
        QString text;
    } rows[] = {
        {"NULL", Cell(), FieldType::Text, u""_s},
        {"integer", Cell::Of(qint64(-12)), FieldType::Integer, u"-12"_s},
        {"double", Cell::Of(12.5), FieldType::Double, u"12.5"_s},
        {"date", Cell::OfText("2001-07-04"), FieldType::Date, u"7/4/2001"_s},
        {"date and time", Cell::OfText("2001-07-04 09:05:00"), FieldType::Date, u"7/4/2001 9:05:00 AM"_s},
        {"a date column's text that is no date", Cell::OfText("soon"), FieldType::Date, u"soon"_s},
        {"ticked", Cell::Of(qint64(1)), FieldType::YesNo, u"Oui"_s},
        {"not ticked", Cell::Of(qint64(0)), FieldType::YesNo, u"Non"_s},
        {"a 1 that is a number", Cell::Of(qint64(1)), FieldType::Integer, u"1"_s},
        {"binary", Cell::OfBinary("abc"), FieldType::LongBinary, u""_s},
    };
    for (const auto& row : rows)
        EXPECT_EQ(GridText(row.cell, row.type, kWords, 50), row.text) << row.what;
}

TEST(TypedValue, TakesTheNumberThatATextBeginsWithWhereAsked)
{
    const struct {
        QString text;
        FieldType type;
        QString number;
    } rows[] = {
        {u"12.7"_s, FieldType::Integer, u"12"_s},       {u"abc"_s, FieldType::SmallInt, u"0"_s},
        {u" -3 apples"_s, FieldType::Integer, u"-3"_s}, {u"1,234.50"_s, FieldType::Double, u"1"_s},
        {u".5e2 m"_s, FieldType::Double, u".5e2"_s},    {u"."_s, FieldType::Double, u"0"_s},
        {u"12 men"_s, FieldType::Text, u"12 men"_s},    {QString(), FieldType::Integer, QString()},
    };
    for (const auto& row : rows)
        EXPECT_EQ(LeadingNumber(row.text, row.type), row.number) << row.text.toStdString();
}

TEST(GridText, IsCutWhereItIsLongerThanTheLimit)
{
    const struct {
        const char* what;
        const char* text;
        int limit;
        QString shown;
    } rows[] = {
        {"as long as the limit", "abcd", 4, u"abcd"_s},
        {"one more", "abcde", 4, u"abcd~"_s},
        {"no limit", "abcde", -1, u"abcde"_s},
        {"limit 0", "abc", 0, u"~"_s},
        {"letters of three bytes", "日本語日本語", 4, u"日本語日~"_s},
        {"never half of a pair", "ab😀😀", 3, u"ab~"_s},
    };
    for (const auto& row : rows)
        EXPECT_EQ(GridText(Cell::OfText(row.text), FieldType::Memo, kWords, row.limit), row.shown) << row.what;
}

TEST(TypedValue, ReadsTheTextByTheFieldsType)
{
    const double date = *OleDate({2001, 7, 4});
    const struct {
        const char* what;
        QString text;
        FieldType type;
        Value value;
        bool keptWhole;
    } rows[] = {
        {"nothing", u""_s, FieldType::Integer, Value::Null(), true},
        {"integer", u"12"_s, FieldType::Integer, Value::Integer(12), true},
        {"signs and blanks", u" +12 "_s, FieldType::Integer, Value::Integer(12), true},
        {"negative small integer", u"-7"_s, FieldType::SmallInt, Value::SmallInt(-7), true},
        {"decimals of an integer", u"12.7"_s, FieldType::Integer, Value::Text(u"12.7"_s), false},
        {"groups of three", u"1,234,567"_s, FieldType::Integer, Value::Integer(1234567), true},
        {"groups that are none", u"12,34"_s, FieldType::Integer, Value::Text(u"12,34"_s), false},
        {"letters", u"abc"_s, FieldType::Integer, Value::Text(u"abc"_s), false},
        {"a sign alone", u"-"_s, FieldType::Integer, Value::Text(u"-"_s), false},
        {"two signs", u"+-5"_s, FieldType::Integer, Value::Text(u"+-5"_s), false},
        {"too large for small, the store refuses", u"40000"_s, FieldType::SmallInt, Value::Integer(40000), false},
        {"too large, passed on", u"3000000000"_s, FieldType::Integer, Value::Text(u"3000000000"_s), false},
        {"beyond 64 bits, passed on", u"99999999999999999999"_s, FieldType::Integer,
         Value::Text(u"99999999999999999999"_s), false},
        {"double", u"1.5e3"_s, FieldType::Double, Value::Double(1500), true},
        {"double and a unit", u"1.5 kg"_s, FieldType::Double, Value::Text(u"1.5 kg"_s), false},
        {"double with groups", u"1,234.50"_s, FieldType::Double, Value::Double(1234.5), true},
        {"no double", u"price"_s, FieldType::Double, Value::Text(u"price"_s), false},
        {"beyond doubles, passed on", u"1e999"_s, FieldType::Double, Value::Text(u"1e999"_s), false},
        {"a word for a double that is none", u"inf"_s, FieldType::Double, Value::Text(u"inf"_s), false},
        {"another", u"nan"_s, FieldType::Double, Value::Text(u"nan"_s), false},
        {"the user's date", u"7/4/2001"_s, FieldType::Date, Value::Date(date), true},
        {"ISO date", u"2001-07-04"_s, FieldType::Date, Value::Date(date), true},
        {"no date, passed on", u"soon"_s, FieldType::Date, Value::Text(u"soon"_s), false},
        {"text", u" O'Brien "_s, FieldType::Text, Value::Text(u" O'Brien "_s), true},
        {"text as long as its field", u"1234567890"_s, FieldType::Text, Value::Text(u"1234567890"_s), true},
        {"text longer than its field", u"12345678901"_s, FieldType::Text, Value::Text(u"12345678901"_s), false},
    };
    for (const auto& row : rows) {
        EXPECT_EQ(TypedValue(row.text, row.type), row.value) << row.what;
        EXPECT_EQ(IsKeptWhole(row.text, row.type, 10), row.keptWhole) << row.what;
    }
    EXPECT_TRUE(IsKeptWhole(u"3000000000"_s, FieldType::Integer, kWideIntegerSize)) << "another program's field";
}

} // namespace
} // namespace mirel
