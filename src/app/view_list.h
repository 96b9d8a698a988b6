#pragma once

#include "app/main_view_state.h"

#include <vector>

namespace mirel {

// What a view shows: a table, a form or a saved query of the database.
struct ViewKey {
    EntryKind kind = EntryKind::Table;
    QString name;
    bool design = false; // the form maker on it, in place of the form

    friend bool operator==(const ViewKey&, const ViewKey&) = default;
};

// The views that are open on a database, in their order, and which is in front; -1: none is.
struct ViewList {
    std::vector<ViewKey> views;
    int front = -1;

    friend bool operator==(const ViewList&, const ViewList&) = default;
};

// As one line of the profile, and back. What does not read is left out.
QString ViewListText(const ViewList& views);
ViewList ReadViewList(QStringView text);

// Those that the database still has; the one in front stays in front where it is one of them.
ViewList StillThere(const ViewList& views, const MainViewState& state);

} // namespace mirel
