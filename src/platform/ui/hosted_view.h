#pragma once

#include "platform/ui/keys_dialog.h"
#include "result/record_draft.h"

#include <QWidget>

#include <optional>

class QMenu;

namespace mirel {

// What is opened of a database: a table's records, a running form. It is a tab or stands in a window of its own
// and does not know which: its host shows its title (windowTitle, windowModified) and its menus, and closes it.
//
// Closing writes or asks about what was typed; the view stays when that is refused.
class HostedView : public QWidget {
    Q_OBJECT
public:
    using QWidget::QWidget;

    // Its menus, which it owns. The host puts entries of its own behind those of the first.
    virtual QList<QMenu*> Menus() const = 0;
    virtual QList<KeyHint> Keys() const = 0;
    // A size in which all of it is in sight; none: whatever there is.
    virtual QSize PreferredSize() const { return {}; }

    // Writes what was typed, or asks about it. True: closing it then asks nothing more.
    [[nodiscard]] virtual bool MayClose() = 0;
    // What was typed is lost: what it belongs to is gone.
    virtual void GiveUpEdits() = 0;
    bool HasEdits() const { return isWindowModified(); }
    // What was typed into a record and is not saved yet, to be kept for the case that the program is killed.
    virtual std::optional<RecordDraft> Draft() { return std::nullopt; }
    // Makes it typed and not saved again, on its own record. False, and nothing typed, where that cannot be.
    virtual bool PutBack(const RecordDraft& draft)
    {
        (void)draft;
        return false;
    }
    // Shows what others have changed in the database. The selection stays on its record, typed text stays.
    virtual void TakeUpChanges() = 0;
    // Nothing is left that it counts or sorts in steps.
    virtual bool IsSettled() const { return true; }

Q_SIGNALS:
    void recordsChanged(); // by this view: others may show them as well
    void closed();         // it is hidden by then
    void typed();          // Draft() may be another one by now

protected:
    void closeEvent(QCloseEvent* event) override;
};

} // namespace mirel
