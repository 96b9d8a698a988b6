// Names of an open database that become others, and what refers to them.
#include "app/renaming.h"

#include "forms/control_source.h"
#include "forms/form_fixture.h"
#include "resources/string_table.h"

#include <QDir>
#include <QFile>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class RenamingTest : public ::testing::Test {
protected:
    void SetUp() override
    {
        ASSERT_TRUE(session_.Create(QDir(folder_.path()).filePath(u"a.cdb"_s)));
        Run(u"CREATE TABLE [Birds] ([Name] Varchar(40),[Price] Float)"_s);
        ASSERT_TRUE(session_.Store().Apply([](FormStore& store) {
            store.AddForm(FormBuilder(u"Birds", u"Entry").Edit(u"A", u"Birds.Name").form);
            store.AddForm(FormBuilder(u"Birds", u"Menu").Button(u"B", ButtonFunction::CallForm, u"Entry").form);
            QueryDef query;
            query.SetName(u"All");
            query.SetTableName(u"Birds");
            query.SetText(u"SELECT Name FROM Birds ORDER BY Name");
            store.AddQuery(query);
            return true;
        }));
        ASSERT_TRUE(session_.SetFavorites({u"query:All"_s, u"table:Birds"_s, u"form:Entry"_s}));
        prompt_.questions.clear();
    }

    void Run(const QString& statement)
    {
        ASSERT_TRUE(session_.GetCatalog().ExecuteStatement(session_.Location(), statement));
    }
    QString Source(const QString& form) { return session_.Store().FindForm(form)->controls[0].source.Text(); }
    QString Query() { return session_.Store().FindQuery(u"All")->text.Text(); }
    QStringList Tables()
    {
        QStringList tables;
        session_.ListTables(tables);
        return tables;
    }
    // What another program reads now.
    FormStore Stored()
    {
        FormStore store(session_.SideFile());
        EXPECT_TRUE(store.Load());
        return store;
    }

    QTemporaryDir folder_;
    ScriptedPrompt prompt_;
    DbConnection connection_;
    DatabaseSession session_{connection_, ProgramFolder{folder_.path()}, prompt_};
    MendingHost host_{session_};
    Renaming renaming_{session_};
};

TEST_F(RenamingTest, MendsWhatRefersToATableOrAField)
{
    TableDesigner designer(connection_, session_.Location(), prompt_, host_);
    ASSERT_TRUE(designer.Open(u"Birds"_s));
    FieldDesign field = designer.Fields()[0];
    field.name = u"Full Name"_s;
    EXPECT_FALSE(designer.ChangeField(0, field)) << "No keeps the name";
    EXPECT_EQ(prompt_.questions,
              QStringList{u"\"Name\" is used here:\r\nForm \"Entry\": 1 place\r\nQuery \"All\": 1 place\r\n"
                          "Shall all of these say \"Full Name\" from now on?"_s});
    EXPECT_EQ(designer.Fields()[0].name, u"Name"_s);
    EXPECT_EQ(Query(), u"SELECT Name FROM Birds ORDER BY Name"_s);
    prompt_.answers = {true, true};
    EXPECT_TRUE(designer.ChangeField(0, field));
    EXPECT_EQ(Source(u"Entry"_s), u"Birds.[Full Name]"_s);
    EXPECT_TRUE(designer.RenameTable(u"All Vögel"_s));
    EXPECT_EQ(Source(u"Entry"_s), u"[All Vögel].[Full Name]"_s);
    EXPECT_EQ(Query(), u"SELECT [Full Name] FROM [All Vögel] ORDER BY [Full Name]"_s);
    EXPECT_EQ(session_.Store().FindForm(u"Menu")->tableName.Text(), u"All Vögel"_s);
    EXPECT_EQ(session_.Favorites(), QStringList({u"query:All"_s, u"table:All Vögel"_s, u"form:Entry"_s}));
    EXPECT_EQ(Stored(), session_.Store());
    EXPECT_EQ(Tables(), QStringList{u"All Vögel"_s});
}

TEST_F(RenamingTest, RenamesFormsAndQueries)
{
    prompt_.answers = {true, true};
    EXPECT_TRUE(renaming_.RenameInStore(EntryKind::Form, u"Entry"_s, u" Start "_s));
    EXPECT_EQ(prompt_.questions[0], u"\"Entry\" is used here:\r\nForm \"Menu\": 1 place\r\nFavorites\r\n"
                                    "Shall all of these say \"Start\" from now on?"_s);
    EXPECT_EQ(Source(u"Menu"_s), u"Start"_s);
    EXPECT_NE(session_.Store().FindForm(u"Start"), nullptr);
    EXPECT_TRUE(renaming_.RenameInStore(EntryKind::Query, u"All"_s, u"Every"_s));
    EXPECT_EQ(session_.Favorites(), QStringList({u"query:Every"_s, u"table:Birds"_s, u"form:Start"_s}));
    EXPECT_EQ(Stored(), session_.Store());

    const FormStore before = session_.Store();
    EXPECT_FALSE(renaming_.RenameInStore(EntryKind::Form, u"Start"_s, u"Menu"_s));
    EXPECT_FALSE(renaming_.RenameInStore(EntryKind::Form, u"Start"_s, u"  "_s));
    EXPECT_FALSE(renaming_.RenameInStore(EntryKind::Form, u"Start"_s, QString(41, u'x')));
    EXPECT_FALSE(renaming_.RenameInStore(EntryKind::Form, u"Gone"_s, u"New"_s));
    EXPECT_EQ(prompt_.shown, QStringList({u"The name \"Menu\" is taken."_s, u"Please enter a name for the form."_s,
                                          StringText(Str::DesignNameTooLong, {QString(41, u'x'), u"40"_s}),
                                          u"\"Gone\" is not there any more."_s}));
    EXPECT_EQ(session_.Store(), before);
}

TEST_F(RenamingTest, IsAllOrNothing)
{
    TableDesigner designer(connection_, session_.Location(), prompt_, host_);
    ASSERT_TRUE(designer.Open(u"Birds"_s));
    // A store that cannot be written keeps the table's name, too.
    const QString forms = QFileInfo(session_.SideFile()).path();
    ASSERT_TRUE(QDir().rename(forms, forms + u'x'));
    prompt_.answers = {true};
    EXPECT_FALSE(designer.RenameTable(u"Other"_s));
    EXPECT_EQ(prompt_.shown.size(), 1) << prompt_.shown.join(u'\n').toStdString();
    EXPECT_EQ(Tables(), QStringList{u"Birds"_s});
    ASSERT_TRUE(QDir().rename(forms + u'x', forms));
    // So does a name that is taken the store.
    Run(u"CREATE TABLE [Taken] ([A] Integer)"_s);
    prompt_.answers = {true};
    EXPECT_FALSE(designer.RenameTable(u"taken"_s));
    EXPECT_EQ(Query(), u"SELECT Name FROM Birds ORDER BY Name"_s);
    EXPECT_EQ(FormStore(Stored()).Forms(), session_.Store().Forms());
}

} // namespace
} // namespace mirel
