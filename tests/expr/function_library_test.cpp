#include "expr/function_library.h"

#include "expr/expr_parser.h"
#include "expr/fake_record.h"
#include "platform/user_locale.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QLocale>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

struct Case {
    QString text;
    QString expected;
};

// Functions over literals; `none` is a field that is NULL.
class FunctionsOfExpressions : public testing::Test {
protected:
    void SetUp() override
    {
        UserLocale::SetCurrent(QLocale(QLocale::English, QLocale::UnitedStates));
        record.SetColumns({{u"none"_s, FieldType::Text, Value::Null()},
                           {u"due"_s, FieldType::Date, Value::Date(DayNumber(2001, 7, 4, 18))}});
    }

    void ExpectValues(const std::vector<Case>& rows)
    {
        for (const Case& row : rows) {
            const ExprTree tree = ParseExpression(row.text, ExprMode::Value);
            EvaluateExpression(record, *tree);
            EXPECT_EQ(Describe(*tree), row.expected) << row.text.toStdString();
        }
    }

    FakeRecord record;
};

TEST_F(FunctionsOfExpressions, ChangeCase)
{
    ExpectValues({{u"UPPER('straße')"_s, u"<STRAßE>"_s}, // one to one: no letter becomes two
                  {u"UPPER('ŉéω')"_s, u"<ŉÉΩ>"_s},
                  {u"LOWER('ÀÇΣ')"_s, u"<àçσ>"_s},
                  {u"UPPER('\U00010428x')"_s, u"<\U00010400X>"_s},
                  {u"INITCAP('the  QUICK\tfox-o élan')"_s, u"<The  QUICK\tFox-o Élan>"_s},
                  {u"UPPER(5)"_s, u"<>"_s},
                  {u"UPPER([none])"_s, u"null"_s},
                  {u"UPPER()"_s, u"null"_s}});
}

TEST_F(FunctionsOfExpressions, CutTexts)
{
    ExpectValues({{u"LTRIM('  a ')"_s, u"<a >"_s},
                  {u"RTRIM(' a\t  ')"_s, u"< a\t>"_s}, // spaces only
                  {u"LEFT('abc',2)"_s, u"<ab>"_s},
                  {u"LEFT('abc',9)"_s, u"<abc>"_s},
                  {u"LEFT('abc',(-1))"_s, u"<>"_s},
                  {u"LEFT('abc')"_s, u"null"_s},
                  {u"RIGHT('abc',2)"_s, u"<bc>"_s},
                  {u"RIGHT('abc',2.9)"_s, u"<bc>"_s},
                  {u"RIGHT('abc',1e12)"_s, u"<abc>"_s},
                  {u"LENGTH('a\U00010428')"_s, u"3"_s},
                  {u"LENGTH([due])"_s, u"19"_s}});
}

TEST_F(FunctionsOfExpressions, TakePartsOfTexts)
{
    ExpectValues({{u"SUBSTR('abcdef',2,3)"_s, u"<bcd>"_s},
                  {u"SUBSTR('abcdef',2)"_s, u"<bcdef>"_s},
                  {u"SUBSTR('abcdef',0,2)"_s, u"<ab>"_s},
                  {u"SUBSTR('abcdef',-3,2)"_s, u"<de>"_s},
                  {u"SUBSTR('abc',-4)"_s, u"<>"_s},
                  {u"SUBSTR('abc',-3)"_s, u"<abc>"_s},
                  {u"SUBSTR('abc',5)"_s, u"<>"_s},
                  {u"SUBSTR('abc',3,9)"_s, u"<c>"_s},
                  {u"SUBSTR('abc',1,-1)"_s, u"<>"_s},
                  {u"SUBSTR('abc',1,[none])"_s, u"null"_s},
                  {u"SUBSTR('abc',-1e30)"_s, u"<>"_s}});
}

