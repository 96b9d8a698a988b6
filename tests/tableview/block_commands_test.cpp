// Blocks of cells: selected, copied, pasted over, cleared; and the way back.
#include "tableview/block_commands.h"

#include "tableview/people_fixture.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

enum Column { Name, Age, Born, Member, Note };

class Blocks : public PeopleFixture {
protected:
    Blocks()
    {
        browser.SetRowsPerPage(10);
        EXPECT_TRUE(browser.Open(RecordBrowser::StatementOfTable(u"People")));
    }

    void Select(int row, int column) { EXPECT_TRUE(browser.SelectCell(row, column)); }
    void Extend(int row, int column) { EXPECT_TRUE(browser.ExtendToCell(row, column)); }
    QString Copied(FieldNames names = FieldNames::Without)
    {
        const std::optional<TextRows> rows = commands.Copy(names);
        return rows ? TextOfRows(*rows) : u"(nothing)"_s;
    }
    bool Paste(const QString& text) { return commands.Paste(RowsOfText(text)); }
    // All of a column, NULL as nothing.
    QString All(const QString& column, const QString& where = u"Age<25"_s)
    {
        DbRecordset records(connection);
        EXPECT_TRUE(records.Open(u"SELECT %1 FROM People WHERE %2"_s.arg(column, where), path,
                                 CursorType::ForwardOnly, LockType::ReadOnly));
        QStringList texts;
        while (!records.IsEof()) {
            texts += records.ValueText(0);
            EXPECT_TRUE(records.MoveNext());
        }
        return texts.join(u' ');
    }
    QString Where() const
    {
        const CellBlock block = browser.Block();
        return u"%1-%2/%3-%4"_s.arg(QString::number(block.firstRecord), QString::number(block.lastRecord),
                                    QString::number(block.firstColumn), QString::number(block.lastColumn));
    }

    RecordBrowser browser{connection, path, prompt, {}};
    BlockCommands commands{browser, prompt};
};

TEST_F(Blocks, GrowFromWhereTheyBegan)
{
    Select(3, Age);
    Extend(5, Born);
    EXPECT_EQ(Where(), u"3-5/1-2"_s);
    Extend(2, Name);
    EXPECT_EQ(Where(), u"2-3/0-1"_s) << "over to the other side";
    EXPECT_TRUE(browser.Extend([](RecordBrowser& b) { return b.GoToLast(); }));
    EXPECT_EQ(Where(), u"3-24/0-1"_s) << "beyond the page";
    EXPECT_TRUE(browser.MoveRows(-1));
    EXPECT_EQ(Where(), u"23-23/0-0"_s) << "a move ends it";
    browser.SelectWholeRecords();
    EXPECT_EQ(Where(), u"23-23/0-4"_s);
    browser.SelectWholeColumns();
    EXPECT_EQ(Where(), u"0-24/0-4"_s);
    EXPECT_TRUE(browser.HideColumn());
    EXPECT_FALSE(browser.HasBlock()) << "other columns";
}

TEST_F(Blocks, AreCopiedAsTheUserReadsThem)
{
    Select(3, Name);
    EXPECT_EQ(Copied(), u"P4"_s);
    EXPECT_EQ(Copied(FieldNames::With), u"Name\nP4"_s);
    Extend(4, Member);
    EXPECT_EQ(Copied(), u"P4\t24\t7/4/2001\tYes\nP5\t\t7/4/2001\tNo"_s);
    Select(0, Member);
    Extend(0, Note);
    EXPECT_EQ(Copied(FieldNames::With), u"Member\tNote\nNo\t"_s + longNote) << "whole, not as the grid cuts it";
    ASSERT_TRUE(browser.TogglePresentation());
    EXPECT_EQ(Copied(FieldNames::With), u"Note\n"_s + longNote);
}

