#include "dialect/plan_fixture.h"
#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel::sqlite {
namespace {

using namespace Qt::StringLiterals;

struct Refusal {
    const char* what;
    QString statement;
    Hr code; // Ok: it is accepted
};

void ExpectCodes(const std::vector<Refusal>& rows)
{
    const dialect::Schema schema = dialect::TestSchema();
    for (const Refusal& row : rows) {
        const PlanResult result = PlanStatement(row.statement, schema);
        const auto* failure = std::get_if<PlanFailure>(&result);
        EXPECT_EQ(failure ? failure->code : Hr::Ok, row.code) << row.what << ": " << qPrintable(row.statement);
    }
}

SelectPlan PlanOf(const QString& statement)
{
    const PlanResult result = PlanStatement(statement, dialect::TestSchema());
    const auto* plan = std::get_if<Plan>(&result);
    if (!plan || !std::holds_alternative<SelectPlan>(*plan)) {
        ADD_FAILURE() << qPrintable(statement);
        return {};
    }
    return std::get<SelectPlan>(*plan);
}

QStringList NamesOf(const SelectPlan& plan)
{
    QStringList names;
    for (const ResultField& field : plan.fields)
        names += field.name;
    return names;
}

TEST(Names, AreFoundOrRefused)
{
    ExpectCodes({
        {"any case", u"select NAME from ITEMS where items.[qty] = 1"_s, Hr::Ok},
        {"unknown table", u"SELECT * FROM Nothing"_s, Hr::NoSuchTable},
        {"unknown bare table", u"Nothing"_s, Hr::NoSuchTable},
        {"unknown column", u"SELECT Nothing FROM Items"_s, Hr::NoSuchColumn},
        {"unknown table before a column", u"SELECT Orders.Qty FROM Items"_s, Hr::NoSuchColumn},
        {"unknown star", u"SELECT Orders.* FROM Items"_s, Hr::NoSuchColumn},
        {"in both tables", u"SELECT Qty FROM Items INNER JOIN Orders ON Items.Name = Orders.Item"_s,
         Hr::SyntaxError},
        {"alias", u"SELECT i.Qty FROM Items AS i, Orders o WHERE i.Name = o.Item"_s, Hr::Ok},
        {"the table behind an alias", u"SELECT Items.Qty FROM Items AS i"_s, Hr::Ok},
        {"a later table in ON", u"SELECT * FROM Items JOIN Orders ON Old.Name = Item JOIN Old ON 1 = 1"_s,
         Hr::NoSuchColumn},
        {"a position that is not there", u"SELECT Name FROM Items ORDER BY 2"_s, Hr::NoSuchColumn},
        {"twice in SET", u"UPDATE Items SET Qty = 1, qty = 2"_s, Hr::DuplicateColumn},
        {"twice in INSERT", u"INSERT INTO Items (Qty,[qty]) VALUES (1,2)"_s, Hr::DuplicateColumn},
        {"another table's column in SET", u"UPDATE Items SET Orders.Qty = 1"_s, Hr::NoSuchColumn},
        {"a column among new values", u"INSERT INTO Items (Qty) VALUES (Small)"_s, Hr::NoSuchColumn},
        {"more columns than values", u"INSERT INTO Items (Qty,Small) VALUES (1)"_s, Hr::SyntaxError},
    });
}

TEST(Literals, FollowTheColumn)
{
    ExpectCodes({
        {"date, the user's form", u"SELECT * FROM Items WHERE Made = '7/4/2001'"_s, Hr::Ok},
        {"no date", u"SELECT * FROM Items WHERE Made > 'soon'"_s, Hr::BadLiteral},
        {"no such day", u"SELECT * FROM Items WHERE '2001-02-30' < Made"_s, Hr::BadLiteral},
        {"no date in a list", u"SELECT * FROM Items WHERE Made IN ('2001-01-01','x')"_s, Hr::BadLiteral},
        {"no date as a bound", u"SELECT * FROM Items WHERE Made BETWEEN '2001-01-01' AND 'x'"_s, Hr::BadLiteral},
        {"year out of range", u"INSERT INTO Items (Made) VALUES ('12001-01-01')"_s, Hr::Overflow},
        {"no number", u"SELECT * FROM Items WHERE Qty = 'abc'"_s, Hr::BadLiteral},
        {"a number as text", u"SELECT * FROM Items WHERE Qty = ' 12.5 '"_s, Hr::Ok},
        {"compared out of range", u"SELECT * FROM Items WHERE Small < 99999"_s, Hr::Ok},
        {"too large a number", u"UPDATE Items SET Small = 32768"_s, Hr::Overflow},
        {"the largest", u"UPDATE Items SET Small = 32767, Qty = -2147483648"_s, Hr::Ok},
        {"an endless number", u"SELECT * FROM Items WHERE Price > '1e999'"_s, Hr::Overflow},
        {"a fraction for an integer", u"UPDATE Items SET Qty = 1.5"_s, Hr::BadLiteral},
        {"no fraction after all", u"UPDATE Items SET Qty = '2.0'"_s, Hr::Ok},
        {"too long a text", u"UPDATE Items SET Name = '12345678901'"_s, Hr::Overflow},
        {"just long enough", u"UPDATE Items SET Name = 'größerer10'"_s, Hr::Ok},
        {"long texts compare", u"SELECT * FROM Items WHERE Name = '12345678901'"_s, Hr::Ok},
        {"words for Yes/No", u"INSERT INTO Items (Sold) VALUES ('yes')"_s, Hr::Ok},
        {"no word for Yes/No", u"INSERT INTO Items (Sold) VALUES ('perhaps')"_s, Hr::BadLiteral},
        {"text for a picture", u"UPDATE Items SET Photo = 'x'"_s, Hr::BadLiteral},
        {"NULL for anything", u"UPDATE Items SET Photo = NULL, Made = NULL"_s, Hr::Ok},
        {"two literals", u"SELECT * FROM Items WHERE 'a' = 1"_s, Hr::BadLiteral},
    });
    EXPECT_EQ(PlanOf(u"SELECT * FROM Items WHERE Made = '7/4/2001 9:05:00 AM'"_s).where,
              QByteArray("t0.[Made] = '2001-07-04 09:05:00'"));
    EXPECT_EQ(PlanOf(u"SELECT * FROM Items WHERE Made < 37076"_s).where, QByteArray("t0.[Made] < '2001-07-04'"));
    EXPECT_EQ(PlanOf(u"SELECT * FROM Items WHERE Sold = -1 AND Sold <> 'no'"_s).where,
              QByteArray("t0.[Sold] = 1 AND t0.[Sold] <> 0"));
    EXPECT_EQ(PlanOf(u"SELECT * FROM Items WHERE Name = 007"_s).where, QByteArray("t0.[Name] = '007'"));
}

TEST(Comparisons, ThatCannotBeMade)
{
    ExpectCodes({
        {"a picture", u"SELECT * FROM Items WHERE Photo = 'x'"_s, Hr::BadComparison},
        {"a picture with a column", u"SELECT * FROM Items WHERE Name < Photo"_s, Hr::BadComparison},
        {"a picture with NULL", u"SELECT * FROM Items WHERE Photo IS NOT NULL AND Photo <> NULL"_s, Hr::Ok},
        {"LIKE on a picture", u"SELECT * FROM Items WHERE Photo LIKE 'x'"_s, Hr::BadComparison},
        {"text function on a picture", u"SELECT UPPER(Photo) FROM Items"_s, Hr::BadComparison},
        {"the largest picture", u"SELECT MAX(Photo) FROM Items"_s, Hr::BadComparison},
        {"pictures are counted", u"SELECT COUNT(Photo) FROM Items"_s, Hr::Ok},
        {"a literal with a date and a number", u"SELECT * FROM Items WHERE 5 BETWEEN Made AND Qty"_s,
         Hr::BadComparison},
        {"date and number", u"SELECT * FROM Items WHERE Made = Qty"_s, Hr::BadComparison},
        {"a text is no condition", u"SELECT * FROM Items WHERE Name"_s, Hr::BadComparison},
        {"a Yes/No is one", u"SELECT * FROM Items WHERE Sold AND NOT Qty"_s, Hr::Ok},
        {"a date is not true", u"SELECT * FROM Items WHERE Made IS TRUE"_s, Hr::BadComparison},
        {"sum of texts", u"SELECT SUM(Name) FROM Items"_s, Hr::BadComparison},
        {"the days between dates", u"SELECT Made - Made FROM Items"_s, Hr::Ok},
        {"dates do not add up", u"SELECT Made + Made FROM Items"_s, Hr::BadComparison},
        {"days after a date", u"SELECT 2 + Made FROM Items"_s, Hr::Ok},
        {"a date taken from days", u"SELECT 2 - Made FROM Items"_s, Hr::BadComparison},
        {"dates do not multiply", u"SELECT Made * 2 FROM Items"_s, Hr::BadComparison},
    });
}

TEST(Aggregates, StandWhereAGroupIs)
{
    ExpectCodes({
        {"in WHERE", u"SELECT Name FROM Items WHERE COUNT(*) > 1"_s, Hr::SyntaxError},
        {"in each other", u"SELECT SUM(COUNT(*)) FROM Items"_s, Hr::SyntaxError},
        {"in GROUP BY, by position", u"SELECT COUNT(*) FROM Items GROUP BY 1"_s, Hr::SyntaxError},
        {"in SET", u"UPDATE Items SET Qty = MAX(Qty)"_s, Hr::SyntaxError},
        {"beside a column", u"SELECT Name, COUNT(*) FROM Items"_s, Hr::SyntaxError},
        {"beside a grouped column", u"SELECT items.Name & '!', COUNT(*) FROM Items GROUP BY Name"_s, Hr::Ok},
        {"beside a grouped expression",
         u"SELECT YEAR(Made) + 1, COUNT(*) FROM Items GROUP BY YEAR(items.[made])"_s, Hr::Ok},
        {"sorted by another column", u"SELECT Name FROM Items GROUP BY Name ORDER BY Qty"_s, Hr::SyntaxError},
        {"HAVING without a group", u"SELECT COUNT(*) FROM Items HAVING COUNT(*) > 1"_s, Hr::Ok},
    });
}

TEST(Nesting, IsHeldAgainstWhatTheEngineReads)
{
    const auto ladder = [](int steps) {
        return u"IIF(Qty>1,'a',"_s.repeated(steps) + u"'z'"_s + u")"_s.repeated(steps);
    };
    const auto within = [](int steps) {
        return u"IIF("_s.repeated(steps) + u"Sold"_s + u",Sold,Sold)"_s.repeated(steps);
    };
    ExpectCodes({
        {"a chain of texts", u"SELECT Name"_s + u" & Name"_s.repeated(90) + u" FROM Items"_s, Hr::Ok},
        {"the same from the right",
         u"SELECT Name"_s + u" || (Name"_s.repeated(90) + u")"_s.repeated(90) + u" FROM Items"_s, Hr::Ok},
        {"a ladder of choices", u"SELECT "_s + ladder(90) + u" FROM Items"_s, Hr::Ok},
        {"a text of 16 million", u"INSERT INTO Items (Note) VALUES ('"_s + QString(16'000'000, u'ß') + u"')"_s,
         Hr::Ok},
        {"choices within choices", u"SELECT "_s + within(40) + u" FROM Items"_s, Hr::SyntaxError},
    });
    const PlanResult deep = PlanStatement(u"SELECT "_s + within(40) + u" FROM Items"_s, dialect::TestSchema());
    EXPECT_TRUE(std::get<PlanFailure>(deep).context.endsWith(u"nested too deeply"))
        << qPrintable(std::get<PlanFailure>(deep).context);
}

TEST(Structure, IsHeldAgainstTheSchema)
{
    ExpectCodes({
        {"table exists", u"CREATE TABLE items (a Integer)"_s, Hr::TableExists},
        {"column twice", u"CREATE TABLE n (a Integer, [A] Bit)"_s, Hr::DuplicateColumn},
        {"reserved name", u"CREATE TABLE sqlite_n (a Integer)"_s, Hr::SyntaxError},
        {"size over 255", u"CREATE TABLE n (a Varchar(256))"_s, Hr::Overflow},
        {"size 0", u"CREATE TABLE n (a Varchar(0))"_s, Hr::Overflow},
        {"too many columns",
         u"CREATE TABLE n (a0 Bit"_s +
             [] {
                 QString columns;
                 for (int i = 1; i <= 2000; ++i)
                     columns += u",a%1 Bit"_s.arg(i);
                 return columns;
             }() +
             u')',
         Hr::TooManyColumns},
        {"as many as a result can have", u"SELECT Qty"_s + u",Qty"_s.repeated(1999) + u" FROM Items"_s, Hr::Ok},
        {"one more", u"SELECT Qty"_s + u",Qty"_s.repeated(2000) + u" FROM Items"_s, Hr::TooManyColumns},
        {"too many by the star", u"SELECT *"_s + u",*"_s.repeated(300) + u" FROM Items"_s, Hr::TooManyColumns},
        {"no such table", u"DROP TABLE Nothing"_s, Hr::NoSuchTable},
        {"add an old column", u"ALTER TABLE Items ADD name Bit"_s, Hr::DuplicateColumn},
        {"drop no column", u"ALTER TABLE Items DROP Nothing"_s, Hr::NoSuchColumn},
        {"rename to another", u"ALTER TABLE Items RENAME Qty TO name"_s, Hr::DuplicateColumn},
        {"rename to itself in capitals", u"ALTER TABLE Items RENAME Qty TO QTY"_s, Hr::Ok},
        {"rename table to another", u"ALTER TABLE Items to Orders"_s, Hr::TableExists},
        {"rename table to itself in capitals", u"ALTER TABLE Items to ITEMS"_s, Hr::Ok},
        {"move before nothing", u"ALTER TABLE Items MOVE Qty BEFORE Nothing"_s, Hr::NoSuchColumn},
        {"index exists", u"CREATE INDEX byqty ON Items (Name)"_s, Hr::IndexExists},
        {"the same name on another table", u"CREATE INDEX ByQty ON Orders (Qty)"_s, Hr::Ok},
        {"index column twice", u"CREATE INDEX i ON Items (Qty, Name, qty)"_s, Hr::DuplicateColumn},
        {"no such index", u"DROP INDEX Orders.ByQty"_s, Hr::NoSuchIndex},
        {"catalog table", u"DROP TABLE MSysTables"_s, Hr::AccessDenied},
        {"catalog records", u"DELETE FROM MSysTables"_s, Hr::AccessDenied},
        {"a view", u"INSERT INTO Seen VALUES ('x')"_s, Hr::ReadOnly},
    });
    const PlanResult renamed =
        PlanStatement(u"ALTER TABLE ITEMS RENAME qty TO [New one]"_s, dialect::TestSchema());
    const auto& change = std::get<RenameColumn>(std::get<StructurePlan>(std::get<Plan>(renamed)));
    EXPECT_EQ(change, (RenameColumn{u"Items"_s, u"Qty"_s, u"New one"_s}));
}

TEST(Results, NameTheirColumns)
{
    EXPECT_EQ(NamesOf(PlanOf(u"SELECT qty AS N, NAME, Price*2, COUNT(*) FROM Items GROUP BY Qty,Name,Price"_s)),
              (QStringList{u"N"_s, u"Name"_s, u"Price*2"_s, u"COUNT(*)"_s}));
    EXPECT_EQ(NamesOf(PlanOf(u"SELECT o.*, Price FROM Items, Orders AS o"_s)),
              (QStringList{u"Item"_s, u"Qty"_s, u"Ship To"_s, u"Price"_s}));
    const ResultField field = PlanOf(u"SELECT Items.Name AS n FROM Items"_s).fields.front();
    EXPECT_EQ(field.table + u'/' + field.column + u'/' + QString::number(field.size), u"Items/Name/10"_s);
}

TEST(Results, KnowTheirTypes)
{
    const SelectPlan plan =
        PlanOf(u"SELECT Qty/2, Qty+Small, Qty+Price, Made+1, Made-Made, Name+'x', Qty>1, "
               "COALESCE(NULL,Made), IIF(Sold,1,2.5), NULL, AVG(Qty), SUM(Qty), MAX(Made), SUM(Sold) "
               "FROM Items GROUP BY Qty,Small,Price,Made,Name,Sold"_s);
    const std::vector<FieldType> types = {
        FieldType::Double, FieldType::Integer, FieldType::Double, FieldType::Date,   FieldType::Double,
        FieldType::Memo,   FieldType::YesNo,   FieldType::Date,   FieldType::Double, FieldType::None,
        FieldType::Double, FieldType::Integer, FieldType::Date,   FieldType::Integer};
    ASSERT_EQ(plan.fields.size(), types.size());
    for (size_t i = 0; i < types.size(); ++i)
        EXPECT_EQ(plan.fields[i].type, types[i]) << qPrintable(plan.fields[i].name);
}

struct Use {
    QString statement;
    bool keyed;
    int updatable;
};

TEST(Results, KnowWhetherTheyCanBeWritten)
{
    const std::vector<Use> rows = {
        {u"Items"_s, true, 0},
        {u"SELECT Name, Qty*2 FROM Items WHERE Qty > 1 ORDER BY Price"_s, true, 0},
        {u"SELECT * FROM Items INNER JOIN Orders ON Name = Item"_s, true, -1},
        {u"SELECT Orders.* FROM Items INNER JOIN Orders ON Name = Item"_s, true, 1},
        {u"SELECT Orders.*, UPPER(Name) FROM Items INNER JOIN Orders ON Name = Item"_s, true, -1},
        {u"SELECT Items.* FROM Items LEFT JOIN Orders ON Name = Item"_s, true, 0},
        {u"SELECT Orders.* FROM Items LEFT JOIN Orders ON Name = Item"_s, true, -1},
        {u"SELECT DISTINCT Name FROM Items"_s, false, -1},
        {u"SELECT Name FROM Items GROUP BY Name"_s, false, -1},
        {u"SELECT COUNT(*) FROM Items"_s, false, -1},
        {u"SELECT Qty + 1 FROM Items"_s, false, -1},
        {u"MSysTables"_s, false, -1},
        {u"Seen"_s, false, -1},
    };
    for (const Use& row : rows) {
        const SelectPlan plan = PlanOf(row.statement);
        EXPECT_EQ(plan.keyed, row.keyed) << qPrintable(row.statement);
        EXPECT_EQ(plan.updatableSource, row.updatable) << qPrintable(row.statement);
    }
}

TEST(Order, IsByLanguageForTextsAlone)
{
    const SelectPlan plan =
        PlanOf(u"SELECT Items.Name AS n, Qty*2, Day FROM Items, Old ORDER BY n, 2 DESC, [Qty*2], Day, 'x'"_s);
    EXPECT_EQ(OrderClause(plan.order), QByteArray("ORDER BY mirel_sortkey(t0.[Name]),t0.[Name],t0.[Qty] * 2 DESC,"
                                                  "t0.[Qty] * 2,mirel_date(t1.[Day])"));
    EXPECT_EQ(OrderClause({}), QByteArray());
}

TEST(DatabaseStatements, NeedNoSchema)
{
    const PlanResult create = PlanDatabaseStatement(u"create database '/x/it''s.cdb'"_s);
    ASSERT_TRUE(std::holds_alternative<Plan>(create));
    EXPECT_EQ(std::get<CreateDatabase>(std::get<Plan>(create)).path, u"/x/it's.cdb"_s);
    EXPECT_TRUE(std::holds_alternative<PlanFailure>(PlanDatabaseStatement(u"DROP TABLE t"_s)));
}

} // namespace
} // namespace mirel::sqlite
