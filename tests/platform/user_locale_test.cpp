#include "platform/ole_date.h"
#include "platform/user_locale.h"
#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

double Days(const DateParts& parts)
{
    return OleDate(parts).value();
}

const UserLocale& UsEnglish()
{
    static const UserLocale locale(QLocale(QLocale::English, QLocale::UnitedStates));
    return locale;
}

struct TextRow {
    const char* what;
    DateParts parts;
    QString text;
};

TEST(UserLocale, WritesDateAndTimeAndLeavesOutWhatSaysNothing)
{
    const TextRow rows[] = {
        {"date and time", {2001, 7, 4, 9, 5, 0, 0}, u"7/4/2001 9:05:00 AM"_s},
        {"afternoon", {2001, 12, 31, 23, 59, 59, 999}, u"12/31/2001 11:59:59 PM"_s},
        {"midnight", {2001, 7, 4, 0, 0, 0, 0}, u"7/4/2001"_s},
        {"a fraction past midnight", {2001, 7, 4, 0, 0, 0, 300}, u"7/4/2001"_s},
        {"base date", {1899, 12, 30, 13, 0, 0, 0}, u"1:00:00 PM"_s},
        {"base date at midnight", {1899, 12, 30, 0, 0, 0, 0}, u"12:00:00 AM"_s},
        {"first day", {1, 1, 1, 6, 0, 0, 0}, u"1/1/0001 6:00:00 AM"_s},
    };
    for (const TextRow& row : rows)
        EXPECT_EQ(UsEnglish().DateTimeText(Days(row.parts)), row.text) << row.what;
    EXPECT_EQ(UsEnglish().DateTimeText(1e9), QString());
}

TEST(UserLocale, IsUsEnglishUnderThePosixLocale)
{
    const UserLocale posix(QLocale::c());
    EXPECT_EQ(posix.DateTimeText(Days({2001, 7, 4, 9, 5, 0, 0})), u"7/4/2001 9:05:00 AM"_s);
}

TEST(UserLocale, ReadsDatesInItsOwnFormAndIso)
{
    const TextRow rows[] = {
        {"own form", {2001, 7, 4, 0, 0, 0, 0}, u"7/4/2001"_s},
        {"padded", {2001, 7, 4, 0, 0, 0, 0}, u" 07/04/2001 "_s},
        {"other separators", {2001, 7, 4, 0, 0, 0, 0}, u"7-4-2001"_s},
        {"two-digit year", {2029, 7, 4, 0, 0, 0, 0}, u"7/4/29"_s},
        {"two-digit year of the last century", {1930, 7, 4, 0, 0, 0, 0}, u"7/4/30"_s},
        {"with a time", {2001, 7, 4, 21, 5, 0, 0}, u"7/4/2001 9:05:00 PM"_s},
        {"narrow blank before PM", {2001, 7, 4, 21, 5, 0, 0}, u"7/4/2001 9:05:00\u202FPM"_s},
        {"time without seconds", {2001, 7, 4, 21, 5, 0, 0}, u"7/4/2001 21:05"_s},
        {"ISO", {2001, 7, 4, 0, 0, 0, 0}, u"2001-07-04"_s},
        {"ISO with T", {2001, 7, 4, 9, 5, 7, 250}, u"2001-07-04T09:05:07.250"_s},
        {"ISO with a blank", {2001, 7, 4, 9, 5, 0, 0}, u"2001-07-04 09:05"_s},
        {"time alone", {1899, 12, 30, 9, 5, 0, 0}, u"9:05:00 AM"_s},
        {"noon", {1899, 12, 30, 12, 0, 0, 0}, u"12:00 p.m."_s},
        {"midnight", {1899, 12, 30, 0, 30, 0, 0}, u"12:30 am"_s},
        {"an hour", {1899, 12, 30, 21, 0, 0, 0}, u"9 PM"_s},
        {"leap day", {2000, 2, 29, 0, 0, 0, 0}, u"2/29/2000"_s},
        {"digits of another script", {2001, 7, 4, 0, 0, 0, 0}, u"٧/٤/٢٠٠١"_s},
    };
    for (const TextRow& row : rows)
        EXPECT_EQ(UsEnglish().ParseDateTime(row.text), OleDate(row.parts)) << row.what;
}

TEST(UserLocale, RefusesWhatNamesNoDayOrTime)
{
    const QString texts[] = {u""_s,
                             u" "_s,
                             u"soon"_s,
                             u"5"_s,
                             u"7/4"_s,
                             u"2/30/2001"_s,
                             u"2/29/1900"_s,
                             u"13/1/2001"_s,
                             u"7/4/101"_s,
                             u"7/4/0000"_s,
                             u"7/4/20010"_s,
                             u"7/4/2001x"_s,
                             u"7/4/2001 x"_s,
                             u"7/4/2001 24:00"_s,
                             u"9:60"_s,
                             u"9:05:61"_s,
                             u"13:00 PM"_s,
                             u"9:5"_s,
                             u"2001-7"_s,
                             u"2001-02-30"_s,
                             u"7/4/20019:05"_s,
                             QString(5000, u'1')};
    for (const QString& text : texts)
        EXPECT_EQ(UsEnglish().ParseDateTime(text), std::nullopt) << text.left(40).toStdString();
}

TEST(UserLocale, ReadsWhatItWritesInEveryLanguage)
{
    const double moments[] = {Days({2001, 7, 4, 9, 5, 7, 0}), Days({1987, 12, 11, 22, 45, 0, 0}),
                              Days({2031, 10, 1, 0, 0, 0, 0}), Days({1899, 12, 30, 13, 5, 9, 0})};
    const QList<QLocale> locales =
        QLocale::matchingLocales(QLocale::AnyLanguage, QLocale::AnyScript, QLocale::AnyTerritory);
    ASSERT_GT(locales.size(), 100);
    for (const QLocale& locale : locales) {
        const UserLocale user(locale);
        for (const double moment : moments) {
            const QString text = user.DateTimeText(moment);
            EXPECT_EQ(user.ParseDateTime(text), moment)
                << locale.name().toStdString() << ' ' << text.toStdString() << ' '
                << user.DateFormat().toStdString() << ' ' << user.TimeFormat().toStdString();
        }
        EXPECT_TRUE(user.TimeFormat().contains(u's')) << locale.name().toStdString();
    }
}

TEST(VariantText, ShowsEachKindOfValue)
{
    const struct {
        const char* what;
        Value value;
        QString text;
    } rows[] = {
        {"empty", Value(), {}},
        {"null", Value::Null(), {}},
        {"small integer", Value::SmallInt(-7), u"-7"_s},
        {"integer", Value::Integer(2147483647), u"2147483647"_s},
        {"sum of binary fractions", Value::Double(0.1 + 0.2), u"0.3"_s},
        {"whole double", Value::Double(12), u"12"_s},
        {"fifteen digits", Value::Double(123456789.1234567), u"123456789.123457"_s},
        {"large", Value::Double(1e20), u"1E+20"_s},
        {"negative zero", Value::Double(-0.0), u"0"_s},
        {"date", Value::Date(Days({2001, 7, 4, 0, 0, 0, 0})), u"7/4/2001"_s},
        {"text as it stands", Value::Text(u" a\r\n"_s), u" a\r\n"_s},
        {"true", Value::Bool(true), u"-1"_s},
        {"false", Value::Bool(false), u"0"_s},
        {"binary", Value::Binary("ab"), {}},
    };
    for (const auto& row : rows)
        EXPECT_EQ(VariantText(row.value), row.text) << row.what;
}

} // namespace
} // namespace mirel
