#include "tableview/record_browser.h"

#include "support/sqlite_file.h"
#include "tableview/condition_label.h"
#include "tableview/people_fixture.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class Browser : public PeopleFixture {
protected:
    static constexpr int kRows = 10;

    Browser()
    {
        browser.SetRowsPerPage(kRows);
        EXPECT_TRUE(browser.Open(RecordBrowser::StatementOfTable(u"People")));
    }

    QString Shown(int row, int column) const { return browser.Page().At(row, column).text; }
    // "top row / selected record / field".
    QString Place() const
    {
        return u"%1/%2/%3"_s.arg(QString::number(browser.ScrollPosition()),
                                 QString::number(browser.SelectedRecord()),
                                 browser.FieldName(browser.SelectedField()));
    }
    void SelectField(const QString& name)
    {
        for (int field = 0; field < browser.FieldCount(); ++field) {
            if (browser.FieldName(field) == name) {
                EXPECT_TRUE(browser.SelectCell(browser.SelectedRow(), browser.Page().ColumnOfField(field)));
            }
        }
    }

    RecordBrowser browser{connection, path, prompt, {}};
};

TEST_F(Browser, OpensOnTheFirstCellOfTheFirstPage)
{
    EXPECT_EQ(Place(), u"0/0/Name"_s);
    EXPECT_EQ(browser.CounterText(), u"1/25"_s);
    EXPECT_EQ(browser.FieldLabel(), u"Name:"_s);
    EXPECT_EQ(browser.Edit().Text(), u"P1"_s);
    EXPECT_EQ(browser.Page().RowCount(), kRows + 1) << "the row that is seen in part";
    EXPECT_EQ(browser.HighestScrollPosition(), 15);
    EXPECT_EQ(Shown(0, 2), u"7/4/2001"_s);
    EXPECT_EQ(Shown(1, 3), u"Yes"_s);
    EXPECT_TRUE(browser.Page().At(4, 1).isNull);
    EXPECT_TRUE(browser.Page().columns[1].rightAligned);
    EXPECT_FALSE(browser.Page().columns[0].rightAligned);
}

TEST_F(Browser, CutsTheCellAndNotTheEditor)
{
    EXPECT_EQ(Shown(0, 4), longNote.left(50) + u'~');
    SelectField(u"Note"_s);
    EXPECT_EQ(browser.Edit().Text(), longNote);
}

TEST_F(Browser, WalksAndScrolls)
{
    const struct {
        const char* what;
        std::function<bool(RecordBrowser&)> step;
        QString place;
    } steps[] = {
        {"up at the top", [](auto& b) { return b.MoveRows(-1); }, u"0/0/Name"_s},
        {"down", [](auto& b) { return b.MoveRows(1); }, u"0/1/Name"_s},
        {"to the last whole row", [](auto& b) { return b.MoveRows(8); }, u"0/9/Name"_s},
        {"down from it scrolls by one", [](auto& b) { return b.GoToNext(); }, u"1/10/Name"_s},
        {"a page on keeps the row", [](auto& b) { return b.PageDown(); }, u"11/20/Name"_s},
        {"the last page stops at the end", [](auto& b) { return b.PageDown(); }, u"15/24/Name"_s},
        {"next at the end", [](auto& b) { return b.GoToNext(); }, u"15/24/Name"_s},
        {"first", [](auto& b) { return b.GoToFirst(); }, u"0/0/Name"_s},
        {"last", [](auto& b) { return b.GoToLast(); }, u"15/24/Name"_s},
        {"previous", [](auto& b) { return b.GoToPrevious(); }, u"15/23/Name"_s},
        {"scrolling keeps the row", [](auto& b) { return b.ScrollTo(3); }, u"3/11/Name"_s},
        {"scrolling stops at the end", [](auto& b) { return b.ScrollTo(99); }, u"15/23/Name"_s},
        {"a record becomes the top row", [](auto& b) { return b.GoToRecord(5); }, u"4/4/Name"_s},
        {"as far as the pages go", [](auto& b) { return b.GoToRecord(20); }, u"15/19/Name"_s},
        {"no record 0", [](auto& b) { return b.GoToRecord(0); }, u"15/19/Name"_s},
        {"none behind the last", [](auto& b) { return b.GoToRecord(26); }, u"15/19/Name"_s},
        {"left of the first column", [](auto& b) { return b.MoveToPreviousCell(); }, u"15/18/Note"_s},
        {"and back", [](auto& b) { return b.MoveToNextCell(); }, u"15/19/Name"_s},
        {"across", [](auto& b) { return b.MoveColumns(2); }, u"15/19/Born"_s},
        {"to the end of the row", [](auto& b) { return b.MoveToLastColumn(); }, u"15/19/Note"_s},
        {"no further", [](auto& b) { return b.MoveColumns(1); }, u"15/19/Note"_s},
    };
    for (const auto& step : steps) {
        EXPECT_TRUE(step.step(browser)) << step.what;
        EXPECT_EQ(Place(), step.place) << step.what;
        if (browser.SelectedField() == 0) {
            EXPECT_EQ(browser.SelectedText(), u"P%1"_s.arg(browser.SelectedRecord() + 1)) << step.what;
        }
    }
}

