#include "forms/design/properties.h"

#include "expr/expr_parser.h"
#include "forms/control_binding.h"
#include "forms/control_source.h"
#include "forms/control_types.h"
#include "resources/string_table.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

using Kind = PropertyKind;
using Group = PropertyGroup;

const QString kSelectStart = u"SELECT * "_s;

// --- fields of both records -----------------------------------------------------------------------------------

bool ReadNumber(const QString& text, qint64& number)
{
    bool read = false;
    number = text.trimmed().toLongLong(&read);
    return read;
}

template <auto Member, typename Record>
QString Number(const Record& record)
{
    return QString::number(qint64(record.*Member));
}
template <auto Member, typename Record>
void SetNumber(Record& record, const QString& text)
{
    using Field = std::remove_reference_t<decltype(record.*Member)>;
    qint64 number = 0;
    if (ReadNumber(text, number) && number >= std::numeric_limits<qint32>::min() &&
        number <= qint64(std::numeric_limits<quint32>::max()))
        record.*Member = Field(number);
}

// A flag that is set already keeps its number, whatever that is.
template <auto Member, typename Record>
QString Flag(const Record& record)
{
    return record.*Member != 0 ? u"1"_s : u"0"_s;
}
template <auto Member, typename Record>
void SetFlag(Record& record, const QString& text)
{
    if (Flag<Member>(record) != text)
        record.*Member = text == u"1" ? 1 : 0;
}

template <auto Member, typename Record>
QString Text(const Record& record)
{
    return (record.*Member).Text();
}
template <auto Member, qsizetype Most, typename Record>
void SetText(Record& record, const QString& text)
{
    if ((record.*Member).Text() != text)
        (record.*Member).Set(text, Most);
}

template <typename Record>
QString Font(const Record& record)
{
    return StyleInWords(record.textStyle);
}
template <typename Record>
void KeepFont(Record&, const QString&)
{
}

template <typename Record>
QString InkColor(const Record& record)
{
    return QString::number(record.textStyle.color);
}
template <typename Record>
void SetInkColor(Record& record, const QString& text)
{
    qint64 color = 0;
    if (ReadNumber(text, color))
        record.textStyle.color = quint32(color);
}

// --- a control's window style ---------------------------------------------------------------------------------

template <quint32 Bit>
QString Style(const ControlDef& control)
{
    return (control.windowStyle & Bit) != 0 ? u"1"_s : u"0"_s;
}
template <quint32 Bit>
void SetStyle(ControlDef& control, const QString& text)
{
    control.windowStyle = text == u"1" ? control.windowStyle | Bit : control.windowStyle & ~Bit;
}

QString Align(const ControlDef& control)
{
    return QString::number(control.windowStyle & style::kAlignMask);
}
void SetAlign(ControlDef& control, const QString& text)
{
    qint64 align = 0;
    if (ReadNumber(text, align))
        control.windowStyle = (control.windowStyle & ~style::kAlignMask) | (quint32(align) & style::kAlignMask);
}

// --- a control's source ---------------------------------------------------------------------------------------

QString Source(const ControlDef& control)
{
    return control.source.Text();
}

// An expression that is written is in force; the flag takes it out of force again.
void SetSource(ControlDef& control, const QString& text)
{
    if (control.source.Text() == text && control.source.IsSet())
        return;
    control.SetSource(text);
    control.hasSource = text.isEmpty() ? control.hasSource : 1;
    if (control.sourceScope == SourceScope::None)
        control.sourceScope = SourceScope::Record;
}

QString ShownFieldSource(const ControlDef& control)
{
    const ControlBinding binding = BindControl(control);
    const bool isPlain = control.hasSource != 0 && ShownField(binding, control.type);
    return isPlain ? control.source.Text() : QString();
}
void ShowField(ControlDef& control, const QString& source)
{
    if (ShownFieldSource(control) == source)
        return;
    if (source.isEmpty()) {
        control.fieldBound = 0;
        return;
    }
    control.fieldBound = 1;
    control.sourceScope = SourceScope::Record;
    control.hasSource = 1;
    control.SetSource(source);
}

