// A database is created, opened, used, backed up, checked and deleted by a mouse, a finger or a keyboard alone,
// and the window takes what it is given from outside.
#include "app/ui/findings_dialog.h"
#include "app/ui/information_dialog.h"
#include "app/ui/message_box_prompt.h"
#include "app/ui/side_tree.h"
#include "app_ui/hands.h"
#include "app_ui/on_dialog.h"
#include "app_ui/program_fixture.h"
#include "platform/ui/entry_list.h"
#include "resources/string_table.h"
#include "support/printing.h"
#include "support/sqlite_file.h"
#include "support/ui/window_sizes.h"
#include "tableview/ui/table_view.h"

#include <QAbstractButton>
#include <QDragEnterEvent>
#include <QDropEvent>
#include <QFileDialog>
#include <QLabel>
#include <QLineEdit>
#include <QMessageBox>
#include <QMimeData>
#include <QProcess>
#include <QUrl>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kPatienceMs = 20'000;

QString Plain(const QString& text)
{
    return QString(text).remove(u'&').remove(u'…');
}

QAbstractButton* ButtonOf(QWidget& dialog, const QString& text)
{
    for (auto* button : dialog.findChildren<QAbstractButton*>()) {
        if (button->isVisible() && Plain(button->text()) == text)
            return button;
    }
    return nullptr;
}

class ShellTest : public ProgramFixture {
protected:
    void SetUp() override
    {
        // The file dialog begins in the documents of a user without any.
        home_ = qgetenv("HOME");
        qputenv("HOME", folder_.path().toUtf8());
        QDir().mkpath(folder_.path() + u"/Documents"_s);
    }
    void TearDown() override { qputenv("HOME", home_); }

    void Press(Hand& hand, QWidget& dialog, const QString& text)
    {
        QAbstractButton* button = ButtonOf(dialog, text);
        ASSERT_TRUE(button) << text.toStdString() << " in " << dialog.windowTitle().toStdString();
        hand.Press(*button);
    }
    void Answer(Script& script, Hand& hand, QMessageBox::StandardButton answer)
    {
        script.On<QMessageBox>([&hand, answer](QMessageBox& box) { hand.Press(*box.button(answer)); });
    }
    // In either file dialog: the list with that file in it, and the button that takes it.
    void ChooseFile(Script& script, Hand& hand, const QString& file, Str accept)
    {
        script.On<QDialog>([this, &hand, file, accept](QDialog& dialog) {
            auto* list = dialog.findChild<EntryList*>();
            auto* view =
                list ? static_cast<QAbstractItemView*>(list) : dialog.findChild<QListView*>(u"listView"_s);
            ASSERT_TRUE(view);
            const auto rowOf = [view, &file] {
                for (int row = 0; row < view->model()->rowCount(view->rootIndex()); ++row) {
                    const QModelIndex index = view->model()->index(row, 0, view->rootIndex());
                    if (index.data(Qt::DisplayRole).toString() == file ||
                        index.data(Qt::AccessibleTextRole).toString().contains(file))
                        return row;
                }
                return -1;
            };
            EXPECT_TRUE(QTest::qWaitFor([&] { return rowOf() >= 0; })) << file.toStdString();
            hand.Pick(*view, std::max(rowOf(), 0));
            Press(hand, dialog, Plain(StringText(accept)));
        });
    }
    void Give(Script& script, Hand& hand, Str command)
    {
        script.Then([this] { return QApplication::activeModalWidget() ? nullptr : &Frame(); },
                    [this, &hand, command](QWidget&) {
                        hand.Choose(Frame(), Plain(StringText(Str::MenuDatabase)), Plain(StringText(command)));
                    });
    }
    bool Finish(const Script& script)
    {
        return QTest::qWaitFor([&] { return script.IsDone() && !QApplication::activeModalWidget(); }, kPatienceMs);
    }

