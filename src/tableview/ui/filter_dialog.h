#pragma once

#include "data/filter_condition.h"
#include "tableview/field_lists.h"

#include <QDialog>

class QCheckBox;
class QComboBox;
class QDateEdit;
class QLineEdit;
class QPlainTextEdit;
class QStackedWidget;
class QTabWidget;

namespace mirel {

class FieldChooser;

// One operator and one value of a filter; the value is typed, or a day picked for a date field.
class FilterTerm : public QWidget {
    Q_OBJECT

public:
    explicit FilterTerm(QWidget* parent);

    void SetType(FieldType type, FilterKind kind); // makes the list of operators anew
    void SetOperator(const QString& operatorText);
    void SetValue(const QString& displayText); // a date is read in the user's form
    QString Operator() const;
    QString Value() const;
    void FocusValue();

private:
    QComboBox* operators_;
    QStackedWidget* values_;
    QLineEdit* text_;
    QDateEdit* date_;
};

// "Filter Expression": puts a condition together from a field, an operator and a value, or takes one as text.
class CFilterDialog : public QDialog {
    Q_OBJECT

public:
    // Begins with the selected cell: its table and field, and the text that it shows, uncut.
    CFilterDialog(FieldLists& lists, const QString& table, const QString& field, const QString& displayText,
                  QWidget* parent);

    // Empty: nothing to filter by, as after Cancel.
    QString Condition() const;

private:
    QWidget* BasicPage();
    QWidget* AdvancedPage();
    void TakeField();
    void ShowRange(bool fromTo);
    FilterDraft Draft() const;
    void Insert(const QString& text);

    FieldLists& lists_;
    QTabWidget* tabs_;
    FieldChooser* field_;
    FilterTerm* single_;
    QCheckBox* fromTo_;
    FilterTerm* from_;
    FilterTerm* to_;
    QPlainTextEdit* expression_;
};

} // namespace mirel