TEST_F(Blocks, ArePastedOverTheCells)
{
    const struct {
        const char* what;
        CellPlace from;
        CellPlace to;
        QString text;
        QString names;
        QString ages;
    } cases[] = {
        {"one over one", {0, Name}, {0, Name}, u"x"_s, u"x P2 P3 P4"_s, u"21 22 23 24"_s},
        {"a block", {1, Name}, {1, Name}, u"a\t1\nb\t2"_s, u"P1 a b P4"_s, u"21 1 2 24"_s},
        {"from the block's first cell", {2, Age}, {1, Name}, u"a\t1\nb\t2"_s, u"P1 a b P4"_s, u"21 1 2 24"_s},
        {"one into many", {0, Age}, {3, Age}, u"7"_s, u"P1 P2 P3 P4"_s, u"7 7 7 7"_s},
        {"a row into rows", {0, Name}, {1, Age}, u"z\t9"_s, u"z z P3 P4"_s, u"9 9 23 24"_s},
        {"twice", {0, Age}, {3, Age}, u"5\n6"_s, u"P1 P2 P3 P4"_s, u"5 6 5 6"_s},
        {"no multiple: once", {0, Age}, {2, Age}, u"5\n6"_s, u"P1 P2 P3 P4"_s, u"5 6 23 24"_s},
        {"a short row leaves cells alone", {0, Name}, {0, Name}, u"a\nb\t2"_s, u"a b P3 P4"_s, u"21 2 23 24"_s},
        {"nothing is NULL", {0, Name}, {0, Name}, u"\t"_s, u" P2 P3 P4"_s, u" 22 23 24"_s},
    };
    const QString these = u"Note IN ('%1','note 2','note 3','note 4')"_s.arg(longNote);
    for (const auto& row : cases) {
        Select(int(row.from.record), row.from.column);
        Extend(int(row.to.record), row.to.column);
        EXPECT_TRUE(Paste(row.text)) << row.what;
        EXPECT_EQ(All(u"Name"_s, these), row.names) << row.what;
        EXPECT_EQ(All(u"Age"_s, these), row.ages) << row.what;
        EXPECT_TRUE(browser.Undo()) << row.what;
        EXPECT_EQ(All(u"Name"_s, these) + All(u"Age"_s, these), u"P1 P2 P3 P421 22 23 24"_s) << row.what;
        EXPECT_FALSE(browser.CanUndo()) << row.what << ": a paste is one step";
    }
    EXPECT_EQ(prompt.shown + prompt.questions, QStringList());
}

TEST_F(Blocks, TakeTheWordsOfYesAndNo)
{
    Select(0, Member);
    EXPECT_TRUE(Paste(u"yes\nTRUE\n1\nNo\nfalse\n"_s));
    EXPECT_EQ(All(u"Name"_s, u"Member=TRUE AND Age<25"_s), u"P1 P2 P3"_s);
    EXPECT_FALSE(Paste(u"perhaps"_s));
    EXPECT_EQ(prompt.shown.size(), 1);
}

TEST_F(Blocks, StopAtARefusedValueAndSayWhere)
{
    const struct {
        const char* what;
        QString text;
        QString refused;
    } cases[] = {
        {"no number", u"a\t1\nb\tten\nc\t3"_s, u"Age"_s},
        {"half a number", u"a\t1\nb\t12.7\nc\t3"_s, u"Age"_s},
        {"too long a text", u"a\t1\nlonger than ten\t2\nc\t3"_s, u"Name"_s},
    };
    for (const auto& row : cases) {
        prompt.shown.clear();
        Select(0, Name);
        EXPECT_FALSE(Paste(row.text)) << row.what;
        ASSERT_EQ(prompt.shown.size(), 1) << row.what;
        EXPECT_TRUE(prompt.shown[0].startsWith(u"Error: "_s)) << row.what;
        EXPECT_TRUE(
            prompt.shown[0].endsWith(u"Field %1, record 2. 1 of 3 record(s) are written."_s.arg(row.refused)))
            << row.what << ": " << prompt.shown[0].toStdString();
        EXPECT_EQ(All(u"Name"_s, u"Age=1"_s), u"a"_s) << row.what;
        EXPECT_EQ(browser.SelectedRecord(), 1) << row.what;
        EXPECT_EQ(browser.FieldName(browser.SelectedField()), row.refused) << row.what;
        EXPECT_TRUE(browser.Undo()) << row.what;
    }
    EXPECT_EQ(All(u"Name"_s), u"P1 P2 P3 P4"_s);
}

