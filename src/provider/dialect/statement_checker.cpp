#include "provider/dialect/statement_checker.h"

#include "provider/dialect/literal.h"
#include "provider/dialect/structure_checker.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel::dialect {
namespace {

using enum ExpressionChecker::Aggregates;

size_t CountNodes(const Expr& expression)
{
    size_t count = 1;
    for (const Expr& argument : expression.arguments)
        count += CountNodes(argument);
    return count;
}

// All that the terms of ORDER BY and GROUP BY may copy from the column list.
constexpr size_t kMaxCopiedNodes = 200000;

bool IsAggregate(const Expr& expression)
{
    return expression.operation == Operation::Call &&
           std::ranges::find(Functions(), expression.function, &FunctionDef::function)->isAggregate;
}

} // namespace

bool StatementChecker::Fail(Hr code, QString context)
{
    failure_ = {code, std::move(context)};
    return false;
}

bool StatementChecker::AddSource(const QString& name, const QString& alias, bool optional)
{
    const Table* table = schema_.FindTable(name);
    if (!table)
        return Fail(Hr::NoSuchTable);
    sources_.push_back({table, alias.isEmpty() ? table->name : alias, optional});
    return true;
}

bool StatementChecker::AddTarget(const QString& name)
{
    sources_.clear();
    aggregated_ = false;
    if (!AddSource(name, {}, false))
        return false;
    const std::optional<Failure> refused = RefuseChange(*sources_.front().table);
    return !refused || Fail(refused->code, refused->context);
}

bool StatementChecker::CheckExpression(Expr& expression, ExpressionChecker::Aggregates aggregates)
{
    ExpressionChecker checker(sources_);
    if (!checker.Check(expression, aggregates))
        return Fail(checker.Fault().code, checker.Fault().context);
    aggregated_ |= checker.SawAggregate();
    return true;
}

bool StatementChecker::CheckWhere(std::optional<Expr>& where)
{
    ExpressionChecker checker(sources_);
    return !where || checker.CheckCondition(*where, Refused) ||
           Fail(checker.Fault().code, checker.Fault().context);
}

bool StatementChecker::Check(Select& select)
{
    sources_.clear();
    copied_ = 0;
    aggregated_ = !select.group.empty();
    if (!CheckFrom(select) || !ExpandColumns(select) || !CheckWhere(select.where) || !CheckGroup(select))
        return false;
    if (select.having) {
        aggregated_ = true;
        ExpressionChecker checker(sources_);
        if (!checker.CheckCondition(*select.having, Allowed))
            return Fail(checker.Fault().code, checker.Fault().context);
    }
    return CheckOrder(select) && (!aggregated_ || CheckGrouping(select));
}

bool StatementChecker::CheckFrom(Select& select)
{
    for (FromTable& table : select.from) {
        if (!AddSource(table.table, table.alias, table.join == JoinKind::Left))
            return false;
        // Sees the tables up to its own, as the statement reads.
        if (!CheckWhere(table.on))
            return false;
    }
    return true;
}

bool StatementChecker::ExpandColumns(Select& select)
{
    std::vector<SelectColumn> columns;
    for (SelectColumn& column : select.columns) {
        if (column.expression.operation == Operation::AllColumns) {
            if (!ExpandAll(column.expression, columns))
                return false;
        } else if (CheckExpression(column.expression, Allowed)) {
            columns.push_back(std::move(column));
        } else {
            return false;
        }
        if (columns.size() > kMaxColumns)
            return Fail(Hr::TooManyColumns);
    }
    select.columns = std::move(columns);
    return true;
}

bool StatementChecker::ExpandAll(const Expr& star, std::vector<SelectColumn>& columns)
{
    bool found = false;
    for (size_t i = 0; i < sources_.size(); ++i) {
        const Source& source = sources_[i];
        if (!star.table.isEmpty() && !SameName(source.name, star.table))
            continue;
        found = true;
        for (size_t j = 0; j < source.table->columns.size(); ++j) {
            Expr& column = columns.emplace_back().expression;
            column.operation = Operation::Column;
            column.text = source.table->columns[j].name;
            column.type = source.table->columns[j].type;
            column.source = int(i);
            column.column = int(j);
        }
    }
    if (found)
        return true;
    return star.table.isEmpty() ? Fail(Hr::SyntaxError, StringText(Str::SyntaxErrorAtEnd))
                                : Fail(Hr::NoSuchColumn);
}

// A whole number is a column's position from 1; a name may be a column's alias or, for one without, its text.
bool StatementChecker::NameResultColumn(Expr& term, const Select& select, NameOrder order, bool& named)
{
    const SelectColumn* column = nullptr;
    bool isPosition = false;
    const int position = term.operation == Operation::Number ? term.text.toInt(&isPosition) : 0;
    if (isPosition) {
        if (position < 1 || size_t(position) > select.columns.size())
            return Fail(Hr::NoSuchColumn);
        column = &select.columns[size_t(position) - 1];
    } else if (term.operation == Operation::Column && term.table.isEmpty()) {
        Expr probe = term;
        ExpressionChecker checker(sources_);
        const bool isColumn = checker.FindColumn(probe) != ExpressionChecker::Lookup::Missing;
        const auto found = std::ranges::find_if(select.columns, [&](const SelectColumn& candidate) {
            const bool aliased = !candidate.alias.isEmpty();
            if (isColumn && (order == NameOrder::ColumnsFirst || !aliased))
                return false;
            return SameName(aliased ? candidate.alias : candidate.name.text, term.text);
        });
        column = found == select.columns.end() ? nullptr : &*found;
    }
    named = column != nullptr;
    if (!named)
        return true;
    copied_ += CountNodes(column->expression);
    if (copied_ > kMaxCopiedNodes)
        return Fail(Hr::SyntaxError, StringText(Str::StatementTooLong));
    term = column->expression;
    return true;
}

