#include "forms/form_fixture.h"
#include "support/scripted_prompt.h"
#include "tableview/block_commands.h"
#include "tableview/bulk_run.h"
#include "tableview/csv_export.h"
#include "tableview/record_browser.h"

#include <gtest/gtest.h>

#include <QBuffer>
#include <QProcess>
#include <QTemporaryDir>

#include <sqlite3.h>

#include <map>
#include <random>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// A table as it has to be, by the key that each of its records bears as a value. Row ids come and go; Key never
// names two records.
using Model = std::map<int, QString>;

// One walks through a result, types, deletes, pastes, undoes; the other, a program of its own or another result of
// this one, changes the table between any two steps. What the file holds in the end is what each was told.
class TwoActors : public ::testing::Test {
protected:
    static constexpr int kRecords = 40;

    TwoActors()
    {
        Run(u"CREATE DATABASE '%1'"_s.arg(path_), {});
        Run(u"CREATE TABLE T (K Integer, Name Varchar(40), N Integer)"_s, path_);
        EXPECT_EQ(sqlite3_open(path_.toUtf8().constData(), &handle_), SQLITE_OK);
        process_.start(u"sqlite3"_s, {u"-batch"_s, path_});
        EXPECT_TRUE(process_.waitForStarted());
        OfProcess(u"PRAGMA synchronous=OFF"_s); // what it writes need not survive a power cut
        OfHandle(u"PRAGMA synchronous=OFF"_s);
        for (int i = 1; i <= kRecords; ++i)
            InsertOutside();
    }
    ~TwoActors() override
    {
        OpenResult::SetLongOrder(OpenResult::kLongOrder);
        process_.closeWriteChannel();
        process_.waitForFinished();
        sqlite3_close(handle_);
    }

    void Run(const QString& statement, const QString& database)
    {
        DbRecordset rows(connection_);
        EXPECT_TRUE(rows.Open(statement, database, CursorType::ForwardOnly, LockType::ReadOnly))
            << statement.toStdString();
    }

    // --- the other ------------------------------------------------------------------------------------------

