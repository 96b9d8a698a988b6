#include "cli/commands.h"
#include "cli/run.h"
#include "data/provider_error.h"
#include "resources/string_table.h"
#include "result/cell_text.h"
#include "tableview/bulk_run.h"

#include <array>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

struct KindName {
    QLatin1StringView name;
    Aggregate kind;
};
constexpr std::array kKinds = {
    KindName{QLatin1StringView("sum"), Aggregate::Sum},
    KindName{QLatin1StringView("max"), Aggregate::Max},
    KindName{QLatin1StringView("min"), Aggregate::Min},
    KindName{QLatin1StringView("avg"), Aggregate::Avg},
};

// The records that the second argument names, and the field that the third does.
class BulkCommand {
public:
    explicit BulkCommand(Run& run)
        : run_(run)
        , records_(run.Connection())
    {
    }

    bool OpenSource(LockType lock)
    {
        if (!run_.OpenDatabase())
            return false;
        if (records_.OpenSource(run_.SourceOf(run_.Argument(1)), run_.Session().Location(), CursorType::Static,
                                lock))
            return true;
        ReportProviderError(run_.Prompt(), &records_, records_.LastResult());
        return false;
    }

    bool FindField()
    {
        const QString name = run_.Argument(2);
        field_ = records_.FieldIndex(name);
        for (int i = 0; field_ < 0 && i < records_.FieldCount(); ++i) {
            if (records_.FieldName(i).compare(name, Qt::CaseInsensitive) == 0)
                field_ = i;
        }
        if (field_ < 0)
            run_.Prompt().Show({Str::NoSuchField, {name}});
        return field_ >= 0;
    }

    DbRecordset& Records() { return records_; }
    int Field() const { return field_; }

private:
    Run& run_;
    DbRecordset records_;
    int field_ = -1;
};

// What the argument stores in such a field; empty, and told why, for a Yes/No that is neither.
std::optional<Value> ValueOf(Run& run, const QString& given, FieldType type)
{
    if (type != FieldType::YesNo)
        return TypedValue(run.IsSet(Setting::TableViewLeadingNumber) ? LeadingNumber(given, type) : given, type);
    const YesNoWords words = run.Words();
    const auto is = [&given](const QString& word) { return given.compare(word, Qt::CaseInsensitive) == 0; };
    if (given == u"1" || is(words.yes))
        return Value::Bool(true);
    if (given == u"0" || is(words.no))
        return Value::Bool(false);
    run.Prompt().Show({Str::CliYesNoValue, {given, words.yes, words.no}});
    return {};
}

ExitStatus EndRun(Run& run, bool done, qint64 records)
{
    if (!done)
        return ExitStatus::Failed;
    run.Times().rows = records;
    run.Out().WriteLine(QString::number(records));
    return ExitStatus::Done;
}

} // namespace

ExitStatus RunAggregateCommand(Run& run)
{
    const QString name = run.Argument(3);
    const auto kind = std::ranges::find_if(kKinds, [&name](const KindName& each) { return name == each.name; });
    if (kind == kKinds.end())
        return run.Refuse(StringText(Str::CliNoSuchAggregate, {name}));
    BulkCommand command(run);
    if (!command.OpenSource(LockType::ReadOnly) || !command.FindField())
        return ExitStatus::Failed;
    const std::optional<AggregateResult> result =
        BulkRun(command.Records(), run.Prompt()).Sum(command.Field(), kind->kind);
    if (!result)
        return ExitStatus::Failed;
    run.Times().rows = result->values;
    run.Out().WriteLine(result->Text(kind->kind));
    return ExitStatus::Done;
}

ExitStatus RunUpdateAll(Run& run)
{
    BulkCommand command(run);
    if (!command.OpenSource(LockType::Optimistic) || !command.FindField())
        return ExitStatus::Failed;
    const FieldType type = command.Records().TypeOfField(command.Field());
    const std::optional<Value> value = ValueOf(run, run.Argument(3), type);
    if (!value)
        return ExitStatus::Failed;
    BulkRun bulk(command.Records(), run.Prompt());
    const bool done = bulk.UpdateAll(command.Field(), *value);
    return EndRun(run, done, bulk.RecordsDone());
}

ExitStatus RunDeleteAll(Run& run)
{
    BulkCommand command(run);
    if (!command.OpenSource(LockType::Optimistic))
        return ExitStatus::Failed;
    BulkRun bulk(command.Records(), run.Prompt());
    const bool done = bulk.DeleteAll();
    return EndRun(run, done, bulk.RecordsDone());
}

} // namespace mirel::cli
