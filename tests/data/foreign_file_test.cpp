// Files that other programs made: opened as they are, read as well as they can be, never rewritten unasked.
#include "data/catalog.h"
#include "data/db_recordset.h"
#include "data/filter_condition.h"
#include "data/statement_text.h"
#include "platform/user_locale.h"
#include "support/printing.h"
#include "support/sqlite_file.h"

#include <gtest/gtest.h>

#include <QCryptographicHash>
#include <QFile>
#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class ForeignFile : public ::testing::Test {
protected:
    void Make(const QByteArray& statements) { SqliteFile(path_).Run(statements); }

    bool Open(DbRecordset& rows, const QString& source, LockType lock = LockType::Optimistic)
    {
        return rows.Open(source, path_, CursorType::Static, lock);
    }
    // All values of the result's first column, as the user's locale shows them.
    QStringList Column(const QString& source)
    {
        QStringList texts;
        DbRecordset rows(connection_);
        EXPECT_TRUE(Open(rows, source)) << source.toStdString() << rows.ErrorContext().toStdString();
        while (!rows.IsEof()) {
            texts += rows.ValueText(0);
            EXPECT_TRUE(rows.MoveNext());
        }
        return texts;
    }
    Hr ResultOf(const QString& source)
    {
        DbRecordset rows(connection_);
        return Open(rows, source) ? Hr::Ok : rows.LastResult();
    }
    QByteArray Fingerprint() const
    {
        QFile file(path_);
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        return QCryptographicHash::hash(file.readAll(), QCryptographicHash::Sha256);
    }

    QTemporaryDir folder_;
    QString path_ = folder_.filePath(u"elsewhere.db"_s);
    DbConnection connection_;
};

// One moment in the forms in which programs write it.
const QByteArray kDates = R"(
    CREATE TABLE events (id INTEGER PRIMARY KEY, form TEXT, at DATETIME);
    CREATE INDEX events_at ON events (at);
    CREATE VIEW late AS SELECT form FROM events WHERE id > 3;
    INSERT INTO events VALUES
        (1, 'blank', '2001-07-04 09:05:00'),
        (2, 'T', '2001-07-04T09:05:00'),
        (3, 'zone', '2001-07-04T11:05:00+02:00'),
        (4, 'Julian', 2452094.87847222),
        (5, 'Unix', 994237500),
        (6, 'later', '2001-07-05T00:00:00Z'),
        (7, 'none', NULL),
        (8, 'words', 'next Tuesday');
)";

TEST_F(ForeignFile, ShowsAndComparesDatesInEveryForm)
{
    Make(kDates);
    const QByteArray before = Fingerprint();
    const QString moment = u"7/4/2001 9:05:00 AM"_s;
    EXPECT_EQ(Column(u"SELECT at FROM events WHERE id <= 5"_s),
              QStringList({moment, moment, moment, moment, moment}));
    EXPECT_EQ(Column(u"SELECT form FROM events WHERE at = '2001-07-04 09:05:00'"_s),
              QStringList({u"blank"_s, u"T"_s, u"zone"_s, u"Julian"_s, u"Unix"_s}));
    EXPECT_EQ(Column(u"SELECT form FROM events WHERE at > '7/4/2001 9:05:00 AM'"_s), QStringList(u"later"_s));
    // What is no date in any form shows as none, and is found as none.
    EXPECT_EQ(Column(u"SELECT form FROM events WHERE at IS NULL"_s), QStringList({u"none"_s, u"words"_s}));
    EXPECT_EQ(Column(u"SELECT form FROM events ORDER BY at DESC, id"_s).value(0), u"later"_s);
    EXPECT_EQ(Fingerprint(), before);
}

