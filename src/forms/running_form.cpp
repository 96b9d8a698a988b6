#include "forms/running_form.h"

#include "data/provider_error.h"
#include "forms/aggregate_pass.h"
#include "platform/ole_date.h"
#include "platform/user_locale.h"
#include "provider/cell_value.h"
#include "provider/conversion.h"
#include "resources/string_table.h"
#include "result/cell_text.h"

#include <QElapsedTimer>
#include <QSet>

#include <algorithm>
#include <utility>

// What is shown, moving, adding, filters; the first result and the buttons are in running_form_buttons.cpp.

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kMaxItems = 10'000; // of a drop-down box: nobody looks through more

} // namespace

RunningForm::RunningForm(FormCall call, FormEnvironment environment)
    : form_(std::move(call.form))
    , callQuery_(std::move(call.query))
    , callRecord_(call.record)
    , environment_(std::move(environment))
    , controls_(form_)
    , source_(
          environment_.connection, environment_.database, environment_.prompt, environment_.settings.words,
          [this](QStringView name) { return ControlText(name); }, environment_.clock)
{
}

RunningForm::~RunningForm() = default;

void RunningForm::ChangeSettings(const FormViewSettings& settings)
{
    environment_.settings = settings;
    source_.Context().SetWords(settings.words);
    if (!IsDirty())
        ShowRecord();
}

// --- items of drop-down boxes -----------------------------------------------------------------------------------

ControlTextOf RunningForm::TextsForQueries() const
{
    return [this](QStringView name) { return controls_.TextOf(name); };
}

// The texts in the query's first column, each once, NULL left out.
bool RunningForm::ReadItems(const QString& query, OnFailure onFailure, QStringList& items)
{
    const QString statement = CompleteQuery(query, form_.tableName.Text(), TextsForQueries());
    if (const auto known = itemsOfQuery_.find(statement); known != itemsOfQuery_.end()) {
        items = *known;
        return true;
    }
    if (onFailure == OnFailure::BeSilent ? !OnlyReads(statement) : !MayRun(statement))
        return false;
    DbRecordset rows(environment_.connection);
    bool more = rows.Open(statement, environment_.database, CursorType::ForwardOnly, LockType::ReadOnly);
    QSet<QString> known;
    for (; more && !rows.IsEof() && items.size() < kMaxItems; more = rows.MoveNext()) {
        const Value value = rows.FieldValue(0);
        const QString text = DisplayText(value, rows.TypeOfField(0), environment_.settings.words);
        if (value.IsNull() || known.contains(text))
            continue;
        known.insert(text);
        items += text;
    }
    if (more)
        itemsOfQuery_[statement] = items;
    else if (onFailure == OnFailure::Tell)
        ReportProviderError(environment_.prompt, &rows, rows.LastResult());
    return more;
}

bool RunningForm::FillDropDown(int control, OnFailure onFailure)
{
    const ControlBinding& binding = controls_.Bindings()[size_t(control)];
    const bool dataIsShown = binding.isMaybeItem && !IsItem(binding, source_.Context());
    QStringList items = dataIsShown ? QStringList() : DropDownItems(binding.dropDown.data);
    QStringList fromQuery;
    const bool filled =
        binding.dropDown.query.isEmpty() || ReadItems(binding.dropDown.query, onFailure, fromQuery);
    items += fromQuery;
    items.removeDuplicates();
    controls_.SetItems(control, std::move(items));
    return filled;
}

// The boxes that come too late are filled when they are opened, see RefreshItems.
void RunningForm::FillDropDowns()
{
    constexpr int kBudgetMs = 1000;
    QElapsedTimer timer;
    timer.start();
    // A query that fails leaves its own box empty. One message is enough: the next is likely to fail likewise.
    OnFailure onFailure = OnFailure::Tell;
    for (int i = 0; i < int(Controls().size()) && timer.elapsed() < kBudgetMs; ++i) {
        if (controls_.Is(i, HasItems) && !FillDropDown(i, onFailure))
            onFailure = OnFailure::BeSilent;
    }
    itemsOfQuery_.clear();
}

void RunningForm::RefreshItems(int control)
{
    if (controls_.Is(control, HasItems))
        (void)FillDropDown(control);
    itemsOfQuery_.clear();
}

