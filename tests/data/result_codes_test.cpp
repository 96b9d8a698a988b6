// Every result code that a database can raise, raised by one, with the words that people then read.
#include "data/provider_error.h"
#include "resources/string_table.h"
#include "support/small_disk.h"
#include "support/sqlite_file.h"
#include "support/test_database.h"

#include <QFile>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class ResultCodes : public TestDatabase {
protected:
    ResultCodes()
    {
        Run(u"CREATE TABLE People (Id Integer,Name Varchar(5),Small Smallint,Born DateTime,Photo Long Varbinary)"_s);
        Run(u"CREATE UNIQUE INDEX byId ON People (Id)"_s);
        Run(u"INSERT INTO People (Id,Name) VALUES (1,'Ann')"_s);
        Run(u"CREATE TABLE Towns (Id Integer,Town Text)"_s);
        Run(u"INSERT INTO Towns (Id,Town) VALUES (1,'Ulm')"_s);
    }

    void ExpectShown(const QString& code, Str message, const QString& context, const QString& what)
    {
        ASSERT_EQ(prompt_.shown.size(), 1) << what.toStdString();
        const QString shown = prompt_.shown.takeFirst();
        const QString head = shown.section(u"\r\n"_s, 0, 0);
        EXPECT_EQ(head.left(head.indexOf(u')') + 1), u"Error: (%1)"_s.arg(code)) << what.toStdString();
        EXPECT_EQ(shown.section(u"\r\n"_s, 1), StringText(message)) << what.toStdString();
        if (context.isEmpty()) {
            EXPECT_TRUE(head.endsWith(u')')) << shown.toStdString();
        } else {
            EXPECT_TRUE(head.contains(context)) << shown.toStdString();
        }
    }
    void ExpectFailure(const QString& file, const QString& statement, const QString& code, Str message,
                       const QString& context = {})
    {
        EXPECT_FALSE(catalog_.ExecuteStatement(file, statement)) << statement.toStdString();
        ExpectShown(code, message, context, statement);
    }
    QByteArray Bytes() const
    {
        QFile file(path_);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }
};

TEST_F(ResultCodes, OfStatementsNameTheirReason)
{
    QStringList many;
    for (int i = 0; i <= 2000; ++i)
        many += u"c%1 Bit"_s.arg(i);
    const struct {
        QString statement;
        QString code;
        Str message;
        QString context = {};
    } rows[] = {
        {u"UPDATE People SET Id='abc'"_s, u"80040E07"_s, Str::ErrorBadLiteral},
        {u"SELECT * FROM People WHERE Born='2001-02-30'"_s, u"80040E07"_s, Str::ErrorBadLiteral},
        {u"UPDATE People SET Name='sixsix'"_s, u"80040E57"_s, Str::ErrorOverflow},
        {u"UPDATE People SET Small=Id+40000"_s, u"80040E57"_s, Str::ErrorOverflow},
        {u"SELECT * FROM Nobody"_s, u"80040E37"_s, Str::ErrorNoSuchTable},
        {u"ALTER TABLE People DROP Nothing"_s, u"80040E11"_s, Str::ErrorNoSuchColumn},
        {u"ALTER TABLE People to TOWNS"_s, u"80040E3F"_s, Str::ErrorTableExists},
        {u"CREATE INDEX BYID ON People (Name)"_s, u"80040E34"_s, Str::ErrorIndexExists},
        {u"DROP INDEX [Towns].[byId]"_s, u"80040E35"_s, Str::ErrorNoSuchIndex},
        {u"CREATE TABLE V (A Integer,a Text)"_s, u"80040E3E"_s, Str::ErrorDuplicateColumn},
        {u"SELECT * FROM People WHERE Photo='x'"_s, u"80040E41"_s, Str::ErrorBadComparison},
        {u"CREATE TABLE W (%1)"_s.arg(many.join(u',')), u"80040E42"_s, Str::ErrorTooManyColumns},
        {u"DROP TABLE MSysTables"_s, u"80070005"_s, Str::ErrorAccessDenied, u"MSysTables"_s},
        {u"SELECT * FORM People"_s, u"80040E14"_s, Str::ErrorInCommand, u"character 10, near \"FORM\""_s},
        {u"ALTER TABLE People RENAME Name TO \"a]b\""_s, u"80040E14"_s, Str::ErrorInCommand, u"a]b"_s},
        {u"INSERT INTO People (Id) VALUES (1)"_s, u"80040E2F"_s, Str::ErrorInCommand, u"People.Id"_s},
    };
    const QByteArray before = Bytes();
    for (const auto& row : rows)
        ExpectFailure(path_, row.statement, row.code, row.message, row.context);
    EXPECT_EQ(Bytes(), before) << "a statement that fails writes nothing";
}

