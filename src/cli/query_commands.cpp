#include "app/main_view_state.h"
#include "cli/cell_text.h"
#include "cli/commands.h"
#include "cli/run.h"
#include "cli/sql_command.h"
#include "data/db_recordset.h"
#include "resources/string_table.h"
#include "tableview/saved_queries.h"

#include <array>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

// The database that the first argument names, with a place for queries. On false the reason was told.
bool OpenStore(Run& run)
{
    if (!run.OpenDatabase())
        return false;
    if (!run.Session().Store().Path().isEmpty())
        return true;
    run.Prompt().Show({Str::StoreMissing, {}});
    return false;
}

} // namespace

ExitStatus RunQueriesList(Run& run)
{
    if (!OpenStore(run))
        return ExitStatus::Failed;
    const std::array columns = {ResultField{u"name"_s, FieldType::Text, kMaxTextSize, {}, {}},
                                ResultField{u"table"_s, FieldType::Text, kMaxTextSize, {}, {}},
                                ResultField{u"statement"_s, FieldType::Memo, -1, {}, {}}};
    const std::unique_ptr<RecordWriter> writer = run.MakeWriter();
    writer->Begin(columns);
    for (const QueryDef& query : run.Session().Store().Queries()) {
        const std::array texts = {query.name.Text().toUtf8(), query.tableName.Text().toUtf8(),
                                  query.text.Text().toUtf8()};
        const std::array cells = {Cell::OfText(View(texts[0])), Cell::OfText(View(texts[1])),
                                  Cell::OfText(View(texts[2]))};
        if (!writer->Record(cells))
            return ExitStatus::Failed;
        ++run.Times().rows;
    }
    writer->End();
    return ExitStatus::Done;
}

ExitStatus RunQueriesSave(Run& run)
{
    if (!OpenStore(run))
        return ExitStatus::Failed;
    SavedQueries queries(run.Session().Store(), run.Prompt());
    const QString name = run.Argument(1);
    const QString statement = run.Argument(2);
    if (name.trimmed().isEmpty()) {
        run.Prompt().Show({Str::CliQueryWithoutName, {}});
        return ExitStatus::Failed;
    }
    // --yes answers for an unbalanced statement; what replaces a query is --replace alone.
    if (!run.Args().Has(Opt::Replace) && queries.Knows(name)) {
        run.Prompt().Show({Str::CliQueryExists, {name}});
        return ExitStatus::Failed;
    }
    const bool saved =
        queries.AskIfUnbalanced(statement) &&
        queries.Save(name, run.Args().Text(Opt::Table), statement, SavedQueries::OnExisting::Replace);
    return saved ? ExitStatus::Done : ExitStatus::Failed;
}

ExitStatus RunQueriesRun(Run& run)
{
    if (!OpenStore(run))
        return ExitStatus::Failed;
    const QString name = run.Argument(1);
    const std::optional<QString> statement = SavedQueries(run.Session().Store(), run.Prompt()).StatementOf(name);
    if (!statement) {
        run.Prompt().Show({Str::NoSuchQuery, {name}});
        return ExitStatus::Failed;
    }
    if (!OnlyReads(*statement) && !run.Args().Has(Opt::Yes)) {
        run.Prompt().Show({Str::CliQueryChanges, {name}});
        return ExitStatus::BadArguments;
    }
    return RunStatement(run, *statement) ? ExitStatus::Done : ExitStatus::Failed;
}

ExitStatus RunQueriesDelete(Run& run)
{
    const QString name = run.Argument(1);
    if (!OpenStore(run) || !SavedQueries(run.Session().Store(), run.Prompt()).Remove(name))
        return ExitStatus::Failed;
    QStringList favorites = run.Session().Favorites();
    if (favorites.removeAll(FavoriteText({EntryKind::Query, name, {}, false})) > 0 &&
        !run.Session().SetFavorites(favorites))
        run.Prompt().Show({Str::FavoritesReadOnly, {}});
    return ExitStatus::Done;
}

} // namespace mirel::cli
