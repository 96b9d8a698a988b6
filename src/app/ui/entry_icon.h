#pragma once

#include "app/main_view_state.h"

#include <QStringView>

namespace mirel {

// The name of the icon of an entry, wherever it is listed.
inline QStringView IconOf(EntryKind kind)
{
    switch (kind) {
    case EntryKind::Table:
        return u"mirel-table";
    case EntryKind::Form:
        return u"mirel-form";
    case EntryKind::Query:
        break;
    }
    return u"mirel-query";
}

} // namespace mirel
