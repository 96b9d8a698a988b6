#include "support/sqlite_file.h"

#include <gtest/gtest.h>
#include <sqlite3.h>

namespace mirel {

SqliteFile::SqliteFile(const QString& path)
{
    EXPECT_EQ(sqlite3_open(path.toUtf8().constData(), &handle_), SQLITE_OK) << path.toStdString();
    sqlite3_busy_timeout(handle_, 5000);
}

SqliteFile::~SqliteFile()
{
    sqlite3_close(handle_);
}

void SqliteFile::Run(const QByteArray& statements)
{
    char* error = nullptr;
    EXPECT_EQ(sqlite3_exec(handle_, statements.constData(), nullptr, nullptr, &error), SQLITE_OK)
        << statements.toStdString() << ": " << (error ? error : "");
    sqlite3_free(error);
}

QString SqliteFile::Text(const QByteArray& query)
{
    return Column(query).value(0);
}

QStringList SqliteFile::Column(const QByteArray& query)
{
    QStringList texts;
    const auto take = [](void* list, int columns, char** values, char**) {
        if (columns > 0)
            *static_cast<QStringList*>(list) += QString::fromUtf8(values[0]);
        return 0;
    };
    char* error = nullptr;
    EXPECT_EQ(sqlite3_exec(handle_, query.constData(), take, &texts, &error), SQLITE_OK)
        << query.toStdString() << ": " << (error ? error : "");
    sqlite3_free(error);
    return texts;
}

} // namespace mirel
