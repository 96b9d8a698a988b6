#include "platform/ui/error_line.h"
#include "resources/string_table.h"
#include "tableview_ui/table_view_fixture.h"

#include <QCheckBox>
#include <QClipboard>
#include <QMimeData>
#include <QMouseEvent>
#include <QPlainTextEdit>
#include <QToolButton>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class TableEditing : public TableViewFixture {};

TEST_F(TableEditing, ReplacesACellByTypingAndGoesDownWithEnter)
{
    Type(u"A"_s);
    EXPECT_EQ(QApplication::focusWidget(), Line());
    Type(u"nn"_s);
    EXPECT_EQ(Line()->text(), u"Ann"_s);
    EXPECT_TRUE(view.isWindowModified());
    Press(Qt::Key_Return);
    EXPECT_EQ(Selected(), u"Name/2/25"_s);
    EXPECT_TRUE(GridHasFocus());
    EXPECT_EQ(Stored(u"SELECT Name FROM People WHERE Age=21"_s), u"Ann"_s);
}

TEST_F(TableEditing, EditsWithF2AndGivesTheOldValueBackOnEscape)
{
    Press(Qt::Key_F2);
    Type(u"x"_s);
    EXPECT_EQ(browser.Edit().Text(), u"P1x"_s);
    Press(Qt::Key_Escape);
    EXPECT_EQ(Line()->text(), u"P1"_s);
    EXPECT_TRUE(GridHasFocus());
    EXPECT_FALSE(browser.HasPendingEdit());
}

TEST_F(TableEditing, SavesWithTabAndGoesOnToTheNextCell)
{
    Type(u"Bo"_s);
    Press(Qt::Key_Tab);
    EXPECT_EQ(Selected(), u"Age/1/25"_s);
    Type(u"7"_s);
    Press(Qt::Key_Backtab, Qt::ShiftModifier);
    EXPECT_EQ(Stored(u"SELECT Name FROM People WHERE Age=7"_s), u"Bo"_s);
}

TEST_F(TableEditing, StaysInTheEditorAndSaysWhyWhenAWriteIsRefused)
{
    Type(u"longer than ten"_s);
    Press(Qt::Key_Return);
    EXPECT_TRUE(prompt.shown.isEmpty()) << "only once the key is over";
    EXPECT_TRUE(QTest::qWaitFor([this] { return !prompt.shown.isEmpty(); }));
    EXPECT_EQ(Selected(), u"Name/1/25"_s);
    EXPECT_EQ(QApplication::focusWidget(), Line());
    EXPECT_EQ(Line()->text(), u"longer than ten"_s);
    EXPECT_FALSE(view.close()) << "nothing typed is lost without a word";
    Press(Qt::Key_Escape);
    EXPECT_TRUE(view.close());
}

TEST_F(TableEditing, TicksWithSpaceAndClearsWithDel)
{
    for (int i = 0; i < 3; ++i)
        Press(Qt::Key_Right);
    Press(Qt::Key_Space);
    auto* box = view.findChild<QCheckBox*>();
    EXPECT_TRUE(box->isVisible());
    EXPECT_TRUE(box->isChecked());
    Press(Qt::Key_Left);
    Press(Qt::Key_Delete);
    Press(Qt::Key_Left);
    EXPECT_EQ(Stored(u"SELECT Name FROM People WHERE Member=TRUE AND Born IS NULL"_s), u"P1"_s);
}

TEST_F(TableEditing, AddsDeletesRepeatsAndCopiesByKey)
{
    Press(Qt::Key_Insert);
    EXPECT_EQ(Selected(), u"Name/26/26"_s);
    QTest::keyClick(&view, Qt::Key_Apostrophe, Qt::ControlModifier);
    EXPECT_EQ(Line()->text(), u"P25"_s);
    QTest::keyClick(&view, Qt::Key_C, Qt::ControlModifier);
    EXPECT_EQ(QApplication::clipboard()->text(), u"P25"_s);
    prompt.answers = {true};
    QTest::keyClick(&view, Qt::Key_Delete, Qt::ControlModifier);
    EXPECT_EQ(browser.CounterText(), u"25/25"_s);
}