TEST_F(Browser, KeepsTheSelectedRecordInSightWhenThePageShrinks)
{
    ASSERT_TRUE(browser.MoveRows(9));
    browser.EditText(u"typing"_s);
    browser.SetRowsPerPage(4);
    EXPECT_EQ(Place(), u"6/9/Name"_s);
    EXPECT_TRUE(browser.HasPendingEdit()) << "a keyboard that slides up is no reason to write";
}

TEST_F(Browser, WritesAnEditWhenTheSelectionLeaves)
{
    const struct {
        QString field;
        QString typed;
        QString shown;
        QString stored;
    } rows[] = {
        {u"Name"_s, u"O'Brien"_s, u"O'Brien"_s, u"O'Brien"_s},
        {u"Age"_s, u"1,234"_s, u"1234"_s, u"1234"_s},
        {u"Age"_s, u""_s, u""_s, u""_s},
        {u"Born"_s, u"2001-12-31 9:05"_s, u"12/31/2001 9:05:00 AM"_s, u"12/31/2001 9:05:00 AM"_s},
        {u"Note"_s, longNote + u'!', longNote.left(50) + u'~', longNote + u'!'},
    };
    for (const auto& row : rows) {
        SelectField(row.field);
        browser.EditText(row.typed);
        EXPECT_TRUE(browser.HasPendingEdit());
        ASSERT_TRUE(browser.MoveRows(1));
        EXPECT_FALSE(browser.HasPendingEdit());
        EXPECT_EQ(Shown(0, browser.SelectedColumn()), row.shown) << row.field.toStdString();
        EXPECT_EQ(Stored(u"SELECT %1 FROM People WHERE Note LIKE '0123%'"_s.arg(row.field)), row.stored);
        ASSERT_TRUE(browser.MoveRows(-1));
    }
}

TEST_F(Browser, KeepsARefusedEditAndGoesNowhereUntilItIsPutRight)
{
    const struct {
        QString field;
        QString typed;
    } rows[] = {
        {u"Name"_s, u"longer than ten"_s},
        {u"Age"_s, u"3000000000"_s},
        {u"Born"_s, u"13/32/2001"_s},
    };
    for (const auto& row : rows) {
        SelectField(row.field);
        const QString before = browser.Edit().Text();
        browser.EditText(row.typed);
        EXPECT_FALSE(browser.WhyNotStored().isEmpty()) << row.field.toStdString();
        const QString place = Place();
        EXPECT_FALSE(browser.MoveRows(1));
        EXPECT_FALSE(browser.ScrollTo(5));
        EXPECT_FALSE(browser.AddRecord());
        EXPECT_FALSE(browser.RunAgain());
        EXPECT_EQ(Place(), place);
        EXPECT_EQ(browser.Edit().Text(), row.typed);
        EXPECT_TRUE(browser.WriteFailed());
        prompt.shown.clear();
        browser.ShowWriteError();
        browser.ShowWriteError();
        EXPECT_EQ(prompt.shown.size(), 1) << "told once";
        EXPECT_TRUE(prompt.reasons.back().startsWith(row.field + u": "_s)) << prompt.reasons.back().toStdString();
        browser.RevertEdit();
        EXPECT_EQ(browser.Edit().Text(), before);
        EXPECT_TRUE(browser.MoveRows(1));
        EXPECT_TRUE(browser.MoveRows(-1));
    }
}