TEST_F(ForeignFile, KeepsTheFormsOfTheDatesItIsNotAskedToChange)
{
    Make(kDates);
    const auto stored = [this] { return SqliteFile(path_).Column("SELECT quote(at) FROM events ORDER BY id"); };
    QStringList expected = stored();
    {
        DbRecordset rows(connection_);
        ASSERT_TRUE(Open(rows, u"SELECT * FROM events WHERE id = 4"_s));
        ASSERT_TRUE(rows.Update(rows.FieldIndex(u"form"), Value::Text(u"renamed"_s)));
    }
    EXPECT_EQ(stored(), expected);
    {
        DbRecordset rows(connection_);
        ASSERT_TRUE(Open(rows, u"SELECT * FROM events WHERE id = 5"_s));
        ASSERT_TRUE(rows.Update(rows.FieldIndex(u"at"), Value::Date(37076)));
    }
    expected[4] = u"'2001-07-04'"_s;
    EXPECT_EQ(stored(), expected);
}

TEST_F(ForeignFile, KeepsIndexesAndViewsOfItsOwnThroughAChangeOfStructure)
{
    Make(kDates);
    ASSERT_EQ(ResultOf(u"ALTER TABLE events MOVE at BEFORE form"_s), Hr::Ok);
    connection_.Provider()->CloseDatabase(path_);
    SqliteFile file(path_);
    EXPECT_EQ(file.Column("SELECT name FROM pragma_table_info('events')"),
              QStringList({u"id"_s, u"at"_s, u"form"_s}));
    EXPECT_EQ(file.Column("SELECT name FROM sqlite_schema WHERE type IN ('index', 'view') ORDER BY name"),
              QStringList({u"events_at"_s, u"late"_s}));
    EXPECT_EQ(file.Text("SELECT count(*) FROM late"), u"5"_s);
    EXPECT_EQ(file.Text("PRAGMA integrity_check"), u"ok"_s);
}

TEST_F(ForeignFile, CannotBeWrittenWhereARecordHasNoAddress)
{
    Make("CREATE TABLE keyed (k TEXT PRIMARY KEY, v TEXT) WITHOUT ROWID; INSERT INTO keyed VALUES ('a', 'b');"
         "CREATE TABLE taken (rowid TEXT, _rowid_ TEXT, oid TEXT); INSERT INTO taken VALUES ('1', '2', '3');"
         "CREATE TABLE hidden (rowid TEXT, v TEXT); INSERT INTO hidden VALUES ('x', 'y');"
         "CREATE VIEW seen AS SELECT * FROM keyed;");
    for (const QString& source : {u"SELECT * FROM keyed"_s, u"SELECT * FROM taken"_s, u"SELECT * FROM seen"_s}) {
        DbRecordset rows(connection_);
        ASSERT_TRUE(Open(rows, source)) << source.toStdString();
        EXPECT_EQ(rows.Lock(), LockType::ReadOnly) << source.toStdString();
        EXPECT_EQ(rows.RecordCount(), 1) << source.toStdString();
        EXPECT_FALSE(rows.Update(0, Value::Text(u"z"_s)));
        EXPECT_EQ(rows.LastResult(), Hr::ReadOnly);
    }
    DbRecordset rows(connection_);
    ASSERT_TRUE(Open(rows, u"SELECT * FROM hidden"_s)); // another alias of the row id is free
    EXPECT_TRUE(rows.Update(1, Value::Text(u"z"_s)));
    EXPECT_EQ(Column(u"SELECT v FROM hidden WHERE rowid = 'x'"_s), QStringList(u"z"_s));
}

