#pragma once

#include <QByteArray>
#include <QString>
#include <QStringList>

namespace mirel {

// The favourites file: one line a database, its stamp, then a tab before each entry ("table:Birds"). In an entry
// "%", tabs and other control characters are written as "%09". Other databases' lines come back byte for byte.

// The entries of that database; none when it has no line.
QStringList FavoritesOf(const QByteArray& file, const QString& stamp);
// The file with these entries for that database; its line is gone when there are none.
QByteArray WithFavorites(const QByteArray& file, const QString& stamp, const QStringList& entries);

} // namespace mirel
