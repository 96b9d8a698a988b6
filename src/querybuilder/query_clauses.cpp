#include "querybuilder/query_clauses.h"

#include "data/statement_text.h"
#include "provider/dialect/lexer.h"
#include "provider/dialect/parser.h"
#include "resources/string_table.h"

#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;
using dialect::Keyword;
using dialect::Token;
using dialect::TokenKind;

constexpr std::array kClauses = {
    ClauseDef{&QueryClauses::select, u"SELECT"},   ClauseDef{&QueryClauses::from, u"FROM"},
    ClauseDef{&QueryClauses::join, u"INNER JOIN"}, ClauseDef{&QueryClauses::on, u"ON"},
    ClauseDef{&QueryClauses::where, u"WHERE"},     ClauseDef{&QueryClauses::order, u"ORDER BY"},
};

enum Word : size_t { Select, From, Inner, Join, On, Where, Order, By, Words };
constexpr std::array<QStringView, Words> kWords = {u"SELECT", u"FROM",  u"INNER", u"JOIN",
                                                   u"ON",     u"WHERE", u"ORDER", u"BY"};

// Where the clause keywords are in a statement.
class WordPlaces {
public:
    explicit WordPlaces(QStringView statement)
        : statement_(statement)
    {
        for (size_t word = 0; word < By; ++word)
            at_[word] = KeywordPosition(statement, kWords[word]);
        // A field may be called BY; the one that counts belongs to ORDER.
        const qsizetype behindOrder = Has(Order) ? BehindOf(Order) : 0;
        const qsizetype by = KeywordPosition(statement.sliced(behindOrder), kWords[By]);
        at_[By] = by < 0 ? -1 : behindOrder + by;
    }

    bool Has(Word word) const { return at_[word] >= 0; }

    // From behind `word` to the first of the words behind it in their fixed order.
    QString Piece(Word word) const
    {
        const qsizetype begin = BehindOf(word);
        qsizetype end = statement_.size();
        for (size_t next = word + 1; next < Words; ++next) {
            if (at_[next] >= 0) {
                end = at_[next];
                break;
            }
        }
        return end > begin ? statement_.sliced(begin, end - begin).trimmed().toString() : QString();
    }

private:
    qsizetype BehindOf(Word word) const { return at_[word] + kWords[word].size(); }

    QStringView statement_;
    std::array<qsizetype, Words> at_{};
};

struct Unboxed {
    Keyword keyword;
    QStringView name;
};
constexpr std::array kUnboxed = {
    Unboxed{Keyword::Distinct, u"DISTINCT"}, Unboxed{Keyword::Group, u"GROUP BY"},
    Unboxed{Keyword::Having, u"HAVING"},     Unboxed{Keyword::Left, u"LEFT JOIN"},
    Unboxed{Keyword::Union, u"UNION"},
};

// LEFT is a function as well; DISTINCT is the statement's own only behind SELECT.
bool IsClause(const Token& before, const Token& word, const Token& next)
{
    if (word.keyword == Keyword::Left)
        return next.symbol != dialect::Symbol::Open;
    return word.keyword != Keyword::Distinct || before.keyword == Keyword::Select;
}

std::optional<QStringView> ClauseWithoutBox(QStringView statement)
{
    dialect::Lexer lexer(statement);
    Token before;
    Token word = lexer.Next();
    while (word.kind != TokenKind::End) {
        const Token next = lexer.Next();
        for (const Unboxed& clause : kUnboxed) {
            if (word.kind == TokenKind::Name && word.keyword == clause.keyword && IsClause(before, word, next))
                return clause.name;
        }
        before = word;
        word = next;
    }
    return std::nullopt;
}

// The clauses joined as JoinClauses does, with the keywords of those that nothing was written into yet.
QString JoinedWithEmptyClauses(QStringView statement)
{
    const WordPlaces places(statement);
    const QueryClauses clauses = SplitStatement(statement);
    const std::array<bool, kClauses.size()> found = {
        places.Has(Select), places.Has(From),  places.Has(Inner) && places.Has(Join),
        places.Has(On),     places.Has(Where), places.Has(Order) && places.Has(By)};
    QString joined;
    for (size_t i = 0; i < kClauses.size(); ++i) {
        if (found[i])
            joined += kClauses[i].keyword.toString() + u' ' + clauses.*kClauses[i].text + u' ';
    }
    return joined;
}

} // namespace

std::span<const ClauseDef> ClauseDefs()
{
    return kClauses;
}

QueryClauses SplitStatement(QStringView statement)
{
    const WordPlaces places(statement);
    QueryClauses clauses;
    if (places.Has(Select))
        clauses.select = places.Piece(Select);
    if (places.Has(From))
        clauses.from = places.Piece(From);
    if (places.Has(Inner) && places.Has(Join))
        clauses.join = places.Piece(Join);
    if (places.Has(On))
        clauses.on = places.Piece(On);
    if (places.Has(Where))
        clauses.where = places.Piece(Where);
    if (places.Has(Order) && places.Has(By))
        clauses.order = places.Piece(By);
    return clauses;
}

QString JoinClauses(const QueryClauses& clauses, const QString& prefix)
{
    QString statement = prefix;
    for (const ClauseDef& def : kClauses) {
        const QString text = (clauses.*def.text).trimmed();
        if (text.isEmpty())
            continue;
        if (def.text != &QueryClauses::select)
            statement += u' ';
        statement += def.keyword.toString() + u' ' + text;
    }
    return statement;
}

bool SayTheSame(QStringView a, QStringView b)
{
    dialect::Lexer left(a);
    dialect::Lexer right(b);
    for (;;) {
        const Token one = left.Next();
        const Token other = right.Next();
        const bool isKeyword = one.keyword != Keyword::None;
        if (one.kind != other.kind || one.keyword != other.keyword || (!isKeyword && one.text != other.text))
            return false;
        if (one.kind == TokenKind::End)
            return true;
    }
}

std::optional<SplitObstacle> ObstacleToSplitting(const QString& statement)
{
    const QString text = statement.trimmed();
    if (text.isEmpty())
        return std::nullopt;
    if (dialect::Lexer(text).Next().keyword != Keyword::Select)
        return SplitObstacle{Str::BuilderOnlySelect, {}};
    if (const std::optional<QStringView> clause = ClauseWithoutBox(text))
        return SplitObstacle{Str::BuilderHasNoBox, {clause->toString()}};
    if (!SayTheSame(text, JoinedWithEmptyClauses(text)))
        return SplitObstacle{Str::BuilderWouldLose, {}};
    return std::nullopt;
}

QString WithoutSelectClause(const QString& statement, const QString& selectClause)
{
    const QString text = statement.trimmed();
    const QString fixed = selectClause.trimmed();
    const bool beginsSo = text.startsWith(fixed, Qt::CaseInsensitive) &&
                          (text.size() == fixed.size() || text[fixed.size()].isSpace());
    if (beginsSo)
        return text.sliced(fixed.size()).trimmed();
    if (KeywordPosition(text, u"SELECT") != 0)
        return text;
    for (const QStringView word : {u"FROM", u"INNER", u"WHERE", u"ORDER"}) {
        if (const qsizetype at = KeywordPosition(text, word); at >= 0)
            return text.sliced(at);
    }
    return {};
}

QString WithSelectClause(const QString& selectClause, const QString& rest)
{
    const QString fixed = selectClause.trimmed();
    const QString tail = rest.trimmed();
    return tail.isEmpty() ? fixed : fixed + u' ' + tail;
}

} // namespace mirel
