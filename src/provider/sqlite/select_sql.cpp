#include "provider/sqlite/select_sql.h"

#include "provider/sqlite/row_reader.h"

namespace mirel::sqlite {

QByteArray ColumnList(const SelectPlan& plan, std::span<const int> fields)
{
    QByteArray list;
    for (const int field : fields)
        list += (list.isEmpty() ? "" : ",") + plan.columns[size_t(field)];
    return list;
}

QByteArray RowIdList(const SelectPlan& plan)
{
    QByteArray list;
    for (const PlannedSource& source : plan.sources)
        list += (list.isEmpty() ? "" : ",") + source.rowId;
    return list;
}

QByteArray WhereClause(const SelectPlan& plan, const QByteArray& further)
{
    if (plan.where.isEmpty())
        return further.isEmpty() ? QByteArray() : " WHERE " + further;
    return further.isEmpty() ? " WHERE " + plan.where : " WHERE (" + plan.where + ") AND " + further;
}

QByteArray KeyedOrder(const SelectPlan& plan)
{
    const QByteArray order = OrderClause(plan.order);
    return ' ' + (order.isEmpty() ? "ORDER BY " : order + ',') + RowIdList(plan);
}

QByteArray WholeSelect(const SelectPlan& plan)
{
    QByteArray sql = plan.distinct ? "SELECT DISTINCT " : "SELECT ";
    sql += ColumnList(plan, AllFields(plan.fields));
    if (!plan.from.isEmpty())
        sql += " FROM " + plan.from;
    sql += WhereClause(plan);
    if (!plan.group.isEmpty())
        sql += ' ' + plan.group;
    if (!plan.order.empty())
        sql += ' ' + OrderClause(plan.order);
    return sql;
}

} // namespace mirel::sqlite
