#include "provider/dialect/schema.h"

#include <algorithm>

namespace mirel::dialect {
namespace {

template <typename Record>
const Record* FindByName(const std::vector<Record>& records, QStringView name)
{
    // Others know names apart that differ in the case of a letter beyond ASCII.
    auto found = std::ranges::find_if(records, [&](const Record& record) { return record.name == name; });
    if (found == records.end())
        found = std::ranges::find_if(records, [&](const Record& record) { return SameName(record.name, name); });
    return found == records.end() ? nullptr : &*found;
}

} // namespace

const Column* Table::FindColumn(QStringView columnName) const
{
    return FindByName(columns, columnName);
}

const Index* Table::FindIndex(QStringView indexName) const
{
    return FindByName(indexes, indexName);
}

const Table* Schema::FindTable(QStringView tableName) const
{
    return FindByName(tables, tableName);
}

QStringView StampOfTable(QStringView tableName)
{
    constexpr QStringView kPrefix = u"MirelSys";
    constexpr qsizetype kStampDigits = 14;
    if (!tableName.startsWith(kPrefix) || tableName.size() != kPrefix.size() + kStampDigits)
        return {};
    const QStringView stamp = tableName.sliced(kPrefix.size());
    return std::ranges::all_of(stamp, [](QChar each) { return each >= u'0' && each <= u'9'; }) ? stamp
                                                                                               : QStringView();
}

bool SameName(QStringView a, QStringView b)
{
    return a.compare(b, Qt::CaseInsensitive) == 0;
}

} // namespace mirel::dialect
