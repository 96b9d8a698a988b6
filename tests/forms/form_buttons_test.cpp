#include "form_fixture.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class FormButtonsTest : public FormFixture {
protected:
    static FormBuilder Form()
    {
        FormBuilder form(u"Birds");
        form.Edit(u"ID", u"Birds.ID")
            .Edit(u"Name", u"Birds.Name")
            .Edit(u"Price", u"Birds.Price")
            .Edit(u"Seen", u"Birds.Seen")
            .Check(u"Wild", u"WHERE Birds.Wild=1")
            .Edit(u"Notes", u"Birds.Notes")
            .Input(u"free");
        return form;
    }
    static std::vector<SourceAssignment> SaveAll()
    {
        std::vector<SourceAssignment> all;
        for (const auto& name : {u"ID"_s, u"Name"_s, u"Price"_s, u"Seen"_s, u"Wild"_s, u"Notes"_s})
            all.push_back({u"Birds."_s + name, u'&' + name});
        return all;
    }
    QString Record(int id) { return Row(u"SELECT * FROM Birds WHERE ID=%1"_s.arg(id)); }
    // All fields of the first record, parted by "|".
    QString Row(const QString& statement)
    {
        DbRecordset rows(connection_);
        EXPECT_TRUE(Open(rows, statement));
        QStringList texts;
        for (int i = 0; i < rows.FieldCount(); ++i)
            texts += rows.FieldValue(i).IsNull() ? u"NULL"_s : rows.ValueText(i);
        return texts.join(u'|');
    }
    // One UPDATE of one field by one expression, on the first record.
    QString Updated(const QString& field, const QString& expression, const QString& freeText = {})
    {
        FormBuilder form = Form();
        form.Button(u"set", ButtonFunction::Update, {{u"Birds."_s + field, expression}});
        Start(form);
        Type(u"free", freeText);
        prompt_.shown.clear();
        if (Press(u"set") == Outcome::Failed)
            return u"refused "_s + prompt_.shown.join(u' ').mid(7, 10);
        return Stored(u"SELECT %1 FROM Birds WHERE ID=1"_s.arg(field));
    }
};

TEST_F(FormButtonsTest, UpdateConvertsForTheField)
{
    const struct {
        const char16_t* field;
        const char16_t* expression;
        const char16_t* free;
        const char16_t* stored;
    } rows[] = {
        {u"Name", u"&free", u" 00501 ", u" 00501 "}, // a text stays what it is
        {u"Name", u"&free", u"'quoted'", u"'quoted'"},
        {u"Name", u"&free", u"", u"NULL"},
        {u"Name", u"UPPER(&free)", u"kite", u"KITE"},
        {u"Name", u"[ID]+1", u"", u"2"},
        {u"Name", u"&free", u"a text of more than twenty characters", u"refused (80040E57)"},
        {u"Notes", u"&free", u"line\r\nline", u"line\r\nline"},
        {u"Small", u"&free", u"12", u"12"},
        {u"Small", u"&free", u"12.7", u"refused (80040E07)"},
        {u"Small", u"&free", u"40000", u"refused (80040E57)"},
        {u"Small", u"&free", u"twelve", u"refused (80040E07)"},
        {u"Small", u"&free", u" ", u"NULL"},
        {u"Small", u"[ID]*12.9", u"", u"12"}, // computed ones lose their fraction
        {u"Small", u"0-[ID]*12.9", u"", u"-12"},
        {u"Small", u"[ID]*40000.5", u"", u"refused (80040E57)"},
        {u"Small", u"[ID]*0.1*30", u"", u"3"}, // as the language writes numbers: the last digits do not count
        {u"Price", u"&free", u"-0.1", u"-0.1"},
        {u"Price", u"&free", u"1e3", u"1000"},
        {u"Price", u"1/3", u"", u"0.333333333333333"},
        {u"Price", u"&nobody", u"", u"NULL"},
        {u"Seen", u"&free", u"7/8/2009 10:00:00 PM", u"7/8/2009 10:00:00 PM"},
        {u"Seen", u"&free", u"2009-07-08", u"7/8/2009"},
        {u"Seen", u"&free", u"2009", u"refused (80040E07)"},
        {u"Seen", u"&free", u"soon", u"refused (80040E07)"},
        {u"Seen", u"[Seen]+1", u"", u"7/5/2001"},
        {u"Wild", u"&free", u"true", u"-1"},
        {u"Wild", u"&free", u"1", u"-1"},
        {u"Wild", u"&free", u"yes", u"-1"},
        {u"Wild", u"&free", u" No ", u"0"},
        {u"Wild", u"&free", u"maybe", u"refused (80040E07)"},
        {u"Wild", u"UPPER('yes')", u"", u"-1"},
        {u"Wild", u"&free", u"", u"0"},
        {u"Wild", u"[ID]=2", u"", u"0"},
    };
    for (const auto& row : rows) {
        const QString field = QString::fromUtf16(row.field);
        Run(u"UPDATE Birds SET Name='Osprey',Price=1.5,Seen='2001-07-04',Wild=1,Notes='one',Small=7 WHERE ID=1"_s);
        EXPECT_EQ(Updated(field, QString::fromUtf16(row.expression), QString::fromUtf16(row.free)),
                  QString::fromUtf16(row.stored))
            << field.toStdString() << " = " << QString::fromUtf16(row.expression).toStdString() << " with "
            << QString::fromUtf16(row.free).toStdString();
    }
}

