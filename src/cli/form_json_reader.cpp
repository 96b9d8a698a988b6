#include "cli/form_json_reader.h"

#include "resources/string_table.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <type_traits>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

// Walks down a JSON text; knows where it is, and keeps the first fault.
class JsonWalk {
public:
    explicit JsonWalk(UserMessage& fault)
        : fault_(fault)
    {
    }

    bool Refuse(Str reason, const QStringList& arguments = {})
    {
        fault_ = {Str::CliJsonMember, {path_.join(QString()), StringText(reason, arguments)}};
        return false;
    }
    // Calls `read` one step further down.
    template <typename Read>
    bool At(const QString& step, Read read)
    {
        path_ += step;
        const bool done = read();
        if (done)
            path_.removeLast();
        return done;
    }

private:
    QStringList path_;
    UserMessage& fault_;
};

bool ReadNumber(JsonWalk& walk, const QJsonValue& value, qint64 least, qint64 most, qint64& number)
{
    const double given = value.toDouble(std::numeric_limits<double>::quiet_NaN());
    if (!value.isDouble() || std::isnan(given) || given < double(least) || given > double(most) ||
        std::floor(given) != given)
        return walk.Refuse(Str::JsonNotNumber, {QString::number(least), QString::number(most)});
    number = qint64(given);
    return true;
}

template <typename Field>
bool ReadField(JsonWalk& walk, const QJsonValue& value, Field& field)
{
    if constexpr (std::is_enum_v<Field>) {
        auto code = std::underlying_type_t<Field>(field);
        if (!ReadField(walk, value, code))
            return false;
        field = Field(code);
        return true;
    } else {
        using Limits = std::numeric_limits<Field>;
        qint64 number = 0;
        if (!ReadNumber(walk, value, Limits::min(), Limits::max(), number))
            return false;
        field = Field(number);
        return true;
    }
}

bool ReadText(JsonWalk& walk, const QJsonValue& value, QString& text)
{
    if (!value.isString())
        return walk.Refuse(Str::JsonNotText);
    text = value.toString();
    return !text.contains(QChar(u'\0')) || walk.Refuse(Str::JsonNulInText);
}

template <size_t N>
bool ReadField(JsonWalk& walk, const QJsonValue& value, FixedText<N>& field)
{
    QString text;
    if (!ReadText(walk, value, text))
        return false;
    if (text.size() > qsizetype(N) - 1)
        return walk.Refuse(Str::JsonTextTooLong, {QString::number(N - 1)});
    field.Set(text);
    return true;
}

bool ReadField(JsonWalk& walk, const QJsonValue& value, VariableText& field)
{
    field.Clear();
    QString text;
    if (value.isNull())
        return true;
    if (!ReadText(walk, value, text))
        return false;
    field.Set(text);
    return true;
}

template <size_t N>
bool ReadField(JsonWalk& walk, const QJsonValue& value, std::array<quint8, N>& bytes)
{
    const QJsonArray array = value.toArray();
    if (!value.isArray() || array.size() != qsizetype(N))
        return walk.Refuse(Str::JsonNotArray);
    for (size_t i = 0; i < N; ++i) {
        if (!walk.At(u"[%1]"_s.arg(i), [&] { return ReadField(walk, array[qsizetype(i)], bytes[i]); }))
            return false;
    }
    return true;
}

// A member of a record's object.
template <typename Record>
struct Member {
    const char* key;
    bool (*read)(JsonWalk& walk, const QJsonValue& value, Record& record);
};

template <typename Record, auto Field>
bool Read(JsonWalk& walk, const QJsonValue& value, Record& record)
{
    return ReadField(walk, value, record.*Field);
}

// Written with a sign: -1 is the default color.
template <typename Record, auto Field>
bool ReadColor(JsonWalk& walk, const QJsonValue& value, Record& record)
{
    qint64 number = 0;
    if (!ReadNumber(walk, value, std::numeric_limits<qint32>::min(), std::numeric_limits<quint32>::max(), number))
        return false;
    record.*Field = quint32(number);
    return true;
}

// What follows from the rest.
template <typename Record>
bool SkipCount(JsonWalk& walk, const QJsonValue& value, Record&)
{
    qint64 number = 0;
    return ReadNumber(walk, value, 0, std::numeric_limits<qint32>::max(), number);
}

template <typename Record>
bool ReadObject(JsonWalk& walk, const QJsonValue& value, Record& record);

template <typename Record>
bool ReadStyle(JsonWalk& walk, const QJsonValue& value, Record& record)
{
    return ReadObject(walk, value, record.textStyle);
}

bool ReadControls(JsonWalk& walk, const QJsonValue& value, FormDef& form)
{
    if (!value.isArray())
        return walk.Refuse(Str::JsonNotArray);
    const QJsonArray array = value.toArray();
    for (qsizetype i = 0; i < array.size(); ++i) {
        ControlDef control;
        if (!walk.At(u"[%1]"_s.arg(i), [&] { return ReadObject(walk, array[i], control); }))
            return false;
        form.AddControl(std::move(control));
    }
    return true;
}

const auto& MembersOf(const TextStyle*)
{
    using S = TextStyle;
    static constexpr std::array kMembers = {
        Member<S>{"face_name", Read<S, &S::faceName>},
        Member<S>{"italic", Read<S, &S::italic>},
        Member<S>{"bold", Read<S, &S::bold>},
        Member<S>{"strikeout", Read<S, &S::strikeout>},
        Member<S>{"underline", Read<S, &S::underline>},
        Member<S>{"point_size", Read<S, &S::pointSize>},
        Member<S>{"text_colour", ReadColor<S, &S::color>},
    };
    return kMembers;
}

