#include "app/database_session.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <csignal>

#include <sys/resource.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// As long as it lives, no file of this process grows.
class FullDisk {
public:
    FullDisk()
        : signal_(std::signal(SIGXFSZ, SIG_IGN))
    {
        getrlimit(RLIMIT_FSIZE, &before_);
        const rlimit none{0, before_.rlim_max};
        setrlimit(RLIMIT_FSIZE, &none);
    }
    ~FullDisk()
    {
        setrlimit(RLIMIT_FSIZE, &before_);
        std::signal(SIGXFSZ, signal_);
    }
    Q_DISABLE_COPY_MOVE(FullDisk)

private:
    void (*signal_)(int);
    rlimit before_{};
};

class SessionTest : public ::testing::Test {
protected:
    QString File(const QString& name) const { return folder_.filePath(name); }
    void SaveQuery(const QString& name)
    {
        EXPECT_TRUE(session_.Store().Apply([&](FormStore& store) {
            QueryDef query;
            query.SetName(name);
            store.AddQuery(query);
            return true;
        }));
    }
    QStringList SideFiles() const { return QDir(home_.FormsFolder()).entryList(QDir::Files); }

    QTemporaryDir folder_;
    ProgramFolder home_{folder_.filePath(u"home"_s)};
    DbConnection connection_;
    ScriptedPrompt prompt_;
    Catalog catalog_{connection_, prompt_};
    DatabaseSession session_{connection_, home_, prompt_};
};

TEST_F(SessionTest, StampsADatabaseOnceAndFindsItsStoreAgain)
{
    ASSERT_TRUE(session_.Create(File(u"O'Brien's.cdb"_s)));
    const QString stamp = session_.Stamp();
    EXPECT_EQ(stamp.size(), 14);
    EXPECT_EQ(session_.SideFile(), home_.FormsFolder() + u"/Mirel_%1.RAF"_s.arg(stamp));
    EXPECT_TRUE(QFile::exists(session_.SideFile())) << "from the first opening on";
    SaveQuery(u"kept"_s);
    EXPECT_TRUE(session_.SetFavorites({u"query:kept"_s}));

    const QString moved = File(u"moved.cdb"_s);
    const QString path = session_.Location().Text();
    session_.Close();
    EXPECT_FALSE(session_.IsOpen());
    EXPECT_TRUE(session_.Store().Queries().empty());
    ASSERT_TRUE(QFile::rename(path, moved));
    ASSERT_TRUE(session_.Open(moved));
    EXPECT_EQ(session_.Stamp(), stamp);
    EXPECT_TRUE(session_.Store().FindQuery(u"kept"));
    EXPECT_EQ(session_.Favorites(), QStringList{u"query:kept"_s});
    EXPECT_EQ(prompt_.shown, QStringList());
}

TEST_F(SessionTest, GivesTwoDatabasesOfOneSecondTheirOwnStores)
{
    ASSERT_TRUE(session_.Create(File(u"a.cdb"_s)));
    const QString first = session_.Stamp();
    ASSERT_TRUE(session_.Create(File(u"b.cdb"_s)));
    EXPECT_NE(session_.Stamp(), first);
    EXPECT_EQ(SideFiles().size(), 2);
}

TEST_F(SessionTest, OpensNothingThatIsNoDatabase)
{
    QFile file(File(u"letter.cdb"_s));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.write(QByteArray(5000, 'x'));
    file.close();
    ASSERT_TRUE(session_.Create(File(u"a.cdb"_s)));
    for (const QString& name : {u"letter.cdb"_s, u"nothing.cdb"_s, u"home"_s}) {
        EXPECT_FALSE(session_.Open(File(name))) << name.toStdString();
        EXPECT_EQ(session_.Location().Text(), File(u"a.cdb"_s)) << name.toStdString();
    }
    EXPECT_TRUE(catalog_.ExecuteStatement(session_.Location(), u"CREATE TABLE T (A SmallInt)"_s)) << "it works on";
    EXPECT_EQ(prompt_.shown.size(), 3) << prompt_.shown.join(u'\n').toStdString();
    EXPECT_EQ(QFile(File(u"letter.cdb"_s)).size(), 5000);
}