QString FromQuery(const ControlDef& control)
{
    return control.source.Text().contains(kDropDownQueryEnd) ? u"1"_s : u"0"_s;
}
void SetFromQuery(ControlDef& control, const QString& text)
{
    if (FromQuery(control) == text)
        return;
    const QString data = SplitDropDown(control.source.Text()).data;
    SetSource(control, text == u"1" ? QString(kDropDownQueryEnd) + data : data);
}
QString ItemsQuery(const ControlDef& control)
{
    return SplitDropDown(control.source.Text()).query;
}
void SetItemsQuery(ControlDef& control, const QString& text)
{
    if (ItemsQuery(control) != text)
        SetSource(control, text + kDropDownQueryEnd + SplitDropDown(control.source.Text()).data);
}
QString ItemsData(const ControlDef& control)
{
    return SplitDropDown(control.source.Text()).data;
}
void SetItemsData(ControlDef& control, const QString& text)
{
    if (ItemsData(control) == text)
        return;
    const bool fromQuery = FromQuery(control) == u"1";
    SetSource(control, fromQuery ? ItemsQuery(control) + kDropDownQueryEnd + text : text);
}

// --- buttons --------------------------------------------------------------------------------------------------

enum class ButtonSource { None, Query, Assignments, Form };

ButtonSource SourceOf(ButtonFunction function)
{
    switch (function) {
    case ButtonFunction::Select:
        return ButtonSource::Query;
    case ButtonFunction::Update:
    case ButtonFunction::UpdateAll:
    case ButtonFunction::Insert:
        return ButtonSource::Assignments;
    case ButtonFunction::CallForm:
        return ButtonSource::Form;
    default:
        return ButtonSource::None;
    }
}

template <ButtonSource Wanted>
bool HasButtonSource(const ControlDef& control)
{
    return Has(control.type, IsPressed) && SourceOf(control.buttonFunction) == Wanted;
}

QString Function(const ControlDef& control)
{
    return QString::number(int(control.buttonFunction));
}
// A source of another kind means nothing to the new function, and would be read as something else.
void SetFunction(ControlDef& control, const QString& text)
{
    qint64 number = 0;
    if (!ReadNumber(text, number) || ButtonFunction(number) == control.buttonFunction)
        return;
    const ButtonSource before = SourceOf(control.buttonFunction);
    control.buttonFunction = ButtonFunction(number);
    if (SourceOf(control.buttonFunction) == before)
        return;
    control.ClearSource();
    control.hasSource = 0;
    control.option1 = 0;
    control.option2 = 0;
}

QString SelectText(const ControlDef& control)
{
    const QString source = control.source.Text();
    return source.startsWith(kSelectStart) ? source.sliced(kSelectStart.size()) : source;
}
void SetSelectText(ControlDef& control, const QString& text)
{
    if (SelectText(control) == text)
        return;
    const bool isWhole = text.trimmed().startsWith(u"SELECT", Qt::CaseInsensitive);
    SetSource(control, isWhole ? text : kSelectStart + text);
}

// --- which controls have which --------------------------------------------------------------------------------

template <unsigned Trait>
bool Having(const ControlDef& control)
{
    return (TypeOf(control.type).traits & Trait) != 0;
}
template <unsigned Trait>
bool Lacking(const ControlDef& control)
{
    return !Having<Trait>(control);
}
template <SourceKind Wanted>
bool OfSource(const ControlDef& control)
{
    return SourceKindOf(control.type) == Wanted;
}
template <ControlType Wanted>
bool OfType(const ControlDef& control)
{
    return control.type == Wanted;
}
bool IsExtendable(const ControlDef& control)
{
    return OfType<ControlType::EditBox>(control) && control.editKind == EditKind::Extendable;
}
bool HasItemsQuery(const ControlDef& control)
{
    return Having<HasItems>(control) && FromQuery(control) == u"1";
}
bool HasAlign(const ControlDef& control)
{
    return control.type == ControlType::Label || control.type == ControlType::EditBox;
}

constexpr std::array kScopes = {PropertyChoice{0, Str::PropScopeNone, false},
                                PropertyChoice{1, Str::PropScopeRecord}, PropertyChoice{2, Str::PropScopeWhole}};
constexpr std::array kEditKinds = {PropertyChoice{0, Str::PropFunctionNone, false},
                                   PropertyChoice{1, Str::PropEditPlain}, PropertyChoice{5, Str::PropEditDate},
                                   PropertyChoice{6, Str::PropEditExtendable}};
