#include "querybuilder/diagram_text.h"

#include "data/catalog.h"
#include "provider/dialect/parser.h"
#include "provider/dialect/schema.h"

#include <algorithm>
#include <array>

// Reading a diagram from a statement: by its words, so that conditions and expressions stay as they are written.
// What comes of it is written again, and must be the same statement to the parser.

namespace mirel {
namespace {

using namespace Qt::StringLiterals;
using dialect::Keyword;
using dialect::Select;
using dialect::Symbol;
using dialect::Token;
using dialect::TokenKind;

// The words of each clause, without their keywords.
struct ClauseRuns {
    TokenRun select, from, where, group, having, order;
};

struct ClauseStart {
    TokenRun ClauseRuns::*run;
    Keyword keyword;
    size_t words; // "GROUP BY" has two
};
constexpr std::array kStarts = {
    ClauseStart{&ClauseRuns::select, Keyword::Select, 1}, ClauseStart{&ClauseRuns::from, Keyword::From, 1},
    ClauseStart{&ClauseRuns::where, Keyword::Where, 1},   ClauseStart{&ClauseRuns::group, Keyword::Group, 2},
    ClauseStart{&ClauseRuns::having, Keyword::Having, 1}, ClauseStart{&ClauseRuns::order, Keyword::Order, 2},
};

ClauseRuns RunsOf(TokenRun tokens)
{
    ClauseRuns runs;
    TokenRun ClauseRuns::*current = nullptr;
    size_t begin = 0;
    for (size_t at = 0; at < tokens.size(); ++at) {
        const auto* start = std::ranges::find_if(kStarts, [&tokens, at](const ClauseStart& one) {
            return tokens[at].kind == TokenKind::Name && one.keyword == tokens[at].keyword;
        });
        if (start == kStarts.end())
            continue;
        if (current)
            runs.*current = tokens.subspan(begin, at - begin);
        current = start->run;
        begin = std::min(at + start->words, tokens.size());
    }
    if (current)
        runs.*current = tokens.subspan(begin);
    return runs;
}

// Whether the arguments of two chains of AND are the same ones, in any order.
bool SameParts(const std::optional<dialect::Expr>& a, const std::optional<dialect::Expr>& b)
{
    if (!a || !b)
        return a.has_value() == b.has_value();
    const bool chains = a->operation == dialect::Operation::And && b->operation == dialect::Operation::And;
    return *a == *b || (chains && a->arguments.size() == b->arguments.size() &&
                        std::ranges::is_permutation(a->arguments, b->arguments));
}

bool SameSelect(const Select& a, const Select& b)
{
    const auto sameTable = [](const dialect::FromTable& one, const dialect::FromTable& other) {
        return one.table == other.table && one.alias == other.alias && one.join == other.join &&
               SameParts(one.on, other.on);
    };
    return a.distinct == b.distinct && a.columns == b.columns && std::ranges::equal(a.from, b.from, sameTable) &&
           SameParts(a.where, b.where) && SameParts(a.having, b.having) && a.order == b.order &&
           std::ranges::is_permutation(a.group, b.group);
}

std::optional<Select> SelectOf(QStringView statement)
{
    dialect::ParseResult parsed = dialect::ParseStatement(statement);
    auto* tree = std::get_if<dialect::Statement>(&parsed);
    auto* select = tree ? std::get_if<Select>(tree) : nullptr;
    return select ? std::optional(std::move(*select)) : std::nullopt;
}

} // namespace

class DiagramReader {
public:
    explicit DiagramReader(QStringView text)
        : text_(text)
    {
    }

    std::optional<QueryDiagram> Read(const Select& select);

private:
    bool ReadTables(const Select& select);
    bool ReadJoins(const dialect::FromTable& table, const dialect::Expr& condition);
    void ReadColumns(TokenRun run);
    void ReadConditions(TokenRun run);
    bool ReadGroups(TokenRun run);
    bool ReadTotalsConditions(TokenRun run);
    bool ReadOrder(TokenRun run);
    DiagramColumn ColumnOf(TokenRun run) const;
    // The column with that expression that `fits`; without one, a new hidden column.
    template <typename Fits>
    DiagramColumn& FindOrAdd(const DiagramColumn& wanted, Fits fits);

