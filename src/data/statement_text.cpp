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

QString WithFields(const QString& statement, const QStringList& fields)
{
    const qsizetype from = KeywordPosition(statement, u"FROM");
    if (from < 0)
        return statement;
    QStringList references;
    for (const QString& field : fields)
        references += FieldReference(field);
    return u"SELECT %1 %2"_s.arg(references.join(u','), statement.sliced(from));
}

} // namespace mirel
