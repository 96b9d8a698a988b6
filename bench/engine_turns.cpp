// Holds the data layer against plain SQLite on the same files, in turns, in one process:
// mirel-bench-engine LARGE.cdb SMALL.cdb [REPEAT [reads]]
// mirel-bench-engine export DATABASE FILE.csv        nothing but the export, for who measures the process
//
// Both files hold a table Birds, the columns of bench_data.cpp; the small one has ten thousand records. Neither is
// changed: what writes works on copies. Each line: what, milliseconds of processor time here and there, the same
// by the clock, the ratio that is asked for ("-": none), a remark; separated by tabs. A time is the shortest of
// the repeats.
#include "data/db_recordset.h"
#include "tableview/aggregate.h"
#include "tableview/csv_export.h"
#include "tableview/record_browser.h"

#include <QElapsedTimer>
#include <QFile>
#include <QRandomGenerator>
#include <QTemporaryDir>

#include <malloc.h>
#include <sqlite3.h>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <ctime>
#include <functional>

using namespace mirel;
using namespace Qt::StringLiterals;

namespace {

constexpr int kPage = 50;
constexpr int kSliceMs = 5;

[[noreturn]] void Fail(const QString& what)
{
    std::fprintf(stderr, "%s\n", what.toUtf8().constData());
    std::exit(1);
}

// The other side: the library by itself, with its defaults.
class Plain {
public:
    explicit Plain(const QString& path)
    {
        if (sqlite3_open_v2(QFile::encodeName(path).constData(), &handle_,
                            SQLITE_OPEN_READWRITE | SQLITE_OPEN_NOMUTEX, nullptr) != SQLITE_OK)
            Fail(path);
    }
    ~Plain() { sqlite3_close(handle_); }
    Q_DISABLE_COPY_MOVE(Plain)

    // Steps through all rows; the first number of the last one.
    qint64 Run(const char* sql)
    {
        sqlite3_stmt* statement = nullptr;
        sqlite3_prepare_v2(handle_, sql, -1, &statement, nullptr);
        int result = SQLITE_ROW;
        qint64 number = 0;
        while ((result = sqlite3_step(statement)) == SQLITE_ROW)
            number = sqlite3_column_int64(statement, 0);
        sqlite3_finalize(statement);
        if (result != SQLITE_DONE)
            Fail(QString::fromUtf8(sqlite3_errmsg(handle_)));
        return number;
    }

private:
    sqlite3* handle_ = nullptr;
};

// An open result that cannot fail without ending the program.
class Result : public DbRecordset {
public:
    Result(DbConnection& connection, const QString& source, const QString& database)
        : DbRecordset(connection)
    {
        Check(Open(source, database, CursorType::Static, LockType::Optimistic));
    }
    void Check(bool done) const
    {
        if (!done)
            Fail(Source() + u": "_s + ErrorContext());
    }
    void ReadPage(qint64 first)
    {
        int records = 0;
        Check(Read({.first = first, .count = kPage, .fields = {}}, [&records](std::span<const Cell>) {
            ++records;
            return true;
        }));
        if (records != kPage)
            Fail(u"a page is not whole"_s);
    }
};

// Others use the machine as well: the processor's time says more than the clock's.
struct Time {
    double processorMs = HUGE_VAL;
    double clockMs = HUGE_VAL;

    void KeepShorter(const Time& other)
    {
        processorMs = std::min(processorMs, other.processorMs);
        clockMs = std::min(clockMs, other.clockMs);
    }
};

Time TimeOf(const std::function<void()>& work)
{
    const auto processorMs = [] {
        timespec now{};
        clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &now);
        return double(now.tv_sec) * 1e3 + double(now.tv_nsec) / 1e6;
    };
    QElapsedTimer timer;
    timer.start();
    const double begin = processorMs();
    work();
    return {processorMs() - begin, double(timer.nsecsElapsed()) / 1e6};
}

class SilentPrompt : public UserPrompt {
public:
    bool AskYesNo(const UserMessage&) override { return false; }
    void Show(const UserMessage& message) override { Fail(message.Text()); }
    void ShowError(const QString& text) override { Fail(text); }
    std::optional<QString> AskText(const UserMessage&, const UserMessage&, const QString&) override { return {}; }
    std::unique_ptr<Progress> StartProgress(const UserMessage&, qint64) override
    {
        struct Quiet : Progress {
            bool Advance(qint64) override { return true; }
        };
        return std::make_unique<Quiet>();
    }
};

