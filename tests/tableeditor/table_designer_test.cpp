// The designer on a real database: what it asks and says, and that records keep their values and row ids.
#include "data/provider_error.h"
#include "resources/string_table.h"
#include "support/small_disk.h"
#include "support/sqlite_file.h"
#include "tableeditor/design_fixture.h"

#include <QFile>

#include <random>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// Notes what a designer tells its surroundings.
struct NotingHost : DesignHost {
    QStringList told;
    bool writes = true;

    bool WritePending(const QString& table) override
    {
        told += u"write "_s + table;
        return writes;
    }
    void TableChanged(const QString& table) override { told += u"changed "_s + table; }
    void TableDropped(const QString& table) override { told += u"dropped "_s + table; }
};

class TableDesignerTest : public DesignFixture {
protected:
    static constexpr int kRecords = 10'000;

    void MakeBirds(int records = kRecords)
    {
        Run(u"CREATE TABLE [Bird s] ([Name] Varchar(40),[N] Integer,[Price] Float,[Seen] DateTime,[Rare] Bit,"
            "[Code] Varchar(10),[Note] Text)"_s);
        Run(u"CREATE INDEX [byName] ON [Bird s] ([Name] DESC)"_s);
        SqliteFile file(path_);
        file.Run("WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i+1 FROM n WHERE i<" +
                 QByteArray::number(records) +
                 ") INSERT INTO [Bird s](rowid,Name,N,Price,Seen,Rare,Code,Note) SELECT i*3,'bird '||i,i,i*0.25,"
                 "date('2001-01-01','+'||(i%400)||' days'),i%2,CAST(i AS TEXT),"
                 "CASE WHEN i%5=0 THEN NULL ELSE 'note '||i END FROM n");
    }
    FieldDesign FieldAt(const TableDesigner& designer, int row) { return designer.Fields()[size_t(row)]; }
    int RowOf(const TableDesigner& designer, const QString& name)
    {
        const auto& fields = designer.Fields();
        return int(std::ranges::find(fields, name, &FieldDesign::name) - fields.begin());
    }

    NotingHost host_;
    TableDesigner designer_{connection_, path_, prompt_, host_};
};

TEST_F(TableDesignerTest, MakesANewTableFromItsList)
{
    designer_.SetTableName(u" Items "_s);
    EXPECT_FALSE(designer_.Create());
    EXPECT_EQ(prompt_.shown, QStringList{u"A table needs a field."_s});
    EXPECT_TRUE(
        designer_.AddField({.name = u"Qty"_s, .type = FieldType::Integer, .index = IndexOrder::Ascending}));
    EXPECT_TRUE(designer_.AddField({.name = u"Name"_s, .size = 40}));
    EXPECT_TRUE(designer_.MoveUp(1));
    EXPECT_EQ(designer_.SelectedRow(), 0);
    EXPECT_FALSE(designer_.MoveUp(0));
    EXPECT_FALSE(designer_.AddField({.name = u"qty"_s}));
    prompt_.shown.clear();
    prompt_.answers = {false, true};
    EXPECT_FALSE(designer_.Create()) << "No leaves everything as it is";
    EXPECT_TRUE(designer_.Create());
    EXPECT_EQ(prompt_.questions, QStringList(2, u"Create table \"Items\" ?"_s));
    EXPECT_EQ(prompt_.shown, QStringList{u"Table \"Items\" created."_s});
    EXPECT_FALSE(designer_.IsNew());
    EXPECT_EQ(Describe(u"Items"_s), u"Name Text 40 NO, Qty Integer ASC"_s);

    TableDesigner again(connection_, path_, prompt_, host_);
    again.SetTableName(u"items"_s);
    EXPECT_TRUE(again.AddField({.name = u"A"_s}));
    EXPECT_FALSE(again.Create());
    EXPECT_EQ(prompt_.shown.last(), u"There is a table \"items\" already."_s);
}

