// What refers to a name that changes: the text means the same as before, and all else stays as it was written.
#include "forms/name_mending.h"

#include "forms/control_source.h"
#include "forms/form_fixture.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;
using enum NameChange::What;

const NameChange kField{Field, u"Birds"_s, u"Name"_s, u"Full Name"_s};
const NameChange kTable{Table, {}, u"Birds"_s, u"All Birds"_s};

TEST(StatementWithNewName, ChangesAFieldWhereItMeansThatField)
{
    struct Row {
        const char* what;
        QString before;
        QString after;
    };
    const std::vector<Row> rows = {
        {"bare", u"SELECT Name,Price FROM Birds"_s, u"SELECT [Full Name],Price FROM Birds"_s},
        {"any case, in brackets", u"select [NAME] from [birds]"_s, u"select [Full Name] from [birds]"_s},
        {"qualified", u"SELECT Birds.Name FROM Birds WHERE [Birds].[Name]='Name'"_s,
         u"SELECT Birds.[Full Name] FROM Birds WHERE [Birds].[Full Name]='Name'"_s},
        {"by alias", u"SELECT b.Name,o.Name FROM Birds b INNER JOIN Other AS o ON b.Name=o.Name"_s,
         u"SELECT b.[Full Name],o.Name FROM Birds b INNER JOIN Other AS o ON b.[Full Name]=o.Name"_s},
        {"another table", u"SELECT Name FROM Other"_s, u"SELECT Name FROM Other"_s},
        {"a table between commas", u"SELECT Name FROM Other, Birds"_s, u"SELECT [Full Name] FROM Other, Birds"_s},
        {"an alias of that name", u"SELECT Price AS Name FROM Birds ORDER BY Name"_s,
         u"SELECT Price AS Name FROM Birds ORDER BY Name"_s},
        {"a function of that name", u"SELECT NAME(Price),LEN(Name) FROM Birds"_s,
         u"SELECT NAME(Price),LEN([Full Name]) FROM Birds"_s},
        {"a table of that name", u"SELECT * FROM Name"_s, u"SELECT * FROM Name"_s},
        {"clauses", u"SELECT COUNT(*) FROM Birds GROUP BY Name HAVING MIN(Name)>'a' ORDER BY Name DESC"_s,
         u"SELECT COUNT(*) FROM Birds GROUP BY [Full Name] HAVING MIN([Full Name])>'a' ORDER BY [Full Name] DESC"_s},
        {"changes", u"UPDATE Birds SET Name='x' WHERE Name IN (Name,'y')"_s,
         u"UPDATE Birds SET [Full Name]='x' WHERE [Full Name] IN ([Full Name],'y')"_s},
        {"additions", u"INSERT INTO Birds (Name,Price) VALUES ('Name',1)"_s,
         u"INSERT INTO Birds ([Full Name],Price) VALUES ('Name',1)"_s},
        {"a control", u"SELECT * FROM Birds WHERE Name=&[Name] AND Name=&Name"_s,
         u"SELECT * FROM Birds WHERE [Full Name]=&[Name] AND [Full Name]=&Name"_s},
        {"joined texts", u"SELECT Name & Name FROM Birds"_s, u"SELECT [Full Name] & [Full Name] FROM Birds"_s},
        {"never closed", u"SELECT Name FROM Birds WHERE Name='x"_s, u"SELECT Name FROM Birds WHERE Name='x"_s},
        {"a bare table", u"Birds"_s, u"Birds"_s},
    };
    for (const Row& row : rows)
        EXPECT_EQ(StatementWithNewName(row.before, kField), row.after) << row.what;
    EXPECT_EQ(StatementWithNewName(u"SELECT Name WHERE Name>'a'"_s, kField, u"Birds"_s),
              u"SELECT [Full Name] WHERE [Full Name]>'a'"_s);
    EXPECT_EQ(StatementWithNewName(u"SELECT [Name] FROM Birds"_s, {Field, u"Birds"_s, u"Name"_s, u"N"_s}),
              u"SELECT [N] FROM Birds"_s);
}