TEST_F(TableEditing, SelectsBlocksByKeyAndByMouse)
{
    Press(Qt::Key_Down, Qt::ShiftModifier);
    Press(Qt::Key_Right, Qt::ShiftModifier);
    EXPECT_EQ(browser.Block(), (CellBlock{0, 1, 0, 1}));
    Press(Qt::Key_Escape);
    EXPECT_FALSE(browser.HasBlock());

    const QPoint from = grid->CellRect(2, 1).center();
    const QPoint to = grid->CellRect(4, 2).center();
    QTest::mousePress(grid->viewport(), Qt::LeftButton, {}, from);
    QTest::mouseMove(grid->viewport(), to);
    QMouseEvent move(QEvent::MouseMove, to, grid->viewport()->mapToGlobal(to), Qt::NoButton, Qt::LeftButton, {});
    QApplication::sendEvent(grid->viewport(), &move);
    QTest::mouseRelease(grid->viewport(), Qt::LeftButton, {}, to);
    EXPECT_EQ(browser.Block(), (CellBlock{2, 4, 1, 2}));
    QTest::mouseClick(grid->viewport(), Qt::LeftButton, Qt::ShiftModifier, grid->CellRect(0, 0).center());
    EXPECT_EQ(browser.Block(), (CellBlock{0, 2, 0, 1})) << "from where it began";
    QTest::mousePress(grid->viewport(), Qt::RightButton, {}, from);
    EXPECT_TRUE(browser.HasBlock()) << "its popup menu is for all of it";
    QTest::mousePress(grid->viewport(), Qt::LeftButton, {}, from);
    EXPECT_TRUE(browser.HasBlock()) << "so is that of a hold";
    QTest::mouseRelease(grid->viewport(), Qt::LeftButton, {}, from);
    EXPECT_FALSE(browser.HasBlock());
    QTest::mouseClick(grid->viewport(), Qt::LeftButton, {}, from);
    EXPECT_FALSE(browser.HasBlock());
}

