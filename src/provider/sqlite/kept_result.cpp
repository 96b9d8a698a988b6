#include "provider/sqlite/kept_result.h"

#include "provider/sqlite/select_sql.h"

namespace mirel::sqlite {
namespace {

QByteArray ColumnName(size_t field)
{
    return 'c' + QByteArray::number(qulonglong(field));
}

QByteArray NextTableName()
{
    static quint64 last = 0;
    return "temp.[kept result " + QByteArray::number(++last) + ']';
}

} // namespace

KeptResult::KeptResult(DatabaseFile& file)
    : file_(file)
    , table_(NextTableName())
{
}

KeptResult::~KeptResult()
{
    if (isThere_ && file_.IsOpen())
        (void)file_.Execute("DROP TABLE IF EXISTS " + table_);
}

Outcome KeptResult::Fill(const SelectPlan& plan)
{
    QByteArray columns;
    for (size_t field = 0; field < plan.fields.size(); ++field)
        columns += (field > 0 ? "," : "") + ColumnName(field); // no types: values stay as they are
    Outcome outcome = file_.Execute("CREATE TABLE " + table_ + " (" + columns + ')');
    isThere_ = outcome.Ok();
    if (outcome.Ok())
        outcome = file_.Execute("INSERT INTO " + table_ + ' ' + WholeSelect(plan));
    return outcome;
}

SelectPlan KeptResult::Plan(const SelectPlan& plan) const
{
    SelectPlan kept;
    kept.fields = plan.fields;
    for (size_t field = 0; field < plan.fields.size(); ++field)
        kept.columns.push_back("t0." + ColumnName(field));
    kept.sources.push_back({{}, "t0", "t0.rowid"});
    kept.from = table_ + " AS t0";
    return kept;
}

} // namespace mirel::sqlite