// Ten thousand records through every kind of change.
TEST_F(TableDesignerTest, ChangesKeepRecordsAndRowIds)
{
    MakeBirds();
    ASSERT_TRUE(designer_.Open(u"Bird s"_s));
    const QString kAll = u"SELECT [Name],[N],[Price],[Seen],[Rare],[Code],[Note] FROM [Bird s]"_s;
    const QStringList before = Records(kAll);
    ASSERT_EQ(before.size(), kRecords);

    EXPECT_TRUE(designer_.MoveDown(0));
    EXPECT_EQ(designer_.SelectedRow(), 1);
    EXPECT_TRUE(designer_.MoveUp(6));
    EXPECT_EQ(Describe(u"Bird s"_s), u"N Integer NO, Name Text 40 DESC, Price Double NO, Seen DateTime NO, "
                                     "Rare Yes/No NO, Note Memo NO, Code Text 10 NO"_s);
    EXPECT_EQ(Records(kAll), before);

    FieldDesign field = FieldAt(designer_, 1);
    field.name = u"Who"_s;
    field.size = 60;
    field.index = IndexOrder::Ascending;
    EXPECT_TRUE(designer_.ChangeField(1, field)); // only longer: nothing is asked
    EXPECT_EQ(prompt_.questions, QStringList());
    const QString kRenamed = u"SELECT [Who],[N],[Price],[Seen],[Rare],[Code],[Note] FROM [Bird s]"_s;
    EXPECT_EQ(Records(kRenamed), before);
    EXPECT_EQ(Read(u"Bird s"_s)->indexes,
              (std::vector<IndexDefinition>{{u"byName"_s, {{u"Who"_s, false}}, false}}));

    prompt_.answers = {true, true, true, true};
    field = FieldAt(designer_, 6);
    field.type = FieldType::Integer;
    EXPECT_TRUE(designer_.ChangeField(6, field));
    EXPECT_EQ(prompt_.questions.last(), u"Change the field \"Code\" from Text (10) to Integer?\r\n"
                                        "Its 10000 values keep their meaning."_s);
    EXPECT_EQ(Records(kRenamed), before);
    field = FieldAt(designer_, 0);
    field.type = FieldType::YesNo;
    EXPECT_TRUE(designer_.ChangeField(0, field));
    EXPECT_EQ(prompt_.questions.last(),
              u"Change the field \"N\" from Integer to Yes/No?\r\n"
              "9999 of its 10000 value(s) will read differently, and cannot be got back."_s);
    EXPECT_TRUE(designer_.DropField(RowOf(designer_, u"Note"_s)));
    EXPECT_EQ(prompt_.questions.last(), u"Are you sure you want to drop this field \"Note\"?\r\n"
                                        "It holds 8000 values, which go with it."_s);
    EXPECT_TRUE(designer_.AddField({.name = u"O'Brien \"x\""_s, .index = IndexOrder::Descending}));
    EXPECT_EQ(Describe(u"Bird s"_s), u"N Yes/No NO, Who Text 60 ASC, Price Double NO, Seen DateTime NO, "
                                     "Rare Yes/No NO, Code Integer NO, O'Brien \"x\" Text 255 DESC"_s);
    EXPECT_TRUE(designer_.RenameTable(u"Vogel"_s));
    EXPECT_EQ(prompt_.shown, QStringList{u"Table \"Bird s\" renamed to \"Vogel\"."_s});
    const QStringList now = Records(u"SELECT [Who],[Price],[Seen],[Rare],[Code] FROM [Vogel]"_s);
    ASSERT_EQ(now.size(), kRecords);
    EXPECT_EQ(now.at(41), u"126|bird 42|10.5|2/12/2001|0|42"_s);
    EXPECT_EQ(now.last(), u"30000|bird 10000|2500|1/1/2001|0|10000"_s);
    EXPECT_EQ(designer_.FirstValues(2)[1], QStringList({u"bird 1"_s, u"bird 2"_s}));
    EXPECT_TRUE(designer_.DropTable());
    EXPECT_EQ(prompt_.questions.last(), u"Are you sure you want to drop this table \"Vogel\"?\r\n"
                                        "It holds 10000 records, which go with it."_s);
    EXPECT_EQ(Describe(u"Vogel"_s), u"gone"_s);
    EXPECT_EQ(host_.told.last(), u"dropped Vogel"_s);
}