class Turns {
public:
    Turns(QString large, QString small, int repeat)
        : large_(std::move(large))
        , small_(std::move(small))
        , repeat_(repeat)
    {
        table_ = folder_.filePath(u"table.cdb"_s);
        copy_ = folder_.filePath(u"copy.cdb"_s);
        gaps_ = folder_.filePath(u"gaps.cdb"_s);
        smallGaps_ = folder_.filePath(u"small gaps.cdb"_s);
    }

    void Run(bool alsoWrites);

private:
    using Work = std::function<void()>;

    static void Say(const char* what, const Time& ours, const Time& theirs, const char* goal,
                    const QString& remark, int runs = 1)
    {
        std::printf("%s\t%.4f\t%.4f\t%.4f\t%.4f\t%s\t%s\n", what, ours.processorMs / runs,
                    theirs.processorMs / runs, ours.clockMs / runs, theirs.clockMs / runs, goal,
                    remark.toUtf8().constData());
        std::fflush(stdout);
    }
    void Compare(const char* what, const char* goal, const Work& ours, const Work& theirs,
                 const QString& remark = {}, int runs = 1)
    {
        Time our;
        Time their;
        for (int i = 0; i < repeat_; ++i) {
            our.KeepShorter(TimeOf(ours));
            their.KeepShorter(TimeOf(theirs));
        }
        Say(what, our, their, goal, remark, runs);
    }
    // The same on fresh copies each time, which are made outside of the time.
    void CompareWrites(const char* what, const char* goal, const std::function<void(const QString&)>& ours,
                       const char* theirs);
    void MakeGaps(const QString& from, const QString& to);
    static void Copy(const QString& from, const QString& to)
    {
        QFile::remove(to);
        if (!QFile::copy(from, to))
            Fail(u"cannot copy to "_s + to);
    }

    void FirstPage();
    void Count(const char* what, const QString& path);
    void AnyPage(const char* what, const QString& order, const QString& large, const QString& small);
    void Order();
    void Sum();
    void Writes();
    void Undo();
    void Undo(const char* what, int records, bool (*change)(OpenResult&, qint64 count));
    void TakeUp();

    QString large_;
    QString small_;
    int repeat_;
    QTemporaryDir folder_;
    QString table_;
    QString copy_;
    QString gaps_; // every hundredth record is missing
    QString smallGaps_;
    DbConnection connection_;
};

void Turns::MakeGaps(const QString& from, const QString& to)
{
    Copy(from, to);
    Plain(to).Run("DELETE FROM Birds WHERE Number % 100 = 7");
}

// Ours against ours: opening must not depend on the size.
void Turns::FirstPage()
{
    const auto open = [this](const QString& path) {
        return [this, path] {
            Result result(connection_, u"SELECT * FROM Birds"_s, path);
            result.ReadPage(0);
        };
    };
    open(large_)(); // the files themselves are open from here on
    open(small_)();
    Compare("open a table: first 50 records", "-", open(large_), open(small_), u"0.4 ms; against ten thousand"_s);
}

void Turns::Count(const char* what, const QString& path)
{
    Plain plain(path);
    double longestMs = 0;
    qint64 count = 0;
    Compare(
        what, "1.6",
        [&] {
            Result result(connection_, u"SELECT * FROM Birds"_s, path);
            for (bool known = false; !known;)
                longestMs = std::max(longestMs, TimeOf([&] { known = result.CountStep(kSliceMs); }).processorMs);
            count = result.RecordCount();
        },
        [&] {
            if (plain.Run("SELECT count(*) FROM Birds") != count)
                Fail(u"the counts differ"_s);
        });
    Result result(connection_, u"SELECT * FROM Birds"_s, path);
    result.ReadPage(0);
    const auto heap = [] { return double(mallinfo2().uordblks) / 1e6; };
    const double before = heap();
    result.RecordCount();
    std::fprintf(stderr, "  %lld records: longest slice %.1f ms of processor time, positions %.3f MB\n",
                 qlonglong(count), longestMs, heap() - before);
}

