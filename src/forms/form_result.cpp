#include "forms/form_result.h"

#include "data/provider_error.h"
#include "data/statement_text.h"

#include <utility>

namespace mirel {

using namespace Qt::StringLiterals;

FormResult::FormResult(DbConnection& connection, QString database, UserPrompt& prompt, YesNoWords words,
                       RecordContext::ControlTexts controlTexts, FormContext::Clock clock)
    : records_(connection)
    , context_(records_, std::move(words), std::move(controlTexts), std::move(clock))
    , prompt_(prompt)
    , database_(std::move(database))
{
}

void FormResult::Report()
{
    ReportProviderError(prompt_, &records_, records_.LastResult());
}

bool FormResult::Open(const QString& query, qint64 record)
{
    conditions_.clear();
    baseQuery_ = query;
    return Run(query, record);
}

bool FormResult::Run(const QString& query, qint64 record)
{
    query_ = query;
    const bool opened = records_.Open(query, database_, CursorType::Static, LockType::Optimistic);
    context_.ResultChanged();
    count_ = opened ? records_.RecordCount() : -1;
    index_ = count_ > 0 ? 0 : -1;
    if (count_ < 0) {
        Report();
        Close();
        return false;
    }
    return record <= 0 || record >= count_ || MoveTo(record);
}

void FormResult::Close()
{
    records_.Close();
    context_.ResultChanged();
    count_ = -1;
    index_ = -1;
}

bool FormResult::RunAgain()
{
    const qint64 record = index_;
    if (!Run(query_, -1))
        return false;
    return record <= 0 || count_ == 0 || MoveTo(std::min(record, count_ - 1));
}

bool FormResult::MoveTo(qint64 record)
{
    if (!records_.MoveTo(record) || (records_.IsEof() && !records_.MoveLast())) {
        Report();
        return false;
    }
    index_ = records_.Position();
    return true;
}

void FormResult::Recount()
{
    count_ = records_.RecordCount();
    index_ = records_.Position();
}

bool FormResult::Add(std::span<const FieldChange> values)
{
    if (!records_.AddNew(values)) {
        Report();
        return false;
    }
    Recount();
    return true;
}

bool FormResult::Delete()
{
    if (!records_.Delete()) {
        Report();
        RunAgain();
        return false;
    }
    count_ = records_.RecordCount();
    if (count_ > 0 && records_.IsEof() && !records_.MoveLast())
        Report();
    index_ = count_ > 0 ? records_.Position() : -1;
    return true;
}

bool FormResult::Rewrite(const QString& query)
{
    const QString before = query_;
    const qint64 record = index_;
    if (Run(query, -1))
        return true;
    if (Run(before, -1) && record > 0 && record < count_)
        MoveTo(record);
    return false;
}

bool FormResult::AddCondition(const QString& condition)
{
    if (!Rewrite(WithCondition(query_, condition)))
        return false;
    conditions_ += condition;
    return true;
}

bool FormResult::SortBy(const QString& terms)
{
    return Rewrite(WithOrder(query_, terms));
}

bool FormResult::RemoveFilter()
{
    if (!Rewrite(baseQuery_))
        return false;
    conditions_.clear();
    return true;
}

QString FormResult::ReferenceOf(int field) const
{
    return FieldReferenceIn(records_.Fields(), field);
}

} // namespace mirel
