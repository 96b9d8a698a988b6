#include "app/drafts.h"

#include "platform/shared_file.h"

#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QRandomGenerator>
#include <QSaveFile>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qint64 kMostBytes = 256LL << 20; // more is no file of ours
const QString kEnding = u".drafts"_s;
const QString kLockEnding = u".lock"_s;
const QString kDamagedEnding = u".damaged"_s;

bool IsSameDatabase(const QString& one, const QString& other)
{
    return one == other || IsSameFile(one, other);
}

} // namespace

bool Drafts::Write(const QString& path, const std::vector<Draft>& drafts)
{
    if (drafts.empty())
        return QFile::remove(path) || !QFileInfo::exists(path);
    const QByteArray bytes = DraftsFile(drafts);
    QSaveFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size() && file.commit();
}

// --- of this process ----------------------------------------------------------------------------------------

// Empty when it cannot be made. What is typed is nobody else's to read.
QString Drafts::NewFile()
{
    const QFileDevice::Permissions ownerOnly =
        QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner;
    if (!QFileInfo(folder_).isDir() && (!QDir().mkpath(folder_) || !QFile::setPermissions(folder_, ownerOnly)))
        return {};
    constexpr int kHex = 16;
    const QString name = u"%1/%2-%3"_s.arg(folder_, QString::number(QCoreApplication::applicationPid()),
                                           QString::number(QRandomGenerator::system()->generate64(), kHex));
    return lock_.Take(name + kLockEnding) ? name + kEnding : QString();
}

bool Drafts::Keep(const std::vector<Draft>& drafts)
{
    if (drafts == kept_)
        return true;
    if (file_.isEmpty())
        file_ = NewFile();
    if (file_.isEmpty() || !Write(file_, drafts))
        return false;
    kept_ = drafts;
    if (kept_.empty()) {
        lock_.ReleaseAndRemove();
        file_.clear();
    }
    return true;
}

// --- left behind --------------------------------------------------------------------------------------------

void Drafts::TakeLeft(const QString& database)
{
    GiveBack();
    damaged_.clear();
    const QDir folder(folder_);
    for (const QString& name : folder.entryList({u'*' + kEnding}, QDir::Files, QDir::Time | QDir::Reversed)) {
        if (folder.filePath(name) != file_)
            TakeFile(folder.filePath(name), database);
    }
    // A process that was killed between its lock and its first draft leaves that alone.
    for (const QString& name : folder.entryList({u'*' + kLockEnding}, QDir::Files)) {
        const QString lock = folder.filePath(name);
        HeldLock idle;
        if (!QFileInfo::exists(lock.chopped(kLockEnding.size()) + kEnding) && idle.Take(lock))
            idle.ReleaseAndRemove();
    }
    for (const LeftFile& file : leftFiles_) {
        std::ranges::copy_if(file.drafts, std::back_inserter(left_),
                             [&](const Draft& draft) { return IsSameDatabase(draft.database, database); });
    }
}

void Drafts::TakeFile(const QString& path, const QString& database)
{
    LeftFile file{path, {}, {}};
    if (!file.lock.Take(path.chopped(kEnding.size()) + kLockEnding) || QFileInfo(path).size() > kMostBytes)
        return; // its process lives, or another one has taken it over
    const std::optional<QByteArray> bytes = ReadWholeFile(path);
    if (!bytes)
        return;
    DraftsRead read = ReadDraftsFile(*bytes);
    if (read.outcome == DraftsRead::Outcome::Newer)
        return;
    if (read.outcome == DraftsRead::Outcome::Damaged) {
        const QString aside = path + kDamagedEnding;
        if (!QFile::copy(path, aside) || !Write(path, read.drafts))
            return;
        damaged_ += aside;
    }
    file.drafts = std::move(read.drafts);
    const bool concerns = std::ranges::any_of(
        file.drafts, [&](const Draft& draft) { return IsSameDatabase(draft.database, database); });
    if (concerns)
        leftFiles_.push_back(std::move(file));
    else if (file.drafts.empty())
        file.lock.ReleaseAndRemove();
}

bool Drafts::DropLeft(size_t index)
{
    const Draft dropped = left_[index];
    for (LeftFile& file : leftFiles_) {
        const auto found = std::ranges::find(file.drafts, dropped);
        if (found == file.drafts.end())
            continue;
        file.drafts.erase(found);
        if (!Write(file.path, file.drafts)) {
            file.drafts.push_back(dropped);
            return false;
        }
        if (file.drafts.empty())
            file.lock.ReleaseAndRemove();
        break;
    }
    left_.erase(left_.begin() + qsizetype(index));
    return true;
}

void Drafts::GiveBack()
{
    left_.clear();
    leftFiles_.clear();
}

} // namespace mirel
