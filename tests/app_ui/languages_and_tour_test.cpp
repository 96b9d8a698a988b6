// The window in each of its languages, and the tour of its first start.
#include "app/ui/tour.h"
#include "app/ui/window_language.h"
#include "forms/ui/design_surface.h"
#include "forms/ui/form_eng_view.h"
#include "forms/ui/form_mak_view.h"
#include "resources/string_table.h"
#include "support/printing.h"
#include "support/ui/screen_checks.h"
#include "support/ui/spoken_in_windows.h"
#include "support/ui/window_sizes.h"
#include "tableview/ui/table_view.h"

#include "app_ui/program_fixture.h"

#include <QCheckBox>
#include <QDialogButtonBox>
#include <QFileInfo>
#include <QListWidget>
#include <QMenuBar>
#include <QProcess>
#include <QPushButton>
#include <QTimer>
#include <QToolButton>

#include <map>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// A window of that size on a screen that may be smaller.
void ResizeTo(QSize size, CMainFrame& frame)
{
    frame.setWindowState(Qt::WindowNoState);
    frame.resize(size);
    QApplication::processEvents();
}

// Entries of one menu whose letters are the same, and entries without one, of the menu and those behind it.
void ExpectLettersOfTheirOwn(const QList<QAction*>& entries, const QString& where)
{
    std::map<QString, QString> taken;
    for (const QAction* entry : entries) {
        if (entry->isSeparator() || !entry->isVisible())
            continue;
        const QString text = QString(entry->text()).remove(u"&&"_s);
        const QString letter = text.section(u'&', 1, 1).left(1).toLower();
        const std::string what = (where + u": "_s + text).toStdString();
        EXPECT_FALSE(letter.isEmpty()) << what << " has no letter";
        EXPECT_TRUE(taken[letter].isEmpty()) << what << " has the letter of " << taken[letter].toStdString();
        taken[letter] = text;
        if (entry->menu())
            ExpectLettersOfTheirOwn(entry->menu()->actions(), where + u'/' + text);
    }
}

class InLanguage : public ProgramFixture, public ::testing::WithParamInterface<const char*> {
protected:
    void SetUp() override
    {
        if (GetParam() != std::string_view("en"))
            spoken_ = std::make_unique<SpokenInWindows>(QString::fromLatin1(GetParam()));
        ASSERT_TRUE(UsePalette(u"light"));
        Start();
        ASSERT_TRUE(Commands().OpenSample());
    }
    void ExpectLetters(const QString& where)
    {
        const QString place = QString::fromLatin1(GetParam()) + u' ' + where;
        ExpectLettersOfTheirOwn(Frame().menuBar()->actions(), place);
    }

    std::unique_ptr<SpokenInWindows> spoken_;
};
INSTANTIATE_TEST_SUITE_P(Each, InLanguage, ::testing::Values("en", "de"),
                         [](const auto& each) { return each.param; });

TEST_P(InLanguage, NoTwoEntriesOfAMenuHaveOneLetter)
{
    for (const QSize size : {kDesktop, kHandheld}) {
        Show(size);
        ResizeTo(size, Frame());
        ExpectLetters(u"lists"_s);
        ASSERT_TRUE(Frame().OpenView({EntryKind::Table, u"Orders"_s}));
        ExpectLetters(u"table"_s);
        ASSERT_TRUE(Frame().OpenView({EntryKind::Form, u"Order"_s}));
        ExpectLetters(u"form"_s);
        CFormMakView* maker = Frame().DesignForm(u"Order"_s);
        ASSERT_TRUE(maker);
        ExpectLetters(u"form maker"_s);
        auto* surface = maker->findChild<DesignSurface*>();
        QTest::keyClick(surface, Qt::Key_Tab);
        ExpectLetters(u"form maker, one control"_s);
        QTest::keyClick(surface, Qt::Key_A, Qt::ControlModifier);
        ExpectLetters(u"form maker, all controls"_s);
        Frame().close();
    }
}

TEST_P(InLanguage, IconsSayWhatTheyDo)
{
    Show(kHandheld);
    ResizeTo(kHandheld, Frame());
    const auto expectTips = [this](const QString& where) {
        for (const QAbstractButton* button : Frame().findChildren<QAbstractButton*>()) {
            if (button->isVisibleTo(&Frame()) && !button->icon().isNull() &&
                button->parentWidget()->objectName() != u"qt_toolbar_ext_button") {
                EXPECT_FALSE(button->toolTip().isEmpty() && button->text().isEmpty())
                    << where.toStdString() << ": " << button->metaObject()->className() << " "
                    << button->accessibleName().toStdString();
            }
        }
    };
    expectTips(u"lists"_s);
    for (const ViewKey& key : {ViewKey{EntryKind::Table, u"Orders"_s}, ViewKey{EntryKind::Form, u"Order"_s}}) {
        ASSERT_TRUE(Frame().OpenView(key));
        expectTips(key.name);
    }
}

TEST_P(InLanguage, FitsItsWindow)
{
    for (const QSize size : {kHandheld, kDesktop}) {
        Show(size);
        ResizeTo(size, Frame());
        const QString name = QString::fromLatin1(GetParam());
        Paint(Frame(), u"%1-main-%2"_s.arg(name, QString::number(size.width())));
        ExpectFits(*Frame().centralWidget(), name + u"-lists"_s, size);
        ASSERT_TRUE(Frame().OpenView({EntryKind::Table, u"Bird Strikes"_s}));
        QTest::qWait(50); // its fields are counted
        Paint(Frame(), u"%1-table-%2"_s.arg(name, QString::number(size.width())));
        ExpectFits(*Frame().centralWidget(), name + u"-records"_s, size);
        Frame().close();
    }
}

