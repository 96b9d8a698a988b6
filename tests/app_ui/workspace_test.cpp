// The main window with its views: side bar and tabs when it is wide, one view in front when it is narrow.
#include "app/form_view_options.h"
#include "app/table_view_options.h"
#include "app/ui/entry_panel.h"
#include "app/ui/lumo_view.h"
#include "app/ui/side_bar.h"
#include "app/ui/side_tree.h"
#include "app/ui/view_window.h"
#include "app_ui/program_fixture.h"
#include "forms/ui/form_eng_view.h"
#include "querybuilder/ui/query_dialog.h"
#include "querybuilder/ui/statement_edit.h"
#include "resources/string_table.h"
#include "support/printing.h"
#include "support/sqlite_file.h"
#include "support/ui/window_sizes.h"
#include "tableview/ui/record_grid.h"
#include "tableview/ui/table_view.h"

#include <gtest/gtest.h>

#include <QAbstractButton>
#include <QAbstractSpinBox>
#include <QApplication>
#include <QComboBox>
#include <QDir>
#include <QFile>
#include <QLabel>
#include <QLineEdit>
#include <QMenuBar>
#include <QPushButton>
#include <QTabBar>
#include <QTemporaryDir>
#include <QTest>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const ViewKey kBirds{EntryKind::Table, u"Birds"_s};
const ViewKey kBees{EntryKind::Table, u"Bees"_s};
const ViewKey kBirdForm{EntryKind::Form, u"Bird form"_s};

// A database with tables, a form and a query.
class WorkspaceTest : public ProgramFixture {
protected:
    void SetUp() override
    {
        Start();
        ASSERT_TRUE(Commands().NewDatabase(PathOf(u"shop.cdb"_s)));
        EXPECT_TRUE(Execute(u"CREATE TABLE Birds ([Name] Varchar(40),[Wings] SmallInt)"_s));
        EXPECT_TRUE(Execute(u"CREATE TABLE Bees (Stripes SmallInt)"_s));
        for (const QString& name : {u"Wren"_s, u"Owl"_s, u"Rook"_s})
            EXPECT_TRUE(Execute(u"INSERT INTO Birds (Name,Wings) VALUES ('%1',2)"_s.arg(name)));
        AddForm();
        Commands().Refill();
        Show(kDesktop);
    }

    // As another program does it.
    void ExecuteElsewhere(const QString& statement)
    {
        DbConnection other;
        EXPECT_TRUE(Catalog(other, prompt_).ExecuteStatement(PathOf(u"shop.cdb"_s), statement));
    }
    void AddForm()
    {
        ControlDef box;
        box.type = ControlType::EditBox;
        box.name.Set(u"Name");
        box.hasSource = 1;
        box.SetSource(u"Birds.Name");
        box.left = box.top = 5;
        box.width = 100;
        box.height = 18;
        FormDef form;
        form.SetName(u"Bird form");
        form.SetTableName(u"Birds");
        form.SetDefaultQuery(u"SELECT * FROM Birds");
        form.defaultQueryOnStartup = 1;
        form.AddControl(box);
        EXPECT_TRUE(
            program_->session.Store().Apply([&form](FormStore& store) { return store.AddForm(form), true; }));
    }
    QTabBar& Bar() { return *Tabs().findChild<QTabBar*>(u"views"_s); }
    SideTree& Tree() { return *Frame().findChild<SideTree*>(); }
    CTableView* Open(const ViewKey& key) { return qobject_cast<CTableView*>(Frame().OpenView(key)); }
    QStringList MenuTitles()
    {
        QStringList titles;
        for (const QAction* action : Frame().menuBar()->actions())
            titles += QString(action->text()).remove(u'&');
        return titles;
    }
    // What a person's tap on an entry of the side bar does.
    void TapEntry(MainTab section, int row, bool twice = false)
    {
        QTreeWidgetItem* heading = Tree().topLevelItem(int(section));
        const QPoint at = Tree().visualItemRect(row < 0 ? heading : heading->child(row)).center();
        QTest::mouseClick(Tree().viewport(), Qt::LeftButton, {}, at);
        if (twice)
            QTest::mouseDClick(Tree().viewport(), Qt::LeftButton, {}, at);
    }
    static void PassOneLook() { QTest::qWait(1300); }
};

