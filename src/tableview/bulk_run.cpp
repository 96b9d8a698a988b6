#include "tableview/bulk_run.h"

#include "data/field_names.h"
#include "data/provider_error.h"
#include "resources/string_table.h"

namespace mirel {

void BulkRun::Report()
{
    if (result_)
        prompt_.ShowError(result_->LastFailure());
    else
        ReportProviderError(prompt_, &records_, records_.LastResult());
}

bool BulkRun::Run(Str what, qint64 total, const Work& work)
{
    done_ = 0;
    stopped_ = false;
    const std::unique_ptr<Progress> progress = prompt_.StartProgress({what, {}}, total);
    return work([&](qint64 done) {
        done_ = done;
        stopped_ = !progress->Advance(done);
        return !stopped_;
    });
}

bool BulkRun::Change(Str what, const std::function<bool(qint64 confirmed, const BulkProgress&)>& change)
{
    for (;;) {
        const qint64 confirmed = confirmed_;
        const qint64 total = confirmed < 0 ? records_.RecordCount() : confirmed;
        if (Run(what, total, [&](const BulkProgress& progress) { return change(confirmed, progress); })) {
            if (stopped_ && done_ < total)
                prompt_.Show({Str::StoppedAt, {QString::number(done_), QString::number(total)}});
            return true;
        }
        if (LastResult() != Hr::RecordChanged) {
            Report();
            return false;
        }
        confirmed_ = records_.RecordCount();
        if (!prompt_.AskYesNo({Str::ResultGrewQuestion, {QString::number(confirmed_), QString::number(total)}}))
            return false;
    }
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
    const bool ended = Run(Str::SummingRecords, total, [&](const BulkProgress& progress) {
        result = RunAggregate(records_, field, kind, progress);
        return !Failed(records_.LastResult());
    });
    if (!ended)
        ReportProviderError(prompt_, &records_, records_.LastResult());
    return result;
}

QString BulkRun::NoteOnUndo(int fieldsOfEach) const
{
    if (!result_)
        return {};
    return StringText(result_->CanUndoAll(confirmed_, fieldsOfEach) ? Str::UndoBringsBack
                                                                    : Str::UndoCannotBringBack);
}

bool BulkRun::AskDeleteAll()
{
    confirmed_ = records_.RecordCount();
    const QString count = QString::number(confirmed_);
    return prompt_.AskYesNo({Str::DeleteAllQuestion, {count}}) &&
           prompt_.AskYesNoWith({Str::DeleteAllReally, {count}}, {.note = NoteOnUndo(records_.FieldCount())});
}

bool BulkRun::AskUpdateAll(int field, const QString& shownValue)
{
    confirmed_ = records_.RecordCount();
    const QString count = QString::number(confirmed_);
    return prompt_.AskYesNo({Str::UpdateAllQuestion, {count, records_.FieldName(field), shownValue}}) &&
           prompt_.AskYesNoWith({Str::UpdateAllReally, {count}}, {.note = NoteOnUndo(1)});
}

bool BulkRun::DeleteAll()
{
    return Change(Str::DeletingRecords, [&](qint64 confirmed, const BulkProgress& progress) {
        return result_ ? result_->DeleteAll(confirmed, progress) : records_.DeleteAll(confirmed, progress);
    });
}

bool BulkRun::UpdateAll(int field, const Value& value)
{
    return Change(Str::UpdatingRecords, [&](qint64 confirmed, const BulkProgress& progress) {
        return result_ ? result_->UpdateAll(field, value, confirmed, progress)
                       : records_.UpdateAll(field, value, confirmed, progress);
    });
}

} // namespace mirel
