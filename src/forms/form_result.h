#pragma once

#include "data/db_recordset.h"
#include "forms/form_context.h"
#include "platform/user_prompt.h"

#include <QString>
#include <QStringList>

namespace mirel {

// The result that a running form stands on: the query behind it, with the filters and sorts put onto it, and the
// current record.
//
// Records count from 0. The recordset stands on the current record at all times. Failures are reported through
// the prompt. Connection, prompt and what the context draws on must outlive it.
class FormResult {
public:
    FormResult(DbConnection& connection, QString database, UserPrompt& prompt, YesNoWords words,
               RecordContext::ControlTexts controlTexts, FormContext::Clock clock);

    // Runs `query`, which becomes the base and the current query, and stands on `record`, or on the first one
    // where there is no such record. False, with nothing open, when the query cannot be run.
    bool Open(const QString& query, qint64 record);
    // Runs the current query again and stands on the same record, or on the last one.
    bool RunAgain();
    void Close();

    bool IsOpen() const { return records_.IsOpen(); }
    qint64 Count() const { return count_; } // -1: not open
    qint64 Index() const { return index_; } // -1: no record
    const QString& Query() const { return query_; }
    DbRecordset& Records() { return records_; }
    const DbRecordset& Records() const { return records_; }
    FormContext& Context() const { return context_; } // it keeps what it looked up

    bool MoveTo(qint64 record);
    bool Add(std::span<const FieldChange> values); // the new record becomes current
    // The record that takes its place becomes current, or the last one. When it fails, the query is run again.
    bool Delete();
    // Brings count and place up to date after records came or went behind the cursor's back: an INSERT of ours, or
    // what another program did.
    void Recount();

    // Each runs the rewritten query and stands on its first record. False when the provider refuses it: the
    // result before is then shown again.
    bool AddCondition(const QString& condition);
    bool SortBy(const QString& terms);
    bool RemoveFilter();
    const QStringList& Conditions() const { return conditions_; }

    // A field as it stands in a statement, with its table where the result draws on more than one.
    QString ReferenceOf(int field) const;

    void Report(); // the last failure, to the user

private:
    bool Run(const QString& query, qint64 record);
    bool Rewrite(const QString& query);

    DbRecordset records_;
    mutable FormContext context_;
    UserPrompt& prompt_;
    QString database_;
    QString baseQuery_;
    QString query_;
    QStringList conditions_;
    qint64 count_ = -1;
    qint64 index_ = -1;
};

} // namespace mirel
