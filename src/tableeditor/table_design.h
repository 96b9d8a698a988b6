#pragma once

#include "data/catalog.h"
#include "data/table_statements.h"
#include "platform/user_prompt.h"

#include <QString>
#include <QStringList>

#include <optional>
#include <vector>

namespace mirel {

// One field as its table's designer shows it: a row of name, type, size and index.
struct FieldDesign {
    QString name;
    FieldType type = FieldType::Text;
    int size = kMaxTextSize; // of a Text; of no other type does it say anything
    IndexOrder index = IndexOrder::None;
    QString was; // the field's name in the table as it is; empty: a new field

    FieldDefinition Definition() const { return {name, type, size}; }
    bool SameStorage(const FieldDesign& other) const
    {
        return type == other.type && (type != FieldType::Text || size == other.size);
    }
    friend bool operator==(const FieldDesign&, const FieldDesign&) = default;
};

// A table's fields in their order, and its indexes. What a designer works on is such a record and a copy of it.
struct TableDesign {
    QString table;
    std::vector<FieldDesign> fields;
    std::vector<IndexDefinition> indexes; // all of the table as it is; FieldDesign::index is what is wanted

    friend bool operator==(const TableDesign&, const TableDesign&) = default;
};

// Names over these lengths would be cut by forms and saved queries, which refer to tables and fields by them.
inline constexpr qsizetype kMaxNewTableName = 31;
inline constexpr qsizetype kMaxNewFieldName = 64;

// Whether two names mean the same table or field.
bool SameDesignName(QStringView a, QStringView b);

// The functions below say what is wrong; empty: nothing.
std::optional<UserMessage> FaultOfTableName(const QString& name);
std::optional<UserMessage> FaultOfFieldName(const QString& name);
// A text field holds 1 to 255 characters.
std::optional<UserMessage> FaultOfSize(const FieldDesign& field);
// All that can be told without the database: names (the new ones alone), doubles, sizes, that there is a field.
std::optional<UserMessage> FaultOfFields(const std::vector<FieldDesign>& fields);

// The index of its own that the table has on a field; null: none. An index on several fields is nobody's own.
const IndexDefinition* OwnIndex(const TableDesign& design, const QString& field);
// `wanted`, or that with the least number from 2 on behind it, that none of `taken` is.
QString FreeName(const QString& wanted, const QStringList& taken);

// The table as it is, each field's `was` being its name. Empty, and the reason reported, when it cannot be read.
std::optional<TableDesign> ReadTableDesign(DbConnection& connection, const DatabaseLocation& database,
                                           const QString& table, UserPrompt& prompt);

} // namespace mirel