TEST_F(WorkspaceTest, CrossingTheWidthClosesNothingAndKeepsWhatIsInFront)
{
    Open(kBees);
    CTableView* birds = Open(kBirds);
    ASSERT_TRUE(birds);
    QTest::keyClick(birds->findChild<RecordGrid*>(), Qt::Key_M);
    ASSERT_TRUE(birds->isWindowModified());
    for (const QSize& size :
         {kHandheld, kDesktop, QSize(200, 200), QSize(4000, 3000), QSize(639, 700), QSize(640, 480)}) {
        Frame().resize(size);
        QCoreApplication::processEvents();
        const bool wide = size.width() >= CMainFrame::kLeastWideWidth;
        EXPECT_EQ(Tabs().Count(), 2);
        EXPECT_EQ(Tabs().Front(), birds) << size.width();
        EXPECT_TRUE(birds->isVisible()) << size.width();
        EXPECT_TRUE(birds->isWindowModified()) << "typed text stays";
        EXPECT_EQ(Frame().findChild<SideBar*>()->isVisible(), wide) << size.width();
        EXPECT_EQ(Bar().isVisible(), wide) << size.width();
    }
    Frame().resize(kHandheld);
    Command(ShellCommand::ShowLists)->trigger();
    EXPECT_TRUE(Frame().findChild<CLumoView*>()->isVisible());
    EXPECT_EQ(Tabs().Count(), 2);
    Command(ShellCommand::NextView)->trigger();
    EXPECT_EQ(Tabs().Front(), birds);
}

TEST_F(WorkspaceTest, TheMenusAreThoseOfTheViewInFrontThenTheWindowsWithOneFile)
{
    const QStringList frames{u"Database"_s, u"Window"_s, u"Help"_s};
    EXPECT_EQ(MenuTitles(), QStringList{u"File"_s} + frames);
    Open(kBirds);
    EXPECT_EQ(MenuTitles(), (QStringList{u"File"_s, u"Edit"_s, u"Tools"_s} + frames));
    Frame().OpenView(kBirdForm);
    EXPECT_EQ(MenuTitles(), (QStringList{u"File"_s, u"Record"_s, u"View"_s} + frames));
    Frame().resize(kHandheld);
    EXPECT_EQ(MenuTitles(), (QStringList{u"File"_s, u"Record"_s, u"View"_s})) << "the rest is in File";
    QStringList inFile;
    for (const QAction* entry : Frame().menuBar()->actions().first()->menu()->actions())
        inFile += QString(entry->text()).remove(u'&');
    for (const QString& entry : {u"Database"_s, u"Help"_s, u"Side Bar"_s, u"Close"_s, u"Exit"_s})
        EXPECT_EQ(inFile.count(entry), 1) << entry.toStdString();
}

TEST_F(WorkspaceTest, OpensFromTheSideBarByTheTapThatTheUserChose)
{
    TapEntry(MainTab::Table, 1);
    EXPECT_EQ(program_->state.Selected()->name, u"Birds"_s);
    EXPECT_EQ(Tabs().Count(), 0);
    TapEntry(MainTab::Table, 1, true);
    ASSERT_EQ(Tabs().Count(), 1);
    EXPECT_EQ(Tabs().KeyAt(0), kBirds);
    TapEntry(MainTab::Table, 1, true);
    EXPECT_EQ(Tabs().Count(), 1) << "it comes forward again";
    program_->state.SetOpensByDoubleTap(false);
    TapEntry(MainTab::Table, 0);
    EXPECT_EQ(Tabs().Count(), 2);
    Tree().setFocus();
    QTest::keyClick(&Tree(), Qt::Key_Down);
    QTest::keyClick(&Tree(), Qt::Key_Return);
    EXPECT_EQ(Tabs().Count(), 2) << "Birds was open";
    EXPECT_EQ(Tabs().KeyAt(Tabs().Current()), kBirds);
}

