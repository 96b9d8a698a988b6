#pragma once

#include "expr/text_buffer.h"
#include "platform/field_type.h"

#include <QString>
#include <QStringView>

#include <array>
#include <memory>
#include <span>

namespace mirel {

struct Evaluation;
struct ExprNode;
struct FunctionDef;

// The numbers of kinds and codes are the language's own: never renumber.
enum class NodeKind : int {
    OneArgument = 1,  // function; its argument is arg2
    TwoArguments = 2, // arithmetic operator (code below 101) or function of two arguments
    ThreeArguments = 3,
    OpenParenthesis = 5,
    CloseParenthesis = 6,
    Operand = 7,
    FourArguments = 8,
    Condition = 9,
};

enum class OpCode : int {
    None = 0,
    Add = 1,
    Subtract = 2,
    Multiply = 3,
    Divide = 4,
    Power = 5,
    OpenParenthesis = 6,
    CloseParenthesis = 7,
    Remainder = 8,
    Where = 50,
    And = 51,
    Or = 52,
    Equal = 53,
    NotEqual = 54,
    Like = 55,
    GreaterOrEqual = 56,
    LessOrEqual = 57,
    Greater = 58,
    Less = 59,
    Not = 60,
    Null = 61,
    Sum = 109, // functions start at 101; only those used outside their table row have names here
    Avg = 110,
    Max = 111,
    Min = 112,
    SysTime = 118,
    SysDate = 128,
    SysDateTime = 139,
    Control = 553,
    Field = 554,
    Number = 555,
    Text = 556,
};

using ExprTree = std::unique_ptr<ExprNode>;

// One node of a parsed expression; it owns its children, so destroying the root destroys the tree. Made by
// ParseExpression, evaluated in place by EvaluateExpression as often as needed.
struct ExprNode {
    // The value that the last evaluation left. A number has isText false. A text has isText true and
    // valueNumber 0. A date has isText true, fieldType Date and its day number in valueNumber; a Yes/No field
    // is a text too, with 0 or 1 in valueNumber. With `null` set the rest is meaningless.
    bool isText = false;
    bool null = false;
    bool suppressed = false; // the condition of WHERE did not hold

    bool parenthesised = false; // in parentheses: no later operator takes it apart
    bool negated = false;       // NOT
    bool constant = false;      // a number that never changes
    bool dateTextDue = false;   // valueText of a date is made on demand, see TextOf
    NodeKind kind = NodeKind::Operand;
    OpCode code = OpCode::None;
    FieldType fieldType = FieldType::None; // of a field; Date for dates
    double valueNumber = 0;
    // The digits of a number that `valueNumber` rounds: an integer field's beyond 53 bits. 0 for every other
    // value.
    qint64 wholeNumber = 0;

    // Points into this node, into a child or into what the context lends: valid until the next evaluation.
    QStringView valueText;

    // Computes the value; null where the value is fixed (literals, aggregates).
    void (*evaluate)(ExprNode& node, Evaluation& evaluation) = nullptr;
    const FunctionDef* function = nullptr;

    // The column of a field name, resolved once for each set of columns; -1: no such field.
    int column = -1;
    FieldType columnType = FieldType::None;
    quint64 columnsId = 0;

    std::array<ExprTree, 4> args; // arg1 to arg4

    TextBuffer buffer;      // texts that the node itself computes
    QString text;           // name, content of a literal, or the spelling in upper case
    qsizetype position = 0; // of the token in the expression, from 0
};

inline bool IsArithmetic(const ExprNode& node)
{
    return node.kind == NodeKind::TwoArguments && int(node.code) < 101;
}

// The slots of a function's arguments, in order. Empty for other nodes.
std::span<ExprTree> ArgumentSlots(ExprNode& node);
std::span<const ExprTree> ArgumentSlots(const ExprNode& node);

// Appends the tree for diagnostics: each node as "{ " left text right " }".
void DumpExpression(const ExprNode* root, QString& out);

} // namespace mirel
