#include "expr/date_format.h"

#include "platform/ole_date.h"
#include "platform/user_locale.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QLocale>

#include <vector>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

double At(int year, int month, int day, int hour = 0, int minute = 0, int second = 0)
{
    return OleDate(DateParts{year, month, day, hour, minute, second, 0}).value();
}

constexpr DateFormat kIso{DateOrder::YearMonthDay, u'-', u':'};

struct Reading {
    const char* what;
    DateFormat format;
    const char* text;
    std::optional<double> date;
};

void ExpectReadings(const std::vector<Reading>& rows)
{
    for (const Reading& row : rows)
        EXPECT_EQ(ParseDateFields(row.format, row.text), row.date) << row.what << ": " << row.text;
}

TEST(ParseDateFields, TakesTheFieldsInTheirOrder)
{
    const double day = At(2001, 7, 4);
    ExpectReadings({{"0", {DateOrder::MonthDayYear, u'/', u':'}, "7/4/2001", day},
                    {"1", {DateOrder::MonthYearDay, u'/', u':'}, "7/2001/4", day},
                    {"2", {DateOrder::YearDayMonth, u'/', u':'}, "2001/4/7", day},
                    {"3", {DateOrder::YearMonthDay, u'/', u':'}, "2001/7/4", day},
                    {"4", {DateOrder::DayMonthYear, u'.', u':'}, "04.07.2001", day},
                    {"5", {DateOrder::DayYearMonth, u'/', u':'}, "4/2001/7", day},
                    {"another separator", {DateOrder::DayMonthYear, u'.', u':'}, "4/7/2001", {}},
                    {"a separator beyond ASCII",
                     {DateOrder::YearMonthDay, u'年', u'·'},
                     "2001年7年4 9·05·00",
                     At(2001, 7, 4, 9, 5)},
                    {"the blank as separator",
                     {DateOrder::YearMonthDay, u' ', u':'},
                     "2001 7 4 9:05:00",
                     At(2001, 7, 4, 9, 5)},
                    {"no separator", {DateOrder::YearMonthDay, 0, u':'}, "2001-7-4", {}},
                    {"half a surrogate pair", {DateOrder::YearMonthDay, 0xD800, u':'}, "2001-7-4", {}}});
}

TEST(ParseDateFields, ReadsATimeWithBothSeparators)
{
    ExpectReadings({{"all", kIso, "2001-7-4 9:05:00", At(2001, 7, 4, 9, 5, 0)},
                    {"last second", kIso, "2001-07-04 23:59:59", At(2001, 7, 4, 23, 59, 59)},
                    {"the hour alone is ignored", kIso, "2001-7-4 9", At(2001, 7, 4)},
                    {"no seconds separator", kIso, "2001-7-4 9:05", {}},
                    {"empty seconds are 0", kIso, "2001-7-4 9:05:", At(2001, 7, 4, 9, 5)},
                    {"text behind a number", kIso, "2001-7-4th 9h:5m:7s", At(2001, 7, 4, 9, 5, 7)}});
}

TEST(ParseDateFields, CompletesYearsBelow100)
{
    ExpectReadings({{"0", kIso, "0-7-4", At(2000, 7, 4)},
                    {"29", kIso, "29-7-4", At(2029, 7, 4)},
                    {"30", kIso, "30-7-4", At(1930, 7, 4)},
                    {"45", kIso, "45-7-4", At(1945, 7, 4)},
                    {"99", kIso, "99-7-4", At(1999, 7, 4)},
                    {"100", kIso, "100-7-4", At(100, 7, 4)},
                    {"negative", {DateOrder::YearMonthDay, u'/', u':'}, "-5/7/4", At(1895, 7, 4)}});
}

TEST(ParseDateFields, RefusesWhatIsNoDate)
{
    for (const char* text :
         {"2001-13-1", "2001-0-1", "2001-2-30", "1900-2-29", "2001-7-4 24:0:0", "2001-7-4 0:60:0",
          "2001-7-4 0:0:-1", "10000-1-1", "9999999999-1-1", "7-4", "", "-", "--", "a-b-c", "-7-4", "2001-07-",
          "2001- 7-\xC2\xA0"
          "4"}) {
        EXPECT_FALSE(ParseDateFields(kIso, text)) << text;
    }
    EXPECT_FALSE(ParseDateFields({DateOrder::MonthDayYear, u'/', u':'}, "7/4"));
    EXPECT_TRUE(ParseDateFields(kIso, "2000-2-29")); // the near miss
}

class DatesInUsEnglish : public testing::Test {
protected:
    void SetUp() override { UserLocale::SetCurrent(QLocale(QLocale::English, QLocale::UnitedStates)); }
};

