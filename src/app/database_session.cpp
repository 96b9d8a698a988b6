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

// A file by its full path; an address stays as it is.
DatabaseLocation Full(const DatabaseLocation& location)
{
    return location.IsFile() ? DatabaseLocation(QDir::cleanPath(QFileInfo(location.FilePath()).absoluteFilePath()))
                             : location;
}

bool Exists(const DatabaseLocation& location)
{
    return location.IsAddress() || QFileInfo::exists(location.FilePath());
}

bool IsSame(const DatabaseLocation& a, const DatabaseLocation& b)
{
    return a == b || (a.IsFile() && b.IsFile() && Exists(a) &&
                      QFileInfo(a.FilePath()).canonicalFilePath() == QFileInfo(b.FilePath()).canonicalFilePath());
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

bool DatabaseSession::Open(const DatabaseLocation& location)
{
    if (location.IsEmpty() || IsCurrent(location))
        Close();
    if (location.IsEmpty())
        return true;
    std::optional<OpenedDatabase> opened = Prepare(location);
    if (!opened)
        return false;
    Adopt(std::move(*opened));
    return true;
}

std::optional<OpenedDatabase> DatabaseSession::Prepare(const DatabaseLocation& location)
{
    OpenedDatabase opened;
    opened.location = Full(location);
    opened.store = std::make_unique<FormStore>();
    if (!FindOrMakeStamp(opened.location, opened.stamp)) {
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
    if (!IsCurrent(opened.location))
        Close();
    location_ = std::move(opened.location);
    stamp_ = std::move(opened.stamp);
    sideFile_ = std::move(opened.sideFile);
    favorites_ = std::move(opened.favorites);
    store_ = std::move(opened.store);
    settings_.AddRecentDatabase(
        location_.Text()); // a profile that cannot be written costs the list of recent ones alone
}

void DatabaseSession::Dismiss(const OpenedDatabase& opened)
{
    if (!IsCurrent(opened.location) && connection_.Provider())
        connection_.Provider()->CloseDatabase(opened.location);
}

bool DatabaseSession::IsCurrent(const DatabaseLocation& location) const
{
    return IsOpen() && IsSame(Full(location), location_);
}

void DatabaseSession::TellRecordsChanged()
{
    for (SessionListener* listener : std::vector(listeners_))
        listener->RecordsChanged();
}

bool DatabaseSession::FindOrMakeStamp(const DatabaseLocation& location, QString& stamp)
{
    if (!catalog_.FindDatabaseStamp(location, stamp))
        return false;
    if (!stamp.isEmpty() || !catalog_.EnsureSystemTable(location, folder_.FormsFolder(), stamp))
        return true;
    // Another program may have had the same thought: both then go by the older stamp.
    return catalog_.FindDatabaseStamp(location, stamp);
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
        // A copy that was handed on brings its forms and queries along.
        if (const QByteArray carried = connection_.Provider()->Care().Belongings(opened.location);
            !carried.isEmpty())
            (void)opened.store->LoadFrom(carried);
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
    if (IsOpen() && connection_.Provider())
        connection_.Provider()->CloseDatabase(location_);
    location_ = {};
    stamp_.clear();
    sideFile_.clear();
    favorites_.clear();
    store_ = std::make_unique<FormStore>();
}

bool DatabaseSession::Create(const DatabaseLocation& location)
{
    const DatabaseLocation full = Full(location);
    return catalog_.ExecuteStatement({}, u"CREATE DATABASE "_s + QuoteText(full.Text())) && Open(full);
}

bool DatabaseSession::Drop(const DatabaseLocation& location)
{
    const DatabaseLocation full = Full(location);
    QString stamp;
    if (!catalog_.FindDatabaseStamp(full, stamp))
        return false;
    const DatabaseLocation current = location_;
    const bool isCurrent = IsCurrent(full);
    if (isCurrent)
        Close();
    if (connection_.Provider())
        connection_.Provider()->CloseDatabase(full);
    if (!catalog_.ExecuteStatement({}, u"DROP DATABASE "_s + QuoteText(full.Text()))) {
        if (isCurrent)
            Open(current);
        return false;
    }
    settings_.ForgetDatabase(full.Text());
    if (stamp.isEmpty() || HasKnownCopy(full, stamp))
        return true;
    QFile::remove(SideFilePath(folder_.FormsFolder(), stamp));
    // The database is gone; favourites that stay behind for a while name a stamp that nobody bears.
    (void)ChangeFile(folder_.FavoritesFile(),
                     [&](const QByteArray& old) { return WithFavorites(old, stamp, {}); });
    return true;
}

bool DatabaseSession::HasKnownCopy(const DatabaseLocation& location, const QString& stamp)
{
    const QStringList known = settings_.RecentDatabases();
    return std::ranges::any_of(known, [&](const QString& other) {
        if (DatabaseLocation(other) == location || !Exists(other))
            return false;
        const bool bears = catalog_.BearsStamp(other, stamp);
        if (DatabaseLocation(other) != location_)
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