// --- what is shown ----------------------------------------------------------------------------------------------

void RunningForm::ShowRecord(FormControls::Edits edits)
{
    fingerprint_.clear();
    controls_.ShowRecord(source_, edits);
    source_.Result().Hold(); // also where no control had to read it again
}

void RunningForm::ShowResult(FormControls::Edits edits)
{
    ShowRecord(edits);
    RecomputeAggregates();
    controls_.TouchLists();
}

void RunningForm::RecomputeAggregates()
{
    bool computed = source_.Count() > 0;
    if (computed) {
        computed =
            ComputeAggregates(source_.Records(), source_.Context(), environment_.prompt, controls_.Bindings());
        if (!computed)
            source_.Result().Report();
    }
    controls_.ShowAggregates(source_, computed);
}

std::vector<QStringList> RunningForm::ListRows(int control, qint64 first, int count)
{
    if (!controls_.Is(control, HasRows) || !HasResult() || first < 0 || count <= 0)
        return {};
    return controls_.ListRows(control, source_, first, count);
}

bool RunningForm::ShowsNumbers(int control, int column)
{
    if (!controls_.Is(control, HasRows) || !HasResult() || column < 0 ||
        column >= controls_[control].columns.size())
        return false;
    const ControlBinding& binding = controls_.Bindings()[size_t(control)];
    const int field = ColumnOf(binding.columns[size_t(column)].tree.get(), source_.Context());
    return field >= 0 && IsRightAligned(source_.Records().TypeOfField(field));
}

QString RunningForm::CounterText() const
{
    return HasResult() ? u"%1/%2"_s.arg(source_.Index() + 1).arg(source_.Count()) : QString();
}

bool RunningForm::CanUpdate() const
{
    return HasResult() && source_.Records().Lock() != LockType::ReadOnly;
}

QString RunningForm::FieldText(int field) const
{
    if (source_.Index() < 0)
        return {};
    const DbRecordset& records = source_.Records();
    return DisplayText(records.FieldValue(field), records.TypeOfField(field), environment_.settings.words);
}

std::vector<QStringList> RunningForm::RecordTexts(qint64 first, int count)
{
    std::vector<QStringList> texts;
    if (!HasResult() || first < 0 || count <= 0)
        return texts;
    DbRecordset& records = source_.Records();
    const bool read =
        records.Read({.first = first, .count = count, .fields = {}}, [&](std::span<const Cell> cells) {
            QStringList record;
            for (size_t field = 0; field < cells.size(); ++field) {
                const FieldType type = records.TypeOfField(int(field));
                record += DisplayText(ValueOfCell(cells[field], type), type, environment_.settings.words);
            }
            texts.push_back(std::move(record));
            return true;
        });
    if (!read)
        source_.Result().Report();
    return texts;
}

// --- what the user does to controls -----------------------------------------------------------------------------

void RunningForm::SetText(int index, const QString& text)
{
    if (controls_.Is(index, ShowsText))
        controls_.SetText(index, text);
}

void RunningForm::SetTicked(int index, bool ticked)
{
    if (controls_.Is(index, IsTicked))
        controls_.SetTicked(index, ticked);
}

RunningForm::Outcome RunningForm::SelectListRow(int index, qint64 row)
{
    if (!controls_.Is(index, HasRows) || row < 0 || row >= source_.Count())
        return Outcome::Failed;
    if (row == source_.Index())
        return Outcome::Done;
    const Outcome outcome = LeaveAndMoveTo(row);
    if (outcome != Outcome::Done)
        controls_.Touch(index); // the window takes its own selection back
    return outcome;
}

RunningForm::Outcome RunningForm::TapListHeader(int index, int column)
{
    if (!controls_.Is(index, HasRows) || source_.Count() < 1 || column < 0 ||
        column >= controls_[index].columns.size())
        return Outcome::Done;
    const ControlBinding& binding = controls_.Bindings()[size_t(index)];
    const int field = ColumnOf(binding.columns[size_t(column)].tree.get(), source_.Context());
    if (field < 0)
        return Outcome::Done;
    const bool descending = controls_[index].sortedColumn == column && !controls_[index].sortedDescending;
    const Outcome outcome = SortByField(field, descending ? SortOrder::Descending : SortOrder::Ascending);
    if (outcome == Outcome::Done)
        controls_.MarkSorted(index, column, descending);
    return outcome;
}

