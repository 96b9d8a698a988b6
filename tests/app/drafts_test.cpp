#include "app/draft_check.h"
#include "app/drafts.h"
#include "forms/running_form.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"
#include "tableview/record_browser.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

Draft SomeDraft(const QString& database = u"/shop.cdb"_s, const QString& text = u"Wren"_s)
{
    return {database,
            u"20260101000000"_s,
            {EntryKind::Table, u"Birds"_s},
            {.statement = u"SELECT * FROM Birds"_s,
             .record = RecordId(QByteArray("\1\0\0\0\0\0\0\0", 8)),
             .fingerprint = "ab",
             .texts = {{0, u"Name"_s, text}}}};
}

TEST(DraftsFile, GivesBackWhatWasPutIn)
{
    Draft form = SomeDraft();
    form.view = {EntryKind::Form, u"a:b \"c\""_s};
    form.typed.record = {};
    form.typed.texts = {{0, u"Seen"_s, u"1"_s, true}, {7, u"Näme"_s, QString(u"two\nlines\0\t🐦"_s), false}};
    const std::vector<Draft> drafts{SomeDraft(), form};
    const DraftsRead read = ReadDraftsFile(DraftsFile(drafts));
    EXPECT_EQ(read.outcome, DraftsRead::Outcome::Read);
    EXPECT_TRUE(read.drafts == drafts);
}

TEST(DraftsFile, CutShortAnywhereItIsDamagedAndNeverAnotherText)
{
    const QByteArray whole = DraftsFile({SomeDraft()});
    for (qsizetype length = 0; length < whole.size(); ++length) {
        const DraftsRead read = ReadDraftsFile(whole.first(length));
        EXPECT_EQ(read.outcome, DraftsRead::Outcome::Damaged) << length;
        EXPECT_TRUE(read.drafts.empty()) << length;
    }
    QByteArray newer = whole;
    EXPECT_EQ(ReadDraftsFile(newer.replace("\"version\":1", "\"version\":2")).outcome, DraftsRead::Outcome::Newer);
}

class DraftsTest : public ::testing::Test {
protected:
    QStringList Files() const
    {
        return QDir(folder_.filePath(u"Drafts"_s)).entryList({u"*.drafts*"_s}, QDir::Files);
    }
    QString Folder() const { return folder_.filePath(u"Drafts"_s); }
    void Write(const QString& name, const QByteArray& bytes)
    {
        QDir().mkpath(Folder());
        QFile file(Folder() + u'/' + name);
        ASSERT_TRUE(file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size());
    }

    QTemporaryDir folder_;
};

TEST_F(DraftsTest, OfALivingProgramAreItsOwn)
{
    Drafts one(Folder());
    Drafts other(Folder());
    ASSERT_TRUE(one.Keep({SomeDraft()}));
    ASSERT_TRUE(other.Keep({SomeDraft(u"/shop.cdb"_s, u"Owl"_s)}));
    EXPECT_EQ(Files().size(), 2) << "neither writes over the other";
    other.TakeLeft(u"/shop.cdb"_s);
    EXPECT_TRUE(other.Left().empty());
    EXPECT_TRUE(one.Keep({}));
    EXPECT_TRUE(other.Keep({}));
    EXPECT_TRUE(QDir(Folder()).entryList(QDir::Files).isEmpty()) << "nothing is left of them";
}

TEST_F(DraftsTest, OfADeadOneAreOfferedOnceAtATimeAndUntilTheyAreDropped)
{
    (void)Drafts(Folder()).Keep({SomeDraft(), SomeDraft(u"/other.cdb"_s)});
    Drafts next(Folder());
    next.TakeLeft(u"/shop.cdb"_s);
    ASSERT_EQ(next.Left().size(), 1U);
    EXPECT_TRUE(next.Left().front() == SomeDraft());
    Drafts third(Folder());
    third.TakeLeft(u"/shop.cdb"_s);
    EXPECT_TRUE(third.Left().empty()) << "it is being asked about elsewhere";
    next.GiveBack();
    third.TakeLeft(u"/shop.cdb"_s);
    ASSERT_EQ(third.Left().size(), 1U);
    EXPECT_TRUE(third.DropLeft(0));
    third.GiveBack();
    next.TakeLeft(u"/shop.cdb"_s);
    EXPECT_TRUE(next.Left().empty());
    next.TakeLeft(u"/other.cdb"_s);
    ASSERT_EQ(next.Left().size(), 1U) << "the other database's stayed";
    EXPECT_TRUE(next.DropLeft(0));
    EXPECT_TRUE(QDir(Folder()).entryList(QDir::Files).isEmpty());
}

