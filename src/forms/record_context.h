#pragma once

#include "data/db_recordset.h"
#include "expr/evaluator.h"
#include "platform/yes_no_words.h"

#include <functional>
#include <vector>

namespace mirel {

// The current record of a recordset as expressions see it, and the texts of a form's controls.
//
// Each value is fetched once a record. The recordset must outlive the context, and may be closed: then field
// names mean nothing. After each Open call ResultChanged, or names go on meaning the columns of the old result.
class RecordContext : public EvalContext {
public:
    using ControlTexts = std::function<QString(QStringView name)>;

    RecordContext(DbRecordset& records, YesNoWords words, ControlTexts controlTexts);

    void ResultChanged();
    void SetWords(YesNoWords words) { words_ = std::move(words); }

    void BeginEvaluation() override;
    qint64 Position() override;
    qint64 RecordCount() override;
    // As written; then without brackets; then by the table and name that a column comes from; then without the
    // table. Each exact first, then without regard to case and blanks.
    int FindColumn(QStringView name) override;
    FieldType TypeOfColumn(int column) override;
    const Value& FieldValue(int column) override;
    QStringView YesNoWord(bool truth) override;
    QString ControlText(QStringView name) override;

private:
    struct FetchedValue {
        Value value;
        quint64 record = 0; // for which it was fetched
    };

    DbRecordset& records_;
    YesNoWords words_;
    ControlTexts controlTexts_;
    std::vector<FetchedValue> values_;
    quint64 record_ = 0; // another number for each record, and each change of one
    qint64 count_ = -1;  // asking the recordset makes it look for changes by others: once a record
    quint64 countedAt_ = 0;
    qint64 position_ = -1;
    quint64 generation_ = 0;
};

} // namespace mirel
