// Changing the structure of tables that hold records: nothing else about them may change.
#include "provider/database_fixture.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class StructureChange : public DatabaseFixture {
protected:
    StructureChange()
    {
        Run(u"CREATE TABLE T (A Integer,B Varchar(10),C DateTime)"_s);
        Run(u"CREATE INDEX byB ON T (B DESC)"_s);
        Run(u"CREATE INDEX byAB ON T (A,B)"_s);
        Outside("INSERT INTO T(rowid,A,B,C) VALUES (5,1,'one','2001-07-04'),(9,2,'two',NULL)");
    }

    QStringList Structure()
    {
        QStringList lines;
        const auto cursor = Open(u"T"_s);
        for (const ResultField& field : cursor->Fields())
            lines += u"%1 %2 %3"_s.arg(field.name).arg(int(field.type)).arg(field.size);
        for (const QString& index : Rows(u"SELECT IndexName,IndexFlags FROM MSysIndexes ORDER BY IndexName"_s))
            lines += u"index "_s + index;
        return lines;
    }
    QByteArray RowIds()
    {
        sqlite3* handle = nullptr;
        sqlite3_stmt* statement = nullptr;
        sqlite3_open(QFile::encodeName(path).constData(), &handle);
        sqlite3_prepare_v2(handle, "SELECT group_concat(id) FROM (SELECT rowid AS id FROM T ORDER BY rowid)", -1,
                           &statement, nullptr);
        sqlite3_step(statement);
        const QByteArray ids(reinterpret_cast<const char*>(sqlite3_column_text(statement, 0)));
        sqlite3_finalize(statement);
        sqlite3_close(handle);
        return ids;
    }
};

TEST_F(StructureChange, KeepsRecordsTypesAndIndexes)
{
    const struct {
        QString statement;
        QStringList structure;
        QString firstRow;
    } rows[] = {
        {u"ALTER TABLE T ADD D Smallint"_s,
         {u"A 3 4"_s, u"B 202 10"_s, u"C 7 8"_s, u"D 2 2"_s, u"index byAB|0"_s, u"index byAB|0"_s,
          u"index byB|1"_s},
         u"1|one|2001-07-04|~"_s},
        {u"ALTER TABLE T MOVE C BEFORE A"_s,
         {u"C 7 8"_s, u"A 3 4"_s, u"B 202 10"_s, u"D 2 2"_s, u"index byAB|0"_s, u"index byAB|0"_s,
          u"index byB|1"_s},
         u"2001-07-04|1|one|~"_s},
        {u"ALTER TABLE T MOVE C BEFORE D"_s,
         {u"A 3 4"_s, u"B 202 10"_s, u"C 7 8"_s, u"D 2 2"_s, u"index byAB|0"_s, u"index byAB|0"_s,
          u"index byB|1"_s},
         u"1|one|2001-07-04|~"_s},
        {u"ALTER TABLE T RENAME B TO [B 2]"_s,
         {u"A 3 4"_s, u"B 2 202 10"_s, u"C 7 8"_s, u"D 2 2"_s, u"index byAB|0"_s, u"index byAB|0"_s,
          u"index byB|1"_s},
         u"1|one|2001-07-04|~"_s},
        {u"ALTER TABLE T RENAME [B 2] TO b"_s,
         {u"A 3 4"_s, u"b 202 10"_s, u"C 7 8"_s, u"D 2 2"_s, u"index byAB|0"_s, u"index byAB|0"_s,
          u"index byB|1"_s},
         u"1|one|2001-07-04|~"_s},
        {u"ALTER TABLE T DROP A"_s,
         {u"b 202 10"_s, u"C 7 8"_s, u"D 2 2"_s, u"index byB|1"_s},
         u"one|2001-07-04|~"_s},
        {u"DROP INDEX [T].[byB]"_s, {u"b 202 10"_s, u"C 7 8"_s, u"D 2 2"_s}, u"one|2001-07-04|~"_s},
    };
    for (const auto& row : rows) {
        Run(row.statement);
        EXPECT_EQ(Structure(), row.structure) << row.statement.toStdString();
        EXPECT_EQ(Rows(u"T"_s).value(0), row.firstRow) << row.statement.toStdString();
        EXPECT_EQ(RowIds(), "5,9") << row.statement.toStdString();
    }
}

