// Structure changes on ten thousand real records with gaps between their row ids: every value stays where it is,
// and a change that fails leaves the file byte for byte.
#include "csvimport/csv_import.h"
#include "provider/database_fixture.h"
#include "support/scripted_prompt.h"
#include "support/small_disk.h"
#include "support/sqlite_file.h"

#include <QCryptographicHash>
#include <QtEndian>

#include <functional>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// A table as it really stands in the file.
struct TablePicture {
    struct Column {
        QString name;
        QString type;
        QString values; // a checksum of all values by row id
        friend bool operator==(const Column&, const Column&) = default;
    };
    std::vector<Column> columns;
    QStringList indexes; // "name: column, column DESC"
    friend bool operator==(const TablePicture&, const TablePicture&) = default;

    qsizetype At(const QString& name) const
    {
        return std::ranges::find(columns, name, &Column::name) - columns.begin();
    }
};

void PrintTo(const TablePicture& picture, std::ostream* out)
{
    for (const TablePicture::Column& column : picture.columns)
        *out << '\n' << (column.name + u' ' + column.type + u' ' + column.values).toStdString();
    *out << '\n' << picture.indexes.join(u'\n').toStdString();
}

TablePicture PictureOf(SqliteFile& file, const QString& table)
{
    TablePicture picture;
    const QByteArray name = table.toUtf8();
    for (const QString& column : file.Column("SELECT name FROM pragma_table_info('" + name + "')")) {
        const QByteArray values =
            file.Column("SELECT rowid||' '||quote([" + column.toUtf8() + "]) FROM [" + name + "] ORDER BY rowid")
                .join(u'\n')
                .toUtf8();
        const QString type =
            file.Text("SELECT type FROM pragma_table_info('" + name + "') WHERE name='" + column.toUtf8() + "'");
        const QByteArray checksum = QCryptographicHash::hash(values, QCryptographicHash::Md5).toHex();
        picture.columns.push_back({column, type, QString::fromLatin1(checksum)});
    }
    picture.indexes =
        file.Column("SELECT l.name||': '||group_concat(x.name||CASE x.desc WHEN 1 THEN ' DESC' ELSE '' "
                    "END,', ') FROM pragma_index_list('" +
                    name + "') AS l, pragma_index_xinfo(l.name) AS x WHERE x.key GROUP BY l.name");
    return picture;
}

class StructureOfManyRecords : public DatabaseFixture {
protected:
    StructureOfManyRecords()
    {
        Run(u"CREATE TABLE [Other] (A Integer)"_s);
        Import();
        Run(u"DELETE FROM [Bird Strikes] WHERE [Speed IAS in knots]=140"_s);
        Run(u"CREATE INDEX byDate ON [Bird Strikes] ([Flight Date] DESC)"_s);
        Run(u"CREATE INDEX byPlace ON [Bird Strikes] ([Origin State],[Airport Name])"_s);
        provider->CloseDatabase(path);
    }

