#include "platform/held_lock.h"

#include <QFile>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

namespace mirel {

HeldLock::HeldLock(HeldLock&& other) noexcept
    : file_(std::exchange(other.file_, -1))
    , path_(std::move(other.path_))
{
}

HeldLock& HeldLock::operator=(HeldLock&& other) noexcept
{
    if (this != &other) {
        Release();
        file_ = std::exchange(other.file_, -1);
        path_ = std::move(other.path_);
    }
    return *this;
}

bool HeldLock::Take(const QString& path)
{
    Release();
    const QByteArray name = QFile::encodeName(path);
    file_ = ::open(name.constData(), O_RDWR | O_CREAT | O_CLOEXEC, S_IRUSR | S_IWUSR);
    path_ = path;
    struct stat held {};
    struct stat named {};
    // The holder before may have removed the file between our two calls: a lock on that would keep nobody out.
    const bool isOurs = file_ >= 0 && ::flock(file_, LOCK_EX | LOCK_NB) == 0 && ::fstat(file_, &held) == 0 &&
                        ::stat(name.constData(), &named) == 0 && held.st_ino == named.st_ino &&
                        held.st_dev == named.st_dev;
    if (!isOurs)
        Release();
    return isOurs;
}

void HeldLock::Release()
{
    if (file_ >= 0)
        ::close(file_);
    file_ = -1;
}

void HeldLock::ReleaseAndRemove()
{
    if (IsHeld())
        QFile::remove(path_);
    Release();
}

} // namespace mirel
