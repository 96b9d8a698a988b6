#include "app/sample_forms.h"

#include "forms/control_source.h"
#include "forms/design/new_controls.h"

#include <QRect>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr QStringView kStrikes = u"Bird Strikes";
constexpr QStringView kOrders = u"Orders";

// A handheld's screen is 240 pixels wide; the surface leaves room for a scroll bar's edge.
constexpr int kWidth = 230;
constexpr int kMargin = 4;
constexpr int kInnerWidth = kWidth - 2 * kMargin;
constexpr int kLineHeight = 20;
constexpr int kRowStep = 23;
constexpr int kPointSize = 9;

constexpr quint32 kLabelStyle = 0x50000000;
constexpr quint32 kEditStyle = 0x50810080;
constexpr quint32 kDropDownStyle = 0x50210002;
constexpr quint32 kButtonStyle = 0x50010000;
constexpr quint32 kListStyle = 0x50b10000;

// A form put together control by control, from the top down.
class FormSheet {
public:
    FormSheet(QStringView name, QStringView table)
    {
        form_.SetName(name);
        form_.SetTableName(table);
        form_.textStyle.pointSize = kPointSize;
        form_.formScrollBar = 1;
        form_.width = kWidth;
    }

    void Title(QStringView text, const QRect& place)
    {
        ControlDef& title = Add(ControlType::Label, text, place, kLabelStyle);
        title.textStyle.pointSize = kPointSize + 2;
        title.textStyle.bold = 1;
    }
    void Counter(const QRect& place)
    {
        ControlDef& counter = Add(ControlType::EditBox, u"counter", place, kEditStyle | style::kRight);
        SetSource(counter, u"RECNO()+'/'+RECCOUNT()"_s, SourceScope::Record);
    }
    // A label stands at the top of its place, the text of a box in the middle of it.
    void Label(QStringView text, const QRect& place)
    {
        Add(ControlType::Label, text, place.adjusted(0, 3, 0, 0), kLabelStyle | style::kRight);
    }
    // A box that shows the field of that name.
    ControlDef& FieldBox(QStringView field, const QRect& place, EditKind kind = EditKind::Plain)
    {
        ControlDef& box = Add(ControlType::EditBox, field, place, kEditStyle);
        box.fieldBound = 1;
        box.editKind = kind;
        SetSource(box, Source(field), SourceScope::Record);
        return box;
    }
    void WholeBox(QStringView name, const QString& expression, const QRect& place)
    {
        ControlDef& box = Add(ControlType::EditBox, name, place, kEditStyle | style::kRight);
        SetSource(box, expression, SourceScope::WholeResult);
    }
    // With the items of `source`; shows the field of its own name where it is bound.
    ControlDef& DropDown(QStringView name, const DropDownSource& source, const QRect& place, bool isBound)
    {
        ControlDef& box = Add(ControlType::DropDownBox, name, place, kDropDownStyle);
        box.fieldBound = isBound ? 1 : 0;
        SetSource(box, JoinDropDown(source), SourceScope::Record);
        return box;
    }
    void List(QStringView name, const std::vector<SourceColumn>& columns, const QRect& place)
    {
        SetSource(Add(ControlType::List, name, place, kListStyle), JoinListColumns(columns), SourceScope::Record);
    }
    ControlDef& Button(QStringView caption, ButtonFunction function, const QString& source, const QRect& place)
    {
        ControlDef& button = Add(ControlType::Button, caption, place, kButtonStyle);
        button.buttonFunction = function;
        if (!source.isEmpty())
            SetSource(button, source, SourceScope::Record);
        return button;
    }

    FormDef Done()
    {
        for (const ControlDef& control : form_.controls)
            form_.height = std::max(form_.height, control.top + control.height + kMargin);
        return std::move(form_);
    }
    FormDef& Form() { return form_; }
    QString Source(const QString& field) const { return FieldSource(form_.tableName.Text(), field); }
    QString Source(QStringView field) const { return Source(field.toString()); }
    // The field gets what the control of that name holds.
    SourceAssignment From(QStringView field) const { return {Source(field), u"&[%1]"_s.arg(field)}; }

private:
    ControlDef& Add(ControlType type, QStringView name, const QRect& place, quint32 windowStyle)
    {
        ControlDef control;
        control.controlId = qint32(form_.controls.size());
        control.type = type;
        control.name.Set(name);
        control.left = place.left();
        control.top = place.top();
        control.width = place.width();
        control.height = place.height();
        control.windowStyle = windowStyle;
        control.editKind = EditKind::Plain;
        control.textStyle = form_.textStyle;
        form_.AddControl(std::move(control));
        return form_.controls.back();
    }
    static void SetSource(ControlDef& control, const QString& source, SourceScope scope)
    {
        control.hasSource = 1;
        control.sourceScope = scope;
        control.SetSource(source);
    }