    void Import()
    {
        QFile csv(QStringLiteral(MIREL_SOURCE_DIR "/samples/birdstrikes.csv"));
        ASSERT_TRUE(csv.open(QIODevice::ReadOnly));
        ScriptedPrompt prompt;
        ImportPlan plan{.table = u"Bird Strikes"_s};
        plan.format.namesInFirstLine = true;
        plan.format.doubledQuotes = true;
        ASSERT_TRUE(GuessColumns(csv, plan.format, plan.columns, prompt));
        Run(CreateTableStatement(plan.table, plan.columns));
        csv.seek(0);
        DbConnection connection;
        ImportReport report;
        ASSERT_TRUE(ImportCsv(connection, path, csv, plan, prompt, report))
            << prompt.shown.join(u'\n').toStdString();
        ASSERT_GE(report.records, 10'000);
    }

    TablePicture Picture(const QString& table = u"Bird Strikes"_s)
    {
        SqliteFile file(path);
        EXPECT_EQ(file.Text("PRAGMA integrity_check"), u"ok"_s);
        return PictureOf(file, table);
    }
    // Grows by one with each transaction that is written.
    quint32 Transactions() const { return qFromBigEndian<quint32>(Bytes().constData() + 24); }
    QByteArray Bytes() const
    {
        QFile file(path);
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        return file.readAll();
    }
};

TEST_F(StructureOfManyRecords, ChangesNothingButWhatItSays)
{
    using Change = std::function<void(TablePicture&)>;
    const auto move = [](const QString& name, const QString& before) -> Change {
        return [=](TablePicture& picture) {
            const TablePicture::Column moved = picture.columns[size_t(picture.At(name))];
            picture.columns.erase(picture.columns.begin() + picture.At(name));
            picture.columns.insert(picture.columns.begin() + picture.At(before), moved);
        };
    };
    const auto none = [](TablePicture&) {};
    const struct {
        QString statement;
        Change expected;
    } rows[] = {
        {u"CREATE TABLE [Another] (A Integer,B Text)"_s, none},
        {u"ALTER TABLE [Bird Strikes] MOVE [Cost Total $] BEFORE [Airport Name]"_s,
         move(u"Cost Total $"_s, u"Airport Name"_s)},
        {u"ALTER TABLE [Bird Strikes] MOVE [Airport Name] BEFORE [Speed IAS in knots]"_s,
         move(u"Airport Name"_s, u"Speed IAS in knots"_s)},
        {u"ALTER TABLE [Bird Strikes] RENAME [Origin State] TO [State (of origin)]"_s,
         [](TablePicture& picture) {
             picture.columns[size_t(picture.At(u"Origin State"_s))].name = u"State (of origin)"_s;
             picture.indexes.replaceInStrings(u"Origin State"_s, u"State (of origin)"_s);
         }},
        {u"CREATE INDEX byCost ON [Bird Strikes] ([Cost Total $] DESC,[Flight Date])"_s,
         [](TablePicture& picture) {
             picture.indexes.insert(0, u"Bird Strikes.byCost: Cost Total $ DESC, Flight Date"_s);
         }},
        {u"ALTER TABLE [Bird Strikes] DROP [Wildlife Size]"_s,
         [](TablePicture& picture) {
             picture.columns.erase(picture.columns.begin() + picture.At(u"Wildlife Size"_s));
         }},
        {u"ALTER TABLE [Bird Strikes] DROP [Flight Date]"_s,
         [](TablePicture& picture) {
             picture.columns.erase(picture.columns.begin() + picture.At(u"Flight Date"_s));
             picture.indexes = picture.indexes.filter(u"byPlace"_s); // the only one without the column
         }},
        {u"DROP INDEX [Bird Strikes].[byPlace]"_s, [](TablePicture& picture) { picture.indexes.clear(); }},
        {u"DROP TABLE [Other]"_s, none},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.statement.toStdString());
        TablePicture expected = Picture();
        const quint32 transactions = Transactions();
        Run(row.statement);
        row.expected(expected);
        EXPECT_EQ(Picture(), expected);
        EXPECT_EQ(Transactions(), transactions + 1);
    }
}

TEST_F(StructureOfManyRecords, AddsAColumnWithoutValuesAndRenamesTheTable)
{
    TablePicture expected = Picture();
    Run(u"ALTER TABLE [Bird Strikes] ADD [A note] Varchar(20)"_s);
    TablePicture wider = Picture();
    EXPECT_EQ(wider.columns.back().type, u"VARCHAR(20)"_s);
    EXPECT_EQ(SqliteFile(path).Text("SELECT count([A note]) FROM [Bird Strikes]"), u"0"_s);
    expected.columns.push_back(wider.columns.back());
    EXPECT_EQ(wider, expected);

    const quint32 transactions = Transactions();
    Run(u"ALTER TABLE [Bird Strikes] to [Strikes]"_s);
    expected.indexes.replaceInStrings(u"Bird Strikes."_s, u"Strikes."_s);
    EXPECT_EQ(Picture(u"Strikes"_s), expected);
    EXPECT_EQ(Transactions(), transactions + 1);
    EXPECT_TRUE(Picture().columns.empty());
}

