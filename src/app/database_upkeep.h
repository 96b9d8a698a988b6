#pragma once

#include "app/database_session.h"
#include "app/store_check.h"

#include <QString>

#include <vector>

namespace mirel {

// The care of the session's database as a window offers it: copies, the check, the compacting, each with a
// progress that can be cancelled. Failures and questions go through the session's prompt. The session must outlive
// it.
class DatabaseUpkeep {
public:
    explicit DatabaseUpkeep(DatabaseSession& session)
        : session_(session)
    {
    }

    // Each returns one line that says how it ended; empty: it failed, which was told, or the user said No.

    // A copy with its forms and queries, made while the database stays open; asks before it replaces a file.
    QString BackUp(const QString& file);
    // What is open on the database must be closed first: compacting renumbers the records.
    QString Compact();
    // The findings come in the order in which they matter; none: all is well.
    QString Check(std::vector<CheckFinding>& findings);

    // For a copy made today, beside the database and of a name that is free.
    QString NameForCopy() const;

private:
    bool Report(Hr hr, const QString& context, const QString& reason = {});

    DatabaseSession& session_;
};

} // namespace mirel
