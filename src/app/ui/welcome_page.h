#pragma once

#include "app/ui/shell_actions.h"

#include <QScrollArea>

namespace mirel {

class EntryList;

// What the main view shows while no database is open: the ways to get one, and those opened lately.
class WelcomePage : public QScrollArea {
    Q_OBJECT
public:
    explicit WelcomePage(const ShellActions& actions, QWidget* parent = nullptr);

    void SetRecent(const QStringList& paths);

Q_SIGNALS:
    void RecentChosen(const QString& path);

private:
    QStringList recent_;
    QWidget* recentHeading_;
    EntryList* recentList_;
};

} // namespace mirel
