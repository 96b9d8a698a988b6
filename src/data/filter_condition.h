#pragma once

#include "platform/field_type.h"
#include "platform/value.h"
#include "platform/yes_no_words.h"

#include <QString>
#include <QStringList>

#include <span>

namespace mirel {

enum class CellFilter { BySelection, ExcludingSelection };

// The condition that keeps or excludes the records whose field equals this cell. `reference` is the field as a
// statement writes it, `displayText` the full text of the cell.
QString ConditionFromCell(CellFilter filter, const QString& reference, FieldType type, const Value& value,
                          const QString& displayText, const YesNoWords& words);

// The operators that a filter offers for a type, in order; none for a type that cannot be compared. `range`: those
// of a From-To filter.
enum class FilterKind { Single, Range };
std::span<const std::u16string_view> FilterOperators(FieldType type, FilterKind kind = FilterKind::Single);
QString FilterOperatorText(std::u16string_view name); // as a person reads it

// The contents of the filter dialog: a field, an operator and a value, or two of each.
struct FilterDraft {
    QString table;
    QString field;
    FieldType type = FieldType::None;
    bool fromTo = false;
    QString operatorText; // one of FilterOperators; also the From operator
    QString valueText;    // also the From value
    QString toOperatorText;
    QString toValueText;

    // The operator with which a Yes/No filter starts on a cell that shows `displayText`.
    static QString PresetYesNo(QStringView displayText);

    // Empty when no table or field is chosen or the operator makes no condition: the dialog then acts as Cancel.
    QString Condition() const;
};

// The text that a sort box receives when a person picks a field or a direction; the text before it decides about
// the comma and the blank.
QString SortFieldInsertion(const QString& box, const QString& table, const QString& field);
QString WordInsertion(const QString& box, const QString& word);

} // namespace mirel
