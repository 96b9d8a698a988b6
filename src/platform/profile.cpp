#include "platform/profile.h"

#include "platform/profile_text.h"
#include "platform/shared_file.h"

#include <utility>

namespace mirel {

Profile::Profile(QString path, Access access)
    : path_(std::move(path))
    , access_(access)
{
}

QString Profile::ReadText(const QString& section, const QString& key, const QString& fallback) const
{
    const ProfileText text(ReadWholeFile(path_).value_or(QByteArray()));
    return text.Find(section, key).value_or(fallback);
}

int Profile::ReadInt(const QString& section, const QString& key, int fallback) const
{
    bool ok = false;
    const int value = ReadText(section, key, {}).toInt(&ok);
    return ok ? value : fallback;
}

bool Profile::WriteText(const QString& section, const QString& key, const QString& value)
{
    if (access_ == Access::ReadOnly)
        return false;
    bool named = false;
    const bool written = ChangeFile(path_, [&](const QByteArray& old) {
        ProfileText text(old);
        named = text.Set(section, key, value);
        return named ? text.Bytes() : old;
    });
    return named && written;
}

bool Profile::WriteInt(const QString& section, const QString& key, int value)
{
    return WriteText(section, key, QString::number(value));
}

} // namespace mirel
