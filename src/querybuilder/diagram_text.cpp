#include "querybuilder/diagram_text.h"

#include "data/catalog.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;
using dialect::Keyword;
using dialect::Symbol;
using dialect::Token;
using dialect::TokenKind;

constexpr std::array kTotals = {
    TotalDef{Total::Count, u"COUNT"}, TotalDef{Total::Sum, u"SUM"},     TotalDef{Total::Average, u"AVG"},
    TotalDef{Total::Minimum, u"MIN"}, TotalDef{Total::Maximum, u"MAX"},
};

bool IsNameToken(const Token& token)
{
    return token.kind == TokenKind::BracketedName ||
           (token.kind == TokenKind::Name && token.keyword == Keyword::None);
}

int DepthChange(const Token& token)
{
    return token.symbol == Symbol::Open ? 1 : token.symbol == Symbol::Close ? -1 : 0;
}

template <typename IsSeparator>
std::vector<TokenRun> Cut(TokenRun run, IsSeparator isSeparator)
{
    std::vector<TokenRun> pieces;
    size_t begin = 0;
    int depth = 0;
    for (size_t at = 0; at < run.size(); ++at) {
        depth += DepthChange(run[at]);
        if (depth == 0 && isSeparator(run[at])) {
            pieces.push_back(run.subspan(begin, at - begin));
            begin = at + 1;
        }
    }
    pieces.push_back(run.subspan(begin));
    return pieces;
}

bool IsComparisonSymbol(Symbol symbol)
{
    return symbol >= Symbol::Equal && symbol <= Symbol::GreaterEqual;
}

bool IsLiteralWord(Keyword keyword)
{
    return keyword == Keyword::True || keyword == Keyword::False;
}

// What stands in a cell without an operator: a value as it is, an expression, or else a text without its quotes.
QString EqualTo(const QString& typed, TokenRun tokens)
{
    const bool isSigned = tokens.size() == 2 && tokens[0].symbol == Symbol::Minus;
    const Token& last = tokens.back();
    if (tokens.size() == 1 && last.keyword == Keyword::Null)
        return u"IS NULL"_s;
    const bool isValue =
        (tokens.size() == 1 || isSigned) && (last.kind == TokenKind::Number || last.kind == TokenKind::Text ||
                                             IsLiteralWord(last.keyword) || last.kind == TokenKind::BracketedName);
    const bool isExpression = std::ranges::any_of(tokens, [](const Token& token) {
        return token.symbol == Symbol::Open || token.symbol == Symbol::Point || token.kind == TokenKind::Fault;
    });
    return u"= "_s + (isValue || isExpression ? typed : QuoteText(typed));
}

QString SingleCondition(const QString& expression, QStringView text, TokenRun run)
{
    const QString typed = TextOf(text, run);
    return expression + u' ' + (BeginsComparison(run) ? typed : EqualTo(typed, run));
}

} // namespace

Tokens TokensOf(QStringView text)
{
    Tokens tokens;
    dialect::Lexer lexer(text);
    for (Token token = lexer.Next(); token.kind != TokenKind::End; token = lexer.Next())
        tokens.push_back(token);
    return tokens;
}

QString TextOf(QStringView text, TokenRun run)
{
    return run.empty() ? QString() : text.sliced(run.front().begin, run.back().end - run.front().begin).toString();
}

std::vector<TokenRun> CutAt(TokenRun run, Symbol symbol)
{
    return Cut(run, [symbol](const Token& token) { return token.symbol == symbol; });
}

std::vector<TokenRun> CutAt(TokenRun run, Keyword keyword)
{
    bool between = false;
    return Cut(run, [&between, keyword](const Token& token) {
        if (token.keyword == Keyword::And && std::exchange(between, false))
            return false;
        between = between || token.keyword == Keyword::Between;
        return token.kind == TokenKind::Name && token.keyword == keyword;
    });
}

bool HasOutside(TokenRun run, Keyword keyword)
{
    return CutAt(run, keyword).size() > 1;
}

TokenRun WithoutParentheses(TokenRun run)
{
    while (run.size() > 2 && run.front().symbol == Symbol::Open && run.back().symbol == Symbol::Close) {
        int depth = 0;
        for (const Token& token : run.first(run.size() - 1)) {
            depth += DepthChange(token);
            if (depth == 0)
                return run;
        }
        run = run.subspan(1, run.size() - 2);
    }
    return run;
}

bool SameWords(TokenRun a, TokenRun b)
{
    return std::ranges::equal(a, b, [](const Token& one, const Token& other) {
        if (IsNameToken(one) && IsNameToken(other))
            return one.Text().compare(other.Text(), Qt::CaseInsensitive) == 0;
        return one.kind == other.kind && one.keyword == other.keyword &&
               (one.keyword != Keyword::None || one.text == other.text);
    });
}

bool SameWords(const QString& a, const QString& b)
{
    return SameWords(TokensOf(a), TokensOf(b));
}

size_t ColumnLength(TokenRun run)
{
    if (run.empty() || !IsNameToken(run[0]))
        return 0;
    if (run.size() >= 3 && run[1].symbol == Symbol::Point)
        return IsNameToken(run[2]) ? 3 : 0;
    return run.size() >= 2 && run[1].symbol == Symbol::Open ? 0 : 1;
}

bool BeginsComparison(TokenRun run)
{
    if (run.empty())
        return false;
    const Keyword word = run.front().keyword;
    return IsComparisonSymbol(run.front().symbol) || word == Keyword::Like || word == Keyword::In ||
           word == Keyword::Between || word == Keyword::Is || word == Keyword::Not;
}

QStringView FunctionOf(Total total)
{
    const auto* row = std::ranges::find(kTotals, total, &TotalDef::total);
    return row == kTotals.end() ? QStringView() : row->function;
}

Total TakeTotal(TokenRun& run)
{
    if (run.size() < 4 || run[0].kind != TokenKind::Name || run[1].symbol != Symbol::Open ||
        run[2].keyword == Keyword::Distinct)
        return Total::None;
    const auto* row = std::ranges::find_if(kTotals, [&run](const TotalDef& def) {
        return def.function.compare(run[0].text, Qt::CaseInsensitive) == 0;
    });
    // The parenthesis closes at the end: no sum of two totals.
    const TokenRun inner = run.subspan(1);
    if (row == kTotals.end() || WithoutParentheses(inner).size() == inner.size())
        return Total::None;
    run = inner.subspan(1, inner.size() - 2);
    return row->total;
}

QString ConditionText(const QString& expression, const QString& condition)
{
    const Tokens tokens = TokensOf(condition);
    if (tokens.empty())
        return {};
    QStringList choices;
    for (const TokenRun choice : CutAt(TokenRun(tokens), Keyword::Or)) {
        QStringList all;
        for (const TokenRun one : CutAt(choice, Keyword::And)) {
            if (!one.empty())
                all += SingleCondition(expression, condition, one);
        }
        if (!all.isEmpty())
            choices += all.join(u" AND "_s);
    }
    return choices.size() > 1 ? u'(' + choices.join(u" OR "_s) + u')' : choices.value(0);
}

} // namespace mirel
