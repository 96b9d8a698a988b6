#pragma once

#include "expr/evaluator.h"
#include "expr/text_buffer.h"

#include <cmath>
#include <optional>

namespace mirel {

// One run over a tree; for the operators and functions of the language only.
//
// The texts that a run makes are limited all together, so that no expression, however it nests REPLACE, can use
// up the memory: what goes beyond is null.
struct Evaluation {
    EvalContext& context;
    qint64 unitsLeft = qint64(1) << 26; // UTF-16 units

    bool Afford(qsizetype units)
    {
        unitsLeft -= units;
        return unitsLeft >= 0;
    }
};

using Evaluator = void (*)(ExprNode& node, Evaluation& evaluation);

inline void Evaluate(ExprNode& node, Evaluation& evaluation)
{
    if (node.evaluate)
        node.evaluate(node, evaluation);
}

// Whether an evaluated node holds where a condition is wanted: a number other than 0.
inline bool Holds(const ExprNode& node)
{
    if (node.null || node.isText)
        return false;
    const bool holds = node.valueNumber != 0;
    return node.kind == NodeKind::Condition ? holds : holds != node.negated;
}

inline void SetNull(ExprNode& node)
{
    node.null = true;
    node.fieldType = FieldType::None;
}

// What is no number, or beyond all numbers, is null.
inline void SetNumber(ExprNode& node, double number)
{
    node.null = !std::isfinite(number);
    node.isText = false;
    node.fieldType = FieldType::None;
    node.valueNumber = number + 0.0; // -0 becomes 0
}

// From here on a double has no number of its own for each whole one: a field's stands in its node's buffer, to the
// last digit.
inline constexpr double kBeyondDoubles = 9007199254740992.0;

inline bool HasDigitsInBuffer(const ExprNode& node)
{
    return node.code == OpCode::Field && std::abs(node.valueNumber) >= kBeyondDoubles && !node.buffer.View().isEmpty();
}

// `text` must outlive the evaluation.
inline void SetText(ExprNode& node, QStringView text)
{
    node.null = false;
    node.isText = true;
    node.dateTextDue = false;
    node.fieldType = FieldType::None;
    node.valueNumber = 0;
    node.valueText = text;
}

// Null for days outside of the calendar.
void SetDate(ExprNode& node, std::optional<double> oleDays);

// Makes what stands in the node's buffer its value.
inline void KeepBuffer(ExprNode& node)
{
    SetText(node, node.buffer.View());
}

// Moves the text of an evaluated child into the node's buffer where the child computed it itself: it has no more
// use for it. False, and the buffer as it was, for a text that stands elsewhere.
inline bool TakeBuffer(ExprNode& node, ExprNode& child)
{
    const QStringView text = TextOf(child);
    const QStringView own = child.buffer.View();
    if (!child.evaluate || text.data() != own.data() || text.size() != own.size())
        return false;
    node.buffer.Swap(child.buffer);
    return true;
}

} // namespace mirel
