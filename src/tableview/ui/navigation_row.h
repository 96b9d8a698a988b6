#pragma once

#include <QToolButton>
#include <QWidget>

#include <array>

class QAction;
class QMenu;

namespace mirel {

// A button whose text is always whole: in a narrow one the letters get narrower.
class CounterButton : public QToolButton {
    Q_OBJECT
public:
    using QToolButton::QToolButton;

protected:
    void paintEvent(QPaintEvent* event) override;
};

// The buttons under the grid: first, previous, the counter (which opens Go To Record), next, last, New, Delete,
// and the change between list and detail. Their places depend on the row's width alone, not on the counter: where
// the row is narrow, words give way to icons, and in a very narrow one buttons move into a menu behind "…".
class NavigationRow : public QWidget {
    Q_OBJECT

public:
    struct Actions {
        QAction* first;
        QAction* previous;
        QAction* goTo;
        QAction* next;
        QAction* last;
        QAction* newRecord;
        QAction* deleteRecord;
        QAction* detail;
    };

    NavigationRow(const Actions& actions, QWidget* parent);

    void ShowCounter(const QString& text);

    QSize minimumSizeHint() const override;

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    QToolButton* AddButton(QAction* action);
    void FitButtons();
    int ButtonsWidth() const; // all but the counter

    CounterButton* counter_;
    QToolButton* more_;
    QMenu* moreMenu_;
    std::array<QToolButton*, 3> worded_{};   // New, Delete, Detail
    std::array<QToolButton*, 5> yielding_{}; // in the order in which they give way
};

} // namespace mirel
