#include "platform/folder_choice.h"

#include "support/printing.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class FolderChoiceTest : public ::testing::Test {
protected:
    void SetUp() override
    {
        QDir(Root()).mkpath(u"Archive/2001"_s);
        for (const QString& name : {u"b.cdb"_s, u"A.CDB"_s, u"notes.txt"_s, u".hidden.cdb"_s}) {
            QFile file(Root() + u'/' + name);
            EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        }
    }

    QString Root() const { return QDir(folder_.path()).canonicalPath(); }
    static QStringList Names(const FolderChoice& choice)
    {
        QStringList names;
        for (const FolderChoice::Entry& entry : choice.Entries())
            names += entry.folder ? entry.name + u'/' : entry.name;
        return names;
    }

private:
    QTemporaryDir folder_;
};

TEST_F(FolderChoiceTest, ListsFoldersAndTheFilesOfItsKind)
{
    EXPECT_EQ(Names(FolderChoice(Root(), {u".cdb"_s})), QStringList({u"Archive/"_s, u"A.CDB"_s, u"b.cdb"_s}));
    EXPECT_EQ(Names(FolderChoice(Root(), {u".csv"_s, u".TXT"_s})), QStringList({u"Archive/"_s, u"notes.txt"_s}));
}

TEST_F(FolderChoiceTest, WalksDownAndUpToTheRoot)
{
    FolderChoice choice(Root(), {u".cdb"_s});
    EXPECT_TRUE(choice.Enter(u"Archive"_s));
    EXPECT_EQ(choice.PathOf(u"x.cdb"_s), Root() + u"/Archive/x.cdb"_s);
    EXPECT_FALSE(choice.Enter(u"2002"_s));
    EXPECT_FALSE(choice.Enter(QString()));
    choice.GoUp();
    EXPECT_FALSE(choice.Enter(u"b.cdb"_s)) << "a file is no folder";
    EXPECT_EQ(choice.Folder(), Root());
    for (int i = 0; i < 100 && choice.CanGoUp(); ++i)
        choice.GoUp();
    EXPECT_TRUE(QDir(choice.Folder()).isRoot());
}

TEST_F(FolderChoiceTest, StartsAboveAFolderThatIsGone)
{
    EXPECT_EQ(FolderChoice(Root() + u"/gone/further"_s, {u".cdb"_s}).Folder(), Root());
}

} // namespace
} // namespace mirel