TEST_F(StructureChange, IndexNamesBelongToTheirTable)
{
    Run(u"CREATE TABLE U (A Integer)"_s);
    Run(u"CREATE INDEX byB ON U (A)"_s);
    EXPECT_EQ(Try(u"CREATE INDEX BYB ON T (A)"_s), Hr::IndexExists);
    Run(u"ALTER TABLE T to [New Name]"_s);
    Run(u"CREATE TABLE T (A Integer)"_s);
    Run(u"CREATE INDEX byB ON T (A)"_s);
    Run(u"DROP INDEX [New Name].[byB]"_s);
    EXPECT_EQ(Rows(u"SELECT IndexName FROM MSysIndexes ORDER BY IndexName"_s),
              (QStringList{u"byAB"_s, u"byAB"_s, u"byB"_s, u"byB"_s}));
    Run(u"ALTER TABLE [New Name] to [NEW NAME]"_s);
    EXPECT_EQ(Rows(u"SELECT TableName FROM MSysTables WHERE TableName LIKE 'new%'"_s), QStringList{u"NEW NAME"_s});
}

TEST_F(StructureChange, ThatFailsChangesNothing)
{
    Outside("CREATE TABLE P (k INTEGER PRIMARY KEY, v INTEGER); INSERT INTO P VALUES (1,1),(2,1);"
            "CREATE INDEX pv ON P(v)");
    const struct {
        QString statement;
        Hr expected;
    } rows[] = {
        {u"CREATE TABLE t (A Integer)"_s, Hr::TableExists},
        {u"CREATE TABLE V (A Integer,a Integer)"_s, Hr::DuplicateColumn},
        {u"CREATE UNIQUE INDEX u ON P (v)"_s, Hr::IntegrityViolation},
        {u"ALTER TABLE P DROP k"_s, Hr::SyntaxError},
        {u"ALTER TABLE T to [P]"_s, Hr::TableExists},
        {u"DROP TABLE Nobody"_s, Hr::NoSuchTable},
        {u"DROP TABLE MSysTables"_s, Hr::AccessDenied},
    };
    const QStringList before = Structure();
    for (const auto& row : rows)
        EXPECT_EQ(Try(row.statement), row.expected) << row.statement.toStdString() << context.toStdString();
    EXPECT_EQ(Structure(), before);
    EXPECT_EQ(Rows(u"P"_s), (QStringList{u"1|1"_s, u"2|1"_s}));
}

// A table that others made: what its statement says beside columns and types comes along.
TEST_F(StructureChange, MovingAColumnKeepsConstraintsDefaultsAndTriggers)
{
    Outside(R"(CREATE TABLE "odd (name" ( -- a comment, with a comma
                 id INTEGER PRIMARY KEY AUTOINCREMENT,
                 [a,b] TEXT DEFAULT 'x,y(' NOT NULL, /* , */
                 "total" REAL CHECK ("total" > 0),
                 twice REAL AS ("total"*2),
                 UNIQUE ([a,b], "total"));
               CREATE TABLE log (n);
               CREATE TRIGGER noted AFTER INSERT ON "odd (name" BEGIN INSERT INTO log VALUES (new.id); END;
               INSERT INTO "odd (name" ("total") VALUES (1.5);
               DELETE FROM "odd (name" WHERE id=1;
               INSERT INTO "odd (name" ("total") VALUES (2.5);
               CREATE VIEW over AS SELECT total FROM "odd (name")");
    Run(u"ALTER TABLE [odd (name] MOVE [total] BEFORE [id]"_s);
    EXPECT_EQ(Rows(u"[odd (name]"_s), QStringList{u"2.5|2|x,y(|5"_s});
    EXPECT_EQ(Rows(u"over"_s), QStringList{u"2.5"_s});
    EXPECT_EQ(Try(u"INSERT INTO [odd (name] (total) VALUES (-1)"_s), Hr::IntegrityViolation);
    EXPECT_EQ(Try(u"INSERT INTO [odd (name] (total) VALUES (2.5)"_s), Hr::IntegrityViolation);
    Run(u"DELETE FROM [odd (name]"_s);
    Run(u"INSERT INTO [odd (name] (total) VALUES (4)"_s);
    EXPECT_EQ(Rows(u"[odd (name]"_s), QStringList{u"4|3|x,y(|8"_s}) << "numbers given out once stay given out";
    EXPECT_EQ(Rows(u"log"_s), (QStringList{u"1"_s, u"2"_s, u"3"_s}));
}

} // namespace
} // namespace mirel