TEST_F(SessionTest, OpensWithoutStampWhatItCannotWrite)
{
    ASSERT_TRUE(catalog_.ExecuteStatement({}, u"CREATE DATABASE "_s + QuoteText(File(u"a.cdb"_s))));
    {
        const FullDisk full;
        EXPECT_TRUE(session_.Open(File(u"a.cdb"_s)));
    }
    EXPECT_EQ(session_.Stamp(), QString());
    EXPECT_FALSE(session_.Store().Save());
    EXPECT_FALSE(session_.SetFavorites({u"table:T"_s}));
    EXPECT_EQ(SideFiles(), QStringList());
    EXPECT_EQ(prompt_.shown, QStringList()) << "opening such a database is no failure";
}

TEST_F(SessionTest, NeverReplacesAStoreThatItCannotRead)
{
    ASSERT_TRUE(session_.Create(File(u"a.cdb"_s)));
    const QString side = session_.SideFile();
    session_.Close();
    ASSERT_TRUE(QFile::remove(side));
    ASSERT_TRUE(QDir().mkpath(side)); // something that no store can be read from
    ASSERT_TRUE(session_.Open(File(u"a.cdb"_s)));
    EXPECT_EQ(prompt_.shown.size(), 1);
    EXPECT_FALSE(session_.Store().Save());
}

TEST_F(SessionTest, DropsTheDatabaseWithAllThatBelongsToIt)
{
    ASSERT_TRUE(session_.Create(File(u"a.cdb"_s)));
    ASSERT_TRUE(session_.SetFavorites({u"table:T"_s}));
    const QString stamp = session_.Stamp();
    ASSERT_TRUE(session_.Drop(File(u"a.cdb"_s)));
    EXPECT_FALSE(session_.IsOpen());
    EXPECT_FALSE(QFile::exists(File(u"a.cdb"_s)));
    EXPECT_EQ(SideFiles(), QStringList());
    QFile favorites(home_.FavoritesFile());
    ASSERT_TRUE(favorites.open(QIODevice::ReadOnly));
    EXPECT_FALSE(favorites.readAll().contains(stamp.toUtf8()));
    EXPECT_FALSE(session_.Drop(File(u"a.cdb"_s))) << "gone already";
    EXPECT_EQ(prompt_.shown.size(), 1);
}

TEST_F(SessionTest, KeepsTheStoreForACopyOfTheDatabase)
{
    ASSERT_TRUE(session_.Create(File(u"a.cdb"_s)));
    SaveQuery(u"kept"_s);
    session_.Close();
    ASSERT_TRUE(QFile::copy(File(u"a.cdb"_s), File(u"copy.cdb"_s)));
    ASSERT_TRUE(session_.Open(File(u"copy.cdb"_s)));
    ASSERT_TRUE(session_.Drop(File(u"a.cdb"_s)));
    EXPECT_EQ(session_.Location().Text(), File(u"copy.cdb"_s)) << "another database stays open";
    ASSERT_TRUE(session_.Open(File(u"copy.cdb"_s)));
    EXPECT_TRUE(session_.Store().FindQuery(u"kept"));
    ASSERT_TRUE(session_.Drop(File(u"copy.cdb"_s)));
    EXPECT_EQ(SideFiles(), QStringList()) << "the last of them takes it along";
}

TEST_F(SessionTest, StaysAsItWasWhenCreateFails)
{
    ASSERT_TRUE(session_.Create(File(u"a.cdb"_s)));
    EXPECT_FALSE(session_.Create(File(u"a.cdb"_s))) << "there is one";
    EXPECT_FALSE(session_.Create(File(u"no such folder/b.cdb"_s)));
    EXPECT_EQ(session_.Location().Text(), File(u"a.cdb"_s));
    EXPECT_EQ(prompt_.shown.size(), 2);
}

} // namespace
} // namespace mirel
