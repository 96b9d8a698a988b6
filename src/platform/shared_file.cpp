#include "platform/shared_file.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QLockFile>
#include <QSaveFile>

namespace mirel {

using namespace Qt::StringLiterals;

bool IsSameFile(const QString& path, const QString& other)
{
    const QString place = QFileInfo(path).canonicalFilePath();
    return !place.isEmpty() && place == QFileInfo(other).canonicalFilePath();
}

std::optional<QByteArray> ReadWholeFile(const QString& path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return {};
    QByteArray bytes = file.readAll();
    if (file.error() != QFileDevice::NoError)
        return {};
    return bytes;
}

bool ChangeFile(const QString& path, const std::function<QByteArray(const QByteArray&)>& change)
{
    constexpr int kLockTimeoutMs = 3000;
    if (!QDir().mkpath(QFileInfo(path).absolutePath()))
        return false;
    QLockFile lock(path + u".lock"_s);
    if (!lock.tryLock(kLockTimeoutMs))
        return false;
    const bool isNew = !QFileInfo::exists(path);
    const std::optional<QByteArray> old = isNew ? QByteArray() : ReadWholeFile(path);
    if (!old) // it is there and keeps its secrets: a new one in its place would lose them
        return false;
    const QByteArray bytes = change(*old);
    if (bytes == *old && !isNew)
        return true;
    QSaveFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size() && file.commit();
}

} // namespace mirel
