#pragma once

#include "platform/profile.h"

#include <QStringList>

namespace mirel {

// The databases that the program knows of, the one opened last first: those opened lately, by full path. They
// stand in the profile's section "Recent" under the keys "1", "2", and so on.
class RecentDatabases {
public:
    static constexpr int kMost = 8;

    // The profile must outlive this.
    explicit RecentDatabases(Profile& profile)
        : profile_(profile)
    {
    }

    QStringList Paths() const;
    void Add(const QString& path); // to the front; the oldest beyond kMost is forgotten
    void Remove(const QString& path);

private:
    void Write(const QStringList& paths);

    Profile& profile_;
};

} // namespace mirel
