#pragma once

#include "app/main_view_state.h"
#include "app/ui/shell_actions.h"
#include "platform/ui/view_look.h"

#include <QWidget>

class QLineEdit;
class QTreeWidgetItem;

namespace mirel {

class SideTree;

// The lists of the main view on a wide window: favorites, tables, forms and queries under one another, each with a
// heading that folds it, and a line to search in all four. It shows a MainViewState and moves its selection; a
// chosen heading is its section with nothing selected. State and actions must outlive it.
class SideBar : public QWidget {
    Q_OBJECT
public:
    SideBar(MainViewState& state, ShellActions& actions, QWidget* parent = nullptr);

    // Shows the state as it is now. Call it after every change.
    void ShowState();
    void SetLook(const ViewLook& look);

Q_SIGNALS:
    void selectionChanged();

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void Connect();
    void Fill();
    void ShowSelection();
    void TakeSelection(const QTreeWidgetItem* item);

    MainViewState& state_;
    ShellActions& actions_;
    QLineEdit* search_;
    SideTree* tree_;
    QString shownSearch_;
    std::array<std::vector<MainEntry>, kMainTabs> shown_; // by section, as the rows stand
    bool filled_ = false;
    bool showing_ = false;
};

} // namespace mirel
