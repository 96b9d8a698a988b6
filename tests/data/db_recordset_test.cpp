#include "data/field_names.h"
#include "platform/ole_date.h"
#include "support/test_database.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class RecordsetTest : public TestDatabase {
protected:
    RecordsetTest()
    {
        Run(u"CREATE TABLE Birds (Species Varchar(40), Seen DateTime, Wings Smallint, Tame Bit, Weight Float)"_s);
        Run(u"INSERT INTO Birds (Species,Seen,Wings,Tame,Weight) VALUES('Owl','2001-07-04 09:05:00',2,1,1.25)"_s);
        Run(u"INSERT INTO Birds (Species,Wings) VALUES('Wren',2)"_s);
        Run(u"INSERT INTO Birds (Species,Wings) VALUES('Auk',2)"_s);
    }

    DbRecordset birds_{connection_};
};

TEST_F(RecordsetTest, ReadsValuesAndTheirTexts)
{
    ASSERT_TRUE(Open(birds_, u"SELECT * FROM Birds"_s));
    EXPECT_EQ(birds_.FieldValue(0), Value::Text(u"Owl"_s));
    EXPECT_EQ(birds_.ValueText(1), u"7/4/2001 9:05:00 AM"_s);
    EXPECT_EQ(birds_.FieldValue(u"Wings"), Value::SmallInt(2));
    EXPECT_EQ(birds_.ValueText(3), u"-1"_s);
    EXPECT_EQ(birds_.ValueText(4), u"1.25"_s);
    ASSERT_TRUE(birds_.MoveNext());
    EXPECT_EQ(birds_.FieldValue(1), Value::Null());
    EXPECT_EQ(birds_.ValueText(1), QString()) << "NULL is empty, not a word";
}

TEST_F(RecordsetTest, GivesNeutralValuesForWhatIsNotThere)
{
    ASSERT_TRUE(Open(birds_, u"SELECT * FROM Birds"_s));
    EXPECT_EQ(birds_.FieldIndex(u"Wings"), 2);
    EXPECT_EQ(birds_.FieldIndex(u"wings"), -1);
    for (const int index : {-1, 5}) {
        EXPECT_EQ(birds_.FieldValue(index), Value::Integer(0)) << index;
        EXPECT_EQ(birds_.FieldName(index), QString()) << index;
        EXPECT_EQ(birds_.FieldSize(index), -1) << index;
    }
    EXPECT_EQ(birds_.FieldValue(u"wings"), Value::Integer(0));
    ASSERT_TRUE(birds_.MoveTo(99));
    EXPECT_TRUE(birds_.IsEof());
    EXPECT_EQ(birds_.FieldValue(0), Value::Null());
}

TEST_F(RecordsetTest, IsNothingUntilItIsOpen)
{
    EXPECT_EQ(birds_.FieldCount(), 0);
    EXPECT_TRUE(birds_.IsEof());
    EXPECT_TRUE(birds_.IsBof());
    EXPECT_EQ(birds_.RecordCount(), -1);
    EXPECT_FALSE(birds_.MoveFirst());
    EXPECT_FALSE(birds_.Update(0, Value::Null()));
    EXPECT_EQ(birds_.LastResult(), Hr::NotOpen);
    DbConnection nothing(u"no such provider"_s);
    DbRecordset recordset(nothing);
    EXPECT_FALSE(Open(recordset, u"SELECT * FROM Birds"_s));
}

TEST_F(RecordsetTest, ClosesTheLastResultBeforeTheNext)
{
    ASSERT_TRUE(Open(birds_, u"SELECT * FROM Birds"_s));
    EXPECT_EQ(birds_.FieldCount(), 5);
    ASSERT_TRUE(Open(birds_, u"SELECT Wings FROM Birds WHERE Species='Wren'"_s));
    EXPECT_EQ(birds_.FieldCount(), 1);
    EXPECT_EQ(birds_.RecordCount(), 1);
    EXPECT_FALSE(Open(birds_, u"SELECT Nothing FROM Birds"_s));
    EXPECT_EQ(birds_.LastResult(), Hr::NoSuchColumn);
    EXPECT_EQ(birds_.FieldCount(), 0);
    EXPECT_FALSE(birds_.IsOpen());
}

