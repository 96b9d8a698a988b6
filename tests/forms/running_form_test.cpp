// What a running form shows and what the user does to its controls; buttons are in form_buttons_test.cpp.
#include "data/db_transaction.h"
#include "form_fixture.h"
#include "support/sqlite_file.h"

#include <limits>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class RunningFormTest : public FormFixture {
protected:
    static FormBuilder BirdForm()
    {
        FormBuilder form(u"Birds");
        form.Edit(u"counter", u"RECNO()+'/'+RECCOUNT()")
            .Edit(u"Name", u"Birds.Name")
            .Edit(u"Price", u"Birds.Price")
            .Edit(u"Seen", u"Birds.Seen")
            .Check(u"Wild", u"WHERE Birds.Wild=1")
            .Input(u"search");
        return form;
    }
    QStringList Shown() const
    {
        QStringList shown;
        for (int i = 0; i < int(running->Controls().size()); ++i)
            shown += running->ShownText(i);
        return shown;
    }
};

TEST_F(RunningFormTest, ShowsEachRecordInItsControls)
{
    Start(BirdForm());
    EXPECT_TRUE(opened);
    EXPECT_EQ(Shown(), (QStringList{u"1/4"_s, u"Osprey"_s, u"1.5"_s, u"7/4/2001"_s, u"1"_s, u""_s}));
    EXPECT_EQ(running->GoToNext(), Outcome::Done);
    EXPECT_EQ(Shown(), (QStringList{u"2/4"_s, u"Gull"_s, u"2.25"_s, u"7/5/2001 9:05:00 AM"_s, u"0"_s, u""_s}));
    EXPECT_EQ(running->GoToNext(), Outcome::Done);
    EXPECT_EQ(Shown(), (QStringList{u"3/4"_s, u"Tern"_s, u""_s, u""_s, u"1"_s, u""_s}));
}

TEST_F(RunningFormTest, MovesWithinTheResultAlone)
{
    Start(BirdForm());
    EXPECT_EQ(running->GoToPrevious(), Outcome::Done); // stays on the first, and is no failure
    EXPECT_EQ(running->CurrentRecord(), 0);
    EXPECT_EQ(running->GoToLast(), Outcome::Done);
    EXPECT_EQ(running->CounterText(), u"4/4"_s);
    EXPECT_EQ(running->GoToNext(), Outcome::Failed);
    EXPECT_EQ(running->GoToRecord(4), Outcome::Failed);
    EXPECT_EQ(running->GoToRecord(-1), Outcome::Failed);
    EXPECT_EQ(running->CurrentRecord(), 3);
    EXPECT_EQ(running->GoToPrevious(), Outcome::Done);
    EXPECT_EQ(running->GoToFirst(), Outcome::Done);
    EXPECT_EQ(running->CurrentRecord(), 0);
}

TEST_F(RunningFormTest, FollowsWhatAnotherProgramDoes)
{
    Start(BirdForm());
    EXPECT_EQ(running->GoToRecord(1), Outcome::Done);
    SqliteFile(path_).Run("DELETE FROM Birds WHERE ID=1; UPDATE Birds SET Name='Swift' WHERE ID=3");
    EXPECT_EQ(running->GoToNext(), Outcome::Done); // of Gull, the first one now
    EXPECT_EQ(Text(u"counter"), u"2/3"_s);
    EXPECT_EQ(Text(u"Name"), u"Swift"_s);
    SqliteFile(path_).Run("DELETE FROM Birds");
    EXPECT_EQ(running->GoToNext(), Outcome::Failed);
    EXPECT_EQ(running->GoToLast(), Outcome::Failed);
    EXPECT_EQ(running->CounterText(), u"0/0"_s);
    EXPECT_EQ(Text(u"Name"), QString());
}

