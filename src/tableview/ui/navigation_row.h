#pragma once

#include <QWidget>

#include <array>

class QAction;
class QMenu;
class QToolButton;

namespace mirel {

// The buttons under the grid: first, previous, the counter (which opens Go To Record), next, last, New, Delete,
// and the change between list and detail. The counter is always whole: where the row is too narrow, words give
// way to icons, and then buttons move into a menu behind "…".
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
    int NeededWidth() const;

    QToolButton* counter_;
    QToolButton* more_;
    QMenu* moreMenu_;
    std::array<QToolButton*, 3> worded_{};   // New, Delete, Detail
    std::array<QToolButton*, 5> yielding_{}; // in the order in which they give way
};

} // namespace mirel
