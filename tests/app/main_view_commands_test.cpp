#include "app/main_view_commands.h"

#include "data/db_recordset.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const QString kSamples = QStringLiteral(MIREL_SOURCE_DIR "/samples");

class MainViewCommandsTest : public ::testing::Test {
protected:
    // A program from its start to its end; the folder outlives it.
    struct Program {
        Program(const ProgramFolder& folder, ScriptedPrompt& prompt)
            : settings(Profile(folder.ProfileFile()))
            , session(connection, folder, prompt)
            , commands(session, state, settings, SampleDatabase(folder, kSamples))
        {
        }

        void SelectOn(MainTab tab, QStringView name)
        {
            state.SetTab(tab);
            for (const MainEntry& entry : state.Entries(tab)) {
                if (entry.name == name)
                    state.Select(entry);
            }
            ASSERT_TRUE(state.Selected()) << name.toUtf8().toStdString();
        }
        bool Execute(const QString& statement)
        {
            const bool done = session.GetCatalog().ExecuteStatement(session.Location(), statement);
            commands.Refill();
            return done;
        }
        QStringList Names(MainTab tab) const
        {
            QStringList names;
            for (const MainEntry& entry : state.Entries(tab))
                names += entry.name;
            return names;
        }

        Settings settings;
        DbConnection connection;
        DatabaseSession session;
        MainViewState state;
        MainViewCommands commands;
    };

    void Start() { program_ = std::make_unique<Program>(ProgramFolder{folder_.path()}, prompt_); }
    void Restart()
    {
        program_->commands.KeepForNextRun();
        program_.reset();
        Start();
    }
    void SetUp() override { Start(); }

    QString PathOf(const QString& name) const { return QDir(folder_.path()).filePath(name); }
    bool MakeShop()
    {
        return program_->commands.NewDatabase(PathOf(u"shop"_s)) &&
               program_->Execute(u"CREATE TABLE [Order Details] ([Name] Varchar(40))"_s) &&
               program_->Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40))"_s);
    }

    QTemporaryDir folder_;
    ScriptedPrompt prompt_;
    std::unique_ptr<Program> program_;
};

TEST_F(MainViewCommandsTest, ANewDatabaseIsNamedStampedAndOpen)
{
    ASSERT_TRUE(program_->commands.NewDatabase(PathOf(u"shop"_s)));
    EXPECT_EQ(program_->state.DatabaseName(), u"shop.cdb"_s);
    EXPECT_EQ(program_->session.Stamp().size(), 14);
    EXPECT_FALSE(program_->commands.NewDatabase(PathOf(u"shop.cdb"_s))) << "one is there already";
    EXPECT_EQ(prompt_.shown.size(), 1);
    EXPECT_EQ(program_->state.DatabaseName(), u"shop.cdb"_s) << "a failure leaves the current one open";
}

TEST_F(MainViewCommandsTest, TheNextRunComesBackToWhatWasOpenAndSelected)
{
    ASSERT_TRUE(MakeShop());
    program_->SelectOn(MainTab::Table, u"Birds");
    ASSERT_TRUE(program_->commands.AddFavorite());
    program_->SelectOn(MainTab::Favorites, u"Birds");
    program_->state.SetOpensByDoubleTap(false);
    Restart();

    program_->commands.RestoreLastRun({});
    EXPECT_EQ(program_->state.DatabasePath(), PathOf(u"shop.cdb"_s));
    EXPECT_EQ(program_->state.Tab(), MainTab::Favorites);
    ASSERT_TRUE(program_->state.Selected());
    EXPECT_EQ(program_->state.Selected()->name, u"Birds"_s);
    EXPECT_EQ(program_->state.CurrentTable(), u"Birds"_s);
    EXPECT_FALSE(program_->state.OpensByDoubleTap());
}

TEST_F(MainViewCommandsTest, ADatabaseThatIsGoneIsReportedAndNoneIsOpen)
{
    ASSERT_TRUE(MakeShop());
    Restart();
    QFile::remove(PathOf(u"shop.cdb"_s));
    program_->commands.RestoreLastRun({});
    EXPECT_FALSE(program_->state.HasDatabase());
    EXPECT_EQ(prompt_.shown.size(), 1);
    EXPECT_TRUE(program_->settings.RecentDatabases().isEmpty());
}

