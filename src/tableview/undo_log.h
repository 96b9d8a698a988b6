#pragma once

#include "data/db_recordset.h"
#include "platform/user_prompt.h"

#include <QString>

#include <deque>
#include <vector>

namespace mirel {

// What one change did to one record, told by its number in its table, so that it can be found again whatever
// result is shown then.
struct RecordChange {
    enum class Kind { Changed, Added, Deleted };
    struct Field {
        QString column; // of the table
        Value before;   // none of an added record
        Value after;    // none of a deleted one
    };

    Kind kind = Kind::Changed;
    QString table;
    qint64 id = 0;
    std::vector<Field> fields;
};

// The last changes, step by step: a step is what the user did at once, of one record or of many.
//
// A record that somebody changed since is left as it is: nothing of theirs is lost, and the user is told.
class UndoLog {
public:
    using Step = std::vector<RecordChange>;

    void Add(Step step); // an empty one is none
    void Clear() { steps_.clear(); }
    bool CanUndo() const { return !steps_.empty(); }

    struct Outcome {
        bool done = false;
        std::optional<qint64> record; // one that was put back
        QString column;               // the first of its columns
    };
    // Takes the last step back. `shown` is used where it holds the record, and stands on any record afterwards;
    // all else is done through a result of its own. What the store refuses stays to be undone, with what was to
    // follow it; what came before it is done.
    Outcome Undo(DbConnection& connection, const QString& database, DbRecordset& shown, UserPrompt& prompt);

private:
    void Rename(const QString& table, qint64 before, qint64 after);

    std::deque<Step> steps_;
};

} // namespace mirel