TEST_F(FormButtonsTest, UpdateWritesAllOfARecordOrNothing)
{
    FormBuilder form = Form();
    form.Button(u"SAVE", ButtonFunction::Update, SaveAll());
    Start(form);
    Type(u"Name", u"Kite"_s);
    Type(u"Price", u"cheap"_s);
    EXPECT_EQ(Press(u"SAVE"), Outcome::Failed);
    EXPECT_EQ(Record(1), u"1|Osprey|1.5|7/4/2001|-1|one|NULL"_s);
    EXPECT_EQ(Text(u"Name"), u"Kite"_s); // what the user typed is still there
    EXPECT_TRUE(running->IsDirty());
    Type(u"Price", u"3"_s);
    running->SetTicked(Control(u"Wild"), false);
    EXPECT_EQ(Press(u"SAVE"), Outcome::Done);
    EXPECT_EQ(Record(1), u"1|Kite|3|7/4/2001|0|one|NULL"_s);
    EXPECT_FALSE(running->IsDirty());
    EXPECT_EQ(running->Close(), Outcome::Done);
    EXPECT_EQ(host.changed, 1);
}

TEST_F(FormButtonsTest, KeepsTheEditsThatAButtonDidNotSave)
{
    FormBuilder form = Form();
    form.Button(u"name", ButtonFunction::Update, {{u"Birds.Name"_s, u"&Name"_s}});
    form.Edit(u"doubled", u"&Price*2").Button(u"recalc", ButtonFunction::Recalc);
    Start(form);
    Type(u"Name", u"Kite"_s);
    Type(u"Price", u"3"_s);
    EXPECT_EQ(Press(u"recalc"), Outcome::Done);
    EXPECT_EQ(Text(u"doubled"), u"6"_s);
    EXPECT_EQ(Text(u"Name"), u"Kite"_s);
    EXPECT_EQ(Press(u"name"), Outcome::Done);
    EXPECT_EQ(Record(1), u"1|Kite|1.5|7/4/2001|-1|one|NULL"_s);
    EXPECT_EQ(Text(u"Price"), u"3"_s);
    EXPECT_TRUE(running->IsDirty());
    EXPECT_EQ(prompt_.questions, QStringList());
}

TEST_F(FormButtonsTest, SavingWithoutAChangeChangesNothing)
{
    Run(u"UPDATE Birds SET Price=0.30000000000000004,Seen='2001-07-04 09:05:00.250' WHERE ID=1"_s);
    Run(u"UPDATE Birds SET Notes='' WHERE ID=1"_s);
    FormBuilder form = Form();
    form.Button(u"SAVE", ButtonFunction::Update, SaveAll());
    Start(form);
    EXPECT_EQ(Press(u"SAVE"), Outcome::Done);
    EXPECT_EQ(Stored(u"SELECT ID FROM Birds WHERE Price=0.30000000000000004 AND Notes='' AND "
                     "Seen='2001-07-04 09:05:00.250'"_s),
              u"1"_s);
    EXPECT_EQ(running->Close(), Outcome::Done);
    EXPECT_EQ(host.changed, 0);
}

TEST_F(FormButtonsTest, UpdateSkipsWhatIsNotThere)
{
    FormBuilder form = Form();
    form.Button(u"set", ButtonFunction::Update,
                {{u"Birds.Nothing"_s, u"'x'"_s},
                 {u"Places.Name"_s, u"'other table'"_s},
                 {u"Birds.Price"_s, u""_s},
                 {u"[birds].[name]"_s, u"'Kite'"_s}});
    Start(form);
    EXPECT_EQ(Press(u"set"), Outcome::Done);
    EXPECT_EQ(Record(1), u"1|Kite|1.5|7/4/2001|-1|one|NULL"_s);
    Start(form, u"SELECT * FROM Birds WHERE ID=99"_s);
    EXPECT_EQ(Press(u"set"), Outcome::Done); // no record, nothing to do
}

