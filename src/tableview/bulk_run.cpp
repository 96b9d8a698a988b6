#include "tableview/bulk_run.h"

#include "data/field_names.h"
#include "data/provider_error.h"
#include "resources/string_table.h"

namespace mirel {

bool BulkRun::Run(Str what, qint64 total, const std::function<bool(const BulkProgress&)>& work)
{
    done_ = 0;
    stopped_ = false;
    bool ended = false;
    {
        const std::unique_ptr<Progress> progress = prompt_.StartProgress({what, {}}, total);
        ended = work([&](qint64 done) {
            done_ = done;
            stopped_ = !progress->Advance(done);
            return !stopped_;
        });
    } // the display goes before a message comes
    if (!ended)
        ReportProviderError(prompt_, &records_, records_.LastResult());
    return ended;
}

bool BulkRun::Change(Str what, const std::function<bool(const BulkProgress&)>& work)
{
    const qint64 total = records_.RecordCount();
    const bool ended = Run(what, total, work);
    if (ended && stopped_ && done_ < total)
        prompt_.Show({Str::StoppedAt, {QString::number(done_), QString::number(total)}});
    return ended;
}

std::optional<AggregateResult> BulkRun::Sum(int field, Aggregate kind)
{
    if (!CanAggregate(records_.TypeOfField(field))) {
        QString type;
        TypeNameOfField(records_.TypeOfField(field), type);
        prompt_.Show({Str::AggregateNotSupported, {type}});
        return {};
    }
    std::optional<AggregateResult> result;
    // Summing needs no count, and counting would take half as long again: a display does without until one is
    // known.
    constexpr int kAsk = -1;
    const qint64 total = records_.CountStep(kAsk) ? records_.RecordCount() : kUnknownTotal;
    Run(Str::SummingRecords, total, [&](const BulkProgress& progress) {
        result = RunAggregate(records_, field, kind, progress);
        return !Failed(records_.LastResult());
    });
    return result;
}

bool BulkRun::AskDeleteAll()
{
    const QString count = QString::number(records_.RecordCount());
    return prompt_.AskYesNo({Str::DeleteAllQuestion, {count}}) &&
           prompt_.AskYesNo({Str::DeleteAllReally, {count}});
}

bool BulkRun::AskUpdateAll(int field, const QString& shownValue)
{
    const QString count = QString::number(records_.RecordCount());
    return prompt_.AskYesNo({Str::UpdateAllQuestion, {count, records_.FieldName(field), shownValue}}) &&
           prompt_.AskYesNo({Str::UpdateAllReally, {count}});
}

bool BulkRun::DeleteAll()
{
    return Change(Str::DeletingRecords,
                  [&](const BulkProgress& progress) { return records_.DeleteAll(progress); });
}

bool BulkRun::UpdateAll(int field, const Value& value)
{
    return Change(Str::UpdatingRecords,
                  [&](const BulkProgress& progress) { return records_.UpdateAll(field, value, progress); });
}

} // namespace mirel