// --- drafts -----------------------------------------------------------------------------------------------------

std::optional<RecordDraft> RunningForm::Draft()
{
    if (!IsDirty())
        return {};
    const bool hasRecord = source_.Index() >= 0;
    if (hasRecord && fingerprint_.isEmpty())
        fingerprint_ = source_.Result().Fingerprint();
    RecordDraft draft{.statement = source_.Result().BaseStatement(),
                      .record = hasRecord ? source_.Records().Id() : RecordId(),
                      .fingerprint = hasRecord ? fingerprint_ : QByteArray(),
                      .texts = {}};
    for (int i = 0; i < int(Controls().size()); ++i) {
        if (controls_[i].edited)
            draft.texts.push_back({i, controls_[i].name, ShownText(i), controls_.Is(i, IsTicked)});
    }
    return draft;
}

bool RunningForm::PutBack(const RecordDraft& draft)
{
    const bool fits = std::ranges::all_of(draft.texts, [this](const TypedText& typed) {
        return controls_.Is(typed.place, typed.isTick ? IsTicked : ShowsText) &&
               controls_[typed.place].name == typed.name;
    });
    if (IsDirty() || !fits || (!draft.record.IsNull() && !HasResult()))
        return false;
    OpenResult& result = source_.Result();
    if (draft.record.IsNull() ? source_.Index() >= 0 : !result.MoveToRecord(draft.record))
        return false;
    ShowRecord();
    controls_.TouchLists();
    if (!draft.record.IsNull() && result.Fingerprint() != draft.fingerprint)
        return false;
    for (const TypedText& typed : draft.texts)
        typed.isTick ? SetTicked(typed.place, typed.text == u"1") : SetText(typed.place, typed.text);
    return IsDirty();
}

// --- moving, adding, deleting -----------------------------------------------------------------------------------

UserPrompt::Answer RunningForm::AskAboutChanges()
{
    const UserMessage question{Str::IgnoreChangesQuestion, {}};
    if (environment_.settings.saveAsThirdAnswer && FirstUpdateButton() >= 0)
        return environment_.prompt.AskYesNoOr(question, {Str::SaveChangesAnswer, {}});
    return environment_.prompt.AskYesNo(question) ? UserPrompt::Answer::Yes : UserPrompt::Answer::No;
}

bool RunningForm::LeaveRecordCheck()
{
    if (IsDirty() && environment_.settings.confirmSave) {
        switch (AskAboutChanges()) {
        case UserPrompt::Answer::No:
            return false;
        case UserPrompt::Answer::Third:
            return PressButton(FirstUpdateButton()) == Outcome::Done && !IsDirty();
        case UserPrompt::Answer::Yes:
            break;
        }
    }
    controls_.ForgetEdits();
    return true;
}

RunningForm::Outcome RunningForm::LeaveAndMoveTo(qint64 record)
{
    OpenResult& result = source_.Result();
    // Others go on while a question is asked: the record that was meant is found wherever it is by then.
    const std::vector<RecordId> meant = IsDirty() ? result.IdsFrom(record, 1) : std::vector<RecordId>();
    if (!LeaveRecordCheck())
        return Outcome::Stopped;
    const bool isThere = !meant.empty() && result.MoveToRecord(meant.front());
    if (!isThere && !result.MoveTo(record)) {
        result.Close();
        ShowResult();
        return Outcome::Failed;
    }
    ShowRecord();
    return Outcome::Done;
}

void RunningForm::TakeUpChanges()
{
    if (!HasResult())
        return;
    OpenResult& result = source_.Result();
    const bool isTyping = IsDirty();
    const bool isOther =
        result.TakeUpChanges(isTyping ? ProviderRecordset::Values::Keep : ProviderRecordset::Values::ReadAgain);
    const bool leavesGone = result.IsGone() && !isTyping;
    if (!isOther && !leavesGone)
        return;
    if (leavesGone || (!isTyping && source_.Index() < 0 && source_.Count() > 0))
        (void)result.MoveTo(std::max<qint64>(source_.Index(), 0));
    ShowRecord(FormControls::Edits::Keep);
    controls_.TouchLists();
}

