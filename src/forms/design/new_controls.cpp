#include "forms/design/new_controls.h"

#include "data/catalog.h"
#include "forms/control_source.h"
#include "forms/control_types.h"

#include <QRect>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kUsualPoints = 9;
constexpr int kMostPoints = 100;
constexpr int kHandheldWidth = 235;
constexpr int kMargin = 4;
constexpr int kGap = 4;    // between label and box
constexpr int kRowGap = 3; // between rows
constexpr int kMemoLines = 3;
constexpr int kLeastBox = 60;
constexpr int kTickSide = 16;

// What a text of the form's font takes, for that font's size; 9 points is what the numbers are for.
struct TextMeasure {
    int points;

    explicit TextMeasure(const TextStyle& style)
        : points(style.pointSize > 0 ? std::min(style.pointSize, kMostPoints) : kUsualPoints)
    {
    }
    int Scaled(int px) const { return px * points / kUsualPoints; }
    int Box() const { return Scaled(20); } // the height of a box with one line
    int Line() const { return Scaled(14); }
    int Text(qsizetype characters) const { return int(std::min<qsizetype>(characters, 400)) * Scaled(7) + kGap; }
};

// How a field is shown, by its type.
struct FieldShape {
    FieldType type;
    int characters; // 0: all there is room for
    int lines;
    EditKind kind;
    quint32 style; // beside the usual one of an edit box
};
constexpr std::array kShapes = {
    FieldShape{FieldType::SmallInt, 9, 1, EditKind::Plain, style::kRight},
    FieldShape{FieldType::Integer, 12, 1, EditKind::Plain, style::kRight},
    FieldShape{FieldType::Double, 14, 1, EditKind::Plain, style::kRight},
    FieldShape{FieldType::Date, 16, 1, EditKind::DatePicker, 0},
    FieldShape{FieldType::Memo, 0, kMemoLines, EditKind::Extendable, 0},
};
constexpr FieldShape kTextShape{FieldType::Text, 0, 1, EditKind::Plain, 0};

const FieldShape& ShapeOf(FieldType type)
{
    const auto shape = std::ranges::find(kShapes, type, &FieldShape::type);
    return shape == kShapes.end() ? kTextShape : *shape;
}

int RightEdge(const FormDef& form)
{
    return std::max(form.width, kHandheldWidth) - kMargin;
}

ControlDef Bare(const FormDef& form, ControlType type, QStringView name, const QRect& place)
{
    ControlDef control;
    control.type = type;
    control.name.Set(name, kMaxNameLength);
    control.editKind = EditKind::Plain;
    control.textStyle = form.textStyle;
    control.windowStyle = TypeOf(type).windowStyle;
    control.left = place.x();
    control.top = place.y();
    control.width = place.width();
    control.height = place.height();
    if (Has(type, TakesGround))
        control.backgroundColor = form.backgroundColor;
    return control;
}

void SetRecordSource(ControlDef& control, const QString& source)
{
    control.hasSource = 1;
    control.sourceScope = SourceScope::Record;
    control.SetSource(source);
}

ControlDef LabelFor(const FormDef& form, const QString& caption, const QRect& place)
{
    return Bare(form, ControlType::Label, caption, place);
}

// At most as wide as the place.
ControlDef BoxFor(const FormDef& form, const QString& table, const ResultField& field, const QRect& place)
{
    const QString source = FieldSource(table, field.name);
    const TextMeasure measure(form.textStyle);
    if (field.type == FieldType::YesNo) {
        const int down = std::max((measure.Box() - kTickSide) / 2, 0);
        ControlDef tick =
            Bare(form, ControlType::CheckBox, field.name, {place.x(), place.y() + down, kTickSide, kTickSide});
        tick.fieldBound = 1;
        SetRecordSource(tick, u"WHERE %1=1"_s.arg(source));
        return tick;
    }
    const FieldShape& shape = ShapeOf(field.type);
    const bool isShortText = field.type == FieldType::Text && field.size > 0;
    const int characters = isShortText ? field.size + 1 : shape.characters;
    const int width = characters == 0 ? place.width() : std::min(measure.Text(characters), place.width());
    const int height = measure.Box() + (shape.lines - 1) * measure.Line();
    ControlDef box = Bare(form, ControlType::EditBox, field.name, {place.x(), place.y(), width, height});
    box.fieldBound = 1;
    box.editKind = shape.kind;
    box.windowStyle |= shape.style;
    if (shape.lines > 1) {
        box.lines = shape.lines;
        box.windowStyle &= ~style::kAutoHorizontalScroll;
    }
    SetRecordSource(box, source);
    return box;
}

// One row after the other, from the top down.
class FieldSheet {
public:
    FieldSheet(const FormDef& like, const QString& table, std::span<const ResultField> fields)
        : measure_(like.textStyle)
        , table_(table)
        , fields_(fields)
    {
        form_.CopyFrom(like);
        form_.controls.clear();
        form_.SetTableName(table);
        form_.width = std::max(kHandheldWidth, measure_.Scaled(kHandheldWidth));
        form_.SetDefaultQuery(u"SELECT * FROM "_s + FieldReference(table));
        form_.defaultQueryOnStartup = 1;
        qsizetype longest = 0;
        for (const ResultField& field : fields)
            longest = std::max(longest, field.name.size());
        labelWidth_ = std::min(measure_.Text(longest + 1), form_.width * 2 / 5);
    }

