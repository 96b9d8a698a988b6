#pragma once

#include "app/ui/look.h"
#include "app/ui/main_frame.h"
#include "app/ui/shell_actions.h"
#include "app/ui/view_tabs.h"
#include "support/scripted_prompt.h"
#include "tableview/record_browser.h"

#include <gtest/gtest.h>

#include <QApplication>
#include <QDir>
#include <QTemporaryDir>
#include <QTest>

#include <memory>

namespace mirel {

// The program with its window, over a folder of its own; it can be ended and started again.
class ProgramFixture : public ::testing::Test {
protected:
    struct Program {
        Program(const QString& folder, UserPrompt& prompt)
            : programFolder{folder}
            , session(connection, programFolder, prompt)
            , commands(session, state, settings,
                       SampleDatabase(programFolder, QStringLiteral(MIREL_SOURCE_DIR "/samples")))
        {
        }

        ProgramFolder programFolder;
        Profile profile{programFolder.ProfileFile()};
        Settings settings{profile};
        DbConnection connection;
        DatabaseSession session;
        MainViewState state;
        MainViewCommands commands;
        std::unique_ptr<CMainFrame> frame;
    };

    static void SetUpTestSuite() { QApplication::setStyle(new TouchTargetStyle(QStringLiteral("Fusion"))); }

    // Without a window.
    void Start(UserPrompt& prompt) { program_ = std::make_unique<Program>(folder_.path(), prompt); }
    void Start() { Start(prompt_); }
    void Show(QSize size)
    {
        program_->frame = std::make_unique<CMainFrame>(program_->session, program_->state, program_->commands,
                                                       program_->settings, program_->profile);
        Frame().setWindowState(Qt::WindowNoState); // the test's screen is small: it would fill that
        Frame().move(0, 0);
        Frame().resize(size);
        Frame().show();
        ASSERT_TRUE(QTest::qWaitForWindowActive(&Frame()));
    }
    // The program ends and is started again.
    void Restart(QSize size)
    {
        EXPECT_TRUE(Frame().close());
        program_->commands.KeepForNextRun();
        program_.reset();
        Start();
        program_->commands.RestoreLastRun({});
        Show(size);
        Frame().RestoreViews();
    }

    bool Execute(const QString& statement)
    {
        return Session().GetCatalog().ExecuteStatement(Session().Location(), statement);
    }
    QString PathOf(const QString& name) const { return QDir(folder_.path()).filePath(name); }

    CMainFrame& Frame() { return *program_->frame; }
    ViewTabs& Tabs() { return *Frame().findChild<ViewTabs*>(); }
    QAction* Command(ShellCommand id) { return Frame().findChild<ShellActions*>()->Of(id); }
    MainViewCommands& Commands() { return program_->commands; }
    MainViewState& State() { return program_->state; }
    DatabaseSession& Session() { return program_->session; }
    CTableView* OpenTable(const QString& name)
    {
        return Frame().OpenTable(
            {.title = name, .statement = RecordBrowser::StatementOfTable(name), .table = name});
    }

    QTemporaryDir folder_;
    ScriptedPrompt prompt_;
    std::unique_ptr<Program> program_;
};

} // namespace mirel
