#include "data/filter_condition.h"
#include "data/statement_text.h"
#include "support/test_database.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// Filters and sorts by each column of a result, as a person does who picks a cell.
class FieldReferences : public TestDatabase {
protected:
    FieldReferences()
    {
        Run(u"CREATE TABLE Staff (Id Integer, Name Varchar(20), Boss Integer, Pay Float)"_s);
        Run(u"CREATE TABLE Towns (Id Integer, Name Varchar(20))"_s);
        for (const QString& record : {u"1,'Ann',0,10"_s, u"2,'Bob',1,20"_s, u"3,'Cid',1,30"_s, u"4,'Dan',2,30"_s})
            Run(u"INSERT INTO Staff VALUES (%1)"_s.arg(record));
        Run(u"INSERT INTO Towns VALUES (2,'Bonn')"_s);
    }

    QStringList Reference(const QString& statement)
    {
        DbRecordset rows(connection_);
        EXPECT_TRUE(Open(rows, statement)) << rows.ErrorContext().toStdString();
        QStringList references;
        for (int field = 0; field < rows.FieldCount(); ++field)
            references += FieldReferenceIn(rows.Fields(), field);
        return references;
    }
    // The values of `field` that a filter by its value in the first record leaves.
    QStringList FilteredByFirst(const QString& statement, int field)
    {
        DbRecordset rows(connection_);
        EXPECT_TRUE(Open(rows, statement)) << rows.ErrorContext().toStdString();
        const QString condition =
            ConditionFromCell(CellFilter::BySelection, FieldReferenceIn(rows.Fields(), field),
                              rows.TypeOfField(field), rows.FieldValue(field), rows.ValueText(field), {});
        const QString filtered =
            WithOrder(WithCondition(statement, condition), FieldReferenceIn(rows.Fields(), field) + u" DESC"_s);
        EXPECT_TRUE(Open(rows, filtered)) << filtered.toStdString() << rows.ErrorContext().toStdString();
        QStringList values;
        while (!rows.IsEof()) {
            values += rows.ValueText(field);
            EXPECT_TRUE(rows.MoveNext());
        }
        return values;
    }
};

TEST_F(FieldReferences, NameTheSourceWhereThereAreSeveral)
{
    EXPECT_EQ(Reference(u"SELECT Name AS N, Id FROM Staff s"_s), QStringList({u"Name"_s, u"Id"_s}));
    EXPECT_EQ(Reference(u"SELECT a.Name, b.Name FROM Staff a INNER JOIN Staff [the boss] ON a.Boss=[the boss].Id"
                        ", Towns b"_s),
              QStringList({u"a.Name"_s, u"b.Name"_s}));
    EXPECT_EQ(Reference(u"SELECT Name AS Id, Id AS Name FROM Staff"_s),
              QStringList({u"Staff.Name"_s, u"Staff.Id"_s}));
    EXPECT_EQ(Reference(u"SELECT Pay * 2, UPPER(Name) AS N, Pay > 3 FROM Staff"_s),
              QStringList({u"Pay * 2"_s, u"UPPER(Name)"_s, u"(Pay > 3)"_s}));
}

TEST_F(FieldReferences, FilterByTheColumnThatWasPicked)
{
    const QString selfJoin = u"SELECT a.Name, b.Name\nFROM Staff a\nINNER JOIN Staff b ON a.Boss = b.Id\n"
                             "WHERE a.Id > 1"_s;
    EXPECT_EQ(FilteredByFirst(selfJoin, 0), QStringList(u"Bob"_s));
    EXPECT_EQ(FilteredByFirst(selfJoin, 1), QStringList({u"Ann"_s, u"Ann"_s}));
    EXPECT_EQ(FilteredByFirst(u"SELECT Pay AS P, Pay*2 AS D FROM Staff WHERE Id > 2"_s, 0).size(), 2);
    EXPECT_EQ(FilteredByFirst(u"SELECT Pay AS P, Pay*2 AS D FROM Staff WHERE Id > 2"_s, 1),
              QStringList({u"60"_s, u"60"_s}));
    EXPECT_EQ(FilteredByFirst(u"SELECT Boss, COUNT(*) AS N FROM Staff GROUP BY Boss"_s, 1),
              QStringList({u"1"_s, u"1"_s}));
    EXPECT_EQ(FilteredByFirst(u"SELECT UPPER(Name) & '!' FROM Staff"_s, 0), QStringList(u"ANN!"_s));
}

} // namespace
} // namespace mirel
