// Somebody types in a window of a process of its own, which is killed; the next start offers what was typed.
#include "app/ui/drafts_dialog.h"
#include "app_ui/on_dialog.h"
#include "app_ui/program_fixture.h"
#include "forms/ui/form_eng_view.h"
#include "platform/ui/entry_list.h"
#include "resources/string_table.h"
#include "support/printing.h"
#include "support/sqlite_file.h"
#include "support/ui/window_sizes.h"
#include "tableview/ui/table_view.h"

#include <QClipboard>
#include <QLabel>
#include <QPlainTextEdit>
#include <QProcess>
#include <QPushButton>

#include <csignal>
#include <unistd.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kPatienceMs = 20'000;

class DraftsWindowTest : public ProgramFixture {
protected:
    void SetUp() override
    {
        Start();
        ASSERT_TRUE(Commands().NewDatabase(path_));
        ASSERT_TRUE(Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40),[Wings] SmallInt,[Note] Text)"_s));
        for (const QString& name : {u"Wren"_s, u"Owl"_s, u"Robin"_s})
            ASSERT_TRUE(Execute(u"INSERT INTO Birds (Name,Wings,Note) VALUES ('%1',2,'old')"_s.arg(name)));
        ControlDef box;
        box.type = ControlType::EditBox;
        box.name.Set(u"NameBox");
        box.hasSource = 1;
        box.SetSource(u"Birds.Name"_s);
        box.left = box.top = 5;
        box.width = 100;
        box.height = 18;
        FormDef form;
        form.SetName(u"Bird form");
        form.SetTableName(u"Birds");
        form.AddControl(box);
        Session().Store().AddForm(form);
        ASSERT_TRUE(Session().Store().Save());
        program_.reset();
    }

    QStringList DraftFiles() const { return QDir(PathOf(u"Drafts"_s)).entryList({u"*.drafts"_s}, QDir::Files); }
    bool IsKept(const QString& text) const
    {
        for (const QString& name : DraftFiles()) {
            QFile file(PathOf(u"Drafts/"_s + name));
            if (file.open(QIODevice::ReadOnly) && file.readAll().contains(text.toUtf8()))
                return true;
        }
        return false;
    }

    // What was typed is on disk by the time this returns.
    void Type(QProcess& typist, const QString& view, const QString& place, const QString& text)
    {
        typist.start(QStringLiteral(MIREL_TYPIST), {folder_.path(), path_, view, place, text});
        ASSERT_TRUE(typist.waitForStarted());
        QByteArray said;
        while (!said.contains("typed") && typist.waitForReadyRead(kPatienceMs))
            said += typist.readAllStandardOutput();
        ASSERT_TRUE(said.contains("typed")) << typist.readAllStandardError().toStdString();
        for (int i = 0; i < 1500 && !IsKept(text); ++i)
            ::usleep(10'000);
        ASSERT_TRUE(IsKept(text)) << text.toStdString();
    }
    static void Kill(QProcess& typist)
    {
        ::kill(pid_t(typist.processId()), SIGKILL);
        ASSERT_TRUE(typist.waitForFinished(kPatienceMs));
        ASSERT_EQ(typist.exitStatus(), QProcess::CrashExit);
    }
    void TypeAndKill(const QString& view, const QString& place, const QString& text)
    {
        QProcess typist;
        Type(typist, view, place, text);
        Kill(typist);
    }

    static void Press(QWidget& dialog, Str text)
    {
        for (auto* button : dialog.findChildren<QPushButton*>()) {
            if (button->text() == StringText(text) && button->isEnabled())
                return QTest::mouseClick(button, Qt::LeftButton);
        }
        ADD_FAILURE() << "no button " << StringText(text).toStdString();
        static_cast<QDialog&>(dialog).reject();
    }
    static bool CanPutBack(const QWidget& dialog)
    {
        for (const auto* button : dialog.findChildren<QPushButton*>()) {
            if (button->text() == StringText(Str::DraftPutBack))
                return button->isEnabled();
        }
        return false;
    }
    static QString ShownText(const QWidget& dialog) { return dialog.findChild<QPlainTextEdit*>()->toPlainText(); }

    // The next start; `act` is what is done in the dialog that offers the drafts.
    void NextStart(QSize size, std::function<void(CDraftsDialog&)> act)
    {
        Script script;
        if (act)
            script.On<CDraftsDialog>(std::move(act));
        Start();
        Commands().RestoreLastRun(path_);
        program_->frame =
            std::make_unique<CMainFrame>(Session(), State(), Commands(), program_->settings, program_->profile);
        Frame().resize(size);
        Frame().show(); // it may not become active: the dialog comes at once
        Frame().RestoreViews();
        EXPECT_TRUE(
            QTest::qWaitFor([&] { return script.IsDone() && !QApplication::activeModalWidget(); }, kPatienceMs));
        Frame().activateWindow();
        EXPECT_TRUE(QTest::qWaitForWindowActive(&Frame()));
    }
    void End()
    {
        EXPECT_TRUE(Frame().close());
        program_.reset();
    }
    QString Stored(const QByteArray& query) { return SqliteFile(path_).Text(query); }
    HostedView* Front() { return Tabs().Front(); }

    const QString path_ = PathOf(u"shop.cdb"_s);
};