// What the first result comes from: the call's query, a default-query button, the form's default query, the table.
TEST_F(RunningFormTest, OpensTheFirstQueryThatThereIs)
{
    FormBuilder form = BirdForm();
    EXPECT_EQ(Start(form).CurrentQuery(), u"SELECT * FROM Birds"_s);
    form.form.SetDefaultQuery(u"SELECT * FROM Birds WHERE ID=2");
    EXPECT_EQ(Start(form).RecordCount(), 4); // the flag is not set
    form.form.defaultQueryOnStartup = 1;
    EXPECT_EQ(Start(form).RecordCount(), 1);
    form.Button(u"not", ButtonFunction::Select, u"SELECT * WHERE ID>3");
    form.Button(u"pick", ButtonFunction::Select, u"SELECT * WHERE ID>1");
    EXPECT_EQ(Start(form).RecordCount(), 1);
    form.Last().option1 = 1;
    EXPECT_EQ(Start(form).RecordCount(), 3);
    EXPECT_EQ(Start(form, {}, 2).CounterText(), u"3/3"_s);
    EXPECT_EQ(Start(form, u"SELECT * FROM Birds WHERE ID>2"_s, 1).CounterText(), u"2/2"_s);
    EXPECT_EQ(Text(u"Name"), u"O'Brien"_s);
    EXPECT_EQ(Start(form, u"SELECT * FROM Birds WHERE ID>2"_s, 7).CounterText(), u"1/2"_s);
}

TEST_F(RunningFormTest, ShowsNothingWithoutARecord)
{
    FormBuilder form = BirdForm();
    form.Whole(u"sum", u"SUM([Price])").List(u"list", {{u"Name"_s, u"Birds.Name"_s}});
    Start(form, u"SELECT * FROM Birds WHERE ID=99"_s);
    const QStringList nothing = {u""_s, u""_s, u""_s, u""_s, u"0"_s, u""_s, u""_s, u""_s};
    EXPECT_TRUE(opened);
    EXPECT_EQ(Shown(), nothing);
    EXPECT_EQ(running->RecordCount(), 0);
    EXPECT_EQ(running->CurrentRecord(), -1);
    for (const Outcome outcome : {running->GoToFirst(), running->GoToLast(), running->GoToNext()})
        EXPECT_EQ(outcome, Outcome::Failed);
    EXPECT_EQ(prompt_.shown, QStringList());

    Start(form, u"SELECT * FROM Nowhere"_s);
    EXPECT_FALSE(opened);
    EXPECT_EQ(Shown(), nothing);
    EXPECT_EQ(running->RecordCount(), -1);
    EXPECT_EQ(prompt_.shown.size(), 1);
    EXPECT_TRUE(running->ListRows(Control(u"list"), 0, 10).empty());
}

TEST_F(RunningFormTest, NeverRunsAQueryThatChangesData)
{
    FormBuilder form = BirdForm();
    form.DropDown(u"items", u"DELETE FROM Birds\x08").Button(u"drop", ButtonFunction::Select, u"DROP TABLE Birds");
    Start(form, u"DELETE FROM Birds"_s);
    EXPECT_FALSE(opened);
    EXPECT_EQ(Press(u"drop"), Outcome::Failed);
    EXPECT_EQ(prompt_.shown.size(), 3);
    EXPECT_EQ(Stored(u"SELECT COUNT(*) FROM Birds"_s), u"4"_s);
}

TEST_F(RunningFormTest, TicksBoxesByConditionOrValue)
{
    FormBuilder form(u"Birds");
    form.Check(u"default", u"WHERE Birds.Wild=1")
        .Check(u"condition", u"Birds.Wild=0")
        .Check(u"field", u"Birds.Wild")
        .Check(u"word", u"[Wild]='Yes'")
        .Check(u"number", u"[ID]-1")
        .Check(u"compare", u"[Price] > 2 AND [Name] LIKE 'G%'")
        .Input(u"Wild", ControlType::CheckBox);
    form.Last().fieldBound = 1;
    Start(form);
    EXPECT_EQ(Shown(), (QStringList{u"1"_s, u"0"_s, u"1"_s, u"1"_s, u"0"_s, u"0"_s, u"1"_s}));
    running->GoToNext();
    EXPECT_EQ(Shown(), (QStringList{u"0"_s, u"1"_s, u"0"_s, u"0"_s, u"1"_s, u"1"_s, u"0"_s}));
}

