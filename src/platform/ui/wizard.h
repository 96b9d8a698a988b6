#pragma once

#include "resources/string_id.h"

#include <QDialog>

#include <span>

class QLabel;
class QPushButton;
class QStackedWidget;

namespace mirel {

struct WizardStep {
    Str title;
    Str goOn; // what the forward button says
};

// The frame of a dialog of several steps: a heading that says which of them it is, the page of the step, and the
// buttons Cancel, Back and the one that goes on. Steps count from 0 and must outlive the wizard.
class Wizard : public QDialog {
    Q_OBJECT

protected:
    Wizard(std::span<const WizardStep> steps, QSize firstSize, QWidget* parent);

    void AddPage(QWidget* page); // in the order of the steps
    int CurrentStep() const;
    bool IsLastStep() const { return CurrentStep() + 1 == int(steps_.size()); }
    // A step out of range stops at the nearest one.
    virtual void ShowStep(int step);
    virtual void GoOn() = 0;
    QPushButton* NextButton() const { return next_; }

private:
    void LayOut();

    std::span<const WizardStep> steps_;
    QLabel* heading_;
    QStackedWidget* pages_;
    QPushButton* back_;
    QPushButton* next_;
};

} // namespace mirel
