#include "data/statement_text.h"

#include "data/catalog.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

bool IsBlank(QChar c)
{
    return c == u' ' || c == u'\t';
}

// The character that ends a run beginning with `opening`; null when nothing begins there.
QChar ClosingOf(QChar opening)
{
    if (opening == u'\'' || opening == u'"')
        return opening;
    return opening == u'[' ? QChar(u']') : QChar();
}

// Where the part begins that must stay behind a WHERE clause; -1: there is none.
qsizetype TailPosition(QStringView statement)
{
    const qsizetype group = KeywordPosition(statement, u"GROUP");
    return group >= 0 ? group : KeywordPosition(statement, u"ORDER");
}

struct ListPlace {
    qsizetype begin = 0; // behind SELECT and DISTINCT
    qsizetype from = -1; // of the FROM; -1: the statement has no such list
    bool distinct = false;
};
ListPlace PlaceOfSelectList(QStringView statement)
{
    constexpr qsizetype kSelectSize = 6;
    constexpr qsizetype kDistinctSize = 8;
    const qsizetype select = KeywordPosition(statement, u"SELECT");
    const qsizetype from = KeywordPosition(statement, u"FROM");
    if (select < 0 || from < select + kSelectSize)
        return {};
    const qsizetype begin = select + kSelectSize;
    const QStringView list = statement.sliced(begin, from - begin);
    const qsizetype distinct = KeywordPosition(list, u"DISTINCT");
    if (distinct < 0 || !list.first(distinct).trimmed().isEmpty())
        return {begin, from, false};
    return {begin + distinct + kDistinctSize, from, true};
}

} // namespace

qsizetype KeywordPosition(QStringView statement, QStringView keyword)
{
    for (qsizetype at = 0; at < statement.size(); ++at) {
        if (const QChar closing = ClosingOf(statement[at]); !closing.isNull()) {
            at = statement.indexOf(closing, at + 1);
            if (at < 0)
                return -1;
            continue;
        }
        if (at > 0 && !IsBlank(statement[at - 1]))
            continue;
        const QStringView here = statement.sliced(at);
        if (!here.startsWith(keyword, Qt::CaseInsensitive))
            continue;
        if (here.size() == keyword.size() || here[keyword.size()] == u'(' || IsBlank(here[keyword.size()]))
            return at;
    }
    return -1;
}

QString WithCondition(const QString& statement, const QString& condition)
{
    constexpr qsizetype kWhereSize = 5;
    const qsizetype where = KeywordPosition(statement, u"WHERE");
    const qsizetype tail = TailPosition(statement);
    if (where < 0) {
        if (tail < 0)
            return u"%1 WHERE %2"_s.arg(statement, condition);
        return u"%1 WHERE %2 %3"_s.arg(statement.first(tail), condition, statement.sliced(tail));
    }
    const qsizetype conditions = where + kWhereSize;
    if (tail < 0)
        return u"%1 (%2) AND (%3)"_s.arg(statement.first(conditions), statement.sliced(conditions), condition);
    if (tail < conditions) // clauses out of their order
        return statement;
    return u"%1 (%2) AND (%3) %4"_s.arg(statement.first(conditions),
                                        statement.sliced(conditions, tail - conditions), condition,
                                        statement.sliced(tail));
}

QString WithOrder(const QString& statement, const QString& terms)
{
    const qsizetype order = KeywordPosition(statement, u"ORDER");
    QString base = order < 0 ? statement : statement.first(order);
    if (order < 0) {
        while (!base.isEmpty() && IsBlank(base.back()))
            base.chop(1);
    }
    return u"%1 ORDER BY %2"_s.arg(base, terms);
}

QStringList SelectList(QStringView statement)
{
    const ListPlace place = PlaceOfSelectList(statement);
    if (place.from < 0)
        return {};
    const QStringView list = statement.sliced(place.begin, place.from - place.begin);
    QStringList columns;
    qsizetype begin = 0;
    int depth = 0;
    for (qsizetype at = 0; at < list.size(); ++at) {
        if (const QChar closing = ClosingOf(list[at]); !closing.isNull()) {
            at = list.indexOf(closing, at + 1);
            if (at < 0)
                break;
        } else if (list[at] == u',' && depth == 0) {
            columns += list.sliced(begin, at - begin).trimmed().toString();
            begin = at + 1;
        } else {
            depth += list[at] == u'(' ? 1 : (list[at] == u')' ? -1 : 0);
        }
    }
    columns += list.sliced(begin).trimmed().toString();
    return columns;
}

QString WithSelectList(const QString& statement, const QStringList& columns)
{
    const ListPlace place = PlaceOfSelectList(statement);
    if (place.from < 0)
        return statement;
    const QString head = place.distinct ? u"SELECT DISTINCT"_s : u"SELECT"_s;
    return u"%1 %2 %3"_s.arg(head, columns.join(u','), statement.sliced(place.from));
}

bool IsBalanced(QStringView statement)
{
    int parentheses = 0;
    int brackets = 0;
    QChar quote;
    for (const QChar c : statement) {
        if (!quote.isNull()) {
            if (c == quote)
                quote = QChar();
            continue;
        }
        if ((c == u')' && parentheses < 1) || (c == u']' && brackets < 1))
            return false;
        parentheses += c == u'(' ? 1 : (c == u')' ? -1 : 0);
        brackets += c == u'[' ? 1 : (c == u']' ? -1 : 0);
        if (c == u'\'' || c == u'"')
            quote = c;
    }
    return parentheses == 0 && brackets == 0 && quote.isNull();
}

} // namespace mirel