constexpr std::array kAligns = {PropertyChoice{0, Str::PropAlignLeft}, PropertyChoice{1, Str::PropAlignCentre},
                                PropertyChoice{2, Str::PropAlignRight}};
// Seven are offered; the others come out of files, and stay.
constexpr std::array kFunctions = {
    PropertyChoice{0, Str::PropFunctionNone},      PropertyChoice{1, Str::PropFnSelect},
    PropertyChoice{2, Str::PropFnDelete},          PropertyChoice{3, Str::PropFnUpdate},
    PropertyChoice{9, Str::PropFnClear},           PropertyChoice{12, Str::PropFnRecalc},
    PropertyChoice{13, Str::PropFnCall},           PropertyChoice{14, Str::PropFnUpdateAll},
    PropertyChoice{4, Str::PropFnInsert, false},   PropertyChoice{5, Str::PropFnFirst, false},
    PropertyChoice{6, Str::PropFnLast, false},     PropertyChoice{7, Str::PropFnNext, false},
    PropertyChoice{8, Str::PropFnPrevious, false}, PropertyChoice{10, Str::PropFnClose, false},
    PropertyChoice{11, Str::PropFnNothing, false},
};

template <auto Member>
constexpr auto ReadControl = &Number<Member, ControlDef>;
template <auto Member>
constexpr auto WriteControl = &SetNumber<Member, ControlDef>;

