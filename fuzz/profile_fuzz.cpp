// Whatever the file holds: a value that is set reads back, and no other key changes with it.
#include "platform/profile_text.h"

#include <cstdint>

using mirel::ProfileText;

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const QByteArray bytes(reinterpret_cast<const char*>(data), qsizetype(size));
    const QString section = QStringLiteral("Config");
    const QString key = QStringLiteral("ActiveDB");
    const QString otherKey = QStringLiteral("ActiveTable");
    const QString value = QString::fromUtf8(bytes.left(40));

    const ProfileText before(bytes);
    ProfileText changed(bytes);
    if (!changed.Set(section, key, value))
        __builtin_trap();
    const ProfileText again(changed.Bytes());
    if (again.Find(section, key) != value || again.Find(section, otherKey) != before.Find(section, otherKey))
        __builtin_trap();
    return 0;
}
