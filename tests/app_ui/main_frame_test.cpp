#include "app/ui/main_frame.h"

#include "app/display_choice.h"
#include "app/ui/look.h"
#include "app/ui/shell_actions.h"
#include "app/ui/side_bar.h"
#include "app/ui/view_tabs.h"
#include "app/ui/view_window.h"
#include "forms/ui/form_eng_view.h"
#include "forms/ui/form_surface.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"
#include "tableview/ui/record_grid.h"
#include "tableview/ui/table_view.h"

#include <gtest/gtest.h>

#include <QApplication>
#include <QDir>
#include <QDropEvent>
#include <QMenuBar>
#include <QMimeData>
#include <QTemporaryDir>
#include <QTest>
#include <QUrl>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class MainFrameTest : public ::testing::Test {
protected:
    static void SetUpTestSuite() { QApplication::setStyle(new TouchTargetStyle(u"Fusion"_s)); }

    void SetUp() override
    {
        ASSERT_TRUE(commands_.NewDatabase(PathOf(u"shop.cdb"_s)));
        ASSERT_TRUE(Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40),[Wings] SmallInt)"_s));
        ASSERT_TRUE(Execute(u"INSERT INTO Birds (Name,Wings) VALUES ('Wren',2)"_s));
        commands_.Refill();
        frame_.ShowState();
        frame_.resize(700, 500);
        frame_.show();
    }

    bool Execute(const QString& statement)
    {
        return session_.GetCatalog().ExecuteStatement(session_.Location(), statement);
    }
    QString PathOf(const QString& name) const { return QDir(folder_.path()).filePath(name); }
    QWidget* OpenBirds() { return frame_.OpenTable({u"Birds"_s, u"SELECT * FROM Birds"_s, u"Birds"_s}); }
    void AddBirdForm()
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
        form.AddControl(box);
        session_.Store().AddForm(form);
        commands_.Refill();
    }
    qsizetype TableViews() const { return frame_.findChildren<CTableView*>().size(); }

    // Drags one file onto the frame and lets it go; false when the frame does not want it.
    bool Drop(const QString& path)
    {
        QMimeData data;
        data.setUrls({QUrl::fromLocalFile(path)});
        QDragEnterEvent enter(QPoint(50, 50), Qt::CopyAction | Qt::MoveAction, &data, Qt::LeftButton, {});
        QApplication::sendEvent(&frame_, &enter);
        if (!enter.isAccepted())
            return false;
        QDropEvent drop(QPointF(50, 50), Qt::CopyAction | Qt::MoveAction, &data, Qt::LeftButton, {});
        QApplication::sendEvent(&frame_, &drop);
        EXPECT_EQ(drop.dropAction(), Qt::CopyAction);
        return true;
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
};

TEST_F(MainFrameTest, EveryMenuEntryHasItsMnemonicAndSaysWhatItDoes)
{
    QSet<QString> seen;
    const auto check = [&seen](const QMenu* menu) {
        EXPECT_TRUE(menu->toolTipsVisible()) << menu->title().toStdString();
        QSet<QChar> mnemonics;
        for (const QAction* action : menu->actions()) {
            if (action->isSeparator())
                continue;
            const QString text = action->text();
            const QChar mnemonic = text.section(u'&', 1, 1).left(1).toLower().front();
            EXPECT_FALSE(mnemonics.contains(mnemonic)) << text.toStdString() << ": its letter is taken";
            mnemonics += mnemonic;
            seen += QString(text).remove(u'&');
            EXPECT_FALSE(action->toolTip().isEmpty()) << text.toStdString();
        }
    };
    for (const int width : {1000, 300}) {
        frame_.resize(width, 500);
        for (const bool withView : {false, true}) {
            if (withView)
                OpenBirds();
            for (const QAction* top : frame_.menuBar()->actions()) {
                check(top->menu());
                for (const QAction* entry : top->menu()->actions()) {
                    if (entry->menu())
                        check(entry->menu());
                }
            }
        }
        AddBirdForm();
        frame_.OpenForm(*commands_.CallOfForm(u"Bird form"_s));
        check(frame_.menuBar()->actions().first()->menu());
        while (frame_.findChild<ViewTabs*>()->Close(0)) {
        }
    }
    for (const QString& entry :
         {u"Add Favorites"_s, u"Remove from Favorites"_s, u"Open by Double-Clicking"_s, u"Font"_s,
          u"Background Color"_s, u"List Background Color"_s, u"Button Background Color"_s,
          u"Current DB Text Color"_s, u"List Text Color"_s, u"Button Text Color"_s, u"Import from CSV ..."_s,
          u"Export to CSV ..."_s, u"Exit"_s, u"Open Database"_s, u"New Database"_s, u"Delete Database"_s,
          u"About Mirel"_s, u"Help"_s})
        EXPECT_TRUE(seen.contains(entry)) << entry.toStdString();
}