TEST_F(Browser, TicksAYesNoFieldAndClearsItToNo)
{
    SelectField(u"Member"_s);
    ASSERT_EQ(browser.Edit().Kind(), EditorKind::Check);
    browser.EditChecked(true);
    ASSERT_TRUE(browser.WriteEdit());
    EXPECT_EQ(Shown(0, 3), u"Yes"_s);
    browser.ClearCell();
    ASSERT_TRUE(browser.WriteEdit());
    EXPECT_EQ(Shown(0, 3), u"No"_s);
    EXPECT_FALSE(browser.Page().At(0, 3).isNull);
}

TEST_F(Browser, RepeatsTheWholeValueAbove)
{
    SelectField(u"Note"_s);
    browser.RepeatAbove();
    EXPECT_FALSE(browser.HasPendingEdit()) << "nothing stands above the first record";
    ASSERT_TRUE(browser.MoveRows(1));
    browser.RepeatAbove();
    EXPECT_EQ(browser.Edit().Text(), longNote);
    ASSERT_TRUE(browser.WriteEdit());
    SelectField(u"Member"_s);
    browser.RepeatAbove();
    EXPECT_FALSE(browser.Edit().IsChecked());
    EXPECT_TRUE(browser.HasPendingEdit());
}

TEST_F(Browser, AddsARecordBehindTheLast)
{
    SelectField(u"Age"_s);
    ASSERT_TRUE(browser.AddRecord());
    EXPECT_EQ(browser.CounterText(), u"26/26"_s);
    EXPECT_EQ(Place(), u"16/25/Name"_s);
    const int row = browser.SelectedRow();
    EXPECT_TRUE(browser.Page().At(row, 0).isNull);
    EXPECT_TRUE(browser.Page().At(row, 1).isNull);
    EXPECT_EQ(Shown(row, 2), QLocale(u"en_US"_s).toString(QDate::currentDate(), u"M/d/yyyy"_s));
    EXPECT_EQ(Shown(row, 3), u"No"_s);
}

TEST_F(Browser, AsksBeforeItDeletesAndGoesOnAtTheSamePlace)
{
    ASSERT_TRUE(browser.GoToRecord(3));
    prompt.answers = {false, true};
    EXPECT_FALSE(browser.DeleteRecord());
    EXPECT_EQ(browser.CounterText(), u"3/25"_s);
    EXPECT_TRUE(browser.DeleteRecord());
    EXPECT_EQ(prompt.questions.size(), 2);
    EXPECT_EQ(browser.CounterText(), u"3/24"_s);
    EXPECT_EQ(browser.Edit().Text(), u"P4"_s);
    EXPECT_EQ(Stored(u"SELECT COUNT(*) FROM People WHERE Name='P3'"_s), u"0"_s);
}

