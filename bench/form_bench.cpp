// Next Record on a form of fifty expressions, at the start and at the end of tables of growing size: it should
// cost the same everywhere, and report the controls that changed alone.
#include "data/catalog.h"
#include "forms/running_form.h"

#include <benchmark/benchmark.h>

#include <QTemporaryDir>

#include <array>
#include <map>
#include <string>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kControls = 50;
constexpr std::array kExpressions = {
    u"RECNO()+'/'+RECCOUNT()",
    u"[Name]",
    u"UPPER([Name])+', '+[City]",
    u"[Price]*[Qty]*(1+0.2)",
    u"[Due]",
    u"TO_CHAR([Qty])+' pieces'",
    u"[Price]",
    u"[Qty]+1",
    u"'the same on every record'",
    u"LEFT([City],3)",
};

struct SilentPrompt : UserPrompt {
    bool AskYesNo(const UserMessage&) override { return true; }
    void Show(const UserMessage&) override {}
    void ShowError(const QString&) override {}
    std::optional<QString> AskText(const UserMessage&, const UserMessage&, const QString&) override { return {}; }
    std::unique_ptr<Progress> StartProgress(const UserMessage&, qint64) override
    {
        struct Silent : Progress {
            bool Advance(qint64) override { return true; }
        };
        return std::make_unique<Silent>();
    }
};

struct NoHost : FormHost {
    void CallForm(const FormCall&) override {}
    void CloseForm() override {}
    void DataChanged() override {}
};

// A database with one table of `records` records, kept for the run of the program.
class Table {
public:
    explicit Table(qint64 records)
        : path_(folder_.filePath(u"bench.cdb"_s))
    {
        Run(u"CREATE DATABASE "_s + QuoteText(path_), {});
        Run(u"CREATE TABLE T (Name Varchar(40),City Varchar(40),Price Float,Qty Integer,Due Datetime)"_s, path_);
        Fill(records);
    }

    static Table& OfSize(qint64 records)
    {
        static std::map<qint64, std::unique_ptr<Table>> tables;
        std::unique_ptr<Table>& table = tables[records];
        if (!table)
            table = std::make_unique<Table>(records);
        return *table;
    }
    const QString& Path() const { return path_; }
    DbConnection& Connection() { return connection_; }

private:
    void Run(const QString& statement, const QString& database)
    {
        DbRecordset rows(connection_);
        if (!rows.Open(statement, database, CursorType::ForwardOnly, LockType::ReadOnly))
            qFatal("%s", qPrintable(statement));
    }
    void Fill(qint64 records)
    {
        Hr hr = Hr::Ok;
        QString context;
        const auto appender = connection_.Provider()->CreateAppender(path_, u"T"_s, {}, hr, context);
        constexpr std::array<std::string_view, 4> kCities = {"Hamburg", "New York", "Lisbon", "Oslo"};
        for (qint64 i = 0; i < records; ++i) {
            const std::string name = "Anna Smith " + std::to_string(i);
            const std::array cells = {Cell::OfText(name), Cell::OfText(kCities[size_t(i % 4)]),
                                      Cell::Of(0.25 * double(i % 997)), Cell::Of(i % 17),
                                      Cell::OfText("2001-07-04")};
            if (Failed(appender->Append(cells)))
                qFatal("append");
        }
        if (Failed(appender->Commit()))
            qFatal("commit");
    }

    QTemporaryDir folder_;
    QString path_;
    DbConnection connection_;
};

FormDef FormOfExpressions()
{
    FormDef form;
    form.SetTableName(u"T");
    for (int i = 0; i < kControls; ++i) {
        ControlDef control;
        control.type = ControlType::EditBox;
        control.hasSource = 1;
        control.sourceScope = SourceScope::Record;
        control.name.Set(u"c%1"_s.arg(i));
        control.SetSource(kExpressions[size_t(i) % kExpressions.size()]);
        form.AddControl(std::move(control));
    }
    return form;
}

// Steps of Next Record that begin a share of the way into the table.
void NextRecord(benchmark::State& state, double share)
{
    Table& table = Table::OfSize(state.range(0));
    SilentPrompt prompt;
    NoHost host;
    FormStore store;
    RunningForm form({FormOfExpressions(), {}, -1},
                     {table.Connection(), table.Path(), store, prompt, host, {}, {}});
    if (!form.Open())
        state.SkipWithError("the form does not open");
    constexpr qint64 kSteps = 1000; // before it goes back to where it began
    const qint64 first = qint64(share * double(state.range(0) - kSteps - 1));
    qint64 changed = 0;
    qint64 step = 0;
    for (auto _ : state) {
        if (step++ % kSteps == 0) {
            state.PauseTiming();
            (void)form.GoToRecord(first);
            state.ResumeTiming();
        }
        const quint64 seen = form.Revision();
        benchmark::DoNotOptimize(form.GoToNext());
        for (const ControlRun& control : form.Controls())
            changed += control.revision > seen ? 1 : 0;
    }
    state.counters["changed"] = double(changed) / double(step);
}
BENCHMARK_CAPTURE(NextRecord, Start, 0.0)->Arg(10'000)->Arg(1'000'000);
BENCHMARK_CAPTURE(NextRecord, Middle, 0.5)->Arg(10'000)->Arg(1'000'000);
BENCHMARK_CAPTURE(NextRecord, End, 1.0)->Arg(10'000)->Arg(1'000'000);

void SumOfAll(benchmark::State& state)
{
    Table& table = Table::OfSize(state.range(0));
    SilentPrompt prompt;
    NoHost host;
    FormStore store;
    FormDef definition;
    definition.SetTableName(u"T");
    ControlDef control;
    control.type = ControlType::EditBox;
    control.hasSource = 1;
    control.sourceScope = SourceScope::WholeResult;
    control.SetSource(u"SUM([Price]*[Qty])");
    definition.AddControl(control);
    RunningForm form({definition, {}, -1}, {table.Connection(), table.Path(), store, prompt, host, {}, {}});
    if (!form.Open())
        state.SkipWithError("the form does not open");
    for (auto _ : state)
        form.RecomputeAggregates();
}
BENCHMARK(SumOfAll)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

} // namespace
} // namespace mirel
