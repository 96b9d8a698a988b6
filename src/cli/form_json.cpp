#include "cli/form_json.h"

#include "cli/json_writer.h"
#include "forms/control_types.h"

#include <algorithm>
#include <concepts>
#include <numeric>
#include <type_traits>

namespace mirel::cli {
namespace {

// Writes an object's members in the order in which they are put.
class JsonObject {
public:
    explicit JsonObject(Output& output)
        : output_(output)
    {
        output_.Write('{');
    }
    ~JsonObject() { output_.Write('}'); }
    Q_DISABLE_COPY_MOVE(JsonObject)

    void Put(const char* key, std::integral auto number)
    {
        Key(key);
        const QByteArray text = QByteArray::number(number);
        output_.Write({text.constData(), size_t(text.size())});
    }
    void Put(const char* key, const QString& text)
    {
        Key(key);
        WriteJsonText(output_, text.toUtf8().toStdString());
    }
    void Put(const char* key, const VariableText& text)
    {
        if (text.IsSet()) {
            Put(key, text.Text());
            return;
        }
        Key(key);
        output_.Write("null");
    }
    void PutColor(const char* key, quint32 color) { Put(key, qint32(color)); }
    template <typename Enum>
    requires std::is_enum_v<Enum>
    void Put(const char* key, Enum code) { Put(key, std::underlying_type_t<Enum>(code)); }
    // A member whose value the caller writes.
    void Key(const char* key)
    {
        if (!first_)
            output_.Write(',');
        first_ = false;
        output_.Write('"');
        output_.Write(key);
        output_.Write("\":");
    }

private:
    Output& output_;
    bool first_ = true;
};

// `write` for each item, in brackets and with commas.
template <typename Items, typename WriteItem>
void WriteArray(Output& output, const Items& items, WriteItem write)
{
    output.Write('[');
    bool first = true;
    for (const auto& item : items) {
        if (!first)
            output.Write(',');
        first = false;
        write(item);
    }
    output.Write(']');
}

void WriteTexts(Output& output, const QStringList& texts)
{
    WriteArray(output, texts,
               [&output](const QString& text) { WriteJsonText(output, text.toUtf8().toStdString()); });
}

template <size_t N>
void WriteBytes(Output& output, const std::array<quint8, N>& bytes)
{
    WriteArray(output, bytes, [&output](quint8 byte) {
        const QByteArray text = QByteArray::number(byte);
        output.Write({text.constData(), size_t(text.size())});
    });
}

void WriteStyle(Output& output, const TextStyle& style)
{
    JsonObject object(output);
    object.Put("face_name", style.faceName.Text());
    object.Put("italic", style.italic);
    object.Put("bold", style.bold);
    object.Put("strikeout", style.strikeout);
    object.Put("underline", style.underline);
    object.Put("point_size", style.pointSize);
    object.PutColor("text_colour", style.color);
}

void WriteControl(Output& output, const ControlDef& control)
{
    JsonObject object(output);
    object.Put("control_id", control.controlId);
    object.Put("control_type", control.type);
    object.Put("field_bound", control.fieldBound);
    object.Put("has_control_source", control.hasSource);
    object.Put("edit_kind", control.editKind);
    object.Put("source_scope", control.sourceScope);
    object.Put("left", control.left);
    object.Put("top", control.top);
    object.Put("height", control.height);
    object.Put("width", control.width);
    object.Put("window_style", control.windowStyle);
    object.Put("lines", control.lines);
    object.Put("button_function", control.buttonFunction);
    object.PutColor("background_colour", control.backgroundColor);
    object.Key("text_style");
    WriteStyle(output, control.textStyle);
    object.Put("name", control.name.Text());
    object.Put("default_value", control.defaultValue.Text());
    object.Put("option_1", control.option1);
    object.Put("option_2", control.option2);
    object.Key("reserved");
    WriteBytes(output, control.reserved);
    object.Put("control_source_length", control.source.AllUnits().size());
    object.Put("control_source", control.source);
}

void WriteForm(Output& output, const FormDef& form)
{
    JsonObject object(output);
    object.Put("form_tag", form.formTag);
    object.Put("form_name", form.name.Text());
    object.Put("table_name", form.tableName.Text());
    object.Put("form_width", form.width);
    object.Put("form_height", form.height);
    object.Put("control_count", form.controls.size());
    object.Put("reserved", form.reservedNumber);
    object.Put("counter_a", form.counterA);
    object.Put("counter_b", form.counterB);
    object.Put("raise_input_panel", form.raiseInputPanel);
    object.Put("form_scroll_bar", form.formScrollBar);
    object.Put("default_query_on_startup", form.defaultQueryOnStartup);
    object.Key("reserved_bytes");
    WriteBytes(output, form.reserved);
    object.Put("default_query_length", form.defaultQuery.AllUnits().size());
    object.PutColor("background_colour", form.backgroundColor);
    object.Key("form_text_style");
    WriteStyle(output, form.textStyle);
    object.Put("default_query", form.defaultQuery);
    object.Key("controls");
    WriteArray(output, form.controls, [&output](const ControlDef& control) { WriteControl(output, control); });
}

void WriteQuery(Output& output, const QueryDef& query)
{
    JsonObject object(output);
    object.Put("query_name", query.name.Text());
    object.Put("table_name", query.tableName.Text());
    object.Put("query_text_length", query.text.AllUnits().size());
    object.Put("query_text", query.text);
}

void WriteListRows(Output& output, RunningForm& form, int control)
{
    constexpr int kRows = 20; // as many as a list shows at once
    const qint64 first = std::max<qint64>(form.CurrentRecord(), 0) / kRows * kRows;
    WriteArray(output, form.ListRows(control, first, kRows),
               [&output](const QStringList& row) { WriteTexts(output, row); });
}

void WriteRunningControl(Output& output, RunningForm& form, int index)
{
    const ControlRun& control = form.Controls()[size_t(index)];
    JsonObject object(output);
    object.Put("name", control.name);
    object.Put("type", control.type);
    object.Put("text", form.ShownText(index));
    if (Has(control.type, HasItems)) {
        object.Key("items");
        WriteTexts(output, control.items);
    } else if (Has(control.type, HasRows)) {
        object.Key("columns");
        WriteTexts(output, control.columns);
        object.Key("rows");
        WriteListRows(output, form, index);
    }
}

} // namespace

void WriteStoreJson(Output& output, const FormStore& store)
{
    {
        JsonObject object(output);
        object.Key("forms");
        WriteArray(output, store.Forms(), [&output](const FormDef& form) { WriteForm(output, form); });
        object.Key("queries");
        WriteArray(output, store.Queries(), [&output](const QueryDef& query) { WriteQuery(output, query); });
    }
    output.Write('\n');
}

void WriteRunningFormJson(Output& output, RunningForm& form)
{
    {
        JsonObject object(output);
        object.Put("form", form.Form().name.Text());
        object.Key("controls");
        std::vector<int> indexes(form.Controls().size());
        std::iota(indexes.begin(), indexes.end(), 0);
        WriteArray(output, indexes, [&](int index) { WriteRunningControl(output, form, index); });
        object.Put("record", form.CurrentRecord() + 1);
        object.Put("records", form.RecordCount());
    }
    output.Write('\n');
}

} // namespace mirel::cli