TEST_F(FormButtonsTest, UpdateAllAsksAndTakesEachRecordsOwnValues)
{
    FormBuilder form = Form();
    form.Button(u"all", ButtonFunction::UpdateAll,
                {{u"Birds.Small"_s, u"[ID]*10"_s}, {u"Birds.Name"_s, u"&Name"_s}});
    Start(form);
    running->GoToNext();
    EXPECT_EQ(Press(u"all"), Outcome::Stopped);
    EXPECT_EQ(prompt_.questions, QStringList{u"Are you sure you want to update 4 records in this result?"_s});
    prompt_.answers = {true};
    EXPECT_EQ(Press(u"all"), Outcome::Done);
    EXPECT_EQ(Stored(u"SELECT Small FROM Birds ORDER BY ID"_s), u"10|20|30|40"_s);
    EXPECT_EQ(Stored(u"SELECT Name FROM Birds ORDER BY ID"_s), u"Gull|Gull|Gull|Gull"_s);
    EXPECT_EQ(running->CurrentRecord(), 1);

    Start(form, u"SELECT * FROM Birds WHERE ID=1"_s);
    EXPECT_EQ(Press(u"all"), Outcome::Done);
    EXPECT_EQ(prompt_.questions.size(), 2); // one record is not asked about
}

TEST_F(FormButtonsTest, UpdateAllKeepsWhatItWroteBeforeAFailure)
{
    FormBuilder form = Form();
    form.Button(u"all", ButtonFunction::UpdateAll, {{u"Birds.Small"_s, u"10000*[ID]"_s}});
    Start(form);
    prompt_.answers = {true};
    EXPECT_EQ(Press(u"all"), Outcome::Failed);
    EXPECT_EQ(Stored(u"SELECT Small FROM Birds ORDER BY ID"_s), u"10000|20000|30000|NULL"_s);
    EXPECT_EQ(prompt_.shown.size(), 1);
    EXPECT_EQ(running->CurrentRecord(), 0);
}

TEST_F(FormButtonsTest, InsertAddsARecord)
{
    FormBuilder form = Form();
    form.Button(u"add", ButtonFunction::Insert, SaveAll());
    Start(form);
    Type(u"ID", u"5"_s);
    Type(u"Name", u"D'Arcy'); DELETE"_s);
    Type(u"Price", u""_s);
    Type(u"Seen", u"7/8/2009"_s);
    EXPECT_EQ(Press(u"add"), Outcome::Done) << prompt_.shown.join(u' ').toStdString();
    EXPECT_EQ(Record(5), u"5|D'Arcy'); DELETE|NULL|7/8/2009|-1|one|NULL"_s);
    EXPECT_EQ(running->CounterText(), u"1/5"_s);
    EXPECT_EQ(Text(u"Name"), u"Osprey"_s);
    EXPECT_FALSE(running->IsDirty());

    Type(u"ID", u"6); DROP TABLE Birds"_s);
    EXPECT_EQ(Press(u"add"), Outcome::Failed);
    EXPECT_EQ(Stored(u"SELECT COUNT(*) FROM Birds"_s), u"5"_s);
}

TEST_F(FormButtonsTest, InsertTakesAllOfItsTargetsOrNone)
{
    Run(u"CREATE TABLE Bin (ID Integer, Data VarBinary(255), Other Integer)"_s);
    Run(u"INSERT INTO Bin (ID) VALUES(1)"_s);
    FormBuilder form(u"Bin");
    form.Button(u"missing", ButtonFunction::Insert, {{u"Bin.ID"_s, u"2"_s}, {u"Bin.Nothing"_s, u"3"_s}});
    // The column of a binary field is listed and has no value: the store refuses the statement.
    form.Button(u"binary", ButtonFunction::Insert, {{u"Bin.ID"_s, u"2"_s}, {u"Bin.Data"_s, u"'x'"_s}});
    Start(form);
    for (const QStringView button : {u"missing", u"binary"})
        EXPECT_EQ(Press(button), Outcome::Failed) << button.toString().toStdString();
    EXPECT_EQ(prompt_.shown.size(), 2);
    EXPECT_EQ(Stored(u"SELECT COUNT(*) FROM Bin"_s), u"1"_s);
}

