#pragma once

#include "data/db_recordset.h"
#include "platform/user_prompt.h"

#include <QHash>
#include <QString>

#include <deque>
#include <span>
#include <utility>
#include <vector>

namespace mirel {

// What one change did to one record, told by its identity in its table, so that it can be found again whatever
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
    RecordId id;
    std::vector<Field> fields;
};

// The last changes to a database, step by step: a step is what the user did at once, of one record or of many.
// Steps can be undone, the last one first, and redone until something else is changed.
//
// A record that somebody changed since is left as it is: nothing of theirs is lost, and the user is told. A
// deleted record comes back as the one it was, where its identity is still free.
class ChangeLog {
public:
    using Step = std::vector<RecordChange>;

    // What is more than this is not kept to be taken back: the caller asks before it changes so many cells.
    static constexpr qint64 kMostCells = 200'000;

    void Add(Step step); // an empty one is none
    // After a change that is not kept: what came before it cannot be taken back either.
    void Clear();

    bool CanUndo() const { return !undo_.empty(); }
    bool CanRedo() const { return !redo_.empty(); }

    struct Outcome {
        bool done = false;
        RecordId record; // the last one that was written; null when none was
        QString column;  // the first of it that was
    };
    // One step, as one transaction. When a record is refused, or the user stops it, those taken back by then stay
    // taken back, and the rest of the step is still to come. Failures are reported through the prompt.
    Outcome Undo(DbConnection& connection, const DatabaseLocation& database, UserPrompt& prompt);
    Outcome Redo(DbConnection& connection, const DatabaseLocation& database, UserPrompt& prompt);

private:
    enum class Direction { Undo, Redo };
    using Place = std::pair<QString, RecordId>; // table and record

    Outcome Run(Direction direction, DbConnection& connection, const DatabaseLocation& database,
                UserPrompt& prompt);
    static void Pass(std::deque<Step>& source, std::deque<Step>& target, std::span<const size_t> done,
                     size_t rest);
    // Records that came back under another identity, because theirs was taken, are known by it from now on.
    void Rename(const QHash<Place, RecordId>& renamed);

    std::deque<Step> undo_;
    std::deque<Step> redo_;
};

} // namespace mirel
