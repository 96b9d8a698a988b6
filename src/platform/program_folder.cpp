#include "platform/program_folder.h"

#include <QDir>
#include <QStandardPaths>

namespace mirel {

using namespace Qt::StringLiterals;

ProgramFolder ProgramFolder::Find(const QString& home)
{
    QString path = home;
    if (path.isEmpty())
        path = qEnvironmentVariable("MIREL_HOME");
    if (path.isEmpty())
        path = QStandardPaths::writableLocation(QStandardPaths::GenericDataLocation) + u"/Mirel"_s;
    return {.path = QDir::cleanPath(QDir(path).absolutePath())};
}

QString ProgramFolder::FormsFolder() const
{
    return path + u"/Forms"_s;
}

QString ProgramFolder::FavoritesFile() const
{
    return path + u"/Mirel.fvs"_s;
}

QString ProgramFolder::DraftsFolder() const
{
    return path + u"/Drafts"_s;
}

QString ProgramFolder::ProfileFile() const
{
    return path + u"/Mirel.ini"_s;
}

Profile ProgramFolder::OpenProfile() const
{
    return Profile(ProfileFile(), profileAccess);
}

} // namespace mirel
