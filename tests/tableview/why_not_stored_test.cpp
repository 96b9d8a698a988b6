#include "tableview/why_not_stored.h"

#include "platform/user_locale.h"
#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TEST(WhyNotStored, NamesTheValueAndTheLimit)
{
    const struct {
        QString text;
        FieldType type;
        int size;
        QString why;
    } rows[] = {
        {u"31.31.99"_s, FieldType::Date, -1, u"not a date: 31.31.99"_s},
        {u"2/29/2000"_s, FieldType::Date, -1, u""_s},
        {u"abc"_s, FieldType::Integer, -1, u"not a number: abc"_s},
        {u"12.7"_s, FieldType::Integer, -1, u"not a whole number: 12.7"_s},
        {u"2147483647"_s, FieldType::Integer, -1, u""_s},
        {u"2147483648"_s, FieldType::Integer, -1, u"from -2147483648 to 2147483647, this is 2147483648"_s},
        {u"-32769"_s, FieldType::SmallInt, -1, u"from -32768 to 32767, this is -32769"_s},
        {u"1.5.2"_s, FieldType::Double, -1, u"not a number: 1.5.2"_s},
        {u"1.5"_s, FieldType::Double, -1, u""_s},
        {u"12345"_s, FieldType::Text, 5, u""_s},
        {u"123456"_s, FieldType::Text, 5, u"at most 5 characters, this has 6"_s},
        {QString(100000, u'x'), FieldType::Memo, -1, u""_s},
        {u""_s, FieldType::Date, -1, u""_s},
    };
    for (const auto& row : rows)
        EXPECT_EQ(WhyNotStored(row.text, row.type, row.size), row.why) << row.text.left(20).toStdString();
}

TEST(WhyNotStored, QuotesALongTextOnOneShortLine)
{
    const QString why = WhyNotStored(u"one\ntwo "_s + QString(500, u'x'), FieldType::Date, -1);
    EXPECT_TRUE(why.startsWith(u"not a date: one two xx"_s)) << why.toStdString();
    EXPECT_LT(why.size(), 60);
    EXPECT_TRUE(why.contains(u'…'));
}

} // namespace
} // namespace mirel
