#pragma once

#include "data/db_recordset.h"
#include "data/db_transaction.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"

#include <gtest/gtest.h>

#include <QTemporaryDir>

namespace mirel {

// A database with the table "People": Name (10 characters), Age, Born, Member and Note, and 25 records: "P1",
// aged 21, to "P25", aged 45. Every fifth has no age; members have an even number; P1's note is long.
class PeopleFixture : public ::testing::Test {
protected:
    static constexpr int kPeople = 25;

    PeopleFixture()
    {
        using namespace Qt::StringLiterals;
        Run(u"CREATE DATABASE '%1'"_s.arg(path), QString());
        Run(u"CREATE TABLE [People] ([Name] Varchar(10),[Age] Integer,[Born] DateTime,[Member] Bit,[Note] Text)"_s);
        DbTransaction whole(connection, path);
        EXPECT_TRUE(whole.Begin());
        for (int i = 1; i <= kPeople; ++i) {
            const QString age = i % 5 == 0 ? u"NULL"_s : QString::number(20 + i);
            const QString note = i == 1 ? longNote : u"note %1"_s.arg(i);
            Run(u"INSERT INTO People (Name,Age,Born,Member,Note) VALUES('P%1',%2,'2001-07-04',%3,'%4')"_s.arg(
                QString::number(i), age, i % 2 == 0 ? u"TRUE"_s : u"FALSE"_s, note));
        }
        EXPECT_TRUE(whole.Commit());
    }

    void Run(const QString& statement, const QString& database)
    {
        DbRecordset recordset(connection);
        EXPECT_TRUE(recordset.Open(statement, database, CursorType::ForwardOnly, LockType::ReadOnly))
            << statement.toStdString() << ": " << recordset.ErrorContext().toStdString();
    }
    void Run(const QString& statement) { Run(statement, path); }

    // What the store holds: the first field of the first record.
    QString Stored(const QString& statement)
    {
        DbRecordset recordset(connection);
        EXPECT_TRUE(recordset.Open(statement, path, CursorType::ForwardOnly, LockType::ReadOnly))
            << statement.toStdString();
        return recordset.ValueText(0);
    }

    QTemporaryDir folder;
    QString path = folder.filePath(QStringLiteral("people.cdb"));
    DbConnection connection;
    ScriptedPrompt prompt;
    const QString longNote = QStringLiteral("0123456789").repeated(6);
};

} // namespace mirel
