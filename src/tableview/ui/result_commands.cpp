#include "tableview/ui/result_commands.h"

#include "platform/ui/wait_cursor.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "tableview/bulk_commands.h"
#include "tableview/saved_queries.h"
#include "tableview/ui/export_wizard.h"
#include "tableview/ui/filter_dialog.h"
#include "tableview/ui/open_query_dialog.h"
#include "tableview/ui/sort_dialog.h"

namespace mirel {

ResultCommands::ResultCommands(RecordBrowser& browser, DbConnection& connection, UserPrompt& prompt, QWidget& view)
    : QObject(&view)
    , browser_(browser)
    , connection_(connection)
    , prompt_(prompt)
    , view_(view)
{
}

bool ResultCommands::CanOpenQuery() const
{
    return store_ && !store_->Queries().empty();
}

bool ResultCommands::CanSaveQuery() const
{
    return store_ && !store_->Path().isEmpty() && browser_.IsOpen();
}

bool ResultCommands::DeleteAll()
{
    return BulkCommands(browser_, prompt_).DeleteAll();
}

bool ResultCommands::UpdateAll()
{
    return BulkCommands(browser_, prompt_).UpdateAll();
}

bool ResultCommands::Compute(Aggregate function)
{
    return BulkCommands(browser_, prompt_).ShowAggregate(function);
}

QString ResultCommands::SelectedColumn() const
{
    const int field = browser_.SelectedField();
    return field < 0 ? QString() : browser_.Fields()[size_t(field)].column;
}

bool ResultCommands::FilterByExpression()
{
    if (!browser_.WriteEdit())
        return false;
    FieldLists lists(connection_, browser_.Database(), prompt_);
    CFilterDialog dialog(
        lists, browser_.TableOf(browser_.SelectedField()), SelectedColumn(), browser_.SelectedText(),
        [this](const QString& condition) {
            const WaitCursor waiting;
            return browser_.AddCondition(condition);
        },
        &view_);
    FillSmallWindow(dialog, view_);
    dialog.exec();
    return true;
}

bool ResultCommands::ChangeFilter(int filter)
{
    const std::vector<OpenResult::Filter>& filters = browser_.Filters();
    if (!browser_.WriteEdit() || filter < 0 || size_t(filter) >= filters.size())
        return false;
    FieldLists lists(connection_, browser_.Database(), prompt_);
    CFilterDialog dialog(
        lists, browser_.TableOf(browser_.SelectedField()), SelectedColumn(), browser_.SelectedText(),
        [this, filter](const QString& condition) {
            const WaitCursor waiting;
            return browser_.ChangeFilter(filter, condition);
        },
        &view_);
    dialog.ShowExpression(filters[size_t(filter)].condition);
    FillSmallWindow(dialog, view_);
    dialog.exec();
    return true;
}

bool ResultCommands::SortByExpression()
{
    if (!browser_.WriteEdit())
        return false;
    FieldLists lists(connection_, browser_.Database(), prompt_);
    CSortDialog dialog(lists, browser_.TableOf(browser_.SelectedField()), SelectedColumn(), &view_);
    FillSmallWindow(dialog, view_);
    if (dialog.exec() != QDialog::Accepted)
        return true;
    const WaitCursor waiting;
    return browser_.SortByTerms(dialog.Terms());
}

bool ResultCommands::NewQuery()
{
    return Write({});
}

bool ResultCommands::EditStatement()
{
    return Write(browser_.Statement());
}

bool ResultCommands::Write(const QString& statement)
{
    if (!CanWriteQuery())
        return true;
    if (!browser_.WriteEdit())
        return false;
    const QueryWanted wanted{statement, browser_.TableOf(browser_.SelectedField()), store_ != nullptr};
    const auto take = [this](const QString& name, const QString& written) {
        const WaitCursor waiting;
        if (!browser_.OpenInstead(written))
            return false;
        if (!name.isEmpty())
            Q_EMIT queryOpened(name);
        return true;
    };
    writeQuery_(wanted, take, view_);
    Q_EMIT queriesChanged();
    return true;
}

bool ResultCommands::OpenQuery()
{
    if (!CanOpenQuery())
        return true;
    if (!browser_.WriteEdit())
        return false;
    SavedQueries queries(*store_, prompt_);
    COpenQueryDialog dialog(queries.Names(), &view_);
    FillSmallWindow(dialog, view_);
    if (dialog.exec() != QDialog::Accepted)
        return true;
    const std::optional<QString> statement = queries.StatementOf(dialog.Chosen());
    if (!statement || !queries.AskIfItChanges(dialog.Chosen(), *statement))
        return true;
    const WaitCursor waiting;
    if (!browser_.OpenInstead(*statement))
        return false;
    Q_EMIT queryOpened(dialog.Chosen());
    return true;
}

bool ResultCommands::SaveQuery()
{
    if (!CanSaveQuery())
        return true;
    if (!browser_.WriteEdit())
        return false;
    const std::optional<QString> name = prompt_.AskText({Str::SaveQueryTitle, {}}, {Str::SaveQueryPrompt, {}}, {});
    if (!name)
        return true;
    const QString table = browser_.TableOf(browser_.SelectedField());
    if (!SavedQueries(*store_, prompt_).Save(*name, table, ShownStatement(browser_)))
        return true;
    Q_EMIT queriesChanged();
    return true;
}

bool ResultCommands::Export()
{
    if (!browser_.WriteEdit())
        return false;
    RunExport(connection_, browser_.Database(), prompt_,
              {.name = title_,
               .statement = browser_.Statement(),
               .words = browser_.Settings().words,
               .writeQuery = writeQuery_},
              view_);
    return true;
}

} // namespace mirel
