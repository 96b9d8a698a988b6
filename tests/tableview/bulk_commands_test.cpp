#include "tableview/bulk_commands.h"

#include "support/small_disk.h"
#include "tableview/people_fixture.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class Bulk : public PeopleFixture {
protected:
    enum Field { Name, Age, Born, Member, Note };

    Bulk()
    {
        browser.SetRowsPerPage(10);
        EXPECT_TRUE(browser.Open(u"SELECT * FROM People"_s));
    }

    void Select(int field) { EXPECT_TRUE(browser.SelectCell(0, field)); }
    QString Counted(const QString& condition)
    {
        return Stored(u"SELECT COUNT(*) FROM People WHERE "_s + condition);
    }
    QString All() { return Stored(u"SELECT COUNT(*) FROM People"_s); }
    QString Sum(const QString& statement, Aggregate kind)
    {
        EXPECT_TRUE(browser.Open(statement));
        EXPECT_TRUE(bulk.ShowAggregate(kind)) << statement.toStdString();
        EXPECT_FALSE(browser.HasPendingEdit()) << "what is shown is no edit";
        return browser.FieldLabel() + browser.ShownResult();
    }
    // More than the run tells of at a time.
    void AddPeople(int count)
    {
        const ProviderConnection* provider = connection.Provider();
        Hr result = Hr::Ok;
        QString context;
        const std::unique_ptr<RecordAppender> people =
            connection.Provider()->CreateAppender(path, u"People"_s, {u"Name"_s, u"Age"_s}, result, context);
        ASSERT_TRUE(provider && people) << context.toStdString();
        for (int i = 0; i < count; ++i)
            ASSERT_EQ(people->Append(std::array{Cell::OfText("x"), Cell::Of(qint64(1))}), Hr::Ok);
        ASSERT_EQ(people->Commit(), Hr::Ok);
        EXPECT_TRUE(browser.RunAgain());
    }

    RecordBrowser browser{connection, path, prompt, {}};
    BulkCommands bulk{browser, prompt};
};

TEST_F(Bulk, ShowsASumThatNothingEdits)
{
    EXPECT_TRUE(browser.Open(u"SELECT Age FROM People"_s));
    EXPECT_TRUE(bulk.ShowAggregate(Aggregate::Sum));
    EXPECT_TRUE(browser.ShowsResult());
    EXPECT_EQ(browser.SelectedText(), u"21"_s) << "what filters and Update all begin with is the cell's";
    browser.RevertEdit();
    EXPECT_EQ(browser.FieldLabel(), u"Age:"_s);
    EXPECT_TRUE(bulk.ShowAggregate(Aggregate::Sum));
    browser.EditText(u"7"_s);
    EXPECT_FALSE(browser.ShowsResult());
    EXPECT_EQ(browser.FieldLabel(), u"Age:"_s);
    EXPECT_TRUE(browser.HasPendingEdit());
}

TEST_F(Bulk, ShowsTheSumInTheEditor)
{
    Run(u"CREATE TABLE N ([I] Integer,[D] Float,[Empty] Float)"_s);
    for (const QString& values : {u"1,2.5,NULL"_s, u"2,1.25,NULL"_s, u"NULL,NULL,NULL"_s})
        Run(u"INSERT INTO N (I,D,[Empty]) VALUES(%1)"_s.arg(values));
    const struct {
        QString field;
        Aggregate kind;
        QString shown;
    } rows[] = {
        {u"I"_s, Aggregate::Sum, u"SUM: 3"_s},       {u"I"_s, Aggregate::Avg, u"AVG: 1.5"_s},
        {u"I"_s, Aggregate::Max, u"MAX: 2"_s},       {u"I"_s, Aggregate::Min, u"MIN: 1"_s},
        {u"D"_s, Aggregate::Sum, u"SUM: 3.75"_s},    {u"D"_s, Aggregate::Min, u"MIN: 1.25"_s},
        {u"[Empty]"_s, Aggregate::Avg, u"AVG: 0"_s}, {u"[Empty]"_s, Aggregate::Max, u"MAX: "_s},
    };
    for (const auto& row : rows)
        EXPECT_EQ(Sum(u"SELECT %1 FROM N"_s.arg(row.field), row.kind), row.shown);
    Run(u"INSERT INTO N (I,D) VALUES(2147483647,-0.0000001)"_s);
    EXPECT_EQ(Sum(u"SELECT I FROM N"_s, Aggregate::Sum), u"SUM: 2147483650"_s) << "beyond 32 bits";
    EXPECT_EQ(Sum(u"SELECT D FROM N"_s, Aggregate::Min), u"MIN: 0"_s) << "no negative zero";
    EXPECT_TRUE(browser.GoToFirst());
    EXPECT_TRUE(browser.RunAgain());
    EXPECT_EQ(browser.FieldLabel(), u"D:"_s) << "the next cell brings its own label back";
}

