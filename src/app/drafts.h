#pragma once

#include "app/draft.h"
#include "platform/held_lock.h"

#include <QString>
#include <QStringList>

#include <optional>
#include <vector>

namespace mirel {

// The drafts beside the profile: those of this process, in a file of its own, and those that processes before it
// left behind because they were killed.
//
// Each file has a lock that its process holds: what a living process keeps is its own and never left behind.
class Drafts {
public:
    explicit Drafts(QString folder) // is made when there is something to keep
        : folder_(std::move(folder))
    {
    }
    Q_DISABLE_COPY_MOVE(Drafts)

    // From here on these, and no others, are what this process keeps; none at all takes its file away. False when
    // they cannot be written; those before are then still there, and FaultyPath() says where.
    bool Keep(const std::vector<Draft>& drafts);
    QString FaultyPath() const { return file_.isEmpty() ? folder_ : file_; }

    // Takes over what was left behind of the database with that path: no other process is offered it, until
    // GiveBack or the end of this one.
    void TakeLeft(const QString& database);
    const std::vector<Draft>& Left() const { return left_; }
    // It was put back, or given up. False when that cannot be written: it will be offered again.
    bool DropLeft(size_t index);
    void GiveBack();
    // Files that could not be read when what was left behind was taken, by their new names.
    const QStringList& Damaged() const { return damaged_; }

private:
    struct LeftFile {
        QString path;
        HeldLock lock;
        std::vector<Draft> drafts; // all of it, of other databases too
    };

    QString NewFile();
    void TakeFile(const QString& path, const QString& database);
    static bool Write(const QString& path, const std::vector<Draft>& drafts);

    QString folder_;
    QString file_; // of this process; empty: none yet
    HeldLock lock_;
    std::vector<Draft> kept_;
    std::vector<LeftFile> leftFiles_;
    std::vector<Draft> left_;
    QStringList damaged_;
};

} // namespace mirel
