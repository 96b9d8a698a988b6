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

// Turns changes record by record, wherever they stand in a result.
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
        Table& table = TableOf(change.table);
        if (!table.editor)
            return Taken::Refused;
        const bool isWhole = Collect(table, change, turn_.to, to_);
        if (change.kind == turn_.adds)
            return Told(*table.editor, table.editor->Add(id, to_));
        // A field that is gone by now: the record is another one.
        if (!isWhole || !Collect(table, change, turn_.from, from_))
            return Taken::LeftAlone;
        if (change.kind == RecordChange::Kind::Changed)
            return Told(*table.editor, table.editor->Update(id, from_, to_));
        return Told(*table.editor, table.editor->Delete(id, from_));
    }

    const QString& Failure() const { return failure_; }

private:
    struct Table {
        std::unique_ptr<RecordEditor> editor; // null: it cannot be written
        QHash<QString, int> fields;
    };

    Table& TableOf(const QString& name)
    {
        const auto [known, isNew] = tables_.try_emplace(name);
        Table& table = known->second;
        if (!isNew)
            return table;
        Hr result = Hr::NotOpen;
        QString context;
        if (ProviderConnection* provider = connection_.Provider())
            table.editor = provider->CreateEditor(database_, name, result, context);
        if (!table.editor) {
            failure_ = ProviderErrorText(nullptr, result, context);
            return table;
        }
        for (const ResultField& field : table.editor->Fields())
            table.fields.insert(field.column, int(table.fields.size()));
        return table;
    }

    // False: the table has not all of the fields; `values` has those that are there.
    static bool Collect(const Table& table, const RecordChange& change, Value RecordChange::Field::*which,
                        std::vector<FieldChange>& values)
    {
        values.clear();
        for (const RecordChange::Field& field : change.fields) {
            const auto index = table.fields.constFind(field.column);
            if (index != table.fields.constEnd())
                values.push_back({*index, field.*which});
        }
        return values.size() == change.fields.size();
    }

    Taken Told(const RecordEditor& editor, Hr result)
    {
        if (!Failed(result))
            return Taken::Done;
        if (result == Hr::NoCurrentRecord || result == Hr::RecordChanged)
            return Taken::LeftAlone;
        failure_ = ProviderErrorText(nullptr, result, editor.ErrorContext());
        return Taken::Refused;
    }

    DbConnection& connection_;
    const DatabaseLocation& database_;
    const Turn& turn_;
    std::map<QString, Table> tables_;
    std::vector<FieldChange> from_;
    std::vector<FieldChange> to_;
    QString failure_;
};

using Place = std::pair<QString, RecordId>; // table and record

// How far a step was turned, from its last change to its first.
struct Turned {
    size_t rest = 0;                // the changes before it are still to come
    std::vector<size_t> changes;    // that were made, in the order of their making
    QHash<Place, RecordId> renamed; // records that have another identity since
    qint64 leftAlone = 0;
    QString refusal;
    RecordId last; // the record that was written last
};

// Inside a transaction. Ends at a record that is refused, and where the user stops it.
Turned TurnStep(const ChangeLog::Step& step, ChangeTurner& turner, Progress* progress)
{
    Turned turned;
    for (turned.rest = step.size(); turned.rest > 0; --turned.rest) {
        const qint64 done = qint64(step.size() - turned.rest);
        if (progress && done % kTellEvery == 0 && !progress->Advance(done))
            break;
        const RecordChange& change = step[turned.rest - 1];
        const RecordId before =
            turned.renamed.isEmpty() ? change.id : turned.renamed.value({change.table, change.id}, change.id);
        RecordId id = before;
        const Taken taken = turner.Apply(change, id);
        if (taken == Taken::Refused) {
            turned.refusal = turner.Failure();
            break;
        }
        if (taken == Taken::LeftAlone) {
            ++turned.leftAlone;
            continue;
        }
        if (id != before)
            turned.renamed.insert({change.table, before}, id);
        turned.last = id;
        turned.changes.push_back(turned.rest - 1);
    }
    return turned;
}

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
    const Step& step = source.back();
    const qint64 total = qint64(step.size());
    Turned turned;
    {
        const std::unique_ptr<Progress> progress =
            total > kTellEvery ? prompt.StartProgress({Str::UndoingChanges, {}}, total) : nullptr;
        ChangeTurner turner(connection, database, direction == Direction::Undo ? kUndo : kRedo);
        turned = TurnStep(step, turner, progress.get());
    }
    if (!transaction.Commit()) { // nothing was taken back
        prompt.ShowError(ProviderErrorText(nullptr, transaction.LastResult(), transaction.ErrorContext()));
        return {};
    }
    Outcome outcome{.done = turned.refusal.isEmpty(), .record = turned.last, .column = {}};
    if (!turned.changes.empty() && !step[turned.changes.back()].fields.empty())
        outcome.column = step[turned.changes.back()].fields.front().column;
    Pass(source, target, turned.changes, turned.rest);
    Rename(turned.renamed);
    if (!outcome.done)
        prompt.ShowError(turned.refusal);
    else if (turned.leftAlone > 0)
        prompt.Show({Str::UndoLeftAlone, {QString::number(turned.leftAlone)}});
    return outcome;
}

// The last step of `source` without what was done of it, which becomes a step of `target`; it runs backwards
// there, as it has to.
void ChangeLog::Pass(std::deque<Step>& source, std::deque<Step>& target, std::span<const size_t> done, size_t rest)
{
    Step& step = source.back();
    Step passed;
    passed.reserve(done.size());
    for (const size_t at : done)
        passed.push_back(std::move(step[at]));
    step.resize(rest);
    if (step.empty())
        source.pop_back();
    if (!passed.empty())
        target.push_back(std::move(passed));
}

} // namespace mirel