TEST_F(Bulk, SumsUpTheFieldOfADetailAndLeavesTheRecordCurrent)
{
    EXPECT_TRUE(browser.SelectCell(4, Age));
    EXPECT_TRUE(browser.TogglePresentation());
    EXPECT_TRUE(bulk.ShowAggregate(Aggregate::Sum));
    EXPECT_EQ(browser.ShownResult(), u"650"_s);
    EXPECT_EQ(browser.CounterText(), u"5/25"_s);
    EXPECT_EQ(browser.Recordset().Position(), 4);
}

TEST_F(Bulk, RefusesToSumUpWhatIsNoNumber)
{
    const std::pair<int, QString> fields[] = {
        {Name, u"Text"_s}, {Born, u"DateTime"_s}, {Member, u"Yes/No"_s}, {Note, u"Memo"_s}};
    for (const auto& [field, type] : fields) {
        Select(field);
        EXPECT_FALSE(bulk.ShowAggregate(Aggregate::Avg));
        EXPECT_EQ(prompt.shown.takeLast(),
                  u"The aggregate functions are not supported on the '%1' field."_s.arg(type));
    }
}

TEST_F(Bulk, WritesThePendingEditFirstAndStopsWhenItIsRefused)
{
    Select(Age);
    browser.EditText(u"121"_s);
    EXPECT_TRUE(bulk.ShowAggregate(Aggregate::Max));
    EXPECT_EQ(browser.Edit().Text(), u"121"_s);
    Select(Name);
    browser.EditText(u"longer than ten"_s);
    prompt.answers = {true, true, true, true};
    EXPECT_FALSE(bulk.UpdateAll());
    EXPECT_TRUE(browser.WriteFailed());
    EXPECT_FALSE(bulk.DeleteAll());
    EXPECT_FALSE(bulk.ShowAggregate(Aggregate::Sum));
    EXPECT_EQ(prompt.questions, QStringList());
    EXPECT_EQ(All(), u"25"_s);
}

TEST_F(Bulk, AsksTwiceBeforeItChangesAnything)
{
    Select(Age);
    const std::deque<bool> refusals[] = {{false}, {true, false}};
    for (const std::deque<bool>& answers : refusals) {
        prompt.answers = answers;
        EXPECT_FALSE(bulk.DeleteAll());
        prompt.answers = answers;
        EXPECT_FALSE(bulk.UpdateAll());
    }
    EXPECT_EQ(
        prompt.questions,
        QStringList({u"Are you sure you want to delete 25 records in this result?"_s,
                     u"Are you sure you want to update 25 records in this result?\r\n\r\nUpdate Field: Age\r\n"
                     "Set Value: 21"_s,
                     u"Are you sure you want to delete 25 records in this result?"_s,
                     u"These 25 records will be permanently deleted.\r\nAre you really sure?"_s,
                     u"Are you sure you want to update 25 records in this result?\r\n\r\nUpdate Field: Age\r\n"
                     "Set Value: 21"_s,
                     u"You are about to update 25 records.\r\nAre you really sure?"_s}));
    EXPECT_EQ(Counted(u"Age=21"_s), u"1"_s);
    EXPECT_EQ(All(), u"25"_s);
}

