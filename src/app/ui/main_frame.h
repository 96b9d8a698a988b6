#pragma once

#include "app/drafts.h"
#include "app/file_state.h"
#include "app/instance.h"
#include "app/main_view_commands.h"
#include "app/shell_commands.h"
#include "forms/design/form_maker.h"
#include "forms/ui/property_editors.h"
#include "platform/ui/file_choice.h"
#include "platform/ui/hosted_view.h"
#include "platform/ui/view_command.h"
#include "platform/ui/view_look.h"
#include "tableview/ui/query_writer.h"

#include <QMainWindow>
#include <QTimer>

#include <memory>

class QLabel;
class QMenu;
class QSplitter;
class QToolButton;

namespace mirel {

class CFormEngView;
class CFormMakView;
class CLumoView;
class OpenViews;
class CTableView;
class CViewWindow;
class EmptyPage;
class EntryPanel;
class HostedView;
class ImportSource;
class ShellActions;
class SideBar;
class StatementHistory;
struct QueryServices;
class ViewTabs;

// The program's window. It hosts all views: on a wide window the lists are a side bar and the views tabs beside
// it; on a narrow one the lists or one view have the window to themselves. Changing between the two closes
// nothing. The menus are those of the view in front, then the window's own, with one File menu. A view can also
// stand in a window of its own.
//
// All arguments must outlive the frame.
class CMainFrame : public QMainWindow, private ViewHost, private SessionListener {
    Q_OBJECT
public:
    static constexpr int kLeastWideWidth = 640; // logical pixels

    CMainFrame(DatabaseSession& session, MainViewState& state, MainViewCommands& commands, Settings& settings,
               Profile& profile);
    ~CMainFrame() override;

    static std::span<const CommandRow<CMainFrame>> CommandTable();

