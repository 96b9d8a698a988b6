#include "app/ui/lumo_view.h"

#include "app/ui/compact_tab_bar.h"
#include "app/ui/look.h"
#include "platform/ui/entry_list.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QApplication>
#include <QLineEdit>
#include <QMenu>
#include <QSignalSpy>
#include <QTest>
#include <QTimer>
#include <QToolButton>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

MainEntry Table(const QString& name)
{
    return {EntryKind::Table, name, {}, false};
}

class LumoViewTest : public ::testing::Test {
protected:
    static void SetUpTestSuite() { QApplication::setStyle(new TouchTargetStyle(u"Fusion"_s)); }

    void SetUp() override
    {
        QObject::connect(&actions_, &CommandActions::given,
                         [this](int id) { given_.push_back(ShellCommand(id)); });
        Fill({Table(u"Airports"_s), Table(u"Birds"_s), Table(u"Contacts"_s)});
        ShowAt(QSize(400, 500));
    }

    void Fill(std::vector<MainEntry> tables)
    {
        state_.Show({.path = u"/home/ann/shop.cdb"_s,
                     .tables = std::move(tables),
                     .forms = {{EntryKind::Form, u"Orders"_s, u"Birds"_s, false}},
                     .queries = {},
                     .favorites = {}});
        view_.ShowState();
    }

    void ShowAt(QSize size)
    {
        view_.resize(size);
        view_.show();
        (void)QTest::qWaitForWindowExposed(&view_);
    }

    // What a pen or a mouse does to the list's row.
    void Tap(int row, bool twice = false)
    {
        const QPoint place = List()->visualRect(List()->model()->index(row, 0)).center();
        QTest::mouseClick(List()->viewport(), Qt::LeftButton, {}, place);
        if (twice)
            QTest::mouseDClick(List()->viewport(), Qt::LeftButton, {}, place);
    }

    long TimesGiven(ShellCommand id) const { return std::ranges::count(given_, id); }
    EntryList* List() const { return view_.findChild<EntryList*>(u"entries"_s); }
    QTabBar* Tabs() const { return view_.findChild<QTabBar*>(); }
    QLineEdit* Search() const { return view_.findChild<QLineEdit*>(u"search"_s); }

    MainViewState state_;
    QWidget window_;
    ShellActions& actions_ = *new ShellActions(window_);
    CLumoView view_{state_, actions_};
    std::vector<ShellCommand> given_;
};

TEST_F(LumoViewTest, OpensByTheTapThatTheUserChose)
{
    Tap(1);
    EXPECT_EQ(state_.Selected(), Table(u"Birds"_s));
    EXPECT_EQ(TimesGiven(ShellCommand::Open), 0);
    Tap(1, true);
    EXPECT_EQ(TimesGiven(ShellCommand::Open), 1);

    state_.SetOpensByDoubleTap(false);
    Tap(2);
    EXPECT_EQ(TimesGiven(ShellCommand::Open), 2);
    Tap(2, true); // its first half opens, its second does not again
    EXPECT_EQ(TimesGiven(ShellCommand::Open), 3);
}

TEST_F(LumoViewTest, AHoldOpensTheMenuAndNotTheEntry)
{
    state_.SetOpensByDoubleTap(false);
    bool sawMenu = false;
    QTimer look;
    QObject::connect(&look, &QTimer::timeout, &view_, [&sawMenu] {
        if (auto* menu = qobject_cast<QMenu*>(QApplication::activePopupWidget())) {
            sawMenu = !menu->actions().isEmpty();
            menu->close();
        }
    });
    look.start(20);
    const QRect place = List()->visualRect(List()->model()->index(1, 0));
    QTest::mousePress(List()->viewport(), Qt::LeftButton, {}, place.center());
    EXPECT_TRUE(QTest::qWaitFor([&sawMenu] { return sawMenu; }));
    EXPECT_EQ(state_.Selected(), Table(u"Birds"_s));
    EXPECT_EQ(TimesGiven(ShellCommand::Open), 0);
}

TEST_F(LumoViewTest, EnterOpensWhateverTheTapDoes)
{
    for (const bool byDouble : {true, false}) {
        given_.clear();
        state_.SetOpensByDoubleTap(byDouble);
        List()->setFocus();
        List()->SetRow(-1);
        QTest::keyClick(List(), Qt::Key_Down);
        QTest::keyClick(List(), Qt::Key_Return);
        EXPECT_EQ(TimesGiven(ShellCommand::Open), 1) << byDouble;
    }
}

