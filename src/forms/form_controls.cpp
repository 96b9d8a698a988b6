#include "forms/form_controls.h"

#include "forms/evaluation_order.h"

#include <algorithm>
#include <utility>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

bool IsClock(const ControlDef& control, const ControlBinding& binding)
{
    if (control.type != ControlType::EditBox || !binding.tree)
        return false;
    const OpCode root = binding.tree->code;
    return root == OpCode::SysTime || root == OpCode::SysDate || root == OpCode::SysDateTime;
}

ControlRun MakeRun(const ControlDef& definition, const ControlBinding& binding, int windowId)
{
    ControlRun control;
    control.definition = &definition;
    control.windowId = windowId;
    control.type = definition.type;
    control.name = definition.name.Text();
    if (Has(control.type, HasCaption))
        control.text = control.name;
    else if (Has(control.type, ShowsText) && definition.fieldBound != 0)
        control.text = definition.defaultValue.Text();
    for (const ControlBinding::Column& column : binding.columns)
        control.columns += column.name;
    control.isClock = IsClock(definition, binding);
    control.keepsInput = definition.fieldBound != 0 || ShownField(binding, definition.type);
    return control;
}

} // namespace

FormControls::FormControls(const FormDef& form)
{
    for (const ControlDef& definition : form.controls) {
        const int index = int(controls_.size());
        ControlBinding binding = BindControl(definition);
        controls_.push_back(MakeRun(definition, binding, kFirstControlWindow + index));
        bindings_.push_back(std::move(binding));
        const QString name = definition.name.Text().trimmed(); // references are trimmed, too
        const int known = names_.value(name, -1);
        if (known < 0 || (!Has((*this)[known].type, HoldsValue) && Has(definition.type, HoldsValue)))
            names_[name] = index;
    }
    MarkUpdateReferences(form);
    OrderByReferences();
}

void FormControls::OrderByReferences()
{
    ControlReferences references(controls_.size());
    for (size_t i = 0; i < controls_.size(); ++i) {
        QStringList names;
        if (bindings_[i].tree)
            CollectControlNames(*bindings_[i].tree, names);
        for (const QString& name : std::as_const(names)) {
            if (const int control = FindInput(name); control >= 0)
                references[i].push_back(control);
        }
    }
    order_ = EvaluationOrder(references);
    std::ranges::copy_if(order_, std::back_inserter(readers_),
                         [&](int control) { return !references[size_t(control)].empty(); });
}

bool FormControls::ShowsRecord(size_t control) const
{
    return bindings_[control].tree && !bindings_[control].wholeResult;
}

void FormControls::MarkUpdateReferences(const FormDef& form)
{
    QStringList names;
    for (const ControlDef& definition : form.controls) {
        if (definition.type != ControlType::Button || definition.buttonFunction != ButtonFunction::Update)
            continue;
        for (const SourceAssignment& source : SplitAssignments(definition.source.Text())) {
            const FieldAssignment assignment = ParseAssignment(source);
            if (assignment.tree)
                CollectControlNames(*assignment.tree, names);
        }
    }
    for (const QString& name : names) {
        if (const int control = FindInput(name); control >= 0)
            controls_[size_t(control)].keepsInput = true;
    }
}

bool FormControls::Is(int control, ControlTrait trait) const
{
    return control >= 0 && control < int(controls_.size()) && Has((*this)[control].type, trait);
}

int FormControls::Find(QStringView name) const
{
    return names_.value(name.trimmed().toString(), -1);
}

int FormControls::FindInput(QStringView name) const
{
    const int control = Find(name);
    return control >= 0 && Has((*this)[control].type, HoldsValue) ? control : -1;
}

QString FormControls::ShownText(int index) const
{
    const ControlRun& control = (*this)[index];
    if (Has(control.type, IsTicked))
        return control.ticked ? u"1"_s : u"0"_s;
    return control.text;
}

std::optional<QString> FormControls::TextOf(QStringView name) const
{
    const int control = FindInput(name);
    return control < 0 ? std::nullopt : std::optional(ShownText(control));
}

int FormControls::ColumnOf(int control, const FormSource& result) const
{
    return result.IsOpen() ? ShownColumn(bindings_[size_t(control)], (*this)[control].type, result.Context()) : -1;
}

// --- showing ----------------------------------------------------------------------------------------------------

void FormControls::ShowText(ControlRun& control, const QString& text)
{
    if (control.text == text)
        return;
    control.text = text;
    Touch(control);
}

void FormControls::ShowTicked(ControlRun& control, bool ticked)
{
    if (control.ticked == ticked)
        return;
    control.ticked = ticked;
    Touch(control);
}

void FormControls::ShowPlaceInList(ControlRun& control, const FormSource& result)
{
    const qint64 rows = std::max<qint64>(result.Count(), 0);
    if (control.rows == rows && control.selectedRow == result.Index())
        return;
    control.rows = rows;
    control.selectedRow = result.Index();
    Touch(control);
}

void FormControls::Show(size_t index, const FormSource& result)
{
    ControlRun& control = controls_[index];
    ControlBinding& binding = bindings_[index];
    const ExprTree& tree = IsItem(binding, result.Context()) ? binding.ownField : binding.tree;
    if (!tree)
        return;
    if (Has(control.type, IsTicked)) {
        binding.recordTicked = HoldsOnRecord(*tree, result.Context());
        if (control.edited)
            MarkEdited(control, control.ticked != binding.recordTicked);
        else
            ShowTicked(control, binding.recordTicked);
    } else {
        binding.recordText = TextOnRecord(*tree, result.Context());
        if (control.edited)
            MarkEdited(control, control.text != binding.recordText);
        else
            ShowText(control, binding.recordText);
    }
    binding.shownRecord = result.Records().Id();
}