TEST(StatementWithNewName, ChangesATableWhereItMeansThatTable)
{
    struct Row {
        const char* what;
        QString before;
        QString after;
    };
    const std::vector<Row> rows = {
        {"everywhere", u"SELECT Birds.Name,Birds FROM Birds LEFT JOIN Other ON Birds.ID=Other.Birds"_s,
         u"SELECT [All Birds].Name,Birds FROM [All Birds] LEFT JOIN Other ON [All Birds].ID=Other.Birds"_s},
        {"an alias of that name", u"SELECT Birds.Name FROM Other Birds"_s,
         u"SELECT Birds.Name FROM Other Birds"_s},
        {"with an alias", u"SELECT b.Name FROM [Birds] b"_s, u"SELECT b.Name FROM [All Birds] b"_s},
        {"bare", u" birds"_s, u"[All Birds]"_s},
        {"in brackets", u"[Birds]"_s, u"[All Birds]"_s},
        {"deleted from", u"DELETE FROM Birds WHERE ID=1"_s, u"DELETE FROM [All Birds] WHERE ID=1"_s},
    };
    for (const Row& row : rows)
        EXPECT_EQ(StatementWithNewName(row.before, kTable), row.after) << row.what;
}

TEST(ExpressionWithNewName, ChangesTheFieldAlone)
{
    struct Row {
        const char* what;
        QString before;
        QString after;
    };
    const std::vector<Row> rows = {
        {"bare", u"Name"_s, u"[Full Name]"_s},
        {"in an expression", u"UPPER(Name)+' Name '+Price"_s, u"UPPER([Full Name])+' Name '+Price"_s},
        {"arguments", u"REPLACE(Name, Name, Price)"_s, u"REPLACE([Full Name], [Full Name], Price)"_s},
        {"qualified", u"Birds.Name + Other.Name"_s, u"Birds.[Full Name] + Other.Name"_s},
        {"qualified in brackets", u"[Birds].[Name]"_s, u"[Birds].[Full Name]"_s},
        {"a condition", u"WHERE Birds.Name='x' AND Name IS NOT NULL"_s,
         u"WHERE Birds.[Full Name]='x' AND [Full Name] IS NOT NULL"_s},
        {"a control", u"&Name+&[Name]"_s, u"&Name+&[Name]"_s},
        {"another name", u"Names-MyName"_s, u"Names-MyName"_s},
    };
    for (const Row& row : rows)
        EXPECT_EQ(ExpressionWithNewName(row.before, kField, ExprMode::Condition, true), row.after) << row.what;
    EXPECT_EQ(ExpressionWithNewName(u"Name+Birds.Name"_s, kField, ExprMode::Condition, false),
              u"Name+Birds.[Full Name]"_s);
    const NameChange blanks{Field, u"My Birds"_s, u"Ship To"_s, u"To"_s};
    EXPECT_EQ(ExpressionWithNewName(u"Ship To + MyBirds.ShipTo"_s, blanks, ExprMode::Condition, true),
              u"To + MyBirds.To"_s);
    EXPECT_EQ(ExpressionWithNewName(u"[Birds].[Name]&Birds.Name"_s, kTable, ExprMode::Condition, true),
              u"[All Birds].[Name]&Birds.Name"_s)
        << "what follows & is a control";
}

