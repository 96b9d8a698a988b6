#pragma once

#include "expr/evaluation.h"

#include <string_view>

namespace mirel {

// An operator, or a word of conditions. Words are in upper case.
struct OperatorDef {
    std::u16string_view text;
    NodeKind kind;
    OpCode code;
    Evaluator evaluate;
};

std::span<const OperatorDef> ArithmeticOperators(); // with both parentheses
std::span<const OperatorDef> ConditionWords();

// By the spelling, in any case; null: unknown.
const OperatorDef* FindArithmeticOperator(QStringView token);
const OperatorDef* FindConditionWord(QStringView token);

// How operands and functions are evaluated.
void EvaluateField(ExprNode& node, Evaluation& evaluation);
void EvaluateControl(ExprNode& node, Evaluation& evaluation);
void EvaluateFunction(ExprNode& node, Evaluation& evaluation);

// Whether `token` is `word`, which is in upper case, without regard to the case of ASCII letters.
bool IsWord(QStringView token, std::u16string_view word);

// Without spaces at both ends. In names and control texts no other white space counts as a blank.
QStringView TrimmedSpaces(QStringView text);

} // namespace mirel