TEST_F(Browser, DeletesTheLastRecordsDownToNone)
{
    Run(u"DELETE FROM People WHERE NOT (Name='P1' OR Name='P2')"_s);
    browser.ChangeSettings({.confirmDelete = false});
    ASSERT_TRUE(browser.RunAgain());
    ASSERT_TRUE(browser.TogglePresentation());
    ASSERT_TRUE(browser.GoToLast());
    EXPECT_TRUE(browser.DeleteRecord());
    EXPECT_EQ(browser.CounterText(), u"1/1"_s) << "the one before the last";
    EXPECT_TRUE(browser.DeleteRecord());
    EXPECT_EQ(browser.CounterText(), u"0/0"_s);
    EXPECT_EQ(browser.Edit().Kind(), EditorKind::None);
    EXPECT_FALSE(browser.DeleteRecord());
    EXPECT_TRUE(prompt.questions.isEmpty());
}

TEST_F(Browser, ShowsAnEmptyResultAndTakesEveryCommand)
{
    ASSERT_TRUE(browser.Open(u"SELECT * FROM People WHERE Age>900"_s));
    EXPECT_EQ(browser.CounterText(), u"0/0"_s);
    EXPECT_EQ(browser.Page().RowCount(), 0);
    EXPECT_EQ(browser.Page().ColumnCount(), 5);
    const std::function<void()> commands[] = {
        [&] { (void)browser.MoveRows(1); },    [&] { (void)browser.GoToLast(); },
        [&] { (void)browser.PageDown(); },     [&] { (void)browser.MoveToNextCell(); },
        [&] { (void)browser.GoToRecord(1); },  [&] { browser.EditText(u"x"_s); },
        [&] { browser.RepeatAbove(); },        [&] { (void)browser.TapHeader(0); },
        [&] { (void)browser.DeleteRecord(); }, [&] { (void)browser.FilterByCell(CellFilter::BySelection); },
        [&] { (void)browser.ScrollTo(4); },    [&] { (void)browser.TogglePresentation(); },
        [&] { (void)browser.MoveRows(1); },    [&] { (void)browser.TogglePresentation(); },
        [&] { (void)browser.RunAgain(); },
    };
    for (const auto& command : commands) {
        command();
        EXPECT_EQ(browser.SelectedRecord(), -1);
        EXPECT_FALSE(browser.HasPendingEdit());
    }
    ASSERT_TRUE(browser.AddRecord());
    EXPECT_EQ(browser.CounterText(), u"1/1"_s);
}

TEST_F(Browser, ShowsOneRecordFieldByField)
{
    ASSERT_TRUE(browser.GoToRecord(4));
    SelectField(u"Born"_s);
    ASSERT_TRUE(browser.TogglePresentation());
    EXPECT_EQ(browser.Page().ColumnCount(), 2);
    EXPECT_EQ(Shown(0, 0), u"Name"_s);
    EXPECT_EQ(Shown(0, 1), u"P4"_s);
    EXPECT_EQ(browser.SelectedRow(), 2) << "the field that was selected";
    EXPECT_EQ(browser.CounterText(), u"4/25"_s);
    ASSERT_TRUE(browser.GoToNext());
    EXPECT_EQ(Shown(0, 1), u"P5"_s);
    ASSERT_TRUE(browser.MoveRows(-2));
    browser.EditText(u"Eve"_s);
    ASSERT_TRUE(browser.MoveRows(1));
    EXPECT_EQ(Shown(0, 1), u"Eve"_s);
    ASSERT_TRUE(browser.GoToLast());
    ASSERT_TRUE(browser.TogglePresentation());
    EXPECT_EQ(Place(), u"3/3/Age"_s) << "the list stands where it was left";
    EXPECT_EQ(Shown(1, 0), u"Eve"_s);
}

TEST_F(Browser, ScrollsThroughTheFieldsOfARecord)
{
    browser.SetRowsPerPage(2);
    ASSERT_TRUE(browser.TogglePresentation());
    EXPECT_EQ(browser.HighestScrollPosition(), 3);
    ASSERT_TRUE(browser.ScrollTo(2));
    EXPECT_EQ(browser.FieldName(browser.SelectedField()), u"Born"_s) << "the row is kept";
    ASSERT_TRUE(browser.MoveRows(9));
    EXPECT_EQ(browser.FieldName(browser.SelectedField()), u"Note"_s);
    EXPECT_EQ(browser.ScrollPosition(), 3);
}