TEST_F(FormButtonsTest, InsertGoesToTheActiveTable)
{
    Run(u"CREATE TABLE Copies (Name Varchar(20))"_s);
    FormBuilder form = Form();
    form.Button(u"add", ButtonFunction::Insert, {{u"Name"_s, u"&Name"_s}});
    activeTable = u"Copies"_s;
    Start(form);
    EXPECT_EQ(Press(u"add"), Outcome::Done) << prompt_.shown.join(u' ').toStdString();
    EXPECT_EQ(Stored(u"SELECT Name FROM Copies"_s), u"Osprey"_s);
}

TEST_F(FormButtonsTest, DeleteShowsTheRecordThatTookItsPlace)
{
    FormBuilder form = Form();
    form.Button(u"delete", ButtonFunction::DeleteRecord).Whole(u"sum", u"SUM([ID])");
    Start(form);
    EXPECT_EQ(Press(u"delete"), Outcome::Stopped);
    EXPECT_EQ(prompt_.questions, QStringList{u"Are you sure you want to delete this record?"_s});
    settings.confirmDelete = false;
    Start(form);
    const auto deleteAt = [&](qint64 record) {
        running->GoToRecord(record);
        EXPECT_EQ(Press(u"delete"), Outcome::Done);
        return u"%1 %2"_s.arg(running->CounterText(), Text(u"Name"));
    };
    EXPECT_EQ(deleteAt(1), u"2/3 Tern"_s);
    EXPECT_EQ(Text(u"sum"), u"10"_s); // the user did not ask for it to be kept up to date
    EXPECT_EQ(deleteAt(2), u"2/2 Tern"_s);
    EXPECT_EQ(deleteAt(0), u"1/1 Tern"_s);
    EXPECT_EQ(deleteAt(0), u"0/0 "_s);
    EXPECT_EQ(Text(u"sum"), QString());
    EXPECT_EQ(Press(u"delete"), Outcome::Done); // nothing there, nothing happens
}

TEST_F(FormButtonsTest, KeepsAggregatesUpToDateWhereAsked)
{
    settings.updateAggregate = true;
    settings.confirmDelete = false;
    FormBuilder form = Form();
    form.Whole(u"sum", u"SUM([ID])").Button(u"delete", ButtonFunction::DeleteRecord);
    form.Button(u"set", ButtonFunction::Update, {{u"Birds.ID"_s, u"[ID]+100"_s}});
    Start(form);
    EXPECT_EQ(Press(u"delete"), Outcome::Done);
    EXPECT_EQ(Text(u"sum"), u"9"_s);
    EXPECT_EQ(Press(u"set"), Outcome::Done);
    EXPECT_EQ(Text(u"sum"), u"109"_s);
}

TEST_F(FormButtonsTest, SelectRunsTheButtonsQuery)
{
    FormBuilder form = Form();
    form.Button(u"find", ButtonFunction::Select, u"SELECT * WHERE Name LIKE '%&[free]%' ORDER BY Name");
    form.Button(u"bad", ButtonFunction::Select, u"SELECT * WHERE").Button(u"none", ButtonFunction::Select);
    Start(form);
    Type(u"free", u"'"_s);
    EXPECT_EQ(Press(u"find"), Outcome::Done);
    EXPECT_EQ(Text(u"Name"), u"O'Brien"_s);
    EXPECT_EQ(Text(u"free"), u"'"_s); // a search box keeps its text
    EXPECT_EQ(host.lastQuery, u"SELECT * WHERE Name LIKE '%&[free]%' ORDER BY Name"_s);
    EXPECT_EQ(Press(u"none"), Outcome::Done);
    EXPECT_EQ(running->RecordCount(), 1);

    Type(u"Name", u"changed"_s);
    EXPECT_EQ(Press(u"find"), Outcome::Stopped);
    EXPECT_EQ(Text(u"Name"), u"changed"_s);
    prompt_.answers = {true};
    EXPECT_EQ(Press(u"bad"), Outcome::Failed);
    EXPECT_EQ(running->RecordCount(), -1);
    EXPECT_EQ(Text(u"Name"), QString()); // an empty form, not the old result
    EXPECT_FALSE(running->IsDirty());
    EXPECT_EQ(prompt_.shown.size(), 1);
}

TEST_F(FormButtonsTest, ClearEmptiesBoxesAndWritesNothing)
{
    FormBuilder form = Form();
    form.Button(u"clear", ButtonFunction::ClearForm).Button(u"recalc", ButtonFunction::Recalc);
    form.DropDown(u"pick", u"a;b");
    Start(form);
    Type(u"pick", u"a"_s);
    EXPECT_EQ(Press(u"clear"), Outcome::Done);
    EXPECT_EQ(Text(u"Name"), QString());
    EXPECT_FALSE(Ticked(u"Wild"));
    EXPECT_EQ(Text(u"pick"), u"a"_s);
    EXPECT_EQ(Record(1), u"1|Osprey|1.5|7/4/2001|-1|one|NULL"_s);
    EXPECT_EQ(Press(u"recalc"), Outcome::Done);
    EXPECT_EQ(Text(u"Name"), u"Osprey"_s);
    EXPECT_TRUE(Ticked(u"Wild"));
}

