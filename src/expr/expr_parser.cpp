#include "expr/expr_parser.h"

#include "expr/expr_number.h"
#include "expr/function_library.h"
#include "expr/operators.h"

#include <algorithm>
#include <functional>
#include <utility>

namespace mirel {
namespace {

// Both bound the height of trees, which are walked by recursion.
constexpr int kMaxTokens = 4000;
constexpr int kMaxNesting = 200;

// What a stretch of tokens began with, which says what ends it.
enum class LevelStart {
    Text,        // the whole expression or one argument: its end, or a ")" that closes nothing
    Parenthesis, // its ")"
    Condition,   // one side of AND and OR: the next of them
    Where,       // the condition of WHERE: the end of the enclosing level
};

// A stretch of tokens with the tree built from it so far.
struct Level {
    LevelStart start;
    ExprTree root;
    ExprNode* last = nullptr;            // the last node hung; null behind a group, a NOT and what was left out
    std::optional<qsizetype> pendingNot; // its position
};

bool IsHigher(const ExprNode& node) // binds more tightly than + and -
{
    return node.code != OpCode::Add && node.code != OpCode::Subtract;
}

bool IsConditionNode(const ExprNode& node)
{
    return node.kind == NodeKind::Condition;
}

bool TakesManyArguments(const ExprNode& node)
{
    return node.kind == NodeKind::ThreeArguments || node.kind == NodeKind::FourArguments;
}

void MakeNumber(ExprNode& node, double number)
{
    node.code = OpCode::Number;
    node.constant = true;
    SetNumber(node, number);
}

void MakeOperand(ExprNode& node, const QString& token)
{
    node.kind = NodeKind::Operand;
    if (token.startsWith(u'&')) {
        node.code = OpCode::Control;
        node.evaluate = EvaluateControl;
        node.text = TrimmedSpaces(BareName(token.sliced(1))).toString();
    } else if (token.startsWith(u'\'') || token.startsWith(u'"')) {
        node.code = OpCode::Text;
        node.text = token.sliced(1).chopped(token.size() > 1 ? 1 : 0);
        SetText(node, node.text);
    } else if (IsWord(token, u"TRUE") || IsWord(token, u"FALSE")) {
        node.text = token;
        MakeNumber(node, IsWord(token, u"TRUE") ? 1 : 0);
    } else if (const double number = LeadingDecimal(token); number != 0 || token.startsWith(u'0')) {
        node.text = token;
        MakeNumber(node, number);
    } else {
        node.code = OpCode::Field;
        node.evaluate = EvaluateField;
        node.text = TrimmedSpaces(token).toString();
    }
}

void MakeOperator(ExprNode& node, const OperatorDef& def)
{
    node.kind = def.kind;
    node.code = def.code;
    node.evaluate = def.evaluate;
    node.null = def.code == OpCode::Null;
    node.text = QStringView(def.text.data(), qsizetype(def.text.size())).toString();
}

void MakeFunction(ExprNode& node, const FunctionDef& def)
{
    node.kind = def.kind;
    node.code = OpCode{def.code};
    node.function = &def;
    node.evaluate = def.evaluate ? EvaluateFunction : nullptr;
    node.null = !def.evaluate; // until its value comes from outside
    node.text = QStringView(def.name.data(), qsizetype(def.name.size())).toString();
}

// Puts a node into the first empty one of the places. Takes it only then.
bool FillFirstEmpty(std::span<ExprTree> places, ExprTree& node)
{
    const auto place = std::ranges::find_if(places, std::logical_not<>());
    if (place == places.end())
        return false;
    *place = std::move(node);
    return true;
}

class Parser {
public:
    Parser(QStringView text, ExprMode mode, std::vector<ParseLoss>* losses)
        : text_(text)
        , mode_(mode)
        , losses_(losses)
    {
    }

    ExprTree Parse()
    {
        ExprTree root = ParseLevel(LevelStart::Text);
        if (!refused_)
            return root;
        if (losses_)
            *losses_ = {{ParseLoss::Reason::TooLong, {}, position_}};
        return nullptr;
    }

private:
    using Reason = ParseLoss::Reason;

    // ---- Stretches of tokens

