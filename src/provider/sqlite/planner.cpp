#include "provider/dialect/parser.h"
#include "provider/dialect/statement_checker.h"
#include "provider/dialect/structure_checker.h"
#include "provider/sqlite/plan.h"
#include "provider/sqlite/sql_writer.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel::sqlite {

using namespace dialect;

namespace {

constexpr qsizetype kMaxNameLength = 1000; // longer texts are no table's name

// Characters of a Text, bytes of everything else, -1 without a limit.
int FieldSize(FieldType type, int declared)
{
    switch (type) {
    case FieldType::SmallInt:
    case FieldType::YesNo:
        return 2;
    case FieldType::Integer:
        return declared == kWideIntegerSize ? declared : 4;
    case FieldType::Double:
    case FieldType::Date:
        return 8;
    case FieldType::Text:
    case FieldType::VarBinary:
        return declared;
    case FieldType::None:
    case FieldType::Memo:
    case FieldType::LongBinary:
        break;
    }
    return -1;
}

// Turns one checked statement into its plan.
class Planner {
public:
    explicit Planner(const Schema& schema)
        : schema_(schema)
        , checker_(schema)
        , writer_(checker_.Sources())
    {
    }

    PlanResult Plan(Select& select);
    PlanResult Plan(Insert& insert);
    PlanResult Plan(Update& update);
    PlanResult Plan(Delete& remove);
    PlanResult Plan(WholeTable& whole);
    PlanResult Plan(StructureChange& change);
    PlanResult Plan(CreateDatabase& create) { return sqlite::Plan(std::move(create)); }
    PlanResult Plan(DropDatabase& drop) { return sqlite::Plan(std::move(drop)); }

private:
    PlanResult Finish(sqlite::Plan plan) const;
    PlanResult FinishChange(QByteArray sql) const;
    QByteArray Target() const; // of a change: the table under its alias
    QByteArray Where(const std::optional<Expr>& where)
    {
        return where ? " WHERE " + writer_.Write(*where) : QByteArray();
    }
    QByteArray Stored(const Expr& value, const QString& columnName);
    void PlanSources(const Select& select, SelectPlan& plan);
    void PlanColumns(const Select& select, SelectPlan& plan);
    void PlanGroup(const Select& select, SelectPlan& plan);
    void PlanOrder(const Select& select, SelectPlan& plan);
    void PlanUse(const Select& select, SelectPlan& plan) const;
    QString WhyReadOnly(const SelectPlan& plan, const std::vector<bool>& used) const;
    ResultField FieldOf(const SelectColumn& column) const;