TEST_F(Bulk, SetsTheFieldOfAllRecordsToWhatTheEditorHolds)
{
    const struct {
        const char* what;
        int field;
        QString typed;
        QString shown;
        QString condition;
    } rows[] = {
        {"text", Name, u"O'Br %1"_s, u"O'Br %1"_s, u"Name='O''Br %1'"_s},
        {"groups of three", Age, u"1,234"_s, u"1234"_s, u"Age=1234"_s},
        {"date", Born, u"7/5/2001"_s, u"7/5/2001"_s, u"Born='2001-07-05'"_s},
        {"empty text", Name, u""_s, u""_s, u"Name IS NULL"_s},
        {"empty number", Age, u""_s, u""_s, u"Age IS NULL"_s},
    };
    for (const auto& row : rows) {
        Select(row.field);
        browser.EditText(row.typed);
        prompt.answers = {true, true};
        EXPECT_TRUE(bulk.UpdateAll()) << row.what;
        EXPECT_TRUE(prompt.questions[0].endsWith(u"Set Value: "_s + row.shown))
            << prompt.questions[0].toStdString();
        EXPECT_EQ(Counted(row.condition), u"25"_s) << row.what;
        prompt.questions.clear();
    }
}

TEST_F(Bulk, TicksAllRecordsInTheUsersWords)
{
    TableViewSettings settings;
    settings.words = {u"Ja"_s, u"Nein"_s};
    browser.ChangeSettings(settings);
    Select(Member);
    browser.EditChecked(true);
    prompt.answers = {true, true};
    EXPECT_TRUE(bulk.UpdateAll());
    EXPECT_TRUE(prompt.questions[0].endsWith(u"Set Value: Ja"_s));
    EXPECT_EQ(Counted(u"Member=TRUE"_s), u"25"_s);
}

TEST_F(Bulk, SaysThatAYesNoWithoutAValueBecomesNo)
{
    Run(u"UPDATE People SET Member=NULL WHERE Name='P1'"_s);
    EXPECT_TRUE(browser.RunAgain());
    Select(Member);
    EXPECT_EQ(browser.SelectedText(), QString());
    prompt.answers = {true, true};
    EXPECT_TRUE(bulk.UpdateAll());
    EXPECT_TRUE(prompt.questions[0].endsWith(u"Set Value: No"_s)) << prompt.questions[0].toStdString();
    EXPECT_EQ(Counted(u"Member=FALSE"_s), u"25"_s);
}

TEST_F(Bulk, UpdatesTheRecordsOfTheResultAloneAndStaysInPlace)
{
    EXPECT_TRUE(browser.AddCondition(u"Member=TRUE"_s));
    EXPECT_TRUE(browser.SortByColumn(Age, SortDirection::Descending));
    browser.SetRowsPerPage(4);
    EXPECT_TRUE(browser.GoToRecord(7));
    EXPECT_TRUE(browser.SelectCell(1, Member));
    const QString counter = browser.CounterText();
    const qint64 top = browser.ScrollPosition();
    browser.EditChecked(false);
    prompt.answers = {true, true};
    EXPECT_TRUE(bulk.UpdateAll());
    EXPECT_EQ(Counted(u"Member=TRUE"_s), u"0"_s);
    EXPECT_EQ(Counted(u"Member=FALSE AND Age IS NULL"_s), u"5"_s);
    EXPECT_EQ(browser.CounterText(), counter) << "the statement is not run again";
    EXPECT_EQ(browser.ScrollPosition(), top);
    EXPECT_EQ(browser.Page().At(0, Member).text, u"No"_s) << "the page shows what is stored now";
}

