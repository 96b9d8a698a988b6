#pragma once

#include "expr/date_format.h"
#include "platform/field_type.h"
#include "platform/user_prompt.h"
#include "provider/provider.h"

#include <QString>
#include <QStringList>

#include <optional>
#include <span>
#include <vector>

namespace mirel {

// Where one column of the file goes. Type and size are those of the field that a new table gets; an existing
// table's field has its own.
struct ImportColumn {
    bool ignored = false;
    QString field;
    FieldType type = FieldType::Text;
    int size = kMaxTextSize;         // of a Text
    std::optional<DateFormat> dates; // where it is not the file's

    friend bool operator==(const ImportColumn&, const ImportColumn&) = default;
};

using ImportColumns = std::vector<ImportColumn>;

// The functions below return false when their input does not fit, with the reason in `fault` and `columns`
// unchanged.

// "Name:Type[:Size],…", the file's columns in order; "-" ignores one. A name in brackets may
// contain "," and ":". A column without a type is a Text of 255.
[[nodiscard]] bool ParseColumnList(const QString& list, ImportColumns& columns, UserMessage& fault);

// Columns of a new table, named by the file's first line; unusable names (empty, twice, too long) are adapted.
ImportColumns ColumnsNamed(const QStringList& names);
// "Field1", "Field2", … of Text 255.
ImportColumns NumberedColumns(int count);

// Finds the columns' fields among those of an existing table, by exact name or in any case, and takes over
// their spelling and types.
[[nodiscard]] bool MatchByName(const QString& table, std::span<const ResultField> fields, ImportColumns& columns,
                               UserMessage& fault);
// The file's columns go to the table's fields in order, one for each field, although the first line has only
// `count` texts: later lines may have more. More texts than fields are refused.
[[nodiscard]] bool MatchInOrder(const QString& table, std::span<const ResultField> fields, int count,
                                ImportColumns& columns, UserMessage& fault);

// Whether they can make a table: at least one is not ignored, sizes are 1 to 255, no name occurs twice.
[[nodiscard]] bool CheckNewColumns(const ImportColumns& columns, UserMessage& fault);

// The statement that creates the table.
QString CreateTableStatement(const QString& table, const ImportColumns& columns);

} // namespace mirel
