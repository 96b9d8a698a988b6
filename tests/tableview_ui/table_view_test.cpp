#include "tableview/ui/table_view.h"

#include "platform/ui/error_line.h"
#include "resources/string_table.h"
#include "tableview/people_fixture.h"
#include "tableview/ui/cell_strip.h"
#include "tableview/ui/empty_note.h"
#include "tableview/ui/filter_bar.h"
#include "tableview/ui/find_line.h"
#include "tableview/ui/navigation_row.h"
#include "tableview/ui/record_grid.h"

#include <QAction>
#include <QApplication>
#include <QCheckBox>
#include <QClipboard>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QMimeData>
#include <QMouseEvent>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QScrollBar>
#include <QTest>
#include <QTimer>
#include <QToolButton>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class TableView : public PeopleFixture {
protected:
    TableView()
    {
        view.resize(700, 400);
        EXPECT_TRUE(view.OpenTable(u"People"_s));
        view.show();
        EXPECT_TRUE(QTest::qWaitForWindowActive(&view));
    }

    // Keys go where the focus is, as they do for the user.
    void Press(Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        QTest::keyClick(QApplication::focusWidget(), key, modifiers);
    }
    void Type(const QString& text)
    {
        for (const QChar letter : text)
            QTest::keyClick(QApplication::focusWidget(), letter.toLatin1());
    }
    bool GridHasFocus() const { return QApplication::focusWidget() == grid; }
    QString Selected() const
    {
        return u"%1/%2"_s.arg(browser.FieldName(browser.SelectedField()), browser.CounterText());
    }
    QAction* ActionOf(Str text) const
    {
        const QList<QAction*> actions = view.actions();
        return *std::ranges::find(actions, StringText(text), &QAction::text);
    }
    QLineEdit* Line() const { return view.findChild<CellStrip*>()->findChild<QLineEdit*>(); }

    CTableView view{connection, path, prompt, {}};
    const RecordBrowser& browser = view.Browser();
    RecordGrid* grid = view.findChild<RecordGrid*>();
};

TEST_F(TableView, ReplacesACellByTypingAndGoesDownWithEnter)
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

TEST_F(TableView, EditsWithF2AndGivesTheOldValueBackOnEscape)
{
    Press(Qt::Key_F2);
    Type(u"x"_s);
    EXPECT_EQ(browser.Edit().Text(), u"P1x"_s);
    Press(Qt::Key_Escape);
    EXPECT_EQ(Line()->text(), u"P1"_s);
    EXPECT_TRUE(GridHasFocus());
    EXPECT_FALSE(browser.HasPendingEdit());
}

TEST_F(TableView, WalksThroughTheCellsWithItsKeys)
{
    const struct {
        Qt::Key key;
        Qt::KeyboardModifiers modifiers;
        QString selected;
    } steps[] = {
        {Qt::Key_Down, Qt::NoModifier, u"Name/2/25"_s},
        {Qt::Key_Right, Qt::NoModifier, u"Age/2/25"_s},
        {Qt::Key_Tab, Qt::NoModifier, u"Born/2/25"_s},
        {Qt::Key_Backtab, Qt::ShiftModifier, u"Age/2/25"_s},
        {Qt::Key_End, Qt::NoModifier, u"Note/2/25"_s},
        {Qt::Key_Tab, Qt::NoModifier, u"Name/3/25"_s},
        {Qt::Key_End, Qt::ControlModifier, u"Name/25/25"_s},
        {Qt::Key_Home, Qt::ControlModifier, u"Name/1/25"_s},
        {Qt::Key_PageDown, Qt::ControlModifier, u"Name/2/25"_s},
    };
    for (const auto& step : steps) {
        Press(step.key, step.modifiers);
        EXPECT_EQ(Selected(), step.selected) << QKeySequence(step.key | step.modifiers).toString().toStdString();
    }
}

TEST_F(TableView, SavesWithTabAndGoesOnToTheNextCell)
{
    Type(u"Bo"_s);
    Press(Qt::Key_Tab);
    EXPECT_EQ(Selected(), u"Age/1/25"_s);
    Type(u"7"_s);
    Press(Qt::Key_Backtab, Qt::ShiftModifier);
    EXPECT_EQ(Stored(u"SELECT Name FROM People WHERE Age=7"_s), u"Bo"_s);
}

TEST_F(TableView, StaysInTheEditorAndSaysWhyWhenAWriteIsRefused)
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

TEST_F(TableView, TicksWithSpaceAndClearsWithDel)
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

TEST_F(TableView, AddsDeletesRepeatsAndCopiesByKey)
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

TEST_F(TableView, SelectsBlocksByKeyAndByMouse)
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

TEST_F(TableView, CopiesPastesAndUndoesByKey)
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

