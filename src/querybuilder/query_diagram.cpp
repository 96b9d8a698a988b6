#include "querybuilder/query_diagram.h"

#include "data/catalog.h"
#include "provider/dialect/schema.h"
#include "querybuilder/diagram_text.h"
#include "tableview/field_lists.h"

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;
using dialect::SameName;

QString SourceText(const DiagramTable& table)
{
    const QString name = FieldReference(table.table);
    return table.alias.isEmpty() ? name : name + u' ' + FieldReference(table.alias);
}

QString ExpressionOf(const DiagramColumn& column)
{
    const QStringView function = FunctionOf(column.total);
    return function.isEmpty() ? column.expression : function.toString() + u'(' + column.expression + u')';
}

QString OnText(const DiagramJoin& join)
{
    return QueryDiagram::Reference(join.left, join.leftField) + u" = "_s +
           QueryDiagram::Reference(join.right, join.rightField);
}

bool IsTotal(const DiagramColumn& column)
{
    return !FunctionOf(column.total).isEmpty();
}

bool CanBeEqual(FieldType type)
{
    return type != FieldType::None && type != FieldType::Memo && type != FieldType::YesNo && !IsBinary(type);
}

// Which of several equal names joins: one that looks like a key, else the first.
int KeyScore(const QString& field, bool first)
{
    static const QStringList endings = {u"id"_s, u"no"_s, u"nr"_s, u"key"_s, u"code"_s, u"number"_s};
    const bool isKey = std::ranges::any_of(
        endings, [&field](const QString& end) { return field.endsWith(end, Qt::CaseInsensitive); });
    return (isKey ? 2 : 0) + (first ? 1 : 0);
}

} // namespace

QString QueryDiagram::Reference(const QString& source, const QString& field)
{
    return FieldReference(source) + u'.' + FieldReference(field);
}

const DiagramTable* QueryDiagram::Find(const QString& source) const
{
    const auto found =
        std::ranges::find_if(tables_, [&](const DiagramTable& table) { return SameName(table.Source(), source); });
    return found == tables_.end() ? nullptr : &*found;
}

// --- writing ------------------------------------------------------------------------------------------------

// Each table as soon as a join leads to it; the left one of a join that keeps all of it comes first.
QString QueryDiagram::FromClause() const
{
    QString from;
    std::vector<const DiagramTable*> left;
    for (const DiagramTable& table : tables_)
        left.push_back(&table);
    QStringList placed;
    const auto isPlaced = [&placed](const QString& source) {
        return placed.contains(source, Qt::CaseInsensitive);
    };
    const auto leadsTo = [&](const DiagramJoin& join, const DiagramTable& table) {
        return (SameName(join.right, table.Source()) && isPlaced(join.left)) ||
               (SameName(join.left, table.Source()) && isPlaced(join.right));
    };
    const auto mustWait = [&](const DiagramTable* table) {
        return std::ranges::any_of(joins_, [&](const DiagramJoin& join) {
            return join.allOfLeft && SameName(join.right, table->Source()) && !isPlaced(join.left);
        });
    };
    const auto isLedTo = [&](const DiagramTable* table) {
        return std::ranges::any_of(joins_, [&](const DiagramJoin& join) { return leadsTo(join, *table); });
    };
    while (!left.empty()) {
        auto next = std::ranges::find_if(
            left, [&](const DiagramTable* table) { return isLedTo(table) && !mustWait(table); });
        if (next == left.end())
            next = std::ranges::find_if(left, [&](const DiagramTable* table) { return !mustWait(table); });
        if (next == left.end())
            next = left.begin();
        const DiagramTable& table = **next;
        QStringList on;
        bool all = false;
        for (const DiagramJoin& join : joins_) {
            if (!leadsTo(join, table))
                continue;
            on += OnText(join);
            all = all || join.allOfLeft;
        }
        if (!on.isEmpty())
            from +=
                u" %1 %2 ON %3"_s.arg(all ? u"LEFT JOIN" : u"INNER JOIN", SourceText(table), on.join(u" AND "_s));
        else
            from += (placed.isEmpty() ? QString() : u", "_s) + SourceText(table);
        placed += table.Source();
        left.erase(next);
    }
    return from;
}

