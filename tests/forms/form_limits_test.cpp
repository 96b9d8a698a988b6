// What forms promise at the edges: long numbers, long lists, a file that another program holds.
#include "forms/form_fixture.h"
#include "support/sqlite_file.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

using FormLimits = FormFixture;

TEST_F(FormLimits, ShowAFieldsNumberToItsLastDigit)
{
    Run(u"UPDATE Birds SET Price=1.23456789 WHERE ID=1"_s);
    Start(FormBuilder(u"Birds").Edit(u"field", u"Birds.Price").Edit(u"computed", u"[Price]*1"));
    EXPECT_EQ(Text(u"field"), u"1.23456789"_s);
    EXPECT_EQ(Text(u"computed"), u"1.234568"_s); // expressions have six decimals
}

TEST_F(FormLimits, OfferTenThousandItems)
{
    SqliteFile(path_).Run("WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i+1 FROM n WHERE i<10100) "
                          "INSERT INTO Birds (ID, Name) SELECT i, 'bird ' || i FROM n");
    FormBuilder form(u"Birds");
    Start(form.DropDown(u"names", u"SELECT Name FROM Birds\x08"));
    const QStringList& items = running->Controls()[size_t(Control(u"names"))].items;
    EXPECT_EQ(items.size(), 10000);
    EXPECT_EQ(items.value(4), u"bird 1"_s);
}

TEST_F(FormLimits, TellWhenAllRecordsCouldNotBeCommitted)
{
    FormBuilder form(u"Birds");
    form.Edit(u"Name", u"Birds.Name").Button(u"all", ButtonFunction::UpdateAll, {{u"Birds.Name"_s, u"&Name"_s}});
    Start(form);
    Type(u"Name", u"Wren"_s);
    SqliteFile reader(path_);
    reader.Run("BEGIN; SELECT count(*) FROM Birds"); // reads on, so nobody can commit
    prompt_.answers = {true};
    EXPECT_EQ(Press(u"all"), Outcome::Failed);
    EXPECT_EQ(prompt_.shown.size(), 1);
    reader.Run("COMMIT");
    EXPECT_EQ(Stored(u"SELECT Name FROM Birds ORDER BY ID"_s), u"Osprey|Gull|Tern|O'Brien"_s);
}

} // namespace
} // namespace mirel