TEST_F(TableEditing, CopiesPastesAndUndoesByKey)
{
    Press(Qt::Key_Down, Qt::ShiftModifier);
    Press(Qt::Key_Right, Qt::ShiftModifier);
    QTest::keyClick(&view, Qt::Key_C, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(QApplication::clipboard()->text(), u"Name\tAge\nP1\t21\nP2\t22"_s);
    QTest::keyClick(&view, Qt::Key_C, Qt::ControlModifier);
    EXPECT_TRUE(QApplication::clipboard()->mimeData()->hasHtml());
    Press(Qt::Key_Down);
    Press(Qt::Key_Left);
    QTest::keyClick(&view, Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(browser.Block(), (CellBlock{2, 3, 0, 1}));
    EXPECT_EQ(Stored(u"SELECT Name FROM People WHERE Age=22 AND Note='note 4'"_s), u"P2"_s);
    Press(Qt::Key_Delete);
    EXPECT_EQ(Stored(u"SELECT Note FROM People WHERE Age IS NULL AND Name IS NULL"_s), u"note 3"_s);
    QTest::keyClick(&view, Qt::Key_Z, Qt::ControlModifier);
    QTest::keyClick(&view, Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(Stored(u"SELECT Name FROM People WHERE Age=24"_s), u"P4"_s);
    EXPECT_FALSE(ActionOf(Str::ActionUndo)->isEnabled());
}

TEST_F(TableEditing, CopiesATextOfSeveralLinesAsOneCell)
{
    Run(u"UPDATE People SET Note='one\ntwo' WHERE Name='P1'"_s);
    QTest::keyClick(&view, Qt::Key_F5);
    Press(Qt::Key_End);
    QTest::keyClick(&view, Qt::Key_C, Qt::ControlModifier);
    EXPECT_EQ(QApplication::clipboard()->text(), u"one\ntwo"_s);
    Press(Qt::Key_Down);
    QTest::keyClick(&view, Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(browser.Edit().Text(), u"one\ntwo"_s);
    EXPECT_TRUE(browser.HasPendingEdit());
}

TEST_F(TableEditing, LeavesCtrlZToTheEditorWhileItHasSomethingToUndo)
{
    Press(Qt::Key_Delete);
    Press(Qt::Key_Tab);
    Press(Qt::Key_F2);
    Type(u"5"_s);
    Press(Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(Line()->text(), u"21"_s);
    Press(Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(Stored(u"SELECT Name FROM People WHERE Age=21"_s), u"P1"_s);
}

TEST_F(TableEditing, ZoomsIntoALongText)
{
    Press(Qt::Key_End);
    QTest::keyClick(&view, Qt::Key_F2, Qt::ShiftModifier);
    const auto* zoom = view.findChild<QPlainTextEdit*>();
    ASSERT_TRUE(zoom->isVisible());
    EXPECT_EQ(zoom->toPlainText(), longNote);
    Press(Qt::Key_End, Qt::ControlModifier);
    Type(u"!"_s);
    Press(Qt::Key_Return);
    Press(Qt::Key_Backtab, Qt::ShiftModifier);
    EXPECT_EQ(Selected(), u"Member/1/25"_s);
    EXPECT_FALSE(zoom->isVisible()) << "a tick keeps its ordinary editor";
    EXPECT_EQ(Stored(u"SELECT Note FROM People WHERE Name='P1'"_s), longNote + u"!\n"_s);
    Press(Qt::Key_Tab);
    EXPECT_TRUE(zoom->isVisible());
    QTest::keyClick(&view, Qt::Key_F2, Qt::ShiftModifier);
    EXPECT_TRUE(grid->isVisible());
}

TEST_F(TableEditing, KeepsLineEndsThatASingleLineCannotShow)
{
    Run(u"UPDATE People SET Note='one\ntwo' WHERE Name='P1'"_s);
    QTest::keyClick(&view, Qt::Key_F5);
    Press(Qt::Key_End);
    Press(Qt::Key_F2);
    Type(u"!"_s);
    Press(Qt::Key_Return);
    EXPECT_EQ(Stored(u"SELECT Note FROM People WHERE Name='P1'"_s), u"one\ntwo!"_s);
}

TEST_F(TableEditing, SaysBesideTheEditorWhatIsWrongAndRestores)
{
    auto* error = view.findChild<ErrorLine*>();
    const struct {
        int field;
        QString typed;
        QString said;
    } rows[] = {{0, u"longer than ten"_s, u"at most 10 characters, this has 15"_s},
                {2, u"31.31.99"_s, u"not a date: 31.31.99"_s}};
    for (const auto& row : rows) {
        Press(Qt::Key_Home);
        for (int i = 0; i < row.field; ++i)
            Press(Qt::Key_Right);
        const QString before = browser.Edit().Text();
        Type(row.typed);
        EXPECT_EQ(error->Text(), QString()) << "not while it is typed";
        Press(Qt::Key_Return);
        EXPECT_EQ(error->Text(), row.said);
        EXPECT_TRUE(QTest::qWaitFor([this] { return !prompt.shown.isEmpty(); }));
        prompt.shown.clear();
        QTest::mouseClick(error->findChild<QToolButton*>(), Qt::LeftButton);
        EXPECT_EQ(browser.Edit().Text(), before);
        EXPECT_EQ(error->Text(), QString());
        EXPECT_TRUE(GridHasFocus());
    }
}

TEST_F(TableEditing, SaysWhyNothingCanBeTyped)
{
    Run(u"CREATE TABLE Blobs ([Name] Varchar(10),[Photo] Long Varbinary)"_s);
    Run(u"INSERT INTO Blobs (Name) VALUES('x')"_s);
    auto* error = view.findChild<ErrorLine*>();
    EXPECT_TRUE(view.OpenStatement(u"Q"_s, u"SELECT Name,Age+1 AS Older FROM People"_s));
    Press(Qt::Key_Right);
    Type(u"5"_s);
    EXPECT_TRUE(error->Text().contains(u"computed"_s) || error->Text().contains(u"read-only"_s));
    Press(Qt::Key_Left);
    EXPECT_EQ(error->Text(), QString()) << "gone with the cell that it was about";
    EXPECT_TRUE(view.OpenTable(u"Blobs"_s));
    Press(Qt::Key_Right);
    Type(u"5"_s);
    EXPECT_EQ(error->Text(), u"\"Photo\" holds bytes: they cannot be typed."_s);
}

TEST_F(TableEditing, EditsAZoomedMemoInOnePlace)
{
    Run(u"UPDATE People SET Note='one\r\ntwo\u00A0x\nthree' WHERE Name='P1'"_s);
    QTest::keyClick(&view, Qt::Key_F5);
    Press(Qt::Key_End);
    ActionOf(Str::ZoomIn)->trigger();
    auto* zoom = view.findChild<QPlainTextEdit*>();
    zoom->moveCursor(QTextCursor::End);
    ActionOf(Str::ActionInsertDateTime)->trigger();
    const QString now = zoom->toPlainText().mid(zoom->toPlainText().lastIndexOf(u"three"_s) + 5);
    EXPECT_FALSE(now.isEmpty());
    EXPECT_EQ(browser.Edit().Text(), u"one\r\ntwo\u00A0x\nthree"_s + now) << "what was not edited is as it was";
    QApplication::clipboard()->setText(u"!"_s);
    ActionOf(Str::ActionPaste)->trigger();
    EXPECT_EQ(browser.Edit().Text(), u"one\r\ntwo\u00A0x\nthree"_s + now + u'!');
    Press(Qt::Key_Escape);
    EXPECT_EQ(browser.Edit().Text(), u"one\r\ntwo\u00A0x\nthree"_s);
    EXPECT_TRUE(zoom->isVisible());
    Press(Qt::Key_Escape);
    EXPECT_FALSE(zoom->isVisible()) << "with nothing to give back it leaves";
}

TEST_F(TableEditing, TogglesTheSelectedYesNoCellWithATap)
{
    const QPoint cell = grid->CellRect(0, 3).center();
    QTest::mouseClick(grid->viewport(), Qt::LeftButton, {}, cell);
    EXPECT_FALSE(browser.HasPendingEdit()) << "the first tap selects";
    QTest::mouseClick(grid->viewport(), Qt::LeftButton, {}, cell);
    EXPECT_TRUE(browser.HasPendingEdit());
    EXPECT_TRUE(browser.Edit().IsChecked());
}

} // namespace
} // namespace mirel