TEST_F(TableView, CopiesATextOfSeveralLinesAsOneCell)
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

TEST_F(TableView, LeavesCtrlZToTheEditorWhileItHasSomethingToUndo)
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

TEST_F(TableView, FindsWhileTypingAndGoesOnWithEnterAndF3)
{
    QTest::keyClick(&view, Qt::Key_F, Qt::ControlModifier);
    Type(u"note 1"_s);
    EXPECT_EQ(Selected(), u"Note/10/25"_s);
    Type(u"2"_s);
    EXPECT_EQ(Selected(), u"Note/12/25"_s);
    Press(Qt::Key_Backspace);
    Press(Qt::Key_Return);
    EXPECT_EQ(Selected(), u"Note/13/25"_s);
    Press(Qt::Key_Return, Qt::ShiftModifier);
    Press(Qt::Key_Escape);
    EXPECT_TRUE(GridHasFocus());
    EXPECT_EQ(Selected(), u"Note/12/25"_s);
    QTest::keyClick(&view, Qt::Key_F3);
    EXPECT_EQ(Selected(), u"Note/13/25"_s);
    QTest::keyClick(&view, Qt::Key_F3, Qt::ShiftModifier);
    EXPECT_EQ(Selected(), u"Note/12/25"_s);
    EXPECT_TRUE(view.findChild<FindLine*>()->isVisible());
    Press(Qt::Key_Escape);
    EXPECT_FALSE(view.findChild<FindLine*>()->isVisible());
}

TEST_F(TableView, ShowsItsMenusWithEveryEntryAndLetter)
{
    QStringList entries;
    for (const QMenu* menu : view.Menus()) {
        QSet<QString> letters;
        for (const QAction* entry : menu->actions()) {
            if (entry->isSeparator())
                continue;
            const QString letter = entry->text().section(u'&', 1, 1).left(1).toLower();
            EXPECT_FALSE(letter.isEmpty()) << entry->text().toStdString();
            EXPECT_FALSE(letters.contains(letter)) << entry->text().toStdString() << ": its letter is taken";
            letters += letter;
            EXPECT_FALSE(entry->toolTip().isEmpty()) << entry->text().toStdString();
            entries += QString(entry->text()).remove(u'&');
        }
    }
    for (const QString& entry : {u"Insert Current DateTime"_s,
                                 u"New Query ..."_s,
                                 u"Open Query ..."_s,
                                 u"Save As Query ..."_s,
                                 u"Export to CSV ..."_s,
                                 u"Auto Size Column"_s,
                                 u"Options..."_s,
                                 u"Layout"_s,
                                 u"Filter By Selection"_s,
                                 u"Filter Excluding Selection"_s,
                                 u"Filter Expression ..."_s,
                                 u"Remove Filter"_s,
                                 u"Sort Ascending"_s,
                                 u"Sort Descending"_s,
                                 u"Sort Expression ..."_s,
                                 u"Edit All"_s,
                                 u"Aggregate"_s,
                                 u"Go To Record ..."_s,
                                 u"Undo"_s,
                                 u"Copy"_s,
                                 u"Paste"_s,
                                 u"Statement ..."_s})
        EXPECT_TRUE(entries.contains(entry)) << entry.toStdString();
}

TEST_F(TableView, OpensAPopupOfItsOwnInEachPresentationAfterAHold)
{
    const auto popupAfterHold = [this] {
        QStringList entries;
        QTimer::singleShot(600, [&entries] {
            auto* popup = qobject_cast<QMenu*>(QApplication::activePopupWidget());
            ASSERT_TRUE(popup);
            for (const QAction* entry : popup->actions())
                entries += QString(entry->text()).remove(u'&');
            popup->close();
        });
        QTest::mousePress(grid->viewport(), Qt::LeftButton, {}, grid->CellRect(1, 1).center());
        QTest::qWait(800);
        QTest::mouseRelease(grid->viewport(), Qt::LeftButton, {}, grid->CellRect(1, 1).center());
        return entries;
    };
    const QStringList list = popupAfterHold();
    EXPECT_TRUE(list.contains(u"Hide this Column"_s));
    EXPECT_TRUE(list.contains(u"AutoSize All Columns"_s));
    EXPECT_TRUE(list.contains(u"Filter Expression ..."_s));
    QTest::keyClick(&view, Qt::Key_D, Qt::ControlModifier);
    const QStringList detail = popupAfterHold();
    EXPECT_TRUE(detail.contains(u"Aggregate"_s));
    EXPECT_TRUE(detail.contains(u"Undo"_s));
    EXPECT_FALSE(detail.contains(u"Hide this Column"_s));
}