void FormControls::ShowNothing(size_t index)
{
    ControlBinding& binding = bindings_[index];
    binding.recordText.clear();
    binding.recordTicked = false;
    binding.shownRecord = {};
    ShowTicked(controls_[index], false);
    ShowText(controls_[index], {});
}

void FormControls::ShowRecord(const FormSource& result, Edits edits)
{
    hasRecord_ = result.Index() >= 0;
    if (edits == Edits::Drop)
        ForgetEdits();
    for (const int control : order_) {
        const auto i = size_t(control);
        if (Has(controls_[i].type, HasRows))
            ShowPlaceInList(controls_[i], result);
        if (!ShowsRecord(i))
            continue;
        if (hasRecord_ || controls_[i].isClock)
            Show(i, result);
        else if (!controls_[i].edited)
            ShowNothing(i);
    }
}

void FormControls::ShowAggregates(const FormSource& result, bool computed)
{
    for (size_t i = 0; i < controls_.size(); ++i) {
        if (!bindings_[i].tree || !bindings_[i].wholeResult)
            continue;
        if (computed)
            Show(i, result);
        else
            ShowNothing(i);
    }
    if (!hasRecord_)
        return;
    // They may read an aggregate, which had its former value when the record was shown.
    for (const int control : readers_) {
        if (ShowsRecord(size_t(control)))
            Show(size_t(control), result);
    }
}

void FormControls::Touch(int control)
{
    Touch(controls_[size_t(control)]);
}

void FormControls::TouchLists()
{
    for (ControlRun& control : controls_) {
        if (Has(control.type, HasRows))
            Touch(control);
    }
}

bool FormControls::HasClock() const
{
    return std::ranges::any_of(controls_, &ControlRun::isClock);
}

void FormControls::ShowTime(const FormSource& result)
{
    for (size_t i = 0; i < controls_.size(); ++i) {
        if (controls_[i].isClock)
            Show(i, result);
    }
}

void FormControls::SetItems(int index, QStringList items)
{
    ControlRun& control = controls_[size_t(index)];
    if (control.items == items)
        return;
    control.items = std::move(items);
    Touch(control);
}

void FormControls::MarkSorted(int index, int column, bool descending)
{
    for (size_t i = 0; i < controls_.size(); ++i) {
        ControlRun& control = controls_[i];
        const int sorted = int(i) == index ? column : -1;
        if (control.sortedColumn == sorted && control.sortedDescending == (sorted >= 0 && descending))
            continue;
        control.sortedColumn = sorted;
        control.sortedDescending = sorted >= 0 && descending;
        Touch(control);
    }
}

std::vector<QStringList> FormControls::ListRows(int control, FormSource& result, qint64 first, int count)
{
    std::vector<ControlBinding::Column>& columns = bindings_[size_t(control)].columns;
    RowContext context(result.Context(), result.Count());
    for (const ControlBinding::Column& column : columns) {
        if (column.tree)
            context.Collect(*column.tree);
    }
    ReadRange range{.first = first, .count = count, .fields = context.Columns()};
    if (range.fields.empty())
        range.fields = {0}; // none would be all of them
    std::vector<QStringList> rows;
    const bool read = result.Records().Read(range, [&](std::span<const Cell> cells) {
        context.Lend(first + qint64(rows.size()), cells);
        QStringList texts;
        for (ControlBinding::Column& column : columns)
            texts += column.tree ? TextOnRecord(*column.tree, context) : QString();
        rows.push_back(std::move(texts));
        return true;
    });
    if (!read)
        result.Result().Report();
    return rows;
}

// --- edits ------------------------------------------------------------------------------------------------------

void FormControls::SetText(int index, const QString& text)
{
    ControlRun& control = controls_[size_t(index)];
    ShowText(control, text);
    MarkEdited(control, text != bindings_[size_t(index)].recordText);
}

void FormControls::SetTicked(int index, bool ticked)
{
    ControlRun& control = controls_[size_t(index)];
    ShowTicked(control, ticked);
    MarkEdited(control, ticked != bindings_[size_t(index)].recordTicked);
}

// Only what would be lost is an edit: the control shows the record, or goes into it. Without a record, what is
// typed can still become one.
void FormControls::MarkEdited(ControlRun& control, bool edited)
{
    edited = edited && control.keepsInput;
    if (control.edited != edited)
        Touch(control);
    control.edited = edited;
    edited_ = std::ranges::any_of(controls_, &ControlRun::edited);
}

void FormControls::ForgetEdits()
{
    for (ControlRun& control : controls_) {
        if (std::exchange(control.edited, false))
            Touch(control);
    }
    edited_ = false;
}

void FormControls::ForgetEditsOf(const QStringList& names)
{
    for (const QString& name : names) {
        if (const int control = FindInput(name); control >= 0)
            MarkEdited(controls_[size_t(control)], false);
    }
}

void FormControls::ClearInputs()
{
    for (ControlRun& control : controls_) {
        if (control.type == ControlType::EditBox)
            ShowText(control, {});
        else if (Has(control.type, IsTicked))
            ShowTicked(control, false);
    }
}

bool FormControls::IsUntouched(const FieldAssignment& assignment, const FormSource& result) const
{
    const int index = assignment.controlName.isEmpty() ? -1 : FindInput(assignment.controlName);
    if (index < 0 || ColumnOf(index, result) != assignment.field)
        return false;
    const ControlRun& control = (*this)[index];
    const ControlBinding& binding = bindings_[size_t(index)];
    if (binding.shownRecord != result.Records().Id())
        return false;
    return control.type == ControlType::CheckBox ? control.ticked == binding.recordTicked
                                                 : control.text == binding.recordText;
}

} // namespace mirel
