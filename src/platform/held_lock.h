#pragma once

#include <QString>

namespace mirel {

// A lock file that is held for as long as its process lives: however that ends, the kernel gives it back at once.
class HeldLock {
public:
    HeldLock() = default;
    ~HeldLock() { Release(); }
    HeldLock(HeldLock&& other) noexcept;
    HeldLock& operator=(HeldLock&& other) noexcept;
    Q_DISABLE_COPY(HeldLock)

    // Does not wait. False while anybody holds it, or where the file cannot be made.
    [[nodiscard]] bool Take(const QString& path);
    void Release();
    // Releases it, and its file goes. Only for a name that is never used again.
    void ReleaseAndRemove();
    bool IsHeld() const { return file_ >= 0; }

private:
    int file_ = -1;
    QString path_;
};

} // namespace mirel
