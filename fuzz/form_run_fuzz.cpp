// Any bytes as a form file, and what a user does to its forms: opened, shown, typed into, pressed, called, closed.
// Refusing is fine; nothing but records may change, and the current record always lies within the result.
//
// The first byte counts the actions, three bytes each; what follows is the file.
#include "data/catalog.h"
#include "forms/form_store.h"
#include "forms/running_form.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <sqlite3.h>

#include <algorithm>
#include <array>
#include <cstdint>
#include <utility>

using namespace mirel;
using namespace Qt::StringLiterals;

namespace {

constexpr size_t kActionBytes = 3;
constexpr size_t kMostActions = 24;
constexpr size_t kMostForms = 4;
constexpr size_t kMostControls = 64;
constexpr size_t kMostCalled = 3;

// A form's query may join a table with itself as often as it likes. So that each input takes a bounded time, the
// engine gives up after some steps, as it does where a user interrupts it.
constexpr int kStepsAtOnce = 10'000;
constexpr int kMostStepsAtOnce = 100;
int stepsTaken = 0;

int GiveUp(void*)
{
    return ++stepsTaken > kMostStepsAtOnce ? 1 : 0;
}

int LimitSteps(sqlite3* handle, char**, const void*)
{
    sqlite3_progress_handler(handle, kStepsAtOnce, GiveUp, nullptr);
    return SQLITE_OK;
}

void Require(bool holds)
{
    if (!holds)
        __builtin_trap();
}

class Yielding : public UserPrompt {
public:
    bool yes = true;

    bool AskYesNo(const UserMessage& question) override
    {
        Require(!question.Text().isEmpty());
        return yes;
    }
    void Show(const UserMessage& message) override { Require(!message.Text().isEmpty()); }
    void ShowError(const QString& text) override { Require(!text.isEmpty()); }
    std::optional<QString> AskText(const UserMessage&, const UserMessage&, const QString&) override { return {}; }
    std::unique_ptr<Progress> StartProgress(const UserMessage&, qint64) override
    {
        struct Going : Progress {
            bool Advance(qint64) override { return true; }
        };
        return std::make_unique<Going>();
    }
};

// The database of each input in turn: always the same when it begins.
class Database {
public:
    Database()
    {
        const QString from = Template();
        QFile::remove(Path());
        Require(QFile::copy(from, Path()));
    }
    static QString Path() { return Folder().filePath(u"run.cdb"_s); }

    // Everything about the file but the records.
    static QString Structure(DbConnection& connection)
    {
        QString structure = QDir(Folder().path()).entryList(QDir::Files).join(u'|');
        for (const QString& source : {u"MSysTables"_s, u"MSysFields"_s, u"MSysIndexes"_s}) {
            DbRecordset rows(connection);
            Require(rows.Open(source, Path(), CursorType::ForwardOnly, LockType::ReadOnly));
            for (; !rows.IsEof(); Require(rows.MoveNext())) {
                for (int i = 0; i < rows.FieldCount(); ++i)
                    structure += rows.ValueText(i) + u'|';
            }
        }
        return structure;
    }

private:
    static const QTemporaryDir& Folder()
    {
        static const QTemporaryDir folder;
        return folder;
    }
    static QString Template()
    {
        static const QTemporaryDir folder;
        const QString path = folder.filePath(u"template.cdb"_s);
        if (QFile::exists(path))
            return path;
        DbConnection connection;
        const auto run = [&](const QString& statement, const QString& database) {
            DbRecordset rows(connection);
            Require(rows.Open(statement, database, CursorType::ForwardOnly, LockType::ReadOnly));
        };
        run(u"CREATE DATABASE "_s + QuoteText(path), {});
        run(u"CREATE TABLE T (A Integer, B Varchar(20), C Bit, D Datetime, E Text, F Float)"_s, path);
        run(u"CREATE TABLE [Two Words] ([My Key] Integer, [My Text] Varchar(20))"_s, path);
        for (const auto* values : {u"1,'one',1,'2001-07-04','long',1.5", u"2,NULL,0,NULL,NULL,NULL",
                                   u"3,'O''Brien',1,'1999-12-31 23:59:59','',-1"})
            run(u"INSERT INTO T (A,B,C,D,E,F) VALUES(%1)"_s.arg(QStringView(values)), path);
        run(u"INSERT INTO [Two Words] ([My Key],[My Text]) VALUES(1,'x')"_s, path);
        return path;
    }
};

constexpr std::array kTyped = {u"",
                               u"7",
                               u"-1.5",
                               u"2001-07-04",
                               u"O'Brien",
                               u"\"'[]&[B]\x05\x06",
                               u"1",
                               u"0",
                               u"true",
                               u"x' OR 1=1",
                               u"); DROP TABLE T; --",
                               u"%_",
                               u"&[B]",
                               u"1e308",
                               u"NULL"};

// The forms that run, and the actions that are done to the one on top.
class Session : public FormHost {
public:
    Session(const FormStore& store, DbConnection& connection)
        : store_(store)
        , connection_(connection)
    {
    }

