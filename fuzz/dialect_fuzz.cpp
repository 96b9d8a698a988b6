// Statements of the dialect: whatever the text, refusing it is fine. What was accepted must survive being
// written and read again, and the SQL made of it must hold no text that was not meant to be there.
#include "provider/dialect/parser.h"
#include "support/tree_text.h"
#include "provider/sqlite/plan.h"

#include <QString>

#include <cstdint>

using namespace mirel;

namespace {

dialect::Table MakeTable(const QString& name, std::vector<dialect::Column> columns)
{
    dialect::Table table;
    table.name = table.storedName = name;
    table.columns = std::move(columns);
    table.rowId = "rowid";
    return table;
}

dialect::Schema MakeSchema()
{
    using namespace Qt::StringLiterals;
    return {{MakeTable(u"T"_s, {{u"a"_s, FieldType::Text, 10, 1, false},
                                {u"b"_s, FieldType::Integer, 0, 2, false},
                                {u"d"_s, FieldType::Date, 0, 3, true},
                                {u"y"_s, FieldType::YesNo, 0, 4, false},
                                {u"p"_s, FieldType::LongBinary, -1, 5, false}}),
             MakeTable(u"U"_s,
                       {{u"a"_s, FieldType::Memo, -1, 1, false}, {u"x y"_s, FieldType::Double, 0, 2, false}})}};
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    static const dialect::Schema schema = MakeSchema();
    const QString text = QString::fromUtf8(reinterpret_cast<const char*>(data), qsizetype(size));
    const dialect::ParseResult parsed = dialect::ParseStatement(text);
    if (const auto* statement = std::get_if<dialect::Statement>(&parsed)) {
        const dialect::ParseResult again = dialect::ParseStatement(dialect::StatementText(*statement));
        const auto* same = std::get_if<dialect::Statement>(&again);
        if (!same || *same != *statement)
            __builtin_trap();
    }
    (void)sqlite::PlanStatement(text, schema);
    (void)sqlite::PlanDatabaseStatement(text);
    return 0;
}