    // From nothing to nothing.
    void GoThrough(Hand& hand, QSize size)
    {
        Start(boxes_);
        Show(size);
        const QString folder = folder_.path() + u"/Documents/"_s;
        const QString first = folder + u"Database.cdb"_s;
        Script script;
        Give(script, hand, Str::CommandNewDatabase);
        script.On<QDialog>(
            [this, &hand](QDialog& dialog) { Press(hand, dialog, Plain(StringText(Str::CommandNew))); });
        ASSERT_TRUE(Finish(script));
        ASSERT_EQ(State().DatabasePath(), first);

        ASSERT_TRUE(Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40))"_s));
        ASSERT_TRUE(Execute(u"INSERT INTO Birds (Name) VALUES ('Wren')"_s));
        State().SetTab(MainTab::Table);
        Commands().Refill();
        Frame().ShowState();
        QCoreApplication::processEvents();
        auto* entries = Frame().findChild<EntryList*>(u"entries"_s);
        auto* tree = Frame().findChild<SideTree*>();
        if (entries && entries->isVisible()) // of a narrow window
            hand.Open(*entries, 0);
        else
            OpenInTree(*tree, u"Birds"_s);
        auto* table = qobject_cast<CTableView*>(Tabs().Front());
        ASSERT_TRUE(table);
        EXPECT_EQ(table->Browser().KnownCount(), 1);
        Frame().findChild<ShellActions*>()->Of(ShellCommand::CloseView)->trigger();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);

        Give(script, hand, Str::CommandBackUp);
        script.On<QDialog>(
            [this, &hand](QDialog& dialog) { Press(hand, dialog, Plain(StringText(Str::CommandBackUp))); });
        ASSERT_TRUE(Finish(script));
        EXPECT_EQ(Frame().size(), size) << "the line that tells of the copy";
        const QStringList copies = QDir(folder).entryList({u"*copy*.cdb"_s});
        ASSERT_EQ(copies.size(), 1);
        EXPECT_EQ(SqliteFile(folder + copies.first()).Text("SELECT Name FROM Birds"), u"Wren"_s);

        Give(script, hand, Str::CommandInformation);
        script.On<CInformationDialog>([this, &hand](CInformationDialog& dialog) {
            Press(hand, dialog, Plain(StringText(Str::CommandCheck)));
            EXPECT_TRUE(QTest::qWaitFor([&dialog] {
                return std::ranges::any_of(dialog.findChildren<QLabel*>(), [](const QLabel* label) {
                    return label->text() == StringText(Str::CheckClean);
                });
            }));
            Press(hand, dialog, Plain(StringText(Str::CommandCompact)));
            Press(hand, dialog, Plain(StringText(Str::ActionClose)));
        });
        ASSERT_TRUE(Finish(script));
        EXPECT_EQ(Frame().size(), size);

        Give(script, hand, Str::CommandOpenDatabase);
        ChooseFile(script, hand, copies.first(), Str::CommandOpen);
        ASSERT_TRUE(Finish(script));
        EXPECT_EQ(State().DatabaseName(), copies.first());

        for (const std::vector<QMessageBox::StandardButton>& answers : {std::vector{QMessageBox::No},
                                                                        {QMessageBox::Yes, QMessageBox::No},
                                                                        {QMessageBox::Yes, QMessageBox::Yes}}) {
            ASSERT_TRUE(QFile::exists(folder + copies.first()));
            EXPECT_EQ(State().DatabaseName(), copies.first()) << "No leaves all as it is";
            Give(script, hand, Str::CommandDeleteDatabase);
            ChooseFile(script, hand, copies.first(), Str::CommandDelete);
            for (const QMessageBox::StandardButton answer : answers)
                Answer(script, hand, answer);
            ASSERT_TRUE(Finish(script));
        }
        EXPECT_FALSE(QFile::exists(folder + copies.first()));
        EXPECT_FALSE(State().HasDatabase());
        EXPECT_TRUE(QFile::exists(first));
        EXPECT_TRUE(Frame().close());
        program_.reset();
    }
    static void OpenInTree(SideTree& tree, const QString& name) // with a mouse
    {
        for (QModelIndex index = tree.model()->index(0, 0); index.isValid(); index = tree.indexBelow(index)) {
            if (index.data().toString() != name)
                continue;
            const QPoint place = tree.visualRect(index).center();
            QTest::mouseClick(tree.viewport(), Qt::LeftButton, {}, place);
            QTest::mouseDClick(tree.viewport(), Qt::LeftButton, {}, place);
            return;
        }
        ADD_FAILURE() << "no " << name.toStdString();
    }

    void Drop(const QStringList& paths)
    {
        QMimeData data;
        QList<QUrl> urls;
        for (const QString& path : paths)
            urls += QUrl::fromLocalFile(path);
        data.setUrls(urls);
        QDragEnterEvent enter(QPoint(50, 50), Qt::CopyAction | Qt::MoveAction, &data, Qt::LeftButton, {});
        QApplication::sendEvent(&Frame(), &enter);
        EXPECT_TRUE(enter.isAccepted());
        QDropEvent drop(QPointF(50, 50), Qt::CopyAction | Qt::MoveAction, &data, Qt::LeftButton, {});
        QApplication::sendEvent(&Frame(), &drop);
        QCoreApplication::processEvents();
    }

    MessageBoxPrompt boxes_;
    QByteArray home_;
};

