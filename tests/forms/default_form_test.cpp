#include "forms/default_form.h"

#include "forms/control_source.h"
#include "forms/form_file.h"
#include "support/test_database.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

std::vector<ResultField> Fields(std::initializer_list<std::pair<const char16_t*, FieldType>> fields)
{
    std::vector<ResultField> made;
    for (const auto& [name, type] : fields)
        made.push_back({QString::fromUtf16(name), type, -1, {}, {}});
    return made;
}

const ControlDef* Find(const FormDef& form, QStringView name)
{
    for (const ControlDef& control : form.controls) {
        if (control.name == name)
            return &control;
    }
    return nullptr;
}

TEST(DefaultForm, ShowsAndSavesTheFirstFiveFields)
{
    const auto fields = Fields({{u"ID", FieldType::Integer},
                                {u"Ship To", FieldType::Text},
                                {u"Due", FieldType::Date},
                                {u"Paid", FieldType::YesNo},
                                {u"Remark", FieldType::Memo},
                                {u"Price", FieldType::Double},
                                {u"Last", FieldType::Text}});
    const FormDef form = MakeDefaultForm(u"My Orders"_s, fields);
    ASSERT_EQ(form.controls.size(), 12U);
    EXPECT_EQ(form.name.Text(), u"DefaultForm"_s);
    EXPECT_EQ(form.tableName.Text(), u"My Orders"_s);
    EXPECT_EQ(form.defaultQuery.Text(), u"SELECT * FROM [My Orders]"_s);
    EXPECT_EQ(form.defaultQueryOnStartup, 1);
    EXPECT_EQ(form.counterA, 5);
    EXPECT_EQ(form.counterB, 5);
    for (size_t i = 0; i < form.controls.size(); ++i)
        EXPECT_EQ(form.controls[i].controlId, qint32(i));

    const std::vector<SourceAssignment> saved = SplitAssignments(form.controls.back().source.Text());
    ASSERT_EQ(saved.size(), 5U);
    EXPECT_EQ(saved[1], (SourceAssignment{u"[My Orders].[Ship To]"_s, u"&[Ship To]"_s}));
    EXPECT_EQ(saved[4], (SourceAssignment{u"[My Orders].Remark"_s, u"&Remark"_s}));
}

// left, top, width, height of a nine-point form: W 5, H 12, so a character of a name takes 4 pixels.
TEST(DefaultForm, LaysControlsOutByTheirTypes)
{
    const auto fields = Fields({{u"ID", FieldType::Integer},
                                {u"Name", FieldType::Text},
                                {u"Due", FieldType::Date},
                                {u"Paid", FieldType::YesNo},
                                {u"Remarks", FieldType::Memo}});
    const FormDef form = MakeDefaultForm(u"T"_s, fields);
    const struct {
        const char16_t* name;
        std::array<int, 4> place;
        ControlType type;
        EditKind kind;
        int lines;
        quint32 style;
    } rows[] = {{u"rec_counter", {155, 2, 80, 12}, ControlType::EditBox, EditKind::Plain, -1, 0x50811086},
                {u"ID:", {5, 17, 32, 12}, ControlType::Label, EditKind::Plain, -1, 0x50000002},
                {u"ID", {42, 17, 83, 12}, ControlType::EditBox, EditKind::Plain, -1, 0x50811086},
                {u"Name", {42, 32, 193, 12}, ControlType::EditBox, EditKind::Plain, -1, 0x50811086},
                {u"Due", {42, 47, 87, 12}, ControlType::EditBox, EditKind::DatePicker, -1, 0x50811086},
                {u"Paid", {42, 62, 16, 16}, ControlType::CheckBox, EditKind::Plain, -1, 0x50010003},
                {u"Remarks", {42, 77, 193, 12}, ControlType::EditBox, EditKind::Extendable, 5, 0x50811086},
                {u"SAVE", {42, 92, 30, 12}, ControlType::Button, EditKind::Plain, -1, 0x50010000}};
    for (const auto& row : rows) {
        const QString name = QString::fromUtf16(row.name);
        const ControlDef* control = Find(form, name);
        ASSERT_TRUE(control) << name.toStdString();
        const std::array<int, 4> place = {control->left, control->top, control->width, control->height};
        EXPECT_EQ(place, row.place) << name.toStdString();
        EXPECT_EQ(control->type, row.type) << name.toStdString();
        EXPECT_EQ(control->editKind, row.kind) << name.toStdString();
        EXPECT_EQ(control->lines, row.lines) << name.toStdString();
        EXPECT_EQ(control->windowStyle, row.style) << name.toStdString();
    }
    EXPECT_EQ(form.width, 235 + 2 * 3 + 5);
    EXPECT_EQ(form.height, 18 + 3 + 92 + 12 + 2);
}

TEST(DefaultForm, LeavesRoomForValuesBesideLongNames)
{
    const FormDef form = MakeDefaultForm(u"T"_s, Fields({{u"a", FieldType::Text}}));
    const QString longName(60, u'n');
    const FormDef cut = MakeDefaultForm(u"T"_s, std::vector{ResultField{longName, FieldType::Text, 20, {}, {}}});
    EXPECT_EQ(form.controls[1].width, 8);
    EXPECT_EQ(cut.controls[2].left + cut.controls[2].width, 235);
    EXPECT_EQ(cut.controls[2].width, 60);
    // A name that is cut in the control is cut in the reference to it, or saving would not find it.
    const QString value = SplitAssignments(cut.controls.back().source.Text()).front().value;
    EXPECT_EQ(value, u'&' + cut.controls[2].name.Text());
}

TEST(DefaultForm, TakesANameThatIsFree)
{
    FormStore store;
    EXPECT_EQ(FreeFormName(store, u"F"_s), u"F"_s);
    for (const QStringView taken : {u"F", u"F2", u"F4"}) {
        FormDef form;
        form.SetName(taken);
        store.AddForm(form);
    }
    EXPECT_EQ(FreeFormName(store, u"F"_s), u"F3"_s);
}

TEST(FormFile, CarriesOneForm)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(u"a.pfs"_s);
    QString error;
    FormDef form = MakeDefaultForm(u"T"_s, Fields({{u"A", FieldType::Integer}}));
    form.formTag = 7;
    ASSERT_TRUE(ExportForm(form, path, error));
    EXPECT_EQ(ImportForm(path, error), form);

    EXPECT_FALSE(ExportForm(form, folder.filePath(u"none/a.pfs"_s), error));
    EXPECT_FALSE(error.isEmpty());
    error.clear();
    FormStore empty(folder.filePath(u"empty.pfs"_s));
    ASSERT_TRUE(empty.Save());
    for (const QString& file : {folder.filePath(u"empty.pfs"_s), folder.filePath(u"missing.pfs"_s)}) {
        EXPECT_FALSE(ImportForm(file, error));
        EXPECT_TRUE(error.contains(file)) << error.toStdString();
    }
}

} // namespace
} // namespace mirel