TEST_F(Browser, HidesColumnsUntilAllAreShownAgain)
{
    EXPECT_FALSE(browser.CanShowAllColumns());
    SelectField(u"Age"_s);
    ASSERT_TRUE(browser.HideColumn());
    EXPECT_EQ(browser.Page().ColumnCount(), 4);
    EXPECT_EQ(browser.FieldName(browser.SelectedField()), u"Born"_s);
    EXPECT_EQ(Shown(0, 1), u"7/4/2001"_s);
    ASSERT_TRUE(browser.SortByColumn(0, SortDirection::Descending));
    EXPECT_EQ(browser.Page().ColumnCount(), 4) << "a sort leaves them hidden";
    while (browser.CanHideColumn())
        ASSERT_TRUE(browser.HideColumn());
    EXPECT_EQ(browser.Page().ColumnCount(), 1);
    ASSERT_TRUE(browser.ShowAllColumns());
    EXPECT_EQ(browser.Page().ColumnCount(), 5);
}

TEST_F(Browser, FiltersAddUpAndAreRemovedAtOnce)
{
    SelectField(u"Member"_s);
    ASSERT_TRUE(browser.FilterByCell(CellFilter::BySelection));
    EXPECT_EQ(browser.Statement(), u"SELECT * FROM People WHERE Member IS FALSE"_s);
    EXPECT_EQ(browser.CounterText(), u"1/13"_s);
    ASSERT_TRUE(browser.FilterByCell(CellFilter::ExcludingSelection));
    EXPECT_EQ(browser.CounterText(), u"0/0"_s);
    EXPECT_TRUE(browser.IsFiltered());
    ASSERT_TRUE(browser.RemoveFilter());
    EXPECT_EQ(browser.CounterText(), u"1/25"_s);
    EXPECT_FALSE(browser.IsFiltered());
}

TEST_F(Browser, FiltersAreChangedSwitchedAndTakenOffOneByOne)
{
    ASSERT_TRUE(browser.SortByColumn(1, SortDirection::Descending));
    ASSERT_TRUE(browser.AddCondition(u"Age > 30"_s));
    ASSERT_TRUE(browser.AddCondition(u"Member IS TRUE"_s));
    const QString base = u"SELECT * FROM People"_s;
    struct Step {
        std::function<bool()> change;
        QString statement;
        QString counter;
    };
    const std::vector<Step> steps = {
        {[&] { return browser.SwitchFilter(0); }, base + u" WHERE Member IS TRUE ORDER BY Age DESC"_s, u"1/12"_s},
        {[&] { return browser.SwitchFilter(1); }, base + u" ORDER BY Age DESC"_s, u"1/25"_s},
        {[&] { return browser.SwitchFilter(0); }, base + u" WHERE Age > 30 ORDER BY Age DESC"_s, u"1/12"_s},
        {[&] { return browser.ChangeFilter(0, u"Age < 23"_s); }, base + u" WHERE Age < 23 ORDER BY Age DESC"_s,
         u"1/2"_s},
        {[&] { return !browser.ChangeFilter(0, u"Nobody = 1"_s); }, base + u" WHERE Age < 23 ORDER BY Age DESC"_s,
         u"1/2"_s},
        {[&] { return browser.TakeFilterOff(7) && browser.SwitchFilter(-1); },
         base + u" WHERE Age < 23 ORDER BY Age DESC"_s, u"1/2"_s},
        {[&] { return browser.ChangeFilter(0, u"Age < 0"_s); }, base + u" WHERE Age < 0 ORDER BY Age DESC"_s,
         u"0/0"_s},
        {[&] { return browser.TakeFilterOff(0); }, base + u" ORDER BY Age DESC"_s, u"1/25"_s},
        {[&] { return browser.TakeFilterOff(0); }, base + u" ORDER BY Age DESC"_s, u"1/25"_s},
    };
    for (const Step& step : steps) {
        EXPECT_TRUE(step.change()) << step.statement.toStdString();
        EXPECT_EQ(browser.Statement(), step.statement);
        EXPECT_EQ(browser.CounterText(), step.counter) << step.statement.toStdString();
    }
    EXPECT_EQ(browser.CurrentSort().field, 1);
    EXPECT_EQ(prompt.shown.size(), 1) << "the refused one is told";
}

