// Copies, the check and the compacting of databases.
#include "cli/program_fixture.h"
#include "support/sqlite_file.h"

#include <QDir>
#include <QFileInfo>

namespace mirel {
namespace {

class CareProgram : public Program {
protected:
    void SetUp() override
    {
        Program::SetUp();
        NewDatabase();
        Sql(u"CREATE TABLE Birds (ID Integer, Name Varchar(40))"_s);
        Sql(u"INSERT INTO Birds VALUES (1,'Osprey')"_s);
        ASSERT_EQ(Run({u"forms"_s, u"default"_s, u"a.cdb"_s, u"Birds"_s}).status, 0);
        ASSERT_EQ(Run({u"queries"_s, u"save"_s, u"a.cdb"_s, u"All"_s, u"SELECT Name FROM Birds"_s, u"--table"_s,
                       u"Birds"_s})
                      .status,
                  0);
    }
    QByteArray Bytes(const QString& name) const
    {
        QFile file(Path(name));
        EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << name.toStdString();
        return file.readAll();
    }
    // Where the forms and queries are kept, in the program's folder.
    QString StoreFile() const
    {
        return u"home/Forms/"_s + QDir(Path(u"home/Forms"_s)).entryList(QDir::Files).value(0);
    }
};

TEST_F(CareProgram, CopiesADatabaseWithAllThatBelongsToIt)
{
    ASSERT_EQ(Run({u"backup"_s, u"a.cdb"_s, u"b.cdb"_s}), (Ended{0, {}, {}}));
    EXPECT_EQ(Run({u"backup"_s, u"a.cdb"_s, u"b.cdb"_s}).status, 2) << "it is there";
    EXPECT_EQ(Run({u"backup"_s, u"a.cdb"_s, u"b.cdb"_s, u"--yes"_s}).status, 0);
    EXPECT_EQ(Run({u"backup"_s, u"a.cdb"_s, u"./a.cdb"_s, u"--yes"_s}).status, 1);
    EXPECT_EQ(Run({u"backup"_s, u"a.cdb"_s, StoreFile(), u"--yes"_s}).status, 1);
    EXPECT_EQ(Run({u"backup"_s, u"a.cdb"_s, u"nowhere/b.cdb"_s}).status, 1);
    EXPECT_EQ(Sql(u"SELECT Name FROM Birds"_s), u"Name\nOsprey\n"_s);

    // Elsewhere the copy brings its forms and queries along; its own file holds them from then on.
    const QStringList elsewhere = {u"--home"_s, Path(u"other"_s)};
    EXPECT_EQ(Run(QStringList{u"tables"_s, u"b.cdb"_s} + elsewhere).out, u"Birds\n"_s);
    EXPECT_EQ(Run(QStringList{u"forms"_s, u"list"_s, u"b.cdb"_s, u"--format"_s, u"csv"_s} + elsewhere).out,
              u"name,table,controls\nDefaultForm,Birds,6\n"_s);
    EXPECT_EQ(
        Run(QStringList{u"queries"_s, u"run"_s, u"b.cdb"_s, u"All"_s, u"--format"_s, u"csv"_s} + elsewhere).out,
        u"Name\nOsprey\n"_s);
    EXPECT_EQ(
        Run(QStringList{u"forms"_s, u"delete"_s, u"b.cdb"_s, u"DefaultForm"_s, u"--yes"_s} + elsewhere).status, 0);
    EXPECT_EQ(Run(QStringList{u"forms"_s, u"list"_s, u"b.cdb"_s, u"--format"_s, u"csv"_s} + elsewhere).out,
              u"name,table,controls\n"_s);
}

TEST_F(CareProgram, CopiesWhatIsThereWhileAnotherProgramReads)
{
    SqliteFile other(Path(u"a.cdb"_s));
    other.Run("BEGIN; SELECT * FROM Birds;");
    EXPECT_EQ(Run({u"backup"_s, u"a.cdb"_s, u"b.cdb"_s}).status, 0);
    EXPECT_EQ(SqliteFile(Path(u"b.cdb"_s)).Text("SELECT Name FROM Birds"), u"Osprey"_s);
    EXPECT_FALSE(QFileInfo::exists(Path(u"b.cdb.part"_s)));
}

TEST_F(CareProgram, GivesUnusedSpaceBack)
{
    SqliteFile(Path(u"a.cdb"_s))
        .Run("INSERT INTO Birds WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i+1 FROM n WHERE i<20000) "
             "SELECT i, 'bird ' || i FROM n; DELETE FROM Birds WHERE Name LIKE 'bird %';");
    const qint64 before = QFileInfo(Path(u"a.cdb"_s)).size();
    {
        SqliteFile other(Path(u"a.cdb"_s));
        other.Run("BEGIN IMMEDIATE");
        const Ended busy = Run({u"compact"_s, u"a.cdb"_s});
        EXPECT_EQ(busy.status, 1);
        EXPECT_TRUE(busy.err.contains(u"80070005"_s)) << busy.err.toStdString();
    }
    EXPECT_EQ(Run({u"compact"_s, u"a.cdb"_s}), (Ended{0, {}, {}}));
    EXPECT_LT(QFileInfo(Path(u"a.cdb"_s)).size(), before / 2);
    EXPECT_EQ(Sql(u"SELECT COUNT(*) FROM Birds"_s).section(u'\n', 1, 1), u"1"_s);
}

TEST_F(CareProgram, FindsWhatRefersToNothing)
{
    const QByteArray before = Bytes(u"a.cdb"_s);
    EXPECT_EQ(Run({u"check"_s, u"a.cdb"_s}), (Ended{0, {}, {}}));
    EXPECT_EQ(Bytes(u"a.cdb"_s), before);

    SqliteFile(Path(u"a.cdb"_s)).Run("ALTER TABLE Birds RENAME COLUMN Name TO Title");
    EXPECT_EQ(Run({u"check"_s, u"a.cdb"_s}).status, 1);
    const QString fields = Run({u"check"_s, u"a.cdb"_s}).out;
    EXPECT_TRUE(fields.contains(u"form \"DefaultForm\", control \"Name\": there is no field"_s))
        << fields.toStdString();
    EXPECT_TRUE(fields.contains(u"query \"All\": "_s)) << fields.toStdString();
    SqliteFile(Path(u"a.cdb"_s)).Run("DROP TABLE Birds");
    EXPECT_TRUE(Run({u"check"_s, u"a.cdb"_s}).out.contains(u"there is no table \"Birds\""_s));
}

TEST_F(CareProgram, FindsDamage)
{
    const QString store = StoreFile();
    const QByteArray whole = Bytes(store);
    WriteFile(store, whole.left(whole.size() - 20));
    EXPECT_TRUE(Run({u"check"_s, u"a.cdb"_s}).out.contains(u"breaks off"_s));
    WriteFile(store, {});
    EXPECT_TRUE(Run({u"check"_s, u"a.cdb"_s}).out.contains(u"is empty"_s));
    WriteFile(store, whole);

    SqliteFile(Path(u"a.cdb"_s))
        .Run("CREATE INDEX [Birds.I] ON Birds(Name); PRAGMA writable_schema=ON; "
             "DELETE FROM sqlite_schema WHERE name='Birds.I'"); // its pages belong to nobody now
    const Ended damaged = Run({u"check"_s, u"a.cdb"_s});
    EXPECT_EQ(damaged.status, 1);
    EXPECT_TRUE(damaged.out.contains(u"never used"_s)) << damaged.out.toStdString() << damaged.err.toStdString();

    for (const QStringList& words : {QStringList{u"check"_s, u"missing.cdb"_s},
                                     {u"compact"_s, u"missing.cdb"_s},
                                     {u"check"_s, WriteFile(u"text.cdb"_s, "no database at all")}}) {
        const Ended ended = Run(words);
        EXPECT_EQ(ended.status, 1) << words.join(u' ').toStdString();
        EXPECT_FALSE(ended.err.isEmpty()) << words.join(u' ').toStdString();
    }
}

} // namespace
} // namespace mirel
