#include "provider/dialect/expression_parser.h"

#include <algorithm>
#include <utility>

namespace mirel::dialect {
namespace {

Operation BinaryOperation(Symbol symbol)
{
    switch (symbol) {
    case Symbol::Star:
        return Operation::Multiply;
    case Symbol::Slash:
        return Operation::Divide;
    case Symbol::Percent:
        return Operation::Remainder;
    case Symbol::Plus:
        return Operation::Add;
    case Symbol::Minus:
        return Operation::Subtract;
    case Symbol::Ampersand:
        return Operation::Join;
    case Symbol::Bars:
        return Operation::Concat;
    case Symbol::Equal:
        return Operation::Equal;
    case Symbol::NotEqual:
        return Operation::NotEqual;
    case Symbol::Less:
        return Operation::Less;
    case Symbol::LessEqual:
        return Operation::LessEqual;
    case Symbol::Greater:
        return Operation::Greater;
    case Symbol::GreaterEqual:
        return Operation::GreaterEqual;
    case Symbol::None:
    case Symbol::Open:
    case Symbol::Close:
    case Symbol::Comma:
    case Symbol::Point:
    case Symbol::Semicolon:
        break;
    }
    return Operation::Null;
}

void Negate(QString& number)
{
    if (number.startsWith(u'-'))
        number.remove(0, 1);
    else
        number.prepend(u'-');
}

} // namespace

bool ExpressionParser::Parse(Expr& expression)
{
    operands_.clear();
    pending_.clear();
    wantsOperand_ = true;
    for (bool more = true; more;) {
        if (!(wantsOperand_ ? ReadOperand() : ReadOperator(more)))
            return false;
    }
    if (!Reduce(Binding::None))
        return false;
    if (!pending_.empty()) // a parenthesis never closed, a BETWEEN without its AND
        return cursor_.Fail();
    expression = std::move(operands_.back());
    return true;
}

bool ExpressionParser::PushLeaf(Operation operation, QString text, QString table)
{
    Expr& leaf = operands_.emplace_back();
    leaf.operation = operation;
    leaf.place = {cursor_.Current().begin, cursor_.Current().end};
    leaf.text = std::move(text);
    leaf.table = std::move(table);
    cursor_.Advance();
    wantsOperand_ = false;
    return true;
}

bool ExpressionParser::ReadOperand()
{
    const Token& token = cursor_.Current();
    const Place place{token.begin, token.end};
    switch (token.kind) {
    case TokenKind::Number:
        return PushLeaf(Operation::Number, token.text.toString());
    case TokenKind::Text:
        return PushLeaf(Operation::Text, token.Text());
    case TokenKind::Name:
    case TokenKind::BracketedName:
        return ReadName();
    case TokenKind::Symbol:
        break;
    case TokenKind::End:
    case TokenKind::Fault:
        return cursor_.Fail();
    }
    if (cursor_.Take(Symbol::Plus))
        return true;
    if (cursor_.Take(Symbol::Minus))
        pending_.push_back({Pending::Kind::Operator, Operation::Negate, 1, false, nullptr, place});
    else if (cursor_.Take(Symbol::Open))
        pending_.push_back({Pending::Kind::Group, Operation::Null, 0, false, nullptr, place});
    else
        return cursor_.Fail();
    return true;
}

bool ExpressionParser::ReadName()
{
    const Token token = cursor_.Current();
    const Place place{token.begin, token.end};
    if (token.keyword == Keyword::Null)
        return PushLeaf(Operation::Null);
    if (token.keyword == Keyword::True)
        return PushLeaf(Operation::True);
    if (token.keyword == Keyword::False)
        return PushLeaf(Operation::False);
    cursor_.Advance();
    if (token.keyword == Keyword::Not) {
        pending_.push_back({Pending::Kind::Operator, Operation::Not, 1, false, nullptr, place});
        return true;
    }
    if (token.kind == TokenKind::Name && cursor_.At(Symbol::Open)) {
        const FunctionDef* function = FindFunction(token.text);
        return function ? ReadCall(*function, place) : cursor_.Fail();
    }
    if (token.keyword != Keyword::None)
        return cursor_.Fail({token.begin, token.end});
    Expr& column = operands_.emplace_back();
    column.operation = Operation::Column;
    column.text = token.Text();
    column.place = place;
    wantsOperand_ = false;
    if (!cursor_.Take(Symbol::Point))
        return true;
    column.table = std::exchange(column.text, {});
    column.place.end = cursor_.Current().end;
    return cursor_.ExpectName(column.text);
}

bool ExpressionParser::ReadCall(const FunctionDef& function, Place place)
{
    cursor_.Advance();
    Pending call{Pending::Kind::Call, Operation::Call, 0, false, &function, place};
    if (cursor_.At(Symbol::Close)) {
        cursor_.Advance();
        return CloseCall(call);
    }
    if (function.function == Function::Count && cursor_.At(Symbol::Star)) {
        PushLeaf(Operation::AllColumns);
        call.operands = 1;
        return cursor_.Expect(Symbol::Close) && CloseCall(call);
    }
    call.distinct = function.isAggregate && cursor_.Take(Keyword::Distinct);
    pending_.push_back(call);
    return true;
}

bool ExpressionParser::ReadOperator(bool& more)
{
    if (cursor_.At(Symbol::Close))
        return Close(more);
    if (cursor_.At(Symbol::Comma))
        return ReadComma(more);
    if (cursor_.Current().kind == TokenKind::Name)
        return ReadWordOperator(more);
    const Operation operation = BinaryOperation(cursor_.Current().symbol);
    more = operation != Operation::Null;
    return !more || PushBinary(operation);
}

bool ExpressionParser::ReadWordOperator(bool& more)
{
    switch (cursor_.Current().keyword) {
    case Keyword::Or:
        return PushBinary(Operation::Or);
    case Keyword::And:
        // The AND of a BETWEEN stands right behind its first bound.
        if (!Reduce(Binding::Text))
            return false;
        if (pending_.empty() || pending_.back().kind != Pending::Kind::Between)
            return PushBinary(Operation::And);
        pending_.back().kind = Pending::Kind::Operator;
        cursor_.Advance();
        wantsOperand_ = true;
        return true;
    case Keyword::Not:
        return ReadNegated();
    case Keyword::Like:
        return PushBinary(Operation::Like);
    case Keyword::In:
        return ReadList(Operation::In);
    case Keyword::Between:
        return ReadBetween(Operation::Between);
    case Keyword::Is:
        return ReadIs();
    default: // a word that no expression goes on with
        more = false;
        return true;
    }
}

bool ExpressionParser::ReadIs()
{
    if (!Reduce(Binding::Comparison))
        return false;
    const Place place{cursor_.Current().begin, cursor_.Current().end};
    cursor_.Advance();
    const bool negated = cursor_.Take(Keyword::Not);
    Operation operation{};
    if (cursor_.Take(Keyword::Null))
        operation = negated ? Operation::IsNotNull : Operation::IsNull;
    else if (cursor_.Take(Keyword::True))
        operation = negated ? Operation::IsNotTrue : Operation::IsTrue;
    else if (cursor_.Take(Keyword::False))
        operation = negated ? Operation::IsNotFalse : Operation::IsFalse;
    else
        return cursor_.Fail();
    return Combine(operation, 1, place);
}

// NOT LIKE, NOT IN, NOT BETWEEN, and "not =" as the filter dialog writes it.
bool ExpressionParser::ReadNegated()
{
    cursor_.Advance();
    if (cursor_.At(Keyword::Like))
        return PushBinary(Operation::NotLike);
    if (cursor_.At(Symbol::Equal))
        return PushBinary(Operation::NotEqual);
    if (cursor_.At(Keyword::In))
        return ReadList(Operation::NotIn);
    return cursor_.At(Keyword::Between) ? ReadBetween(Operation::NotBetween) : cursor_.Fail();
}

bool ExpressionParser::ReadBetween(Operation operation)
{
    if (!PushBinary(operation))
        return false;
    pending_.back().kind = Pending::Kind::Between;
    pending_.back().operands = 3;
    return true;
}

bool ExpressionParser::ReadList(Operation operation)
{
    if (!Reduce(Binding::Comparison))
        return false;
    const Place place{cursor_.Current().begin, cursor_.Current().end};
    cursor_.Advance();
    if (!cursor_.Expect(Symbol::Open))
        return false;
    pending_.push_back({Pending::Kind::List, operation, 1, false, nullptr, place});
    wantsOperand_ = true;
    return true;
}

bool ExpressionParser::ReadComma(bool& more)
{
    if (!Reduce(Binding::None))
        return false;
    const bool inList = !pending_.empty() && (pending_.back().kind == Pending::Kind::Call ||
                                              pending_.back().kind == Pending::Kind::List);
    if (!inList) {
        more = false;
        return true;
    }
    ++pending_.back().operands;
    cursor_.Advance();
    wantsOperand_ = true;
    return true;
}

bool ExpressionParser::Close(bool& more)
{
    if (!Reduce(Binding::None))
        return false;
    if (pending_.empty()) {
        more = false;
        return true;
    }
    Pending closed = pending_.back();
    if (closed.kind == Pending::Kind::Between)
        return cursor_.Fail();
    pending_.pop_back();
    cursor_.Advance();
    if (closed.kind == Pending::Kind::Group)
        return true;
    ++closed.operands;
    return closed.kind == Pending::Kind::Call ? CloseCall(closed)
                                              : Combine(closed.operation, closed.operands, closed.place);
}

bool ExpressionParser::CloseCall(Pending call)
{
    if (call.operands < call.function->minArguments || call.operands > call.function->maxArguments)
        return cursor_.Fail(call.place);
    if (!Combine(Operation::Call, call.operands, call.place))
        return false;
    operands_.back().function = call.function->function;
    operands_.back().distinct = call.distinct;
    wantsOperand_ = false;
    return true;
}

bool ExpressionParser::PushBinary(Operation operation)
{
    if (!Reduce(BindingOf(operation)))
        return false;
    const Place place{cursor_.Current().begin, cursor_.Current().end};
    pending_.push_back({Pending::Kind::Operator, operation, 2, false, nullptr, place});
    cursor_.Advance();
    wantsOperand_ = true;
    return true;
}

bool ExpressionParser::Reduce(Binding binding)
{
    while (!pending_.empty() && pending_.back().kind == Pending::Kind::Operator &&
           BindingOf(pending_.back().operation) >= binding) {
        const Pending top = pending_.back();
        pending_.pop_back();
        if (!Apply(top))
            return false;
    }
    return true;
}

bool ExpressionParser::Apply(const Pending& pending)
{
    if (pending.operation == Operation::And || pending.operation == Operation::Or)
        return ApplyChain(pending.operation);
    if (pending.operation == Operation::Negate && operands_.back().operation == Operation::Number) {
        Negate(operands_.back().text);
        return true;
    }
    return Combine(pending.operation, pending.operands, pending.place);
}

// "a AND b AND c" is one node with three arguments, however it was put in parentheses.
bool ExpressionParser::ApplyChain(Operation operation)
{
    Expr right = std::move(operands_.back());
    operands_.pop_back();
    Expr& left = operands_.back();
    if (left.operation != operation) {
        Expr chain;
        chain.operation = operation;
        chain.place = left.place;
        chain.depth = left.depth + 1;
        chain.arguments.push_back(std::move(left));
        left = std::move(chain);
    }
    if (right.operation == operation) {
        left.depth = std::max(left.depth, right.depth);
        left.arguments.splice(left.arguments.end(), right.arguments);
    } else {
        left.depth = std::max(left.depth, right.depth + 1);
        left.arguments.push_back(std::move(right));
    }
    return left.depth <= kMaxDepth || cursor_.FailTooDeep(left.place.begin);
}

bool ExpressionParser::Combine(Operation operation, int count, Place place)
{
    Expr combined;
    combined.operation = operation;
    combined.place = place;
    const auto first = operands_.end() - count;
    for (auto operand = first; operand != operands_.end(); ++operand) {
        combined.depth = std::max(combined.depth, operand->depth + 1);
        combined.arguments.push_back(std::move(*operand));
    }
    operands_.erase(first, operands_.end());
    operands_.push_back(std::move(combined));
    return operands_.back().depth <= kMaxDepth || cursor_.FailTooDeep(place.begin);
}

} // namespace mirel::dialect