    const Schema& schema_;
    StatementChecker checker_;
    SqlWriter writer_;
};

PlanResult Planner::Finish(sqlite::Plan plan) const
{
    switch (writer_.HowItFits()) {
    case SqlWriter::Fit::Fits:
        break;
    case SqlWriter::Fit::TooDeep:
        return PlanFailure{Hr::SyntaxError,
                           StringText(Str::SyntaxTooDeep, {QString::number(writer_.TooDeepAt() + 1)})};
    case SqlWriter::Fit::TooLong:
        return PlanFailure{Hr::SyntaxError, StringText(Str::StatementTooLong)};
    }
    return plan;
}

PlanResult Planner::FinishChange(QByteArray sql) const
{
    return Finish(ChangePlan{std::move(sql), checker_.Sources().front().table->name});
}

QByteArray Planner::Target() const
{
    return QuoteName(checker_.Sources().front().table->storedName) + " AS " + SqlWriter::Alias(0);
}

PlanResult Planner::Plan(WholeTable& whole)
{
    Select select;
    select.columns.emplace_back().expression.operation = Operation::AllColumns;
    select.from.emplace_back().table = whole.table;
    return Plan(select);
}

PlanResult Planner::Plan(Select& select)
{
    if (!checker_.Check(select))
        return checker_.Fault();
    SelectPlan plan;
    PlanSources(select, plan);
    PlanColumns(select, plan);
    if (select.where)
        plan.where = writer_.Write(*select.where);
    PlanGroup(select, plan);
    PlanOrder(select, plan);
    PlanUse(select, plan);
    return Finish(std::move(plan));
}

void Planner::PlanSources(const Select& select, SelectPlan& plan)
{
    for (size_t i = 0; i < select.from.size(); ++i) {
        const Source& source = checker_.Sources()[i];
        const FromTable& from = select.from[i];
        const QByteArray alias = SqlWriter::Alias(i);
        const QByteArray& rowId = source.table->rowId;
        plan.sources.push_back(
            {source.table->name, alias, rowId.isEmpty() ? QByteArray() : alias + '.' + rowId, source.optional});
        switch (from.join) {
        case JoinKind::None:
            break;
        case JoinKind::Cross:
            plan.from += ", ";
            break;
        case JoinKind::Inner:
            plan.from += " JOIN ";
            break;
        case JoinKind::Left:
            plan.from += " LEFT JOIN ";
            break;
        }
        plan.from += QuoteName(source.table->storedName) + " AS " + alias;
        if (from.on)
            plan.from += " ON " + writer_.Write(*from.on);
    }
}

ResultField Planner::FieldOf(const SelectColumn& column) const
{
    const Expr& expression = column.expression;
    if (expression.operation != Operation::Column) {
        const QString& name = column.alias.isEmpty() ? column.name.text : column.alias;
        ResultField field{name, expression.type, FieldSize(expression.type, -1), {}, {}};
        const bool isOperand = BindingOf(expression.operation) >= Binding::Text;
        field.expression = isOperand ? column.name.text : u'(' + column.name.text + u')';
        return field;
    }
    const Source& source = checker_.Sources()[size_t(expression.source)];
    ResultField field = ResultFieldOf(*source.table, source.table->columns[size_t(expression.column)]);
    field.source = source.name;
    field.isJoined = checker_.Sources().size() > 1;
    field.isRequired = source.table->columns[size_t(expression.column)].isRequired;
    if (!column.alias.isEmpty())
        field.name = column.alias;
    return field;
}

void Planner::PlanColumns(const Select& select, SelectPlan& plan)
{
    for (const SelectColumn& column : select.columns) {
        plan.fields.push_back(FieldOf(column));
        const Expr& expression = column.expression;
        if (expression.operation == Operation::Column) { // as it is stored: its readers know foreign dates
            plan.columns.push_back(SqlWriter::Alias(size_t(expression.source)) + '.' +
                                   QuoteName(plan.fields.back().column));
        } else {
            plan.columns.push_back(writer_.Write(expression));
        }
    }
}

void Planner::PlanGroup(const Select& select, SelectPlan& plan)
{
    for (const Expr& term : select.group) {
        plan.group += plan.group.isEmpty() ? "GROUP BY " : ",";
        // SQLite would take a number for a column's position.
        plan.group += IsLiteral(term.operation) ? "NULL" : writer_.Write(term);
    }
    if (select.having)
        plan.group += " HAVING " + writer_.Write(*select.having);
}

void Planner::PlanOrder(const Select& select, SelectPlan& plan)
{
    for (const OrderTerm& term : select.order) {
        if (IsLiteral(term.expression.operation)) // puts nothing in order
            continue;
        plan.order.push_back({writer_.Write(term.expression), IsText(term.expression.type), term.descending});
    }
}

// The sources that an expression reads from.
void CollectSources(const Expr& expression, std::vector<bool>& used)
{
    if (expression.operation == Operation::Column)
        used[size_t(expression.source)] = true;
    for (const Expr& argument : expression.arguments)
        CollectSources(argument, used);
}

void Planner::PlanUse(const Select& select, SelectPlan& plan) const
{
    const auto isColumn = [](const ResultField& field) { return !field.column.isEmpty(); };
    const auto hasRowId = [](const PlannedSource& source) { return !source.rowId.isEmpty(); };
    plan.distinct = select.distinct;
    plan.isAggregated = checker_.IsAggregated();
    plan.keyed = !select.distinct && !checker_.IsAggregated() && std::ranges::any_of(plan.fields, isColumn) &&
                 std::ranges::all_of(plan.sources, hasRowId);
    std::vector<bool> used(plan.sources.size());
    for (const SelectColumn& column : select.columns)
        CollectSources(column.expression, used);
    plan.readOnlyReason = WhyReadOnly(plan, used);
    if (plan.readOnlyReason.isEmpty())
        plan.updatableSource = int(std::ranges::find(used, true) - used.begin());
}

// `used`: the sources that the columns read from.
QString Planner::WhyReadOnly(const SelectPlan& plan, const std::vector<bool>& used) const
{
    if (plan.distinct)
        return StringText(Str::DistinctIsReadOnly);
    if (checker_.IsAggregated())
        return StringText(Str::GroupsAreReadOnly);
    for (const Source& source : checker_.Sources()) {
        if (source.table->rowId.isEmpty() && !source.table->writable)
            return ReadOnlyReason(*source.table);
    }
    if (!plan.keyed)
        return StringText(Str::ComputedIsReadOnly);
    if (std::ranges::count(used, true) != 1)
        return StringText(Str::JoinIsReadOnly);
    const Source& source = checker_.Sources()[size_t(std::ranges::find(used, true) - used.begin())];
    return source.optional ? StringText(Str::JoinIsReadOnly) : ReadOnlyReason(*source.table);
}

// A value that is only known as the statement runs is held against its column then: refused, never cut.
QByteArray Planner::Stored(const Expr& value, const QString& columnName)
{
    const dialect::Column& column = *checker_.Sources().front().table->FindColumn(columnName);
    QByteArray sql = writer_.Write(value);
    const bool certain = IsLiteral(value.operation) || column.type == FieldType::None;
    if (certain)
        return sql;
    return kStoreFunction + ('(' + sql) + ',' + QByteArray::number(int(column.type)) + ',' +
           QByteArray::number(column.size) + ')';
}

PlanResult Planner::Plan(Insert& insert)
{
    if (!checker_.Check(insert))
        return checker_.Fault();
    QByteArray names;
    QByteArray values;
    for (size_t i = 0; i < insert.columns.size(); ++i) {
        names += (i > 0 ? "," : "") + QuoteName(insert.columns[i].name);
        values += (i > 0 ? "," : "") + Stored(insert.values[i], insert.columns[i].name);
    }
    const QByteArray table = QuoteName(checker_.Sources().front().table->storedName);
    return FinishChange("INSERT INTO " + table + " (" + names + ") VALUES (" + values + ')');
}

PlanResult Planner::Plan(Update& update)
{
    if (!checker_.Check(update))
        return checker_.Fault();
    QByteArray assignments;
    for (const Assignment& assignment : update.assignments) {
        assignments += (assignments.isEmpty() ? "" : ",") + QuoteName(assignment.column.name) + '=' +
                       Stored(assignment.value, assignment.column.name);
    }
    return FinishChange("UPDATE " + Target() + " SET " + assignments + Where(update.where));
}

PlanResult Planner::Plan(Delete& remove)
{
    if (!checker_.Check(remove))
        return checker_.Fault();
    return FinishChange("DELETE FROM " + Target() + Where(remove.where));
}

PlanResult Planner::Plan(StructureChange& change)
{
    if (std::optional<Failure> failure = CheckStructure(change, schema_))
        return std::move(*failure);
    return sqlite::Plan(std::move(change));
}

} // namespace

