#include "forms/default_form.h"

#include "data/catalog.h"
#include "data/db_recordset.h"
#include "data/provider_error.h"
#include "forms/control_source.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// What the form is laid out by, in pixels. The handheld took these from its screen and its default font.
struct Measures {
    int pointSize = 9; // of the default font
    int characterWidth = 5;
    int characterHeight = 12;
    int surfaceWidth = 235;
    int frameWidth = 3; // of a dialog
    int frameHeight = 3;
    int captionHeight = 18;
    int labelLeft = 5;
    int columnGap = 10;
    int rowGap = 3;
    int firstRowGap = 5;
    int counterTop = 2;
    int counterCharacters = 20;
    int checkBoxSize = 16;
    int extendableLines = 5;
    int leastValueWidth = 60; // where the labels would leave none
    int margin = 5;           // right of the rightmost control
    int bottomMargin = 2;
};
constexpr Measures kMeasures;
constexpr size_t kMaxRows = 5; // more do not fit onto the handheld's screen

constexpr quint32 kLabelStyle = 0x50000002;
constexpr quint32 kEditStyle = 0x50811086;
constexpr quint32 kCheckStyle = 0x50010003;
constexpr quint32 kButtonStyle = 0x50010000;

class DefaultFormMaker {
public:
    DefaultFormMaker(const QString& table, std::span<const ResultField> fields, const TextStyle& style)
        : table_(FieldReference(table))
        , fields_(fields)
    {
        form_.SetName(u"DefaultForm");
        form_.SetTableName(table);
        form_.textStyle = style;
        form_.SetDefaultQuery(u"SELECT * FROM "_s + table_);
        form_.defaultQueryOnStartup = 1;
        const int pointSize = style.pointSize > 0 ? std::min(style.pointSize, 1000) : kMeasures.pointSize;
        characterWidth_ = kMeasures.characterWidth * pointSize / kMeasures.pointSize;
        height_ = kMeasures.characterHeight * pointSize / kMeasures.pointSize;
        grid_ = 2 * characterWidth_ / 3 + 1;
        LayOutColumns();
    }

    FormDef Make()
    {
        AddCounter();
        int top = height_ + kMeasures.firstRowGap;
        for (const ResultField& field : fields_.first(std::min(fields_.size(), kMaxRows))) {
            AddRow(field, top);
            top += height_ + kMeasures.rowGap;
        }
        AddSaveButton(top);
        int right = 0;
        for (const ControlDef& control : form_.controls)
            right = std::max(right, control.left + control.width);
        form_.width = right + 2 * kMeasures.frameWidth + kMeasures.margin;
        form_.height = kMeasures.captionHeight + kMeasures.frameHeight + top + height_ + kMeasures.bottomMargin;
        return std::move(form_);
    }

private:
    void LayOutColumns()
    {
        qsizetype longest = 0;
        for (const ResultField& field : fields_)
            longest = std::max(longest, field.name.size());
        labelWidth_ = int(longest + 1) * grid_;
        if (labelWidth_ + kMeasures.columnGap >= kMeasures.surfaceWidth)
            labelWidth_ = kMeasures.surfaceWidth - kMeasures.leastValueWidth - kMeasures.columnGap;
        valueLeft_ = labelWidth_ + kMeasures.columnGap;
    }

    ControlDef Control(ControlType type, QStringView name, quint32 windowStyle) const
    {
        ControlDef control;
        control.type = type;
        control.name.Set(name, kMaxNameLength);
        control.windowStyle = windowStyle;
        control.textStyle = form_.textStyle;
        control.editKind = EditKind::Plain;
        control.height = height_;
        return control;
    }

    static void SetRecordSource(ControlDef& control, const QString& source)
    {
        control.hasSource = 1;
        control.sourceScope = SourceScope::Record;
        control.SetSource(source);
    }

    static int CutAtEdge(int left, int width) { return std::min(width, kMeasures.surfaceWidth - left); }

    void AddCounter()
    {
        ControlDef counter = Control(ControlType::EditBox, u"rec_counter", kEditStyle);
        counter.controlId = 0;
        counter.width = kMeasures.counterCharacters * grid_;
        counter.left = kMeasures.surfaceWidth - counter.width;
        counter.top = kMeasures.counterTop;
        SetRecordSource(counter, u"RECNO()+'/'+RECCOUNT()"_s);
        form_.AddControl(std::move(counter));
    }

