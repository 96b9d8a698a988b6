#pragma once

#include "data/db_recordset.h"
#include "platform/user_prompt.h"
#include "result/open_result.h"
#include "tableview/aggregate.h"

#include <optional>

namespace mirel {

// One command over all records of an open result, with its questions, its progress and the report of what fails:
// the same for the window and the command line. Result and prompt must outlive it.
//
// Changes are one transaction. A refused record, or Cancel, ends the run, and the records before it stay changed;
// any other failure, a full disk among them, changes none.
class BulkRun {
public:
    BulkRun(DbRecordset& records, UserPrompt& prompt)
        : records_(records)
        , prompt_(prompt)
    {
    }
    // What it does can be undone, up to a size.
    BulkRun(OpenResult& result, UserPrompt& prompt)
        : records_(result.Records())
        , result_(&result)
        , prompt_(prompt)
    {
    }

    // Empty when the field cannot be summed up, which the user is told, or the walk did not come to its end.
    std::optional<AggregateResult> Sum(int field, Aggregate kind);

    // The questions, two of them before each run; false: the user does not want it. What is done then is done to
    // no more records than they named: when there are more meanwhile, another question names those.
    bool AskDeleteAll();
    bool AskUpdateAll(int field, const QString& shownValue);
    // True when the run went through, or the user ended it on the way: how far it came is then told.
    bool DeleteAll();
    bool UpdateAll(int field, const Value& value);

    // What the last run has changed, as far as it was told.
    qint64 RecordsDone() const { return done_; }

private:
    using Work = std::function<bool(const BulkProgress&)>;

    // Whether Undo can take the run back, for people to know before they answer; empty where nothing is undone.
    QString NoteOnUndo(int fieldsOfEach) const;
    bool Run(Str what, qint64 total, const Work& work);
    bool Change(Str what, const std::function<bool(qint64 confirmed, const BulkProgress&)>& change);
    Hr LastResult() const { return result_ ? result_->LastResult() : records_.LastResult(); }
    void Report();

    DbRecordset& records_;
    OpenResult* result_ = nullptr;
    UserPrompt& prompt_;
    qint64 confirmed_ = -1; // records that the questions named
    qint64 done_ = 0;
    bool stopped_ = false;
};

} // namespace mirel