TEST_F(Blocks, AskBeforeTheyGoPastTheEnds)
{
    ASSERT_TRUE(browser.GoToLast());
    EXPECT_FALSE(Paste(u"a\nb\nc"_s));
    EXPECT_EQ(prompt.questions.size(), 1);
    EXPECT_EQ(browser.CounterText(), u"25/25"_s) << "No changes nothing";
    EXPECT_EQ(browser.SelectedText(), u"P25"_s);
    prompt.answers = {true};
    EXPECT_TRUE(Paste(u"a\nb\nc"_s));
    EXPECT_EQ(browser.CounterText(), u"25/27"_s);
    EXPECT_EQ(All(u"Name"_s, u"Name>='a' AND Name<'d'"_s), u"a b c"_s);
    EXPECT_TRUE(browser.Undo());
    EXPECT_EQ(browser.CounterText(), u"25/25"_s);
    EXPECT_EQ(browser.SelectedText(), u"P25"_s);

    ASSERT_TRUE(browser.MoveToLastColumn());
    EXPECT_FALSE(Paste(u"a\tb"_s));
    prompt.answers = {true};
    EXPECT_TRUE(Paste(u"a\tb"_s));
    EXPECT_EQ(browser.SelectedText(), u"a"_s);
}

TEST_F(Blocks, GoToTheFieldsOfASingleRecord)
{
    ASSERT_TRUE(browser.TogglePresentation());
    EXPECT_TRUE(Paste(u"Ann\t30\t2002-01-02"_s));
    EXPECT_EQ(Stored(u"SELECT Name FROM People WHERE Age=30 AND Born='2002-01-02'"_s), u"Ann"_s);
}

TEST_F(Blocks, AreClearedAtOnce)
{
    Select(0, Age);
    Extend(1, Born);
    EXPECT_TRUE(commands.Clear());
    EXPECT_EQ(All(u"Name"_s, u"Age IS NULL AND Born IS NULL"_s), u"P1 P2"_s);
    EXPECT_TRUE(browser.Undo());
    EXPECT_EQ(All(u"Name"_s, u"Born IS NULL"_s), QString());
}

TEST_F(Blocks, StopWhenTheUserAsksForIt)
{
    Select(0, Age);
    browser.SelectWholeColumns();
    prompt.stopAt = 0;
    EXPECT_FALSE(Paste(u"1"_s));
    EXPECT_EQ(All(u"Name"_s, u"Age=1"_s), QString());
    browser.SelectWholeColumns();
    EXPECT_EQ(Copied(), u"(nothing)"_s);
}

TEST_F(Blocks, LeaveAResultThatCannotBeChangedAlone)
{
    ASSERT_TRUE(browser.Open(u"SELECT Name,Age+1 AS Next FROM People"_s));
    Select(0, 0);
    EXPECT_FALSE(Paste(u"x\t1"_s));
    EXPECT_EQ(All(u"Name"_s), u"P1 P2 P3 P4"_s);
    ASSERT_TRUE(browser.Open(u"SELECT DISTINCT Name FROM People"_s));
    EXPECT_FALSE(Paste(u"x"_s));
    EXPECT_FALSE(commands.Clear());
}

// --- the way back -------------------------------------------------------------------------------------------

TEST_F(Blocks, UndoTakesEditsBackInTheirOrder)
{
    browser.EditText(u"Ann"_s);
    EXPECT_TRUE(browser.Undo()) << "what is pending goes first";
    EXPECT_EQ(browser.Edit().Text(), u"P1"_s);
    browser.EditText(u"Ann"_s);
    ASSERT_TRUE(browser.MoveRows(1));
    browser.EditText(u"Bo"_s);
    ASSERT_TRUE(browser.MoveRows(5));
    EXPECT_TRUE(browser.Undo());
    EXPECT_EQ(browser.SelectedRecord(), 1) << "back where it was";
    EXPECT_EQ(browser.SelectedText(), u"P2"_s);
    EXPECT_TRUE(browser.Undo());
    EXPECT_EQ(All(u"Name"_s), u"P1 P2 P3 P4"_s);
    EXPECT_FALSE(browser.CanUndo());
}

