// Which statements lead from one design to another; what names and sizes are refused; what becomes of values.
#include "data/table_statements.h"
#include "platform/user_locale.h"
#include "resources/string_table.h"
#include "support/printing.h"
#include "tableeditor/design_plan.h"
#include "tableeditor/value_survey.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

FieldDesign Field(const QString& name, FieldType type, int size = kMaxTextSize,
                  IndexOrder index = IndexOrder::None)
{
    return {name, type, size, index, name};
}
FieldDesign Was(FieldDesign field, const QString& name)
{
    field.name = name;
    return field;
}
FieldDesign NewField(FieldDesign field)
{
    field.was.clear();
    return field;
}
FieldDesign Indexed(FieldDesign field, IndexOrder order)
{
    field.index = order;
    return field;
}

const FieldDesign kName = Field(u"Name"_s, FieldType::Text, 40);
const FieldDesign kQty = Field(u"Qty"_s, FieldType::Integer, kMaxTextSize, IndexOrder::Ascending);
const FieldDesign kNote = Field(u"Note"_s, FieldType::Memo);

TableDesign Items()
{
    return {u"Items"_s, {kName, kQty, kNote}, {{u"Items_Qty_idx"_s, {{u"Qty"_s, false}}, false}}};
}

TEST(DesignStatements, MakeANewTableAndItsIndexes)
{
    const TableDesign design = {u"Items"_s, {kName, kQty}, {}};
    EXPECT_EQ(StatementsOfNewTable(design),
              QStringList({u"CREATE TABLE [Items] ([Name] Varchar(40),[Qty] Integer)"_s,
                           u"CREATE INDEX [Items_Qty_idx] ON [Items] ([Qty] ASC)"_s}));
}

TEST(DesignStatements, AreThoseOfEachChange)
{
    struct Row {
        const char* what;
        std::vector<FieldDesign> wanted;
        QStringList statements;
    };
    const FieldDesign added = NewField(Field(u"Paid"_s, FieldType::YesNo));
    const std::vector<Row> rows = {
        {"nothing", {kName, kQty, kNote}, {}},
        {"add", {kName, kQty, kNote, added}, {u"ALTER TABLE [Items] ADD [Paid] Bit"_s}},
        {"add in the middle",
         {kName, added, kQty, kNote},
         {u"ALTER TABLE [Items] ADD [Paid] Bit"_s, u"ALTER TABLE [Items] MOVE [Paid] BEFORE [Qty]"_s}},
        {"drop, with its index", {kName, kNote}, {u"ALTER TABLE [Items] DROP [Qty]"_s}},
        {"drop all",
         {added},
         {u"ALTER TABLE [Items] DROP [Name]"_s, u"ALTER TABLE [Items] DROP [Qty]"_s,
          u"ALTER TABLE [Items] ADD [Paid] Bit"_s, u"ALTER TABLE [Items] DROP [Note]"_s}},
        {"replace the only one left by its namesake",
         {NewField(kNote)},
         {u"ALTER TABLE [Items] DROP [Name]"_s, u"ALTER TABLE [Items] DROP [Qty]"_s,
          u"ALTER TABLE [Items] RENAME [Note] TO [Note2]"_s, u"ALTER TABLE [Items] ADD [Note] Text"_s,
          u"ALTER TABLE [Items] DROP [Note2]"_s}},
        {"rename", {Was(kName, u"Who"_s), kQty, kNote}, {u"ALTER TABLE [Items] RENAME [Name] TO [Who]"_s}},
        {"another spelling",
         {Was(kName, u"NAME"_s), kQty, kNote},
         {u"ALTER TABLE [Items] RENAME [Name] TO [NAME]"_s}},
        {"exchange names",
         {Was(kName, u"Note"_s), kQty, Was(kNote, u"Name"_s)},
         {u"ALTER TABLE [Items] RENAME [Note] TO [Note2]"_s, u"ALTER TABLE [Items] RENAME [Name] TO [Note]"_s,
          u"ALTER TABLE [Items] RENAME [Note2] TO [Name]"_s}},
        {"move up", {kQty, kName, kNote}, {u"ALTER TABLE [Items] MOVE [Qty] BEFORE [Name]"_s}},
        {"move down", {kName, kNote, kQty}, {u"ALTER TABLE [Items] MOVE [Note] BEFORE [Qty]"_s}},
        {"no index", {kName, Indexed(kQty, IndexOrder::None), kNote}, {u"DROP INDEX [Items].[Items_Qty_idx]"_s}},
        {"the other order",
         {kName, Indexed(kQty, IndexOrder::Descending), kNote},
         {u"DROP INDEX [Items].[Items_Qty_idx]"_s, u"CREATE INDEX [Items_Qty_idx] ON [Items] ([Qty] DESC)"_s}},
        {"an index",
         {Indexed(kName, IndexOrder::Ascending), kQty, kNote},
         {u"CREATE INDEX [Items_Name_idx] ON [Items] ([Name] ASC)"_s}},
        {"an index whose name an earlier field of that name has left",
         {kName, Was(kQty, u"Count"_s), kNote, NewField(kQty)},
         {u"ALTER TABLE [Items] RENAME [Qty] TO [Count]"_s, u"ALTER TABLE [Items] ADD [Qty] Integer"_s,
          u"CREATE INDEX [Items_Qty_idx2] ON [Items] ([Qty] ASC)"_s}},
        {"another type",
         {kName, Field(u"Qty"_s, FieldType::Double, kMaxTextSize, IndexOrder::Ascending), kNote},
         {u"ALTER TABLE [Items] ADD [Qty (new)] Float"_s, u"UPDATE [Items] SET [Qty (new)]=[Qty]"_s,
          u"ALTER TABLE [Items] DROP [Qty]"_s, u"ALTER TABLE [Items] RENAME [Qty (new)] TO [Qty]"_s,
          u"ALTER TABLE [Items] MOVE [Qty] BEFORE [Note]"_s,
          u"CREATE INDEX [Items_Qty_idx] ON [Items] ([Qty] ASC)"_s}},
        {"another size of the last",
         {kName, kQty, Field(u"Note"_s, FieldType::Text, 90)},
         {u"ALTER TABLE [Items] ADD [Note (new)] Varchar(90)"_s, u"UPDATE [Items] SET [Note (new)]=[Note]"_s,
          u"ALTER TABLE [Items] DROP [Note]"_s, u"ALTER TABLE [Items] RENAME [Note (new)] TO [Note]"_s}},
    };
    for (const Row& row : rows)
        EXPECT_EQ(PlanDesign(Items(), row.wanted).statements, row.statements) << row.what;
}

