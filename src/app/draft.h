#pragma once

#include "app/view_list.h"
#include "result/record_draft.h"

#include <QByteArray>
#include <QString>

#include <vector>

namespace mirel {

// What was typed in one view of one database and is not saved yet.
struct Draft {
    QString database; // its path
    QString stamp;    // empty: it has none
    ViewKey view;     // never a design
    RecordDraft typed;

    friend bool operator==(const Draft&, const Draft&) = default;
};

// The file of drafts, JSON: an object with "version" and "drafts".
QByteArray DraftsFile(const std::vector<Draft>& drafts);

struct DraftsRead {
    enum class Outcome { Read, Newer, Damaged }; // Newer: a later version of this program wrote it
    Outcome outcome = Outcome::Damaged;
    std::vector<Draft> drafts; // a draft that does not read whole is left out; the file is Damaged then, too
};
DraftsRead ReadDraftsFile(const QByteArray& file);

} // namespace mirel