TEST_F(TableDesignerTest, RefusesWhatWouldLoseAValueThatDoesNotConvert)
{
    MakeBirds(50);
    Run(u"UPDATE [Bird s] SET Code='12a' WHERE N=7"_s);
    ASSERT_TRUE(designer_.Open(u"Bird s"_s));
    const QStringList before = Records(u"SELECT * FROM [Bird s]"_s);
    const QString described = Describe(u"Bird s"_s);
    FieldDesign field = FieldAt(designer_, 5);
    field.type = FieldType::SmallInt;
    EXPECT_FALSE(designer_.ChangeField(5, field));
    field.type = FieldType::Text;
    field.size = 2;
    EXPECT_FALSE(designer_.ChangeField(5, field));
    EXPECT_EQ(prompt_.shown,
              QStringList({u"1 of the 50 value(s) of \"Code\" in \"Bird s\" cannot become SmallInt; the first is "
                           "\"12a\".\r\nThe table stays as it is."_s,
                           u"1 of the 50 value(s) of \"Code\" in \"Bird s\" cannot become Text (2); the first is "
                           "\"12a\".\r\nThe table stays as it is."_s}));
    field.size = 256;
    EXPECT_FALSE(designer_.ChangeField(5, field));
    EXPECT_EQ(prompt_.shown.last(), StringText(Str::ImportTextSize));
    EXPECT_EQ(Describe(u"Bird s"_s), described);
    EXPECT_EQ(Describe(designer_.Fields()), described);
    EXPECT_EQ(Records(u"SELECT * FROM [Bird s]"_s), before);
}

TEST_F(TableDesignerTest, SeesWhatOthersChangedMeanwhile)
{
    MakeBirds(50);
    ASSERT_TRUE(designer_.Open(u"Bird s"_s));
    SqliteFile(path_).Run("ALTER TABLE [Bird s] RENAME COLUMN Code TO Kode");
    EXPECT_FALSE(designer_.MoveUp(1));
    EXPECT_EQ(prompt_.shown.takeLast(), StringText(Str::DesignStale, {u"Bird s"_s}));
    EXPECT_EQ(FieldAt(designer_, 5).name, u"Kode"_s);
    EXPECT_EQ(FieldAt(designer_, 0).name, u"Name"_s);
    EXPECT_TRUE(designer_.MoveUp(1));

    SqliteFile(path_).Run("DROP TABLE [Bird s]");
    prompt_.answers = {true, true};
    EXPECT_FALSE(designer_.DropField(0));
    EXPECT_FALSE(designer_.AddField({.name = u"New"_s}));
    EXPECT_FALSE(designer_.RenameTable(u"New"_s));
    EXPECT_FALSE(designer_.DropTable());
    EXPECT_EQ(prompt_.questions, QStringList());
    for (const QString& text : prompt_.shown)
        EXPECT_EQ(text, ProviderErrorText(nullptr, Hr::NoSuchTable, {}));
    EXPECT_EQ(designer_.Fields().size(), 7U) << "the screen is kept";
}

// A prompt during which another program works.
struct MeddlingPrompt : ScriptedPrompt {
    std::function<void()> meddle;

    bool AskYesNo(const UserMessage& question) override
    {
        if (const auto once = std::exchange(meddle, {}))
            once();
        return ScriptedPrompt::AskYesNo(question);
    }
};

TEST_F(TableDesignerTest, AsksAgainWhenMoreIsLostThanWasSaid)
{
    MakeBirds(50);
    MeddlingPrompt prompt;
    TableDesigner designer(connection_, path_, prompt, host_);
    ASSERT_TRUE(designer.Open(u"Bird s"_s));
    prompt.answers = {true, false};
    prompt.meddle = [this] { SqliteFile(path_).Run("UPDATE [Bird s] SET Note='x' WHERE N=5"); };
    EXPECT_FALSE(designer.DropField(6));
    ASSERT_EQ(prompt.questions.size(), 2);
    EXPECT_TRUE(prompt.questions[1].contains(u"41 values"_s)) << prompt.questions[1].toStdString();
    FieldDesign code = designer.Fields()[5];
    code.type = FieldType::Integer;
    prompt.questions.clear();
    prompt.answers = {true, false};
    prompt.meddle = [this] { SqliteFile(path_).Run("UPDATE [Bird s] SET Code='005' WHERE N=5"); };
    EXPECT_FALSE(designer.ChangeField(5, code));
    ASSERT_EQ(prompt.questions.size(), 2) << "it would become 5";
    EXPECT_NE(prompt.questions[1], prompt.questions[0]);
    EXPECT_EQ(designer.Fields()[5].type, FieldType::Text);
    prompt.answers = {true};
    prompt.meddle = [this] { SqliteFile(path_).Run("UPDATE [Bird s] SET Code='x' WHERE N=5"); };
    EXPECT_FALSE(designer.ChangeField(5, code));
    EXPECT_TRUE(prompt.shown.last().startsWith(u"1 of the 50 value(s) of \"Code\""_s));
    prompt.answers = {true, true};
    prompt.meddle = [this] { SqliteFile(path_).Run("INSERT INTO [Bird s](N) VALUES (51)"); };
    EXPECT_TRUE(designer.DropTable());
    EXPECT_TRUE(prompt.questions.last().contains(u"51 records"_s));
}

