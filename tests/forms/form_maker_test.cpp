#include "forms/design/form_maker.h"

#include "form_fixture.h"
#include "forms/default_form.h"
#include "forms/design/expression_desk.h"
#include "forms/design/new_controls.h"
#include "forms/design/properties.h"
#include "forms/form_file.h"
#include "forms/store_bytes.h"
#include "resources/string_table.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QFile>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class FormMakerTest : public FormFixture {
protected:
    FormMakerTest()
        : file_(folder_.filePath(u"forms.raf"_s))
    {
        (void)file_.Save();
    }

    std::unique_ptr<FormMaker> MakerOn(const FormDef& form, FormMaker::Start start)
    {
        return std::make_unique<FormMaker>(form, start, MakerSurroundings{connection_, path_, file_, prompt_});
    }
    std::unique_ptr<FormMaker> NewMaker() { return MakerOn(DefaultForm(), FormMaker::Start::New); }
    FormDef DefaultForm() { return *DefaultFormOf(connection_, path_, u"Birds"_s, prompt_); }
    QStringList StoredNames() const
    {
        FormStore store(file_.Path());
        EXPECT_TRUE(store.Load());
        QStringList names;
        for (const FormDef& form : store.Forms())
            names += form.name.Text();
        return names;
    }

    FormStore file_;
};

// --- saving -------------------------------------------------------------------------------------------------

TEST_F(FormMakerTest, AsksForTheNameAtTheFirstSaveAndReplacesOnlyWhenAllowed)
{
    auto maker = NewMaker();
    EXPECT_TRUE(maker->Design().IsModified());
    EXPECT_FALSE(maker->Save()) << "the name was not given";
    EXPECT_EQ(prompt_.questions, QStringList{u"Save as/Form Name:"_s});
    prompt_.texts = {u"  "_s, u"Birds form"_s};
    EXPECT_FALSE(maker->Save());
    EXPECT_TRUE(maker->Save());
    EXPECT_FALSE(maker->Design().IsModified());
    EXPECT_EQ(StoredNames(), QStringList{u"Birds form"_s});
    prompt_.questions.clear();
    maker->Design().SelectOnly(0);
    maker->Design().MoveBy(1, 1);
    EXPECT_TRUE(maker->Save());
    EXPECT_TRUE(prompt_.questions.isEmpty()) << "it has its name now";

    auto other = NewMaker();
    prompt_.texts = {u"Birds form"_s, u"Birds form"_s};
    prompt_.answers = {false, true};
    EXPECT_FALSE(other->Save());
    EXPECT_EQ(prompt_.questions.last(),
              u"Form \"Birds form\" exists:\r\nDo you want to replace the existing form?"_s);
    EXPECT_TRUE(other->Design().IsModified());
    EXPECT_TRUE(other->Save());
    EXPECT_EQ(StoredNames(), QStringList{u"Birds form"_s});

    maker->Design().MoveBy(5, 5);
    prompt_.answers = {false};
    EXPECT_FALSE(maker->Save()) << "the other one has replaced it meanwhile";
    EXPECT_EQ(prompt_.questions.last(),
              u"The form \"Birds form\" has been changed meanwhile.\r\nReplace it by yours?"_s);
    EXPECT_TRUE(maker->Design().IsModified());
    prompt_.texts = {u"Second"_s};
    EXPECT_TRUE(maker->SaveAs());
    EXPECT_EQ(StoredNames(), QStringList({u"Birds form"_s, u"Second"_s}));
    EXPECT_EQ(maker->StoredName(), u"Second"_s);
}