TEST_F(Browser, AFilterThatIsSwitchedLeavesTheSelectionOnItsRecord)
{
    ASSERT_TRUE(browser.AddCondition(u"Age > 30"_s));
    ASSERT_TRUE(browser.GoToRecord(5));
    SelectField(u"Note"_s);
    const QString note = browser.SelectedText();
    ASSERT_TRUE(browser.SwitchFilter(0));
    EXPECT_EQ(browser.SelectedText(), note);
    EXPECT_EQ(browser.KnownCount(), 25);
}

TEST_F(Browser, FiltersFollowANewName)
{
    ASSERT_TRUE(browser.AddCondition(u"Age > 30"_s));
    ASSERT_TRUE(browser.SortByColumn(1, SortDirection::Descending));
    ASSERT_TRUE(browser.AddCondition(u"Member IS TRUE"_s));
    Run(u"ALTER TABLE People RENAME COLUMN Age TO Years"_s);
    ASSERT_TRUE(browser.OpenRenamed([](QString statement) { return statement.replace(u"Age"_s, u"Years"_s); }));
    EXPECT_EQ(browser.Conditions(), QStringList({u"Years > 30"_s, u"Member IS TRUE"_s}));
    ASSERT_TRUE(browser.TakeFilterOff(1));
    EXPECT_EQ(browser.Statement(), u"SELECT * FROM People WHERE Years > 30 ORDER BY Years DESC"_s);
}

TEST(ConditionLabels, SayInWordsWhatAConditionKeeps)
{
    const std::vector<std::pair<QString, QString>> rows = {
        {u"Name = 'P1'"_s, u"Name: P1"_s},
        {u"[Airport Name]='O''Hare'"_s, u"Airport Name: O'Hare"_s},
        {u"[Bird Strikes].[Cost Total $] >= 300000"_s, u"Cost Total $ >= 300000"_s},
        {u"(NOT(Damage = 'None'))"_s, u"Damage: not None"_s},
        {u"Damage <> 'None'"_s, u"Damage: not None"_s},
        {u"Note IS NULL"_s, u"Note: empty"_s},
        {u"(NOT(Note IS NULL))"_s, u"Note: not empty"_s},
        {u"Member IS TRUE"_s, u"Member: TRUE"_s},
        {u"Name LIKE 'P%'"_s, u"Name LIKE P%"_s},
        {u"[a]]b] = 1"_s, u"a]b: 1"_s},
        {u"Age > 1 AND  Age < 9"_s, u"Age > 1 AND Age < 9"_s},
        {u"(Age = 1) OR (Age = 2)"_s, u"(Age = 1) OR (Age = 2)"_s},
        {u"(Age = 1"_s, u"(Age = 1"_s},
        {QString(), QString()},
    };
    for (const auto& [condition, label] : rows)
        EXPECT_EQ(ConditionLabel(condition), label);
}

TEST_F(Browser, FiltersByTheWholeTextNotByTheCutOne)
{
    SelectField(u"Note"_s);
    ASSERT_TRUE(browser.FilterByCell(CellFilter::BySelection));
    EXPECT_EQ(browser.CounterText(), u"1/1"_s);
}