TEST_F(ResultCodes, OfFilesNamePathAndReason)
{
    const QString text = folder_.filePath(u"letter.cdb"_s);
    QFile letter(text);
    ASSERT_TRUE(letter.open(QIODevice::WriteOnly));
    letter.write("Dear Ann,");
    letter.close();
    const QString select = u"SELECT * FROM People"_s;
    ExpectFailure(folder_.filePath(u"none.cdb"_s), select, u"80040E4D"_s, Str::ErrorInCommand, u"none.cdb"_s);
    ExpectFailure(folder_.path(), select, u"80040E4D"_s, Str::ErrorInCommand, folder_.path());
    ExpectFailure(text, select, u"80040E73"_s, Str::ErrorInCommand, text);

    SqliteFile other(path_);
    other.Run("BEGIN IMMEDIATE");
    ExpectFailure(path_, u"DELETE FROM Towns"_s, u"80070005"_s, Str::ErrorAccessDenied, u"in use"_s);
    other.Run("ROLLBACK");

    connection_.Provider()->CloseDatabase(path_);
    ASSERT_TRUE(QFile::setPermissions(path_, QFile::ReadOwner));
    ExpectFailure(path_, u"DELETE FROM Towns"_s, u"80070005"_s, Str::ErrorAccessDenied, u"read-only"_s);
}

TEST_F(ResultCodes, OfAFullDiskLeaveTheFileAsItWas)
{
    SqliteFile(path_).Run("WITH RECURSIVE s(n) AS (SELECT 2 UNION ALL SELECT n+1 FROM s WHERE n<5000) "
                          "INSERT INTO Towns SELECT n,'a town by the name of '||n FROM s");
    const int pages = SqliteFile(path_).Text("PRAGMA page_count").toInt();
    connection_.Provider()->CloseDatabase(path_);
    const QByteArray before = Bytes();
    const SmallDisk disk(pages + 2);
    for (const QString& statement :
         {u"ALTER TABLE Towns MOVE Town BEFORE Id"_s, u"CREATE INDEX byTown ON Towns (Town)"_s,
          u"UPDATE Towns SET Town='another town by the name of something that is longer'"_s})
        ExpectFailure(path_, statement, u"80040E65"_s, Str::ErrorInCommand, path_);
    EXPECT_EQ(Bytes(), before);
    Run(u"UPDATE Towns SET Town='Ulm'"_s); // what fits goes on working
}

TEST_F(ResultCodes, OfResultsTellWhyTheyCannotBeChanged)
{
    const struct {
        const char* what;
        QString source;
        qint64 record;
        QString code;
        Str message;
        QString reason;
    } rows[] = {
        {"columns of two tables",
         u"SELECT People.Name,Towns.Town FROM People INNER JOIN Towns ON People.Id=Towns.Id"_s, 0, u"800A0CB3"_s,
         Str::ErrorReadOnlyJoin, StringText(Str::JoinIsReadOnly)},
        {"no keys", u"SELECT DISTINCT Name FROM People"_s, 0, u"800A0CB3"_s, Str::ErrorInCommand,
         StringText(Str::DistinctIsReadOnly)},
        {"behind the last record", u"SELECT Name FROM People"_s, 1, u"800A0BCD"_s, Str::ErrorInCommand, {}},
    };
    for (const auto& row : rows) {
        DbRecordset recordset(connection_);
        ASSERT_TRUE(Open(recordset, row.source)) << row.what;
        ASSERT_TRUE(recordset.MoveTo(row.record)) << row.what;
        EXPECT_FALSE(recordset.Update(0, Value::Text(u"Bob"_s))) << row.what;
        ReportProviderError(prompt_, &recordset, recordset.LastResult());
        ExpectShown(row.code, row.message, row.reason, QString::fromLatin1(row.what));
    }
}

} // namespace
} // namespace mirel
