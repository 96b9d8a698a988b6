#include "result/change_log.h"

#include "data/catalog.h"
#include "data/db_transaction.h"
#include "data/provider_error.h"
#include "resources/string_table.h"

#include <algorithm>
#include <map>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr size_t kMostSteps = 200;
constexpr qint64 kTellEvery = 64;

enum class Taken { Done, LeftAlone, Refused };

// One direction of a change: what the record must hold for it, and what it holds afterwards.
struct Turn {
    Value RecordChange::Field::*from;
    Value RecordChange::Field::*to;
    RecordChange::Kind adds; // the kind of change that puts a record into its table in this direction
};

constexpr Turn kUndo{&RecordChange::Field::after, &RecordChange::Field::before, RecordChange::Kind::Deleted};
constexpr Turn kRedo{&RecordChange::Field::before, &RecordChange::Field::after, RecordChange::Kind::Added};

// Turns changes on recordsets of the tables, which reach every record, in any order, at the same cost. What changes a
// few fields of many records reads no others.
class ChangeTurner {
public:
    ChangeTurner(DbConnection& connection, const DatabaseLocation& database, const Turn& turn)
        : connection_(connection)
        , database_(database)
        , turn_(turn)
    {
    }

    // `id`: of the record as it is now; on return, as it is then.
    Taken Apply(const RecordChange& change, RecordId& id)
    {
        Table& table = TableOf(change);
        if (!table.records.IsOpen())
            return Refuse(table.records);
        if (change.kind == turn_.adds) {
            const bool added = table.records.AddNew(Values(table, change), id);
            id = table.records.IdInTable();
            return added ? Taken::Done : Refuse(table.records);
        }
        if (!table.records.MoveToRecord(id))
            return table.records.LastResult() == Hr::NoCurrentRecord ? Taken::LeftAlone : Refuse(table.records);
        if (!HoldsExpected(table, change))
            return Taken::LeftAlone;
        if (change.kind != RecordChange::Kind::Changed)
            return table.records.Delete() ? Taken::Done : Refuse(table.records);
        const bool written = table.records.Update(Values(table, change));
        id = table.records.IdInTable();
        return written ? Taken::Done : Refuse(table.records);
    }

    const QString& Failure() const { return failure_; }

private:
    struct Table {
        explicit Table(DbConnection& connection)
            : records(connection)
        {
        }
        DbRecordset records;
        QHash<QString, int> fields;
    };

    Table& TableOf(const RecordChange& change)
    {
        QStringList fields;
        if (change.kind == RecordChange::Kind::Changed) {
            for (const RecordChange::Field& field : change.fields)
                fields += FieldReference(field.column);
        }
        const QString of = u" FROM "_s + FieldReference(change.table);
        const QString key = fields.join(u',') + of;
        const auto known = tables_.find(key);
        if (known != tables_.end())
            return known->second;
        Table& table = tables_.try_emplace(key, connection_).first->second;
        const auto open = [&](const QString& what) {
            return table.records.Open(u"SELECT "_s + what + of, database_, CursorType::Static, LockType::Optimistic);
        };
        // A field may be gone by now: the others then tell that its record is another one.
        if ((fields.isEmpty() || !open(fields.join(u','))) && !open(u"*"_s))
            return table;
        for (int field = 0; field < table.records.FieldCount(); ++field)
            table.fields.insert(table.records.Fields()[size_t(field)].column, field);
        return table;
    }

    bool HoldsExpected(const Table& table, const RecordChange& change) const
    {
        return std::ranges::all_of(change.fields, [&](const RecordChange::Field& field) {
            const int index = table.fields.value(field.column, -1);
            return index >= 0 && table.records.FieldValue(index) == field.*turn_.from;
        });
    }

    std::vector<FieldChange> Values(const Table& table, const RecordChange& change) const
    {
        std::vector<FieldChange> values;
        for (const RecordChange::Field& field : change.fields) {
            const int index = table.fields.value(field.column, -1);
            if (index >= 0)
                values.push_back({index, field.*turn_.to});
        }
        return values;
    }

