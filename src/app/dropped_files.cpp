#include "app/dropped_files.h"

#include <QFile>
#include <QFileInfo>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

struct Ending {
    QStringView text;
    QStringList DroppedFiles::*kind;
};
const std::array kEndings = {
    Ending{u".cdb", &DroppedFiles::databases},     Ending{u".db", &DroppedFiles::databases},
    Ending{u".db3", &DroppedFiles::databases},     Ending{u".sqlite", &DroppedFiles::databases},
    Ending{u".sqlite3", &DroppedFiles::databases}, Ending{u".csv", &DroppedFiles::texts},
    Ending{u".tsv", &DroppedFiles::texts},         Ending{u".tab", &DroppedFiles::texts},
    Ending{u".txt", &DroppedFiles::texts},         Ending{u".pfs", &DroppedFiles::forms},
};

bool BeginsAsDatabase(const QString& path)
{
    constexpr QByteArrayView kBeginning("SQLite format 3\0", 16);
    QFile file(path);
    return QFileInfo(path).isFile() && file.open(QIODevice::ReadOnly) &&
           file.read(kBeginning.size()) == kBeginning;
}

} // namespace

DroppedFiles DroppedFiles::Of(const QStringList& paths)
{
    DroppedFiles files;
    for (const QString& path : paths) {
        const auto ending = std::ranges::find_if(
            kEndings, [&path](const Ending& each) { return path.endsWith(each.text, Qt::CaseInsensitive); });
        if (ending != kEndings.end())
            files.*(ending->kind) += path;
        else
            (BeginsAsDatabase(path) ? files.databases : files.others) += path;
    }
    return files;
}

} // namespace mirel