    QStringView text_;
    QueryDiagram diagram_;
};

// The tables and joins have no other spelling: from the tree.
bool DiagramReader::ReadTables(const Select& select)
{
    for (const dialect::FromTable& from : select.from) {
        diagram_.tables_.push_back({from.table, from.alias});
        if (from.on && !ReadJoins(from, *from.on))
            return false;
    }
    return !select.from.empty();
}

bool DiagramReader::ReadJoins(const dialect::FromTable& table, const dialect::Expr& condition)
{
    using dialect::Operation;
    if (condition.operation == Operation::And) {
        return std::ranges::all_of(condition.arguments,
                                   [&](const dialect::Expr& one) { return ReadJoins(table, one); });
    }
    if (condition.operation != Operation::Equal)
        return false;
    const dialect::Expr& left = condition.arguments.front();
    const dialect::Expr& right = condition.arguments.back();
    const auto isColumn = [this](const dialect::Expr& side) {
        return side.operation == Operation::Column && diagram_.Find(side.table);
    };
    if (!isColumn(left) || !isColumn(right))
        return false;
    DiagramJoin join{left.table, left.text, right.table, right.text, table.join == dialect::JoinKind::Left};
    const QString& source = diagram_.tables_.back().Source();
    if (join.allOfLeft && !dialect::SameName(join.right, source)) {
        std::swap(join.left, join.right);
        std::swap(join.leftField, join.rightField);
    }
    diagram_.joins_.push_back(join);
    return true;
}

DiagramColumn DiagramReader::ColumnOf(TokenRun run) const
{
    run = WithoutParentheses(run);
    DiagramColumn column;
    column.total = TakeTotal(run);
    column.expression = TextOf(text_, run);
    return column;
}

void DiagramReader::ReadColumns(TokenRun run)
{
    if (!run.empty() && run.front().keyword == Keyword::Distinct) {
        diagram_.distinct_ = true;
        run = run.subspan(1);
    }
    for (TokenRun one : CutAt(run, Symbol::Comma)) {
        QString alias;
        const bool hasAs = one.size() > 2 && one[one.size() - 2].keyword == Keyword::As;
        if (hasAs) {
            alias = one.back().Text();
            one = one.first(one.size() - 2);
        }
        DiagramColumn column;
        column.total = TakeTotal(one);
        column.expression = TextOf(text_, one);
        column.alias = alias;
        diagram_.columns_.push_back(column);
    }
    if (diagram_.columns_.size() == 1 && diagram_.columns_.front() == DiagramColumn{.expression = u"*"_s})
        diagram_.columns_.clear(); // all fields: what a drawing without ticks says
}

template <typename Fits>
DiagramColumn& DiagramReader::FindOrAdd(const DiagramColumn& wanted, Fits fits)
{
    for (DiagramColumn& column : diagram_.columns_) {
        if (SameWords(column.expression, wanted.expression) && fits(column))
            return column;
    }
    DiagramColumn hidden = wanted;
    hidden.shown = false;
    return diagram_.columns_.emplace_back(hidden);
}

void DiagramReader::ReadConditions(TokenRun run)
{
    run = WithoutParentheses(run);
    QStringList others;
    const bool isChoice = HasOutside(run, Keyword::Or);
    for (const TokenRun one : isChoice ? std::vector<TokenRun>{run} : CutAt(run, Keyword::And)) {
        const size_t length = ColumnLength(one);
        if (isChoice || length == 0 || !BeginsComparison(one.subspan(length))) {
            others += TextOf(text_, one);
            continue;
        }
        const QString expression = TextOf(text_, one.first(length));
        DiagramColumn& column = FindOrAdd({.expression = expression}, [](const DiagramColumn& known) {
            return known.condition.isEmpty() && FunctionOf(known.total).isEmpty();
        });
        column.condition = TextOf(text_, one.subspan(length));
    }
    diagram_.other_ = others.join(u" AND "_s);
}

bool DiagramReader::ReadGroups(TokenRun run)
{
    if (run.empty())
        return true;
    for (const TokenRun one : CutAt(run, Symbol::Comma)) {
        DiagramColumn group = ColumnOf(one);
        if (group.total != Total::None)
            return false;
        group.total = Total::Group;
        FindOrAdd(group, [](const DiagramColumn& known) { return known.total == Total::None; }).total =
            Total::Group;
    }
    return true;
}

bool DiagramReader::ReadTotalsConditions(TokenRun run)
{
    if (run.empty())
        return true;
    run = WithoutParentheses(run);
    if (HasOutside(run, Keyword::Or))
        return false;
    for (const TokenRun one : CutAt(run, Keyword::And)) {
        size_t length = 0;
        int depth = 0;
        while (length < one.size() && (depth > 0 || !BeginsComparison(one.subspan(length)))) {
            depth += one[length].symbol == Symbol::Open ? 1 : one[length].symbol == Symbol::Close ? -1 : 0;
            ++length;
        }
        const DiagramColumn total = ColumnOf(one.first(length));
        if (length == one.size() || total.total == Total::None)
            return false;
        FindOrAdd(total, [&total](const DiagramColumn& known) {
            return known.total == total.total && known.condition.isEmpty();
        }).condition = TextOf(text_, one.subspan(length));
    }
    return true;
}

bool DiagramReader::ReadOrder(TokenRun run)
{
    if (run.empty())
        return true;
    int rank = 0;
    for (TokenRun one : CutAt(run, Symbol::Comma)) {
        if (one.empty())
            return false;
        const bool descends = one.back().keyword == Keyword::Desc;
        if (descends || one.back().keyword == Keyword::Asc)
            one = one.first(one.size() - 1);
        const DiagramColumn wanted = ColumnOf(one);
        const auto named = std::ranges::find_if(diagram_.columns_, [&wanted](const DiagramColumn& known) {
            return !known.alias.isEmpty() && known.sort == ColumnOrder::None &&
                   SameWords(wanted.expression, FieldReference(known.alias));
        });
        const bool byAlias = wanted.total == Total::None && named != diagram_.columns_.end();
        DiagramColumn& column = byAlias ? *named : FindOrAdd(wanted, [&wanted](const DiagramColumn& known) {
            const bool sameTotal =
                known.total == wanted.total || (known.total == Total::Group && wanted.total == Total::None);
            return sameTotal && known.sort == ColumnOrder::None;
        });
        column.sort = descends ? ColumnOrder::Descending : ColumnOrder::Ascending;
        column.rank = ++rank;
        column.sortsByAlias = byAlias;
    }
    return true;
}

std::optional<QueryDiagram> DiagramReader::Read(const Select& select)
{
    Tokens tokens = TokensOf(text_);
    if (!tokens.empty() && tokens.back().symbol == Symbol::Semicolon)
        tokens.pop_back();
    const ClauseRuns runs = RunsOf(tokens);
    if (!ReadTables(select))
        return std::nullopt;
    ReadColumns(runs.select);
    if (!runs.where.empty())
        ReadConditions(runs.where);
    if (!ReadGroups(runs.group) || !ReadTotalsConditions(runs.having) || !ReadOrder(runs.order))
        return std::nullopt;
    const std::optional<Select> written = SelectOf(diagram_.Statement());
    return written && SameSelect(select, *written) ? std::optional(diagram_) : std::nullopt;
}

std::optional<QueryDiagram> QueryDiagram::Read(const QString& statement)
{
    constexpr qsizetype kLongest = 20'000; // nobody draws more
    if (statement.size() > kLongest)
        return std::nullopt;
    const std::optional<Select> select = SelectOf(statement);
    return select ? DiagramReader(statement).Read(*select) : std::nullopt;
}

} // namespace mirel