TEST_F(WorkspaceTest, NewActsOnTheSectionOfTheCurrentEntry)
{
    TapEntry(MainTab::Table, 1);
    TapEntry(MainTab::Form, 0);
    prompt_.answers = {false};
    Command(ShellCommand::New)->trigger();
    ASSERT_EQ(prompt_.questions.size(), 1);
    EXPECT_TRUE(prompt_.questions.last().contains(u"\"Birds\""_s)) << prompt_.questions.last().toStdString();
    TapEntry(MainTab::Query, -1);
    EXPECT_EQ(program_->state.Tab(), MainTab::Query);
    EXPECT_FALSE(Command(ShellCommand::Delete)->isEnabled()) << "a heading is nothing to delete";
}

TEST_F(WorkspaceTest, FavoritesAreTakenOffInOneWay)
{
    TapEntry(MainTab::Table, 1);
    Command(ShellCommand::AddFavorites)->trigger();
    EXPECT_FALSE(Command(ShellCommand::RemoveFavorites)->isEnabled());
    EXPECT_TRUE(Command(ShellCommand::Delete)->isEnabled());
    TapEntry(MainTab::Favorites, 0);
    EXPECT_FALSE(Command(ShellCommand::Delete)->isEnabled());
    Command(ShellCommand::RemoveFavorites)->trigger();
    EXPECT_TRUE(program_->session.Favorites().isEmpty());
    EXPECT_EQ(program_->state.Entries(MainTab::Table).size(), 2U);
}

TEST_F(WorkspaceTest, TheSearchGoesThroughAllKinds)
{
    auto* search = Frame().findChild<QLineEdit*>(u"sideBarSearch"_s);
    QTest::keyClicks(search, u"bird"_s);
    EXPECT_EQ(Tree().topLevelItem(int(MainTab::Table))->childCount(), 1);
    EXPECT_EQ(Tree().topLevelItem(int(MainTab::Form))->childCount(), 1);
    TapEntry(MainTab::Form, 0, true);
    EXPECT_EQ(Tabs().KeyAt(0), kBirdForm);
    EXPECT_EQ(Tree().topLevelItem(int(MainTab::Table))->childCount(), 1) << "choosing does not end the search";
    QTest::keyClick(search, Qt::Key_Escape);
    EXPECT_EQ(Tree().topLevelItem(int(MainTab::Table))->childCount(), 2);
}

TEST_F(WorkspaceTest, TabsHaveTheirKeys)
{
    Open(kBees);
    CTableView* birds = Open(kBirds);
    Frame().OpenView(kBirdForm);
    QTest::keyClick(&Frame(), Qt::Key_Tab, Qt::ControlModifier);
    EXPECT_EQ(Tabs().Current(), 0);
    QTest::keyClick(&Frame(), Qt::Key_Backtab, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(Tabs().Current(), 2);
    Tabs().BringForward(1);
    EXPECT_EQ(QApplication::focusWidget(), birds->findChild<RecordGrid*>());
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_N, Qt::ControlModifier);
    EXPECT_EQ(birds->Browser().KnownCount(), 4) << "the view's key, not that of the side bar";
    QTest::keyClick(&Frame(), Qt::Key_W, Qt::ControlModifier);
    EXPECT_EQ(Tabs().Count(), 2);
}