TEST_F(RunningFormTest, ShowsSourcesThatAreInForceAlone)
{
    FormBuilder form(u"Birds");
    form.Edit(u"off", u"Birds.Name").Last().hasSource = 0;
    form.Edit(u"Name", u"Birds.ID").Last().hasSource = 0;
    form.Last().fieldBound = 1; // shows the field of its own name instead
    form.Edit(u"wrong", u"Birds.Nothing").Edit(u"computed", u"[Price]*[ID]+' EUR'").Edit(u"yes", u"Birds.Wild");
    Start(form);
    EXPECT_EQ(Shown(), (QStringList{u""_s, u"Osprey"_s, u""_s, u"1.5 EUR"_s, u"Yes"_s}));
}

TEST_F(RunningFormTest, FillsDropDownsFromDataAndQueries)
{
    FormBuilder form(u"Birds");
    form.DropDown(u"data", u"red; green;red\r\nblue")
        .DropDown(u"query", u"SELECT Seen FROM Birds ORDER BY ID\x08"
                            u"(all)")
        .DropDown(u"limited", u"SELECT Name WHERE ID>&[from]\x08")
        .Input(u"from");
    form.DropDown(u"Name", u"x;y").Last().fieldBound = 1;
    form.DropDown(u"field", u"Birds.Name").Last().hasSource = 1;
    form.DropDown(u"one", u"single").Last().hasSource = 1;
    form.DropDown(u"Price", u"free").Last().hasSource = 1;
    form.Last().fieldBound = 1;
    form.DropDown(u"Notes", u"a;b").Last().hasSource = 1;
    form.Last().fieldBound = 1;
    Start(form);
    const auto items = [this](QStringView name) { return running->Controls()[size_t(Control(name))].items; };
    EXPECT_EQ(items(u"data"), (QStringList{u"red"_s, u"green"_s, u"blue"_s}));
    EXPECT_EQ(items(u"query"),
              (QStringList{u"(all)"_s, u"7/4/2001"_s, u"7/5/2001 9:05:00 AM"_s, u"12/31/1999"_s}));
    EXPECT_EQ(items(u"limited"), QStringList());
    Type(u"from", u"3"_s);
    running->RefreshItems(Control(u"limited"));
    EXPECT_EQ(items(u"limited"), QStringList{u"O'Brien"_s});
    EXPECT_EQ(Text(u"Name"), u"Osprey"_s);
    EXPECT_EQ(Text(u"field"), u"Osprey"_s);
    EXPECT_EQ(items(u"field"), QStringList());
    EXPECT_EQ(items(u"one"), QStringList{u"single"_s});
    EXPECT_EQ(items(u"Price"), QStringList{u"free"_s});
    EXPECT_EQ(Text(u"Price"), u"1.5"_s);
    EXPECT_EQ(items(u"Notes"), (QStringList{u"a"_s, u"b"_s}));
    EXPECT_EQ(Text(u"Notes"), u"one"_s);
}

TEST_F(RunningFormTest, AFailingDropDownLeavesTheOthersTheirItems)
{
    FormBuilder form(u"Birds");
    form.DropDown(u"wrong", u"SELECT Nothing FROM Birds\x08")
        .DropDown(u"kills", u"DELETE FROM Birds\x08"
                            u"(all)")
        .DropDown(u"good", u"SELECT Name FROM Birds WHERE ID<3\x08");
    Start(form);
    EXPECT_EQ(running->Controls()[1].items, QStringList{u"(all)"_s});
    EXPECT_EQ(running->Controls()[2].items, (QStringList{u"Osprey"_s, u"Gull"_s}));
    EXPECT_EQ(prompt_.shown.size(), 1) << prompt_.shown.join(u' ').toStdString();
    EXPECT_EQ(Stored(u"SELECT COUNT(*) FROM Birds"_s), u"4"_s);
}

