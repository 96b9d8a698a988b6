#include "data/filter_condition.h"

#include "data/condition_fault.h"

#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TEST(ConditionFromCell, FollowsTheTypeOfTheField)
{
    struct Row {
        FieldType type;
        Value value;
        QString shown;
        QString expected;
    };
    const Row rows[] = {
        {FieldType::Text, Value::Null(), u""_s, u"F IS NULL"_s},
        {FieldType::Text, Value::Text(u"O'Brien %2"_s), u"O'Brien %2"_s, u"F = 'O''Brien %2'"_s},
        {FieldType::SmallInt, Value::SmallInt(-7), u"-7"_s, u"F = -7"_s},
        {FieldType::Double, Value::Double(2.5), u"2.5"_s, u"F >= 2.500000 AND F <= 2.500000"_s},
        {FieldType::Date, Value::Date(37076), u"7/4/2001"_s, u"F = '7/4/2001'"_s},
        {FieldType::Date, Value::Date(37076.5 + 0.25 / 86400), u"7/4/2001 12:00:00 PM"_s,
         u"F = '2001-07-04 12:00:00.250'"_s},
        {FieldType::Date, Value::Text(u"next '99"_s), u"next '99"_s, u"F = 'next ''99'"_s},
        {FieldType::Integer, Value::Double(2.5), u"2.5"_s, u"F = 2.5"_s},
        {FieldType::YesNo, Value::Bool(true), u"Oui"_s, u"F IS TRUE"_s},
        {FieldType::YesNo, Value::Bool(true), u"oui"_s, u"F IS FALSE"_s}, // the words are compared exactly
    };
    for (const Row& row : rows) {
        EXPECT_EQ(ConditionFromCell(CellFilter::BySelection, u"F"_s, row.type, row.value, row.shown,
                                    {u"Oui"_s, u"Non"_s}),
                  row.expected);
    }
    EXPECT_EQ(
        ConditionFromCell(CellFilter::ExcludingSelection, u"[A b]"_s, FieldType::Memo, Value::Null(), {}, {}),
        u"(NOT([A b] IS NULL))"_s);
}

TEST(FilterDraft, WritesTheConditionOfItsOperator)
{
    struct Row {
        FieldType type;
        QString operatorText;
        QString value;
        QString expected;
    };
    const Row rows[] = {
        {FieldType::Text, u"begins with"_s, u"O'Neil"_s, u"T.[My f] LIKE 'O''Neil%'"_s},
        {FieldType::Memo, u"not contains"_s, u" %1 "_s, u"T.[My f] NOT LIKE '%%1%'"_s},
        {FieldType::Text, u"ends with"_s, u"'abc'"_s, u"T.[My f] LIKE '%abc'"_s},
        {FieldType::Text, u"ends with"_s, u"'"_s, u"T.[My f] LIKE '%'''"_s}, // no pair: one character
        {FieldType::Text, u"="_s, u"abc"_s, u""_s},
        {FieldType::Integer, u"not ="_s, u" 5"_s, u"T.[My f] not = 5"_s},
        {FieldType::Double, u"="_s, u"2.5"_s, u"T.[My f] >= 2.5 AND T.[My f] <= 2.5"_s},
        {FieldType::Double, u">"_s, u"2.5"_s, u"T.[My f] > 2.5"_s},
        {FieldType::Date, u"<="_s, u"7/4/2001"_s, u"T.[My f] <= '7/4/2001'"_s},
        {FieldType::Date, u"="_s, u"7/4/2001 9:05:00 AM"_s, u"T.[My f] = '7/4/2001 9:05:00 AM'"_s},
        {FieldType::Integer, u"="_s, u" "_s, u"T.[My f] IS NULL"_s},
        {FieldType::Date, u"not ="_s, u""_s, u"T.[My f] IS NOT NULL"_s},
        {FieldType::Double, u">"_s, u""_s, u""_s},
        {FieldType::YesNo, u"is false"_s, u""_s, u"T.[My f] is false"_s},
        {FieldType::LongBinary, u"="_s, u"x"_s, u""_s},
        {FieldType::None, u"="_s, u"x"_s, u""_s},
    };
    for (const Row& row : rows) {
        const FilterDraft draft{.table = u"T"_s,
                                .field = u"My f"_s,
                                .type = row.type,
                                .fromTo = false,
                                .operatorText = row.operatorText,
                                .valueText = row.value,
                                .toOperatorText = {},
                                .toValueText = {}};
        EXPECT_EQ(draft.Condition(), row.expected) << row.operatorText.toStdString();
    }
}

TEST(ConditionFault, IsFoundWhereTheTextCannotBeRead)
{
    const struct {
        QString condition;
        std::optional<qsizetype> at;
    } rows[] = {
        {u"Age > 5 AND Name LIKE 'x%'"_s, std::nullopt},
        {u"Age >> 5"_s, 5},
        {u"Age = 5 5"_s, 8},
        {u"Age >"_s, 5},
        {u"Name = 'open"_s, 7},
    };
    for (const auto& row : rows)
        EXPECT_EQ(FaultInCondition(row.condition), row.at) << row.condition.toStdString();
}

TEST(FilterDraft, WritesBothEndsOfARange)
{
    FilterDraft draft{.table = u"T"_s,
                      .field = u"f"_s,
                      .type = FieldType::Text,
                      .fromTo = true,
                      .operatorText = u">="_s,
                      .valueText = u"a'b"_s,
                      .toOperatorText = u"<"_s,
                      .toValueText = u"\"c\""_s};
    EXPECT_EQ(draft.Condition(), u"T.f >= 'a''b' AND T.f < 'c'"_s);
    draft.type = FieldType::Integer;
    draft.valueText = u"1"_s;
    draft.toValueText = u"9"_s;
    EXPECT_EQ(draft.Condition(), u"T.f >= 1 AND T.f < 9"_s);
    draft.valueText.clear();
    EXPECT_EQ(draft.Condition(), QString()) << "no bound is no range";
    draft.valueText = u"1"_s;
    draft.toOperatorText.clear();
    EXPECT_EQ(draft.Condition(), QString());
}

TEST(FilterDraft, BeginsAYesNoFilterWithWhatTheCellShows)
{
    for (const char16_t* yes : {u"yes", u"True", u"1"})
        EXPECT_EQ(FilterDraft::PresetYesNo(yes), u"is true"_s);
    for (const char16_t* no : {u"No", u"0", u""})
        EXPECT_EQ(FilterDraft::PresetYesNo(no), u"is false"_s);
}

TEST(SortInsertion, SeparatesFieldsByCommasAndWordsByBlanks)
{
    QString box;
    box += SortFieldInsertion(box, u"T"_s, u"a"_s);
    box += SortFieldInsertion(box, u"T"_s, u"b"_s);
    EXPECT_EQ(box, u"T.a ,T.b "_s);
    box += WordInsertion(box, u"DESC"_s);
    EXPECT_EQ(box, u"T.a ,T.b DESC "_s);
    EXPECT_EQ(WordInsertion(u"T.a"_s, u"ASC"_s), u" ASC "_s);
}

} // namespace
} // namespace mirel
