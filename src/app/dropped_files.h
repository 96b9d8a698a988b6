#pragma once

#include <QString>
#include <QStringList>

namespace mirel {

// Files that are dropped on the window, by what can be done with them: a database opens, a text file is imported,
// a form file brings a form. Endings decide, and the first bytes where an ending says nothing.
struct DroppedFiles {
    QStringList databases;
    QStringList texts;
    QStringList forms;
    QStringList others; // nothing can be done with them

    static DroppedFiles Of(const QStringList& paths);
    bool IsUsable() const { return !databases.isEmpty() || !texts.isEmpty() || !forms.isEmpty(); }
};

} // namespace mirel