bool QueryDiagram::HasTotals() const
{
    return std::ranges::any_of(columns_, [](const DiagramColumn& column) { return column.total != Total::None; });
}

// Beside a total, a field that is shown or ordered by is one of its groups.
bool QueryDiagram::IsGrouped(const DiagramColumn& column) const
{
    const bool counts = column.shown || column.sort != ColumnOrder::None;
    return column.total == Total::Group || (column.total == Total::None && counts && HasTotals());
}

QStringList QueryDiagram::Conditions(bool ofTotals) const
{
    QStringList conditions;
    for (const DiagramColumn& column : columns_) {
        if (IsTotal(column) != ofTotals)
            continue;
        const QString text = ConditionText(ExpressionOf(column), column.condition);
        if (!text.isEmpty())
            conditions += text;
    }
    return conditions;
}

QString QueryDiagram::Statement() const
{
    if (tables_.empty())
        return {};
    QStringList shown;
    QStringList groups;
    std::vector<const DiagramColumn*> sorted;
    for (const DiagramColumn& column : columns_) {
        if (column.shown) {
            const QString alias = column.alias.isEmpty() ? QString() : u" AS "_s + FieldReference(column.alias);
            shown += ExpressionOf(column) + alias;
        }
        if (IsGrouped(column) && !groups.contains(column.expression, Qt::CaseInsensitive))
            groups += column.expression;
        if (column.sort != ColumnOrder::None)
            sorted.push_back(&column);
    }
    std::ranges::stable_sort(sorted, {}, &DiagramColumn::rank);
    QStringList order;
    for (const DiagramColumn* column : sorted)
        order += (column->sortsByAlias ? FieldReference(column->alias) : ExpressionOf(*column)) +
                 (column->sort == ColumnOrder::Descending ? u" DESC"_s : QString());
    QStringList where = Conditions(false);
    const Tokens other = TokensOf(other_);
    if (!other.empty()) {
        const bool isOpen = !where.isEmpty() && HasOutside(other, dialect::Keyword::Or);
        where += isOpen ? u'(' + other_.trimmed() + u')' : other_.trimmed();
    }
    const auto clause = [](QStringView keyword, const QStringList& parts, const QString& between) {
        return parts.isEmpty() ? QString() : u' ' + keyword.toString() + u' ' + parts.join(between);
    };
    return (distinct_ ? u"SELECT DISTINCT "_s : u"SELECT "_s) + (shown.isEmpty() ? u"*"_s : shown.join(u", "_s)) +
           u" FROM "_s + FromClause() + clause(u"WHERE", where, u" AND "_s) +
           clause(u"GROUP BY", groups, u", "_s) + clause(u"HAVING", Conditions(true), u" AND "_s) +
           clause(u"ORDER BY", order, u", "_s);
}

// --- changing -----------------------------------------------------------------------------------------------

void QueryDiagram::AddTable(const QString& table, FieldLists& lists)
{
    DiagramTable added{table, {}};
    for (int count = 2; Find(added.Source()); ++count)
        added.alias = table + QString::number(count);
    for (const DiagramTable& other : tables_) {
        if (const std::optional<DiagramJoin> join = ProposedJoin(other, added, lists)) {
            joins_.push_back(*join);
            break;
        }
    }
    tables_.push_back(added);
}

void QueryDiagram::RemoveTable(const QString& source)
{
    std::erase_if(tables_, [&](const DiagramTable& table) { return SameName(table.Source(), source); });
    std::erase_if(joins_, [&](const DiagramJoin& join) {
        return SameName(join.left, source) || SameName(join.right, source);
    });
    std::erase_if(columns_, [&](const DiagramColumn& column) {
        const Tokens tokens = TokensOf(column.expression);
        return tokens.size() == 3 && ColumnLength(tokens) == 3 && SameName(tokens[0].Text(), source);
    });
}