TEST_F(FormMakerTest, KeepsTheDesignWhereTheStoreCannotBeWritten)
{
    auto maker = NewMaker();
    prompt_.texts = {u"Lost"_s};
    file_ = FormStore(folder_.filePath(u"no/such/folder/forms.raf"_s));
    EXPECT_FALSE(maker->Save());
    EXPECT_FALSE(prompt_.shown.isEmpty());
    EXPECT_TRUE(maker->Design().IsModified());
    EXPECT_EQ(maker->Design().Count(), 12);
    prompt_.texts = {u"Lost"_s};
    prompt_.answers = {true};
    EXPECT_FALSE(maker->MayClose()) << "Yes saves, and a save that fails keeps the form open";
    prompt_.answers = {false};
    EXPECT_TRUE(maker->MayClose()) << "No closes";
    prompt_.cancels = true;
    EXPECT_FALSE(maker->MayClose());
    EXPECT_EQ(prompt_.questions.last(), u"Save changes?"_s);
    file_ = FormStore();
    prompt_.cancels = false;
    prompt_.texts = {u"Lost"_s};
    EXPECT_FALSE(maker->SaveAs());
    EXPECT_EQ(prompt_.shown.last(), StringText(Str::MakerStoreMissing));
}

TEST_F(FormMakerTest, SaysOnceWhatOfTheFormWillBeNothing)
{
    FormDef form = FormBuilder(u"Birds", u"Wrong").Edit(u"A", u"[Nmae]").Edit(u"B", u"Name").form;
    auto maker = MakerOn(form, FormMaker::Start::New);
    ExpressionDesk desk(connection_, path_, {});
    maker->losses = [&desk](const FormDef& design) { return desk.LossesOf(design); };
    prompt_.texts = {u"Wrong"_s, u"Wrong"_s};
    prompt_.answers = {false, true};
    EXPECT_FALSE(maker->Save());
    EXPECT_TRUE(prompt_.questions.last().contains(u"[Nmae]")) << prompt_.questions.last().toStdString();
    EXPECT_FALSE(prompt_.questions.last().contains(u"B:"));
    EXPECT_TRUE(maker->Save());
    const qsizetype asked = prompt_.questions.size();
    EXPECT_TRUE(maker->Save());
    EXPECT_EQ(prompt_.questions.size(), asked);
}

// --- replacing and deleting ---------------------------------------------------------------------------------

TEST_F(FormMakerTest, AsksBeforeControlsGo)
{
    auto maker = NewMaker();
    FormDesign& design = maker->Design();
    const std::vector<std::pair<std::function<bool()>, QString>> commands = {
        {[&] {
             design.SelectOnly(0);
             return maker->DeleteSelected();
         },
         u"Delete this control?"_s},
        {[&] {
             design.SelectAll();
             return maker->DeleteSelected();
         },
         u"Delete these 11 controls?"_s},
        {[&] { return maker->CreateDefaultForm(); }, {}}, // nothing is there now
        {[&] { return maker->CreateDefaultForm(); },
         u"All controls on this form will be deleted.\r\nAre you sure you want to create the default form ?"_s},
        {[&] { return maker->LayOutAllFields(); },
         u"All controls on this form will be deleted.\r\nAre you sure you want to lay out all fields ?"_s},
        {[&] { return maker->MayImport(); },
         u"All controls on this form will be deleted.\r\nAre you sure you want to import a form ?"_s},
        {[&] { return maker->DeleteAll(); }, u"Are you sure you want to delete all controls?"_s},
    };
    for (const auto& [command, question] : commands) {
        const QByteArray before = design.CopySelected();
        const int count = design.Count();
        prompt_.questions.clear();
        if (!question.isEmpty()) {
            EXPECT_FALSE(command()) << question.toStdString();
            EXPECT_EQ(design.Count(), count);
            prompt_.answers = {true};
        }
        EXPECT_TRUE(command()) << question.toStdString();
        EXPECT_EQ(prompt_.questions.value(0), question);
    }
    EXPECT_EQ(design.Count(), 0);
    EXPECT_TRUE(maker->MayImport()) << "an empty surface asks nothing";
}