void Turns::AnyPage(const char* what, const QString& order, const QString& large, const QString& small)
{
    constexpr int kJumps = 300;
    const auto jumps = [&](const QString& path) {
        auto result = std::make_shared<Result>(connection_, u"SELECT * FROM Birds"_s + order, path);
        const qint64 last = result->RecordCount() - kPage;
        return [result, last] {
            QRandomGenerator random(1);
            for (int i = 0; i < kJumps; ++i)
                result->ReadPage(qint64(random.bounded(quint32(last))));
        };
    };
    Compare(what, "1.5", jumps(large), jumps(small), u"against ten thousand"_s, kJumps);
}

void Turns::Order()
{
    Plain plain(large_);
    Compare(
        "order by a text, in the user's language", "1.0",
        [&] { Result(connection_, u"SELECT * FROM Birds ORDER BY Remarks"_s, large_).RecordCount(); },
        [&] { plain.Run("SELECT rowid FROM Birds ORDER BY Remarks COLLATE NOCASE"); }, u"COLLATE NOCASE"_s);
    Compare(
        "order by a text of few values", "1.0",
        [&] { Result(connection_, u"SELECT * FROM Birds ORDER BY Species"_s, large_).RecordCount(); },
        [&] { plain.Run("SELECT rowid FROM Birds ORDER BY Species COLLATE NOCASE"); }, u"COLLATE NOCASE"_s);
}

void Turns::Sum()
{
    Plain plain(large_);
    constexpr int kCost = 3;
    Result result(connection_, u"SELECT * FROM Birds"_s, large_);
    qint64 sum = 0;
    Compare(
        "SUM by walking the result", "1.5",
        [&] { sum = qint64(RunAggregate(result, kCost, Aggregate::Sum).value_or(AggregateResult()).value); },
        [&] {
            if (plain.Run("SELECT sum(Cost) FROM Birds") != sum)
                Fail(u"the sums differ"_s);
        },
        u"sum()"_s);
}

void Turns::CompareWrites(const char* what, const char* goal, const std::function<void(const QString&)>& ours,
                          const char* theirs)
{
    Time our;
    Time their;
    for (int i = 0; i < repeat_; ++i) {
        Copy(large_, table_);
        our.KeepShorter(TimeOf([&] { ours(table_); }));
        connection_.Provider()->CloseDatabase(table_);
        Copy(large_, copy_);
        Plain plain(copy_);
        their.KeepShorter(TimeOf([&] { plain.Run(theirs); }));
    }
    Say(what, our, their, goal, QString::fromLatin1(theirs));
}

void Turns::Writes()
{
    const BulkProgress goOn = [](qint64) { return true; };
    const QString all = u"SELECT * FROM Birds"_s;
    const QString some = u"SELECT * FROM Birds WHERE Cost<50000"_s;
    const auto update = [&](const QString& source) {
        return [this, source, goOn](const QString& path) {
            constexpr int kDamage = 7;
            Result result(connection_, source, path);
            result.Check(result.UpdateAll(kDamage, Value::Integer(7), -1, goOn));
        };
    };
    const auto remove = [&](const QString& source) {
        return [this, source, goOn](const QString& path) {
            Result result(connection_, source, path);
            result.Check(result.DeleteAll(-1, goOn));
        };
    };
    CompareWrites("update all", "1.15", update(all), "UPDATE Birds SET Damage=7");
    CompareWrites("update a half", "-", update(some), "UPDATE Birds SET Damage=7 WHERE Cost<50000");
    CompareWrites("delete all", "1.15", remove(all), "DELETE FROM Birds");
    CompareWrites("delete a half", "-", remove(some), "DELETE FROM Birds WHERE Cost<50000");
}

