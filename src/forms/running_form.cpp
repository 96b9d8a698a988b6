#include "forms/running_form.h"

#include "data/provider_error.h"
#include "expr/evaluation.h"
#include "forms/aggregate_pass.h"
#include "forms/form_query.h"
#include "platform/ole_date.h"
#include "platform/user_locale.h"
#include "provider/conversion.h"
#include "resources/string_table.h"

#include <QSet>

#include <algorithm>
#include <utility>

// The controls, what they show and what the user does to them; the buttons are in running_form_buttons.cpp.

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kMaxItems = 10'000; // of a drop-down box: nobody looks through more

bool HoldsValue(ControlType type)
{
    return type == ControlType::EditBox || type == ControlType::DropDownBox || type == ControlType::CheckBox;
}

bool ShowsText(ControlType type)
{
    return type == ControlType::EditBox || type == ControlType::DropDownBox;
}

bool IsClock(const ControlRun& control, const ControlBinding& binding)
{
    if (control.type != ControlType::EditBox || !binding.tree)
        return false;
    const OpCode root = binding.tree->code;
    return root == OpCode::SysTime || root == OpCode::SysDate || root == OpCode::SysDateTime;
}

QString DisplayText(const Value& value, FieldType type, const YesNoWords& words)
{
    return type == FieldType::YesNo && !value.IsNull() ? words.Of(value.Number() != 0) : VariantText(value);
}

} // namespace

RunningForm::RunningForm(FormCall call, FormEnvironment environment)
    : form_(std::move(call.form))
    , callQuery_(std::move(call.query))
    , callRecord_(call.record)
    , environment_(std::move(environment))
    , result_(
          environment_.connection, environment_.database, environment_.prompt, environment_.settings.words,
          [this](QStringView name) { return ControlText(name); }, environment_.clock)
{
    BuildControls();
}

RunningForm::~RunningForm() = default;

// --- making the controls ----------------------------------------------------------------------------------------

void RunningForm::BuildControls()
{
    for (const ControlDef& definition : form_.controls) {
        ControlRun control;
        control.definition = &definition;
        control.windowId = kFirstControlWindow + int(controls_.size());
        control.type = definition.type;
        control.name = definition.name.Text();
        ControlBinding binding = BindControl(definition);
        if (control.type == ControlType::Label || control.type == ControlType::Button)
            control.text = control.name;
        else if (ShowsText(control.type) && definition.fieldBound != 0)
            control.text = definition.defaultValue.Text();
        for (const ControlBinding::Column& column : binding.columns)
            control.columns += column.name;
        control.isClock = IsClock(control, binding);
        control.keepsInput = definition.fieldBound != 0 || ShownField(binding, definition.type);
        controls_.push_back(std::move(control));
        bindings_.push_back(std::move(binding));
    }
    for (int i = 0; i < int(controls_.size()); ++i) {
        const QString name = controls_[size_t(i)].name.trimmed(); // references are trimmed, too
        const int known = inputs_.value(name, -1);
        if (known < 0 || (!HoldsValue(controls_[size_t(known)].type) && HoldsValue(controls_[size_t(i)].type)))
            inputs_[name] = i;
    }
    MarkUpdateReferences();
}

void RunningForm::MarkUpdateReferences()
{
    for (const ControlDef& definition : form_.controls) {
        if (definition.type != ControlType::Button || definition.buttonFunction != ButtonFunction::Update)
            continue;
        QStringList names;
        for (const SourceAssignment& source : SplitAssignments(definition.source.Text())) {
            const FieldAssignment assignment = ParseAssignment(source);
            if (assignment.tree)
                CollectControlNames(*assignment.tree, names);
        }
        for (const QString& name : names) {
            if (const int control = FindInput(name); control >= 0)
                controls_[size_t(control)].keepsInput = true;
        }
    }
}

QStringList RunningForm::ItemsOf(const ControlBinding& binding, bool& failed)
{
    const bool dataIsShown = binding.isMaybeItem && !IsItem(binding, result_.Context());
    QStringList items = dataIsShown ? QStringList() : DropDownItems(binding.dropDown.data);
    items.removeDuplicates();
    if (binding.dropDown.query.isEmpty())
        return items;
    const QString query = CompleteQuery(binding.dropDown.query, form_.tableName.Text(), TextsForQueries());
    DbRecordset rows(environment_.connection);
    failed =
        !MayRun(query) || !rows.Open(query, environment_.database, CursorType::ForwardOnly, LockType::ReadOnly);
    if (failed) {
        ReportProviderError(environment_.prompt, &rows, rows.LastResult());
        return items;
    }
    QSet<QString> known(items.begin(), items.end());
    while (!rows.IsEof() && items.size() < kMaxItems) {
        const Value value = rows.FieldValue(0);
        const QString text = DisplayText(value, rows.TypeOfField(0), environment_.settings.words);
        if (!value.IsNull() && !known.contains(text)) {
            known.insert(text);
            items += text;
        }
        if (!rows.MoveNext())
            break;
    }
    return items;
}