TEST_F(RunningFormTest, ComputesAControlAfterThoseItReads)
{
    FormBuilder form(u"Birds");
    form.Edit(u"last", u"&middle+'!'").Edit(u"middle", u"&first+'?'").Edit(u"first", u"Birds.Name");
    form.Edit(u"a", u"&b+'a'").Edit(u"b", u"&a+'b'").Edit(u"self", u"&self+'x'").Edit(u"behind", u"&a");
    form.Whole(u"count", u"SUM([ID])").Edit(u"ofCount", u"&count+' in all'");
    Start(form);
    EXPECT_EQ(Text(u"last"), u"Osprey?!"_s);
    EXPECT_EQ(Text(u"ofCount"), u"10 in all"_s);
    EXPECT_EQ(Text(u"behind"), Text(u"a"));
    EXPECT_EQ(Text(u"b"), Text(u"a") + u'b') << "the first listed of a circle goes first";
    ASSERT_EQ(running->GoToNext(), Outcome::Done);
    EXPECT_EQ(Text(u"last"), u"Gull?!"_s);
}

TEST_F(RunningFormTest, IsDirtyByWhatWouldBeLost)
{
    FormBuilder form = BirdForm();
    form.Input(u"used").Edit(u"computed", u"[ID]+1");
    form.Button(u"SAVE", ButtonFunction::Update, {{u"Birds.Notes"_s, u"&used"_s}});
    Start(form);
    Type(u"search", u"x"_s);
    Type(u"computed", u"x"_s);
    EXPECT_FALSE(running->IsDirty());
    for (const QStringView name : {u"Name", u"Seen", u"used"}) {
        const QString before = Text(name);
        Type(name, u"1/2/2003"_s);
        EXPECT_TRUE(running->IsDirty()) << name.toString().toStdString();
        Type(name, before); // taken back
        EXPECT_FALSE(running->IsDirty()) << name.toString().toStdString();
    }
    running->SetTicked(Control(u"Wild"), false);
    EXPECT_TRUE(running->IsDirty());
}

TEST_F(RunningFormTest, AsksBeforeItLeavesChanges)
{
    Start(BirdForm());
    Type(u"Name", u"Kite"_s);
    prompt_.answers = {false, true};
    EXPECT_EQ(running->GoToNext(), Outcome::Stopped);
    EXPECT_EQ(prompt_.questions, QStringList{u"You are about to ignore changes you have made.\r\nContinue?"_s});
    EXPECT_EQ(Text(u"Name"), u"Kite"_s);
    EXPECT_TRUE(running->IsDirty());
    EXPECT_EQ(running->GoToNext(), Outcome::Done);
    EXPECT_EQ(Text(u"Name"), u"Gull"_s);
    EXPECT_FALSE(running->IsDirty());
    EXPECT_EQ(Stored(u"SELECT Name FROM Birds WHERE ID=1"_s), u"Osprey"_s);

    settings.confirmSave = false;
    Start(BirdForm());
    Type(u"Name", u"Kite"_s);
    EXPECT_EQ(running->GoToNext(), Outcome::Done);
    EXPECT_EQ(prompt_.questions.size(), 2);
    EXPECT_EQ(running->GoToFirst(), Outcome::Done);
    EXPECT_EQ(Text(u"Name"), u"Osprey"_s);
}

