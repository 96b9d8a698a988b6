// The program's window while a table changes under its views.
#include "app_ui/program_fixture.h"
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

class OpenViewsTest : public ProgramFixture {
protected:
    void SetUp() override
    {
        Start();
        ASSERT_TRUE(Commands().NewDatabase(PathOf(u"shop.cdb"_s)));
        ASSERT_TRUE(Execute(u"CREATE TABLE Birds (Name Varchar(40),Price Float)"_s));
        ASSERT_TRUE(Execute(u"INSERT INTO Birds (Name,Price) VALUES ('Kite',2)"_s));
        Session().Store().AddForm(FormBuilder(u"Birds", u"Entry").Edit(u"A", u"Birds.Name").form);
        Commands().Refill();
        State().SetTab(MainTab::Table);
        State().Select({EntryKind::Table, u"Birds"_s, {}, false});
        Show({700, 500});
        designer_ = std::make_unique<TableDesigner>(program_->connection, Session().Location(), prompt_,
                                                    Commands().Views());
        ASSERT_TRUE(designer_->Open(u"Birds"_s));
    }
    void TearDown() override { designer_.reset(); }
    CTableView* OpenBirds() { return OpenTable(u"Birds"_s); }
    void Give(ShellCommand command) { Command(command)->trigger(); }
    static QStringList Columns(const CTableView& view)
    {
        QStringList names;
        for (const ResultField& field : view.Browser().Fields())
            names += field.name;
        return names;
    }

    std::unique_ptr<TableDesigner> designer_;
};

TEST_F(OpenViewsTest, RunAgainAfterAChangeAndKeepWhatWasTyped)
{
    CTableView* view = OpenBirds();
    CFormEngView* form = Frame().OpenForm(*Commands().CallOfForm(u"Entry"_s));
    auto* grid = view->findChild<RecordGrid*>();
    QTest::keyClicks(grid, u"O"_s);
    ASSERT_TRUE(view->Browser().HasPendingEdit());
    EXPECT_TRUE(designer_->AddField({.name = u"Seen"_s, .type = FieldType::Date}));
    EXPECT_EQ(Columns(*view), QStringList({u"Name"_s, u"Price"_s, u"Seen"_s}));
    EXPECT_TRUE(designer_->MoveUp(1));
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
    EXPECT_FALSE(designer_->MoveUp(1));
    EXPECT_TRUE(view->Browser().HasPendingEdit());
    EXPECT_EQ(Columns(*view), QStringList({u"Price"_s, u"Name"_s, u"Seen"_s}));
    QTest::keyClick(line, Qt::Key_Escape);
}

TEST_F(OpenViewsTest, FollowNewNames)
{
    CTableView* view = OpenBirds();
    CFormEngView* form = Frame().OpenForm(*Commands().CallOfForm(u"Entry"_s));
    const QPointer<CFormEngView> formLives(form);
    FieldDesign field = designer_->Fields()[0];
    field.name = u"Full Name"_s;
    prompt_.answers = {true};
    EXPECT_TRUE(designer_->ChangeField(0, field));
    EXPECT_EQ(Columns(*view), QStringList({u"Full Name"_s, u"Price"_s}));
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_TRUE(formLives.isNull()) << "it shows what it was opened with";
    EXPECT_EQ(Commands().CallOfForm(u"Entry"_s)->form.controls[0].source.Text(), u"Birds.[Full Name]"_s);

    prompt_.texts = {u"All Birds"_s};
    prompt_.answers = {true};
    Give(ShellCommand::Rename);
    EXPECT_EQ(view->Browser().Statement(), u"SELECT * FROM [All Birds]"_s);
    EXPECT_EQ(view->Title(), u"All Birds"_s);
    EXPECT_EQ(State().Selected()->name, u"All Birds"_s);
    EXPECT_EQ(prompt_.shown, QStringList{u"Table \"Birds\" renamed to \"All Birds\"."_s});
}

TEST_F(OpenViewsTest, CloseWithTheirTable)
{
    const QPointer<CTableView> view(OpenBirds());
    const QPointer<CFormEngView> form(Frame().OpenForm(*Commands().CallOfForm(u"Entry"_s)));
    prompt_.answers = {true};
    Give(ShellCommand::Delete);
    EXPECT_EQ(prompt_.questions, QStringList{u"Are you sure you want to drop this table \"Birds\"?\r\n"
                                             "It holds 1 record, which goes with it."_s});
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_TRUE(view.isNull());
    EXPECT_TRUE(form.isNull());
    EXPECT_TRUE(State().Entries(MainTab::Table).empty());
}

} // namespace
} // namespace mirel