TEST_F(TableDesignerTest, LeavesTheTableAsItWasWhenTheDatabaseRefuses)
{
    MakeBirds(50);
    ASSERT_TRUE(designer_.Open(u"Bird s"_s));
    const QString described = Describe(u"Bird s"_s);
    const auto refused = [&] {
        prompt_.shown.clear();
        prompt_.answers = {true, true};
        EXPECT_FALSE(designer_.MoveUp(1));
        prompt_.answers = {true, true};
        EXPECT_FALSE(designer_.DropField(6));
        EXPECT_FALSE(designer_.RenameTable(u"Other"_s));
        EXPECT_EQ(Describe(designer_.Fields()), described);
        for (const QString& text : prompt_.shown)
            EXPECT_TRUE(text.startsWith(u"Error: (80070005)"_s)) << text.toStdString();
        EXPECT_EQ(prompt_.shown.size(), 3);
    };
    {
        SqliteFile other(path_);
        other.Run("BEGIN IMMEDIATE");
        refused();
        other.Run("ROLLBACK");
    }
    connection_.Provider()->CloseDatabase(path_);
    QFile(path_).setPermissions(QFile::ReadOwner);
    refused();
    QFile(path_).setPermissions(QFile::ReadOwner | QFile::WriteOwner);
    connection_.Provider()->CloseDatabase(path_);

    host_.writes = false; // a view holds a value that is refused
    prompt_.shown.clear();
    EXPECT_FALSE(designer_.MoveUp(1));
    EXPECT_EQ(Describe(u"Bird s"_s), described);
}

TEST_F(TableDesignerTest, SurvivesAFullDisk)
{
    MakeBirds(3000);
    ASSERT_TRUE(designer_.Open(u"Bird s"_s));
    const QStringList before = Records(u"SELECT * FROM [Bird s]"_s);
    connection_.Provider()->CloseDatabase(path_);
    {
        const SmallDisk disk(int(QFileInfo(path_).size() / 16384));
        EXPECT_FALSE(designer_.MoveUp(1));
        EXPECT_FALSE(designer_.AddField({.name = u"X"_s, .index = IndexOrder::Ascending}));
        EXPECT_EQ(prompt_.shown.size(), 2) << prompt_.shown.join(u'\n').toStdString();
        connection_.Provider()->CloseDatabase(path_);
    }
    EXPECT_EQ(Records(u"SELECT * FROM [Bird s]"_s), before);
    EXPECT_TRUE(designer_.MoveUp(1));
}

TEST_F(TableDesignerTest, OnlyFieldStays)
{
    Run(u"CREATE TABLE T (A Integer)"_s);
    ASSERT_TRUE(designer_.Open(u"T"_s));
    EXPECT_FALSE(designer_.DropField(0));
    EXPECT_EQ(prompt_.shown, QStringList{StringText(Str::DesignLastField, {u"A"_s})});
}

// --- random designs against a plain model of the table --------------------------------------------------------

struct ModelField {
    FieldDesign design;
    QStringList values; // as texts of whole numbers, so that every type takes them; NULL is "NULL"
};

class DesignModel {
public:
    explicit DesignModel(quint32 seed)
        : random_(seed)
    {
    }

