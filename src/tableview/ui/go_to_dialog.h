#pragma once

#include <QDialog>

class QLineEdit;
class QRadioButton;

namespace mirel {

// Asks which record to go to.
class CGoToDialog : public QDialog {
    Q_OBJECT

public:
    enum class Choice { Record, First, Last, Previous, Next };

    // `record` counts from 1, and is what the number begins with.
    CGoToDialog(qint64 record, QWidget* parent);

    Choice Chosen() const;
    qint64 Number() const; // 0: no number was entered

private:
    QRadioButton* AddChoice(const QString& text);

    QList<QRadioButton*> choices_; // in the order of Choice
    QLineEdit* number_;
};

} // namespace mirel
