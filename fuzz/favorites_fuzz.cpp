// Whatever the file holds: entries that are set read back, and other databases keep theirs.
#include "app/favorites.h"

#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const QByteArray file(reinterpret_cast<const char*>(data), qsizetype(size));
    const QString own = QStringLiteral("20011024153012");
    const QString other = QStringLiteral("20020101000000");
    const QStringList entries = mirel::FavoritesOf(file, own) + QStringList{QStringLiteral("table:a\tb%\n")};

    const QByteArray changed = mirel::WithFavorites(file, own, entries);
    if (mirel::FavoritesOf(changed, own) != entries ||
        mirel::FavoritesOf(changed, other) != mirel::FavoritesOf(file, other))
        __builtin_trap();
    if (!mirel::FavoritesOf(mirel::WithFavorites(changed, own, {}), own).isEmpty())
        __builtin_trap();
    return 0;
}