TEST_F(DatesInUsEnglish, AreParsedToTheLocalesText)
{
    QString out = u"before"_s;
    EXPECT_FALSE(ParseDateText(DateOrder::DayMonthYear, u'.', u':', u"31.4.2001", out));
    EXPECT_EQ(out, u"before"_s);
    EXPECT_TRUE(ParseDateText(DateOrder::DayMonthYear, u'.', u':', u"4.7.01 21:05:00", out));
    EXPECT_EQ(out, u"7/4/2001 9:05:00 PM"_s);
    EXPECT_TRUE(ParseDateText(DateOrder::Locale, u'.', u':', u"7/5/2001", out));
    EXPECT_EQ(out, u"7/5/2001"_s);
}

TEST_F(DatesInUsEnglish, AreWrittenInTheChosenOrder)
{
    const struct {
        const char* what;
        DateFormat format;
        double date;
        QString text;
    } rows[] = {
        {"midnight left out", kIso, At(2001, 7, 4), u"2001-07-04"_s},
        {"with time", {DateOrder::MonthDayYear, u'/', u'.'}, At(2001, 7, 4, 9, 5, 7), u"07/04/2001 09.05.07"_s},
        {"order 1", {DateOrder::MonthYearDay, u'-', u':'}, At(99, 7, 4), u"07-0099-04"_s},
        {"order 2", {DateOrder::YearDayMonth, u'-', u':'}, At(2001, 7, 4), u"2001-04-07"_s},
        {"order 4", {DateOrder::DayMonthYear, u'年', u':'}, At(2001, 7, 4), u"04年07年2001"_s},
        {"order 5", {DateOrder::DayYearMonth, u'-', u':'}, At(2001, 7, 4), u"04-2001-07"_s},
        {"no separators", {DateOrder::YearMonthDay, 0, 0}, At(2001, 7, 4, 9, 5, 7), u"20010704 090507"_s},
        {"base date: the time alone", kIso, At(1899, 12, 30, 9, 5, 7), u"09:05:07"_s},
        {"base date without a time", kIso, At(1899, 12, 30), u"1899-12-30"_s},
        {"locale", {}, At(2001, 7, 4, 9, 5), u"7/4/2001 9:05:00 AM"_s},
        {"no date", kIso, 1e9, QString()},
    };
    for (const auto& row : rows)
        EXPECT_EQ(FormatDateText(row.format, row.date), row.text) << row.what;
}

TEST(FormatDatePattern, FillsPiecesAndCopiesTheRest)
{
    const double afternoon = At(2005, 7, 4, 15, 5, 9);
    const double morning = At(2005, 11, 14, 9, 0, 0);
    const struct {
        double date;
        const char16_t* pattern;
        QString text;
    } rows[] = {
        {At(2001, 7, 4), u"(YYYY)(MM)(DD)", u"20010704"_s},
        {afternoon, u"(D).(M).(YYYY), (hh):(mm):(ss)!", u"4.7.2005, 15:05:09!"_s},
        {afternoon, u"(h)h(m)m(s)", u"15h5m9"_s},
        {afternoon, u"(YY)", u"5"_s},
        {At(2029, 1, 1), u"(YY)", u"29"_s},
        {At(1930, 1, 1), u"(YY)", u"30"_s},
        {At(1929, 1, 1), u"(YY)", u"1929"_s},
        {At(2030, 1, 1), u"(YY)", u"2030"_s},
        {afternoon, u"(12)(h) (hh) (24)(h)", u"3 03 15"_s},
        {morning, u"(12)(h)", u"-3"_s},
        {morning, u"(Mm)(dd)(x y)()", u"Mmddx y"_s},
        {morning, u"((DD))", u"(DD)"_s},
        {morning, u"(DD)(MM", u"14(MM"_s},
        {1e9, u"(DD)", QString()},
    };
    for (const auto& row : rows)
        EXPECT_EQ(FormatDatePattern(row.date, row.pattern), row.text);
}

TEST_F(DatesInUsEnglish, HaveFixedTextsForStatementsAndFileNames)
{
    EXPECT_EQ(CurrentTimeText(QTime(9, 5, 0)), u"09:05:00"_s);
    EXPECT_EQ(DateText(At(81, 7, 4, 23, 0, 0)), u"0081-07-04"_s);
    EXPECT_EQ(DateText(1e9), QString());
    EXPECT_EQ(CompactDateText(u"7/4/2001 9:05:00 AM"), u"20010704"_s);
    EXPECT_EQ(CompactDateText(u"soon"), QString());
}

} // namespace
} // namespace mirel