TEST_F(DraftsWindowTest, KilledWhileTypingInTheGridTheTextComesBackIntoTheSameCell)
{
    struct Row {
        const char* what;
        QString place;
        QString text;
        QString record; // by its name
        int field;
        QSize size;
    };
    for (const Row& row : {Row{"in the cell", u"d"_s, u"Tawny"_s, u"Owl"_s, 0, kDesktop},
                           Row{"on a handheld", u"ddr"_s, u"4"_s, u"Robin"_s, 1, kHandheld},
                           Row{"zoomed", u"rrz"_s, u"long story"_s, u"Wren"_s, 2, kDesktop}}) {
        SCOPED_TRACE(row.what);
        TypeAndKill(u"table:Birds"_s, row.place, row.text);
        NextStart(row.size, [&](CDraftsDialog& dialog) {
            EXPECT_TRUE(ShownText(dialog).contains(row.text));
            Press(dialog, Str::DraftPutBack);
        });
        auto* table = qobject_cast<CTableView*>(Front());
        ASSERT_TRUE(table);
        RecordBrowser& browser = const_cast<RecordBrowser&>(table->Browser());
        EXPECT_TRUE(browser.HasPendingEdit());
        EXPECT_TRUE(browser.SelectedText().contains(row.text));
        EXPECT_EQ(browser.SelectedField(), row.field);
        EXPECT_EQ(browser.Recordset().FieldValue(0).ToText(), row.record);
        EXPECT_EQ(
            Stored("SELECT count(*) FROM Birds WHERE Name IN ('Wren','Owl','Robin') AND Wings=2 AND Note='old'"),
            u"3"_s)
            << "nothing is written by that";
        EXPECT_EQ(DraftFiles().size(), 1) << "it is kept until it is saved";
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
        EXPECT_FALSE(browser.HasPendingEdit());
        EXPECT_TRUE(DraftFiles().isEmpty()) << "given up";
        End();
    }
}

TEST_F(DraftsWindowTest, KilledWhileTypingIntoANewRecordItComesBackThere)
{
    TypeAndKill(u"table:Birds"_s, u"n"_s, u"Heron"_s);
    NextStart(kDesktop, [](CDraftsDialog& dialog) { Press(dialog, Str::DraftPutBack); });
    ASSERT_TRUE(Front());
    EXPECT_TRUE(Front()->HasEdits());
    End();
    EXPECT_EQ(Stored("SELECT Name FROM Birds WHERE rowid=4"), u"Heron"_s) << "saved as the window closed";
    EXPECT_TRUE(DraftFiles().isEmpty());
}