TEST_F(DraftsTest, WhatCannotBeReadIsSetAsideAndWhatALaterVersionWroteIsLeftAlone)
{
    Write(u"1-a.drafts"_s, "{\"version\":1,");
    Write(u"2-b.drafts"_s, "{\"version\":9,\"drafts\":{}}");
    Drafts drafts(Folder());
    drafts.TakeLeft(u"/shop.cdb"_s);
    EXPECT_TRUE(drafts.Left().empty());
    EXPECT_EQ(drafts.Damaged(), QStringList{Folder() + u"/1-a.drafts.damaged"_s});
    EXPECT_EQ(Files(), QStringList({u"1-a.drafts.damaged"_s, u"2-b.drafts"_s}));
    drafts.TakeLeft(u"/shop.cdb"_s);
    EXPECT_TRUE(drafts.Damaged().isEmpty()) << "told once";
}

TEST_F(DraftsTest, WhereNothingCanBeWrittenKeepingFailsAndNamesThePlace)
{
    Write(u"file"_s, "x");
    Drafts drafts(Folder() + u"/file/Drafts"_s);
    EXPECT_FALSE(drafts.Keep({SomeDraft()}));
    EXPECT_TRUE(drafts.FaultyPath().endsWith(u"file/Drafts"_s));
    drafts.TakeLeft(u"/shop.cdb"_s);
    EXPECT_TRUE(drafts.Left().empty());
}

// --- of records -----------------------------------------------------------------------------------------------

class DraftRecordTest : public ::testing::Test, protected FormHost {
protected:
    DraftRecordTest()
    {
        EXPECT_TRUE(session_.Create(folder_.filePath(u"shop.cdb"_s)));
        EXPECT_TRUE(Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40),[Wings] SmallInt,[Seen] Bit)"_s));
        for (const QString& name : {u"Wren"_s, u"Owl"_s, u"Robin"_s})
            EXPECT_TRUE(Execute(u"INSERT INTO Birds (Name,Wings,Seen) VALUES ('%1',2,TRUE)"_s.arg(name)));
        FormDef form;
        form.SetName(u"Bird form");
        form.SetTableName(u"Birds");
        AddControl(form, ControlType::EditBox, u"NameBox", u"Birds.Name");
        AddControl(form, ControlType::CheckBox, u"SeenBox", u"Birds.Seen");
        session_.Store().AddForm(form);
        EXPECT_TRUE(browser_.Open(kStatement));
    }

    static void AddControl(FormDef& form, ControlType type, QStringView name, QStringView source)
    {
        ControlDef control;
        control.type = type;
        control.name.Set(name);
        control.hasSource = 1;
        control.SetSource(source.toString());
        form.AddControl(control);
    }
    bool Execute(const QString& statement)
    {
        return session_.GetCatalog().ExecuteStatement(session_.Location(), statement);
    }
    Draft OfCell(RecordBrowser& browser) { return Of({EntryKind::Table, u"Birds"_s}, browser.Draft()); }
    Draft Of(const ViewKey& view, const std::optional<RecordDraft>& typed)
    {
        EXPECT_TRUE(typed);
        return {session_.Location().Text(), session_.Stamp(), view, typed.value_or(RecordDraft())};
    }
    std::unique_ptr<RunningForm> RunForm()
    {
        FormCall call;
        call.form.CopyFrom(*session_.Store().FindForm(u"Bird form"));
        auto form = std::make_unique<RunningForm>(std::move(call), FormEnvironment{.connection = connection_,
                                                                                   .database = session_.Location(),
                                                                                   .store = session_.Store(),
                                                                                   .prompt = prompt_,
                                                                                   .host = *this,
                                                                                   .settings = {},
                                                                                   .activeTable = {}});
        EXPECT_TRUE(form->Open());
        return form;
    }
    void CallForm(const FormCall&) override {}
    void CloseForm() override {}
    void DataChanged() override {}

    const QString kStatement = u"SELECT * FROM Birds"_s;
    QTemporaryDir folder_;
    ScriptedPrompt prompt_;
    DbConnection connection_;
    DatabaseSession session_{connection_, ProgramFolder{folder_.path()}, prompt_};
    RecordBrowser browser_{connection_, folder_.filePath(u"shop.cdb"_s), prompt_, {}};
};