const auto& Controls()
{
    using C = ControlDef;
    static const std::array rows = {
        ControlProperty{
            {.caption = Str::PropCaption, .kind = Kind::Text, .group = Group::Content, .maxLength = 40},
            Text<&C::name, C>,
            SetText<&C::name, kMaxNameLength, C>,
            Having<HasCaption>},
        ControlProperty{{.caption = Str::PropName, .kind = Kind::Text, .group = Group::Content, .maxLength = 40},
                        Text<&C::name, C>,
                        SetText<&C::name, kMaxNameLength, C>,
                        Lacking<HasCaption>},
        ControlProperty{{.caption = Str::PropField, .kind = Kind::Field, .group = Group::Content},
                        ShownFieldSource,
                        ShowField,
                        OfSource<SourceKind::Expression>},
        ControlProperty{{.caption = Str::PropFieldBound, .kind = Kind::Flag, .group = Group::Content},
                        Flag<&C::fieldBound, C>,
                        SetFlag<&C::fieldBound, C>,
                        Having<HoldsValue>},
        ControlProperty{{.caption = Str::PropHasSource, .kind = Kind::Flag, .group = Group::Content},
                        Flag<&C::hasSource, C>,
                        SetFlag<&C::hasSource, C>,
                        Having<HoldsValue>},
        ControlProperty{{.caption = Str::PropSource, .kind = Kind::Expression, .group = Group::Content},
                        Source,
                        SetSource,
                        OfSource<SourceKind::Expression>},
        ControlProperty{{.caption = Str::PropFromQuery, .kind = Kind::Flag, .group = Group::Content},
                        FromQuery,
                        SetFromQuery,
                        Having<HasItems>},
        ControlProperty{{.caption = Str::PropQuery, .kind = Kind::Query, .group = Group::Content},
                        ItemsQuery,
                        SetItemsQuery,
                        HasItemsQuery},
        ControlProperty{{.caption = Str::PropItems, .kind = Kind::Items, .group = Group::Content},
                        ItemsData,
                        SetItemsData,
                        Having<HasItems>},
        ControlProperty{
            {.caption = Str::PropScope, .kind = Kind::Choice, .group = Group::Content, .choices = kScopes},
            ReadControl<&C::sourceScope>,
            WriteControl<&C::sourceScope>,
            Having<HoldsValue>},
        ControlProperty{
            {.caption = Str::PropEditKind, .kind = Kind::Choice, .group = Group::Content, .choices = kEditKinds},
            ReadControl<&C::editKind>,
            WriteControl<&C::editKind>,
            OfType<ControlType::EditBox>},
        ControlProperty{
            {.caption = Str::PropLines, .kind = Kind::Number, .group = Group::Content, .least = -1, .most = 1000},
            ReadControl<&C::lines>,
            WriteControl<&C::lines>,
            IsExtendable},
        ControlProperty{
            {.caption = Str::PropDefaultValue, .kind = Kind::Text, .group = Group::Content, .maxLength = 40},
            Text<&C::defaultValue, C>,
            SetText<&C::defaultValue, kMaxNameLength, C>,
            OfType<ControlType::EditBox>},
        ControlProperty{{.caption = Str::PropColumns, .kind = Kind::Columns, .group = Group::Content},
                        Source,
                        SetSource,
                        OfSource<SourceKind::Columns>},
        ControlProperty{
            {.caption = Str::PropFunction, .kind = Kind::Choice, .group = Group::Content, .choices = kFunctions},
            Function,
            SetFunction,
            Having<IsPressed>},
        ControlProperty{
            {.caption = Str::PropSelectText, .kind = Kind::Query, .group = Group::Content, .followsSelect = true},
            SelectText,
            SetSelectText,
            HasButtonSource<ButtonSource::Query>},
        ControlProperty{{.caption = Str::PropDefaultQuery, .kind = Kind::Flag, .group = Group::Content},
                        Flag<&C::option1, C>,
                        SetFlag<&C::option1, C>,
                        HasButtonSource<ButtonSource::Query>},
        ControlProperty{{.caption = Str::PropAssignments, .kind = Kind::Assignments, .group = Group::Content},
                        Source,
                        SetSource,
                        HasButtonSource<ButtonSource::Assignments>},
        ControlProperty{{.caption = Str::PropCalledForm, .kind = Kind::CalledForm, .group = Group::Content},
                        Source,
                        SetSource,
                        HasButtonSource<ButtonSource::Form>},
        ControlProperty{{.caption = Str::PropWithResult, .kind = Kind::Flag, .group = Group::Content},
                        Flag<&C::option1, C>,
                        SetFlag<&C::option1, C>,
                        HasButtonSource<ButtonSource::Form>},
        ControlProperty{{.caption = Str::PropCloseCurrent, .kind = Kind::Flag, .group = Group::Content},
                        Flag<&C::option2, C>,
                        SetFlag<&C::option2, C>,
                        HasButtonSource<ButtonSource::Form>},
        ControlProperty{
            {.caption = Str::PropAlign, .kind = Kind::Choice, .group = Group::Look, .choices = kAligns},
            Align,
            SetAlign,
            HasAlign},
        ControlProperty{{.caption = Str::PropAutoScroll, .kind = Kind::Flag, .group = Group::Look},
                        Style<style::kAutoHorizontalScroll>,
                        SetStyle<style::kAutoHorizontalScroll>,
                        Having<ShowsText>},
        ControlProperty{{.caption = Str::PropVerticalScroll, .kind = Kind::Flag, .group = Group::Look},
                        Style<style::kVerticalScrollBar>,
                        SetStyle<style::kVerticalScrollBar>,
                        Having<ShowsText>},
        ControlProperty{{.caption = Str::PropBorder, .kind = Kind::Flag, .group = Group::Look},
                        Style<style::kBorder>,
                        SetStyle<style::kBorder>,
                        Lacking<IsPressed>},
        ControlProperty{
            {.caption = Str::PropFont, .kind = Kind::Font, .group = Group::Look}, Font<C>, KeepFont<C>},
        ControlProperty{{.caption = Str::PropTextColor, .kind = Kind::Color, .group = Group::Look},
                        InkColor<C>,
                        SetInkColor<C>},
        ControlProperty{{.caption = Str::PropGround, .kind = Kind::Color, .group = Group::Look},
                        ReadControl<&C::backgroundColor>,
                        WriteControl<&C::backgroundColor>},
        ControlProperty{{.caption = Str::PropLeft, .kind = Kind::Number, .group = Group::Place},
                        ReadControl<&C::left>,
                        WriteControl<&C::left>},
        ControlProperty{{.caption = Str::PropTop, .kind = Kind::Number, .group = Group::Place},
                        ReadControl<&C::top>,
                        WriteControl<&C::top>},
        ControlProperty{{.caption = Str::PropWidth, .kind = Kind::Number, .group = Group::Place, .least = 3},
                        ReadControl<&C::width>,
                        WriteControl<&C::width>},
        ControlProperty{{.caption = Str::PropHeight, .kind = Kind::Number, .group = Group::Place, .least = 3},
                        ReadControl<&C::height>,
                        WriteControl<&C::height>},
    };
    return rows;
}