void RunningForm::FillDropDowns()
{
    for (size_t i = 0; i < controls_.size(); ++i) {
        bool failed = false;
        if (controls_[i].type == ControlType::DropDownBox)
            FillDropDown(i, failed);
        if (failed)
            return; // one message is enough, and the next query is likely to fail likewise
    }
}

void RunningForm::FillDropDown(size_t control, bool& failed)
{
    QStringList items = ItemsOf(bindings_[control], failed);
    if (items == controls_[control].items)
        return;
    controls_[control].items = std::move(items);
    Touch(controls_[control]);
}

void RunningForm::RefreshItems(int control)
{
    bool failed = false;
    if (Is(control, ControlType::DropDownBox))
        FillDropDown(size_t(control), failed);
}

// --- what is shown ----------------------------------------------------------------------------------------------

void RunningForm::ChangeSettings(const FormViewSettings& settings)
{
    environment_.settings = settings;
    result_.Context().SetWords(settings.words);
    if (!dirty_)
        ShowRecord();
}

bool RunningForm::Is(int control, ControlType type) const
{
    return control >= 0 && control < int(controls_.size()) && controls_[size_t(control)].type == type;
}

int RunningForm::FindControl(QStringView name) const
{
    return inputs_.value(name.trimmed().toString(), -1);
}

int RunningForm::FindInput(QStringView name) const
{
    const int control = FindControl(name);
    return control >= 0 && HoldsValue(controls_[size_t(control)].type) ? control : -1;
}

QString RunningForm::ControlText(QStringView name) const
{
    const int found = FindInput(name);
    return found < 0 ? QString() : ShownText(found);
}

QString RunningForm::ShownText(int index) const
{
    const ControlRun& control = controls_[size_t(index)];
    if (control.type == ControlType::CheckBox)
        return control.ticked ? u"1"_s : u"0"_s;
    return control.text;
}

ControlTextOf RunningForm::TextsForQueries() const
{
    return
        [this](QStringView name) { return FindInput(name) < 0 ? std::nullopt : std::optional(ControlText(name)); };
}

void RunningForm::Touch(ControlRun& control)
{
    control.revision = ++revision_;
}

void RunningForm::ShowText(ControlRun& control, const QString& text)
{
    if (control.text == text)
        return;
    control.text = text;
    Touch(control);
}

void RunningForm::ShowTicked(ControlRun& control, bool ticked)
{
    if (control.ticked == ticked)
        return;
    control.ticked = ticked;
    Touch(control);
}

void RunningForm::ShowControl(size_t index)
{
    ControlRun& control = controls_[index];
    ControlBinding& binding = bindings_[index];
    const ExprTree& tree = IsItem(binding, result_.Context()) ? binding.ownField : binding.tree;
    if (!tree)
        return;
    if (control.type == ControlType::CheckBox) {
        binding.recordTicked = HoldsOnRecord(*tree, result_.Context());
        ShowTicked(control, binding.recordTicked);
    } else {
        binding.recordText = TextOnRecord(*tree, result_.Context());
        ShowText(control, binding.recordText);
    }
    binding.shownRecord = result_.Index();
}

void RunningForm::ShowRecord()
{
    ForgetEdits();
    if (result_.Index() < 0) {
        ClearControls(Clearing::Record);
        return;
    }
    for (size_t i = 0; i < controls_.size(); ++i) {
        if (controls_[i].type == ControlType::List)
            ShowList(controls_[i]);
        else if (bindings_[i].tree && !bindings_[i].wholeResult)
            ShowControl(i);
    }
}

void RunningForm::ShowResult()
{
    ShowRecord();
    RecomputeAggregates();
    for (ControlRun& control : controls_) {
        if (control.type == ControlType::List)
            Touch(control); // its rows may hold other texts
    }
    ++revision_;
}

