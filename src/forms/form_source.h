#pragma once

#include "forms/form_context.h"
#include "result/open_result.h"

namespace mirel {

// What a running form stands on: its open result, and the context in which expressions see the current record of
// it. Connection, prompt and what the context draws on must outlive it.
class FormSource {
public:
    FormSource(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt, YesNoWords words,
               RecordContext::ControlTexts controlTexts, FormContext::Clock clock)
        : result_(connection, std::move(database), prompt)
        , context_(result_.Records(), std::move(words), std::move(controlTexts), std::move(clock))
    {
    }

    OpenResult& Result() { return result_; }
    const OpenResult& Result() const { return result_; }
    DbRecordset& Records() { return result_.Records(); }
    const DbRecordset& Records() const { return result_.Records(); }

    bool IsOpen() const { return result_.IsOpen(); }
    qint64 Count() const { return IsOpen() ? result_.Count() : -1; }    // -1: not open
    qint64 Index() const { return IsOpen() ? result_.Position() : -1; } // -1: no record

    // It keeps what it looked up, for as long as the result is the same.
    FormContext& Context() const
    {
        if (runs_ != result_.Runs()) {
            runs_ = result_.Runs();
            context_.ResultChanged();
        }
        return context_;
    }

private:
    mutable OpenResult result_; // counting on changes nothing that anybody sees
    mutable FormContext context_;
    mutable quint64 runs_ = 0;
};

} // namespace mirel