bool RunningForm::CatchUp(int budgetMs)
{
    if (IsBehind() && !source_.Result().CatchUp(budgetMs))
        return false;
    TakeUpChanges();
    return true;
}

RunningForm::Outcome RunningForm::GoToFirst()
{
    return GoToRecord(0);
}

RunningForm::Outcome RunningForm::GoToLast()
{
    TakeUpChanges();
    return source_.Count() < 1 ? Outcome::Failed : LeaveAndMoveTo(source_.Count() - 1);
}

RunningForm::Outcome RunningForm::GoToNext()
{
    TakeUpChanges();
    // Behind a record that is gone comes the one that has its place now.
    const qint64 next = source_.Index() + (source_.Result().IsGone() ? 0 : 1);
    if (next < source_.Count())
        return LeaveAndMoveTo(next);
    whyFailed_ = StringText(Str::NoNextRecord);
    return Outcome::Failed;
}

RunningForm::Outcome RunningForm::GoToPrevious()
{
    TakeUpChanges();
    if (source_.Count() < 1) {
        whyFailed_ = StringText(Str::NoPreviousRecord);
        return Outcome::Failed;
    }
    return source_.Index() <= 0 ? Outcome::Done : LeaveAndMoveTo(source_.Index() - 1);
}

RunningForm::Outcome RunningForm::GoToRecord(qint64 record)
{
    TakeUpChanges();
    return record < 0 || record >= source_.Count() ? Outcome::Failed : LeaveAndMoveTo(record);
}