TEST_F(ForeignFile, ReadsTypesByTheirNearestCode)
{
    Make(
        "CREATE TABLE t (a BIGINT, b REAL, c BOOLEAN, d NVARCHAR(30), e CLOB, f BLOB, g DECIMAL(10,2), h DATE, i);"
        "INSERT INTO t VALUES (9000000000, 1.5, 1, 'x', 'y', x'00FF', 2.50, '2001-07-04', 'free');");
    DbRecordset rows(connection_);
    ASSERT_TRUE(Open(rows, u"t"_s));
    const FieldType expected[] = {FieldType::Integer, FieldType::Double,     FieldType::YesNo,  FieldType::Text,
                                  FieldType::Memo,    FieldType::LongBinary, FieldType::Double, FieldType::Date};
    for (int i = 0; i < int(std::size(expected)); ++i)
        EXPECT_EQ(rows.TypeOfField(i), expected[i]) << rows.FieldName(i).toStdString();
    EXPECT_EQ(rows.FieldSize(3), 30);
    EXPECT_EQ(rows.ValueText(0), u"9000000000"_s); // shown whole though an Integer field has 32 bits
    EXPECT_EQ(rows.ValueText(8), u"free"_s);
}

TEST_F(ForeignFile, KeepsWholeNumbersToTheLastDigit)
{
    Make("CREATE TABLE t (Id BIGINT, n NUMERIC); INSERT INTO t VALUES (9007199254740993, 9007199254740995),"
         "(9007199254740992, 9007199254740994), (0, 0);");
    DbRecordset rows(connection_);
    ASSERT_TRUE(Open(rows, u"t"_s));
    for (int field : {0, 1}) {
        const Value value = rows.FieldValue(field);
        EXPECT_EQ(value.Tag(), ValueTag::Double);
        const QString condition = ConditionFromCell(CellFilter::BySelection, rows.FieldName(field),
                                                    rows.TypeOfField(field), value, VariantText(value), {});
        EXPECT_EQ(Column(u"SELECT Id FROM t WHERE "_s + condition), QStringList(u"9007199254740993"_s))
            << condition.toStdString();
    }
    EXPECT_EQ(rows.ValueText(1), u"9007199254740995"_s);
    EXPECT_EQ(Column(u"SELECT SUM(Id) FROM t"_s), QStringList(u"18014398509481985"_s));
    EXPECT_EQ(Column(u"SELECT n & '' FROM t WHERE Id = '9007199254740993'"_s), QStringList(u"9007199254740995"_s));

    ASSERT_TRUE(rows.Update(0, Value::Text(u"9223372036854775807"_s)));
    ASSERT_TRUE(rows.Update(1, rows.FieldValue(0)));
    EXPECT_EQ(ResultOf(u"UPDATE t SET Id = '9007199254740997' WHERE Id = 9007199254740992"_s), Hr::Ok);
    EXPECT_EQ(ResultOf(u"UPDATE t SET Id = 9223372036854775808 WHERE Id = 0"_s), Hr::Overflow);
    EXPECT_EQ(SqliteFile(path_).Column("SELECT Id || ' ' || n FROM t"),
              QStringList({u"9223372036854775807 9223372036854775807"_s, u"9007199254740997 9007199254740994"_s,
                           u"0 0"_s}));
}

TEST_F(ForeignFile, ShowsAReplacementForBytesThatAreNoText)
{
    Make("CREATE TABLE t (v TEXT); INSERT INTO t VALUES (CAST(x'41FF42' AS TEXT)), (CAST(x'C3A4' AS TEXT));");
    EXPECT_EQ(Column(u"t"_s), QStringList({u"A\uFFFDB"_s, u"ä"_s}));
    DbRecordset rows(connection_);
    ASSERT_TRUE(Open(rows, u"t"_s));
    QByteArray raw;
    EXPECT_TRUE(rows.Read({.fields = {}}, [&](std::span<const Cell> cells) {
        raw += QByteArrayView(cells[0].bytes.data(), qsizetype(cells[0].bytes.size()));
        return true;
    }));
    EXPECT_EQ(QString::fromUtf8(raw), u"A\uFFFDBä"_s);
    EXPECT_TRUE(raw.isValidUtf8()) << "cells pass on as they are to files";

    Hr result = Hr::Ok;
    QString context;
    const auto appender = connection_.Provider()->CreateAppender(path_, u"t"_s, {}, result, context);
    ASSERT_TRUE(appender) << context.toStdString();
    const Cell broken = Cell::OfText("A\xFF");
    EXPECT_EQ(appender->Append({&broken, 1}), Hr::BadLiteral);
}

