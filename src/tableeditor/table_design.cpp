#include "tableeditor/table_design.h"

#include "data/db_recordset.h"
#include "data/provider_error.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr size_t kMostFields = 2000;

// Brackets enclose names in statements and expressions, "*" stands for all fields, and what cannot be seen cannot
// be typed again.
bool HasUnusableCharacter(const QString& name)
{
    return std::ranges::any_of(name, [](QChar each) { return each == u'[' || each == u']' || !each.isPrint(); });
}

std::optional<UserMessage> FaultOfName(const QString& name, Str missing, qsizetype longest)
{
    if (name.trimmed().isEmpty())
        return UserMessage{missing, {}};
    if (name != name.trimmed() || name == u"*" || HasUnusableCharacter(name))
        return UserMessage{Str::DesignNameUnusable, {name}};
    if (name.size() > longest)
        return UserMessage{Str::DesignNameTooLong, {name, QString::number(longest)}};
    return {};
}

IndexOrder OrderOf(const IndexDefinition* index)
{
    if (!index)
        return IndexOrder::None;
    return index->parts.front().descending ? IndexOrder::Descending : IndexOrder::Ascending;
}

} // namespace

bool SameDesignName(QStringView a, QStringView b)
{
    return a.compare(b, Qt::CaseInsensitive) == 0;
}

std::optional<UserMessage> FaultOfTableName(const QString& name)
{
    return FaultOfName(name, Str::DesignTableNameMissing, kMaxNewTableName);
}

std::optional<UserMessage> FaultOfFieldName(const QString& name)
{
    return FaultOfName(name, Str::DesignFieldNameMissing, kMaxNewFieldName);
}

std::optional<UserMessage> FaultOfSize(const FieldDesign& field)
{
    if (field.type != FieldType::Text || (field.size >= 1 && field.size <= kMaxTextSize))
        return {};
    return UserMessage{Str::ImportTextSize, {}};
}

std::optional<UserMessage> FaultOfFields(const std::vector<FieldDesign>& fields)
{
    if (fields.empty())
        return UserMessage{Str::DesignNoFields, {}};
    if (fields.size() > kMostFields)
        return UserMessage{Str::ErrorTooManyColumns, {}};
    for (auto field = fields.begin(); field != fields.end(); ++field) {
        // A name that others have given may stay.
        if (field->name != field->was) {
            if (std::optional<UserMessage> fault = FaultOfFieldName(field->name))
                return fault;
        }
        if (std::optional<UserMessage> fault = FaultOfSize(*field))
            return fault;
        const auto isSame = [field](const FieldDesign& other) { return SameDesignName(other.name, field->name); };
        if (std::any_of(fields.begin(), field, isSame))
            return UserMessage{Str::DesignFieldTaken, {field->name}};
    }
    return {};
}

const IndexDefinition* OwnIndex(const TableDesign& design, const QString& field)
{
    const auto index = std::ranges::find_if(design.indexes, [&field](const IndexDefinition& each) {
        return each.parts.size() == 1 && each.parts.front().field == field;
    });
    return index == design.indexes.end() ? nullptr : &*index;
}

QString FreeName(const QString& wanted, const QStringList& taken)
{
    QString name = wanted;
    for (int number = 2; taken.contains(name, Qt::CaseInsensitive); ++number)
        name = wanted + QString::number(number);
    return name;
}

std::optional<TableDesign> ReadTableDesign(DbConnection& connection, const DatabaseLocation& database,
                                           const QString& table, UserPrompt& prompt)
{
    TableDesign design;
    DbRecordset rows(connection);
    if (!rows.Open(NameInBrackets(table), database, CursorType::ForwardOnly, LockType::ReadOnly)) {
        ReportProviderError(prompt, &rows, rows.LastResult());
        return {};
    }
    const std::span<const ResultField> fields = rows.Fields();
    design.table = fields.empty() || fields.front().table.isEmpty() ? table : fields.front().table;
    if (!Catalog(connection, prompt).ListIndexes(design.table, database, design.indexes))
        return {};
    for (const ResultField& field : fields) {
        const int size = field.type == FieldType::Text && field.size > 0 ? field.size : kMaxTextSize;
        design.fields.push_back({field.name, field.type, size, OrderOf(OwnIndex(design, field.name)), field.name});
    }
    return design;
}

} // namespace mirel