bool RunningForm::NewRecordValues(std::vector<FieldChange>& values)
{
    const DbRecordset& records = source_.Records();
    values = source_.Result().NewRecordValues(environment_.clock());
    for (int i = 0; i < int(Controls().size()); ++i) {
        const QString text = controls_[i].definition->defaultValue.Text();
        const int field = text.isEmpty() ? -1 : FieldOfControl(i);
        if (field < 0)
            continue;
        Value value;
        if (const Hr hr =
                ConvertForColumn(Value::Text(text), records.TypeOfField(field), records.FieldSize(field), value);
            Failed(hr)) {
            environment_.prompt.ShowError(RefusedField(field, hr));
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
    if (!NewRecordValues(values))
        return Outcome::Failed;
    if (CanUpdate() && !source_.Result().AskForRequired(values))
        return Outcome::Stopped;
    if (source_.Result().Add(values) != OpenResult::Written::Done) {
        environment_.prompt.ShowError(source_.Result().LastFailure());
        return Outcome::Failed;
    }
    DataHasChanged();
    return Outcome::Done;
}

// What is meant for a record that others have deleted must not reach the one behind it.
bool RunningForm::IsRecordStillThere()
{
    const RecordId before = source_.Records().Id();
    TakeUpChanges();
    if (source_.Records().Id() == before && !source_.Result().IsGone())
        return true;
    environment_.prompt.Show({Str::RecordDeletedMeanwhile, {}});
    return false;
}

RunningForm::Outcome RunningForm::DeleteRecord()
{
    if (source_.Count() < 1)
        return Outcome::Done;
    const SeenRecord asked = source_.Result().Seen(); // what the form shows, whatever is there by now
    if (source_.Index() >= 0 && !IsRecordStillThere())
        return Outcome::Failed;
    OpenResult& result = source_.Result();
    if (environment_.settings.confirmDelete && !environment_.prompt.AskYesNo({Str::DeleteRecordQuestion, {}}))
        return Outcome::Stopped;
    switch (result.Delete(asked, environment_.settings.words)) {
    case OpenResult::Written::Done:
        DataHasChanged();
        return Outcome::Done;
    case OpenResult::Written::Refused:
        environment_.prompt.ShowError(result.LastFailure());
        result.RunAgain();
        ShowResult(FormControls::Edits::Keep);
        return Outcome::Failed;
    case OpenResult::Written::Gone:
        environment_.prompt.Show({Str::RecordDeletedMeanwhile, {}});
        TakeUpChanges();
        return Outcome::Failed;
    case OpenResult::Written::GaveWay:
        break;
    }
    ShowRecord(FormControls::Edits::Keep);
    return Outcome::Stopped;
}

RunningForm::Outcome RunningForm::Undo()
{
    return Turn(CanUndo(), &OpenResult::Undo);
}

RunningForm::Outcome RunningForm::Redo()
{
    return Turn(CanRedo(), &OpenResult::Redo);
}

RunningForm::Outcome RunningForm::Turn(bool can, ChangeLog::Outcome (OpenResult::*turn)())
{
    if (!can || !HasResult())
        return Outcome::Done;
    if (!LeaveRecordCheck())
        return Outcome::Stopped;
    const bool done = (source_.Result().*turn)().done;
    DataHasChanged();
    return done ? Outcome::Done : Outcome::Failed;
}

// After each change that was written: the aggregates only where the user wants them brought up to date, because
// they cost a walk over all records.
void RunningForm::DataHasChanged(FormControls::Edits edits)
{
    dataChanged_ = true;
    ShowRecord(edits);
    if (environment_.settings.updateAggregate || source_.Count() < 1)
        RecomputeAggregates();
    controls_.TouchLists();
}

QString RunningForm::RefusedField(int field, Hr hr) const
{
    const QString place = StringText(Str::FormFieldRefused, {source_.Records().FieldName(field)});
    return ProviderErrorText(&source_.Records(), hr, place);
}

// --- filter and sort --------------------------------------------------------------------------------------------

int RunningForm::FieldOfControl(int control) const
{
    return control < 0 || control >= int(Controls().size()) ? -1 : controls_.ColumnOf(control, source_);
}

template <typename Rewrite>
RunningForm::Outcome RunningForm::Rearrange(Rewrite rewrite)
{
    if (!HasResult())
        return Outcome::Failed;
    if (!LeaveRecordCheck())
        return Outcome::Stopped;
    const bool done = rewrite();
    controls_.ForgetSorting();
    ShowResult();
    return done ? Outcome::Done : Outcome::Failed;
}

RunningForm::Outcome RunningForm::FilterByControl(int control, CellFilter filter)
{
    const int field = FieldOfControl(control);
    if (field < 0 || source_.Index() < 0)
        return Outcome::Done;
    const DbRecordset& records = source_.Records();
    const YesNoWords& words = environment_.settings.words;
    const Value value = records.FieldValue(field);
    const FieldType type = records.TypeOfField(field);
    return AddCondition(ConditionFromCell(filter, source_.Result().ReferenceOf(field), type, value,
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
    return SortByTerms(u"%1 %2"_s.arg(source_.Result().ReferenceOf(field), word));
}

RunningForm::Outcome RunningForm::AddCondition(const QString& condition)
{
    if (condition.isEmpty() || source_.Count() < 1)
        return Outcome::Done;
    return Rearrange([&] { return source_.Result().AddCondition(condition); });
}

RunningForm::Outcome RunningForm::SortByTerms(const QString& terms)
{
    if (terms.isEmpty() || source_.Count() < 1)
        return Outcome::Done;
    return Rearrange([&] { return source_.Result().OrderBy(terms); });
}

RunningForm::Outcome RunningForm::RemoveFilter()
{
    return Rearrange([&] { return source_.Result().RemoveConditions(); });
}

RunningForm::Outcome RunningForm::TakeFilterOff(int filter)
{
    std::vector<OpenResult::Filter> filters = Filters();
    if (filter < 0 || size_t(filter) >= filters.size())
        return Outcome::Done;
    filters.erase(filters.begin() + filter);
    return Rearrange([&] { return source_.Result().Refilter(filters); });
}

RunningForm::Outcome RunningForm::SwitchFilter(int filter)
{
    std::vector<OpenResult::Filter> filters = Filters();
    if (filter < 0 || size_t(filter) >= filters.size())
        return Outcome::Done;
    filters[size_t(filter)].on = !filters[size_t(filter)].on;
    return Rearrange([&] { return source_.Result().Refilter(filters); });
}

} // namespace mirel
