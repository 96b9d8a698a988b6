#include "app/file_state.h"

#include <QFileInfo>

#include <algorithm>

namespace mirel {

FileState FileState::Of(const QString& path)
{
    const QFileInfo file(path);
    const QFileInfo log(path + QStringLiteral("-wal"));
    FileState state{file.isFile(), file.size(), file.lastModified()};
    if (log.exists()) {
        state.sizeBytes += log.size();
        state.changed = std::max(state.changed, log.lastModified());
    }
    return state;
}

} // namespace mirel
