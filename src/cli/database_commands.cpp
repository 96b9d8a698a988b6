#include "cli/cell_text.h"
#include "cli/commands.h"
#include "cli/run.h"
#include "data/field_names.h"
#include "data/provider_error.h"
#include "data/table_statements.h"

#include <array>
#include <vector>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

QString InBrackets(const QString& table)
{
    return table.startsWith(u'[') ? table : u'[' + table + u']';
}

// How the index on a field sorts.
QString IndexWord(const QString& index, int flags)
{
    constexpr int kDescending = 1;
    if (index.isEmpty())
        return WordOfIndexOrder(IndexOrder::None);
    return WordOfIndexOrder((flags & kDescending) != 0 ? IndexOrder::Descending : IndexOrder::Ascending);
}

ResultField TextColumn(const QString& name)
{
    return {name, FieldType::Text, kMaxTextSize, {}, {}};
}

bool WriteField(Run& run, RecordWriter& writer, const QString& table, const ResultField& field)
{
    QString index;
    int flags = 0;
    if (!run.Session().GetCatalog().FindFieldIndex(table, field.name, run.Session().Location(), index, flags))
        return false;
    QString type;
    TypeNameOfField(field.type, type);
    const std::array texts = {field.name.toUtf8(), type.toUtf8(), IndexWord(index, flags).toUtf8()};
    const std::array cells = {Cell::OfText(View(texts[0])), Cell::OfText(View(texts[1])),
                              field.size < 0 ? Cell() : Cell::Of(qint64(field.size)),
                              Cell::OfText(View(texts[2]))};
    return writer.Record(cells);
}

} // namespace

ExitStatus RunNew(Run& run)
{
    return run.Session().Create(run.PathArgument(0)) ? ExitStatus::Done : ExitStatus::Failed;
}

ExitStatus RunDrop(Run& run)
{
    return run.Session().Drop(run.PathArgument(0)) ? ExitStatus::Done : ExitStatus::Failed;
}

ExitStatus RunTables(Run& run)
{
    QStringList tables;
    if (!run.OpenDatabase() || !run.Session().ListTables(tables))
        return ExitStatus::Failed;
    for (const QString& table : tables)
        run.Out().WriteLine(table);
    run.Times().rows = tables.size();
    return ExitStatus::Done;
}

ExitStatus RunFields(Run& run)
{
    const QString table = run.Argument(1);
    DbRecordset records(run.Connection());
    if (!run.OpenDatabase())
        return ExitStatus::Failed;
    if (!records.Open(InBrackets(table), run.Session().Location(), CursorType::ForwardOnly, LockType::ReadOnly)) {
        ReportProviderError(run.Prompt(), &records, records.LastResult());
        return ExitStatus::Failed;
    }
    const std::vector<ResultField> columns = {TextColumn(u"name"_s),
                                              TextColumn(u"type"_s),
                                              {u"size"_s, FieldType::Integer, 4, {}, {}},
                                              TextColumn(u"indexed"_s)};
    const std::unique_ptr<RecordWriter> writer = run.MakeWriter();
    writer->Begin(columns);
    for (const ResultField& field : records.Fields()) {
        if (!WriteField(run, *writer, table, field))
            return ExitStatus::Failed;
        ++run.Times().rows;
    }
    writer->End();
    return ExitStatus::Done;
}

} // namespace mirel::cli
