#include "forms/control_source.h"

#include "forms/form_records.h"

#include <QRegularExpression>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// The text between the first two `mark`s; takes both, and all before them, off `rest`. Null when there are not
// two.
QStringView TakeBetween(QStringView& rest, QChar mark)
{
    const qsizetype begin = rest.indexOf(mark);
    const qsizetype end = begin < 0 ? -1 : rest.indexOf(mark, begin + 1);
    if (end < 0)
        return {};
    const QStringView between = rest.sliced(begin + 1, end - begin - 1);
    rest = rest.sliced(end + 1);
    return between;
}

// The text up to `mark`, both taken off `rest`; null when there is no mark.
QStringView TakeUpTo(QStringView& rest, QChar mark)
{
    const qsizetype end = rest.indexOf(mark);
    if (end < 0)
        return {};
    const QStringView taken = rest.first(end);
    rest = rest.sliced(end + 1);
    return taken;
}

QString WithoutBrackets(QStringView name)
{
    name = name.trimmed();
    if (name.startsWith(u'[') && name.endsWith(u']') && name.size() > 1)
        name = name.sliced(1, name.size() - 2);
    return name.toString();
}

// The point between table and field: the last one that stands in no brackets.
qsizetype PointOf(QStringView target)
{
    qsizetype point = -1;
    bool inBrackets = false;
    for (qsizetype i = 0; i < target.size(); ++i) {
        if (target[i] == u'[' || target[i] == u']')
            inBrackets = target[i] == u'[';
        else if (target[i] == u'.' && !inBrackets)
            point = i;
    }
    return point;
}

} // namespace

std::vector<SourceAssignment> SplitAssignments(QStringView source)
{
    std::vector<SourceAssignment> assignments;
    for (;;) {
        const QStringView target = TakeBetween(source, kAssignmentTarget);
        const QStringView value = TakeBetween(source, kAssignmentValue);
        if (target.isNull() || value.isNull())
            return assignments;
        assignments.push_back({target.toString(), value.toString()});
    }
}

QString JoinAssignments(const std::vector<SourceAssignment>& assignments)
{
    QString source;
    for (const SourceAssignment& each : assignments) {
        source += kAssignmentTarget + each.target + kAssignmentTarget;
        source += kAssignmentValue + each.value + kAssignmentValue;
    }
    return source;
}

std::vector<SourceColumn> SplitListColumns(QStringView source)
{
    std::vector<SourceColumn> columns;
    for (;;) {
        const QStringView name = TakeUpTo(source, kListNameEnd);
        if (name.isNull())
            return columns;
        // The last column's end may be missing.
        QStringView expression = TakeUpTo(source, kListColumnEnd);
        if (expression.isNull()) {
            expression = source;
            source = {};
        }
        columns.push_back({name.toString(), expression.toString()});
    }
}

QString JoinListColumns(const std::vector<SourceColumn>& columns)
{
    QString source;
    for (const SourceColumn& each : columns)
        source += each.name + kListNameEnd + each.expression + kListColumnEnd;
    return source;
}

DropDownSource SplitDropDown(QStringView source)
{
    const QStringView query = TakeUpTo(source, kDropDownQueryEnd);
    return {query.toString(), source.toString()};
}

QString JoinDropDown(const DropDownSource& source)
{
    return source.query.isEmpty() ? source.data : source.query + kDropDownQueryEnd + source.data;
}

QStringList DropDownItems(QStringView data)
{
    static const QRegularExpression separator(u"[;\r\n]"_s);
    QStringList items;
    for (const QString& item : data.toString().split(separator)) {
        if (const QString trimmed = item.trimmed(); !trimmed.isEmpty())
            items += trimmed;
    }
    return items;
}

TargetName SplitTarget(QStringView target)
{
    const qsizetype point = PointOf(target);
    return {WithoutBrackets(target.first(std::max<qsizetype>(point, 0))),
            WithoutBrackets(target.sliced(point + 1))};
}

} // namespace mirel