    // A statement of the other's: of another process, of another handle in this one, or of another result of this
    // program, where the dialect has the statement.
    void Outside(const QString& sql, const QString& dialect = {})
    {
        switch (Random(3)) {
        case 0:
            OfProcess(sql);
            break;
        case 1:
            if (!dialect.isEmpty()) {
                Run(dialect, path_);
                break;
            }
            [[fallthrough]];
        default:
            OfHandle(sql);
        }
    }
    void OfProcess(const QString& sql)
    {
        process_.write(sql.toUtf8() + ";\nSELECT 'done';\n");
        QByteArray answer;
        while (!answer.endsWith("done\n") && process_.waitForReadyRead(10'000))
            answer += process_.readAllStandardOutput();
        EXPECT_EQ(answer, "done\n") << sql.toStdString() << process_.readAllStandardError().toStdString();
    }
    void OfHandle(const QString& sql)
    {
        char* error = nullptr;
        EXPECT_EQ(sqlite3_exec(handle_, sql.toUtf8().constData(), nullptr, nullptr, &error), SQLITE_OK)
            << sql.toStdString() << ": " << (error ? error : "");
        sqlite3_free(error);
    }
    void InsertOutside()
    {
        const int key = ++lastKey_;
        const QString statement = u"INSERT INTO T VALUES(%1,'new %1',%2)"_s.arg(key).arg(Random(50));
        Outside(statement, statement);
        model_[key] = u"new %1"_s.arg(key);
    }
    int AnyKey()
    {
        auto record = model_.begin();
        std::advance(record, Random(int(model_.size())));
        return record->first;
    }
    int Random(int below) { return int(random_() % unsigned(below)); }

    // The other's step, and what of it hits the record with the key `pointed`. Moved: it may have another row id.
    // Replaced: another record may have its row id.
    enum class Hit { Nothing, Changed, Deleted, Moved, Replaced };
    Hit OtherActs(int pointed)
    {
        if (model_.empty()) {
            InsertOutside();
            return Hit::Nothing;
        }
        const int key = Random(3) == 0 && model_.contains(pointed) ? pointed : AnyKey();
        switch (Random(6)) {
        case 0:
        case 1:
            InsertOutside();
            return Hit::Nothing;
        case 2:
            Outside(u"DELETE FROM T WHERE K=%1"_s.arg(key), u"DELETE FROM T WHERE K=%1"_s.arg(key));
            model_.erase(key);
            return key == pointed ? Hit::Deleted : Hit::Nothing;
        case 3: {
            const QString name = u"theirs %1"_s.arg(++edits_);
            const QString statement = u"UPDATE T SET Name='%1' WHERE K=%2"_s.arg(name).arg(key);
            Outside(statement, statement);
            model_[key] = name;
            return key == pointed ? Hit::Changed : Hit::Nothing;
        }
        case 4: // row ids are given away again
            Outside(u"DELETE FROM T WHERE rowid=(SELECT max(rowid) FROM T); "
                    "INSERT INTO T VALUES(%1,'new %1',%2)"_s.arg(lastKey_ + 1)
                        .arg(Random(50)));
            TakeUpModel();
            return pointed < 0 || model_.contains(pointed) ? Hit::Nothing : Hit::Replaced;
        default:
            Outside(u"VACUUM"_s);
            return Hit::Moved;
        }
    }
    // After a change whose victim only the file knows.
    void TakeUpModel()
    {
        ++lastKey_;
        model_ = Stored();
    }

    // What a sum and an export of `result` say holds for the file as it is.
    void ReadsAllOf(OpenResult& result)
    {
        qint64 sum = 0;
        for (const auto& [key, name] : model_)
            sum += key;
        const std::optional<AggregateResult> read = BulkRun(result, prompt_).Sum(0, Aggregate::Sum);
        ASSERT_TRUE(read);
        EXPECT_EQ(read->whole, sum);
        EXPECT_EQ(read->values, qint64(model_.size()));
        QBuffer file;
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        EXPECT_EQ(ExportCsv(result.Records(), {}, file, nullptr).records, qint64(model_.size()));
        for (const auto& [key, name] : model_)
            EXPECT_TRUE(file.data().contains(name.toUtf8())) << key;
    }

    Model Stored() const
    {
        Model stored;
        sqlite3_stmt* statement = nullptr;
        EXPECT_EQ(sqlite3_prepare_v2(handle_, "SELECT K,Name FROM T", -1, &statement, nullptr), SQLITE_OK);
        while (sqlite3_step(statement) == SQLITE_ROW) {
            stored[sqlite3_column_int(statement, 0)] =
                QString::fromUtf8(reinterpret_cast<const char*>(sqlite3_column_text(statement, 1)));
        }
        sqlite3_finalize(statement);
        return stored;
    }

    QTemporaryDir folder_;
    QString path_ = folder_.filePath(u"two.cdb"_s);
    DbConnection connection_;
    ScriptedPrompt prompt_;
    sqlite3* handle_ = nullptr;
    QProcess process_;
    std::mt19937 random_{20'011'024};
    Model model_;
    int lastKey_ = 0;
    int edits_ = 0;
};

TEST_F(TwoActors, ATableViewWritesTheRecordThatItsUserPointsAtOrNone)
{
    TableViewSettings settings;
    settings.confirmDelete = false;
    RecordBrowser browser(connection_, path_, prompt_, settings);
    browser.SetRowsPerPage(7);
    const QStringList statements = {u"SELECT * FROM T"_s, u"SELECT * FROM T ORDER BY N"_s,
                                    u"SELECT K,Name FROM T WHERE K>5 ORDER BY Name DESC"_s,
                                    u"SELECT * FROM T WHERE N>=0"_s};
    ASSERT_TRUE(browser.Open(statements[0]));
    const auto pointed = [&] {
        return browser.SelectedRecord() < 0 ? -1 : browser.Recordset().FieldValue(0).ToInt();
    };
    for (int round = 0; round < 2400; ++round) {
        SCOPED_TRACE(round);
        prompt_.questions.clear();
        prompt_.shown.clear();
        if (round % 200 == 0) { // orders made at once, then orders that come in steps
            OpenResult::SetLongOrder(round / 200 % 8 < 4 ? OpenResult::kLongOrder : 2);
            ASSERT_TRUE(browser.Open(statements[(round / 200) % statements.size()]));
        }
        for (int steps = Random(4); steps > 0; --steps)
            browser.SettleOn(0);
        (void)browser.GoToRecord(1 + Random(std::max(int(model_.size()), 1)));
        const int key = pointed();
        if (key < 0) {
            OtherActs(-1);
            browser.TakeUpChanges();
            continue;
        }
        const bool keepsMine = Random(2) == 0;
        prompt_.answers = {keepsMine};
        switch (Random(6)) {
        case 0: { // types; the other acts before it is written
            (void)browser.GoToCell(browser.SelectedRecord(), 1);
            const QString mine = u"mine %1"_s.arg(++edits_);
            browser.EditText(mine);
            const Hit hit = OtherActs(key);
            if (hit == Hit::Replaced)
                prompt_.answers = {false}; // it is asked about like any change, and shown
            const bool written = browser.WriteEdit();
            if (hit == Hit::Nothing || hit == Hit::Changed || hit == Hit::Deleted) {
                EXPECT_EQ(written, hit != Hit::Deleted);
            }
            if (hit == Hit::Replaced)
                browser.RevertEdit();
            else if (!written) {
                EXPECT_TRUE(browser.WriteFailed());
                EXPECT_EQ(browser.SelectedText(), mine) << "typed text is kept";
                browser.RevertEdit();
            } else if (hit != Hit::Changed || keepsMine) {
                model_[key] = mine;
            }
            break;
        }
        case 1: { // deletes; the other acts before, seen or unseen
            const Hit hit = OtherActs(key);
            const bool isSeen = Random(2) == 0;
            if (isSeen)
                browser.TakeUpChanges();
            if (hit == Hit::Replaced)
                prompt_.answers = {false};
            const int now = isSeen ? pointed() : key;
            const bool deleted = now >= 0 && browser.DeleteRecord();
            if (!isSeen && (hit == Hit::Deleted || hit == Hit::Replaced)) {
                EXPECT_FALSE(deleted) << "never a neighbor";
            }
            if (hit == Hit::Nothing) {
                EXPECT_TRUE(deleted && now == key);
            }
            if (deleted)
                model_.erase(now);
            break;
        }
        case 2: { // deletes and undoes
            OtherActs(-1);
            browser.TakeUpChanges();
            const int now = pointed();
            if (now < 0)
                break;
            const QString name = model_[now];
            ASSERT_TRUE(browser.DeleteRecord());
            model_.erase(now);
            OtherActs(-1);
            EXPECT_TRUE(browser.Undo());
            EXPECT_EQ(prompt_.shown, QStringList());
            model_[now] = name;
            break;
        }
        case 3: { // pastes over up to three names, and may undo it; the other acts before
            OtherActs(-1);
            browser.TakeUpChanges();
            if (pointed() < 0)
                break;
            (void)browser.GoToCell(browser.SelectedRecord(), 1);
            const qint64 first = browser.SelectedRecord();
            TextRows rows;
            std::vector<int> keys;
            for (qint64 at = first; at < std::min<qint64>(first + 3, browser.Result().Count()); ++at) {
                ASSERT_TRUE(browser.Recordset().MoveTo(at));
                keys.push_back(browser.Recordset().FieldValue(0).ToInt());
                rows.push_back({u"mine %1"_s.arg(++edits_)});
            }
            ASSERT_TRUE(browser.Recordset().MoveTo(first));
            const Model before = model_;
            ASSERT_TRUE(BlockCommands(browser, prompt_).Paste(rows)) << prompt_.shown.join(u' ').toStdString();
            for (size_t i = 0; i < keys.size(); ++i)
                model_[keys[i]] = rows[i][0];
            if (Random(2) == 0) {
                EXPECT_TRUE(browser.Undo());
                model_ = before;
            }
            break;
        }
        case 4: // sums up and exports
            OtherActs(key);
            ASSERT_TRUE(browser.Open(statements[0]));
            OtherActs(-1);
            browser.TakeUpChanges();
            ReadsAllOf(browser.Result());
            ASSERT_TRUE(browser.Open(statements[(round / 200) % statements.size()]));
            break;
        default: // walks
            OtherActs(key);
            browser.TakeUpChanges();
            EXPECT_TRUE(browser.GoToNext() && browser.GoToPrevious());
            EXPECT_TRUE(model_.empty() || model_.contains(pointed()));
            break;
        }
        ASSERT_EQ(Stored(), model_);
    }
}

// The same of a form: what SAVE, DELETE RECORD and Undo do.
TEST_F(TwoActors, AFormWritesTheRecordThatItShowsOrNone)
{
    FormBuilder builder(u"T");
    builder.Edit(u"K", u"T.K").Edit(u"Name", u"T.Name");
    builder.Button(u"SAVE", ButtonFunction::Update, std::vector<SourceAssignment>{{u"T.Name"_s, u"&[Name]"_s}});
    const FormStore store;
    RecordingHost host;
    FormViewSettings settings;
    settings.confirmDelete = false;
    RunningForm form({builder.form, u"SELECT * FROM T ORDER BY N"_s, -1},
                     {connection_, path_, store, prompt_, host, settings, {}});
    OpenResult::SetLongOrder(2);
    ASSERT_TRUE(form.Open());
    const int name = form.FindControl(u"Name");
    const int save = form.FindControl(u"SAVE");
    using Outcome = RunningForm::Outcome;
    const auto shown = [&] { return form.CurrentRecord() < 0 ? -1 : form.ShownText(0).toInt(); };
    for (int round = 0; round < 1200; ++round) {
        SCOPED_TRACE(round);
        prompt_.questions.clear();
        prompt_.shown.clear();
        prompt_.answers = {true, true}; // leaving drops what is typed
        for (int steps = Random(4); steps > 0; --steps)
            form.CatchUp(0);
        (void)form.GoToRecord(Random(std::max(int(model_.size()), 1)));
        const int key = shown();
        if (key < 0 || model_.empty()) {
            OtherActs(-1);
            form.TakeUpChanges();
            continue;
        }
        const bool keepsMine = Random(2) == 0;
        prompt_.answers = {keepsMine};
        switch (Random(3)) {
        case 0: {
            const QString mine = u"mine %1"_s.arg(++edits_);
            form.SetText(name, mine);
            const Hit hit = OtherActs(key);
            if (hit == Hit::Replaced)
                prompt_.answers = {false};
            if (Random(2) == 0)
                form.TakeUpChanges(); // what is typed stays on its record
            const Outcome saved = form.PressButton(save);
            if (hit == Hit::Nothing || hit == Hit::Deleted) {
                EXPECT_EQ(saved, hit == Hit::Nothing ? Outcome::Done : Outcome::Failed);
            }
            if (saved == Outcome::Done)
                model_[key] = mine;
            if (saved == Outcome::Failed) {
                EXPECT_EQ(form.ShownText(name), mine) << "typed text is kept";
            }
            break;
        }
        case 1: {
            const Hit hit = OtherActs(key);
            const bool isSeen = Random(2) == 0;
            if (isSeen)
                form.TakeUpChanges();
            if (hit == Hit::Replaced)
                prompt_.answers = {false};
            const int now = isSeen ? shown() : key;
            const bool deleted = now >= 0 && form.DeleteRecord() == Outcome::Done;
            if (!isSeen && (hit == Hit::Deleted || hit == Hit::Replaced)) {
                EXPECT_FALSE(deleted) << "never a neighbor";
            }
            if (!deleted)
                break;
            const QString taken = model_[now];
            model_.erase(now);
            OtherActs(-1);
            if (Random(2) == 0) {
                EXPECT_EQ(form.Undo(), Outcome::Done);
                model_[now] = taken;
            }
            break;
        }
        default:
            OtherActs(key);
            EXPECT_NE(form.GoToNext(), Outcome::Stopped);
            EXPECT_TRUE(model_.empty() || model_.contains(shown()));
            break;
        }
        ASSERT_EQ(Stored(), model_);
    }
}

} // namespace
} // namespace mirel