TEST(MendNames, GoesThroughFormsAndQueries)
{
    FormBuilder builder(u"Birds", u"Entry");
    builder.Edit(u"A", u"Birds.Name")
        .Check(u"B", u"WHERE Birds.Wild=1")
        .List(u"C", {{u"Name"_s, u"Name"_s}})
        .DropDown(u"D", u"SELECT Name FROM Birds\x08")
        .Button(u"E", ButtonFunction::Update, {{u"Birds.Name"_s, u"&A"_s}, {u"Price"_s, u"LEN(Name)"_s}})
        .Button(u"F", ButtonFunction::Select, u"SELECT * WHERE Name>'a'")
        .Button(u"G", ButtonFunction::CallForm, u"Name")
        .Input(u"Name");
    builder.Last().fieldBound = 1;
    FormStore store;
    store.AddForm(builder.form);
    store.AddForm(FormBuilder(u"Other", u"Elsewhere").Edit(u"A", u"Name").form);
    QueryDef query;
    query.SetName(u"All");
    query.SetTableName(u"Birds");
    query.SetText(u"SELECT Name FROM Birds");
    store.AddQuery(query);
    const FormStore before = store;

    EXPECT_EQ(MendNames(store, kField), (std::vector<NameUse>{{NameUse::Holder::Form, u"Entry"_s, 7},
                                                              {NameUse::Holder::Query, u"All"_s, 1}}));
    const std::vector<ControlDef>& controls = store.Forms()[0].controls;
    EXPECT_EQ(controls[0].source.Text(), u"Birds.[Full Name]"_s);
    EXPECT_EQ(controls[2].source.Text(), JoinListColumns({{u"Name"_s, u"[Full Name]"_s}}));
    EXPECT_EQ(controls[3].source.Text(), u"SELECT [Full Name] FROM Birds\x08"_s);
    EXPECT_EQ(controls[4].source.Text(),
              JoinAssignments({{u"Birds.[Full Name]"_s, u"&A"_s}, {u"Price"_s, u"LEN([Full Name])"_s}}));
    EXPECT_EQ(controls[5].source.Text(), u"SELECT * WHERE [Full Name]>'a'"_s);
    EXPECT_EQ(controls[7].source.Text(), u"[Full Name]"_s);
    EXPECT_EQ(store.Forms()[1], before.Forms()[1]);

    store = before;
    MendNames(store, kTable);
    EXPECT_EQ(store.Forms()[0].tableName.Text(), u"All Birds"_s);
    EXPECT_EQ(store.Forms()[0].controls[1].source.Text(), u"WHERE [All Birds].Wild=1"_s);
    EXPECT_EQ(store.Queries()[0].tableName.Text(), u"All Birds"_s);

    store = before;
    EXPECT_EQ(MendNames(store, {Form, {}, u"Name"_s, u"Start"_s}),
              (std::vector<NameUse>{{NameUse::Holder::Form, u"Entry"_s, 1}}));
    EXPECT_EQ(store.Forms()[0].controls[6].source.Text(), u"Start"_s);
    store = before;
    EXPECT_TRUE(MendNames(store, {Query, {}, u"All"_s, u"Some"_s}).empty());
    EXPECT_EQ(store, before);
}

TEST(MendNames, ADropDownBoxThatShowsTheFieldOfItsOwnNameFollowsIt)
{
    FormBuilder builder(u"Birds", u"Entry");
    builder.DropDown(u"Name", u"Owl;Wren")
        .Button(u"Save", ButtonFunction::Update, {{u"Birds.Name"_s, u"&Name"_s}, {u"Note"_s, u"&NameX"_s}})
        .Button(u"Find", ButtonFunction::Select, u"SELECT * WHERE Note LIKE '&[name]%'");
    builder.form.controls[0].fieldBound = 1;
    FormDef& items = builder.form;
    FormBuilder query(u"Birds", u"By query");
    query.DropDown(u"Name", u"SELECT Kind FROM Kinds\x08");
    query.form.controls[0].fieldBound = 1;
    FormStore store;
    store.AddForm(items);
    store.AddForm(query.form);
    EXPECT_EQ(MendNames(store, kField).size(), 2U);
    const std::vector<ControlDef>& controls = store.Forms()[0].controls;
    EXPECT_EQ(controls[0].name.Text(), u"Full Name"_s);
    EXPECT_EQ(controls[0].source.Text(), u"Owl;Wren"_s);
    EXPECT_EQ(controls[1].source.Text(),
              JoinAssignments({{u"Birds.[Full Name]"_s, u"&[Full Name]"_s}, {u"Note"_s, u"&NameX"_s}}));
    EXPECT_EQ(controls[2].source.Text(), u"SELECT * WHERE Note LIKE '&[Full Name]%'"_s);
    const ControlDef& byQuery = store.Forms()[1].controls[0];
    EXPECT_EQ(byQuery.name.Text(), u"Name"_s);
    EXPECT_EQ(SplitDropDown(byQuery.source.Text()).data, u"[Full Name]"_s);
    EXPECT_EQ(SplitDropDown(byQuery.source.Text()).query, u"SELECT Kind FROM Kinds"_s);
}

} // namespace
} // namespace mirel