    void Start(const FormCall& call)
    {
        forms_.push_back(std::make_unique<RunningForm>(
            call, FormEnvironment{connection_, Database::Path(), store_, prompt_, *this, settings_, {}, [] {
                                      return QDateTime(QDate(2001, 7, 4), QTime(9, 5));
                                  }}));
        (void)forms_.back()->Open();
        Check();
    }

    void Act(const uint8_t* action)
    {
        stepsTaken = 0;
        RunningForm& form = *forms_.back();
        const int controls = int(form.Controls().size());
        const int control = controls > 0 ? action[1] % controls : 0;
        prompt_.yes = action[2] % 4 != 0;
        closing_ = false;
        Do(form, action[0] % 20, control, action[2]);
        Check();
        if (closing_ && forms_.size() > 1)
            forms_.pop_back();
    }

    void CallForm(const FormCall& call) override { called_ = call; }
    void CloseForm() override { closing_ = true; }
    void DataChanged() override {}

private:
    void Do(RunningForm& form, int action, int control, uint8_t choice)
    {
        const QString typed = QStringView(kTyped[choice % kTyped.size()]).toString();
        switch (action) {
        case 0:
            form.SetText(control, typed);
            break;
        case 1:
            form.SetTicked(control, choice % 2 != 0);
            break;
        case 2:
            (void)form.SelectListRow(control, choice);
            break;
        case 3:
            (void)form.TapListHeader(control, choice % 4);
            break;
        case 4:
            (void)form.GoToFirst();
            break;
        case 5:
            (void)form.GoToNext();
            break;
        case 6:
            (void)form.GoToPrevious();
            break;
        case 7:
            (void)form.GoToLast();
            break;
        case 8:
            (void)form.AddRecord();
            break;
        case 9:
            (void)form.DeleteRecord();
            break;
        case 10:
            (void)form.FilterByControl(control, CellFilter::BySelection);
            break;
        case 11:
            (void)form.SortByControl(control, SortOrder::Descending);
            break;
        case 12:
            (void)form.RemoveFilter();
            break;
        case 13:
            form.Tick();
            break;
        case 14:
            form.RefreshItems(control);
            break;
        case 15:
            (void)form.ListRows(control, choice, 10);
            break;
        case 16:
            (void)form.Close();
            break;
        default:
            Press(form, control);
            break;
        }
    }

    void Press(RunningForm& form, int control)
    {
        (void)form.PressButton(control);
        if (called_ && forms_.size() < kMostCalled)
            Start(*std::exchange(called_, {}));
        called_.reset();
    }

    void Check()
    {
        const RunningForm& form = *forms_.back();
        Require(form.RecordCount() >= -1 && form.CurrentRecord() >= -1);
        Require(form.CurrentRecord() < std::max<qint64>(form.RecordCount(), 0));
        Require(form.HasResult() == (form.RecordCount() >= 0));
        for (const ControlRun& control : form.Controls()) {
            Require(control.revision <= form.Revision());
            (void)PartsOf(*control.definition);
        }
    }

    const FormStore& store_;
    DbConnection& connection_;
    Yielding prompt_;
    FormViewSettings settings_{.updateAggregate = true};
    std::vector<std::unique_ptr<RunningForm>> forms_;
    std::optional<FormCall> called_;
    bool closing_ = false;
};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    static const int limited = sqlite3_auto_extension(reinterpret_cast<void (*)()>(LimitSteps));
    Require(limited == SQLITE_OK);
    const size_t actions =
        size == 0 ? 0 : std::min<size_t>(data[0] % (kMostActions + 1), (size - 1) / kActionBytes);
    const size_t fileBegin = std::min(size, 1 + actions * kActionBytes);
    FormStore store;
    store.LoadFrom(QByteArrayView(data + fileBegin, qsizetype(size - fileBegin)));

    for (size_t i = 0; i < std::min(store.Forms().size(), kMostForms); ++i) {
        const FormDef& form = store.Forms()[i];
        if (form.controls.size() > kMostControls)
            continue;
        const Database database;
        stepsTaken = 0;
        DbConnection connection;
        const QString before = Database::Structure(connection);
        {
            Session session(store, connection);
            session.Start({form, {}, -1});
            for (size_t action = 0; action < actions; ++action)
                session.Act(data + 1 + action * kActionBytes);
        }
        stepsTaken = 0;
        Require(Database::Structure(connection) == before);
    }
    return 0;
}