TEST_F(Browser, SortsUpAndDownWithTapsOnAHeader)
{
    ASSERT_TRUE(browser.TapHeader(0));
    EXPECT_EQ(browser.Statement(), browser.BaseStatement()) << "not asked for by the settings";
    browser.ChangeSettings({.sortByHeader = true});
    for (const QString& first : {u"P1"_s, u"P9"_s, u"P1"_s}) {
        ASSERT_TRUE(browser.TapHeader(0));
        EXPECT_EQ(Shown(0, 0), first);
    }
}

TEST_F(Browser, ReturnsToTheResultBeforeWhenARewriteIsRefused)
{
    ASSERT_TRUE(browser.SortByColumn(0, SortDirection::Descending));
    EXPECT_FALSE(browser.AddCondition(u"Nobody = 1"_s));
    EXPECT_EQ(prompt.shown.size(), 1);
    EXPECT_EQ(browser.Statement(), u"SELECT * FROM People ORDER BY Name DESC"_s);
    EXPECT_EQ(Shown(0, 0), u"P9"_s);
    EXPECT_FALSE(browser.IsFiltered());
}

TEST_F(Browser, IsClosedWhenItsStatementIsRefused)
{
    EXPECT_FALSE(browser.Open(u"SELECT * FROM Nobody"_s));
    EXPECT_EQ(prompt.shown.size(), 1);
    EXPECT_FALSE(browser.IsOpen());
    EXPECT_EQ(browser.CounterText(), u"0/0"_s);
    EXPECT_EQ(browser.Page().ColumnCount(), 0);
    EXPECT_FALSE(browser.AddRecord());
    EXPECT_FALSE(browser.TogglePresentation());
    EXPECT_TRUE(browser.Open(RecordBrowser::StatementOfTable(u"People")));
}

TEST_F(Browser, EditsNothingOfAResultThatCannotBeWritten)
{
    ASSERT_TRUE(browser.Open(u"SELECT Member, COUNT(*) AS Many FROM People GROUP BY Member"_s));
    EXPECT_FALSE(browser.CanUpdate());
    browser.EditText(u"x"_s);
    browser.EditChecked(true);
    EXPECT_FALSE(browser.HasPendingEdit());
}

TEST_F(Browser, AsksForWhatTheTableRequiresOfANewRecord)
{
    SqliteFile(path).Run("CREATE TABLE Strict (Id INTEGER PRIMARY KEY NOT NULL, N INTEGER NOT NULL, "
                         "D TEXT NOT NULL DEFAULT 'given', T TEXT NOT NULL, Free TEXT)");
    ASSERT_TRUE(browser.Open(RecordBrowser::StatementOfTable(u"Strict")));
    EXPECT_FALSE(browser.AddRecord()) << "given up";
    EXPECT_EQ(Stored(u"SELECT COUNT(*) FROM Strict"_s), u"0"_s);
    prompt.questions.clear();
    prompt.texts = {u"many"_s, u""_s, u"12"_s, u""_s};
    ASSERT_TRUE(browser.AddRecord());
    EXPECT_EQ(prompt.questions.size(), 4) << prompt.questions.join(u'|').toStdString();
    EXPECT_EQ(prompt.shown.size(), 2) << "no number, and nothing at all";
    EXPECT_EQ(SqliteFile(path).Text("SELECT Id || N || D || T || (Free IS NULL) FROM Strict"), u"112given1"_s);
}

TEST_F(Browser, RunsAgainWhereItStood)
{
    ASSERT_TRUE(browser.GoToRecord(12));
    SelectField(u"Age"_s);
    Run(u"UPDATE People SET Age=99 WHERE Name='P12'"_s);
    ASSERT_TRUE(browser.RunAgain());
    EXPECT_EQ(Place(), u"11/11/Age"_s);
    EXPECT_EQ(browser.Edit().Text(), u"99"_s);
    Run(u"DELETE FROM People WHERE Age>25"_s);
    ASSERT_TRUE(browser.RunAgain());
    EXPECT_EQ(browser.SelectedRecord(), *browser.KnownCount() - 1) << "its place is gone";
}

} // namespace
} // namespace mirel
