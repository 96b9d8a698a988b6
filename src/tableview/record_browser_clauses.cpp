#include "result/cell_text.h"
#include "tableview/record_browser.h"

#include <algorithm>

// The filters and sorts of the record browser.

namespace mirel {

using namespace Qt::StringLiterals;

bool RecordBrowser::FilterByCell(CellFilter filter)
{
    if (SelectedRecord() < 0 || selectedField_ < 0)
        return true;
    if (!WriteEdit())
        return false;
    const FieldType type = TypeOfField(selectedField_);
    const Value value = Recordset().FieldValue(selectedField_);
    return AddCondition(ConditionFromCell(filter, ReferenceOf(selectedField_), type, value,
                                          DisplayText(value, type, settings_.words), settings_.words));
}

bool RecordBrowser::AddCondition(const QString& condition)
{
    if (!IsOpen() || IsEmpty() || condition.isEmpty())
        return true;
    return WriteEdit() && Execute([&] { return result_.AddCondition(condition); });
}

bool RecordBrowser::RemoveFilter()
{
    if (!IsOpen())
        return true;
    if (!WriteEdit() || !Execute([&] { return result_.RemoveConditions(); }))
        return false;
    sort_ = {};
    return true;
}

bool RecordBrowser::Refilter(const std::vector<OpenResult::Filter>& filters)
{
    return IsOpen() && WriteEdit() && Execute([&] { return result_.Refilter(filters); });
}

bool RecordBrowser::TakeFilterOff(int filter)
{
    std::vector<OpenResult::Filter> filters = Filters();
    if (filter < 0 || size_t(filter) >= filters.size())
        return true;
    filters.erase(filters.begin() + filter);
    return Refilter(filters);
}

bool RecordBrowser::SwitchFilter(int filter)
{
    std::vector<OpenResult::Filter> filters = Filters();
    if (filter < 0 || size_t(filter) >= filters.size())
        return true;
    filters[size_t(filter)].on = !filters[size_t(filter)].on;
    return Refilter(filters);
}

bool RecordBrowser::ChangeFilter(int filter, const QString& condition)
{
    std::vector<OpenResult::Filter> filters = Filters();
    if (filter < 0 || size_t(filter) >= filters.size() || condition.isEmpty())
        return true;
    filters[size_t(filter)] = {condition};
    return Refilter(filters);
}

bool RecordBrowser::SortByTerms(const QString& terms)
{
    if (!IsOpen() || IsEmpty() || terms.isEmpty())
        return true;
    if (!WriteEdit() || !Execute([&] { return result_.OrderBy(terms); }))
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
