#include "forms/form_store.h"

#include "forms/store_bytes.h"
#include "resources/string_table.h"

#include <QFile>
#include <QLockFile>
#include <QSaveFile>

#include <algorithm>
#include <utility>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kLockTimeoutMs = 3000;

quint32 LocalSeconds(const QDateTime& local)
{
    const QDateTime asUtc(local.date(), local.time(), Qt::UTC);
    return quint32((asUtc.toMSecsSinceEpoch() + 500) / 1000);
}

template <typename Records>
auto* FindByName(Records& records, QStringView name)
{
    const auto at = std::ranges::find_if(records, [name](const auto& record) { return record.name == name; });
    return at == records.end() ? nullptr : &*at;
}

template <typename Records>
bool RemoveByName(Records& records, QStringView name)
{
    return std::erase_if(records, [name](const auto& record) { return record.name == name; }) > 0;
}

} // namespace

FormStore::FormStore(QString path, Clock clock)
    : path_(std::move(path))
    , clock_(std::move(clock))
{
}

bool FormStore::Load()
{
    QFile file(path_);
    if (!file.open(QIODevice::ReadOnly)) {
        lastError_ = StringText(Str::StoreNotReadable, {path_});
        return false;
    }
    onDisk_ = file.readAll();
    LoadFrom(onDisk_);
    lastError_.clear();
    return true;
}

bool FormStore::Save()
{
    if (path_.isEmpty()) {
        lastError_ = StringText(Str::StoreNotWritable, {path_});
        return false;
    }
    Content stamped = content_;
    const quint32 now = LocalSeconds(clock_());
    if (stamped.initialised == 0) {
        stamped.initialised = 1;
        stamped.reserved[0] = stamped.reserved[1] = 0;
        stamped.created = now;
    }
    stamped.saved = now;
    const QByteArray bytes = WriteStore(stamped);
    QSaveFile file(path_);
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size() || !file.commit()) {
        lastError_ = StringText(Str::StoreNotWritable, {path_});
        return false;
    }
    content_ = std::move(stamped);
    onDisk_ = bytes;
    lastError_.clear();
    return true;
}

bool FormStore::Apply(const std::function<bool(FormStore&)>& change)
{
    QLockFile lock(path_ + u".lock"_s);
    if (path_.isEmpty() || !lock.tryLock(kLockTimeoutMs)) {
        const bool busy = lock.error() == QLockFile::LockFailedError;
        lastError_ = StringText(busy ? Str::StoreIsLocked : Str::StoreNotWritable, {path_});
        return false;
    }
    QFile file(path_);
    if (file.open(QIODevice::ReadOnly)) {
        QByteArray bytes = file.readAll();
        if (bytes != onDisk_) {
            LoadFrom(bytes);
            onDisk_ = std::move(bytes);
        }
    }
    const Content before = content_;
    lastError_.clear();
    if (change(*this) && Save())
        return true;
    content_ = before;
    return false;
}

bool FormStore::LoadFrom(QByteArrayView bytes)
{
    return ReadStore(bytes, content_);
}

QByteArray FormStore::ToBytes() const
{
    return WriteStore(content_);
}

FormDef* FormStore::FindForm(QStringView name)
{
    return FindByName(content_.forms, name);
}

const FormDef* FormStore::FindForm(QStringView name) const
{
    return FindByName(content_.forms, name);
}

QueryDef* FormStore::FindQuery(QStringView name)
{
    return FindByName(content_.queries, name);
}

const QueryDef* FormStore::FindQuery(QStringView name) const
{
    return FindByName(content_.queries, name);
}

bool FormStore::RemoveForm(QStringView name)
{
    return RemoveByName(content_.forms, name);
}

bool FormStore::RemoveQuery(QStringView name)
{
    return RemoveByName(content_.queries, name);
}

} // namespace mirel