PlanResult PlanStatement(QStringView statement, const Schema& schema)
{
    Planner planner(schema);
    // A bare name may hold blanks, or begin with a word that statements begin with.
    const QStringView name = statement.trimmed();
    const Table* const table = name.size() <= kMaxNameLength ? schema.FindTable(name) : nullptr;
    WholeTable whole{table ? table->name : QString()};
    if (table && !BeginsAsStatement(statement))
        return planner.Plan(whole);
    ParseResult parsed = ParseStatement(statement);
    if (auto* failure = std::get_if<Failure>(&parsed)) {
        if (table)
            return planner.Plan(whole);
        return std::move(*failure);
    }
    return std::visit([&](auto& one) { return planner.Plan(one); }, std::get<Statement>(parsed));
}

PlanResult PlanDatabaseStatement(QStringView statement)
{
    ParseResult parsed = ParseStatement(statement);
    if (auto* failure = std::get_if<Failure>(&parsed))
        return std::move(*failure);
    Statement& one = std::get<Statement>(parsed);
    if (auto* create = std::get_if<CreateDatabase>(&one))
        return Plan(std::move(*create));
    if (auto* drop = std::get_if<DropDatabase>(&one))
        return Plan(std::move(*drop));
    return PlanFailure{Hr::SyntaxError, StringText(Str::NeedsADatabase)};
}

QByteArray OrderClause(const std::vector<PlannedOrder>& order)
{
    QByteArray clause;
    for (const PlannedOrder& term : order) {
        clause += clause.isEmpty() ? "ORDER BY " : ",";
        const char* direction = term.descending ? " DESC" : "";
        if (term.isText)
            clause += kSortKeyFunction + ('(' + term.expression + ')') + direction + ',';
        clause += term.expression + direction;
    }
    return clause;
}

ResultField ResultFieldOf(const Table& table, const Column& column)
{
    return {column.name, column.type, FieldSize(column.type, column.size), table.name, column.name};
}

} // namespace mirel::sqlite