TEST_F(WorkspaceTest, TabsComeBackInTheirOrder)
{
    Open(kBees);
    Open(kBirds);
    Frame().OpenView(kBirdForm);
    Bar().moveTab(2, 0);
    Tabs().BringForward(kBees);
    Restart(kDesktop);
    ASSERT_EQ(Tabs().Count(), 3);
    EXPECT_EQ(Tabs().KeyAt(0), kBirdForm);
    EXPECT_EQ(Tabs().KeyAt(1), kBees);
    EXPECT_EQ(Tabs().Current(), 1);
    EXPECT_TRUE(Tabs().Front());
    EXPECT_FALSE(Tabs().ViewAt(2)) << "it is read when it comes to the front";
    Tabs().BringForward(2);
    EXPECT_TRUE(Tabs().Front());

    ExecuteElsewhere(u"DROP TABLE Bees"_s);
    Restart(kDesktop);
    EXPECT_EQ(Tabs().Count(), 2);
    EXPECT_EQ(prompt_.shown, QStringList());
}

TEST_F(WorkspaceTest, AViewMovesToAWindowOfItsOwnAndBack)
{
    CTableView* birds = Open(kBirds);
    QTest::keyClick(birds->findChild<RecordGrid*>(), Qt::Key_Down);
    Command(ShellCommand::OpenInWindow)->trigger();
    auto* window = Frame().findChild<CViewWindow*>();
    ASSERT_TRUE(window);
    EXPECT_TRUE(birds->isVisible());
    EXPECT_EQ(Tabs().Count(), 0);
    EXPECT_TRUE(window->windowTitle().startsWith(u"Birds"_s));
    EXPECT_EQ(Open(kBirds), birds) << "it comes forward";
    for (const QAction* entry : window->menuBar()->actions().first()->menu()->actions()) {
        if (entry->text() == StringText(Str::CommandShowAsTab))
            const_cast<QAction*>(entry)->trigger();
    }
    EXPECT_EQ(Tabs().Front(), birds);
    EXPECT_EQ(birds->Browser().SelectedRecord(), 1) << "as it was left";

    Command(ShellCommand::OpenInWindow)->trigger();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    window = Frame().findChild<CViewWindow*>();
    ASSERT_TRUE(window);
    EXPECT_TRUE(window->close());
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_TRUE(Frame().findChildren<CTableView*>().isEmpty());
}

TEST_F(WorkspaceTest, WhatOneViewWritesTheOthersShowAtOnce)
{
    CTableView* birds = Open(kBirds);
    Command(ShellCommand::OpenInWindow)->trigger();
    Open({EntryKind::Table, u"Bees"_s});
    QTest::keyClick(birds->findChild<RecordGrid*>(), Qt::Key_End, Qt::ControlModifier);
    auto* form = qobject_cast<CFormEngView*>(Frame().OpenView(kBirdForm));
    ASSERT_TRUE(form);
    EXPECT_EQ(birds->Browser().CounterText(), u"3/3"_s);
    for (QAction* action : form->actions()) {
        if (action->text() == StringText(Str::FormAdd))
            action->trigger();
    }
    QTest::qWait(50);
    EXPECT_EQ(birds->Browser().CounterText(), u"3/4"_s) << "the selection stays on its record";
}

TEST_F(WorkspaceTest, OptionsOfOneViewReachAllThatAreOpen)
{
    EXPECT_TRUE(Execute(u"ALTER TABLE Birds ADD COLUMN Rare Bit"_s));
    EXPECT_TRUE(Execute(u"UPDATE Birds SET Rare=1"_s));
    CTableView* birds = Open(kBirds);
    Command(ShellCommand::OpenInWindow)->trigger(); // in a window of its own
    auto* form = qobject_cast<CFormEngView*>(Frame().OpenView(kBirdForm));
    CTableView* bees = Open(kBees);
    ASSERT_TRUE(birds && form && bees);
    const auto shown = [birds] { return birds->Browser().Page().At(0, 2).text; };
    EXPECT_EQ(shown(), u"Yes"_s);

    TableViewSettings options = ReadTableViewSettings(program_->settings);
    options.words = {u"Ja"_s, u"Nein"_s};
    options.maxColumnChars = 7;
    Q_EMIT bees->settingsChanged(options);
    EXPECT_EQ(shown(), u"Ja"_s);
    EXPECT_EQ(ReadFormViewSettings(program_->settings).words.yes, u"Ja"_s);

    FormViewSettings ofForms = ReadFormViewSettings(program_->settings);
    ofForms.words = {u"Oui"_s, u"Non"_s};
    Q_EMIT form->settingsChanged(ofForms);
    EXPECT_EQ(shown(), u"Oui"_s);
    EXPECT_EQ(ReadTableViewSettings(program_->settings).maxColumnChars, 7) << "written back by nobody";
    EXPECT_EQ(Open(kBirds)->Browser().Page().At(0, 2).text, u"Oui"_s);
}