TEST_F(DraftRecordTest, ACellsTextGoesBackIntoThatCellAndNotIntoTheDatabase)
{
    struct Row {
        const char* what;
        QString order; // in which the grid shows the records when it is put back
        int field;
        QString text;
    };
    for (const Row& row :
         {Row{"as it was", u"Name"_s, 0, u"Jenny wren"_s}, Row{"an empty text", u"Name"_s, 0, u""_s},
          Row{"another order", u"Name DESC"_s, 1, u"4"_s}}) {
        ASSERT_TRUE(browser_.SortByTerms(u"Name"_s));
        ASSERT_TRUE(browser_.GoToCell(1, row.field)); // Robin
        browser_.EditText(row.text);
        const Draft draft = OfCell(browser_);
        browser_.RevertEdit();
        EXPECT_FALSE(browser_.Draft());
        EXPECT_EQ(StateOf(draft, session_), DraftState::Fits) << row.what;

        RecordBrowser next(connection_, session_.Location(), prompt_, {});
        ASSERT_TRUE(next.Open(kStatement + u" ORDER BY "_s + row.order));
        EXPECT_TRUE(next.PutBack(draft.typed)) << row.what;
        EXPECT_TRUE(next.HasPendingEdit());
        EXPECT_EQ(next.SelectedField(), row.field);
        EXPECT_EQ(next.SelectedText(), row.text);
        EXPECT_EQ(next.Recordset().FieldValue(0).ToText(), u"Robin"_s) << "the record is as it was";
        EXPECT_FALSE(next.PutBack(draft.typed)) << "something is pending";
        next.RevertEdit();
    }
}

TEST_F(DraftRecordTest, ATickComesBackAsATick)
{
    ASSERT_TRUE(browser_.GoToCell(2, 2));
    browser_.EditChecked(false);
    const Draft draft = OfCell(browser_);
    browser_.RevertEdit();
    EXPECT_TRUE(browser_.PutBack(draft.typed));
    EXPECT_FALSE(browser_.Edit().IsChecked());
    EXPECT_TRUE(browser_.HasPendingEdit());
}

TEST_F(DraftRecordTest, IsPutBackIntoNoOtherRecordThanItsOwn)
{
    struct Row {
        const char* what;
        QStringList meanwhile;
        DraftState state;
    };
    for (const Row& row :
         {Row{"another record changed", {u"UPDATE Birds SET Wings=3 WHERE Name='Owl'"_s}, DraftState::Fits},
          Row{"another field changed", {u"UPDATE Birds SET Wings=5 WHERE Name='Robin'"_s}, DraftState::Changed},
          Row{"it was saved", {u"UPDATE Birds SET Name='typed' WHERE Name='Robin'"_s}, DraftState::Saved},
          Row{"deleted", {u"DELETE FROM Birds WHERE Name='Robin' OR Name='typed'"_s}, DraftState::Gone},
          Row{"its key used again",
              {u"DELETE FROM Birds WHERE Name='Robin'"_s, u"INSERT INTO Birds (Name,Wings) VALUES ('Kite',2)"_s},
              DraftState::Changed},
          Row{"a field more", {u"ALTER TABLE Birds ADD Note Text"_s}, DraftState::Changed},
          Row{"the table gone", {u"DROP TABLE Birds"_s}, DraftState::NoView}}) {
        ASSERT_TRUE(Execute(u"DROP TABLE Birds"_s)) << row.what;
        ASSERT_TRUE(Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40),[Wings] SmallInt)"_s));
        ASSERT_TRUE(Execute(u"INSERT INTO Birds (Name,Wings) VALUES ('Owl',2)"_s));
        ASSERT_TRUE(Execute(u"INSERT INTO Birds (Name,Wings) VALUES ('Robin',2)"_s));
        ASSERT_TRUE(browser_.Open(kStatement));
        ASSERT_TRUE(browser_.GoToCell(1, 0));
        browser_.EditText(u"typed"_s);
        const Draft draft = OfCell(browser_);
        browser_.RevertEdit();
        browser_.Close();
        for (const QString& statement : row.meanwhile)
            ASSERT_TRUE(Execute(statement)) << row.what;
        EXPECT_EQ(StateOf(draft, session_), row.state) << row.what;
        if (row.state == DraftState::NoView) {
            ASSERT_TRUE(Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40))"_s));
            continue;
        }
        RecordBrowser next(connection_, session_.Location(), prompt_, {});
        ASSERT_TRUE(next.Open(kStatement));
        EXPECT_EQ(next.PutBack(draft.typed), row.state == DraftState::Fits) << row.what;
        EXPECT_EQ(next.HasPendingEdit(), row.state == DraftState::Fits) << row.what;
        next.RevertEdit();
        next.Close();
    }
}