    int Below(int end) { return int(random_() % quint32(end)); }
    FieldDesign RandomField()
    {
        constexpr std::array kTypes = {FieldType::Text, FieldType::Integer, FieldType::Double, FieldType::Memo,
                                       FieldType::SmallInt};
        static const QStringList kNames = {u"A"_s,  u"a b"_s, u"Order"_s, u"O'x"_s, u"\"q\""_s,
                                           u"[]"_s, u"é"_s,   u"Rowid"_s, u"x.y"_s, u"Select"_s};
        FieldDesign field{
            kNames[Below(int(kNames.size()))], kTypes[size_t(Below(5))], 5 + Below(20), IndexOrder(Below(3)), {}};
        return field;
    }
    // What the fields become: some go, some come, some change, all move.
    std::vector<FieldDesign> RandomDesign(const std::vector<FieldDesign>& fields)
    {
        std::vector<FieldDesign> wanted;
        for (FieldDesign field : fields) {
            if (Below(6) == 0)
                continue;
            const FieldDesign other = RandomField();
            if (Below(3) == 0)
                field.name = other.name;
            if (Below(3) == 0) {
                field.type = other.type;
                field.size = other.size;
            }
            if (Below(3) == 0)
                field.index = other.index;
            wanted.push_back(field);
        }
        while (wanted.empty() || Below(2) == 0)
            wanted.push_back(RandomField());
        if (Below(2) == 0)
            std::shuffle(wanted.begin(), wanted.end(), random_);
        return wanted;
    }

private:
    std::mt19937 random_;
};

TEST_F(TableDesignerTest, RandomDesignsAgreeWithAPlainModel)
{
    constexpr int kRows = 40;
    Run(u"CREATE TABLE T (A Integer)"_s);
    std::vector<ModelField> model = {{{u"A"_s, FieldType::Integer, 255, IndexOrder::None, u"A"_s}, {}}};
    for (int i = 0; i < kRows; ++i) {
        Run(u"INSERT INTO T (A) VALUES (%1)"_s.arg(i * 7 % 100));
        model[0].values += QString::number(i * 7 % 100);
    }
    DesignRun run(connection_, path_, prompt_);
    DesignModel random(20261121);
    int applied = 0;
    for (int round = 0; round < 150; ++round) {
        const std::optional<TableDesign> current = Read(u"T"_s);
        ASSERT_TRUE(current);
        const std::vector<FieldDesign> wanted = random.RandomDesign(current->fields);
        if (FaultOfFields(wanted))
            continue;
        prompt_.answers.assign(50, true);
        ASSERT_EQ(run.Apply(*current, wanted), DesignRun::Outcome::Done)
            << round << ' ' << Describe(wanted).toStdString() << '\n'
            << PlanDesign(*current, wanted).statements.join(u'\n').toStdString() << '\n'
            << prompt_.shown.join(u'\n').toStdString();
        ++applied;
        std::vector<ModelField> next;
        for (const FieldDesign& field : wanted) {
            const auto before =
                std::ranges::find_if(model, [&](const ModelField& each) { return each.design.name == field.was; });
            next.push_back({field, before == model.end() ? QStringList(kRows, u"NULL"_s) : before->values});
        }
        // Something to lose in the new ones.
        for (ModelField& field : next) {
            if (!field.design.was.isEmpty())
                continue;
            Run(u"UPDATE T SET %1=%2"_s.arg(NameInBrackets(field.design.name)).arg(round));
            field.values = QStringList(kRows, QString::number(round));
        }
        model = std::move(next);
        ASSERT_EQ(Describe(u"T"_s), Describe(wanted)) << round;
        for (const ModelField& field : model) {
            const QStringList records = Records(u"SELECT %1 FROM T"_s.arg(NameInBrackets(field.design.name)));
            ASSERT_EQ(records.size(), kRows);
            for (int i = 0; i < kRows; ++i)
                ASSERT_EQ(records[i], u"%1|%2"_s.arg(i + 1).arg(field.values[i])) << round;
        }
        ASSERT_EQ(SqliteFile(path_).Text("PRAGMA integrity_check"), u"ok"_s);
    }
    EXPECT_GT(applied, 50);
}

} // namespace
} // namespace mirel
