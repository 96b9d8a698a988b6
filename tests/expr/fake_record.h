#pragma once

#include "expr/evaluator.h"
#include "platform/ole_date.h"
#include "platform/user_locale.h"
#include "platform/yes_no_words.h"

#include <QMap>

#include <vector>

namespace mirel {

// A record of columns that the test names, the third of ten unless it says otherwise, on 4 July 2001 at 09:05:07.
class FakeRecord : public EvalContext {
public:
    struct Column {
        QString name;
        FieldType type;
        Value value;
    };
    std::vector<Column> columns;
    QMap<QString, QString> controls;
    YesNoWords words;
    qint64 position = 2;
    qint64 count = 10;
    QDateTime now{QDate(2001, 7, 4), QTime(9, 5, 7, 250)};
    int lookups = 0;

    void SetColumns(std::vector<Column> others)
    {
        columns = std::move(others);
        ColumnsChanged();
    }

    qint64 Position() override { return position; }
    qint64 RecordCount() override { return count; }
    int FindColumn(QStringView name) override
    {
        ++lookups;
        for (size_t i = 0; i < columns.size(); ++i) {
            if (name == columns[i].name || name == QString(u'[' + columns[i].name + u']'))
                return int(i);
        }
        return -1;
    }
    FieldType TypeOfColumn(int column) override { return columns[size_t(column)].type; }
    const Value& FieldValue(int column) override
    {
        static const Value kNone = Value::Null();
        return position < 0 ? kNone : columns[size_t(column)].value;
    }
    QStringView YesNoWord(bool truth) override { return words.Of(truth); }
    QString ControlText(QStringView name) override { return controls.value(name.toString()); }
    QDateTime Now() override { return now; }
};

inline double DayNumber(int year, int month, int day, int hour = 0, int minute = 0, int second = 0)
{
    return OleDate(DateParts{year, month, day, hour, minute, second, 0}).value();
}

// Null as "null", a number as it is, a text in "<>", a date in "<>" behind "date".
inline QString Describe(ExprNode& node)
{
    if (node.null)
        return QStringLiteral("null");
    if (!node.isText)
        return NumberText(node.valueNumber);
    const QString text = u'<' + TextOf(node).toString() + u'>';
    return node.fieldType == FieldType::Date ? QStringLiteral("date") + text : text;
}

} // namespace mirel
