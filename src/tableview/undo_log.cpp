#include "tableview/undo_log.h"

#include "data/catalog.h"
#include "data/provider_error.h"
#include "resources/string_table.h"

#include <algorithm>
#include <optional>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr size_t kMostSteps = 200;

enum class Taken { Back, LeftAlone, Refused };

// One change on its way back, on a recordset that can reach its table.
class Way {
public:
    Way(DbConnection& connection, const QString& database, DbRecordset& shown)
        : whole_(connection)
        , database_(database)
        , shown_(shown)
    {
    }

    Taken TakeBack(const RecordChange& change)
    {
        newId_.reset();
        DbRecordset* records = RecordsFor(change);
        if (!records)
            return Refuse(whole_);
        if (change.kind == RecordChange::Kind::Deleted)
            return Write(*records, records->AddNew(Values(*records, change, &RecordChange::Field::before)));
        if (!records->MoveToRecord(change.id))
            return records->LastResult() == Hr::NoCurrentRecord ? Taken::LeftAlone : Refuse(*records);
        if (!Stands(*records, change))
            return Taken::LeftAlone;
        if (change.kind == RecordChange::Kind::Added)
            return records->Delete() ? Taken::Back : Refuse(*records);
        return Write(*records, records->Update(Values(*records, change, &RecordChange::Field::before)));
    }

    std::optional<qint64> NewId() const { return newId_; } // of the record that was put back
    const QString& Failure() const { return failure_; }

private:
    // The shown result where it reaches the record and its columns, else the whole table. A record that comes back
    // goes to the end of what is shown: the result's own order is for the next run of its statement.
    DbRecordset* RecordsFor(const RecordChange& change)
    {
        const bool adds = change.kind == RecordChange::Kind::Deleted;
        if (Reaches(shown_, change) && (adds || shown_.MoveToRecord(change.id)))
            return &shown_;
        const QString statement = u"SELECT * FROM "_s + FieldReference(change.table);
        if (whole_.IsOpen() && whole_.Source() == statement)
            return &whole_;
        return whole_.Open(statement, database_, CursorType::Static, LockType::Optimistic) ? &whole_ : nullptr;
    }

    static int FieldOf(const DbRecordset& records, const RecordChange& change, const QString& column)
    {
        const std::span<const ResultField> fields = records.Fields();
        const auto at = std::ranges::find_if(fields, [&](const ResultField& field) {
            return field.table == change.table && field.column == column;
        });
        return at == fields.end() ? -1 : int(at - fields.begin());
    }

    static bool Reaches(const DbRecordset& records, const RecordChange& change)
    {
        return records.IsOpen() && records.Lock() != LockType::ReadOnly &&
               std::ranges::all_of(change.fields, [&](const RecordChange::Field& field) {
                   return FieldOf(records, change, field.column) >= 0;
               });
    }

    // The record holds what the change left there.
    static bool Stands(const DbRecordset& records, const RecordChange& change)
    {
        return std::ranges::all_of(change.fields, [&](const RecordChange::Field& field) {
            const int index = FieldOf(records, change, field.column);
            return index >= 0 && records.FieldValue(index) == field.after;
        });
    }

    static std::vector<FieldChange> Values(const DbRecordset& records, const RecordChange& change,
                                           Value RecordChange::Field::*value)
    {
        std::vector<FieldChange> values;
        for (const RecordChange::Field& field : change.fields) {
            const int index = FieldOf(records, change, field.column);
            if (index >= 0)
                values.push_back({index, field.*value});
        }
        return values;
    }

    Taken Write(const DbRecordset& records, bool written)
    {
        if (written)
            newId_ = records.RecordId();
        return written ? Taken::Back : Refuse(records);
    }

    Taken Refuse(const DbRecordset& records)
    {
        failure_ = ProviderErrorText(&records, records.LastResult(), records.ErrorContext());
        return Taken::Refused;
    }

    DbRecordset whole_;
    const QString& database_;
    DbRecordset& shown_;
    std::optional<qint64> newId_;
    QString failure_;
};

} // namespace

void UndoLog::Add(Step step)
{
    if (step.empty())
        return;
    steps_.push_back(std::move(step));
    if (steps_.size() > kMostSteps)
        steps_.pop_front();
}

// A record that was deleted and comes back has a new number; older steps know it by the one before.
void UndoLog::Rename(const QString& table, qint64 before, qint64 after)
{
    for (Step& step : steps_) {
        for (RecordChange& change : step) {
            if (change.id == before && change.table == table)
                change.id = after;
        }
    }
}

UndoLog::Outcome UndoLog::Undo(DbConnection& connection, const QString& database, DbRecordset& shown,
                               UserPrompt& prompt)
{
    if (steps_.empty())
        return {};
    const Step before = steps_.back();
    const Hr begun = connection.Provider()->BeginBulk(database);
    if (Failed(begun)) {
        prompt.ShowError(ProviderErrorText(nullptr, begun, {}));
        return {};
    }
    Outcome outcome;
    qint64 leftAlone = 0;
    QString refusal;
    Way way(connection, database, shown);
    while (!steps_.back().empty() && refusal.isEmpty()) {
        const RecordChange change = steps_.back().back();
        const Taken taken = way.TakeBack(change);
        if (taken == Taken::Refused) {
            refusal = way.Failure();
            continue;
        }
        steps_.back().pop_back();
        leftAlone += taken == Taken::LeftAlone ? 1 : 0;
        if (!way.NewId())
            continue;
        outcome.record = way.NewId();
        outcome.column = change.fields.empty() ? QString() : change.fields.front().column;
        Rename(change.table, change.id, *way.NewId());
    }
    if (const Hr ended = connection.Provider()->EndBulk(database); Failed(ended)) {
        steps_.back() = before; // nothing was taken back
        refusal = ProviderErrorText(nullptr, ended, {});
    }
    if (steps_.back().empty())
        steps_.pop_back();
    outcome.done = refusal.isEmpty();
    if (!outcome.done)
        prompt.ShowError(refusal);
    else if (leftAlone > 0)
        prompt.Show({Str::UndoLeftAlone, {QString::number(leftAlone)}});
    return outcome;
}

} // namespace mirel