void QueryDiagram::AddJoin(const DiagramJoin& join)
{
    const auto isSame = [&join](const DiagramJoin& other) {
        const bool along = SameName(other.left, join.left) && SameName(other.leftField, join.leftField) &&
                           SameName(other.right, join.right) && SameName(other.rightField, join.rightField);
        const bool against = SameName(other.left, join.right) && SameName(other.leftField, join.rightField) &&
                             SameName(other.right, join.left) && SameName(other.rightField, join.leftField);
        return along || against;
    };
    std::erase_if(joins_, isSame);
    if (!SameName(join.left, join.right) && Find(join.left) && Find(join.right))
        joins_.push_back(join);
}

void QueryDiagram::SetJoin(size_t join, bool allOfLeft)
{
    if (join < joins_.size())
        joins_[join].allOfLeft = allOfLeft;
}

void QueryDiagram::TurnJoin(size_t join)
{
    if (join >= joins_.size())
        return;
    std::swap(joins_[join].left, joins_[join].right);
    std::swap(joins_[join].leftField, joins_[join].rightField);
}

void QueryDiagram::RemoveJoin(size_t join)
{
    if (join < joins_.size())
        joins_.erase(joins_.begin() + qsizetype(join));
}

bool QueryDiagram::Shows(const QString& source, const QString& field) const
{
    const QString reference = Reference(source, field);
    return std::ranges::any_of(columns_, [&](const DiagramColumn& column) {
        return column.shown && (SameWords(column.expression, reference) ||
                                (tables_.size() == 1 && SameWords(column.expression, FieldReference(field))));
    });
}

void QueryDiagram::Show(const QString& source, const QString& field, bool shown)
{
    const QString reference = Reference(source, field);
    const auto names = [&](const DiagramColumn& column) {
        return SameWords(column.expression, reference) ||
               (tables_.size() == 1 && SameWords(column.expression, FieldReference(field)));
    };
    const auto found = std::ranges::find_if(columns_, names);
    if (!shown) {
        // A field that is not shown can still be one to sort or choose by.
        for (DiagramColumn& column : columns_)
            column.shown = column.shown && !names(column);
        std::erase_if(columns_, [&](const DiagramColumn& column) {
            return names(column) && column.sort == ColumnOrder::None && column.condition.isEmpty();
        });
    } else if (found != columns_.end()) {
        found->shown = true;
    } else {
        columns_.push_back({.expression = reference});
    }
}

void QueryDiagram::SetColumn(size_t column, const DiagramColumn& changed)
{
    if (column > columns_.size())
        return;
    if (column == columns_.size())
        columns_.push_back({.expression = changed.expression});
    const bool begins = columns_[column].sort == ColumnOrder::None && changed.sort != ColumnOrder::None;
    columns_[column] = changed;
    if (!begins)
        return;
    int last = 0;
    for (const DiagramColumn& other : columns_)
        last = std::max(last, other.sort == ColumnOrder::None ? 0 : other.rank);
    columns_[column].rank = last + 1;
}

void QueryDiagram::RemoveColumn(size_t column)
{
    if (column < columns_.size())
        columns_.erase(columns_.begin() + qsizetype(column));
}

void QueryDiagram::MoveColumn(size_t from, size_t to)
{
    if (from >= columns_.size() || to >= columns_.size())
        return;
    const DiagramColumn moved = columns_[from];
    RemoveColumn(from);
    columns_.insert(columns_.begin() + qsizetype(to), moved);
}

std::optional<DiagramJoin> ProposedJoin(const DiagramTable& left, const DiagramTable& right, FieldLists& lists)
{
    // The lists keep references alive until they are asked for another table: copies.
    const std::vector<FieldLists::Field> fields = lists.FieldsOf(left.table);
    const std::vector<FieldLists::Field> others = lists.FieldsOf(right.table);
    std::optional<DiagramJoin> best;
    int bestScore = -1;
    for (size_t i = 0; i < fields.size(); ++i) {
        for (size_t j = 0; j < others.size(); ++j) {
            if (!SameName(fields[i].name, others[j].name) || fields[i].type != others[j].type ||
                !CanBeEqual(fields[i].type))
                continue;
            const int score = KeyScore(fields[i].name, i == 0 || j == 0);
            if (score <= bestScore)
                continue;
            bestScore = score;
            best = DiagramJoin{left.Source(), fields[i].name, right.Source(), others[j].name};
        }
    }
    return best;
}

} // namespace mirel
