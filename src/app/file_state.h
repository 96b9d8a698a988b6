#pragma once

#include <QDateTime>
#include <QString>

namespace mirel {

// What a database's file looks like from outside: it tells in a moment whether another program wrote to it.
struct FileState {
    bool exists = false;
    qint64 sizeBytes = 0; // with what is not yet in the file itself
    QDateTime changed;

    static FileState Of(const QString& path);

    friend bool operator==(const FileState&, const FileState&) = default;
};

} // namespace mirel