TEST_F(FormButtonsTest, CallFormHandsOverTheResult)
{
    FormDef called;
    called.SetName(u"Other");
    called.formTag = 5;
    store.AddForm(called);
    FormBuilder form = Form();
    form.Button(u"plain", ButtonFunction::CallForm, u"Other");
    form.Button(u"with", ButtonFunction::CallForm, u"Other").Last().option1 = 1;
    form.Last().option2 = 1;
    form.Button(u"missing", ButtonFunction::CallForm, u"Nobody").Last().option2 = 1;
    form.Button(u"set", ButtonFunction::Update, {{u"Birds.Small"_s, u"1"_s}});
    Start(form);
    running->GoToNext();
    EXPECT_EQ(Press(u"missing"), Outcome::Done); // and says nothing
    EXPECT_EQ(host.closed, 0);
    EXPECT_EQ(Press(u"plain"), Outcome::Done);
    EXPECT_EQ(host.changed, 0);
    EXPECT_EQ(Press(u"set"), Outcome::Done);
    EXPECT_EQ(Press(u"with"), Outcome::Done);
    ASSERT_EQ(host.calls.size(), 2U);
    EXPECT_EQ(host.calls[0].form.formTag, 5);
    EXPECT_EQ(host.calls[0].query, QString());
    EXPECT_EQ(host.calls[0].record, -1);
    EXPECT_EQ(host.calls[1].query, u"SELECT * FROM Birds"_s);
    EXPECT_EQ(host.calls[1].record, 1);
    EXPECT_EQ(host.changed, 1);
    EXPECT_EQ(host.closed, 1);
    EXPECT_EQ(running->Close(), Outcome::Done);
    EXPECT_EQ(host.changed, 1); // told once
}

TEST_F(FormButtonsTest, TakesTheFunctionsThatNoSheetOffers)
{
    FormBuilder form = Form();
    form.Button(u"first", ButtonFunction::First)
        .Button(u"last", ButtonFunction::Last)
        .Button(u"next", ButtonFunction::Next)
        .Button(u"previous", ButtonFunction::Previous)
        .Button(u"close", ButtonFunction::Close)
        .Button(u"nothing", ButtonFunction::Nothing)
        .Button(u"unknown", ButtonFunction(4711));
    Start(form);
    const struct {
        const char16_t* button;
        Outcome outcome;
        qint64 record;
    } rows[] = {{u"last", Outcome::Done, 3},    {u"next", Outcome::Failed, 3}, {u"previous", Outcome::Done, 2},
                {u"next", Outcome::Done, 3},    {u"first", Outcome::Done, 0},  {u"previous", Outcome::Done, 0},
                {u"nothing", Outcome::Done, 0}, {u"unknown", Outcome::Done, 0}};
    for (const auto& row : rows) {
        EXPECT_EQ(Press(row.button), row.outcome) << QString::fromUtf16(row.button).toStdString();
        EXPECT_EQ(running->CurrentRecord(), row.record) << QString::fromUtf16(row.button).toStdString();
    }
    Type(u"Name", u"x"_s);
    EXPECT_EQ(Press(u"close"), Outcome::Stopped);
    EXPECT_EQ(host.closed, 0);
    prompt_.answers = {true};
    EXPECT_EQ(Press(u"close"), Outcome::Done);
    EXPECT_EQ(host.closed, 1);
}

TEST_F(FormButtonsTest, TellsWhyAResultCannotBeChanged)
{
    settings.confirmDelete = false;
    FormBuilder form = Form();
    form.Button(u"set", ButtonFunction::Update, {{u"Birds.Name"_s, u"'x'"_s}});
    form.Button(u"delete", ButtonFunction::DeleteRecord);
    Start(form, u"SELECT DISTINCT Name,ID FROM Birds ORDER BY ID"_s);
    EXPECT_FALSE(running->CanUpdate());
    running->GoToNext();
    for (const QStringView button : {u"set", u"delete"})
        EXPECT_EQ(Press(button), Outcome::Failed) << button.toString().toStdString();
    EXPECT_EQ(running->AddRecord(), Outcome::Failed);
    EXPECT_EQ(prompt_.shown.size(), 3);
    EXPECT_EQ(running->CounterText(), u"2/4"_s); // the same record
}

} // namespace
} // namespace mirel