TEST_F(WorkspaceTest, TakesUpWhatOtherProgramsChange)
{
    const CTableView* birds = Open(kBirds);
    QTest::qWait(100);
    ExecuteElsewhere(u"INSERT INTO Birds (Name) VALUES ('Jay')"_s);
    ExecuteElsewhere(u"CREATE TABLE Ants (A SmallInt)"_s);
    PassOneLook();
    EXPECT_EQ(birds->Browser().CounterText(), u"1/4"_s);
    EXPECT_EQ(Tree().topLevelItem(int(MainTab::Table))->childCount(), 3);
    ExecuteElsewhere(u"DROP TABLE Birds"_s);
    PassOneLook();
    EXPECT_EQ(Tabs().Count(), 0) << "what it showed is gone";
    EXPECT_EQ(prompt_.shown, QStringList());
}

TEST_F(WorkspaceTest, ADatabaseThatIsGoneIsToldOnceAndQuietly)
{
    Open(kBirds);
    QTest::qWait(100);
    ASSERT_TRUE(QFile::rename(PathOf(u"shop.cdb"_s), PathOf(u"moved.cdb"_s)));
    PassOneLook();
    EXPECT_EQ(prompt_.shown, QStringList());
    EXPECT_EQ(Tabs().Count(), 1);
    bool told = false;
    for (const QLabel* label : Frame().findChildren<QLabel*>())
        told = told || (label->isVisible() && label->text().startsWith(u"shop.cdb is gone"_s));
    EXPECT_TRUE(told);
}

TEST_F(WorkspaceTest, ADroppedTableClosesItsViewAndNoOther)
{
    Open(kBees);
    Open(kBirds);
    TapEntry(MainTab::Table, 1);
    prompt_.answers = {false};
    Command(ShellCommand::Delete)->trigger();
    EXPECT_EQ(Tabs().Count(), 2) << "No is harmless";
    prompt_.answers = {true};
    Command(ShellCommand::Delete)->trigger();
    ASSERT_EQ(Tabs().Count(), 1);
    EXPECT_EQ(Tabs().KeyAt(0), kBees);
    EXPECT_EQ(prompt_.shown, QStringList());
}

TEST_F(WorkspaceTest, AnotherDatabaseThatDoesNotOpenLeavesAllAsItIs)
{
    Open(kBirds);
    Open(kBees);
    QFile letter(PathOf(u"letter.cdb"_s));
    ASSERT_TRUE(letter.open(QIODevice::WriteOnly));
    letter.write(QByteArray(5000, 'x'));
    letter.close();
    EXPECT_FALSE(program_->commands.OpenDatabase(letter.fileName()));
    EXPECT_FALSE(program_->commands.OpenDatabase(PathOf(u"no such.cdb"_s)));
    EXPECT_FALSE(program_->commands.NewDatabase(PathOf(u"shop.cdb"_s)));
    EXPECT_EQ(prompt_.shown.size(), 3);
    EXPECT_FALSE(program_->commands.DeleteDatabase(QString()));
    EXPECT_FALSE(program_->commands.DeleteDatabase(PathOf(u"no such.cdb"_s)));
    EXPECT_FALSE(program_->commands.DeleteDatabase(letter.fileName()));
    EXPECT_EQ(prompt_.questions, QStringList()) << "nothing is asked about what is no database";
    EXPECT_EQ(program_->state.DatabaseName(), u"shop.cdb"_s);
    ASSERT_EQ(Tabs().Count(), 2);
    EXPECT_EQ(Open(kBirds)->Browser().CounterText(), u"1/3"_s) << "it works on";
}

