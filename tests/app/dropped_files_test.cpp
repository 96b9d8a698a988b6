#include "app/dropped_files.h"

#include "app/main_view_commands.h"
#include "forms/form_file.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"
#include "support/sqlite_file.h"

#include <gtest/gtest.h>

#include <QFile>
#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TEST(DroppedFiles, GoWhereTheirEndingSaysAndElseWhereTheirFirstBytesSay)
{
    QTemporaryDir folder;
    const QString unnamed = folder.filePath(u"export"_s);
    SqliteFile(unnamed).Run("CREATE TABLE t(a)");
    const DroppedFiles files =
        DroppedFiles::Of({u"/a/Shop.CDB"_s, u"/a/x.sqlite3"_s, unnamed, u"/a/b.csv"_s, u"/a/c.TXT"_s,
                          u"/a/f.pfs"_s, u"/a/picture.png"_s, u"/a/.cdb.bak"_s, folder.path()});
    EXPECT_EQ(files.databases, QStringList({u"/a/Shop.CDB"_s, u"/a/x.sqlite3"_s, unnamed}));
    EXPECT_EQ(files.texts, QStringList({u"/a/b.csv"_s, u"/a/c.TXT"_s}));
    EXPECT_EQ(files.forms, QStringList(u"/a/f.pfs"_s));
    EXPECT_EQ(files.others, QStringList({u"/a/picture.png"_s, u"/a/.cdb.bak"_s, folder.path()}));
    EXPECT_FALSE(DroppedFiles::Of({u"/a/picture.png"_s}).IsUsable());
}

TEST(DroppedFiles, AFormFileBringsItsFormAndAsksBeforeItReplacesOne)
{
    QTemporaryDir folder;
    ScriptedPrompt prompt;
    DbConnection connection;
    const ProgramFolder home{folder.path()};
    Settings settings{Profile(home.ProfileFile())};
    DatabaseSession session(connection, home, prompt);
    MainViewState state;
    MainViewCommands commands(session, state, settings, SampleDatabase(home, {}));
    ASSERT_TRUE(commands.NewDatabase(folder.filePath(u"shop.cdb"_s)));
    const QString path = folder.filePath(u"entry.pfs"_s);
    FormDef form;
    form.SetName(u"Entry");
    form.SetTableName(u"Birds");
    QString error;
    ASSERT_TRUE(ExportForm(form, path, error));

    EXPECT_TRUE(commands.ImportFormFile(path));
    ASSERT_TRUE(session.Store().FindForm(u"Entry"));
    EXPECT_EQ(state.Tab(), MainTab::Form);
    ASSERT_TRUE(state.Selected());
    EXPECT_EQ(state.Selected()->name, u"Entry"_s);

    form.SetTableName(u"Bees");
    ASSERT_TRUE(ExportForm(form, path, error));
    prompt.answers = {false, true};
    EXPECT_FALSE(commands.ImportFormFile(path));
    EXPECT_EQ(session.Store().FindForm(u"Entry")->tableName.Text(), u"Birds"_s);
    EXPECT_TRUE(commands.ImportFormFile(path));
    EXPECT_EQ(session.Store().FindForm(u"Entry")->tableName.Text(), u"Bees"_s);
    EXPECT_EQ(session.Store().Forms().size(), 1U);
    EXPECT_EQ(prompt.questions.last(), u"Form \"Entry\" exists:\r\nDo you want to replace the existing form?"_s);

    QFile wrong(folder.filePath(u"wrong.pfs"_s));
    ASSERT_TRUE(wrong.open(QIODevice::WriteOnly) && wrong.write("a,b\n1,2\n") > 0);
    wrong.close();
    EXPECT_FALSE(commands.ImportFormFile(wrong.fileName()));
    EXPECT_FALSE(commands.ImportFormFile(folder.filePath(u"gone.pfs"_s)));
    EXPECT_EQ(prompt.shown.size(), 2);
    EXPECT_EQ(session.Store().Forms().size(), 1U);
}

} // namespace
} // namespace mirel
