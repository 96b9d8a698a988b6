#include "forms/design/expression_words.h"

#include "expr/function_library.h"
#include "resources/string_table.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kIndent = 4;
constexpr int kDeepest = 64;

struct CodeWord {
    OpCode code;
    Str words; // may name the node's own text
};
constexpr std::array kWords = {
    CodeWord{OpCode::Add, Str::WordAdd},
    CodeWord{OpCode::Subtract, Str::WordSubtract},
    CodeWord{OpCode::Multiply, Str::WordMultiply},
    CodeWord{OpCode::Divide, Str::WordDivide},
    CodeWord{OpCode::Power, Str::WordPower},
    CodeWord{OpCode::Remainder, Str::WordRemainder},
    CodeWord{OpCode::Where, Str::WordWhere},
    CodeWord{OpCode::And, Str::WordAnd},
    CodeWord{OpCode::Or, Str::WordOr},
    CodeWord{OpCode::Equal, Str::WordEqual},
    CodeWord{OpCode::NotEqual, Str::WordNotEqual},
    CodeWord{OpCode::Like, Str::WordLike},
    CodeWord{OpCode::GreaterOrEqual, Str::WordGreaterOrEqual},
    CodeWord{OpCode::LessOrEqual, Str::WordLessOrEqual},
    CodeWord{OpCode::Greater, Str::WordGreater},
    CodeWord{OpCode::Less, Str::WordLess},
    CodeWord{OpCode::Null, Str::WordNull},
    CodeWord{OpCode::Sum, Str::WordSum},
    CodeWord{OpCode::Avg, Str::WordAvg},
    CodeWord{OpCode::Max, Str::WordMax},
    CodeWord{OpCode::Min, Str::WordMin},
    CodeWord{OpCode::Control, Str::WordControl},
    CodeWord{OpCode::Field, Str::WordField},
    CodeWord{OpCode::Number, Str::WordNumber},
    CodeWord{OpCode::Text, Str::WordText},
};

QString WordsOf(const ExprNode& node, bool hasOperands)
{
    const auto row = std::ranges::find(kWords, node.code, &CodeWord::code);
    if (row != kWords.end())
        return StringText(row->words, {node.text});
    if (node.function)
        return StringText(hasOperands ? Str::WordFunction : Str::WordFunctionAlone, {node.text});
    return StringText(Str::WordOther, {node.text});
}

void Describe(const ExprNode& node, int depth, QStringList& lines)
{
    if (depth > kDeepest)
        return;
    const auto put = [&lines](int indent, const QString& words) {
        lines += QString(indent * kIndent, u' ') + words;
    };
    if (node.negated)
        put(depth++, StringText(Str::WordNot));
    const bool isLeaf = node.kind == NodeKind::Operand;
    const std::span<const ExprTree> slots_ = node.function ? ArgumentSlots(node)
                                             : isLeaf      ? std::span<const ExprTree>()
                                                           : std::span<const ExprTree>(node.args).first(2);
    const bool hasOperands = std::ranges::any_of(slots_, [](const ExprTree& slot) { return slot != nullptr; });
    put(depth, WordsOf(node, hasOperands));
    if (node.function && !hasOperands)
        return;
    for (const ExprTree& slot : slots_) {
        if (slot)
            Describe(*slot, depth + 1, lines);
        else if (!node.function)
            put(depth + 1, StringText(Str::WordMissing));
    }
}

} // namespace

QStringList ExpressionInWords(const ExprNode& tree)
{
    QStringList lines;
    Describe(tree, 0, lines);
    return lines;
}

} // namespace mirel