QString DefaultQuery(const FormDef& form)
{
    return form.defaultQuery.Text();
}
void SetDefaultQuery(FormDef& form, const QString& text)
{
    if (text.isEmpty())
        form.ClearDefaultQuery();
    else if (form.defaultQuery.Text() != text)
        form.SetDefaultQuery(text);
}

const auto& Forms()
{
    using F = FormDef;
    static const std::array rows = {
        FormProperty{{.caption = Str::PropName, .kind = Kind::Text, .group = Group::Content, .maxLength = 40},
                     Text<&F::name, F>,
                     SetText<&F::name, kMaxNameLength, F>},
        FormProperty{{.caption = Str::PropTable, .kind = Kind::Table, .group = Group::Content},
                     Text<&F::tableName, F>,
                     SetText<&F::tableName, kMaxTableNameLength, F>},
        FormProperty{{.caption = Str::PropQuery, .kind = Kind::Query, .group = Group::Content},
                     DefaultQuery,
                     SetDefaultQuery},
        FormProperty{{.caption = Str::PropQueryOnStartup, .kind = Kind::Flag, .group = Group::Start},
                     Flag<&F::defaultQueryOnStartup, F>,
                     SetFlag<&F::defaultQueryOnStartup, F>},
        FormProperty{{.caption = Str::PropFormScrollBar, .kind = Kind::Flag, .group = Group::Start},
                     Flag<&F::formScrollBar, F>,
                     SetFlag<&F::formScrollBar, F>},
        FormProperty{{.caption = Str::PropRaisePanel, .kind = Kind::Flag, .group = Group::Start},
                     Flag<&F::raiseInputPanel, F>,
                     SetFlag<&F::raiseInputPanel, F>},
        FormProperty{{.caption = Str::PropFont, .kind = Kind::Font, .group = Group::Look}, Font<F>, KeepFont<F>},
        FormProperty{{.caption = Str::PropTextColor, .kind = Kind::Color, .group = Group::Look},
                     InkColor<F>,
                     SetInkColor<F>},
        FormProperty{{.caption = Str::PropGround, .kind = Kind::Color, .group = Group::Look},
                     Number<&F::backgroundColor, F>,
                     SetNumber<&F::backgroundColor, F>},
        FormProperty{
            {.caption = Str::PropFormWidth, .kind = Kind::Number, .group = Group::Place, .least = 0, .most = 8000},
            Number<&F::width, F>,
            SetNumber<&F::width, F>},
        FormProperty{{.caption = Str::PropFormHeight,
                      .kind = Kind::Number,
                      .group = Group::Place,
                      .least = 0,
                      .most = 8000},
                     Number<&F::height, F>,
                     SetNumber<&F::height, F>},
    };
    return rows;
}

} // namespace

std::span<const ControlProperty> ControlProperties()
{
    return Controls();
}

std::span<const FormProperty> FormProperties()
{
    return Forms();
}

QString ChoiceText(const PropertyDef& def, qint32 value)
{
    const auto choice = std::ranges::find(def.choices, value, &PropertyChoice::value);
    return choice == def.choices.end() ? StringText(Str::PropOther, {QString::number(value)})
                                       : StringText(choice->text);
}

QString StyleInWords(const TextStyle& style)
{
    const QString face = style.faceName.IsEmpty() ? StringText(Str::MakerFontDefault) : style.faceName.Text();
    QStringList words = {
        style.pointSize > 0 ? StringText(Str::MakerFontText, {face, QString::number(style.pointSize)}) : face};
    for (const auto& [flag, word] :
         {std::pair(style.bold, Str::MakerFontBold), std::pair(style.italic, Str::MakerFontItalic),
          std::pair(style.underline, Str::MakerFontUnderline),
          std::pair(style.strikeout, Str::MakerFontStrikeout)}) {
        if (flag != 0)
            words += StringText(word);
    }
    return words.join(u", "_s);
}

Str GroupTitle(PropertyGroup group)
{
    constexpr std::array kTitles = {Str::PropGroupContent, Str::PropGroupStart, Str::PropGroupLook,
                                    Str::PropGroupPlace};
    return kTitles[size_t(group)];
}

} // namespace mirel