TEST_F(FormMakerTest, ExportsWhatIsOnTheBoardAndImportsItElsewhere)
{
    auto maker = NewMaker();
    maker->Design().SelectOnly(1);
    maker->Design().MoveBy(3, 4);
    const QString path = folder_.filePath(u"one.pfs"_s);
    ASSERT_TRUE(maker->Export(path));
    EXPECT_FALSE(maker->Export(path)) << "an existing file needs a Yes";
    EXPECT_FALSE(maker->Export(path_)) << "never over the database";
    QString error;
    EXPECT_EQ(ImportForm(path, error)->controls, maker->Design().Form().controls);

    auto other = MakerOn(FormBuilder(u"Other", u"Mine").form, FormMaker::Start::Stored);
    ASSERT_TRUE(other->Import(path));
    EXPECT_EQ(other->Design().Count(), 12);
    EXPECT_EQ(other->Design().Form().name.Text(), u"Mine"_s) << "it stays the form that it is";
    EXPECT_TRUE(other->Design().IsModified());
    const FormDef before = other->Design().Form();
    QFile broken(folder_.filePath(u"broken.pfs"_s));
    ASSERT_TRUE(broken.open(QIODevice::WriteOnly));
    broken.write("no form");
    broken.close();
    EXPECT_FALSE(other->Import(broken.fileName()));
    EXPECT_EQ(other->Design().Form(), before);
}

TEST_F(FormMakerTest, LaysOutEveryFieldWithinTheForm)
{
    auto maker = MakerOn(FormBuilder(u"Birds", u"All").form, FormMaker::Start::Stored);
    ASSERT_TRUE(maker->LayOutAllFields());
    const FormDef& form = maker->Design().Form();
    QStringList bound;
    for (const ControlDef& control : form.controls) {
        EXPECT_GE(control.left, 0);
        EXPECT_LE(control.left + control.width, form.width) << control.name.Text().toStdString();
        EXPECT_LE(control.top + control.height, form.height);
        if (control.fieldBound != 0)
            bound += control.name.Text();
    }
    EXPECT_EQ(bound, QStringList({u"ID"_s, u"Name"_s, u"Price"_s, u"Seen"_s, u"Wild"_s, u"Notes"_s, u"Small"_s}));
    EXPECT_TRUE(ExpressionDesk(connection_, path_, {}).LossesOf(form).isEmpty());
    ASSERT_TRUE(maker->Design().CanUndo());
}

// --- property sheets ----------------------------------------------------------------------------------------

QByteArray BytesOf(const ControlDef& control)
{
    FormStore::Content content;
    content.forms.emplace_back().AddControl(control);
    return WriteStore(content);
}

// A record in which no byte is as a new one has it.
ControlDef OddControl(ControlType type)
{
    ControlDef control;
    control.type = type;
    control.controlId = 77;
    control.fieldBound = 5;
    control.hasSource = 9;
    control.editKind = EditKind(3);
    control.sourceScope = SourceScope(8);
    control.left = 11;
    control.top = 12;
    control.width = 13;
    control.height = 14;
    control.windowStyle = 0x7A5B3C1D;
    control.lines = 15;
    control.buttonFunction = ButtonFunction(4);
    control.backgroundColor = 0x01020304;
    control.textStyle.bold = 0x100;
    control.name.Set(u"odd");
    control.defaultValue.Set(u"value");
    control.option1 = 200;
    control.option2 = 100;
    control.reserved = {1, 2, 3, 4, 5, 6, 7, 8};
    control.padding = {9, 9};
    control.SetSource(u"a\u0002b\u0003\u0005T.F\u0005\u0006&x\u0006tail\u0008data");
    return control;
}

TEST(Properties, WritingWhatWasReadChangesNoByte)
{
    for (const int type : {200, 201, 202, 203, 204, 205, 0, 999}) {
        const ControlDef odd = OddControl(ControlType(type));
        for (const ControlProperty& row : ControlProperties()) {
            ControlDef written = odd;
            if (IsShown(row, odd))
                row.write(written, row.read(odd));
            EXPECT_EQ(BytesOf(written), BytesOf(odd)) << type << ' ' << StringText(row.def.caption).toStdString();
        }
    }
}

