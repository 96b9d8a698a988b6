#include "tableview/bulk_commands.h"

#include "resources/string_table.h"
#include "tableview/bulk_run.h"

namespace mirel {
namespace {

Str LabelOf(Aggregate kind)
{
    switch (kind) {
    case Aggregate::Sum:
        return Str::AggregateSum;
    case Aggregate::Max:
        return Str::AggregateMax;
    case Aggregate::Min:
        return Str::AggregateMin;
    case Aggregate::Avg:
        break;
    }
    return Str::AggregateAvg;
}

} // namespace

bool BulkCommands::IsReady()
{
    return browser_.IsOpen() && !browser_.IsEmpty() && browser_.WriteEdit();
}

bool BulkCommands::ShowAggregate(Aggregate kind)
{
    if (!IsReady() || browser_.SelectedField() < 0)
        return false;
    std::optional<AggregateResult> result;
    {
        const RecordBrowser::Work work(browser_);
        result = BulkRun(browser_.Recordset(), prompt_).Sum(browser_.SelectedField(), kind);
    }
    if (!result)
        return false;
    browser_.ShowInEditor(StringText(LabelOf(kind)), result->Text(kind));
    return true;
}

bool BulkCommands::DeleteAll()
{
    BulkRun run(browser_.Result(), prompt_);
    if (!IsReady() || !run.AskDeleteAll())
        return false;
    bool done = false;
    {
        const RecordBrowser::Work work(browser_);
        done = run.DeleteAll();
    }
    return browser_.Rewrite(browser_.Statement()) && done;
}

bool BulkCommands::UpdateAll()
{
    BulkRun run(browser_.Result(), prompt_);
    if (!IsReady() || !browser_.CanEdit())
        return false;
    const int field = browser_.SelectedField();
    const Value value = browser_.EditedValue();
    if (!run.AskUpdateAll(field, browser_.EditedText()))
        return false;
    bool done = false;
    {
        const RecordBrowser::Work work(browser_);
        done = run.UpdateAll(field, value);
    }
    browser_.TakeUpChanges();
    return done;
}

} // namespace mirel
