#pragma once

#include "platform/profile.h"

#include <QString>

namespace mirel {

// The folder with the program's own files.
struct ProgramFolder {
    QString path;
    Profile::Access profileAccess = Profile::Access::ReadWrite; // of every profile opened through this folder

    // `home` (from --home), else the environment variable MIREL_HOME, else the desktop's data folder for
    // "Mirel". Nothing is created.
    static ProgramFolder Find(const QString& home);

    QString FormsFolder() const;   // the side files of the databases
    QString FavoritesFile() const; // Mirel.fvs
    QString DraftsFolder() const;  // what is typed and not saved, a file for each running program
    QString ProfileFile() const;   // Mirel.ini
    Profile OpenProfile() const;
};

} // namespace mirel