TEST_F(RunningFormTest, CanSaveInsteadOfLeavingChanges)
{
    struct SavingPrompt : ScriptedPrompt {
        Answer AskYesNoOr(const UserMessage&, const UserMessage& third) override
        {
            offered = third.Text();
            return Answer::Third;
        }
        QString offered;
    } saving;
    FormBuilder form = BirdForm();
    settings.saveAsThirdAnswer = true;
    Start(form);
    Type(u"Name", u"Kite"_s);
    EXPECT_EQ(running->GoToNext(), Outcome::Stopped); // no button that saves: asked as ever
    form.Button(u"SAVE", ButtonFunction::Update, {{u"Birds.Name"_s, u"&Name"_s}, {u"Birds.Price"_s, u"&Price"_s}});
    RunningForm other({form.form, {}, -1}, {connection_, path_, store, saving, host, settings, {}});
    ASSERT_TRUE(other.Open());
    other.SetText(other.FindControl(u"Name"), u"Kite"_s);
    EXPECT_EQ(other.GoToNext(), Outcome::Done);
    EXPECT_EQ(saving.offered, u"&Save"_s);
    EXPECT_EQ(other.CurrentRecord(), 1);
    EXPECT_EQ(Stored(u"SELECT Name FROM Birds WHERE ID=1"_s), u"Kite"_s);
    other.SetText(other.FindControl(u"Price"), u"no number"_s);
    EXPECT_EQ(other.GoToNext(), Outcome::Stopped); // what cannot be saved keeps the record
    EXPECT_EQ(other.CurrentRecord(), 1);
    EXPECT_TRUE(other.IsDirty());
}

TEST_F(RunningFormTest, ComputesAggregatesOverTheWholeResult)
{
    FormBuilder form(u"Birds");
    form.Whole(u"sum", u"SUM([Price]*2)+' EUR'")
        .Whole(u"avg", u"AVG([Price])")
        .Whole(u"min", u"MIN([Seen])")
        .Whole(u"max", u"MAX([Name])")
        .Whole(u"two", u"MAX([ID])-MIN([ID])")
        .Whole(u"wild", u"SUM([Wild])")
        .Whole(u"positions", u"SUM(RECNO())")
        .Whole(u"none", u"SUM([Small])")
        .Whole(u"bare", u"SUM()")
        .Edit(u"record", u"SUM([Price])");
    Start(form);
    const QStringList shown = {u"27.5 EUR"_s, u"4.583333"_s, u"12/31/1999"_s, u"Tern"_s, u"3"_s,
                               u"2"_s,        u"10"_s,       u""_s,           u""_s,     u""_s};
    EXPECT_EQ(Shown(), shown);
    running->GoToNext();
    EXPECT_EQ(Shown(), shown);
    EXPECT_EQ(running->CurrentRecord(), 1);
    EXPECT_EQ(running->AddCondition(u"ID<3"_s), Outcome::Done);
    EXPECT_EQ(Text(u"sum"), u"7.5 EUR"_s);
}

TEST_F(RunningFormTest, StopsAnAggregatePassWhenTheUserDoes)
{
    Run(u"CREATE TABLE Many (N Integer)"_s);
    DbTransaction whole(connection_, path_);
    EXPECT_TRUE(whole.Begin());
    for (int i = 0; i < 2048; ++i)
        Run(u"INSERT INTO Many (N) VALUES(1)"_s);
    EXPECT_TRUE(whole.Commit());
    FormBuilder form(u"Many");
    form.Whole(u"sum", u"SUM([N])");
    Start(form);
    EXPECT_EQ(Text(u"sum"), u"2048"_s);
    prompt_.stopAt = 1000;
    running->RecomputeAggregates();
    EXPECT_EQ(Text(u"sum"), QString()); // half a sum is none
    EXPECT_EQ(running->CurrentRecord(), 0);
}