TEST_F(TableView, ScrollsTheWholeResultWithItsBar)
{
    QScrollBar* bar = grid->verticalScrollBar();
    EXPECT_EQ(bar->maximum(), kPeople - browser.RowsPerPage());
    bar->setSliderDown(true);
    bar->setSliderPosition(5);
    EXPECT_EQ(browser.ScrollPosition(), 0) << "a drag only counts";
    EXPECT_EQ(view.findChild<NavigationRow*>()->findChildren<QToolButton*>()[0]->text(), u"6/25"_s);
    bar->setSliderDown(false);
    EXPECT_EQ(browser.ScrollPosition(), 5);
    bar->triggerAction(QAbstractSlider::SliderSingleStepAdd);
    EXPECT_EQ(browser.ScrollPosition(), 6);
    QTest::keyClick(grid, Qt::Key_End, Qt::ControlModifier);
    EXPECT_EQ(bar->value(), bar->maximum());
}

TEST_F(TableView, GivesTheBarBackWhenAPendingEditIsRefused)
{
    Type(u"longer than ten"_s);
    grid->verticalScrollBar()->setValue(4);
    EXPECT_EQ(browser.ScrollPosition(), 0);
    EXPECT_EQ(grid->verticalScrollBar()->value(), 0);
}

TEST_F(TableView, SelectsTheTappedCellAndEditsItOnADoubleTap)
{
    const QPoint middle = grid->CellRect(2, 1).center();
    QTest::mouseClick(grid->viewport(), Qt::LeftButton, {}, middle);
    EXPECT_EQ(Selected(), u"Age/3/25"_s);
    EXPECT_TRUE(GridHasFocus());
    QTest::mouseDClick(grid->viewport(), Qt::LeftButton, {}, middle);
    EXPECT_EQ(QApplication::focusWidget(), Line());
}

TEST_F(TableView, FitsTheColumnsButLeavesAWidthSetByHand)
{
    QWidget* header = grid->findChild<QWidget*>(u"header"_s);
    ASSERT_TRUE(header);
    const int edge = grid->CellRect(0, 0).right() + 1;
    QTest::mousePress(header, Qt::LeftButton, {}, QPoint(edge, 5));
    QTest::mouseMove(header, QPoint(edge + 60, 5));
    QTest::mouseRelease(header, Qt::LeftButton, {}, QPoint(edge + 60, 5));
    const int wide = grid->CellRect(0, 0).width();
    EXPECT_NEAR(wide, edge + 60, 2);
    QTest::keyClick(grid, Qt::Key_PageDown);
    EXPECT_EQ(grid->CellRect(0, 0).width(), wide);
    QTest::mouseDClick(header, Qt::LeftButton, {}, QPoint(wide, 5));
    EXPECT_EQ(grid->CellRect(0, 0).width(), edge);
}

TEST_F(TableView, ZoomsIntoALongText)
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

TEST_F(TableView, KeepsLineEndsThatASingleLineCannotShow)
{
    Run(u"UPDATE People SET Note='one\ntwo' WHERE Name='P1'"_s);
    QTest::keyClick(&view, Qt::Key_F5);
    Press(Qt::Key_End);
    Press(Qt::Key_F2);
    Type(u"!"_s);
    Press(Qt::Key_Return);
    EXPECT_EQ(Stored(u"SELECT Note FROM People WHERE Name='P1'"_s), u"one\ntwo!"_s);
}

TEST_F(TableView, SaysBesideTheEditorWhatIsWrongAndRestores)
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

TEST_F(TableView, SaysWhyNothingCanBeTyped)
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

TEST_F(TableView, EditsAZoomedMemoInOnePlace)
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

TEST_F(TableView, EndsAShownSumWithTheFirstKey)
{
    Press(Qt::Key_Right);
    const auto label = [this] { return view.findChild<CellStrip*>()->findChild<QLabel*>()->text(); };
    const auto sum = [&] {
        ActionOf(Str::ActionSum)->trigger();
        EXPECT_EQ(Line()->text(), u"650"_s);
        EXPECT_TRUE(Line()->isReadOnly());
    };
    sum();
    Press(Qt::Key_F2);
    EXPECT_EQ(Line()->text(), u"21"_s);
    EXPECT_EQ(label(), u"Age:"_s);
    Press(Qt::Key_Escape);
    sum();
    Press(Qt::Key_Escape);
    EXPECT_EQ(label(), u"Age:"_s);
    sum();
    Line()->setFocus();
    Type(u"5"_s);
    EXPECT_EQ(Line()->text(), u"5"_s);
    EXPECT_EQ(label(), u"Age:"_s);
}

