#pragma once

#include <QString>

namespace mirel {

// The per-application profile: integers and texts by section and key, in one text file. A line that cannot be
// read gives the default; other programs' lines and hand edits survive. Not cached between programs: each write
// goes to the file at once. A read-only profile refuses every write.
class Profile {
public:
    enum class Access { ReadWrite, ReadOnly };

    explicit Profile(QString path, Access access = Access::ReadWrite);

    int ReadInt(const QString& section, const QString& key, int fallback) const;
    QString ReadText(const QString& section, const QString& key, const QString& fallback) const;
    bool WriteInt(const QString& section, const QString& key, int value);
    bool WriteText(const QString& section, const QString& key, const QString& value);

private:
    QString path_;
    Access access_;
};

} // namespace mirel