TEST_F(RecordsetTest, StaysWhereItWasWhenAChangeIsRefused)
{
    ASSERT_TRUE(Open(birds_, u"SELECT * FROM Birds"_s));
    ASSERT_TRUE(birds_.MoveTo(1));
    EXPECT_FALSE(birds_.Update(0, Value::Text(QString(41, u'x'))));
    EXPECT_EQ(birds_.LastResult(), Hr::Overflow);
    EXPECT_EQ(birds_.Position(), 1);
    EXPECT_EQ(birds_.ValueText(0), u"Wren"_s);
    EXPECT_TRUE(birds_.Update(0, Value::Text(u"Tit"_s)));
    EXPECT_EQ(birds_.ValueText(0), u"Tit"_s);
}

TEST_F(RecordsetTest, BringsEveryTypeNameBack)
{
    for (const QString& name : {u"SmallInt"_s, u"Integer"_s, u"Double"_s, u"DateTime"_s, u"Yes/No"_s, u"Boolean"_s,
                                u"Text"_s, u"Memo"_s, u"VarBinary"_s, u"OLEObject"_s}) {
        Run(u"CREATE TABLE Types (F %1)"_s.arg(DdlTypeOfName(name, 40)));
        ASSERT_TRUE(Open(birds_, u"SELECT * FROM Types"_s)) << name.toStdString();
        QString back;
        EXPECT_TRUE(TypeNameOfField(birds_.TypeOfField(0), back)) << name.toStdString();
        EXPECT_EQ(back, name == u"Boolean" ? u"Yes/No"_s : name);
        birds_.Close();
        Run(u"DROP TABLE Types"_s);
    }
}

TEST(OnlyReads, IsWhatShowsRecordsAlone)
{
    for (const char16_t* reads : {u"SELECT * FROM T", u"T", u"[My Birds]", u"not a statement at all"})
        EXPECT_TRUE(OnlyReads(QString::fromUtf16(reads))) << QString::fromUtf16(reads).toStdString();
    for (const char16_t* changes : {u"DELETE FROM T", u"UPDATE T SET A=1", u"DROP TABLE T", u"DROP DATABASE 'x'",
                                    u"INSERT INTO T (A) VALUES(1)", u"CREATE TABLE T (A Integer)"})
        EXPECT_FALSE(OnlyReads(QString::fromUtf16(changes))) << QString::fromUtf16(changes).toStdString();
}

TEST_F(RecordsetTest, TakesNothingButATableOrASelectForASource)
{
    const auto open = [&](const QString& source) {
        return birds_.OpenSource(source, path_, CursorType::Static, LockType::Optimistic);
    };
    for (const QString& statement :
         {u"DELETE FROM Birds"_s, u"DROP TABLE Birds;"_s, u"UPDATE Birds SET Wings=4"_s,
          u"INSERT INTO Birds (Species) VALUES ('Emu')"_s, u"CREATE TABLE More (A Integer)"_s}) {
        EXPECT_FALSE(open(statement)) << statement.toStdString();
        EXPECT_EQ(birds_.LastResult(), Hr::SyntaxError);
        EXPECT_EQ(birds_.ErrorContext(), u"only a SELECT can be read here"_s);
    }
    EXPECT_FALSE(open(u"SELECT * FROM Nowhere"_s));
    EXPECT_EQ(birds_.LastResult(), Hr::NoSuchTable);
    EXPECT_NE(birds_.ErrorContext(), u"only a SELECT can be read here"_s);
    ASSERT_TRUE(open(u"Birds"_s));
    EXPECT_EQ(birds_.RecordCount(), 3);
    EXPECT_EQ(birds_.FieldValue(u"Wings"), Value::SmallInt(2));
}

} // namespace
} // namespace mirel
