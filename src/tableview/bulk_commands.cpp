#include "tableview/bulk_commands.h"

#include "data/field_names.h"
#include "data/provider_error.h"
#include "resources/string_table.h"

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

bool BulkCommands::ShowAggregate(Aggregate kind)
{
    if (!browser_.IsOpen() || browser_.IsEmpty() || !browser_.WriteEdit())
        return false;
    const int field = browser_.SelectedField();
    if (field < 0)
        return false;
    if (!CanAggregate(browser_.TypeOfField(field))) {
        QString type;
        TypeNameOfField(browser_.TypeOfField(field), type);
        prompt_.Show({Str::AggregateNotSupported, {type}});
        return false;
    }
    const std::optional<AggregateResult> result = RunAggregate(browser_.Recordset(), field, kind);
    if (!result) {
        ReportProviderError(prompt_, &browser_.Recordset(), browser_.Recordset().LastResult());
        return false;
    }
    browser_.ShowInEditor(StringText(LabelOf(kind)), result->Text(kind));
    return true;
}

bool BulkCommands::Ask(const UserMessage& question, const UserMessage& again)
{
    return prompt_.AskYesNo(question) && prompt_.AskYesNo(again);
}

BulkProgress BulkCommands::Follow(Progress& progress) const
{
    return [&progress](qint64 done) { return progress.Advance(done); };
}

bool BulkCommands::DeleteAll()
{
    if (!browser_.IsOpen() || browser_.IsEmpty() || !browser_.WriteEdit())
        return false;
    DbRecordset& records = browser_.Recordset();
    const qint64 count = records.RecordCount();
    const QString countText = QString::number(count);
    if (!Ask({Str::DeleteAllQuestion, {countText}}, {Str::DeleteAllReally, {countText}}))
        return false;
    bool done = false;
    {
        const std::unique_ptr<Progress> progress = prompt_.StartProgress({Str::DeletingRecords, {}}, count);
        done = records.DeleteAll(Follow(*progress));
    }
    if (!done)
        ReportProviderError(prompt_, &records, records.LastResult());
    return browser_.Rewrite(browser_.Statement()) && done;
}

bool BulkCommands::UpdateAll()
{
    if (!browser_.IsOpen() || browser_.IsEmpty() || !browser_.CanEdit() || !browser_.WriteEdit())
        return false;
    DbRecordset& records = browser_.Recordset();
    const int field = browser_.SelectedField();
    const Value value = browser_.EditedValue();
    const qint64 count = records.RecordCount();
    const QString countText = QString::number(count);
    if (!Ask({Str::UpdateAllQuestion, {countText, browser_.FieldName(field), browser_.SelectedText()}},
             {Str::UpdateAllReally, {countText}})) {
        return false;
    }
    bool done = false;
    {
        const std::unique_ptr<Progress> progress = prompt_.StartProgress({Str::UpdatingRecords, {}}, count);
        done = records.UpdateAll(field, value, Follow(*progress));
    }
    if (!done)
        ReportProviderError(prompt_, &records, records.LastResult());
    browser_.TakeUpChanges();
    return done;
}

} // namespace mirel
