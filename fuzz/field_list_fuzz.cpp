// A list of fields in JSON: refusing is fine; what was accepted must be a design that can be planned.
#include "resources/string_table.h"
#include "tableeditor/design_plan.h"
#include "tableeditor/field_list.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    using namespace mirel;
    UserMessage fault{Str::DesignNoFields, {}};
    const auto list = ReadFieldList(QByteArray(reinterpret_cast<const char*>(data), qsizetype(size)), fault);
    if (!list)
        return 0;
    const auto field = [](const char* name) {
        return FieldDesign{QLatin1String(name), FieldType::Integer, kMaxTextSize, IndexOrder::None,
                           QLatin1String(name)};
    };
    const TableDesign table{QStringLiteral("T"), {field("A"), field("B"), field("C")}, {}};
    const auto fields = FieldsOfList(*list, &table, fault);
    if (!fields || FaultOfFields(*fields))
        return 0;
    if (PlanDesign(table, *fields).dropped.size() + qsizetype(fields->size()) < 3)
        __builtin_trap(); // a field of the table is lost without a word
    return 0;
}