TEST_F(LumoViewTest, EachTabComesBackToItsSelection)
{
    Tap(2);
    Tabs()->setCurrentIndex(int(MainTab::Form));
    EXPECT_FALSE(actions_.Of(ShellCommand::Delete)->isEnabled());
    EXPECT_EQ(List()->model()->rowCount(), 1);
    Tap(0);
    Tabs()->setCurrentIndex(int(MainTab::Table));
    EXPECT_EQ(List()->Row(), 2);
    Tabs()->setCurrentIndex(int(MainTab::Form));
    EXPECT_EQ(List()->Row(), 0);
}

TEST_F(LumoViewTest, ALongListCanBeSearched)
{
    EXPECT_FALSE(Search()->isVisible());
    std::vector<MainEntry> many;
    for (int i = 0; i < 40; ++i)
        many.push_back(Table(u"Table %1"_s.arg(i)));
    Fill(many);
    EXPECT_TRUE(Search()->isVisible());
    QTest::keyClicks(Search(), u"e 3"_s);
    EXPECT_EQ(List()->model()->rowCount(), 11);
    QTest::keyClicks(Search(), u"x"_s);
    EXPECT_FALSE(List()->isVisible()) << "a line says that nothing was found";
    Tabs()->setCurrentIndex(int(MainTab::Form));
    EXPECT_EQ(List()->model()->rowCount(), 1) << "another tab begins without a search";
}

TEST_F(LumoViewTest, NothingIsCutOffOnAHandheld)
{
    ShowAt(QSize(240, 320));
    for (int tab = 0; tab < Tabs()->count(); ++tab) {
        const QRect place = Tabs()->tabRect(tab);
        EXPECT_GE(place.height(), 24);
        EXPECT_GE(place.width(), Tabs()->fontMetrics().size(Qt::TextShowMnemonic, Tabs()->tabText(tab)).width());
        EXPECT_LE(place.right(), Tabs()->width()) << tab;
    }
    for (const QToolButton* button : view_.findChildren<QToolButton*>()) {
        if (!button->isVisible() || button->parentWidget() == Search())
            continue;
        const QRect place(button->mapTo(&view_, QPoint()), button->size());
        EXPECT_TRUE(view_.rect().contains(place)) << button->text().toStdString();
        EXPECT_GE(std::min(place.width(), place.height()), 24) << button->text().toStdString();
        EXPECT_FALSE(button->toolTip().isEmpty()) << button->text().toStdString();
    }
    EXPECT_GE(List()->visualRect(List()->model()->index(0, 0)).height(), 24);
}

TEST_F(LumoViewTest, ButtonsCarryTheirNamesWhereThereIsRoom)
{
    const auto styles = [this] {
        QSet<Qt::ToolButtonStyle> found;
        for (const QToolButton* button : view_.findChildren<QToolButton*>()) {
            if (button->isVisible() && button->defaultAction())
                found += button->toolButtonStyle();
        }
        return found;
    };
    ShowAt(QSize(700, 500));
    EXPECT_EQ(styles(), QSet{Qt::ToolButtonTextBesideIcon});
    ShowAt(QSize(200, 320));
    EXPECT_EQ(styles(), QSet{Qt::ToolButtonIconOnly});
    ShowAt(QSize(700, 500));
    EXPECT_EQ(styles(), QSet{Qt::ToolButtonTextBesideIcon});
}

TEST_F(LumoViewTest, KeysOfEntriesActOnTheList)
{
    Tap(0);
    QTest::keyClick(List(), Qt::Key_Delete);
    EXPECT_EQ(TimesGiven(ShellCommand::Delete), 1);
    QTest::keyClick(List(), Qt::Key_N, Qt::ControlModifier);
    EXPECT_EQ(TimesGiven(ShellCommand::New), 1);
    QTest::keyClick(List(), Qt::Key_F2);
    EXPECT_EQ(TimesGiven(ShellCommand::Edit), 1);
    QTest::keyClick(List(), Qt::Key_F2, Qt::ShiftModifier);
    EXPECT_EQ(TimesGiven(ShellCommand::Rename), 1);
    state_.Show({});
    view_.ShowState();
    QTest::keyClick(&view_, Qt::Key_N, Qt::ControlModifier);
    EXPECT_EQ(TimesGiven(ShellCommand::New), 2) << "without a database it says so";
}

} // namespace
} // namespace mirel