TEST_F(DraftRecordTest, OfADatabaseThatWasReplacedIsNotPutBackAndNothingInADraftRuns)
{
    ASSERT_TRUE(browser_.GoToCell(0, 0));
    browser_.EditText(u"typed"_s);
    Draft draft = OfCell(browser_);
    browser_.RevertEdit();
    draft.stamp = u"20010101000000"_s;
    EXPECT_EQ(StateOf(draft, session_), DraftState::OtherDatabase);
    draft.stamp = session_.Stamp();
    draft.typed.statement = u"DELETE FROM Birds"_s;
    EXPECT_EQ(StateOf(draft, session_), DraftState::NoView);
    draft.typed.statement = kStatement;
    draft.typed.record = RecordId("too short");
    EXPECT_EQ(StateOf(draft, session_), DraftState::Gone);
    EXPECT_TRUE(prompt_.shown.isEmpty()) << "looking tells nothing";
}

TEST_F(DraftRecordTest, AFormsTextsGoBackIntoTheSameControls)
{
    const std::unique_ptr<RunningForm> form = RunForm();
    EXPECT_FALSE(form->Draft());
    ASSERT_EQ(form->GoToRecord(1), RunningForm::Outcome::Done);
    form->SetText(0, u"Tawny owl"_s);
    form->SetTicked(1, false);
    const Draft draft = Of({EntryKind::Form, u"Bird form"_s}, form->Draft());
    EXPECT_EQ(draft.typed.texts.size(), 2U);
    EXPECT_EQ(StateOf(draft, session_), DraftState::Fits);

    const std::unique_ptr<RunningForm> next = RunForm();
    EXPECT_TRUE(next->PutBack(draft.typed));
    EXPECT_EQ(next->CurrentRecord(), 1);
    EXPECT_TRUE(next->IsDirty());
    EXPECT_EQ(next->ShownText(0), u"Tawny owl"_s);
    EXPECT_EQ(next->ShownText(1), u"0"_s);
    EXPECT_FALSE(next->PutBack(draft.typed)) << "something else is typed";

    ASSERT_TRUE(Execute(u"UPDATE Birds SET Wings=9 WHERE Name='Owl'"_s));
    EXPECT_EQ(StateOf(draft, session_), DraftState::Changed);
    const std::unique_ptr<RunningForm> third = RunForm();
    EXPECT_FALSE(third->PutBack(draft.typed));
    EXPECT_FALSE(third->IsDirty());
}

TEST_F(DraftRecordTest, WhatWasTypedWithoutARecordGoesBackWhereThereIsNone)
{
    ASSERT_TRUE(Execute(u"DELETE FROM Birds WHERE Wings=2"_s));
    const std::unique_ptr<RunningForm> form = RunForm();
    form->SetText(0, u"Heron"_s);
    const Draft draft = Of({EntryKind::Form, u"Bird form"_s}, form->Draft());
    EXPECT_TRUE(draft.typed.record.IsNull());
    EXPECT_EQ(StateOf(draft, session_), DraftState::Fits);
    const std::unique_ptr<RunningForm> next = RunForm();
    EXPECT_TRUE(next->PutBack(draft.typed));
    EXPECT_EQ(next->ShownText(0), u"Heron"_s);

    ASSERT_TRUE(Execute(u"INSERT INTO Birds (Name,Wings) VALUES ('Kite',2)"_s));
    EXPECT_EQ(StateOf(draft, session_), DraftState::Gone) << "there is a record now: it is another one's";
}

} // namespace
} // namespace mirel
