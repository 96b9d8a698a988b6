// docs/expressions.md promises that its examples are what the program gives, and that it tells of everything.
#include "expr/date_format.h"
#include "expr/expr_parser.h"
#include "expr/fake_record.h"
#include "expr/function_library.h"
#include "expr/operators.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QFile>
#include <QLocale>
#include <QSet>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// A row of one of the page's tables, with the heads of its columns.
struct Row {
    QStringList heads;
    QStringList cells;

    QString Cell(const QString& head) const
    {
        QString cell = cells.value(heads.indexOf(head));
        return cell.size() >= 2 && cell.startsWith(u'`') ? cell.sliced(1).chopped(1) : cell;
    }
};

QStringList CellsOf(const QString& line)
{
    QStringList cells = line.sliced(1).chopped(1).split(u'|');
    for (QString& cell : cells)
        cell = cell.trimmed();
    return cells;
}

std::vector<Row> RowsOfThePage()
{
    QFile page(QStringLiteral(MIREL_SOURCE_DIR "/docs/expressions.md"));
    EXPECT_TRUE(page.open(QIODevice::ReadOnly));
    std::vector<Row> rows;
    QStringList heads;
    for (const QString& line : QString::fromUtf8(page.readAll()).split(u'\n')) {
        if (!line.startsWith(u'|'))
            heads.clear();
        else if (heads.isEmpty())
            heads = CellsOf(line);
        else if (!line.startsWith(u"|---"))
            rows.push_back({heads, CellsOf(line)});
    }
    return rows;
}

FakeRecord& RecordOfThePage()
{
    static FakeRecord record;
    record.SetColumns({{u"Name"_s, FieldType::Text, Value::Text(u"Smith"_s)},
                       {u"Unit Price"_s, FieldType::Double, Value::Double(2.5)},
                       {u"UnitPrice"_s, FieldType::Double, Value::Double(2.5)},
                       {u"Qty"_s, FieldType::Integer, Value::Integer(4)},
                       {u"Active"_s, FieldType::YesNo, Value::Bool(true)},
                       {u"Due"_s, FieldType::Date, Value::Date(DayNumber(2001, 7, 4, 18))},
                       {u"Paid"_s, FieldType::Date, Value::Null()}});
    record.controls = {{u"Discount"_s, u"10"_s}, {u"Ship To"_s, u"Bonn"_s}};
    return record;
}

QString ValueOf(const QString& expression)
{
    const ExprTree tree = ParseExpression(expression, ExprMode::Condition);
    if (!tree)
        return u"null"_s;
    EvaluateExpression(RecordOfThePage(), *tree);
    return tree->null ? u"null"_s : ShownText(*tree);
}

TEST(ExpressionsPage, GivesTheProgramsResults)
{
    UserLocale::SetCurrent(QLocale(QLocale::English, QLocale::UnitedStates));
    int checked = 0;
    for (const Row& row : RowsOfThePage()) {
        if (row.heads.contains(u"expression"_s)) {
            const QString expression = row.Cell(u"expression"_s);
            EXPECT_EQ(ValueOf(expression), row.Cell(u"value"_s)) << expression.toStdString();
            ++checked;
        } else if (row.heads.contains(u"pattern"_s)) {
            const QString text = FormatDatePattern(DayNumber(2001, 7, 4, 18), row.Cell(u"pattern"_s));
            EXPECT_EQ(text, row.Cell(u"text"_s));
            ++checked;
        }
    }
    EXPECT_GT(checked, 100);
}

TEST(ExpressionsPage, TellsOfEveryFunctionAndOperator)
{
    QSet<QString> functions;
    QSet<QString> tokens;
    for (const Row& row : RowsOfThePage()) {
        const QString expression = row.Cell(u"expression"_s);
        const QString function = row.Cell(u"function"_s);
        functions += function;
        if (!function.isEmpty()) {
            EXPECT_TRUE(expression.startsWith(function.left(function.indexOf(u'(') + 1)))
                << expression.toStdString();
        }
        qsizetype position = 0;
        while (const std::optional<ExprToken> token =
                   NextExpressionToken(expression, position, ExprMode::Condition))
            tokens += token->text;
    }
    const auto text = [](std::u16string_view units) {
        return QString::fromUtf16(units.data(), qsizetype(units.size()));
    };
    for (const FunctionDef& function : Functions())
        EXPECT_TRUE(functions.contains(StringText(function.help))) << StringText(function.help).toStdString();
    for (const std::span<const OperatorDef> table : {ArithmeticOperators(), ConditionWords()}) {
        for (const OperatorDef& def : table)
            EXPECT_TRUE(tokens.contains(text(def.text))) << text(def.text).toStdString();
    }
}

} // namespace
} // namespace mirel
