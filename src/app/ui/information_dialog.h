#pragma once

#include "app/database_facts.h"

#include <QDialog>
#include <QTimer>

#include <functional>
#include <vector>

class QFormLayout;
class QLabel;

namespace mirel {

class ElidedLabel;

// Path, stamp, size and content of the open database, and the commands that take care of it.
class CInformationDialog : public QDialog {
    Q_OBJECT
public:
    // Each carries its command out and returns one line that says how it ended; empty: nothing is to be said.
    struct Actions {
        std::function<QString()> backUp;
        std::function<QString()> compact;
        std::function<QString()> check;
    };
    CInformationDialog(DatabaseSession& session, Actions actions, QWidget* parent);

private:
    void LayOut();
    void AddButton(Str text, Str tip, bool asks, const std::function<QString()>& action);
    void Look();
    void ShowFacts();

    DatabaseFacts facts_;
    std::vector<ElidedLabel*> values_;
    QLabel* result_;
    QTimer countTimer_;
    class QGridLayout* buttons_;
    int columns_;
};

} // namespace mirel
