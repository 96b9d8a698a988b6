#include "data/catalog.h"
#include "data/statement_text.h"
#include "tableview/cell_text.h"
#include "tableview/record_browser.h"

#include <algorithm>

// The filters and sorts of the record browser.

namespace mirel {

using namespace Qt::StringLiterals;

QString RecordBrowser::ReferenceOf(int field) const
{
    return FieldReferenceIn(recordset_.Fields(), field);
}

QString RecordBrowser::TableOf(int field) const
{
    const std::span<const ResultField> fields = recordset_.Fields();
    if (field >= 0 && field < FieldCount() && !fields[size_t(field)].table.isEmpty())
        return fields[size_t(field)].table;
    const auto first =
        std::ranges::find_if(fields, [](const ResultField& other) { return !other.table.isEmpty(); });
    return first == fields.end() ? QString() : first->table;
}

bool RecordBrowser::FilterByCell(CellFilter filter)
{
    if (SelectedRecord() < 0 || selectedField_ < 0)
        return true;
    if (!WriteEdit())
        return false;
    const FieldType type = TypeOfField(selectedField_);
    const Value value = recordset_.FieldValue(selectedField_);
    return AddCondition(ConditionFromCell(filter, ReferenceOf(selectedField_), type, value,
                                          DisplayText(value, type, settings_.words), settings_.words));
}

bool RecordBrowser::AddCondition(const QString& condition)
{
    if (!IsOpen() || IsEmpty() || condition.isEmpty())
        return true;
    if (!Rewrite(WithCondition(statement_, condition)))
        return false;
    conditions_ += condition;
    return true;
}

bool RecordBrowser::RemoveFilter()
{
    if (!IsOpen())
        return true;
    if (!Rewrite(baseStatement_))
        return false;
    conditions_.clear();
    sort_ = {};
    return true;
}

bool RecordBrowser::SortByTerms(const QString& terms)
{
    if (!IsOpen() || IsEmpty() || terms.isEmpty())
        return true;
    if (!Rewrite(WithOrder(statement_, terms)))
        return false;
    sort_ = {};
    return true;
}

bool RecordBrowser::SortByColumn(int field, SortDirection direction)
{
    if (!IsOpen() || IsEmpty() || field < 0 || field >= FieldCount())
        return true;
    const QString word = direction == SortDirection::Ascending ? u"ASC"_s : u"DESC"_s;
    if (!SortByTerms(u"%1 %2"_s.arg(ReferenceOf(field), word)))
        return false;
    sort_ = {field, direction};
    return true;
}

bool RecordBrowser::TapHeader(int column)
{
    if (!settings_.sortByHeader || presentation_ != Presentation::List || column < 0 ||
        column >= page_.ColumnCount())
        return true;
    const int field = page_.columns[size_t(column)].field;
    const bool again = sort_.field == field && sort_.direction == SortDirection::Ascending;
    return SortByColumn(field, again ? SortDirection::Descending : SortDirection::Ascending);
}

} // namespace mirel