TEST_F(FunctionsOfExpressions, SearchTexts)
{
    ExpectValues({{u"INSTR('abcabc','bc')"_s, u"2"_s},
                  {u"INSTR('abcabc','bc',1,2)"_s, u"5"_s},
                  {u"INSTR('abcabc','bc',3)"_s, u"5"_s},
                  {u"INSTR('abcabc','bc',0)"_s, u"2"_s},
                  {u"INSTR('abcabc','bc',7)"_s, u"0"_s},
                  {u"INSTR('abcabc','bc',-1)"_s, u"5"_s},
                  {u"INSTR('abcabc','bc',-2)"_s, u"2"_s}, // the match must end before the last character
                  {u"INSTR('abcabc','bc',-1,2)"_s, u"2"_s},
                  {u"INSTR('abcabc','bc',-7)"_s, u"0"_s},
                  {u"INSTR('aaaa','aa',1,2)"_s, u"3"_s}, // matches never overlap
                  {u"INSTR('aaaaa','aa',-1,2)"_s, u"2"_s},
                  {u"INSTR('abc','c',1,0)"_s, u"0"_s},
                  {u"INSTR('abc','')"_s, u"0"_s},
                  {u"INSTR('','a')"_s, u"0"_s},
                  {u"INSTR('abc','a',[none])"_s, u"null"_s},
                  {u"REPLACE('a-b-c','-','+')"_s, u"<a+b+c>"_s},
                  {u"REPLACE('aaa','aa','b')"_s, u"<ba>"_s},
                  {u"REPLACE('abc','','x')"_s, u"<abc>"_s},
                  {u"REPLACE('abc','b','')"_s, u"<ac>"_s},
                  {u"REPLACE('abc','b')"_s, u"null"_s}});
    const QString needle = QString(100, u'x') + u'y'; // long ones take another way
    ExpectValues({{u"INSTR('ab"_s + needle + needle + u"','"_s + needle + u"',1,2)"_s, u"104"_s},
                  {u"INSTR('ab"_s + needle + needle + u"','"_s + needle + u"',-2)"_s, u"3"_s},
                  {u"REPLACE('ab"_s + needle + u"c','"_s + needle + u"','-')"_s, u"<ab-c>"_s}});
}

TEST_F(FunctionsOfExpressions, ConvertValues)
{
    ExpectValues({{u"TO_CHAR(2.50)"_s, u"<2.5>"_s},
                  {u"TO_CHAR(3)"_s, u"<3>"_s},
                  {u"TO_CHAR(0.0000001)"_s, u"<0.>"_s},
                  {u"TO_CHAR(100)"_s, u"<100>"_s},
                  {u"TO_CHAR('x')"_s, u"<x>"_s},
                  {u"TO_CHAR([none])"_s, u"<>"_s},
                  {u"TO_CHAR()"_s, u"null"_s},
                  {u"TO_NUMBER(' -1.5e1kg')"_s, u"-15"_s},
                  {u"TO_NUMBER('1e')"_s, u"1"_s},
                  {u"TO_NUMBER('+.5')"_s, u"0.5"_s},
                  {u"TO_NUMBER('0x10')"_s, u"0"_s},
                  {u"TO_NUMBER('inf')"_s, u"0"_s},
                  {u"TO_NUMBER('1e999')"_s, u"null"_s},
                  {u"TO_NUMBER('1e-999')"_s, u"0"_s},
                  {u"TO_NUMBER('-')"_s, u"0"_s},
                  {u"TO_NUMBER(5)"_s, u"0"_s}, // a number has no text: TO_CHAR makes one
                  {u"TO_TIMESTR(3661)"_s, u"<01:01:01>"_s},
                  {u"TO_TIMESTR(90061)"_s, u"<25:01:01>"_s},
                  {u"TO_TIMESTR(0-61)"_s, u"<-00:01:01>"_s}});
}

TEST_F(FunctionsOfExpressions, ReadDates)
{
    ExpectValues({{u"SYSTIME()"_s, u"<9:05:07 AM>"_s},
                  {u"SYSDATE()"_s, u"date<7/4/2001>"_s},
                  {u"SYSDATETIME()"_s, u"date<7/4/2001 9:05:07 AM>"_s},
                  {u"SYSDATE()+1"_s, u"date<7/5/2001>"_s},
                  {u"SYSTIME()+1"_s, u"<9:05:07 AM1>"_s}, // a text, unlike the other two
                  {u"TO_DATE('2001-07-04')"_s, u"date<7/4/2001>"_s},
                  {u"TO_DATE('7/4/2001 6:00:00 PM')"_s, u"date<7/4/2001 6:00:00 PM>"_s},
                  {u"TO_DATE('soon')"_s, u"null"_s},
                  {u"YEAR([due])+MONTH([due])+DAY([due])"_s, u"2012"_s},
                  {u"YEAR('7/4/2001')"_s, u"2001"_s},
                  {u"DAY('31')"_s, u"null"_s},
                  {u"LAST_DAY('2000-02-10')"_s, u"29"_s},
                  {u"LAST_DAY()"_s, u"31"_s},
                  {u"LAST_DAY('soon')"_s, u"31"_s},
                  {u"LAST_DAY([none])"_s, u"null"_s}});
}

