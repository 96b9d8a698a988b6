#include "app/sample_database.h"

#include "app/sample_forms.h"
#include "csvimport/csv_import.h"
#include "data/table_statements.h"
#include "platform/system_reason.h"
#include "resources/string_table.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// A table of the sample: its file, where the file's columns go, and the fields that get an index.
struct SampleTable {
    QStringView name;
    QStringView file;
    QStringView columns; // as ParseColumnList takes them
    std::array<QStringView, 3> indexes;
};
constexpr std::array kTables = {
    SampleTable{u"Bird Strikes",
                u"birdstrikes.csv",
                u"Airport Name:Text:60,Aircraft Make Model:Text:30,Effect Amount of damage:Text:20,"
                u"Flight Date:DateTime,Aircraft Airline Operator:Text:50,Origin State:Text:30,"
                u"Phase of flight:Text:20,Wildlife Size:Text:10,Wildlife Species:Text:40,Time of day:Text:10,"
                u"Cost Other:Integer,Cost Repair:Integer,Cost Total $:Integer,Speed IAS in knots:SmallInt",
                {u"Flight Date", u"Wildlife Species", u"Airport Name"}},
    SampleTable{u"Airports",
                u"airports.csv",
                u"IATA:Text:4,Name:Text:60,City:Text:40,State:Text:2,Country:Text:40,Latitude:Double,"
                u"Longitude:Double",
                {u"IATA", u"City"}},
    SampleTable{u"Contacts",
                u"contacts.csv",
                u"Name:Text:40,Company:Text:40,City:Text:40,Country:Text:40,Phone:Text:30,Birthday:DateTime,"
                u"Friend:Yes/No,Visits:SmallInt,Credit:Double,Notes:Memo",
                {u"Name"}},
    SampleTable{u"Orders",
                u"orders.csv",
                u"Number:Integer,Customer:Text:40,Item:Text:60,Quantity:SmallInt,Price:Double,Ordered:DateTime,"
                u"Paid:Yes/No,Remark:Memo",
                {u"Number", u"Customer"}},
};

struct SampleQuery {
    QStringView name;
    QStringView table;
    QStringView statement;
};
constexpr std::array kQueries = {
    SampleQuery{u"Costly strikes", u"Bird Strikes",
                u"SELECT [Airport Name],[Flight Date],[Wildlife Species],[Cost Total $] FROM [Bird Strikes] "
                u"WHERE [Cost Total $] > 100000 ORDER BY [Cost Total $] DESC"},
    SampleQuery{u"Strikes by species", u"Bird Strikes",
                u"SELECT [Wildlife Species],COUNT(*) AS Strikes,SUM([Cost Total $]) AS Cost FROM [Bird Strikes] "
                u"GROUP BY [Wildlife Species] ORDER BY Strikes DESC"},
    SampleQuery{u"Unpaid orders", u"Orders", u"SELECT * FROM Orders WHERE Paid = 0 ORDER BY Ordered"},
    SampleQuery{u"Orders with city", u"Orders",
                u"SELECT Orders.Number,Orders.Customer,Contacts.City,Orders.Item,Orders.Price FROM Orders "
                u"INNER JOIN Contacts ON Orders.Customer = Contacts.Name ORDER BY Orders.Number"},
};

const QStringList kFavorites = {u"table:Bird Strikes"_s, u"query:Strikes by species"_s, u"form:Strikes"_s};

CsvFormat FormatOfTheFiles()
{
    CsvFormat format;
    format.doubledQuotes = true;
    format.namesInFirstLine = true;
    format.dates = {DateOrder::YearMonthDay, u'-', u':'};
    return format;
}

class TableMaker {
public:
    TableMaker(DatabaseSession& session, DatabaseLocation database, QString source)
        : session_(session)
        , database_(std::move(database))
        , source_(std::move(source))
    {
    }

    bool Make(const SampleTable& table)
    {
        ImportPlan plan{.format = FormatOfTheFiles(), .table = table.name.toString(), .columns = {}};
        UserMessage fault{};
        if (!ParseColumnList(table.columns.toString(), plan.columns, fault)) {
            session_.Prompt().Show(fault);
            return false;
        }
        return Execute(CreateTableStatement(plan.table, plan.columns)) && Fill(plan, table.file) && Index(table);
    }

private:
    bool Execute(const QString& statement) { return session_.GetCatalog().ExecuteStatement(database_, statement); }

    bool Fill(const ImportPlan& plan, QStringView fileName)
    {
        QFile file(QDir(source_).filePath(fileName.toString()));
        if (!file.open(QIODevice::ReadOnly)) {
            session_.Prompt().Show({Str::SampleFailed, {SystemReason(file)}});
            return false;
        }
        ImportReport report;
        return ImportCsv(session_.Connection(), database_, file, plan, session_.Prompt(), report) &&
               !report.stopped;
    }

    bool Index(const SampleTable& table)
    {
        const QString name = table.name.toString();
        return std::ranges::all_of(table.indexes, [&](QStringView indexed) {
            const QString field = indexed.toString();
            return field.isEmpty() ||
                   Execute(CreateIndexStatement(name, {IndexNameOfField(name, field), {{field}}}));
        });
    }

    DatabaseSession& session_;
    DatabaseLocation database_;
    QString source_;
};

void AddQueries(FormStore& store)
{
    for (const SampleQuery& sample : kQueries) {
        QueryDef query;
        query.SetName(sample.name);
        query.SetTableName(sample.table);
        query.SetText(sample.statement);
        store.AddQuery(query);
    }
}

} // namespace

SampleDatabase::SampleDatabase(const ProgramFolder& folder, QString source)
    : folder_(folder.path)
    , path_(QDir(folder.path).absoluteFilePath(u"Sample.cdb"_s))
    , source_(std::move(source))
{
}

bool SampleDatabase::Open(DatabaseSession& session) const
{
    const bool isNew = !QFileInfo::exists(path_);
    if (!Provide(session) || !session.Open(path_))
        return false;
    if (isNew)
        Furnish(session);
    return true;
}

bool SampleDatabase::Provide(DatabaseSession& session) const
{
    if (QFileInfo::exists(path_))
        return true;
    // Made under another name: what an interruption leaves behind is never taken for the sample.
    const QString unfinished = path_ + u".new"_s;
    QDir().mkpath(folder_);
    QFile::remove(unfinished);
    const bool made = Make(session, unfinished);
    if (ProviderConnection* provider = session.Connection().Provider())
        provider->CloseDatabase(unfinished);
    if (made && QFile::rename(unfinished, path_))
        return true;
    QFile::remove(unfinished);
    return false;
}

void SampleDatabase::Furnish(DatabaseSession& session) const
{
    // Without queries, forms and favorites it is a sample all the same.
    (void)session.Store().Apply([](FormStore& store) { return AddQueries(store), AddSampleForms(store), true; });
    (void)session.SetFavorites(kFavorites);
}

bool SampleDatabase::Make(DatabaseSession& session, const QString& path) const
{
    if (!session.GetCatalog().ExecuteStatement({}, u"CREATE DATABASE "_s + QuoteText(path)))
        return false;
    TableMaker maker(session, path, source_);
    return std::ranges::all_of(kTables, [&maker](const SampleTable& table) { return maker.Make(table); });
}

} // namespace mirel