// A change of the first records of the table, taken back; against making it.
void Turns::Undo(const char* what, int records, bool (*change)(OpenResult&, qint64 count))
{
    const QString statement = u"SELECT * FROM Birds WHERE Number<=%1"_s.arg(records);
    Time making;
    Time undoing;
    for (int i = 0; i < repeat_; ++i) {
        Copy(large_, table_);
        {
            SilentPrompt prompt;
            OpenResult result(connection_, table_, prompt);
            if (!result.Open(statement))
                Fail(u"no result"_s);
            const qint64 count = result.Count();
            making.KeepShorter(TimeOf([&] {
                if (!change(result, count))
                    Fail(result.LastFailure());
            }));
            undoing.KeepShorter(TimeOf([&] { result.Undo(); }));
            if (result.CanUndo() || !result.CanRedo())
                Fail(u"nothing was undone"_s);
        }
        connection_.Provider()->CloseDatabase(table_);
    }
    Say(what, undoing, making, "1.5", u"making them"_s);
}

void Turns::Undo()
{
    Undo("undo of 200,000 changes", 200'000, [](OpenResult& result, qint64 count) {
        constexpr int kDamage = 7;
        return result.UpdateAll(kDamage, Value::Integer(7), count, [](qint64) { return true; });
    });
    Undo("undo of 20,000 deletions", 20'000,
         [](OpenResult& result, qint64 count) { return result.DeleteAll(count, [](qint64) { return true; }); });
}

// Another program writes a record of a sorted result; against opening that result.
void Turns::TakeUp()
{
    Copy(large_, table_);
    {
        SilentPrompt prompt;
        RecordBrowser browser(connection_, table_, prompt, {});
        const Time opening = TimeOf([&] {
            if (!browser.Open(u"SELECT * FROM Birds ORDER BY Remarks"_s))
                Fail(u"no result"_s);
            browser.SetRowsPerPage(kPage);
        });
        Plain other(table_);
        Time taking;
        Time settling;
        Time longestStep{0, 0};
        for (int i = 0; i < repeat_; ++i) {
            other.Run("UPDATE Birds SET Cost=Cost+1 WHERE Number=500000");
            taking.KeepShorter(TimeOf([&] { browser.TakeUpChanges(); }));
            settling.KeepShorter(TimeOf([&] {
                while (!browser.IsSettled()) {
                    const Time step = TimeOf([&] { (void)browser.SettleOn(kSliceMs); });
                    if (step.processorMs > longestStep.processorMs)
                        longestStep = step;
                }
            }));
        }
        Say("sorted page after another program's commit", taking, opening, "50 ms", u"opening it"_s);
        Say("its new order, in steps", settling, opening, "1.0", u"opening it"_s);
        Say("the longest of these steps", longestStep, opening, "50 ms", u"opening it"_s);
    }
    connection_.Provider()->CloseDatabase(table_);
}

void Turns::Run(bool alsoWrites)
{
    FirstPage();
    MakeGaps(large_, gaps_);
    MakeGaps(small_, smallGaps_);
    Count("count and positions", large_);
    Count("count and positions, with gaps", gaps_);
    AnyPage("50 records at any position", {}, large_, small_);
    AnyPage("50 records at any position, with gaps", {}, gaps_, smallGaps_);
    AnyPage("50 records of a sorted result", u" ORDER BY Cost"_s, large_, small_);
    Order();
    Sum();
    TakeUp();
    if (alsoWrites) {
        Writes();
        Undo();
    }
}

int Export(const QString& database, const QString& path)
{
    DbConnection connection;
    Result result(connection, u"SELECT * FROM Birds"_s, database);
    CsvExportOptions options;
    options.header = true;
    options.dates = {DateOrder::YearMonthDay, u'-', u':'};
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly | QIODevice::Unbuffered))
        Fail(path);
    return ExportCsv(result, options, file, nullptr).ending == CsvExportResult::Ending::Complete ? 0 : 1;
}

} // namespace

int main(int argc, char** argv)
{
    if (argc == 4 && qstrcmp(argv[1], "export") == 0)
        return Export(QFile::decodeName(argv[2]), QFile::decodeName(argv[3]));
    if (argc < 3)
        Fail(u"mirel-bench-engine LARGE.cdb SMALL.cdb [REPEAT [reads]]"_s);
    const int repeat = argc > 3 ? std::max(1, std::atoi(argv[3])) : 3;
    const bool alsoWrites = argc <= 4;
    Turns(QFile::decodeName(argv[1]), QFile::decodeName(argv[2]), repeat).Run(alsoWrites);
}
