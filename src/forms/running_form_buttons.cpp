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
        return control.type == ControlType::Button && control.buttonFunction == ButtonFunction::Select &&
               control.option1 != 0;
    });
    if (button != form_.controls.end())
        return RunSelect(*button) == Outcome::Done;
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

RunningForm::Outcome RunningForm::RunQuery(const QString& query, qint64 record)
{
    const QString statement = CompleteQuery(query, form_.tableName.Text(), TextsForQueries());
    const bool opened = MayRun(statement) && result_.Open(statement, record);
    if (!opened)
        result_.Close();
    controls_.ForgetSorting();
    ShowResult();
    return opened ? Outcome::Done : Outcome::Failed;
}

int RunningForm::FirstUpdateButton() const
{
    const std::span<const ControlRun> controls = Controls();
    const auto button = std::ranges::find_if(controls, [](const ControlRun& control) {
        return control.type == ControlType::Button && control.definition->buttonFunction == ButtonFunction::Update;
    });
    return button == controls.end() ? -1 : int(button - controls.begin());
}

RunningForm::Outcome RunningForm::PressButton(int control)
{
    return controls_.Is(control, ControlType::Button) ? RunButton(*controls_[control].definition)
                                                      : Outcome::Failed;
}

RunningForm::Outcome RunningForm::RunButton(const ControlDef& button)
{
    switch (button.buttonFunction) {
    case ButtonFunction::Select:
        return RunSelect(button);
    case ButtonFunction::DeleteRecord:
        return DeleteRecord();
    case ButtonFunction::Update:
        return RunUpdate(button, result_.Index(), result_.Index());
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
        return RunUpdate(button, 0, result_.Count() - 1);
    case ButtonFunction::None:
    case ButtonFunction::Nothing:
        break;
    }
    return Outcome::Done; // so is any other number that a file may hold
}

RunningForm::Outcome RunningForm::RunSelect(const ControlDef& button)
{
    if (!LeaveRecordCheck())
        return Outcome::Stopped;
    const QString query = button.source.Text();
    if (query.isEmpty())
        return Outcome::Done;
    environment_.host.lastQuery = query;
    return RunQuery(query, -1);
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
    const bool done = result_.RunAgain();
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
        call.query = result_.Query();
        call.record = result_.Index();
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
    const int field = result_.Context().FindColumn(written);
    if (field < 0 || target.table.isEmpty())
        return field;
    const QString& table = result_.Records().Fields()[size_t(field)].table;
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
        assignment.type = result_.Records().TypeOfField(assignment.field);
        assignment.size = result_.Records().FieldSize(assignment.field);
        assignments.push_back(std::move(assignment));
    }
    return assignments;
}

bool RunningForm::UpdateRecord(std::vector<FieldAssignment>& assignments, bool& written)
{
    const bool isShown = result_.Records().Position() == result_.Index(); // others pass by in a bulk update
    std::vector<FieldChange> changes;
    for (FieldAssignment& assignment : assignments) {
        if (assignment.field < 0 || !assignment.tree)
            continue;
        // What the record itself put into a control may show less than the store holds: a number's last digits, a
        // date's fraction of a second. Writing it back would lose them.
        if (isShown && controls_.IsUntouched(assignment, result_))
            continue;
        FieldChange change{assignment.field, {}};
        const Hr hr = ValueToStore(
            assignment, result_.Context(), [this](QStringView name) { return ControlText(name); }, change.value);
        if (Failed(hr)) {
            ReportRefusedField(assignment.field, hr);
            return false;
        }
        changes.push_back(std::move(change));
    }
    if (changes.empty())
        return true;
    written = result_.Records().Update(changes);
    if (!written)
        result_.Report();
    return written;
}

bool RunningForm::UpdateRecords(std::vector<FieldAssignment>& assignments, qint64 first, qint64 last,
                                qint64& written)
{
    constexpr qint64 kTellEvery = 64;
    const std::unique_ptr<Progress> progress =
        environment_.prompt.StartProgress({Str::FormUpdatingRecords, {}}, last - first + 1);
    for (qint64 record = first; record <= last; ++record) {
        if (record != result_.Records().Position() && !result_.Records().MoveTo(record)) {
            result_.Report();
            return false;
        }
        bool wrote = false;
        if (!UpdateRecord(assignments, wrote))
            return false;
        written += wrote ? 1 : 0;
        const qint64 done = record - first + 1;
        if (done % kTellEvery == 0 && !progress->Advance(done))
            return false;
    }
    return true;
}

RunningForm::Outcome RunningForm::RunUpdate(const ControlDef& button, qint64 first, qint64 last)
{
    if (result_.Count() <= 0 || first < 0)
        return Outcome::Done;
    const qint64 count = last - first + 1;
    if (count > 1 && !environment_.prompt.AskYesNo({Str::FormUpdateAllQuestion, {QString::number(count)}}))
        return Outcome::Stopped;
    std::vector<FieldAssignment> assignments = AssignmentsOf(button);
    const qint64 current = result_.Index();
    qint64 written = 0;
    const bool done = count > 1 ? UpdateInBulk(assignments, first, last, written)
                                : UpdateRecords(assignments, first, last, written);
    if (result_.Records().Position() != current)
        (void)result_.MoveTo(current);
    if (written > 0 || done)
        controls_.ForgetEditsOf(ControlsOf(assignments));
    if (written > 0)
        DataHasChanged(FormControls::Edits::Keep);
    return done ? Outcome::Done : Outcome::Failed;
}

// One transaction: what was written before a refused record or a stop is committed, a power loss leaves nothing.
bool RunningForm::UpdateInBulk(std::vector<FieldAssignment>& assignments, qint64 first, qint64 last,
                               qint64& written)
{
    ProviderConnection* provider = environment_.connection.Provider();
    Hr hr = provider->BeginBulk(environment_.database);
    const bool done = !Failed(hr) && UpdateRecords(assignments, first, last, written);
    if (!Failed(hr))
        hr = provider->EndBulk(environment_.database);
    if (Failed(hr))
        environment_.prompt.ShowError(ProviderErrorText(nullptr, hr, {}));
    return done && !Failed(hr);
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
            LiteralToInsert(assignment, result_.Context(), [this](QStringView name) { return ControlText(name); });
    }
    const QString table = environment_.activeTable.isEmpty() ? form_.tableName.Text() : environment_.activeTable;
    const QString statement = u"INSERT INTO [%1] [%2)] %3)"_s.arg(table, columns, values);
    DbRecordset rows(environment_.connection);
    if (!rows.Open(statement, environment_.database, CursorType::ForwardOnly, LockType::ReadOnly)) {
        ReportProviderError(environment_.prompt, &rows, rows.LastResult());
        return Outcome::Failed;
    }
    result_.Recount();
    controls_.ForgetEditsOf(ControlsOf(assignments));
    DataHasChanged(FormControls::Edits::Keep);
    return Outcome::Done;
}

} // namespace mirel