    // Shows the state as it is now, after somebody else changed it.
    void ShowState();
    // Opens the table view on a result, or brings forward the one that shows it already. Null when it does not
    // open; why was told then.
    CTableView* OpenTable(const TableRequest& request);
    // The frame's command 5001: runs a form in a form engine of its own, also when one runs that form already.
    CFormEngView* OpenForm(const FormCall& call);
    // The frame's command 5002: opens a new form in the form maker, where it is saved when the user says so.
    CFormMakView* DesignNewForm(const FormDef& form);
    // Opens a form of the store in the form maker, or brings forward the one it is open in; null: there is no such
    // form.
    CFormMakView* DesignForm(const QString& name);
    // Opens a table, form or query of the database by its name; null as above.
    HostedView* OpenView(const ViewKey& key);
    // The views that were open on this database at the end of the last run. Each is read when it first comes to
    // the front; what is gone is left out.
    void RestoreViews();
    // From here on the window is that of the views opened in it: it shows no lists, and closes with the last view.
    void BeAlone(const ViewKey& view);
    bool IsAlone() const { return aloneWith_.has_value(); }
    // Nothing of it is still to be looked up, counted or sorted.
    bool IsSettled() const;
    // From here on other starts with the same database lead here; the instance must outlive the frame.
    void AnswerOtherStarts(Instance& instance);
    // What was being typed when an earlier run was killed; asks nothing when nothing was.
    void OfferDrafts();
    // A quiet line that goes by itself.
    void Note(const QString& text);
    // The help page of the view in front.
    void ShowHelpOfFront();
    // Points at the parts of the window one by one.
    void ShowTour();

protected:
    void closeEvent(QCloseEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dropEvent(QDropEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    struct Commands;

    void MakeParts();
    CLumoView& Lists();
    EmptyPage& Home();
    void MakeMenus();
    void Connect();
    bool IsWide() const { return width() >= kLeastWideWidth; }
    void FitWidth();
    void FitBar();
    void ShowFront();
    void ShowMenus();
    void FillRecentMenu();
    void FillWindowMenu();
    void FollowTabs();
    void DesignTable(const QString& table);    // empty: a new one
    void WriteSavedQuery(const QString& name); // empty: a new one
    void ShowSavedQuery(const QString& name);
    WriteQuery QueryWriter();
    bool BuildFormQuery(MakerDialogs::Query& query, QWidget& window); // false: it stays
    MakerDialogs DialogsOfMaker();
    QueryServices ServicesForQueries(StatementHistory& history);
    void ShowLook();
    void ShowTitle();

    // Commands.
    void ChooseMainLook(LookItem item);
    void OpenSelected();
    void MakeNew();
    void EditSelected();
    void DeleteSelected();
    void ShowLists();
    void MoveToWindow();
    void ShowKeyList();
    void ShowInformation();
    QString BackUp();
    QString Compact();
    QString Check();
    void RunCare(QString (CMainFrame::*command)());
    QString ChooseDatabase(Str title, Str accept, FileUse use);
    void ChooseAndOpenDatabase();
    void ChooseAndCreateDatabase();
    void ChooseAndDeleteDatabase();
    void OpenPath(const QString& path);
    void ImportFrom(const ImportSource& source); // none: the user chooses
    void ImportFromClipboard();
    void TakeFiles(const QStringList& paths);

    // Views.
    CTableView* MakeTable(const TableRequest& request);
    CFormEngView* MakeForm(const FormCall& call);
    CFormMakView* MakeMaker(const FormDef& form, FormMaker::Start start);
    void RunFromMaker(CFormMakView& maker, const FormCall& call);
    void EditRunning(CFormEngView& form);
    void FollowMaker(CFormMakView& maker);
    HostedView* MakeView(const ViewKey& key);
    void ConnectView(HostedView& view);
    void FollowTyping(HostedView& view);
    void KeepDrafts();
    QString PutBack(const Draft& draft);
    HostedView* TableForDraft(const Draft& draft);
    HostedView* FormForDraft(const Draft& draft);
    void SpreadOptions();
    template <typename View>
    QList<View*> ViewsOf() const
    {
        QList<View*> found;
        for (HostedView* view : Views()) {
            if (auto* one = qobject_cast<View*>(view))
                found += one;
        }
        return found;
    }
    void FollowNames();
    QList<CViewWindow*> Windows() const;
    QList<HostedView*> Views() const;
    QString WidthsKey(const QString& statement) const;
    void KeepWidths(const CTableView& table);
    void KeepViews();
    QString ViewsKey() const;

    // ViewHost.
    bool MayCloseViews() override;
    ViewList CloseViews() override;
    void OpenAgain(const ViewList& views) override;
    void CloseViewOf(const ViewKey& view) override;

    // Other starts.
    void FollowInstance();
    void ComeForward();
    void OpenWhenFree(const ViewKey& view);

    // What others change.
    void RecordsChanged() override;
    void TakeUpChanges(const HostedView* butNot);
    void LookAtFile();
    void TellWhereNothingIsKept();

    DatabaseSession& session_;
    MainViewState& state_;
    MainViewCommands& commands_;
    Settings& settings_;
    Profile& profile_;
    ShellActions* actions_;
    std::unique_ptr<OpenViews> openViews_;
    CLumoView* lists_ = nullptr; // of a narrow window; null until it is one
    QSplitter* splitter_;
    QWidget* sidePane_;
    SideBar* sideBar_;
    EntryPanel* panel_;
    EmptyPage* emptyPage_ = nullptr; // of a wide one; null until it shows
    ViewTabs* tabs_;
    QLabel* notice_;
    QMenu* fileMenu_;
    QMenu* databaseMenu_;
    QMenu* windowMenu_;
    QMenu* helpMenu_;
    QMenu* recentMenu_;
    QToolButton* corner_;
    const HostedView* shownFront_ = nullptr; // whose menus are shown
    QTimer watchTimer_;
    QTimer tellTimer_;
    QString watchedPath_;
    FileState file_;
    bool wide_ = false;
    bool alone_ = false; // aloneWith_ is set, and the window closes with its last view
    std::optional<ViewKey> aloneWith_;
    bool telling_ = false;
    Instance* instance_ = nullptr;
    Drafts drafts_;
    QTimer draftTimer_;
    bool saidDraftsFail_ = false;
    bool triedSettings_ = false;
};

} // namespace mirel
