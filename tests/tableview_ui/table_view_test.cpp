#include "resources/string_table.h"
#include "tableview/ui/cell_strip.h"
#include "tableview/ui/empty_note.h"
#include "tableview/ui/filter_bar.h"
#include "tableview/ui/find_line.h"
#include "tableview/ui/navigation_row.h"
#include "tableview_ui/table_view_fixture.h"

#include <QLabel>
#include <QMenu>
#include <QPushButton>
#include <QScrollBar>
#include <QTimer>
#include <QToolButton>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class TableView : public TableViewFixture {};

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