class StructureThatFails : public StructureOfManyRecords {
protected:
    StructureThatFails() { before_ = Bytes(); }
    ~StructureThatFails() override { EXPECT_EQ(Bytes() == before_, true) << "the file is another"; }

    static QStringList AllStatements()
    {
        return {u"ALTER TABLE [Bird Strikes] ADD [A note] Varchar(20)"_s,
                u"ALTER TABLE [Bird Strikes] DROP [Wildlife Size]"_s,
                u"ALTER TABLE [Bird Strikes] RENAME [Origin State] TO [State]"_s,
                u"ALTER TABLE [Bird Strikes] MOVE [Cost Total $] BEFORE [Airport Name]"_s,
                u"ALTER TABLE [Bird Strikes] to [Strikes]"_s,
                u"CREATE INDEX byCost ON [Bird Strikes] ([Cost Total $])"_s,
                u"DROP INDEX [Bird Strikes].[byDate]"_s,
                u"CREATE TABLE [Another] (A Integer)"_s,
                u"DROP TABLE [Bird Strikes]"_s};
    }

private:
    QByteArray before_;
};

TEST_F(StructureThatFails, InAFileThatMayNotBeWritten)
{
    ASSERT_TRUE(QFile::setPermissions(path, QFile::ReadOwner));
    for (const QString& statement : AllStatements())
        EXPECT_EQ(Try(statement), Hr::AccessDenied) << statement.toStdString();
    QFile::setPermissions(path, QFile::ReadOwner | QFile::WriteOwner);
}

TEST_F(StructureThatFails, ForANameOrAPlaceThatIsTaken)
{
    const struct {
        QString statement;
        Hr expected;
    } rows[] = {
        {u"ALTER TABLE [Bird Strikes] ADD [wildlife size] Integer"_s, Hr::DuplicateColumn},
        {u"ALTER TABLE [Bird Strikes] RENAME [Origin State] TO [Wildlife Size]"_s, Hr::DuplicateColumn},
        {u"ALTER TABLE [Bird Strikes] to [other]"_s, Hr::TableExists},
        {u"ALTER TABLE [Bird Strikes] to [MSysTables]"_s, Hr::TableExists},
        {u"ALTER TABLE [Bird Strikes] MOVE [Nobody] BEFORE [Airport Name]"_s, Hr::NoSuchColumn},
        {u"ALTER TABLE [Bird Strikes] DROP [Nobody]"_s, Hr::NoSuchColumn},
        {u"CREATE INDEX bydate ON [Bird Strikes] ([Cost Total $])"_s, Hr::IndexExists},
        {u"CREATE UNIQUE INDEX u ON [Bird Strikes] ([Wildlife Size])"_s, Hr::IntegrityViolation},
        {u"DROP INDEX [Bird Strikes].[Nobody]"_s, Hr::NoSuchIndex},
    };
    for (const auto& row : rows)
        EXPECT_EQ(Try(row.statement), row.expected) << row.statement.toStdString() << '\n'
                                                    << context.toStdString();
}

TEST_F(StructureThatFails, OnAFullDisk)
{
    const SmallDisk disk(SqliteFile(path).Text("PRAGMA page_count").toInt() + 2);
    for (const QString& statement : {AllStatements()[3], AllStatements()[5]})
        EXPECT_EQ(Try(statement), Hr::DiskFull) << statement.toStdString();
}

// The one that writes keeps others out from the start, the one that reads only when it comes to commit.
TEST_F(StructureThatFails, WhileAnotherProgramUsesTheFile)
{
    for (const char* use : {"BEGIN IMMEDIATE", "BEGIN; SELECT * FROM [Bird Strikes] LIMIT 1"}) {
        SqliteFile other(path);
        other.Run(use);
        EXPECT_EQ(Try(AllStatements()[3]), Hr::AccessDenied) << use;
        EXPECT_EQ(Open(u"Bird Strikes"_s)->Fields()[0].name, u"Airport Name"_s) << "the old order";
    }
}

} // namespace
} // namespace mirel
