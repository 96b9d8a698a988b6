#pragma once

#include "expr/expr_token.h"
#include "forms/design/quiet_prompt.h"
#include "forms/form_records.h"
#include "forms/form_source.h"

#include <QHash>
#include <QString>
#include <QStringList>

#include <memory>
#include <vector>

namespace mirel {

// An expression as a field of a property sheet holds it.
struct DeskQuestion {
    QString text;
    ExprMode mode = ExprMode::Condition;
    bool overAll = false;  // evaluated over all records
    bool isColumn = false; // of a list: a row is one record
    bool ticks = false;    // of a check box: what counts is whether it holds
};

// What the desk says of it.
struct DeskAnswer {
    enum class State {
        Nothing,  // there is no expression: the control shows what is put into it
        NoResult, // the form's table cannot be read
        NoRecord,
        Null,
        Value,
    };
    State state = State::Nothing;
    QString value;       // as a control shows it; of a check box "1" or "0"
    QStringList losses;  // what will be nothing, or less than it says, whatever the record
    QStringList reasons; // why it is null on this record
    QStringList meaning; // the tree in words, a line a node
};

// Reads expressions of a form that is being designed: their value on a record of the form's table, what the
// language leaves out of them, what they mean, and which controls refer to each other in a circle.
//
// Connection must outlive the desk. Nothing is ever asked or reported.
class ExpressionDesk {
public:
    ExpressionDesk(DbConnection& connection, DatabaseLocation database, YesNoWords words);
    Q_DISABLE_COPY_MOVE(ExpressionDesk)

    // The records of that table; does nothing when they are open already.
    void Open(const QString& table);
    void Close(); // its structure changes
    bool HasResult() const { return source_.IsOpen(); }
    qint64 RecordCount() { return source_.IsOpen() ? source_.Count() : 0; }
    qint64 Record() const { return record_; } // from 0; -1: none
    void GoTo(qint64 record);

    DeskAnswer Read(const DeskQuestion& question, const FormDef& form);
    // The value on another record, for the neighbors; "" where there is none.
    QString ValueOn(qint64 record, const DeskQuestion& question, const FormDef& form);

    // Everything of the form that will be nothing, or less than it says: "Total: At 3: ...".
    QStringList LossesOf(const FormDef& form);

private:
    QString TextOfControl(QStringView name) const { return texts_.value(name.trimmed().toString()); }
    void CollectTexts(const ExprNode& tree, const FormDef& form, QStringList visited);
    DeskAnswer Evaluate(const DeskQuestion& question, const FormDef& form);
    void AddLosses(const ControlDef& control, const DeskQuestion& question, const FormDef& form, QStringList& all);
    void AddAssignmentLosses(const ControlDef& control, const FormDef& form, QStringList& all);

    QuietPrompt quiet_;
    FormSource source_;
    QHash<QString, QString> texts_; // of the controls that the expression names
    QString table_;
    qint64 record_ = -1;
};

// The circles in which the form's controls refer to each other, each "A → B → A".
QStringList CirclesOf(const FormDef& form);

// The expressions of a control, as its property sheet has them.
std::vector<DeskQuestion> ExpressionsOf(const ControlDef& control);

} // namespace mirel