bool StatementChecker::CheckGroup(Select& select)
{
    if (select.group.size() > kMaxColumns)
        return Fail(Hr::TooManyColumns);
    for (Expr& term : select.group) {
        bool named = false;
        if (!NameResultColumn(term, select, NameOrder::ColumnsFirst, named))
            return false;
        // A term that stands for a result column is checked again, because aggregates are not allowed here.
        if (!CheckExpression(term, Refused))
            return false;
    }
    return true;
}

bool StatementChecker::CheckOrder(Select& select)
{
    if (select.order.size() > kMaxColumns)
        return Fail(Hr::TooManyColumns);
    for (OrderTerm& term : select.order) {
        bool named = false;
        if (!NameResultColumn(term.expression, select, NameOrder::ResultsFirst, named))
            return false;
        if (!named && !CheckExpression(term.expression, Allowed))
            return false;
    }
    return true;
}

bool StatementChecker::IsGrouped(const Expr& expression, const std::vector<Expr>& group)
{
    if (IsAggregate(expression))
        return true;
    if (std::ranges::find(group, expression) != group.end())
        return true;
    if (expression.operation == Operation::Column) {
        return Fail(Hr::SyntaxError, StringText(Str::NeitherGroupedNorAggregated,
                                                {QString::number(expression.place.begin + 1), expression.text}));
    }
    return std::ranges::all_of(expression.arguments,
                               [&](const Expr& argument) { return IsGrouped(argument, group); });
}

// What is shown or sorted of a group has one value for the whole group.
bool StatementChecker::CheckGrouping(const Select& select)
{
    const auto grouped = [&](const Expr& expression) { return IsGrouped(expression, select.group); };
    return std::ranges::all_of(select.columns, grouped, &SelectColumn::expression) &&
           std::ranges::all_of(select.order, grouped, &OrderTerm::expression) &&
           (!select.having || grouped(*select.having));
}

bool StatementChecker::CheckDistinctNames(std::vector<QString> names)
{
    std::ranges::sort(names,
                      [](const QString& a, const QString& b) { return a.compare(b, Qt::CaseInsensitive) < 0; });
    const auto twice =
        std::ranges::adjacent_find(names, [](const QString& a, const QString& b) { return a == b; });
    return twice == names.end() || Fail(Hr::DuplicateColumn);
}

bool StatementChecker::CheckTargetColumn(ColumnName& name, const Column*& column)
{
    const Table& table = *sources_.front().table;
    column = name.table.isEmpty() || SameName(name.table, table.name) ? table.FindColumn(name.name) : nullptr;
    if (!column)
        return Fail(Hr::NoSuchColumn);
    name.table.clear();
    name.name = column->name;
    return true;
}

bool StatementChecker::CheckValue(const Column& column, Expr& value, const std::vector<Source>& sources)
{
    ExpressionChecker checker(sources);
    if (!checker.Check(value, Refused))
        return Fail(checker.Fault().code, checker.Fault().context);
    if (const Hr hr = StoreLiteral(value, column.type, column.size); Failed(hr))
        return Fail(hr);
    const bool fits = IsLiteral(value.operation) || IsBinary(column.type) == IsBinary(value.type) ||
                      value.type == FieldType::None;
    return fits || Fail(Hr::BadLiteral);
}

bool StatementChecker::Check(Insert& insert)
{
    if (!AddTarget(insert.table))
        return false;
    const Table& table = *sources_.front().table;
    if (insert.columns.empty()) {
        for (const Column& column : table.columns)
            insert.columns.push_back({{}, column.name});
    }
    std::vector<const Column*> columns;
    std::vector<QString> names;
    for (ColumnName& name : insert.columns) {
        if (!CheckTargetColumn(name, columns.emplace_back()))
            return false;
        names.push_back(name.name);
    }
    if (!CheckDistinctNames(std::move(names)))
        return false;
    if (insert.values.size() != insert.columns.size()) {
        return Fail(Hr::SyntaxError, StringText(Str::ValueCountDiffers, {QString::number(insert.columns.size()),
                                                                         QString::number(insert.values.size())}));
    }
    static const std::vector<Source> kNoSources; // a new record has no columns yet
    for (size_t i = 0; i < columns.size(); ++i) {
        if (!CheckValue(*columns[i], insert.values[i], kNoSources))
            return false;
    }
    return true;
}

bool StatementChecker::Check(Update& update)
{
    if (!AddTarget(update.table))
        return false;
    std::vector<QString> names;
    for (Assignment& assignment : update.assignments) {
        const Column* column = nullptr;
        if (!CheckTargetColumn(assignment.column, column) || !CheckValue(*column, assignment.value, sources_))
            return false;
        names.push_back(column->name);
    }
    return CheckDistinctNames(std::move(names)) && CheckWhere(update.where);
}

bool StatementChecker::Check(Delete& remove)
{
    return AddTarget(remove.table) && CheckWhere(remove.where);
}

} // namespace mirel::dialect