    FormDef form_;
};

FormDef StrikesForm()
{
    FormSheet sheet(u"Strikes", kStrikes);
    sheet.Title(u"Bird strikes", {kMargin, 4, 140, kLineHeight});
    sheet.Counter({146, 4, 80, kLineHeight});
    sheet.Label(u"Search:", {kMargin, 28, 44, 22});
    sheet.DropDown(u"Species",
                   {u"SELECT DISTINCT [Wildlife Species] FROM [Bird Strikes] ORDER BY [Wildlife Species]"_s, {}},
                   {52, 28, 120, 22}, false);
    sheet
        .Button(u"Find", ButtonFunction::Select,
                u"SELECT * WHERE [Wildlife Species] LIKE '%&[Species]%' ORDER BY [Cost Total $] DESC"_s,
                {176, 28, 50, 22})
        .option1 = 1;
    sheet.List(u"strikes",
               {{u"Date"_s, sheet.Source(u"Flight Date"_s)},
                {u"Cost $"_s, sheet.Source(u"Cost Total $"_s)},
                {u"Airport"_s, sheet.Source(u"Airport Name"_s)}},
               {kMargin, 54, kInnerWidth, 84});
    int top = 142;
    const auto row = [&](QStringView label, QStringView field) {
        sheet.Label(label, {kMargin, top, 56, kLineHeight});
        sheet.FieldBox(field, {64, top, 162, kLineHeight});
        top += kRowStep;
    };
    row(u"Species:", u"Wildlife Species");
    row(u"Aircraft:", u"Aircraft Make Model");
    row(u"Damage:", u"Effect Amount of damage");
    sheet.Label(u"Total $:", {kMargin, top, 56, kLineHeight});
    sheet.WholeBox(u"Total", u"SUM([Cost Total $])"_s, {64, top, 74, kLineHeight});
    sheet.Label(u"Avg:", {140, top, 28, kLineHeight});
    sheet.WholeBox(u"Average", u"ROUND(AVG([Cost Total $]),0)"_s, {170, top, 56, kLineHeight});
    top += kRowStep + 2;
    ControlDef& call =
        sheet.Button(u"Edit this one", ButtonFunction::CallForm, u"Strike entry"_s, {kMargin, top, 100, 24});
    call.option1 = 1;
    sheet.Button(u"Recalculate", ButtonFunction::Recalc, {}, {126, top, 100, 24});
    return sheet.Done();
}

// The fields of the entry form in their order, and how each is entered.
struct EntryRow {
    QStringView label;
    QStringView field;
    QStringView items; // of a drop-down box; empty: an edit box
    EditKind kind = EditKind::Plain;
    int width = 146;
};
constexpr std::array kEntryRows = {
    EntryRow{u"Date:", u"Flight Date", {}, EditKind::DatePicker, 110},
    EntryRow{u"Airport:", u"Airport Name", {}},
    EntryRow{u"State:", u"Origin State", {}},
    EntryRow{u"Airline:", u"Aircraft Airline Operator", {}},
    EntryRow{u"Aircraft:", u"Aircraft Make Model", {}},
    EntryRow{u"Species:", u"Wildlife Species", {}, EditKind::Extendable},
    EntryRow{u"Size:", u"Wildlife Size", u"Small;Medium;Large", EditKind::Plain, 110},
    EntryRow{u"Phase:", u"Phase of flight",
             u"Parked;Taxi;Take-off run;Climb;En Route;Descent;Approach;Landing Roll", EditKind::Plain, 110},
    EntryRow{u"Time:", u"Time of day", u"Dawn;Day;Dusk;Night", EditKind::Plain, 110},
    EntryRow{u"Damage:", u"Effect Amount of damage", u"None;Minor;Medium;Substantial", EditKind::Plain, 110},
    EntryRow{u"Cost $:", u"Cost Total $", {}, EditKind::Plain, 80},
};