TEST_F(ShellTest, IsWorkedByAMouseAlone)
{
    Mouse mouse;
    GoThrough(mouse, kDesktop);
}

TEST_F(ShellTest, IsWorkedByAMouseAloneOnAHandheld)
{
    Mouse mouse;
    GoThrough(mouse, kHandheld);
}

TEST_F(ShellTest, IsWorkedByAFingerAlone)
{
    Finger finger;
    GoThrough(finger, kHandheld);
}

TEST_F(ShellTest, IsWorkedByAKeyboardAlone)
{
    Keyboard keyboard;
    GoThrough(keyboard, kHandheld);
}

TEST_F(ShellTest, DroppedFilesGoWhereTheyBelongAndWrongOnesLeaveTheDatabaseOpen)
{
    Start();
    ASSERT_TRUE(Commands().NewDatabase(PathOf(u"shop.cdb"_s)));
    Show(kDesktop);
    SqliteFile(PathOf(u"foreign.sqlite"_s)).Run("CREATE TABLE t(a); INSERT INTO t VALUES(1)");
    QFile text(PathOf(u"text.cdb"_s));
    ASSERT_TRUE(text.open(QIODevice::WriteOnly) && text.write("no database\n") > 0);
    text.close();
    Drop({PathOf(u"text.cdb"_s)});
    ASSERT_EQ(prompt_.shown.size(), 1);
    EXPECT_EQ(State().DatabaseName(), u"shop.cdb"_s);
    Drop({PathOf(u"shop.cdb"_s), PathOf(u"foreign.sqlite"_s)});
    EXPECT_EQ(prompt_.shown.last(), StringText(Str::DropOneDatabase));
    EXPECT_EQ(State().DatabaseName(), u"shop.cdb"_s);
    Drop({PathOf(u"foreign.sqlite"_s), PathOf(u"gone.png"_s)});
    EXPECT_EQ(prompt_.shown.last(), StringText(Str::DropNotUsable, {u"gone.png"_s}));
    EXPECT_EQ(State().DatabaseName(), u"foreign.sqlite"_s);
    EXPECT_EQ(program_->settings.RecentDatabases().first(), PathOf(u"foreign.sqlite"_s));
    Drop({PathOf(u"gone.cdb"_s)});
    EXPECT_EQ(State().DatabaseName(), u"foreign.sqlite"_s);
}

TEST_F(ShellTest, CompactingOpensTheViewsAgain)
{
    Start();
    ASSERT_TRUE(Commands().NewDatabase(PathOf(u"shop.cdb"_s)));
    ASSERT_TRUE(Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40))"_s));
    ASSERT_TRUE(Execute(u"INSERT INTO Birds (Name) VALUES ('Wren')"_s));
    Commands().Refill();
    Show(kDesktop);
    CTableView* table = OpenTable(u"Birds"_s);
    ASSERT_TRUE(table);
    FocusView(*table);
    for (const QChar each : u"Owl"_s) // the first one moves the focus into the editor
        QTest::keyClicks(QApplication::focusWidget(), QString(each));
    Command(ShellCommand::Compact)->trigger();
    EXPECT_TRUE(prompt_.shown.isEmpty()) << prompt_.shown.join(u'\n').toStdString();
    EXPECT_EQ(SqliteFile(PathOf(u"shop.cdb"_s)).Text("SELECT Name FROM Birds"), u"Owl"_s) << "written before";
    auto* again = qobject_cast<CTableView*>(Tabs().Front());
    ASSERT_TRUE(again);
    EXPECT_EQ(again->Browser().KnownCount(), 1);
}

// --- the profile ----------------------------------------------------------------------------------------------