void RunningForm::ShowList(ControlRun& control)
{
    const qint64 rows = std::max<qint64>(result_.Count(), 0);
    if (control.rows == rows && control.selectedRow == result_.Index())
        return;
    control.rows = rows;
    control.selectedRow = result_.Index();
    Touch(control);
}

void RunningForm::ClearControls(Clearing what)
{
    for (size_t i = 0; i < controls_.size(); ++i) {
        ControlRun& control = controls_[i];
        ControlBinding& binding = bindings_[i];
        if (control.type == ControlType::List)
            ShowList(control);
        if (!binding.tree || binding.wholeResult != (what == Clearing::Aggregates))
            continue;
        if (control.isClock) {
            ShowControl(i);
            continue;
        }
        binding.recordText.clear();
        binding.recordTicked = false;
        binding.shownRecord = -1;
        ShowTicked(control, false);
        if (ShowsText(control.type))
            ShowText(control, {});
    }
}

void RunningForm::RecomputeAggregates()
{
    const bool computed = result_.Count() > 0 &&
                          ComputeAggregates(result_.Records(), result_.Context(), environment_.prompt, bindings_);
    if (!computed) {
        if (result_.Count() > 0)
            result_.Report();
        ClearControls(Clearing::Aggregates);
        return;
    }
    for (size_t i = 0; i < controls_.size(); ++i) {
        if (bindings_[i].tree && bindings_[i].wholeResult)
            ShowControl(i);
    }
}

std::vector<QStringList> RunningForm::ListRows(int control, qint64 first, int count)
{
    std::vector<QStringList> rows;
    if (!Is(control, ControlType::List) || !HasResult() || first < 0 || count <= 0)
        return rows;
    std::vector<ControlBinding::Column>& columns = bindings_[size_t(control)].columns;
    RowContext context(result_.Context(), result_.Count());
    for (const ControlBinding::Column& column : columns) {
        if (column.tree)
            context.Collect(*column.tree);
    }
    ReadRange range{.first = first, .count = count, .fields = context.Columns()};
    if (range.fields.empty())
        range.fields = {0}; // none would be all of them
    const bool read = result_.Records().Read(range, [&](std::span<const Cell> cells) {
        context.Lend(first + qint64(rows.size()), cells);
        QStringList texts;
        for (ControlBinding::Column& column : columns)
            texts += column.tree ? TextOnRecord(*column.tree, context) : QString();
        rows.push_back(std::move(texts));
        return true;
    });
    if (!read)
        result_.Report();
    return rows;
}

QString RunningForm::CounterText() const
{
    return HasResult() ? u"%1/%2"_s.arg(result_.Index() + 1).arg(result_.Count()) : QString();
}

bool RunningForm::CanUpdate() const
{
    return HasResult() && result_.Records().Lock() != LockType::ReadOnly;
}

QString RunningForm::FieldText(int field) const
{
    if (result_.Index() < 0)
        return {};
    const DbRecordset& records = result_.Records();
    return DisplayText(records.FieldValue(field), records.TypeOfField(field), environment_.settings.words);
}

// --- what the user does to controls -----------------------------------------------------------------------------

void RunningForm::MarkEdited(ControlRun& control, bool edited)
{
    edited = edited && control.keepsInput && result_.Index() >= 0;
    if (control.edited != edited)
        Touch(control);
    control.edited = edited;
    const bool dirty = std::ranges::any_of(controls_, &ControlRun::edited);
    if (dirty_ != dirty)
        ++revision_;
    dirty_ = dirty;
}

void RunningForm::ForgetEdits()
{
    for (ControlRun& control : controls_) {
        if (control.edited)
            Touch(control);
        control.edited = false;
    }
    if (dirty_)
        ++revision_;
    dirty_ = false;
}

void RunningForm::SetText(int index, const QString& text)
{
    if (!Is(index, ControlType::EditBox) && !Is(index, ControlType::DropDownBox))
        return;
    ControlRun& control = controls_[size_t(index)];
    ShowText(control, text);
    MarkEdited(control, text != bindings_[size_t(index)].recordText);
}

void RunningForm::SetTicked(int index, bool ticked)
{
    if (!Is(index, ControlType::CheckBox))
        return;
    ControlRun& control = controls_[size_t(index)];
    ShowTicked(control, ticked);
    MarkEdited(control, ticked != bindings_[size_t(index)].recordTicked);
}

