#pragma once

#include "data/db_connection.h"
#include "data/filter_condition.h"
#include "forms/form_controls.h"
#include "forms/form_host.h"
#include "forms/form_source.h"
#include "forms/form_store.h"
#include "forms/form_view_settings.h"
#include "platform/user_prompt.h"
#include "result/record_draft.h"

#include <QDateTime>
#include <QHash>
#include <QString>
#include <QStringList>

#include <functional>
#include <optional>
#include <span>
#include <vector>

namespace mirel {

// What a running form works with. All of it must outlive the form.
struct FormEnvironment {
    DbConnection& connection;
    DatabaseLocation database;
    const FormStore& store; // where CALL FORM looks
    UserPrompt& prompt;
    FormHost& host;
    FormViewSettings settings;
    QString activeTable; // the table that the main view has active: an insert button's; may be empty
    std::function<QDateTime()> clock = &QDateTime::currentDateTime;
};

enum class SortOrder { Ascending, Descending };

// A form as it runs: its controls with what they show, an open result and a current record in it, and all that
// the user can do with them; without a window.
//
// Controls count from 0 in the form's list order; records and rows count from 0. The result stands on the current
// record at all times. A failure of the provider is reported through the prompt before the call returns; a
// result that could not be opened is then closed, and the controls are empty.
//
// A call that leaves the current record asks first when the record is dirty; the user's No stops it, and nothing
// has changed then.
class RunningForm {
public:
    // How a call ended. Stopped: the user said No. Failed: it could not be done, and the user was told where
    // there is something to tell.
    enum class Outcome { Done, Stopped, Failed };

    RunningForm(FormCall call, FormEnvironment environment);
    ~RunningForm();
    Q_DISABLE_COPY_MOVE(RunningForm)

    // Opens the first result and shows its first record, or the one that the call names. Once, before all else.
    // False when the result could not be opened; the form runs all the same.
    bool Open();

    const FormDef& Form() const { return form_; }
    QString Title() const { return form_.name.Text(); }
    const FormViewSettings& Settings() const { return environment_.settings; }
    void ChangeSettings(const FormViewSettings& settings);

    // --- what is shown ------------------------------------------------------------------------------------

    std::span<const ControlRun> Controls() const { return controls_.All(); }
    // The first of that name that can hold a value, else the first; -1: none.
    int FindControl(QStringView name) const { return controls_.Find(name); }
    // What a control holds as one text: "1" or "0" for a check box, nothing for a list.
    QString ShownText(int control) const { return controls_.ShownText(control); }
    // Grows with every change of a control; those whose own revision is greater than the one last seen changed.
    quint64 Revision() const { return controls_.Revision(); }

    bool HasResult() const { return source_.IsOpen(); }
    qint64 RecordCount() const { return source_.Count(); }   // -1: no result
    qint64 CurrentRecord() const { return source_.Index(); } // -1: none
    QString CounterText() const;                             // "3/12", "0/0"; empty without a result
    bool IsDirty() const { return controls_.AreEdited(); }
    bool CanUpdate() const;
    const QString& CurrentQuery() const { return source_.Result().Statement(); }

    // Shows what others changed since the last look, in this program or another. The form stays on its record;
    // where that is gone, the one behind it is shown. Once something is typed, the record stays as it was shown:
    // its save tells what happened to it.
    void TakeUpChanges();
    // After a change of a long order it is the old one for a while; CatchUp works on the new one for about
    // `budgetMs`. True once it is shown.
    bool IsBehind() const { return HasResult() && source_.Result().IsBehind(); }
    bool CatchUp(int budgetMs);

    // The texts of a list's rows, a QStringList a row, uncut. Fewer than asked for at the end.
    std::vector<QStringList> ListRows(int control, qint64 first, int count);
    bool ShowsNumbers(int control, int column); // of a list: a field of numbers

    // --- what the user does to controls -------------------------------------------------------------------

    void SetText(int control, const QString& text); // edit boxes and drop-down boxes
    void SetTicked(int control, bool ticked);       // check boxes
    Outcome SelectListRow(int control, qint64 row);
    // Orders the result by the column's field, and the other way round with the next tap on the same column. Does
    // nothing on an expression.
    Outcome TapListHeader(int control, int column);
    Outcome PressButton(int control);
    // Why the last press failed, where nobody was told yet; empty otherwise.
    QString WhyPressFailed() const { return whyFailed_; }
    // Reads the items of a drop-down box again, before its list is shown: its query may name other controls.
    void RefreshItems(int control);
    // The button that saves; -1: the form has none.
    int FirstUpdateButton() const;

    // What was typed into the current record, or into none, and is not saved; to be kept for the case that the
    // program is killed. None: nothing was.
    std::optional<RecordDraft> Draft();
    // Types it into the same controls on the same record again. False, and nothing changed but the current record,
    // where that is gone or holds other values by now, the form has other controls, or something else is typed.
    bool PutBack(const RecordDraft& draft);

    // --- moving, adding, deleting -------------------------------------------------------------------------