// The keys that the window reads and writes are those that the command line shows.
TEST_F(ShellTest, EveryKeyThatAWholeRunWritesIsOneThatTheCommandLineShows)
{
    Start();
    ASSERT_TRUE(Commands().NewDatabase(PathOf(u"shop.cdb"_s)));
    ASSERT_TRUE(Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40))"_s));
    Commands().Refill();
    Show(kDesktop);
    for (const SettingRow& row : Settings::Rows()) // as every dialog of options does
        EXPECT_TRUE(program_->settings.SetText(row.id, program_->settings.Text(row.id)));
    Restart(kDesktop);
    EXPECT_TRUE(Frame().close());
    EXPECT_TRUE(Commands().KeepForNextRun());

    QFile profile(PathOf(u"Mirel.ini"_s));
    ASSERT_TRUE(profile.open(QIODevice::ReadOnly));
    QString section;
    QStringList written;
    for (const QString& line : QString::fromUtf8(profile.readAll()).split(u'\n')) {
        if (line.startsWith(u'['))
            section = line.mid(1).chopped(1).trimmed();
        const bool isOurs =
            section == u"Config" || section == u"MainView" || section == u"TableView" || section == u"FormView";
        const QString key = line.section(u'=', 0, 0);
        if (!isOurs || !line.contains(u'='))
            continue;
        written += section + u'/' + key;
        QProcess shown;
        shown.start(QStringLiteral(MIREL_CLI), {u"config"_s, u"get"_s, section, key, u"--home"_s, folder_.path()});
        ASSERT_TRUE(shown.waitForFinished(kPatienceMs));
        EXPECT_EQ(shown.exitCode(), 0) << section.toStdString() << "/" << key.toStdString();
    }
    EXPECT_EQ(written.size(), qsizetype(Settings::Rows().size())) << "and all that it shows are written";
}

TEST_F(ShellTest, ADamagedProfileGivesTheDefaultsAndAHomeThatIsAFileIsToldOnce)
{
    for (const QByteArray& bytes :
         {QByteArray("[Config]\nActiveDB=\"unclosed\nopenByDoubleClick=maybe\n[MainView]\nBkColor=red\nFont=(1\n"),
          QByteArray("\xff\xfe\0[Config", 10), QByteArray("[Config]\n").repeated(5000)}) {
        QFile profile(PathOf(u"Mirel.ini"_s));
        ASSERT_TRUE(profile.open(QIODevice::WriteOnly) && profile.write(bytes) == bytes.size());
        profile.close();
        Start();
        Commands().RestoreLastRun({});
        Show(kHandheld);
        EXPECT_FALSE(State().HasDatabase());
        EXPECT_TRUE(State().OpensByDoubleTap());
        EXPECT_TRUE(prompt_.shown.isEmpty());
        EXPECT_TRUE(Frame().close());
        EXPECT_TRUE(Commands().KeepForNextRun());
        EXPECT_EQ(program_->settings.Text(Setting::MainViewBkColor), QString());
        program_.reset();
    }
    QFile home(PathOf(u"home"_s));
    ASSERT_TRUE(home.open(QIODevice::WriteOnly));
    program_ = std::make_unique<Program>(home.fileName(), prompt_);
    Commands().RestoreLastRun({});
    Show(kHandheld);
    const auto isTold = [this] {
        return std::ranges::any_of(Frame().findChildren<QLabel*>(), [](const QLabel* label) {
            return label->isVisible() && label->text().contains(u"Mirel.ini"_s);
        });
    };
    EXPECT_TRUE(QTest::qWaitFor(isTold, kPatienceMs));
    EXPECT_TRUE(Frame().close());
    EXPECT_FALSE(Commands().KeepForNextRun());
}

TEST_F(ShellTest, ARememberedDatabaseThatIsGoneIsReportedAndTheFoldersAreMadeAgain)
{
    Start();
    ASSERT_TRUE(Commands().NewDatabase(PathOf(u"shop.cdb"_s)));
    ASSERT_TRUE(Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40))"_s));
    Commands().Refill();
    State().SetTab(MainTab::Table);
    State().Select({EntryKind::Table, u"Birds"_s, {}, false});
    ASSERT_TRUE(Commands().AddFavorite());
    Show(kDesktop);
    EXPECT_TRUE(Frame().close());
    ASSERT_TRUE(Commands().KeepForNextRun());
    program_.reset();
    ASSERT_TRUE(QDir(PathOf(u"Forms"_s)).removeRecursively());
    Start();
    Commands().RestoreLastRun({});
    EXPECT_TRUE(QFileInfo(PathOf(u"Forms"_s)).isDir());
    Show(kDesktop);
    auto* tree = Frame().findChild<SideTree*>();
    EXPECT_EQ(tree->currentIndex().data().toString(), u"Birds"_s) << "selected in the side bar too";
    EXPECT_TRUE(Frame().close());
    ASSERT_TRUE(Commands().KeepForNextRun());
    program_.reset();
    ASSERT_TRUE(QFile::remove(PathOf(u"shop.cdb"_s)));
    Start();
    Commands().RestoreLastRun({});
    EXPECT_EQ(prompt_.shown.size(), 1);
    Show(kHandheld);
    EXPECT_FALSE(State().HasDatabase());
}

} // namespace
} // namespace mirel
