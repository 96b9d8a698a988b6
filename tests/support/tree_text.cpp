#include "support/tree_text.h"

#include "provider/dialect/column_types.h"

#include <QStringList>

#include <algorithm>

namespace mirel::dialect {
namespace {

using namespace Qt::StringLiterals;

QString Name(QString name)
{
    return u'[' + name.replace(u']', u"]]"_s) + u']';
}

QString Name(const QString& table, const QString& name)
{
    return table.isEmpty() ? Name(name) : Name(table) + u'.' + Name(name);
}

QString Quoted(QString text)
{
    return u'\'' + text.replace(u'\'', u"''"_s) + u'\'';
}

// The first of a function's names.
QString NameOf(Function function)
{
    return std::ranges::find(Functions(), function, &FunctionDef::function)->name.toString();
}

QString Text(const Expr& expression);

QString Operand(const Expr& expression, Binding least)
{
    return BindingOf(expression.operation) >= least ? Text(expression) : u'(' + Text(expression) + u')';
}

QString Infix(const Expr& expression, const QString& sign, Binding left, Binding right)
{
    return Operand(expression.arguments.front(), left) + u' ' + sign + u' ' +
           Operand(expression.arguments.back(), right);
}

QString Comparison(const Expr& expression, const QString& sign)
{
    return Infix(expression, sign, Binding::Text, Binding::Text);
}

QString Postfix(const Expr& expression, const QString& words)
{
    return Operand(expression.arguments.front(), Binding::Text) + u' ' + words;
}

QString List(std::list<Expr>::const_iterator first, std::list<Expr>::const_iterator last)
{
    QStringList items;
    std::transform(first, last, std::back_inserter(items), Text);
    return u'(' + items.join(u',') + u')';
}

QString Chain(const Expr& expression, const QString& word)
{
    QStringList parts;
    const auto least = Binding(int(BindingOf(expression.operation)) + 1);
    for (const Expr& part : expression.arguments)
        parts += Operand(part, least);
    return parts.join(word);
}

QString Negated(const Expr& expression)
{
    const QString operand = Operand(expression.arguments.front(), Binding::Sign);
    return (operand.startsWith(u'-') ? u"- "_s : u"-"_s) + operand; // two signs in a row begin a comment
}

QString Call(const Expr& expression)
{
    QString list = List(expression.arguments.begin(), expression.arguments.end());
    if (expression.distinct)
        list.insert(1, u"DISTINCT "_s);
    return NameOf(expression.function) + list;
}

QString Between(const Expr& expression, const QString& words)
{
    auto argument = expression.arguments.begin();
    const QString value = Operand(*argument, Binding::Text);
    const QString low = Operand(*++argument, Binding::Text);
    const QString high = Operand(*++argument, Binding::Text);
    return value + u' ' + words + u' ' + low + u" AND "_s + high;
}

QString In(const Expr& expression, const QString& words)
{
    const auto first = expression.arguments.begin();
    return Operand(*first, Binding::Text) + u' ' + words + u' ' +
           List(std::next(first), expression.arguments.end());
}

QString Text(const Expr& expression)
{
    switch (expression.operation) {
    case Operation::Null:
        return u"NULL"_s;
    case Operation::True:
        return u"TRUE"_s;
    case Operation::False:
        return u"FALSE"_s;
    case Operation::Number:
        return expression.text;
    case Operation::Text:
    case Operation::Date:
        return Quoted(expression.text);
    case Operation::Column:
        return Name(expression.table, expression.text);
    case Operation::AllColumns:
        return expression.table.isEmpty() ? u"*"_s : Name(expression.table) + u".*"_s;
    case Operation::Or:
        return Chain(expression, u" OR "_s);
    case Operation::And:
        return Chain(expression, u" AND "_s);
    case Operation::Not:
        return u"NOT "_s + Operand(expression.arguments.front(), Binding::Not);
    case Operation::Equal:
        return Comparison(expression, u"="_s);
    case Operation::NotEqual:
        return Comparison(expression, u"<>"_s);
    case Operation::Less:
        return Comparison(expression, u"<"_s);
    case Operation::LessEqual:
        return Comparison(expression, u"<="_s);
    case Operation::Greater:
        return Comparison(expression, u">"_s);
    case Operation::GreaterEqual:
        return Comparison(expression, u">="_s);
    case Operation::Like:
        return Comparison(expression, u"LIKE"_s);
    case Operation::NotLike:
        return Comparison(expression, u"NOT LIKE"_s);
    case Operation::In:
        return In(expression, u"IN"_s);
    case Operation::NotIn:
        return In(expression, u"NOT IN"_s);
    case Operation::Between:
        return Between(expression, u"BETWEEN"_s);
    case Operation::NotBetween:
        return Between(expression, u"NOT BETWEEN"_s);
    case Operation::IsNull:
        return Postfix(expression, u"IS NULL"_s);
    case Operation::IsNotNull:
        return Postfix(expression, u"IS NOT NULL"_s);
    case Operation::IsTrue:
        return Postfix(expression, u"IS TRUE"_s);
    case Operation::IsNotTrue:
        return Postfix(expression, u"IS NOT TRUE"_s);
    case Operation::IsFalse:
        return Postfix(expression, u"IS FALSE"_s);
    case Operation::IsNotFalse:
        return Postfix(expression, u"IS NOT FALSE"_s);
    case Operation::Join:
        return Infix(expression, u"&"_s, Binding::Text, Binding::Sum);
    case Operation::Concat:
        return Infix(expression, u"||"_s, Binding::Text, Binding::Sum);
    case Operation::Add:
        return Infix(expression, u"+"_s, Binding::Sum, Binding::Product);
    case Operation::Subtract:
        return Infix(expression, u"-"_s, Binding::Sum, Binding::Product);
    case Operation::Multiply:
        return Infix(expression, u"*"_s, Binding::Product, Binding::Sign);
    case Operation::Divide:
        return Infix(expression, u"/"_s, Binding::Product, Binding::Sign);
    case Operation::Remainder:
        return Infix(expression, u"%"_s, Binding::Product, Binding::Sign);
    case Operation::Negate:
        return Negated(expression);
    case Operation::Call:
        return Call(expression);
    }
    return {};
}

QString Clause(const QString& keyword, const std::optional<Expr>& condition)
{
    return condition ? u' ' + keyword + u' ' + Text(*condition) : QString();
}

QString Text(const FromTable& from)
{
    QString text;
    switch (from.join) {
    case JoinKind::None:
        break;
    case JoinKind::Cross:
        text = u","_s;
        break;
    case JoinKind::Inner:
        text = u" INNER JOIN "_s;
        break;
    case JoinKind::Left:
        text = u" LEFT JOIN "_s;
        break;
    }
    text += Name(from.table);
    if (!from.alias.isEmpty())
        text += u" AS "_s + Name(from.alias);
    return text + Clause(u"ON"_s, from.on);
}

QString Text(const Select& select)
{
    QStringList columns;
    for (const SelectColumn& column : select.columns)
        columns += Text(column.expression) + (column.alias.isEmpty() ? QString() : u" AS "_s + Name(column.alias));
    QString text = (select.distinct ? u"SELECT DISTINCT "_s : u"SELECT "_s) + columns.join(u',');
    if (!select.from.empty())
        text += u" FROM "_s;
    for (const FromTable& from : select.from)
        text += Text(from);
    text += Clause(u"WHERE"_s, select.where);
    QStringList group;
    std::ranges::transform(select.group, std::back_inserter(group), [](const Expr& term) { return Text(term); });
    if (!group.isEmpty())
        text += u" GROUP BY "_s + group.join(u',');
    text += Clause(u"HAVING"_s, select.having);
    QStringList order;
    for (const OrderTerm& term : select.order)
        order += Text(term.expression) + (term.descending ? u" DESC"_s : QString());
    return order.isEmpty() ? text : text + u" ORDER BY "_s + order.join(u',');
}

QString Text(const Insert& insert)
{
    QStringList columns;
    for (const ColumnName& column : insert.columns)
        columns += Name(column.table, column.name);
    QStringList values;
    for (const Expr& value : insert.values)
        values += Text(value);
    return u"INSERT INTO "_s + Name(insert.table) +
           (columns.isEmpty() ? QString() : u" ("_s + columns.join(u',') + u')') + u" VALUES ("_s +
           values.join(u',') + u')';
}

QString Text(const Update& update)
{
    QStringList assignments;
    for (const Assignment& one : update.assignments)
        assignments += Name(one.column.table, one.column.name) + u'=' + Text(one.value);
    return u"UPDATE "_s + Name(update.table) + u" SET "_s + assignments.join(u',') +
           Clause(u"WHERE"_s, update.where);
}

QString Text(const Delete& remove)
{
    return u"DELETE FROM "_s + Name(remove.table) + Clause(u"WHERE"_s, remove.where);
}

QString Text(const WholeTable& whole)
{
    return Name(whole.table);
}

QString Text(const CreateDatabase& create)
{
    return u"CREATE DATABASE "_s + Quoted(create.path);
}

QString Text(const DropDatabase& drop)
{
    return u"DROP DATABASE "_s + Quoted(drop.path);
}

QString Text(const ColumnDefinition& column)
{
    return Name(column.name) + u' ' + ColumnTypeText(column);
}

QString Text(const CreateTable& create)
{
    QStringList columns;
    for (const ColumnDefinition& column : create.columns)
        columns += Text(column);
    return u"CREATE TABLE "_s + Name(create.table) + u" ("_s + columns.join(u',') + u')';
}

QString Text(const DropTable& drop)
{
    return u"DROP TABLE "_s + Name(drop.table);
}

QString Alter(const QString& table)
{
    return u"ALTER TABLE "_s + Name(table);
}

QString Text(const RenameTable& rename)
{
    return Alter(rename.table) + u" TO "_s + Name(rename.newName);
}

QString Text(const AddColumn& add)
{
    return Alter(add.table) + u" ADD "_s + Text(add.column);
}

QString Text(const DropColumn& drop)
{
    return Alter(drop.table) + u" DROP "_s + Name(drop.column);
}

QString Text(const RenameColumn& rename)
{
    return Alter(rename.table) + u" RENAME "_s + Name(rename.column) + u" TO "_s + Name(rename.newName);
}

QString Text(const MoveColumn& move)
{
    return Alter(move.table) + u" MOVE "_s + Name(move.column) + u" BEFORE "_s + Name(move.before);
}

QString Text(const CreateIndex& create)
{
    QStringList columns;
    for (const auto& [column, descending] : create.columns)
        columns += Name(column) + (descending ? u" DESC"_s : u" ASC"_s);
    return (create.unique ? u"CREATE UNIQUE INDEX "_s : u"CREATE INDEX "_s) + Name(create.index) + u" ON "_s +
           Name(create.table) + u" ("_s + columns.join(u',') + u')';
}

QString Text(const DropIndex& drop)
{
    return u"DROP INDEX "_s + Name(drop.table, drop.index);
}

QString Text(const StructureChange& change)
{
    return std::visit([](const auto& one) { return Text(one); }, change);
}

} // namespace

QString StatementText(const Statement& statement)
{
    return std::visit([](const auto& one) { return Text(one); }, statement);
}

} // namespace mirel::dialect