TEST(Properties, EachWritesItsOwnFieldAlone)
{
    struct Case {
        Str caption;
        ControlType type;
        QString value;
        std::function<void(ControlDef&)> expected;
    };
    const QString odd = OddControl(ControlType::List).source.Text();
    const std::vector<Case> cases = {
        {Str::PropBorder, ControlType::EditBox, u"0"_s, [](ControlDef& c) { c.windowStyle &= ~0x00800000U; }},
        {Str::PropVerticalScroll, ControlType::EditBox, u"1"_s,
         [](ControlDef& c) { c.windowStyle |= 0x00200000; }},
        {Str::PropAutoScroll, ControlType::EditBox, u"1"_s, [](ControlDef& c) { c.windowStyle |= 0x80; }},
        {Str::PropAlign, ControlType::Label, u"2"_s, [](ControlDef& c) { c.windowStyle = 0x7A5B3C1E; }},
        {Str::PropEditKind, ControlType::EditBox, u"5"_s,
         [](ControlDef& c) { c.editKind = EditKind::DatePicker; }},
        {Str::PropScope, ControlType::EditBox, u"2"_s,
         [](ControlDef& c) { c.sourceScope = SourceScope::WholeResult; }},
        {Str::PropHasSource, ControlType::EditBox, u"0"_s, [](ControlDef& c) { c.hasSource = 0; }},
        {Str::PropLeft, ControlType::Button, u"-4"_s, [](ControlDef& c) { c.left = -4; }},
        {Str::PropLeft, ControlType::Button, u"no"_s, [](ControlDef&) {}},
        {Str::PropGround, ControlType::Button, u"4294967295"_s,
         [](ControlDef& c) { c.backgroundColor = kDefaultColor; }},
        {Str::PropItems, ControlType::DropDownBox, u"x;y"_s,
         [&](ControlDef& c) {
             c.hasSource = 1;
             c.SetSource(odd.section(QChar(8), 0, 0) + QChar(8) + u"x;y"_s);
         }},
        {Str::PropFromQuery, ControlType::DropDownBox, u"0"_s,
         [](ControlDef& c) {
             c.hasSource = 1;
             c.SetSource(u"data");
         }},
        {Str::PropFunction, ControlType::Button, u"14"_s,
         [](ControlDef& c) { c.buttonFunction = ButtonFunction::UpdateAll; }}, // the assignments stay
        {Str::PropFunction, ControlType::Button, u"12"_s,
         [](ControlDef& c) {
             c.buttonFunction = ButtonFunction::Recalc;
             c.hasSource = 0;
             c.option1 = c.option2 = 0;
             c.ClearSource();
         }},
    };
    for (const Case& each : cases) {
        ControlDef written = OddControl(each.type);
        ControlDef expected = written;
        each.expected(expected);
        for (const ControlProperty& row : ControlProperties()) {
            if (row.def.caption == each.caption && IsShown(row, written)) {
                row.write(written, each.value);
                break;
            }
        }
        EXPECT_EQ(BytesOf(written), BytesOf(expected)) << StringText(each.caption).toStdString();
    }
}

TEST(Properties, AnUnknownNumberHasAnEntryAndStays)
{
    for (const ControlProperty& row : ControlProperties()) {
        if (row.def.kind == PropertyKind::Choice) {
            EXPECT_EQ(ChoiceText(row.def, 4711), u"Other (4711)"_s);
        }
    }
    ControlDef button;
    button.type = ControlType::Button;
    button.buttonFunction = ButtonFunction::Select;
    const auto select = std::ranges::find_if(
        ControlProperties(), [](const ControlProperty& row) { return row.def.caption == Str::PropSelectText; });
    for (const auto& [typed, stored, shown] :
         {std::tuple(u"FROM T"_s, u"SELECT * FROM T"_s, u"FROM T"_s),
          std::tuple(u"select A FROM T"_s, u"select A FROM T"_s, u"select A FROM T"_s)}) {
        select->write(button, typed);
        EXPECT_EQ(button.source.Text(), stored);
        EXPECT_EQ(select->read(button), shown);
        EXPECT_EQ(button.hasSource, 1);
    }
}

// --- the expression desk ------------------------------------------------------------------------------------

using DeskTest = FormMakerTest;

