#pragma once

#include "data/db_connection.h"
#include "provider/database_location.h"
#include "querybuilder/query_draft.h"
#include "querybuilder/ui/builder_page.h"
#include "tableview/field_lists.h"
#include "tableview/table_view_settings.h"

#include <QDialog>

#include <functional>
#include <optional>

class QLabel;
class QLineEdit;
class QMenu;
class QPushButton;
class QStackedWidget;
class QTabWidget;
class QToolButton;

namespace mirel {

class DbRecordset;
class DiagramPage;
class ErrorLine;
class NameLists;
class StatementHistory;

// What the query dialog works with; all must outlive it.
struct QueryServices {
    DbConnection& connection;
    DatabaseLocation database;
    FormStore& store;
    UserPrompt& prompt;
    StatementHistory* history = nullptr; // null: the last statements are not kept
    TableViewSettings settings{};        // of the view that shows a result
    std::function<void()> changed{};     // a statement that ran may have changed the database
};

// "Create and Edit a Query": writes the statement of a draft whole, by clauses or as a drawing, runs it, and saves
// it under a name. Leaving it with changes asks. The draft must outlive it.
class CQueryDialog : public QDialog {
    Q_OBJECT
public:
    // Takes a statement before the dialog closes; false: it was refused, which was told, and the dialog stays.
    using Take = std::function<bool(const QString& name, const QString& statement)>;

    CQueryDialog(QueryDraft& draft, const QueryServices& services, Take take, QWidget* parent);

    void reject() override; // asks where something would be lost

protected:
    void resizeEvent(QResizeEvent* event) override;
    void closeEvent(QCloseEvent* event) override;

private:
    enum Tab { SqlTab, BuilderTab, DiagramTab };

    QWidget* MakeNameRow();
    QWidget* MakeSqlPage();
    QWidget* MakeTabs();
    QWidget* MakeButtons();
    void Connect();
    void FitSize();
    void ShowTab(int tab);
    // A page that shows the statement, or says why it cannot.
    QStackedWidget* Refusable(QWidget* page, QLabel*& reason);

    void Run();
    void RunChange(const QString& statement);
    void MarkFaultOf(const QString& statement);
    void MarkFault(const QString& statement, const DbRecordset& refused);
    void FillRecent();
    void TakeStatement(const QString& statement);
    void Accept();

    QueryDraft& draft_;
    QueryServices services_;
    Take take_;
    FieldLists lists_;
    QLineEdit* name_ = nullptr;
    QTabWidget* tabs_;
    StatementEdit* sql_ = nullptr;
    BuilderPage* builder_ = nullptr;
    DiagramPage* diagram_ = nullptr;
    QLabel* whyNoBuilder_ = nullptr;
    QLabel* whyNoDiagram_ = nullptr;
    NameLists* names_;
    ErrorLine* error_;
    QMenu* recent_ = nullptr;
    QToolButton* recentButton_ = nullptr;
    struct Fit {
        bool narrow;
        bool draws;
        friend bool operator==(const Fit&, const Fit&) = default;
    };
    std::optional<Fit> fit_; // to the dialog's size
    bool showing_ = false;
};

struct EditedQuery {
    QString name; // empty: it was not saved
    QString statement;
};
// The dialog over `window`; empty: the user cancelled. This is how all others use it:
//   New and Edit of a saved query        Name::Required
//   "New Query ..." of a table view      Name::Offered
//   the source of an export              Name::None
//   the query of a SELECT button         Name::None, selectClause "SELECT *", table the form's
std::optional<EditedQuery> EditQuery(const QueryRequest& request, const QueryServices& services, QWidget& window,
                                     CQueryDialog::Take take = {});

} // namespace mirel
