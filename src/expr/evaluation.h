#pragma once

#include "expr/evaluator.h"
#include "expr/text_buffer.h"

#include <cmath>
#include <optional>

namespace mirel {

// One run over a tree; for the operators and functions of the language only.
//
// The texts that one run makes share a limit, so that no expression can use up the memory, however it nests
// REPLACE. Beyond the limit the result is null.
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

// Whether an evaluated node holds as a condition: a number other than 0 does.
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

// Null for infinity and for what is not a number.
inline void SetNumber(ExprNode& node, double number)
{
    node.null = !std::isfinite(number);
    node.isText = false;
    node.fieldType = FieldType::None;
    node.valueNumber = number + 0.0; // -0 becomes 0
    node.wholeNumber = 0;
}

// An integer with all of its digits, for the text that shows it; expressions calculate with the rounded number.
inline void SetWholeNumber(ExprNode& node, qint64 number)
{
    constexpr qint64 kExact = qint64(1) << 53;
    SetNumber(node, double(number));
    if (number < -kExact || number > kExact)
        node.wholeNumber = number;
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

// Null for days outside the calendar.
void SetDate(ExprNode& node, std::optional<double> oleDays);

// Makes the text in the node's buffer its value.
inline void KeepBuffer(ExprNode& node)
{
    SetText(node, node.buffer.View());
}

// Moves the text of an evaluated child into the node's buffer if the child computed it itself and so no longer
// needs it. False, with the buffer unchanged, for a text that lives elsewhere.
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
