#include "data/catalog.h"
#include "data/provider_error.h"
#include "expr/evaluation.h"
#include "forms/form_query.h"
#include "forms/running_form.h"
#include "platform/ole_date.h"
#include "resources/string_table.h"

#include <algorithm>

// The first result of a running form, and the functions of its buttons.

namespace mirel {

using namespace Qt::StringLiterals;

namespace {

// The controls whose texts the assignments write.
QStringList ControlsOf(const std::vector<FieldAssignment>& assignments)
{
    QStringList names;
    for (const FieldAssignment& assignment : assignments) {
        if (assignment.field >= 0 && assignment.tree)
            CollectControlNames(*assignment.tree, names);
    }
    return names;
}

QString ReferenceOf(const TargetName& target)
{
    const QString field = FieldReference(target.field);
    return target.table.isEmpty() ? field : FieldReference(target.table) + u'.' + field;
}

} // namespace

bool RunningForm::Open()
{
    const bool opened = OpenFirstResult();
    FillDropDowns();
    return opened;
}

bool RunningForm::OpenFirstResult()
{
    if (!callQuery_.isEmpty())
        return RunQuery(callQuery_, callRecord_) == Outcome::Done;
    const auto button = std::ranges::find_if(form_.controls, [](const ControlDef& control) {
        return Has(control.type, IsPressed) && control.buttonFunction == ButtonFunction::Select &&
               control.option1 != 0;
    });
    if (button != form_.controls.end())
        return RunSelect(*button, callRecord_) == Outcome::Done;
    if (form_.defaultQueryOnStartup != 0 && form_.defaultQuery.IsSet())
        return RunQuery(form_.defaultQuery.Text(), callRecord_) == Outcome::Done;
    if (!form_.tableName.IsEmpty())
        return RunQuery(u"SELECT *"_s, callRecord_) == Outcome::Done;
    ShowResult();
    return true;
}

// A form's queries come from a file: they show records, and nothing else.
bool RunningForm::MayRun(const QString& statement)
{
    if (OnlyReads(statement))
        return true;
    environment_.prompt.Show({Str::FormQueryMustRead, {statement}});
    return false;
}

// On that record, or on the first one where there is no such record.
bool RunningForm::OpenAt(const QString& statement, qint64 record)
{
    OpenResult& result = source_.Result();
    if (!result.Open(statement))
        return false;
    return record <= 0 || record >= result.Count() || result.MoveTo(record);
}

RunningForm::Outcome RunningForm::RunQuery(const QString& query, qint64 record)
{
    const QString statement = CompleteQuery(query, form_.tableName.Text(), TextsForQueries());
    const bool opened = MayRun(statement) && OpenAt(statement, record);
    if (!opened)
        source_.Result().Close();
    controls_.ForgetSorting();
    ShowResult();
    return opened ? Outcome::Done : Outcome::Failed;
}

int RunningForm::FirstUpdateButton() const
{
    const std::span<const ControlRun> controls = Controls();
    const auto button = std::ranges::find_if(controls, [](const ControlRun& control) {
        return Has(control.type, IsPressed) && control.definition->buttonFunction == ButtonFunction::Update;
    });
    return button == controls.end() ? -1 : int(button - controls.begin());
}

RunningForm::Outcome RunningForm::PressButton(int control)
{
    whyFailed_.clear();
    return controls_.Is(control, IsPressed) ? RunButton(*controls_[control].definition) : Outcome::Failed;
}

RunningForm::Outcome RunningForm::RunButton(const ControlDef& button)
{
    switch (button.buttonFunction) {
    case ButtonFunction::Select:
        return RunSelect(button);
    case ButtonFunction::DeleteRecord:
        return DeleteRecord();
    case ButtonFunction::Update:
        return RunUpdate(button);
    case ButtonFunction::Insert:
        return RunInsert(button);
    case ButtonFunction::First:
        return GoToFirst();
    case ButtonFunction::Last:
        return GoToLast();
    case ButtonFunction::Next:
        return GoToNext();
    case ButtonFunction::Previous:
        return GoToPrevious();
    case ButtonFunction::ClearForm:
        return RunClearForm();
    case ButtonFunction::Close:
        return Close();
    case ButtonFunction::Recalc:
        return RunRecalc();
    case ButtonFunction::CallForm:
        return RunCallForm(button);
    case ButtonFunction::UpdateAll:
        return RunUpdateAll(button);
    case ButtonFunction::None:
    case ButtonFunction::Nothing:
        break;
    }
    return Outcome::Done; // so is any other number that a file may hold
}

RunningForm::Outcome RunningForm::RunSelect(const ControlDef& button, qint64 record)
{
    if (!LeaveRecordCheck())
        return Outcome::Stopped;
    const QString query = button.source.Text();
    if (query.isEmpty())
        return Outcome::Done;
    environment_.host.lastQuery = query;
    return RunQuery(query, record);
}

RunningForm::Outcome RunningForm::RunClearForm()
{
    controls_.ClearInputs();
    return Outcome::Done;
}

RunningForm::Outcome RunningForm::RunAgain()
{
    if (!HasResult())
        return Outcome::Failed;
    if (!LeaveRecordCheck())
        return Outcome::Stopped;
    const bool done = source_.Result().RunAgain();
    FillDropDowns();
    ShowResult();
    return done ? Outcome::Done : Outcome::Failed;
}

RunningForm::Outcome RunningForm::RunRecalc()
{
    FillDropDowns();
    // What the user typed stays: expressions that refer to it are what is to be recomputed.
    ShowResult(FormControls::Edits::Keep);
    return Outcome::Done;
}

RunningForm::Outcome RunningForm::RunCallForm(const ControlDef& button)
{
    const bool wasDirty = IsDirty();
    if (!LeaveRecordCheck())
        return Outcome::Stopped;
    if (wasDirty)
        ShowRecord();
    const FormDef* called = environment_.store.FindForm(button.source.Text());
    if (!called)
        return Outcome::Done;
    FormCall call;
    call.form.CopyFrom(*called);
    if (button.option1 != 0 && HasResult()) {
        call.query = CurrentQuery();
        call.record = source_.Index();
    }
    const bool closes = button.option2 != 0;
    TellDataChanged();
    environment_.host.CallForm(call);
    if (closes)
        environment_.host.CloseForm();
    return Outcome::Done;
}

RunningForm::Outcome RunningForm::Close()
{
    if (!LeaveRecordCheck())
        return Outcome::Stopped;
    TellDataChanged();
    environment_.host.CloseForm();
    return Outcome::Done;
}

void RunningForm::TellDataChanged()
{
    if (dataChanged_)
        environment_.host.DataChanged();
    dataChanged_ = false;
}

// --- assignments ------------------------------------------------------------------------------------------------

// The result's field that a target names. A field of the same name that belongs to another table is none.
int RunningForm::FieldOfTarget(const TargetName& target)
{
    const QString written =
        target.table.isEmpty() ? u"[%1]"_s.arg(target.field) : u"[%1].[%2]"_s.arg(target.table, target.field);
    const int field = source_.Context().FindColumn(written);
    if (field < 0 || target.table.isEmpty())
        return field;
    const QString& table = source_.Records().Fields()[size_t(field)].table;
    const bool same = table.isEmpty() || table.compare(target.table, Qt::CaseInsensitive) == 0;
    return same ? field : -1;
}

std::vector<FieldAssignment> RunningForm::AssignmentsOf(const ControlDef& button)
{
    std::vector<FieldAssignment> assignments;
    if (!HasResult())
        return assignments;
    for (const SourceAssignment& source : SplitAssignments(button.source.Text())) {
        FieldAssignment assignment = ParseAssignment(source);
        assignment.field = FieldOfTarget(assignment.target);
        assignment.type = source_.Records().TypeOfField(assignment.field);
        assignment.size = source_.Records().FieldSize(assignment.field);
        assignments.push_back(std::move(assignment));
    }
    return assignments;
}

std::optional<std::vector<FieldChange>> RunningForm::ValuesOf(std::vector<FieldAssignment>& assignments,
                                                              Values which, QString& failure)
{
    std::vector<FieldChange> values;
    for (FieldAssignment& assignment : assignments) {
        if (assignment.field < 0 || !assignment.tree)
            continue;
        // What the record itself put into a control may show less than the store holds: a number's last digits, a
        // date's fraction of a second. Writing it back would lose them.
        if (which == Values::Touched && controls_.IsUntouched(assignment, source_))
            continue;
        FieldChange change{assignment.field, {}};
        const Hr hr = ValueToStore(
            assignment, source_.Context(), [this](QStringView name) { return ControlText(name); }, change.value);
        if (Failed(hr)) {
            failure = RefusedField(assignment.field, hr);
            return {};
        }
        values.push_back(std::move(change));
    }
    return values;
}

RunningForm::Outcome RunningForm::RunUpdate(const ControlDef& button)
{
    if (!HasResult())
        return Outcome::Done;
    if (source_.Index() < 0)
        return SaveToNoRecord(button);
    if (!IsRecordStillThere())
        return Outcome::Failed;
    OpenResult& result = source_.Result();
    std::vector<FieldAssignment> assignments = AssignmentsOf(button);
    QString failure;
    const std::optional<std::vector<FieldChange>> values = ValuesOf(assignments, Values::Touched, failure);
    if (!values) {
        environment_.prompt.ShowError(failure);
        return Outcome::Failed;
    }
    OpenResult::Written written = OpenResult::Written::Done;
    if (!values->empty())
        written = result.Update(*values, environment_.settings.words);
    else if (result.IsGone())
        written = OpenResult::Written::Gone;
    switch (written) {
    case OpenResult::Written::Refused:
        environment_.prompt.ShowError(result.LastFailure());
        return Outcome::Failed;
    case OpenResult::Written::Gone:
        environment_.prompt.Show({Str::RecordDeletedMeanwhile, {}});
        return Outcome::Failed;
    case OpenResult::Written::GaveWay:
        ShowRecord();
        return Outcome::Stopped;
    case OpenResult::Written::Done:
        break;
    }
    controls_.ForgetEditsOf(ControlsOf(assignments));
    if (!values->empty())
        DataHasChanged(FormControls::Edits::Keep);
    return Outcome::Done;
}

// What is typed has no record to go to: it can become one.
RunningForm::Outcome RunningForm::SaveToNoRecord(const ControlDef& button)
{
    if (!controls_.AreEdited())
        return Outcome::Done;
    if (!CanUpdate() ||
        !environment_.prompt.AskYesNoWith({Str::SaveAsNewRecord, {}}, {.preset = UserPrompt::Preset::Yes}))
        return Outcome::Stopped;
    std::vector<FieldAssignment> assignments = AssignmentsOf(button);
    std::vector<FieldChange> values;
    QString failure;
    const std::optional<std::vector<FieldChange>> typed = ValuesOf(assignments, Values::All, failure);
    if (!typed || !NewRecordValues(values)) {
        if (!typed)
            environment_.prompt.ShowError(failure);
        return Outcome::Failed;
    }
    for (const FieldChange& change : *typed) {
        std::erase_if(values, [&](const FieldChange& preset) { return preset.field == change.field; });
        values.push_back(change);
    }
    if (!source_.Result().AskForRequired(values))
        return Outcome::Stopped;
    if (source_.Result().Add(values) != OpenResult::Written::Done) {
        environment_.prompt.ShowError(source_.Result().LastFailure());
        return Outcome::Failed;
    }
    controls_.ForgetEdits();
    DataHasChanged();
    return Outcome::Done;
}

RunningForm::Outcome RunningForm::RunUpdateAll(const ControlDef& button)
{
    TakeUpChanges();
    if (source_.Count() <= 0)
        return Outcome::Done;
    OpenResult& result = source_.Result();
    qint64 count = source_.Count();
    std::vector<FieldAssignment> assignments = AssignmentsOf(button);
    const RecordId current = source_.Records().Id();
    OpenResult::ManyWritten written;
    QString failure;
    for (bool isAskedAgain = false;; isAskedAgain = true) {
        if ((count > 1 || isAskedAgain) &&
            !environment_.prompt.AskYesNo({Str::FormUpdateAllQuestion, {QString::number(count)}}))
            return Outcome::Stopped;
        const std::unique_ptr<Progress> progress =
            environment_.prompt.StartProgress({Str::FormUpdatingRecords, {}}, count);
        const auto values = [&] {
            // Others pass by: only the shown record has put its own values into the controls.
            const Values which = source_.Records().Id() == current ? Values::Touched : Values::All;
            return ValuesOf(assignments, which, failure);
        };
        written = result.WriteAll(count, values, *progress);
        if (result.LastResult() != Hr::RecordChanged)
            break;
        count = result.Count();
    }
    if (!result.MoveToRecord(current))
        (void)result.MoveTo(std::max<qint64>(result.Position(), 0));
    const bool done = written.failure.isEmpty() && failure.isEmpty();
    if (!done)
        environment_.prompt.ShowError(failure.isEmpty() ? written.failure : failure);
    else if (written.records > 0)
        controls_.ForgetEditsOf(ControlsOf(assignments));
    if (written.records > 0)
        DataHasChanged(FormControls::Edits::Keep);
    return done ? Outcome::Done : Outcome::Failed;
}

RunningForm::Outcome RunningForm::RunInsert(const ControlDef& button)
{
    QString columns = u"("_s;
    QString values = u"VALUES("_s;
    if (!HasResult())
        return Outcome::Failed;
    std::vector<FieldAssignment> assignments = AssignmentsOf(button);
    if (assignments.empty())
        return Outcome::Done;
    for (FieldAssignment& assignment : assignments) {
        if (assignment.field < 0) {
            environment_.prompt.Show({Str::FormNoSuchField, {assignment.target.field}});
            return Outcome::Failed;
        }
        if (&assignment != &assignments.front()) {
            columns += u',';
            values += u',';
        }
        columns += ReferenceOf(assignment.target);
        values +=
            LiteralToInsert(assignment, source_.Context(), [this](QStringView name) { return ControlText(name); });
    }
    const QString table = environment_.activeTable.isEmpty() ? form_.tableName.Text() : environment_.activeTable;
    const QString statement = u"INSERT INTO [%1] [%2)] %3)"_s.arg(table, columns, values);
    DbRecordset rows(environment_.connection);
    if (!rows.Open(statement, environment_.database, CursorType::ForwardOnly, LockType::ReadOnly)) {
        ReportProviderError(environment_.prompt, &rows, rows.LastResult());
        return Outcome::Failed;
    }
    controls_.ForgetEditsOf(ControlsOf(assignments));
    TakeUpChanges();
    DataHasChanged(FormControls::Edits::Keep);
    return Outcome::Done;
}

} // namespace mirel
