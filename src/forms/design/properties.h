#pragma once

#include "forms/form_records.h"
#include "resources/string_id.h"

#include <QString>

#include <limits>
#include <span>

namespace mirel {

// How a property is edited. Its value is a text all the same: a flag "1" or "0", a color its number.
enum class PropertyKind {
    Text,
    Number,
    Flag,
    Choice,
    Color,
    Font, // of the record's text style, which goes through a dialog: read tells it, nothing is written
    Expression,
    Query,       // a statement, or what follows "SELECT * "
    Items,       // a text of several lines
    Field,       // of the form's table: the value is the ControlSource that shows it, "" for another one
    Columns,     // of a list: the value is the whole ControlSource, taken apart by SplitListColumns
    Assignments, // of a button: likewise, by SplitAssignments
    Table,
    CalledForm,
};

enum class PropertyGroup { Content, Start, Look, Place };

struct PropertyChoice {
    qint32 value;
    Str text;
    bool offered = true; // false: known, kept and shown, but not chosen here
};

struct PropertyDef {
    Str caption;
    PropertyKind kind;
    PropertyGroup group;
    std::span<const PropertyChoice> choices{};
    qint32 least = std::numeric_limits<qint32>::min();
    qint32 most = std::numeric_limits<qint32>::max();
    int maxLength = 0;          // of a text; 0: any
    bool followsSelect = false; // of a query: what stands behind "SELECT * "
};

// A line of a property sheet. Writing changes the fields that the line is about and leaves every other byte of the
// record as it is; a value that does not read changes nothing.
template <typename Record>
struct PropertyRow {
    PropertyDef def;
    QString (*read)(const Record& record);
    void (*write)(Record& record, const QString& value);
    bool (*shown)(const Record& record) = nullptr; // null: always
};

using ControlProperty = PropertyRow<ControlDef>;
using FormProperty = PropertyRow<FormDef>;

std::span<const ControlProperty> ControlProperties();
std::span<const FormProperty> FormProperties();

template <typename Record>
bool IsShown(const PropertyRow<Record>& row, const Record& record)
{
    return !row.shown || row.shown(record);
}

// The name of a choice as the sheet shows it; of a number without a meaning "Other (7)".
QString ChoiceText(const PropertyDef& def, qint32 value);
QString StyleInWords(const TextStyle& style); // "Default, 9 pt, bold"

Str GroupTitle(PropertyGroup group);

} // namespace mirel
