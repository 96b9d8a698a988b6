#pragma once

#include "app/main_view_commands.h"
#include "app/shell_commands.h"
#include "platform/ui/file_choice.h"

#include <QMainWindow>

#include <memory>

class QMenu;

namespace mirel {

class CFormEngView;
class CLumoView;
class OpenViews;
class CTableView;
class ShellActions;

// The program's window: the menus, and in its middle the main view. Table views and running forms are windows of
// the frame. Carries the commands of the menus to MainViewCommands; DatabaseSession is the document.
//
// All arguments must outlive the frame.
class CMainFrame : public QMainWindow {
    Q_OBJECT
public:
    CMainFrame(DatabaseSession& session, MainViewState& state, MainViewCommands& commands, Settings& settings,
               Profile& profile);
    ~CMainFrame() override;

    // Shows the state as it is now, after somebody else changed it.
    void ShowState();
    // Opens the table view on a result, or brings forward the one that shows it already. Null when it does not
    // open; why was told then. Table views close with the database.
    QWidget* OpenTable(const TableRequest& request);
    // The frame's command 5001: runs a form in a form engine of its own, also when one runs that form already.
    // Form engines close with the database.
    CFormEngView* OpenForm(const FormCall& call);

protected:
    void closeEvent(QCloseEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dropEvent(QDropEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void MakeMenus();
    void FillRecentMenu();
    void Run(ShellCommand id);
    void ChooseLayout(ShellCommand id);
    void DesignTable(const QString& table); // empty: a new one
    void ShowLook();
    QString WidthsKey(const QString& statement) const;
    void KeepWidths(const CTableView& table);
    QString ChooseDatabase(Str title, Str accept, FileUse use);
    void ChooseAndOpenDatabase();
    void ChooseAndCreateDatabase();
    void ChooseAndDeleteDatabase();
    void OpenPath(const QString& path);
    // The windows on the open database. False when one of them holds an edit that is not to be lost: the user
    // stays in it.
    bool CloseWindows();
    QList<CTableView*> Tables() const;
    QList<CFormEngView*> Forms() const;
    void Place(QWidget& window, const QString& key, QSize firstSize);
    void SpreadOptions();
    void KeepPlaceOf(QWidget& window);

    DatabaseSession& session_;
    MainViewState& state_;
    MainViewCommands& commands_;
    Settings& settings_;
    Profile& profile_;
    ShellActions* actions_;
    CLumoView* view_;
    std::unique_ptr<OpenViews> openViews_;
    QMenu* recentMenu_ = nullptr;
};

} // namespace mirel
