#pragma once

#include <QString>
#include <QStringList>

namespace mirel {

class Profile;

// The last statements that ran on a database, the latest first; each once. They are kept in the profile's section
// "Statements" under `key`, where another window's are found, too. The profile must outlive it.
class StatementHistory {
public:
    static constexpr qsizetype kMost = 20;
    static constexpr qsizetype kLongest = 4096; // characters; a longer one is not kept

    StatementHistory(Profile& profile, QString key)
        : profile_(profile)
        , key_(std::move(key))
    {
    }

    QStringList Statements() const;
    void Add(const QString& statement);

private:
    Profile& profile_;
    QString key_;
};

} // namespace mirel
