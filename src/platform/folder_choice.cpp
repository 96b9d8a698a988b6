#include "platform/folder_choice.h"

#include <QDir>
#include <QFileInfo>

#include <algorithm>

namespace mirel {

FolderChoice::FolderChoice(const QString& folder, QStringList endings)
    : folder_(QDir::cleanPath(QFileInfo(folder).absoluteFilePath()))
    , endings_(std::move(endings))
{
    while (!QFileInfo(folder_).isDir() && CanGoUp())
        GoUp();
}

std::vector<FolderChoice::Entry> FolderChoice::Entries() const
{
    const QDir::SortFlags order = QDir::Name | QDir::IgnoreCase | QDir::LocaleAware;
    const QDir here(folder_);
    std::vector<Entry> entries;
    for (const QString& name : here.entryList(QDir::Dirs | QDir::NoDotAndDotDot | QDir::Readable, order))
        entries.push_back({name, true});
    for (const QString& name : here.entryList(QDir::Files, order)) {
        if (std::ranges::any_of(endings_,
                                [&](const QString& ending) { return name.endsWith(ending, Qt::CaseInsensitive); }))
            entries.push_back({name, false});
    }
    return entries;
}

bool FolderChoice::CanGoUp() const
{
    return !QDir(folder_).isRoot();
}

void FolderChoice::GoUp()
{
    folder_ = QFileInfo(folder_).path();
}

bool FolderChoice::Enter(const QString& name)
{
    const QFileInfo target(QDir(folder_), name);
    if (name.isEmpty() || !target.isDir() || !target.isReadable())
        return false;
    folder_ = QDir::cleanPath(target.absoluteFilePath());
    return true;
}

QString FolderChoice::PathOf(const QString& name) const
{
    return QDir::cleanPath(QDir(folder_).absoluteFilePath(name));
}

} // namespace mirel
