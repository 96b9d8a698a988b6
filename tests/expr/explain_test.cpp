#include "expr/explain.h"

#include "expr/fake_record.h"
#include "resources/string_table.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QLocale>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

struct Slip {
    qsizetype position;
    Str reason;
    friend bool operator==(const Slip&, const Slip&) = default;
};

void PrintTo(const Slip& slip, std::ostream* out)
{
    *out << StringText(slip.reason, {QString::number(slip.position)}).toStdString();
}

class Explanations : public testing::Test {
protected:
    void SetUp() override
    {
        UserLocale::SetCurrent(QLocale(QLocale::English, QLocale::UnitedStates));
        record.SetColumns({{u"Name"_s, FieldType::Text, Value::Text(u"Smith"_s)},
                           {u"Price"_s, FieldType::Double, Value::Double(2.5)},
                           {u"Qty"_s, FieldType::Integer, Value::Integer(4)},
                           {u"None"_s, FieldType::Integer, Value::Null()},
                           {u"Active"_s, FieldType::YesNo, Value::Bool(true)},
                           {u"Due"_s, FieldType::Date, Value::Date(DayNumber(2001, 7, 4))}});
    }

    std::vector<Slip> Slips(const QString& text, ExprMode mode = ExprMode::Condition)
    {
        std::vector<Slip> slips;
        for (const ExprSlip& slip : ExplainExpression(text, mode, record)) {
            slips.push_back({slip.position, slip.reason});
            EXPECT_TRUE(slip.Text().startsWith(u"At %1: "_s.arg(slip.position))) << slip.Text().toStdString();
            EXPECT_FALSE(slip.Text().contains(u'%') && slip.reason != Str::ExplainNoPercent);
        }
        return slips;
    }

    FakeRecord record;
};

TEST_F(Explanations, AreSilentOnFaultlessExpressions)
{
    record.controls = {{u"qty"_s, u"3"_s}};
    for (const char16_t* text : {u"RECNO()+'/'+RECCOUNT()",
                                 u"[Price]*[Qty]*(1+0.2)",
                                 u"UPPER([Name])+'/'+[Name]",
                                 u"[Price] >= 100 AND [Name] LIKE 'A%'",
                                 u"[Due] IS NOT NULL",
                                 u"[None] IS NULL",
                                 u"[None] = NULL OR [Qty] = 4",
                                 u"NOT [Qty] = 5",
                                 u"NOT LENGTH([Name]) = 3",
                                 u"[Active] = 'Yes'",
                                 u"[Qty] = ([Price] + 1)",
                                 u"([Qty] = 4) + 1",
                                 u"-(2^2)",
                                 u"-5+3",
                                 u"-[Qty]",
                                 u"2-3*4",
                                 u"[Due]+1-[Due]",
                                 u"[Due] > SYSDATE()",
                                 u"LAST_DAY()",
                                 u"TO_CHAR([None])+TO_CHAR(5)",
                                 u"ADD_MONTH([Due],1)",
                                 u"SUBSTR([Name],2)",
                                 u"INSTR([Name],'i')",
                                 u"ROUND([Price])",
                                 u"[Name] WHERE [Qty] = 4",
                                 u"WHERE [Qty] = 4",
                                 u"&[Ship To]+'!'",
                                 u"&qty*2",
                                 u"[Name]+[Qty]",
                                 u"MONTH([Due])",
                                 u"ABS(TO_NUMBER([Name]))",
                                 u"([Qty] OR [Price]) AND NOT ([Qty])",
                                 u"DIFF_TIME([Due],SYSDATETIME())"}) {
        EXPECT_EQ(Slips(QString::fromUtf16(text)), std::vector<Slip>()) << QString::fromUtf16(text).toStdString();
    }
}

