#include "tableview/condition_label.h"

#include "resources/string_table.h"

#include <QRegularExpression>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// A field, with or without its table; an operator; a text in quotes, a number or a word such as NULL.
const QString kName = uR"((?:\[((?:[^\]]|\]\])+)\]|(\w+)))"_s;
const QString kValue = uR"((?:'((?:[^']|'')*)'|([+-]?[\d.]+)|(\w+)))"_s;
const QString kComparison =
    uR"(^\s*(NOT\s*\()?\s*(?:(?:\[(?:[^\]]|\]\])+\]|\w+)\s*\.\s*)?%1\s*(=|<>|not =|<=|>=|<|>|LIKE|IS)\s*%2\s*(\))?\s*$)"_s;

// The parentheses around the whole of it.
QString WithoutParentheses(QString condition)
{
    condition = condition.trimmed();
    while (condition.startsWith(u'(') && condition.endsWith(u')')) {
        int depth = 0;
        qsizetype closed = 0;
        for (; closed < condition.size(); ++closed) {
            depth += condition[closed] == u'(' ? 1 : (condition[closed] == u')' ? -1 : 0);
            if (depth == 0)
                break;
        }
        if (closed != condition.size() - 1)
            break;
        condition = condition.sliced(1, condition.size() - 2).trimmed();
    }
    return condition;
}

} // namespace

QString ConditionLabel(const QString& condition)
{
    static const QRegularExpression comparison(kComparison.arg(kName, kValue),
                                               QRegularExpression::CaseInsensitiveOption);
    const QRegularExpressionMatch match = comparison.match(WithoutParentheses(condition));
    const bool negated = !match.captured(1).isEmpty();
    if (!match.hasMatch() || negated != !match.captured(8).isEmpty())
        return condition.simplified();
    const QString field =
        match.captured(2).isEmpty() ? match.captured(3) : match.captured(2).replace(u"]]"_s, u"]"_s);
    const QString operatorText = match.captured(4).toUpper();
    const QString word = match.captured(7).toUpper();
    if (word == u"NULL" && (operatorText == u"IS" || operatorText == u"="))
        return StringText(negated ? Str::ConditionNotEmpty : Str::ConditionEmpty, {field});
    const bool quoted = match.capturedStart(5) >= 0;
    const QString value =
        quoted ? match.captured(5).replace(u"''"_s, u"'"_s) : match.captured(6) + match.captured(7);
    if (operatorText == u"=" || operatorText == u"IS")
        return StringText(negated ? Str::ConditionIsNot : Str::ConditionIs, {field, value.simplified()});
    if (!negated && (operatorText == u"<>" || operatorText == u"NOT ="))
        return StringText(Str::ConditionIsNot, {field, value.simplified()});
    if (negated)
        return condition.simplified();
    return StringText(Str::ConditionCompares, {field, operatorText, value.simplified()});
}

} // namespace mirel
