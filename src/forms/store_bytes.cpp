#include "forms/store_bytes.h"

#include "forms/byte_reader.h"

#include <type_traits>

namespace mirel {
namespace {

// The fields of each record stand in one list below, in the order of the file; the two classes here go through
// it, one filling the record and one writing it out.

class FieldReader {
public:
    explicit FieldReader(ByteReader& bytes)
        : bytes_(bytes)
    {
    }

    template <typename Field>
    void operator()(Field& field)
    {
        if constexpr (std::is_enum_v<Field>)
            field = Field{bytes_.Next<std::underlying_type_t<Field>>()};
        else
            field = bytes_.Next<Field>();
    }
    template <size_t N>
    void operator()(FixedText<N>& field)
    {
        typename FixedText<N>::Units units{};
        bytes_.Next(units.data(), qsizetype(N));
        field = FixedText<N>(units);
    }
    template <size_t N>
    void operator()(std::array<quint8, N>& field)
    {
        bytes_.Next(field.data(), qsizetype(N));
    }

private:
    ByteReader& bytes_;
};

class FieldWriter {
public:
    explicit FieldWriter(ByteWriter& bytes)
        : bytes_(bytes)
    {
    }

    template <typename Field>
    void operator()(const Field& field)
    {
        if constexpr (std::is_enum_v<Field>)
            bytes_.Put(std::underlying_type_t<Field>(field));
        else
            bytes_.Put(field);
    }
    template <size_t N>
    void operator()(const FixedText<N>& field)
    {
        bytes_.Put(field.AllUnits().data(), qsizetype(N));
    }
    template <size_t N>
    void operator()(const std::array<quint8, N>& field)
    {
        bytes_.Put(field.data(), qsizetype(N));
    }

private:
    ByteWriter& bytes_;
};

template <typename Io, typename Style>
void StyleFields(Io& io, Style& style)
{
    io(style.faceName);
    io(style.italic);
    io(style.bold);
    io(style.strikeout);
    io(style.underline);
    io(style.pointSize);
    io(style.color);
}

template <typename Io, typename Control, typename Number>
void ControlFields(Io& io, Control& control, Number& sourceLength)
{
    io(control.controlId);
    io(control.type);
    io(control.fieldBound);
    io(control.hasSource);
    io(control.editKind);
    io(control.sourceScope);
    io(control.left);
    io(control.top);
    io(control.height);
    io(control.width);
    io(control.windowStyle);
    io(control.lines);
    io(control.buttonFunction);
    io(control.backgroundColor);
    StyleFields(io, control.textStyle);
    io(control.name);
    io(control.defaultValue);
    io(control.option1);
    io(control.option2);
    io(control.reserved);
    io(control.padding);
    io(sourceLength);
}

template <typename Io, typename Form, typename Number>
void FormFields(Io& io, Form& form, Number& controlCount, Number& queryLength)
{
    io(form.formTag);
    io(form.name);
    io(form.tableName);
    io(form.width);
    io(form.height);
    io(controlCount);
    io(form.reservedNumber);
    io(form.counterA);
    io(form.counterB);
    io(form.raiseInputPanel);
    io(form.formScrollBar);
    io(form.defaultQueryOnStartup);
    io(form.reserved);
    io(form.padding);
    io(queryLength);
    io(form.backgroundColor);
    StyleFields(io, form.textStyle);
}

template <typename Io, typename Query, typename Number>
void QueryFields(Io& io, Query& query, Number& textLength)
{
    io(query.name);
    io(query.tableName);
    io(textLength);
}

template <typename Io, typename Content, typename Number>
void HeaderFields(Io& io, Content& content, Number& formCount, Number& queryCount)
{
    io(content.initialised);
    io(content.reserved);
    io(content.created);
    io(content.saved);
    io(formCount);
    io(queryCount);
}

VariableText ReadText(ByteReader& bytes, qint32 length)
{
    if (length <= 0)
        return {};
    if (!bytes.Has<char16_t>(length)) {
        bytes.Fail();
        return {};
    }
    std::u16string units(size_t(length), u'\0');
    bytes.Next(units.data(), length);
    return VariableText(std::move(units));
}

bool ReadControl(ByteReader& bytes, ControlDef& control)
{
    qint32 sourceLength = 0;
    FieldReader io(bytes);
    ControlFields(io, control, sourceLength);
    control.source = ReadText(bytes, sourceLength);
    return bytes.Ok();
}

bool ReadForm(ByteReader& bytes, FormDef& form)
{
    qint32 controlCount = 0;
    qint32 queryLength = 0;
    FieldReader io(bytes);
    FormFields(io, form, controlCount, queryLength);
    form.defaultQuery = ReadText(bytes, queryLength);
    for (qint32 i = 0; i < controlCount; ++i) { // a count is a promise: nothing is reserved for it
        ControlDef control;
        if (!ReadControl(bytes, control))
            return false;
        form.AddControl(std::move(control));
    }
    return bytes.Ok();
}

bool ReadQuery(ByteReader& bytes, QueryDef& query)
{
    qint32 textLength = 0;
    FieldReader io(bytes);
    QueryFields(io, query, textLength);
    query.text = ReadText(bytes, textLength);
    return bytes.Ok();
}

qint32 Count(size_t size)
{
    return qint32(size);
}

void WriteText(ByteWriter& bytes, const VariableText& text)
{
    bytes.Put(text.AllUnits().data(), qsizetype(text.AllUnits().size()));
}

void WriteForm(ByteWriter& bytes, const FormDef& form)
{
    FieldWriter io(bytes);
    const qint32 controlCount = Count(form.controls.size());
    const qint32 queryLength = Count(form.defaultQuery.AllUnits().size());
    FormFields(io, form, controlCount, queryLength);
    WriteText(bytes, form.defaultQuery);
    for (const ControlDef& control : form.controls) {
        const qint32 sourceLength = Count(control.source.AllUnits().size());
        ControlFields(io, control, sourceLength);
        WriteText(bytes, control.source);
    }
}

void WriteQuery(ByteWriter& bytes, const QueryDef& query)
{
    FieldWriter io(bytes);
    const qint32 textLength = Count(query.text.AllUnits().size());
    QueryFields(io, query, textLength);
    WriteText(bytes, query.text);
}

} // namespace

bool ReadStore(QByteArrayView bytes, FormStore::Content& content)
{
    ByteReader reader(bytes);
    FormStore::Content read;
    qint32 formCount = 0;
    qint32 queryCount = 0;
    FieldReader io(reader);
    HeaderFields(io, read, formCount, queryCount);
    content = reader.Ok() ? std::move(read) : FormStore::Content();
    for (qint32 i = 0; reader.Ok() && i < formCount; ++i) {
        FormDef form;
        if (ReadForm(reader, form))
            content.forms.push_back(std::move(form));
    }
    for (qint32 i = 0; reader.Ok() && i < queryCount; ++i) {
        QueryDef query;
        if (ReadQuery(reader, query))
            content.queries.push_back(std::move(query));
    }
    return reader.Ok();
}

QByteArray WriteStore(const FormStore::Content& content)
{
    ByteWriter bytes;
    FieldWriter io(bytes);
    const qint32 formCount = Count(content.forms.size());
    const qint32 queryCount = Count(content.queries.size());
    HeaderFields(io, content, formCount, queryCount);
    for (const FormDef& form : content.forms)
        WriteForm(bytes, form);
    for (const QueryDef& query : content.queries)
        WriteQuery(bytes, query);
    return bytes.Bytes();
}

} // namespace mirel