    Taken Refuse(const DbRecordset& records)
    {
        failure_ = ProviderErrorText(&records, records.LastResult(), records.ErrorContext());
        return Taken::Refused;
    }

    DbConnection& connection_;
    const DatabaseLocation& database_;
    const Turn& turn_;
    std::map<QString, Table> tables_;
    QString failure_;
};

} // namespace

void ChangeLog::Add(Step step)
{
    if (step.empty())
        return;
    redo_.clear();
    undo_.push_back(std::move(step));
    if (undo_.size() > kMostSteps)
        undo_.pop_front();
}

void ChangeLog::Clear()
{
    undo_.clear();
    redo_.clear();
}

void ChangeLog::Rename(const QHash<Place, RecordId>& renamed)
{
    if (renamed.isEmpty())
        return;
    for (std::deque<Step>* steps : {&undo_, &redo_}) {
        for (Step& step : *steps) {
            for (RecordChange& change : step)
                change.id = renamed.value({change.table, change.id}, change.id);
        }
    }
}

ChangeLog::Outcome ChangeLog::Undo(DbConnection& connection, const DatabaseLocation& database, UserPrompt& prompt)
{
    return Run(Direction::Undo, connection, database, prompt);
}

ChangeLog::Outcome ChangeLog::Redo(DbConnection& connection, const DatabaseLocation& database, UserPrompt& prompt)
{
    return Run(Direction::Redo, connection, database, prompt);
}

ChangeLog::Outcome ChangeLog::Run(Direction direction, DbConnection& connection, const DatabaseLocation& database,
                                  UserPrompt& prompt)
{
    std::deque<Step>& source = direction == Direction::Undo ? undo_ : redo_;
    std::deque<Step>& target = direction == Direction::Undo ? redo_ : undo_;
    if (source.empty())
        return {};
    DbTransaction transaction(connection, database);
    if (!transaction.Begin()) {
        prompt.ShowError(ProviderErrorText(nullptr, transaction.LastResult(), transaction.ErrorContext()));
        return {};
    }
    Outcome outcome;
    Step rest = source.back();
    Step taken;
    QHash<Place, RecordId> renamed;
    qint64 leftAlone = 0;
    QString refusal;
    {
        const qint64 total = qint64(rest.size());
        const std::unique_ptr<Progress> progress =
            total > kTellEvery ? prompt.StartProgress({Str::UndoingChanges, {}}, total) : nullptr;
        ChangeTurner turner(connection, database, direction == Direction::Undo ? kUndo : kRedo);
        while (!rest.empty() && refusal.isEmpty()) {
            const qint64 done = total - qint64(rest.size());
            if (progress && done % kTellEvery == 0 && !progress->Advance(done))
                break;
            const RecordChange& change = rest.back();
            const RecordId before = renamed.value({change.table, change.id}, change.id);
            RecordId id = before;
            const Taken what = turner.Apply(change, id);
            if (what == Taken::Refused) {
                refusal = turner.Failure();
                break;
            }
            if (what == Taken::LeftAlone) {
                ++leftAlone;
            } else {
                if (!id.IsNull() && id != before)
                    renamed.insert({change.table, before}, id);
                outcome.record = id;
                outcome.column = change.fields.empty() ? QString() : change.fields.front().column;
                taken.push_back(change);
            }
            rest.pop_back();
        }
    }
    if (!transaction.Commit()) { // nothing was taken back
        prompt.ShowError(ProviderErrorText(nullptr, transaction.LastResult(), transaction.ErrorContext()));
        return {};
    }
    source.pop_back();
    if (!rest.empty())
        source.push_back(std::move(rest));
    if (!taken.empty())
        target.push_back(std::move(taken)); // it runs backwards there, as it has to
    Rename(renamed);
    outcome.done = refusal.isEmpty();
    if (!outcome.done)
        prompt.ShowError(refusal);
    else if (leftAlone > 0)
        prompt.Show({Str::UndoLeftAlone, {QString::number(leftAlone)}});
    return outcome;
}

} // namespace mirel