TEST_F(MainFrameTest, ATableOpensOnceAndComesForwardAgain)
{
    QWidget* first = OpenBirds();
    ASSERT_TRUE(first);
    EXPECT_EQ(OpenBirds(), first);
    EXPECT_EQ(TableViews(), 1);
    EXPECT_FALSE(frame_.OpenTable({u"Bees"_s, u"SELECT * FROM Bees"_s, u"Bees"_s}));
    EXPECT_EQ(prompt_.shown.size(), 1);
    EXPECT_EQ(TableViews(), 1);
}

TEST_F(MainFrameTest, AFormRunsFromItsListAndEachTimeInAnEngineOfItsOwn)
{
    AddBirdForm();
    state_.SetTab(MainTab::Form);
    state_.Select({EntryKind::Form, u"Bird form"_s, u"Birds"_s, false});
    frame_.ShowState();
    auto* actions = frame_.findChild<ShellActions*>();
    actions->Of(ShellCommand::Open)->trigger();
    actions->Of(ShellCommand::Open)->trigger();
    const auto forms = frame_.findChildren<CFormEngView*>();
    ASSERT_EQ(forms.size(), 2);
    EXPECT_EQ(forms.last()->Form().RecordCount(), 1);
}

TEST_F(MainFrameTest, TheProgramStaysWhileAFormsChangesAreNotGivenUp)
{
    AddBirdForm();
    CFormEngView* form = frame_.OpenForm(*commands_.CallOfForm(u"Bird form"_s));
    QTest::keyClicks(form->Surface().WidgetOf(0), u"x"_s);
    ASSERT_TRUE(form->isWindowModified());
    EXPECT_FALSE(frame_.close());
    EXPECT_TRUE(form->isVisible());
    prompt_.answers = {true};
    EXPECT_TRUE(frame_.close());
    EXPECT_FALSE(form->isVisible());
}

TEST_F(MainFrameTest, ADroppedDatabaseOpensAndClosesTheTablesOfTheOneBefore)
{
    ASSERT_TRUE(commands_.NewDatabase(PathOf(u"other.cdb"_s)));
    ASSERT_TRUE(commands_.OpenDatabase(PathOf(u"shop.cdb"_s)));
    ASSERT_TRUE(OpenBirds());
    EXPECT_FALSE(Drop(PathOf(u"notes.txt"_s)));
    EXPECT_TRUE(Drop(PathOf(u"other.cdb"_s)));
    EXPECT_EQ(state_.DatabaseName(), u"other.cdb"_s);
    EXPECT_TRUE(frame_.windowTitle().contains(u"other.cdb"_s));
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_EQ(TableViews(), 0);
}

TEST_F(MainFrameTest, ClosingKeepsTheWindowsSizeForTheNextRun)
{
    frame_.resize(640, 480);
    ASSERT_TRUE(OpenBirds());
    EXPECT_TRUE(frame_.close());
    const CMainFrame next(session_, state_, commands_, settings_, profile_);
    EXPECT_EQ(next.size(), QSize(640, 480));
}

TEST_F(MainFrameTest, ATableKeepsTheWidthsSetByHandAndTheChosenColors)
{
    auto* first = qobject_cast<CTableView*>(OpenBirds());
    ASSERT_TRUE(first);
    first->SetWidthsByHand({{u"Name"_s, 222}});
    EXPECT_TRUE(first->close());
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    DisplayChoice(settings_, DisplayView::Table).SetColor(ColorPart::Lists, ColorKind::Background, 0x00FFFF);
    const auto* again = qobject_cast<CTableView*>(OpenBirds());
    ASSERT_TRUE(again);
    EXPECT_EQ(again->WidthsByHand().value(u"Name"_s), 222);
    const auto* grid = again->findChild<RecordGrid*>();
    EXPECT_EQ(grid->CellRect(0, 0).width(), 222);
    EXPECT_EQ(grid->palette().color(QPalette::Base), QColor(Qt::yellow));
    EXPECT_EQ(grid->palette().color(QPalette::Text), QApplication::palette().color(QPalette::Text));
}

} // namespace
} // namespace mirel