TEST_F(Blocks, UndoFindsTheRecordUnderAnotherFilterAndOrder)
{
    browser.EditText(u"Ann"_s);
    ASSERT_TRUE(browser.WriteEdit());
    ASSERT_TRUE(browser.SortByColumn(Age, SortDirection::Descending));
    EXPECT_TRUE(browser.Undo());
    EXPECT_EQ(browser.SelectedText(), u"P1"_s);
    EXPECT_EQ(browser.Page().At(browser.SelectedRow(), Age).text, u"21"_s);

    browser.EditText(u"Ann"_s);
    ASSERT_TRUE(browser.AddCondition(u"Age>30"_s));
    EXPECT_TRUE(browser.Undo());
    EXPECT_EQ(All(u"Name"_s), u"P1 P2 P3 P4"_s) << "although it is not shown";
}

TEST_F(Blocks, UndoBringsADeletedRecordBackWhole)
{
    ASSERT_TRUE(browser.Open(u"SELECT Age,Name FROM People"_s)); // not all of its fields
    prompt.answers = {true, true};
    browser.EditText(u"77"_s);
    ASSERT_TRUE(browser.DeleteRecord());
    EXPECT_TRUE(browser.Undo());
    EXPECT_EQ(browser.CounterText(), u"1/25"_s) << "where it was";
    EXPECT_EQ(Stored(u"SELECT Note FROM People WHERE Age=77 AND Name='P1' AND Born='2001-07-04'"_s), longNote);
    EXPECT_TRUE(browser.Undo()) << "the edit before it";
    EXPECT_EQ(All(u"Name"_s, u"Age=21"_s), u"P1"_s);
}

TEST_F(Blocks, AreDeletedAsWholeRecordsAndComeBack)
{
    ASSERT_TRUE(browser.SortByColumn(Age, SortDirection::Descending));
    Select(1, Name);
    Extend(3, Age);
    EXPECT_FALSE(browser.DeleteRecord());
    EXPECT_EQ(prompt.questions, QStringList{u"Are you sure you want to delete these 3 records?"_s});
    prompt.answers = {true};
    EXPECT_TRUE(browser.DeleteRecord());
    EXPECT_EQ(browser.CounterText(), u"2/22"_s);
    EXPECT_EQ(All(u"Name"_s, u"Age>40"_s), u"P24"_s);
    EXPECT_TRUE(browser.Undo());
    EXPECT_EQ(All(u"Name"_s, u"Age>40 ORDER BY Age"_s), u"P21 P22 P23 P24"_s);
}

TEST_F(Blocks, UndoTakesANewRecordAwayUnlessItWasFilledInElsewhere)
{
    ASSERT_TRUE(browser.AddRecord());
    EXPECT_TRUE(browser.Undo());
    EXPECT_EQ(browser.CounterText(), u"25/25"_s);
    ASSERT_TRUE(browser.AddRecord());
    Run(u"UPDATE People SET Name='Zoe' WHERE Name IS NULL"_s);
    EXPECT_TRUE(browser.Undo());
    EXPECT_EQ(prompt.shown.size(), 1);
    EXPECT_EQ(All(u"Name"_s, u"Name='Zoe'"_s), u"Zoe"_s);
}

TEST_F(Blocks, UndoLeavesAloneWhatSomebodyElseChanged)
{
    Select(0, Name);
    ASSERT_TRUE(Paste(u"a\nb\nc"_s));
    Run(u"UPDATE People SET Name='mine' WHERE Name='b'"_s);
    Run(u"DELETE FROM People WHERE Name='c'"_s);
    EXPECT_TRUE(browser.Undo());
    EXPECT_EQ(All(u"Name"_s), u"P1 mine P4"_s);
    EXPECT_EQ(prompt.shown, QStringList{u"2 records have been changed or deleted since, and were left as they "
                                        "are."_s});
    EXPECT_FALSE(browser.CanUndo());
}

} // namespace
} // namespace mirel