    ExprTree ParseLevel(LevelStart start)
    {
        Level level{.start = start, .root = nullptr, .last = nullptr, .pendingNot = {}};
        refused_ = refused_ || ++nesting_ > kMaxNesting;
        while (!refused_) {
            const qsizetype before = position_;
            const std::optional<ExprToken> token = NextExpressionToken(text_, position_, mode_);
            if (!token || EndsLevel(*token, start, before))
                break;
            refused_ = ++tokens_ > kMaxTokens;
            Place(*token, level);
        }
        --nesting_;
        if (level.pendingNot)
            Lose(Reason::LostNot, QStringLiteral("NOT"), *level.pendingNot);
        return std::move(level.root);
    }

    // Goes back to `before` where the token belongs to a level further out.
    bool EndsLevel(const ExprToken& token, LevelStart start, qsizetype before)
    {
        if (token.text == u')') {
            if (start == LevelStart::Condition || start == LevelStart::Where)
                position_ = before;
            if (start == LevelStart::Text)
                LoseRest(token.position);
            return true;
        }
        if (start != LevelStart::Condition || !(IsWord(token.text, u"AND") || IsWord(token.text, u"OR")))
            return false;
        position_ = before;
        return true;
    }

    // An argument, which ends at `end` whatever it holds.
    ExprTree ParsePiece(qsizetype end)
    {
        const QStringView whole = std::exchange(text_, text_.first(end));
        ExprTree piece = ParseLevel(LevelStart::Text);
        text_ = whole;
        return piece;
    }

    // From the function's "(" to behind its ")". The last argument goes into the first place that is still empty.
    void ParseArguments(ExprNode& function)
    {
        ++position_;
        const std::span<ExprTree> places = ArgumentSlots(function);
        for (ExprTree& place : places.first(places.size() - 1)) {
            const qsizetype end = FindArgumentEnd(text_, position_);
            if (end < 0 || text_[end] == u')')
                break;
            place = ParsePiece(end);
            position_ = end + 1;
        }
        const qsizetype end = FindClosingParenthesis(text_, position_);
        ExprTree piece = ParsePiece(end < 0 ? text_.size() : end);
        if (piece)
            FillFirstEmpty(places, piece);
        position_ = end < 0 ? text_.size() : end + 1;
    }

    // ---- Tokens into nodes

    ExprTree Classify(const ExprToken& token) const
    {
        auto node = std::make_unique<ExprNode>();
        node->position = token.position;
        const bool called = position_ < text_.size() && text_[position_] == u'(';
        const OperatorDef* def = FindArithmeticOperator(token.text);
        if (!def && mode_ == ExprMode::Condition)
            def = FindConditionWord(token.text);
        const FunctionDef* function = !def && called ? FindFunction(token.text) : nullptr;
        if (def)
            MakeOperator(*node, *def);
        else if (function)
            MakeFunction(*node, *function);
        else
            MakeOperand(*node, token.text);
        return node;
    }

    // ---- Nodes into the tree

    void Place(const ExprToken& token, Level& level)
    {
        ExprTree node = Classify(token);
        if (node->kind == NodeKind::OpenParenthesis)
            PlaceGroup(level, token.position);
        else if (node->kind == NodeKind::Operand)
            PlaceOperand(level, std::move(node));
        else if (node->kind == NodeKind::Condition)
            PlaceCondition(level, std::move(node));
        else if (IsArithmetic(*node))
            PlaceOperator(level, std::move(node));
        else
            PlaceFunction(level, std::move(node));
    }

    void PlaceGroup(Level& level, qsizetype position)
    {
        ExprTree group = ParseLevel(LevelStart::Parenthesis);
        ExprNode* const last = std::exchange(level.last, nullptr);
        if (!group)
            return;
        group->parenthesised = true;
        if (level.pendingNot) {
            group->negated = true;
            level.pendingNot.reset();
        }
        if (last && (IsArithmetic(*last) || IsConditionNode(*last) || TakesManyArguments(*last)))
            Replace(last->args[1], std::move(group));
        else if (!level.root)
            level.root = std::move(group);
        else
            LoseFrom(position);
    }

    void PlaceOperand(Level& level, ExprTree node)
    {
        if (node->code == OpCode::Field && level.last && level.last->code == OpCode::Field) {
            level.last->text += node->text; // adjacent names are one name
            return;
        }
        Hang(level, std::move(node));
    }

    void PlaceFunction(Level& level, ExprTree node)
    {
        ParseArguments(*node);
        const bool one = node->kind == NodeKind::OneArgument;
        ExprNode* const last = level.last;
        ExprNode* const root = level.root.get();
        if (one && last && (last->kind == NodeKind::TwoArguments || IsConditionNode(*last))) {
            level.last = node.get();
            Replace(last->args[1], std::move(node));
        } else if (!one && root && root->kind == NodeKind::OneArgument) {
            level.last = node.get();
            Replace(root->args[1], std::move(node));
        } else {
            Hang(level, std::move(node));
        }
    }