    FormDef Make()
    {
        AddTitle();
        for (const ResultField& field : fields_)
            AddRow(field);
        AddButtons();
        form_.height = top_ + kMargin;
        form_.formScrollBar = form_.height > kHandheldHeight ? 1 : form_.formScrollBar;
        return std::move(form_);
    }

private:
    static constexpr int kHandheldHeight = 260;

    ControlDef& Add(ControlDef control)
    {
        control.controlId = control.name == u"rec_counter" ? 0 : ++lastId_;
        form_.AddControl(std::move(control));
        return form_.controls.back();
    }

    void AddTitle()
    {
        ControlDef counter = NewRecordCounter(form_);
        counter.top = top_;
        counter.left = form_.width - kMargin - counter.width;
        ControlDef title = LabelFor(form_, table_, {kMargin, top_, counter.left - kMargin - kGap, measure_.Box()});
        title.windowStyle &= ~style::kAlignMask;
        title.textStyle.bold = 1;
        title.textStyle.pointSize = measure_.points + 2;
        Add(std::move(title));
        Add(std::move(counter));
        top_ += measure_.Box() + 2 * kRowGap;
    }

    void AddRow(const ResultField& field)
    {
        if (IsBinary(field.type))
            return; // nothing of it could be shown or typed
        const int left = kMargin + labelWidth_ + kGap;
        ControlDef box = BoxFor(form_, table_, field, {left, top_, form_.width - kMargin - left, measure_.Box()});
        const int height = std::max(box.height, measure_.Box());
        // A label stands at the top of its place, the text of a box in the middle of its own.
        Add(LabelFor(form_, field.name + u':', {kMargin, top_ + 2, labelWidth_, measure_.Box() - 2}));
        Add(std::move(box));
        saved_.push_back(
            {FieldSource(table_, field.name), u'&' + BracketedName(form_.controls.back().name.Text())});
        top_ += height + kRowGap;
        ++form_.counterA;
        ++form_.counterB;
    }

    void AddButtons()
    {
        const int width = (form_.width - 2 * kMargin - 2 * kGap) / 3;
        top_ += kRowGap;
        const auto button = [&](QStringView caption, int place, ButtonFunction function) -> ControlDef& {
            ControlDef& made = Add(Bare(form_, ControlType::Button, caption,
                                        {kMargin + place * (width + kGap), top_, width, measure_.Box() + 4}));
            made.buttonFunction = function;
            return made;
        };
        SetRecordSource(button(u"SAVE", 0, ButtonFunction::Update), JoinAssignments(saved_));
        button(u"CLEAR", 1, ButtonFunction::ClearForm);
        button(u"DELETE", 2, ButtonFunction::DeleteRecord);
        top_ += measure_.Box() + 4;
    }

    TextMeasure measure_;
    QString table_;
    std::span<const ResultField> fields_;
    FormDef form_;
    std::vector<SourceAssignment> saved_;
    int labelWidth_ = 0;
    int top_ = kMargin;
    qint32 lastId_ = 0;
};

} // namespace

QString FieldSource(const QString& table, const QString& field)
{
    return FieldReference(table) + u'.' + FieldReference(field);
}

ControlDef NewControl(const FormDef& form, ControlType type, const QString& name, QPoint at)
{
    const ControlTypeDef& row = TypeOf(type);
    const TextMeasure measure(form.textStyle);
    const bool fixed = Has(type, IsTicked);
    const int widest = RightEdge(form) - kMargin;
    const int width = fixed ? row.width : std::clamp(measure.Scaled(row.width), 3, widest);
    const int height = fixed ? row.height : std::max(measure.Scaled(row.height), 3);
    const int left = std::max(std::min(at.x(), RightEdge(form) - width), std::min(at.x(), 0));
    ControlDef control = Bare(form, type, name, {left, at.y(), width, height});
    // What it shows is chosen in its property sheet.
    if (row.source == SourceKind::Expression || row.source == SourceKind::Columns)
        control.sourceScope = SourceScope::Record;
    return control;
}

ControlDef NewRecordCounter(const FormDef& form)
{
    const TextMeasure measure(form.textStyle);
    const int width = measure.Text(11);
    ControlDef counter =
        Bare(form, ControlType::EditBox, u"rec_counter", {RightEdge(form) - width, 2, width, measure.Box()});
    counter.controlId = 0;
    counter.windowStyle |= style::kRight;
    SetRecordSource(counter, u"RECNO()+'/'+RECCOUNT()"_s);
    return counter;
}

std::vector<ControlDef> FieldControls(const FormDef& form, const ResultField& field, QPoint at)
{
    const TextMeasure measure(form.textStyle);
    const int room = RightEdge(form) - at.x();
    const int label = std::clamp(measure.Text(field.name.size() + 1), 30, std::max(room - kLeastBox, 60));
    const int left = at.x() + label + kGap;
    const int width = std::max(RightEdge(form) - left, kLeastBox);
    return {LabelFor(form, field.name + u':', {at.x(), at.y() + 2, label, measure.Box() - 2}),
            BoxFor(form, form.tableName.Text(), field, {left, at.y(), width, measure.Box()})};
}

FormDef LayOutAllFields(const FormDef& like, const QString& table, std::span<const ResultField> fields)
{
    return FieldSheet(like, table, fields).Make();
}

} // namespace mirel
