#include "app/display_choice.h"
#include "app/ui/side_bar.h"
#include "app/ui/view_window.h"
#include "app_ui/program_fixture.h"
#include "forms/ui/form_eng_view.h"
#include "forms/ui/form_surface.h"
#include "support/printing.h"
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

class MainFrameTest : public ProgramFixture {
protected:
    void SetUp() override
    {
        Start();
        ASSERT_TRUE(Commands().NewDatabase(PathOf(u"shop.cdb"_s)));
        ASSERT_TRUE(Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40),[Wings] SmallInt)"_s));
        ASSERT_TRUE(Execute(u"INSERT INTO Birds (Name,Wings) VALUES ('Wren',2)"_s));
        Commands().Refill();
        Show({700, 500});
    }

    QWidget* OpenBirds() { return OpenTable(u"Birds"_s); }
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
        Session().Store().AddForm(form);
        Commands().Refill();
    }
    qsizetype TableViews() { return Frame().findChildren<CTableView*>().size(); }

    // Drags one file onto the frame and lets it go; false when the frame does not want it.
    bool Drop(const QString& path)
    {
        QMimeData data;
        data.setUrls({QUrl::fromLocalFile(path)});
        QDragEnterEvent enter(QPoint(50, 50), Qt::CopyAction | Qt::MoveAction, &data, Qt::LeftButton, {});
        QApplication::sendEvent(&Frame(), &enter);
        if (!enter.isAccepted())
            return false;
        QDropEvent drop(QPointF(50, 50), Qt::CopyAction | Qt::MoveAction, &data, Qt::LeftButton, {});
        QApplication::sendEvent(&Frame(), &drop);
        EXPECT_EQ(drop.dropAction(), Qt::CopyAction);
        QCoreApplication::processEvents(); // it is opened once the drop is over
        return true;
    }
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
            seen += QString(text).remove(u'&').remove(u'…');
            EXPECT_FALSE(action->toolTip().isEmpty()) << text.toStdString();
        }
    };
    for (const int width : {1000, 300}) {
        Frame().resize(width, 500);
        for (const bool withView : {false, true}) {
            if (withView)
                OpenBirds();
            for (const QAction* top : Frame().menuBar()->actions()) {
                check(top->menu());
                for (const QAction* entry : top->menu()->actions()) {
                    if (entry->menu())
                        check(entry->menu());
                }
            }
        }
        AddBirdForm();
        Frame().OpenForm(*Commands().CallOfForm(u"Bird form"_s));
        check(Frame().menuBar()->actions().first()->menu());
        while (Frame().findChild<ViewTabs*>()->Close(0)) {
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
    EXPECT_FALSE(Frame().OpenTable({u"Bees"_s, u"SELECT * FROM Bees"_s, u"Bees"_s}));
    EXPECT_EQ(prompt_.shown.size(), 1);
    EXPECT_EQ(TableViews(), 1);
}

TEST_F(MainFrameTest, AFormRunsFromItsListAndEachTimeInAnEngineOfItsOwn)
{
    AddBirdForm();
    State().SetTab(MainTab::Form);
    State().Select({EntryKind::Form, u"Bird form"_s, u"Birds"_s, false});
    Frame().ShowState();
    auto* actions = Frame().findChild<ShellActions*>();
    actions->Of(ShellCommand::Open)->trigger();
    actions->Of(ShellCommand::Open)->trigger();
    const auto forms = Frame().findChildren<CFormEngView*>();
    ASSERT_EQ(forms.size(), 2);
    EXPECT_EQ(forms.last()->Form().RecordCount(), 1);
}

TEST_F(MainFrameTest, TheProgramStaysWhileAFormsChangesAreNotGivenUp)
{
    AddBirdForm();
    CFormEngView* form = Frame().OpenForm(*Commands().CallOfForm(u"Bird form"_s));
    QTest::keyClicks(form->Surface().WidgetOf(0), u"x"_s);
    ASSERT_TRUE(form->isWindowModified());
    EXPECT_FALSE(Frame().close());
    EXPECT_TRUE(form->isVisible());
    prompt_.answers = {true};
    EXPECT_TRUE(Frame().close());
    EXPECT_FALSE(form->isVisible());
}

TEST_F(MainFrameTest, ADroppedDatabaseOpensAndClosesTheTablesOfTheOneBefore)
{
    ASSERT_TRUE(Commands().NewDatabase(PathOf(u"other.cdb"_s)));
    ASSERT_TRUE(Commands().OpenDatabase(PathOf(u"shop.cdb"_s)));
    ASSERT_TRUE(OpenBirds());
    EXPECT_FALSE(Drop(PathOf(u"picture.png"_s)));
    EXPECT_TRUE(Drop(PathOf(u"other.cdb"_s)));
    EXPECT_EQ(State().DatabaseName(), u"other.cdb"_s);
    EXPECT_TRUE(Frame().windowTitle().contains(u"other.cdb"_s));
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_EQ(TableViews(), 0);
}

TEST_F(MainFrameTest, ClosingKeepsTheWindowsSizeForTheNextRun)
{
    Frame().resize(640, 480);
    ASSERT_TRUE(OpenBirds());
    EXPECT_TRUE(Frame().close());
    const CMainFrame next(Session(), State(), Commands(), program_->settings, program_->profile);
    EXPECT_EQ(next.size(), QSize(640, 480));
}

TEST_F(MainFrameTest, ATableKeepsTheWidthsSetByHandAndTheChosenColors)
{
    auto* first = qobject_cast<CTableView*>(OpenBirds());
    ASSERT_TRUE(first);
    first->SetWidthsByHand({{u"Name"_s, 222}});
    EXPECT_TRUE(first->close());
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    DisplayChoice(program_->settings, DisplayView::Table)
        .SetColor(ColorPart::Lists, ColorKind::Background, 0x00FFFF);
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
