#pragma once

#include "tableview/record_browser.h"

#include <QWidget>

class QAction;
class QToolButton;

namespace mirel {

// The buttons under the grid: first, previous, the counter (which opens Go To Record), next, last, New, Delete,
// and the change between list and detail. The buttons are those of the actions they are given.
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

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    QToolButton* AddButton(QAction* action);

    QToolButton* counter_;
    QToolButton* newRecord_;
    QToolButton* deleteRecord_;
    QToolButton* detail_;
};

} // namespace mirel
