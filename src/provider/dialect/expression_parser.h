#pragma once

#include "provider/dialect/token_cursor.h"
#include "provider/dialect/tree.h"

#include <vector>

namespace mirel::dialect {

// Reads one expression, up to the first token that cannot belong to it. Works on a stack of its own, not by
// recursion: conditions that were wrapped in parentheses thousands of times are nothing special.
class ExpressionParser {
public:
    // The cursor must outlive the parser.
    explicit ExpressionParser(TokenCursor& cursor)
        : cursor_(cursor)
    {
    }

    [[nodiscard]] bool Parse(Expr& expression);

private:
    // What waits for its last operand, or for its ")".
    struct Pending {
        enum class Kind : quint8 { Operator, Group, Call, List, Between };

        Kind kind;
        Operation operation = Operation::Null;
        int operands = 0; // that have been read, or for an operator: that it takes
        bool distinct = false;
        const FunctionDef* function = nullptr;
        Place place;
    };

    bool ReadOperand();
    bool ReadName();
    bool ReadCall(const FunctionDef& function, Place place);
    bool ReadOperator(bool& more);
    bool ReadWordOperator(bool& more);
    bool ReadIs();
    bool ReadNegated();
    bool ReadBetween(Operation operation);
    bool ReadList(Operation operation);
    bool ReadComma(bool& more);
    bool Close(bool& more);
    bool CloseCall(Pending call);
    bool PushBinary(Operation operation);
    bool Reduce(Binding binding); // applies what binds at least as tightly
    bool Apply(const Pending& pending);
    bool ApplyChain(Operation operation);
    bool Combine(Operation operation, int count, Place place);
    bool PushLeaf(Operation operation, QString text = {}, QString table = {});

    TokenCursor& cursor_;
    std::vector<Expr> operands_;
    std::vector<Pending> pending_;
    bool wantsOperand_ = true;
};

} // namespace mirel::dialect
