#pragma once

#include "resources/string_id.h"

#include <QWidget>

#include <functional>
#include <vector>

class QLabel;
class QPushButton;

namespace mirel {

// One step: what it says, and the part of the window that it points at (null: none, or not there now).
struct TourStep {
    Str title;
    Str text;
    std::function<QWidget*()> part;
};

// Points at the parts of a window one after the other. It lies over the whole window, dims what it does not speak
// of, and goes at its end, with Escape, or with its cross. Its steps ask for their parts again when the window
// changes its size.
class Tour : public QWidget {
    Q_OBJECT
public:
    Tour(std::vector<TourStep> steps, QWidget& window);

    int Step() const { return step_; }

protected:
    void paintEvent(QPaintEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;
    bool focusNextPrevChild(bool next) override; // the Tab key stays in the bubble

private:
    void MakeBubble();
    void GoTo(int step);
    void Place();
    QRect PartRect() const; // empty: the step points at nothing

    QWidget& window_;
    std::vector<TourStep> steps_;
    int step_ = 0;
    QWidget* bubble_;
    QLabel* title_;
    QLabel* text_;
    QLabel* count_;
    QPushButton* back_;
    QPushButton* next_;
};

} // namespace mirel
