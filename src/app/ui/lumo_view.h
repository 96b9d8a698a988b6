#pragma once

#include "app/main_view_state.h"
#include "app/ui/shell_actions.h"
#include "platform/ui/view_look.h"

#include <QWidget>

class QLabel;
class QLineEdit;
class QStackedWidget;
class QToolButton;

namespace mirel {

class CompactTabBar;
class ElidedLabel;
class EntryList;
struct EntryLine;
class WelcomePage;

// The main view: which database is open, its favorites, tables, forms and queries on four tabs, and a row of
// buttons. It shows a MainViewState and moves selection, tab and search in it; commands go through the actions.
// State and actions must outlive the view.
class CLumoView : public QWidget {
    Q_OBJECT
public:
    CLumoView(MainViewState& state, ShellActions& actions, QWidget* parent = nullptr);

    // Shows the state as it is now. Call it after every change.
    void ShowState();
    void ShowRecent(const QStringList& paths);
    void SetLook(const ViewLook& look);

Q_SIGNALS:
    void RecentChosen(const QString& path);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    QWidget* MakeHeader();
    QWidget* MakeButtons();
    void Connect();
    void ShowList();
    void FitButtons();
    std::vector<EntryLine> Lines() const;
    WelcomePage& Welcome();

    MainViewState& state_;
    ShellActions& actions_;
    QLabel* databaseIcon_;
    ElidedLabel* databaseLine_;
    CompactTabBar* tabs_;
    QLineEdit* search_;
    QStackedWidget* pages_;
    EntryList* list_;
    QLabel* emptyText_;
    WelcomePage* welcome_ = nullptr; // until no database is open
    QStringList recent_;
    QWidget* header_;
    QWidget* buttonRow_;
    std::vector<QToolButton*> buttons_;
};

} // namespace mirel
