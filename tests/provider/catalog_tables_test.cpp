// The catalog as tables, and the structure that statements give a database.
#include "provider/database_fixture.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class CatalogTables : public DatabaseFixture {
protected:
    CatalogTables()
    {
        Run(u"CREATE TABLE [Order Details] ([Name] Varchar(40),[Qty] Integer,[Sent] DateTime)"_s);
        Run(u"CREATE UNIQUE INDEX [idx] ON [Order Details] ([Qty] DESC)"_s);
    }
};

TEST_F(CatalogTables, ListThemselvesAndTheUsersTables)
{
    EXPECT_EQ(
        Rows(u"SELECT TableName FROM MSYSTABLES ORDER BY TableName"_s),
        (QStringList{u"MSysFields"_s, u"MSysIndexes"_s, u"MSysProcs"_s, u"MSysTables"_s, u"Order Details"_s}));
}

TEST_F(CatalogTables, LeadFromATableToTheIndexOfAField)
{
    const QString table = Rows(u"SELECT TableID FROM MSysTables WHERE TableName='Order Details'"_s).value(0);
    const QString field =
        Rows(u"SELECT FieldID FROM MSysFields WHERE TableID=%1 AND FieldName='Qty'"_s.arg(table)).value(0);
    const QString indexes = u"SELECT IndexName,IndexFlags FROM MSysIndexes WHERE TableID=%1 AND FieldID=%2"_s;
    EXPECT_EQ(Rows(indexes.arg(table, field)), QStringList{u"idx|3"_s});
    Run(u"ALTER TABLE [Order Details] RENAME [Qty] TO [Quantity]"_s);
    Run(u"ALTER TABLE [Order Details] to [Details]"_s);
    EXPECT_EQ(Rows(indexes.arg(table, field)), QStringList{u"idx|3"_s}) << "numbers survive renaming";
}

// The engine folds A to Z alone, so that files from elsewhere may hold both of these.
TEST_F(CatalogTables, GiveFieldsThatDifferByTheCaseOfAnUmlautNumbersOfTheirOwn)
{
    Outside("CREATE TABLE Umlauts (\xC3\xA4 INTEGER, \xC3\x84 INTEGER)");
    const QString table = Rows(u"SELECT TableID FROM MSysTables WHERE TableName='Umlauts'"_s).value(0);
    QStringList fields = Rows(u"SELECT FieldID FROM MSysFields WHERE TableID="_s + table);
    EXPECT_EQ(fields.size(), 2);
    EXPECT_EQ(fields.removeDuplicates(), 0);
}

} // namespace
} // namespace mirel