TEST_P(InLanguage, TheTourGoesThroughTheWindow)
{
    for (const QSize size : {kHandheld, kDesktop}) {
        ASSERT_TRUE(UsePalette(size == kHandheld ? u"light" : u"dark"));
        Show(size);
        ResizeTo(size, Frame());
        Frame().ShowTour();
        Frame().ShowTour(); // once is enough
        ASSERT_EQ(Frame().findChildren<Tour*>().size(), 1);
        QPointer<Tour> tour = Frame().findChild<Tour*>();
        for (int step = 0; step < 5; ++step) {
            ASSERT_TRUE(tour && tour->isVisible());
            EXPECT_EQ(tour->Step(), step);
            Paint(Frame(), u"%1-tour-%2-%3"_s.arg(QString::fromLatin1(GetParam()), QString::number(step),
                                                  QString::number(size.width())));
            ExpectFits(*tour, u"tour"_s, size);
            QTest::keyClick(QApplication::focusWidget(), Qt::Key_Space);
        }
        QTest::qWait(1);
        EXPECT_FALSE(tour) << "it ends behind its last step";
        Frame().close();
    }
}

// --- the tour ---------------------------------------------------------------------------------------------------

class TourTest : public ProgramFixture {
protected:
    Tour* Begin(QSize size)
    {
        Start();
        Show(size);
        ResizeTo(size, Frame());
        Frame().ShowTour();
        return Frame().findChild<Tour*>();
    }
};

TEST_F(TourTest, IsLeftAtAnyStepWithEscapeOrItsCross)
{
    QPointer<Tour> tour = Begin(kHandheld);
    ASSERT_TRUE(tour);
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Space);
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
    QTest::qWait(1);
    EXPECT_FALSE(tour);
    Frame().ShowTour();
    tour = Frame().findChild<Tour*>();
    tour->findChild<QToolButton*>()->click();
    QTest::qWait(1);
    EXPECT_FALSE(tour);
}

TEST_F(TourTest, KeepsTheTabKey)
{
    const Tour* tour = Begin(kHandheld);
    ASSERT_TRUE(tour);
    for (const Qt::Key key : {Qt::Key_Tab, Qt::Key_Backtab}) {
        for (int i = 0; i < 4; ++i) {
            QTest::keyClick(QApplication::focusWidget(), key);
            EXPECT_TRUE(tour->isAncestorOf(QApplication::focusWidget())) << i;
        }
    }
}

TEST_F(TourTest, FollowsTheWindowsSize)
{
    Tour* tour = Begin(kDesktop);
    ASSERT_TRUE(tour);
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Space);
    Frame().resize(kHandheld);
    QTest::qWait(10);
    EXPECT_EQ(tour->size(), Frame().size());
    ExpectFits(*tour, u"tour-resized"_s, kHandheld);
}

// The program itself, as it is started for the first time; a second start ends it.
class FirstStart : public ProgramFixture {
protected:
    // The profile's word on the tour, after the program has run for a moment.
    QString TourSeenAfter(const QStringList& arguments)
    {
        QProcess program;
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        environment.insert(u"QT_QPA_PLATFORM"_s, u"offscreen"_s);
        program.setProcessEnvironment(environment);
        program.start(QStringLiteral(MIREL_WINDOW), QStringList{u"--home"_s, folder_.path()} + arguments);
        EXPECT_TRUE(program.waitForStarted());
        const QString profile = PathOf(u"Mirel.ini"_s);
        const auto seen = [&] { return Profile(profile).ReadText(u"MainView"_s, u"tourSeen"_s, u"0"_s); };
        QDeadlineTimer enough(20'000);
        while (seen() == u"0" && !enough.hasExpired() && arguments.isEmpty())
            QTest::qWait(20);
        program.terminate();
        program.waitForFinished();
        return seen();
    }
};

TEST_F(FirstStart, ShowsTheTourOnceAndNeverToScripts)
{
    EXPECT_EQ(TourSeenAfter({u"--picture"_s, PathOf(u"a.png"_s)}), u"0"_s);
    EXPECT_EQ(TourSeenAfter({u"--version"_s}), u"0"_s);
    EXPECT_EQ(TourSeenAfter({}), u"1"_s);
}

// --- choosing a language ----------------------------------------------------------------------------------------

TEST_F(TourTest, ALanguageIsChosenForTheNextStart)
{
    Start();
    Show(kHandheld);
    ResizeTo(kHandheld, Frame());
    const auto choose = [this](const QString& name) {
        QTimer::singleShot(0, &Frame(), [name] {
            auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
            ASSERT_TRUE(dialog);
            ExpectFits(*dialog, u"language"_s, kHandheld);
            auto* list = dialog->findChild<QListWidget*>();
            const QList<QListWidgetItem*> found = list->findItems(name, Qt::MatchExactly);
            ASSERT_EQ(found.size(), 1) << name.toStdString();
            list->setCurrentItem(found.first());
            dialog->findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok)->click();
        });
        Command(ShellCommand::Language)->trigger();
        return program_->settings.Text(Setting::MainViewLanguage);
    };
    EXPECT_EQ(choose(u"Deutsch"_s), u"de"_s);
    EXPECT_EQ(choose(StringText(Str::LanguageOfSystem)), QString());
}

} // namespace
} // namespace mirel
