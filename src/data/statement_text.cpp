#include "data/statement_text.h"

#include "data/catalog.h"
#include "provider/dialect/functions.h"
#include "provider/dialect/schema.h"

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// As the dialect has it.
bool IsBlank(QChar c)
{
    return c.isSpace();
}

// The character that ends a run beginning with `opening`; null when nothing begins there.
QChar ClosingOf(QChar opening)
{
    if (opening == u'\'' || opening == u'"')
        return opening;
    return opening == u'[' ? QChar(u']') : QChar();
}

// Where the quoted text or bracketed name ends that begins at `at`: its last character. The size of the statement
// when it is never closed.
qsizetype EndOfRun(QStringView statement, qsizetype at, QChar closing)
{
    const QChar doubled[] = {closing, closing};
    for (qsizetype end = at + 1;; end += 2) {
        end = statement.indexOf(closing, end);
        if (end < 0)
            return statement.size();
        if (!statement.sliced(end).startsWith(QStringView(doubled)))
            return end;
    }
}

qsizetype FirstKeyword(QStringView statement, std::initializer_list<QStringView> keywords)
{
    for (const QStringView keyword : keywords) {
        if (const qsizetype at = KeywordPosition(statement, keyword); at >= 0)
            return at;
    }
    return -1;
}

bool IsAggregate(QStringView word)
{
    const dialect::FunctionDef* function = dialect::FindFunction(word);
    return function && function->isAggregate;
}

// Whether the condition holds a call of COUNT, SUM and the like.
bool HasAggregate(QStringView condition)
{
    for (qsizetype at = 0; at < condition.size(); ++at) {
        if (const QChar closing = ClosingOf(condition[at]); !closing.isNull()) {
            at = EndOfRun(condition, at, closing);
            continue;
        }
        if (!condition[at].isLetter())
            continue;
        const qsizetype begin = at;
        while (at < condition.size() && (condition[at].isLetterOrNumber() || condition[at] == u'_'))
            ++at;
        const QStringView word = condition.sliced(begin, at - begin);
        if (condition.sliced(at).trimmed().startsWith(u'(') && IsAggregate(word))
            return true;
        --at; // the character behind the word may open a text
    }
    return false;
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
            at = EndOfRun(statement, at, closing);
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
    const bool isOfGroups = HasAggregate(condition);
    const QStringView keyword = isOfGroups ? u"HAVING" : u"WHERE";
    const qsizetype clause = KeywordPosition(statement, keyword);
    const qsizetype tail = isOfGroups ? KeywordPosition(statement, u"ORDER")
                                      : FirstKeyword(statement, {u"GROUP", u"HAVING", u"ORDER"});
    if (clause < 0) {
        if (tail < 0)
            return u"%1 %2 %3"_s.arg(statement, keyword, condition);
        return u"%1 %2 %3 %4"_s.arg(QStringView(statement).first(tail), keyword, condition,
                                    QStringView(statement).sliced(tail));
    }
    const qsizetype conditions = clause + keyword.size();
    if (tail < 0)
        return u"%1 (%2) AND (%3)"_s.arg(statement.first(conditions), statement.sliced(conditions), condition);
    if (tail < conditions) // clauses out of their order
        return statement;
    return u"%1 (%2) AND (%3) %4"_s.arg(statement.first(conditions),
                                        statement.sliced(conditions, tail - conditions), condition,
                                        statement.sliced(tail));
}

QString FieldReferenceIn(std::span<const ResultField> result, int field)
{
    const ResultField& shown = result[size_t(field)];
    if (shown.column.isEmpty())
        return shown.expression.isEmpty() ? FieldReference(shown.name) : shown.expression;
    const auto name = [](const QString& exact) {
        return exact.startsWith(u'[') ? BracketedName(exact) : FieldReference(exact);
    };
    // A bare name in ORDER BY is first of all what the result calls its columns.
    const bool isTaken = std::ranges::any_of(result, [&](const ResultField& other) {
        return dialect::SameName(other.name, shown.column) &&
               (other.column != shown.column || other.source != shown.source);
    });
    return shown.isJoined || isTaken ? name(shown.source) + u'.' + name(shown.column) : name(shown.column);
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
            at = EndOfRun(list, at, closing);
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
    for (qsizetype at = 0; at < statement.size(); ++at) {
        const QChar c = statement[at];
        if (!quote.isNull()) {
            if (c == quote)
                quote = QChar();
            continue;
        }
        const bool isDoubled = brackets > 0 && statement.sliced(at).startsWith(u"]]");
        if (isDoubled && brackets == 1) { // part of a name
            ++at;
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
