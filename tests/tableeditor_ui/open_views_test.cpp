// The program's window while a table changes under its views.
#include "app/ui/main_frame.h"
#include "app/ui/shell_actions.h"
#include "forms/form_fixture.h"
#include "forms/ui/form_eng_view.h"
#include "tableview/ui/cell_strip.h"
#include "tableview/ui/record_grid.h"
#include "tableview/ui/table_view.h"

#include <QAction>
#include <QApplication>
#include <QDir>
#include <QLineEdit>
#include <QPointer>
#include <QTest>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class OpenViewsTest : public ::testing::Test {
protected:
    void SetUp() override
    {
        ASSERT_TRUE(commands_.NewDatabase(QDir(folder_.path()).filePath(u"shop.cdb"_s)));
        ASSERT_TRUE(Execute(u"CREATE TABLE Birds (Name Varchar(40),Price Float)"_s));
        ASSERT_TRUE(Execute(u"INSERT INTO Birds (Name,Price) VALUES ('Kite',2)"_s));
        session_.Store().AddForm(FormBuilder(u"Birds", u"Entry").Edit(u"A", u"Birds.Name").form);
        commands_.Refill();
        state_.SetTab(MainTab::Table);
        state_.Select({EntryKind::Table, u"Birds"_s, {}, false});
        frame_.ShowState();
        frame_.show();
        ASSERT_TRUE(designer_.Open(u"Birds"_s));
    }
    bool Execute(const QString& statement)
    {
        return session_.GetCatalog().ExecuteStatement(session_.Location(), statement);
    }
    CTableView* OpenBirds()
    {
        return qobject_cast<CTableView*>(frame_.OpenTable({u"Birds"_s, u"SELECT * FROM Birds"_s, u"Birds"_s}));
    }
    void Give(ShellCommand command) { frame_.findChild<ShellActions*>()->Of(command)->trigger(); }
    static QStringList Columns(const CTableView& view)
    {
        QStringList names;
        for (const ResultField& field : view.Browser().Fields())
            names += field.name;
        return names;
    }

    QTemporaryDir folder_;
    ProgramFolder programFolder_{folder_.path()};
    ScriptedPrompt prompt_;
    Profile profile_{programFolder_.ProfileFile()};
    Settings settings_{profile_};
    DbConnection connection_;
    DatabaseSession session_{connection_, programFolder_, prompt_};
    MainViewState state_;
    MainViewCommands commands_{session_, state_, settings_, SampleDatabase(programFolder_, {})};
    CMainFrame frame_{session_, state_, commands_, settings_, profile_};
    TableDesigner designer_{connection_, QDir(folder_.path()).filePath(u"shop.cdb"_s), prompt_, commands_.Views()};
};

TEST_F(OpenViewsTest, RunAgainAfterAChangeAndKeepWhatWasTyped)
{
    CTableView* view = OpenBirds();
    CFormEngView* form = frame_.OpenForm(*commands_.CallOfForm(u"Entry"_s));
    auto* grid = view->findChild<RecordGrid*>();
    QTest::keyClicks(grid, u"O"_s);
    ASSERT_TRUE(view->Browser().HasPendingEdit());
    EXPECT_TRUE(designer_.AddField({.name = u"Seen"_s, .type = FieldType::Date}));
    EXPECT_EQ(Columns(*view), QStringList({u"Name"_s, u"Price"_s, u"Seen"_s}));
    EXPECT_TRUE(designer_.MoveUp(1));
    EXPECT_EQ(Columns(*view), QStringList({u"Price"_s, u"Name"_s, u"Seen"_s}));
    EXPECT_EQ(form->Form().ShownText(0), u"O"_s);
    EXPECT_EQ(prompt_.shown, QStringList());

    // A value that its field refuses stops the change.
    grid->setFocus();
    QTest::keyClick(grid, Qt::Key_End);
    QTest::keyClick(grid, Qt::Key_Left);
    auto* line = view->findChild<CellStrip*>()->findChild<QLineEdit*>();
    line->selectAll();
    QTest::keyClicks(line, QString(41, u'x'));
    ASSERT_TRUE(view->Browser().HasPendingEdit());
    EXPECT_FALSE(designer_.MoveUp(1));
    EXPECT_TRUE(view->Browser().HasPendingEdit());
    EXPECT_EQ(Columns(*view), QStringList({u"Price"_s, u"Name"_s, u"Seen"_s}));
    QTest::keyClick(line, Qt::Key_Escape);
}

TEST_F(OpenViewsTest, FollowNewNames)
{
    CTableView* view = OpenBirds();
    CFormEngView* form = frame_.OpenForm(*commands_.CallOfForm(u"Entry"_s));
    const QPointer<CFormEngView> formLives(form);
    FieldDesign field = designer_.Fields()[0];
    field.name = u"Full Name"_s;
    prompt_.answers = {true};
    EXPECT_TRUE(designer_.ChangeField(0, field));
    EXPECT_EQ(Columns(*view), QStringList({u"Full Name"_s, u"Price"_s}));
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_TRUE(formLives.isNull()) << "it shows what it was opened with";
    EXPECT_EQ(commands_.CallOfForm(u"Entry"_s)->form.controls[0].source.Text(), u"Birds.[Full Name]"_s);

    prompt_.texts = {u"All Birds"_s};
    prompt_.answers = {true};
    Give(ShellCommand::Rename);
    EXPECT_EQ(view->Browser().Statement(), u"SELECT * FROM [All Birds]"_s);
    EXPECT_EQ(view->Title(), u"All Birds"_s);
    EXPECT_EQ(state_.Selected()->name, u"All Birds"_s);
    EXPECT_EQ(prompt_.shown, QStringList{u"Table \"Birds\" renamed to \"All Birds\"."_s});
}

TEST_F(OpenViewsTest, CloseWithTheirTable)
{
    const QPointer<CTableView> view(OpenBirds());
    const QPointer<CFormEngView> form(frame_.OpenForm(*commands_.CallOfForm(u"Entry"_s)));
    prompt_.answers = {true};
    Give(ShellCommand::Delete);
    EXPECT_EQ(prompt_.questions, QStringList{u"Are you sure you want to drop this table \"Birds\"?\r\n"
                                             "It holds 1 record(s), which go with it."_s});
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_TRUE(view.isNull());
    EXPECT_TRUE(form.isNull());
    EXPECT_TRUE(state_.Entries(MainTab::Table).empty());
}

} // namespace
} // namespace mirel
