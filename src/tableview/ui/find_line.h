#pragma once

#include "tableview/quick_find.h"

#include <QTimer>
#include <QWidget>

class QLineEdit;

namespace mirel {

class ElidedLabel;

// The line that looks for a text in the records while it is typed: Enter goes on to the next place, Shift+Enter
// to the one before, Escape ends a search that takes long, or closes the line.
//
// The browser must outlive it.
class FindLine : public QWidget {
    Q_OBJECT

public:
    struct Actions {
        QAction* next;
        QAction* previous;
    };

    FindLine(RecordBrowser& browser, const Actions& actions, QWidget* parent);

    void Open(); // with the last text, all of it selected
    // Without a text the line opens.
    void FindAgain(QuickFind::Direction direction);

Q_SIGNALS:
    void moved();  // the browser has been sent to another cell, or has refused to go
    void closed(); // the line is away

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    void Begin(QuickFind::Direction direction, QuickFind::From from);
    void Step();
    void ShowNote();

    QuickFind find_;
    QLineEdit* text_;
    ElidedLabel* note_;
    QTimer slices_;
};

} // namespace mirel
