#include "app/recent_databases.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const QString kSection = u"Recent"_s;

} // namespace

QStringList RecentDatabases::Paths() const
{
    QStringList paths;
    for (int i = 1; i <= kMost; ++i) {
        const QString path = profile_.ReadText(kSection, QString::number(i), {});
        if (!path.isEmpty() && !paths.contains(path))
            paths += path;
    }
    return paths;
}

void RecentDatabases::Add(const QString& path)
{
    QStringList paths = Paths();
    paths.removeAll(path);
    paths.prepend(path);
    Write(paths);
}

void RecentDatabases::Remove(const QString& path)
{
    QStringList paths = Paths();
    if (paths.removeAll(path) > 0)
        Write(paths);
}

void RecentDatabases::Write(const QStringList& paths)
{
    for (int i = 1; i <= kMost; ++i) {
        const QString key = QString::number(i);
        const QString path = paths.value(i - 1);
        if (profile_.ReadText(kSection, key, {}) != path)
            profile_.WriteText(kSection, key, path);
    }
}

} // namespace mirel
