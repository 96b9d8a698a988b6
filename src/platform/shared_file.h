#pragma once

#include <QByteArray>
#include <QString>

#include <functional>
#include <optional>

namespace mirel {

// Whether both paths lead to one file that is there, whatever links are on the way.
bool IsSameFile(const QString& path, const QString& other);

// Small text files that several programs change: the profile, the favourites.

// Empty when the file is missing or cannot be read.
std::optional<QByteArray> ReadWholeFile(const QString& path);

// One change of such a file: locks it, reads it, lets `change` make the new bytes of the old (empty for a missing
// file), and puts them in its place in one step. Folders on the way are made. An unchanged file is not written.
// False, and the file as it was, when it cannot be locked, read or written.
[[nodiscard]] bool ChangeFile(const QString& path, const std::function<QByteArray(const QByteArray& old)>& change);

} // namespace mirel