FormDef StrikeEntryForm()
{
    FormSheet sheet(u"Strike entry", kStrikes);
    sheet.Form().SetDefaultQuery(u"SELECT * FROM [Bird Strikes] ORDER BY [Flight Date] DESC");
    sheet.Form().defaultQueryOnStartup = 1;
    sheet.Title(u"One strike", {kMargin, 4, 140, kLineHeight});
    sheet.Counter({146, 4, 80, kLineHeight});
    int top = 28;
    std::vector<SourceAssignment> saved;
    for (const EntryRow& row : kEntryRows) {
        const QRect place(78, top, row.width, kLineHeight);
        sheet.Label(row.label, {kMargin, top, 70, kLineHeight});
        if (row.items.isEmpty())
            sheet.FieldBox(row.field, place, row.kind).lines = row.kind == EditKind::Extendable ? 3 : -1;
        else
            sheet.DropDown(row.field, {{}, row.items.toString()}, place, true);
        saved.push_back(sheet.From(row.field));
        top += kRowStep;
    }
    top += 2;
    // No button empties the boxes: what is then typed would be saved over the record that is shown.
    sheet.Button(u"Save", ButtonFunction::Update, JoinAssignments(saved), {kMargin, top, 56, 24});
    sheet.Button(u"Add as new", ButtonFunction::Insert, JoinAssignments(saved), {64, top, 94, 24});
    sheet.Button(u"Delete", ButtonFunction::DeleteRecord, {}, {162, top, 64, 24});
    return sheet.Done();
}

// The lines of one order are the records with its number.
FormDef OrderForm()
{
    FormSheet sheet(u"Order", kOrders);
    sheet.Form().SetDefaultQuery(u"SELECT * FROM Orders WHERE Number = 1001");
    sheet.Form().defaultQueryOnStartup = 1;
    sheet.Title(u"Order", {kMargin, 4, 60, kLineHeight});
    sheet.DropDown(u"Which", {u"SELECT DISTINCT Number FROM Orders ORDER BY Number"_s, {}}, {66, 4, 90, 22},
                   false);
    sheet.Button(u"Open", ButtonFunction::Select, u"SELECT * WHERE Number = &[Which]"_s, {160, 4, 66, 22});
    int top = 32;
    const auto row = [&](QStringView label, QStringView field, int width, EditKind kind = EditKind::Plain) {
        sheet.Label(label, {kMargin, top, 60, kLineHeight});
        sheet.FieldBox(field, {68, top, width, kLineHeight}, kind);
        top += kRowStep;
    };
    row(u"Number:", u"Number", 60);
    row(u"Customer:", u"Customer", 158);
    row(u"Ordered:", u"Ordered", 158, EditKind::DatePicker);
    sheet.List(u"lines",
               {{u"Item"_s, sheet.Source(u"Item"_s)},
                {u"Qty"_s, sheet.Source(u"Quantity"_s)},
                {u"Price"_s, sheet.Source(u"Price"_s)},
                {u"Amount"_s, u"ROUND([Quantity]*[Price],2)"_s}},
               {kMargin, top, kInnerWidth, 84});
    top += 88;
    sheet.Label(u"Total:", {kMargin, top, 60, kLineHeight});
    sheet.WholeBox(u"Total", u"ROUND(SUM([Quantity]*[Price]),2)"_s, {68, top, 80, kLineHeight});
    sheet.Counter({152, top, 74, kLineHeight});
    top += kRowStep + 4;
    row(u"Item:", u"Item", 158);
    row(u"Quantity:", u"Quantity", 60);
    row(u"Price:", u"Price", 80);
    top += 2;
    const std::vector<SourceAssignment> line = {sheet.From(u"Item"), sheet.From(u"Quantity"),
                                                sheet.From(u"Price")};
    std::vector<SourceAssignment> added = {sheet.From(u"Number"), sheet.From(u"Customer"), sheet.From(u"Ordered")};
    added.insert(added.end(), line.begin(), line.end());
    sheet.Button(u"Save line", ButtonFunction::Update, JoinAssignments(line), {kMargin, top, 72, 24});
    sheet.Button(u"Add line", ButtonFunction::Insert, JoinAssignments(added), {80, top, 70, 24});
    sheet.Button(u"Delete line", ButtonFunction::DeleteRecord, {}, {154, top, 72, 24});
    return sheet.Done();
}

} // namespace

void AddSampleForms(FormStore& store)
{
    store.AddForm(StrikesForm());
    store.AddForm(StrikeEntryForm());
    store.AddForm(OrderForm());
}

} // namespace mirel
