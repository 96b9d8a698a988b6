#include "forms/form_context.h"

#include "provider/cell_value.h"

#include "platform/ole_date.h"

#include <algorithm>
#include <utility>

namespace mirel {
namespace {

// In front of a field's name in a tree: the field's number is meant, not its word. Columns so found are numbered
// behind those of the result.
constexpr QChar kAsNumber{1};

bool IsOrderComparison(OpCode code)
{
    switch (code) {
    case OpCode::Equal:
    case OpCode::NotEqual:
    case OpCode::Less:
    case OpCode::LessOrEqual:
    case OpCode::Greater:
    case OpCode::GreaterOrEqual:
        return true;
    default:
        return false;
    }
}

} // namespace

void CompareYesNoAsNumber(ExprNode& tree)
{
    if (tree.kind == NodeKind::Condition && IsOrderComparison(tree.code) && tree.args[0] && tree.args[1]) {
        for (size_t side : {0, 1}) {
            ExprNode& field = *tree.args[side];
            if (field.code == OpCode::Field && tree.args[1 - side]->code == OpCode::Number)
                field.text.prepend(kAsNumber);
        }
    }
    for (const ExprTree& argument : tree.args) {
        if (argument)
            CompareYesNoAsNumber(*argument);
    }
}

FormContext::FormContext(DbRecordset& records, YesNoWords words, ControlTexts controlTexts, Clock clock)
    : RecordContext(records, std::move(words), std::move(controlTexts))
    , records_(records)
    , clock_(std::move(clock))
{
}

int FormContext::FindColumn(QStringView name)
{
    if (!name.startsWith(kAsNumber))
        return RecordContext::FindColumn(name);
    const int column = RecordContext::FindColumn(name.sliced(1));
    return column >= 0 && RecordContext::TypeOfColumn(column) == FieldType::YesNo ? column + records_.FieldCount()
                                                                                  : column;
}

FieldType FormContext::TypeOfColumn(int column)
{
    return column < records_.FieldCount() ? RecordContext::TypeOfColumn(column) : FieldType::Integer;
}

const Value& FormContext::FieldValue(int column)
{
    const int count = records_.FieldCount();
    return RecordContext::FieldValue(column < count ? column : column - count);
}

RowContext::RowContext(FormContext& form, qint64 recordCount)
    : form_(form)
    , recordCount_(recordCount)
{
}

void RowContext::Collect(const ExprNode& tree)
{
    const int column = tree.code == OpCode::Field ? form_.FindColumn(tree.text) : -1;
    if (column >= 0 && !names_.contains(tree.text)) {
        const auto at = std::ranges::find(columns_, column);
        names_[tree.text] = int(at - columns_.begin());
        if (at == columns_.end()) {
            columns_.push_back(column);
            types_.push_back(form_.TypeOfColumn(column));
            values_.emplace_back();
        }
    }
    for (const ExprTree& argument : tree.args) {
        if (argument)
            Collect(*argument);
    }
}

void RowContext::Lend(qint64 position, std::span<const Cell> cells)
{
    position_ = position;
    cells_ = cells;
}

const Value& RowContext::FieldValue(int column)
{
    const auto at = size_t(column);
    return values_[at] = ValueOfCell(cells_[at], types_[at]);
}

} // namespace mirel