RunningForm::Outcome RunningForm::SelectListRow(int index, qint64 row)
{
    if (!Is(index, ControlType::List) || row < 0 || row >= result_.Count())
        return Outcome::Failed;
    if (row == result_.Index())
        return Outcome::Done;
    const Outcome outcome = LeaveAndMoveTo(row);
    if (outcome != Outcome::Done)
        Touch(controls_[size_t(index)]); // the window takes its own selection back
    return outcome;
}

RunningForm::Outcome RunningForm::TapListHeader(int index, int column)
{
    if (!Is(index, ControlType::List) || result_.Count() < 1 || column < 0 ||
        column >= int(bindings_[size_t(index)].columns.size()))
        return Outcome::Done;
    ControlRun& control = controls_[size_t(index)];
    const bool descending = control.sortedColumn == column && !control.sortedDescending;
    const ExprNode* tree = bindings_[size_t(index)].columns[size_t(column)].tree.get();
    const int field = ColumnOf(tree, result_.Context());
    if (field < 0)
        return Outcome::Done;
    const Outcome outcome = SortByField(field, descending ? SortOrder::Descending : SortOrder::Ascending);
    if (outcome == Outcome::Done) {
        control.sortedColumn = column;
        control.sortedDescending = descending;
        Touch(control);
    }
    return outcome;
}

// --- moving, adding, deleting -----------------------------------------------------------------------------------

bool RunningForm::LeaveRecordCheck()
{
    if (!dirty_ || !environment_.settings.confirmSave) {
        ForgetEdits();
        return true;
    }
    const UserMessage question{Str::IgnoreChangesQuestion, {}};
    const bool offersSave = environment_.settings.saveAsThirdAnswer && FirstUpdateButton() >= 0;
    const UserPrompt::Answer answer = offersSave
                                          ? environment_.prompt.AskYesNoOr(question, {Str::SaveChangesAnswer, {}})
                                      : environment_.prompt.AskYesNo(question) ? UserPrompt::Answer::Yes
                                                                               : UserPrompt::Answer::No;
    if (answer == UserPrompt::Answer::No)
        return false;
    if (answer == UserPrompt::Answer::Third)
        return PressButton(FirstUpdateButton()) == Outcome::Done && !dirty_;
    ForgetEdits();
    return true;
}

RunningForm::Outcome RunningForm::LeaveAndMoveTo(qint64 record)
{
    if (!LeaveRecordCheck())
        return Outcome::Stopped;
    if (!result_.MoveTo(record)) {
        result_.Close();
        ShowResult();
        return Outcome::Failed;
    }
    ShowRecord();
    ++revision_;
    return Outcome::Done;
}

RunningForm::Outcome RunningForm::GoToFirst()
{
    return result_.Count() < 1 ? Outcome::Failed : LeaveAndMoveTo(0);
}

RunningForm::Outcome RunningForm::GoToLast()
{
    return result_.Count() < 1 ? Outcome::Failed : LeaveAndMoveTo(result_.Count() - 1);
}

RunningForm::Outcome RunningForm::GoToNext()
{
    return GoToRecord(result_.Index() + 1);
}

RunningForm::Outcome RunningForm::GoToPrevious()
{
    return result_.Index() == 0 ? Outcome::Done : GoToRecord(result_.Index() - 1);
}

RunningForm::Outcome RunningForm::GoToRecord(qint64 record)
{
    return record < 0 || record >= result_.Count() ? Outcome::Failed : LeaveAndMoveTo(record);
}

bool RunningForm::NewRecordValues(std::vector<FieldChange>& values)
{
    const DbRecordset& records = result_.Records();
    const std::optional<double> today = OleDate(environment_.clock().date().startOfDay());
    for (int field = 0; field < records.FieldCount(); ++field) {
        const bool isColumn = !records.Fields()[size_t(field)].column.isEmpty();
        if (isColumn && records.TypeOfField(field) == FieldType::Date && today)
            values.push_back({field, Value::Date(*today)});
        else if (isColumn && records.TypeOfField(field) == FieldType::YesNo)
            values.push_back({field, Value::Bool(false)});
    }
    for (size_t i = 0; i < controls_.size(); ++i) {
        const QString text = controls_[i].definition->defaultValue.Text();
        const int field = text.isEmpty() ? -1 : FieldOfControl(int(i));
        if (field < 0)
            continue;
        Value value;
        if (const Hr hr =
                ConvertForColumn(Value::Text(text), records.TypeOfField(field), records.FieldSize(field), value);
            Failed(hr)) {
            ReportRefusedField(field, hr);
            return false;
        }
        std::erase_if(values, [field](const FieldChange& change) { return change.field == field; });
        values.push_back({field, value});
    }
    return true;
}

