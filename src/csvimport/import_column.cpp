#include "csvimport/import_column.h"

#include "data/field_names.h"
#include "data/table_statements.h"
#include "resources/string_table.h"
#include "tableeditor/table_design.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// The types that a text file can fill, in the order in which they are offered.
constexpr std::array kTypes = {FieldType::Text, FieldType::Integer, FieldType::SmallInt, FieldType::Double,
                               FieldType::Memo, FieldType::Date,    FieldType::YesNo};

QString NameOf(FieldType type)
{
    QString name;
    TypeNameOfField(type, name);
    return name;
}

bool Refuse(UserMessage& fault, Str message, const QStringList& arguments = {})
{
    fault = {message, arguments};
    return false;
}

bool ReadType(const QString& name, FieldType& type, UserMessage& fault)
{
    QStringList known;
    for (const FieldType each : kTypes) {
        known += NameOf(each);
        if (known.last().compare(name, Qt::CaseInsensitive) == 0) {
            type = each;
            return true;
        }
    }
    return Refuse(fault, Str::ImportUnknownType, {name, known.join(u", "_s)});
}

// Cuts the next item off the front of a column list: up to the next "," outside brackets.
QString CutItem(QStringView& rest)
{
    qsizetype end = 0;
    for (bool bracketed = false; end < rest.size() && (bracketed || rest[end] != u','); ++end) {
        if (rest[end] == u'[' || rest[end] == u']')
            bracketed = rest[end] == u'[';
    }
    const QString item = rest.first(end).trimmed().toString();
    rest = rest.sliced(std::min(end + 1, rest.size()));
    return item;
}

bool ParseItem(const QString& item, ImportColumn& column, UserMessage& fault)
{
    if (item == u"-") {
        column.ignored = true;
        return true;
    }
    const qsizetype closing = item.startsWith(u'[') ? item.indexOf(u']') : -1;
    const qsizetype colon = item.indexOf(u':', closing + 1);
    const QString name = item.left(colon).trimmed();
    column.field = closing > 0 ? item.mid(1, closing - 1) : name;
    if (colon < 0)
        return true;
    const QString type = item.mid(colon + 1).section(u':', 0, 0).trimmed();
    const QString size = item.mid(colon + 1).section(u':', 1).trimmed();
    if (!ReadType(type, column.type, fault))
        return false;
    bool isNumber = true;
    if (!size.isEmpty())
        column.size = size.toInt(&isNumber);
    return isNumber ? true : Refuse(fault, Str::ImportTextSize);
}

bool SameName(const QString& a, const QString& b)
{
    return a.compare(b, Qt::CaseInsensitive) == 0;
}

const ResultField* FindField(std::span<const ResultField> fields, const QString& name)
{
    auto field = std::ranges::find(fields, name, &ResultField::name);
    if (field == fields.end())
        field =
            std::ranges::find_if(fields, [&name](const ResultField& each) { return SameName(each.name, name); });
    return field == fields.end() ? nullptr : &*field;
}

// The first column that bears the name of one before it; null: none.
const ImportColumn* FindDouble(const ImportColumns& columns)
{
    for (auto column = columns.begin(); column != columns.end(); ++column) {
        const auto isSame = [&](const ImportColumn& each) {
            return !each.ignored && SameName(each.field, column->field);
        };
        if (!column->ignored && std::any_of(columns.begin(), column, isSame))
            return &*column;
    }
    return nullptr;
}

bool AllAreIgnored(const ImportColumns& columns)
{
    return std::ranges::all_of(columns, &ImportColumn::ignored);
}

QString NumberedName(int number)
{
    return u"Field%1"_s.arg(number);
}

constexpr qsizetype kRoomForNumber = 5; // " 1234", of a name that occurs again

// Brackets enclose names in statements, and control characters are of no use in one.
QString FitName(const QString& name, int number)
{
    QString fit = name.simplified();
    fit.replace(u'[', u'(').replace(u']', u')').remove(QChar(0));
    fit = fit.left(kMaxNewFieldName - kRoomForNumber).trimmed();
    return fit.isEmpty() || fit == u"-" ? NumberedName(number) : fit;
}

} // namespace

bool ParseColumnList(const QString& list, ImportColumns& columns, UserMessage& fault)
{
    ImportColumns parsed;
    for (QStringView rest = list; !rest.isEmpty();) {
        ImportColumn column;
        if (!ParseItem(CutItem(rest), column, fault))
            return false;
        parsed.push_back(column);
    }
    columns = std::move(parsed);
    return true;
}

ImportColumns ColumnsNamed(const QStringList& names)
{
    ImportColumns columns;
    for (const QString& name : names) {
        const QString fit = FitName(name, int(columns.size()) + 1);
        ImportColumn column;
        column.field = fit;
        const auto isTaken = [&](const ImportColumn& each) { return SameName(each.field, column.field); };
        for (int number = 2; std::ranges::any_of(columns, isTaken); ++number)
            column.field = fit + u' ' + QString::number(number);
        columns.push_back(column);
    }
    return columns;
}

ImportColumns NumberedColumns(int count)
{
    ImportColumns columns(size_t(std::max(count, 0)));
    for (size_t i = 0; i < columns.size(); ++i)
        columns[i].field = NumberedName(int(i) + 1);
    return columns;
}

bool MatchByName(const QString& table, std::span<const ResultField> fields, ImportColumns& columns,
                 UserMessage& fault)
{
    ImportColumns matched = columns;
    for (ImportColumn& column : matched) {
        if (column.ignored)
            continue;
        const ResultField* field = FindField(fields, column.field);
        if (!field)
            return Refuse(fault, Str::ImportNoSuchField, {table, column.field});
        column.field = field->name;
        column.type = field->type;
    }
    if (AllAreIgnored(matched))
        return Refuse(fault, Str::ImportNoColumns);
    if (const ImportColumn* twice = FindDouble(matched))
        return Refuse(fault, Str::ImportFieldAssigned, {twice->field});
    columns = std::move(matched);
    return true;
}

bool MatchInOrder(const QString& table, std::span<const ResultField> fields, int count, ImportColumns& columns,
                  UserMessage& fault)
{
    if (size_t(count) > fields.size())
        return Refuse(fault, Str::ImportMoreColumnsThanFields,
                      {QString::number(count), table, QString::number(fields.size())});
    columns.clear();
    for (const ResultField& field : fields) {
        ImportColumn column;
        column.field = field.name;
        column.type = field.type;
        columns.push_back(column);
    }
    return true;
}

bool CheckNewColumns(const ImportColumns& columns, UserMessage& fault)
{
    if (AllAreIgnored(columns))
        return Refuse(fault, Str::ImportNoColumns);
    for (size_t i = 0; i < columns.size(); ++i) {
        const ImportColumn& column = columns[i];
        if (column.ignored)
            continue;
        if (column.field.isEmpty())
            return Refuse(fault, Str::ImportColumnWithoutName, {QString::number(i + 1)});
        if (column.type == FieldType::Text && (column.size < 1 || column.size > kMaxTextSize))
            return Refuse(fault, Str::ImportTextSize);
    }
    if (const ImportColumn* twice = FindDouble(columns))
        return Refuse(fault, Str::ImportColumnTwice, {twice->field});
    return true;
}

QString CreateTableStatement(const QString& table, const ImportColumns& columns)
{
    std::vector<FieldDefinition> fields;
    for (const ImportColumn& column : columns) {
        if (!column.ignored)
            fields.push_back({column.field, column.type, column.size});
    }
    return CreateTableStatement(table, fields);
}

} // namespace mirel
