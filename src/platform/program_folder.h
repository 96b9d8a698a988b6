#pragma once

#include <QString>

namespace mirel {

// Where the program keeps what is its own.
struct ProgramFolder {
    QString path;

    // `home` (from --home), else the environment variable MIREL_HOME, else the desktop's data folder for
    // "Mirel". Nothing is created.
    static ProgramFolder Find(const QString& home);

    QString FormsFolder() const;   // the side files of the databases
    QString FavoritesFile() const; // Mirel.fvs
    QString ProfileFile() const;   // Mirel.ini
};

} // namespace mirel