TEST(DesignStatements, KeepIndexesOnSeveralFieldsAndUniqueOnes)
{
    TableDesign design = Items();
    design.indexes = {{u"both"_s, {{u"Name"_s, true}, {u"Qty"_s, false}}, false},
                      {u"one"_s, {{u"Name"_s, false}}, true}};
    design.fields[0].index = IndexOrder::Ascending;
    design.fields[1].index = IndexOrder::None;
    std::vector<FieldDesign> wanted = design.fields;
    wanted[0].size = 50;
    EXPECT_EQ(PlanDesign(design, wanted).statements.mid(5),
              QStringList({u"CREATE INDEX [both] ON [Items] ([Name] DESC,[Qty] ASC)"_s,
                           u"CREATE UNIQUE INDEX [one] ON [Items] ([Name] ASC)"_s}));
    wanted = design.fields;
    wanted[0].index = IndexOrder::None;
    EXPECT_EQ(PlanDesign(design, wanted).statements, QStringList({u"DROP INDEX [Items].[one]"_s}));
}

TEST(IndexWords, SayWhichOrder)
{
    const std::vector<std::pair<QString, IndexOrder>> rows = {
        {u"NO"_s, IndexOrder::None},         {u"No"_s, IndexOrder::None},        {u"N"_s, IndexOrder::None},
        {u"YES"_s, IndexOrder::Ascending},   {u"ASC"_s, IndexOrder::Ascending},  {u"asc"_s, IndexOrder::Ascending},
        {u"DESC"_s, IndexOrder::Descending}, {u"desc"_s, IndexOrder::Descending}};
    for (const auto& [word, order] : rows)
        EXPECT_EQ(IndexOrderOfWord(word), order) << word.toStdString();
}