TEST_F(Explanations, NameThePlaceAndTheReason)
{
    const struct {
        QString text;
        std::vector<Slip> slips;
    } rows[] = {
        {u"1 2"_s, {{3, Str::ExplainNoPlace}}},
        {u"'it''s'"_s, {{5, Str::ExplainNoPlace}}},
        {u"+5"_s, {{1, Str::ExplainNoPlace}}},
        {u"[Qty] = 4 UPPER('x') (5)"_s, {{11, Str::ExplainNoPlace}, {22, Str::ExplainNoPlace}}},
        {u"REPLACE('a','b','c') ('d')"_s, {{13, Str::ExplainReplaced}}},
        {u"[Qty]) + 1"_s, {{6, Str::ExplainAfterTheEnd}}},
        {u"NOT [Qty]"_s, {{1, Str::ExplainLostNot}}},
        {QString(300, u'(') + u'1', {{201, Str::ExplainTooLong}}},
        {u" () "_s, {{1, Str::ExplainNothing}}},
        {u"[Cost]*2"_s, {{1, Str::ExplainUnknownName}, {7, Str::ExplainTextInArithmetic}}},
        {u"First Name"_s, {{1, Str::ExplainUnknownName}}},
        {u"SUBSTR ([Name],1)"_s,
         {{1, Str::ExplainUnknownName}, {8, Str::ExplainNoPlace}, {16, Str::ExplainNoPlace}}},
        {u"[Qty] = [Price] + 1"_s, {{17, Str::ExplainSwallowed}}},
        {u"1 < [Qty] < 5"_s, {{11, Str::ExplainSwallowed}}},
        {u"[Qty] AND ([Price] + 1) > 3"_s, {{25, Str::ExplainSwallowed}}},
        {u"-2^2"_s, {{1, Str::ExplainLeadingMinus}}},
        {u"-ABS(2)*3"_s, {{1, Str::ExplainLeadingMinus}}},
        {u"5*-3"_s, {{2, Str::ExplainMissingOperand}}},
        {u"[Qty] ="_s, {{7, Str::ExplainMissingOperand}}},
        {u"[Name] WHERE"_s, {{8, Str::ExplainMissingOperand}}},
        {u"UPPER([Qty])"_s, {{7, Str::ExplainNumberForText}}},
        {u"TO_DATE(5)"_s, {{1, Str::ExplainNoValue}, {9, Str::ExplainNumberForText}}},
        {u"LEFT(5*2,1)"_s, {{7, Str::ExplainNumberForText}}},
        {u"SQRT([Name])"_s, {{6, Str::ExplainTextForNumber}}},
        {u"LEFT([Name])"_s, {{1, Str::ExplainMissingArgument}}},
        {u"POWER()"_s, {{1, Str::ExplainMissingArgument}, {1, Str::ExplainMissingArgument}}},
        {u"SUM([Qty])"_s, {{1, Str::ExplainAggregate}}},
        {u"[Active] = TRUE"_s, {{10, Str::ExplainYesNoAndNumber}}},
        {u"[Name] = 5"_s, {{8, Str::ExplainTextAndNumber}}},
        {u"[Qty] LIKE '4%'"_s, {{7, Str::ExplainTextAndNumber}}},
        {u"[Name] LIKE 'Smith'"_s, {{13, Str::ExplainNoPercent}}},
        {u"[Active] AND [Qty] = 4"_s, {{1, Str::ExplainTextAsCondition}}},
        {u"[Price]*[None]"_s, {{9, Str::ExplainFieldIsNull}}},
        {u"'x'+UPPER(LEFT([Name],[None]))"_s, {{23, Str::ExplainFieldIsNull}}},
        {u"NULL = 1"_s, {{1, Str::ExplainNullWord}}},
        {u"[Qty]/([Qty]-4)"_s, {{6, Str::ExplainDivisionByZero}}},
        {u"'x'*2"_s, {{4, Str::ExplainTextInArithmetic}}},
        {u"SQRT(0-1)+1"_s, {{1, Str::ExplainNoValue}}},
        {u"ADD_MONTH('2001-12-15',12)"_s, {{1, Str::ExplainNoValue}}},
        {u"[Due]+9999999"_s, {{6, Str::ExplainNoValue}}},
    };
    for (const auto& row : rows)
        EXPECT_EQ(Slips(row.text), row.slips) << row.text.toStdString();
    EXPECT_EQ(Slips(u"[Qty]<5"_s, ExprMode::Value),
              (std::vector<Slip>{{1, Str::ExplainUnknownName}, {7, Str::ExplainNoPlace}}));
    record.position = -1;
    record.count = 0;
    EXPECT_EQ(Slips(u"[Name]"_s), (std::vector<Slip>{{1, Str::ExplainNoRecord}}));
}

} // namespace
} // namespace mirel
