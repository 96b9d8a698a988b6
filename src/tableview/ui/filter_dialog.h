#pragma once

#include "data/filter_condition.h"
#include "tableview/field_lists.h"

#include <QDialog>

#include <functional>

class QBoxLayout;
class QCheckBox;
class QComboBox;
class QPlainTextEdit;
class QTabWidget;

namespace mirel {

class DateField;
class ErrorLine;
class FieldChooser;

// One operator and one value of a filter. Of a date field the value is a date with or without a time.
class FilterTerm : public QWidget {
    Q_OBJECT

public:
    explicit FilterTerm(QWidget* parent);

    void SetType(FieldType type, FilterKind kind); // makes the list of operators again
    void SetOperator(const QString& operatorText);
    void SetValue(const QString& displayText);
    QString Operator() const;
    QString Value() const; // a number as a statement has it
    void FocusValue();
    // Why the value cannot be compared, in plain words; empty: it can.
    QString Fault(bool mayBeMissing) const;

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    FieldType type_ = FieldType::None;
    QBoxLayout* row_;
    QComboBox* operators_;
    DateField* value_;
};

// "Filter Expression": puts a condition together from a field, an operator and a value, or takes one as text.
class CFilterDialog : public QDialog {
    Q_OBJECT

public:
    // What takes the condition; false: it was refused, and the user was told why.
    using Apply = std::function<bool(const QString& condition)>;

    // Begins with the selected cell: its table and field, and the text that it shows, uncut. The dialog stays
    // open, with all that was entered, until the condition is taken.
    CFilterDialog(FieldLists& lists, const QString& table, const QString& field, const QString& displayText,
                  Apply apply, QWidget* parent);

    // Begins with a condition that is to be changed.
    void ShowExpression(const QString& condition);

    // Empty: nothing to filter by, as after Cancel.
    QString Condition() const;

private:
    QWidget* BasicPage();
    QWidget* AdvancedPage();
    void TakeField();
    void ShowRange(bool fromTo);
    FilterDraft Draft() const;
    void Insert(const QString& text);
    void TakeCondition();
    QString FaultInBasic() const;
    QString MarkFaultInExpression();

    FieldLists& lists_;
    Apply apply_;
    QTabWidget* tabs_;
    FieldChooser* field_;
    FilterTerm* single_;
    QCheckBox* fromTo_;
    FilterTerm* from_;
    FilterTerm* to_;
    QPlainTextEdit* expression_;
    ErrorLine* error_;
};

} // namespace mirel