TEST(DesignNames, AreRefusedWhereTheyCannotBeUsed)
{
    struct Row {
        QString name;
        std::optional<Str> fault;
    };
    const std::vector<Row> rows = {
        {u"Ship To"_s, {}},
        {u"O'Brien \"x\""_s, {}},
        {QString(64, u'x'), {}},
        {QString(65, u'x'), Str::DesignNameTooLong},
        {u""_s, Str::DesignFieldNameMissing},
        {u"   "_s, Str::DesignFieldNameMissing},
        {u" a"_s, Str::DesignNameUnusable},
        {u"a]b"_s, Str::DesignNameUnusable},
        {u"[a"_s, Str::DesignNameUnusable},
        {u"*"_s, Str::DesignNameUnusable},
        {u"a\nb"_s, Str::DesignNameUnusable},
        {QString(u"a\0b"_s.constData(), 3), Str::DesignNameUnusable},
    };
    for (const Row& row : rows) {
        const std::optional<UserMessage> fault = FaultOfFieldName(row.name);
        EXPECT_EQ(fault ? std::optional(fault->id) : std::nullopt, row.fault) << row.name.toStdString();
    }
    EXPECT_FALSE(FaultOfTableName(QString(31, u'x')));
    EXPECT_EQ(FaultOfTableName(QString(32, u'x'))->id, Str::DesignNameTooLong);
}

TEST(DesignFields, AreHeldAgainstEachOther)
{
    const auto faultOf = [](std::vector<FieldDesign> fields) {
        const std::optional<UserMessage> fault = FaultOfFields(fields);
        return fault ? std::optional(fault->id) : std::nullopt;
    };
    FieldDesign foreign = Field(u"a]b"_s, FieldType::Integer);
    EXPECT_EQ(faultOf({}), Str::DesignNoFields);
    EXPECT_EQ(faultOf({kName, foreign}), std::nullopt) << "a name that others gave stays";
    EXPECT_EQ(faultOf({kName, NewField(foreign)}), Str::DesignNameUnusable);
    EXPECT_EQ(faultOf({kName, NewField(Field(u"NAME"_s, FieldType::Integer))}), Str::DesignFieldTaken);
    for (const int size : {0, -1, 256})
        EXPECT_EQ(faultOf({Field(u"T"_s, FieldType::Text, size)}), Str::ImportTextSize) << size;
    EXPECT_EQ(faultOf({Field(u"T"_s, FieldType::Memo, 0)}), std::nullopt);
}

TEST(ValuesAtStake, AreToldByWhatComesBack)
{
    using enum FieldType;
    struct Row {
        Value stored;
        FieldType from;
        FieldType to;
        int size;
        ValueFate fate;
    };
    const auto text = [](const QString& value) { return Value::Text(value); };
    const std::vector<Row> rows = {
        {text(u"12"_s), Text, Integer, -1, ValueFate::Same},
        {text(u" 12"_s), Text, Integer, -1, ValueFate::Altered},
        {text(u"12.5"_s), Text, Integer, -1, ValueFate::Unfit},
        {text(u"12.5"_s), Text, Double, -1, ValueFate::Same},
        {text(u"abc"_s), Memo, Text, 3, ValueFate::Same},
        {text(u"abc"_s), Memo, Text, 2, ValueFate::Unfit},
        {Value::Integer(7), Integer, YesNo, -1, ValueFate::Altered},
        {Value::Integer(1), YesNo, Integer, -1, ValueFate::Same},
        {Value::Integer(40000), Integer, SmallInt, -1, ValueFate::Unfit},
        {Value::Double(2.5), Double, Integer, -1, ValueFate::Unfit},
        {Value::Double(0.1), Double, Text, 20, ValueFate::Same},
        {text(u"2001-07-04"_s), Date, Text, 20, ValueFate::Same},
        {text(u"2001-07-04"_s), Date, Integer, -1, ValueFate::Unfit},
        {text(u"2001-07-04"_s), Text, Date, -1, ValueFate::Same},
        {text(u"7/4/2001"_s), Text, Date, -1, ValueFate::Altered},
        {text(u"someday"_s), Text, Date, -1, ValueFate::Unfit},
        {Value::Binary("x"), VarBinary, Memo, -1, ValueFate::Unfit},
        {Value::Binary("x"), VarBinary, LongBinary, -1, ValueFate::Same},
        // Other programs put texts into columns of bytes, and bytes into columns of texts.
        {text(u"x"_s), VarBinary, Memo, -1, ValueFate::Unfit},
        {Value::Binary("x"), Memo, LongBinary, -1, ValueFate::Unfit},
    };
    for (const Row& row : rows) {
        Hr fault = Hr::Ok;
        EXPECT_EQ(FateOfValue(row.stored, row.from, row.to, row.size, fault), row.fate)
            << VariantText(row.stored).toStdString() << " from " << int(row.from) << " to " << int(row.to);
        EXPECT_EQ(Failed(fault), row.fate == ValueFate::Unfit);
    }
}

} // namespace
} // namespace mirel