TEST_F(MainViewCommandsTest, DeletingADatabaseAsksTwice)
{
    struct Row {
        const char* what;
        std::deque<bool> answers;
        bool deleted;
        qsizetype asked;
    };
    for (const Row& row : {Row{"No at once", {false}, false, 1}, Row{"No at last", {true, false}, false, 2},
                           Row{"twice Yes", {true, true}, true, 2}}) {
        if (!program_->session.IsOpen()) {
            ASSERT_TRUE(MakeShop());
        }
        const QString sideFile = program_->session.SideFile();
        prompt_.questions.clear();
        prompt_.answers = row.answers;
        EXPECT_EQ(program_->commands.DeleteDatabase(PathOf(u"shop.cdb"_s)), row.deleted) << row.what;
        EXPECT_EQ(prompt_.questions.size(), row.asked) << row.what;
        EXPECT_EQ(QFileInfo::exists(PathOf(u"shop.cdb"_s)), !row.deleted) << row.what;
        EXPECT_EQ(QFileInfo::exists(sideFile), !row.deleted) << row.what;
        EXPECT_EQ(program_->state.HasDatabase(), !row.deleted) << row.what;
    }
}

TEST_F(MainViewCommandsTest, DeletingATableTakesItsFavoriteAlong)
{
    ASSERT_TRUE(MakeShop());
    program_->SelectOn(MainTab::Table, u"Order Details");
    ASSERT_TRUE(program_->commands.AddFavorite());
    EXPECT_FALSE(program_->commands.AddFavorite()) << "it is one already";
    prompt_.answers = {false};
    EXPECT_FALSE(program_->commands.DeleteSelected());
    EXPECT_EQ(program_->Names(MainTab::Table), QStringList({u"Birds"_s, u"Order Details"_s}));
    prompt_.answers = {true};
    EXPECT_TRUE(program_->commands.DeleteSelected());
    EXPECT_EQ(program_->Names(MainTab::Table), QStringList{u"Birds"_s});
    EXPECT_TRUE(program_->Names(MainTab::Favorites).isEmpty());
}

TEST_F(MainViewCommandsTest, ARenamedEntryStaysSelectedAndAFavorite)
{
    ASSERT_TRUE(MakeShop());
    program_->SelectOn(MainTab::Table, u"Birds");
    ASSERT_TRUE(program_->commands.AddFavorite());
    prompt_.texts = {std::nullopt, u"Order Details"_s, u" Bees "_s};
    EXPECT_FALSE(program_->commands.RenameSelected()) << "Cancel";
    prompt_.answers = {true};
    EXPECT_FALSE(program_->commands.RenameSelected()) << "taken";
    EXPECT_EQ(program_->state.Selected()->name, u"Birds"_s);
    prompt_.answers = {true};
    EXPECT_TRUE(program_->commands.RenameSelected());
    EXPECT_EQ(prompt_.questions.last(),
              u"\"Birds\" is used here:\r\nFavorites\r\nShall all of these say \"Bees\" from now on?"_s);
    EXPECT_EQ(program_->state.Selected()->name, u"Bees"_s);
    EXPECT_EQ(program_->Names(MainTab::Favorites), QStringList{u"Bees"_s});
    EXPECT_FALSE(program_->state.Entries(MainTab::Favorites)[0].missing);
}

TEST_F(MainViewCommandsTest, RemovingAFavoriteKeepsTheTable)
{
    ASSERT_TRUE(MakeShop());
    program_->SelectOn(MainTab::Table, u"Birds");
    ASSERT_TRUE(program_->commands.AddFavorite());
    program_->SelectOn(MainTab::Favorites, u"Birds");
    EXPECT_FALSE(program_->commands.DeleteSelected());
    EXPECT_TRUE(program_->commands.RemoveFavorite());
    EXPECT_TRUE(prompt_.questions.isEmpty()) << "nothing is lost";
    EXPECT_TRUE(program_->Names(MainTab::Favorites).isEmpty());
    EXPECT_TRUE(program_->Names(MainTab::Table).contains(u"Birds"_s));
}

TEST_F(MainViewCommandsTest, AnEntryBecomesAStatementThatAFilterCanBeAppendedTo)
{
    ASSERT_TRUE(MakeShop());
    program_->SelectOn(MainTab::Table, u"Order Details");
    ASSERT_TRUE(program_->commands.RequestOfSelected());
    EXPECT_EQ(program_->commands.RequestOfSelected()->statement, u"SELECT * FROM [Order Details]"_s);
    program_->state.SetTab(MainTab::Form);
    EXPECT_FALSE(program_->commands.RequestOfSelected());
}