    Outcome GoToFirst();
    Outcome GoToPrevious(); // on the first record it is Done and stays
    Outcome GoToNext();     // on the last one it has Failed
    Outcome GoToLast();
    Outcome GoToRecord(qint64 record);
    Outcome AddRecord();
    Outcome DeleteRecord();
    // Runs the current query again and shows the same record, with everything that is computed computed again.
    Outcome RunAgain();
    // Asks about unsaved changes, tells the host what changed and that it is to close.
    Outcome Close();
    // Only asks about unsaved changes. True: the caller may go on.
    bool LeaveRecordCheck();

    // --- the way back -------------------------------------------------------------------------------------

    // What this form wrote, added and deleted, step by step; what is typed is asked about first.
    bool CanUndo() const { return source_.Result().CanUndo(); }
    bool CanRedo() const { return source_.Result().CanRedo(); }
    Outcome Undo();
    Outcome Redo();

    // --- time ---------------------------------------------------------------------------------------------

    bool HasClock() const { return controls_.HasClock(); } // then call Tick once a second
    void Tick() { controls_.ShowTime(source_); }

    void RecomputeAggregates();

    // --- filter and sort of the result ----------------------------------------------------------------------

    // The result's field that a control shows; -1: none, or an expression.
    int FieldOfControl(int control) const;
    // By what the current record holds in the control's field. Do nothing where there is no such field.
    Outcome FilterByControl(int control, CellFilter filter);
    Outcome SortByControl(int control, SortOrder order);
    Outcome AddCondition(const QString& condition);
    Outcome SortByTerms(const QString& terms);
    bool IsFiltered() const { return !Filters().empty(); }
    QStringList Conditions() const { return source_.Result().Conditions(); } // those in force
    const std::vector<OpenResult::Filter>& Filters() const { return source_.Result().Filters(); }
    // One of them, by its place in the list.
    Outcome TakeFilterOff(int filter);
    Outcome SwitchFilter(int filter);
    Outcome RemoveFilter(); // back to the query that was run, its order included

    // --- the result as records: for the list, zoom and detail modes -----------------------------------------

    std::span<const ResultField> Fields() const { return source_.Records().Fields(); }
    QString FieldText(int field) const; // of the current record, uncut, as the grid shows it
    // The same of any records, a QStringList a record. Fewer than asked for at the end.
    std::vector<QStringList> RecordTexts(qint64 first, int count);
    Outcome SortByField(int field, SortOrder order);

private:
    // The result.
    bool OpenFirstResult();
    bool MayRun(const QString& statement);
    bool OpenAt(const QString& statement, qint64 record);
    Outcome RunQuery(const QString& query, qint64 record);
    bool IsRecordStillThere();
    UserPrompt::Answer AskAboutChanges();
    Outcome LeaveAndMoveTo(qint64 record);
    // Runs `rewrite` on the result after the leave-record check, and shows what came of it.
    template <typename Rewrite>
    Outcome Rearrange(Rewrite rewrite);
    bool NewRecordValues(std::vector<FieldChange>& values);
    void ShowRecord(FormControls::Edits edits = FormControls::Edits::Drop);
    // The aggregates and the lists as well.
    void ShowResult(FormControls::Edits edits = FormControls::Edits::Drop);
    void DataHasChanged(FormControls::Edits edits = FormControls::Edits::Drop);
    QString RefusedField(int field, Hr hr) const;
    Outcome Turn(bool can, ChangeLog::Outcome (OpenResult::*turn)());

    // Items of drop-down boxes.
    // False: its query failed, which was told unless it was to be silent.
    enum class OnFailure { Tell, BeSilent };
    [[nodiscard]] bool FillDropDown(int control, OnFailure onFailure = OnFailure::Tell);
    void FillDropDowns();
    [[nodiscard]] bool ReadItems(const QString& query, OnFailure onFailure, QStringList& items);
    ControlTextOf TextsForQueries() const;

    // Buttons.
    Outcome RunButton(const ControlDef& button);
    Outcome RunSelect(const ControlDef& button, qint64 record = -1);
    Outcome RunUpdate(const ControlDef& button);
    Outcome RunUpdateAll(const ControlDef& button);
    Outcome SaveToNoRecord(const ControlDef& button);
    Outcome RunInsert(const ControlDef& button);
    Outcome RunCallForm(const ControlDef& button);
    Outcome RunClearForm();
    Outcome RunRecalc();
    std::vector<FieldAssignment> AssignmentsOf(const ControlDef& button);
    int FieldOfTarget(const TargetName& target);
    // What the assignments store in the current record. None: a value is refused, and `failure` says why.
    enum class Values { All, Touched }; // Touched: without what still shows what the record itself gave
    std::optional<std::vector<FieldChange>> ValuesOf(std::vector<FieldAssignment>& assignments, Values which,
                                                     QString& failure);
    QString ControlText(QStringView name) const { return controls_.TextOf(name).value_or(QString()); }
    void TellDataChanged();

    FormDef form_;
    QString callQuery_;
    qint64 callRecord_;
    FormEnvironment environment_;
    FormControls controls_;
    FormSource source_;
    QHash<QString, QStringList> itemsOfQuery_; // while many drop-down boxes are filled
    bool dataChanged_ = false;
    QString whyFailed_;
    QByteArray fingerprint_; // of the record that is typed into, once it was asked for
};

} // namespace mirel
