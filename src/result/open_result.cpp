#include "result/open_result.h"

#include "data/catalog.h"
#include "data/provider_error.h"
#include "data/statement_text.h"
#include "platform/ole_date.h"
#include "provider/cell_value.h"
#include "provider/conversion.h"
#include "resources/string_table.h"
#include "result/cell_text.h"
#include "result/record_draft.h"

#include <algorithm>

// The statement and the records; what is written is in open_result_writes.cpp.

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// How long a small result may take to be counted before anybody sees it.
constexpr int kFirstCountMs = 3;

} // namespace

OpenResult::OpenResult(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt)
    : connection_(connection)
    , records_(connection)
    , prompt_(prompt)
    , database_(std::move(database))
{
}

void OpenResult::Report()
{
    ReportProviderError(prompt_, &records_, records_.LastResult());
}

// --- the statement
// ------------------------------------------------------------------------------------------------

bool OpenResult::Open(const QString& statement)
{
    filters_.clear();
    order_.clear();
    baseStatement_ = statement;
    return Execute(statement);
}

bool OpenResult::OpenInstead(const QString& statement)
{
    const QString base = baseStatement_;
    const QString current = statement_;
    const std::vector<Filter> filters = filters_;
    const QString order = order_;
    if (Open(statement))
        return true;
    if (base.isEmpty())
        return false;
    baseStatement_ = base;
    if (Execute(current)) {
        filters_ = filters;
        order_ = order;
    }
    return false;
}

bool OpenResult::Execute(const QString& statement)
{
    statement_ = statement;
    ++runs_;
    lookFailure_.clear();
    if (!records_.Open(statement, database_, CursorType::Static, LockType::Optimistic)) {
        Report();
        Close();
        return false;
    }
    records_.AllowOldOrder(longOrder_);
    Recount();
    position_ = records_.Position();
    return true;
}

void OpenResult::Close()
{
    records_.Close();
    ++runs_;
    count_ = 0;
    position_ = -1;
}

bool OpenResult::Rewrite(const QString& statement)
{
    const QString before = statement_;
    const RecordId id = records_.Id();
    const qint64 position = position_;
    if (Execute(statement))
        return true;
    if (Execute(before))
        ReturnTo(id, position);
    return false;
}

bool OpenResult::RunAgain()
{
    const RecordId id = records_.Id();
    const qint64 position = position_;
    if (!Execute(statement_))
        return false;
    ReturnTo(id, position);
    return true;
}

// To the record, or to what is at its position now.
void OpenResult::ReturnTo(const RecordId& id, qint64 position)
{
    if (position < 0 || position_ < 0 || (!id.IsNull() && records_.Id() == id))
        return;
    if (!id.IsNull() && records_.MoveToRecord(id))
        position_ = records_.Position();
    else
        (void)MoveTo(position);
}

bool OpenResult::AddCondition(const QString& condition)
{
    if (!Rewrite(WithCondition(statement_, condition)))
        return false;
    filters_.push_back({condition});
    return true;
}

bool OpenResult::OrderBy(const QString& terms)
{
    if (!Rewrite(WithOrder(statement_, terms)))
        return false;
    order_ = terms;
    return true;
}

bool OpenResult::RemoveConditions()
{
    if (!Rewrite(baseStatement_))
        return false;
    filters_.clear();
    order_.clear();
    return true;
}

bool OpenResult::Refilter(const std::vector<Filter>& filters)
{
    QString statement = baseStatement_;
    for (const Filter& filter : filters) {
        if (filter.on)
            statement = WithCondition(statement, filter.condition);
    }
    if (!order_.isEmpty())
        statement = WithOrder(statement, order_);
    const RecordId id = records_.Id();
    if (!Rewrite(statement))
        return false;
    ReturnTo(id, 0);
    filters_ = filters;
    return true;
}

QStringList OpenResult::Conditions() const
{
    QStringList conditions;
    for (const Filter& filter : filters_) {
        if (filter.on)
            conditions += filter.condition;
    }
    return conditions;
}

bool OpenResult::OpenRenamed(const std::function<QString(const QString&)>& renamed)
{
    const QString base = renamed(baseStatement_);
    const QString current = renamed(statement_);
    // A part reads by the new names as the whole does that ends with it.
    const auto renamedPart = [&](const QString& part, QString (*put)(const QString&, const QString&)) {
        const QString before = put(base, QStringLiteral("1"));
        const QString whole = renamed(put(baseStatement_, part));
        const QString head = before.chopped(1);
        return before.endsWith(u'1') && whole.startsWith(head) ? whole.sliced(head.size()) : part;
    };
    std::vector<Filter> filters = filters_;
    for (Filter& filter : filters)
        filter.condition = renamedPart(filter.condition, WithCondition);
    const QString order = order_.isEmpty() ? QString() : renamedPart(order_, WithOrder);
    if (!Open(base) || (current != base && !Rewrite(current)))
        return false;
    filters_ = filters;
    order_ = order;
    return true;
}

// --- fields
// -------------------------------------------------------------------------------------------------------

bool OpenResult::IsWritable(int field) const
{
    return field >= 0 && field < FieldCount() && CanUpdate() && !Fields()[size_t(field)].column.isEmpty() &&
           !IsBinary(records_.TypeOfField(field));
}

QString OpenResult::ReferenceOf(int field) const
{
    return FieldReferenceIn(Fields(), field);
}