TEST_F(TableView, MovesSidewaysForTheSelectionAlone)
{
    view.resize(240, 320);
    Press(Qt::Key_End);
    QScrollBar* bar = grid->horizontalScrollBar();
    ASSERT_GT(bar->maximum(), 0);
    bar->setValue(0);
    Press(Qt::Key_PageDown);
    grid->verticalScrollBar()->triggerAction(QAbstractSlider::SliderSingleStepAdd);
    ActionOf(Str::ActionSortDescending)->trigger();
    EXPECT_EQ(bar->value(), 0);
    Press(Qt::Key_Left);
    EXPECT_GT(bar->value(), 0);
}

TEST_F(TableView, GrowsItsColumnsAndNeverShrinksThem)
{
    Run(u"UPDATE People SET Name='WWWWWWWWWW' WHERE Name='P25'"_s);
    const int narrow = grid->CellRect(0, 0).width();
    QTest::keyClick(grid, Qt::Key_End, Qt::ControlModifier);
    const int wide = grid->CellRect(0, 0).width();
    EXPECT_GT(wide, narrow);
    QTest::keyClick(grid, Qt::Key_Home, Qt::ControlModifier);
    EXPECT_EQ(grid->CellRect(0, 0).width(), wide);
    ActionOf(Str::ActionFitAll)->trigger();
    EXPECT_EQ(grid->CellRect(0, 0).width(), narrow);
}

TEST_F(TableView, TogglesTheSelectedYesNoCellWithATap)
{
    const QPoint cell = grid->CellRect(0, 3).center();
    QTest::mouseClick(grid->viewport(), Qt::LeftButton, {}, cell);
    EXPECT_FALSE(browser.HasPendingEdit()) << "the first tap selects";
    QTest::mouseClick(grid->viewport(), Qt::LeftButton, {}, cell);
    EXPECT_TRUE(browser.HasPendingEdit());
    EXPECT_TRUE(browser.Edit().IsChecked());
}

TEST_F(TableView, OffersToRemoveAFilterThatNothingMatches)
{
    ActionOf(Str::ActionFilterBy)->trigger();
    Run(u"DELETE FROM People WHERE Name='P1'"_s);
    QTest::keyClick(&view, Qt::Key_F5);
    auto* button = view.findChild<EmptyNote*>()->findChild<QPushButton*>();
    ASSERT_TRUE(button->isVisible());
    button->click();
    EXPECT_EQ(browser.CounterText(), u"1/24"_s);
    EXPECT_FALSE(button->isVisible());
}

TEST_F(TableView, ShowsAChipForEachFilterThatIsSwitchedAndTakenOffByItself)
{
    auto* bar = view.findChild<FilterBar*>();
    const auto chips = [bar] {
        QList<FilterChip*> shown = bar->findChildren<FilterChip*>();
        shown.removeIf([](const FilterChip* chip) { return chip->isHidden(); });
        return shown;
    };
    EXPECT_FALSE(bar->isVisible());
    ActionOf(Str::ActionSortDescending)->trigger();
    for (int step = 0; step < 3; ++step) // to Member
        QTest::keyClick(view.findChild<RecordGrid*>(), Qt::Key_Right);
    ActionOf(Str::ActionFilterBy)->trigger();
    QTest::keyClick(view.findChild<RecordGrid*>(), Qt::Key_Home);
    ActionOf(Str::ActionFilterExcluding)->trigger();
    ASSERT_EQ(chips().size(), 2);
    EXPECT_EQ(browser.CounterText(), u"1/12"_s);
    Q_EMIT bar->switched(0);
    EXPECT_EQ(browser.CounterText(), u"2/24"_s) << "the same record";
    EXPECT_EQ(chips().size(), 2) << "it stays, switched off";
    chips()[1]->Cross()->click();
    EXPECT_EQ(browser.CounterText(), u"3/25"_s);
    Q_EMIT bar->switched(0);
    EXPECT_EQ(browser.CounterText(), u"2/13"_s);
    EXPECT_EQ(browser.Statement(), u"SELECT * FROM People WHERE Member IS FALSE ORDER BY Name DESC"_s)
        << "the order stays";
    chips()[0]->Cross()->click();
    EXPECT_FALSE(bar->isVisible());
    EXPECT_EQ(browser.CounterText(), u"3/25"_s);
}

TEST_F(TableView, FitsOnAHandheldWithTheCounterWhole)
{
    view.resize(240, 320);
    QCoreApplication::processEvents();
    EXPECT_EQ(view.size(), QSize(240, 320));
    for (const QToolButton* button : view.findChild<NavigationRow*>()->findChildren<QToolButton*>()) {
        if (button->isHidden())
            continue;
        EXPECT_GE(button->geometry().left(), 0);
        EXPECT_LE(button->geometry().right(), 240) << button->text().toStdString();
        EXPECT_GE(button->width(), button->sizeHint().width()) << button->text().toStdString();
        EXPECT_GE(button->height(), 24);
    }
}

} // namespace
} // namespace mirel
