#include "support/test_database.h"

#include <QDateTime>
#include <QFile>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class CatalogTest : public TestDatabase {
protected:
    QString Stamp()
    {
        QString stamp;
        EXPECT_TRUE(catalog_.FindDatabaseStamp(path_, stamp));
        return stamp;
    }
    QStringList Tables()
    {
        QStringList tables;
        EXPECT_TRUE(catalog_.ListTables(path_, tables));
        return tables;
    }
};

TEST_F(CatalogTest, ListsTheUsersTablesAlone)
{
    for (const QString& table : {u"msysMine"_s, u"[Order Details]"_s, u"MirelSysNotes"_s,
                                 u"MirelSys2001102415301"_s, u"MirelSys20011024153012"_s, u"MSysProcs2"_s})
        Run(u"CREATE TABLE %1 (F Integer)"_s.arg(table));
    QStringList tables = Tables();
    tables.sort();
    EXPECT_EQ(tables, (QStringList{u"MSysProcs2"_s, u"MirelSys2001102415301"_s, u"MirelSysNotes"_s,
                                   u"Order Details"_s, u"msysMine"_s}));
}

TEST_F(CatalogTest, FindsTheOldestStampAndNoTableLikeIt)
{
    Run(u"CREATE TABLE MirelSysNotes (F Integer)"_s);
    Run(u"CREATE TABLE mirelsys19990101000000 (F Integer)"_s);
    EXPECT_EQ(Stamp(), QString());
    Run(u"CREATE TABLE MirelSys20000101000000 (SysParam Varchar(255))"_s);
    EXPECT_EQ(Stamp(), u"20000101000000"_s);
    EXPECT_TRUE(catalog_.BearsStamp(path_, u"20000101000000"_s));
    EXPECT_FALSE(catalog_.BearsStamp(folder_.filePath(u"nothing.cdb"_s), u"20000101000000"_s));
    EXPECT_EQ(prompt_.shown, QStringList());
}

TEST_F(CatalogTest, LetsNoStatementTouchTheStampTable)
{
    Run(u"CREATE TABLE MirelSys20000101000000 (SysParam Varchar(255))"_s);
    Run(u"CREATE TABLE Mine (F Integer)"_s);
    for (const QString& statement :
         {u"DROP TABLE mirelsys20000101000000"_s, u"ALTER TABLE MirelSys20000101000000 TO Other"_s,
          u"ALTER TABLE Mine TO MirelSys20010101000000"_s, u"ALTER TABLE MirelSys20000101000000 ADD G Bit"_s,
          u"CREATE INDEX i ON MirelSys20000101000000 (SysParam)"_s,
          u"CREATE TABLE MirelSys19990101000000 (SysParam Varchar(255))"_s,
          u"INSERT INTO MirelSys20000101000000 VALUES ('x')"_s, u"DELETE FROM MirelSys20000101000000"_s}) {
        EXPECT_FALSE(catalog_.ExecuteStatement(path_, statement));
        EXPECT_TRUE(prompt_.shown.last().startsWith(u"Error: (80070005) "_s))
            << prompt_.shown.last().toStdString();
    }
    DbRecordset rows(connection_);
    ASSERT_TRUE(rows.Open(u"MirelSys20000101000000"_s, path_, CursorType::Static, LockType::Optimistic));
    EXPECT_FALSE(rows.AddNew({}));
    EXPECT_EQ(Stamp(), u"20000101000000"_s);
}

TEST_F(CatalogTest, StampsWithAMomentThatNoSideFileBears)
{
    const QDateTime now = QDateTime::currentDateTime();
    constexpr int kTakenSeconds = 20;
    for (int i = 0; i < kTakenSeconds; ++i) {
        QFile taken(SideFilePath(folder_.path(), now.addSecs(i).toString(u"yyyyMMddHHmmss"_s)));
        ASSERT_TRUE(taken.open(QIODevice::WriteOnly));
    }
    QString stamp;
    ASSERT_TRUE(catalog_.EnsureSystemTable(path_, folder_.path(), stamp));
    EXPECT_EQ(stamp.size(), 14);
    EXPECT_FALSE(QFile::exists(SideFilePath(folder_.path(), stamp)));
    EXPECT_EQ(Stamp(), stamp);
    EXPECT_EQ(Tables(), QStringList());
}

TEST_F(CatalogTest, ListsFieldsInTheirOrder)
{
    Run(u"CREATE TABLE [Order Details] ([Unit Price] Float, Qty Integer)"_s);
    const QStringList wanted = {u"Unit Price"_s, u"Qty"_s};
    for (const QString& table : {u"Order Details"_s, u"[Order Details]"_s}) {
        QStringList fields = {u"old"_s};
        EXPECT_TRUE(catalog_.ListFields(table, path_, fields));
        EXPECT_EQ(fields, wanted) << table.toStdString();
    }
    QStringList fields = wanted;
    EXPECT_FALSE(catalog_.ListFields(u"Nobody"_s, path_, fields));
    EXPECT_EQ(fields, QStringList());
    EXPECT_EQ(prompt_.shown.size(), 1);
}

TEST_F(CatalogTest, FindsTheIndexOfAField)
{
    Run(u"CREATE TABLE [O'Brien] (Name Varchar(40), Town Varchar(40), Age Integer)"_s);
    Run(u"CREATE INDEX ByName ON [O'Brien] (Name DESC)"_s);
    Run(u"CREATE UNIQUE INDEX ByAge ON [O'Brien] (Age)"_s);
    const struct {
        QString table;
        QString field;
        QString index;
        int flags;
    } rows[] = {
        {u"O'Brien"_s, u"Name"_s, u"ByName"_s, 1}, {u"O'Brien"_s, u"Age"_s, u"ByAge"_s, 2},
        {u"O'Brien"_s, u"Town"_s, {}, 0},          {u"O'Brien"_s, u"No'body"_s, {}, 0},
        {u"Nobody"_s, u"Name"_s, {}, 0},
    };
    for (const auto& row : rows) {
        QString index = u"old"_s;
        int flags = 9;
        EXPECT_TRUE(catalog_.FindFieldIndex(row.table, row.field, path_, index, flags)) << row.field.toStdString();
        EXPECT_EQ(index, row.index) << row.field.toStdString();
        EXPECT_EQ(flags, row.flags) << row.field.toStdString();
    }
}

TEST_F(CatalogTest, ReportsWhatFails)
{
    QStringList tables = {u"old"_s};
    EXPECT_FALSE(catalog_.ListTables(folder_.filePath(u"nothing.cdb"_s), tables));
    EXPECT_EQ(tables, QStringList());
    EXPECT_FALSE(catalog_.ExecuteStatement(path_, u"DROP TABLE Nobody"_s));
    EXPECT_EQ(prompt_.shown.size(), 2);
    EXPECT_FALSE(QFile::exists(folder_.filePath(u"nothing.cdb"_s))) << "looking makes no file";
}

} // namespace
} // namespace mirel
