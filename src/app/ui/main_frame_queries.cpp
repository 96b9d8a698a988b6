#include "app/table_view_options.h"
#include "app/ui/display_look.h"
#include "app/ui/entry_panel.h"
#include "app/ui/main_frame.h"
#include "app/ui/view_tabs.h"
#include "app/ui/view_window.h"
#include "querybuilder/query_clauses.h"
#include "querybuilder/statement_history.h"
#include "querybuilder/ui/query_dialog.h"
#include "tableview/ui/table_view.h"

// The query builder in the main window: New and Edit of saved queries, and the statements that views ask for.

namespace mirel {

using namespace Qt::StringLiterals;

QueryServices CMainFrame::ServicesForQueries(StatementHistory& history)
{
    return {.connection = session_.Connection(),
            .database = session_.Location(),
            .store = session_.Store(),
            .prompt = session_.Prompt(),
            .history = &history,
            .settings = ReadTableViewSettings(settings_),
            .changed = [this] {
                commands_.Refill();
                ShowState();
                TakeUpChanges(nullptr);
            }};
}

void CMainFrame::WriteSavedQuery(const QString& name)
{
    panel_->StopCounting();
    QueryRequest request{.nameUse = QueryRequest::Name::Required, .table = state_.CurrentTable()};
    if (!name.isEmpty()) {
        const QueryDef* query = std::as_const(session_.Store()).FindQuery(name);
        if (!query)
            return;
        request.name = name;
        request.statement = query->text.Text();
        request.table = query->tableName.Text();
    }
    StatementHistory history(profile_, ViewsKey());
    const std::optional<EditedQuery> written = EditQuery(request, ServicesForQueries(history), *this);
    commands_.Refill();
    if (written && state_.Tab() == MainTab::Query)
        state_.Select({EntryKind::Query, written->name, request.table, false});
    ShowState();
    if (written)
        ShowSavedQuery(written->name);
}

// A view that is open on the query shows its new statement.
void CMainFrame::ShowSavedQuery(const QString& name)
{
    const QueryDef* query = std::as_const(session_.Store()).FindQuery(name);
    const ViewKey key{EntryKind::Query, name};
    if (!query)
        return;
    const QString statement = query->text.Text();
    const auto show = [&](HostedView* view) {
        auto* table = qobject_cast<CTableView*>(view);
        if (table && table->Browser().BaseStatement() != statement && table->WritePending())
            (void)table->OpenStatement(name, statement);
    };
    for (int tab = 0; tab < tabs_->Count(); ++tab) {
        if (tabs_->KeyAt(tab) == key)
            show(tabs_->ViewAt(tab));
    }
    for (CViewWindow* window : Windows()) {
        if (window->Key() == key)
            show(window->View());
    }
}

WriteQuery CMainFrame::QueryWriter()
{
    return [this](const QueryWanted& wanted, const TakeQuery& take, QWidget& window) {
        const bool saves = wanted.mayBeSaved && !session_.Store().Path().isEmpty();
        StatementHistory history(profile_, ViewsKey());
        (void)EditQuery({.nameUse = saves ? QueryRequest::Name::Offered : QueryRequest::Name::None,
                         .statement = wanted.statement,
                         .table = wanted.table},
                        ServicesForQueries(history), window, take);
    };
}

// A form's query often has no FROM, which the form completes; that of a button stands behind its "SELECT *".
bool CMainFrame::BuildFormQuery(MakerDialogs::Query& query, QWidget& window)
{
    const QString select = query.followsSelect ? u"SELECT *"_s : QString();
    StatementHistory history(profile_, ViewsKey());
    const std::optional<EditedQuery> written = EditQuery({.nameUse = QueryRequest::Name::None,
                                                          .statement = query.text,
                                                          .table = query.table,
                                                          .selectClause = select},
                                                         ServicesForQueries(history), window);
    if (!written)
        return false;
    query.text = query.followsSelect ? WithoutSelectClause(written->statement, select) : written->statement;
    return true;
}

MakerDialogs CMainFrame::DialogsOfMaker()
{
    MakerDialogs dialogs = MakerDialogsOf();
    dialogs.buildQuery = [this](MakerDialogs::Query& query, QWidget& window) {
        return BuildFormQuery(query, window);
    };
    return dialogs;
}

} // namespace mirel
