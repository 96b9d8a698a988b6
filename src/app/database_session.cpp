#include "app/database_session.h"

#include "app/favorites.h"
#include "platform/shared_file.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <algorithm>
#include <utility>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

QString FullPath(const QString& path)
{
    return path.isEmpty() ? path : QDir::cleanPath(QFileInfo(path).absoluteFilePath());
}

bool SameFile(const QString& a, const QString& b)
{
    return a == b ||
           (QFileInfo::exists(a) && QFileInfo(a).canonicalFilePath() == QFileInfo(b).canonicalFilePath());
}

} // namespace

DatabaseSession::DatabaseSession(DbConnection& connection, ProgramFolder folder, UserPrompt& prompt)
    : connection_(connection)
    , folder_(std::move(folder))
    , settings_(folder_.OpenProfile())
    , prompt_(prompt)
    , catalog_(connection, prompt)
    , store_(std::make_unique<FormStore>())
{
}

DatabaseSession::~DatabaseSession()
{
    Close();
}

bool DatabaseSession::Open(const QString& path)
{
    if (path.isEmpty() || IsCurrent(path))
        Close();
    if (path.isEmpty())
        return true;
    std::optional<OpenedDatabase> opened = Prepare(path);
    if (!opened)
        return false;
    Adopt(std::move(*opened));
    return true;
}

std::optional<OpenedDatabase> DatabaseSession::Prepare(const QString& path)
{
    OpenedDatabase opened;
    opened.path = FullPath(path);
    opened.store = std::make_unique<FormStore>();
    if (!FindOrMakeStamp(opened.path, opened.stamp)) {
        Dismiss(opened);
        return std::nullopt;
    }
    LoadStore(opened);
    if (!opened.stamp.isEmpty()) {
        const QByteArray file = ReadWholeFile(folder_.FavoritesFile()).value_or(QByteArray());
        opened.favorites = FavoritesOf(file, opened.stamp);
    }
    return opened;
}

void DatabaseSession::Adopt(OpenedDatabase opened)
{
    if (!IsCurrent(opened.path))
        Close();
    path_ = std::move(opened.path);
    stamp_ = std::move(opened.stamp);
    sideFile_ = std::move(opened.sideFile);
    favorites_ = std::move(opened.favorites);
    store_ = std::move(opened.store);
    settings_.AddRecentDatabase(path_); // a profile that cannot be written costs the list of recent ones alone
}

void DatabaseSession::Dismiss(const OpenedDatabase& opened)
{
    if (!IsCurrent(opened.path) && connection_.Provider())
        connection_.Provider()->CloseDatabase(opened.path);
}

bool DatabaseSession::IsCurrent(const QString& path) const
{
    return IsOpen() && SameFile(FullPath(path), path_);
}

void DatabaseSession::TellRecordsChanged()
{
    for (SessionListener* listener : std::vector(listeners_))
        listener->RecordsChanged();
}

bool DatabaseSession::FindOrMakeStamp(const QString& path, QString& stamp)
{
    if (!catalog_.FindDatabaseStamp(path, stamp))
        return false;
    if (!stamp.isEmpty() || !catalog_.EnsureSystemTable(path, folder_.FormsFolder(), stamp))
        return true;
    // Another program may have had the same thought: both then go by the older stamp.
    return catalog_.FindDatabaseStamp(path, stamp);
}

void DatabaseSession::LoadStore(OpenedDatabase& opened)
{
    if (opened.stamp.isEmpty())
        return;
    QDir().mkpath(folder_.FormsFolder());
    opened.sideFile = SideFilePath(folder_.FormsFolder(), opened.stamp);
    opened.store = std::make_unique<FormStore>(opened.sideFile);
    if (opened.store->Load())
        return;
    if (!QFileInfo::exists(opened.sideFile)) {
        if (!opened.store->Save())
            prompt_.ShowError(opened.store->LastError());
        return;
    }
    // It is there and cannot be read now: an empty store in its place would cost the user's forms.
    prompt_.ShowError(opened.store->LastError());
    opened.store = std::make_unique<FormStore>();
}

void DatabaseSession::Close()
{
    if (!path_.isEmpty() && connection_.Provider())
        connection_.Provider()->CloseDatabase(path_);
    path_.clear();
    stamp_.clear();
    sideFile_.clear();
    favorites_.clear();
    store_ = std::make_unique<FormStore>();
}

bool DatabaseSession::Create(const QString& path)
{
    const QString full = FullPath(path);
    return catalog_.ExecuteStatement({}, u"CREATE DATABASE "_s + QuoteText(full)) && Open(full);
}

bool DatabaseSession::Drop(const QString& path)
{
    const QString full = FullPath(path);
    QString stamp;
    if (!catalog_.FindDatabaseStamp(full, stamp))
        return false;
    const QString current = path_;
    const bool isCurrent = IsCurrent(full);
    if (isCurrent)
        Close();
    if (connection_.Provider())
        connection_.Provider()->CloseDatabase(full);
    if (!catalog_.ExecuteStatement({}, u"DROP DATABASE "_s + QuoteText(full))) {
        if (isCurrent)
            Open(current);
        return false;
    }
    settings_.ForgetDatabase(full);
    if (stamp.isEmpty() || HasKnownCopy(full, stamp))
        return true;
    QFile::remove(SideFilePath(folder_.FormsFolder(), stamp));
    // The database is gone; favourites that stay behind for a while name a stamp that nobody bears.
    (void)ChangeFile(folder_.FavoritesFile(),
                     [&](const QByteArray& old) { return WithFavorites(old, stamp, {}); });
    return true;
}

bool DatabaseSession::HasKnownCopy(const QString& path, const QString& stamp)
{
    const QStringList known = settings_.RecentDatabases();
    return std::ranges::any_of(known, [&](const QString& other) {
        if (other == path || !QFileInfo::exists(other))
            return false;
        const bool bears = catalog_.BearsStamp(other, stamp);
        if (other != path_)
            connection_.Provider()->CloseDatabase(other);
        return bears;
    });
}

bool DatabaseSession::SetFavorites(const QStringList& favorites)
{
    const bool written = !stamp_.isEmpty() && ChangeFile(folder_.FavoritesFile(), [&](const QByteArray& old) {
        return WithFavorites(old, stamp_, favorites);
    });
    if (written)
        favorites_ = favorites;
    return written;
}

} // namespace mirel