TEST_F(WorkspaceTest, QuestionsComeBeforeAnyViewIsClosed)
{
    Open(kBirds);
    auto* form = qobject_cast<CFormEngView*>(Frame().OpenView(kBirdForm));
    ASSERT_TRUE(form);
    QTest::keyClicks(QApplication::focusWidget(), u"x"_s);
    ASSERT_TRUE(form->isWindowModified());
    prompt_.answers = {};
    EXPECT_FALSE(program_->commands.NewDatabase(PathOf(u"other.cdb"_s)));
    EXPECT_FALSE(QFile::exists(PathOf(u"other.cdb"_s))) << "nothing is left of it";
    prompt_.answers = {true, true, false};
    EXPECT_FALSE(program_->commands.DeleteDatabase(PathOf(u"shop.cdb"_s)));
    EXPECT_FALSE(Frame().close());
    EXPECT_EQ(Tabs().Count(), 2);
    EXPECT_TRUE(form->isWindowModified());
    EXPECT_EQ(program_->state.DatabaseName(), u"shop.cdb"_s);
    prompt_.answers = {true};
    EXPECT_TRUE(program_->commands.NewDatabase(PathOf(u"other.cdb"_s)));
    EXPECT_EQ(Tabs().Count(), 0);
    EXPECT_EQ(program_->state.DatabaseName(), u"other.cdb"_s);
}

TEST_F(WorkspaceTest, OneViewAloneEndsTheProgramWhenItCloses)
{
    Frame().BeAlone(kBirds);
    CTableView* birds = Open(kBirds);
    ASSERT_TRUE(birds);
    EXPECT_FALSE(Frame().findChild<SideBar*>()->isVisible());
    EXPECT_FALSE(Bar().isVisible());
    EXPECT_TRUE(birds->close());
    EXPECT_FALSE(Frame().isVisible());
}

TEST_F(WorkspaceTest, NoNameAndNoNumberOfTablesIsTooMuch)
{
    const QString longName = u"Long & long "_s + QString(100, u'w');
    Execute(u"CREATE TABLE [%1] (A SmallInt)"_s.arg(longName));
    QByteArray statements = "BEGIN;";
    for (int i = 0; i < 2000; ++i)
        statements += "CREATE TABLE T" + QByteArray::number(i) + " (A SMALLINT);";
    SqliteFile(PathOf(u"shop.cdb"_s)).Run(statements + "COMMIT;");
    program_->commands.Refill();
    Frame().ShowState();
    EXPECT_EQ(Tree().topLevelItem(int(MainTab::Table))->childCount(), 2003);
    ASSERT_TRUE(Open({EntryKind::Table, longName}));
    for (int i = 0; i < 30; ++i)
        Open({EntryKind::Table, u"T%1"_s.arg(i)});
    for (const QSize& size : {QSize(200, 200), QSize(640, 480), kDesktop, QSize(4000, 3000)}) {
        Frame().resize(size);
        QCoreApplication::processEvents();
        EXPECT_EQ(Frame().size(), size) << "nothing widens the window";
    }
}