QString OpenResult::TableOf(int field) const
{
    const std::span<const ResultField> fields = Fields();
    if (field >= 0 && field < FieldCount() && !fields[size_t(field)].table.isEmpty())
        return fields[size_t(field)].table;
    const auto first =
        std::ranges::find_if(fields, [](const ResultField& other) { return !other.table.isEmpty(); });
    return first == fields.end() ? QString() : first->table;
}

std::vector<FieldChange> OpenResult::NewRecordValues(const QDateTime& now) const
{
    const std::optional<double> today = OleDate(now.date().startOfDay());
    std::vector<FieldChange> values;
    for (int field = 0; field < FieldCount(); ++field) {
        if (!IsWritable(field))
            continue;
        if (records_.TypeOfField(field) == FieldType::Date && today)
            values.push_back({field, Value::Date(*today)});
        else if (records_.TypeOfField(field) == FieldType::YesNo)
            values.push_back({field, Value::Bool(false)});
    }
    return values;
}

bool OpenResult::AskForRequired(std::vector<FieldChange>& values)
{
    for (int field = 0; field < FieldCount(); ++field) {
        const bool isGiven = std::ranges::find(values, field, &FieldChange::field) != values.end();
        if (isGiven || !IsWritable(field) || !Fields()[size_t(field)].isRequired)
            continue;
        std::optional<Value> value = AskForValue(field);
        if (!value)
            return false;
        values.push_back({field, std::move(*value)});
    }
    return true;
}

// Until it is one that the field takes.
std::optional<Value> OpenResult::AskForValue(int field)
{
    const FieldType type = records_.TypeOfField(field);
    for (QString typed;;) {
        const UserMessage label{Str::RequiredValue, {records_.FieldName(field)}};
        const std::optional<QString> answer = prompt_.AskText({Str::RequiredValueTitle, {}}, label, typed);
        if (!answer)
            return {};
        typed = *answer;
        const Value given = typed.isEmpty() && IsText(type) ? Value::Text(typed) : TypedValue(typed, type);
        Value value;
        const Hr hr =
            given.IsNull() ? Hr::BadLiteral : ConvertForColumn(given, type, records_.FieldSize(field), value);
        if (!Failed(hr))
            return value;
        prompt_.ShowError(ProviderErrorText(&records_, hr, records_.FieldName(field)));
    }
}

// --- records
// ------------------------------------------------------------------------------------------------------

qint64 OpenResult::Count()
{
    if (!count_) {
        count_ = std::max<qint64>(records_.RecordCount(), 0);
        generation_ = records_.Generation();
    }
    return *count_;
}

bool OpenResult::CountOn(int budgetMs)
{
    if (!count_ && records_.CountStep(budgetMs))
        (void)Count();
    return count_.has_value();
}

void OpenResult::Recount()
{
    count_.reset();
    generation_ = records_.Generation();
    (void)CountOn(kFirstCountMs);
}

bool OpenResult::MoveTo(qint64 position)
{
    if (!records_.MoveTo(std::max<qint64>(position, 0)) || (records_.IsEof() && !records_.MoveLast())) {
        Report();
        return false;
    }
    position_ = records_.Position();
    return true;
}

bool OpenResult::MoveToRecord(const RecordId& id)
{
    if (!records_.MoveToRecord(id))
        return false;
    StandWhereRecordsAre();
    return true;
}

// After the records have moved under the current one, or it among them.
void OpenResult::StandWhereRecordsAre()
{
    Recount();
    if (!records_.IsGone())
        position_ = records_.Position();
}

bool OpenResult::TakeUpChanges(ProviderRecordset::Values values)
{
    if (!IsOpen() || isAsking_)
        return false;
    if (!records_.TakeUpChanges(values)) {
        // Others dropped the table, or hold the file: told once, not at every look.
        const QString failure = ProviderErrorText(&records_, records_.LastResult(), records_.ErrorContext());
        if (failure != lookFailure_) {
            lookFailure_ = failure;
            Report();
        }
        return false;
    }
    lookFailure_.clear();
    if (records_.Generation() == generation_)
        return false;
    StandWhereRecordsAre();
    return true;
}

void OpenResult::Hold()
{
    if (IsOpen() && position_ >= 0 && !IsGone())
        (void)records_.FieldValue(0);
}

SeenRecord OpenResult::Seen()
{
    SeenRecord seen{records_.Id(), {}};
    for (int field = 0; field < FieldCount(); ++field)
        seen.values.push_back(records_.FieldValue(field));
    return seen;
}

QByteArray OpenResult::Fingerprint()
{
    return IsOpen() && Position() >= 0 && !IsGone() ? FingerprintOf(Fields(), Seen().values) : QByteArray();
}

std::vector<RecordId> OpenResult::IdsFrom(qint64 first, qint64 count)
{
    std::vector<RecordId> ids;
    if (!IsOpen() || first < 0 || count <= 0 || !records_.Ids(first, count, ids))
        ids.clear();
    return ids;
}

std::vector<SeenRecord> OpenResult::SeenFrom(qint64 first, qint64 count)
{
    const std::vector<RecordId> ids = IdsFrom(first, count);
    std::vector<SeenRecord> seen;
    for (const RecordId& id : ids)
        seen.push_back({id, {}});
    if (qint64(seen.size()) * FieldCount() > ChangeLog::kMostCells)
        return seen;
    const bool read = records_.ReadRecords(ids, [&](size_t index, std::span<const Cell> cells) {
        for (size_t field = 0; field < cells.size(); ++field)
            seen[index].values.push_back(ValueOfCell(cells[field], Fields()[field].type));
    });
    if (!read)
        Report();
    return seen;
}

} // namespace mirel