TEST_F(DeskTest, GivesTheValueOnTheRecordAndWhatIsWrong)
{
    ExpressionDesk desk(connection_, path_, {});
    desk.Open(u"Birds"_s);
    const FormDef form = FormBuilder(u"Birds").Edit(u"Shown", u"UPPER(Name)").form;
    using S = DeskAnswer::State;
    struct Case {
        const char* what;
        DeskQuestion question;
        S state;
        QString value;
        QString loss; // a part of it; empty: none
    };
    for (const Case& each : {
             Case{"a field", {.text = u"Name"_s}, S::Value, u"Osprey"_s, {}},
             Case{"another control's text", {.text = u"&Shown+'!'"_s}, S::Value, u"OSPREY!"_s, {}},
             Case{"a sum", {.text = u"SUM(Price)+' EUR'"_s, .overAll = true}, S::Value, u"13.75 EUR"_s, {}},
             Case{"a sum per record", {.text = u"SUM(Price)"_s}, S::Null, {}, u"SUM"_s},
             Case{"a sum in a list",
                  {.text = u"SUM(Price)"_s, .mode = ExprMode::Value, .isColumn = true},
                  S::Null,
                  {},
                  u"list"_s},
             Case{"a tick", {.text = u"WHERE Birds.Wild=1"_s, .ticks = true}, S::Value, u"1"_s, {}},
             Case{"an unknown name", {.text = u"[Nmae]"_s}, S::Value, {}, u"Nmae"_s},
             Case{"an unknown control", {.text = u"&Nobody"_s}, S::Value, {}, u"Nobody"_s},
             Case{"a surplus operand", {.text = u"LENGTH(Name) 'x'"_s}, S::Value, {}, u"left out"_s},
             Case{"nothing", {.text = {}}, S::Nothing, {}, {}},
         }) {
        const DeskAnswer answer = desk.Read(each.question, form);
        EXPECT_EQ(int(answer.state), int(each.state)) << each.what;
        if (!each.value.isEmpty()) {
            EXPECT_EQ(answer.value, each.value) << each.what;
        }
        EXPECT_EQ(answer.losses.isEmpty(), each.loss.isEmpty())
            << each.what << answer.losses.join(u'|').toStdString();
        EXPECT_TRUE(answer.losses.join(u'|').contains(each.loss))
            << each.what << answer.losses.join(u'|').toStdString();
    }
    desk.GoTo(2);
    const DeskAnswer null = desk.Read({.text = u"Price*2"_s}, form);
    EXPECT_EQ(int(null.state), int(S::Null));
    EXPECT_TRUE(null.losses.isEmpty()) << "that is the record's, not the expression's";
    EXPECT_FALSE(null.reasons.isEmpty());
    EXPECT_EQ(desk.ValueOn(1, {.text = u"Name"_s}, form), u"Gull"_s);
    EXPECT_EQ(desk.Record(), 2) << "looking at a neighbor moves nothing";
    desk.Open(u"No such table"_s);
    EXPECT_EQ(int(desk.Read({.text = u"Name"_s}, form).state), int(S::NoResult));
}

TEST_F(DeskTest, NamesCirclesAndTargetsThatDoNotExist)
{
    const FormDef form =
        FormBuilder(u"Birds")
            .Edit(u"A", u"&B+1")
            .Edit(u"B", u"&C+1")
            .Edit(u"C", u"&A+1")
            .Edit(u"Self", u"&Self")
            .Edit(u"Fine", u"&A")
            .Button(u"Save", ButtonFunction::Update,
                    {{u"Birds.Nmae"_s, u"&Fine"_s}, {u"Name"_s, u"&Fine"_s}, {u"Other.X"_s, u"1"_s}})
            .form;
    EXPECT_EQ(CirclesOf(form), QStringList({u"A → B → C → A"_s, u"Self → Self"_s}));
    const QString losses = ExpressionDesk(connection_, path_, {}).LossesOf(form).join(u'\n');
    EXPECT_TRUE(losses.contains(u"Nmae")) << losses.toStdString();
    EXPECT_EQ(losses.count(u"does nothing"), 1) << losses.toStdString();
}

TEST_F(DeskTest, TellsTheTreeInWords)
{
    ExpressionDesk desk(connection_, path_, {});
    desk.Open(u"Birds"_s);
    const DeskAnswer answer = desk.Read({.text = u"SUM(Price)+LEFT('abc',2)"_s, .overAll = true}, {});
    EXPECT_EQ(answer.meaning, QStringList({u"added or joined:"_s, u"    the sum over all records of:"_s,
                                           u"        the field Price"_s, u"    LEFT of:"_s,
                                           u"        the text 'abc'"_s, u"        the number 2"_s}));
}

} // namespace
} // namespace mirel