    // Two levels of precedence: an operator takes all before it as its left operand, but for a higher one behind
    // + or -, which takes the right operand away from it. A group is never taken apart.
    void PlaceOperator(Level& level, ExprTree node)
    {
        if (!level.root && node->code != OpCode::Subtract) {
            Drop(level, *node);
            return;
        }
        level.last = node.get();
        ExprNode* const root = level.root.get();
        const bool open = root && IsArithmetic(*root) && !root->parenthesised;
        const bool takesRight = open && IsHigher(*node) && !IsHigher(*root);
        ExprTree& place = takesRight ? root->args[1] : level.root;
        node->args[0] = std::move(place);
        place = std::move(node);
    }

    void PlaceCondition(Level& level, ExprTree node)
    {
        if (node->code == OpCode::Not) {
            PlaceNot(level, node->position);
            return;
        }
        level.last = node.get();
        node->args[0] = std::move(level.root);
        if (node->code == OpCode::Where) {
            node->args[1] = ParseLevel(LevelStart::Where);
        } else if (node->code == OpCode::And || node->code == OpCode::Or) {
            node->args[1] = ParseRightSide();
        } else {
            node->negated = level.pendingNot.has_value();
            level.pendingNot.reset();
        }
        level.root = std::move(node);
    }

    void PlaceNot(Level& level, qsizetype position)
    {
        level.last = nullptr;
        if (level.root && level.root->code == OpCode::Equal)
            level.root->negated = !level.root->negated; // IS NOT NULL
        else if (level.pendingNot)
            level.pendingNot.reset();
        else
            level.pendingNot = position;
    }

    // Of AND and OR: a group, or all up to the next of them, so that both group from the left.
    ExprTree ParseRightSide()
    {
        position_ = SkipExpressionBlanks(text_, position_);
        if (position_ >= text_.size() || text_[position_] != u'(')
            return ParseLevel(LevelStart::Condition);
        ++position_;
        return ParseLevel(LevelStart::Parenthesis);
    }

    // Hangs an operand or a function into the first free place of the root.
    void Hang(Level& level, ExprTree node)
    {
        ExprNode* const hung = node.get();
        if (!level.root)
            level.root = std::move(node);
        else if (!FillFirstEmpty(FreePlaces(*level.root), node)) {
            Drop(level, *node);
            return;
        }
        level.last = hung;
    }

    static std::span<ExprTree> FreePlaces(ExprNode& root)
    {
        if (TakesManyArguments(root))
            return ArgumentSlots(root);
        if (!IsArithmetic(root) && !IsConditionNode(root))
            return {};
        const std::span<ExprTree> sides = std::span(root.args).first(2);
        ExprNode* const right = sides[1].get();
        const bool tookRight =
            IsArithmetic(root) && sides[0] && right && IsArithmetic(*right) && !right->parenthesised;
        return tookRight ? std::span(right->args).subspan(1, 1) : sides;
    }

    void Replace(ExprTree& place, ExprTree node)
    {
        if (place)
            Lose(Reason::Replaced, place->text, place->position);
        place = std::move(node);
    }

    // ---- What is left out

    void Drop(Level& level, const ExprNode& node)
    {
        level.last = nullptr;
        LoseFrom(node.position);
    }

    void LoseFrom(qsizetype position)
    {
        Lose(Reason::NoPlace, text_.sliced(position, position_ - position).toString(), position);
    }

    void LoseRest(qsizetype position)
    {
        position_ = text_.size();
        Lose(Reason::AfterTheEnd, text_.sliced(position).toString(), position);
    }

    void Lose(Reason reason, QString text, qsizetype position)
    {
        if (losses_)
            losses_->push_back({reason, std::move(text), position});
    }

    QStringView text_; // up to the end of the piece that is being parsed
    ExprMode mode_;
    std::vector<ParseLoss>* losses_;
    qsizetype position_ = 0;
    int nesting_ = 0;
    int tokens_ = 0;
    bool refused_ = false;
};

} // namespace

ExprTree ParseExpression(QStringView text, ExprMode mode, std::vector<ParseLoss>* losses)
{
    return Parser(text, mode, losses).Parse();
}

} // namespace mirel
