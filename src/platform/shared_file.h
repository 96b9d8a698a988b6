#pragma once

#include <QByteArray>
#include <QString>

#include <functional>
#include <optional>

namespace mirel {

// Whether both paths lead to the same existing file, links resolved.
bool IsSameFile(const QString& path, const QString& other);

// Small text files that several programs change: the profile, the favourites.

// Empty when the file is missing or cannot be read.
std::optional<QByteArray> ReadWholeFile(const QString& path);

// Changes such a file: locks it, reads it, lets `change` turn the old bytes (empty for a missing file) into the
// new ones, and replaces the file in one step. Missing folders are created. An unchanged file is not written.
// False, with the file unchanged, when it cannot be locked, read or written.
[[nodiscard]] bool ChangeFile(const QString& path, const std::function<QByteArray(const QByteArray& old)>& change);

} // namespace mirel
