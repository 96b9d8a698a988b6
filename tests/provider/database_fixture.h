#pragma once

#include "provider/provider.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QStringList>
#include <QTemporaryDir>

#include <sqlite3.h>

#include <memory>

namespace mirel {

// A new database in a folder of its own, and verbs over it.
class DatabaseFixture : public ::testing::Test {
protected:
    DatabaseFixture() { Run(QStringLiteral("CREATE DATABASE '%1'").arg(path), {}); }

    std::unique_ptr<ProviderRecordset> Open(const QString& source, CursorType cursor = CursorType::Static,
                                            LockType lock = LockType::Optimistic)
    {
        auto recordset = provider->CreateRecordset();
        const Hr hr = recordset->Open(source, path, cursor, lock);
        EXPECT_EQ(hr, Hr::Ok) << source.toStdString() << ": " << recordset->ErrorContext().toStdString();
        return recordset;
    }
    // What a statement ends with.
    Hr Try(const QString& statement, const QString& database)
    {
        auto recordset = provider->CreateRecordset();
        const Hr hr = recordset->Open(statement, database, CursorType::ForwardOnly, LockType::ReadOnly);
        context = recordset->ErrorContext();
        return hr;
    }
    Hr Try(const QString& statement) { return Try(statement, path); }
    void Run(const QString& statement, const QString& database)
    {
        EXPECT_EQ(Try(statement, database), Hr::Ok) << statement.toStdString() << ": " << context.toStdString();
    }
    void Run(const QString& statement) { Run(statement, path); }

    // The records that Read hands over, fields by "|", NULL as "~".
    static QStringList Read(ProviderRecordset& recordset, const ReadRange& range = {})
    {
        QStringList rows;
        EXPECT_EQ(recordset.Read(range,
                                 [&rows](std::span<const Cell> cells) {
                                     rows += RowText(cells);
                                     return true;
                                 }),
                  Hr::Ok)
            << recordset.ErrorContext().toStdString();
        return rows;
    }
    QStringList Rows(const QString& source, CursorType cursor = CursorType::ForwardOnly)
    {
        return Read(*Open(source, cursor, LockType::ReadOnly));
    }

    static QString RowText(std::span<const Cell> cells)
    {
        QStringList texts;
        for (const Cell& cell : cells)
            texts += CellText(cell);
        return texts.join(u'|');
    }
    static QString CellText(const Cell& cell)
    {
        switch (cell.kind) {
        case Cell::Kind::Null:
            return QStringLiteral("~");
        case Cell::Kind::Integer:
            return QString::number(cell.integer);
        case Cell::Kind::Real:
            return QString::number(cell.real);
        case Cell::Kind::Text:
            return QString::fromUtf8(cell.bytes.data(), qsizetype(cell.bytes.size()));
        case Cell::Kind::Binary:
            return QString::fromLatin1(QByteArray(cell.bytes.data(), qsizetype(cell.bytes.size())).toHex());
        }
        return {};
    }
    static Value FieldOf(ProviderRecordset& recordset, int field = 0)
    {
        Value value;
        EXPECT_EQ(recordset.GetValue(field, value), Hr::Ok) << recordset.ErrorContext().toStdString();
        return value;
    }

    // What another program does to the file.
    static void Outside(const QString& file, const QByteArray& sql)
    {
        sqlite3* handle = nullptr;
        char* error = nullptr;
        ASSERT_EQ(sqlite3_open(QFile::encodeName(file).constData(), &handle), SQLITE_OK);
        EXPECT_EQ(sqlite3_exec(handle, sql.constData(), nullptr, nullptr, &error), SQLITE_OK)
            << (error ? error : "");
        sqlite3_free(error);
        sqlite3_close(handle);
    }
    void Outside(const QByteArray& sql) { Outside(path, sql); }

    void Write(const QString& name, const QByteArray& bytes)
    {
        QFile file(PathOf(name));
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(bytes);
    }
    QString PathOf(const QString& name) const { return folder.filePath(name); }

    QTemporaryDir folder;
    QString path = folder.filePath(QStringLiteral("test.cdb"));
    std::unique_ptr<ProviderConnection> provider = CreateProvider(u"cedb");
    QString context; // of the last Try
};

} // namespace mirel