TEST_F(RunningFormTest, ListsTheRecordsOfTheResult)
{
    FormBuilder form = BirdForm();
    form.List(u"list", {{u"Bird"_s, u"Birds.Name"_s},
                        {u"No"_s, u"RECNO()+'.'"_s},
                        {u"Price"_s, u"[Price]"_s},
                        {u"Wild"_s, u"[Wild]"_s},
                        {u"Seen"_s, u"[Seen]"_s},
                        {u"Nothing"_s, u""_s}});
    Start(form);
    const int list = Control(u"list");
    EXPECT_EQ(running->Controls()[size_t(list)].columns.size(), 6);
    EXPECT_EQ(running->Controls()[size_t(list)].rows, 4);
    const auto rows = running->ListRows(list, 1, 2);
    ASSERT_EQ(rows.size(), 2U);
    EXPECT_EQ(rows[0], (QStringList{u"Gull"_s, u"2."_s, u"2.25"_s, u"No"_s, u"7/5/2001 9:05:00 AM"_s, u""_s}));
    EXPECT_EQ(rows[1], (QStringList{u"Tern"_s, u"3."_s, u""_s, u"Yes"_s, u""_s, u""_s}));
    EXPECT_EQ(running->ListRows(list, 3, 10).size(), 1U);
    EXPECT_EQ(running->CurrentRecord(), 0);

    EXPECT_EQ(running->SelectListRow(list, 2), Outcome::Done);
    EXPECT_EQ(Text(u"Name"), u"Tern"_s);
    EXPECT_EQ(running->Controls()[size_t(list)].selectedRow, 2);
    Type(u"Name", u"Kite"_s);
    EXPECT_EQ(running->SelectListRow(list, 0), Outcome::Stopped);
    EXPECT_EQ(running->Controls()[size_t(list)].selectedRow, 2);
    EXPECT_EQ(running->SelectListRow(list, 4), Outcome::Failed);
}

TEST_F(RunningFormTest, SortsByTheHeaderOfAField)
{
    FormBuilder form = BirdForm();
    form.List(u"list", {{u"Bird"_s, u"Birds.Name"_s}, {u"Double"_s, u"[ID]*2"_s}, {u"ID"_s, u"[ID]"_s}});
    Start(form, u"SELECT * FROM Birds WHERE ID<4 ORDER BY ID"_s);
    const int list = Control(u"list");
    const auto tap = [&](int column) {
        EXPECT_EQ(running->TapListHeader(list, column), Outcome::Done);
        QString order;
        for (const QStringList& row : running->ListRows(list, 0, 9))
            order += row.back();
        return order;
    };
    EXPECT_EQ(tap(0), u"213"_s);
    EXPECT_EQ(tap(0), u"312"_s);
    EXPECT_TRUE(running->Controls()[size_t(list)].sortedDescending);
    EXPECT_EQ(tap(1), u"312"_s); // an expression is no field
    EXPECT_EQ(tap(2), u"123"_s); // another column begins ascending
    EXPECT_EQ(tap(0), u"213"_s);
    EXPECT_EQ(running->CurrentQuery().simplified(), u"SELECT * FROM Birds WHERE ID<4 ORDER BY Name ASC"_s);
}

TEST_F(RunningFormTest, FiltersAndSortsByTheFieldOfAControl)
{
    Start(BirdForm());
    running->GoToNext();
    EXPECT_EQ(running->FilterByControl(Control(u"Wild"), CellFilter::BySelection), Outcome::Done);
    EXPECT_EQ(running->RecordCount(), 2);
    EXPECT_EQ(running->SortByControl(Control(u"Name"), SortOrder::Descending), Outcome::Done);
    EXPECT_EQ(Text(u"Name"), u"O'Brien"_s);
    EXPECT_EQ(running->FilterByControl(Control(u"Name"), CellFilter::ExcludingSelection), Outcome::Done);
    EXPECT_EQ(running->CounterText(), u"1/1"_s);
    EXPECT_EQ(running->Conditions().size(), 2);
    for (const QStringView notAField : {u"counter", u"search"})
        EXPECT_EQ(running->FilterByControl(Control(notAField), CellFilter::BySelection), Outcome::Done);
    EXPECT_EQ(running->Conditions().size(), 2);

    EXPECT_EQ(running->AddCondition(u"Nothing=1"_s), Outcome::Failed);
    EXPECT_EQ(running->CounterText(), u"1/1"_s); // the result before is there again
    EXPECT_EQ(prompt_.shown.size(), 1);
    EXPECT_EQ(running->RemoveFilter(), Outcome::Done);
    EXPECT_EQ(running->CounterText(), u"1/4"_s);
    EXPECT_FALSE(running->IsFiltered());
}

