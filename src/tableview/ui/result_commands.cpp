#include "tableview/ui/result_commands.h"

#include "platform/ui/wait_cursor.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "tableview/bulk_commands.h"
#include "tableview/saved_queries.h"
#include "tableview/ui/export_wizard.h"
#include "tableview/ui/filter_dialog.h"
#include "tableview/ui/query_dialog.h"
#include "tableview/ui/sort_dialog.h"

namespace mirel {

using Command = TableCommand;

ResultCommands::ResultCommands(RecordBrowser& browser, DbConnection& connection, UserPrompt& prompt, QWidget& view)
    : QObject(&view)
    , browser_(browser)
    , connection_(connection)
    , prompt_(prompt)
    , view_(view)
{
}

bool ResultCommands::CanDo(TableCommand command) const
{
    const bool hasRecord = browser_.SelectedRecord() >= 0;
    switch (command) {
    case Command::FilterExpression:
    case Command::SortExpression:
    case Command::Aggregate:
    case Command::Sum:
    case Command::Max:
    case Command::Min:
    case Command::Avg:
    case Command::ExportCsv:
        return hasRecord;
    case Command::EditAll:
    case Command::DeleteAll:
        return hasRecord && browser_.CanUpdate();
    case Command::UpdateAll:
        return hasRecord && browser_.CanEdit();
    case Command::OpenQuery:
        return store_ && !store_->Queries().empty();
    case Command::SaveQuery:
        return store_ && !store_->Path().isEmpty() && browser_.IsOpen();
    default: // none of these
        return false;
    }
}

std::optional<bool> ResultCommands::Do(TableCommand command)
{
    BulkCommands bulk(browser_, prompt_);
    switch (command) {
    case Command::FilterExpression:
        return FilterByExpression();
    case Command::SortExpression:
        return SortByExpression();
    case Command::DeleteAll:
        return bulk.DeleteAll();
    case Command::UpdateAll:
        return bulk.UpdateAll();
    case Command::Sum:
        return bulk.ShowAggregate(Aggregate::Sum);
    case Command::Max:
        return bulk.ShowAggregate(Aggregate::Max);
    case Command::Min:
        return bulk.ShowAggregate(Aggregate::Min);
    case Command::Avg:
        return bulk.ShowAggregate(Aggregate::Avg);
    case Command::OpenQuery:
        return OpenQuery();
    case Command::SaveQuery:
        return SaveQuery();
    case Command::ExportCsv:
        return Export();
    default: // none of these
        return std::nullopt;
    }
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

bool ResultCommands::OpenQuery()
{
    if (!CanDo(Command::OpenQuery))
        return true;
    if (!browser_.WriteEdit())
        return false;
    SavedQueries queries(*store_, prompt_);
    CQueryDialog dialog(queries.Names(), &view_);
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
    if (!CanDo(Command::SaveQuery))
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
    RunExport(connection_, browser_.Database(), prompt_, {.name = title_, .statement = browser_.Statement()},
              view_);
    return true;
}

} // namespace mirel