const auto& MembersOf(const ControlDef*)
{
    using C = ControlDef;
    static constexpr std::array kMembers = {
        Member<C>{"control_id", Read<C, &C::controlId>},
        Member<C>{"control_type", Read<C, &C::type>},
        Member<C>{"field_bound", Read<C, &C::fieldBound>},
        Member<C>{"has_control_source", Read<C, &C::hasSource>},
        Member<C>{"edit_kind", Read<C, &C::editKind>},
        Member<C>{"source_scope", Read<C, &C::sourceScope>},
        Member<C>{"left", Read<C, &C::left>},
        Member<C>{"top", Read<C, &C::top>},
        Member<C>{"height", Read<C, &C::height>},
        Member<C>{"width", Read<C, &C::width>},
        Member<C>{"window_style", Read<C, &C::windowStyle>},
        Member<C>{"lines", Read<C, &C::lines>},
        Member<C>{"button_function", Read<C, &C::buttonFunction>},
        Member<C>{"background_colour", ReadColor<C, &C::backgroundColor>},
        Member<C>{"text_style", ReadStyle<C>},
        Member<C>{"name", Read<C, &C::name>},
        Member<C>{"default_value", Read<C, &C::defaultValue>},
        Member<C>{"option_1", Read<C, &C::option1>},
        Member<C>{"option_2", Read<C, &C::option2>},
        Member<C>{"reserved", Read<C, &C::reserved>},
        Member<C>{"control_source_length", SkipCount<C>},
        Member<C>{"control_source", Read<C, &C::source>},
    };
    return kMembers;
}

const auto& MembersOf(const FormDef*)
{
    using F = FormDef;
    static constexpr std::array kMembers = {
        Member<F>{"form_tag", Read<F, &F::formTag>},
        Member<F>{"form_name", Read<F, &F::name>},
        Member<F>{"table_name", Read<F, &F::tableName>},
        Member<F>{"form_width", Read<F, &F::width>},
        Member<F>{"form_height", Read<F, &F::height>},
        Member<F>{"control_count", SkipCount<F>},
        Member<F>{"reserved", Read<F, &F::reservedNumber>},
        Member<F>{"counter_a", Read<F, &F::counterA>},
        Member<F>{"counter_b", Read<F, &F::counterB>},
        Member<F>{"raise_input_panel", Read<F, &F::raiseInputPanel>},
        Member<F>{"form_scroll_bar", Read<F, &F::formScrollBar>},
        Member<F>{"default_query_on_startup", Read<F, &F::defaultQueryOnStartup>},
        Member<F>{"reserved_bytes", Read<F, &F::reserved>},
        Member<F>{"default_query_length", SkipCount<F>},
        Member<F>{"background_colour", ReadColor<F, &F::backgroundColor>},
        Member<F>{"form_text_style", ReadStyle<F>},
        Member<F>{"default_query", Read<F, &F::defaultQuery>},
        Member<F>{"controls", ReadControls},
    };
    return kMembers;
}

template <typename Record>
bool ReadObject(JsonWalk& walk, const QJsonValue& value, Record& record)
{
    if (!value.isObject())
        return walk.Refuse(Str::JsonNotObject);
    const auto& members = MembersOf(static_cast<const Record*>(nullptr));
    const QJsonObject object = value.toObject();
    for (auto member = object.begin(); member != object.end(); ++member) {
        const bool done = walk.At(u'.' + member.key(), [&] {
            const auto known = std::ranges::find_if(
                members, [&](const auto& each) { return member.key() == QLatin1StringView(each.key); });
            return known == members.end() ? walk.Refuse(Str::JsonUnknown)
                                          : known->read(walk, member.value(), record);
        });
        if (!done)
            return false;
    }
    return true;
}

bool ReadStore(JsonWalk& walk, const QJsonObject& store, FormDef& form)
{
    for (auto member = store.begin(); member != store.end(); ++member) {
        const QJsonArray array = member.value().toArray();
        const bool done = walk.At(member.key(), [&] {
            if (member.key() != u"forms" && member.key() != u"queries")
                return walk.Refuse(Str::JsonUnknown);
            if (!member.value().isArray())
                return walk.Refuse(Str::JsonNotArray);
            if (member.key() == u"queries")
                return array.isEmpty() || walk.Refuse(Str::JsonNoQueries);
            if (array.size() != 1)
                return walk.Refuse(Str::JsonNotOneForm, {QString::number(array.size())});
            return walk.At(u"[0]"_s, [&] { return ReadObject(walk, array[0], form); });
        });
        if (!done)
            return false;
    }
    return store.contains(u"forms") ||
           walk.At(u"forms"_s, [&] { return walk.Refuse(Str::JsonNotOneForm, {u"0"_s}); });
}

} // namespace

std::optional<FormDef> ReadFormJson(const QByteArray& json, UserMessage& fault)
{
    QJsonParseError error{};
    const QJsonDocument document = QJsonDocument::fromJson(json, &error);
    if (error.error != QJsonParseError::NoError) {
        fault = {Str::CliJsonFault, {error.errorString(), QString::number(error.offset)}};
        return std::nullopt;
    }
    FormDef form;
    JsonWalk walk(fault);
    if (!document.isObject())
        (void)walk.At(u"/"_s, [&] { return walk.Refuse(Str::JsonNotObject); });
    const bool read = document.isObject() && ReadStore(walk, document.object(), form);
    return read ? std::optional(std::move(form)) : std::nullopt;
}

} // namespace mirel::cli