TEST_F(ForeignFile, MayHaveNamesThatCannotBeMadeHere)
{
    Make("CREATE TABLE \"a]b\" (\"[x\" INTEGER, \"y]\" TEXT); INSERT INTO \"a]b\" VALUES (1, 'one'), (2, 'two');"
         "CREATE TABLE msystables (own TEXT); INSERT INTO msystables VALUES ('mine');");
    const QString table = FieldReference(u"a]b"_s);
    EXPECT_EQ(table, u"[a]]b]"_s);
    DbRecordset rows(connection_);
    ASSERT_TRUE(Open(rows, u"SELECT * FROM "_s + table)) << rows.ErrorContext().toStdString();
    EXPECT_EQ(Column(u"SELECT %1 FROM %2 WHERE %3 = 2"_s.arg(FieldReferenceIn(rows.Fields(), 1), table,
                                                             FieldReferenceIn(rows.Fields(), 0))),
              QStringList(u"two"_s));
    ASSERT_TRUE(rows.Update(1, Value::Text(u"uno"_s)));
    EXPECT_EQ(Column(u"SELECT [y]]] AS [z]]] FROM [a]]b] ORDER BY [z]]] DESC"_s),
              QStringList({u"uno"_s, u"two"_s}));
    for (const QString& made : {u"CREATE TABLE [c]]d] (a Integer)"_s, u"CREATE TABLE n ([[a] Integer)"_s,
                                u"ALTER TABLE [a]]b] RENAME [y]]] TO [z]]]"_s})
        EXPECT_EQ(ResultOf(made), Hr::SyntaxError) << made.toStdString();

    EXPECT_EQ(Column(u"SELECT own FROM msystables"_s), QStringList(u"mine"_s));
    EXPECT_EQ(Column(u"SELECT TableName FROM MSysTables WHERE TableName LIKE 'msystables'"_s),
              QStringList({u"MSysTables"_s, u"msystables"_s}));
}

TEST_F(ForeignFile, ThatIsNoDatabaseIsRefusedAndLeftAlone)
{
    const auto expectRefused = [this](const QByteArray& bytes) {
        QFile file(path_);
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(bytes);
        file.close();
        DbRecordset rows(connection_);
        EXPECT_FALSE(Open(rows, u"SELECT * FROM MSysTables"_s));
        EXPECT_TRUE(Failed(rows.LastResult()));
        EXPECT_TRUE(rows.ErrorContext().contains(path_)) << rows.ErrorContext().toStdString();
        connection_.Provider()->CloseDatabase(path_);
        ASSERT_TRUE(file.open(QIODevice::ReadOnly));
        EXPECT_EQ(file.readAll(), bytes);
    };
    expectRefused("a,b,c\n1,2,3\n");
    expectRefused(QByteArray("SQLite format 3\0", 16) + QByteArray(4080, '\x7f'));

    SqliteFile(folder_.filePath(u"whole.db"_s)).Run(kDates);
    QFile whole(folder_.filePath(u"whole.db"_s));
    ASSERT_TRUE(whole.open(QIODevice::ReadOnly));
    expectRefused(whole.read(1000)); // cut short inside the schema

    DbRecordset rows(connection_);
    EXPECT_FALSE(rows.Open(u"t"_s, folder_.path(), CursorType::Static, LockType::ReadOnly)); // a folder
    EXPECT_TRUE(Failed(rows.LastResult()));
    EXPECT_FALSE(rows.Open(u"t"_s, folder_.filePath(u"none.cdb"_s), CursorType::Static, LockType::ReadOnly));
    EXPECT_FALSE(QFile::exists(folder_.filePath(u"none.cdb"_s)));
}

} // namespace
} // namespace mirel
