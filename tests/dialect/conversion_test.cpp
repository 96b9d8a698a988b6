#include "platform/ole_date.h"
#include "provider/conversion.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <limits>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const double kFourthOfJuly = *OleDate(DateParts{2001, 7, 4});

struct Conversion {
    const char* what;
    Value value;
    FieldType type;
    Value stored; // Empty: refused with `code`
    Hr code = Hr::Ok;
    int size = -1;
};

void ExpectConversions(const std::vector<Conversion>& rows)
{
    for (const Conversion& row : rows) {
        Value converted;
        EXPECT_EQ(ConvertForColumn(row.value, row.type, row.size, converted), row.code) << row.what;
        EXPECT_EQ(converted, row.stored) << row.what;
    }
}

TEST(ConvertForColumn, ReadsTextsAsTheColumnsType)
{
    const auto text = [](const QString& content) { return Value::Text(content); };
    ExpectConversions({
        {"integer", text(u" 12 "_s), FieldType::Integer, Value::Integer(12)},
        {"integer with a point", text(u"12.0"_s), FieldType::SmallInt, Value::SmallInt(12)},
        {"fraction", text(u"12.5"_s), FieldType::Integer, {}, Hr::BadLiteral},
        {"no number", text(u"12a"_s), FieldType::Integer, {}, Hr::BadLiteral},
        {"empty", text(u""_s), FieldType::Double, {}, Hr::BadLiteral},
        {"exponent", text(u"-1.5e3"_s), FieldType::Double, Value::Double(-1500)},
        {"a word C reads as a number", text(u"nan"_s), FieldType::Double, {}, Hr::BadLiteral},
        {"hexadecimal", text(u"0x10"_s), FieldType::Integer, {}, Hr::BadLiteral},
        {"endless", text(u"1e999"_s), FieldType::Double, {}, Hr::Overflow},
        {"the user's date", text(u"7/4/2001"_s), FieldType::Date, Value::Date(kFourthOfJuly)},
        {"ISO", text(u"2001-07-04T12:00"_s), FieldType::Date, Value::Date(kFourthOfJuly + 0.5)},
        {"no such day", text(u"2001-02-29"_s), FieldType::Date, {}, Hr::BadLiteral},
        {"year 0", text(u"0000-01-01"_s), FieldType::Date, {}, Hr::Overflow},
        {"year 10000", text(u"10000-01-01"_s), FieldType::Date, {}, Hr::Overflow},
        {"yes", text(u"True"_s), FieldType::YesNo, Value::Bool(true)},
        {"no", text(u"0"_s), FieldType::YesNo, Value::Bool(false)},
        {"neither", text(u"maybe"_s), FieldType::YesNo, {}, Hr::BadLiteral},
        {"binary from text", text(u"x"_s), FieldType::VarBinary, {}, Hr::BadLiteral, 255},
    });
}

TEST(ConvertForColumn, RefusesWhatDoesNotFit)
{
    constexpr double kBeyond = 2147483648.0;
    const auto text = [](qsizetype length) { return Value::Text(u"ä"_s.repeated(length)); };
    ExpectConversions({
        {"just long enough", text(10), FieldType::Text, text(10), Hr::Ok, 10},
        {"too long", text(11), FieldType::Text, {}, Hr::Overflow, 10},
        {"memos have no size", text(70000), FieldType::Memo, text(70000)},
        {"small integer", Value::Integer(32767), FieldType::SmallInt, Value::SmallInt(32767)},
        {"too large", Value::Integer(32768), FieldType::SmallInt, {}, Hr::Overflow},
        {"too small", Value::Double(-kBeyond - 1), FieldType::Integer, {}, Hr::Overflow},
        {"the smallest", Value::Double(-kBeyond), FieldType::Integer,
         Value::Integer(std::numeric_limits<qint32>::min())},
        {"infinite", Value::Double(std::numeric_limits<double>::infinity()), FieldType::Double, {}, Hr::Overflow},
        {"not a number",
         Value::Double(std::numeric_limits<double>::quiet_NaN()),
         FieldType::Integer,
         {},
         Hr::Overflow},
        {"after the last day", Value::Double(2958466), FieldType::Date, {}, Hr::Overflow},
        {"binary over its size", Value::Binary(QByteArray(256, 'x')), FieldType::VarBinary, {}, Hr::Overflow, 255},
    });
}

TEST(ConvertForColumn, CarriesOtherValuesOver)
{
    ExpectConversions({
        {"null", Value::Null(), FieldType::Integer, Value::Null()},
        {"nothing", Value(), FieldType::Text, Value::Null(), Hr::Ok, 5},
        {"number into text", Value::Double(2.50), FieldType::Text, Value::Text(u"2.5"_s), Hr::Ok, 5},
        {"date into text", Value::Date(kFourthOfJuly), FieldType::Memo, Value::Text(u"7/4/2001"_s)},
        {"day number into date", Value::Double(kFourthOfJuly), FieldType::Date, Value::Date(kFourthOfJuly)},
        {"truth into number", Value::Bool(true), FieldType::Integer, Value::Integer(1)},
        {"number into truth", Value::Integer(-1), FieldType::YesNo, Value::Bool(true)},
        {"truth into date", Value::Bool(true), FieldType::Date, {}, Hr::BadLiteral},
        {"binary into text", Value::Binary("x"), FieldType::Text, {}, Hr::BadLiteral, 5},
    });
}

} // namespace
} // namespace mirel