TEST_F(RunningFormTest, TellsWhichControlsChanged)
{
    FormBuilder form = BirdForm();
    form.Edit(u"constant", u"'same'");
    Start(form);
    const quint64 seen = running->Revision();
    running->GoToNext();
    QStringList changed;
    for (const ControlRun& control : running->Controls()) {
        if (control.revision > seen)
            changed += control.name;
    }
    EXPECT_EQ(changed, (QStringList{u"counter"_s, u"Name"_s, u"Price"_s, u"Seen"_s, u"Wild"_s}));
}

TEST_F(RunningFormTest, TicksItsClocksAlone)
{
    FormBuilder form(u"Birds");
    form.Edit(u"clock", u"SYSTIME()").Edit(u"frozen", u"SYSTIME()+''").Edit(u"Name", u"Birds.Name");
    Start(form);
    EXPECT_TRUE(running->HasClock());
    Type(u"Name", u"typed"_s);
    now = now.addSecs(1);
    running->Tick();
    EXPECT_EQ(Shown(), (QStringList{u"9:05:08 AM"_s, u"9:05:07 AM"_s, u"typed"_s}));
    EXPECT_FALSE(Start(BirdForm()).HasClock());
}

TEST_F(RunningFormTest, AddsARecordWithTheDefaultValues)
{
    FormBuilder form = BirdForm();
    form.form.controls[1].defaultValue.Set(u"new bird");
    form.form.controls[2].defaultValue.Set(u"2.5");
    Start(form);
    EXPECT_EQ(running->AddRecord(), Outcome::Done);
    EXPECT_EQ(running->CounterText(), u"5/5"_s);
    EXPECT_EQ(Shown(), (QStringList{u"5/5"_s, u"new bird"_s, u"2.5"_s, u"7/4/2001"_s, u"0"_s, u""_s}));
    EXPECT_FALSE(running->IsDirty());
    EXPECT_EQ(Stored(u"SELECT Name FROM Birds WHERE ID IS NULL"_s), u"new bird"_s);

    form.form.controls[2].defaultValue.Set(u"cheap");
    Start(form);
    EXPECT_EQ(running->AddRecord(), Outcome::Failed);
    EXPECT_EQ(running->RecordCount(), 5);
    EXPECT_TRUE(prompt_.shown.join(u' ').contains(u"80040E07"_s)) << prompt_.shown.join(u' ').toStdString();
}

TEST_F(RunningFormTest, PlacesTheSecondWindowOfABox)
{
    const struct {
        EditKind kind;
        QRect main;
        QRect second;
    } rows[] = {{EditKind::Plain, {10, 20, 100, 12}, {}},
                {EditKind::DatePicker, {10, 20, 85, 12}, {10, 20, 100, 12}},
                {EditKind::Extendable, {10, 20, 85, 12}, {95, 20, 15, 12}}};
    ControlDef control;
    control.type = ControlType::EditBox;
    control.left = 10;
    control.top = 20;
    control.width = 100;
    control.height = 12;
    for (const auto& row : rows) {
        control.editKind = row.kind;
        EXPECT_EQ(PartsOf(control).main, row.main) << int(row.kind);
        EXPECT_EQ(PartsOf(control).second, row.second) << int(row.kind);
    }
    control.width = -50;
    control.left = std::numeric_limits<int>::max();
    EXPECT_TRUE(PartsOf(control).main.isEmpty());
    EXPECT_TRUE(PartsOf(control).second.isEmpty());
}

} // namespace
} // namespace mirel
