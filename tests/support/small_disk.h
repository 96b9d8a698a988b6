#pragma once

#include <QByteArray>

#include <sqlite3.h>

namespace mirel {

// As long as it lives, database files that are opened cannot grow beyond so many pages: a full disk, as the
// engine meets it.
class SmallDisk {
public:
    explicit SmallDisk(int pages)
    {
        limit_ = "PRAGMA max_page_count=" + QByteArray::number(pages);
        sqlite3_auto_extension(reinterpret_cast<void (*)()>(Limit));
    }
    ~SmallDisk() { sqlite3_cancel_auto_extension(reinterpret_cast<void (*)()>(Limit)); }
    Q_DISABLE_COPY_MOVE(SmallDisk)

private:
    static int Limit(sqlite3* handle, char**, const void*)
    {
        return sqlite3_exec(handle, limit_.constData(), nullptr, nullptr, nullptr);
    }

    static inline QByteArray limit_;
};

} // namespace mirel