TEST_F(FunctionsOfExpressions, CountMonthsAndSeconds)
{
    ExpectValues({{u"ADD_MONTH('2001-01-31',1)"_s, u"date<2/28/2001>"_s},
                  {u"ADD_MONTH([due],0)"_s, u"date<7/4/2001>"_s},
                  {u"ADD_MONTH('2001-01-15',11)"_s, u"date<12/15/2001>"_s},
                  {u"ADD_MONTH('2001-12-15',1)"_s, u"date<1/15/2002>"_s},
                  {u"ADD_MONTH('2001-12-15',12)"_s, u"null"_s}, // 24 by 13 is 1, and month 0 is none
                  {u"ADD_MONTH('2001-12-15',13)"_s, u"date<1/15/2002>"_s},
                  {u"ADD_MONTH('2001-03-31',-1)"_s, u"date<2/28/2001>"_s},
                  {u"ADD_MONTH('2001-01-15',-1)"_s, u"date<12/15/2000>"_s},
                  {u"ADD_MONTH('2001-01-15',-13)"_s, u"date<12/15/1999>"_s},
                  {u"ADD_MONTH('2001-01-15',-1e9)"_s, u"null"_s},
                  {u"ADD_MONTH('2001-01-15',1e12)"_s, u"null"_s},
                  {u"ADD_MONTH('soon',1)"_s, u"null"_s},
                  {u"DIFF_TIME('2001-07-04 09:00:10','2001-07-04 09:00:00')"_s, u"10"_s},
                  {u"DIFF_TIME('2001-07-05','2001-07-04')"_s, u"86400"_s},
                  {u"DIFF_TIME('2001-07-04','2001-07-05')"_s, u"-86399"_s}, // cut after a small addition
                  {u"DIFF_TIME('2001-07-04','soon')"_s, u"null"_s}});
}

TEST_F(FunctionsOfExpressions, RoundOnSixDecimals)
{
    ExpectValues({{u"ROUND(2.5,0)"_s, u"3"_s},         {u"ROUND(2.4)"_s, u"2"_s},
                  {u"ROUND(-2.5,0)"_s, u"-1"_s}, // always upward
                  {u"ROUND(-2.7,0)"_s, u"-1"_s},       {u"ROUND(-2.2,0)"_s, u"-2"_s},
                  {u"ROUND(2.345,2)"_s, u"2.35"_s},    {u"ROUND(2.3456789,6)"_s, u"2.3456789"_s},
                  {u"ROUND(0.9999999,2)"_s, u"1"_s}, // six decimals show 1.000000
                  {u"ROUND(1250,-2)"_s, u"1300"_s},    {u"ROUND(1249,-2)"_s, u"1200"_s},
                  {u"ROUND(1250,-4)"_s, u"0"_s},       {u"ROUND(5250,-4)"_s, u"10000"_s},
                  {u"ROUND(1250,-5)"_s, u"1250"_s},    {u"ROUND(0-1250,-2)"_s, u"-1100"_s},
                  {u"ROUND(1.5,-1e30)"_s, u"1.5"_s},   {u"ROUND(1.5,[none])"_s, u"null"_s},
                  {u"TRUNC(2.789,2)"_s, u"2.78"_s},    {u"TRUNC(-2.789)"_s, u"-2"_s},
                  {u"TRUNC(0-1250,-2)"_s, u"-1200"_s}, {u"TRUNC(1e300,-2)"_s, u"1E+300"_s}});
}

TEST_F(FunctionsOfExpressions, DoMathematics)
{
    ExpectValues({{u"ABS(-2.7)"_s, u"2"_s},
                  {u"ABS(0-1e12)"_s, u"2147483648"_s},
                  {u"SQRT(16)"_s, u"4"_s},
                  {u"SQRT(0-1)"_s, u"null"_s},
                  {u"LN(EXP(2))"_s, u"2"_s},
                  {u"LN(0)"_s, u"null"_s},
                  {u"LOG(2,8)"_s, u"3"_s},
                  {u"LOG(1,8)"_s, u"null"_s},
                  {u"POWER(2,0.5)*POWER(2,0.5)"_s, u"2"_s},
                  {u"EXP(1000)"_s, u"null"_s},
                  {u"FLOOR(-2.5)*10+CEIL(-2.5)"_s, u"-32"_s},
                  {u"SIN(0)+COS(0)+TAN(0)"_s, u"1"_s},
                  {u"ASIN(1)+ACOS(1)+ATAN(0)"_s, u"1.5707963267949"_s},
                  {u"SINH(0)+COSH(0)+TANH(0)"_s, u"1"_s},
                  {u"ASIN(2)"_s, u"null"_s},
                  {u"SQRT('16')"_s, u"0"_s}});
}

TEST_F(FunctionsOfExpressions, KnowTheResult)
{
    ExpectValues({{u"RECNO()"_s, u"3"_s},
                  {u"RECNO([none])"_s, u"3"_s}, // what takes no argument ignores one
                  {u"RECCOUNT()+COUNT([none])+SEEKTOTAL(1)"_s, u"30"_s}});
}

} // namespace
} // namespace mirel
