#pragma once

#include "app/database_session.h"
#include "app/main_view_state.h"
#include "forms/name_mending.h"
#include "tableeditor/table_designer.h"

namespace mirel {

// Renames what the open database holds, and offers to mend what refers to it: forms, saved queries, CALL FORM
// buttons, favorites. They are listed first; all of them are mended in one change of the store file, which belongs
// to the renaming: both are done, or neither.
//
// The session must outlive it.
class Renaming {
public:
    explicit Renaming(DatabaseSession& session)
        : session_(session)
    {
    }

    // Of a table or a field: `rename` does it, and does the last step that it is given before it commits.
    bool Rename(const NameChange& change, const std::function<bool(const DesignRun::LastStep& last)>& rename);
    // The same for several at once, names exchanged included, without a question: all that refers to them is
    // mended.
    bool RenameAndMend(const std::vector<NameChange>& changes,
                       const std::function<bool(const DesignRun::LastStep& last)>& rename);
    // Of a form or a saved query. False, with the reason told, for a name that cannot be or is taken.
    bool RenameInStore(EntryKind kind, const QString& name, const QString& newName);

private:
    enum class Choice { Cancel, RenameAlone, Mend };

    Choice Ask(const NameChange& change);
    bool MendsFavorites(const NameChange& change) const;
    void MendFavorites(const NameChange& change);
    bool CheckName(EntryKind kind, const QString& name, const QString& newName);

    DatabaseSession& session_;
};

// The surroundings of a designer without views: renamings are mended all the same.
class MendingHost : public DesignHost {
public:
    explicit MendingHost(DatabaseSession& session)
        : session_(session)
    {
    }

    bool Rename(const NameChange& change,
                const std::function<bool(const DesignRun::LastStep& last)>& rename) override
    {
        return Renaming(session_).Rename(change, rename);
    }

private:
    DatabaseSession& session_;
};

} // namespace mirel