TEST_F(WorkspaceTest, EveryPartHasANameForThoseWhoDoNotSee)
{
    Open(kBirds);
    Frame().OpenView(kBirdForm);
    for (const QSize& size : {kDesktop, kHandheld}) {
        Frame().resize(size);
        Command(ShellCommand::ShowLists)->trigger();
        QCoreApplication::processEvents();
        for (const QWidget* widget : Frame().findChildren<QWidget*>()) {
            if (!widget->isVisible() || widget->focusPolicy() == Qt::NoFocus || widget->focusProxy())
                continue;
            const auto* button = qobject_cast<const QAbstractButton*>(widget);
            const bool named = !widget->accessibleName().isEmpty() || (button && !button->text().isEmpty()) ||
                               (button && !button->toolTip().isEmpty());
            EXPECT_TRUE(named) << widget->metaObject()->className() << " " << widget->objectName().toStdString();
        }
    }
}

TEST_F(WorkspaceTest, AQueryIsWrittenOpenedAndChangedWithItsViewFollowing)
{
    const auto inBuilder = [&](ShellCommand command, const std::function<void(CQueryDialog&)>& work) {
        QTimer::singleShot(0, &Frame(), [&] {
            auto* dialog = qobject_cast<CQueryDialog*>(QApplication::activeModalWidget());
            ASSERT_TRUE(dialog);
            work(*dialog);
        });
        Command(command)->trigger();
    };
    const auto sql = [](CQueryDialog& dialog) -> StatementEdit& {
        return *dialog.findChild<StatementEdit*>(u"sql"_s);
    };
    const ViewKey few{EntryKind::Query, u"Few"_s};

    for (const QSize size : {kDesktop, kHandheld}) {
        Frame().resize(size);
        State().SetTab(MainTab::Table); // a new query is about the chosen table
        State().Select({EntryKind::Table, kBirds.name, {}, false});
        State().SetTab(MainTab::Query);
        const QString statement = size == kDesktop ? u"SELECT Name FROM Birds"_s : u"SELECT Wings FROM Birds"_s;
        if (size == kDesktop) {
            inBuilder(ShellCommand::New, [&](CQueryDialog& dialog) {
                QTest::keyClicks(dialog.findChild<QLineEdit*>(u"queryName"_s), few.name);
                sql(dialog).setPlainText(statement);
                dialog.findChild<QPushButton*>(u"save"_s)->click();
            });
            ASSERT_TRUE(std::as_const(Session().Store()).FindQuery(few.name))
                << prompt_.shown.join(u' ').toStdString();
            ASSERT_TRUE(Open(few)) << prompt_.shown.join(u' ').toStdString();
        } else {
            State().Select({EntryKind::Query, few.name, {}, false});
            inBuilder(ShellCommand::Edit, [&](CQueryDialog& dialog) {
                EXPECT_EQ(sql(dialog).toPlainText(), u"SELECT Name FROM Birds"_s);
                sql(dialog).setPlainText(statement);
                dialog.findChild<QPushButton*>(u"save"_s)->click();
            });
        }
        ASSERT_TRUE(std::as_const(Session().Store()).FindQuery(few.name));
        EXPECT_EQ(std::as_const(Session().Store()).FindQuery(few.name)->text.Text(), statement);
        EXPECT_EQ(Open(few)->Browser().Statement(), statement) << "the open view follows";
    }

    // One of a megabyte opens and comes back as it was.
    QString longOne = u"SELECT Name FROM Birds WHERE Name IN ('Wren'"_s;
    while (longOne.size() < 1'000'000)
        longOne += u",\n'a name that no bird bears'"_s;
    longOne += u')';
    inBuilder(ShellCommand::Edit, [&](CQueryDialog& dialog) {
        sql(dialog).setPlainText(longOne);
        dialog.findChild<QPushButton*>(u"save"_s)->click();
    });
    inBuilder(ShellCommand::Edit, [&](CQueryDialog& dialog) {
        EXPECT_EQ(sql(dialog).toPlainText().size(), longOne.size());
        dialog.reject();
    });
    EXPECT_EQ(std::as_const(Session().Store()).FindQuery(few.name)->text.Text(), longOne);
}

} // namespace
} // namespace mirel
