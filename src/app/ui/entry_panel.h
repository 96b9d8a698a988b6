#pragma once

#include "app/entry_summary.h"

#include <QTimer>
#include <QWidget>

#include <array>

namespace mirel {

class ElidedLabel;

// The foot of the side bar: what the selected entry is, at a glance. The session must outlive it.
class EntryPanel : public QWidget {
    Q_OBJECT
public:
    explicit EntryPanel(DatabaseSession& session, QWidget* parent = nullptr);

    // Looks at the entry once the user stays on it.
    void LookAt(const std::optional<MainEntry>& entry);
    bool IsSettled() const { return !lookTimer_.isActive() && !countTimer_.isActive(); }
    void StopCounting() { summary_.StopCounting(); }

private:
    void Look();
    void ShowLines();

    EntrySummary summary_;
    std::optional<MainEntry> entry_;
    ElidedLabel* name_;
    std::array<ElidedLabel*, 3> lines_{}; // always as many: the list above stays where it is
    QTimer lookTimer_;
    QTimer countTimer_;
};

} // namespace mirel
