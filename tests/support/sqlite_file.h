#pragma once

#include <QByteArray>
#include <QString>
#include <QStringList>

struct sqlite3;

namespace mirel {

// A database file as other programs open it: plain SQLite, nothing of ours. For making files from elsewhere, and
// for seeing what was really written.
class SqliteFile {
public:
    explicit SqliteFile(const QString& path); // makes the file when there is none
    ~SqliteFile();
    Q_DISABLE_COPY_MOVE(SqliteFile)

    void Run(const QByteArray& statements); // a failure fails the test
    QString Text(const QByteArray& query);  // the first column of the first row; empty for NULL and no row
    QStringList Column(const QByteArray& query);

private:
    sqlite3* handle_ = nullptr;
};

} // namespace mirel
