// A list of fields in JSON: what it says, what is refused and where, and what each field was.
#include "resources/string_table.h"
#include "support/printing.h"
#include "tableeditor/field_list.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// "Name/Text/40/ASC/was", comma-separated; the reason in angle brackets when it is refused.
QString Read(const char* json, const TableDesign* table = nullptr)
{
    UserMessage fault{Str::DesignNoFields, {}};
    const auto list = ReadFieldList(json, fault);
    const auto fields = list ? FieldsOfList(*list, table, fault) : std::nullopt;
    if (!fields)
        return u'<' + fault.Text() + u'>';
    QStringList texts;
    for (const FieldDesign& field : *fields) {
        texts += QStringList({field.name, QString::number(int(field.type)), QString::number(field.size),
                              WordOfIndexOrder(field.index), field.was})
                     .join(u'/');
    }
    return texts.join(u',');
}

TEST(FieldList, NamesFields)
{
    EXPECT_EQ(Read(R"([{"name":"A","type":"Text","size":40,"index":"DESC"},{"name":"B","type":"yes/no"}])"),
              u"A/202/40/DESC/,B/11/255/NO/"_s);
    EXPECT_EQ(Read(R"([{"name":"A","type":"Boolean","size":null,"index":"yes","was":null}])"), u"A/11/255/ASC/"_s);
    EXPECT_EQ(Read("[]"), u""_s);
}

TEST(FieldList, RefusesWhatItDoesNotUnderstandAndSaysWhere)
{
    struct Row {
        const char* json;
        const char* place;
    };
    const std::vector<Row> rows = {
        {"{}", "it is no JSON list"},
        {"[1]", "[0] is no field"},
        {R"([{"name":"A","type":"Text"},{"type":"Text"}])", "[1].name is not understood"},
        {R"([{"name":3,"type":"Text"}])", "[0].name is not understood"},
        {R"([{"name":"A"}])", "[0].type is not understood"},
        {R"([{"name":"A","type":"Number"}])", "[0].type is not understood"},
        {R"([{"name":"A","type":"Text","size":1.5}])", "[0].size is not understood"},
        {R"([{"name":"A","type":"Text","size":"40"}])", "[0].size is not understood"},
        {R"([{"name":"A","type":"Text","index":"UP"}])", "[0].index is not understood"},
        {R"([{"name":"A","type":"Text","was":1}])", "[0].was is not understood"},
        {R"([{"name":"A","type":"Text","colour":1}])", "[0].colour is not understood"},
    };
    for (const Row& row : rows)
        EXPECT_EQ(Read(row.json), u"<The list of fields cannot be read: %1>"_s.arg(QLatin1String(row.place)));
    EXPECT_TRUE(Read("[{\"name\":").startsWith(u"<The list of fields cannot be read: "_s));
    // Out of range is for the rule of sizes.
    EXPECT_EQ(Read(R"([{"name":"A","type":"Text","size":1e300}])"), u"A/202/256/NO/"_s);
    EXPECT_EQ(Read(R"([{"name":"A","type":"Text","size":-7}])"), u"A/202/-1/NO/"_s);
}

TEST(FieldList, FindsWhatEachFieldWas)
{
    const auto field = [](const QString& name) {
        return FieldDesign{name, FieldType::Integer, kMaxTextSize, IndexOrder::None, name};
    };
    const TableDesign table = {u"T"_s, {field(u"A"_s), field(u"B"_s)}, {}};
    struct Row {
        const char* json;
        QString fields;
    };
    const std::vector<Row> rows = {
        {R"([{"name":"a","type":"Integer"}])", u"a/3/255/NO/A"_s},
        {R"([{"name":"B","type":"Integer","was":"A"},{"name":"A","type":"Integer","was":"B"}])",
         u"B/3/255/NO/A,A/3/255/NO/B"_s},
        {R"([{"name":"B","type":"Integer"},{"name":"C","type":"Integer","was":"B"}])",
         u"B/3/255/NO/,C/3/255/NO/B"_s},
        {R"([{"name":"A","type":"Integer","was":""}])", u"A/3/255/NO/"_s},
        {R"([{"name":"C","type":"Integer","was":"X"}])",
         u"<The table \"T\" has no field \"X\" that \"C\" was.>"_s},
        {R"([{"name":"C","type":"Integer","was":"a"},{"name":"D","type":"Integer","was":"A"}])",
         u"<Only one field can be what \"A\" was.>"_s},
    };
    for (const Row& row : rows)
        EXPECT_EQ(Read(row.json, &table), row.fields) << row.json;
}

} // namespace
} // namespace mirel