TEST_F(DraftsWindowTest, KilledWhileTypingInAFormTheTextComesBackIntoTheSameControl)
{
    TypeAndKill(u"form:Bird form"_s, {}, u"Jenny"_s);
    NextStart(kHandheld, [](CDraftsDialog& dialog) {
        EXPECT_TRUE(ShownText(dialog).contains(u"Jenny"_s));
        Press(dialog, Str::DraftPutBack);
    });
    auto* form = qobject_cast<CFormEngView*>(Front());
    ASSERT_TRUE(form);
    EXPECT_TRUE(form->HasEdits());
    EXPECT_TRUE(form->Form().ShownText(0).contains(u"Jenny"_s));
    EXPECT_EQ(form->Form().CurrentRecord(), 0);
    EXPECT_EQ(Stored("SELECT Name FROM Birds WHERE rowid=1"), u"Wren"_s);
    prompt_.answers = {true};
    End();
    EXPECT_TRUE(DraftFiles().isEmpty()) << "its changes were given up";
}

TEST_F(DraftsWindowTest, WhereTheRecordIsAnotherByNowTheTextCanOnlyBeCopied)
{
    TypeAndKill(u"table:Birds"_s, u"d"_s, u"Tawny"_s);
    SqliteFile(path_).Run("UPDATE Birds SET Wings=1 WHERE Name='Owl'");
    NextStart(kHandheld, [](CDraftsDialog& dialog) {
        EXPECT_FALSE(CanPutBack(dialog));
        Press(dialog, Str::DraftCopy);
        EXPECT_TRUE(QApplication::clipboard()->text().contains(u"Tawny"_s));
        Press(dialog, Str::DraftLater);
    });
    EXPECT_FALSE(Front() && Front()->HasEdits());
    End();
    EXPECT_EQ(DraftFiles().size(), 1) << "asked again the next time";
    NextStart(kDesktop, [](CDraftsDialog& dialog) { Press(dialog, Str::DraftDiscard); });
    EXPECT_TRUE(DraftFiles().isEmpty());
    End();
    NextStart(kDesktop, nullptr);
    EXPECT_FALSE(QApplication::activeModalWidget());
    End();
}

TEST_F(DraftsWindowTest, TwoThatWereKilledAreBothOffered)
{
    QProcess one;
    QProcess other;
    Type(one, u"table:Birds"_s, u"d"_s, u"Tawny"_s);
    Type(other, u"form:Bird form"_s, {}, u"Jenny"_s); // is not offered what the living one keeps
    EXPECT_EQ(DraftFiles().size(), 2);
    Kill(one);
    Kill(other);
    NextStart(kDesktop, [](CDraftsDialog& dialog) {
        EXPECT_EQ(dialog.findChild<EntryList*>()->model()->rowCount(), 2);
        Press(dialog, Str::DraftPutBack);
        Press(dialog, Str::DraftPutBack);
    });
    int edited = 0;
    for (const HostedView* view : Tabs().Views())
        edited += view->HasEdits() ? 1 : 0;
    EXPECT_EQ(edited, 2);
    prompt_.answers = {true, true};
    End();
    EXPECT_TRUE(DraftFiles().isEmpty());
}

TEST_F(DraftsWindowTest, WhereTheyCannotBeKeptTheWindowSaysSoOnce)
{
    QFile inTheWay(PathOf(u"Drafts"_s));
    ASSERT_TRUE(inTheWay.open(QIODevice::WriteOnly));
    NextStart(kDesktop, nullptr);
    auto* table = OpenTable(u"Birds"_s);
    ASSERT_TRUE(table);
    FocusView(*table);
    const auto notice = [this] {
        for (const QLabel* label : Frame().findChildren<QLabel*>()) {
            if (label->isVisible() && label->text().contains(PathOf(u"Drafts"_s)))
                return true;
        }
        return false;
    };
    QTest::keyClicks(QApplication::focusWidget(), u"x"_s);
    EXPECT_TRUE(QTest::qWaitFor(notice, kPatienceMs));
    EXPECT_TRUE(table->Browser().HasPendingEdit());
    End();
}

} // namespace
} // namespace mirel