TEST_F(Bulk, KeepsWhatCameBeforeARefusedRecord)
{
    Run(u"CREATE UNIQUE INDEX [One] ON [People] ([Name])"_s);
    Select(Name);
    browser.EditText(u"same"_s);
    prompt.answers = {true, true};
    EXPECT_FALSE(bulk.UpdateAll());
    EXPECT_EQ(prompt.shown.size(), 1);
    EXPECT_EQ(Counted(u"Name='same'"_s), u"1"_s);
    EXPECT_EQ(Counted(u"Name='P25'"_s), u"1"_s);
    EXPECT_EQ(browser.Page().At(0, Name).text, u"same"_s);
}

TEST_F(Bulk, KeepsWhatWasDoneWhenTheUserStops)
{
    AddPeople(5000);
    Select(Age);
    browser.EditText(u"99"_s);
    prompt.answers = {true, true};
    prompt.stopAt = 2000;
    EXPECT_TRUE(bulk.UpdateAll());
    const int updated = Counted(u"Age=99"_s).toInt();
    EXPECT_GE(updated, 2000);
    EXPECT_LT(updated, 4000);
    EXPECT_EQ(prompt.shown, QStringList(u"Stopped: %1 of 5025 records were changed, and stay so."_s.arg(updated)));

    EXPECT_TRUE(browser.AddCondition(u"Age<200"_s)); // a whole table goes in one step
    prompt.answers = {true, true};
    EXPECT_TRUE(bulk.DeleteAll());
    const int left = All().toInt();
    EXPECT_LE(left, 3025);
    EXPECT_GT(left, 1000);
    prompt.stopAt = 1;
    EXPECT_FALSE(bulk.ShowAggregate(Aggregate::Sum)) << "half a sum is none";
    EXPECT_EQ(browser.FieldLabel(), u"Age:"_s);
    EXPECT_EQ(prompt.shown.size(), 2) << "that of the deletion, none of the sum";
}

TEST_F(Bulk, DeletesTheRecordsOfTheResultAndShowsWhatIsLeft)
{
    EXPECT_TRUE(browser.AddCondition(u"Member=TRUE"_s));
    EXPECT_TRUE(browser.TogglePresentation());
    prompt.answers = {true, true};
    EXPECT_TRUE(bulk.DeleteAll());
    EXPECT_EQ(browser.CounterText(), u"0/0"_s);
    EXPECT_EQ(browser.CurrentPresentation(), Presentation::Detail);
    EXPECT_EQ(browser.Page().RowCount(), 0);
    EXPECT_EQ(browser.Edit().Kind(), EditorKind::None);
    EXPECT_TRUE(browser.RemoveFilter());
    EXPECT_EQ(browser.CounterText(), u"1/13"_s);
}

TEST_F(Bulk, LosesNothingOnAFullDisk)
{
    AddPeople(2000);
    browser.Close();
    connection.Provider()->CloseDatabase(path);
    const SmallDisk disk(12);
    EXPECT_TRUE(browser.Open(u"SELECT * FROM People"_s));
    Select(Note);
    browser.EditText(u"a long note "_s.repeated(100));
    EXPECT_TRUE(browser.WriteEdit());
    prompt.answers = {true, true};
    EXPECT_FALSE(bulk.UpdateAll());
    EXPECT_EQ(prompt.shown.size(), 1);
    EXPECT_EQ(Counted(u"Note LIKE 'a long note %'"_s), u"1"_s);
    EXPECT_EQ(All(), u"2025"_s);
}

TEST_F(Bulk, ReadsNothingElseWhileACommandWorks)
{
    browser.SetRowsPerPage(3);
    const quint64 before = browser.PageRevision();
    {
        const RecordBrowser::Work work(browser);
        browser.SetRowsPerPage(20); // the window was made larger meanwhile
        browser.TakeUpChanges();
        EXPECT_EQ(browser.PageRevision(), before);
    }
    EXPECT_EQ(browser.Page().RowCount(), 21);
}

} // namespace
} // namespace mirel
