#pragma once

#include "app/database_session.h"
#include "app/draft.h"

namespace mirel {

// What became of the record that a draft was typed into.
enum class DraftState {
    Fits,          // it is as it was
    Saved,         // it holds what was typed: the process was killed right after the write
    Changed,       // it holds other values by now
    Gone,          // it was deleted
    OtherDatabase, // the file of that name is another database by now
    NoView,        // what showed it cannot be opened any more
};

// Looks at the record in the session's database; writes nothing, and reports nothing.
DraftState StateOf(const Draft& draft, DatabaseSession& session);

} // namespace mirel
