#include "forms/aggregate_pass.h"

#include "expr/evaluation.h"
#include "expr/function_library.h"
#include "resources/string_table.h"

#include <optional>

namespace mirel {
namespace {

// One aggregate on its way through the result.
class Accumulator {
public:
    explicit Accumulator(ExprNode& node)
        : node_(node)
        , argument_(node.args[1].get())
    {
    }

    ExprNode* Argument() const { return argument_; }

    void Add(EvalContext& context)
    {
        if (!argument_)
            return;
        EvaluateExpression(context, *argument_);
        if (argument_->null || argument_->suppressed)
            return;
        const bool first = count_++ == 0;
        const double number = argument_->valueNumber;
        sum_ += number;
        fieldType_ = argument_->fieldType;
        const bool isWord = argument_->isText && fieldType_ != FieldType::Date && fieldType_ != FieldType::YesNo;
        if (isWord)
            AddText(first);
        else if (first || (IsMax() ? number > extreme_ : number < extreme_))
            extreme_ = number;
    }

    void Finish()
    {
        if (count_ == 0)
            SetNull(node_);
        else if (node_.code == OpCode::Sum)
            SetNumber(node_, sum_);
        else if (node_.code == OpCode::Avg)
            SetNumber(node_, sum_ / double(count_));
        else if (extremeText_)
            KeepText();
        else if (fieldType_ == FieldType::Date)
            SetDate(node_, extreme_);
        else
            SetNumber(node_, extreme_);
    }

private:
    bool IsMax() const { return node_.code == OpCode::Max; }

    void AddText(bool first)
    {
        if (node_.code != OpCode::Min && node_.code != OpCode::Max)
            return;
        const QStringView text = TextOf(*argument_);
        const int order = first || !extremeText_ ? 0 : text.compare(*extremeText_);
        if (!extremeText_ || (IsMax() ? order > 0 : order < 0))
            extremeText_ = text.toString();
    }

    void KeepText()
    {
        node_.buffer.Assign(*extremeText_);
        KeepBuffer(node_);
    }

    ExprNode& node_;
    ExprNode* argument_;
    qint64 count_ = 0;
    double sum_ = 0;
    double extreme_ = 0;
    std::optional<QString> extremeText_;
    FieldType fieldType_ = FieldType::None;
};

// Whether the tree asks for the record's position: records then have to come in the result's order.
bool AsksForPosition(const ExprNode& node)
{
    if (node.function && node.function->name == u"RECNO")
        return true;
    for (const ExprTree& argument : node.args) {
        if (argument && AsksForPosition(*argument))
            return true;
    }
    return false;
}

bool Walk(DbRecordset& records, FormContext& context, UserPrompt& prompt, std::vector<Accumulator>& accumulators)
{
    constexpr qint64 kTellEvery = 1024;
    const qint64 count = records.RecordCount();
    RowContext rows(context, count);
    ReadRange range;
    range.order = ReadRange::Order::Any;
    for (const Accumulator& each : accumulators) {
        if (!each.Argument())
            continue;
        rows.Collect(*each.Argument());
        if (AsksForPosition(*each.Argument()))
            range.order = ReadRange::Order::Result;
    }
    range.fields = rows.Columns();
    if (range.fields.empty() && records.FieldCount() > 0)
        range.fields = {0}; // none would be all of them
    const std::unique_ptr<Progress> progress = prompt.StartProgress({Str::ComputingAggregates, {}}, count);
    qint64 done = 0;
    bool stopped = false;
    const bool read = records.Read(range, [&](std::span<const Cell> cells) {
        rows.Lend(done, cells);
        for (Accumulator& each : accumulators)
            each.Add(rows);
        stopped = ++done % kTellEvery == 0 && !progress->Advance(done);
        return !stopped;
    });
    return read && !stopped;
}

} // namespace

bool ComputeAggregates(DbRecordset& records, FormContext& context, UserPrompt& prompt,
                       std::span<ControlBinding> bindings)
{
    std::vector<Accumulator> accumulators;
    for (const ControlBinding& binding : bindings) {
        if (!binding.wholeResult)
            continue;
        for (const ControlBinding::Aggregate& aggregate : binding.aggregates) {
            SetNull(*aggregate.node);
            accumulators.emplace_back(*aggregate.node);
        }
    }
    if (accumulators.empty())
        return true;
    if (!Walk(records, context, prompt, accumulators))
        return false;
    for (Accumulator& each : accumulators)
        each.Finish();
    return true;
}

} // namespace mirel