RunningForm::Outcome RunningForm::AddRecord()
{
    if (!HasResult())
        return Outcome::Failed;
    if (!LeaveRecordCheck())
        return Outcome::Stopped;
    std::vector<FieldChange> values;
    if (!NewRecordValues(values) || !result_.Add(values))
        return Outcome::Failed;
    DataHasChanged();
    return Outcome::Done;
}

RunningForm::Outcome RunningForm::DeleteRecord()
{
    if (result_.Count() < 1)
        return Outcome::Done;
    if (environment_.settings.confirmDelete && !environment_.prompt.AskYesNo({Str::DeleteRecordQuestion, {}}))
        return Outcome::Stopped;
    const bool deleted = result_.Delete();
    if (deleted)
        DataHasChanged();
    else
        ShowResult();
    return deleted ? Outcome::Done : Outcome::Failed;
}

// After each change that was written: the aggregates only where the user wants them brought up to date, because
// they cost a walk over all records.
void RunningForm::DataHasChanged()
{
    dataChanged_ = true;
    ShowRecord();
    if (environment_.settings.updateAggregate || result_.Count() < 1)
        RecomputeAggregates();
    for (ControlRun& control : controls_) {
        if (control.type == ControlType::List)
            Touch(control);
    }
    ++revision_;
}

void RunningForm::ReportRefusedField(int field, Hr hr)
{
    const QString place = StringText(Str::FormFieldRefused, {result_.Records().FieldName(field)});
    environment_.prompt.ShowError(ProviderErrorText(&result_.Records(), hr, place));
}

// --- time -------------------------------------------------------------------------------------------------------

bool RunningForm::HasClock() const
{
    return std::ranges::any_of(controls_, &ControlRun::isClock);
}

void RunningForm::Tick()
{
    for (size_t i = 0; i < controls_.size(); ++i) {
        if (controls_[i].isClock)
            ShowControl(i);
    }
}

// --- filter and sort --------------------------------------------------------------------------------------------

int RunningForm::FieldOfControl(int control) const
{
    if (control < 0 || control >= int(controls_.size()) || !HasResult())
        return -1;
    return ShownColumn(bindings_[size_t(control)], controls_[size_t(control)].type, result_.Context());
}

template <typename Rewrite>
RunningForm::Outcome RunningForm::Rearrange(Rewrite rewrite)
{
    if (!HasResult())
        return Outcome::Failed;
    if (!LeaveRecordCheck())
        return Outcome::Stopped;
    const bool done = rewrite();
    for (ControlRun& control : controls_)
        control.sortedColumn = -1;
    ShowResult();
    return done ? Outcome::Done : Outcome::Failed;
}

RunningForm::Outcome RunningForm::FilterByControl(int control, CellFilter filter)
{
    const int field = FieldOfControl(control);
    if (field < 0 || result_.Index() < 0)
        return Outcome::Done;
    const DbRecordset& records = result_.Records();
    const YesNoWords& words = environment_.settings.words;
    const Value value = records.FieldValue(field);
    const FieldType type = records.TypeOfField(field);
    return AddCondition(ConditionFromCell(filter, result_.ReferenceOf(field), type, value,
                                          DisplayText(value, type, words), words));
}

RunningForm::Outcome RunningForm::SortByControl(int control, SortOrder order)
{
    const int field = FieldOfControl(control);
    return field < 0 ? Outcome::Done : SortByField(field, order);
}

RunningForm::Outcome RunningForm::SortByField(int field, SortOrder order)
{
    const QString word = order == SortOrder::Ascending ? u"ASC"_s : u"DESC"_s;
    return SortByTerms(u"%1 %2"_s.arg(result_.ReferenceOf(field), word));
}

RunningForm::Outcome RunningForm::AddCondition(const QString& condition)
{
    if (condition.isEmpty() || result_.Count() < 1)
        return Outcome::Done;
    return Rearrange([&] { return result_.AddCondition(condition); });
}

RunningForm::Outcome RunningForm::SortByTerms(const QString& terms)
{
    if (terms.isEmpty() || result_.Count() < 1)
        return Outcome::Done;
    return Rearrange([&] { return result_.SortBy(terms); });
}

RunningForm::Outcome RunningForm::RemoveFilter()
{
    return Rearrange([&] { return result_.RemoveFilter(); });
}

} // namespace mirel
