#pragma once

#include "data/db_connection.h"
#include "forms/assignment.h"
#include "forms/control_binding.h"
#include "forms/control_run.h"
#include "forms/control_types.h"
#include "forms/form_query.h"
#include "forms/form_source.h"

#include <QHash>

#include <span>
#include <vector>

namespace mirel {

// The controls of a running form: what they show of a result, and what the user changed in them.
//
// Controls count from 0 in the form's list order. The form must outlive them. They ask nothing and write nothing;
// indexes are those of controls that are there.
class FormControls {
public:
    explicit FormControls(const FormDef& form);
    Q_DISABLE_COPY_MOVE(FormControls)

    std::span<const ControlRun> All() const { return controls_; }
    const ControlRun& operator[](int control) const { return controls_[size_t(control)]; }
    bool Is(int control, ControlTrait trait) const; // false for an index out of range
    int Find(QStringView name) const;               // the first that can hold a value, else the first; -1: none
    // Grows with every change of what a control shows.
    quint64 Revision() const { return revision_; }

    // What a control holds as one text: "1" or "0" for a check box, nothing for a list.
    QString ShownText(int control) const;
    // The same by name, for expressions and queries; empty where no control of that name holds a value.
    std::optional<QString> TextOf(QStringView name) const;
    // The result's column that a control shows; -1: none, or more than that.
    int ColumnOf(int control, const FormSource& result) const;

    // --- showing ------------------------------------------------------------------------------------------

    // The current record in all controls that show one, without a record nothing but the time.
    enum class Edits { Drop, Keep }; // kept ones stay as long as they differ from what the record gives
    void ShowRecord(const FormSource& result, Edits edits = Edits::Drop);
    // The aggregates, computed again over the whole result; nothing where `computed` says that there are none.
    void ShowAggregates(const FormSource& result, bool computed);
    std::span<ControlBinding> Bindings() { return bindings_; }
    void TouchLists(); // their rows may hold other texts
    void Touch(int control);
    void ShowTime(const FormSource& result); // in the clocks alone
    bool HasClock() const;
    void SetItems(int control, QStringList items);
    // Which column a list is sorted by; -1: none. No other list is sorted then.
    void MarkSorted(int control, int column, bool descending);
    void ForgetSorting() { MarkSorted(-1, -1, false); }
    // The rows of a list as far as there are any.
    std::vector<QStringList> ListRows(int control, FormSource& result, qint64 first, int count);

    // --- edits --------------------------------------------------------------------------------------------

    void SetText(int control, const QString& text);
    void SetTicked(int control, bool ticked);
    void ClearInputs(); // edit boxes and check boxes; no edit
    bool AreEdited() const { return edited_; }
    void ForgetEdits();
    void ForgetEditsOf(const QStringList& names); // what these controls hold was written
    // Whether the assignment would only write back what the current record put into its control.
    bool IsUntouched(const FieldAssignment& assignment, const FormSource& result) const;

private:
    int FindInput(QStringView name) const;
    void MarkUpdateReferences(const FormDef& form);
    void OrderByReferences();
    bool ShowsRecord(size_t control) const; // its own value on the current record, not one over the whole result
    void Show(size_t control, const FormSource& result);
    void ShowNothing(size_t control);
    void ShowText(ControlRun& control, const QString& text);
    void ShowTicked(ControlRun& control, bool ticked);
    void ShowPlaceInList(ControlRun& control, const FormSource& result);
    void MarkEdited(ControlRun& control, bool edited);
    void Touch(ControlRun& control) { control.revision = ++revision_; }

    std::vector<ControlRun> controls_;
    std::vector<ControlBinding> bindings_; // one a control
    QHash<QString, int> names_;            // those that hold a value first
    std::vector<int> order_;               // in which they are computed: what one reads comes before it
    std::vector<int> readers_;             // of other controls, in that order
    bool edited_ = false;
    bool hasRecord_ = false;
    quint64 revision_ = 0;
};

} // namespace mirel