TEST_F(MainViewCommandsTest, NewSaysWhatMustBeChosenFirst)
{
    program_->state.SetTab(MainTab::Query);
    EXPECT_FALSE(program_->commands.New());
    EXPECT_EQ(prompt_.shown, QStringList{u"Please choose a Database and Table first."_s});
}

TEST_F(MainViewCommandsTest, NewGivesTheDefaultFormOfTheSelectedTableAndAsksFirst)
{
    ASSERT_TRUE(MakeShop());
    program_->SelectOn(MainTab::Table, u"Birds");
    program_->state.SetTab(MainTab::Form);
    prompt_.answers = {false, true};
    EXPECT_FALSE(program_->commands.New());
    const std::optional<FormDef> form = program_->commands.New();
    EXPECT_EQ(prompt_.questions.last(), u"Create a form based on the table \"Birds\" ?"_s);
    ASSERT_TRUE(form);
    EXPECT_EQ(form->name.Text(), u"DefaultForm"_s);
    EXPECT_EQ(form->tableName.Text(), u"Birds"_s);
    EXPECT_TRUE(program_->session.Store().Forms().empty()) << "it is saved in the form maker";
}

TEST_F(MainViewCommandsTest, TheSampleIsMadeOnceAndIsTheUsersFromThenOn)
{
    ASSERT_TRUE(program_->commands.OpenSample()) << prompt_.shown.join(u'\n').toStdString();
    EXPECT_EQ(program_->Names(MainTab::Table),
              QStringList({u"Airports"_s, u"Bird Strikes"_s, u"Contacts"_s, u"Orders"_s}));
    EXPECT_EQ(program_->Names(MainTab::Favorites).size(), 3);
    for (const MainEntry& favorite : program_->state.Entries(MainTab::Favorites))
        EXPECT_FALSE(favorite.missing) << favorite.name.toStdString();

    ASSERT_TRUE(program_->Execute(u"DROP TABLE [Airports]"_s));
    Restart();
    ASSERT_TRUE(program_->commands.OpenSample());
    EXPECT_FALSE(program_->Names(MainTab::Table).contains(u"Airports"_s));
    EXPECT_FALSE(QFileInfo::exists(PathOf(u"Sample.cdb.new"_s)));
}

// Every query that the sample brings along must run, and every row of its files must have come in.
TEST_F(MainViewCommandsTest, TheSamplesTablesAndQueriesHoldTheirRecords)
{
    ASSERT_TRUE(program_->commands.OpenSample());
    const std::pair<QString, int> expected[] = {
        {u"SELECT COUNT(*) FROM [Bird Strikes]"_s, 10000},
        {u"SELECT COUNT(*) FROM Airports"_s, 3376},
        {u"SELECT COUNT(*) FROM Contacts WHERE Friend = 1"_s, 7},
        {u"SELECT COUNT(*) FROM Orders WHERE Ordered >= '2001-06-01'"_s, 6}};
    DbRecordset counter(program_->connection);
    for (const auto& [statement, count] : expected) {
        ASSERT_TRUE(
            counter.Open(statement, program_->session.Location(), CursorType::ForwardOnly, LockType::ReadOnly))
            << statement.toStdString();
        EXPECT_EQ(counter.FieldValue(0).Number(), count) << statement.toStdString();
    }
    ASSERT_FALSE(program_->state.Entries(MainTab::Query).empty());
    for (const QString& name : program_->Names(MainTab::Query)) {
        program_->SelectOn(MainTab::Query, name);
        const std::optional<TableRequest> request = program_->commands.RequestOfSelected();
        ASSERT_TRUE(request) << name.toStdString();
        EXPECT_TRUE(counter.Open(request->statement, program_->session.Location(), CursorType::ForwardOnly,
                                 LockType::ReadOnly))
            << name.toStdString();
        EXPECT_FALSE(counter.IsEof()) << name.toStdString();
    }
}

TEST_F(MainViewCommandsTest, ASampleThatCannotBeMadeLeavesNothingBehind)
{
    QDir().mkdir(PathOf(u"Sample.cdb.new"_s)); // a folder is in the way
    EXPECT_FALSE(program_->commands.OpenSample());
    EXPECT_FALSE(prompt_.shown.isEmpty());
    EXPECT_FALSE(QFileInfo::exists(PathOf(u"Sample.cdb"_s)));
    EXPECT_FALSE(program_->state.HasDatabase());
}

} // namespace
} // namespace mirel