    void AddRow(const ResultField& field, int top)
    {
        ControlDef label = Control(ControlType::Label, field.name + u':', kLabelStyle);
        label.controlId = nextId_++;
        label.left = kMeasures.labelLeft;
        label.top = top;
        label.width = labelWidth_;
        label.backgroundColor = form_.backgroundColor;
        form_.AddControl(std::move(label));

        ControlDef value = field.type == FieldType::YesNo ? CheckBox(field) : EditBox(field);
        value.controlId = nextId_++;
        value.fieldBound = 1;
        value.left = valueLeft_;
        value.top = top;
        value.width = CutAtEdge(valueLeft_, value.width);
        form_.AddControl(std::move(value));
        ++form_.counterA;
        ++form_.counterB;
    }

    QString SourceOf(const ResultField& field) const { return table_ + u'.' + FieldReference(field.name); }

    ControlDef CheckBox(const ResultField& field) const
    {
        ControlDef box = Control(ControlType::CheckBox, field.name, kCheckStyle);
        box.width = kMeasures.checkBoxSize;
        box.height = kMeasures.checkBoxSize;
        box.backgroundColor = form_.backgroundColor;
        SetRecordSource(box, u"WHERE %1=1"_s.arg(SourceOf(field)));
        return box;
    }

    ControlDef EditBox(const ResultField& field) const
    {
        ControlDef box = Control(ControlType::EditBox, field.name, kEditStyle);
        box.width = kMeasures.surfaceWidth - valueLeft_;
        SetRecordSource(box, SourceOf(field));
        if (IsNumber(field.type))
            box.width = 20 * grid_ + 3;
        if (field.type == FieldType::Date) {
            box.editKind = EditKind::DatePicker;
            box.width = 21 * grid_ + 3;
        }
        if (field.type == FieldType::Memo) {
            box.editKind = EditKind::Extendable;
            box.lines = kMeasures.extendableLines;
        }
        return box;
    }

    void AddSaveButton(int top)
    {
        constexpr QStringView kCaption = u"SAVE";
        ControlDef button = Control(ControlType::Button, kCaption, kButtonStyle);
        button.controlId = nextId_++;
        button.buttonFunction = ButtonFunction::Update;
        button.left = valueLeft_;
        button.top = top;
        button.width = CutAtEdge(valueLeft_, int(kCaption.size() + 2) * characterWidth_);
        std::vector<SourceAssignment> assignments;
        for (const ControlDef& control : form_.controls) {
            if (control.fieldBound == 0)
                continue;
            const ResultField& field = fields_[assignments.size()];
            assignments.push_back({SourceOf(field), u'&' + FieldReference(control.name.Text())});
        }
        SetRecordSource(button, JoinAssignments(assignments));
        form_.AddControl(std::move(button));
    }

    QString table_; // as it stands in a statement
    std::span<const ResultField> fields_;
    FormDef form_;
    int characterWidth_ = 0;
    int height_ = 0; // of a line
    int grid_ = 0;   // what a character of a name takes
    int labelWidth_ = 0;
    int valueLeft_ = 0;
    qint32 nextId_ = 1;
};

} // namespace

FormDef MakeDefaultForm(const QString& table, std::span<const ResultField> fields, const TextStyle& style)
{
    return DefaultFormMaker(table, fields, style).Make();
}

std::optional<FormDef> DefaultFormOf(DbConnection& connection, const DatabaseLocation& database,
                                     const QString& table, UserPrompt& prompt, const TextStyle& style)
{
    DbRecordset records(connection);
    const QString statement = u"SELECT * FROM "_s + FieldReference(table);
    if (!records.Open(statement, database, CursorType::ForwardOnly, LockType::ReadOnly)) {
        ReportProviderError(prompt, &records, records.LastResult());
        return {};
    }
    return MakeDefaultForm(table, records.Fields(), style);
}

QString FreeFormName(const FormStore& store, const QString& name)
{
    QString free = name;
    for (int number = 2; store.FindForm(free); ++number)
        free = name + QString::number(number);
    return free;
}

} // namespace mirel
